#pragma once

#include <cstddef>
#include <functional>
#include <memory_resource>
#include <string>
#include <string_view>
#include <unordered_map>

namespace vyn::ie {
class DexObject;
}

namespace vyn::ie::detail {

// The name index of a dataset: object names to the first object filed under each.
//
// Entries and their name copies come from a pool of the index's own, so that they lie close together
// in memory instead of between the objects that the dataset allocates at the same pace; a lookup of a
// large dataset then reads the index nearly as fast as a map that was filled on its own.
class DatasetNameIndex {
 public:
  DatasetNameIndex() = default;
  DatasetNameIndex(const DatasetNameIndex&) = delete;
  DatasetNameIndex& operator=(const DatasetNameIndex&) = delete;

  // The object filed under name, or null.
  DexObject* find(std::wstring_view name) const {
    const auto found = entries_.find(name);
    return found != entries_.end() ? found->second : nullptr;
  }
  // Files object under name unless the name is filed already.
  void fileFirst(std::wstring_view name, DexObject* object) {
    if (entries_.find(name) == entries_.end()) entries_.emplace(Name(name, &pool_), object);
  }
  // Takes object's entry out, looking under name first and then, when object is not filed there (it
  // was renamed since it was filed), among all entries. Answers the name the entry had; false when
  // object has no entry.
  bool remove(std::wstring_view name, const DexObject* object, std::wstring& removedName) {
    auto entry = entries_.find(name);
    if (entry == entries_.end() || entry->second != object) {
      entry = entries_.begin();
      while (entry != entries_.end() && entry->second != object)
        ++entry;
      if (entry == entries_.end()) return false;
    }
    removedName.assign(entry->first);
    entries_.erase(entry);
    return true;
  }
  std::size_t size() const noexcept { return entries_.size(); }

 private:
  using Name = std::pmr::wstring;
  struct Hash {
    using is_transparent = void;
    std::size_t operator()(std::wstring_view name) const noexcept {
      return std::hash<std::wstring_view>()(name);
    }
  };
  struct Equal {
    using is_transparent = void;
    bool operator()(std::wstring_view a, std::wstring_view b) const noexcept { return a == b; }
  };

  std::pmr::unsynchronized_pool_resource pool_;
  std::pmr::unordered_map<Name, DexObject*, Hash, Equal> entries_{&pool_};
};

}  // namespace vyn::ie::detail
