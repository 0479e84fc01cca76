#pragma once

#include <map>
#include <unordered_set>
#include <utility>

namespace vyn::ie {

// A map from a key to an owned item that keeps the first item of a key: the storage behind every
// "map by name, owned" of the data model (the container's level runs, the road templates). An item
// handed to add() belongs to the map from then on and is deleted by remove(), clear() and the
// destructor; an item that add() declines (null, or a key already present) stays with the caller.
//
// Iteration runs in key order over the pairs (key, item pointer) of the underlying std::map, so that
// hosts and plug-ins read `it->first` and `it->second` as from any map. The map is not copied: the
// items are not known to be copyable.
template <class Key, class T>
class DexOwningMap {
  using Map = std::map<Key, T*>;

 public:
  using const_iterator = typename Map::const_iterator;

  DexOwningMap() = default;
  DexOwningMap(const DexOwningMap&) = delete;
  DexOwningMap& operator=(const DexOwningMap&) = delete;
  ~DexOwningMap() { clear(); }

  // Stores item under key and takes ownership: true. Declined (false) for null and when key is
  // present; the present item stays and the caller keeps item. An item the map already holds (under
  // any key) changes nothing and answers true, so that the caller never deletes an item the map owns.
  bool add(const Key& key, T* item) {
    if (item == nullptr) return false;
    if (held_.contains(item)) return true;
    if (!items_.try_emplace(key, item).second) return false;
    held_.insert(item);
    return true;
  }

  // True when the map holds item.
  bool holds(const T* item) const { return held_.contains(item); }

  // The item stored under key, or null.
  T* find(const Key& key) const {
    const auto found = items_.find(key);
    return found != items_.end() ? found->second : nullptr;
  }

  // Deletes the item stored under key and answers true; false when key is absent.
  bool remove(const Key& key) {
    const auto found = items_.find(key);
    if (found == items_.end()) return false;
    T* const item = found->second;
    items_.erase(found);
    held_.erase(item);
    delete item;
    return true;
  }

  // Deletes every item.
  void clear() noexcept {
    Map items;
    items.swap(items_);
    held_.clear();
    for (auto& entry : items)
      delete entry.second;
  }

  int count() const noexcept { return static_cast<int>(items_.size()); }
  const_iterator begin() const noexcept { return items_.begin(); }
  const_iterator end() const noexcept { return items_.end(); }

 private:
  Map items_;
  std::unordered_set<const T*> held_;
};

}  // namespace vyn::ie
