#pragma once
#include <string>

namespace qv {

// The text-to-speech engine. Voices are numbered from 1. Operations that fail return false or
// throw nothing; callers log and carry on.
class SpeechEngine {
public:
    virtual ~SpeechEngine() = default;
    virtual bool Initialise() = 0;
    virtual int VoiceCount() = 0;
    virtual bool SelectVoice(int number) = 0;
    virtual std::string VoiceName(int number) = 0;
    // Three descriptive texts of a voice (name, language, gender/age or similar).
    virtual std::string VoiceDescription(int number, int which) = 0;
    virtual void Stop() = 0;
    virtual bool Say(const std::string& text) = 0;
};

}  // namespace qv
