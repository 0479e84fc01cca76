#include "hostlibs/XmlParser.h"

#include <gtest/gtest.h>

#include <chrono>
#include <string>
#include <thread>
#include <vector>

#include "hostlibs/File.h"
#include "support/OpenFiles.h"
#include "support/PrintString.h"
#include "support/TempDir.h"

namespace {

using String = CVynStringT<wchar_t>;

struct Token {
  std::wstring tag;
  std::wstring attributes;
  std::wstring value;
  bool operator==(const Token&) const = default;
};

void PrintTo(const Token& token, std::ostream* out) {
  *out << "{\"" << dex_test::narrow(token.tag) << "\", \"" << dex_test::narrow(token.attributes) << "\", \""
       << dex_test::narrow(token.value) << "\"}";
}

std::vector<Token> readAll(CXmlParserBase& parser, std::size_t limit = 1000000) {
  std::vector<Token> tokens;
  String tag;
  String attributes;
  String value;
  while (tokens.size() < limit && parser.ReadToken(tag, attributes, value)) {
    tokens.push_back({std::wstring(tag.view()), std::wstring(attributes.view()), std::wstring(value.view())});
  }
  return tokens;
}

// Opens path (UTF-8) with a fresh parser and returns every token; fails the test unless it opens.
std::vector<Token> tokensOf(const std::string& path) {
  CXmlParser parser;
  EXPECT_EQ(CXmlParserBase::DoInitialize(dex_test::widen(path).c_str(), &parser), CXmlParserBase::INIT_OK)
      << path;
  return readAll(parser);
}

std::string xmlFixture(const char* name) {
  return dex_test::dataFile(std::string("xml/") + name);
}

int initialize(const std::string& path, CXmlParserBase& parser) {
  return CXmlParserBase::DoInitialize(dex_test::widen(path).c_str(), &parser);
}

// The tokens of the job fixtures after their declaration.
const std::vector<Token> kJobBody = {
    {L"Job", L"name=\"Road &amp; Bridge\" units=\"m\" note=\"say &quot;hi&quot; &lt;now&gt;\"", L""},
    {L"Point", L"id=\"P1\" x=\"1000.0\"", L""},
    {L"/Point", L"", L""},
    {L"Point", L"id=\"P2\"", L""},
    {L"Point", L"", L"Größe & 東京 \U0001D11E"},
    {L"/Point", L"", L""},
    {L"Note", L"", L""},
    {L"Note", L"", L"<raw> & text"},
    {L"/Note", L"", L""},
    {L"Remark", L"", L""},
    {L"Remark", L"", L"  spaced  "},
    {L"/Remark", L"", L""},
    {L"Empty", L"", L""},
    {L"/Empty", L"", L""},
    {L"/Job", L"", L""},
};

std::vector<Token> withDeclaration(const wchar_t* pseudoAttributes) {
  std::vector<Token> tokens = {{L"", pseudoAttributes, L""}};
  tokens.insert(tokens.end(), kJobBody.begin(), kJobBody.end());
  return tokens;
}

// UTF-16LE bytes of a wide text, with the byte-order mark.
std::string utf16LittleEndian(std::wstring_view text, bool withMark = true) {
  std::string bytes = withMark ? std::string("\xFF\xFE") : std::string();
  const auto put = [&](char32_t unit) {
    bytes += static_cast<char>(unit & 0xFF);
    bytes += static_cast<char>((unit >> 8) & 0xFF);
  };
  for (const wchar_t ch : text) {
    const auto value = static_cast<char32_t>(ch);
    if (value < 0x10000) {
      put(value);
    } else {
      put(0xD800 + ((value - 0x10000) >> 10));
      put(0xDC00 + ((value - 0x10000) & 0x3FF));
    }
  }
  return bytes;
}

// --- Reading

TEST(CXmlParser, ReadsTheSameTokensFromUtf8AndUtf16) {
  EXPECT_EQ(tokensOf(xmlFixture("job_utf8.xml")), withDeclaration(L"version=\"1.0\" encoding=\"UTF-8\""));
  EXPECT_EQ(tokensOf(xmlFixture("job_utf8_with_bom.xml")),
            withDeclaration(L"version=\"1.0\" encoding=\"UTF-8\""));
  EXPECT_EQ(tokensOf(xmlFixture("job_utf16le_with_bom.xml")),
            withDeclaration(L"version=\"1.0\" encoding=\"utf-16\""));
  EXPECT_EQ(tokensOf(xmlFixture("job_utf16be_with_bom.xml")),
            withDeclaration(L"version=\"1.0\" encoding=\"UTF-16\""));
}

TEST(CXmlParser, GivesNoDeclarationTokenForADocumentWithoutOne) {
  EXPECT_EQ(tokensOf(xmlFixture("job_without_declaration.xml")), kJobBody);
}

TEST(CXmlParser, TellsTheEncodingOfTheDocument) {
  struct Case {
    const char* file;
    bool utf8;
    bool utf16;
  };
  for (const Case& c :
       {Case{"job_utf8.xml", true, false}, Case{"job_utf8_with_bom.xml", true, false},
        Case{"job_without_declaration.xml", true, false}, Case{"job_utf16le_with_bom.xml", false, true},
        Case{"job_utf16be_with_bom.xml", false, true}, Case{"job_latin1.xml", false, false}}) {
    CXmlParser parser;
    ASSERT_EQ(initialize(xmlFixture(c.file), parser), CXmlParserBase::INIT_OK) << c.file;
    EXPECT_EQ(parser.IsUTF8(), c.utf8) << c.file;
    EXPECT_EQ(parser.IsUTF16(), c.utf16) << c.file;
  }
  CXmlParser closed;
  EXPECT_FALSE(closed.IsUTF8());
  EXPECT_FALSE(closed.IsUTF16());
}

TEST(CXmlParser, ReadsUtf16WithoutByteOrderMark) {
  const dex_test::TempDir dir;
  const std::string path =
      dir.write("nomark.xml",
                utf16LittleEndian(L"<?xml version=\"1.0\" encoding=\"UTF-16\"?><A b=\"东\">x</A>", false));
  CXmlParser parser;
  ASSERT_EQ(initialize(path, parser), CXmlParserBase::INIT_OK);
  EXPECT_TRUE(parser.IsUTF16());
  const std::vector<Token> expected = {{L"", L"version=\"1.0\" encoding=\"UTF-16\"", L""},
                                       {L"A", L"b=\"东\"", L""},
                                       {L"A", L"", L"x"},
                                       {L"/A", L"", L""}};
  EXPECT_EQ(readAll(parser), expected);
}

TEST(CXmlParser, ReadsDocumentsDeclaredInOtherEncodings) {
  const std::vector<Token> expected = {
      {L"", L"version=\"1.0\" encoding=\"ISO-8859-1\" standalone=\"yes\"", L""},
      {L"Job", L"name=\"Größe\"", L""},
      {L"Job", L"", L"café"},
      {L"/Job", L"", L""}};
  EXPECT_EQ(tokensOf(xmlFixture("job_latin1.xml")), expected);
}

TEST(CXmlParser, FollowsTheJobHistoryTableLayout) {
  const std::vector<Token> tokens = tokensOf(xmlFixture("job_history_table.xml"));
  const std::vector<std::wstring> tags = [&] {
    std::vector<std::wstring> names;
    for (const Token& token : tokens)
      names.push_back(token.tag);
    return names;
  }();
  const std::vector<std::wstring> expected = {L"",
                                              L"OrvexJobHistory",
                                              L"Table",
                                              L"Date",
                                              L"Date",
                                              L"/Date",
                                              L"Type",
                                              L"Type",
                                              L"/Type",
                                              L"Content",
                                              L"Station",
                                              L"/Station",
                                              L"/Content",
                                              L"/Table",
                                              L"/OrvexJobHistory"};
  ASSERT_EQ(tags, expected);
  EXPECT_EQ(tokens[4].value, L"12/31/2015 23:30:00");
  EXPECT_EQ(tokens[7].value, L"OccupationChanged");
  const String station(std::wstring_view(tokens[10].attributes));
  EXPECT_EQ(CXmlParserBase::ReadAttrib(station, L"Name"), L"P7");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(station, L"Z"), L"55.2");
}

