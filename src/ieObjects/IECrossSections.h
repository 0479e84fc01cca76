#pragma once

#include <map>
#include <set>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IEOwningMap.h"
#include "ieObjects/IETypedValues.h"

// The shape of a road across its centre line: template segments, road templates and the dictionary of
// an exchange that owns them; cross sections placing templates at stations, and the cross-section set
// (an alignment part) that owns the cross sections of a road. Cross sections refer to templates
// without owning them.
namespace vyn::ie {

class DexVerticalAlignment;

// One point across the road: an offset (negative on the left of the centre line) and a height, with a
// name (a code or label). Whether offsets and heights are taken from the centre line or from the
// previous point is a property of the templates dictionary. The virtual operations keep their order:
// destructor, setName, getName, setData, getData.
class DEX_API DexTemplateSegment : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  enum ETSDataType : int {
    OFFSET = 0,
    HEIGHT = 1,
  };

  // No name, offset and height 0.0.
  DexTemplateSegment() = default;
  DexTemplateSegment(double offset, double height, const CVynStringT<wchar_t>& name = {});
  DexTemplateSegment(const DexTemplateSegment&) = default;
  DexTemplateSegment& operator=(const DexTemplateSegment&) = default;
  ~DexTemplateSegment() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  // A kind outside 0 to 1 is ignored by setData and reads as 0.0.
  virtual void setData(int kind, double value) { data_.set(kind, value); }
  virtual double getData(int kind) const { return data_.get(kind); }

  // A new segment with the same name, offset and height, owned by the caller.
  DexTemplateSegment* clone() const;

 private:
  DexTypedValues<ETSDataType, 2> data_;
  CVynStringT<wchar_t> name_;
};

// A named road template: its segments in order across the road and two values that the plug-ins give
// their meaning. The template owns its segments; copies duplicate them. The virtual operations keep
// their order: destructor, setName, getName, setData, getData.
class DEX_API DexRoadTemplate : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The two values of a template; the library reads neither.
  enum ECSDataType : int {
    TEMPLATE_VALUE_1 = 0,
    TEMPLATE_VALUE_2 = 1,
  };

  // No name, no segments, both values 0.0.
  DexRoadTemplate() = default;
  explicit DexRoadTemplate(const CVynStringT<wchar_t>& name) : name_(name) {}
  DexRoadTemplate(const DexRoadTemplate&) = default;
  DexRoadTemplate& operator=(const DexRoadTemplate&) = default;
  ~DexRoadTemplate() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  // A kind outside 0 to 1 is ignored by setData and reads as 0.0.
  virtual void setData(int kind, double value) { data_.set(kind, value); }
  virtual double getData(int kind) const { return data_.get(kind); }

  // ---- Segments (owned) -----------------------------------------------------------------------
  // Appends segment and takes ownership; null is ignored.
  void addSegment(DexTemplateSegment* segment) { segments_.add(segment); }
  // Inserts segment before index and takes ownership; index == count appends. Null or an index outside
  // 0 to count is ignored and the segment stays with the caller.
  void insertTemplateAt(int index, DexTemplateSegment* segment) { segments_.insert(index, segment); }
  int getNumberOfSegments() const noexcept { return segments_.count(); }
  // The segment at index, or null outside the list.
  DexTemplateSegment* getSegmentAt(int index) noexcept { return segments_.at(index); }
  const DexTemplateSegment* getSegmentAt(int index) const noexcept { return segments_.at(index); }
  // The index of the first segment with exactly the offset, height (a NaN never matches) and name of
  // segment; -1 when none matches or segment is null.
  int findSegment(const DexTemplateSegment* segment) const;

  // ---- Fitting a template to a format's conventions -------------------------------------------
  // The height of the first segment whose offset, rounded to 3 decimals, lies within 0.1 of the centre
  // line; 0.0 when there is none.
  double getCLHeight() const;
  // Subtracts height from the height of every segment.
  void removeCLHeight(double height);
  // Sorts the segments by offset, ascending (equal offsets may change places).
  void makeOffsetsOrdered();
  // Mirrors negative offsets to positive ones. With reorder, each mirrored segment is moved behind the
  // last segment of smaller offset, so a template listed from left to right ends in ascending order
  // with a mirrored point before right-side points of equal offset.
  void makeOffsetsPositiveAndOrdered(bool reorder);
  // Splits off the left side: a new template of the same name (owned by the caller) with the segments
  // of negative offset moved into it and a copy of each centre point (offset exactly 0); null when
  // there is no left side beyond the centre point. A template left holding only its centre point is
  // emptied. The offsets of the result stay negative.
  DexRoadTemplate* separateLeftPart();
  // Whether other has this template's name and, after rounding to 3 decimals, the offsets, heights and
  // names of this template's first segments (two empty names are equal, one empty name is not). Without
  // adjust the counts must agree. With adjust they may differ by one: a centre point (offset and height
  // 0) that only other has at its front, or failing that at its end, is first copied into this
  // template, which isEqual thus changes.
  bool isEqual(const DexRoadTemplate* other, bool adjust);

 private:
  void addCentrePointMissingHere(const DexRoadTemplate& other);

  DexOwningList<DexTemplateSegment> segments_;
  DexTypedValues<ECSDataType, 2> data_;
  CVynStringT<wchar_t> name_;
};

