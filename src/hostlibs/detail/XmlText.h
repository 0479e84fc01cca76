#pragma once

#include <functional>
#include <string>
#include <string_view>

// The XML text rules shared by the XML reader and writers: escaping, resolving the predefined entities
// and character references, and the serialised attribute list `name="value" name="value"`.
namespace vyn_text::detail {

enum class XmlEscaping {
  Attribute,  // also TAB, LF and CR as references, so that attribute-value normalisation keeps them
  Text,       // also CR as a reference, so that line-end normalisation keeps it
};

// Appends text with &, <, > and " escaped. Characters that XML 1.0 cannot carry at all (the other
// control characters, U+FFFE, U+FFFF, lone surrogates, values above U+10FFFF) become U+FFFD, so what
// is written always reads back.
void appendXmlEscaped(std::wstring& out, std::wstring_view text, XmlEscaping where);

// Appends name="value" with the value escaped for an attribute.
void appendXmlAttribute(std::wstring& out, std::wstring_view name, std::wstring_view value);

// Resolves &amp; &lt; &gt; &quot; &apos; and numeric character references (a value that is not a
// Unicode scalar value gives U+FFFD); anything else, an unterminated "&" included, is kept as written.
std::wstring unescapeXml(std::wstring_view text);

// Calls visit(name, rawValue) for each name=value pair of a serialised attribute list, in order, until
// visit answers false. Values may be quoted with " or ' (or not at all, up to the next blank); blanks
// around "=" are allowed; a word without "=" is skipped. Raw values are still escaped.
void forEachXmlAttribute(
    std::wstring_view attributes,
    const std::function<bool(std::wstring_view name, std::wstring_view rawValue)>& visit);

// True for the blanks of XML: space, TAB, CR and LF.
constexpr bool isXmlBlank(wchar_t ch) noexcept {
  return ch == L' ' || ch == L'\t' || ch == L'\r' || ch == L'\n';
}

}  // namespace vyn_text::detail
