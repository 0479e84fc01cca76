// The text rules the point-file plug-ins share: splitting lines, numbers, code texts, layouts, header
// names, order names, delimiters and the notes of an import.

#include <gtest/gtest.h>

#include <cwctype>
#include <string>
#include <tuple>
#include <vector>

#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEPoints.h"
#include "pointfiles/CodeText.h"
#include "pointfiles/ImportNotes.h"
#include "pointfiles/LayoutFinding.h"
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

std::wstring joined(const std::vector<std::wstring>& values) {
  std::wstring text;
  for (const std::wstring& value : values)
    text += (text.empty() ? L"" : L"|") + value;
  return text;
}

// The field names of a layout's columns, "|"-joined, a kept column as its label in quotes.
std::wstring columnsOf(const PointLayout& layout) {
  ImportFindings findings;
  findings.describe(layout);
  return joined(findings.columns);
}

TEST(PointFileText, LinesSplitByTheirDelimiterWithQuotesAndBlankRuns) {
  const struct {
    wchar_t delimiter;
    const wchar_t* line;
    const wchar_t* values;
  } cases[] = {
      {L',', L" \"a, b\" ,\"say \"\"hi\"\"\",, x ", L"a, b|say \"hi\"||x"},
      {L',', L"", L""},
      {L',', L"\"open", L"open"},
      {L' ', L"  P1   1.5\t 2.5  \"x y\"  ", L"P1|1.5|2.5|x y"},
      {L'\t', L"P1\t\t2.5 \t", L"P1||2.5|"},
  };
  for (const auto& [delimiter, line, values] : cases) {
    PointLayout layout;
    layout.delimiter = delimiter;
    EXPECT_EQ(values, joined(split(layout, line))) << line;
  }
}

TEST(PointFileText, FixedWidthLinesAreCutByTheWidthsAndKeepWhatFollows) {
  PointLayout layout;
  layout.fields = {{ascii_fields::FIELD_NAME, 4, 1},
                   {ascii_fields::FIELD_NORTHING, 10, 0},
                   {ascii_fields::FIELD_EASTING, 3, 0}};
  layout.fixedWidth = true;
  EXPECT_EQ(L"P1|12.5|", joined(split(layout, L"P1      12.5")));
  EXPECT_EQ(L"P1|12.5|7|extra", joined(split(layout, L"P1        12.5  7 extra ")));
}

TEST(PointFileText, NumbersAreReadWholeAndIndependentlyOfTheLocale) {
  const struct {
    const wchar_t* text;
    bool decimalComma;
    bool read;
    double value;
  } cases[] = {
      {L"-12.5", false, true, -12.5}, {L"+1e3", false, true, 1000.0}, {L"12,5", true, true, 12.5},
      {L"12,5", false, false, 0},     {L"1,2,5", true, false, 0},     {L"1,234.5", true, false, 0},
      {L"", false, false, 0},         {L"1.5m", false, false, 0},     {L"+-3", false, false, 0},
      {L"++3", false, false, 0},      {L"+", false, false, 0},        {L"inf", false, false, 0},
      {L"nan", false, false, 0},      {L"1e999", false, false, 0},    {L"１", false, false, 0},
  };
  for (const auto& [text, decimalComma, read, value] : cases) {
    double parsed = -1.0;
    EXPECT_EQ(read, parseNumber(text, parsed, decimalComma)) << text;
    EXPECT_EQ(read ? value : -1.0, parsed) << text;
  }
}

