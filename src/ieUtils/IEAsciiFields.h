#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IEUtilsStringArray.h"

// Custom ASCII field lists: the ordered columns of a user-defined text format. The library holds one
// built-in table of every known field (its display name, its type and the record kinds, called owners,
// that may use it); the functions below turn field lists into text and back, by names or by type
// numbers. Several names and types stand in more than one row of the table; a search meets the first
// row in table order, and lists built from the table follow that order.
namespace vyn::ie::ascii_fields {

// The field types. The display name of each stands after it; FIELD_UNKNOWN is the answer for a name
// that is not in the table.
enum EType : std::int32_t {
  FIELD_NAME = 0,                           // "Name"
  FIELD_LAT_NORTH = 1,                      // "Lat(North)"
  FIELD_LON_EAST = 2,                       // "Lon(East)"
  FIELD_HEIGHT = 3,                         // "Ht"
  FIELD_HEIGHT_GEOID = 4,                   // "Ht(G)"
  FIELD_DEPTH = 5,                          // "Depth"
  FIELD_NOTES = 6,                          // "Notes"
  FIELD_CODES = 7,                          // "Codes"
  FIELD_CODES_AND_DESCRIPTIONS = 8,         // "Codes&Descriptions"
  FIELD_CODES_AND_STRINGS = 9,              // "Codes&Strings"
  FIELD_CODES_AND_ATTRIBUTES = 10,          // "Codes&Attributes"
  FIELD_FULL_CODES = 11,                    // "FullCodes"
  FIELD_HRMS = 12,                          // "HRMS"
  FIELD_VRMS = 13,                          // "VRMS"
  FIELD_DATE = 14,                          // "Date"
  FIELD_TIME = 15,                          // "Time"
  FIELD_PDOP = 16,                          // "PDOP"
  FIELD_HDOP = 17,                          // "HDOP"
  FIELD_VDOP = 18,                          // "VDOP"
  FIELD_GDOP = 19,                          // "GDOP"
  FIELD_TDOP = 20,                          // "TDOP"
  FIELD_SOLUTION_TYPE = 21,                 // "Solution Type"
  FIELD_GPS_SATELLITES = 22,                // "GPS satellites"
  FIELD_GLONASS_SATELLITES = 23,            // "GLONASS satellites"
  FIELD_INSTRUMENT_OR_BASE_HEIGHT = 24,     // "HI/Base Ant. Ht."
  FIELD_BACKSIGHT_POINT = 25,               // "Backsight Pt"
  FIELD_INSTRUMENT_OR_BASE_POINT = 26,      // "Instrument/Base Point"
  FIELD_TARGET_OR_ANTENNA_HEIGHT = 27,      // "HR/Ant Ht."
  FIELD_DESIGN_POINT = 28,                  // "Design Point"
  FIELD_STAKED_POINT = 29,                  // "Staked Point"
  FIELD_STAKEOUT_CUT = 30,                  // "Cut"
  FIELD_STAKEOUT_FILL = 31,                 // "Fill"
  FIELD_CUT_FILL = 32,                      // "Cut(Fill)"
  FIELD_TIME_STAMP = 33,                    // "Time Stamp"
  FIELD_STATION = 34,                       // "Station"
  FIELD_OFFSET_DIRECTION = 35,              // "Offset Direction"
  FIELD_OFFSET_DISTANCE = 36,               // "Offset Distance"
  FIELD_DESIGN_NORTH = 37,                  // "Design North"
  FIELD_DESIGN_EAST = 38,                   // "Design East"
  FIELD_DESIGN_ELEVATION = 39,              // "Design Elevation"
  FIELD_STATION_NORTH = 40,                 // "Station North"
  FIELD_STATION_EAST = 41,                  // "Station East"
  FIELD_STATION_ELEVATION = 42,             // "Station Elevation"
  FIELD_DELTA_NORTH = 43,                   // "Delta North"
  FIELD_DELTA_EAST = 44,                    // "Delta East"
  FIELD_DELTA_ELEVATION = 45,               // "Delta Elevation"
  FIELD_INTERNAL_CHAINAGE = 46,             // "Internal Chainage"
  FIELD_STAKEOUT_CHAINAGE = 47,             // "Chainage"
  FIELD_PTL_DISTANCE = 48,                  // "PTL Distance"
  FIELD_DELTA_H = 49,                       // "Delta H"
  FIELD_TEMPLATE_NAME = 50,                 // "Template Name"
  FIELD_ROAD_SIDE = 51,                     // "Road Side"
  FIELD_SECTION_CHAINAGE = 52,              // "Chainage"
  FIELD_OFFSET_FROM_CENTRE_LINE = 53,       // "Offset From CL"
  FIELD_OFFSET_FROM_PREVIOUS_SEGMENT = 54,  // "Offset From Prev. Seg."
  FIELD_ABSOLUTE_HEIGHT = 55,               // "Absolute Height"
  FIELD_HEIGHT_FROM_CENTRE_LINE = 56,       // "Height From CL"
  FIELD_HEIGHT_FROM_PREVIOUS_SEGMENT = 57,  // "Height From Prev. Seg."
  FIELD_SECTION_CODE = 58,                  // "Code"
  FIELD_SECTION_CUT = 59,                   // "Cut"
  FIELD_SECTION_FILL = 60,                  // "Fill"
  FIELD_GENERAL_PREFIX = 61,                // "General Prefix"
  FIELD_CODE = 62,                          // "Code"
  FIELD_CODE_SEPARATOR = 63,                // "Code Separator"
  FIELD_CONTROL_CODE = 64,                  // "Control Code"
  FIELD_CONTROL_CODE_SEPARATOR = 65,        // "Control Code Separator"
  FIELD_CODE_STRING = 66,                   // "Code String"
  FIELD_STRING_SEPARATOR = 67,              // "String Separator"
  FIELD_NOTE = 68,                          // "Note"
  FIELD_NOTE_SEPARATOR = 69,                // "Note Separator"
  FIELD_ATTRIBUTE_NAME = 70,                // "Attribute Name"
  FIELD_ATTRIBUTE_NAME_SEPARATOR = 71,      // "Attribute Name Separator"
  FIELD_ATTRIBUTE_VALUE = 72,               // "Attribute Value"
  FIELD_ATTRIBUTE_VALUE_SEPARATOR = 73,     // "Attribute Value Separator"
  FIELD_DESCRIPTION = 74,                   // "Description"
  FIELD_CODE_TYPE = 75,                     // "Code Type"
  FIELD_LAYER_NAME = 76,                    // "Layer Name"
  FIELD_LAYER_COLOR = 77,                   // "Layer Color"
  FIELD_LAYER_POINT_SYMBOL = 78,            // "Layer Point Symbol"
  FIELD_LAYER_LINE_STYLE = 79,              // "Layer Line Style"
  FIELD_LAYER_LINE_WIDTH = 80,              // "Layer Line Width"
  FIELD_LAYER_AREA_STYLE = 81,              // "Layer Area Style"
  FIELD_LAYER_AREA_TRANSPARENCY = 82,       // "Layer Area Transparency"
  FIELD_CODE_POINT_SYMBOL = 83,             // "Code Point Symbol"
  FIELD_CODE_POINT_COLOR = 84,              // "Code Point Color"
  FIELD_CODE_LINE_STYLE = 85,               // "Code Line Style"
  FIELD_CODE_LINE_WIDTH = 86,               // "Code Line Width"
  FIELD_CODE_LINE_COLOR = 87,               // "Code Line Color"
  FIELD_CODE_AREA_STYLE = 88,               // "Code Area Style"
  FIELD_CODE_AREA_COLOR = 89,               // "Code Area Color"
  FIELD_CODE_AREA_TRANSPARENCY = 90,        // "Code Area Transparency"
  FIELD_CODE_ATTRIBUTE_PROMPT = 91,         // "Code Attribute Prompt"
  FIELD_LAT = 92,                           // "Lat"
  FIELD_LON = 93,                           // "Lon"
  FIELD_X = 94,                             // "X"
  FIELD_Y = 95,                             // "Y"
  FIELD_Z = 96,                             // "Z"
  FIELD_NORTHING = 97,                      // "Northing"
  FIELD_EASTING = 98,                       // "Easting"
  FIELD_GEOID_SEPARATION = 99,              // "Geoid Separation"
  FIELD_COMBINED_SCALE_FACTOR = 100,        // "Combined Scale Factor"
  FIELD_TARGET_POINT = 101,                 // "Target Point"
  FIELD_AZIMUTH = 102,                      // "Azimuth"
  FIELD_SLOPE_DISTANCE = 103,               // "Slope Distance"
  FIELD_HORIZONTAL_ANGLE = 104,             // "Horizontal Angle"
  FIELD_ZENITH_ANGLE = 105,                 // "Zenith Angle"
  FIELD_TS_TYPE = 106,                      // "TS Type"
  FIELD_VERTICAL_ANGLE = 107,               // "Vertical Angle"
  FIELD_HORIZONTAL_DISTANCE = 108,          // "Horizontal Distance"
  FIELD_VERTICAL_DISTANCE = 109,            // "Vertical Distance"
  FIELD_OFFSET_HEIGHT = 110,                // "Offset Height"
  FIELD_BASE_ANTENNA_TYPE = 111,            // "Base Antenna Type"
  FIELD_ROVER_ANTENNA_TYPE = 112,           // "Rover Antenna Type"
  FIELD_DX = 113,                           // "DX"
  FIELD_DY = 114,                           // "DY"
  FIELD_DZ = 115,                           // "DZ"
  FIELD_SIGMA_X = 116,                      // "SigmaX"
  FIELD_SIGMA_Y = 117,                      // "SigmaY"
  FIELD_SIGMA_Z = 118,                      // "SigmaZ"
  FIELD_CORRELATION_XY = 119,               // "CorXY"
  FIELD_CORRELATION_XZ = 120,               // "CorXZ"
  FIELD_CORRELATION_YZ = 121,               // "CorYZ"
  FIELD_COVARIANCE_XY = 122,                // "CovXY"
  FIELD_COVARIANCE_XZ = 123,                // "CovXZ"
  FIELD_COVARIANCE_YZ = 124,                // "CovYZ"
  FIELD_EPOCHS_COUNT = 125,                 // "Epochs count"
  FIELD_TOLERANCE = 126,                    // "Tolerance"
  FIELD_GALILEO_SATELLITES = 127,           // "GALILEO satellites"
  FIELD_BEIDOU_SATELLITES = 128,            // "BEIDOU satellites"
  FIELD_QZSS_SATELLITES = 129,              // "QZSS satellites"
  FIELD_SBAS_SATELLITES = 130,              // "SBAS satellites"
  FIELD_PHYSICAL_STATION_ID = 131,          // "Physical Station ID"
  FIELD_VIRTUAL_STATION_ID = 132,           // "Virtual Station ID"
  FIELD_PRISM_CONSTANT = 133,               // "Prism Constant"
  FIELD_UNKNOWN = 134,
};

// The kinds of record a field belongs to. In the table, owner n is the bit 1 << n of a 64-bit mask.
enum EOwner : std::int32_t {
  OWNER_POINTS = 0,                // names, coordinates, heights, notes, codes in five forms, layer
  OWNER_PLAIN_POINTS = 1,          // points without notes and without the combined code forms
  OWNER_GNSS_POINTS = 2,           // points with accuracies, date, time, DOP values, satellites, antenna
  OWNER_STAKEOUT = 3,              // stakeout records
  OWNER_CROSS_SECTION_POINTS = 4,  // road cross-section points
  OWNER_CODE_STRING = 5,           // the parts of a code string
  OWNER_CODE_LIBRARY = 6,          // code library entries with their layer and drawing styles
  OWNER_TS_OBSERVATIONS = 7,       // total-station observations
  OWNER_GNSS_OBSERVATIONS = 8,     // GNSS observations
  OWNER_FIXED_POINT_LAYOUT = 9,    // upper-case point number, code, description, X, Y, Z
  OWNER_NONE = 10,                 // no field
  OWNER_ACCURACIES = 11,           // accuracies, geoid separation, combined scale factor
};

// One column of a field list: its type, its width in characters (0 = free width) and the side on which
// a fixed-width value is padded (0 = blanks in front of the value, any other value = blanks after it).
struct DexFieldFormat {
  EType type = FIELD_NAME;
  std::int32_t width = 0;
  std::int32_t alignment = 0;
};

using FieldList = vyn_vector<DexFieldFormat>;

// Table searches. typeToField: the name of the first row of type, empty when none. fieldToType: the type
// of the first row named name (exact, case-sensitive), FIELD_UNKNOWN when none. isFieldHasOwner:
// whether the first row of type has owner; false for a type or owner outside the table.
DEX_API CVynStringT<wchar_t> typeToField(EType type);
DEX_API EType fieldToType(const CVynStringT<wchar_t>& name);
DEX_API bool isFieldHasOwner(EType type, EOwner owner);

// Lists from the table. Each appends, in table order, one element {type, 0, 0} for every row that has
// owner (and, for the second, has not without); the list is not cleared first.
DEX_API void getSupportedFieldsByOwner(FieldList& list, EOwner owner);
DEX_API void getSupportedFieldsByOwners(FieldList& list, EOwner with, EOwner without);

// The index of the first element of type, -1 when none.
DEX_API int findTypeInArray(EType type, const FieldList& list);
// Same length and the same type at every index; widths and alignments are not compared.
DEX_API bool isArraysEqual(const FieldList& first, const FieldList& second);

// Field lists as names. fieldsToString joins the names of the elements' types with separator; an
// element whose type is not in the table writes nothing, and the separator stands before every name
// except that of the element at index 0. stringToFields clears list and, for each comma-separated
// value (trimmed), appends {type, 0, 0} of the first row with that name and owner; a value without
// such a row is skipped. It answers true when every value gave an element (an empty text is one empty
// value, so it answers false).
DEX_API CVynStringT<wchar_t> fieldsToString(const FieldList& list, wchar_t separator);
DEX_API bool stringToFields(const CVynStringT<wchar_t>& text, FieldList& list, EOwner owner);

// Field lists as type numbers. typesToString writes, for each element and each table row with the
// element's type and owner, the type number in decimal, with a comma before it unless the element is
// at index 0. stringToTypes clears list and, for each comma-separated value read as a decimal integer
// (leading blanks and a sign allowed, reading stops at the first other character; an empty value or
// one without digits reads as 0), appends {type, 0, 0} for each table row with that type and owner.
// An empty or blank text gives an empty list.
DEX_API CVynStringT<wchar_t> typesToString(const FieldList& list, EOwner owner);
DEX_API void stringToTypes(const CVynStringT<wchar_t>& text, FieldList& list, EOwner owner);

// value in the column of format: unchanged for width 0; otherwise trimmed of blanks, tabs and line
// ends, then cut to width characters or padded with blanks to width (in front when alignment is 0).
// A negative width gives an empty text.
DEX_API CVynStringT<wchar_t> alignByFormat(const DexFieldFormat& format, const CVynStringT<wchar_t>& value);

}  // namespace vyn::ie::ascii_fields

