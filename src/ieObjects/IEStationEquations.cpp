#include "ieObjects/IEStationEquations.h"

#include <climits>
#include <cmath>
#include <unordered_set>
#include <utility>

#include "ieUtils/IEUtilsUnits.h"

namespace vyn::ie {

namespace {

using Names = std::unordered_set<CVynStringT<wchar_t>>;

double chainageOf(const DexStaEquation& equation) {
  return equation.getData(DexStaEquation::RUNNING_CHAINAGE);
}

// Ascending running chainage; a NaN chainage sorts last, so the order stays a strict weak one.
bool isBefore(const DexStaEquation& a, const DexStaEquation& b) {
  const double first = chainageOf(a);
  const double second = chainageOf(b);
  if (std::isnan(first)) return false;
  return std::isnan(second) || first < second;
}

// Whether a station back given for an equation agrees with the one the equation before implies,
// aheadBefore + (chainage - chainageBefore). Written so that NaN fails.
bool agreesWithEquationBefore(double stationBack, double aheadBefore, double chainageStep) {
  const double step = stationBack - aheadBefore;
  return step > 0.0 && std::abs(chainageStep - step) < DexStaEquationSet::kStationBackTolerance;
}

}  // namespace

// ---- DexStaEquation -----------------------------------------------------------------------------

DexStaEquation::~DexStaEquation() = default;

bool DexStaEquation::operator==(const DexStaEquation& other) const {
  for (int kind = 0; kind < kNumberOfDataTypes; ++kind) {
    if (!(getData(kind) == other.getData(kind))) return false;
  }
  return name_.Compare(other.name_) == 0;
}

// ---- DexStaEquationSet --------------------------------------------------------------------------

DexStaEquationSet::~DexStaEquationSet() = default;

bool DexStaEquationSet::addEquation(const DexStaEquation* equation) {
  if (equation == nullptr || !equation->isDataSet(DexStaEquation::RUNNING_CHAINAGE) ||
      !equation->isDataSet(DexStaEquation::STATION_AHEAD)) {
    return false;
  }
  const double chainage = chainageOf(*equation);
  const bool taken = equations_.findFirst([chainage](const DexStaEquation& held) {
    return chainageOf(held) == chainage;
  }) != nullptr;
  return !taken && equations_.add(equation->clone());
}

int DexStaEquationSet::findEquation(const DexStaEquation* equation) const {
  if (equation == nullptr) return -1;
  for (int i = equations_.count() - 1; i >= 0; --i) {
    if (*equations_.at(i) == *equation) return i;
  }
  return -1;
}

bool DexStaEquationSet::validate() {
  equations_.sort(isBefore);
  if (equations_.isEmpty() || std::isnan(chainageOf(*equations_.at(equations_.count() - 1)))) return false;
  return completeStationBacks() && !hasRepeatedName() && assignNumericNames();
}

bool DexStaEquationSet::completeStationBacks() {
  DexStaEquation& first = *equations_.at(0);
  if (!first.isDataSet(DexStaEquation::STATION_BACK)) {
    first.setData(DexStaEquation::STATION_BACK, chainageOf(first));
  } else if (!(first.getData(DexStaEquation::STATION_BACK) == chainageOf(first))) {
    return false;
  }
  for (int i = 1; i < equations_.count(); ++i) {
    const DexStaEquation& before = *equations_.at(i - 1);
    DexStaEquation& equation = *equations_.at(i);
    const double aheadBefore = before.getData(DexStaEquation::STATION_AHEAD);
    const double chainageStep = chainageOf(equation) - chainageOf(before);
    if (!equation.isDataSet(DexStaEquation::STATION_BACK)) {
      equation.setData(DexStaEquation::STATION_BACK, aheadBefore + chainageStep);
    } else if (!agreesWithEquationBefore(equation.getData(DexStaEquation::STATION_BACK), aheadBefore,
                                         chainageStep)) {
      return false;
    }
  }
  return true;
}

bool DexStaEquationSet::hasRepeatedName() const {
  Names names;
  for (const DexStaEquation* equation : equations_) {
    const CVynStringT<wchar_t>& name = equation->getName();
    if (!name.IsEmpty() && !names.insert(name).second) return true;
  }
  return false;
}

bool DexStaEquationSet::assignNumericNames() {
  Names names;
  for (const DexStaEquation* equation : equations_)
    names.insert(equation->getName());
  int counter = 1;
  for (DexStaEquation* equation : equations_) {
    if (!equation->getName().IsEmpty()) continue;
    CVynStringT<wchar_t> name = utils::intToString(counter);
    while (names.contains(name)) {
      if (++counter == INT_MAX) return false;
      name = utils::intToString(counter);
    }
    names.insert(name);
    equation->setName(name);
  }
  return true;
}

bool DexStaEquationSet::operator==(const DexStaEquationSet& other) const {
  if (getNumberOfEquations() != other.getNumberOfEquations()) return false;
  for (const DexStaEquation* equation : equations_) {
    if (other.findEquation(equation) < 0) return false;
  }
  for (const DexStaEquation* equation : other.equations_) {
    if (findEquation(equation) < 0) return false;
  }
  return true;
}

// ---- DexStaEquationSetDictionary ----------------------------------------------------------------

DexStaEquationSetDictionary::~DexStaEquationSetDictionary() = default;

bool DexStaEquationSetDictionary::addStaEquationSet(DexStaEquationSet* set) {
  if (set == nullptr) return false;
  if (sets_.indexOf(set) >= 0) return true;
  if (!set->validate() || findStaEquationSet(set) >= 0) return false;
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

int DexStaEquationSetDictionary::findStaEquationSet(const DexStaEquationSet* set) const {
  if (set == nullptr) return -1;
  for (int i = sets_.count() - 1; i >= 0; --i) {
    if (*sets_.at(i) == *set) return i;
  }
  return -1;
}

// ---- IDexAlignmentStaEq -------------------------------------------------------------------------

// Out of line so that the class has one virtual table and type identity, in the library.
IDexAlignmentStaEq::~IDexAlignmentStaEq() = default;

}  // namespace vyn::ie
