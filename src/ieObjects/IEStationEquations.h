#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IETypedValues.h"

// Station equations: the points of a road where the displayed station (chainage) jumps while the
// running chainage along the alignment goes on. A named set of them applies to one road; the
// dictionary of an exchange owns every set, and alignments and their parts refer to one.
//
// A valid set, sorted by running chainage c[i], with stations back b[i] and ahead a[i], satisfies
// b[0] = c[0] and, for i >= 1, b[i] = a[i-1] + (c[i] - c[i-1]) with b[i] > a[i-1]. So the displayed
// station of a running chainage c is c itself before the first equation and a[k] + (c - c[k]) after
// equation k, up to the next one.
namespace vyn::ie {

// One station equation: the running chainage of its point, the stations back and ahead, a mark for
// each of the three telling whether it was set, and a name. The virtual operations keep their order:
// destructor, setName, getName.
class DEX_API DexStaEquation : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The three values of an equation.
  enum EStationEqDataType : int {
    RUNNING_CHAINAGE = 0,  // measured along the alignment; the key that orders a set
    STATION_BACK = 1,      // the displayed station on the back side of the point
    STATION_AHEAD = 2,     // the displayed station after the point
  };
  static constexpr int kNumberOfDataTypes = 3;

  // ---- Construction ---------------------------------------------------------------------------
  // All three values 0.0 and not set, no name.
  DexStaEquation() = default;
  DexStaEquation(const DexStaEquation&) = default;
  DexStaEquation& operator=(const DexStaEquation&) = default;
  ~DexStaEquation() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // ---- Values ---------------------------------------------------------------------------------
  // Stores the value of kind and marks it set; a kind outside 0 to 2 is ignored.
  void setData(int kind, double value) {
    if (data_.set(kind, value)) isSet_.set(kind, true);
  }
  // The value of kind: 0.0 when never set and for a kind outside 0 to 2.
  double getData(int kind) const { return data_.get(kind); }
  // Whether kind was set; false for a kind outside 0 to 2.
  bool isDataSet(int kind) const { return isSet_.get(kind); }

  // A new equation with the same name, values and marks, owned by the caller (null when memory is
  // short).
  DexStaEquation* clone() const { return new DexStaEquation(*this); }

  // True when the three values are equal (a NaN on either side is unequal) and the names are equal
  // exactly. The marks are not compared.
  bool operator==(const DexStaEquation& other) const;

 private:
  DexTypedValues<EStationEqDataType, kNumberOfDataTypes> data_;
  DexTypedArray<EStationEqDataType, kNumberOfDataTypes, bool> isSet_;
  CVynStringT<wchar_t> name_;
};

// A named set of station equations that applies to one road. The set owns its equations (copies of
// those handed to addEquation) and deletes them with itself; a copy of the set has its own copies.
// The virtual operations keep their order: destructor, setName, getName.
class DEX_API DexStaEquationSet : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The tolerance, in the units of the stations, within which a given station back must agree with
  // the one that the equation before it implies.
  static constexpr double kStationBackTolerance = 1e-12;

  // ---- Construction ---------------------------------------------------------------------------
  DexStaEquationSet() = default;
  explicit DexStaEquationSet(const CVynStringT<wchar_t>& name) : name_(name) {}
  DexStaEquationSet(const DexStaEquationSet&) = default;
  DexStaEquationSet& operator=(const DexStaEquationSet&) = default;
  ~DexStaEquationSet() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // ---- Equations ------------------------------------------------------------------------------
  // Appends a copy of equation (the caller keeps and still owns its argument) and answers true.
  // Refused (false) for null, for an equation whose running chainage or station ahead is not set,
  // and for one whose running chainage equals exactly that of an equation in the set. Nothing is
  // sorted here.
  bool addEquation(const DexStaEquation* equation);
  int getNumberOfEquations() const noexcept { return equations_.count(); }
  // The equation at index, or null for an index outside the set. The set keeps ownership.
  DexStaEquation* getEquationAt(int index) noexcept { return equations_.at(index); }
  const DexStaEquation* getEquationAt(int index) const noexcept { return equations_.at(index); }
  // The index of the last equation == to equation; -1 when there is none and for null.
  int findEquation(const DexStaEquation* equation) const;

  // ---- Validation -----------------------------------------------------------------------------
  // Sorts and completes the set in place and answers whether it is valid:
  // 1. sorts the equations by running chainage;
  // 2. an empty set is invalid, and so is one with a NaN running chainage;
  // 3. a station back given on the first equation must equal its running chainage exactly; a missing
  //    one becomes the running chainage;
  // 4. a station back given on a later equation must lie above the station ahead before it and agree
  //    with the station ahead before it plus the chainage between them within
  //    kStationBackTolerance; a missing one becomes that sum;
  // 5. two equations with the same non-empty name make the set invalid;
  // 6. each unnamed equation, in chainage order, takes the next numeric name ("1", "2", ...) that no
  //    equation has, counting on from the last one given.
  // A set found invalid stays sorted and keeps what the steps before the failing one filled in.
  bool validate();

  // ---- Comparison -----------------------------------------------------------------------------
  // True when both sets have as many equations and each equation of either set has an equal one in
  // the other; order and set names do not count.
  bool operator==(const DexStaEquationSet& other) const;

 private:
  bool completeStationBacks();
  bool hasRepeatedName() const;
  bool assignNumericNames();

  DexOwningList<DexStaEquation> equations_;
  CVynStringT<wchar_t> name_;
};

// The station-equation sets of one exchange, in order of addition. The dictionary owns its sets and
// deletes them with itself; it is not copied (alignments refer to the sets by address). The exchange
// data holds one.
class DEX_API DexStaEquationSetDictionary {
 public:
  VYN_CLASS_ALLOCATOR

  DexStaEquationSetDictionary() = default;
  DexStaEquationSetDictionary(const DexStaEquationSetDictionary&) = delete;
  DexStaEquationSetDictionary& operator=(const DexStaEquationSetDictionary&) = delete;
  virtual ~DexStaEquationSetDictionary();

  // Validates set (which sorts and completes it in place) and, when it is valid and no set == to it
  // is held yet, appends it and takes ownership: true. Refused (false; the caller keeps set, possibly
  // sorted and partly completed) for null, an invalid set and one == to a set held. Adding a set the
  // dictionary holds already changes nothing and answers true, so that the caller never deletes a
  // set the dictionary owns.
  bool addStaEquationSet(DexStaEquationSet* set);

  // The last set, searching from the end, whose name equals name exactly; null for an empty name and
  // when there is none.
  DexStaEquationSet* findStaEquationSet(const CVynStringT<wchar_t>& name);
  const DexStaEquationSet* findStaEquationSet(const CVynStringT<wchar_t>& name) const;
  // The index of the last set == to set; -1 when there is none and for null.
  int findStaEquationSet(const DexStaEquationSet* set) const;

  int getNumberOfElements() const noexcept { return sets_.count(); }
  // The set at index, or null for an index outside the list.
  DexStaEquationSet* getStaEquationSetAt(int index) noexcept { return sets_.at(index); }
  const DexStaEquationSet* getStaEquationSetAt(int index) const noexcept { return sets_.at(index); }

  // Has no effect: validate() names the equations.
  void assignNames() {}

 private:
  DexOwningList<DexStaEquationSet> sets_;
};

// The station-equation set that applies to an alignment or to its horizontal or vertical part. The set
// is referred to, not owned: it is expected to be one that the exchange's station-equation dictionary
// holds.
//
// The two operations come first in the virtual table and the destructor last: that order is the
// plug-in ABI.
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

}  // namespace vyn::ie
