#include "ieUtils/IEAsciiFields.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <string>
#include <vector>

using String = CVynStringT<wchar_t>;
namespace fields = vyn::ie::ascii_fields;
using fields::DexFieldFormat;
using fields::EOwner;
using fields::EType;
using fields::FieldList;

namespace {

struct ExpectedRow {
  const wchar_t* name;
  int type;
  std::vector<int> owners;

  bool hasOwner(int owner) const {
    for (const int o : owners) {
      if (o == owner) return true;
    }
    return false;
  }
};

// The field table as users and settings know it, row by row.
const std::vector<ExpectedRow>& expectedTable() {
  static const std::vector<ExpectedRow> rows = {
      {L"Name", 0, {0, 1, 2}},
      {L"Lat(North)", 1, {0, 1, 2}},
      {L"Lon(East)", 2, {0, 1, 2}},
      {L"Ht", 3, {0, 1, 2, 8}},
      {L"Ht(G)", 4, {0, 1, 2, 8}},
      {L"Depth", 5, {2, 7, 8}},
      {L"Notes", 6, {0}},
      {L"Codes", 7, {0, 1, 2, 3, 7, 8}},
      {L"Codes&Descriptions", 8, {0}},
      {L"Codes&Strings", 9, {0}},
      {L"Codes&Attributes", 10, {0}},
      {L"FullCodes", 11, {0}},
      {L"HRMS", 12, {2, 8, 11}},
      {L"VRMS", 13, {2, 8, 11}},
      {L"Date", 14, {2, 7, 8}},
      {L"Time", 15, {2, 7, 8}},
      {L"HDOP", 17, {2, 8}},
      {L"PDOP", 16, {2, 8}},
      {L"VDOP", 18, {2, 8}},
      {L"GDOP", 19, {2, 8}},
      {L"TDOP", 20, {2, 8}},
      {L"Solution Type", 21, {2, 8}},
      {L"GPS satellites", 22, {2, 8}},
      {L"GLONASS satellites", 23, {2, 8}},
      {L"GALILEO satellites", 127, {2}},
      {L"BEIDOU satellites", 128, {2, 8}},
      {L"SBAS satellites", 130, {2, 8}},
      {L"QZSS satellites", 129, {2, 8}},
      {L"HI/Base Ant. Ht.", 24, {3, 7, 8}},
      {L"Backsight Pt", 25, {3}},
      {L"Instrument/Base Point", 26, {3, 7, 8}},
      {L"HR/Ant Ht.", 27, {2, 3, 7, 8}},
      {L"Design Point", 28, {3}},
      {L"Staked Point", 29, {3}},
      {L"Cut", 30, {3}},
      {L"Fill", 31, {3}},
      {L"Cut(Fill)", 32, {3}},
      {L"Tolerance", 126, {3}},
      {L"Time Stamp", 33, {3, 7, 8}},
      {L"Station", 34, {3, 7}},
      {L"Offset Direction", 35, {3, 7}},
      {L"Offset Distance", 36, {3, 7}},
      {L"Design North", 37, {3}},
      {L"Design East", 38, {3}},
      {L"Design Elevation", 39, {3}},
      {L"Station North", 40, {3}},
      {L"Station East", 41, {3}},
      {L"Station Elevation", 42, {3}},
      {L"Delta North", 43, {3, 8}},
      {L"Delta East", 44, {3, 8}},
      {L"Delta Elevation", 45, {3, 8}},
      {L"Internal Chainage", 46, {3}},
      {L"Chainage", 47, {3}},
      {L"PTL Distance", 48, {3}},
      {L"Delta H", 49, {3}},
      {L"Template Name", 50, {4}},
      {L"Road Side", 51, {4}},
      {L"Chainage", 52, {4}},
      {L"Offset From CL", 53, {4}},
      {L"Offset From Prev. Seg.", 54, {4}},
      {L"Absolute Height", 55, {4}},
      {L"Height From CL", 56, {4}},
      {L"Height From Prev. Seg.", 57, {4}},
      {L"Code", 58, {4}},
      {L"Cut", 59, {4}},
      {L"Fill", 60, {4}},
      {L"General Prefix", 61, {5}},
      {L"Code Separator", 63, {5}},
      {L"Code", 62, {5, 6}},
      {L"String Separator", 67, {5}},
      {L"Code String", 66, {5}},
      {L"Control Code Separator", 65, {5}},
      {L"Control Code", 64, {5}},
      {L"Note Separator", 69, {5}},
      {L"Note", 68, {5}},
      {L"Attribute Name Separator", 71, {5}},
      {L"Attribute Name", 70, {5}},
      {L"Attribute Value Separator", 73, {5}},
      {L"Attribute Value", 72, {5}},
      {L"Description", 74, {6}},
      {L"Code Type", 75, {6}},
      {L"Layer Name", 76, {0, 1, 2, 6}},
      {L"Layer Color", 77, {6}},
      {L"Layer Point Symbol", 78, {6}},
      {L"Layer Line Style", 79, {6}},
      {L"Layer Line Width", 80, {6}},
      {L"Layer Area Style", 81, {6}},
      {L"Layer Area Transparency", 82, {6}},
      {L"Code Point Symbol", 83, {6}},
      {L"Code Point Color", 84, {6}},
      {L"Code Line Style", 85, {6}},
      {L"Code Line Width", 86, {6}},
      {L"Code Line Color", 87, {6}},
      {L"Code Area Style", 88, {6}},
      {L"Code Area Color", 89, {6}},
      {L"Code Area Transparency", 90, {6}},
      {L"Code Attribute Prompt", 91, {6}},
      {L"Lat", 92, {0, 1, 8}},
      {L"Lon", 93, {0, 1, 8}},
      {L"X", 94, {0, 1}},
      {L"Y", 95, {0, 1}},
      {L"Z", 96, {0, 1}},
      {L"Northing", 97, {0, 1, 8}},
      {L"Easting", 98, {0, 1, 8}},
      {L"Geoid Separation", 99, {0, 1, 11}},
      {L"Combined Scale Factor", 100, {0, 1, 11}},
      {L"Target Point", 101, {7, 8}},
      {L"Azimuth", 102, {7, 8}},
      {L"Slope Distance", 103, {7, 8}},
      {L"Horizontal Angle", 104, {7}},
      {L"Zenith Angle", 105, {7}},
      {L"TS Type", 106, {7}},
      {L"Vertical Angle", 107, {7, 8}},
      {L"Horizontal Distance", 108, {7}},
      {L"Vertical Distance", 109, {7}},
      {L"Offset Height", 110, {7}},
      {L"Base Antenna Type", 111, {8}},
      {L"Rover Antenna Type", 112, {8}},
      {L"DX", 113, {8}},
      {L"DY", 114, {8}},
      {L"DZ", 115, {8}},
      {L"SigmaX", 116, {8}},
      {L"SigmaY", 117, {8}},
      {L"SigmaZ", 118, {8}},
      {L"CorXY", 119, {8}},
      {L"CorXZ", 120, {8}},
      {L"CorYZ", 121, {8}},
      {L"CovXY", 122, {8}},
      {L"CovXZ", 123, {8}},
      {L"CovYZ", 124, {8}},
      {L"Epochs count", 125, {8}},
      {L"Physical Station ID", 131, {2, 8}},
      {L"Virtual Station ID", 132, {2, 8}},
      {L"Prism Constant", 133, {7}},
      {L"CODE", 7, {9}},
      {L"DESCRIPTION", 6, {9}},
      {L"POINT NUMBER", 0, {9}},
      {L"X", 2, {9}},
      {L"Y", 1, {9}},
      {L"Z", 3, {9}},
  };
  return rows;
}

constexpr int kOwnerCount = 12;

const ExpectedRow* firstRowOfType(int type) {
  for (const ExpectedRow& row : expectedTable()) {
    if (row.type == type) return &row;
  }
  return nullptr;
}

const ExpectedRow* firstRowNamed(const std::wstring& name, int owner) {
  for (const ExpectedRow& row : expectedTable()) {
    if (name == row.name && row.hasOwner(owner)) return &row;
  }
  return nullptr;
}

FieldList fieldsOf(std::initializer_list<int> types) {
  FieldList list;
  for (const int type : types)
    list.push_back(DexFieldFormat{static_cast<EType>(type), 7, 1});
  return list;
}

std::vector<int> typesOf(const FieldList& list) {
  std::vector<int> types;
  for (const DexFieldFormat& field : list)
    types.push_back(field.type);
  return types;
}

EOwner owner(int value) {
  return static_cast<EOwner>(value);
}

}  // namespace

