#pragma once
#include <cstdint>
#include <string>

namespace qv {

// The process-wide settings: the config.inc keys plus settings that exist only as defaults.
struct Options {
    // Stored in config.inc.
    std::string MamePath;
    std::string MameExec;
    std::string DefaultROMdir;
    std::string CheatsFile;
    std::string CtrlrFile;
    std::string CtrlrDir;
    std::string SnapDir;
    std::string HighDir;
    std::string ArtworkDir;
    std::string StateDir;
    std::string HistoryFile;
    std::string MameInfoFile;
    std::int16_t Volume = 0;  // -32..0
    bool Joystick = true;
    bool Sound = true;
    bool SteadyKey = false;  // read, never written
    bool Edit = true;
    bool ShowHidden = false;
    bool ShowWorking = false;
    bool SaveOnExit = true;
    std::string GameType;
    bool Windows2000XP = true;
    bool Speak = true;
    std::int16_t Voice = 1;
    std::string Intro;
    std::string Rate0, Rate1, Rate2, Rate3, Rate4, Rate5;
    std::string ScreenshotsURL;
    std::string LiveUpdateURL;
    std::string RomsURL;       // read, never written
    std::string RomsUserName;  // read, never written
    std::string RomsPassword;  // read, never written

    // Defaults only.
    std::string MarqueeDir;
    std::string SamplesDir;
    std::string MarqueeURL;
    std::string Resolutions;
    bool LogGameOutput = true;
    std::string GamesFile;
    std::string RomLibraryFile;

    const std::string& RateText(int stars) const {
        switch (stars) {
            case 1: return Rate1;
            case 2: return Rate2;
            case 3: return Rate3;
            case 4: return Rate4;
            case 5: return Rate5;
            default: return Rate0;
        }
    }
};

}  // namespace qv
