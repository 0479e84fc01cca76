// Registries started from formats data files, each built apart from the process-wide one.

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "ieDefinitions/IEFormatsData.h"
#include "ieDefinitions/detail/FormatsDataAccess.h"
#include "support/CommaLocale.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"

using vyn::ie::DexCommonType;
using vyn::ie::DexFlags;
using vyn::ie::DexFormat;
using vyn::ie::DexFormatsData;
using vyn::ie::EAngleUnits;
using vyn::ie::EDistUnits;
using Access = vyn::ie::detail::FormatsDataAccess;

using namespace std::string_literals;

namespace {

const std::wstring kSource = L"ieDefinitions\\IEFormatsData";

// ---- Bytes and texts ----

std::string utf16File(std::wstring_view text) {
  std::string bytes = "\xFF\xFE";
  for (const wchar_t ch : text) {
    bytes += static_cast<char>(ch & 0xFF);
    bytes += static_cast<char>((ch >> 8) & 0xFF);
  }
  return bytes;
}

// The text of a UTF-16LE file with byte-order mark (BMP text only); empty when the mark is missing.
std::wstring utf16Text(const std::string& bytes) {
  std::wstring text;
  if (bytes.size() < 2 || bytes[0] != '\xFF' || bytes[1] != '\xFE') return text;
  for (std::size_t i = 2; i + 1 < bytes.size(); i += 2)
    text += static_cast<wchar_t>(static_cast<unsigned char>(bytes[i]) |
                                 (static_cast<unsigned char>(bytes[i + 1]) << 8));
  return text;
}

std::wstring replaced(std::wstring text, std::wstring_view from, std::wstring_view to) {
  const std::size_t at = text.find(from);
  EXPECT_NE(std::wstring::npos, at) << dex_test::narrow(from);
  if (at != std::wstring::npos) text.replace(at, from.size(), to);
  return text;
}

std::string fixture(const std::string& name) {
  return dex_test::readFile(dex_test::dataFile("formats/" + name));
}

std::wstring text(const CVynStringT<wchar_t>& value) {
  return std::wstring(value.view());
}

// ---- Registries ----

const DexFormatsData& builtIn() {
  return vyn::ie::getIEFormatsData();
}

std::unique_ptr<DexFormatsData> startFrom(const std::string& path) {
  return Access::create(dex_test::widen(path).c_str());
}

std::vector<std::wstring> namesOf(const DexFormatsData& data) {
  std::vector<std::wstring> names;
  for (unsigned int i = 0; i < data.getNumberOfFormats(); ++i)
    names.push_back(text(data.getFormatByIndex(i)->getName()));
  return names;
}

bool holdsTheBuiltInTable(const DexFormatsData& data) {
  return namesOf(data) == namesOf(builtIn());
}

// True when the file holds the built-in table as the library writes it.
bool isWrittenBuiltInTable(const std::string& path) {
  const std::wstring written = utf16Text(dex_test::readFile(path));
  return written.find(L"<IEFormatsData version=\"1.9\" useDataFromFile=\"false\" numberOfFormats=\"154\">") !=
             std::wstring::npos &&
         written.find(L"name=\"Customizable ASCII Point Files") != std::wstring::npos;
}

// Writes the built-in table to a file in folder and answers its text.
std::wstring writtenBuiltInTable(const dex_test::TempDir& folder) {
  const std::string path = folder.file("built-in.xml");
  EXPECT_TRUE(Access::storeDataToTheFile(builtIn(), dex_test::widen(path).c_str()));
  return utf16Text(dex_test::readFile(path));
}

std::wstring switchedToFile(const std::wstring& written) {
  return replaced(written, L"useDataFromFile=\"false\"", L"useDataFromFile=\"true\"");
}

// Every token of a file as "tag|attributes" lines (text tokens add "|value").
std::vector<std::wstring> tokensOf(const std::string& path) {
  std::vector<std::wstring> tokens;
  vyn::ie::DexXmlParser* opened = nullptr;
  if (vyn::ie::DexXmlParser::initialize(dex_test::widen(path).c_str(), opened) != vyn::ie::DEX_RESULT_OK)
    return tokens;
  const std::unique_ptr<vyn::ie::DexXmlParser> parser(opened);
  CVynStringT<wchar_t> tag;
  CVynStringT<wchar_t> attributes;
  CVynStringT<wchar_t> value;
  while (parser->ReadToken(tag, attributes, value)) {
    std::wstring token = text(tag);
    if (!attributes.IsEmpty()) token += L"|" + text(attributes);
    if (!value.IsEmpty()) token += L"||" + text(value);
    tokens.push_back(token);
  }
  return tokens;
}

void expectSameFormat(const DexFormat& expected, const DexFormat& actual, bool withoutWordlessParameters) {
  SCOPED_TRACE(dex_test::narrow(text(expected.getName())));
  EXPECT_EQ(expected.getGuid(), actual.getGuid());
  EXPECT_EQ(text(expected.getName()), text(actual.getName()));
  EXPECT_EQ(expected.getDataDirections(), actual.getDataDirections());
  EXPECT_EQ(text(expected.getDllName(true)), text(actual.getDllName(true)));
  EXPECT_EQ(text(expected.getDllName(false)), text(actual.getDllName(false)));
  EXPECT_EQ(text(expected.getTitle()), text(actual.getTitle()));
  EXPECT_EQ(text(expected.getExtension(false)), text(actual.getExtension(false)));
  EXPECT_EQ(text(expected.getFilterExtension()), text(actual.getFilterExtension()));
  EXPECT_EQ(expected.getConfigurations(), actual.getConfigurations());
  EXPECT_EQ(expected.getUsingModes(), actual.getUsingModes());
  EXPECT_EQ(expected.getDataTypes(), actual.getDataTypes());
  EXPECT_EQ(expected.getDistanceUnits(), actual.getDistanceUnits());
  EXPECT_EQ(expected.getAngleUnits(), actual.getAngleUnits());
  DexFlags<DexFormat::EParameterName> parameters = expected.getParameters();
  if (withoutWordlessParameters)
    parameters.remove(DexFormat::BUILT_IN_PARAMETER_51).remove(DexFormat::BUILT_IN_PARAMETER_52);
  EXPECT_EQ(parameters, actual.getParameters());
}

int rowsWithWordlessParameters() {
  int memberships = 0;
  for (unsigned int i = 0; i < builtIn().getNumberOfFormats(); ++i) {
    const DexFormat* format = builtIn().getFormatByIndex(i);
    memberships += format->isParameterSupported(DexFormat::BUILT_IN_PARAMETER_51) ? 1 : 0;
    memberships += format->isParameterSupported(DexFormat::BUILT_IN_PARAMETER_52) ? 1 : 0;
  }
  return memberships;
}

// The outcome of loadDataFromFile alone, on a registry without formats.
struct LoadOutcome {
  bool loaded = false;
  bool storeFile = false;
  unsigned int formats = 0;
};

LoadOutcome loadOnly(const std::string& path) {
  std::unique_ptr<DexFormatsData> data = Access::create(L"");
  Access::clearFormats(*data);
  LoadOutcome outcome;
  outcome.storeFile = false;
  outcome.loaded = Access::loadDataFromFile(*data, dex_test::widen(path).c_str(), outcome.storeFile);
  outcome.formats = data->getNumberOfFormats();
  return outcome;
}

}  // namespace

