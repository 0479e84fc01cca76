// Registries started from formats data files, each built apart from the process-wide one.
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "ieDefinitions/IEFormatsData.h"
#include "ieDefinitions/detail/FormatsDataAccess.h"
#include "support/CommaLocale.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::ie;
using Access = vyn::ie::detail::FormatsDataAccess;
using namespace std::string_literals;

const std::wstring kSource = L"ieDefinitions\\IEFormatsData";

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

const DexFormatsData& builtIn() {
  return getIEFormatsData();
}

std::unique_ptr<DexFormatsData> startFrom(const std::string& path) {
  return Access::create(dex_test::widen(path).c_str());
}

// Every field of every format as one text, the wordless parameters 51 and 52 left out.
std::wstring contentOf(const DexFormatsData& data, unsigned int first = 0, unsigned int count = ~0u) {
  std::wstring text;
  for (unsigned int i = first; i < data.getNumberOfFormats() && i - first < count; ++i) {
    const DexFormat& f = *data.getFormatByIndex(i);
    DexFlags<DexFormat::EParameterName> parameters = f.getParameters();
    parameters.remove(DexFormat::BUILT_IN_PARAMETER_51).remove(DexFormat::BUILT_IN_PARAMETER_52);
    text +=
        std::wstring(f.getGuidAsString().view()) + L"|" + std::wstring(f.getName().view()) + L"|" +
        std::to_wstring(f.getDataDirections()) + L"|" + std::wstring(f.getDllName(true).view()) + L"|" +
        std::wstring(f.getDllName(false).view()) + L"|" + std::wstring(f.getTitle().view()) + L"|" +
        std::wstring(f.getExtension(false).view()) + L"|" + std::wstring(f.getFilterExtension().view()) +
        L"|" + std::to_wstring(f.getConfigurations().getMask()) + L"|" +
        std::to_wstring(f.getUsingModes().getMask()) + L"|" + std::to_wstring(f.getDataTypes().getMask()) +
        L"|" + std::to_wstring(f.getDistanceUnits().getMask()) + L"|" +
        std::to_wstring(f.getAngleUnits().getMask()) + L"|" + std::to_wstring(parameters.getMask()) + L"\n";
  }
  return text;
}

bool holdsTheBuiltInTable(const DexFormatsData& data) {
  return data.getNumberOfFormats() == 154 && contentOf(data) == contentOf(builtIn());
}

// True when the file holds the built-in table as the library writes it.
bool isWrittenBuiltInTable(const std::string& path) {
  const std::wstring written = utf16Text(dex_test::readFile(path));
  return written.find(L"<IEFormatsData version=\"1.9\" useDataFromFile=\"false\" numberOfFormats=\"154\">") !=
             std::wstring::npos &&
         written.find(L"name=\"Customizable ASCII Point Files") != std::wstring::npos;
}

// The built-in table written to a file in folder, switched to be used.
std::wstring switchedBuiltInTable(const dex_test::TempDir& folder) {
  const std::string path = folder.file("built-in.xml");
  EXPECT_TRUE(Access::storeDataToTheFile(builtIn(), dex_test::widen(path).c_str()));
  return replaced(utf16Text(dex_test::readFile(path)), L"useDataFromFile=\"false\"",
                  L"useDataFromFile=\"true\"");
}

// What loadDataFromFile alone makes of a file, on a registry without formats: "loaded store formats".
std::string loadOnly(const std::string& path) {
  std::unique_ptr<DexFormatsData> data = Access::create(L"");
  Access::clearFormats(*data);
  bool storeFile = false;
  const bool loaded = Access::loadDataFromFile(*data, dex_test::widen(path).c_str(), storeFile);
  return std::to_string(loaded) + " " + std::to_string(storeFile) + " " +
         std::to_string(data->getNumberOfFormats());
}

