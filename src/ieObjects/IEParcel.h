#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"

// Parcels of a dataset.
//
// Error-log record (source ieObjects\IEParcel, empty message):
// - line 711: setHAlignment() was given a null alignment.
namespace vyn::ie {

class DexDesignPoint;
class DexHorizontalAlignment;

// A parcel: a named link between a horizontal alignment and a central design point.
//
// The parcel refers to both without owning them: the alignment belongs to the alignment parts
// dictionary of the exchange data and the point to the dataset, and both must outlive the parcel's use
// of them. Copy construction and assignment copy the two references and the name.
//
// The virtual table after the destructor: getType, setCentralPoint, getCentralPoint (the plug-in ABI);
// setName and getName follow.
class DEX_API DexParcel : public IDexObjInterface, public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // No alignment, no central point, empty name.
  DexParcel() = default;
  DexParcel(const DexParcel&) = default;
  DexParcel& operator=(const DexParcel&) = default;
  ~DexParcel() override;

  // OBJECT_TYPE_PARCEL.
  EDexObjectsType getType() override;
  // Stores the reference (null allowed).
  virtual void setCentralPoint(DexDesignPoint* point) { centralPoint_ = point; }
  virtual DexDesignPoint* getCentralPoint() const { return centralPoint_; }

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // Stores the reference. A null alignment is refused with an error-log record (line 711) and the
  // alignment set before stays.
  void setHAlignment(DexHorizontalAlignment* alignment);
  DexHorizontalAlignment* getHAlignment() const noexcept { return hAlignment_; }

 private:
  DexHorizontalAlignment* hAlignment_ = nullptr;
  DexDesignPoint* centralPoint_ = nullptr;
  CVynStringT<wchar_t> name_;
};

}  // namespace vyn::ie
