#include "catalogue/MyClass.h"

#include <stdexcept>

namespace qv {

std::string MyClass::FoldKey(std::string_view key) {
    std::string folded(key);
    for (char& c : folded)
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    return folded;
}

void MyClass::SetKey(std::string key) {
    if (keySet_) return;
    key_ = std::move(key);
    keySet_ = true;
}

void MyClass::Delete(std::string_view key) {
    const auto found = index_.find(FoldKey(key));
    if (found == index_.end()) throw std::out_of_range("No item with key " + std::string(key));
    const std::size_t position = found->second;
    index_.erase(found);
    items_.erase(items_.begin() + static_cast<std::ptrdiff_t>(position));
    ReindexFrom(position);
}

void MyClass::Delete(std::int32_t position) {
    if (position < 1 || position > Count())
        throw std::out_of_range("No item at position " + std::to_string(position));
    const auto at = static_cast<std::size_t>(position - 1);
    index_.erase(FoldKey(items_[at]->Key()));
    items_.erase(items_.begin() + static_cast<std::ptrdiff_t>(at));
    ReindexFrom(at);
}

void MyClass::ReindexFrom(std::size_t first) {
    for (std::size_t i = first; i < items_.size(); ++i) index_[FoldKey(items_[i]->Key())] = i;
}

MyClass* MyClass::Item(std::string_view key) {
    return const_cast<MyClass*>(static_cast<const MyClass*>(this)->Item(key));
}

const MyClass* MyClass::Item(std::string_view key) const {
    if (items_.empty()) return nullptr;
    const auto found = index_.find(FoldKey(key));
    return found == index_.end() ? nullptr : items_[found->second].get();
}

MyClass* MyClass::Item(std::int32_t position) {
    return const_cast<MyClass*>(static_cast<const MyClass*>(this)->Item(position));
}

const MyClass* MyClass::Item(std::int32_t position) const {
    if (position < 1 || position > Count()) return nullptr;
    return items_[static_cast<std::size_t>(position - 1)].get();
}

MyClass* MyClass::Add(std::string key) {
    auto [slot, inserted] = index_.try_emplace(FoldKey(key), items_.size());
    if (!inserted) return nullptr;
    auto item = std::make_unique<MyClass>();
    item->SetKey(std::move(key));
    items_.push_back(std::move(item));
    return items_.back().get();
}

void MyClass::Clear() {
    items_.clear();
    index_.clear();
}

void MyClass::Reserve(std::size_t count) {
    items_.reserve(count);
    index_.reserve(count);
}

}  // namespace qv
