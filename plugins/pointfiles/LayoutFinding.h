#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "PointLayout.h"

// Finding the layout of a point file from its first lines: the delimiter, and the columns a header
// line names. Also the order names surveyors give point files ("PNEZD").
namespace vyn::ie::point_files {

// One line of a file with its line number (counted from 1).
using NumberedLine = std::pair<int, std::wstring>;

// An order name as columns: P Name, N Northing, E Easting, Z Ht, D FullCodes (the codes or the
// description); case ignored, each letter at most once, N and E required. False, with fields
// untouched, for any other text.
bool fieldsFromOrder(std::wstring_view order, ascii_fields::FieldList& fields);
// The order name of the columns, or empty when one of them has no letter.
std::wstring orderOf(const ascii_fields::FieldList& fields);

// Takes the columns a header line names into layout (its fields and labels): the library's point
// field names and the common names (Point, Name, PtNo, Id; N, Northing, Y, North; E, Easting, X,
// East; Z, Elevation, Elev, Height, H; Code; Description, Desc, D; Notes; Layer), case, blanks,
// underscores and a trailing unit in parentheses ignored. A description is the code column when no
// code column is named. A name that no field matches, and a second column of the same kind, make an
// OTHER column labelled with the name. False (layout untouched) when no value names a coordinate
// column or a value is a number: such a line is no header.
bool readHeader(const std::vector<std::wstring_view>& values, PointLayout& layout);

// The delimiter that splits the lines into the most lines of two numbers or more: tab, semicolon,
// comma, pipe or runs of blanks (the earlier on a tie). fallback when none gives such a line.
wchar_t findDelimiter(const std::vector<NumberedLine>& lines, wchar_t fallback);

// "comma", "semicolon", "tab", "blanks", "pipe", or the character in double quotes.
std::wstring delimiterWord(wchar_t delimiter);

// Completes an import's layout from the first non-blank lines of its file. When the delimiter is
// left to the file, it is found (ESource::FOUND; ESource::ASSUMED with the comma when no delimiter
// gives numbers). The header is the last line before the first line of numbers that names columns
// (with the layout's headerLine set, the first line, whatever it names); its columns replace the
// layout's. Answers true when they replaced other columns given in the settings.
bool findLayout(const std::vector<NumberedLine>& firstLines, PointLayout& layout);

}  // namespace vyn::ie::point_files
