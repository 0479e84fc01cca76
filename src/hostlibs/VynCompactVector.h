#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <new>
#include <utility>

namespace vyn_templ {

// A growable array that keeps one item of up to pointer size inside itself: 16 bytes in all, and no
// heap block while it holds at most one such item. Survey objects mostly carry one code, and codes one
// code string, so the lists behind them (CVynArray, DexOwningList) use it instead of std::vector.
// Items are contiguous and iterators are pointers; growth, insertion and erasure invalidate them as
// they do in std::vector. T must be move-constructible; a failed allocation throws std::bad_alloc.
template <class T>
class CompactVector {
  // NOLINTBEGIN(misc-redundant-expression): the sides are equal only when T is pointer-sized
  static constexpr std::uint32_t kInlineCapacity =
      sizeof(T) <= sizeof(void*) && alignof(T) <= alignof(void*) ? 1 : 0;
  // NOLINTEND(misc-redundant-expression)

 public:
  using value_type = T;
  using size_type = std::size_t;
  using iterator = T*;
  using const_iterator = const T*;

  // ---- Construction and assignment ------------------------------------------------------------
  // User-provided, so that a const list of a class without constructor of its own is valid.
  CompactVector() noexcept {}  // NOLINT(modernize-use-equals-default)
  CompactVector(const CompactVector& other) {
    reserve(other.size());
    for (const T& item : other)
      push_back(item);
  }
  CompactVector(CompactVector&& other) noexcept { takeFrom(other); }
  CompactVector& operator=(const CompactVector& other) {
    if (this != &other) {
      CompactVector copy(other);
      swap(copy);
    }
    return *this;
  }
  CompactVector& operator=(CompactVector&& other) noexcept {
    if (this != &other) {
      clear();
      releaseHeap();
      takeFrom(other);
    }
    return *this;
  }
  ~CompactVector() {
    clear();
    releaseHeap();
  }
  void swap(CompactVector& other) noexcept {
    CompactVector held(std::move(other));
    other = std::move(*this);
    *this = std::move(held);
  }

  // ---- Size and access ------------------------------------------------------------------------
  std::size_t size() const noexcept { return size_; }
  bool empty() const noexcept { return size_ == 0; }
  std::size_t capacity() const noexcept { return capacity_; }
  T* data() noexcept { return isInline() ? inlineItems() : heap_; }
  const T* data() const noexcept { return isInline() ? inlineItems() : heap_; }
  T& operator[](std::size_t index) noexcept { return data()[index]; }
  const T& operator[](std::size_t index) const noexcept { return data()[index]; }
  T* begin() noexcept { return data(); }
  T* end() noexcept { return data() + size_; }
  const T* begin() const noexcept { return data(); }
  const T* end() const noexcept { return data() + size_; }

  // ---- Capacity -------------------------------------------------------------------------------
  void reserve(std::size_t capacity) {
    if (capacity > capacity_) relocate(capacity);
  }
  void shrink_to_fit() {
    if (capacity_ > std::max<std::size_t>(size_, kInlineCapacity)) relocate(size_);
  }
  // New items are value-initialised.
  void resize(std::size_t size) {
    if (size < size_) {
      std::destroy(begin() + size, end());
    } else {
      reserve(size);
      std::uninitialized_value_construct(end(), begin() + size);
    }
    size_ = static_cast<std::uint32_t>(size);
  }

  // ---- Adding and removing --------------------------------------------------------------------
  // The arguments may refer to an item of this vector.
  template <class... Args>
  T& emplace_back(Args&&... args) {
    if (size_ < capacity_) {
      T* const added = ::new (static_cast<void*>(end())) T(std::forward<Args>(args)...);
      ++size_;
      return *added;
    }
    // The new item is made before the old ones move, as it may be made from one of them.
    const std::size_t capacity = std::max<std::size_t>(2 * std::size_t{capacity_}, 4);
    T* const fresh = allocate(capacity);
    try {
      ::new (static_cast<void*>(fresh + size_)) T(std::forward<Args>(args)...);
    } catch (...) {
      deallocate(fresh, capacity);
      throw;
    }
    moveItemsTo(fresh);
    adoptHeap(fresh, capacity);
    ++size_;
    return fresh[size_ - 1];
  }
  void push_back(const T& item) { emplace_back(item); }
  void push_back(T&& item) { emplace_back(std::move(item)); }