// ---- Writing ------------------------------------------------------------------------------------

TEST(FormatsDataFile, AMissingFileIsWrittenWithTheBuiltInTable) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("IEFormatsData.xml");
  const dex_test::LogCapture log;
  const std::unique_ptr<DexFormatsData> data = startFrom(path);
  EXPECT_TRUE(holdsTheBuiltInTable(*data));
  EXPECT_EQ(21u, data->getNumberOfDataTypes());

  const std::string bytes = dex_test::readFile(path);
  ASSERT_GT(bytes.size(), 4u);
  EXPECT_EQ("\xFF\xFE<\0?\0"s, bytes.substr(0, 6));
  EXPECT_EQ(0u, bytes.size() % 2);
  const std::wstring written = utf16Text(bytes);
  EXPECT_EQ(0u, written.rfind(
                    L"<?xml version=\"1.0\" encoding=\"utf-16\"?>\r\n"
                    L"<IEFormatsData version=\"1.9\" useDataFromFile=\"false\" numberOfFormats=\"154\">\r\n",
                    0));
  // Every line ends in CR LF, the last one included.
  for (std::size_t at = written.find(L'\n'); at != std::wstring::npos; at = written.find(L'\n', at + 1))
    ASSERT_EQ(L'\r', written[at - 1]) << at;
  EXPECT_EQ(L"</IEFormatsData>\r\n", written.substr(written.size() - 18));

  // Parameters 51 and 52 have no word: each membership leaves one record and is left out.
  EXPECT_EQ(rowsWithWordlessParameters(), log.count(kSource, 2360));
  EXPECT_EQ(2, rowsWithWordlessParameters());
  EXPECT_EQ(static_cast<std::size_t>(rowsWithWordlessParameters()), log.size());
}

