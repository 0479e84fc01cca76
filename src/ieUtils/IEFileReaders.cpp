#include "ieUtils/IEFileReaders.h"

#include <memory>

namespace vyn::ie {

DexTextFile::DexTextFile(int bufferSize) : CTextFile(bufferSize) {}
DexTextFile::~DexTextFile() = default;

DexXmlParser::DexXmlParser(DexTextFile* file) : CXmlParser(file) {}
DexXmlParser::~DexXmlParser() = default;
DexXmlParser::DexXmlParser(const DexXmlParser& other) = default;
DexXmlParser& DexXmlParser::operator=(const DexXmlParser& other) = default;

EDexResult DexXmlParser::initialize(const CVynStringT<wchar_t>& fileName, DexXmlParser*& parser) {
  std::unique_ptr<DexXmlParser> opened(new DexXmlParser(nullptr));
  if (!opened) return DEX_RESULT_FAILED;
  switch (CXmlParserBase::DoInitialize(fileName, opened.get())) {
    case CXmlParserBase::INIT_OK:
      parser = opened.release();
      return DEX_RESULT_OK;
    case CXmlParserBase::INIT_CANNOT_OPEN:
      return DEX_RESULT_FILE_ERROR;
    case CXmlParserBase::INIT_NOT_XML:
      return DEX_RESULT_WRONG_FORMAT;
    default:
      return DEX_RESULT_FAILED;
  }
}

}  // namespace vyn::ie
