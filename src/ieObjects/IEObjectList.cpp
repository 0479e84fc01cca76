#include "ieObjects/IEObjectList.h"

#include "ieObjects/IEObjectBase.h"

namespace vyn::ie {

// The cursor is not copied: an iterator into the other list's map would walk that map.
DexObjectList::DexObjectList(const DexObjectList& other)
    : IDexNameInterface(other), name_(other.name_), objects_(other.objects_) {}

DexObjectList& DexObjectList::operator=(const DexObjectList& other) {
  if (&other != this) {
    name_ = other.name_;
    objects_ = other.objects_;
    cursor_.reset();
  }
  return *this;
}

DexObjectList::~DexObjectList() = default;

bool DexObjectList::addObject(DexObject* object) {
  if (object == nullptr) return false;
  return objects_.try_emplace(object->getName(), object).second;
}

DexObject* DexObjectList::findObjectInTheList(const CVynStringT<wchar_t>& name) const {
  const auto found = objects_.find(name);
  return found != objects_.end() ? found->second : nullptr;
}

DexObject* DexObjectList::getNextObjectInTheList() const noexcept {
  if (!cursor_) cursor_ = objects_.cbegin();
  auto& position = *cursor_;
  if (position == objects_.cend()) return nullptr;
  DexObject* const object = position->second;
  ++position;
  return object;
}

}  // namespace vyn::ie
