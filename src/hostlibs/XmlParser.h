#pragma once

#include <functional>
#include <memory>
#include <string_view>

#include "hostlibs/DexApi.h"
#include "hostlibs/TextFile.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"

namespace vyn_text::detail {
class XmlTokenReader;
}

// Reads an XML file as a flat stream of tokens and forms the text of tags and attributes for writers.
// Reading goes through libxml2, which takes the encoding from the byte-order mark or the declaration
// (UTF-8, UTF-16, Latin-1 and the others it knows) and resolves the predefined entities and character
// references. It never loads a DTD or an external entity and never reaches the network; entities that
// a document declares itself are not substituted (their references give no text). Faults are never
// printed. Each object reads on its own, so different objects may be used in different threads.
//
// Tokens (ReadToken gives tag, attributes, value):
//   <?xml version="1.0" encoding="utf-16"?>   ""      version="1.0" encoding="utf-16"   ""
//   <A x="1" y="a&amp;b">                      "A"     x="1" y="a&amp;b"                  ""
//   text inside A                              "A"     ""                                 the text
//   </A>                                       "/A"    ""                                 ""
//   <B/>                                       "B" then "/B", as a start and an end tag
// The declaration token comes only when the file has a declaration; its pseudo-attributes are those
// written there, in their order. Attributes are re-serialised as name="value" separated by single
// blanks with values escaped (read them with ReadAttrib). Text is given as written, entities resolved;
// text that is only blanks (space, TAB, CR, LF) gives no token, and text interrupted by comments is one
// token. CDATA sections count as text. Comments, processing instructions and the document type give
// nothing. A document that turns malformed after a good start ends the stream at or before the fault:
// libxml2 parses a block of a few hundred bytes ahead of the tokens it hands out, so a fault in the
// first block makes DoInitialize answer INIT_NOT_XML, and the last tokens before a later fault may be
// missing. Text of an element left open by a fault is dropped.
//
// Limits, so that a hostile file costs bounded time and memory: nesting deeper than 256 elements, a
// name longer than 50,000 bytes, and a text (joined across comments) or attribute value longer than
// 10,000,000 characters are faults like any other. A 100 MB attribute thus ends reading after about
// 10 MB, and a document nested 10,000 deep gives at most its first 256 start tags and then nothing.
class DEX_API CXmlParserBase {
 public:
  VYN_CLASS_ALLOCATOR

  // The kinds of tag OpenTag forms. Callers may pass the numbers.
  enum TagTypeFlag : int {
    TAG_EMPTY_ELEMENT = 0,  // <A/>
    TAG_CLOSING = 1,        // </A>
    TAG_OPENING = 2,        // <A, to which attributes are appended before CloseTag
  };

  // Results of DoInitialize.
  enum EInitResult : int {
    INIT_OK = 0,
    INIT_CANNOT_OPEN = 1,  // missing file, folder, null or empty path
    INIT_NOT_XML = 2,      // libxml2 cannot read the first node (an empty file included)
    INIT_NO_PARSER = -1,   // parser is null
  };

  CXmlParserBase();
  virtual ~CXmlParserBase();
  // A copy shares nothing with its original: it is a parser that has no document open, whatever the
  // state of the original (a libxml2 reader cannot be duplicated mid-stream). Assignment closes the
  // document of the target and leaves it so too.
  CXmlParserBase(const CXmlParserBase& other);
  CXmlParserBase& operator=(const CXmlParserBase& other);

  // Opening. Opens path for parser (closing any document it had open) and reads the first node;
  // answers an EInitResult. Only with INIT_OK is a document open.
  static int DoInitialize(const wchar_t* path, CXmlParserBase* parser);
  bool IsOpen() const noexcept;
  void Close() noexcept;

  // Reading. Gives the next token (see above); false at the end of the document, after a fault in it,
  // or when no document is open; the three strings are then emptied.
  bool ReadToken(CVynStringT<wchar_t>& tag, CVynStringT<wchar_t>& attributes, CVynStringT<wchar_t>& value);
  // The same token as views into the reader's own strings, valid until the next read or Close: for
  // readers of large documents that copy only what they keep. Empty views with false at the end.
  bool ReadToken(std::wstring_view& tag, std::wstring_view& attributes, std::wstring_view& value);

