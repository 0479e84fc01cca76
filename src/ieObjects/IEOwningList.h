#pragma once

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <memory>
#include <type_traits>
#include <utility>

#include "hostlibs/VynCompactVector.h"

namespace vyn::ie {

// Copy policies of DexOwningList: how one owned item is duplicated when the list is copied. A copier
// may answer null (a failed allocation through a class allocator); the copy then skips that item.

// Duplicates an item with its class's copy constructor (and class-level operator new). For lists of
// one concrete class.
struct DexCopyByConstructor {
  template <class T>
  static T* copy(const T& item) {
    return new T(item);
  }
};

// Duplicates an item with its clone() operation, so that a list of a polymorphic base keeps each
// item's own class. clone() must return a new object owned by the caller, convertible to T*.
struct DexCopyByClone {
  template <class T>
  static T* copy(const T& item) {
    return item.clone();
  }
};

// A list that owns its items: the storage behind every "list of X*, owned" of the data model. Items
// are kept in insertion order; an item handed to add() or insert() belongs to the list from then on
// and is deleted by remove(), clear(), assignment over the list and the destructor. Null items are
// declined (the list never holds null). Indexes are ints; an index outside the list never crashes:
// at() and detach() answer null, remove() and insert() answer false.
//
// Copy construction and assignment duplicate every item through CopyPolicy, so the copy owns its own
// items and never shares them with the original; self-assignment changes nothing. Iteration yields the
// item pointers (const pointers through a const list).
template <class T, class CopyPolicy = DexCopyByConstructor>
class DexOwningList {
  using Storage = vyn_templ::CompactVector<std::unique_ptr<T>>;

  template <bool IsConst>
  class Iterator {
    using Base = std::conditional_t<IsConst, typename Storage::const_iterator, typename Storage::iterator>;

   public:
    using iterator_concept = std::forward_iterator_tag;
    using iterator_category = std::input_iterator_tag;
    using value_type = std::conditional_t<IsConst, const T*, T*>;
    using difference_type = std::ptrdiff_t;
    using reference = value_type;
    using pointer = void;

    Iterator() = default;
    explicit Iterator(Base position) : position_(position) {}

    value_type operator*() const { return position_->get(); }
    Iterator& operator++() {
      ++position_;
      return *this;
    }
    Iterator operator++(int) {
      Iterator before = *this;
      ++position_;
      return before;
    }
    friend bool operator==(const Iterator&, const Iterator&) = default;

   private:
    Base position_{};
  };

 public:
  using iterator = Iterator<false>;
  using const_iterator = Iterator<true>;

  // Construction, copy and destruction.
  DexOwningList() = default;
  DexOwningList(const DexOwningList& other) { appendCopiesOf(other); }
  DexOwningList(DexOwningList&& other) noexcept = default;
  DexOwningList& operator=(const DexOwningList& other) {
    if (&other != this) {
      DexOwningList copy(other);
      swap(copy);
    }
    return *this;
  }
  DexOwningList& operator=(DexOwningList&& other) noexcept = default;
  ~DexOwningList() = default;

  void swap(DexOwningList& other) noexcept { items_.swap(other.items_); }

  // Size and access.
  int count() const noexcept { return static_cast<int>(items_.size()); }
  bool isEmpty() const noexcept { return items_.empty(); }
  // The item at index, or null when index is outside the list. The list keeps ownership.
  T* at(int index) noexcept { return isValidIndex(index) ? items_[toSize(index)].get() : nullptr; }
  const T* at(int index) const noexcept {
    return isValidIndex(index) ? items_[toSize(index)].get() : nullptr;
  }
  // The index of the item held at this address, or -1.
  int indexOf(const T* item) const noexcept {
    for (std::size_t i = 0; i < items_.size(); ++i) {
      if (items_[i].get() == item) return static_cast<int>(i);
    }
    return -1;
  }
  // The first item for which predicate(const T&) is true, or null.
  template <class Predicate>
  T* findFirst(Predicate predicate) {
    return const_cast<T*>(std::as_const(*this).findFirst(predicate));
  }
  template <class Predicate>
  const T* findFirst(Predicate predicate) const {
    for (const auto& item : items_) {
      if (predicate(static_cast<const T&>(*item))) return item.get();
    }
    return nullptr;
  }

  // Adding. Each takes ownership of item and returns true; a null item is declined (false).
  bool add(T* item) {
    if (item == nullptr) return false;
    std::unique_ptr<T> owned(item);
    items_.push_back(std::move(owned));
    return true;
  }
  // Inserts before index; index == count() appends. An index outside 0 to count() is declined
  // (false) and the caller keeps item.
  bool insert(int index, T* item) {
    if (item == nullptr || index < 0 || index > count()) return false;
    std::unique_ptr<T> owned(item);
    items_.insert(items_.begin() + index, std::move(owned));
    return true;
  }
  // Appends a copy of every item of other (through CopyPolicy). Copying a list into itself changes
  // nothing.
  void appendCopiesOf(const DexOwningList& other) {
    if (&other == this) return;
    items_.reserve(items_.size() + other.items_.size());
    for (const auto& item : other.items_) {
      add(CopyPolicy::copy(static_cast<const T&>(*item)));
    }
  }
  void reserve(int capacity) {
    if (capacity > 0) items_.reserve(toSize(capacity));
  }

  // Removing.
  // Deletes the item at index and closes the gap; false (nothing changes) for an index outside the list.
  bool remove(int index) {
    if (!isValidIndex(index)) return false;
    items_.erase(items_.begin() + index);
    return true;
  }
  // Takes the item at index out of the list without deleting it: the caller owns the result. Null
  // for an index outside the list.
  T* detach(int index) {
    if (!isValidIndex(index)) return nullptr;
    T* const item = items_[toSize(index)].release();
    items_.erase(items_.begin() + index);
    return item;
  }
  // Deletes every item.
  void clear() noexcept { items_.clear(); }

  // Reordering. Sorts the items by less(const T&, const T&), a strict weak order; equal items may
  // change places.
  template <class Less>
  void sort(Less less) {
    std::sort(items_.begin(), items_.end(),
              [&less](const std::unique_ptr<T>& a, const std::unique_ptr<T>& b) {
                return less(static_cast<const T&>(*a), static_cast<const T&>(*b));
              });
  }

  // Iteration over the item pointers, in list order.
  iterator begin() noexcept { return iterator(items_.begin()); }
  iterator end() noexcept { return iterator(items_.end()); }
  const_iterator begin() const noexcept { return const_iterator(items_.begin()); }
  const_iterator end() const noexcept { return const_iterator(items_.end()); }
  const_iterator cbegin() const noexcept { return begin(); }
  const_iterator cend() const noexcept { return end(); }

 private:
  bool isValidIndex(int index) const noexcept { return index >= 0 && index < count(); }
  static std::size_t toSize(int index) noexcept { return static_cast<std::size_t>(index); }

  Storage items_;
};

template <class T, class CopyPolicy>
void swap(DexOwningList<T, CopyPolicy>& a, DexOwningList<T, CopyPolicy>& b) noexcept {
  a.swap(b);
}

}  // namespace vyn::ie