TEST(FormatsDataFile, WritesTheMapInfoRowAsTheExampleShows) {
  const dex_test::TempDir folder;
  const std::wstring written = writtenBuiltInTable(folder);
  EXPECT_NE(std::wstring::npos,
            written.find(
                L"<IEFormat guid=\"{C144E2ED-E0F1-4B21-ACEC-9D5FB675621A}\" name=\"MapInfo (*.mif)\" "
                L"directionType=\"ImportExport\" importDLL=\"ImportParsers\" exportDLL=\"ExportParsers\" "
                L"titleForVerticalScreen=\"MIF\" extension=\"mif\" filterExtension=\"MIF Files (*.mif)|\">"));

  const std::vector<std::wstring> tokens = tokensOf(folder.file("built-in.xml"));
  const auto start = std::find_if(tokens.begin(), tokens.end(), [](const std::wstring& token) {
    return token.find(L"name=\"MapInfo (*.mif)\"") != std::wstring::npos;
  });
  ASSERT_NE(tokens.end(), start);
  const std::vector<std::wstring> expected = {L"Configurations",
                                              L"REGULAR",
                                              L"/REGULAR",
                                              L"ONBOARD",
                                              L"/ONBOARD",
                                              L"/Configurations",
                                              L"UsingModes",
                                              L"/UsingModes",
                                              L"DataTypes",
                                              L"POINTS",
                                              L"/POINTS",
                                              L"LINES",
                                              L"/LINES",
                                              L"POINT_LISTS",
                                              L"/POINT_LISTS",
                                              L"MULTIPLE",
                                              L"/MULTIPLE",
                                              L"/DataTypes",
                                              L"DistanceUnits|used=\"true\"",
                                              L"ANY_UNITS",
                                              L"/ANY_UNITS",
                                              L"/DistanceUnits",
                                              L"AngeUnits|used=\"false\"",
                                              L"/AngeUnits",
                                              L"Parameters",
                                              L"/Parameters",
                                              L"/IEFormat"};
  ASSERT_GE(tokens.end() - start, static_cast<std::ptrdiff_t>(expected.size() + 1));
  EXPECT_EQ(expected,
            std::vector<std::wstring>(start + 1, start + 1 + static_cast<std::ptrdiff_t>(expected.size())));
}

TEST(FormatsDataFile, WritesParameterEighteenWithItsCurrentWord) {
  const dex_test::TempDir folder;
  const std::wstring written = writtenBuiltInTable(folder);
  EXPECT_NE(std::wstring::npos, written.find(L"<PREDEFINED_CODE_WITH_ATTRS_EXP/>"));
  EXPECT_EQ(std::wstring::npos, written.find(L"PREDEFINED_CODE_STYLE_EXP"));
}