  // The unescaped value of the first attribute called name (exact, case-sensitive) in a serialised
  // attribute list; empty when there is none.
  static CVynStringT<wchar_t> ReadAttrib(const CVynStringT<wchar_t>& attributes, const wchar_t* name);
  // Calls visit(name, value) for each attribute of a serialised attribute list, in order, with the value
  // unescaped, until visit answers false. Both views are valid during the call only. For readers that
  // take many attributes of many elements: one pass, and no string made for a value without references.
  static void ForEachAttrib(
      std::wstring_view attributes,
      const std::function<bool(std::wstring_view name, std::wstring_view value)>& visit);

  // The encoding of the open document, judged from its start: UTF-16 when it begins with a UTF-16
  // byte-order mark or with "<?" in UTF-16; UTF-8 when it begins with the UTF-8 mark, or is 8-bit
  // text whose declaration names UTF-8 or no encoding (or which has no declaration). A document
  // declared in another encoding (ISO-8859-1, say) is neither. Both false when no document is open.
  bool IsUTF8() const noexcept;
  bool IsUTF16() const noexcept;

  // Writing. The writers form text only; the caller writes it out. Names are taken as given; values
  // are escaped (&, <, >, ", and TAB, LF, CR as references; characters XML cannot carry become
  // U+FFFD). A null text counts as empty.
  //
  //   CVynStringT<wchar_t> tag = CXmlParserBase::OpenTag(L"IEFormatsData", CXmlParserBase::TAG_OPENING);
  //   tag += CXmlParserBase::FormAttrib(L"version", L"1.9");
  //   CXmlParserBase::CloseTag(tag, CXmlParserBase::TAG_OPENING);  // <IEFormatsData version="1.9">
  //   CXmlParserBase::OpenTag(L"REGULAR", CXmlParserBase::TAG_EMPTY_ELEMENT);  // <REGULAR/>
  //   CXmlParserBase::OpenTag(L"IEFormatsData", CXmlParserBase::TAG_CLOSING);  // </IEFormatsData>
  //   tag = CXmlParserBase::OpenTag(L"AngeUnits", CXmlParserBase::TAG_OPENING);
  //   tag += CXmlParserBase::FormAttrib(L"used", L"false");
  //   CXmlParserBase::CloseTag(tag, CXmlParserBase::TAG_EMPTY_ELEMENT);  // <AngeUnits used="false"/>
  //
  // OpenTag: "<A/>" for TAG_EMPTY_ELEMENT, "</A>" for TAG_CLOSING, "<A" for TAG_OPENING and any other
  // value. CloseTag ends an opening tag in tagText: "/>" for TAG_EMPTY_ELEMENT (the element has no
  // content), ">" otherwise; it answers tagText. FormAttrib gives ` name="value"` with its leading
  // blank, ready to append. EscapeText gives element content.
  static CVynStringT<wchar_t> OpenTag(const wchar_t* tag, int typeFlag);
  static CVynStringT<wchar_t>& CloseTag(CVynStringT<wchar_t>& tagText, int typeFlag);
  static CVynStringT<wchar_t> FormAttrib(const wchar_t* name, const wchar_t* value);
  static CVynStringT<wchar_t> EscapeText(const wchar_t* text);

 private:
  std::unique_ptr<vyn_text::detail::XmlTokenReader> reader_;  // null when no document is open
};

// The parser the host library offers over a text file. The text file is the caller's (never owned,
// may be null) and is only kept for the caller: documents are opened by path with DoInitialize. A copy
// refers to the same text file and, like every parser copy, has no document open.
class DEX_API CXmlParser : public CXmlParserBase {
 public:
  VYN_CLASS_ALLOCATOR

  explicit CXmlParser(CTextFile* file = nullptr) noexcept;
  ~CXmlParser() override;
  CXmlParser(const CXmlParser& other);
  CXmlParser& operator=(const CXmlParser& other);

  CTextFile* GetTextFile() const noexcept { return textFile_; }

 private:
  CTextFile* textFile_;
};
