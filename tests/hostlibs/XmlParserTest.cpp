#include "hostlibs/XmlParser.h"

#include <gtest/gtest.h>

#include <algorithm>
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
using Parser = CXmlParserBase;
using Tokens = std::vector<std::wstring>;

// Every token as "tag|attributes|value", at most limit of them.
Tokens readAll(CXmlParserBase& parser, std::size_t limit = 1000000) {
  Tokens tokens;
  String tag;
  String attributes;
  String value;
  while (tokens.size() < limit && parser.ReadToken(tag, attributes, value))
    tokens.push_back(std::wstring(tag.view()) + L"|" + std::wstring(attributes.view()) + L"|" +
                     std::wstring(value.view()));
  return tokens;
}

std::string fixture(const char* name) {
  return dex_test::dataFile(std::string("xml/") + name);
}

int initialize(const std::string& path, CXmlParserBase& parser) {
  return Parser::DoInitialize(dex_test::widen(path).c_str(), &parser);
}

// The tokens of a file that must open.
Tokens tokensOf(const std::string& path) {
  CXmlParser parser;
  EXPECT_EQ(initialize(path, parser), Parser::INIT_OK) << path;
  return readAll(parser);
}

// The tokens of the job fixtures after their declaration.
const Tokens kJobBody = {
    L"Job|name=\"Road &amp; Bridge\" units=\"m\" note=\"say &quot;hi&quot; &lt;now&gt;\"|",
    L"Point|id=\"P1\" x=\"1000.0\"|",
    L"/Point||",
    L"Point|id=\"P2\"|",
    L"Point||Größe & 東京 \U0001D11E",
    L"/Point||",
    L"Note||",
    L"Note||<raw> & text",
    L"/Note||",
    L"Remark||",
    L"Remark||  spaced  ",
    L"/Remark||",
    L"Empty||",
    L"/Empty||",
    L"/Job||"};

Tokens withDeclaration(const wchar_t* encoding) {
  Tokens tokens = {std::wstring(L"|version=\"1.0\" encoding=\"") + encoding + L"\"|"};
  tokens.insert(tokens.end(), kJobBody.begin(), kJobBody.end());
  return tokens;
}

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

TEST(CXmlParser, ReadsTheSameTokensFromEveryEncodingAndTellsWhichItIs) {
  const struct {
    const char* file;
    const wchar_t* declared;  // null: no declaration
    bool utf8;
    bool utf16;
  } cases[] = {{"job_utf8.xml", L"UTF-8", true, false},
               {"job_utf8_with_bom.xml", L"UTF-8", true, false},
               {"job_without_declaration.xml", nullptr, true, false},
               {"job_utf16le_with_bom.xml", L"utf-16", false, true},
               {"job_utf16be_with_bom.xml", L"UTF-16", false, true}};
  for (const auto& c : cases) {
    CXmlParser parser;
    ASSERT_EQ(initialize(fixture(c.file), parser), Parser::INIT_OK) << c.file;
    EXPECT_EQ(parser.IsUTF8(), c.utf8) << c.file;
    EXPECT_EQ(parser.IsUTF16(), c.utf16) << c.file;
    EXPECT_EQ(readAll(parser), c.declared != nullptr ? withDeclaration(c.declared) : kJobBody) << c.file;
  }
  EXPECT_EQ(tokensOf(fixture("job_latin1.xml")),
            (Tokens{L"|version=\"1.0\" encoding=\"ISO-8859-1\" standalone=\"yes\"|", L"Job|name=\"Größe\"|",
                    L"Job||café", L"/Job||"}));
  const dex_test::TempDir dir;
  const std::string noMark =
      dir.write("nomark.xml",
                utf16LittleEndian(L"<?xml version=\"1.0\" encoding=\"UTF-16\"?><A b=\"东\">x</A>", false));
  EXPECT_EQ(tokensOf(noMark),
            (Tokens{L"|version=\"1.0\" encoding=\"UTF-16\"|", L"A|b=\"东\"|", L"A||x", L"/A||"}));
  CXmlParser closed;
  EXPECT_FALSE(closed.IsUTF8() || closed.IsUTF16());
}

TEST(CXmlParser, JoinsTextAroundCommentsSplitsItAroundElementsAndKeepsNamespaces) {
  const dex_test::TempDir dir;
  EXPECT_EQ(tokensOf(dir.write("mixed.xml", "<A>x<!-- note -->y<?pi z?>&#65;&#x42;&lt;<B/>tail\n</A>")),
            (Tokens{L"A||", L"A||xyAB<", L"B||", L"/B||", L"A||tail\n", L"/A||"}));
  EXPECT_EQ(tokensOf(dir.write("ns.xml", "<p:r xmlns:p=\"urn:x\" p:a=\"1\"/>")),
            (Tokens{L"p:r|xmlns:p=\"urn:x\" p:a=\"1\"|", L"/p:r||"}));
  const Tokens history = tokensOf(fixture("job_history_table.xml"));
  ASSERT_EQ(history.size(), 15u);
  EXPECT_EQ(history[4], L"Date||12/31/2015 23:30:00");
  EXPECT_EQ(history[10].substr(0, 8), L"Station|");
}