TEST(CXmlParser, JoinsTextAroundCommentsAndSplitsItAroundElements) {
  const dex_test::TempDir dir;
  const std::string path = dir.write("mixed.xml", "<A>x<!-- note -->y<?pi z?>&#65;&#x42;&lt;<B/>tail\n</A>");
  const std::vector<Token> expected = {{L"A", L"", L""},  {L"A", L"", L"xyAB<"},  {L"B", L"", L""},
                                       {L"/B", L"", L""}, {L"A", L"", L"tail\n"}, {L"/A", L"", L""}};
  EXPECT_EQ(tokensOf(path), expected);
}

TEST(CXmlParser, KeepsNamespacePrefixesAndDeclarations) {
  const dex_test::TempDir dir;
  const std::string path = dir.write("ns.xml", "<p:r xmlns:p=\"urn:x\" p:a=\"1\"/>");
  const std::vector<Token> expected = {{L"p:r", L"xmlns:p=\"urn:x\" p:a=\"1\"", L""}, {L"/p:r", L"", L""}};
  EXPECT_EQ(tokensOf(path), expected);
}

TEST(CXmlParser, EndsTheStreamAtAFaultLaterInTheDocument) {
  const dex_test::TempDir dir;
  std::string document = "<?xml version=\"1.0\"?>\n<Job>\n";
  std::vector<Token> expected = {{L"", L"version=\"1.0\"", L""}, {L"Job", L"", L""}};
  for (int i = 0; i < 200; ++i) {
    document += "  <Point id=\"P" + std::to_string(i) + "\"/>\n";
    expected.push_back({L"Point", L"id=\"P" + std::to_wstring(i) + L"\"", L""});
    expected.push_back({L"/Point", L"", L""});
  }
  document += "  <Point id=\"bad\">text</Wrong>\n  <Point id=\"after\"/>\n</Job>\n";
  CXmlParser parser;
  ASSERT_EQ(initialize(dir.write("late-fault.xml", document), parser), CXmlParserBase::INIT_OK);
  const std::vector<Token> tokens = readAll(parser);
  // libxml2 parses a block ahead of the tokens it hands out, so the last tokens before the fault may
  // be missing; nothing at or after the fault is ever given.
  ASSERT_LE(tokens.size(), expected.size());
  EXPECT_GT(tokens.size(), expected.size() / 2);
  EXPECT_TRUE(std::equal(tokens.begin(), tokens.end(), expected.begin()));
  String tag = L"stale";
  String attributes = L"stale";
  String value = L"stale";
  EXPECT_FALSE(parser.ReadToken(tag, attributes, value));
  EXPECT_TRUE(tag.IsEmpty() && attributes.IsEmpty() && value.IsEmpty());
}

