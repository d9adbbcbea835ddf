#pragma once
#include <string>
#include <vector>

#include "platform/SpeechEngine.h"

namespace qv::test {

// A speech engine that hears instead of speaking: every text passed to Say is kept in `spoken`
// (in order), so tests can check exactly what the program said.
class RecordingSpeechEngine final : public SpeechEngine {
public:
    explicit RecordingSpeechEngine(int voiceCount = 3) : voiceCount(voiceCount) {}

    bool Initialise() override {
        ++initialisations;
        return initialiseSucceeds;
    }
    int VoiceCount() override { return voiceCount; }
    bool SelectVoice(int number) override {
        if (number < 1 || number > voiceCount) return false;
        selectedVoice = number;
        return true;
    }
    std::string VoiceName(int number) override { return "Voice " + std::to_string(number); }
    std::string VoiceDescription(int number, int which) override {
        return "Voice " + std::to_string(number) + " description " + std::to_string(which);
    }
    void Stop() override { ++stops; }
    bool Say(const std::string& text) override {
        spoken.push_back(text);
        return saySucceeds;
    }

    // The last text said, or empty.
    std::string Last() const { return spoken.empty() ? std::string() : spoken.back(); }

    int voiceCount;
    bool initialiseSucceeds = true;
    bool saySucceeds = true;
    int selectedVoice = 0;
    int initialisations = 0;
    int stops = 0;
    std::vector<std::string> spoken;
};

}  // namespace qv::test
