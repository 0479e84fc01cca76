#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"

// Station-equation sets (the places of a road where the displayed station jumps) and the dictionary
// of an exchange that owns them. Alignments and their parts refer to a set without owning it.
namespace vyn::ie {

// A named set of station equations that applies to one road. The virtual operations keep their order:
// destructor, setName, getName.
class DEX_API DexStaEquationSet : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  DexStaEquationSet() = default;
  explicit DexStaEquationSet(const CVynStringT<wchar_t>& name) : name_(name) {}
  DexStaEquationSet(const DexStaEquationSet&) = default;
  DexStaEquationSet& operator=(const DexStaEquationSet&) = default;
  ~DexStaEquationSet() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

 private:
  CVynStringT<wchar_t> name_;
};

// The station-equation sets of one exchange, in order of addition. The dictionary owns its sets and
// deletes them with itself; it is not copied (alignments refer to the sets by address).
class DEX_API DexStaEquationSetDictionary {
 public:
  VYN_CLASS_ALLOCATOR

  DexStaEquationSetDictionary() = default;
  DexStaEquationSetDictionary(const DexStaEquationSetDictionary&) = delete;
  DexStaEquationSetDictionary& operator=(const DexStaEquationSetDictionary&) = delete;
  virtual ~DexStaEquationSetDictionary();

  // Appends set and takes ownership: true. Declined (false; the caller keeps set) for null. Adding a
  // set the dictionary already holds changes nothing and answers true, so that the caller never
  // deletes a set the dictionary owns.
  bool addStaEquationSet(DexStaEquationSet* set);

  // The last set, searching from the end, whose name equals name exactly; null for an empty name and
  // when there is none.
  DexStaEquationSet* findStaEquationSet(const CVynStringT<wchar_t>& name);
  const DexStaEquationSet* findStaEquationSet(const CVynStringT<wchar_t>& name) const;

  int getNumberOfElements() const noexcept { return sets_.count(); }
  // The set at index, or null for an index outside the list.
  DexStaEquationSet* getStaEquationSetAt(int index) noexcept { return sets_.at(index); }
  const DexStaEquationSet* getStaEquationSetAt(int index) const noexcept { return sets_.at(index); }

 private:
  DexOwningList<DexStaEquationSet> sets_;
};

}  // namespace vyn::ie
