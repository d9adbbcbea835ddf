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
// are ignored; columns a short line lacks are reported absent by Has(). The same pass counts
// the '"' in each column, so that quote stripping needs no second look at most texts.
template <std::size_t N>
class TabColumns {
public:
    explicit TabColumns(std::string_view line) : line_(line) {
        static_assert(N > 0);
        // Local copies: stores into the arrays could otherwise alias the members.
        std::size_t count = 0;
        std::uint32_t quotes = 0;
        starts_[0] = 0;
        auto mark = [&](std::size_t at, bool tab) {
            if (!tab) {
                ++quotes;
                return false;
            }
            quotes_[count] = quotes;
            quotes = 0;
            starts_[++count] = at + 1;
            return count == N;
        };
        std::size_t at = 0;
        // Eight bytes at a time: every tab in the word ends a column, every quote is counted.
        if constexpr (std::endian::native == std::endian::little) {
            for (; at + 8 <= line.size(); at += 8) {
                std::uint64_t word;
                std::memcpy(&word, line.data() + at, 8);
                const std::uint64_t tabs = BytesEqual(word, '\t');
                for (std::uint64_t marks = tabs | BytesEqual(word, '"'); marks != 0;
                     marks &= marks - 1) {
                    const std::uint64_t bit = marks & (~marks + 1);
                    const std::size_t pos = at + (static_cast<std::size_t>(std::countr_zero(marks)) >> 3);
                    if (mark(pos, (tabs & bit) != 0)) {
                        count_ = count;
                        return;
                    }
                }
            }
        }
        for (; at < line.size(); ++at) {
            if ((line[at] == '\t' || line[at] == '"') && mark(at, line[at] == '\t')) {
                count_ = count;
                return;
            }
        }
        mark(line.size(), true);
        count_ = count;
    }

    bool Has(std::size_t index) const { return index < count_; }
    std::size_t Count() const { return count_; }
    // An absent column reads as empty.
    std::string_view operator[](std::size_t index) const {
        if (index >= N || index >= count_) return {};
        return std::string_view(line_.data() + starts_[index], starts_[index + 1] - 1 - starts_[index]);
    }

    // out = the column without its '"' (absent: empty).
    void AssignWithoutQuotes(std::string& out, std::size_t index) const;

private:
    // 0x80 in each byte of the word that equals c, 0 elsewhere.
    static std::uint64_t BytesEqual(std::uint64_t word, char c) {
        constexpr std::uint64_t low7 = 0x7f7f7f7f7f7f7f7full;
        const std::uint64_t x = word ^ (0x0101010101010101ull * static_cast<unsigned char>(c));
        return ~(((x & low7) + low7) | x | low7);
    }

    std::string_view line_;
    // Column i runs from starts_[i] to the tab before starts_[i + 1]; the first count_ + 1 are set.
    std::array<std::size_t, N + 1> starts_;
    std::array<std::uint32_t, N> quotes_;  // '"' in each column; the first count_ are set
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

namespace qv {

template <std::size_t N>
void TabColumns<N>::AssignWithoutQuotes(std::string& out, std::size_t index) const {
    const std::string_view text = (*this)[index];
    if (index >= N || index >= count_ || quotes_[index] == 0) {
        out.assign(text);
    } else if (quotes_[index] == 2 && text.size() >= 2 && text.front() == '"' &&
               text.back() == '"') {
        out.assign(text.data() + 1, text.size() - 2);
    } else {
        qv::AssignWithoutQuotes(out, text);
    }
}

}  // namespace qv
