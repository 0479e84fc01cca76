#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IEHorizontalElements.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IEStationEquations.h"

// The plan geometry of a road centre line: an ordered chain of elements.
namespace vyn::ie {

// The plan geometry of a road centre line (part kind HORIZONTAL_ALIGNMENT): its elements in the order
// the plug-in adds and inserts them, with the reference to the station-equation set that applies to
// it. The library neither checks nor enforces that an element starts where the one before it ends.
//
// Ownership: the alignment owns its elements and deletes those still in it with itself; the parts
// dictionary owns the alignment; alignments, road strings and parcels refer to it. A copy has copies
// of the elements (see DexCopyAlignmentElement) and refers to the same station-equation set.
class DEX_API DexHorizontalAlignment : public IDexAlignmentPart, public IDexAlignmentStaEq {
 public:
  VYN_CLASS_ALLOCATOR

  // No elements; the part's defaults (see IDexAlignmentPart), no station-equation set.
  DexHorizontalAlignment();
  DexHorizontalAlignment(const DexHorizontalAlignment&);
  DexHorizontalAlignment& operator=(const DexHorizontalAlignment&);
  ~DexHorizontalAlignment() override;

  // HORIZONTAL_ALIGNMENT.
  EDexAlignmentPartType getType() const override { return HORIZONTAL_ALIGNMENT; }

  // ---- Elements -------------------------------------------------------------------------------
  // Appends element and takes ownership: true; false for null.
  bool addSegment(IDexAlignmentObjInterface* element);
  // Inserts element before index (index == count appends) and takes ownership: true. False, with
  // element left to the caller, for null and for an index outside 0 to count.
  bool insertSegmentAt(int index, IDexAlignmentObjInterface* element);
  // Takes the element at index out of the alignment without deleting it: ownership passes back to
  // the caller (take the pointer with getSegmentAt first). False, changing nothing, for an index
  // outside the list.
  bool removeSegmentAt(int index);
  // The element at index, or null for an index outside the list. The alignment keeps ownership.
  IDexAlignmentObjInterface* getSegmentAt(int index) noexcept { return segments_.at(index); }
  const IDexAlignmentObjInterface* getSegmentAt(int index) const noexcept { return segments_.at(index); }
  int getNumberOfSegments() const noexcept { return segments_.count(); }

 private:
  DexOwningList<IDexAlignmentObjInterface, DexCopyAlignmentElement> segments_;
};

}  // namespace vyn::ie
