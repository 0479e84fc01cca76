#pragma once

#include <array>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEStationEquations.h"
#include "ieObjects/IEVerticalAlignment.h"

// Alignments of a dataset: named roads made of parts.
//
// Error-log records (source ieObjects\IEAlignment, empty message):
// - line 741: setAlignmentPart() was given a null part;
// - line 742: getAlignmentPart() was asked for a part kind outside 0 to 3.
namespace vyn::ie {

class DexLayer;

// A road of a dataset: a name, an edit state (1 when new), a start station, a length, a station
// interval, corridor offsets, a layer, drawing properties, the station-equation set that applies to it
// and the parts it is made of (horizontal and vertical alignments, cross-section sets, road-string
// sets). The first part of each kind given to it is its primary part of that kind.
//
// Ownership: the alignment owns its drawing properties. It refers to its parts, its layer and its
// station-equation set without owning them (the parts dictionary and the station-equation dictionary of
// the exchange data own those); several alignments may share a part. Copy construction and assignment
// copy the references and duplicate the drawing properties.
//
// The virtual table after the destructor: getType, setStaStart, getStaStart, setLength, getLength,
// setCorridorLeftOffset, getCorridorLeftOffset, setCorridorRightOffset, getCorridorRightOffset (the
// plug-in ABI); the state, name and station-equation operations follow.
class DEX_API DexAlignment : public IDexObjInterface,
                             public IDexStateInterface,
                             public IDexNameInterface,
                             public IDexAlignmentStaEq {
 public:
  VYN_CLASS_ALLOCATOR

  // ---- Construction ---------------------------------------------------------------------------
  // No parts, layer or drawing properties; start station, length and interval 0; no corridor offsets;
  // empty name; state 1.
  DexAlignment();
  DexAlignment(const DexAlignment&) = default;
  DexAlignment& operator=(const DexAlignment&) = default;
  ~DexAlignment() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  // OBJECT_TYPE_ALIGNMENT.
  EDexObjectsType getType() override;
  // The alignment's own start station and length; they are not derived from its parts.
  virtual void setStaStart(double station) { staStart_ = station; }
  virtual double getStaStart() const { return staStart_; }
  virtual void setLength(double length) { length_ = length; }
  virtual double getLength() const { return length_; }
  // A NaN clears the offset (hasCorridor...Offset() false, value 0); any other value sets it.
  virtual void setCorridorLeftOffset(double offset);
  // The offset, 0.0 when none is set.
  virtual double getCorridorLeftOffset() const { return corridorLeftOffset_; }
  virtual void setCorridorRightOffset(double offset);
  virtual double getCorridorRightOffset() const { return corridorRightOffset_; }

  void setStateType(ECurrentState state) override { state_ = state; }
  ECurrentState getStateType() const override { return state_; }
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // ---- Parts (not owned) ----------------------------------------------------------------------
  // Adds a reference to part: it becomes the primary part of its kind when the alignment has none of
  // that kind yet, and it is listed among the parts in every case (a part given twice is listed twice).
  // A null part is refused with an error-log record (line 741).
  void setAlignmentPart(IDexAlignmentPart* part);
  // The primary part of type (an IDexAlignmentPart::EDexAlignmentPartType value or its number), or null
  // when there is none. A type outside 0 to 3 answers null after an error-log record (line 742).
  IDexAlignmentPart* getAlignmentPart(int type) const;
  // Whether part is among the alignment's parts (the same object). With deep, also whether one of its
  // road-string sets names part in one of its pairs (by kind and name). False for null.
  bool isAlignPartIncluded(const IDexAlignmentPart* part, bool deep) const;
  // Every part given to the alignment, in the order given, primary parts included (a part given twice
  // is listed twice).
  int getNumberOfAlignmentParts() const noexcept { return static_cast<int>(parts_.size()); }
  // The part at index in that list, or null for an index outside it.
  IDexAlignmentPart* getAlignmentPartAt(int index) const noexcept;

  // ---- Further properties ---------------------------------------------------------------------
  // False, with interval unchanged, while no interval above 0 is set; otherwise the interval and true.
  bool getStnInterval(double& interval) const;
  // Stores an interval above 0 and answers true; any other value is refused (false) and the interval
  // set before stays.
  bool setStnInterval(double interval);
  bool hasCorridorLeftOffset() const noexcept { return hasCorridorLeftOffset_; }
  bool hasCorridorRightOffset() const noexcept { return hasCorridorRightOffset_; }
  const DexLayer* getLayer() const noexcept { return layer_; }
  void setLayer(const DexLayer* layer) noexcept { layer_ = layer; }
  const IDexDrawProperties* getDrawProperties() const noexcept { return drawProperties_.get(); }
  // Takes ownership of properties (null allowed) and deletes the object held before, unless it is the
  // same pointer.
  void setDrawProperties(IDexDrawProperties* properties) noexcept { drawProperties_.reset(properties); }

 private:
  std::array<IDexAlignmentPart*, IDexAlignmentPart::kNumberOfPartTypes> primaryParts_{};
  const DexLayer* layer_ = nullptr;
  DexOwnedPointer<IDexDrawProperties, DexCopyByClone> drawProperties_;
  double staStart_ = 0.0;
  double length_ = 0.0;
  double stnInterval_ = 0.0;
  double corridorLeftOffset_ = 0.0;
  double corridorRightOffset_ = 0.0;
  bool hasCorridorLeftOffset_ = false;
  bool hasCorridorRightOffset_ = false;
  CVynStringT<wchar_t> name_;
  ECurrentState state_ = ACTIVE_STATE;
  vyn_vector<IDexAlignmentPart*> parts_;
};

}  // namespace vyn::ie