TEST(FormatsDataFile, ValuesWithoutAWordAreLoggedAndLeftOut) {
  const dex_test::TempDir folder;
  std::unique_ptr<DexFormatsData> data = Access::create(L"");
  Access::clearFormats(*data);
  GUID guid;
  ASSERT_EQ(S_OK, CLSIDFromString(L"{0F3B6E2A-77C4-4D5B-8E1F-2A9C6D4B3E58}", &guid));
  Access::appendFormat(*data, nullptr);
  Access::appendFormat(
      *data, new DexFormat(guid, L"Odd <values> & more", DexCommonType::EXPORT_ONLY, L"ExportParsers", L"",
                           L"Odd", L"odd", L"",
                           {DexCommonType::REGULAR, static_cast<DexCommonType::ESupportedConfigurations>(5)},
                           static_cast<DexCommonType::EUsingModes>(2),
                           {vyn::ie::POINTS, static_cast<vyn::ie::EDexDataType>(23)},
                           static_cast<EDistUnits>(28), static_cast<EAngleUnits>(6),
                           {DexFormat::PHOTO_NOTES, DexFormat::BUILT_IN_PARAMETER_52,
                            static_cast<DexFormat::EParameterName>(60)}));
  const std::string path = folder.file("odd.xml");
  const dex_test::LogCapture log;
  EXPECT_TRUE(Access::storeDataToTheFile(*data, dex_test::widen(path).c_str()));
  EXPECT_EQ(1, log.count(kSource, 2117));
  EXPECT_EQ(1, log.count(kSource, 2161));
  EXPECT_EQ(1, log.count(kSource, 2179));
  EXPECT_EQ(1, log.count(kSource, 2217));
  EXPECT_EQ(1, log.count(kSource, 2265));
  EXPECT_EQ(1, log.count(kSource, 2292));
  EXPECT_EQ(2, log.count(kSource, 2360));
  EXPECT_EQ(8u, log.size());

  const std::wstring written = utf16Text(dex_test::readFile(path));
  EXPECT_NE(std::wstring::npos, written.find(L"numberOfFormats=\"2\""));
  EXPECT_NE(std::wstring::npos, written.find(L"name=\"Odd &lt;values&gt; &amp; more\""));
  // A set whose members all lack a word is written empty; a unit set keeps its "used" attribute.
  EXPECT_NE(std::wstring::npos, written.find(L"<UsingModes/>"));
  EXPECT_NE(std::wstring::npos, written.find(L"<DistanceUnits used=\"true\"/>"));
  EXPECT_NE(std::wstring::npos, written.find(L"<AngeUnits used=\"true\"/>"));
  EXPECT_NE(std::wstring::npos,
            written.find(L"<Parameters>\r\n        <PHOTO_NOTES/>\r\n      </Parameters>"));

  // What was written reads back as written (once the file is switched to be used).
  const std::string switched = folder.write("switched.xml", utf16File(switchedToFile(written)));
  const std::unique_ptr<DexFormatsData> reread = startFrom(switched);
  ASSERT_EQ(1u, reread->getNumberOfFormats());
  const DexFormat* odd = reread->getFormatByIndex(0);
  EXPECT_EQ(L"Odd <values> & more", text(odd->getName()));
  EXPECT_EQ(DexFlags<DexCommonType::ESupportedConfigurations>(DexCommonType::REGULAR),
            odd->getConfigurations());
  EXPECT_TRUE(odd->getUsingModes().isEmpty());
  EXPECT_EQ(DexFlags<vyn::ie::EDexDataType>(vyn::ie::POINTS), odd->getDataTypes());
  EXPECT_FALSE(odd->areDistUnitsUsed());
  EXPECT_EQ(DexFlags<DexFormat::EParameterName>(DexFormat::PHOTO_NOTES), odd->getParameters());
}

TEST(FormatsDataFile, AFileThatCannotBeWrittenLeavesTheBuiltInTable) {
  const dex_test::TempDir folder;
  const std::string inMissingFolder = folder.file("missing/IEFormatsData.xml");
  const std::unique_ptr<DexFormatsData> data = startFrom(inMissingFolder);
  EXPECT_TRUE(holdsTheBuiltInTable(*data));
  EXPECT_FALSE(PathFileExistsW(dex_test::widen(inMissingFolder).c_str()));
  EXPECT_FALSE(Access::storeDataToTheFile(*data, dex_test::widen(inMissingFolder).c_str()));
  EXPECT_FALSE(Access::storeDataToTheFile(*data, L""));

  // A folder in place of the file is neither read nor replaced.
  const std::unique_ptr<DexFormatsData> fromFolder = startFrom(folder.path());
  EXPECT_TRUE(holdsTheBuiltInTable(*fromFolder));
}

// ---- The next start -----------------------------------------------------------------------------

