#pragma once
#include <cstdint>
#include <string>

#include "catalogue/MyClass.h"
#include "platform/ProcessLauncher.h"

namespace qv {

// The running-game watch. The main window ticks it once a second from its timer; the watch owns
// GameTaskId and the seconds counter. Only one game is watched at a time.
class GameWatch {
public:
    static constexpr ProcessId kNoGame = -1;

    explicit GameWatch(ProcessLauncher& launcher) : launcher_(launcher) {}

    // Drops any game being watched (its seconds are not stored) and resets the counter.
    void Clear() {
        gameTaskId_ = kNoGame;
        seconds_ = 0;
    }
    // Starts watching a process that RunGame has just started.
    void Watch(ProcessId id) {
        gameTaskId_ = id;
        seconds_ = 0;
    }

    ProcessId GameTaskId() const { return gameTaskId_; }
    std::int32_t PlaySecondsCounter() const { return seconds_; }
    bool Watching() const { return gameTaskId_ != kNoGame; }

    struct TickResult {
        bool ended = false;           // the game ended on this tick: refresh the details panel
        std::int32_t seconds = 0;     // seconds counted for that run
        bool credited = false;        // whether a record received them
    };

    // One timer tick. While the process runs it counts a second; on the first tick that finds it
    // gone it adds the counted seconds to the PlaySeconds of selectedGameKey's record (when
    // there is one), goes back to idle and reports that the panel must be refreshed.
    TickResult Tick(MyClass& records, const std::string& selectedGameKey);

private:
    ProcessLauncher& launcher_;
    ProcessId gameTaskId_ = kNoGame;
    std::int32_t seconds_ = 0;
};

}  // namespace qv
