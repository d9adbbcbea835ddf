#pragma once
#include <string>

#include "app/ActivityLog.h"
#include "app/Options.h"
#include "reference/DetailsText.h"
#include "reference/GameNotes.h"
#include "reference/ReferenceIndex.h"

namespace qv {

// The history and information views of the details text area (ShowHistory / ShowMameInfo).
// Each database keeps its own index of entry positions for the whole run.
class ReferenceViews {
public:
    ReferenceViews(const Options& options, GameNotes& notes, ActivityLog& log)
        : options_(options), notes_(notes), log_(log) {}

    void ShowHistory(DetailsText& area, const std::string& name);
    void ShowMameInfo(DetailsText& area, const std::string& name);

private:
    void Show(ReferenceKind kind, DetailsText& area, const std::string& name);

    const Options& options_;
    GameNotes& notes_;
    ActivityLog& log_;
    ReferenceIndex history_{ReferenceKind::History};
    ReferenceIndex info_{ReferenceKind::Info};
};

// The tooltip of a view icon whose database is missing when the window starts.
inline constexpr const char* kUnavailableMark = "Not found";

// What clicking the history or information icon says when its file is unavailable.
std::string UnavailableMessage(ReferenceKind kind, const std::string& configuredPath);

}  // namespace qv
