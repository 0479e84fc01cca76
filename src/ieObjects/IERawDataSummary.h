#pragma once

#include <array>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IEGPSRawData.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IETSRawData.h"
#include "ieUtils/IEUtilsStringArray.h"

// What a dataset's raw observations hold, counted once: for reports and the tool's "info".
namespace vyn::ie {

// The records of a raw-data list by kind, the stations set up and the time range. A plain value.
struct DEX_API DexRawDataSummary {
  static constexpr int kNumberOfRawKinds = 5;
  static constexpr int kNumberOfTotalStationKinds = 8;
  static constexpr int kNumberOfGnssKinds = 3;

  int records = 0;
  // By IDexRawDataInterface::ERawDataType; records of a kind outside 0 to 4 count as other.
  std::array<int, kNumberOfRawKinds> byRawKind{};
  int otherKinds = 0;
  // The total-station records by EDexTSRawDataType and the GNSS records by EDexGpsRawDataType.
  std::array<int, kNumberOfTotalStationKinds> byTotalStationKind{};
  std::array<int, kNumberOfGnssKinds> byGnssKind{};
  // The names of the station records, in recording order.
  utils::StringArray stations;
  // DexRawData::getRawTime.
  bool hasTime = false;
  base::CTime firstTime;
  base::CTime lastTime;
};

// Counts the records of rawData.
DEX_API DexRawDataSummary summarizeRawData(const DexRawData& rawData);

}  // namespace vyn::ie
