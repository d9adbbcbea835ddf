#include "reference/GameNotes.h"

namespace qv {
namespace {

std::string ReplaceAll(std::string_view text, std::string_view find, std::string_view with) {
    std::string out;
    out.reserve(text.size());
    std::size_t start = 0;
    for (std::size_t at = text.find(find); at != std::string_view::npos;
         at = text.find(find, start)) {
        out.append(text.substr(start, at - start));
        out.append(with);
        start = at + find.size();
    }
    out.append(text.substr(start));
    return out;
}

}  // namespace

std::string EscapeNotes(std::string_view text) {
    return ReplaceAll(ReplaceAll(text, "\t", "<tab>"), "\r\n", "<crlf>");
}

std::string UnescapeNotes(std::string_view stored) {
    return ReplaceAll(ReplaceAll(stored, "<tab>", "\t"), "<crlf>", "\r\n");
}

void GameNotes::SaveNotes(const DetailsText& area) {
    if (ownerKey_.empty()) return;
    // The record may have been deleted while its notes were on screen: nothing to store then.
    if (MyClass* record = records_.Item(ownerKey_)) record->Notes = EscapeNotes(area.Text);
    ownerKey_.clear();
}

void GameNotes::ShowNotes(DetailsText& area, const std::string& name) {
    SaveNotes(area);
    area.Marker = "Notes";
    area.Text = "No details ...";
    area.Colour = textcolours::NoNotesRecord;
    const MyClass* record = name.empty() ? nullptr : records_.Item(name);
    if (record == nullptr) return;
    area.Text = UnescapeNotes(record->Notes);
    area.ReadOnly = !options_.Edit;
    area.Colour = textcolours::Shown;
    ownerKey_ = name;
}

}  // namespace qv