// ---- The table

TEST(FieldTable, HasOneHundredFortyRowsCoveringEveryType) {
  ASSERT_EQ(expectedTable().size(), 140u);
  for (int type = 0; type < fields::FIELD_UNKNOWN; ++type)
    EXPECT_NE(firstRowOfType(type), nullptr) << type;
}

TEST(FieldTable, EveryNameFindsTheTypeOfItsFirstRow) {
  for (const ExpectedRow& row : expectedTable()) {
    const ExpectedRow* first = nullptr;
    for (const ExpectedRow& candidate : expectedTable()) {
      if (std::wstring(candidate.name) == row.name) {
        first = &candidate;
        break;
      }
    }
    EXPECT_EQ(fields::fieldToType(row.name), first->type) << row.name;
  }
}

TEST(FieldTable, EveryTypeFindsTheNameOfItsFirstRow) {
  for (int type = 0; type < fields::FIELD_UNKNOWN; ++type) {
    EXPECT_EQ(fields::typeToField(static_cast<EType>(type)), firstRowOfType(type)->name) << type;
  }
}

TEST(FieldTable, OwnersOfATypeAreThoseOfItsFirstRow) {
  for (int type = 0; type < fields::FIELD_UNKNOWN; ++type) {
    for (int o = 0; o < kOwnerCount; ++o) {
      EXPECT_EQ(fields::isFieldHasOwner(static_cast<EType>(type), owner(o)),
                firstRowOfType(type)->hasOwner(o))
          << type << " " << o;
    }
  }
}

