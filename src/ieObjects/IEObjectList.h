#pragma once

#include <map>
#include <optional>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"

namespace vyn::ie {

class DexObject;

// A named selection of survey objects, kept by object name and read in name order (exact code-unit
// order, case-sensitive) through a cursor.
//
// The list refers to its objects without owning them: destroying, copying or assigning a list never
// deletes or duplicates an object, and the objects must outlive the list (the dataset owns them).
// An object is filed under the name it has when it is added; a name keeps the first object added
// under it.
//
// The cursor belongs to the list, not to a reader: reset() and getNextObjectInTheList() are const so
// that a const list can be walked, and two walks at once disturb each other. A new, copied or
// assigned list reads from its first object.
class DEX_API DexObjectList : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  DexObjectList() = default;
  // The name and the same object references; the cursor on the first object.
  DexObjectList(const DexObjectList& other);
  DexObjectList& operator=(const DexObjectList& other);
  ~DexObjectList() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // Files object under its current name and answers true. Declined (false) for null and when an
  // object of that name is present (the present one stays). The list never owns the object.
  bool addObject(DexObject* object);
  // The object filed under exactly name, or null.
  DexObject* findObjectInTheList(const CVynStringT<wchar_t>& name) const;
  int getNumberOfObjects() const noexcept { return static_cast<int>(objects_.size()); }

  // Reading in name order. reset() puts the cursor on the first object; getNextObjectInTheList()
  // answers the object under the cursor and moves on, null at the end.
  void reset() const noexcept { cursor_.reset(); }
  DexObject* getNextObjectInTheList() const noexcept;

 private:
  using Map = std::map<CVynStringT<wchar_t>, DexObject*>;

  CVynStringT<wchar_t> name_;
  Map objects_;
  // Empty: at the first object.
  mutable std::optional<Map::const_iterator> cursor_;
};

}  // namespace vyn::ie