TEST(CXmlParser, EndsTheStreamAtAFaultAndGivesNothingAtOrAfterIt) {
  const dex_test::TempDir dir;
  std::string document = "<?xml version=\"1.0\"?>\n<Job>\n";
  Tokens expected = {L"|version=\"1.0\"|", L"Job||"};
  for (int i = 0; i < 200; ++i) {
    document += "  <Point id=\"P" + std::to_string(i) + "\"/>\n";
    expected.push_back(L"Point|id=\"P" + std::to_wstring(i) + L"\"|");
    expected.push_back(L"/Point||");
  }
  document += "  <Point id=\"bad\">text</Wrong>\n  <Point id=\"after\"/>\n</Job>\n";
  CXmlParser parser;
  ASSERT_EQ(initialize(dir.write("late-fault.xml", document), parser), Parser::INIT_OK);
  const Tokens tokens = readAll(parser);
  // libxml2 parses a block ahead of the tokens it hands out: the last ones before the fault may be missing.
  ASSERT_LE(tokens.size(), expected.size());
  EXPECT_GT(tokens.size(), expected.size() / 2);
  EXPECT_TRUE(std::equal(tokens.begin(), tokens.end(), expected.begin()));
  String tag = L"stale";
  String attributes = L"stale";
  String value = L"stale";
  EXPECT_FALSE(parser.ReadToken(tag, attributes, value));
  EXPECT_TRUE(tag.IsEmpty() && attributes.IsEmpty() && value.IsEmpty());
}

TEST(CXmlParser, AnswersWhyAFileDoesNotOpenAndClosesItsFileOnEveryPath) {
  const dex_test::TempDir dir;
  const int before = dex_test::openFileDescriptors();
  CXmlParser parser;
  EXPECT_EQ(initialize(dir.file("missing.xml"), parser), Parser::INIT_CANNOT_OPEN);
  EXPECT_EQ(initialize(dir.path(), parser), Parser::INIT_CANNOT_OPEN);
  EXPECT_EQ(Parser::DoInitialize(L"", &parser), Parser::INIT_CANNOT_OPEN);
  EXPECT_EQ(Parser::DoInitialize(nullptr, &parser), Parser::INIT_CANNOT_OPEN);
  EXPECT_EQ(Parser::DoInitialize(dex_test::widen(fixture("job_utf8.xml")).c_str(), nullptr),
            Parser::INIT_NO_PARSER);
  for (const char* name : {"empty.xml", "not_xml.txt", "declaration_only.xml", "malformed_near_start.xml"}) {
    EXPECT_EQ(initialize(fixture(name), parser), Parser::INIT_NOT_XML) << name;
    EXPECT_FALSE(parser.IsOpen());
    EXPECT_TRUE(readAll(parser).empty());
  }
  // Initialized again, it starts again; closed, it answers nothing.
  ASSERT_EQ(initialize(fixture("job_utf8.xml"), parser), Parser::INIT_OK);
  readAll(parser, 5);
  ASSERT_EQ(initialize(fixture("job_without_declaration.xml"), parser), Parser::INIT_OK);
  EXPECT_EQ(readAll(parser), kJobBody);
  ASSERT_EQ(initialize(fixture("job_utf8.xml"), parser), Parser::INIT_OK);
  readAll(parser, 3);
  parser.Close();
  EXPECT_TRUE(readAll(parser).empty());
  EXPECT_EQ(dex_test::openFileDescriptors(), before);
}

TEST(CXmlParser, CopiesShareNothingWithTheirOriginal) {
  CTextFile textFile;
  CXmlParser original(&textFile);
  ASSERT_EQ(initialize(fixture("job_without_declaration.xml"), original), Parser::INIT_OK);
  readAll(original, 1);
  CXmlParser copy(original);
  EXPECT_EQ(copy.GetTextFile(), &textFile);
  EXPECT_FALSE(copy.IsOpen());
  EXPECT_TRUE(readAll(copy).empty());
  EXPECT_EQ(readAll(original).size(), kJobBody.size() - 1);
  CXmlParser target;
  ASSERT_EQ(initialize(fixture("job_utf8.xml"), target), Parser::INIT_OK);
  target = copy;
  EXPECT_FALSE(target.IsOpen());
}

