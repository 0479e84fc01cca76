#include "hostlibs/XmlParser.h"

#include <algorithm>
#include <string>
#include <string_view>

#include "hostlibs/detail/XmlText.h"
#include "hostlibs/detail/XmlTokenReader.h"

namespace {

using String = CVynStringT<wchar_t>;

std::wstring_view viewOf(const wchar_t* text) noexcept {
  return text == nullptr ? std::wstring_view() : std::wstring_view(text);
}

// Replaces target with text, reusing target's memory.
void assignText(String& target, const std::wstring& text) {
  if (text.empty()) {
    target.Empty();
    return;
  }
  const int length = static_cast<int>(text.size());
  std::copy(text.begin(), text.end(), target.GetBuffer(length));
  target.ReleaseBuffer(length);
}

String stringOf(const std::wstring& text) {
  return String(std::wstring_view(text));
}

}  // namespace

CXmlParserBase::CXmlParserBase() = default;
CXmlParserBase::~CXmlParserBase() = default;

CXmlParserBase::CXmlParserBase(const CXmlParserBase& /*other*/) {}

CXmlParserBase& CXmlParserBase::operator=(const CXmlParserBase& other) {
  if (this != &other) Close();
  return *this;
}

int CXmlParserBase::DoInitialize(const wchar_t* path, CXmlParserBase* parser) {
  using vyn_text::detail::XmlTokenReader;
  if (parser == nullptr) return INIT_NO_PARSER;
  parser->Close();
  auto reader = std::make_unique<XmlTokenReader>();
  switch (reader->open(path)) {
    case XmlTokenReader::OpenResult::Opened:
      parser->reader_ = std::move(reader);
      return INIT_OK;
    case XmlTokenReader::OpenResult::CannotOpen:
      return INIT_CANNOT_OPEN;
    case XmlTokenReader::OpenResult::NotXml:
      break;
  }
  return INIT_NOT_XML;
}

bool CXmlParserBase::IsOpen() const noexcept {
  return reader_ != nullptr;
}

void CXmlParserBase::Close() noexcept {
  reader_.reset();
}

bool CXmlParserBase::ReadToken(String& tag, String& attributes, String& value) {
  const vyn_text::detail::XmlToken* const token = reader_ != nullptr ? reader_->next() : nullptr;
  if (token == nullptr) {
    tag.Empty();
    attributes.Empty();
    value.Empty();
    return false;
  }
  // Assigning into the caller's strings reuses their memory: a reader that keeps its three strings
  // reads a long document without a heap block per token.
  assignText(tag, token->tag);
  assignText(attributes, token->attributes);
  assignText(value, token->value);
  return true;
}

bool CXmlParserBase::ReadToken(std::wstring_view& tag, std::wstring_view& attributes, std::wstring_view& value) {
  const vyn_text::detail::XmlToken* const token = reader_ != nullptr ? reader_->next() : nullptr;
  if (token == nullptr) {
    tag = attributes = value = std::wstring_view();
    return false;
  }
  tag = token->tag;
  attributes = token->attributes;
  value = token->value;
  return true;
}

String CXmlParserBase::ReadAttrib(const String& attributes, const wchar_t* name) {
  const std::wstring_view wanted = viewOf(name);
  std::wstring found;
  vyn_text::detail::forEachXmlAttribute(attributes.view(), [&](std::wstring_view key, std::wstring_view raw) {
    if (key != wanted) return true;
    found = vyn_text::detail::unescapeXml(raw);
    return false;
  });
  return stringOf(found);
}

void CXmlParserBase::ForEachAttrib(std::wstring_view attributes,
                                   const std::function<bool(std::wstring_view, std::wstring_view)>& visit) {
  std::wstring unescaped;
  vyn_text::detail::forEachXmlAttribute(attributes, [&](std::wstring_view key, std::wstring_view raw) {
    if (raw.find(L'&') == std::wstring_view::npos) return visit(key, raw);
    unescaped = vyn_text::detail::unescapeXml(raw);
    return visit(key, unescaped);
  });
}

bool CXmlParserBase::IsUTF8() const noexcept {
  return reader_ != nullptr && reader_->prolog().utf8;
}
bool CXmlParserBase::IsUTF16() const noexcept {
  return reader_ != nullptr && reader_->prolog().utf16;
}

String CXmlParserBase::OpenTag(const wchar_t* tag, int typeFlag) {
  std::wstring text = typeFlag == TAG_CLOSING ? L"</" : L"<";
  text += viewOf(tag);
  if (typeFlag == TAG_EMPTY_ELEMENT) text += L"/>";
  if (typeFlag == TAG_CLOSING) text += L'>';
  return stringOf(text);
}

String& CXmlParserBase::CloseTag(String& tagText, int typeFlag) {
  tagText += typeFlag == TAG_EMPTY_ELEMENT ? L"/>" : L">";
  return tagText;
}

String CXmlParserBase::FormAttrib(const wchar_t* name, const wchar_t* value) {
  std::wstring text = L" ";
  vyn_text::detail::appendXmlAttribute(text, viewOf(name), viewOf(value));
  return stringOf(text);
}

String CXmlParserBase::EscapeText(const wchar_t* text) {
  std::wstring escaped;
  vyn_text::detail::appendXmlEscaped(escaped, viewOf(text), vyn_text::detail::XmlEscaping::Text);
  return stringOf(escaped);
}

CXmlParser::CXmlParser(CTextFile* file) noexcept : textFile_(file) {}
CXmlParser::~CXmlParser() = default;
CXmlParser::CXmlParser(const CXmlParser& other) : CXmlParserBase(other), textFile_(other.textFile_) {}

CXmlParser& CXmlParser::operator=(const CXmlParser& other) {
  if (&other == this) return *this;
  CXmlParserBase::operator=(other);
  textFile_ = other.textFile_;
  return *this;
}
