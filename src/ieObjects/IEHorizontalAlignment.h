#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"

// The parts a road is made of: the common base of horizontal alignments, vertical alignments,
// cross-section sets and road-string sets, the reference to a station-equation set that alignments and
// their plan and profile parts share, and the horizontal alignment.
//
// So far the horizontal alignment holds only what every part holds (name, start, length, start point,
// state); its chain of elements, the other three part kinds and the dictionary that owns the parts of
// an exchange are still to come.
namespace vyn::ie {

class DexDesignPoint;
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

// A part of a road: a horizontal or vertical alignment, a cross-section set or a road-string set, with
// a name, an edit state (1 when new), a start station, a length and the design point it starts at. The
// start point is referred to, not owned. The parts of an exchange belong to its parts dictionary;
// alignments (DexAlignment) and parcels refer to them.
//
// The virtual table after the destructor: setStateType, getStateType, getType, setStartPoint,
// getStartPoint, setStaStart, getStaStart, setLength, getLength (the plug-in ABI); setName and getName
// follow.
class DEX_API IDexAlignmentPart : public IDexStateInterface, public IDexNameInterface {
 public:
  // The four kinds of part; every table indexed by the kind has four entries.
  enum EDexAlignmentPartType : std::int32_t {
    HORIZONTAL_ALIGNMENT_PART = 0,
    VERTICAL_ALIGNMENT_PART = 1,
    CROSS_SECTION_SET_PART = 2,
    ROAD_STRING_SET_PART = 3,
  };
  static constexpr int kNumberOfPartTypes = 4;

  ~IDexAlignmentPart() override;

  void setStateType(ECurrentState state) override { state_ = state; }
  ECurrentState getStateType() const override { return state_; }
  virtual EDexAlignmentPartType getType() const = 0;
  // Stores the reference (null allowed); the point must outlive the part's use of it.
  virtual void setStartPoint(DexDesignPoint* point) { startPoint_ = point; }
  virtual const DexDesignPoint* getStartPoint() const { return startPoint_; }
  virtual void setStaStart(double station) { staStart_ = station; }
  virtual double getStaStart() const { return staStart_; }
  virtual void setLength(double length) { length_ = length; }
  virtual double getLength() const { return length_; }

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

 protected:
  // No start point, start station and length 0, empty name, state 1.
  IDexAlignmentPart() = default;
  IDexAlignmentPart(const IDexAlignmentPart&) = default;
  IDexAlignmentPart& operator=(const IDexAlignmentPart&) = default;

 private:
  DexDesignPoint* startPoint_ = nullptr;
  double staStart_ = 0.0;
  double length_ = 0.0;
  CVynStringT<wchar_t> name_;
  ECurrentState state_ = ACTIVE_STATE;
};

// The plan geometry of a road centre line (part kind HORIZONTAL_ALIGNMENT_PART), with the reference to
// the station-equation set that applies to it.
//
// Not copyable: it will own its chain of elements, and copying that is not offered.
class DEX_API DexHorizontalAlignment : public IDexAlignmentPart, public IDexAlignmentStaEq {
 public:
  VYN_CLASS_ALLOCATOR

  DexHorizontalAlignment();
  DexHorizontalAlignment(const DexHorizontalAlignment&) = delete;
  DexHorizontalAlignment& operator=(const DexHorizontalAlignment&) = delete;
  ~DexHorizontalAlignment() override;

  // HORIZONTAL_ALIGNMENT_PART.
  EDexAlignmentPartType getType() const override { return HORIZONTAL_ALIGNMENT_PART; }
};

}  // namespace vyn::ie
