#include "ieUtils/IEFileReaders.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "support/TempDir.h"

using vyn::ie::DexTextFile;
using vyn::ie::DexXmlParser;

namespace {

// Reads every token of a parser as "tag|attributes|value" lines.
std::wstring allTokens(DexXmlParser& parser) {
  std::wstring tokens;
  CVynStringT<wchar_t> tag;
  CVynStringT<wchar_t> attributes;
  CVynStringT<wchar_t> value;
  while (parser.ReadToken(tag, attributes, value)) {
    tokens += std::wstring(tag.view()) + L"|" + std::wstring(attributes.view()) + L"|" +
              std::wstring(value.view()) + L"\n";
  }
  return tokens;
}

}  // namespace

TEST(DexXmlParser, InitializeHandsOverAReaderOfTheDocument) {
  const dex_test::TempDir folder;
  const std::string path = folder.write("formats.xml",
                                        "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n"
                                        "<IEFormatsData version=\"1.9\"><REGULAR/><Name>CSV &amp; text</Name>"
                                        "</IEFormatsData>\n");
  DexXmlParser* parser = nullptr;
  ASSERT_EQ(vyn::ie::DEX_RESULT_OK, DexXmlParser::initialize(dex_test::widen(path).c_str(), parser));
  ASSERT_NE(nullptr, parser);
  const std::unique_ptr<DexXmlParser> owned(parser);
  EXPECT_TRUE(parser->IsUTF8());
  EXPECT_FALSE(parser->IsUTF16());
  EXPECT_EQ(
      L"|version=\"1.0\" encoding=\"utf-8\"|\n"
      L"IEFormatsData|version=\"1.9\"|\n"
      L"REGULAR||\n"
      L"/REGULAR||\n"
      L"Name||\n"
      L"Name||CSV & text\n"
      L"/Name||\n"
      L"/IEFormatsData||\n",
      allTokens(*parser));
}

TEST(DexXmlParser, FailuresLeaveTheCallersPointerAlone) {
  const dex_test::TempDir folder;
  DexXmlParser* const untouched = reinterpret_cast<DexXmlParser*>(0x1);
  DexXmlParser* parser = untouched;

  EXPECT_EQ(vyn::ie::DEX_RESULT_FILE_ERROR,
            DexXmlParser::initialize(folder.wfile("missing.xml").c_str(), parser));
  EXPECT_EQ(untouched, parser);

  EXPECT_EQ(vyn::ie::DEX_RESULT_FILE_ERROR, DexXmlParser::initialize(L"", parser));
  EXPECT_EQ(untouched, parser);

  const std::string notXml = folder.write("points.csv", "P1,100.0,200.0,10.0,CODE\n");
  EXPECT_EQ(vyn::ie::DEX_RESULT_WRONG_FORMAT,
            DexXmlParser::initialize(dex_test::widen(notXml).c_str(), parser));
  EXPECT_EQ(untouched, parser);

  const std::string empty = folder.write("empty.xml", "");
  EXPECT_EQ(vyn::ie::DEX_RESULT_WRONG_FORMAT,
            DexXmlParser::initialize(dex_test::widen(empty).c_str(), parser));
  EXPECT_EQ(untouched, parser);
}

TEST(DexXmlParser, ACopySharesNothingWithItsOriginal) {
  const dex_test::TempDir folder;
  const std::string path = folder.write("a.xml", "<A><B>1</B></A>");
  DexXmlParser* parser = nullptr;
  ASSERT_EQ(vyn::ie::DEX_RESULT_OK, DexXmlParser::initialize(dex_test::widen(path).c_str(), parser));
  std::unique_ptr<DexXmlParser> original(parser);
  const DexXmlParser copy(*original);
  original.reset();
  EXPECT_FALSE(copy.IsOpen());
}

TEST(DexTextFile, ReadsLinesThroughTheHostReader) {
  const dex_test::TempDir folder;
  const std::string path = folder.write("points.txt", "\xEF\xBB\xBFP1,1\r\nP2,2\rP\xC3\xA9,3");
  DexTextFile file(512);
  ASSERT_NE(0, file.Open(dex_test::widen(path).c_str()));
  CVynStringT<wchar_t> line;
  ASSERT_TRUE(file.ReadString(line));
  EXPECT_EQ(line, L"P1,1");
  ASSERT_TRUE(file.ReadString(line));
  EXPECT_EQ(line, L"P2,2");
  ASSERT_TRUE(file.ReadString(line));
  EXPECT_EQ(line, L"P\u00E9,3");
  EXPECT_FALSE(file.ReadString(line));

  DexTextFile missing(512);
  EXPECT_EQ(0, missing.Open(folder.wfile("none.txt").c_str()));
  EXPECT_FALSE(missing.ReadString(line));

  auto* heap = new DexTextFile(16);
  delete static_cast<CTextFile*>(heap);
}
