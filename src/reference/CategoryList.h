#pragma once
#include <string>
#include <string_view>

namespace qv {

// Category lists: GameType separates its items by ", ", a record's Categories by ",". They are
// edited item by item, so a name that is part of a longer one (Shoot in Shooter) is never
// touched. Comparisons are exact (letter case counts).

bool ListHasItem(std::string_view list, std::string_view separator, std::string_view item);

// Every item equal to oldName becomes newName.
std::string RenameListItem(std::string_view list, std::string_view separator,
                           std::string_view oldName, std::string_view newName);

// Every item equal to name is removed together with the separator after it; a last item
// leaves the separator before it ("Classic,Shooter" without Shooter is "Classic,"), as the
// stored lists have always read.
std::string RemoveListItem(std::string_view list, std::string_view separator,
                           std::string_view name);

// A category root shows its name followed by " (N)", the count of its games.
std::string CategoryNameOf(std::string_view nodeText);

}  // namespace qv