TEST(FieldTable, EveryRowIsReachableByNameWithEachOfItsOwners) {
  for (const ExpectedRow& row : expectedTable()) {
    for (const int o : row.owners) {
      FieldList list;
      EXPECT_TRUE(fields::stringToFields(row.name, list, owner(o))) << row.name;
      ASSERT_EQ(list.size(), 1u);
      EXPECT_EQ(list[0].type, firstRowNamed(row.name, o)->type) << row.name << " " << o;
    }
  }
}

TEST(FieldTable, EveryRowIsReachableByTypeWithEachOfItsOwners) {
  for (const ExpectedRow& row : expectedTable()) {
    for (const int o : row.owners) {
      FieldList list;
      fields::stringToTypes(String(std::to_wstring(row.type).c_str()), list, owner(o));
      ASSERT_EQ(list.size(), 1u) << row.name;
      EXPECT_EQ(list[0].type, row.type);
    }
  }
}

TEST(FieldTable, ListsByOwnerFollowTheTableOrder) {
  for (int o = 0; o < kOwnerCount; ++o) {
    std::vector<int> expected;
    for (const ExpectedRow& row : expectedTable()) {
      if (row.hasOwner(o)) expected.push_back(row.type);
    }
    FieldList list;
    fields::getSupportedFieldsByOwner(list, owner(o));
    EXPECT_EQ(typesOf(list), expected) << o;
  }
}

// ---- Searches

TEST(FieldToType, FirstRowOfANameWins) {
  EXPECT_EQ(fields::fieldToType(L"Name"), 0);
  EXPECT_EQ(fields::fieldToType(L"X"), 94);
  EXPECT_EQ(fields::fieldToType(L"Chainage"), 47);
  EXPECT_EQ(fields::fieldToType(L"Code"), 58);
  EXPECT_EQ(fields::fieldToType(L"Unknown field"), 134);
  EXPECT_EQ(fields::fieldToType(L"name"), fields::FIELD_UNKNOWN);
  EXPECT_EQ(fields::fieldToType(L""), fields::FIELD_UNKNOWN);
}