TEST(FormatsDataFile, AWrittenFileIsNeitherUsedNorRewrittenAtTheNextStart) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("IEFormatsData.xml");
  startFrom(path);
  // An administrator edits a name but leaves useDataFromFile as written.
  const std::string edited = utf16File(
      replaced(utf16Text(dex_test::readFile(path)), L"name=\"MapInfo (*.mif)\"", L"name=\"Edited\""));
  folder.write("IEFormatsData.xml", edited);

  const std::unique_ptr<DexFormatsData> next = startFrom(path);
  EXPECT_TRUE(holdsTheBuiltInTable(*next));
  EXPECT_EQ(edited, dex_test::readFile(path));
  const LoadOutcome outcome = loadOnly(path);
  EXPECT_FALSE(outcome.loaded);
  EXPECT_FALSE(outcome.storeFile);
}

TEST(FormatsDataFile, AFileSwitchedToBeUsedGivesBackTheSameFormatsButTheWordlessParameters) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("IEFormatsData.xml");
  startFrom(path);
  const std::string switched = utf16File(switchedToFile(utf16Text(dex_test::readFile(path))));
  folder.write("IEFormatsData.xml", switched);

  const dex_test::LogCapture log;
  const std::unique_ptr<DexFormatsData> fromFile = startFrom(path);
  EXPECT_EQ(0u, log.size());
  ASSERT_EQ(builtIn().getNumberOfFormats(), fromFile->getNumberOfFormats());
  for (unsigned int i = 0; i < builtIn().getNumberOfFormats(); ++i)
    expectSameFormat(*builtIn().getFormatByIndex(i), *fromFile->getFormatByIndex(i), true);
  const DexFormat* landXml = fromFile->getFormatById(L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}");
  ASSERT_NE(nullptr, landXml);
  EXPECT_FALSE(landXml->isParameterSupported(DexFormat::BUILT_IN_PARAMETER_51));
  EXPECT_TRUE(landXml->isParameterSupported(DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP));
  // A file in use is not rewritten.
  EXPECT_EQ(switched, dex_test::readFile(path));
  // The data kinds always come from the built-in table.
  EXPECT_EQ(21u, fromFile->getNumberOfDataTypes());
}

TEST(FormatsDataFile, AnEditedFileReplacesTheBuiltInTable) {
  const dex_test::TempDir folder;
  const std::string utf8 = folder.write("two.xml", fixture("two_formats_used.xml"));
  const std::wstring utf16Text16 = replaced(dex_test::widen(fixture("two_formats_used.xml")),
                                            L"encoding=\"utf-8\"", L"encoding=\"utf-16\"");
  const std::string utf16 = folder.write("two16.xml", utf16File(utf16Text16));

  for (const std::string& path : {utf8, utf16}) {
    SCOPED_TRACE(path);
    const std::string before = dex_test::readFile(path);
    const dex_test::LogCapture log;
    const std::unique_ptr<DexFormatsData> data = startFrom(path);
    EXPECT_EQ(0u, log.size());
    ASSERT_EQ(2u, data->getNumberOfFormats());
    expectSameFormat(*builtIn().getFormatById(L"{C144E2ED-E0F1-4b21-ACEC-9D5FB675621A}"),
                     *data->getFormatByIndex(0), false);
    const DexFormat* site = data->getFormatByIndex(1);
    EXPECT_EQ(L"Site Points & Codes (*.spc)", text(site->getName()));
    EXPECT_EQ(DexCommonType::EXPORT_ONLY, site->getDataDirections());  // "export", case ignored
    EXPECT_EQ(L"SitePlugin", text(site->getDllName(true)));
    EXPECT_EQ(L"", text(site->getDllName(false)));  // missing attribute
    EXPECT_EQ(L"SPC", text(site->getTitle()));
    EXPECT_EQ(L".spc", text(site->getExtension(true)));
    EXPECT_EQ(DexFlags<DexCommonType::ESupportedConfigurations>(DexCommonType::JAPAN),
              site->getConfigurations());
    EXPECT_TRUE(site->isUsingModeApplied(DexCommonType::EXPORT_IN_JAPAN));
    EXPECT_EQ((DexFlags<vyn::ie::EDexDataType>{vyn::ie::POINTS, vyn::ie::CODES}), site->getDataTypes());
    EXPECT_EQ((DexFlags<EDistUnits>{EDistUnits::METERS, EDistUnits::USFEET}), site->getDistanceUnits());
    EXPECT_EQ(DexFlags<EAngleUnits>(EAngleUnits::DDDMMSSS), site->getAngleUnits());
    EXPECT_EQ((DexFlags<DexFormat::EParameterName>{DexFormat::MULTIPLE_FILES_EXP,
                                                   DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP}),
              site->getParameters());
    EXPECT_EQ(before, dex_test::readFile(path));
    EXPECT_EQ(21u, data->getNumberOfDataTypes());
  }
}