TEST(FormatsDataFile, AMissingFileIsWrittenWithTheBuiltInTableAndNeitherUsedNorRewrittenNextTime) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("IEFormatsData.xml");
  const dex_test::LogCapture log;
  EXPECT_TRUE(holdsTheBuiltInTable(*startFrom(path)));
  const std::string bytes = dex_test::readFile(path);
  EXPECT_EQ("\xFF\xFE<\0?\0"s, bytes.substr(0, 6));
  const std::wstring written = utf16Text(bytes);
  EXPECT_EQ(0u, written.rfind(
                    L"<?xml version=\"1.0\" encoding=\"utf-16\"?>\r\n"
                    L"<IEFormatsData version=\"1.9\" useDataFromFile=\"false\" numberOfFormats=\"154\">\r\n",
                    0));
  for (std::size_t at = written.find(L'\n'); at != std::wstring::npos; at = written.find(L'\n', at + 1))
    ASSERT_EQ(L'\r', written[at - 1]) << at;  // every line ends in CR LF, the last one included
  EXPECT_EQ(L"</IEFormatsData>\r\n", written.substr(written.size() - 18));
  EXPECT_NE(std::wstring::npos,
            written.find(
                L"<IEFormat guid=\"{C144E2ED-E0F1-4B21-ACEC-9D5FB675621A}\" name=\"MapInfo (*.mif)\" "
                L"directionType=\"ImportExport\" importDLL=\"ImportParsers\" exportDLL=\"ExportParsers\" "
                L"titleForVerticalScreen=\"MIF\" extension=\"mif\" filterExtension=\"MIF Files (*.mif)|\">"));
  EXPECT_NE(std::wstring::npos,
            written.find(L"<PREDEFINED_CODE_WITH_ATTRS_EXP/>"));  // the current word of 18
  EXPECT_EQ(std::wstring::npos, written.find(L"PREDEFINED_CODE_STYLE_EXP"));
  EXPECT_EQ(2, log.count(kSource, 2360));  // parameters 51 and 52 have no word: logged and left out
  EXPECT_EQ(2u, log.size());
  // An administrator edits a name but leaves useDataFromFile as written: the file is left alone.
  const std::string edited = utf16File(replaced(written, L"name=\"MapInfo (*.mif)\"", L"name=\"Edited\""));
  folder.write("IEFormatsData.xml", edited);
  EXPECT_TRUE(holdsTheBuiltInTable(*startFrom(path)));
  EXPECT_EQ(edited, dex_test::readFile(path));
  EXPECT_EQ("0 0 0", loadOnly(path));
}

TEST(FormatsDataFile, AFileThatCannotBeWrittenOrIsAFolderLeavesTheBuiltInTable) {
  const dex_test::TempDir folder;
  const std::string inMissingFolder = folder.file("missing/IEFormatsData.xml");
  const std::unique_ptr<DexFormatsData> data = startFrom(inMissingFolder);
  EXPECT_TRUE(holdsTheBuiltInTable(*data));
  EXPECT_FALSE(PathFileExistsW(dex_test::widen(inMissingFolder).c_str()));
  EXPECT_FALSE(Access::storeDataToTheFile(*data, dex_test::widen(inMissingFolder).c_str()) ||
               Access::storeDataToTheFile(*data, L""));
  EXPECT_TRUE(holdsTheBuiltInTable(*startFrom(folder.path())));
}