TEST(TypeToField, GivesTheFirstRowsNameOrNothing) {
  EXPECT_EQ(fields::typeToField(fields::FIELD_NAME), L"Name");
  EXPECT_EQ(fields::typeToField(static_cast<EType>(2)), L"Lon(East)");
  EXPECT_EQ(fields::typeToField(fields::FIELD_UNKNOWN), L"");
  EXPECT_EQ(fields::typeToField(static_cast<EType>(-1)), L"");
}

TEST(IsFieldHasOwner, LooksAtTheFirstRowOfTheType) {
  EXPECT_FALSE(fields::isFieldHasOwner(static_cast<EType>(127), owner(8)));
  EXPECT_TRUE(fields::isFieldHasOwner(static_cast<EType>(128), owner(8)));
  EXPECT_FALSE(fields::isFieldHasOwner(fields::FIELD_NAME, fields::OWNER_FIXED_POINT_LAYOUT));
  EXPECT_FALSE(fields::isFieldHasOwner(fields::FIELD_UNKNOWN, owner(0)));
  EXPECT_FALSE(fields::isFieldHasOwner(fields::FIELD_NAME, owner(64)));
  EXPECT_FALSE(fields::isFieldHasOwner(fields::FIELD_NAME, owner(-1)));
}

// ---- Lists from the table

TEST(GetSupportedFieldsByOwner, FixedLayoutInTableOrder) {
  FieldList list;
  fields::getSupportedFieldsByOwner(list, fields::OWNER_FIXED_POINT_LAYOUT);
  EXPECT_EQ(typesOf(list), (std::vector<int>{7, 6, 0, 2, 1, 3}));
  for (const DexFieldFormat& field : list) {
    EXPECT_EQ(field.width, 0);
    EXPECT_EQ(field.alignment, 0);
  }
}

TEST(GetSupportedFieldsByOwner, OwnerWithoutFieldsAndOwnersOutsideTheMaskGiveNothing) {
  FieldList list;
  fields::getSupportedFieldsByOwner(list, fields::OWNER_NONE);
  fields::getSupportedFieldsByOwner(list, owner(64));
  fields::getSupportedFieldsByOwner(list, owner(-3));
  EXPECT_TRUE(list.empty());
}

TEST(GetSupportedFieldsByOwner, AppendsToTheList) {
  FieldList list = fieldsOf({99});
  fields::getSupportedFieldsByOwner(list, fields::OWNER_ACCURACIES);
  EXPECT_EQ(typesOf(list), (std::vector<int>{99, 12, 13, 99, 100}));
}

TEST(GetSupportedFieldsByOwners, KeepsRowsWithOneOwnerAndWithoutTheOther) {
  FieldList list;
  fields::getSupportedFieldsByOwners(list, fields::OWNER_POINTS, fields::OWNER_PLAIN_POINTS);
  EXPECT_EQ(typesOf(list), (std::vector<int>{6, 8, 9, 10, 11}));
  fields::getSupportedFieldsByOwners(list, fields::OWNER_ACCURACIES, fields::OWNER_GNSS_POINTS);
  EXPECT_EQ(typesOf(list), (std::vector<int>{6, 8, 9, 10, 11, 99, 100}));
}

// ---- Comparing lists

TEST(FindTypeInArray, GivesTheFirstIndexOrMinusOne) {
  const FieldList list = fieldsOf({3, 5, 3});
  EXPECT_EQ(fields::findTypeInArray(static_cast<EType>(3), list), 0);
  EXPECT_EQ(fields::findTypeInArray(static_cast<EType>(5), list), 1);
  EXPECT_EQ(fields::findTypeInArray(static_cast<EType>(4), list), -1);
  EXPECT_EQ(fields::findTypeInArray(static_cast<EType>(4), FieldList()), -1);
}