// --- Opening

TEST(CXmlParser, AnswersOneForFilesThatCannotBeOpened) {
  const dex_test::TempDir dir;
  CXmlParser parser;
  EXPECT_EQ(initialize(dir.file("missing.xml"), parser), CXmlParserBase::INIT_CANNOT_OPEN);
  EXPECT_EQ(initialize(dir.path(), parser), CXmlParserBase::INIT_CANNOT_OPEN);
  EXPECT_EQ(CXmlParserBase::DoInitialize(L"", &parser), CXmlParserBase::INIT_CANNOT_OPEN);
  EXPECT_EQ(CXmlParserBase::DoInitialize(nullptr, &parser), CXmlParserBase::INIT_CANNOT_OPEN);
  EXPECT_FALSE(parser.IsOpen());
}

TEST(CXmlParser, AnswersTwoForFilesThatAreNotXml) {
  for (const char* name : {"empty.xml", "not_xml.txt", "declaration_only.xml", "malformed_near_start.xml"}) {
    CXmlParser parser;
    EXPECT_EQ(initialize(xmlFixture(name), parser), CXmlParserBase::INIT_NOT_XML) << name;
    EXPECT_FALSE(parser.IsOpen()) << name;
    EXPECT_TRUE(readAll(parser).empty()) << name;
  }
}