namespace vyn::ie {

// The user's custom ASCII layout inside the import and export settings: a delimiter, three flags and
// the field list. The library copies the delimiter and the flags and reads only the field list; the
// plug-ins and the settings give them their meaning.
struct DEX_API DexUserAsciiSettingsData {
  VYN_CLASS_ALLOCATOR

  DexUserAsciiSettingsData() = default;
  DexUserAsciiSettingsData(const DexUserAsciiSettingsData&) = default;
  DexUserAsciiSettingsData& operator=(const DexUserAsciiSettingsData&) = default;
  virtual ~DexUserAsciiSettingsData();

  wchar_t delimiter = L',';        // between the values of a delimited line
  bool fixedWidth = false;         // the values stand in columns of fixed width
  bool headerLine = false;         // the first line names the fields
  bool quotedValues = false;       // texts are written in double quotes
  ascii_fields::FieldList fields;  // the columns in order
};

// Splits a fixed-width line by the widths of the settings' field list: one value per field, in order,
// each the next width characters of line (fewer at its end, none past it) trimmed at both ends. values
// is cleared first, so it always ends with as many values as there are fields; null settings give no
// values. A field of negative width gives an empty value and moves the position back by its width.
DEX_API void parseValuesByFixFmt(const DexUserAsciiSettingsData* settings, const CVynStringT<wchar_t>& line,
                                 CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&>& values);

}  // namespace vyn::ie