TEST(IsArraysEqual, ComparesOnlyLengthAndTypes) {
  FieldList other = fieldsOf({1, 2});
  other[0].width = 99;
  other[1].alignment = 0;
  EXPECT_TRUE(fields::isArraysEqual(fieldsOf({1, 2}), other));
  EXPECT_FALSE(fields::isArraysEqual(fieldsOf({1, 2}), fieldsOf({2, 1})));
  EXPECT_FALSE(fields::isArraysEqual(fieldsOf({1, 2}), fieldsOf({1})));
  EXPECT_TRUE(fields::isArraysEqual(FieldList(), FieldList()));
}

// ---- Lists as names

TEST(FieldsToString, JoinsTheNamesOfTheFirstRows) {
  EXPECT_EQ(fields::fieldsToString(fieldsOf({0, 1, 47, 52}), L','), L"Name,Lat(North),Chainage,Chainage");
  EXPECT_EQ(fields::fieldsToString(fieldsOf({0, 2}), L';'), L"Name;Lon(East)");
  EXPECT_EQ(fields::fieldsToString(FieldList(), L','), L"");
}

TEST(FieldsToString, UnknownTypeWritesNothingButTheFirstIndexStillHasNoSeparator) {
  EXPECT_EQ(fields::fieldsToString(fieldsOf({0, 134, 1}), L','), L"Name,Lat(North)");
  EXPECT_EQ(fields::fieldsToString(fieldsOf({134, 1}), L','), L",Lat(North)");
}

TEST(StringToFields, SkipsUnknownNamesAndAnswersFalse) {
  FieldList list;
  EXPECT_FALSE(fields::stringToFields(L"Name,Lat(North),Bogus", list, fields::OWNER_POINTS));
  EXPECT_EQ(typesOf(list), (std::vector<int>{0, 1}));
}

TEST(StringToFields, SearchPassesOverRowsOfOtherOwners) {
  FieldList list;
  EXPECT_TRUE(fields::stringToFields(L"POINT NUMBER,X", list, fields::OWNER_FIXED_POINT_LAYOUT));
  EXPECT_EQ(typesOf(list), (std::vector<int>{0, 2}));
  EXPECT_FALSE(fields::stringToFields(L"Name,X", list, fields::OWNER_FIXED_POINT_LAYOUT));
  EXPECT_EQ(typesOf(list), (std::vector<int>{2}));
}

TEST(StringToFields, SameNameGivesTheTypeOfTheOwner) {
  FieldList list;
  EXPECT_TRUE(fields::stringToFields(L"Chainage, Cut ,Fill", list, fields::OWNER_STAKEOUT));
  EXPECT_EQ(typesOf(list), (std::vector<int>{47, 30, 31}));
  EXPECT_TRUE(fields::stringToFields(L"Chainage,Cut,Fill,Code", list, fields::OWNER_CROSS_SECTION_POINTS));
  EXPECT_EQ(typesOf(list), (std::vector<int>{52, 59, 60, 58}));
  EXPECT_TRUE(fields::stringToFields(L"Code", list, fields::OWNER_CODE_LIBRARY));
  EXPECT_EQ(typesOf(list), (std::vector<int>{62}));
}

TEST(StringToFields, ClearsTheListAndTreatsAnEmptyTextAsOneEmptyValue) {
  FieldList list = fieldsOf({5, 6});
  EXPECT_FALSE(fields::stringToFields(L"", list, fields::OWNER_POINTS));
  EXPECT_TRUE(list.empty());
}

TEST(StringToFields, RoundTripsTheListsOfEveryOwnerButTheFixedLayout) {
  for (int o = 0; o < kOwnerCount; ++o) {
    if (o == fields::OWNER_FIXED_POINT_LAYOUT) continue;
    FieldList list;
    fields::getSupportedFieldsByOwner(list, owner(o));
    if (list.empty()) continue;
    FieldList back;
    EXPECT_TRUE(fields::stringToFields(fields::fieldsToString(list, L','), back, owner(o))) << o;
    EXPECT_TRUE(fields::isArraysEqual(list, back)) << o;
  }
}

