#include "PointLayout.h"

#include <algorithm>

namespace vyn::ie::point_files {

using namespace ascii_fields;

bool isPointFileFormat(const DexFormat* format) {
  return format != nullptr && (format->isIdEqual(kCsvFormatId) || format->isIdEqual(kCustomAsciiFormatId));
}

EColumn columnOf(EType type) {
  switch (type) {
    case FIELD_NAME:
      return EColumn::NAME;
    case FIELD_LAT_NORTH:
    case FIELD_LAT:
    case FIELD_Y:
    case FIELD_NORTHING:
      return EColumn::NORTH;
    case FIELD_LON_EAST:
    case FIELD_LON:
    case FIELD_X:
    case FIELD_EASTING:
      return EColumn::EAST;
    case FIELD_HEIGHT:
    case FIELD_Z:
      return EColumn::HEIGHT;
    case FIELD_HEIGHT_GEOID:
      return EColumn::GEOID_HEIGHT;
    case FIELD_NOTES:
      return EColumn::NOTES;
    case FIELD_CODES:
    case FIELD_CODES_AND_DESCRIPTIONS:
      return EColumn::CODES;
    case FIELD_CODES_AND_STRINGS:
      return EColumn::CODES_STRINGS;
    case FIELD_CODES_AND_ATTRIBUTES:
      return EColumn::CODES_ATTRS;
    case FIELD_FULL_CODES:
      return EColumn::FULL_CODES;
    case FIELD_LAYER_NAME:
      return EColumn::LAYER;
    default:
      return EColumn::OTHER;
  }
}

int PointLayout::findColumn(EColumn column) const {
  for (int i = 0; i < static_cast<int>(fields.size()); ++i) {
    if (columnOf(fields[static_cast<std::size_t>(i)].type) == column) return i;
  }
  return -1;
}

std::wstring PointLayout::label(std::size_t column) const {
  if (column < labels.size() && !labels[column].empty()) return labels[column];
  return column < fields.size() ? std::wstring(typeToField(fields[column].type).view()) : std::wstring();
}

namespace {

void setCsvColumns(PointLayout& layout) {
  layout.fields = {{FIELD_NAME, 0, 0},
                   {FIELD_NORTHING, 0, 0},
                   {FIELD_EASTING, 0, 0},
                   {FIELD_HEIGHT, 0, 0},
                   {FIELD_FULL_CODES, 0, 0}};
  layout.fixedWidth = false;
  layout.headerLine = false;
  layout.quoteAlways = false;
  layout.columnsFrom = ESource::ASSUMED;
}

// The point fields of the user's layout; false when it has none.
bool setCustomColumns(const DexUserAsciiSettingsData& ascii, PointLayout& layout) {
  layout.fields.clear();
  for (const DexFieldFormat& field : ascii.fields) {
    if (isFieldHasOwner(field.type, OWNER_POINTS)) layout.fields.push_back(field);
  }
  if (layout.fields.empty()) return false;
  layout.fixedWidth = std::any_of(layout.fields.begin(), layout.fields.end(),
                                  [](const DexFieldFormat& field) { return field.width > 0; });
  layout.headerLine = ascii.headerLine;
  layout.quoteAlways = ascii.quotedValues && !layout.fixedWidth;
  layout.columnsFrom = ESource::GIVEN;
  return true;
}

}  // namespace

bool makeLayout(const DexFormat* format, const DexSettings& settings, bool forImport, PointLayout& layout) {
  if (!isPointFileFormat(format)) return false;
  layout = PointLayout();
  const DexUserAsciiSettingsData* ascii = settings.userAsciiSettings;
  const bool csv = format->isIdEqual(kCsvFormatId);
  const bool customColumns = ascii != nullptr && (forImport || !csv) && setCustomColumns(*ascii, layout);
  if (!customColumns) setCsvColumns(layout);
  // A CSV file is delimited whatever widths the custom layout gives.
  if (csv) layout.fixedWidth = layout.headerLine = false;
  const bool delimiterGiven = ascii != nullptr && !csv && ascii->delimiter != kDelimiterToFind;
  if (delimiterGiven) layout.delimiter = ascii->delimiter;
  layout.delimiterFrom = delimiterGiven || !forImport ? ESource::GIVEN : ESource::FOUND;
  layout.units = settings.distUnits;
  for (std::size_t i = 0; i < layout.decimals.size(); ++i)
    layout.decimals[i] = std::clamp(settings.coordDecimals[i], 0, 12);
  return true;
}

DexUserAsciiSettingsData toAsciiSettings(const PointLayout& layout) {
  DexUserAsciiSettingsData ascii;
  ascii.delimiter = layout.delimiter;
  ascii.fixedWidth = layout.fixedWidth;
  ascii.headerLine = layout.headerLine;
  ascii.quotedValues = layout.quoteAlways;
  ascii.fields = layout.fields;
  return ascii;
}

}  // namespace vyn::ie::point_files