TEST(PointFileText, CodeTextsRoundTripAndMalformedCodesAreSetAside) {
  DexData data{DexSettings()};
  CodeReader reader(&data);
  DexDesignPoint point;
  std::wstring rejected;
  ASSERT_TRUE(reader.read(L"  EP:1:2   TREE;Species=Oak;Girth=0.8 GND ", point, rejected));
  EXPECT_EQ(3, data.getIEDataDictionary()->getSize());
  for (const auto& [strings, attributes, text] :
       {std::tuple{true, true, L"EP:1:2 TREE;Species=Oak;Girth=0.8 GND"},
        std::tuple{false, false, L"EP TREE GND"}}) {
    std::wstring written;
    appendCodesText(point, strings, attributes, written);
    EXPECT_EQ(text, written);
  }
  const struct {
    const wchar_t* text;
    const wchar_t* codes;  // read, with their parts
    const wchar_t* rejected;
  } cases[] = {
      {L"EP;Surface=Asphalt", L"EP;Surface=Asphalt", L""},
      {L":1", L"", L":1"},
      {L";a=b", L"", L";a=b"},
      {L"EP;Surface KERB", L"KERB", L"EP;Surface"},
      {L"EP;=Asphalt", L"", L"EP;=Asphalt"},
      {L"A :x B", L"A B", L":x"},
      {L"", L"", L""},
  };
  for (const auto& [text, codes, rejectedText] : cases) {
    DexDesignPoint other;
    rejected.clear();
    EXPECT_EQ(rejectedText[0] == L'\0', reader.read(text, other, rejected)) << text;
    std::wstring written;
    appendCodesText(other, true, true, written);
    EXPECT_EQ(std::tuple(codes, rejectedText), std::tuple(written, rejected)) << text;
  }
  EXPECT_EQ(6, data.getIEDataDictionary()->getSize());  // EP found again; KERB, A and B added
}

TEST(PointFileText, LayoutsFollowTheFormatTheSettingsAndTheDirection) {
  const DexFormat* csv = getIEFormatsData().getFormatById(kCsvFormatId);
  const DexFormat* ascii = getIEFormatsData().getFormatById(kCustomAsciiFormatId);
  DexSettings settings;
  PointLayout layout;
  ASSERT_TRUE(makeLayout(ascii, settings, true, layout));
  EXPECT_EQ(L"Name|Northing|Easting|Ht|FullCodes", columnsOf(layout));
  EXPECT_EQ(ESource::ASSUMED, layout.columnsFrom);
  EXPECT_EQ(ESource::FOUND, layout.delimiterFrom);

  settings.userAsciiSettings = new DexUserAsciiSettingsData();
  settings.userAsciiSettings->fields = {{ascii_fields::FIELD_NAME, 0, 0},
                                        {ascii_fields::FIELD_TEMPLATE_NAME, 0, 0},
                                        {ascii_fields::FIELD_NORTHING, 8, 0}};
  settings.userAsciiSettings->delimiter = L'\t';
  ASSERT_TRUE(makeLayout(ascii, settings, true, layout));
  EXPECT_EQ(L"Name|Northing", columnsOf(layout));  // the road field is no point field
  EXPECT_TRUE(layout.fixedWidth);
  EXPECT_EQ(ESource::GIVEN, layout.columnsFrom);
  ASSERT_TRUE(makeLayout(csv, settings, true, layout));  // read with the user's columns, delimiter found
  EXPECT_EQ(L"Name|Northing", columnsOf(layout));
  EXPECT_FALSE(layout.fixedWidth);
  EXPECT_EQ(ESource::FOUND, layout.delimiterFrom);
  ASSERT_TRUE(makeLayout(csv, settings, false, layout));  // written in the CSV columns
  EXPECT_EQ(L"Name|Northing|Easting|Ht|FullCodes", columnsOf(layout));
  EXPECT_EQ(L',', layout.delimiter);
  EXPECT_FALSE(makeLayout(getIEFormatsData().getFormatByIndex(0), settings, true, layout));
  EXPECT_FALSE(makeLayout(nullptr, settings, true, layout));
}

