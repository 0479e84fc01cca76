#pragma once

#include <memory>
#include <type_traits>
#include <utility>

#include "ieObjects/IEOwningList.h"

namespace vyn::ie {

// Copy policy of DexOwnedPointer for a member typed as a concrete class of a polymorphic family whose
// clone() answers the family's base (an area's DexDrawAreaProperties, whose clone() answers an
// IDexDrawProperties*): the clone keeps the item's own class. A clone of another class is deleted and
// the copy holds nothing.
struct DexCopyByCloneAs {
  template <class T>
  static T* copy(const T& item) {
    auto cloned = std::unique_ptr<std::remove_pointer_t<decltype(item.clone())>>(item.clone());
    T* const typed = dynamic_cast<T*>(cloned.get());
    if (typed != nullptr) static_cast<void>(cloned.release());
    return typed;
  }
};

// One owned object behind a pointer, or nothing: the storage behind every "owned pointer" member of the
// data model (the drawing properties and photo notes of a survey object). The held object is deleted
// when it is replaced and with the holder.
//
// Copy construction and assignment duplicate the held object through CopyPolicy (the policies of
// IEOwningList.h, or DexCopyByCloneAs above), so a copy never shares it; self-assignment changes
// nothing.
template <class T, class CopyPolicy = DexCopyByConstructor>
class DexOwnedPointer {
 public:
  DexOwnedPointer() noexcept = default;
  // Takes ownership of object (null allowed).
  explicit DexOwnedPointer(T* object) noexcept : object_(object) {}
  DexOwnedPointer(const DexOwnedPointer& other) : object_(copyOf(other.object_.get())) {}
  DexOwnedPointer(DexOwnedPointer&& other) noexcept = default;
  DexOwnedPointer& operator=(const DexOwnedPointer& other) {
    if (&other != this) reset(copyOf(other.object_.get()));
    return *this;
  }
  DexOwnedPointer& operator=(DexOwnedPointer&& other) noexcept = default;
  ~DexOwnedPointer() = default;

  T* get() const noexcept { return object_.get(); }
  explicit operator bool() const noexcept { return object_ != nullptr; }

  // Takes ownership of object (null allowed) and deletes the object held before, unless it is the
  // same pointer, which changes nothing.
  void reset(T* object = nullptr) noexcept {
    if (object != object_.get()) object_.reset(object);
  }
  // Gives up the held object without deleting it: the caller owns the result (null when empty).
  T* release() noexcept { return object_.release(); }

 private:
  static T* copyOf(const T* object) { return object != nullptr ? CopyPolicy::copy(*object) : nullptr; }

  std::unique_ptr<T> object_;
};

}  // namespace vyn::ie