TEST(CXmlParser, NeverLoadsExternalEntitiesStaysBoundedAndPrintsNothing) {
  const dex_test::TempDir dir;
  const std::string secret = dir.write("secret.txt", "TOP-SECRET");
  const std::string dtd = dir.write("evil.dtd", "<!ATTLIST r injected CDATA \"from-dtd\">");
  const std::string xxe =
      dir.write("xxe.xml", "<?xml version=\"1.0\"?>\n<!DOCTYPE r SYSTEM \"file://" + dtd +
                               "\" [\n<!ENTITY x SYSTEM \"file://" + secret +
                               "\">\n<!ENTITY inner \"inside\">\n]>\n<r>[&x;][&inner;]</r>\n");
  for (const std::wstring& token : tokensOf(xxe)) {
    EXPECT_EQ(token.find(L"TOP-SECRET"), std::wstring::npos);
    EXPECT_EQ(token.find(L"injected"), std::wstring::npos);
  }
  const auto start = std::chrono::steady_clock::now();
  testing::internal::CaptureStderr();
  CXmlParser laughs;  // it may be refused at once; read, it stays small
  std::size_t characters = 0;
  if (initialize(fixture("billion_laughs.xml"), laughs) == Parser::INIT_OK) {
    for (const std::wstring& token : readAll(laughs))
      characters += token.size();
  }
  EXPECT_LT(characters, 1000000u);
  std::string deep;
  for (int i = 0; i < 100000; ++i)
    deep += "<a>";
  EXPECT_LT(tokensOf(dir.write("deep.xml", deep + "</a>")).size(), 100000u);
  for (const std::string& path :
       {dir.write("bad-utf8.xml", "<?xml version=\"1.0\" encoding=\"UTF-8\"?><A>caf\xE9</A>"),
        dir.write("bad-label.xml", "<?xml version=\"1.0\" encoding=\"no-such\"?><A/>"),
        dir.write("bad-utf16.xml", std::string("\xFF\xFE<\0A\0>\0\x00\xDC", 10)),
        fixture("malformed_near_start.xml")}) {
    CXmlParser parser;
    if (initialize(path, parser) == Parser::INIT_OK) readAll(parser);
  }
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(20));
}

TEST(CXmlParser, ReadsIndependentlyInSeveralThreads) {
  std::vector<Tokens> results(4);
  std::vector<std::thread> threads;
  for (auto& result : results) {
    threads.emplace_back([&result] {
      for (int round = 0; round < 20; ++round)
        result = tokensOf(fixture("job_utf16le_with_bom.xml"));
    });
  }
  for (std::thread& thread : threads)
    thread.join();
  for (const auto& result : results)
    EXPECT_EQ(result, withDeclaration(L"utf-16"));
}

TEST(CXmlParser, ReadAttribGivesTheFirstUnescapedValueAndToleratesHandMadeLists) {
  const String list =
      L"id=\"P1\" idx=\"2\" note=\"say &quot;hi&quot; &amp; &lt;go&gt; &#x41;&#66;\" name=\"\"";
  const String handMade = L"  lone a = 'it''s' b=\"x y\" c=bare d=\"&unknown; & &#xD800;\" e=\"open";
  const std::pair<String, const wchar_t*> rows[] = {
      {Parser::ReadAttrib(list, L"id"), L"P1"},     {Parser::ReadAttrib(list, L"idx"), L"2"},
      {Parser::ReadAttrib(list, L"ID"), L""},       {Parser::ReadAttrib(list, L"i"), L""},
      {Parser::ReadAttrib(list, L""), L""},         {Parser::ReadAttrib(list, nullptr), L""},
      {Parser::ReadAttrib(String(), L"id"), L""},   {Parser::ReadAttrib(handMade, L"a"), L"it"},
      {Parser::ReadAttrib(handMade, L"b"), L"x y"}, {Parser::ReadAttrib(handMade, L"c"), L"bare"},
      {Parser::ReadAttrib(handMade, L"lone"), L""}, {Parser::ReadAttrib(L"a=\"1\" a=\"2\"", L"a"), L"1"}};
  for (const auto& [actual, expected] : rows)
    EXPECT_EQ(actual, expected);
  EXPECT_EQ(Parser::ReadAttrib(list, L"note"), L"say \"hi\" & <go> AB");
  EXPECT_EQ(Parser::ReadAttrib(handMade, L"d"), L"&unknown; & \uFFFD");
  EXPECT_EQ(Parser::ReadAttrib(L"e=\"open", L"e"), L"open");
}

