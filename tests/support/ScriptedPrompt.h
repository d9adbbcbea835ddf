#pragma once
#include <deque>
#include <string>
#include <vector>

#include "platform/Prompt.h"

namespace qv::test {

// Answers questions from a script instead of showing message boxes, and keeps every question
// asked so tests can check the exact texts. With the script used up it answers Cancel for
// three-button questions and No otherwise, and counts the question as unexpected.
class ScriptedPrompt final : public Prompt {
public:
    struct Question {
        std::string title;
        std::string text;
        PromptButtons buttons;
        PromptIcon icon;
    };

    void Answer(PromptAnswer answer) { answers.push_back(answer); }

    PromptAnswer Ask(const std::string& title, const std::string& text, PromptButtons buttons,
                     PromptIcon icon) override {
        asked.push_back({title, text, buttons, icon});
        if (answers.empty()) {
            ++unexpected;
            return buttons == PromptButtons::YesNoCancel ? PromptAnswer::Cancel
                                                         : PromptAnswer::No;
        }
        const PromptAnswer next = answers.front();
        answers.pop_front();
        return next;
    }

    std::deque<PromptAnswer> answers;
    std::vector<Question> asked;
    int unexpected = 0;
};

}  // namespace qv::test
