#include "app/OptionsFile.h"

#include <charconv>
#include <cmath>
#include <limits>
#include <optional>

#include "app/NetworkSwitch.h"
#include "app/TextFile.h"

namespace qv {

namespace {

// Path defaults: the classic C:\MAME\ layout under Windows conventions, ~/mame/ here.
std::string DefaultPath(const HostConventions& host, const std::string& homeFolder,
                        const std::string& windowsName, const std::string& posixName) {
    if (host.caseInsensitivePaths) return "C:\\MAME\\" + windowsName;
    return host.Join(host.Join(homeFolder, "mame"), posixName);
}

// A number the way the settings file has always accepted it: optional sign, digits with an
// optional fraction and exponent. Rounds half to even. Empty when the text is not a number.
std::optional<double> ParseNumber(std::string_view text) {
    if (text.empty()) return std::nullopt;
    bool negative = false;
    if (text.front() == '+' || text.front() == '-') {
        negative = text.front() == '-';
        text.remove_prefix(1);
    }
    if (text.empty() || text.find_first_not_of("0123456789.E+-") != std::string_view::npos)
        return std::nullopt;
    double value = 0;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), value,
                                        std::chars_format::general);
    if (result.ec != std::errc() || result.ptr != text.data() + text.size()) return std::nullopt;
    if (!std::isfinite(value)) return std::nullopt;
    return std::nearbyint(negative ? -value : value);
}

std::int16_t ReadVolume(std::string_view upperValue) {
    const auto number = ParseNumber(upperValue);
    if (!number) return 0;
    // Out-of-range numbers fall on the same side of the clamp as their sign.
    if (*number > 0) return 0;
    if (*number < -32) return -32;
    return static_cast<std::int16_t>(*number);
}

std::int16_t ReadVoice(std::string_view upperValue) {
    const auto number = ParseNumber(upperValue);
    // A voice number that does not fit the field is as unusable as a word: the first voice.
    if (!number || *number > std::numeric_limits<std::int16_t>::max() ||
        *number < std::numeric_limits<std::int16_t>::min())
        return 1;
    return static_cast<std::int16_t>(*number);
}

std::string RemoveAll(std::string text, std::string_view what) {
    for (auto at = text.find(what); at != std::string::npos; at = text.find(what, at))
        text.erase(at, what.size());
    return text;
}

std::string NormaliseKey(std::string_view key) {
    std::string out;
    for (char c : UpperAscii(key))
        if (c != ' ') out += c;
    return out;
}

// Returns false for keys this program does not know (they are ignored).
bool Assign(Options& o, const std::string& key, const std::string& value) {
    const std::string upper = UpperAscii(value);
    const bool yes = upper == "YES";
    if (key == "EDIT") o.Edit = yes;
    else if (key == "MAMEPATH") o.MamePath = RemoveAll(value, "MAMEPP.EXE");
    else if (key == "MAMEEXEC") o.MameExec = value;
    else if (key == "DEFAULTROMDIR") o.DefaultROMdir = value;
    else if (key == "CHEATSFILE") o.CheatsFile = value;
    else if (key == "CTRLR" || key == "CTRLRFILE") o.CtrlrFile = value;
    else if (key == "CTRLRDIR") o.CtrlrDir = value;
    else if (key == "SNAPDIR") o.SnapDir = value;
    else if (key == "HIGHDIR") o.HighDir = value;
    else if (key == "ARTDIR" || key == "ARTWORKDIR") o.ArtworkDir = value;
    else if (key == "STATEDIR") o.StateDir = value;
    else if (key == "HISTORYFILE") o.HistoryFile = value;
    else if (key == "MAMEINFO" || key == "MAMEINFOFILE") o.MameInfoFile = value;
    else if (key == "SHOWHIDDEN") o.ShowHidden = yes;
    else if (key == "SHOWWORKING") o.ShowWorking = yes;
    else if (key == "SPEAK") o.Speak = yes;
    else if (key == "VOICE") o.Voice = ReadVoice(upper);
    else if (key == "STEADYKEY") o.SteadyKey = yes;
    else if (key == "VOLUME") o.Volume = ReadVolume(upper);
    else if (key == "WINDOWS2000XP") o.Windows2000XP = yes;
    else if (key == "JOYSTICK") o.Joystick = yes;
    else if (key == "SOUND") o.Sound = yes;
    else if (key == "SAVEONEXIT") o.SaveOnExit = yes;
    else if (key == "GAMETYPE") o.GameType = value;
    else if (key == "INTRO") o.Intro = value;
    else if (key == "RATE0") o.Rate0 = value;
    else if (key == "RATE1") o.Rate1 = value;
    else if (key == "RATE2") o.Rate2 = value;
    else if (key == "RATE3") o.Rate3 = value;
    else if (key == "RATE4") o.Rate4 = value;
    else if (key == "RATE5") o.Rate5 = value;
    else if (key == "SCREENSHOTSURL") o.ScreenshotsURL = value;
    else if (key == "LIVEUPDATEURL") o.LiveUpdateURL = value;
    else if (key == "ROMSURL" || key == "ROMURL") o.RomsURL = value;
    else if (key == "ROMSUSERNAME" || key == "ROMUSERNAME") o.RomsUserName = value;
    else if (key == "ROMSPASSWORD" || key == "ROMPASSWORD") o.RomsPassword = value;
    else return false;
    return true;
}

