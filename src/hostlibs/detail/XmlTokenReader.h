#pragma once

#include <deque>
#include <memory>
#include <string>
#include <vector>

#include "hostlibs/detail/PosixFile.h"
#include "hostlibs/detail/XmlProlog.h"

struct _xmlTextReader;

// The token stream of an XML file over libxml2's streaming reader. libxml2 reads the file in blocks
// and keeps only the current node, so files of any size are read in bounded memory; its default limits
// stay in force (XML_PARSE_HUGE is never set): nesting deeper than 256 elements, a name longer than
// 50,000 bytes and a text or attribute value longer than 10,000,000 bytes are faults. Text that
// comments split into several nodes is held to the same 10,000,000 characters once joined. No DTD or
// external entity is ever loaded and nothing is fetched from the network; libxml2's messages are
// swallowed.
namespace vyn_text::detail {

struct XmlToken {
  std::wstring tag;
  std::wstring attributes;
  std::wstring value;
};

class XmlTokenReader {
 public:
  enum class OpenResult { Opened, CannotOpen, NotXml };

  XmlTokenReader();
  ~XmlTokenReader();
  XmlTokenReader(const XmlTokenReader&) = delete;
  XmlTokenReader& operator=(const XmlTokenReader&) = delete;

  // Opens the file and reads its first node; NotXml when libxml2 cannot read even that.
  OpenResult open(const wchar_t* path);

  // The next token; false at the end of the document or at the first fault in it.
  bool next(XmlToken& token);

  const XmlProlog& prolog() const noexcept { return prolog_; }

 private:
  struct ReaderDeleter {
    void operator()(_xmlTextReader* reader) const noexcept;
  };

  bool step();
  void startElement();
  void endElement();
  void flushText();
  void finish() noexcept;

  UniqueFd file_;
  std::unique_ptr<_xmlTextReader, ReaderDeleter> reader_;
  XmlProlog prolog_;
  std::deque<XmlToken> ready_;
  std::vector<std::wstring> openElements_;
  std::wstring text_;  // character data collected since the last tag
};

}  // namespace vyn_text::detail
