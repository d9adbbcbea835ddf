#include "reference/Speaker.h"

#include <limits>

namespace qv {
namespace {
constexpr const char* kWindowName = "PlayForm";
}

Speaker::Speaker(SpeechEngine& engine, Options& options, ActivityLog& log)
    : engine_(engine), options_(options), log_(log) {}

void Speaker::Speak(const std::string& text) {
    if (text.empty() || !ready_ || !options_.Speak) return;
    engine_.Stop();
    if (!engine_.Say(text)) log_.LogError(kWindowName, "Speak");
}

bool Speaker::CheckVoice() {
    bool ok = engine_.Initialise();
    if (ok) {
        const int count = engine_.VoiceCount();
        if (options_.Voice < 1) options_.Voice = 1;
        if (options_.Voice > count) {
            options_.Voice = static_cast<std::int16_t>(
                count < 0 ? 0 : (count > std::numeric_limits<std::int16_t>::max()
                                     ? std::numeric_limits<std::int16_t>::max()
                                     : count));
        }
        // Voice 0 (no voices installed) cannot be selected.
        ok = options_.Voice >= 1 && engine_.SelectVoice(options_.Voice);
    }
    if (!ok) {
        log_.LogError(kWindowName, "CheckVoice");
        options_.Speak = false;
        return false;
    }
    log_.WriteLog("Voice using: " + engine_.VoiceDescription(options_.Voice, 1));
    log_.WriteLog(engine_.VoiceDescription(options_.Voice, 2) + " - " +
                  engine_.VoiceDescription(options_.Voice, 3));
    return true;
}

}  // namespace qv