TEST(FieldsToString, FixedLayoutFieldsAreWrittenWithTheNamesOfTheirFirstRows) {
  FieldList list;
  fields::getSupportedFieldsByOwner(list, fields::OWNER_FIXED_POINT_LAYOUT);
  const String names = fields::fieldsToString(list, L',');
  EXPECT_EQ(names, L"Codes,Notes,Name,Lon(East),Lat(North),Ht");
  FieldList back;
  EXPECT_FALSE(fields::stringToFields(names, back, fields::OWNER_FIXED_POINT_LAYOUT));
  EXPECT_TRUE(back.empty());
}

// ---- Lists as type numbers

TEST(TypesToString, WritesOnlyTypesOfTheOwner) {
  EXPECT_EQ(fields::typesToString(fieldsOf({0, 50}), fields::OWNER_POINTS), L"0");
  EXPECT_EQ(fields::typesToString(fieldsOf({0, 50}), fields::OWNER_CROSS_SECTION_POINTS), L",50");
  EXPECT_EQ(fields::typesToString(fieldsOf({7, 6, 0}), fields::OWNER_FIXED_POINT_LAYOUT), L"7,6,0");
  EXPECT_EQ(fields::typesToString(FieldList(), fields::OWNER_POINTS), L"");
}

TEST(StringToTypes, ReadsNumbersAsTheRuntimeDoes) {
  FieldList list = fieldsOf({99});
  fields::stringToTypes(L" 7 , x, ,12abc,+13,-5,99999999999", list, fields::OWNER_GNSS_POINTS);
  EXPECT_EQ(typesOf(list), (std::vector<int>{7, 0, 0, 12, 13}));
}

TEST(StringToTypes, KeepsTypesOfTheOwnerOnly) {
  FieldList list;
  fields::stringToTypes(L"0,50", list, fields::OWNER_CROSS_SECTION_POINTS);
  EXPECT_EQ(typesOf(list), (std::vector<int>{50}));
  fields::stringToTypes(L"0,50", list, fields::OWNER_POINTS);
  EXPECT_EQ(typesOf(list), (std::vector<int>{0}));
}

TEST(StringToTypes, EmptyTextGivesAnEmptyList) {
  FieldList list = fieldsOf({1});
  fields::stringToTypes(L"", list, fields::OWNER_POINTS);
  EXPECT_TRUE(list.empty());
  fields::stringToTypes(L"  ", list, fields::OWNER_POINTS);
  EXPECT_TRUE(list.empty());
}

TEST(StringToTypes, RoundTripsTypesToString) {
  for (int o = 0; o < kOwnerCount; ++o) {
    FieldList list;
    fields::getSupportedFieldsByOwner(list, owner(o));
    FieldList back;
    fields::stringToTypes(fields::typesToString(list, owner(o)), back, owner(o));
    EXPECT_TRUE(fields::isArraysEqual(list, back)) << o;
  }
}

// ---- Fixed widths

TEST(AlignByFormat, PadsOnTheSideTheAlignmentNames) {
  EXPECT_EQ(fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, 5, 0}, L"AB"), L"   AB");
  EXPECT_EQ(fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, 5, 1}, L"AB"), L"AB   ");
  EXPECT_EQ(fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, 5, -2}, L"AB"), L"AB   ");
  EXPECT_EQ(fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, 1, 0}, L"AB"), L"A");
  EXPECT_EQ(fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, 2, 0}, L"AB"), L"AB");
}

TEST(AlignByFormat, TrimsBeforeMeasuringExceptForFreeWidth) {
  EXPECT_EQ(fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, 3, 1}, L" AB\t\r\n"), L"AB ");
  EXPECT_EQ(fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, 0, 0}, L" AB "), L" AB ");
  EXPECT_EQ(fields::alignByFormat(DexFieldFormat{fields::FIELD_NAME, -1, 0}, L"AB"), L"");
}

