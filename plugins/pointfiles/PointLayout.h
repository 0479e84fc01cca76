#pragma once

#include <array>
#include <string>
#include <string_view>
#include <vector>

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

// The remark an importer answers when it dropped lines (no name or no coordinates) but read at least
// one point: a success (above 0) that a host must not take for a plain DEX_RESULT_OK. The notes name
// the first kNotedLines dropped lines with their line number and reason, and give the count.
inline constexpr EDexResult kResultLinesSkipped = static_cast<EDexResult>(23);
inline constexpr int kNotedLines = 10;

// The delimiter of settings that leave it to the importer to find it in the file.
inline constexpr wchar_t kDelimiterToFind = L'\0';

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
  OTHER,          // any other field, or a header's name no field matches: read into the notes, written empty
};

EColumn columnOf(ascii_fields::EType type);

// How an import came to its columns and delimiter.
enum class ESource {
  GIVEN,    // the settings' custom ASCII layout (or the format's own delimiter)
  HEADER,   // the file's header line named the columns
  FOUND,    // the delimiter was found from the first lines
  ASSUMED,  // the format's columns, for want of a header line or a layout in the settings
};

// One file's layout.
struct PointLayout {
  ascii_fields::FieldList fields;    // the columns in order
  std::vector<std::wstring> labels;  // the header's name of each column; empty when not read from one
  wchar_t delimiter = L',';
  bool fixedWidth = false;    // the fields give widths: columns of fixed width, no delimiter
  bool headerLine = false;    // the exporter writes the field names first; the importer skips the first line
  bool quoteAlways = false;   // texts are always written in double quotes (otherwise only when needed)
  EDistUnits units = METERS;  // the unit of the coordinates in the file
  std::array<int, 3> decimals{3, 3, 3};  // written decimals of north, east and heights

  // What an import found out (makeLayout sets the sources to GIVEN or ASSUMED).
  ESource columnsFrom = ESource::ASSUMED;
  ESource delimiterFrom = ESource::GIVEN;
  int headerLineNumber = 0;  // the line skipped as the header, 0 when none

  // The index of the first column of that kind, or -1.
  int findColumn(EColumn column) const;
  // The header's name of a column, or else its field name.
  std::wstring label(std::size_t column) const;
  // Whether numbers may carry a decimal comma: when the comma does not separate the values.
  bool decimalComma() const { return fixedWidth || delimiter != L','; }
};

// The layout of a format for a run with these settings:
//  - "CSV (Comma delimited)": written as Name, Northing, Easting, Ht, FullCodes, comma-delimited,
//    texts quoted only when they need it, no header line. Read with the point fields of the
//    settings' custom ASCII layout when it has any, otherwise with those columns; the delimiter is
//    found in the file.
//  - "Customizable ASCII Point Files": the point fields (owner 0) of the settings' custom ASCII
//    layout in order, its delimiter and flags; the columns are of fixed width when any field gives
//    a width. Without custom ASCII settings, or with no point field in them, the CSV columns. The
//    delimiter kDelimiterToFind (or no custom ASCII settings) leaves it to the importer.
// A header line that names the columns takes precedence over both when a file is read (the importer
// finds it). The units come from the settings' distUnits (ANY_UNITS converts nothing), the decimals
// from coordDecimals. False for another format.
bool makeLayout(const DexFormat* format, const DexSettings& settings, bool forImport, PointLayout& layout);

// The custom ASCII settings data a fixed-width layout is split by (the layout's fields and delimiter).
DexUserAsciiSettingsData toAsciiSettings(const PointLayout& layout);

}  // namespace vyn::ie::point_files