TEST(FormatsDataFile, ValuesWithoutAWordAreLoggedAndLeftOutAndWhatWasWrittenReadsBack) {
  const dex_test::TempDir folder;
  std::unique_ptr<DexFormatsData> data = Access::create(L"");
  Access::clearFormats(*data);
  GUID guid;
  ASSERT_EQ(S_OK, CLSIDFromString(L"{0F3B6E2A-77C4-4D5B-8E1F-2A9C6D4B3E58}", &guid));
  Access::appendFormat(*data, nullptr);
  Access::appendFormat(
      *data,
      new DexFormat(guid, L"Odd <values> & more", DexCommonType::EXPORT_ONLY, L"ExportParsers", L"", L"Odd",
                    L"odd", L"",
                    {DexCommonType::REGULAR, static_cast<DexCommonType::ESupportedConfigurations>(5)},
                    static_cast<DexCommonType::EUsingModes>(2), {POINTS, static_cast<EDexDataType>(23)},
                    static_cast<EDistUnits>(28), static_cast<EAngleUnits>(6),
                    {DexFormat::PHOTO_NOTES, DexFormat::BUILT_IN_PARAMETER_52,
                     static_cast<DexFormat::EParameterName>(60)}));
  const std::string path = folder.file("odd.xml");
  const dex_test::LogCapture log;
  EXPECT_TRUE(Access::storeDataToTheFile(*data, dex_test::widen(path).c_str()));
  for (const int line : {2117, 2161, 2179, 2217, 2265, 2292})
    EXPECT_EQ(1, log.count(kSource, line)) << line;
  EXPECT_EQ(2, log.count(kSource, 2360));
  EXPECT_EQ(8u, log.size());
  const std::wstring written = utf16Text(dex_test::readFile(path));
  EXPECT_NE(std::wstring::npos, written.find(L"numberOfFormats=\"2\""));
  EXPECT_NE(std::wstring::npos, written.find(L"name=\"Odd &lt;values&gt; &amp; more\""));
  // A set whose members all lack a word is written empty; a unit set keeps its "used" attribute.
  for (const wchar_t* part :
       {L"<UsingModes/>", L"<DistanceUnits used=\"true\"/>", L"<AngeUnits used=\"true\"/>",
        L"<Parameters>\r\n        <PHOTO_NOTES/>\r\n      </Parameters>"})
    EXPECT_NE(std::wstring::npos, written.find(part)) << dex_test::narrow(part);
  const std::string switched =
      folder.write("switched.xml",
                   utf16File(replaced(written, L"useDataFromFile=\"false\"", L"useDataFromFile=\"true\"")));
  const std::unique_ptr<DexFormatsData> reread = startFrom(switched);
  ASSERT_EQ(1u, reread->getNumberOfFormats());
  EXPECT_EQ(std::wstring(L"{0F3B6E2A-77C4-4D5B-8E1F-2A9C6D4B3E58}|Odd <values> & more|") +
                std::to_wstring(DexCommonType::EXPORT_ONLY) + L"|ExportParsers||Odd|odd||1|0|1|0|0|" +
                std::to_wstring(DexFlags<DexFormat::EParameterName>(DexFormat::PHOTO_NOTES).getMask()) +
                L"\n",
            contentOf(*reread));
}

TEST(FormatsDataFile, AFileSwitchedToBeUsedInUtf16OrUtf8GivesBackTheSameFormatsAndIsNotRewritten) {
  const dex_test::TempDir folder;
  const std::wstring switched = switchedBuiltInTable(folder);
  for (const std::string& bytes :
       {utf16File(switched),
        vyn_text::toUtf8(replaced(switched, L"encoding=\"utf-16\"", L"encoding=\"utf-8\""))}) {
    const std::string path = folder.write("IEFormatsData.xml", bytes);
    const dex_test::LogCapture log;
    const std::unique_ptr<DexFormatsData> fromFile = startFrom(path);
    EXPECT_EQ(0u, log.size());
    EXPECT_EQ(contentOf(builtIn()), contentOf(*fromFile));
    EXPECT_FALSE(fromFile->getFormatById(L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}")
                     ->isParameterSupported(DexFormat::BUILT_IN_PARAMETER_51));
    EXPECT_EQ(bytes, dex_test::readFile(path));
    EXPECT_EQ(21u, fromFile->getNumberOfDataTypes());  // the data kinds always come from the built-in table
  }
}

TEST(FormatsDataFile, AnEditedFileReplacesTheBuiltInTable) {
  const dex_test::TempDir folder;
  const std::string utf8 = folder.write("two.xml", fixture("two_formats_used.xml"));
  const std::string utf16 =
      folder.write("two16.xml", utf16File(replaced(dex_test::widen(fixture("two_formats_used.xml")),
                                                   L"encoding=\"utf-8\"", L"encoding=\"utf-16\"")));
  const unsigned int mapInfo = builtIn().getIndexFormatById(L"{C144E2ED-E0F1-4b21-ACEC-9D5FB675621A}");
  for (const std::string& path : {utf8, utf16}) {
    const std::string before = dex_test::readFile(path);
    const dex_test::LogCapture log;
    const std::unique_ptr<DexFormatsData> data = startFrom(path);
    EXPECT_EQ(0u, log.size());
    ASSERT_EQ(2u, data->getNumberOfFormats());
    EXPECT_EQ(contentOf(builtIn(), mapInfo, 1), contentOf(*data, 0, 1));
    // "export" with the case ignored, a missing import library, JAPAN, the older word of parameter 18.
    const DexFlags<DexFormat::EParameterName> parameters{DexFormat::MULTIPLE_FILES_EXP,
                                                         DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP};
    EXPECT_EQ(std::wstring(L"{5D8A2C71-0B44-4E0F-9A36-7C1E2B9F4D10}|Site Points & Codes (*.spc)|") +
                  std::to_wstring(DexCommonType::EXPORT_ONLY) +
                  L"|SitePlugin||SPC|spc|SPC Files (*.spc)||4|1|" +
                  std::to_wstring(DexFlags<EDexDataType>{POINTS, CODES}.getMask()) + L"|" +
                  std::to_wstring(DexFlags<EDistUnits>{EDistUnits::METERS, EDistUnits::USFEET}.getMask()) +
                  L"|" + std::to_wstring(DexFlags<EAngleUnits>(EAngleUnits::DDDMMSSS).getMask()) + L"|" +
                  std::to_wstring(parameters.getMask()) + L"\n",
              contentOf(*data, 1));
    EXPECT_EQ(before, dex_test::readFile(path));
  }
  std::string newer = fixture("two_formats_used.xml");  // a newer version is read
  newer.replace(newer.find("version=\"1.9\""), 13, "version=\"2.10\"");
  EXPECT_EQ("1 1 2", loadOnly(folder.write("newer.xml", newer)));
}

