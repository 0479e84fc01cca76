#pragma once

#include <cstddef>
#include <string>
#include <string_view>

// What the first bytes of an XML file tell before any parsing: the encoding family and the XML
// declaration as written.
namespace vyn_text::detail {

// Bytes of the file start that readXmlProlog looks at; a declaration longer than this is not seen.
inline constexpr std::size_t kXmlPrologBytes = 512;

struct XmlProlog {
  bool utf8 = false;   // UTF-8 byte-order mark, or 8-bit text declared UTF-8 or not declared at all
  bool utf16 = false;  // UTF-16 byte-order mark, or "<?" as UTF-16 code units
  bool hasDeclaration = false;
  std::wstring declarationAttributes;  // the pseudo-attributes re-serialised, e.g. version="1.0"
};

XmlProlog readXmlProlog(std::string_view firstBytes);

}  // namespace vyn_text::detail