TEST(FormatsDataFile, AUtf8FileThatSaysSoIsReadLikeAUtf16One) {
  const dex_test::TempDir folder;
  const std::wstring written = switchedToFile(writtenBuiltInTable(folder));
  const std::string path = folder.write(
      "utf8.xml", vyn_text::toUtf8(replaced(written, L"encoding=\"utf-16\"", L"encoding=\"utf-8\"")));
  const std::string before = dex_test::readFile(path);
  const std::unique_ptr<DexFormatsData> data = startFrom(path);
  ASSERT_EQ(154u, data->getNumberOfFormats());
  for (unsigned int i = 0; i < data->getNumberOfFormats(); ++i)
    expectSameFormat(*builtIn().getFormatByIndex(i), *data->getFormatByIndex(i), true);
  EXPECT_EQ(before, dex_test::readFile(path));
}

// ---- Bad files ----------------------------------------------------------------------------------

TEST(FormatsDataFile, UnreadableFilesAreReplacedWithTheBuiltInTable) {
  const dex_test::TempDir folder;
  struct Case {
    const char* name;
    std::string bytes;
  };
  const std::wstring written = switchedToFile(writtenBuiltInTable(folder));
  std::string noUsableGuid = fixture("formats_without_usable_guid.xml");
  noUsableGuid.replace(noUsableGuid.find("{0F3B"), 1, "(");
  const Case cases[] = {
      {"empty", ""},
      {"not XML", "P1,1000.0,2000.0,55.2,TREE\r\nP2,1001.0,2001.0,55.4,TREE\r\n"},
      {"binary", std::string("\x00\x01\x02\xFF\xFE\x00", 6)},
      {"other root", "<?xml version=\"1.0\"?><FieldBook version=\"2.0\" useDataFromFile=\"true\"/>"},
      {"without declaration and root", "<IEFormats/>"},
      {"Latin-1", fixture("latin1_declared.xml")},
      {"version 1.8", fixture("version_1_8.xml")},
      {"version 1.8 in UTF-16", utf16File(replaced(written, L"version=\"1.9\" use", L"version=\"1.8\" use"))},
      {"version missing", "<IEFormatsData useDataFromFile=\"true\"><IEFormats/></IEFormatsData>"},
      {"version not a number", "<IEFormatsData version=\"new\" useDataFromFile=\"true\"/>"},
      {"version NaN", "<IEFormatsData version=\"nan\" useDataFromFile=\"true\"/>"},
      {"no usable format", noUsableGuid},
      {"no formats element", "<IEFormatsData version=\"1.9\" useDataFromFile=\"true\"/>"},
      {"UTF-8 bytes declared as UTF-16", vyn_text::toUtf8(written)},
      {"UTF-16 cut inside the first format", utf16File(written.substr(0, written.find(L"</IEFormat>")))},
  };
  for (const Case& bad : cases) {
    SCOPED_TRACE(bad.name);
    const std::string path = folder.write("bad.xml", bad.bytes);
    const LoadOutcome outcome = loadOnly(path);
    EXPECT_FALSE(outcome.loaded);
    EXPECT_TRUE(outcome.storeFile);
    EXPECT_EQ(0u, outcome.formats);

    const std::unique_ptr<DexFormatsData> data = startFrom(path);
    EXPECT_TRUE(holdsTheBuiltInTable(*data));
    EXPECT_TRUE(isWrittenBuiltInTable(path));
  }
}

