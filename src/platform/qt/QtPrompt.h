#pragma once
#include <QPointer>
#include <QWidget>

#include "platform/Prompt.h"

namespace qv {

// Message boxes. An empty title shows the program's name.
class QtPrompt final : public Prompt {
public:
    explicit QtPrompt(QWidget* parent = nullptr);

    PromptAnswer Ask(const std::string& title, const std::string& text, PromptButtons buttons,
                     PromptIcon icon) override;

private:
    QPointer<QWidget> parent_;
};

}  // namespace qv