TEST(FormatsDataFile, UnreadableFilesAreReplacedWithTheBuiltInTableAndUnusedOnesLeftAlone) {
  const dex_test::TempDir folder;
  const std::wstring written = switchedBuiltInTable(folder);
  std::string noUsableGuid = fixture("formats_without_usable_guid.xml");
  noUsableGuid.replace(noUsableGuid.find("{0F3B"), 1, "(");
  const std::string unreadable[] = {
      "",
      "P1,1000.0,2000.0,55.2,TREE\r\nP2,1001.0,2001.0,55.4,TREE\r\n",
      std::string("\x00\x01\x02\xFF\xFE\x00", 6),
      "<?xml version=\"1.0\"?><FieldBook version=\"2.0\" useDataFromFile=\"true\"/>",
      "<IEFormats/>",
      fixture("latin1_declared.xml"),
      fixture("version_1_8.xml"),
      utf16File(replaced(written, L"version=\"1.9\" use", L"version=\"1.8\" use")),
      "<IEFormatsData useDataFromFile=\"true\"><IEFormats/></IEFormatsData>",
      "<IEFormatsData version=\"new\" useDataFromFile=\"true\"/>",
      "<IEFormatsData version=\"nan\" useDataFromFile=\"true\"/>",
      noUsableGuid,
      "<IEFormatsData version=\"1.9\" useDataFromFile=\"true\"/>",
      vyn_text::toUtf8(written),
      utf16File(written.substr(0, written.find(L"</IEFormat>")))};
  for (const std::string& bytes : unreadable) {
    const std::string path = folder.write("bad.xml", bytes);
    EXPECT_EQ("0 1 0", loadOnly(path)) << bytes.substr(0, 80);
    EXPECT_TRUE(holdsTheBuiltInTable(*startFrom(path)));
    EXPECT_TRUE(isWrittenBuiltInTable(path));
  }
  const std::string usable = fixture("two_formats_used.xml");
  for (const std::string& bytes :
       {std::string(usable).replace(usable.find("\"true\""), 6, "\"TRUE\""),
        std::string(usable).replace(usable.find(" useDataFromFile=\"true\""), 23, ""),
        "<IEFormatsData version=\"2.0\" useDataFromFile=\"false\"/>"s}) {
    const std::string path = folder.write("kept.xml", bytes);
    EXPECT_EQ("0 0 0", loadOnly(path)) << bytes.substr(0, 160);
    EXPECT_TRUE(holdsTheBuiltInTable(*startFrom(path)));
    EXPECT_EQ(bytes, dex_test::readFile(path));
  }
}

