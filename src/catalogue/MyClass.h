#pragma once
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace qv {

// The game item and, at the same time, a keyed collection of further items in insertion order.
// Library entries, game records, the resolution cycle and the update list are all MyClass
// items; a collection's own fields stay empty and an item's own collection stays empty.
// Keys ignore ASCII letter case.
class MyClass {
public:
    std::string RomFile;
    std::string Title;
    std::string Notes;
    bool Working = false;
    bool Mouse = false;
    std::string Year;
    std::string Company;
    std::string Rating;
    std::string Categories;
    bool Hidden = false;
    bool EmuWorking = false;
    bool EmuColors = false;
    bool EmuSound = false;
    bool EmuScreenFlip = false;
    std::int64_t FileSize = 0;  // archives over 2 GB exist
    bool Present = false;
    std::int16_t Plays = 0;
    std::string LastPlayed;
    std::string Category;
    std::string MameVersion;
    std::string Extra;
    std::string Resolution;
    std::int32_t PlaySeconds = 0;
    // The games.inc line a record was read from. The record is saved as that line while its
    // fields still match it, so columns and texts the reader does not keep are not lost.
    std::string StoredLine;

    MyClass() = default;
    ~MyClass();
    MyClass(const MyClass&) = delete;
    MyClass& operator=(const MyClass&) = delete;
    MyClass(MyClass&&) noexcept = default;
    MyClass& operator=(MyClass&&) noexcept = default;

    // Set once: the first assignment stores the key, later ones are ignored.
    const std::string& Key() const { return key_; }
    void SetKey(std::string key);

    std::int32_t Count() const {
        return inner_ ? static_cast<std::int32_t>(inner_->order.size()) : 0;
    }

    // Removes by key or by 1-based position; throws std::out_of_range when there is none.
    void Delete(std::string_view key);
    void Delete(std::int32_t position);

    // The item by key or 1-based position, or nullptr.
    MyClass* Item(std::string_view key);
    const MyClass* Item(std::string_view key) const;
    MyClass* Item(std::int32_t position);
    const MyClass* Item(std::int32_t position) const;
    MyClass* Item(const char* key) { return Item(std::string_view(key)); }
    const MyClass* Item(const char* key) const { return Item(std::string_view(key)); }
    MyClass* Item(const std::string& key) { return Item(std::string_view(key)); }
    const MyClass* Item(const std::string& key) const { return Item(std::string_view(key)); }

    bool exists(std::string_view key) const { return Item(key) != nullptr; }
    bool exists(std::int32_t position) const { return Item(position) != nullptr; }

    // A new item under the key, or nullptr (and nothing added) when the key is taken.
    MyClass* Add(std::string key);

    // Empties the collection.
    void Clear();
    void Reserve(std::size_t count);

    // Enumeration in insertion order (NewEnum).
    template <typename Item, typename Inner>
    class BasicIterator {
    public:
        explicit BasicIterator(Inner it) : it_(it) {}
        Item& operator*() const { return **it_; }
        Item* operator->() const { return *it_; }
        BasicIterator& operator++() { ++it_; return *this; }
        bool operator==(const BasicIterator& other) const { return it_ == other.it_; }
        bool operator!=(const BasicIterator& other) const { return it_ != other.it_; }
    private:
        Inner it_;
    };
    using iterator = BasicIterator<MyClass, MyClass* const*>;
    using const_iterator = BasicIterator<const MyClass, const MyClass* const*>;
    iterator begin() { return iterator(First()); }
    iterator end() { return iterator(First() + Count()); }
    const_iterator begin() const { return const_iterator(First()); }
    const_iterator end() const { return const_iterator(First() + Count()); }

    // Case-folded form of a key, as used for lookups.
    static std::string FoldKey(std::string_view key);

private:
    // An item's own collection exists only once something is added to it, so that the many
    // items that never hold others carry one empty pointer instead of a whole empty table.
    struct Collection {
        // Items live in chunks that never move, so callers may keep pointers across Adds.
        struct Chunk {
            MyClass* items = nullptr;
            std::size_t capacity = 0;
        };
        // Open addressing over positions in `order`; keys are compared with the items' own.
        // A slot holds the 1-based position in its low bits (as many as the table's size
        // needs) and the high bits of the key's hash above them; 0 is an empty slot. Four
        // bytes a slot keep the table of a large library small enough to stay in cache.
        using Slot = std::uint32_t;
        std::vector<MyClass*> order;  // insertion order
        std::vector<Chunk> chunks;
        std::size_t usedInLastChunk = 0;
        std::vector<MyClass*> freed;  // destroyed items whose storage may be used again
        std::vector<Slot> keyTable;   // size is a power of two, at most three quarters full

        Collection() = default;
        Collection(const Collection&) = delete;
        Collection& operator=(const Collection&) = delete;
        ~Collection();
    };

    MyClass* const* First() const { return inner_ ? inner_->order.data() : nullptr; }
    Collection& Inner();
    const MyClass* Find(std::string_view key, std::uint32_t hash, std::size_t& slot) const;
    MyClass* NewItem();
    void GrowIndex(std::size_t count);
    void RebuildIndex();

    std::string key_;
    bool keySet_ = false;
    std::unique_ptr<Collection> inner_;
};

}  // namespace qv
