#pragma once

#include <cstddef>

#include "hostlibs/VynString.h"
#include "ieUtils/IEFileReaders.h"

// Reading an XML document to its end through the library's reader, checking every token against the
// token model (see hostlibs/XmlParser.h): end tokens carry nothing, text tokens no attributes, and
// every serialised attribute list reads back through ReadAttrib and forms again through FormAttrib.
namespace dex_fuzz {

// Every name="value" of a serialised attribute list reads back through ReadAttrib and forms again into
// the same text through FormAttrib.
void checkXmlAttributes(const CVynStringT<wchar_t>& attributes);

// Reads every token of an open parser, checking each; answers how many there were. byteCount, the
// size of the file, bounds the count. The parser answers nothing more afterwards.
std::size_t readXmlToEnd(vyn::ie::DexXmlParser& parser, std::size_t byteCount);

}  // namespace dex_fuzz
