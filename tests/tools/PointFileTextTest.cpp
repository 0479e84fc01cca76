// The text rules the point-file plug-ins share: splitting lines, reading numbers, code texts.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEPoints.h"
#include "pointfiles/CodeText.h"
#include "pointfiles/LineValues.h"
#include "pointfiles/PointLayout.h"

namespace {

using namespace vyn::ie;
using namespace vyn::ie::point_files;

std::vector<std::wstring> split(const PointLayout& layout, const wchar_t* line) {
  LineSplitter splitter(layout);
  std::vector<std::wstring> values;
  for (const std::wstring_view value : splitter.split(line))
    values.emplace_back(value);
  return values;
}

TEST(PointFileText, DelimitedLinesKeepQuotedDelimitersAndDoubledQuotes) {
  const PointLayout layout;
  EXPECT_EQ((std::vector<std::wstring>{L"a, b", L"say \"hi\"", L"", L"x"}),
            split(layout, L" \"a, b\" ,\"say \"\"hi\"\"\",, x "));
  EXPECT_EQ((std::vector<std::wstring>{L""}), split(layout, L""));
  EXPECT_EQ((std::vector<std::wstring>{L"open"}), split(layout, L"\"open"));
}

TEST(PointFileText, BlankDelimitedLinesTakeARunOfBlanksAsOneDelimiter) {
  PointLayout layout;
  layout.delimiter = L' ';
  EXPECT_EQ((std::vector<std::wstring>{L"P1", L"1.5", L"2.5", L"x y"}),
            split(layout, L"  P1   1.5 2.5  \"x y\"  "));
}

TEST(PointFileText, FixedWidthLinesAreCutByTheFieldWidths) {
  PointLayout layout;
  layout.fields = {{ascii_fields::FIELD_NAME, 4, 1},
                   {ascii_fields::FIELD_NORTHING, 10, 0},
                   {ascii_fields::FIELD_EASTING, 3, 0}};
  layout.fixedWidth = true;
  EXPECT_EQ((std::vector<std::wstring>{L"P1", L"12.5", L""}), split(layout, L"P1      12.5"));
}

TEST(PointFileText, NumbersAreReadWholeAndIndependentlyOfTheLocale) {
  double value = 0.0;
  EXPECT_TRUE(parseNumber(L"-12.5", value));
  EXPECT_EQ(-12.5, value);
  EXPECT_TRUE(parseNumber(L"+1e3", value));
  EXPECT_EQ(1000.0, value);
  for (const wchar_t* bad : {L"", L"12,5", L"1.5m", L"+-3", L"++3", L"+", L"inf", L"nan", L"1e999", L"１"})
    EXPECT_FALSE(parseNumber(bad, value)) << bad;
  EXPECT_EQ(1000.0, value);
}

TEST(PointFileText, CodeTextsRoundTripWithStringsAndAttributes) {
  DexData data{DexSettings()};
  CodeReader reader(&data);
  DexDesignPoint point;
  ASSERT_TRUE(reader.read(L"  EP:1:2   TREE;Species=Oak;Girth=0.8 GND ", point));
  ASSERT_EQ(3, point.getNumberOfCodes());
  EXPECT_EQ(3, data.getIEDataDictionary()->getSize());
  std::wstring text;
  appendCodesText(point, true, true, text);
  EXPECT_EQ(L"EP:1:2 TREE;Species=Oak;Girth=0.8 GND", text);
  text.clear();
  appendCodesText(point, false, false, text);
  EXPECT_EQ(L"EP TREE GND", text);

  DexDesignPoint other;
  ASSERT_TRUE(reader.read(L"EP;Surface=Asphalt", other));
  EXPECT_EQ(point.getCode(0)->getDescription(), other.getCode(0)->getDescription());
  EXPECT_EQ(3, data.getIEDataDictionary()->getSize());
}

TEST(PointFileText, MalformedCodeTextsAreRefused) {
  DexData data{DexSettings()};
  CodeReader reader(&data);
  for (const wchar_t* bad : {L":1", L";a=b", L"EP;Surface", L"EP;=Asphalt"}) {
    DexDesignPoint point;
    EXPECT_FALSE(reader.read(bad, point)) << bad;
  }
  DexDesignPoint point;
  EXPECT_TRUE(reader.read(L"", point));
  EXPECT_EQ(0, point.getNumberOfCodes());
}

TEST(PointFileText, LayoutsFollowTheFormatAndTheSettings) {
  const DexFormat* csv = getIEFormatsData().getFormatById(kCsvFormatId);
  const DexFormat* ascii = getIEFormatsData().getFormatById(kCustomAsciiFormatId);
  DexSettings settings;
  PointLayout layout;
  ASSERT_TRUE(makeLayout(ascii, settings, layout));
  EXPECT_EQ(5u, layout.fields.size());  // no custom layout: the CSV columns

  settings.userAsciiSettings = new DexUserAsciiSettingsData();
  settings.userAsciiSettings->fields = {{ascii_fields::FIELD_NAME, 0, 0},
                                        {ascii_fields::FIELD_TEMPLATE_NAME, 0, 0},
                                        {ascii_fields::FIELD_NORTHING, 8, 0}};
  settings.userAsciiSettings->delimiter = L'\t';
  ASSERT_TRUE(makeLayout(ascii, settings, layout));
  EXPECT_EQ(2u, layout.fields.size());  // the road field is no point field
  EXPECT_TRUE(layout.fixedWidth);
  ASSERT_TRUE(makeLayout(csv, settings, layout));
  EXPECT_EQ(L',', layout.delimiter);
  EXPECT_EQ(ascii_fields::FIELD_FULL_CODES, layout.fields.back().type);
  EXPECT_FALSE(makeLayout(getIEFormatsData().getFormatByIndex(0), settings, layout));
  EXPECT_FALSE(makeLayout(nullptr, settings, layout));
}

}  // namespace
