#include "catalogue/MyClass.h"

#include <algorithm>
#include <cstring>
#include <new>
#include <stdexcept>

namespace qv {

namespace {

constexpr std::size_t kFirstChunk = 16;
constexpr std::size_t kLargestChunk = 8192;

inline unsigned char Fold(char c) {
    return static_cast<unsigned char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
}

// Eight bytes with the ASCII capitals lowered; other bytes (including non-ASCII) unchanged.
inline std::uint64_t FoldWord(std::uint64_t w) {
    constexpr std::uint64_t ones = 0x0101010101010101ull;
    const std::uint64_t low7 = w & (0x7f * ones);
    const std::uint64_t atLeastA = low7 + (0x80 - 'A') * ones;
    const std::uint64_t aboveZ = low7 + (0x80 - 'Z' - 1) * ones;
    const std::uint64_t capitals = atLeastA & ~aboveZ & ~w & (0x80 * ones);
    return w | (capitals >> 2);
}

inline std::uint64_t Mix(std::uint64_t h) {
    h ^= h >> 33;
    h *= 0xff51afd7ed558ccdull;
    h ^= h >> 33;
    return h;
}

// A hash of the folded key, eight bytes at a time.
std::uint32_t KeyHash(std::string_view key) {
    std::uint64_t h = 0x9e3779b97f4a7c15ull ^ key.size();
    const char* p = key.data();
    std::size_t left = key.size();
    for (; left >= 8; p += 8, left -= 8) {
        std::uint64_t w;
        std::memcpy(&w, p, 8);
        h = (h ^ FoldWord(w)) * 0x9e3779b97f4a7c15ull;
        h ^= h >> 29;
    }
    if (left > 0) {
        // The last bytes without a call to memcpy: one load that overlaps bytes already hashed,
        // shifted out, or byte by byte for short keys.
        std::uint64_t w = 0;
        if (key.size() >= 8) {
            std::memcpy(&w, key.data() + key.size() - 8, 8);
            w >>= (8 - left) * 8;
        } else {
            for (std::size_t i = 0; i < left; ++i)
                w |= static_cast<std::uint64_t>(static_cast<unsigned char>(p[i])) << (8 * i);
        }
        h = (h ^ FoldWord(w)) * 0x9e3779b97f4a7c15ull;
    }
    return static_cast<std::uint32_t>(Mix(h));
}

bool SameKey(std::string_view a, std::string_view b) {
    if (a.size() != b.size()) return false;
    const char* x = a.data();
    const char* y = b.data();
    std::size_t left = a.size();
    for (; left >= 8; x += 8, y += 8, left -= 8) {
        std::uint64_t u, v;
        std::memcpy(&u, x, 8);
        std::memcpy(&v, y, 8);
        if (u != v && FoldWord(u) != FoldWord(v)) return false;
    }
    for (std::size_t i = 0; i < left; ++i)
        if (Fold(x[i]) != Fold(y[i])) return false;
    return true;
}

// Positions never reach the table's size (it is at most three quarters full), so they fit
// in the bits that the mask covers.
inline std::uint32_t SlotFor(std::uint32_t hash, std::size_t position, std::size_t mask) {
    const auto positionBits = static_cast<std::uint32_t>(mask);
    return (hash & ~positionBits) | static_cast<std::uint32_t>(position);
}

inline void PrefetchSlot(const void* address) {
#if defined(__GNUC__) || defined(__clang__)
    __builtin_prefetch(address);
#else
    (void)address;
#endif
}

}  // namespace

MyClass::~MyClass() = default;

MyClass::Collection::~Collection() {
    for (MyClass* item : order) item->~MyClass();
    for (const Chunk& chunk : chunks) ::operator delete(chunk.items);
}

std::string MyClass::FoldKey(std::string_view key) {
    std::string folded(key);
    for (char& c : folded) c = static_cast<char>(Fold(c));
    return folded;
}

void MyClass::SetKey(std::string key) {
    if (keySet_) return;
    key_ = std::move(key);
    keySet_ = true;
}

MyClass::Collection& MyClass::Inner() {
    if (!inner_) inner_ = std::make_unique<Collection>();
    return *inner_;
}

const MyClass* MyClass::Find(std::string_view key, std::uint32_t hash, std::size_t& slot) const {
    const auto& keyTable = inner_->keyTable;
    const std::size_t mask = keyTable.size() - 1;
    const auto positionBits = static_cast<std::uint32_t>(mask);
    const std::uint32_t tag = hash & ~positionBits;
    for (slot = hash & mask;; slot = (slot + 1) & mask) {
        const Collection::Slot entry = keyTable[slot];
        if (entry == 0) return nullptr;
        if ((entry & ~positionBits) == tag) {
            const MyClass* item = inner_->order[(entry & positionBits) - 1];
            if (SameKey(item->key_, key)) return item;
        }
    }
}

void MyClass::GrowIndex(std::size_t count) {
    std::size_t size = 16;
    while (size * 3 < count * 4) size *= 2;  // at most three quarters full
    if (size <= inner_->keyTable.size()) return;
    inner_->keyTable.resize(size);
    RebuildIndex();
}

void MyClass::RebuildIndex() {
    Collection& c = *inner_;
    std::fill(c.keyTable.begin(), c.keyTable.end(), Collection::Slot{});
    const std::size_t mask = c.keyTable.size() - 1;
    for (std::size_t i = 0; i < c.order.size(); ++i) {
        const std::uint32_t hash = KeyHash(c.order[i]->key_);
        std::size_t slot = hash & mask;
        while (c.keyTable[slot] != 0) slot = (slot + 1) & mask;
        c.keyTable[slot] = SlotFor(hash, i + 1, mask);
    }
}

MyClass* MyClass::NewItem() {
    Collection& c = *inner_;
    if (!c.freed.empty()) {
        MyClass* storage = c.freed.back();
        c.freed.pop_back();
        return new (storage) MyClass();
    }
    if (c.chunks.empty() || c.usedInLastChunk == c.chunks.back().capacity) {
        std::size_t capacity = kFirstChunk;
        for (const Collection::Chunk& chunk : c.chunks) capacity += chunk.capacity;
        if (capacity > kLargestChunk) capacity = kLargestChunk;
        c.chunks.reserve(c.chunks.size() + 1);
        c.chunks.push_back(Collection::Chunk{
            static_cast<MyClass*>(::operator new(capacity * sizeof(MyClass))), capacity});
        c.usedInLastChunk = 0;
    }
    return new (c.chunks.back().items + c.usedInLastChunk++) MyClass();
}

void MyClass::Delete(std::string_view key) {
    const MyClass* found = nullptr;
    if (inner_ && !inner_->order.empty()) {
        std::size_t slot = 0;
        found = Find(key, KeyHash(key), slot);
    }
    if (!found) throw std::out_of_range("No item with key " + std::string(key));
    auto& order = inner_->order;
    for (std::size_t i = 0; i < order.size(); ++i)
        if (order[i] == found) return Delete(static_cast<std::int32_t>(i + 1));
}

void MyClass::Delete(std::int32_t position) {
    if (position < 1 || position > Count())
        throw std::out_of_range("No item at position " + std::to_string(position));
    Collection& c = *inner_;
    const auto at = static_cast<std::size_t>(position - 1);
    MyClass* item = c.order[at];
    c.freed.reserve(c.freed.size() + 1);
    c.order.erase(c.order.begin() + static_cast<std::ptrdiff_t>(at));
    item->~MyClass();
    c.freed.push_back(item);
    RebuildIndex();
}

MyClass* MyClass::Item(std::string_view key) {
    return const_cast<MyClass*>(static_cast<const MyClass*>(this)->Item(key));
}

const MyClass* MyClass::Item(std::string_view key) const {
    if (!inner_ || inner_->order.empty()) return nullptr;
    std::size_t slot = 0;
    return Find(key, KeyHash(key), slot);
}

MyClass* MyClass::Item(std::int32_t position) {
    return const_cast<MyClass*>(static_cast<const MyClass*>(this)->Item(position));
}

const MyClass* MyClass::Item(std::int32_t position) const {
    if (position < 1 || position > Count()) return nullptr;
    return inner_->order[static_cast<std::size_t>(position - 1)];
}

MyClass* MyClass::Add(std::string key) {
    Collection& c = Inner();
    const std::uint32_t hash = KeyHash(key);
    if (c.keyTable.size() * 3 < (c.order.size() + 1) * 4) GrowIndex(c.order.size() + 1);
    // The index slot is rarely in cache in a large collection: ask for it now and build the
    // new item meanwhile. A taken key (rare) gives the item's storage back.
    PrefetchSlot(c.keyTable.data() + (hash & (c.keyTable.size() - 1)));
    // Room first, so that a failed allocation cannot leave an item outside the order.
    if (c.order.size() == c.order.capacity()) c.order.reserve(c.order.capacity() * 2 + 16);
    MyClass* item = NewItem();
    std::size_t slot = 0;
    if (Find(key, hash, slot)) {
        item->~MyClass();
        c.freed.push_back(item);
        return nullptr;
    }
    item->key_ = std::move(key);
    item->keySet_ = true;
    c.order.push_back(item);
    c.keyTable[slot] = SlotFor(hash, c.order.size(), c.keyTable.size() - 1);
    return item;
}

void MyClass::Clear() { inner_.reset(); }

void MyClass::Reserve(std::size_t count) {
    Collection& c = Inner();
    c.order.reserve(count);
    const std::size_t have = c.order.size() + c.freed.size();
    const std::size_t rest = c.chunks.empty() ? 0 : c.chunks.back().capacity - c.usedInLastChunk;
    if (count > have + rest) {
        // One chunk for all that is asked for; the rest of the last chunk stays unused.
        const std::size_t more = count - have;
        c.chunks.reserve(c.chunks.size() + 1);
        c.chunks.push_back(Collection::Chunk{
            static_cast<MyClass*>(::operator new(more * sizeof(MyClass))), more});
        c.usedInLastChunk = 0;
    }
    GrowIndex(count);
}

}  // namespace qv
