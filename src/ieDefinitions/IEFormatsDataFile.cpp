// The formats data file of the registry: reading an administrator's file and writing the built-in
// table for one to edit.

#include <cwchar>
#include <memory>
#include <string>
#include <vector>

#include "hostlibs/VynLogging.h"
#include "hostlibs/detail/CLocale.h"
#include "hostlibs/detail/Utf.h"
#include "ieDefinitions/IEFormatWords.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieDefinitions/detail/FormatsDataLog.h"
#include "ieUtils/IEUtilsUnitWords.h"

namespace vyn::ie {

namespace {

using String = CVynStringT<wchar_t>;
using Configuration = DexCommonType::ESupportedConfigurations;
using UsingMode = DexCommonType::EUsingModes;
using Parameter = DexFormat::EParameterName;

// Files older than this are replaced with the built-in table.
constexpr double kOldestUsableVersion = 1.9;
constexpr const wchar_t* kWrittenVersion = L"1.9";

// A configuration word of older files that names no configuration any more; it is dropped silently.
constexpr const wchar_t* kRetiredConfigurationWord = L"CONTRACTOR";

void logError(int line) {
  vyn_logging::vyn_err_log(detail::kFormatsDataLogSource, line);
}

// ---- Reading ------------------------------------------------------------------------------------

// Text inside an element comes as a token named after the element with the text as its value; start
// and end tokens have no value.
bool isTextToken(const String& value) {
  return !value.IsEmpty();
}

bool isEndToken(const String& tag) {
  return tag.GetAt(0) == L'/';
}

// Reads the next token; false at the end of the document, at an empty token or at the closing token.
bool readTokenBefore(DexXmlParser& parser, const wchar_t* closing, String& tag, String& attributes,
                     String& value) {
  return parser.ReadToken(tag, attributes, value) && !tag.IsEmpty() && tag != closing;
}

// Skips the rest of an element whose start token was just read, nested elements included.
void skipElement(DexXmlParser& parser) {
  String tag;
  String attributes;
  String value;
  int depth = 1;
  while (depth > 0 && parser.ReadToken(tag, attributes, value)) {
    if (isTextToken(value)) continue;
    depth += isEndToken(tag) ? -1 : 1;
  }
}

// The version attribute as a number, read with "." as the decimal separator whatever the locale.
double versionNumber(const String& version) {
  const vyn_text::detail::CLocaleScope cLocale;
  return std::wcstod(version.GetString(), nullptr);
}

// Reads the items of a set element up to closing and adds each known word's value. The end tokens and
// texts of the items are ignored; every other unknown word leaves one error-log record at logLine,
// except silentWord.
template <class E, class Lookup>
void loadSetWords(DexXmlParser& parser, String& tag, String& attributes, String& value,
                  const wchar_t* closing, DexFlags<E>& set, Lookup lookup, int logLine,
                  const wchar_t* silentWord = nullptr) {
  while (readTokenBefore(parser, closing, tag, attributes, value)) {
    if (isEndToken(tag) || isTextToken(value)) continue;
    E member{};
    if (lookup(tag, member)) {
      set.add(member);
    } else if (silentWord == nullptr || tag != silentWord) {
      logError(logLine);
    }
  }
}

// ---- Writing ------------------------------------------------------------------------------------

// Writes lines to a file as UTF-16 little-endian text with CR LF line ends, indented by two blanks a
// level. Remembers whether every write succeeded.
class Utf16LineWriter {
 public:
  explicit Utf16LineWriter(base::CFile& file) : file_(file) {}

  void byteOrderMark() {
    static constexpr unsigned char kByteOrderMark[] = {0xFF, 0xFE};
    ok_ = file_.Write(kByteOrderMark, sizeof kByteOrderMark) && ok_;
  }

  void line(int depth, const String& text) {
    std::string bytes;
    appendUnits(bytes, std::wstring(static_cast<std::size_t>(depth) * 2, L' '));
    appendUnits(bytes, text.view());
    appendUnits(bytes, L"\r\n");
    ok_ = file_.Write(bytes.data(), bytes.size()) && ok_;
  }

  bool ok() const { return ok_; }

 private:
  static void appendUnits(std::string& bytes, std::wstring_view text) {
    for (const char16_t unit : vyn_text::detail::toUtf16(text)) {
      bytes += static_cast<char>(unit & 0xFF);
      bytes += static_cast<char>(unit >> 8);
    }
  }

