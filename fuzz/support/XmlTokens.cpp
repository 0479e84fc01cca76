#include "support/XmlTokens.h"

#include <string>
#include <string_view>

#include "hostlibs/XmlParser.h"
#include "support/FuzzCheck.h"

namespace dex_fuzz {

namespace {

using String = CVynStringT<wchar_t>;

void checkToken(const String& tag, const String& attributes, const String& value) {
  if (!tag.IsEmpty() && tag[0] == L'/') DEX_FUZZ_CHECK(attributes.IsEmpty() && value.IsEmpty());
  if (!value.IsEmpty()) DEX_FUZZ_CHECK(attributes.IsEmpty());
  checkXmlAttributes(attributes);
}

}  // namespace

void checkXmlAttributes(const String& attributes) {
  const std::wstring_view text = attributes.view();
  std::size_t at = 0;
  while (at < text.size()) {
    const std::size_t equals = text.find(L"=\"", at);
    DEX_FUZZ_CHECK(equals != std::wstring_view::npos);
    const std::size_t close = text.find(L'"', equals + 2);
    DEX_FUZZ_CHECK(close != std::wstring_view::npos);
    const std::wstring name(text.substr(at, equals - at));
    const std::wstring_view serialised = text.substr(at, close + 1 - at);
    // Only the first attribute of a name is found by ReadAttrib; XML allows no second one.
    const String value = CXmlParserBase::ReadAttrib(attributes, name.c_str());
    DEX_FUZZ_CHECK(CXmlParserBase::FormAttrib(name.c_str(), value.GetString()).view() ==
                   L" " + std::wstring(serialised));
    at = close + 1;
    if (at < text.size()) {
      DEX_FUZZ_CHECK(text[at] == L' ');
      ++at;
    }
  }
}

std::size_t readXmlToEnd(vyn::ie::DexXmlParser& parser, std::size_t byteCount) {
  DEX_FUZZ_CHECK(!(parser.IsUTF8() && parser.IsUTF16()));
  String tag;
  String attributes;
  String value;
  std::size_t tokens = 0;
  while (parser.ReadToken(tag, attributes, value)) {
    checkToken(tag, attributes, value);
    DEX_FUZZ_CHECK(++tokens <= byteCount + 1);
  }
  DEX_FUZZ_CHECK(tag.IsEmpty() && attributes.IsEmpty() && value.IsEmpty());
  DEX_FUZZ_CHECK(!parser.ReadToken(tag, attributes, value));
  return tokens;
}

}  // namespace dex_fuzz
