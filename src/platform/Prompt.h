#pragma once
#include <string>

namespace qv {

enum class PromptButtons { Ok, YesNo, YesNoCancel, OkCancel };
enum class PromptIcon { None, Information, Question, Exclamation, Critical };
enum class PromptAnswer { Ok, Yes, No, Cancel };

// Every question and message to the user goes through here, so tests can answer without a
// modal loop. An empty title means the application's default title ("Quorvane").
class Prompt {
public:
    virtual ~Prompt() = default;
    virtual PromptAnswer Ask(const std::string& title, const std::string& text,
                             PromptButtons buttons, PromptIcon icon) = 0;
    void Inform(const std::string& text, PromptIcon icon = PromptIcon::None,
                const std::string& title = "Quorvane") {
        Ask(title, text, PromptButtons::Ok, icon);
    }
};

}  // namespace qv
