#include "hostlibs/detail/XmlProlog.h"

#include "hostlibs/detail/ByteOrderMark.h"
#include "hostlibs/detail/XmlText.h"

namespace vyn_text::detail {
namespace {

enum class Layout { Bytes, Utf16LE, Utf16BE, Unknown };

bool startsWith(std::string_view bytes, std::string_view prefix) {
  return bytes.substr(0, prefix.size()) == prefix;
}

// How the characters are laid out when no byte-order mark tells: "<?" gives it away, as does a
// first character with zero bytes (UCS-4, which this reader does not interpret).
Layout layoutWithoutMark(std::string_view bytes) {
  using namespace std::string_view_literals;
  if (startsWith(bytes, "<\0?\0"sv)) return Layout::Utf16LE;
  if (startsWith(bytes, "\0<\0?"sv)) return Layout::Utf16BE;
  if (startsWith(bytes, "\0\0"sv) || startsWith(bytes, "<\0\0\0"sv)) return Layout::Unknown;
  return Layout::Bytes;
}

// The characters of the declaration are ASCII, so a byte or a code unit is one character here.
std::wstring charactersOf(std::string_view bytes, Layout layout) {
  std::wstring out;
  const auto byte = [&](std::size_t i) { return static_cast<wchar_t>(static_cast<unsigned char>(bytes[i])); };
  if (layout == Layout::Bytes) {
    for (std::size_t i = 0; i < bytes.size(); ++i)
      out += byte(i);
  } else if (layout != Layout::Unknown) {
    const bool little = layout == Layout::Utf16LE;
    for (std::size_t i = 0; i + 1 < bytes.size(); i += 2) {
      out += little ? static_cast<wchar_t>(byte(i) | (byte(i + 1) << 8))
                    : static_cast<wchar_t>((byte(i) << 8) | byte(i + 1));
    }
  }
  return out;
}

bool isUtf8Label(std::wstring_view label) {
  std::wstring upper(label);
  for (wchar_t& ch : upper) {
    if (ch >= L'a' && ch <= L'z') ch = static_cast<wchar_t>(ch - L'a' + L'A');
  }
  return upper == L"UTF-8" || upper == L"UTF8";
}

}  // namespace

XmlProlog readXmlProlog(std::string_view firstBytes) {
  const DetectedMark mark = detectByteOrderMark(firstBytes);
  const std::string_view body = firstBytes.substr(mark.length);
  Layout layout = Layout::Bytes;
  if (mark.mark == ByteOrderMark::Utf16LE) {
    layout = Layout::Utf16LE;
  } else if (mark.mark == ByteOrderMark::Utf16BE) {
    layout = Layout::Utf16BE;
  } else if (mark.mark == ByteOrderMark::None) {
    layout = layoutWithoutMark(body);
  }

  XmlProlog prolog;
  prolog.utf16 = layout == Layout::Utf16LE || layout == Layout::Utf16BE;
  const std::wstring text = charactersOf(body, layout);
  constexpr std::wstring_view kOpening = L"<?xml";
  prolog.hasDeclaration =
      text.size() > kOpening.size() && text.starts_with(kOpening) && isXmlBlank(text[kOpening.size()]);

  std::wstring_view encoding;
  if (prolog.hasDeclaration) {
    std::wstring_view inside = std::wstring_view(text).substr(kOpening.size());
    inside = inside.substr(0, inside.find(L"?>"));
    forEachXmlAttribute(inside, [&](std::wstring_view name, std::wstring_view value) {
      if (!prolog.declarationAttributes.empty()) prolog.declarationAttributes += L' ';
      appendXmlAttribute(prolog.declarationAttributes, name, value);
      if (name == L"encoding") encoding = value;
      return true;
    });
  }
  prolog.utf8 = mark.mark == ByteOrderMark::Utf8 ||
                (layout == Layout::Bytes && (encoding.empty() || isUtf8Label(encoding)));
  return prolog;
}

}  // namespace vyn_text::detail