TEST(FormatsDataFile, AFileNotSwitchedToBeUsedIsLeftAlone) {
  const dex_test::TempDir folder;
  const std::string usable = fixture("two_formats_used.xml");
  const std::string cases[] = {
      std::string(usable).replace(usable.find("\"true\""), 6, "\"TRUE\""),
      std::string(usable).replace(usable.find("\"true\""), 6, "\"yes\""),
      std::string(usable).replace(usable.find(" useDataFromFile=\"true\""), 23, ""),
      "<IEFormatsData version=\"2.0\" useDataFromFile=\"false\"/>",
  };
  for (const std::string& bytes : cases) {
    SCOPED_TRACE(bytes.substr(0, 160));
    const std::string path = folder.write("kept.xml", bytes);
    const LoadOutcome outcome = loadOnly(path);
    EXPECT_FALSE(outcome.loaded);
    EXPECT_FALSE(outcome.storeFile);
    const std::unique_ptr<DexFormatsData> data = startFrom(path);
    EXPECT_TRUE(holdsTheBuiltInTable(*data));
    EXPECT_EQ(bytes, dex_test::readFile(path));
  }
}

TEST(FormatsDataFile, ANewerVersionIsRead) {
  const dex_test::TempDir folder;
  std::string newer = fixture("two_formats_used.xml");
  newer.replace(newer.find("version=\"1.9\""), 13, "version=\"2.10\"");
  const std::string path = folder.write("newer.xml", newer);
  const LoadOutcome outcome = loadOnly(path);
  EXPECT_TRUE(outcome.loaded);
  EXPECT_EQ(2u, outcome.formats);
}

TEST(FormatsDataFile, TheVersionIsReadWithAPointWhateverTheLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  const dex_test::TempDir folder;
  const std::string path = folder.write("two.xml", fixture("two_formats_used.xml"));
  const LoadOutcome outcome = loadOnly(path);
  EXPECT_TRUE(outcome.loaded);
  EXPECT_EQ(2u, outcome.formats);
}

TEST(FormatsDataFile, AFormatWithoutAUsableGuidIsSkipped) {
  const dex_test::TempDir folder;
  const std::string path = folder.write("guids.xml", fixture("formats_without_usable_guid.xml"));
  const dex_test::LogCapture log;
  const std::unique_ptr<DexFormatsData> data = startFrom(path);
  ASSERT_EQ(1u, data->getNumberOfFormats());
  EXPECT_EQ(L"Kept (*.kpt)", text(data->getFormatByIndex(0)->getName()));
  EXPECT_EQ(DexCommonType::IMPORT_ONLY, data->getFormatByIndex(0)->getDataDirections());
  EXPECT_EQ(0u, log.size());
  EXPECT_EQ(fixture("formats_without_usable_guid.xml"), dex_test::readFile(path));
}

TEST(FormatsDataFile, UnknownWordsCostOneRecordEachAndAreSkipped) {
  const dex_test::TempDir folder;
  const std::string path = folder.write("words.xml", fixture("unknown_words.xml"));
  const dex_test::LogCapture log;
  const std::unique_ptr<DexFormatsData> data = startFrom(path);
  ASSERT_EQ(1u, data->getNumberOfFormats());
  EXPECT_EQ(1, log.count(kSource, 2506));  // OFFICE; CONTRACTOR is dropped silently
  EXPECT_EQ(1, log.count(kSource, 2519));  // EXPORT_IN_FRANCE
  EXPECT_EQ(1, log.count(kSource, 2552));  // points: words are case-sensitive
  EXPECT_EQ(1, log.count(kSource, 2486));  // Colour, with its content
  EXPECT_EQ(1, log.count(kSource, 2591));  // FURLONGS
  EXPECT_EQ(1, log.count(kSource, 2607));  // DEGREES
  EXPECT_EQ(1, log.count(kSource, 2668));  // MULTIPLE_STATION_POINTS
  EXPECT_EQ(7u, log.size());
  for (const auto& record : log.records())
    EXPECT_TRUE(record.message.empty());

  const DexFormat* format = data->getFormatByIndex(0);
  EXPECT_EQ(DexCommonType::IMPORT_AND_EXPORT, format->getDataDirections());
  EXPECT_EQ(DexFlags<DexCommonType::ESupportedConfigurations>(DexCommonType::REGULAR),
            format->getConfigurations());
  EXPECT_EQ(DexFlags<DexCommonType::EUsingModes>(DexCommonType::EXPORT_IN_JAPAN), format->getUsingModes());
  EXPECT_EQ(DexFlags<vyn::ie::EDexDataType>(vyn::ie::POINTS), format->getDataTypes());
  // The "used" attribute is not read: the units present count.
  EXPECT_EQ(DexFlags<EDistUnits>(EDistUnits::METERS), format->getDistanceUnits());
  EXPECT_EQ(DexFlags<EAngleUnits>(EAngleUnits::DECDEG), format->getAngleUnits());
  EXPECT_EQ(DexFlags<DexFormat::EParameterName>(DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP),
            format->getParameters());
}

