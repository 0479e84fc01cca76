#include "ieObjects/IERawDataSummary.h"

namespace vyn::ie {
namespace {

template <std::size_t N>
void count(std::array<int, N>& counts, int kind) {
  if (kind >= 0 && kind < static_cast<int>(N)) ++counts[static_cast<std::size_t>(kind)];
}

void addTotalStation(const IDexTSRawDataInterface& record, DexRawDataSummary& summary) {
  const EDexTSRawDataType type = record.getType();
  count(summary.byTotalStationKind, type);
  if (type == TS_RAW_STATION) summary.stations.Add(record.getName());
}

void addRecord(const IDexRawDataInterface& record, DexRawDataSummary& summary) {
  const int kind = record.getRawDataType();
  if (kind < 0 || kind >= DexRawDataSummary::kNumberOfRawKinds) {
    ++summary.otherKinds;
    return;
  }
  count(summary.byRawKind, kind);
  if (const auto* const shot = dynamic_cast<const IDexTSRawDataInterface*>(&record))
    addTotalStation(*shot, summary);
  if (const auto* const gnss = dynamic_cast<const IDexGpsRawDataInterface*>(&record))
    count(summary.byGnssKind, gnss->getGpsRawDataType());
}

}  // namespace

DexRawDataSummary summarizeRawData(const DexRawData& rawData) {
  DexRawDataSummary summary;
  summary.records = rawData.getNumberOfRawData();
  for (int i = 0; i < summary.records; ++i)
    addRecord(*rawData.getRawDataAt(i), summary);
  summary.hasTime = rawData.getRawTime(summary.firstTime, summary.lastTime);
  return summary;
}

}  // namespace vyn::ie
