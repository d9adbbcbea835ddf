#include "launch/CommandLine.h"

#include <filesystem>

#include "app/TextFile.h"

namespace qv {
namespace {

bool Exists(const CommandInputs& in, const std::string& path) {
    if (path.empty()) return false;
    return in.fileExists ? in.fileExists(path) : FileExists(path);
}

bool IsAuto(const std::string& resolution) {
    const std::string_view trimmed = TrimSpaces(resolution);
    return trimmed.empty() || trimmed == "Auto";
}

std::string WithoutBlanks(const std::string& text) {
    std::string out;
    for (char c : text)
        if (c != ' ') out += c;
    return out;
}

bool CheatsOn(const CommandInputs& in) {
    return in.switches.Cheats && Exists(in, in.options.CheatsFile);
}

// The controller file name without its extension, when name + ".cfg" exists in CtrlrDir: a
// missing controller file is fatal for a current emulator.
std::string CurrentControllerName(const CommandInputs& in, const HostConventions& host) {
    const Options& o = in.options;
    if (o.CtrlrFile.empty() || o.CtrlrDir.empty()) return {};
    const std::string stem = std::filesystem::path(o.CtrlrFile).filename().stem().string();
    if (stem.empty()) return {};
    return Exists(in, host.Join(o.CtrlrDir, stem + ".cfg")) ? stem : std::string();
}

std::string FolderOf(const std::string& file) {
    const std::string folder = std::filesystem::path(file).parent_path().string();
    return folder.empty() ? std::string(".") : folder;
}

}  // namespace

EmulatorCommand ClassicCommand(const CommandInputs& in, const HostConventions& host) {
    const Options& o = in.options;
    const bool full = !in.safeMode;
    const bool artOn = in.switches.Artwork;
    EmulatorCommand command;
    command.program = host.Join(o.MamePath, o.MameExec);
    auto& a = command.arguments;
    a = {in.game.RomFile, "-rp", in.romFolder};

    if (in.game.Mouse) a.push_back("-mouse");
    if (!o.Sound) a.push_back("-nosound");
    if (CheatsOn(in)) a.insert(a.end(), {"-cheat_file", o.CheatsFile, "-c"});
    if (full && !IsAuto(in.resolution)) a.insert(a.end(), {"-r", WithoutBlanks(in.resolution)});
    if (o.Joystick) a.push_back("-joy");
    if (full && !o.CtrlrDir.empty()) a.insert(a.end(), {"-ctrlr_directory", o.CtrlrDir});
    if (full && !o.CtrlrFile.empty()) a.insert(a.end(), {"-ctrlr", o.CtrlrFile});
    if (full && !o.HighDir.empty()) a.insert(a.end(), {"-hiscore_directory", o.HighDir});
    if (full && !o.SnapDir.empty()) a.insert(a.end(), {"-snapshot_directory", o.SnapDir});
    if (!o.ArtworkDir.empty() && artOn) a.insert(a.end(), {"-artwork_directory", o.ArtworkDir});
    if (!artOn) a.push_back("-noart");
    if (full && o.SteadyKey) a.push_back("-steady");
    if (o.Volume != 0) a.insert(a.end(), {"-vol", std::to_string(o.Volume)});
    if (full && !o.SamplesDir.empty()) a.insert(a.end(), {"-sp", o.SamplesDir});
    if (full && !o.HistoryFile.empty()) a.insert(a.end(), {"-history_file", o.HistoryFile});
    if (full && !o.MameInfoFile.empty()) a.insert(a.end(), {"-mameinfo_file", o.MameInfoFile});
    if (full && !o.StateDir.empty()) a.insert(a.end(), {"-state_directory", o.StateDir});
    if (full && in.switches.Priority) a.push_back("-high_priority");
    if (full && in.switches.Window) a.push_back("-w");
    a.insert(a.end(), {"-skip_disclaimer", "-skip_gameinfo"});
    return command;
}

std::string ClassicCommandText(const CommandInputs& in, const HostConventions& host) {
    const EmulatorCommand command = ClassicCommand(in, host);
    // Every piece ends with one blank, so the redirect follows after two.
    std::string text = command.program;
    for (const std::string& word : command.arguments) text += " " + word;
    text += " ";
    if (in.options.LogGameOutput) text += " > \"" + in.logFile + "\"";
    if (host.startThroughShell)
        text = (in.options.Windows2000XP ? "Cmd.exe /C " : "Command.com /C ") + text;
    return text;
}

EmulatorCommand CurrentCommand(const CommandInputs& in, const HostConventions& host) {
    const Options& o = in.options;
    EmulatorCommand command;
    command.program = host.Join(o.MamePath, o.MameExec);
    auto& a = command.arguments;
    a = {in.game.RomFile, "-rompath", in.romFolder};

    const bool full = !in.safeMode;
    if (in.game.Mouse) a.push_back("-mouse");
    if (!o.Sound) a.insert(a.end(), {"-sound", "none"});
    if (CheatsOn(in)) a.insert(a.end(), {"-cheat", "-cheatpath", FolderOf(o.CheatsFile)});
    if (full && !IsAuto(in.resolution))
        a.insert(a.end(), {"-resolution", WithoutBlanks(in.resolution)});
    if (o.Joystick) a.push_back("-joystick");
    if (full && !o.CtrlrDir.empty()) a.insert(a.end(), {"-ctrlrpath", o.CtrlrDir});
    if (full) {
        if (const std::string name = CurrentControllerName(in, host); !name.empty())
            a.insert(a.end(), {"-ctrlr", name});
    }
    if (full && !o.SnapDir.empty()) a.insert(a.end(), {"-snapshot_directory", o.SnapDir});
    if (!o.ArtworkDir.empty() && in.switches.Artwork) a.insert(a.end(), {"-artpath", o.ArtworkDir});
    if (o.Volume != 0) a.insert(a.end(), {"-volume", std::to_string(o.Volume)});
    if (full && !o.SamplesDir.empty()) a.insert(a.end(), {"-samplepath", o.SamplesDir});
    if (full && !o.StateDir.empty()) a.insert(a.end(), {"-state_directory", o.StateDir});
    if (full && in.switches.Window) a.push_back("-window");
    a.push_back("-skip_gameinfo");
    return command;
}

std::string CommandText(const EmulatorCommand& command, const std::string& logFile) {
    auto shown = [](const std::string& word) {
        if (!word.empty() && word.find_first_of(" \t\"'") == std::string::npos) return word;
        std::string quoted = "\"";
        for (char c : word) {
            if (c == '"' || c == '\\') quoted += '\\';
            quoted += c;
        }
        return quoted + "\"";
    };
    std::string text = shown(command.program);
    for (const std::string& argument : command.arguments) text += " " + shown(argument);
    if (!logFile.empty()) text += " > \"" + logFile + "\"";
    return text;
}

}  // namespace qv