TEST(FormatsDataFile, SkipsFormatsWithoutAUsableGuidAndLogsEachUnknownWord) {
  const dex_test::TempDir folder;
  const std::string guids = folder.write("guids.xml", fixture("formats_without_usable_guid.xml"));
  const dex_test::LogCapture log;
  const std::unique_ptr<DexFormatsData> kept = startFrom(guids);
  ASSERT_EQ(1u, kept->getNumberOfFormats());
  EXPECT_EQ(L"Kept (*.kpt)", kept->getFormatByIndex(0)->getName());
  EXPECT_EQ(0u, log.size());
  const std::unique_ptr<DexFormatsData> data =
      startFrom(folder.write("words.xml", fixture("unknown_words.xml")));
  ASSERT_EQ(1u, data->getNumberOfFormats());
  // OFFICE (CONTRACTOR is dropped silently), EXPORT_IN_FRANCE, points (words are case-sensitive),
  // Colour with its content, FURLONGS, DEGREES, MULTIPLE_STATION_POINTS.
  for (const int line : {2506, 2519, 2552, 2486, 2591, 2607, 2668})
    EXPECT_EQ(1, log.count(kSource, line)) << line;
  EXPECT_EQ(7u, log.size());
  const DexFormat* format = data->getFormatByIndex(0);
  EXPECT_EQ(
      std::wstring(format->getGuidAsString().view()) + L"|" + std::wstring(format->getName().view()) + L"|" +
          std::to_wstring(DexCommonType::IMPORT_AND_EXPORT) + L"|" +
          std::wstring(format->getDllName(true).view()) + L"|" +
          std::wstring(format->getDllName(false).view()) + L"|" + std::wstring(format->getTitle().view()) +
          L"|" + std::wstring(format->getExtension(false).view()) + L"|" +
          std::wstring(format->getFilterExtension().view()) +
          L"|1|1|1|1|" +  // the "used" attribute is not read
          std::to_wstring(DexFlags<EAngleUnits>(EAngleUnits::DECDEG).getMask()) + L"|" +
          std::to_wstring(
              DexFlags<DexFormat::EParameterName>(DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP).getMask()) +
          L"\n",
      contentOf(*data));
}

TEST(FormatsDataFile, ATruncatedFileGivesTheFormatsReadCompletelyBeforeTheCut) {
  const dex_test::TempDir folder;
  const std::wstring whole = switchedBuiltInTable(folder);
  const std::size_t cut = whole.find(L"<AngeUnits", whole.size() / 2);  // inside a format element
  ASSERT_NE(std::wstring::npos, cut);
  for (const bool oddByte : {false, true}) {
    const std::string bytes = utf16File(whole.substr(0, cut)) + (oddByte ? "<" : "");
    const std::string path = folder.write("cut.xml", bytes);
    const std::unique_ptr<DexFormatsData> data = startFrom(path);
    const unsigned int count = data->getNumberOfFormats();
    EXPECT_TRUE(count > 0 && count < 154);
    EXPECT_EQ(contentOf(builtIn(), 0, count), contentOf(*data));
    std::size_t elementEnd = 0;  // every format that ends before the cut is offered, the one cut off is not
    for (unsigned int i = 0; i < count; ++i)
      elementEnd = whole.find(L"</IEFormat>", elementEnd) + 1;
    EXPECT_TRUE(elementEnd < cut && whole.find(L"</IEFormat>", elementEnd) > cut);
    EXPECT_EQ(bytes, dex_test::readFile(path));
  }
}

TEST(FormatsDataFile, HostileFilesAreDroppedAndTheBuiltInTableServes) {
  const dex_test::TempDir folder;
  const std::string head =
      "<?xml version=\"1.0\" encoding=\"utf-8\"?><IEFormatsData version=\"1.9\" useDataFromFile=\"true\">"
      "<IEFormats><IEFormat guid=\"{E653FE2B-C46A-400E-BA60-864A221BE19F}\" name=\"";
  std::string closing;
  for (int i = 0; i < 10000; ++i)
    closing += "</Extra>";
  const dex_test::LogCapture log;
  const std::string deep = folder.writeRepeated("deep.xml", head + "Deep\">", "<Extra>", 10000,
                                                closing + "</IEFormat></IEFormats></IEFormatsData>");
  const std::string huge =
      folder.writeRepeated("huge.xml", head, std::string(1 << 20, 'N'), 100,
                           "\"><DataTypes><POINTS/></DataTypes></IEFormat></IEFormats></IEFormatsData>");
  for (const std::string& path : {deep, huge}) {
    EXPECT_TRUE(holdsTheBuiltInTable(*startFrom(path)));
    EXPECT_TRUE(isWrittenBuiltInTable(path));
  }
  EXPECT_EQ(1, log.count(kSource, 2486));  // the unknown child, whose skipping ends with the stream
}

TEST(FormatsDataFile, TheVersionIsReadWithAPointWhateverTheLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  const dex_test::TempDir folder;
  EXPECT_EQ("1 1 2", loadOnly(folder.write("two.xml", fixture("two_formats_used.xml"))));
}

}  // namespace
