#include "ieUtils/IEFileReaders.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "support/PrintString.h"
#include "support/TempDir.h"

namespace {

using vyn::ie::DexTextFile;
using vyn::ie::DexXmlParser;

TEST(DexXmlParser, InitializeHandsOverAReaderOfTheDocumentOrLeavesThePointerAlone) {
  const dex_test::TempDir folder;
  const std::string path =
      folder.write("formats.xml",
                   "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n<IEFormatsData version=\"1.9\">"
                   "<Name>CSV &amp; text</Name></IEFormatsData>\n");
  DexXmlParser* parser = nullptr;
  ASSERT_EQ(vyn::ie::DEX_RESULT_OK, DexXmlParser::initialize(dex_test::widen(path).c_str(), parser));
  std::unique_ptr<DexXmlParser> owned(parser);
  EXPECT_TRUE(parser->IsUTF8() && !parser->IsUTF16());
  std::wstring tokens;
  CVynStringT<wchar_t> tag;
  CVynStringT<wchar_t> attributes;
  CVynStringT<wchar_t> value;
  while (parser->ReadToken(tag, attributes, value))
    tokens += std::wstring(tag.view()) + L"|" + std::wstring(attributes.view()) + L"|" +
              std::wstring(value.view()) + L"\n";
  EXPECT_EQ(
      tokens,
      L"|version=\"1.0\" encoding=\"utf-8\"|\nIEFormatsData|version=\"1.9\"|\nName||\nName||CSV & text\n"
      L"/Name||\n/IEFormatsData||\n");
  const DexXmlParser copy(*owned);  // shares nothing with its original
  owned.reset();
  EXPECT_FALSE(copy.IsOpen());

  DexXmlParser* const untouched = reinterpret_cast<DexXmlParser*>(0x1);
  parser = untouched;
  EXPECT_EQ(vyn::ie::DEX_RESULT_FILE_ERROR,
            DexXmlParser::initialize(folder.wfile("missing.xml").c_str(), parser));
  EXPECT_EQ(vyn::ie::DEX_RESULT_FILE_ERROR, DexXmlParser::initialize(L"", parser));
  for (const char* notXml : {"P1,100.0,200.0,10.0,CODE\n", ""}) {
    const std::string file = folder.write("points.csv", notXml);
    EXPECT_EQ(vyn::ie::DEX_RESULT_WRONG_FORMAT,
              DexXmlParser::initialize(dex_test::widen(file).c_str(), parser));
  }
  EXPECT_EQ(untouched, parser);
}

TEST(DexTextFile, ReadsLinesThroughTheHostReader) {
  const dex_test::TempDir folder;
  const std::string path = folder.write("points.txt", "\xEF\xBB\xBFP1,1\r\nP2,2\rP\xC3\xA9,3");
  DexTextFile file(512);
  ASSERT_NE(0, file.Open(dex_test::widen(path).c_str()));
  CVynStringT<wchar_t> line;
  std::wstring lines;
  while (file.ReadString(line))
    lines += std::wstring(line.view()) + L"|";
  EXPECT_EQ(lines, L"P1,1|P2,2|P\u00E9,3|");
  DexTextFile missing(512);
  EXPECT_EQ(0, missing.Open(folder.wfile("none.txt").c_str()));
  EXPECT_FALSE(missing.ReadString(line));
  delete static_cast<CTextFile*>(new DexTextFile(16));
}

}  // namespace
