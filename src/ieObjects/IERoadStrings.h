#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"

// Road strings: named lines running along a road (kerbs, edges, ditches) whose geometry is given by
// pairs of horizontal and vertical alignments of the parts dictionary, and the road-string set, the
// fourth alignment part kind, that groups the strings of a road.
//
// Error-log records (source ieObjects\IEAlignmentPartsDictionary, empty message):
// - line 831: DexRoadString::addRoadStringPair() was given a null pair;
// - line 832: DexRoadStringSet::addRoadString() was given a null road string.
namespace vyn::ie {

class DexHorizontalAlignment;
class DexVerticalAlignment;

// A horizontal and a vertical alignment that together give a stretch of a road string; either may be
// null. The pair refers to the alignments without owning them (the parts dictionary owns them).
struct DEX_API DexRoadStringPair {
  VYN_CLASS_ALLOCATOR

  DexRoadStringPair(const DexHorizontalAlignment* horizontalAlignment,
                    const DexVerticalAlignment* verticalAlignment)
      : horizontal(horizontalAlignment), vertical(verticalAlignment) {}

  const DexHorizontalAlignment* horizontal;
  const DexVerticalAlignment* vertical;
};

// A named line of a road: its alignment pairs in order, a start station and a length. The string owns
// its pairs; copies duplicate them (the alignments stay shared). The virtual operations keep their
// order: destructor, setName, getName, setStaStart, getStaStart, setLength, getLength.
class DEX_API DexRoadString : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // No pairs, no name, start station and length 0.0.
  DexRoadString() = default;
  DexRoadString(const DexRoadString&) = default;
  DexRoadString& operator=(const DexRoadString&) = default;
  ~DexRoadString() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  virtual void setStaStart(double station) { staStart_ = station; }
  virtual double getStaStart() const { return staStart_; }
  virtual void setLength(double length) { length_ = length; }
  virtual double getLength() const { return length_; }

  // ---- Pairs (owned) --------------------------------------------------------------------------
  // Appends pair and takes ownership; null adds nothing and is written to the error log (line 831).
  void addRoadStringPair(DexRoadStringPair* pair);
  int getNumberOfRoadStringPairs() const noexcept { return pairs_.count(); }
  // The pair at index, or null outside the list.
  DexRoadStringPair* getRoadStringPairAt(int index) noexcept { return pairs_.at(index); }
  const DexRoadStringPair* getRoadStringPairAt(int index) const noexcept { return pairs_.at(index); }

 private:
  DexOwningList<DexRoadStringPair> pairs_;
  double staStart_ = 0.0;
  double length_ = 0.0;
  CVynStringT<wchar_t> name_;
};

// The road strings of a road: the fourth alignment part kind. The set owns its strings; copies
// duplicate them.
class DEX_API DexRoadStringSet : public IDexAlignmentPart {
 public:
  VYN_CLASS_ALLOCATOR

  DexRoadStringSet() = default;
  DexRoadStringSet(const DexRoadStringSet&) = default;
  DexRoadStringSet& operator=(const DexRoadStringSet&) = default;
  ~DexRoadStringSet() override;

  // ROAD_STRING_SET.
  EDexAlignmentPartType getType() const override { return ROAD_STRING_SET; }

  // Appends roadString and takes ownership; null adds nothing and is written to the error log
  // (line 832).
  void addRoadString(DexRoadString* roadString);
  int getNumberOfRoadStrings() const noexcept { return roadStrings_.count(); }
  // The road string at index, or null outside the list.
  DexRoadString* getRoadStringAt(int index) noexcept { return roadStrings_.at(index); }
  const DexRoadString* getRoadStringAt(int index) const noexcept { return roadStrings_.at(index); }

  // Whether a pair of some road string names part: a horizontal alignment named like the horizontal
  // alignment of a pair, or a vertical alignment named like the vertical alignment of a pair. Matching
  // is by kind and name, not by object, so another part of the same kind and name counts as used.
  // False for null and for parts of the other two kinds.
  bool isAlignmentPartUsed(const IDexAlignmentPart* part) const;

 private:
  DexOwningList<DexRoadString> roadStrings_;
};

}  // namespace vyn::ie
