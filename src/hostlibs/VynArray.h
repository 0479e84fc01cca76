#pragma once

#include <algorithm>
#include <iterator>
#include <vector>

#include "hostlibs/VynCompactVector.h"

namespace vyn_templ {

// An MFC-style growable array; one item of pointer size is held without a heap block. Indexes are
// ints. Reading past the end answers a default element and writing past the end does nothing
// (SetAtGrow grows instead), so a bad index from a field file never crashes a plug-in.
template <class TYPE, class ARG_TYPE = const TYPE&>
class CVynArray {
 public:
  using value_type = TYPE;
  using iterator = TYPE*;
  using const_iterator = const TYPE*;

  // Size.
  int GetSize() const noexcept { return static_cast<int>(items_.size()); }
  int GetCount() const noexcept { return GetSize(); }
  bool IsEmpty() const noexcept { return items_.empty(); }
  int GetUpperBound() const noexcept { return GetSize() - 1; }
  // New elements are default-constructed; growBy is accepted for compatibility and not needed.
  void SetSize(int newSize, int growBy = -1) {
    static_cast<void>(growBy);
    items_.resize(newSize > 0 ? static_cast<std::size_t>(newSize) : 0);
  }
  void RemoveAll() noexcept { items_.clear(); }
  void FreeExtra() { items_.shrink_to_fit(); }

  // Element access.
  const TYPE& GetAt(int index) const { return isValid(index) ? items_[at(index)] : neutral(); }
  TYPE& GetAt(int index) { return ElementAt(index); }
  TYPE& ElementAt(int index) { return isValid(index) ? items_[at(index)] : scratch(); }
  const TYPE& operator[](int index) const { return GetAt(index); }
  TYPE& operator[](int index) { return ElementAt(index); }
  void SetAt(int index, ARG_TYPE element) {
    if (isValid(index)) items_[at(index)] = element;
  }
  void SetAtGrow(int index, ARG_TYPE element) {
    if (index < 0) return;
    if (index >= GetSize()) {
      const TYPE copy(element);  // element may live in this array
      items_.resize(at(index) + 1);
      items_[at(index)] = copy;
    } else {
      items_[at(index)] = element;
    }
  }
  const TYPE* GetData() const noexcept { return items_.data(); }
  TYPE* GetData() noexcept { return items_.data(); }

  // Adding and removing. Add returns the new element's index, Append the index of the first added one.
  int Add(ARG_TYPE element) {
    items_.push_back(element);
    return GetUpperBound();
  }
  int Append(const CVynArray& other) {
    const int first = GetSize();
    if (&other == this) {
      const CompactVector<TYPE> copy(items_);
      items_.insert(items_.end(), copy.begin(), copy.end());
    } else {
      items_.insert(items_.end(), other.items_.begin(), other.items_.end());
    }
    return first;
  }
  void Copy(const CVynArray& other) {
    if (&other != this) items_ = other.items_;
  }
  // An index past the end appends.
  void InsertAt(int index, ARG_TYPE element, int count = 1) {
    if (count <= 0) return;
    const TYPE copy(element);
    const auto position = items_.begin() + static_cast<std::ptrdiff_t>(std::clamp(index, 0, GetSize()));
    items_.insert(position, static_cast<std::size_t>(count), copy);
  }
  // Elements outside the array are ignored.
  void RemoveAt(int index, int count = 1) {
    if (!isValid(index) || count <= 0) return;
    const auto first = items_.begin() + index;
    const auto last = first + std::min<std::ptrdiff_t>(count, GetSize() - index);
    items_.erase(first, last);
  }

  // Iteration for range-for and the standard algorithms.
  iterator begin() noexcept { return items_.begin(); }
  iterator end() noexcept { return items_.end(); }
  const_iterator begin() const noexcept { return items_.begin(); }
  const_iterator end() const noexcept { return items_.end(); }

  friend bool operator==(const CVynArray& a, const CVynArray& b) { return a.items_ == b.items_; }

 private:
  bool isValid(int index) const noexcept { return index >= 0 && index < GetSize(); }
  static std::size_t at(int index) noexcept { return static_cast<std::size_t>(index); }
  static const TYPE& neutral() {
    static const TYPE value{};
    return value;
  }
  // The writable answer to a bad index: a per-thread element, reset on every use.
  static TYPE& scratch() {
    thread_local TYPE value{};
    value = TYPE{};
    return value;
  }

  CompactVector<TYPE> items_;
};

}  // namespace vyn_templ

using vyn_templ::CVynArray;

// The host's vector: a standard vector.
template <class T>
using vyn_vector = std::vector<T>;
