// The XML token reader on raw bytes in UTF-8 and UTF-16. The first byte chooses how the rest reaches
// the file: 0 as it is; 1 behind a UTF-8 mark; 2 to 5 re-encoded from lenient UTF-8 into UTF-16
// little- or big-endian, with or without a mark. The file is read through DexXmlParser token by token
// and every token is checked against the token model. Choices 6 and 7 test the writers instead: the
// rest becomes an attribute value and the text of an element, written with FormAttrib and EscapeText
// into a UTF-8 or UTF-16 document, which must read back as that text.

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "hostlibs/XmlParser.h"
#include "ieUtils/IEFileReaders.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/FuzzText.h"
#include "support/ScratchFile.h"
#include "support/XmlTokens.h"

namespace {

using String = CVynStringT<wchar_t>;
using vyn::ie::DexXmlParser;

enum Layout : int {
  RAW = 0,
  UTF8_MARK = 1,
  UTF16LE_MARK = 2,
  UTF16BE_MARK = 3,
  UTF16LE = 4,
  UTF16BE = 5,
  WRITTEN_UTF8 = 6,
  WRITTEN_UTF16 = 7,
};

const std::string kUtf8Mark = "\xEF\xBB\xBF";
const std::string kUtf16LEMark = "\xFF\xFE";
const std::string kUtf16BEMark = "\xFE\xFF";

std::string fileBytes(Layout layout, std::string_view rest) {
  switch (layout) {
    case UTF8_MARK:
      return kUtf8Mark + std::string(rest);
    case UTF16LE_MARK:
      return kUtf16LEMark + dex_fuzz::encodeUtf16(dex_fuzz::decodeLenientUtf8(rest), true);
    case UTF16BE_MARK:
      return kUtf16BEMark + dex_fuzz::encodeUtf16(dex_fuzz::decodeLenientUtf8(rest), false);
    case UTF16LE:
      return dex_fuzz::encodeUtf16(dex_fuzz::decodeLenientUtf8(rest), true);
    case UTF16BE:
      return dex_fuzz::encodeUtf16(dex_fuzz::decodeLenientUtf8(rest), false);
    default:
      return std::string(rest);
  }
}

std::unique_ptr<DexXmlParser> open(const std::wstring& path) {
  DexXmlParser* parser = nullptr;
  const vyn::ie::EDexResult result = DexXmlParser::initialize(String(path.c_str()), parser);
  DEX_FUZZ_CHECK((result == vyn::ie::DEX_RESULT_OK) == (parser != nullptr));
  DEX_FUZZ_CHECK(result == vyn::ie::DEX_RESULT_OK || result == vyn::ie::DEX_RESULT_WRONG_FORMAT);
  return std::unique_ptr<DexXmlParser>(parser);
}

void readRawDocument(const dex_fuzz::ScratchFile& scratch, Layout layout, std::string_view rest) {
  const std::string bytes = fileBytes(layout, rest);
  if (!scratch.write(bytes)) return;
  const std::unique_ptr<DexXmlParser> parser = open(scratch.wpath());
  if (!parser) return;
  // A copy has no document open, whatever the state of its original.
  DexXmlParser copy(*parser);
  String tag, attributes, value;
  DEX_FUZZ_CHECK(!copy.ReadToken(tag, attributes, value) && !copy.IsOpen());
  dex_fuzz::readXmlToEnd(*parser, bytes.size());
}

// text as the reader must give it back: up to its first NUL (the writers take C strings), with the
// characters XML cannot carry replaced.
std::wstring carried(std::wstring_view text) {
  std::wstring expected(text.substr(0, text.find(L'\0')));
  for (wchar_t& ch : expected) {
    if (!dex_fuzz::isXmlCharacter(ch)) ch = L'\uFFFD';
  }
  return expected;
}

bool isBlank(std::wstring_view text) {
  return text.find_first_not_of(L" \t\r\n") == std::wstring_view::npos;
}

void readWrittenDocument(const dex_fuzz::ScratchFile& scratch, Layout layout, std::string_view rest) {
  const std::wstring text = dex_fuzz::decodeLenientUtf8(rest);
  const bool utf16 = layout == WRITTEN_UTF16;
  String document = utf16 ? L"<?xml version=\"1.0\" encoding=\"UTF-16\"?>\n" : L"<?xml version=\"1.0\"?>\n";
  String start = CXmlParserBase::OpenTag(L"R", CXmlParserBase::TAG_OPENING);
  start += CXmlParserBase::FormAttrib(L"a", text.c_str());
  document += CXmlParserBase::CloseTag(start, CXmlParserBase::TAG_OPENING);
  document += CXmlParserBase::EscapeText(text.c_str());
  document += CXmlParserBase::OpenTag(L"R", CXmlParserBase::TAG_CLOSING);
  const std::string bytes =
      utf16 ? kUtf16LEMark + dex_fuzz::encodeUtf16(document.view(), true) : vyn_text::toUtf8(document.view());
  if (!scratch.write(bytes)) return;

  const std::unique_ptr<DexXmlParser> parser = open(scratch.wpath());
  DEX_FUZZ_CHECK(parser != nullptr);
  DEX_FUZZ_CHECK(utf16 ? parser->IsUTF16() : parser->IsUTF8());
  const std::wstring expected = carried(text);
  String tag, attributes, value;
  DEX_FUZZ_CHECK(parser->ReadToken(tag, attributes, value) && tag.IsEmpty());  // the declaration
  DEX_FUZZ_CHECK(parser->ReadToken(tag, attributes, value) && tag == L"R");
  DEX_FUZZ_CHECK(CXmlParserBase::ReadAttrib(attributes, L"a").view() == expected);
  dex_fuzz::checkXmlAttributes(attributes);
  if (!isBlank(expected)) {
    DEX_FUZZ_CHECK(parser->ReadToken(tag, attributes, value) && tag == L"R");
    DEX_FUZZ_CHECK(value.view() == expected);
  }
  DEX_FUZZ_CHECK(parser->ReadToken(tag, attributes, value) && tag == L"/R");
  DEX_FUZZ_CHECK(!parser->ReadToken(tag, attributes, value));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const dex_fuzz::ScratchFile scratch("xml-reader");
  dex_fuzz::FuzzInput input(data, size);
  const auto layout = static_cast<Layout>(input.takeByte() % 8);
  const std::string_view rest = input.takeRest();
  if (layout == WRITTEN_UTF8 || layout == WRITTEN_UTF16) {
    readWrittenDocument(scratch, layout, rest);
  } else {
    readRawDocument(scratch, layout, rest);
  }
  return 0;
}
