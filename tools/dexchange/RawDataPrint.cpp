#include "RawDataPrint.h"

#include <array>

#include "ToolText.h"
#include "ieObjects/IERawDataSummary.h"

namespace dexchange_tool {
namespace {

// One line per kind that has records: the indent, the kind's name and its count.
template <std::size_t N>
void printKinds(std::ostream& out, const char* indent, const char* const (&names)[N],
                const std::array<int, N>& counts) {
  for (std::size_t kind = 0; kind < N; ++kind) {
    if (counts[kind] > 0) out << indent << names[kind] << ": " << counts[kind] << '\n';
  }
}

}  // namespace

void printRawData(std::ostream& out, const vyn::ie::DexRawData& rawData) {
  static const char* const kRawKinds[] = {"total station", "GNSS", "digital level", "notes",
                                          "GNSS and level"};
  static const char* const kShotKinds[] = {"backbearings",  "backsights",      "foresights", "sideshots",
                                           "missing lines", "resection shots", "stations",   "stakeouts"};
  static const char* const kGnssKinds[] = {"GNSS offsets", "GNSS base stations", "GNSS positions"};
  const vyn::ie::DexRawDataSummary summary = vyn::ie::summarizeRawData(rawData);
  out << "    raw data: " << summary.records << " records\n";
  printKinds(out, "      ", kRawKinds, summary.byRawKind);
  if (summary.otherKinds > 0) out << "      other: " << summary.otherKinds << '\n';
  printKinds(out, "        ", kShotKinds, summary.byTotalStationKind);
  printKinds(out, "        ", kGnssKinds, summary.byGnssKind);
  out << "      stations set up: " << summary.stations.GetCount();
  for (int i = 0; i < summary.stations.GetCount(); ++i)
    out << (i == 0 ? " (" : ", ") << utf8(summary.stations.GetAt(i));
  out << (summary.stations.GetCount() > 0 ? ")\n" : "\n");
  if (summary.hasTime) {
    constexpr const wchar_t* kTimeFormat = L"%Y-%m-%d %H:%M:%S";
    out << "      time: " << utf8(summary.firstTime.Format(kTimeFormat)) << " .. "
        << utf8(summary.lastTime.Format(kTimeFormat)) << '\n';
  }
}

}  // namespace dexchange_tool
