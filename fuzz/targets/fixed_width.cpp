// Fixed-width splitting and the field-list readers. The first byte gives the number of fields and
// each field takes three bytes (type, signed width, alignment; widths 0x80 and 0x7F stand for the
// extremes of an int), then a byte names the owner. The rest, up to an LF, is the fixed-width line;
// after the LF comes a field list read both as names and as type numbers.

#include <algorithm>
#include <climits>
#include <cstddef>
#include <cstdint>

#include "ieUtils/IEAsciiFields.h"
#include "ieUtils/IEUtilsStringArray.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/FuzzText.h"

namespace {

namespace fields = vyn::ie::ascii_fields;
using String = CVynStringT<wchar_t>;

constexpr int kMostFields = 31;
constexpr int kWidestAlignedColumn = 1 << 16;

int widthOf(std::uint8_t byte) {
  if (byte == 0x80) return INT_MIN;
  if (byte == 0x7F) return INT_MAX;
  return static_cast<std::int8_t>(byte);
}

vyn::ie::DexUserAsciiSettingsData settingsFrom(dex_fuzz::FuzzInput& input) {
  vyn::ie::DexUserAsciiSettingsData settings;
  const int count = input.takeInt(0, kMostFields);
  for (int i = 0; i < count; ++i) {
    fields::DexFieldFormat field;
    field.type = static_cast<fields::EType>(input.takeByte());
    field.width = widthOf(input.takeByte());
    field.alignment = input.takeByte() % 2;
    settings.fields.push_back(field);
  }
  return settings;
}

void splitFixedWidth(const vyn::ie::DexUserAsciiSettingsData& settings, const String& line) {
  vyn::ie::utils::StringArray values;
  vyn::ie::parseValuesByFixFmt(&settings, line, values);
  DEX_FUZZ_CHECK(values.GetSize() == static_cast<int>(settings.fields.size()));
  for (int i = 0; i < values.GetSize(); ++i) {
    const fields::DexFieldFormat& field = settings.fields[static_cast<std::size_t>(i)];
    DEX_FUZZ_CHECK(values[i].GetLength() <= (field.width > 0 ? field.width : 0));
    // A column as wide as an int would be padded to gigabytes, as asked: keep to sane widths here.
    if (field.width > kWidestAlignedColumn) continue;
    const String aligned = fields::alignByFormat(field, values[i]);
    if (field.width > 0) DEX_FUZZ_CHECK(aligned.GetLength() == field.width);
    if (field.width < 0) DEX_FUZZ_CHECK(aligned.IsEmpty());
  }
  vyn::ie::parseValuesByFixFmt(nullptr, line, values);
  DEX_FUZZ_CHECK(values.GetSize() == 0);
}

// Lists read from text hold rows of the table only, at free width.
void checkList(const fields::FieldList& list) {
  for (const fields::DexFieldFormat& field : list) {
    DEX_FUZZ_CHECK(!fields::typeToField(field.type).IsEmpty());
    DEX_FUZZ_CHECK(field.width == 0 && field.alignment == 0);
  }
  DEX_FUZZ_CHECK(fields::isArraysEqual(list, list));
  if (!list.empty()) DEX_FUZZ_CHECK(fields::findTypeInArray(list.front().type, list) == 0);
}

void readFieldLists(const String& text, fields::EOwner owner) {
  fields::FieldList byNames;
  const bool everyName = fields::stringToFields(text, byNames, owner);
  checkList(byNames);
  // Every comma-separated value gave a field, or the answer says otherwise.
  const auto values = static_cast<std::size_t>(std::count(text.view().begin(), text.view().end(), L',')) + 1;
  DEX_FUZZ_CHECK(everyName == (byNames.size() == values));

  fields::FieldList byTypes;
  fields::stringToTypes(text, byTypes, owner);
  checkList(byTypes);

  // The table answers for any type and owner, inside it or not.
  for (const fields::DexFieldFormat& field : byNames) {
    DEX_FUZZ_CHECK(fields::fieldToType(fields::typeToField(field.type)) != fields::FIELD_UNKNOWN);
    [[maybe_unused]] const bool owned = fields::isFieldHasOwner(field.type, owner);
  }
  fields::FieldList supported;
  fields::getSupportedFieldsByOwners(supported, owner, static_cast<fields::EOwner>(text.GetLength() % 16));
  checkList(supported);

  // What the writers form reads back without a fault.
  fields::FieldList again;
  fields::stringToFields(fields::fieldsToString(byNames, L','), again, owner);
  fields::stringToTypes(fields::typesToString(byTypes, owner), again, owner);
  checkList(again);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  dex_fuzz::FuzzInput input(data, size);
  const vyn::ie::DexUserAsciiSettingsData settings = settingsFrom(input);
  const auto owner = static_cast<fields::EOwner>(input.takeInt(0, 15));
  const String line(dex_fuzz::decodeLenientUtf8(input.takeUntil('\n')));
  const String list(dex_fuzz::decodeLenientUtf8(input.takeRest()));

  splitFixedWidth(settings, line);
  readFieldLists(list, owner);
  return 0;
}