TEST(FormatsDataFile, ATruncatedFileGivesTheFormatsReadCompletelyBeforeTheCut) {
  const dex_test::TempDir folder;
  const std::wstring whole = switchedToFile(writtenBuiltInTable(folder));
  const std::vector<std::wstring> builtInNames = namesOf(builtIn());
  // Cut in the middle of a format element, at an odd byte too.
  const std::size_t cut = whole.find(L"<AngeUnits", whole.size() / 2);
  ASSERT_NE(std::wstring::npos, cut);
  for (const std::size_t extraByte : {0u, 1u}) {
    SCOPED_TRACE(extraByte);
    std::string bytes = utf16File(whole.substr(0, cut));
    if (extraByte != 0) bytes += '<';
    const std::string path = folder.write("cut.xml", bytes);
    const std::unique_ptr<DexFormatsData> data = startFrom(path);
    const std::vector<std::wstring> names = namesOf(*data);
    EXPECT_GT(names.size(), 0u);
    EXPECT_LT(names.size(), 154u);
    EXPECT_EQ(std::vector<std::wstring>(builtInNames.begin(),
                                        builtInNames.begin() + static_cast<std::ptrdiff_t>(names.size())),
              names);
    for (unsigned int i = 0; i < data->getNumberOfFormats(); ++i)
      expectSameFormat(*builtIn().getFormatByIndex(i), *data->getFormatByIndex(i), true);
    // Every format that ends before the cut is offered, the one cut off is not.
    std::size_t elementEnd = 0;
    for (std::size_t i = 0; i < names.size(); ++i)
      elementEnd = whole.find(L"</IEFormat>", elementEnd) + 1;
    EXPECT_LT(elementEnd, cut);
    const std::size_t nextEnd = whole.find(L"</IEFormat>", elementEnd);
    EXPECT_GT(nextEnd, cut);
    EXPECT_EQ(bytes, dex_test::readFile(path));
  }
}

// ---- Hostile files --------------------------------------------------------------------------------

TEST(FormatsDataFile, AFormatNested10000DeepIsDroppedAndTheBuiltInTableServes) {
  const dex_test::TempDir folder;
  std::string closing;
  for (int i = 0; i < 10000; ++i)
    closing += "</Extra>";
  const std::string path = folder.writeRepeated(
      "deep.xml",
      "<?xml version=\"1.0\" encoding=\"utf-8\"?><IEFormatsData version=\"1.9\" useDataFromFile=\"true\">"
      "<IEFormats><IEFormat guid=\"{E653FE2B-C46A-400E-BA60-864A221BE19F}\" name=\"Deep\">",
      "<Extra>", 10000, closing + "</IEFormat></IEFormats></IEFormatsData>");
  const dex_test::LogCapture log;
  const std::unique_ptr<DexFormatsData> data = startFrom(path);
  EXPECT_TRUE(holdsTheBuiltInTable(*data));
  EXPECT_TRUE(isWrittenBuiltInTable(path));
  EXPECT_EQ(1, log.count(kSource, 2486));  // the unknown child, whose skipping ends with the stream
}

TEST(FormatsDataFile, AHundredMegabyteAttributeIsRefusedAndTheBuiltInTableServes) {
  const dex_test::TempDir folder;
  const std::string path = folder.writeRepeated(
      "huge.xml",
      "<?xml version=\"1.0\" encoding=\"utf-8\"?><IEFormatsData version=\"1.9\" useDataFromFile=\"true\">"
      "<IEFormats><IEFormat guid=\"{E653FE2B-C46A-400E-BA60-864A221BE19F}\" name=\"",
      std::string(1 << 20, 'N'), 100,
      "\"><DataTypes><POINTS/></DataTypes></IEFormat></IEFormats></IEFormatsData>");
  const std::unique_ptr<DexFormatsData> data = startFrom(path);
  EXPECT_TRUE(holdsTheBuiltInTable(*data));
  EXPECT_TRUE(isWrittenBuiltInTable(path));
}
