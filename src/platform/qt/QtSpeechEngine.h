#pragma once
#include <QList>
#include <QString>
#include <QVoice>
#include <memory>
#include <string>

#include "platform/SpeechEngine.h"

class QTextToSpeech;

namespace qv {

// Speech through QTextToSpeech. The first engine that offers a voice is used; with no engine
// or no voice the voice count is 0 (and CheckVoice switches speech off). Failures such as
// "No audio device available" leave the engine in its error state: Say then returns false and
// LastError() tells why; the program goes on.
class QtSpeechEngine final : public SpeechEngine {
public:
    // engineName empty: the platform's engines in their order of preference.
    explicit QtSpeechEngine(QString engineName = {});
    ~QtSpeechEngine() override;

    bool Initialise() override;
    int VoiceCount() override;
    bool SelectVoice(int number) override;
    std::string VoiceName(int number) override;
    // 1: name, 2: language, 3: gender and age.
    std::string VoiceDescription(int number, int which) override;
    void Stop() override;
    bool Say(const std::string& text) override;

    // The engine's own description of its last failure, or empty.
    std::string LastError() const;
    // The name of the engine in use, or empty before Initialise or without one.
    std::string EngineName() const;

private:
    const QVoice* Voice(int number) const;

    QString wanted_;
    std::unique_ptr<QTextToSpeech> speech_;
    QList<QVoice> voices_;
    bool initialised_ = false;
};

}  // namespace qv