TEST(CXmlParser, WritersFormEscapedTagsThatTheReaderGivesBack) {
  EXPECT_EQ(Parser::OpenTag(L"REGULAR", Parser::TAG_EMPTY_ELEMENT), L"<REGULAR/>");
  EXPECT_EQ(Parser::OpenTag(L"IEFormats", Parser::TAG_CLOSING), L"</IEFormats>");
  EXPECT_EQ(Parser::OpenTag(L"A", 7), L"<A");
  String units = Parser::OpenTag(L"AngeUnits", 2) + Parser::FormAttrib(L"used", L"false");
  EXPECT_EQ(Parser::CloseTag(units, 0), L"<AngeUnits used=\"false\"/>");
  EXPECT_EQ(Parser::FormAttrib(L"name", L"a&b<c>\"d'e\tf\ng\rh\x01"),
            L" name=\"a&amp;b&lt;c&gt;&quot;d'e&#9;f&#10;g&#13;h\uFFFD\"");
  EXPECT_EQ(Parser::FormAttrib(L"empty", nullptr), L" empty=\"\"");
  EXPECT_EQ(Parser::EscapeText(L"1 < 2 & \"3\" > 0\r\n\tend\uFFFE"),
            L"1 &lt; 2 &amp; &quot;3&quot; &gt; 0&#13;\n\tend\uFFFD");
  EXPECT_EQ(Parser::EscapeText(nullptr), L"");

  const std::wstring nasty = L"Road & <Bridge> \"east\" 'A'\t\r\n 東 \U0001D11E";
  String root =
      Parser::OpenTag(L"IEFormatsData", Parser::TAG_OPENING) + Parser::FormAttrib(L"version", L"1.9");
  root += Parser::FormAttrib(L"note", nasty.c_str());
  String item = Parser::OpenTag(L"Item", Parser::TAG_OPENING);
  const String document =
      L"<?xml version=\"1.0\" encoding=\"utf-16\"?>\r\n" + Parser::CloseTag(root, Parser::TAG_OPENING) +
      Parser::CloseTag(item, Parser::TAG_OPENING) + Parser::EscapeText(nasty.c_str()) +
      Parser::OpenTag(L"Item", Parser::TAG_CLOSING) + Parser::OpenTag(L"IEFormatsData", Parser::TAG_CLOSING);
  const dex_test::TempDir dir;
  base::CFile file;
  const std::string bytes = utf16LittleEndian(document.view());
  ASSERT_TRUE(file.OpenForWriting(dir.wfile("formats.xml").c_str()) &&
              file.Write(bytes.data(), bytes.size()) && file.Close());
  const Tokens tokens = tokensOf(dir.file("formats.xml"));
  ASSERT_EQ(tokens.size(), 6u);
  const String attributes(std::wstring_view(tokens[1]).substr(14, tokens[1].size() - 15));
  EXPECT_EQ(Parser::ReadAttrib(attributes, L"version"), L"1.9");
  EXPECT_EQ(Parser::ReadAttrib(attributes, L"note"), nasty.c_str());
  EXPECT_EQ(tokens[3], L"Item||" + nasty);
}

TEST(CXmlParserLimits, GivesAtMostTheFirst256LevelsOfADocumentNested10000Deep) {
  const dex_test::TempDir dir;
  std::string closing;
  for (int i = 0; i < 10000; ++i)
    closing += "</a>";
  CXmlParser parser;
  ASSERT_EQ(initialize(dir.writeRepeated("deep.xml", "<?xml version=\"1.0\"?>", "<a x=\"1\">", 10000,
                                         "text" + closing),
                       parser),
            Parser::INIT_OK);
  const Tokens tokens = readAll(parser);
  ASSERT_LE(tokens.size(), 1u + 256u);
  ASSERT_GE(tokens.size(), 1u + 128u);
  for (std::size_t i = 1; i < tokens.size(); ++i)
    EXPECT_EQ(tokens[i], L"a|x=\"1\"|");
}

TEST(CXmlParserLimits, RefusesOrEndsAtAnAttributeOfAHundredMegabytesAndTextOfTenMillionCharacters) {
  const dex_test::TempDir dir;
  CXmlParser parser;
  EXPECT_EQ(initialize(dir.writeRepeated("huge-attribute.xml", "<?xml version=\"1.0\"?><r a=\"",
                                         std::string(1 << 20, 'x'), 100, "\" b=\"2\"><p/></r>"),
                       parser),
            Parser::INIT_NOT_XML);
  ASSERT_EQ(
      initialize(dir.writeRepeated("late-huge.xml", "<r>" + std::string(4096, ' ') + "<p a=\"1\"/><q a=\"",
                                   std::string(1 << 20, 'y'), 100, "\"/></r>"),
                 parser),
      Parser::INIT_OK);
  const Tokens tokens = readAll(parser);
  EXPECT_LE(tokens.size(), 3u);
  for (const std::wstring& token : tokens)
    EXPECT_NE(token.substr(0, 2), L"q|");
  EXPECT_EQ(tokensOf(dir.writeRepeated("long-text.xml", "<r><p>short</p><q>",
                                       std::string(1 << 20, 'z') + "<!-- -->", 11, "</q></r>")),
            (Tokens{L"r||", L"p||", L"p||short", L"/p||", L"q||"}));
}

}  // namespace
