#include "hostlibs/detail/XmlTokenReader.h"

#include <fcntl.h>
#include <unistd.h>
#include <algorithm>
#include <mutex>

#include <libxml/globals.h>
#include <libxml/parser.h>
#include <libxml/parserInternals.h>
#include <libxml/xmlerror.h>
#include <libxml/xmlreader.h>

#include "hostlibs/VynString.h"
#include "hostlibs/detail/Utf.h"
#include "hostlibs/detail/XmlText.h"

namespace vyn_text::detail {
namespace {

// No network, no DTD, no entity substitution (which would also load external entities); libxml2's
// own reports are off.
constexpr int kParseOptions = XML_PARSE_NONET | XML_PARSE_NOERROR | XML_PARSE_NOWARNING;

// libxml2 refuses a single text node longer than this; text that comments split into several nodes
// is joined into one token here, so the same cap applies to the joined text.
constexpr std::size_t kLongestText = XML_MAX_TEXT_LENGTH;

void ensureLibxmlInitialized() {
  static std::once_flag once;
  std::call_once(once, [] { xmlInitParser(); });
}

void ignoreStructuredError(void* /*context*/, xmlErrorPtr /*error*/) {}

// Some libxml2 reports (encoding conversions among them) bypass the reader's own handler and go to
// the thread's global one, which prints to stderr. This silences them for the calling thread only,
// for the length of a scope, and then restores whatever the host had installed.
class QuietLibxml {
 public:
  QuietLibxml() : previous_(xmlStructuredError), previousContext_(xmlStructuredErrorContext) {
    xmlSetStructuredErrorFunc(nullptr, ignoreStructuredError);
  }
  ~QuietLibxml() { xmlSetStructuredErrorFunc(previousContext_, previous_); }
  QuietLibxml(const QuietLibxml&) = delete;
  QuietLibxml& operator=(const QuietLibxml&) = delete;

 private:
  xmlStructuredErrorFunc previous_;
  void* previousContext_;
};

std::wstring wide(const xmlChar* utf8) {
  if (utf8 == nullptr) return {};
  return fromUtf8(reinterpret_cast<const char*>(utf8));
}

bool isBlank(std::wstring_view text) {
  return std::all_of(text.begin(), text.end(), isXmlBlank);
}

}  // namespace

void XmlTokenReader::ReaderDeleter::operator()(_xmlTextReader* reader) const noexcept {
  const QuietLibxml quiet;
  xmlFreeTextReader(reader);
}

XmlTokenReader::XmlTokenReader() = default;
XmlTokenReader::~XmlTokenReader() = default;

XmlTokenReader::OpenResult XmlTokenReader::open(const wchar_t* path) {
  ensureLibxmlInitialized();
  file_ = openFile(path, O_RDONLY);
  if (!file_.valid()) return OpenResult::CannotOpen;

  char head[kXmlPrologBytes];
  const ssize_t got = ::pread(file_.get(), head, sizeof head, 0);
  prolog_ = readXmlProlog(std::string_view(head, got > 0 ? static_cast<std::size_t>(got) : 0));

  {
    const QuietLibxml quiet;
    reader_.reset(xmlReaderForFd(file_.get(), toUtf8(path).c_str(), nullptr, kParseOptions));
  }
  if (!reader_) {
    finish();
    return OpenResult::NotXml;
  }
  xmlTextReaderSetStructuredErrorHandler(reader_.get(), ignoreStructuredError, nullptr);
  if (prolog_.hasDeclaration)
    ready_.push_back({std::wstring(), prolog_.declarationAttributes, std::wstring()});
  if (!step()) {
    ready_.clear();
    return OpenResult::NotXml;
  }
  return OpenResult::Opened;
}

bool XmlTokenReader::next(XmlToken& token) {
  while (ready_.empty() && step()) {
  }
  if (ready_.empty()) return false;
  token = std::move(ready_.front());
  ready_.pop_front();
  return true;
}

// Reads one node and turns it into tokens; false (and the reader released) at the end or a fault.
bool XmlTokenReader::step() {
  if (!reader_) return false;
  int read = 0;
  {
    const QuietLibxml quiet;
    read = xmlTextReaderRead(reader_.get());
  }
  if (read != 1) {
    finish();
    return false;
  }
  switch (xmlTextReaderNodeType(reader_.get())) {
    case XML_READER_TYPE_ELEMENT:
      startElement();
      break;
    case XML_READER_TYPE_END_ELEMENT:
      endElement();
      break;
    case XML_READER_TYPE_TEXT:
    case XML_READER_TYPE_CDATA:
    case XML_READER_TYPE_WHITESPACE:
    case XML_READER_TYPE_SIGNIFICANT_WHITESPACE:
      appendUtf8(text_, reinterpret_cast<const char*>(xmlTextReaderConstValue(reader_.get())));
      if (text_.size() > kLongestText) {
        finish();  // a fault like libxml2's own for one overlong text node
        return false;
      }
      break;
    default:  // comments, processing instructions, the document type, entity references
      break;
  }
  return true;
}

void XmlTokenReader::startElement() {
  flushText();
  _xmlTextReader* const reader = reader_.get();
  std::wstring name = wide(xmlTextReaderConstName(reader));
  std::wstring attributes;
  while (xmlTextReaderMoveToNextAttribute(reader) == 1) {
    if (!attributes.empty()) attributes += L' ';
    appendXmlAttribute(attributes, wide(xmlTextReaderConstName(reader)),
                       wide(xmlTextReaderConstValue(reader)));
  }
  xmlTextReaderMoveToElement(reader);
  const bool empty = xmlTextReaderIsEmptyElement(reader) == 1;
  ready_.push_back({name, std::move(attributes), std::wstring()});
  if (empty) {
    ready_.push_back({L"/" + name, std::wstring(), std::wstring()});
  } else {
    openElements_.push_back(std::move(name));
  }
}

void XmlTokenReader::endElement() {
  flushText();
  std::wstring name =
      openElements_.empty() ? wide(xmlTextReaderConstName(reader_.get())) : openElements_.back();
  if (!openElements_.empty()) openElements_.pop_back();
  ready_.push_back({L"/" + name, std::wstring(), std::wstring()});
}

// Text between two tags becomes one token named after the element that holds it, unless it is blank.
void XmlTokenReader::flushText() {
  if (!isBlank(text_)) {
    ready_.push_back({openElements_.empty() ? std::wstring() : openElements_.back(), std::wstring(), text_});
  }
  text_.clear();
}

// Text of an element that never closed is dropped: the document broke off inside it.
void XmlTokenReader::finish() noexcept {
  reader_.reset();
  file_.reset();
  text_.clear();
  openElements_.clear();
}

}  // namespace vyn_text::detail