namespace {

vyn::ie::utils::StringArray splitFixed(std::initializer_list<int> widths, const String& line) {
  vyn::ie::DexUserAsciiSettingsData settings;
  for (const int width : widths)
    settings.fields.push_back(DexFieldFormat{fields::FIELD_NAME, width, 0});
  vyn::ie::utils::StringArray values;
  values.Add(L"stale");
  vyn::ie::parseValuesByFixFmt(&settings, line, values);
  return values;
}

vyn::ie::utils::StringArray listOf(std::initializer_list<const wchar_t*> texts) {
  vyn::ie::utils::StringArray values;
  for (const wchar_t* text : texts)
    values.Add(text);
  return values;
}

}  // namespace

TEST(ParseValuesByFixFmt, GivesOneValuePerFieldEvenPastTheLine) {
  EXPECT_EQ(splitFixed({4, 10, 3}, L"P001 12 "), listOf({L"P001", L"12", L""}));
}

TEST(ParseValuesByFixFmt, TrimsEachColumn) {
  EXPECT_EQ(splitFixed({3, 5, 2}, L" A   B \tC"), listOf({L"A", L"B", L"C"}));
}

TEST(ParseValuesByFixFmt, NoFieldsOrNoSettingsGiveNoValues) {
  EXPECT_EQ(splitFixed({}, L"abc"), listOf({}));
  vyn::ie::utils::StringArray values = listOf({L"stale"});
  vyn::ie::parseValuesByFixFmt(nullptr, L"abc", values);
  EXPECT_EQ(values, listOf({}));
}

TEST(ParseValuesByFixFmt, FreeAndNegativeWidthsTakeNothing) {
  EXPECT_EQ(splitFixed({2, 0, 2}, L"abcd"), listOf({L"ab", L"", L"cd"}));
  EXPECT_EQ(splitFixed({2, -2, 2, 2}, L"abcd"), listOf({L"ab", L"", L"ab", L"cd"}));
  EXPECT_EQ(splitFixed({-5, 2, 10}, L"abcdef"), listOf({L"", L"", L""}));
}

// ---- The settings record

TEST(DexFieldFormat, IsThreeThirtyTwoBitMembers) {
  EXPECT_EQ(sizeof(DexFieldFormat), 12u);
  const DexFieldFormat field;
  EXPECT_EQ(field.type, fields::FIELD_NAME);
  EXPECT_EQ(field.width, 0);
  EXPECT_EQ(field.alignment, 0);
}

TEST(DexUserAsciiSettingsData, CopiesEveryMember) {
  vyn::ie::DexUserAsciiSettingsData original;
  original.delimiter = L';';
  original.fixedWidth = true;
  original.headerLine = true;
  original.quotedValues = true;
  original.fields = fieldsOf({0, 1, 2});

  const vyn::ie::DexUserAsciiSettingsData copy(original);
  vyn::ie::DexUserAsciiSettingsData assigned;
  assigned = original;
  for (const vyn::ie::DexUserAsciiSettingsData* data :
       {&copy, static_cast<const vyn::ie::DexUserAsciiSettingsData*>(&assigned)}) {
    EXPECT_EQ(data->delimiter, L';');
    EXPECT_TRUE(data->fixedWidth);
    EXPECT_TRUE(data->headerLine);
    EXPECT_TRUE(data->quotedValues);
    EXPECT_EQ(typesOf(data->fields), (std::vector<int>{0, 1, 2}));
    EXPECT_EQ(data->fields[1].width, 7);
  }
}

TEST(DexUserAsciiSettingsData, IsMadeAndDeletedThroughTheHostAllocator) {
  std::unique_ptr<vyn::ie::DexUserAsciiSettingsData> data(new vyn::ie::DexUserAsciiSettingsData());
  ASSERT_NE(data, nullptr);
  data->fields = fieldsOf({4});
  EXPECT_EQ(data->fields.size(), 1u);
}
