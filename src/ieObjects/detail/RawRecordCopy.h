#pragma once

#include "ieObjects/IEOwnedPointer.h"

// The copy rules the raw records share: owned value records, which setters copy rather than take, and
// the clone of a record.
namespace vyn::ie::detail {

// Null removes the held record; otherwise the held record (made when there is none) becomes a copy
// of *value. Handing in the held record itself changes nothing.
template <class T>
void assignHeldCopy(DexOwnedPointer<T>& held, const T* value) {
  if (value == nullptr) {
    held.reset();
  } else if (held.get() == nullptr) {
    held.reset(new T(*value));
  } else if (held.get() != value) {
    *held.get() = *value;
  }
}

// Copies the held record into out and answers true; false, leaving out alone, when none is held.
template <class T>
bool copyHeldInto(const DexOwnedPointer<T>& held, T& out) {
  if (held.get() == nullptr) return false;
  out = *held.get();
  return true;
}

// A new object made by make() and filled by fill(object); null, with nothing filled, when memory runs
// out (the class allocators answer null).
template <class Make, class Fill>
auto makeFilled(Make make, Fill fill) {
  auto* const object = make();
  if (object != nullptr) fill(object);
  return object;
}

}  // namespace vyn::ie::detail
