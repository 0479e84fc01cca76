#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/TextFile.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/XmlParser.h"
#include "ieDefinitions/IEResult.h"

namespace vyn::ie {

// The library's name for the host's line reader, so that plug-ins depend on library types only.
class DEX_API DexTextFile : public CTextFile {
 public:
  VYN_CLASS_ALLOCATOR

  // bufferSize is handed to the host reader as its read-buffer size hint.
  explicit DexTextFile(int bufferSize);
  ~DexTextFile() override;
};

// The library's XML reader over the host's token reader. Obtain one with initialize(); all reading
// then goes through the host operations ReadToken, ReadAttrib, IsUTF8 and IsUTF16.
class DEX_API DexXmlParser : public CXmlParser {
 public:
  VYN_CLASS_ALLOCATOR

  ~DexXmlParser() override;
  DexXmlParser(const DexXmlParser& other);
  DexXmlParser& operator=(const DexXmlParser& other);

  // Opens fileName for reading. On success parser receives a new reader, which the caller deletes, and
  // the result is DEX_RESULT_OK. Otherwise parser is left as it was and the result is
  // DEX_RESULT_FILE_ERROR (the file cannot be opened), DEX_RESULT_WRONG_FORMAT (it is not readable XML)
  // or DEX_RESULT_FAILED (any other refusal of the host reader).
  static EDexResult initialize(const CVynStringT<wchar_t>& fileName, DexXmlParser*& parser);

 protected:
  // file is not owned and may be null.
  explicit DexXmlParser(DexTextFile* file);
};

}  // namespace vyn::ie