// A value must stay on its own line: a line break inside it would start a new setting.
std::string OneLine(std::string value) {
    for (char& c : value)
        if (c == '\r' || c == '\n') c = ' ';
    return value;
}

}  // namespace

void SetDefaults(Options& o, const std::filesystem::path& appFolder, const HostConventions& host,
                 const std::string& homeFolder, HostInfo* hostInfo) {
    const auto path = [&](const char* windowsName, const char* posixName) {
        return DefaultPath(host, homeFolder, windowsName, posixName);
    };
    if (host.caseInsensitivePaths) {
        o.MamePath = "C:\\MAME\\";
        o.MameExec = "MAMEPP.EXE";
        o.CtrlrFile = "DEFAULT.ZIP";
        o.CtrlrDir = "C:\\MAME";
    } else {
        o.MamePath = "/usr/games/";
        o.MameExec = "mame";
        o.CtrlrFile = "default.zip";
        o.CtrlrDir = path("", "ctrlr");
    }
    o.DefaultROMdir = path("ROMS", "roms");
    o.CheatsFile = path("CHEAT.DAT", "cheat.dat");
    o.SnapDir = path("SNAP", "snap");
    o.HighDir = path("HI", "hi");
    o.ArtworkDir = path("ARTWORK", "artwork");
    o.StateDir = path("STA", "sta");
    o.HistoryFile = path("HISTORY.DAT", "history.dat");
    o.MameInfoFile = path("MAMEINFO.DAT", "mameinfo.dat");
    o.MarqueeDir = path("MARQUEE", "marquee");
    o.SamplesDir = path("SAMPLES", "samples");

    o.Volume = 0;
    o.Joystick = true;
    o.Sound = true;
    o.SteadyKey = false;
    o.Edit = true;
    o.ShowHidden = false;
    o.ShowWorking = false;
    o.SaveOnExit = true;
    o.GameType.clear();
    o.Windows2000XP = true;
    o.Speak = true;
    o.Voice = 1;
    o.Intro = "Hey you!  Would you like to play a game?";
    o.Rate0 = "No opinion";
    o.Rate1 = "It sucks!";
    o.Rate2 = "Lame!";
    o.Rate3 = "It's fun.";
    o.Rate4 = "It's Cool!";
    o.Rate5 = "This game rocks!";
    o.ScreenshotsURL = std::string(network_switch::MakerWebHost) + "/quorvane/downloads/snap/";
    o.LiveUpdateURL = std::string(network_switch::MakerWebHost) + "/quorvane/downloads/files";
    o.MarqueeURL = std::string(network_switch::MakerWebHost) + "/quorvane/downloads/marquee/";
    o.Resolutions = "320 x 240, 640 x 480, 800 x 600, 1024 x 768";
    o.LogGameOutput = true;

    const std::string app = appFolder.string();
    o.GamesFile = host.Join(app, "games.inc");
    o.RomLibraryFile = host.Join(app, "mame_rom_lib.inc");

    // Only ask for the address when a prefix is configured: the lookup may prompt the user.
    if (hostInfo && network_switch::PrivatePrefix[0] != '\0')
        ApplyNetworkSwitch(o, hostInfo->GetLocalIP(), network_switch::PrivatePrefix,
                           network_switch::PrivateServer);

    o.RomsURL.clear();
    o.RomsUserName.clear();
    o.RomsPassword.clear();
}

void ApplyNetworkSwitch(Options& o, const std::string& localIP, const std::string& prefix,
                        const std::string& server) {
    if (prefix.empty() || localIP.substr(0, 10) != prefix) return;
    const std::string host = network_switch::MakerWebHost;
    for (std::string* url : {&o.ScreenshotsURL, &o.MarqueeURL, &o.LiveUpdateURL})
        for (auto at = url->find(host); at != std::string::npos;
             at = url->find(host, at + server.size()))
            url->replace(at, host.size(), server);
}

