#include "launch/ResolutionCycle.h"

#include <vector>

#include "app/TextFile.h"

namespace qv {

void ResolutionCycle::Build(const std::string& resolutions) {
    cycle_.Clear();
    MyClass* autoEntry = cycle_.Add(kAuto);

    std::vector<std::string> pieces;
    std::size_t start = 0;
    while (start <= resolutions.size()) {
        std::size_t comma = resolutions.find(',', start);
        if (comma == std::string::npos) comma = resolutions.size();
        std::string piece = resolutions.substr(start, comma - start);
        // A blank piece ("a,,b" or a trailing comma) would put an empty entry on the label.
        if (!TrimSpaces(piece).empty()) pieces.push_back(std::move(piece));
        start = comma + 1;
    }

    // Built from the last piece to the first so each entry knows its successor.
    std::string previous = kAuto;
    for (auto it = pieces.rbegin(); it != pieces.rend(); ++it) {
        MyClass* entry = cycle_.Add(std::string(TrimSpaces(*it)));
        if (!entry) continue;  // a repeated resolution keeps its later place
        entry->Resolution = previous;
        previous = *it;
    }
    autoEntry->Resolution = previous;
}

std::string ResolutionCycle::Next(const std::string& labelText) const {
    const std::string_view key =
        labelText.empty() ? std::string_view(kAuto) : TrimSpaces(labelText);
    if (const MyClass* entry = cycle_.Item(key)) return entry->Resolution;
    return kAuto;
}

std::string ResolutionCycle::Advance(const std::string& labelText, MyClass* selectedGame) const {
    std::string next = Next(labelText);
    if (selectedGame) selectedGame->Resolution = next == kAuto ? std::string() : next;
    return next;
}

}  // namespace qv
