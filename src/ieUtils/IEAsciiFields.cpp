#include "ieUtils/IEAsciiFields.h"

#include <algorithm>
#include <array>
#include <climits>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "ieUtils/IEUtilsParsers.h"
#include "ieUtils/detail/FieldText.h"

namespace vyn::ie::ascii_fields {

namespace {

using String = CVynStringT<wchar_t>;

constexpr int kOwnerBits = 64;

struct FieldRow {
  const wchar_t* name;
  EType type;
  std::uint64_t owners;  // owner n is the bit 1 << n
};

template <class... Owners>
constexpr std::uint64_t ownedBy(Owners... owners) {
  return ((std::uint64_t{1} << owners) | ...);
}

// Every known field, in the order that decides which row a search meets first.
// clang-format off
constexpr std::array<FieldRow, 140> kFieldTable = {{
    {L"Name",                      FIELD_NAME,                         ownedBy(0, 1, 2)},          // 0
    {L"Lat(North)",                FIELD_LAT_NORTH,                    ownedBy(0, 1, 2)},          // 1
    {L"Lon(East)",                 FIELD_LON_EAST,                     ownedBy(0, 1, 2)},          // 2
    {L"Ht",                        FIELD_HEIGHT,                       ownedBy(0, 1, 2, 8)},       // 3
    {L"Ht(G)",                     FIELD_HEIGHT_GEOID,                 ownedBy(0, 1, 2, 8)},       // 4
    {L"Depth",                     FIELD_DEPTH,                        ownedBy(2, 7, 8)},          // 5
    {L"Notes",                     FIELD_NOTES,                        ownedBy(0)},                // 6
    {L"Codes",                     FIELD_CODES,                        ownedBy(0, 1, 2, 3, 7, 8)}, // 7
    {L"Codes&Descriptions",        FIELD_CODES_AND_DESCRIPTIONS,       ownedBy(0)},                // 8
    {L"Codes&Strings",             FIELD_CODES_AND_STRINGS,            ownedBy(0)},                // 9
    {L"Codes&Attributes",          FIELD_CODES_AND_ATTRIBUTES,         ownedBy(0)},                // 10
    {L"FullCodes",                 FIELD_FULL_CODES,                   ownedBy(0)},                // 11
    {L"HRMS",                      FIELD_HRMS,                         ownedBy(2, 8, 11)},         // 12
    {L"VRMS",                      FIELD_VRMS,                         ownedBy(2, 8, 11)},         // 13
    {L"Date",                      FIELD_DATE,                         ownedBy(2, 7, 8)},          // 14
    {L"Time",                      FIELD_TIME,                         ownedBy(2, 7, 8)},          // 15
    {L"HDOP",                      FIELD_HDOP,                         ownedBy(2, 8)},             // 16
    {L"PDOP",                      FIELD_PDOP,                         ownedBy(2, 8)},             // 17
    {L"VDOP",                      FIELD_VDOP,                         ownedBy(2, 8)},             // 18
    {L"GDOP",                      FIELD_GDOP,                         ownedBy(2, 8)},             // 19
    {L"TDOP",                      FIELD_TDOP,                         ownedBy(2, 8)},             // 20
    {L"Solution Type",             FIELD_SOLUTION_TYPE,                ownedBy(2, 8)},             // 21
    {L"GPS satellites",            FIELD_GPS_SATELLITES,               ownedBy(2, 8)},             // 22
    {L"GLONASS satellites",        FIELD_GLONASS_SATELLITES,           ownedBy(2, 8)},             // 23
    {L"GALILEO satellites",        FIELD_GALILEO_SATELLITES,           ownedBy(2)},                // 24
    {L"BEIDOU satellites",         FIELD_BEIDOU_SATELLITES,            ownedBy(2, 8)},             // 25
    {L"SBAS satellites",           FIELD_SBAS_SATELLITES,              ownedBy(2, 8)},             // 26
    {L"QZSS satellites",           FIELD_QZSS_SATELLITES,              ownedBy(2, 8)},             // 27
    {L"HI/Base Ant. Ht.",          FIELD_INSTRUMENT_OR_BASE_HEIGHT,    ownedBy(3, 7, 8)},          // 28
    {L"Backsight Pt",              FIELD_BACKSIGHT_POINT,              ownedBy(3)},                // 29
    {L"Instrument/Base Point",     FIELD_INSTRUMENT_OR_BASE_POINT,     ownedBy(3, 7, 8)},          // 30
    {L"HR/Ant Ht.",                FIELD_TARGET_OR_ANTENNA_HEIGHT,     ownedBy(2, 3, 7, 8)},       // 31
    {L"Design Point",              FIELD_DESIGN_POINT,                 ownedBy(3)},                // 32
    {L"Staked Point",              FIELD_STAKED_POINT,                 ownedBy(3)},                // 33
    {L"Cut",                       FIELD_STAKEOUT_CUT,                 ownedBy(3)},                // 34
    {L"Fill",                      FIELD_STAKEOUT_FILL,                ownedBy(3)},                // 35
    {L"Cut(Fill)",                 FIELD_CUT_FILL,                     ownedBy(3)},                // 36
    {L"Tolerance",                 FIELD_TOLERANCE,                    ownedBy(3)},                // 37
    {L"Time Stamp",                FIELD_TIME_STAMP,                   ownedBy(3, 7, 8)},          // 38
    {L"Station",                   FIELD_STATION,                      ownedBy(3, 7)},             // 39
    {L"Offset Direction",          FIELD_OFFSET_DIRECTION,             ownedBy(3, 7)},             // 40
    {L"Offset Distance",           FIELD_OFFSET_DISTANCE,              ownedBy(3, 7)},             // 41
    {L"Design North",              FIELD_DESIGN_NORTH,                 ownedBy(3)},                // 42
    {L"Design East",               FIELD_DESIGN_EAST,                  ownedBy(3)},                // 43
    {L"Design Elevation",          FIELD_DESIGN_ELEVATION,             ownedBy(3)},                // 44
    {L"Station North",             FIELD_STATION_NORTH,                ownedBy(3)},                // 45
    {L"Station East",              FIELD_STATION_EAST,                 ownedBy(3)},                // 46
    {L"Station Elevation",         FIELD_STATION_ELEVATION,            ownedBy(3)},                // 47
    {L"Delta North",               FIELD_DELTA_NORTH,                  ownedBy(3, 8)},             // 48
    {L"Delta East",                FIELD_DELTA_EAST,                   ownedBy(3, 8)},             // 49
    {L"Delta Elevation",           FIELD_DELTA_ELEVATION,              ownedBy(3, 8)},             // 50
    {L"Internal Chainage",         FIELD_INTERNAL_CHAINAGE,            ownedBy(3)},                // 51
    {L"Chainage",                  FIELD_STAKEOUT_CHAINAGE,            ownedBy(3)},                // 52
    {L"PTL Distance",              FIELD_PTL_DISTANCE,                 ownedBy(3)},                // 53
    {L"Delta H",                   FIELD_DELTA_H,                      ownedBy(3)},                // 54
    {L"Template Name",             FIELD_TEMPLATE_NAME,                ownedBy(4)},                // 55
    {L"Road Side",                 FIELD_ROAD_SIDE,                    ownedBy(4)},                // 56
    {L"Chainage",                  FIELD_SECTION_CHAINAGE,             ownedBy(4)},                // 57
    {L"Offset From CL",            FIELD_OFFSET_FROM_CENTRE_LINE,      ownedBy(4)},                // 58
    {L"Offset From Prev. Seg.",    FIELD_OFFSET_FROM_PREVIOUS_SEGMENT, ownedBy(4)},                // 59
    {L"Absolute Height",           FIELD_ABSOLUTE_HEIGHT,              ownedBy(4)},                // 60
    {L"Height From CL",            FIELD_HEIGHT_FROM_CENTRE_LINE,      ownedBy(4)},                // 61
    {L"Height From Prev. Seg.",    FIELD_HEIGHT_FROM_PREVIOUS_SEGMENT, ownedBy(4)},                // 62
    {L"Code",                      FIELD_SECTION_CODE,                 ownedBy(4)},                // 63
    {L"Cut",                       FIELD_SECTION_CUT,                  ownedBy(4)},                // 64
    {L"Fill",                      FIELD_SECTION_FILL,                 ownedBy(4)},                // 65
    {L"General Prefix",            FIELD_GENERAL_PREFIX,               ownedBy(5)},                // 66
    {L"Code Separator",            FIELD_CODE_SEPARATOR,               ownedBy(5)},                // 67
    {L"Code",                      FIELD_CODE,                         ownedBy(5, 6)},             // 68
    {L"String Separator",          FIELD_STRING_SEPARATOR,             ownedBy(5)},                // 69
    {L"Code String",               FIELD_CODE_STRING,                  ownedBy(5)},                // 70
    {L"Control Code Separator",    FIELD_CONTROL_CODE_SEPARATOR,       ownedBy(5)},                // 71
    {L"Control Code",              FIELD_CONTROL_CODE,                 ownedBy(5)},                // 72
    {L"Note Separator",            FIELD_NOTE_SEPARATOR,               ownedBy(5)},                // 73
    {L"Note",                      FIELD_NOTE,                         ownedBy(5)},                // 74
    {L"Attribute Name Separator",  FIELD_ATTRIBUTE_NAME_SEPARATOR,     ownedBy(5)},                // 75
    {L"Attribute Name",            FIELD_ATTRIBUTE_NAME,               ownedBy(5)},                // 76
    {L"Attribute Value Separator", FIELD_ATTRIBUTE_VALUE_SEPARATOR,    ownedBy(5)},                // 77
    {L"Attribute Value",           FIELD_ATTRIBUTE_VALUE,              ownedBy(5)},                // 78
    {L"Description",               FIELD_DESCRIPTION,                  ownedBy(6)},                // 79
    {L"Code Type",                 FIELD_CODE_TYPE,                    ownedBy(6)},                // 80
    {L"Layer Name",                FIELD_LAYER_NAME,                   ownedBy(0, 1, 2, 6)},       // 81
    {L"Layer Color",               FIELD_LAYER_COLOR,                  ownedBy(6)},                // 82
    {L"Layer Point Symbol",        FIELD_LAYER_POINT_SYMBOL,           ownedBy(6)},                // 83
    {L"Layer Line Style",          FIELD_LAYER_LINE_STYLE,             ownedBy(6)},                // 84
    {L"Layer Line Width",          FIELD_LAYER_LINE_WIDTH,             ownedBy(6)},                // 85
    {L"Layer Area Style",          FIELD_LAYER_AREA_STYLE,             ownedBy(6)},                // 86
    {L"Layer Area Transparency",   FIELD_LAYER_AREA_TRANSPARENCY,      ownedBy(6)},                // 87
    {L"Code Point Symbol",         FIELD_CODE_POINT_SYMBOL,            ownedBy(6)},                // 88
    {L"Code Point Color",          FIELD_CODE_POINT_COLOR,             ownedBy(6)},                // 89
    {L"Code Line Style",           FIELD_CODE_LINE_STYLE,              ownedBy(6)},                // 90
    {L"Code Line Width",           FIELD_CODE_LINE_WIDTH,              ownedBy(6)},                // 91
    {L"Code Line Color",           FIELD_CODE_LINE_COLOR,              ownedBy(6)},                // 92
    {L"Code Area Style",           FIELD_CODE_AREA_STYLE,              ownedBy(6)},                // 93
    {L"Code Area Color",           FIELD_CODE_AREA_COLOR,              ownedBy(6)},                // 94
    {L"Code Area Transparency",    FIELD_CODE_AREA_TRANSPARENCY,       ownedBy(6)},                // 95
    {L"Code Attribute Prompt",     FIELD_CODE_ATTRIBUTE_PROMPT,        ownedBy(6)},                // 96
    {L"Lat",                       FIELD_LAT,                          ownedBy(0, 1, 8)},          // 97
    {L"Lon",                       FIELD_LON,                          ownedBy(0, 1, 8)},          // 98
    {L"X",                         FIELD_X,                            ownedBy(0, 1)},             // 99
    {L"Y",                         FIELD_Y,                            ownedBy(0, 1)},             // 100
    {L"Z",                         FIELD_Z,                            ownedBy(0, 1)},             // 101
    {L"Northing",                  FIELD_NORTHING,                     ownedBy(0, 1, 8)},          // 102
    {L"Easting",                   FIELD_EASTING,                      ownedBy(0, 1, 8)},          // 103
    {L"Geoid Separation",          FIELD_GEOID_SEPARATION,             ownedBy(0, 1, 11)},         // 104
    {L"Combined Scale Factor",     FIELD_COMBINED_SCALE_FACTOR,        ownedBy(0, 1, 11)},         // 105
    {L"Target Point",              FIELD_TARGET_POINT,                 ownedBy(7, 8)},             // 106
    {L"Azimuth",                   FIELD_AZIMUTH,                      ownedBy(7, 8)},             // 107
    {L"Slope Distance",            FIELD_SLOPE_DISTANCE,               ownedBy(7, 8)},             // 108
    {L"Horizontal Angle",          FIELD_HORIZONTAL_ANGLE,             ownedBy(7)},                // 109
    {L"Zenith Angle",              FIELD_ZENITH_ANGLE,                 ownedBy(7)},                // 110
    {L"TS Type",                   FIELD_TS_TYPE,                      ownedBy(7)},                // 111
    {L"Vertical Angle",            FIELD_VERTICAL_ANGLE,               ownedBy(7, 8)},             // 112
    {L"Horizontal Distance",       FIELD_HORIZONTAL_DISTANCE,          ownedBy(7)},                // 113
    {L"Vertical Distance",         FIELD_VERTICAL_DISTANCE,            ownedBy(7)},                // 114
    {L"Offset Height",             FIELD_OFFSET_HEIGHT,                ownedBy(7)},                // 115
    {L"Base Antenna Type",         FIELD_BASE_ANTENNA_TYPE,            ownedBy(8)},                // 116
    {L"Rover Antenna Type",        FIELD_ROVER_ANTENNA_TYPE,           ownedBy(8)},                // 117
    {L"DX",                        FIELD_DX,                           ownedBy(8)},                // 118
    {L"DY",                        FIELD_DY,                           ownedBy(8)},                // 119
    {L"DZ",                        FIELD_DZ,                           ownedBy(8)},                // 120
    {L"SigmaX",                    FIELD_SIGMA_X,                      ownedBy(8)},                // 121
    {L"SigmaY",                    FIELD_SIGMA_Y,                      ownedBy(8)},                // 122
    {L"SigmaZ",                    FIELD_SIGMA_Z,                      ownedBy(8)},                // 123
    {L"CorXY",                     FIELD_CORRELATION_XY,               ownedBy(8)},                // 124
    {L"CorXZ",                     FIELD_CORRELATION_XZ,               ownedBy(8)},                // 125
    {L"CorYZ",                     FIELD_CORRELATION_YZ,               ownedBy(8)},                // 126
    {L"CovXY",                     FIELD_COVARIANCE_XY,                ownedBy(8)},                // 127
    {L"CovXZ",                     FIELD_COVARIANCE_XZ,                ownedBy(8)},                // 128
    {L"CovYZ",                     FIELD_COVARIANCE_YZ,                ownedBy(8)},                // 129
    {L"Epochs count",              FIELD_EPOCHS_COUNT,                 ownedBy(8)},                // 130
    {L"Physical Station ID",       FIELD_PHYSICAL_STATION_ID,          ownedBy(2, 8)},             // 131
    {L"Virtual Station ID",        FIELD_VIRTUAL_STATION_ID,           ownedBy(2, 8)},             // 132
    {L"Prism Constant",            FIELD_PRISM_CONSTANT,               ownedBy(7)},                // 133
    {L"CODE",                      FIELD_CODES,                        ownedBy(9)},                // 134
    {L"DESCRIPTION",               FIELD_NOTES,                        ownedBy(9)},                // 135
    {L"POINT NUMBER",              FIELD_NAME,                         ownedBy(9)},                // 136
    {L"X",                         FIELD_LON_EAST,                     ownedBy(9)},                // 137
    {L"Y",                         FIELD_LAT_NORTH,                    ownedBy(9)},                // 138
    {L"Z",                         FIELD_HEIGHT,                       ownedBy(9)},                // 139
}};
// clang-format on

bool hasOwner(const FieldRow& row, EOwner owner) {
  return owner >= 0 && owner < kOwnerBits && (row.owners & (std::uint64_t{1} << owner)) != 0;
}

const FieldRow* firstRowOfType(EType type) {
  const auto row = std::find_if(kFieldTable.begin(), kFieldTable.end(),
                                [type](const FieldRow& r) { return r.type == type; });
  return row == kFieldTable.end() ? nullptr : &*row;
}

DexFieldFormat freeWidthField(EType type) {
  return DexFieldFormat{type, 0, 0};
}

// Appends a free-width element for every row that accepts.
template <class Predicate>
void appendRows(FieldList& list, Predicate accepts) {
  for (const FieldRow& row : kFieldTable) {
    if (accepts(row)) list.push_back(freeWidthField(row.type));
  }
}

// The comma-separated values of text, trimmed.
utils::StringArray splitAtCommas(const String& text) {
  utils::StringArray values;
  utils::parseValues(text, values, L',', String());
  return values;
}

// A decimal integer as the runtime's _wtoi reads it, independent of the locale: leading white space,
// an optional sign, then digits up to the first other character; no digits read as 0. Values beyond
// the range of int are clamped.
int readDecimalInteger(std::wstring_view text) {
  std::size_t pos = text.find_first_not_of(L" \t\n\v\f\r");
  if (pos == std::wstring_view::npos) return 0;
  const bool negative = text[pos] == L'-';
  if (text[pos] == L'-' || text[pos] == L'+') ++pos;
  long long value = 0;
  for (; pos < text.size() && text[pos] >= L'0' && text[pos] <= L'9'; ++pos) {
    value = std::min<long long>(value * 10 + (text[pos] - L'0'), static_cast<long long>(INT_MAX) + 1);
  }
  value = negative ? -value : value;
  return static_cast<int>(std::clamp<long long>(value, INT_MIN, INT_MAX));
}

}  // namespace

String typeToField(EType type) {
  const FieldRow* row = firstRowOfType(type);
  return row == nullptr ? String() : String(row->name);
}

EType fieldToType(const String& name) {
  const auto row = std::find_if(kFieldTable.begin(), kFieldTable.end(),
                                [&name](const FieldRow& r) { return name == r.name; });
  return row == kFieldTable.end() ? FIELD_UNKNOWN : row->type;
}

bool isFieldHasOwner(EType type, EOwner owner) {
  const FieldRow* row = firstRowOfType(type);
  return row != nullptr && hasOwner(*row, owner);
}

void getSupportedFieldsByOwner(FieldList& list, EOwner owner) {
  appendRows(list, [owner](const FieldRow& row) { return hasOwner(row, owner); });
}

void getSupportedFieldsByOwners(FieldList& list, EOwner with, EOwner without) {
  appendRows(list,
             [with, without](const FieldRow& row) { return hasOwner(row, with) && !hasOwner(row, without); });
}

int findTypeInArray(EType type, const FieldList& list) {
  const auto found =
      std::find_if(list.begin(), list.end(), [type](const DexFieldFormat& f) { return f.type == type; });
  return found == list.end() ? -1 : static_cast<int>(found - list.begin());
}

bool isArraysEqual(const FieldList& first, const FieldList& second) {
  return std::equal(first.begin(), first.end(), second.begin(), second.end(),
                    [](const DexFieldFormat& a, const DexFieldFormat& b) { return a.type == b.type; });
}

String fieldsToString(const FieldList& list, wchar_t separator) {
  String text;
  for (std::size_t i = 0; i < list.size(); ++i) {
    const FieldRow* row = firstRowOfType(list[i].type);
    if (row == nullptr) continue;
    if (i > 0) text += separator;
    text += row->name;
  }
  return text;
}

bool stringToFields(const String& text, FieldList& list, EOwner owner) {
  list.clear();
  bool everyValueKnown = true;
  for (const String& value : splitAtCommas(text)) {
    const auto row = std::find_if(kFieldTable.begin(), kFieldTable.end(),
                                  [&](const FieldRow& r) { return value == r.name && hasOwner(r, owner); });
    if (row == kFieldTable.end()) {
      everyValueKnown = false;
    } else {
      list.push_back(freeWidthField(row->type));
    }
  }
  return everyValueKnown;
}

String typesToString(const FieldList& list, EOwner owner) {
  String text;
  for (std::size_t i = 0; i < list.size(); ++i) {
    for (const FieldRow& row : kFieldTable) {
      if (row.type != list[i].type || !hasOwner(row, owner)) continue;
      if (i > 0) text += L',';
      text.AppendFormat(L"%d", static_cast<int>(row.type));
    }
  }
  return text;
}

void stringToTypes(const String& text, FieldList& list, EOwner owner) {
  list.clear();
  if (utils::detail::trimValue(text.view()).empty()) return;  // no values, rather than one that reads as 0
  for (const String& value : splitAtCommas(text)) {
    const int type = readDecimalInteger(value.view());
    appendRows(list, [type, owner](const FieldRow& row) { return row.type == type && hasOwner(row, owner); });
  }
}

String alignByFormat(const DexFieldFormat& format, const String& value) {
  if (format.width == 0) return value;
  const String trimmed(utils::detail::trimValue(value.view()));
  if (trimmed.GetLength() >= format.width) return trimmed.Left(format.width);
  const String pad(L' ', format.width - trimmed.GetLength());
  return format.alignment == 0 ? pad + trimmed : trimmed + pad;
}

}  // namespace vyn::ie::ascii_fields

namespace vyn::ie {

DexUserAsciiSettingsData::~DexUserAsciiSettingsData() = default;

void parseValuesByFixFmt(const DexUserAsciiSettingsData* settings, const CVynStringT<wchar_t>& line,
                         CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&>& values) {
  values.RemoveAll();
  if (settings == nullptr) return;
  const std::wstring_view text = line.view();
  long long pos = 0;
  for (const ascii_fields::DexFieldFormat& field : settings->fields) {
    const bool inside = pos >= 0 && pos < static_cast<long long>(text.size());
    const std::size_t count = field.width > 0 ? static_cast<std::size_t>(field.width) : 0;
    const std::wstring_view value =
        inside ? text.substr(static_cast<std::size_t>(pos), count) : std::wstring_view();
    values.Add(CVynStringT<wchar_t>(utils::detail::trimValue(value)));
    pos += field.width;
  }
}

}  // namespace vyn::ie
