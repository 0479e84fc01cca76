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

// Replaces out with the wide form of utf8 (nothing for null), reusing its memory.
void assignWide(std::wstring& out, const xmlChar* utf8) {
  out.clear();
  if (utf8 != nullptr) appendUtf8(out, reinterpret_cast<const char*>(utf8));
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
  if (prolog_.hasDeclaration) pushToken().attributes = prolog_.declarationAttributes;
  bool started = false;
  {
    const QuietLibxml quiet;
    started = step();
  }
  if (!started) {
    head_ = used_ = 0;
    return OpenResult::NotXml;
  }
  return OpenResult::Opened;
}

const XmlToken* XmlTokenReader::next() {
  if (handedOut_) {
    handedOut_ = false;
    if (++head_ == used_) head_ = used_ = 0;
  }
  if (head_ == used_) refill();
  if (head_ == used_) return nullptr;
  handedOut_ = true;
  return &slots_[head_];
}

XmlToken& XmlTokenReader::pushToken() {
  if (used_ == slots_.size()) slots_.emplace_back();
  XmlToken& token = slots_[used_++];
  token.tag.clear();
  token.attributes.clear();
  token.value.clear();
  return token;
}

// Reads nodes until tokens are ready and, to spread the cost of silencing libxml2 over many nodes, on
// up to kNodesPerRefill nodes.
void XmlTokenReader::refill() {
  const QuietLibxml quiet;
  for (int nodes = 0; reader_ && (head_ == used_ || nodes < kNodesPerRefill); ++nodes) {
    if (!step()) return;
  }
}

// Reads one node and turns it into tokens; false (and the reader released) at the end or a fault. The
// caller silences libxml2.
bool XmlTokenReader::step() {
  if (!reader_) return false;
  if (xmlTextReaderRead(reader_.get()) != 1) {
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

// libxml2's reader hands out names from its dictionary (XML_PARSE_NODICT is never set): one copy of
// each name, kept for the life of the reader, so a name's wide form can be kept by the address of
// its copy.
const std::wstring& XmlTokenReader::nameOf(const xmlChar* utf8) {
  if (utf8 == nullptr) {
    uncachedName_.clear();
    return uncachedName_;
  }
  NameEntry& entry = names_[(reinterpret_cast<std::uintptr_t>(utf8) >> 3) % names_.size()];
  if (entry.key != utf8) {
    entry.key = utf8;
    assignWide(entry.name, utf8);
  }
  return entry.name;
}

void XmlTokenReader::startElement() {
  flushText();
  _xmlTextReader* const reader = reader_.get();
  XmlToken& start = pushToken();
  start.tag = nameOf(xmlTextReaderConstName(reader));
  while (xmlTextReaderMoveToNextAttribute(reader) == 1) {
    if (!start.attributes.empty()) start.attributes += L' ';
    const std::wstring& name = nameOf(xmlTextReaderConstName(reader));
    assignWide(attributeValue_, xmlTextReaderConstValue(reader));
    appendXmlAttribute(start.attributes, name, attributeValue_);
  }
  xmlTextReaderMoveToElement(reader);
  if (xmlTextReaderIsEmptyElement(reader) == 1) {
    XmlToken& end = pushToken();
    end.tag = L'/';
    end.tag += slots_[used_ - 2].tag;
    return;
  }
  if (depth_ == openElements_.size()) openElements_.emplace_back();
  openElements_[depth_++] = start.tag;
}

void XmlTokenReader::endElement() {
  flushText();
  XmlToken& end = pushToken();
  end.tag = L'/';
  if (depth_ == 0) {
    end.tag += nameOf(xmlTextReaderConstName(reader_.get()));
    return;
  }
  end.tag += openElement();
  --depth_;
}

// Text between two tags becomes one token named after the element that holds it, unless it is blank.
void XmlTokenReader::flushText() {
  if (!isBlank(text_)) {
    XmlToken& token = pushToken();
    if (depth_ > 0) token.tag = openElement();
    token.value = text_;
  }
  text_.clear();
}

// Text of an element that never closed is dropped: the document broke off inside it.
void XmlTokenReader::finish() noexcept {
  reader_.reset();
  file_.reset();
  text_.clear();
  depth_ = 0;
  for (NameEntry& entry : names_)
    entry.key = nullptr;
}

}  // namespace vyn_text::detail
