#include "platform/qt/QtSpeechEngine.h"

#include <QLocale>
#include <QStringList>
#include <QTextToSpeech>

namespace qv {

QtSpeechEngine::QtSpeechEngine(QString engineName) : wanted_(std::move(engineName)) {}

QtSpeechEngine::~QtSpeechEngine() = default;

bool QtSpeechEngine::Initialise() {
    if (initialised_) return speech_ != nullptr;
    initialised_ = true;

    QStringList candidates;
    if (!wanted_.isEmpty()) candidates << wanted_;
    else candidates = QTextToSpeech::availableEngines();

    // Keep the first engine that works and has a voice; otherwise the first that works at all.
    std::unique_ptr<QTextToSpeech> fallback;
    for (const QString& name : candidates) {
        auto engine = std::make_unique<QTextToSpeech>(name);
        if (engine->state() == QTextToSpeech::Error) continue;
        const QList<QVoice> voices = engine->availableVoices();
        if (!voices.isEmpty()) {
            speech_ = std::move(engine);
            voices_ = voices;
            return true;
        }
        if (!fallback) fallback = std::move(engine);
    }
    speech_ = std::move(fallback);
    return speech_ != nullptr;
}

int QtSpeechEngine::VoiceCount() {
    if (!initialised_) Initialise();
    return static_cast<int>(voices_.size());
}

const QVoice* QtSpeechEngine::Voice(int number) const {
    if (number < 1 || number > voices_.size()) return nullptr;
    return &voices_[number - 1];
}

bool QtSpeechEngine::SelectVoice(int number) {
    const QVoice* voice = Voice(number);
    if (!speech_ || !voice) return false;
    speech_->setVoice(*voice);
    return speech_->state() != QTextToSpeech::Error;
}

std::string QtSpeechEngine::VoiceName(int number) {
    const QVoice* voice = Voice(number);
    return voice ? voice->name().toStdString() : std::string();
}

std::string QtSpeechEngine::VoiceDescription(int number, int which) {
    const QVoice* voice = Voice(number);
    if (!voice) return {};
    switch (which) {
        case 1: return voice->name().toStdString();
        case 2: return QLocale::languageToString(voice->locale().language()).toStdString();
        default:
            return (QVoice::genderName(voice->gender()) + QStringLiteral(", ") +
                    QVoice::ageName(voice->age()))
                .toStdString();
    }
}

void QtSpeechEngine::Stop() {
    if (speech_) speech_->stop(QTextToSpeech::BoundaryHint::Immediate);
}

bool QtSpeechEngine::Say(const std::string& text) {
    if (!speech_) return false;
    speech_->say(QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size())));
    return speech_->state() != QTextToSpeech::Error;
}

std::string QtSpeechEngine::LastError() const {
    return speech_ ? speech_->errorString().toStdString() : std::string("No speech engine");
}

std::string QtSpeechEngine::EngineName() const {
    return speech_ ? speech_->engine().toStdString() : std::string();
}

}  // namespace qv
