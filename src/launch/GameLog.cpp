#include "launch/GameLog.h"

#include <charconv>
#include <string_view>
#include <vector>

#include "app/TextFile.h"

namespace qv {
namespace {

// The third piece of a line split at every single blank (empty pieces count), or nothing.
std::string_view ThirdPiece(std::string_view line) {
    std::size_t start = 0;
    for (int piece = 0; piece < 2; ++piece) {
        const std::size_t blank = line.find(' ', start);
        if (blank == std::string_view::npos) return {};
        start = blank + 1;
    }
    const std::size_t end = line.find(' ', start);
    return line.substr(start, end == std::string_view::npos ? line.size() - start : end - start);
}

bool ParseNumber(std::string_view text, double& value) {
    if (text.empty()) return false;
    const char* first = text.data();
    const char* last = text.data() + text.size();
    const auto [ptr, ec] = std::from_chars(first, last, value);
    return ec == std::errc() && ptr == last;
}

}  // namespace

std::string GameLogName(const std::string& gameKey) {
    std::string name;
    for (std::size_t i = 0; i < gameKey.size();) {
        if (gameKey.compare(i, 4, ".zip") == 0) {
            name += ".log";
            i += 4;
        } else {
            const char c = gameKey[i++];
            name += (c == '/' || c == '\\') ? '_' : c;
        }
    }
    if (name.empty() || name == "." || name == "..") name = "_" + name;
    return name;
}

std::string GameLogPath(const std::string& appFolder, const std::string& gameKey,
                        const HostConventions& host) {
    return host.Join(host.Join(appFolder, "logs"), GameLogName(gameKey));
}

FrameRateReport ReadFrameRate(const std::filesystem::path& logFile, const Regional& regional) {
    FrameRateReport report{kFpsNotAvailable, false};
    if (!FileExists(logFile)) return report;
    const std::optional<std::string> bytes = ReadFileBytes(logFile);
    if (!bytes) return report;

    std::string fps, speed;
    ForEachLine(*bytes, [&](std::string_view line) {
        if (line.substr(0, 12) == "Average FPS:") {
            double value = 0;
            // A summary line without a number is skipped; an earlier good one stays.
            if (ParseNumber(ThirdPiece(line), value)) fps = "FPS: " + regional.FormatNumber(value, 3);
        } else if (line.substr(0, 14) == "Average speed:") {
            const std::string_view percent = ThirdPiece(line);
            if (!percent.empty()) speed = "Speed: " + std::string(percent);
        }
    });
    if (!fps.empty()) return {fps, true};
    if (!speed.empty()) return {speed, true};
    return report;
}

LogView ReadLogView(const std::filesystem::path& logFile) {
    LogView view{"No log available...", false};
    if (!FileExists(logFile)) return view;
    const std::optional<std::string> bytes = ReadFileBytes(logFile);
    if (!bytes) return view;
    std::string text;
    text.reserve(bytes->size() + bytes->size() / 16);
    ForEachLine(*bytes, [&](std::string_view line) {
        text += line;
        text += "\r\n";
    });
    return {text, true};
}

std::string SpokenFrameRate(const std::string& labelText) {
    std::string out;
    for (std::size_t i = 0; i < labelText.size();) {
        if (labelText.compare(i, 3, "FPS") == 0) {
            out += "Frames per second ";
            i += 3;
        } else {
            out += labelText[i++];
        }
    }
    return out;
}

}  // namespace qv
