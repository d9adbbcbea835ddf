#include "reference/CategoryList.h"

#include <cctype>
#include <vector>

namespace qv {
namespace {

std::vector<std::string_view> Items(std::string_view list, std::string_view separator) {
    std::vector<std::string_view> items;
    std::size_t start = 0;
    while (true) {
        const std::size_t at = list.find(separator, start);
        if (at == std::string_view::npos) {
            items.push_back(list.substr(start));
            return items;
        }
        items.push_back(list.substr(start, at - start));
        start = at + separator.size();
    }
}

}  // namespace

bool ListHasItem(std::string_view list, std::string_view separator, std::string_view item) {
    for (std::string_view each : Items(list, separator))
        if (each == item) return true;
    return false;
}

std::string RenameListItem(std::string_view list, std::string_view separator,
                           std::string_view oldName, std::string_view newName) {
    std::string out;
    bool first = true;
    for (std::string_view each : Items(list, separator)) {
        if (!first) out.append(separator);
        first = false;
        out.append(each == oldName ? newName : each);
    }
    return out;
}

std::string RemoveListItem(std::string_view list, std::string_view separator,
                           std::string_view name) {
    const std::vector<std::string_view> items = Items(list, separator);
    std::string out;
    for (std::size_t i = 0; i < items.size(); ++i) {
        const bool last = i + 1 == items.size();
        if (items[i] == name) continue;  // the item and the separator after it
        out.append(items[i]);
        if (!last) out.append(separator);
    }
    return out;
}

std::string CategoryNameOf(std::string_view nodeText) {
    if (nodeText.size() >= 4 && nodeText.back() == ')') {
        const std::size_t open = nodeText.rfind(" (");
        if (open != std::string_view::npos && open + 2 < nodeText.size() - 1) {
            bool digits = true;
            for (std::size_t i = open + 2; i + 1 < nodeText.size(); ++i)
                digits = digits && std::isdigit(static_cast<unsigned char>(nodeText[i]));
            if (digits) return std::string(nodeText.substr(0, open));
        }
    }
    return std::string(nodeText);
}

}  // namespace qv
