#pragma once
#include <array>
#include <bit>
#include <cstdint>
#include <cstring>
#include <cstddef>
#include <string>
#include <string_view>

namespace qv {

// The first N tab-separated columns of a line, as views into it (no copies). Columns past N
// are ignored; columns a short line lacks are reported absent by Has().
template <std::size_t N>
class TabColumns {
public:
    explicit TabColumns(std::string_view line) : line_(line) {
        static_assert(N > 0);
        starts_[0] = 0;
        std::size_t at = 0;
        // Eight bytes at a time: every tab in the word is a column end.
        if constexpr (std::endian::native == std::endian::little) {
            for (; at + 8 <= line.size(); at += 8) {
                std::uint64_t word;
                std::memcpy(&word, line.data() + at, 8);
                for (std::uint64_t tabs = TabBytes(word); tabs != 0; tabs &= tabs - 1) {
                    const std::size_t tab = at + (static_cast<std::size_t>(std::countr_zero(tabs)) >> 3);
                    if (EndColumn(tab)) return;
                }
            }
        }
        for (; at < line.size(); ++at)
            if (line[at] == '\t' && EndColumn(at)) return;
        EndColumn(line.size());
    }

    bool Has(std::size_t index) const { return index < count_; }
    std::size_t Count() const { return count_; }
    // An absent column reads as empty.
    std::string_view operator[](std::size_t index) const {
        if (index >= N || index >= count_) return {};
        return std::string_view(line_.data() + starts_[index], starts_[index + 1] - 1 - starts_[index]);
    }

private:
    // 0x80 in each byte of the word that is a tab, 0 elsewhere.
    static std::uint64_t TabBytes(std::uint64_t word) {
        constexpr std::uint64_t low7 = 0x7f7f7f7f7f7f7f7full;
        const std::uint64_t x = word ^ 0x0909090909090909ull;
        return ~(((x & low7) + low7) | x | low7);
    }

    // Records the column that ends at the tab; true once N columns are there.
    bool EndColumn(std::size_t end) {
        starts_[++count_] = end + 1;
        return count_ == N;
    }

    std::string_view line_;
    // Column i runs from starts_[i] to the tab before starts_[i + 1]; the first count_ + 1 are set.
    std::array<std::size_t, N + 1> starts_;
    std::size_t count_ = 0;
};

// out = text with every '"' removed. Most texts have quotes only around them, or none: those
// are assigned in one piece.
inline void AssignWithoutQuotes(std::string& out, std::string_view text) {
    std::size_t first = 0;
    std::size_t last = text.size();
    if (last >= 2 && text.front() == '"' && text.back() == '"') {
        ++first;
        --last;
    }
    std::size_t quote = first;
    while (quote < last && text[quote] != '"') ++quote;
    if (quote == last) {
        out.assign(text.data() + first, last - first);
        return;
    }
    out.clear();
    std::size_t start = 0;
    for (;;) {
        const std::size_t next = text.find('"', start);
        if (next == std::string_view::npos) {
            out.append(text.substr(start));
            return;
        }
        out.append(text.substr(start, next - start));
        start = next + 1;
    }
}

inline std::string WithoutQuotes(std::string_view text) {
    std::string out;
    AssignWithoutQuotes(out, text);
    return out;
}

}  // namespace qv
