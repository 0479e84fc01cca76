#include "ieUtils/IEAsciiFields.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <initializer_list>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "support/Cases.h"
#include "support/PrintString.h"

namespace {

using String = CVynStringT<wchar_t>;
namespace fields = vyn::ie::ascii_fields;
using fields::DexFieldFormat;
using fields::EOwner;
using fields::EType;
using fields::FieldList;
using Types = std::vector<int>;

constexpr int kOwnerCount = 12;

struct Row {
  std::wstring name;
  int type = 0;
  std::vector<int> owners;
  bool hasOwner(int owner) const { return std::find(owners.begin(), owners.end(), owner) != owners.end(); }
};

// tests/data/cases/asciifields.txt, the table as users and settings know it.
const std::vector<Row>& table() {
  static const std::vector<Row> rows = [] {
    std::vector<Row> read;
    for (const dex_test::Case& c : dex_test::casesOf("asciifields.txt")) {
      Row row{c.text(0), c.integer(1), {}};
      std::istringstream owners(c[2]);
      for (int owner = 0; owners >> owner;)
        row.owners.push_back(owner);
      read.push_back(row);
    }
    return read;
  }();
  return rows;
}

// The first row of the type, or of the name with the owner (any owner for -1).
const Row* firstRow(int type, const std::wstring& name = L"", int owner = -1) {
  for (const Row& row : table()) {
    if (name.empty() ? row.type == type : row.name == name && (owner == -1 || row.hasOwner(owner)))
      return &row;
  }
  return nullptr;
}

FieldList fieldsOf(std::initializer_list<int> types) {
  FieldList list;
  for (const int type : types)
    list.push_back(DexFieldFormat{static_cast<EType>(type), 7, 1});
  return list;
}

Types typesOf(const FieldList& list) {
  Types types;
  for (const DexFieldFormat& field : list)
    types.push_back(field.type);
  return types;
}

EOwner owner(int value) {
  return static_cast<EOwner>(value);
}

TEST(FieldTable, NamesTypesAndOwnersFollowTheFirstRowOfEachNameAndType) {
  ASSERT_EQ(table().size(), 140u);
  for (int type = 0; type < fields::FIELD_UNKNOWN; ++type) {
    const Row* first = firstRow(type);
    ASSERT_NE(first, nullptr) << type;
    EXPECT_EQ(fields::typeToField(static_cast<EType>(type)), first->name.c_str()) << type;
    for (int o = 0; o < kOwnerCount; ++o)
      EXPECT_EQ(fields::isFieldHasOwner(static_cast<EType>(type), owner(o)), first->hasOwner(o))
          << type << " " << o;
  }
  for (const Row& row : table()) {
    EXPECT_EQ(fields::fieldToType(row.name.c_str()), firstRow(0, row.name)->type)
        << dex_test::narrow(row.name);
    for (const int o : row.owners) {  // every row is reachable by name and by type with each of its owners
      FieldList list;
      EXPECT_TRUE(fields::stringToFields(row.name.c_str(), list, owner(o)));
      EXPECT_EQ(typesOf(list), Types{firstRow(0, row.name, o)->type});
      fields::stringToTypes(std::to_wstring(row.type).c_str(), list, owner(o));
      EXPECT_EQ(typesOf(list), Types{row.type});
    }
  }
  for (int o = 0; o < kOwnerCount; ++o) {  // the lists of an owner follow the table order
    Types expected;
    for (const Row& row : table())
      if (row.hasOwner(o)) expected.push_back(row.type);
    FieldList list;
    fields::getSupportedFieldsByOwner(list, owner(o));
    EXPECT_EQ(typesOf(list), expected) << o;
    FieldList back;  // and read back what they write, as names (but the fixed layout) and as types
    if (o != fields::OWNER_FIXED_POINT_LAYOUT && !list.empty()) {
      EXPECT_TRUE(fields::stringToFields(fields::fieldsToString(list, L','), back, owner(o)) &&
                  fields::isArraysEqual(list, back));
    }
    fields::stringToTypes(fields::typesToString(list, owner(o)), back, owner(o));
    EXPECT_TRUE(fields::isArraysEqual(list, back)) << o;
  }
}

TEST(FieldTable, UnknownNamesTypesAndOwnersFindNothing) {
  EXPECT_EQ(fields::fieldToType(L"Unknown field"), 134);
  EXPECT_EQ(fields::fieldToType(L"name"), fields::FIELD_UNKNOWN);
  EXPECT_EQ(fields::fieldToType(L""), fields::FIELD_UNKNOWN);
  EXPECT_EQ(fields::typeToField(fields::FIELD_UNKNOWN), L"");
  EXPECT_EQ(fields::typeToField(static_cast<EType>(-1)), L"");
  EXPECT_FALSE(fields::isFieldHasOwner(fields::FIELD_UNKNOWN, owner(0)) ||
               fields::isFieldHasOwner(fields::FIELD_NAME, owner(64)) ||
               fields::isFieldHasOwner(fields::FIELD_NAME, owner(-1)));
  FieldList list = fieldsOf({99});
  fields::getSupportedFieldsByOwner(list, fields::OWNER_NONE);
  fields::getSupportedFieldsByOwner(list, owner(64));
  fields::getSupportedFieldsByOwner(list, owner(-3));
  fields::getSupportedFieldsByOwner(list, fields::OWNER_ACCURACIES);  // appends
  EXPECT_EQ(typesOf(list), (Types{99, 12, 13, 99, 100}));
  list.clear();
  fields::getSupportedFieldsByOwner(list, fields::OWNER_FIXED_POINT_LAYOUT);
  EXPECT_EQ(list[0].width + list[0].alignment, 0);
  fields::getSupportedFieldsByOwners(list, fields::OWNER_POINTS, fields::OWNER_PLAIN_POINTS);
  EXPECT_EQ(typesOf(list), (Types{7, 6, 0, 2, 1, 3, 6, 8, 9, 10, 11}));  // one owner and not the other
}

TEST(FieldLists, AreComparedByTypeAndWrittenAndReadAsNamesOrTypeNumbers) {
  const FieldList list = fieldsOf({3, 5, 3});
  EXPECT_EQ(fields::findTypeInArray(static_cast<EType>(5), list), 1);
  EXPECT_EQ(fields::findTypeInArray(static_cast<EType>(3), list), 0);
  EXPECT_EQ(fields::findTypeInArray(static_cast<EType>(4), list), -1);
  FieldList other = fieldsOf({1, 2});
  other[0].width = 99;
  EXPECT_TRUE(fields::isArraysEqual(fieldsOf({1, 2}), other));
  EXPECT_FALSE(fields::isArraysEqual(fieldsOf({1, 2}), fieldsOf({2, 1})) ||
               fields::isArraysEqual(other, fieldsOf({1})));
  EXPECT_EQ(fields::fieldsToString(fieldsOf({0, 1, 47, 52}), L','), L"Name,Lat(North),Chainage,Chainage");
  EXPECT_EQ(fields::fieldsToString(fieldsOf({134, 0, 134, 2}), L';'),
            L";Name;Lon(East)");  // unknown: nothing
  FieldList read = fieldsOf({5});
  EXPECT_FALSE(fields::stringToFields(L"", read, fields::OWNER_POINTS));
  EXPECT_TRUE(read.empty());
  EXPECT_FALSE(fields::stringToFields(L"Name,Lat(North),Bogus", read, fields::OWNER_POINTS));
  EXPECT_EQ(typesOf(read), (Types{0, 1}));
  EXPECT_FALSE(
      fields::stringToFields(L"Name,X", read, fields::OWNER_FIXED_POINT_LAYOUT));  // other owners' rows
  EXPECT_EQ(typesOf(read), (Types{2}));
  EXPECT_TRUE(fields::stringToFields(L"Chainage, Cut ,Fill", read, fields::OWNER_STAKEOUT));
  EXPECT_EQ(typesOf(read), (Types{47, 30, 31}));
  EXPECT_TRUE(fields::stringToFields(L"Chainage,Cut,Fill,Code", read, fields::OWNER_CROSS_SECTION_POINTS));
  EXPECT_EQ(typesOf(read), (Types{52, 59, 60, 58}));
  EXPECT_EQ(fields::typesToString(fieldsOf({0, 50}), fields::OWNER_POINTS), L"0");
  EXPECT_EQ(fields::typesToString(fieldsOf({0, 50}), fields::OWNER_CROSS_SECTION_POINTS), L",50");
  read = fieldsOf({99});
  fields::stringToTypes(L" 7 , x, ,12abc,+13,-5,99999999999", read, fields::OWNER_GNSS_POINTS);
  EXPECT_EQ(typesOf(read), (Types{7, 0, 0, 12, 13}));  // read as the runtime reads numbers
  fields::stringToTypes(L"  ", read, fields::OWNER_POINTS);
  EXPECT_TRUE(read.empty());
}

TEST(FixedWidths, PadTrimAndSplitByTheFieldWidths) {
  const auto align = [](int width, int alignment, const wchar_t* text) {
    return fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, width, alignment}, text);
  };
  const std::pair<String, const wchar_t*> rows[] = {
      {align(5, 0, L"AB"), L"   AB"},  {align(5, 1, L"AB"), L"AB   "}, {align(5, -2, L"AB"), L"AB   "},
      {align(1, 0, L"AB"), L"A"},      {align(2, 0, L"AB"), L"AB"},    {align(3, 1, L" AB\t\r\n"), L"AB "},
      {align(0, 0, L" AB "), L" AB "}, {align(-1, 0, L"AB"), L""}};
  for (const auto& [actual, expected] : rows)
    EXPECT_EQ(actual, expected);
  const auto split = [](std::initializer_list<int> widths, const wchar_t* line) {
    vyn::ie::DexUserAsciiSettingsData settings;
    for (const int width : widths)
      settings.fields.push_back(DexFieldFormat{fields::FIELD_NAME, width, 0});
    vyn::ie::utils::StringArray values;
    values.Add(L"stale");
    vyn::ie::parseValuesByFixFmt(&settings, line, values);
    String joined;
    for (int i = 0; i < values.GetSize(); ++i)
      joined += values[i] + L"|";
    return joined;
  };
  EXPECT_EQ(split({4, 10, 3}, L"P001 12 "), L"P001|12||");  // one value per field, even past the line
  EXPECT_EQ(split({3, 5, 2}, L" A   B \tC"), L"A|B|C|");
  EXPECT_EQ(split({}, L"abc"), L"");
  EXPECT_EQ(split({2, 0, 2}, L"abcd"), L"ab||cd|");  // free and negative widths take nothing
  EXPECT_EQ(split({2, -2, 2, 2}, L"abcd"), L"ab||ab|cd|");
  EXPECT_EQ(split({-5, 2, 10}, L"abcdef"), L"|||");
  vyn::ie::utils::StringArray values;
  values.Add(L"stale");
  vyn::ie::parseValuesByFixFmt(nullptr, L"abc", values);
  EXPECT_EQ(values.GetSize(), 0);
}

TEST(DexUserAsciiSettingsData, CopiesEveryMember) {
  static_assert(sizeof(DexFieldFormat) == 12);
  auto original = std::make_unique<vyn::ie::DexUserAsciiSettingsData>();
  original->delimiter = L';';
  original->fixedWidth = original->headerLine = original->quotedValues = true;
  original->fields = fieldsOf({0, 1, 2});
  const vyn::ie::DexUserAsciiSettingsData copy(*original);
  vyn::ie::DexUserAsciiSettingsData assigned;
  assigned = *original;
  original.reset();
  for (const auto* data : {&copy, static_cast<const vyn::ie::DexUserAsciiSettingsData*>(&assigned)}) {
    EXPECT_TRUE(data->delimiter == L';' && data->fixedWidth && data->headerLine && data->quotedValues);
    EXPECT_EQ(typesOf(data->fields), (Types{0, 1, 2}));
    EXPECT_EQ(data->fields[1].width, 7);
  }
}

}  // namespace
