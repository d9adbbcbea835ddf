#include "reference/ReferenceScan.h"

#include "app/TextFile.h"

namespace qv {

std::string ReferenceKey(std::string_view name) {
    std::string key = LowerAscii(name);
    for (std::size_t at = key.find(".zip"); at != std::string::npos; at = key.find(".zip", at))
        key.erase(at, 4);
    return key;
}

std::string_view CollectedStart(ReferenceKind kind) {
    return kind == ReferenceKind::Info ? std::string_view("MAME ") : std::string_view();
}

bool InfoLineNames(std::string_view itemList, std::string_view key) {
    std::size_t start = 0;
    while (true) {
        const std::size_t comma = itemList.find(',', start);
        const std::string_view item = itemList.substr(
            start, comma == std::string_view::npos ? std::string_view::npos : comma - start);
        if (!item.empty() && item == key) return true;
        if (comma == std::string_view::npos) return false;
        start = comma + 1;
    }
}

EntryText ScanReference(std::string_view bytes, std::string_view key, ReferenceKind kind) {
    EntryText result;
    result.text = std::string(CollectedStart(kind));
    bool done = false;
    ForEachLine(bytes, [&](std::string_view raw) {
        if (done) return;
        const std::string_view line = TrimSpaces(raw);
        if (!line.empty() && line.front() == '#') return;
        if (!line.empty() && line.front() == '$') {
            if (line == "$end" && result.matched) {
                result.closed = true;
                done = true;
            } else if (line.substr(0, 6) == "$info=") {
                if (InfoLineNames(line.substr(6), key)) result.matched = true;
            }
            return;
        }
        if (!result.matched) return;
        if (kind == ReferenceKind::History && line.empty() && result.text.empty()) return;
        result.text.append(line);
        result.text.append("\r\n");
    });
    return result;
}

}  // namespace qv
