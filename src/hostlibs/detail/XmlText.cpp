#include "hostlibs/detail/XmlText.h"

#include <cwchar>

#include "hostlibs/detail/Utf.h"

namespace vyn_text::detail {
namespace {

bool isXmlCharacter(wchar_t ch) noexcept {
  const auto value = static_cast<char32_t>(ch);
  if (value < 0x20) return value == 0x9 || value == 0xA || value == 0xD;
  return isScalarValue(value) && value != 0xFFFE && value != 0xFFFF;
}

// The character a reference body (the text between "&" and ";") stands for, or false when the body
// is not a reference this reader knows.
bool resolveReference(std::wstring_view body, wchar_t& resolved) {
  struct PredefinedEntity {
    std::wstring_view name;
    wchar_t character;
  };
  static constexpr PredefinedEntity kPredefined[] = {
      {L"amp", L'&'}, {L"lt", L'<'}, {L"gt", L'>'}, {L"quot", L'"'}, {L"apos", L'\''}};
  for (const PredefinedEntity& entity : kPredefined) {
    if (body == entity.name) {
      resolved = entity.character;
      return true;
    }
  }
  if (body.size() < 2 || body[0] != L'#') return false;
  const bool hex = body[1] == L'x';
  const std::wstring_view digits = body.substr(hex ? 2 : 1);
  if (digits.empty() || digits.size() > 8) return false;
  char32_t value = 0;
  for (const wchar_t digit : digits) {
    int number = -1;
    if (digit >= L'0' && digit <= L'9') {
      number = digit - L'0';
    } else if (hex && digit >= L'a' && digit <= L'f') {
      number = digit - L'a' + 10;
    } else if (hex && digit >= L'A' && digit <= L'F') {
      number = digit - L'A' + 10;
    }
    if (number < 0) return false;
    value = value * (hex ? 16 : 10) + static_cast<char32_t>(number);
  }
  resolved = static_cast<wchar_t>(isScalarValue(value) ? value : kReplacementCharacter);
  return true;
}

}  // namespace

void appendXmlEscaped(std::wstring& out, std::wstring_view text, XmlEscaping where) {
  const bool attribute = where == XmlEscaping::Attribute;
  for (const wchar_t ch : text) {
    switch (ch) {
      case L'&':
        out += L"&amp;";
        break;
      case L'<':
        out += L"&lt;";
        break;
      case L'>':
        out += L"&gt;";
        break;
      case L'"':
        out += L"&quot;";
        break;
      case L'\r':
        out += L"&#13;";
        break;
      case L'\t':
        out += attribute ? L"&#9;" : L"\t";
        break;
      case L'\n':
        out += attribute ? L"&#10;" : L"\n";
        break;
      default:
        out += isXmlCharacter(ch) ? ch : kReplacementCharacter;
        break;
    }
  }
}

void appendXmlAttribute(std::wstring& out, std::wstring_view name, std::wstring_view value) {
  out += name;
  out += L"=\"";
  appendXmlEscaped(out, value, XmlEscaping::Attribute);
  out += L'"';
}

std::wstring unescapeXml(std::wstring_view text) {
  std::wstring out;
  out.reserve(text.size());
  std::size_t at = 0;
  while (at < text.size()) {
    const std::size_t amp = text.find(L'&', at);
    out += text.substr(at, amp - at);
    if (amp == std::wstring_view::npos) break;
    const std::size_t semicolon = text.find(L';', amp + 1);
    wchar_t resolved = 0;
    if (semicolon != std::wstring_view::npos &&
        resolveReference(text.substr(amp + 1, semicolon - amp - 1), resolved)) {
      out += resolved;
      at = semicolon + 1;
    } else {
      out += L'&';
      at = amp + 1;
    }
  }
  return out;
}

void forEachXmlAttribute(std::wstring_view attributes,
                         const std::function<bool(std::wstring_view, std::wstring_view)>& visit) {
  const std::size_t size = attributes.size();
  std::size_t at = 0;
  const auto skipBlanks = [&] {
    while (at < size && isXmlBlank(attributes[at]))
      ++at;
  };
  while (true) {
    skipBlanks();
    if (at >= size) return;
    const std::size_t nameStart = at;
    while (at < size && !isXmlBlank(attributes[at]) && attributes[at] != L'=')
      ++at;
    const std::wstring_view name = attributes.substr(nameStart, at - nameStart);
    skipBlanks();
    if (at >= size || attributes[at] != L'=') continue;  // a word without a value
    ++at;
    skipBlanks();
    std::wstring_view value;
    if (at < size && (attributes[at] == L'"' || attributes[at] == L'\'')) {
      const std::size_t close = attributes.find(attributes[at], at + 1);
      const std::size_t end = close == std::wstring_view::npos ? size : close;
      value = attributes.substr(at + 1, end - at - 1);
      at = end + 1;
    } else {
      const std::size_t valueStart = at;
      while (at < size && !isXmlBlank(attributes[at]))
        ++at;
      value = attributes.substr(valueStart, at - valueStart);
    }
    if (!name.empty() && !visit(name, value)) return;
  }
}

}  // namespace vyn_text::detail
