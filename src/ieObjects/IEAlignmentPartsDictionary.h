#pragma once

#include <array>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"

// The reusable parts of roads (horizontal and vertical alignments, cross-section sets, road-string
// sets) and the one dictionary of an exchange that owns them all. Alignments refer to parts without
// owning them.
//
// Error-log records (source ieObjects\IEAlignmentPartsDictionary, empty message):
// - line 801: a null part was handed to DexAlignmentPartsDictionary::addAlignmentPart();
// - line 802: a part kind outside 0 to 3 was given to the dictionary (as an argument, or as the
//   getType() of a part to add).
namespace vyn::ie {

class DexDesignPoint;

// The common base of the four part kinds: a start point (a design point of a dataset, not owned), the
// station of the start, a length, a name and an edit state (ACTIVE_STATE when new). The part classes
// give the kind through getType().
//
// The virtual operations of the primary table are in their fixed order (the plug-in ABI): destructor,
// setStateType, getStateType, getType, setStartPoint, getStartPoint, setStaStart, getStaStart,
// setLength, getLength; setName and getName are in the IDexNameInterface table.
class DEX_API IDexAlignmentPart : public IDexStateInterface, public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The part kinds; every table indexed by a kind has kNumberOfPartTypes entries.
  enum EDexAlignmentPartType : int {
    HORIZONTAL_ALIGNMENT = 0,
    VERTICAL_ALIGNMENT = 1,
    CROSS_SECTION_SET = 2,
    ROAD_STRING_SET = 3,
  };
  static constexpr int kNumberOfPartTypes = 4;

  ~IDexAlignmentPart() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  void setStateType(ECurrentState state) override { state_ = state; }
  ECurrentState getStateType() const override { return state_; }
  virtual EDexAlignmentPartType getType() const = 0;
  // The start point is a point of a dataset; the part refers to it without owning it.
  virtual void setStartPoint(DexDesignPoint* startPoint) { startPoint_ = startPoint; }
  virtual const DexDesignPoint* getStartPoint() const { return startPoint_; }
  virtual void setStaStart(double staStart) { staStart_ = staStart; }
  virtual double getStaStart() const { return staStart_; }
  virtual void setLength(double length) { length_ = length; }
  virtual double getLength() const { return length_; }

  // ---- Name -----------------------------------------------------------------------------------
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

 protected:
  // No start point, start station and length 0, an empty name, ACTIVE_STATE.
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

// The alignment parts of one exchange: one list per part kind, in order of addition. The dictionary
// owns every part it holds and deletes them with itself; it is not copied (parts are shared by
// reference between alignments, so a copy could not tell which references to move).
class DEX_API DexAlignmentPartsDictionary {
 public:
  VYN_CLASS_ALLOCATOR

  using EDexAlignmentPartType = IDexAlignmentPart::EDexAlignmentPartType;

  DexAlignmentPartsDictionary() = default;
  DexAlignmentPartsDictionary(const DexAlignmentPartsDictionary&) = delete;
  DexAlignmentPartsDictionary& operator=(const DexAlignmentPartsDictionary&) = delete;
  virtual ~DexAlignmentPartsDictionary();

  // Appends part to the list of its kind and takes ownership: true. Names are not checked. Declined
  // (false; the caller keeps part) with an error-log record for null (line 801) and for a part whose
  // getType() is outside 0 to 3 (line 802). A part the dictionary holds already changes nothing and
  // answers true.
  bool addAlignmentPart(IDexAlignmentPart* part);

  // The number of parts of that kind; -1 and an error-log record (line 802) for a kind outside 0 to 3.
  int getNumberOfElements(int kind) const;
  // The part at index in the list of that kind, or null for an index outside the list (and, with an
  // error-log record, line 802, for a kind outside 0 to 3).
  IDexAlignmentPart* getAlignmentPartAt(int kind, int index);
  const IDexAlignmentPart* getAlignmentPartAt(int kind, int index) const;
  // The first part of that kind, in order of addition, whose name equals name exactly (case-sensitive);
  // null when there is none (and, with an error-log record, line 802, for a kind outside 0 to 3).
  IDexAlignmentPart* findAlignmentPart(int kind, const CVynStringT<wchar_t>& name);
  const IDexAlignmentPart* findAlignmentPart(int kind, const CVynStringT<wchar_t>& name) const;

  // True when some horizontal alignment, or failing that some vertical alignment, starts at a point
  // named pointName exactly. Cross-section sets and road-string sets are not looked at.
  bool isPointUsedAsStartPoint(const CVynStringT<wchar_t>& pointName) const;

 private:
  using PartList = DexOwningList<IDexAlignmentPart>;

  // The list of kind, or null with an error-log record (line 802) for a kind outside 0 to 3.
  PartList* listOf(int kind);
  const PartList* listOf(int kind) const;
  bool isStartPointOfAnyPart(int kind, const CVynStringT<wchar_t>& pointName) const;

  std::array<PartList, IDexAlignmentPart::kNumberOfPartTypes> parts_;
};

}  // namespace vyn::ie
