#pragma once

#include <memory>
#include <vector>

#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEObjectBase.h"

// Helpers of the dataset's walks over its objects, shared by its source files.
namespace vyn::ie::detail {

// Calls visit(DexObject&) for every object of the list in order, passing over the empty slots.
template <class Visit>
void forEachObject(const std::vector<std::unique_ptr<DexObject>>& objects, Visit&& visit) {
  for (const std::unique_ptr<DexObject>& object : objects) {
    if (object != nullptr) visit(*object);
  }
}

// The number of objects for which count(DexObject&) is true.
template <class Count>
int countObjects(const std::vector<std::unique_ptr<DexObject>>& objects, Count&& count) {
  int result = 0;
  forEachObject(objects, [&](DexObject& object) {
    if (count(object)) ++result;
  });
  return result;
}

// ANY_STATE passes every object; any other state only the objects in exactly that state.
inline bool isInState(const DexObject& object, int state) {
  return state == IDexStateInterface::ANY_STATE || object.getStateType() == state;
}

}  // namespace vyn::ie::detail
