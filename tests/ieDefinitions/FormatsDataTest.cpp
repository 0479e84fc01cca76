// The process-wide registry: the built-in table, its lookups and its filters.
#include "ieDefinitions/IEFormatsData.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <string>
#include <thread>
#include <vector>

#include "ieDefinitions/detail/FormatsDataAccess.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::ie;
using Modes = DexFlags<DexCommonType::EUsingModes>;
using Names = std::vector<std::wstring>;

const std::wstring kSource = L"ieDefinitions\\IEFormatsData";
constexpr const wchar_t* kDrawingGuid = L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}";
constexpr const wchar_t* kLandXmlGuid = L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}";
constexpr const wchar_t* kUnknownGuid = L"{00000000-1111-2222-3333-444444444444}";

// No test of this program names a formats data file before the first getIEFormatsData().
const DexFormatsData& registry() {
  return getIEFormatsData();
}

Names namesOf(const vyn_vector<const DexDataType*>& types) {
  Names names;
  for (const DexDataType* type : types)
    names.emplace_back(type->getName().view());
  return names;
}

// The built-in table as the formats data file holds it, every field of every row and data kind but
// the two parameters without a word, compared with tests/data/formats/built_in_table.xml. A difference
// leaves the table written in the working folder (build/tests) for a look with diff.
TEST(BuiltInFormats, HoldTheTableOfTheFormatsDataFileGoldenCopy) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("built-in.xml");
  ASSERT_TRUE(detail::FormatsDataAccess::storeDataToTheFile(registry(), dex_test::widen(path).c_str()));
  const std::string written = dex_test::readFile(path);
  const std::string golden = dex_test::readFile(dex_test::dataFile("formats/built_in_table.xml"));
  if (written != golden) {
    std::ofstream("built_in_table.xml", std::ios::binary) << written;
    ADD_FAILURE()
        << "the built-in table differs from tests/data/formats/built_in_table.xml; see built_in_table.xml";
  }
  // The wordless parameters: 51 of LandXML and one more.
  int wordless = 0;
  for (unsigned int i = 0; i < registry().getNumberOfFormats(); ++i) {
    const DexFormat* format = registry().getFormatByIndex(i);
    wordless += format->isParameterSupported(DexFormat::BUILT_IN_PARAMETER_51) +
                format->isParameterSupported(DexFormat::BUILT_IN_PARAMETER_52);
  }
  EXPECT_EQ(2, wordless);
  EXPECT_TRUE(registry().getFormatById(kLandXmlGuid)->isParameterSupported(DexFormat::BUILT_IN_PARAMETER_51));
}

TEST(BuiltInFormats, HoldTwentyOneDataKindsAndOneHundredFiftyFourFormatsOnlyTwoOfWhichShareAGuid) {
  const DexFormatsData& first = registry();
  EXPECT_EQ(&first, &registry());
  ASSERT_EQ(154u, first.getNumberOfFormats());
  EXPECT_EQ(21u, first.getNumberOfDataTypes());
  std::map<std::wstring, std::vector<const DexFormat*>> byGuid;
  for (unsigned int i = 0; i < first.getNumberOfFormats(); ++i) {
    const DexFormat* format = first.getFormatByIndex(i);
    GUID parsed;
    ASSERT_EQ(S_OK, CLSIDFromString(format->getGuidAsString(), &parsed));
    EXPECT_TRUE(format->getGuid() == parsed && format->getGuid() != GUID{});
    byGuid[std::wstring(format->getGuidAsString().view())].push_back(format);
  }
  EXPECT_EQ(153u, byGuid.size());
  for (const auto& [guid, rows] : byGuid) {
    if (rows.size() == 1) continue;
    // The two 12d rows: lookups answer the import row, the first in the table.
    EXPECT_TRUE(rows[0]->getName() == L"12d ASCII (*.12da)" &&
                rows[0]->getDataDirections() == DexCommonType::IMPORT_ONLY);
    EXPECT_TRUE(rows[0] == first.getFormatById(guid.c_str()) &&
                rows[0] == first.getFormatByGuid(rows[1]->getGuid()));
    EXPECT_EQ(rows[0], first.getFormatByIndex(first.getIndexFormatById(guid.c_str())));
  }
  // Once the registry exists, naming a file changes nothing and creates no file.
  const dex_test::TempDir folder;
  const std::wstring fileName = folder.wfile("IEFormatsData.xml");
  intializeIEformatsDataFromFile(fileName.c_str());
  EXPECT_EQ(&first, &registry());
  EXPECT_FALSE(PathFileExistsW(fileName.c_str()));
}