TEST(PointFileText, HeaderLinesNameTheColumnsInTheirCommonNames) {
  const struct {
    const wchar_t* header;
    const wchar_t* columns;  // empty: no header
  } cases[] = {
      {L"Point,Northing,Easting,Elevation,Description", L"Name|Northing|Easting|Ht|Codes&Descriptions"},
      {L"PtNo,N,E,Z,D", L"Name|Northing|Easting|Z|Codes&Descriptions"},
      {L"id,EAST,north,Height,code", L"Name|Easting|Northing|Ht|Codes"},
      {L"X,Y,Z", L"X|Y|Z"},
      {L"\"Pt No\",Elev (m),x,y,Layer,Notes", L"Name|Ht|X|Y|Layer Name|Notes"},
      {L"Name,Lat(North),Lon(East),Ht(G),FullCodes", L"Name|Lat(North)|Lon(East)|Ht(G)|FullCodes"},
      {L"Point,N,E,H,Code,Description,Date", L"Name|Northing|Easting|Ht|Codes|\"Description\"|\"Date\""},
      {L"Point,N,E,N", L"Name|Northing|Easting|\"N\""},
      {L"Name,Code,Date", L""},  // names no coordinate column
      {L"P,N,E,2018", L""},      // holds a number
      {L"Nom,Nord,Est", L""},
  };
  for (const auto& [header, columns] : cases) {
    PointLayout layout;
    const std::vector<std::wstring> values = split(layout, header);
    const std::vector<std::wstring_view> views(values.begin(), values.end());
    EXPECT_EQ(columns[0] != L'\0', readHeader(views, layout)) << header;
    EXPECT_EQ(columns, columnsOf(layout)) << header;  // untouched when no header
  }
}

TEST(PointFileText, OrderNamesGiveColumnsAndColumnsGiveOrderNames) {
  const struct {
    const wchar_t* order;
    const wchar_t* columns;  // empty: refused
  } cases[] = {
      {L"PNEZD", L"Name|Northing|Easting|Ht|FullCodes"},
      {L"penzd", L"Name|Easting|Northing|Ht|FullCodes"},
      {L"PNEZ", L"Name|Northing|Easting|Ht"},
      {L"PENZ", L"Name|Easting|Northing|Ht"},
      {L"NEZ", L"Northing|Easting|Ht"},
      {L"ENZ", L"Easting|Northing|Ht"},
      {L"PNE", L"Name|Northing|Easting"},
      {L"PEN", L"Name|Easting|Northing"},
      {L"PNNE", L""},
      {L"PZD", L""},
      {L"PNEX", L""},
      {L"", L""},
  };
  for (const auto& [order, columns] : cases) {
    PointLayout layout;
    layout.fields.clear();
    EXPECT_EQ(columns[0] != L'\0', fieldsFromOrder(order, layout.fields)) << order;
    EXPECT_EQ(columns, columnsOf(layout)) << order;
    std::wstring upper(order);
    for (wchar_t& ch : upper)
      ch = static_cast<wchar_t>(std::towupper(ch));
    if (columns[0] != L'\0') {
      EXPECT_EQ(upper, orderOf(layout.fields));
    }
  }
  ascii_fields::FieldList withLayer;
  ascii_fields::stringToFields(L"Name,Layer Name", withLayer, ascii_fields::OWNER_POINTS);
  EXPECT_EQ(L"", orderOf(withLayer));
  ascii_fields::FieldList coded;
  ascii_fields::stringToFields(L"Name,Easting,Northing,Z,Codes&Strings", coded, ascii_fields::OWNER_POINTS);
  EXPECT_EQ(L"PENZD", orderOf(coded));
}

TEST(PointFileText, TheDelimiterIsTheOneThatGivesLinesOfNumbers) {
  const struct {
    std::vector<const wchar_t*> lines;
    wchar_t delimiter;
  } cases[] = {
      {{L"P,N,E", L"1,100.5,200.5", L"2,101.5,201.5,TREE;Species=Oak"}, L','},
      {{L"1;100,5;200,5", L"2;101,5;201,5"}, L';'},
      {{L"1\t100.5\t200.5\tA B"}, L'\t'},
      {{L"X Y Z", L"0 1 2", L"15  1 2"}, L' '},
      {{L"1, 100.5, 200.5"}, L','},
      {{L"1|100.5|200.5"}, L'|'},
      {{L"nothing here", L"nor here"}, L'?'},
  };
  for (const auto& [texts, delimiter] : cases) {
    std::vector<NumberedLine> lines;
    lines.reserve(texts.size());
    for (const wchar_t* text : texts)
      lines.emplace_back(static_cast<int>(lines.size()) + 1, text);
    EXPECT_EQ(delimiter, findDelimiter(lines, L'?')) << texts.front();
  }
}