// The road templates of one exchange by name, read in name order (exact code-unit order,
// case-sensitive), with the two conventions every template of the dictionary follows: offsets from
// the centre line (or from the previous point) and absolute heights (or heights relative to the
// previous point). The dictionary owns its templates and deletes them with itself; it is not copied.
class DEX_API DexRoadTemplatesDictionary {
 public:
  VYN_CLASS_ALLOCATOR

  using const_iterator = DexOwningMap<CVynStringT<wchar_t>, DexRoadTemplate>::const_iterator;

  DexRoadTemplatesDictionary(bool centralOffsets, bool absHeights)
      : centralOffsetsUsed_(centralOffsets), absHeightsUsed_(absHeights) {}
  DexRoadTemplatesDictionary(const DexRoadTemplatesDictionary&) = delete;
  DexRoadTemplatesDictionary& operator=(const DexRoadTemplatesDictionary&) = delete;
  virtual ~DexRoadTemplatesDictionary();

  // Files roadTemplate under its current name and takes ownership: true. Declined (false; the caller
  // keeps it) for null and when a template of that name is present (the present one stays). A
  // template the dictionary holds already changes nothing and answers true.
  bool addRoadTemplate(DexRoadTemplate* roadTemplate) {
    return roadTemplate != nullptr && templates_.add(roadTemplate->getName(), roadTemplate);
  }
  // The template filed under name, or null.
  DexRoadTemplate* findRoadTemplate(const CVynStringT<wchar_t>& name) { return templates_.find(name); }
  const DexRoadTemplate* findRoadTemplate(const CVynStringT<wchar_t>& name) const {
    return templates_.find(name);
  }
  // Deletes the template filed under name; an absent name changes nothing.
  void removeRoadTemplate(const CVynStringT<wchar_t>& name) { templates_.remove(name); }

  int getNumberOfRoadTemplates() const noexcept { return templates_.count(); }
  // The pairs (name, template) in name order.
  const_iterator begin() const noexcept { return templates_.begin(); }
  const_iterator end() const noexcept { return templates_.end(); }

  bool areCentralOffsetsUsed() const noexcept { return centralOffsetsUsed_; }
  bool areAbsHeightsUsed() const noexcept { return absHeightsUsed_; }

  // Turns the offsets (and/or heights) of every template into differences from the previous segment;
  // offsets are then no longer central. Nothing happens when both flags are false.
  void convertOffsetsCentralToSeq(bool offsets, bool heights);
  // The inverse: each offset (and/or height) becomes the running sum up to its segment; offsets are
  // then central. Nothing happens when both flags are false.
  void convertOffsetsSeqToCentral(bool offsets, bool heights);

 private:
  DexOwningMap<CVynStringT<wchar_t>, DexRoadTemplate> templates_;
  bool centralOffsetsUsed_;
  bool absHeightsUsed_;
};