TEST(DexFormatsData, FindsFormatsByIndexGuidAndExtensionAndLogsBadIndexesAndUnregisteredKinds) {
  const dex_test::LogCapture log;
  const DexFormat* drawing = registry().getFormatById(kDrawingGuid);
  ASSERT_NE(nullptr, drawing);
  EXPECT_EQ(L"AutoCAD Drawing (*.dwg)", drawing->getName());
  EXPECT_EQ(drawing, registry().getFormatById(L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}"));
  EXPECT_EQ(drawing, registry().getFormatByIndex(registry().getIndexFormatById(kDrawingGuid)));
  GUID unknown;
  ASSERT_EQ(S_OK, CLSIDFromString(kUnknownGuid, &unknown));
  EXPECT_TRUE(
      registry().getFormatByGuid(unknown) == nullptr && registry().getFormatById(kUnknownGuid) == nullptr &&
      registry().getFormatById(L"E1EE3440") == nullptr && registry().getFormatById(nullptr) == nullptr);
  // An unknown GUID has index zero like the first format.
  EXPECT_EQ(0u, registry().getIndexFormatById(kUnknownGuid) + registry().getIndexFormatById(nullptr));
  const DexFormat* dxf = registry().getFormatByExtension(L"DXF", false);  // the first dxf row, case ignored
  ASSERT_NE(nullptr, dxf);
  EXPECT_EQ(L"AutoCAD DXF (*.dxf)", dxf->getName());
  EXPECT_TRUE(dxf == registry().getFormatByExtension(L".DxF", true) &&
              registry().getFormatByExtension(L"dxf", true) == nullptr);
  EXPECT_TRUE(registry().getFormatByExtension(L".dxf", false) == nullptr &&
              registry().getFormatByExtension(L"nosuch", false) == nullptr);
  EXPECT_EQ(L"LandXML (*.xml)", registry().getFormatByExtension(L"XML", false)->getName());
  EXPECT_NE(nullptr, registry().getFormatByIndex(153));
  EXPECT_NE(nullptr, registry().getDataTypeById(POINTS));
  EXPECT_EQ(0u, log.size());
  EXPECT_TRUE(registry().getFormatByIndex(154) == nullptr && registry().getFormatByIndex(~0u) == nullptr);
  EXPECT_EQ(2, log.count(kSource, 1988));
  EXPECT_TRUE(registry().getDataTypeById(ROAD_STRINGS) == nullptr &&
              registry().getDataTypeById(STA_EQUATION_SETS) == nullptr &&
              registry().getDataTypeById(static_cast<EDexDataType>(40)) == nullptr);
  EXPECT_EQ(3, log.count(kSource, 2039));
  EXPECT_EQ(5u, log.size());
  EXPECT_TRUE(log.records().front().message.empty());
}

TEST(DexFormatsData, DataKindFiltersLeaveOutTheModeBoundKindsAndAppend) {
  vyn_vector<const DexDataType*> plain{nullptr};
  registry().getDataTypes(plain, DexCommonType::EXPORT_ONLY, {}, {});
  EXPECT_EQ(nullptr, plain.front());
  const Names names = namesOf(vyn_vector<const DexDataType*>(plain.begin() + 1, plain.end()));
  EXPECT_EQ(16u, names.size());
  for (const wchar_t* left : {L"Lines", L"Areas", L"Point Lists", L"Scanning Data", L"Parcels"})
    EXPECT_EQ(names.end(), std::find(names.begin(), names.end(), left)) << dex_test::narrow(left);
  vyn_vector<const DexDataType*> japanese;
  registry().getDataTypes(japanese, DexCommonType::EXPORT_ONLY, {}, DexCommonType::EXPORT_IN_JAPAN);
  const Names japaneseNames = namesOf(japanese);
  EXPECT_EQ((Names{L"Points", L"Lines", L"Areas", L"Point Lists"}),
            Names(japaneseNames.begin(), japaneseNames.begin() + 4));
  vyn_vector<const DexDataType*> japan;
  registry().getDataTypes(japan, DexCommonType::IMPORT_ONLY, DexCommonType::JAPAN, {});
  EXPECT_EQ((Names{L"Points", L"Code Library", L"Raw Data", L"Surfaces"}), namesOf(japan));
  // A query of no known direction passes every kind's direction, leaving a record for each.
  vyn_vector<const DexDataType*> all;
  const dex_test::LogCapture log;
  registry().getDataTypes(all, static_cast<DexCommonType::EDataDirections>(3), {},
                          Modes{DexCommonType::EXPORT_IN_JAPAN, DexCommonType::ONBOARD_WITH_SCANNING});
  EXPECT_EQ(21, log.count(L"ieDefinitions\\IEFormats", 62));
  EXPECT_EQ(21u, all.size());
}

TEST(DexFormatsData, FormatFiltersGiveTheIndexesThatPassInOrderAndAppend) {
  for (const auto direction :
       {DexCommonType::IMPORT_ONLY, DexCommonType::EXPORT_ONLY, DexCommonType::IMPORT_AND_EXPORT}) {
    for (const Modes modes : {Modes{}, Modes{DexCommonType::EXPORT_IN_JAPAN}}) {
      vyn_vector<int> found{-5};
      registry().getSupportedFormats(found, direction, DexCommonType::REGULAR, modes);
      vyn_vector<int> expected{-5};
      for (unsigned int i = 0; i < registry().getNumberOfFormats(); ++i)
        if (registry().getFormatByIndex(i)->compareCommonData(direction, DexCommonType::REGULAR, modes))
          expected.push_back(static_cast<int>(i));
      EXPECT_EQ(expected, found);
      EXPECT_GT(found.size(), 1u);
    }
  }
  vyn_vector<int> twoWay;
  registry().getSupportedFormats(twoWay, DexCommonType::IMPORT_AND_EXPORT, {},
                                 DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_EQ(98u, twoWay.size());
  vyn_vector<int> points{-7};
  registry().getSupportedFormatsByDataType(points, POINTS, DexCommonType::EXPORT_ONLY, {}, {});
  vyn_vector<int> exports;
  registry().getSupportedFormats(exports, DexCommonType::EXPORT_ONLY, {}, {});
  EXPECT_EQ(-7, points.front());
  EXPECT_LT(points.size(), exports.size());
  for (auto index = points.begin() + 1; index != points.end(); ++index) {
    EXPECT_TRUE(registry().getFormatByIndex(static_cast<unsigned int>(*index))->isDataTypeSupported(POINTS));
    EXPECT_NE(exports.end(), std::find(exports.begin(), exports.end(), *index));
  }
  // The kind's own direction is not consulted: Parcels is an import-only kind, yet exports carry it.
  vyn_vector<int> parcels;
  registry().getSupportedFormatsByDataType(parcels, PARCELS, DexCommonType::EXPORT_ONLY, {},
                                           DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_FALSE(parcels.empty());
  // An unregistered kind has no formats although formats carry it.
  const dex_test::LogCapture log;
  vyn_vector<int> roadStrings;
  registry().getSupportedFormatsByDataType(roadStrings, ROAD_STRINGS, DexCommonType::IMPORT_ONLY, {},
                                           DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_TRUE(roadStrings.empty());
  EXPECT_EQ(1, log.count(kSource, 2039));
  EXPECT_TRUE(registry().getFormatById(kLandXmlGuid)->isDataTypeSupported(ROAD_STRINGS));
  // The one format without a configuration is found only by queries naming none.
  vyn_vector<int> any;
  registry().getSupportedFormats(any, DexCommonType::IMPORT_ONLY, {}, DexCommonType::EXPORT_IN_JAPAN);
  vyn_vector<int> regular;
  registry().getSupportedFormats(regular, DexCommonType::IMPORT_ONLY, DexCommonType::REGULAR,
                                 DexCommonType::EXPORT_IN_JAPAN);
  int withoutConfiguration = 0;
  for (const int index : any) {
    if (!registry().getFormatByIndex(static_cast<unsigned int>(index))->getConfigurations().isEmpty())
      continue;
    ++withoutConfiguration;
    EXPECT_EQ(regular.end(), std::find(regular.begin(), regular.end(), index));
  }
  EXPECT_EQ(1, withoutConfiguration);
}

TEST(DexFormatsData, IsReadFromManyThreadsAtOnce) {
  std::vector<std::thread> readers;
  std::vector<unsigned int> counts(4, 0);
  for (std::size_t i = 0; i < counts.size(); ++i) {
    readers.emplace_back([&counts, i] {
      for (int round = 0; round < 50; ++round) {
        vyn_vector<int> found;
        registry().getSupportedFormatsByDataType(found, POINTS, DexCommonType::EXPORT_ONLY, {}, {});
        counts[i] = static_cast<unsigned int>(found.size());
      }
    });
  }
  for (std::thread& reader : readers)
    reader.join();
  EXPECT_GT(counts[0], 0u);
  EXPECT_TRUE(
      std::all_of(counts.begin(), counts.end(), [&counts](unsigned int n) { return n == counts[0]; }));
}

}  // namespace