TEST(CXmlParser, AnswersFailureForANullParser) {
  EXPECT_EQ(CXmlParserBase::DoInitialize(dex_test::widen(xmlFixture("job_utf8.xml")).c_str(), nullptr),
            CXmlParserBase::INIT_NO_PARSER);
}

TEST(CXmlParser, StartsAgainWhenInitializedAgainAndAnswersNothingWhenClosed) {
  CXmlParser parser;
  ASSERT_EQ(initialize(xmlFixture("job_utf8.xml"), parser), CXmlParserBase::INIT_OK);
  readAll(parser, 5);
  ASSERT_EQ(initialize(xmlFixture("job_without_declaration.xml"), parser), CXmlParserBase::INIT_OK);
  EXPECT_EQ(readAll(parser), kJobBody);
  EXPECT_EQ(initialize(xmlFixture("missing.xml"), parser), CXmlParserBase::INIT_CANNOT_OPEN);
  EXPECT_FALSE(parser.IsOpen());
  ASSERT_EQ(initialize(xmlFixture("job_utf8.xml"), parser), CXmlParserBase::INIT_OK);
  parser.Close();
  EXPECT_TRUE(readAll(parser).empty());
}

TEST(CXmlParser, CopiesShareNothingWithTheirOriginal) {
  CTextFile textFile;
  CXmlParser original(&textFile);
  ASSERT_EQ(initialize(xmlFixture("job_without_declaration.xml"), original), CXmlParserBase::INIT_OK);
  String tag;
  String attributes;
  String value;
  ASSERT_TRUE(original.ReadToken(tag, attributes, value));

  CXmlParser copy(original);
  EXPECT_EQ(copy.GetTextFile(), &textFile);
  EXPECT_FALSE(copy.IsOpen());
  EXPECT_FALSE(copy.ReadToken(tag, attributes, value));
  EXPECT_EQ(readAll(original).size(), kJobBody.size() - 1);  // the original goes on undisturbed

  CXmlParser target;
  ASSERT_EQ(initialize(xmlFixture("job_utf8.xml"), target), CXmlParserBase::INIT_OK);
  target = copy;
  EXPECT_FALSE(target.IsOpen());
  EXPECT_EQ(target.GetTextFile(), &textFile);
}

TEST(CXmlParser, ClosesItsFileOnEveryPath) {
  const int before = dex_test::openFileDescriptors();
  for (const char* name :
       {"job_utf8.xml", "empty.xml", "not_xml.txt", "malformed_near_start.xml", "missing.xml"}) {
    CXmlParser parser;
    initialize(xmlFixture(name), parser);
    CXmlParser halfRead;
    if (initialize(xmlFixture(name), halfRead) == CXmlParserBase::INIT_OK) readAll(halfRead, 3);
  }
  CXmlParser reopened;
  for (int i = 0; i < 3; ++i)
    initialize(xmlFixture("job_utf8.xml"), reopened);
  reopened.Close();
  EXPECT_EQ(dex_test::openFileDescriptors(), before);
}

// --- Safety

TEST(CXmlParser, NeverLoadsExternalEntitiesOrDtds) {
  const dex_test::TempDir dir;
  const std::string secret = dir.write("secret.txt", "TOP-SECRET");
  const std::string dtd = dir.write("evil.dtd", "<!ATTLIST r injected CDATA \"from-dtd\">");
  const std::string path =
      dir.write("xxe.xml", "<?xml version=\"1.0\"?>\n<!DOCTYPE r SYSTEM \"file://" + dtd +
                               "\" [\n<!ENTITY x SYSTEM \"file://" + secret +
                               "\">\n<!ENTITY inner \"inside\">\n]>\n<r>[&x;][&inner;]</r>\n");
  CXmlParser parser;
  ASSERT_EQ(initialize(path, parser), CXmlParserBase::INIT_OK);
  for (const Token& token : readAll(parser)) {
    EXPECT_EQ(token.value.find(L"TOP-SECRET"), std::wstring::npos);
    EXPECT_EQ(token.attributes.find(L"injected"), std::wstring::npos);
  }
}

