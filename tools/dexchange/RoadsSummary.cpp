#include "RoadsSummary.h"

#include <array>
#include <string>

#include "ToolText.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEStationEquations.h"
#include "ieObjects/IEVerticalAlignment.h"

namespace dexchange_tool {
namespace {

using vyn::ie::DexAlignment;
using vyn::ie::DexAlignmentPartsDictionary;
using vyn::ie::DexStaEquation;
using vyn::ie::DexStaEquationSet;
using vyn::ie::IDexAlignmentPart;

constexpr int kPartKinds = IDexAlignmentPart::kNumberOfPartTypes;
constexpr std::array<const char*, kPartKinds> kPartNames = {"horizontal", "vertical", "cross-section set",
                                                            "road-string set"};
constexpr std::array<const char*, kPartKinds> kPartPlurals = {"horizontal", "vertical", "cross-section sets",
                                                              "road-string sets"};
constexpr std::array<const char*, 4> kElementNames = {"line", "curve", "spiral", "intersection point"};

// "1 curve", "2 curves".
std::string counted(int count, const std::string& noun) {
  return std::to_string(count) + " " + noun + (count == 1 ? "" : "s");
}

std::string quoted(const CVynStringT<wchar_t>& text) {
  return "\"" + vyn_text::toUtf8(text.view()) + "\"";
}

std::string stations(double start, double length) {
  return "stations " + fixed3(start) + " .. " + fixed3(start + length);
}

std::string elementsOf(const vyn::ie::DexHorizontalAlignment& alignment) {
  std::array<int, kElementNames.size()> counts{};
  for (int i = 0; i < alignment.getNumberOfSegments(); ++i) {
    const int kind = alignment.getSegmentAt(i)->getType();
    if (kind >= 0 && kind < static_cast<int>(counts.size())) ++counts[static_cast<std::size_t>(kind)];
  }
  std::string text = counted(alignment.getNumberOfSegments(), "element") + " (";
  for (std::size_t kind = 0; kind < counts.size(); ++kind)
    text += (kind > 0 ? ", " : "") + counted(counts[kind], kElementNames[kind]);
  return text + ")";
}

// What a part holds beyond its name and stations.
std::string contentOf(const IDexAlignmentPart& part) {
  if (const auto* horizontal = dynamic_cast<const vyn::ie::DexHorizontalAlignment*>(&part))
    return ", " + elementsOf(*horizontal);
  if (const auto* vertical = dynamic_cast<const vyn::ie::DexVerticalAlignment*>(&part)) {
    return ", " + counted(vertical->getNumberOfVerticalElements(), "vertical element") + ", " +
           counted(vertical->getNumberOfLongSections(), "long section");
  }
  return "";
}

std::string equationSetOf(const vyn::ie::IDexAlignmentStaEq& owner) {
  const DexStaEquationSet* const set = owner.getStaEquationSet();
  return set != nullptr ? ", station equations " + quoted(set->getName()) : "";
}

void printAlignment(std::ostream& out, const DexAlignment& alignment) {
  out << "  " << quoted(alignment.getName()) << ": "
      << stations(alignment.getStaStart(), alignment.getLength()) << equationSetOf(alignment) << '\n';
  for (int i = 0; i < alignment.getNumberOfAlignmentParts(); ++i) {
    const IDexAlignmentPart& part = *alignment.getAlignmentPartAt(i);
    const int kind = part.getType();
    const char* const kindName =
        kind >= 0 && kind < kPartKinds ? kPartNames[static_cast<std::size_t>(kind)] : "part";
    out << "    " << kindName << ' ' << quoted(part.getName()) << ": "
        << stations(part.getStaStart(), part.getLength()) << contentOf(part);
    if (const auto* withSet = dynamic_cast<const vyn::ie::IDexAlignmentStaEq*>(&part))
      out << equationSetOf(*withSet);
    out << '\n';
  }
}

int numberOfAlignments(const vyn::ie::DexData& data) {
  int count = 0;
  for (int d = 0; d < data.getNumberOfDatasets(); ++d)
    count += data.getDatasetAt(d)->getNumberOfAlignments();
  return count;
}

void printParts(std::ostream& out, const DexAlignmentPartsDictionary& dictionary) {
  int total = 0;
  for (int kind = 0; kind < kPartKinds; ++kind)
    total += dictionary.getNumberOfElements(kind);
  if (total == 0) return;
  out << "alignment parts:";
  for (int kind = 0; kind < kPartKinds; ++kind)
    out << (kind > 0 ? "," : "") << ' ' << dictionary.getNumberOfElements(kind) << ' '
        << kPartPlurals[static_cast<std::size_t>(kind)];
  out << '\n';
}

void printEquationSet(std::ostream& out, const DexStaEquationSet& set) {
  out << "  " << quoted(set.getName()) << ": " << counted(set.getNumberOfEquations(), "equation") << '\n';
  for (int i = 0; i < set.getNumberOfEquations(); ++i) {
    const DexStaEquation& equation = *set.getEquationAt(i);
    out << "    " << quoted(equation.getName()) << ": chainage "
        << fixed3(equation.getData(DexStaEquation::RUNNING_CHAINAGE)) << ", back "
        << fixed3(equation.getData(DexStaEquation::STATION_BACK)) << ", ahead "
        << fixed3(equation.getData(DexStaEquation::STATION_AHEAD)) << '\n';
  }
}

}  // namespace

void printRoads(std::ostream& out, const vyn::ie::DexData& data) {
  if (const int count = numberOfAlignments(data); count > 0) {
    out << "alignments: " << count << '\n';
    for (int d = 0; d < data.getNumberOfDatasets(); ++d) {
      const vyn::ie::DexDataset& dataset = *data.getDatasetAt(d);
      for (int i = 0; i < dataset.getNumberOfAlignments(); ++i)
        printAlignment(out, *dataset.getAlignmentAt(i));
    }
  }
  const DexAlignmentPartsDictionary* const parts = data.getIEAlignmentPartsDictionary();
  if (parts != nullptr) printParts(out, *parts);
  const vyn::ie::DexStaEquationSetDictionary* const sets = data.getIEStaEquationSetDictionary();
  if (sets != nullptr && sets->getNumberOfElements() > 0) {
    out << "station-equation sets: " << sets->getNumberOfElements() << '\n';
    for (int i = 0; i < sets->getNumberOfElements(); ++i)
      printEquationSet(out, *sets->getStaEquationSetAt(i));
  }
}

}  // namespace dexchange_tool
