#pragma once

#include <cstdint>

namespace vyn::ie {

// The kinds of exchanged data by which settings, formats and the formats registry are filtered. The
// enumerator names are the words of the formats data file.
enum EDexDataType : std::int32_t {
  POINTS = 0,
  CODES = 1,
  LINES = 2,
  AREAS = 3,
  PARCELS = 4,
  H_ALIGNMENTS = 5,
  V_ALIGNMENTS = 6,
  X_SECTIONS = 7,
  ROAD_STRINGS = 8,
  ROADS = 9,
  SURFACES = 10,
  POINT_LISTS = 11,
  X_SECTION_TEMPLATES = 12,
  ROAD_SURVEY = 13,
  LOCALIZATION = 14,
  SCANNING_DATA = 15,
  JOB_HISTORY = 16,
  LAYER_STATES = 17,
  RAW_DATA = 18,
  STAKE_REPORTS = 19,
  STA_EQUATION_SETS = 20,
  FIELD_REPORTS = 21,
  MULTIPLE = 22,  // several kinds at once
};

// The number of data kinds: values 0 to kDexDataTypeCount - 1.
inline constexpr int kDexDataTypeCount = 23;

}  // namespace vyn::ie
