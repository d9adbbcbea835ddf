#pragma once
#include <filesystem>
#include <string>

#include "app/HostConventions.h"
#include "platform/Regional.h"

namespace qv {

// The game log's file name for a game key: every ".zip" replaced by ".log" (exact case, so
// PACMAN.ZIP keeps its name). Folder separators become "_" and a bare "." or ".." gets a "_"
// in front, so a key read from a file never puts the log outside the logs folder.
std::string GameLogName(const std::string& gameKey);

// appFolder + "logs" + GameLogName(gameKey), joined with the host's separator.
std::string GameLogPath(const std::string& appFolder, const std::string& gameKey,
                        const HostConventions& host);

// What the frame-rate label shows after a run.
struct FrameRateReport {
    std::string text;  // "FPS: 59.924", "Speed: 99.99%" or "FPS: Not available"
    bool available = false;  // false: red; true: green
};

inline constexpr const char* kFpsNotAvailable = "FPS: Not available";

// Reads the game log: the last "Average FPS:" line gives "FPS: " + its number with three
// decimals in the regional format; without one, the last line beginning "Average speed:" (a
// current emulator) gives "Speed: " + its percentage. A missing log, or neither line, gives
// "FPS: Not available". A malformed number never stops the reader.
FrameRateReport ReadFrameRate(const std::filesystem::path& logFile, const Regional& regional);

// The "Log" view of the text area.
struct LogView {
    // Every line followed by CR LF, bytes as the emulator wrote them (show through
    // DisplayUtf8), or "No log available...".
    std::string text;
    bool found = false;  // true: colour RGB(128, 128, 255); false: red
};
LogView ReadLogView(const std::filesystem::path& logFile);

// The label text spoken on a click: every "FPS" becomes "Frames per second ".
std::string SpokenFrameRate(const std::string& labelText);

}  // namespace qv