TEST(CXmlParser, StaysBoundedOnEntityExpansionAndDeepNesting) {
  const auto start = std::chrono::steady_clock::now();
  {
    CXmlParser parser;
    if (initialize(xmlFixture("billion_laughs.xml"), parser) == CXmlParserBase::INIT_OK) {
      std::size_t characters = 0;
      for (const Token& token : readAll(parser))
        characters += token.value.size();
      EXPECT_LT(characters, 1000000u);
    }
  }
  const dex_test::TempDir dir;
  std::string deep;
  for (int i = 0; i < 100000; ++i)
    deep += "<a>";
  for (int i = 0; i < 100000; ++i)
    deep += "</a>";
  CXmlParser parser;
  ASSERT_EQ(initialize(dir.write("deep.xml", deep), parser), CXmlParserBase::INIT_OK);
  EXPECT_LT(readAll(parser).size(), 100000u);
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(20));
}

TEST(CXmlParser, PrintsNothingAboutBadDocuments) {
  const dex_test::TempDir dir;
  const std::string badByte =
      dir.write("bad-utf8.xml", "<?xml version=\"1.0\" encoding=\"UTF-8\"?><A>caf\xE9</A>");
  const std::string badEncoding =
      dir.write("bad-label.xml", "<?xml version=\"1.0\" encoding=\"no-such\"?><A/>");
  const std::string badUtf16 = dir.write("bad-utf16.xml", "\xFF\xFE<\0A\0>\0\x00\xDC");
  testing::internal::CaptureStderr();
  for (const std::string& path : {badByte, badEncoding, badUtf16, xmlFixture("malformed_near_start.xml"),
                                  xmlFixture("not_xml.txt"), xmlFixture("billion_laughs.xml")}) {
    CXmlParser parser;
    if (initialize(path, parser) == CXmlParserBase::INIT_OK) readAll(parser);
  }
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
}

TEST(CXmlParser, ReadsIndependentlyInSeveralThreads) {
  std::vector<std::vector<Token>> results(4);
  std::vector<std::thread> threads;
  for (auto& result : results) {
    threads.emplace_back([&result] {
      for (int round = 0; round < 20; ++round)
        result = tokensOf(xmlFixture("job_utf16le_with_bom.xml"));
    });
  }
  for (std::thread& thread : threads)
    thread.join();
  for (const auto& result : results)
    EXPECT_EQ(result, withDeclaration(L"version=\"1.0\" encoding=\"utf-16\""));
}

// --- Attributes

TEST(CXmlParserReadAttrib, GivesTheUnescapedValueOfTheNamedAttribute) {
  const String attributes = L"id=\"P1\" idx=\"2\" note=\"say &quot;hi&quot; &amp; &lt;go&gt; &#x41;&#66;\"";
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"id"), L"P1");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"idx"), L"2");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"note"), L"say \"hi\" & <go> AB");
}

TEST(CXmlParserReadAttrib, GivesEmptyForMissingNames) {
  const String attributes = L"id=\"P1\" name=\"\"";
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"ID"), L"");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"i"), L"");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"name"), L"");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L""), L"");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, nullptr), L"");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(String(), L"id"), L"");
}

TEST(CXmlParserReadAttrib, ToleratesHandMadeAttributeLists) {
  const String attributes = L"  lone a = 'it''s' b=\"x y\" c=bare d=\"&unknown; & &#xD800;\" e=\"open";
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"a"), L"it");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"b"), L"x y");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"c"), L"bare");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"d"), L"&unknown; & \uFFFD");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"e"), L"open");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"lone"), L"");
}

TEST(CXmlParserReadAttrib, TakesTheFirstOfRepeatedNames) {
  EXPECT_EQ(CXmlParserBase::ReadAttrib(L"a=\"1\" a=\"2\"", L"a"), L"1");
}

// --- Writing

