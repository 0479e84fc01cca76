#pragma once

#include <array>
#include <memory>
#include <string>
#include <vector>

#include "hostlibs/detail/PosixFile.h"
#include "hostlibs/detail/XmlProlog.h"

struct _xmlTextReader;
using xmlChar = unsigned char;

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

  // The next token, valid until the following call; null at the end of the document or at the first
  // fault in it. Tokens are kept in reused slots, so a long document is read without a heap block per
  // token once the slots have grown to its longest names and texts.
  const XmlToken* next();

  const XmlProlog& prolog() const noexcept { return prolog_; }

 private:
  struct ReaderDeleter {
    void operator()(_xmlTextReader* reader) const noexcept;
  };

  // The nodes read per refill at most, beyond those needed for one token.
  static constexpr int kNodesPerRefill = 64;

  void refill();
  bool step();
  // The wide form of a name libxml2 gives.
  const std::wstring& nameOf(const xmlChar* utf8);
  void startElement();
  void endElement();
  void flushText();
  void finish() noexcept;
  // A slot at the back of the queue of ready tokens, its strings emptied but keeping their memory.
  XmlToken& pushToken();
  const std::wstring& openElement() const { return openElements_[depth_ - 1]; }

  UniqueFd file_;
  std::unique_ptr<_xmlTextReader, ReaderDeleter> reader_;
  XmlProlog prolog_;
  // Ready tokens are slots [head_, used_); a handed-out token (handedOut_) stays in its slot until the
  // next call. The queue only fills when it is empty, so it never holds more than one node's tokens.
  std::vector<XmlToken> slots_;
  std::size_t head_ = 0;
  std::size_t used_ = 0;
  bool handedOut_ = false;
  // The names of the open elements are openElements_[0, depth_); the strings beyond are kept for reuse.
  std::vector<std::wstring> openElements_;
  std::size_t depth_ = 0;
  std::wstring text_;  // character data collected since the last tag
  std::wstring attributeValue_;
  // Wide names by the address of libxml2's dictionary copy (a small direct-mapped cache).
  struct NameEntry {
    const xmlChar* key = nullptr;
    std::wstring name;
  };
  std::array<NameEntry, 64> names_;
  std::wstring uncachedName_;
};

}  // namespace vyn_text::detail