// One or more templates placed at a station of a road, with the level at the centre line for each
// vertical alignment and a turn flag. It refers to its templates and vertical alignments without
// owning them; copies share them. The virtual operations keep their order: destructor, setSta, getSta,
// setLevelAtCL, getLevelAtCL, setTurn, getTurn.
class DEX_API DexCrossSection {
 public:
  VYN_CLASS_ALLOCATOR

  // roadTemplate (even null) is the first template reference; station 0.0, turn true.
  explicit DexCrossSection(const DexRoadTemplate* roadTemplate);
  DexCrossSection(const DexCrossSection&) = default;
  DexCrossSection& operator=(const DexCrossSection&) = default;
  virtual ~DexCrossSection();

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  virtual void setSta(double station) { sta_ = station; }
  virtual double getSta() const { return sta_; }
  // Records level for verticalAlignment only when none is recorded for it yet: the first level stays.
  virtual void setLevelAtCL(double level, const DexVerticalAlignment* verticalAlignment);
  // The level recorded for verticalAlignment, 0.0 when none is.
  virtual double getLevelAtCL(const DexVerticalAlignment* verticalAlignment) const;
  virtual void setTurn(bool turn) { turn_ = turn; }
  virtual bool getTurn() const { return turn_; }

  // ---- Template references (not owned) --------------------------------------------------------
  // Appends a reference to roadTemplate; null is ignored.
  void addRoadTemplate(DexRoadTemplate* roadTemplate);
  int getNumberOfRoadTemplates() const noexcept { return static_cast<int>(templates_.size()); }
  // The reference at index (possibly the null first one), or null outside the list.
  const DexRoadTemplate* getRoadTemplateAt(int index) const noexcept;
  // The first referenced template named name, or null.
  const DexRoadTemplate* findRoadTemplate(const CVynStringT<wchar_t>& name) const;
  // Drops the first reference to a template named name (the template itself stays): true; false when
  // there is none.
  bool removeRoadTemplate(const CVynStringT<wchar_t>& name);

  // Takes over other's levels, station, template references and turn; null changes nothing.
  void copyData(const DexCrossSection* other);

 private:
  vyn_vector<const DexRoadTemplate*> templates_;
  std::map<const DexVerticalAlignment*, double> levelsAtCL_;
  double sta_ = 0.0;
  bool turn_ = true;
};

// The cross sections of a road, in order of addition (they are not sorted by station): the third
// alignment part kind. The set owns its cross sections; copies duplicate them. With the template map,
// it also remembers the names of the templates its cross sections use.
class DEX_API DexCrossSectionSet : public IDexAlignmentPart {
 public:
  VYN_CLASS_ALLOCATOR

  explicit DexCrossSectionSet(bool useTemplateMap);
  DexCrossSectionSet(const DexCrossSectionSet&) = default;
  DexCrossSectionSet& operator=(const DexCrossSectionSet&) = default;
  ~DexCrossSectionSet() override;

  // CROSS_SECTION_SET.
  EDexAlignmentPartType getType() const override { return CROSS_SECTION_SET; }

  // Appends crossSection and takes ownership, noting the names of its templates when the template map
  // is used: true. Null is refused (false).
  bool addCrossSection(DexCrossSection* crossSection);
  int getNumberOfCrossSections() const noexcept { return crossSections_.count(); }
  // The cross section at index, or null outside the list.
  DexCrossSection* getCrossSectionAt(int index) noexcept { return crossSections_.at(index); }
  const DexCrossSection* getCrossSectionAt(int index) const noexcept { return crossSections_.at(index); }

  bool isTemplateMapUsed() const noexcept { return useTemplateMap_; }
  // Whether a cross section added so far uses a template named name; always false without the map.
  bool isTemplateUsed(const CVynStringT<wchar_t>& name) const { return templateNames_.contains(name); }

 private:
  DexOwningList<DexCrossSection> crossSections_;
  std::set<CVynStringT<wchar_t>> templateNames_;
  bool useTemplateMap_;
};

}  // namespace vyn::ie