  base::CFile& file_;
  bool ok_ = true;
};

String openingTag(const wchar_t* name) {
  return CXmlParserBase::OpenTag(name, CXmlParserBase::TAG_OPENING);
}

String& finished(String& tag, int typeFlag) {
  return CXmlParserBase::CloseTag(tag, typeFlag);
}

String closingTag(const wchar_t* name) {
  return CXmlParserBase::OpenTag(name, CXmlParserBase::TAG_CLOSING);
}

String emptyElement(const wchar_t* name) {
  return CXmlParserBase::OpenTag(name, CXmlParserBase::TAG_EMPTY_ELEMENT);
}

// The words of a set's members in value order. A member without a word leaves one error-log record at
// logLine and is left out.
template <class E, class WordOf>
std::vector<String> wordsOfSet(DexFlags<E> set, WordOf wordOf, int logLine) {
  std::vector<String> words;
  for (int value = 0; value < DexFlags<E>::kCapacity; ++value) {
    if (!set.has(static_cast<E>(value))) continue;
    String word = wordOf(static_cast<E>(value));
    if (word.IsEmpty()) {
      logError(logLine);
    } else {
      words.push_back(std::move(word));
    }
  }
  return words;
}

// A set element holding one empty element per word; an empty element when there is no word.
// attributes are appended to the element's tag as formed by FormAttrib.
void writeSetElement(Utf16LineWriter& writer, int depth, const wchar_t* name,
                     const std::vector<String>& words, const String& attributes = String()) {
  String tag = openingTag(name) + attributes;
  if (words.empty()) {
    writer.line(depth, finished(tag, CXmlParserBase::TAG_EMPTY_ELEMENT));
    return;
  }
  writer.line(depth, finished(tag, CXmlParserBase::TAG_OPENING));
  for (const String& word : words)
    writer.line(depth + 1, emptyElement(word));
  writer.line(depth, closingTag(name));
}

// A unit set element with its "used" attribute: "true" when the set is not empty.
template <class E>
void writeUnitsElement(Utf16LineWriter& writer, int depth, const wchar_t* name, DexFlags<E> units,
                       const std::vector<String>& words) {
  writeSetElement(writer, depth, name, words,
                  CXmlParserBase::FormAttrib(L"used", units.isEmpty() ? L"false" : L"true"));
}

}  // namespace

// ---- Reading ------------------------------------------------------------------------------------

bool DexFormatsData::loadDataFromFile(const CVynStringT<wchar_t>& fileName, bool& storeFile) {
  storeFile = true;
  DexXmlParser* opened = nullptr;
  if (DexXmlParser::initialize(fileName, opened) != DEX_RESULT_OK) return false;
  const std::unique_ptr<DexXmlParser> parser(opened);

  String tag;
  String attributes;
  String value;
  while (parser->ReadToken(tag, attributes, value)) {
    if (tag.IsEmpty()) {
      // The declaration: only UTF-8 and UTF-16 files are read.
      if (!parser->IsUTF8() && !parser->IsUTF16()) return false;
      continue;
    }
    if (tag != L"IEFormatsData" || isTextToken(value)) continue;

    const String version = CXmlParserBase::ReadAttrib(attributes, L"version");
    // A version that is not a number at all (NaN) counts as too old.
    if (version.IsEmpty() || !(versionNumber(version) >= kOldestUsableVersion)) return false;
    if (CXmlParserBase::ReadAttrib(attributes, L"useDataFromFile") != L"true") {
      storeFile = false;
      return false;
    }
    return loadIEFormatsData(*parser);
  }
  return false;
}

bool DexFormatsData::loadIEFormatsData(DexXmlParser& parser) {
  String tag;
  String attributes;
  String value;
  while (readTokenBefore(parser, L"/IEFormatsData", tag, attributes, value)) {
    if (tag != L"IEFormats" || isTextToken(value)) continue;
    while (readTokenBefore(parser, L"/IEFormats", tag, attributes, value)) {
      if (tag != L"IEFormat" || isTextToken(value)) continue;
      DexFormat* format = nullptr;
      if (loadIEFormat(parser, attributes, value, format)) {
        formats_.push_back(format);
      } else {
        delete format;
      }
    }
  }
  return !formats_.empty();
}

bool DexFormatsData::loadIEFormat(DexXmlParser& parser, const CVynStringT<wchar_t>& attributes,
                                  const CVynStringT<wchar_t>& /*value*/, DexFormat*& out) {
  out = nullptr;
  const auto attribute = [&attributes](const wchar_t* name) {
    return CXmlParserBase::ReadAttrib(attributes, name);
  };
  GUID guid;
  const String guidText = attribute(L"guid");
  if (guidText.IsEmpty() || CLSIDFromString(guidText, &guid) != S_OK) return false;

  DexFlags<Configuration> configurations;
  DexFlags<UsingMode> usingModes;
  DexFlags<EDexDataType> dataTypes;
  DexFlags<EDistUnits> distanceUnits;
  DexFlags<EAngleUnits> angleUnits;
  DexFlags<Parameter> parameters;

  String tag;
  String childAttributes;
  String value;
  bool complete = false;
  while (parser.ReadToken(tag, childAttributes, value) && !tag.IsEmpty()) {
    if (tag == L"/IEFormat") {
      complete = true;
      break;
    }
    if (isEndToken(tag) || isTextToken(value)) continue;
    if (tag == L"Configurations") {
      loadConfigurations(parser, tag, childAttributes, value, configurations);
    } else if (tag == L"UsingModes") {
      loadUsingModes(parser, tag, childAttributes, value, usingModes);
    } else if (tag == L"DataTypes") {
      loadDataTypes(parser, tag, childAttributes, value, dataTypes);
    } else if (tag == L"DistanceUnits") {
      loadDistanceUnits(parser, tag, childAttributes, value, distanceUnits);
    } else if (tag == L"AngeUnits") {
      loadAngleUnits(parser, tag, childAttributes, value, angleUnits);
    } else if (tag == L"Parameters") {
      loadParameters(parser, tag, childAttributes, value, parameters);
    } else {
      logError(detail::kLogUnknownFormatChild);
      skipElement(parser);
    }
  }
  // A format cut off by the end of a truncated or broken file may lack any of its sets: it is not
  // offered rather than offered with the wrong abilities.
  if (!complete) return false;

  out = new DexFormat(guid, attribute(L"name"), directionFromKeyword(attribute(L"directionType")),
                      attribute(L"exportDLL"), attribute(L"importDLL"), attribute(L"titleForVerticalScreen"),
                      attribute(L"extension"), attribute(L"filterExtension"), configurations, usingModes,
                      dataTypes, distanceUnits, angleUnits, parameters);
  return out != nullptr;
}

void DexFormatsData::loadConfigurations(DexXmlParser& parser, CVynStringT<wchar_t>& tag,
                                        CVynStringT<wchar_t>& attributes, CVynStringT<wchar_t>& value,
                                        DexFlags<Configuration>& configurations) {
  loadSetWords(parser, tag, attributes, value, L"/Configurations", configurations, configurationFromKeyword,
               detail::kLogUnknownConfigurationWord, kRetiredConfigurationWord);
}

void DexFormatsData::loadUsingModes(DexXmlParser& parser, CVynStringT<wchar_t>& tag,
                                    CVynStringT<wchar_t>& attributes, CVynStringT<wchar_t>& value,
                                    DexFlags<UsingMode>& modes) {
  loadSetWords(parser, tag, attributes, value, L"/UsingModes", modes, usingModeFromKeyword,
               detail::kLogUnknownUsingModeWord);
}

void DexFormatsData::loadDataTypes(DexXmlParser& parser, CVynStringT<wchar_t>& tag,
                                   CVynStringT<wchar_t>& attributes, CVynStringT<wchar_t>& value,
                                   DexFlags<EDexDataType>& types) {
  loadSetWords(parser, tag, attributes, value, L"/DataTypes", types, dataTypeFromKeyword,
               detail::kLogUnknownDataTypeWord);
}

void DexFormatsData::loadDistanceUnits(DexXmlParser& parser, CVynStringT<wchar_t>& tag,
                                       CVynStringT<wchar_t>& attributes, CVynStringT<wchar_t>& value,
                                       DexFlags<EDistUnits>& units) {
  loadSetWords(parser, tag, attributes, value, L"/DistanceUnits", units, utils::distUnitsFromKeyword,
               detail::kLogUnknownDistanceUnitsWord);
}

void DexFormatsData::loadAngleUnits(DexXmlParser& parser, CVynStringT<wchar_t>& tag,
                                    CVynStringT<wchar_t>& attributes, CVynStringT<wchar_t>& value,
                                    DexFlags<EAngleUnits>& units) {
  loadSetWords(parser, tag, attributes, value, L"/AngeUnits", units, utils::angleUnitsFromKeyword,
               detail::kLogUnknownAngleUnitsWord);
}

void DexFormatsData::loadParameters(DexXmlParser& parser, CVynStringT<wchar_t>& tag,
                                    CVynStringT<wchar_t>& attributes, CVynStringT<wchar_t>& value,
                                    DexFlags<Parameter>& parameters) {
  loadSetWords(parser, tag, attributes, value, L"/Parameters", parameters, parameterFromKeyword,
               detail::kLogUnknownParameterWord);
}

// ---- Writing ------------------------------------------------------------------------------------

bool DexFormatsData::storeDataToTheFile(const CVynStringT<wchar_t>& fileName) const {
  base::CFile file;
  if (!file.OpenForWriting(fileName)) return false;
  Utf16LineWriter writer(file);
  writer.byteOrderMark();
  writer.line(0, L"<?xml version=\"1.0\" encoding=\"utf-16\"?>");
  String root = openingTag(L"IEFormatsData");
  root += CXmlParserBase::FormAttrib(L"version", kWrittenVersion);
  root += CXmlParserBase::FormAttrib(L"useDataFromFile", L"false");
  root += CXmlParserBase::FormAttrib(L"numberOfFormats", std::to_wstring(formats_.size()).c_str());
  writer.line(0, finished(root, CXmlParserBase::TAG_OPENING));
  String formatsTag = openingTag(L"IEFormats");
  writer.line(1, finished(formatsTag, CXmlParserBase::TAG_OPENING));
  bool written = writer.ok();
  for (const DexFormat* format : formats_)
    written = writeIEFormat(file, format) && written;
  writer.line(1, closingTag(L"IEFormats"));
  writer.line(0, closingTag(L"IEFormatsData"));
  return file.Close() && written && writer.ok();
}

bool DexFormatsData::writeIEFormat(base::CFile& file, const DexFormat* format) const {
  if (format == nullptr) {
    logError(detail::kLogNullFormatNotWritten);
    return true;
  }
  constexpr int kDepth = 2;
  Utf16LineWriter writer(file);
  String tag = openingTag(L"IEFormat");
  const auto appendAttribute = [&tag](const wchar_t* name, const String& text) {
    tag += CXmlParserBase::FormAttrib(name, text);
  };
  appendAttribute(L"guid", format->getGuidAsString());
  appendAttribute(L"name", format->getName());
  appendAttribute(L"directionType", keywordFromDirection(format->getDataDirections()));
  appendAttribute(L"importDLL", format->getDllName(false));
  appendAttribute(L"exportDLL", format->getDllName(true));
  appendAttribute(L"titleForVerticalScreen", format->getTitle());
  appendAttribute(L"extension", format->getExtension(false));
  appendAttribute(L"filterExtension", format->getFilterExtension());
  writer.line(kDepth, finished(tag, CXmlParserBase::TAG_OPENING));

  writeSetElement(writer, kDepth + 1, L"Configurations",
                  wordsOfSet(format->getConfigurations(), keywordFromConfiguration,
                             detail::kLogConfigurationWithoutWord));
  writeSetElement(
      writer, kDepth + 1, L"UsingModes",
      wordsOfSet(format->getUsingModes(), keywordFromUsingMode, detail::kLogUsingModeWithoutWord));
  writeSetElement(writer, kDepth + 1, L"DataTypes",
                  wordsOfSet(format->getDataTypes(), keywordFromDataType, detail::kLogDataTypeWithoutWord));
  writeUnitsElement(writer, kDepth + 1, L"DistanceUnits", format->getDistanceUnits(),
                    wordsOfSet(format->getDistanceUnits(), utils::keywordFromDistUnits,
                               detail::kLogDistanceUnitsWithoutWord));
  writeUnitsElement(
      writer, kDepth + 1, L"AngeUnits", format->getAngleUnits(),
      wordsOfSet(format->getAngleUnits(), utils::keywordFromAngleUnits, detail::kLogAngleUnitsWithoutWord));
  writeSetElement(
      writer, kDepth + 1, L"Parameters",
      wordsOfSet(format->getParameters(), keywordFromParameter, detail::kLogParameterWithoutWord));
  writer.line(kDepth, closingTag(L"IEFormat"));
  return writer.ok();
}

}  // namespace vyn::ie