TEST(CXmlParserWriters, FormTagsOfEachKind) {
  EXPECT_EQ(CXmlParserBase::OpenTag(L"REGULAR", CXmlParserBase::TAG_EMPTY_ELEMENT), L"<REGULAR/>");
  EXPECT_EQ(CXmlParserBase::OpenTag(L"IEFormats", CXmlParserBase::TAG_CLOSING), L"</IEFormats>");
  EXPECT_EQ(CXmlParserBase::OpenTag(L"IEFormat", CXmlParserBase::TAG_OPENING), L"<IEFormat");
  EXPECT_EQ(CXmlParserBase::OpenTag(L"A", 7), L"<A");
  String tag = CXmlParserBase::OpenTag(L"IEFormatsData", 2);
  tag += CXmlParserBase::FormAttrib(L"version", L"1.9");
  tag += CXmlParserBase::FormAttrib(L"useDataFromFile", L"false");
  EXPECT_EQ(CXmlParserBase::CloseTag(tag, 2), L"<IEFormatsData version=\"1.9\" useDataFromFile=\"false\">");
  String empty = CXmlParserBase::OpenTag(L"AngeUnits", 2) + CXmlParserBase::FormAttrib(L"used", L"false");
  EXPECT_EQ(CXmlParserBase::CloseTag(empty, 0), L"<AngeUnits used=\"false\"/>");
}

TEST(CXmlParserWriters, EscapeWhatTheyWrite) {
  EXPECT_EQ(CXmlParserBase::FormAttrib(L"name", L"a&b<c>\"d'e\tf\ng\rh\x01"),
            L" name=\"a&amp;b&lt;c&gt;&quot;d'e&#9;f&#10;g&#13;h\uFFFD\"");
  EXPECT_EQ(CXmlParserBase::FormAttrib(L"empty", nullptr), L" empty=\"\"");
  EXPECT_EQ(CXmlParserBase::EscapeText(L"1 < 2 & \"3\" > 0\r\n\tend\uFFFE"),
            L"1 &lt; 2 &amp; &quot;3&quot; &gt; 0&#13;\n\tend\uFFFD");
  EXPECT_EQ(CXmlParserBase::EscapeText(nullptr), L"");
}

TEST(CXmlParserWriters, WriteWhatTheReaderGivesBack) {
  const dex_test::TempDir dir;
  const std::wstring nasty = L"Road & <Bridge> \"east\" 'A'\t\r\n 東 \U0001D11E";
  String document = L"<?xml version=\"1.0\" encoding=\"utf-16\"?>\r\n";
  String root = CXmlParserBase::OpenTag(L"IEFormatsData", CXmlParserBase::TAG_OPENING);
  root += CXmlParserBase::FormAttrib(L"version", L"1.9");
  root += CXmlParserBase::FormAttrib(L"note", nasty.c_str());
  document += CXmlParserBase::CloseTag(root, CXmlParserBase::TAG_OPENING) + L"\r\n";
  document += CXmlParserBase::OpenTag(L"REGULAR", CXmlParserBase::TAG_EMPTY_ELEMENT) + L"\r\n";
  String item = CXmlParserBase::OpenTag(L"Item", CXmlParserBase::TAG_OPENING);
  document += CXmlParserBase::CloseTag(item, CXmlParserBase::TAG_OPENING);
  document += CXmlParserBase::EscapeText(nasty.c_str());
  document += CXmlParserBase::OpenTag(L"Item", CXmlParserBase::TAG_CLOSING) + L"\r\n";
  document += CXmlParserBase::OpenTag(L"IEFormatsData", CXmlParserBase::TAG_CLOSING) + L"\r\n";

  base::CFile file;
  ASSERT_TRUE(file.OpenForWriting(dir.wfile("formats.xml").c_str()));
  const std::string bytes = utf16LittleEndian(document.view());
  ASSERT_TRUE(file.Write(bytes.data(), bytes.size()));
  ASSERT_TRUE(file.Close());

  CXmlParser parser;
  ASSERT_EQ(initialize(dir.file("formats.xml"), parser), CXmlParserBase::INIT_OK);
  EXPECT_TRUE(parser.IsUTF16());
  const std::vector<Token> tokens = readAll(parser);
  ASSERT_EQ(tokens.size(), 8u);
  EXPECT_EQ(tokens[0], (Token{L"", L"version=\"1.0\" encoding=\"utf-16\"", L""}));
  EXPECT_EQ(tokens[1].tag, L"IEFormatsData");
  const String attributes(std::wstring_view(tokens[1].attributes));
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"version"), L"1.9");
  EXPECT_EQ(CXmlParserBase::ReadAttrib(attributes, L"note"), nasty.c_str());
  EXPECT_EQ(tokens[2], (Token{L"REGULAR", L"", L""}));
  EXPECT_EQ(tokens[3], (Token{L"/REGULAR", L"", L""}));
  EXPECT_EQ(tokens[4], (Token{L"Item", L"", L""}));
  EXPECT_EQ(tokens[5], (Token{L"Item", L"", nasty}));
  EXPECT_EQ(tokens[6], (Token{L"/Item", L"", L""}));
  EXPECT_EQ(tokens[7], (Token{L"/IEFormatsData", L"", L""}));
}

}  // namespace