void LoadOptions(Options& options, const std::filesystem::path& configFile, ActivityLog& log,
                 StatusDisplay& status) {
    log.WriteLog("Loading Options...");
    status.ShowStatusIfVisible("Loading Options ...");
    if (!FileExists(configFile)) return;

    const auto bytes = ReadFileBytes(configFile);
    if (!bytes) {
        log.LogError("Globals", "LoadOptions",
                     PendingError{53, "Cannot read " + configFile.string()});
        return;
    }
    int lineNumber = 0;
    bool stopped = false;
    ForEachLine(*bytes, [&](std::string_view raw) {
        if (stopped) return;
        ++lineNumber;
        const std::string_view line = TrimSpaces(raw);
        if (line.empty() || line.front() == '#') return;
        const auto equals = line.find('=');
        if (equals == std::string_view::npos) {
            stopped = true;
            log.LogError("Globals", "LoadOptions",
                         PendingError{9, "Line " + std::to_string(lineNumber) +
                                             " of config.inc has no \"=\""});
            return;
        }
        const std::string key = NormaliseKey(TrimSpaces(line.substr(0, equals)));
        std::string_view rest = line.substr(equals + 1);
        if (const auto next = rest.find('='); next != std::string_view::npos)
            rest = rest.substr(0, next);
        Assign(options, key, std::string(TrimSpaces(rest)));
    });
}

std::string OptionsFileText(const Options& o, const HostConventions& host,
                            const std::string& updatedText) {
    std::string text;
    const auto line = [&](const std::string& content) { text += OneLine(content) + "\r\n"; };
    const auto setting = [&](const char* key, const std::string& value) {
        line(std::string("    ") + key + " = " + value);
    };
    const auto pathSetting = [&](const char* key, const std::string& value) {
        setting(key, host.caseInsensitivePaths ? UpperAscii(value) : value);
    };
    const auto flag = [&](const char* key, bool value) { setting(key, YesNo(value)); };

    line("# Quorvane Configuration File");
    line("# Updated: " + updatedText);
    line("");
    line(" ### MAME Path, Files information");
    pathSetting("MamePath", o.MamePath);
    pathSetting("MameExec", o.MameExec);
    pathSetting("DefaultROMdir", o.DefaultROMdir);
    pathSetting("CheatsFile", o.CheatsFile);
    pathSetting("CtrlrFile", o.CtrlrFile);
    pathSetting("CtrlrDir", o.CtrlrDir);
    pathSetting("SnapDir", o.SnapDir);
    pathSetting("HighDir", o.HighDir);
    pathSetting("ArtworkDir", o.ArtworkDir);
    pathSetting("MameInfoFile", o.MameInfoFile);
    pathSetting("HistoryFile", o.HistoryFile);
    pathSetting("StateDir", o.StateDir);
    line("");
    line("### Miscellaneous MAME Options");
    line("");
    line("# Volume = -32 to 0");
    setting("Volume", std::to_string(o.Volume));
    line("");
    line("# Joystick enabled?");
    flag("Joystick", o.Joystick);
    line("");
    line("# Enable sound by default?");
    flag("Sound", o.Sound);
    line("");
    line("### Interface Options");
    line("");
    line("# Allow editing (delete, rating, categories, working, mouse, notes, etc.)");
    flag("Edit", o.Edit);
    line("");
    line("# Show hidden files on game tree");
    flag("ShowHidden", o.ShowHidden);
    line("");
    line("# Show working ROMs only on game tree");
    flag("ShowWorking", o.ShowWorking);
    line("");
    line("# Save ROM information on Exit?");
    flag("SaveOnExit", o.SaveOnExit);
    line("");
    line("# Game categories, separate with comma");
    setting("GameType", o.GameType);
    line("");
    line("# Windows 2000 or XP?");
    flag("Windows2000XP", o.Windows2000XP);
    line("");
    line("### Voice synthesizer options");
    line("");
    line("# Use the voice synthesizer (MS Direct Speech)");
    flag("Speak", o.Speak);
    line("");
    line("# Voice id, depends on voice engine installed");
    setting("Voice", std::to_string(o.Voice));
    line("");
    line("# Spoken when program starts");
    setting("Intro", o.Intro);
    line("");
    line("# Ratings");
    setting("Rate0", o.Rate0);
    setting("Rate1", o.Rate1);
    setting("Rate2", o.Rate2);
    setting("Rate3", o.Rate3);
    setting("Rate4", o.Rate4);
    setting("Rate5", o.Rate5);
    line("");
    line("### Internet Options");
    line("     Screenshots URL = " + o.ScreenshotsURL);
    line("     Live Update URL = " + o.LiveUpdateURL);
    return text;
}

std::string WriteOptions(const Options& options, const std::filesystem::path& configFile,
                         const HostConventions& host, const Regional& regional,
                         const Clock& clock, ActivityLog& log) {
    const std::string text =
        OptionsFileText(options, host, regional.GeneralDate(clock.Now()));
    std::string error = WriteFileAtomically(configFile, text);
    if (!error.empty()) log.LogError("Globals", "WriteOptions", PendingError{75, error});
    return error;
}

}  // namespace qv
