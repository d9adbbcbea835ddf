#include "reference/MakeSpeakable.h"

#include <array>
#include <utility>

#include "app/TextFile.h"

namespace qv {

namespace {

void ReplaceAll(std::string& text, std::string_view from, std::string_view to) {
    std::size_t at = text.find(from);
    while (at != std::string::npos) {
        text.replace(at, from.size(), to);
        at = text.find(from, at + to.size());
    }
}

// Applied in this order; the spaces are part of the patterns and are consumed with them, and
// "&&" is how titles are escaped for labels (a single "&" stays).
constexpr std::array<std::pair<std::string_view, std::string_view>, 8> kReplacements{{
    {"VS.", "verses"},
    {"&&", "and"},
    {"*", "-"},
    {"III ", "3"},
    {" III", "3"},
    {"II ", "2"},
    {" II", "2"},
    {"(C)", "Copyright"},
}};

constexpr std::string_view kTrailingArticle = ", THE";

}  // namespace

std::string MakeSpeakable(std::string_view text) {
    std::string result = UpperAscii(text);
    for (const auto& [from, to] : kReplacements) ReplaceAll(result, from, to);

    // Set names such as "(Japan)" are not read out.
    const std::size_t bracket = result.find('(');
    if (bracket != std::string::npos) result.erase(bracket);

    const std::string_view trimmed = TrimSpaces(result);
    if (trimmed.size() >= kTrailingArticle.size() &&
        UpperAscii(trimmed.substr(trimmed.size() - kTrailingArticle.size())) == kTrailingArticle) {
        std::string body = UpperAscii(result);
        ReplaceAll(body, kTrailingArticle, "");
        return "The " + body;
    }
    return result;
}

}  // namespace qv
