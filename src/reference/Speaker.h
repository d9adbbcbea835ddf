#pragma once
#include <string>

#include "app/ActivityLog.h"
#include "app/Options.h"
#include "platform/SpeechEngine.h"

namespace qv {

// The main window's voice: speaks only once the window is ready and while the Speak setting is
// on; a new text cuts off the one still being spoken.
class Speaker {
public:
    Speaker(SpeechEngine& engine, Options& options, ActivityLog& log);

    void SetReady(bool ready) { ready_ = ready; }
    bool IsReady() const { return ready_; }

    void Speak(const std::string& text);
    // Clamps and selects the configured voice; switches speech off when that fails. Returns
    // whether speech is usable.
    bool CheckVoice();

    SpeechEngine& Engine() { return engine_; }

private:
    SpeechEngine& engine_;
    Options& options_;
    ActivityLog& log_;
    bool ready_ = false;
};

}  // namespace qv
