#include "ieObjects/IEStationEquations.h"

#include <utility>

namespace vyn::ie {

DexStaEquationSet::~DexStaEquationSet() = default;

DexStaEquationSetDictionary::~DexStaEquationSetDictionary() = default;

bool DexStaEquationSetDictionary::addStaEquationSet(DexStaEquationSet* set) {
  if (set == nullptr) return false;
  if (sets_.indexOf(set) >= 0) return true;
  return sets_.add(set);
}

DexStaEquationSet* DexStaEquationSetDictionary::findStaEquationSet(const CVynStringT<wchar_t>& name) {
  return const_cast<DexStaEquationSet*>(std::as_const(*this).findStaEquationSet(name));
}

const DexStaEquationSet* DexStaEquationSetDictionary::findStaEquationSet(
    const CVynStringT<wchar_t>& name) const {
  if (name.IsEmpty()) return nullptr;
  for (int i = sets_.count() - 1; i >= 0; --i) {
    const DexStaEquationSet* const set = sets_.at(i);
    if (set->getName().Compare(name) == 0) return set;
  }
  return nullptr;
}

}  // namespace vyn::ie
