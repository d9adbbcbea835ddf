#pragma once
#include <array>
#include <cstddef>
#include <string>
#include <string_view>

namespace qv {

// The first N tab-separated columns of a line, as views into it (no copies). Columns past N
// are ignored; columns a short line lacks are reported absent by Has().
template <std::size_t N>
class TabColumns {
public:
    explicit TabColumns(std::string_view line) {
        std::size_t start = 0;
        while (count_ < N) {
            const std::size_t tab = line.find('\t', start);
            if (tab == std::string_view::npos) {
                columns_[count_++] = line.substr(start);
                break;
            }
            columns_[count_++] = line.substr(start, tab - start);
            start = tab + 1;
        }
    }

    bool Has(std::size_t index) const { return index < count_; }
    std::size_t Count() const { return count_; }
    // An absent column reads as empty.
    std::string_view operator[](std::size_t index) const {
        return index < count_ ? columns_[index] : std::string_view();
    }

private:
    std::array<std::string_view, N> columns_{};
    std::size_t count_ = 0;
};

// out = text with every '"' removed; copies the runs between quotes rather than byte by byte.
inline void AssignWithoutQuotes(std::string& out, std::string_view text) {
    out.clear();
    std::size_t start = 0;
    for (;;) {
        const std::size_t quote = text.find('"', start);
        if (quote == std::string_view::npos) {
            out.append(text.substr(start));
            return;
        }
        out.append(text.substr(start, quote - start));
        start = quote + 1;
    }
}

inline std::string WithoutQuotes(std::string_view text) {
    std::string out;
    AssignWithoutQuotes(out, text);
    return out;
}

}  // namespace qv
