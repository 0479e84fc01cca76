#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"

// The plan geometry of a road centre line and the reference to the station-equation set that
// alignments and their plan and profile parts share.
//
// So far the horizontal alignment holds only what every part holds (name, start, length, start point,
// state); its chain of elements is still to come.
namespace vyn::ie {

class DexStaEquationSet;

// The station-equation set that applies to an alignment or to its horizontal or vertical part. The set
// is referred to, not owned: it belongs to the station-equation dictionary of the exchange data.
//
// The two operations come first in the virtual table and the destructor last: that order is the plug-in
// ABI.
class DEX_API IDexAlignmentStaEq {
 public:
  IDexAlignmentStaEq() = default;
  IDexAlignmentStaEq(const IDexAlignmentStaEq&) = default;
  IDexAlignmentStaEq& operator=(const IDexAlignmentStaEq&) = default;

  // Stores the reference (null allowed).
  virtual void setStaEquationSet(const DexStaEquationSet* set) { staEquationSet_ = set; }
  virtual const DexStaEquationSet* getStaEquationSet() const { return staEquationSet_; }
  virtual ~IDexAlignmentStaEq();

 private:
  const DexStaEquationSet* staEquationSet_ = nullptr;
};

// The plan geometry of a road centre line (part kind HORIZONTAL_ALIGNMENT), with the reference to the
// station-equation set that applies to it. Its parts dictionary owns it; alignments and parcels refer
// to it.
//
// Not copyable: it will own its chain of elements, and copying that is not offered.
class DEX_API DexHorizontalAlignment : public IDexAlignmentPart, public IDexAlignmentStaEq {
 public:
  VYN_CLASS_ALLOCATOR

  DexHorizontalAlignment();
  DexHorizontalAlignment(const DexHorizontalAlignment&) = delete;
  DexHorizontalAlignment& operator=(const DexHorizontalAlignment&) = delete;
  ~DexHorizontalAlignment() override;

  // HORIZONTAL_ALIGNMENT.
  EDexAlignmentPartType getType() const override { return HORIZONTAL_ALIGNMENT; }
};

}  // namespace vyn::ie
