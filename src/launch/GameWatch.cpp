#include "launch/GameWatch.h"

#include <limits>

namespace qv {

GameWatch::TickResult GameWatch::Tick(MyClass& records, const std::string& selectedGameKey) {
    TickResult result;
    if (gameTaskId_ == kNoGame) return result;
    if (seconds_ < std::numeric_limits<std::int32_t>::max()) ++seconds_;
    if (launcher_.IsRunning(gameTaskId_)) return result;

    result.ended = true;
    result.seconds = seconds_;
    if (!selectedGameKey.empty()) {
        if (MyClass* game = records.Item(selectedGameKey)) {
            // The total stays at the largest 32-bit count rather than wrapping to negative.
            const std::int64_t total = std::int64_t{game->PlaySeconds} + seconds_;
            game->PlaySeconds = total > std::numeric_limits<std::int32_t>::max()
                                    ? std::numeric_limits<std::int32_t>::max()
                                    : static_cast<std::int32_t>(total);
            result.credited = true;
        }
    }
    Clear();
    return result;
}

}  // namespace qv