  T* insert(const T* position, T&& item) {
    const std::size_t index = indexOf(position);
    emplace_back(std::move(item));
    std::rotate(begin() + index, end() - 1, end());
    return begin() + index;
  }
  T* insert(const T* position, std::size_t count, const T& item) {
    const std::size_t index = indexOf(position);
    const T copy(item);  // NOLINT(performance-unnecessary-copy-initialization): item may live in this vector
    reserve(size_ + count);
    for (std::size_t i = 0; i < count; ++i)
      push_back(copy);
    std::rotate(begin() + index, end() - count, end());
    return begin() + index;
  }
  template <class Iterator>
  T* insert(const T* position, Iterator first, Iterator last) {
    const std::size_t index = indexOf(position);
    const std::size_t before = size_;
    for (; first != last; ++first)
      emplace_back(*first);
    std::rotate(begin() + index, begin() + before, end());
    return begin() + index;
  }
  T* erase(const T* position) { return erase(position, position + 1); }
  T* erase(const T* first, const T* last) {
    const std::size_t index = indexOf(first);
    const std::size_t count = indexOf(last) - index;
    T* const tail = std::move(begin() + index + count, end(), begin() + index);
    std::destroy(tail, end());
    size_ -= static_cast<std::uint32_t>(count);
    return begin() + index;
  }
  // Keeps the capacity.
  void clear() noexcept {
    std::destroy(begin(), end());
    size_ = 0;
  }

  friend bool operator==(const CompactVector& a, const CompactVector& b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end());
  }

 private:
  bool isInline() const noexcept { return capacity_ <= kInlineCapacity; }
  T* inlineItems() noexcept { return std::launder(reinterpret_cast<T*>(inline_)); }
  const T* inlineItems() const noexcept { return std::launder(reinterpret_cast<const T*>(inline_)); }
  std::size_t indexOf(const T* position) const noexcept {
    return static_cast<std::size_t>(position - begin());
  }

  static T* allocate(std::size_t capacity) {
    if (capacity > UINT32_MAX) throw std::bad_alloc();
    return std::allocator<T>().allocate(capacity);
  }
  static void deallocate(T* items, std::size_t capacity) noexcept {
    std::allocator<T>().deallocate(items, capacity);
  }
  void releaseHeap() noexcept {
    if (!isInline()) deallocate(heap_, capacity_);
    heap_ = nullptr;
    capacity_ = kInlineCapacity;
  }
  // Moves the items into target and ends their life here; the size stays.
  void moveItemsTo(T* target) noexcept {
    std::uninitialized_move(begin(), end(), target);
    std::destroy(begin(), end());
  }
  void adoptHeap(T* items, std::size_t capacity) noexcept {
    releaseHeap();
    heap_ = items;
    capacity_ = static_cast<std::uint32_t>(capacity);
  }
  // Moves the items into storage for capacity items (inside when they fit there).
  void relocate(std::size_t capacity) {
    if (capacity <= kInlineCapacity) {
      if (isInline()) return;
      T* const heap = heap_;
      const std::uint32_t heapCapacity = capacity_;
      capacity_ = kInlineCapacity;  // the items now go inside, over the heap pointer
      std::uninitialized_move(heap, heap + size_, inlineItems());
      std::destroy(heap, heap + size_);
      deallocate(heap, heapCapacity);
      return;
    }
    T* const fresh = allocate(capacity);
    moveItemsTo(fresh);
    adoptHeap(fresh, capacity);
  }
  void takeFrom(CompactVector& other) noexcept {
    size_ = other.size_;
    capacity_ = other.capacity_;
    if (other.isInline()) {
      capacity_ = kInlineCapacity;
      std::uninitialized_move(other.begin(), other.end(), inlineItems());
      other.clear();
    } else {
      heap_ = other.heap_;
      other.heap_ = nullptr;
      other.size_ = 0;
      other.capacity_ = kInlineCapacity;
    }
  }

  union {
    T* heap_ = nullptr;
    alignas(
        T) unsigned char inline_[kInlineCapacity > 0 ? sizeof(T) : 1];  // NOLINT(modernize-avoid-c-arrays)
  };
  std::uint32_t size_ = 0;
  std::uint32_t capacity_ = kInlineCapacity;
};

}  // namespace vyn_templ
