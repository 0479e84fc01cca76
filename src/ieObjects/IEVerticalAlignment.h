#pragma once

#include <memory>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynCompactVector.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IEStationEquations.h"
#include "ieObjects/IETypedValues.h"

// The profile (levels along the stations) of a road. Exchange formats describe a profile in one of two
// ways, so a vertical alignment keeps two independent lists side by side: vertical elements (typed
// records of twelve numbers) and long sections (typed records of five numbers at a station, optionally
// tied to a parabola element). A plug-in fills whichever its format uses; the library computes nothing
// from either.
//
// The element types and the meaning of the values are what the plug-ins that write and read a profile
// agree on; the names below are the layout that the shipped plug-ins use. The library reads none of
// them, except that datum 8 (a curve length) has no meaning for element type 0 (a vertex without a
// curve): reading it writes an error-log record (source ieObjects\IEAlignmentPartsDictionary, line
// 821, empty message).
namespace vyn::ie {

// One element of a profile: its type, fixed at construction, and twelve values.
class DEX_API DexVerticalElement {
 public:
  VYN_CLASS_ALLOCATOR

  enum EElementType : int {
    VERTEX = 0,               // a point of intersection of two grades, without a curve
    PARABOLA = 1,             // a symmetric parabolic vertical curve at a vertex
    ASYMMETRIC_PARABOLA = 2,  // a parabola with different lengths before and after the vertex
    CIRCULAR_CURVE = 3,       // a circular vertical curve at a vertex
  };
  enum EVEDataType : int {
    VERTEX_STATION = 0,
    VERTEX_LEVEL = 1,
    GRADE_IN = 2,  // the grade before the vertex
    GRADE_OUT = 3,
    START_STATION = 4,  // of the curve
    START_LEVEL = 5,
    END_STATION = 6,
    END_LEVEL = 7,
    CURVE_LENGTH = 8,  // none for a VERTEX
    LENGTH_IN = 9,     // of an asymmetric parabola, before the vertex
    LENGTH_OUT = 10,
    RADIUS = 11,
  };
  static constexpr int kNumberOfDataTypes = 12;

  // Every value 0.0.
  explicit DexVerticalElement(EElementType elementType) : elementType_(elementType) {}
  DexVerticalElement(const DexVerticalElement&) = default;
  DexVerticalElement& operator=(const DexVerticalElement&) = default;
  virtual ~DexVerticalElement();

  EElementType getElementType() const noexcept { return elementType_; }
  // The value of kind; 0.0 for a kind outside 0 to 11, which setData ignores. Reading CURVE_LENGTH of
  // a VERTEX writes the error-log record and answers the stored value.
  double getData(int kind) const;
  void setData(int kind, double value) { data_.set(kind, value); }

 private:
  EElementType elementType_;
  DexTypedValues<EVEDataType, kNumberOfDataTypes> data_;
};

// A long section: a typed record of five values at a station (value 0), optionally tied to a parabola
// element of the same vertical alignment (not owned).
class DEX_API DexLongSection {
 public:
  VYN_CLASS_ALLOCATOR

  enum ELSType : int {
    LEVEL_POINT = 0,  // a level at a station, the grades meeting there without a curve
    PARABOLA_POINT = 1,
    CIRCULAR_POINT = 2,
  };
  enum ELSDataType : int {
    STATION = 0,  // the key of DexVerticalAlignment::findLongSection
    LEVEL = 1,
    GRADE = 2,
    CURVE_LENGTH = 3,
    RADIUS = 4,
  };
  static constexpr int kNumberOfDataTypes = 5;

  // Every value 0.0, no parabola.
  explicit DexLongSection(ELSType lsType) : lsType_(lsType) {}
  DexLongSection(const DexLongSection&) = default;
  DexLongSection& operator=(const DexLongSection&) = default;
  virtual ~DexLongSection();

  ELSType getLSType() const noexcept { return lsType_; }
  // The value of kind; 0.0 for a kind outside 0 to 4, which setData ignores.
  double getData(int kind) const { return data_.get(kind); }
  void setData(int kind, double value) { data_.set(kind, value); }

  // The parabola element the section belongs to, referred to and not owned: it is expected to be one
  // of the vertical alignment's elements.
  const DexVerticalElement* getParabola() const noexcept { return parabola_; }
  void setParabola(const DexVerticalElement* parabola) noexcept { parabola_ = parabola; }

 private:
  ELSType lsType_;
  DexTypedValues<ELSDataType, kNumberOfDataTypes> data_;
  const DexVerticalElement* parabola_ = nullptr;
};

// The profile of a road (part kind VERTICAL_ALIGNMENT): its long sections and its vertical elements,
// with the reference to the station-equation set that applies to it.
//
// Ownership: the alignment owns its long sections and elements and deletes them with itself, the long
// sections first; the parts dictionary owns the alignment. A copy has copies of both lists, and a
// copied long section that was tied to one of the original's elements is tied to the copy of it.
class DEX_API DexVerticalAlignment : public IDexAlignmentPart, public IDexAlignmentStaEq {
 public:
  VYN_CLASS_ALLOCATOR

  // No long sections or elements; the part's defaults (see IDexAlignmentPart).
  DexVerticalAlignment();
  DexVerticalAlignment(const DexVerticalAlignment& other);
  DexVerticalAlignment& operator=(const DexVerticalAlignment& other);
  ~DexVerticalAlignment() override;

  // VERTICAL_ALIGNMENT.
  EDexAlignmentPartType getType() const override { return VERTICAL_ALIGNMENT; }

  // ---- Vertical elements ----------------------------------------------------------------------
  // Appends element and takes ownership: true; false for null.
  bool addVerticalElement(DexVerticalElement* element) { return verticalElements_.add(element); }
  int getNumberOfVerticalElements() const noexcept { return verticalElements_.count(); }
  // The element at index, or null for an index outside the list.
  const DexVerticalElement* getVerticalElementAt(int index) const noexcept {
    return verticalElements_.at(index);
  }
  DexVerticalElement* getVerticalElementAt(int index) noexcept { return verticalElements_.at(index); }

  // ---- Long sections --------------------------------------------------------------------------
  // Appends section and takes ownership. A null section is appended too, as an empty entry: readers
  // of the list skip null entries, as findLongSection does.
  void addLongSection(DexLongSection* section);
  int getNumberOfLongSections() const noexcept { return static_cast<int>(longSections_.size()); }
  // The section at index (null for an empty entry), or null for an index outside the list.
  const DexLongSection* getLongSectionAt(int index) const noexcept;
  DexLongSection* getLongSectionAt(int index) noexcept;
  // The first section, in list order, whose station (value 0) equals station exactly; null when none.
  const DexLongSection* findLongSection(double station) const;
  DexLongSection* findLongSection(double station);

 private:
  void copyLongSectionsOf(const DexVerticalAlignment& other);

  // Declared in this order so that the long sections, which may refer to elements, go first.
  DexOwningList<DexVerticalElement> verticalElements_;
  vyn_templ::CompactVector<std::unique_ptr<DexLongSection>> longSections_;
};

}  // namespace vyn::ie
