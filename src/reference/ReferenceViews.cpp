#include "reference/ReferenceViews.h"

#include "app/TextFile.h"

namespace qv {

void ReferenceViews::ShowHistory(DetailsText& area, const std::string& name) {
    Show(ReferenceKind::History, area, name);
}

void ReferenceViews::ShowMameInfo(DetailsText& area, const std::string& name) {
    Show(ReferenceKind::Info, area, name);
}

void ReferenceViews::Show(ReferenceKind kind, DetailsText& area, const std::string& name) {
    const bool history = kind == ReferenceKind::History;
    const std::string& file = history ? options_.HistoryFile : options_.MameInfoFile;
    notes_.SaveNotes(area);
    area.Marker = history ? "Hist" : "Info";
    if (!FileExists(file)) {
        area.Text = std::string(history ? "History.dat not found:" : "MAMEInfo.dat not found:") +
                    "\r\n" + file;
        area.Colour = textcolours::Failure;
    } else if (name.empty()) {
        log_.WriteLog(history ? "History: No game specified." : "MAMEInfo: No game specified.");
    } else {
        area.Text = "Please wait, searching ...";
        log_.WriteLog((history ? "HISTORY: " : "MAMEINFO: ") + name);
        area.Colour = textcolours::Searching;
        ReferenceIndex& index = history ? history_ : info_;
        const std::optional<EntryText> entry = index.Find(file, ReferenceKey(name));
        const std::string start(CollectedStart(kind));
        if (!entry) {
            log_.LogError(history ? "ShowHistory" : "ShowMameInfo", "Read " + file);
            area.Text = "Cannot read " + file;
            area.Colour = textcolours::Failure;
        } else if (entry->text.empty() || entry->text == start) {
            // Nothing collected. An entry closed by "$end" still shows its (empty) text.
            if (entry->closed) {
                area.Text = entry->text;
                if (history) area.Colour = textcolours::Shown;
            } else {
                area.Text = history ? "No history data found for " + name + "."
                                    : "No MAME info data found for " + name + ".";
                area.Colour = textcolours::Failure;
            }
        } else {
            // Also for an entry that runs to the end of the file without "$end": what was
            // collected is shown rather than leaving the searching message.
            area.Text = entry->text;
            area.Colour = textcolours::Shown;
        }
    }
    area.ReadOnly = true;
}

std::string UnavailableMessage(ReferenceKind kind, const std::string& configuredPath) {
    if (kind == ReferenceKind::History)
        return configuredPath.empty() ? "No history file identified." : "Cannot find history file.";
    return configuredPath.empty() ? "No MAME Info file identified." : "Cannot find MAME Info file.";
}

}  // namespace qv