namespace {

// --- Limits

TEST(CXmlParserLimits, GivesAtMostTheFirst256LevelsOfADocumentNested10000Deep) {
  constexpr std::size_t kLevels = 10000;
  constexpr std::size_t kDeepestNesting = 256;
  const dex_test::TempDir dir;
  std::string closing;
  for (std::size_t i = 0; i < kLevels; ++i)
    closing += "</a>";
  const std::string path =
      dir.writeRepeated("deep.xml", "<?xml version=\"1.0\"?>", "<a x=\"1\">", kLevels, "text" + closing);
  CXmlParser parser;
  ASSERT_EQ(initialize(path, parser), CXmlParserBase::INIT_OK);
  const std::vector<Token> tokens = readAll(parser);
  // The declaration and start tags; libxml2's read-ahead loses the last few before the fault.
  ASSERT_LE(tokens.size(), 1 + kDeepestNesting);
  ASSERT_GE(tokens.size(), 1 + kDeepestNesting / 2);
  for (std::size_t i = 1; i < tokens.size(); ++i)
    EXPECT_EQ(tokens[i], (Token{L"a", L"x=\"1\"", L""}));
  String tag, attributes, value;
  EXPECT_FALSE(parser.ReadToken(tag, attributes, value));
}

TEST(CXmlParserLimits, RefusesAnAttributeOfAHundredMegabytes) {
  const dex_test::TempDir dir;
  const std::string path = dir.writeRepeated("huge-attribute.xml", "<?xml version=\"1.0\"?><r a=\"",
                                             std::string(1 << 20, 'x'), 100, "\" b=\"2\"><p/></r>");
  CXmlParser parser;
  EXPECT_EQ(initialize(path, parser), CXmlParserBase::INIT_NOT_XML);
  EXPECT_FALSE(parser.IsOpen());
}

TEST(CXmlParserLimits, EndsTheStreamAtAnAttributeOfAHundredMegabytesAfterAGoodStart) {
  const dex_test::TempDir dir;
  const std::string path =
      dir.writeRepeated("late-huge-attribute.xml", "<r>" + std::string(4096, ' ') + "<p a=\"1\"/><q a=\"",
                        std::string(1 << 20, 'y'), 100, "\"/></r>");
  CXmlParser parser;
  ASSERT_EQ(initialize(path, parser), CXmlParserBase::INIT_OK);
  const std::vector<Token> tokens = readAll(parser);
  EXPECT_LE(tokens.size(), 3u);
  for (const Token& token : tokens)
    EXPECT_NE(token.tag, L"q");
}

TEST(CXmlParserLimits, EndsTheStreamAtTextOfMoreThanTenMillionCharactersSplitByComments) {
  const dex_test::TempDir dir;
  const std::string path = dir.writeRepeated("long-text.xml", "<r><p>short</p><q>",
                                             std::string(1 << 20, 'z') + "<!-- -->", 11, "</q></r>");
  CXmlParser parser;
  ASSERT_EQ(initialize(path, parser), CXmlParserBase::INIT_OK);
  const std::vector<Token> tokens = readAll(parser);
  EXPECT_EQ(
      tokens,
      (std::vector<Token>{
          {L"r", L"", L""}, {L"p", L"", L""}, {L"p", L"", L"short"}, {L"/p", L"", L""}, {L"q", L"", L""}}));
}

}  // namespace