TEST(PointFileText, TheHeaderIsTheLastNamingLineBeforeTheNumbers) {
  PointLayout layout;
  layout.delimiterFrom = ESource::FOUND;
  const std::vector<NumberedLine> lines = {{1, L"Survey export"},
                                           {3, L"Point;Easting;Northing;RL"},
                                           {4, L"1;100,5;200,5;10"},
                                           {5, L"Point;N;E;Z"}};
  EXPECT_FALSE(findLayout(lines, layout));
  EXPECT_EQ(L"Name|Easting|Northing|Ht", columnsOf(layout));
  EXPECT_EQ(3, layout.headerLineNumber);
  EXPECT_EQ(L';', layout.delimiter);
  EXPECT_TRUE(layout.decimalComma());

  PointLayout given;  // a header line takes precedence over given columns, and says so
  given.columnsFrom = ESource::GIVEN;
  EXPECT_TRUE(findLayout({{1, L"Point,Easting,Northing"}, {2, L"1,2,3"}}, given));
  EXPECT_EQ(ESource::HEADER, given.columnsFrom);
}

TEST(PointFileText, ImportNotesAreReadBackAsTheyWereWritten) {
  ImportFindings written;
  written.layoutKnown = true;
  written.columns = {L"Name", L"Easting", L"Lat(North)", L"\"Height (m)\""};
  written.delimiter = L"semicolon";
  written.points = 20;
  for (int line = 3; line < 20; ++line)
    written.extra.add(line, L"");
  written.skipped.add(2, L"no point name");
  written.unreadable.add(9, L"malformed code");
  for (const auto& [order, from, headerLine, delimiterFrom] :
       {std::tuple{L"", ESource::HEADER, 1, ESource::FOUND},
        std::tuple{L"PEN", ESource::GIVEN, 0, ESource::GIVEN},
        std::tuple{L"PEN", ESource::GIVEN, 4, ESource::ASSUMED},
        std::tuple{L"", ESource::ASSUMED, 0, ESource::FOUND}}) {
    written.order = order;
    written.columnsFrom = from;
    written.headerLine = headerLine;
    written.delimiterFrom = delimiterFrom;
    ImportFindings read;
    for (const std::wstring& note : notesOf(L"/a b/job (2).txt", written))
      EXPECT_TRUE(readNote(L"/a b/job (2).txt", note, read)) << note;
    EXPECT_EQ(joined(written.columns), joined(read.columns));
    EXPECT_EQ(std::tuple(written.order, written.columnsFrom, written.headerLine, written.delimiter,
                         written.delimiterFrom),
              std::tuple(read.order, read.columnsFrom, read.headerLine, read.delimiter, read.delimiterFrom));
    EXPECT_EQ(std::tuple(20, 1, 17, 10u, 1, 1u),
              std::tuple(read.points, read.skipped.count, read.extra.count, read.extra.first.size(),
                         read.unreadable.count, read.unreadable.first.size()));
    EXPECT_EQ(
        std::tuple(2, L"no point name", 9, L"malformed code", 12),
        std::tuple(read.skipped.first[0].line, read.skipped.first[0].reason, read.unreadable.first[0].line,
                   read.unreadable.first[0].reason, read.extra.first.back().line));
  }
  ImportFindings none;
  EXPECT_FALSE(readNote(L"job.txt", L"other.txt: columns Name (as given); fixed-width columns", none));
  EXPECT_FALSE(readNote(L"job.txt", L"job.txt: something else", none));
  EXPECT_FALSE(none.layoutKnown);
}

}  // namespace
