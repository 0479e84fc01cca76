#pragma once

#include <array>
#include <string_view>

#include "hostlibs/VynString.h"
#include "ieDefinitions/IEFormats.h"
#include "ieUtils/IEAsciiFields.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/IEUtilsUnits.h"

// The layout of a point file shared by the point-file importer and exporter: which value stands in
// each column, how the columns are separated, and the units and decimals of the coordinates.
namespace vyn::ie::point_files {

// The formats the point-file plug-ins read and write.
inline constexpr const wchar_t* kCsvFormatId = L"{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}";
inline constexpr const wchar_t* kCustomAsciiFormatId = L"{5F39DDC1-F0FD-4F27-938A-96EFF426CD60}";

// The remark an importer answers when it skipped malformed lines but read at least one point: a
// success (above 0) that a host must not take for a plain DEX_RESULT_OK. Each skipped line is traced
// (the first kTracedSkippedLines of them with their line number and reason) and a last trace gives
// the count.
inline constexpr EDexResult kResultLinesSkipped = static_cast<EDexResult>(23);
inline constexpr int kTracedSkippedLines = 10;

// True for the two formats above.
bool isPointFileFormat(const DexFormat* format);

// What a column holds, as the importer and the exporter treat it.
enum class EColumn {
  NAME,
  NORTH,          // Lat(North), Lat, Y, Northing: the station's x
  EAST,           // Lon(East), Lon, X, Easting: the station's y
  HEIGHT,         // Ht, Z
  GEOID_HEIGHT,   // Ht(G)
  NOTES,          // Notes
  CODES,          // Codes, Codes&Descriptions: the code names
  CODES_STRINGS,  // Codes&Strings: the codes with their code strings
  CODES_ATTRS,    // Codes&Attributes: the codes with their attribute values
  FULL_CODES,     // FullCodes: the codes with code strings and attribute values
  LAYER,          // Layer Name: the layer of the draw dictionary (added when missing)
  IGNORED,        // any other point field: read over, written empty
};

EColumn columnOf(ascii_fields::EType type);

// One file's layout.
struct PointLayout {
  ascii_fields::FieldList fields;  // the columns in order
  wchar_t delimiter = L',';
  bool fixedWidth = false;    // the fields give widths: columns of fixed width, no delimiter
  bool headerLine = false;    // the exporter writes the field names first; the importer skips them
  bool quoteAlways = false;   // texts are always written in double quotes (otherwise only when needed)
  EDistUnits units = METERS;  // the unit of the coordinates in the file
  std::array<int, 3> decimals{3, 3, 3};  // written decimals of north, east and heights

  // The index of the first column of that kind, or -1.
  int findColumn(EColumn column) const;
};

// The layout of a format for a run with these settings:
//  - "CSV (Comma delimited)": Name, Northing, Easting, Ht, FullCodes, comma-delimited, texts
//    quoted only when they need it, no header line (an importer skips a first line that names the
//    columns);
//  - "Customizable ASCII Point Files": the point fields (owner 0) of the settings' custom ASCII
//    layout in order, its delimiter and flags; the columns are of fixed width when any field gives
//    a width. Without custom ASCII settings, or with no point field in them, the CSV layout.
// The units come from the settings' distUnits (ANY_UNITS converts nothing), the decimals from
// coordDecimals. False for another format.
bool makeLayout(const DexFormat* format, const DexSettings& settings, PointLayout& layout);

// The custom ASCII settings data a fixed-width layout is split by (the layout's fields and delimiter).
DexUserAsciiSettingsData toAsciiSettings(const PointLayout& layout);

}  // namespace vyn::ie::point_files
