#include "ieDefinitions/IEFormatsData.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <thread>
#include <vector>

#include "support/LogCapture.h"
#include "support/TempDir.h"

using vyn::ie::DexCommonType;
using vyn::ie::DexDataType;
using vyn::ie::DexFlags;
using vyn::ie::DexFormat;
using vyn::ie::DexFormatsData;

namespace {

using Configurations = DexFlags<DexCommonType::ESupportedConfigurations>;
using Modes = DexFlags<DexCommonType::EUsingModes>;

const std::wstring kSource = L"ieDefinitions\\IEFormatsData";
constexpr const wchar_t* kDrawingGuid = L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}";
constexpr const wchar_t* kUnknownGuid = L"{00000000-1111-2222-3333-444444444444}";

// The process-wide registry of this test program is always the built-in one: no test here names a
// formats data file before the first getIEFormatsData().
const DexFormatsData& registry() {
  return vyn::ie::getIEFormatsData();
}

std::wstring text(const CVynStringT<wchar_t>& value) {
  return std::wstring(value.view());
}

std::vector<std::wstring> namesOf(const vyn_vector<const DexDataType*>& types) {
  std::vector<std::wstring> names;
  for (const DexDataType* type : types)
    names.push_back(text(type->getName()));
  return names;
}

bool contains(const std::vector<std::wstring>& names, const wchar_t* name) {
  return std::find(names.begin(), names.end(), name) != names.end();
}

}  // namespace

// ---- The process-wide registry ------------------------------------------------------------------

TEST(FormatsDataSingleton, WithoutAFileHoldsTheBuiltInTableAndWritesNothing) {
  const dex_test::TempDir folder;
  const DexFormatsData& first = registry();
  EXPECT_EQ(&first, &registry());
  EXPECT_EQ(154u, first.getNumberOfFormats());
  EXPECT_EQ(21u, first.getNumberOfDataTypes());

  // Once the registry exists, naming a file changes nothing and creates no file.
  const std::string fileName = folder.file("IEFormatsData.xml");
  vyn::ie::intializeIEformatsDataFromFile(dex_test::widen(fileName).c_str());
  vyn::ie::intializeIEformatsDataFromFile(dex_test::widen(fileName).c_str());
  EXPECT_EQ(&first, &registry());
  EXPECT_EQ(154u, registry().getNumberOfFormats());
  EXPECT_FALSE(PathFileExistsW(dex_test::widen(fileName).c_str()));
}

TEST(FormatsDataSingleton, IsReadFromManyThreadsAtOnce) {
  std::vector<std::thread> readers;
  std::vector<unsigned int> counts(4, 0);
  for (std::size_t i = 0; i < counts.size(); ++i) {
    readers.emplace_back([&counts, i] {
      for (int round = 0; round < 50; ++round) {
        vyn_vector<int> found;
        registry().getSupportedFormatsByDataType(found, vyn::ie::POINTS, DexCommonType::EXPORT_ONLY, {}, {});
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

// ---- Lookups ------------------------------------------------------------------------------------

TEST(DexFormatsData, AnIndexPastTheEndAnswersNullAndIsLogged) {
  const dex_test::LogCapture log;
  EXPECT_NE(nullptr, registry().getFormatByIndex(0));
  EXPECT_NE(nullptr, registry().getFormatByIndex(153));
  EXPECT_EQ(0u, log.size());
  EXPECT_EQ(nullptr, registry().getFormatByIndex(154));
  EXPECT_EQ(nullptr, registry().getFormatByIndex(~0u));
  EXPECT_EQ(2, log.count(kSource, 1988));
  EXPECT_EQ(2u, log.size());
  EXPECT_TRUE(log.records().front().message.empty());
}

TEST(DexFormatsData, FindsFormatsByGuidAndGuidText) {
  const dex_test::LogCapture log;
  const DexFormat* drawing = registry().getFormatById(kDrawingGuid);
  ASSERT_NE(nullptr, drawing);
  EXPECT_EQ(L"AutoCAD Drawing (*.dwg)", text(drawing->getName()));
  EXPECT_EQ(drawing, registry().getFormatById(L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}"));
  EXPECT_EQ(drawing, registry().getFormatByGuid(drawing->getGuid()));
  EXPECT_EQ(drawing, registry().getFormatByIndex(registry().getIndexFormatById(kDrawingGuid)));

  GUID unknown;
  ASSERT_EQ(S_OK, CLSIDFromString(kUnknownGuid, &unknown));
  EXPECT_EQ(nullptr, registry().getFormatByGuid(unknown));
  EXPECT_EQ(nullptr, registry().getFormatById(kUnknownGuid));
  EXPECT_EQ(nullptr, registry().getFormatById(L"E1EE3440"));
  EXPECT_EQ(nullptr, registry().getFormatById(L""));
  EXPECT_EQ(nullptr, registry().getFormatById(nullptr));
  EXPECT_EQ(0u, log.size());
}

TEST(DexFormatsData, AnUnknownGuidHasIndexZeroLikeTheFirstFormat) {
  const dex_test::LogCapture log;
  EXPECT_EQ(0u, registry().getIndexFormatById(kUnknownGuid));
  EXPECT_EQ(0u, registry().getIndexFormatById(L"not a guid"));
  EXPECT_EQ(0u, registry().getIndexFormatById(nullptr));
  EXPECT_EQ(0u, registry().getIndexFormatById(registry().getFormatByIndex(0)->getGuidAsString()));
  EXPECT_EQ(0u, log.size());
}

TEST(DexFormatsData, FindsFormatsByExtensionIgnoringCase) {
  const DexFormat* dxf = registry().getFormatByExtension(L"DXF", false);
  ASSERT_NE(nullptr, dxf);
  EXPECT_EQ(L"AutoCAD DXF (*.dxf)", text(dxf->getName()));
  EXPECT_EQ(nullptr, registry().getFormatByExtension(L"dxf", true));
  EXPECT_EQ(dxf, registry().getFormatByExtension(L".dxf", true));
  EXPECT_EQ(nullptr, registry().getFormatByExtension(L".dxf", false));
  EXPECT_EQ(nullptr, registry().getFormatByExtension(L"nosuch", false));
  const DexFormat* landXml = registry().getFormatByExtension(L"XML", false);
  ASSERT_NE(nullptr, landXml);
  EXPECT_EQ(L"LandXML (*.xml)", text(landXml->getName()));
}

TEST(DexFormatsData, AnUnregisteredDataKindAnswersNullAndIsLogged) {
  const dex_test::LogCapture log;
  const DexDataType* points = registry().getDataTypeById(vyn::ie::POINTS);
  ASSERT_NE(nullptr, points);
  EXPECT_EQ(L"Points", text(points->getName()));
  EXPECT_EQ(0u, log.size());
  EXPECT_EQ(nullptr, registry().getDataTypeById(vyn::ie::ROAD_STRINGS));
  EXPECT_EQ(nullptr, registry().getDataTypeById(vyn::ie::STA_EQUATION_SETS));
  EXPECT_EQ(nullptr, registry().getDataTypeById(static_cast<vyn::ie::EDexDataType>(40)));
  EXPECT_EQ(3, log.count(kSource, 2039));
  EXPECT_EQ(3u, log.size());
}

// ---- Filters ------------------------------------------------------------------------------------

TEST(DexFormatsData, ExportDataKindsWithoutModesLeaveOutTheModeBoundKinds) {
  vyn_vector<const DexDataType*> plain;
  registry().getDataTypes(plain, DexCommonType::EXPORT_ONLY, {}, {});
  const std::vector<std::wstring> names = namesOf(plain);
  EXPECT_FALSE(contains(names, L"Lines"));
  EXPECT_FALSE(contains(names, L"Areas"));
  EXPECT_FALSE(contains(names, L"Point Lists"));
  EXPECT_FALSE(contains(names, L"Scanning Data"));
  EXPECT_FALSE(contains(names, L"Parcels"));  // import only
  EXPECT_TRUE(contains(names, L"Points"));
  EXPECT_TRUE(contains(names, L"Field Reports"));
  EXPECT_EQ(16u, names.size());

  vyn_vector<const DexDataType*> japanese;
  registry().getDataTypes(japanese, DexCommonType::EXPORT_ONLY, {}, DexCommonType::EXPORT_IN_JAPAN);
  const std::vector<std::wstring> japaneseNames = namesOf(japanese);
  EXPECT_TRUE(contains(japaneseNames, L"Lines"));
  EXPECT_TRUE(contains(japaneseNames, L"Areas"));
  EXPECT_TRUE(contains(japaneseNames, L"Point Lists"));
  EXPECT_FALSE(contains(japaneseNames, L"Scanning Data"));
  EXPECT_EQ(std::vector<std::wstring>({L"Points", L"Lines", L"Areas", L"Point Lists"}),
            std::vector<std::wstring>(japaneseNames.begin(), japaneseNames.begin() + 4));
}

TEST(DexFormatsData, DataKindsOfAConfigurationAreThoseOfferedThere) {
  vyn_vector<const DexDataType*> japan;
  registry().getDataTypes(japan, DexCommonType::IMPORT_ONLY, DexCommonType::JAPAN, {});
  EXPECT_EQ(std::vector<std::wstring>({L"Points", L"Code Library", L"Raw Data", L"Surfaces"}),
            namesOf(japan));
}

TEST(DexFormatsData, FiltersAppendToWhatTheCallerHolds) {
  vyn_vector<const DexDataType*> types{nullptr};
  registry().getDataTypes(types, DexCommonType::IMPORT_ONLY, {}, {});
  ASSERT_GT(types.size(), 1u);
  EXPECT_EQ(nullptr, types.front());

  vyn_vector<int> indexes{-5};
  registry().getSupportedFormats(indexes, DexCommonType::IMPORT_ONLY, {}, {});
  ASSERT_GT(indexes.size(), 1u);
  EXPECT_EQ(-5, indexes.front());

  vyn_vector<int> byType{-7};
  registry().getSupportedFormatsByDataType(byType, vyn::ie::POINTS, DexCommonType::IMPORT_ONLY, {}, {});
  ASSERT_GT(byType.size(), 1u);
  EXPECT_EQ(-7, byType.front());
}

TEST(DexFormatsData, SupportedFormatsAreTheIndexesThatPassTheFilterInOrder) {
  const Configurations regular{DexCommonType::REGULAR};
  for (const auto direction :
       {DexCommonType::IMPORT_ONLY, DexCommonType::EXPORT_ONLY, DexCommonType::IMPORT_AND_EXPORT}) {
    for (const Modes modes : {Modes{}, Modes{DexCommonType::EXPORT_IN_JAPAN}}) {
      vyn_vector<int> found;
      registry().getSupportedFormats(found, direction, regular, modes);
      vyn_vector<int> expected;
      for (unsigned int i = 0; i < registry().getNumberOfFormats(); ++i) {
        if (registry().getFormatByIndex(i)->compareCommonData(direction, regular, modes))
          expected.push_back(static_cast<int>(i));
      }
      EXPECT_EQ(expected, found);
      EXPECT_FALSE(found.empty());
    }
  }
  // The two-way rows are exactly those an import-and-export query finds without modes or
  // configurations, bar the ones restricted to a using mode.
  vyn_vector<int> twoWay;
  registry().getSupportedFormats(twoWay, DexCommonType::IMPORT_AND_EXPORT, {},
                                 DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_EQ(98u, twoWay.size());
}

TEST(DexFormatsData, TheFormatWithoutConfigurationIsFoundOnlyByQueriesNamingNone) {
  vyn_vector<int> any;
  registry().getSupportedFormats(any, DexCommonType::IMPORT_ONLY, {}, DexCommonType::EXPORT_IN_JAPAN);
  vyn_vector<int> regular;
  registry().getSupportedFormats(regular, DexCommonType::IMPORT_ONLY, DexCommonType::REGULAR,
                                 DexCommonType::EXPORT_IN_JAPAN);
  vyn_vector<int> onboardOnly;
  registry().getSupportedFormats(onboardOnly, DexCommonType::IMPORT_ONLY, DexCommonType::ONBOARD,
                                 DexCommonType::EXPORT_IN_JAPAN);
  int withoutConfiguration = 0;
  for (const int index : any) {
    const DexFormat* format = registry().getFormatByIndex(static_cast<unsigned int>(index));
    if (!format->getConfigurations().isEmpty()) continue;
    ++withoutConfiguration;
    EXPECT_EQ(regular.end(), std::find(regular.begin(), regular.end(), index));
    EXPECT_EQ(onboardOnly.end(), std::find(onboardOnly.begin(), onboardOnly.end(), index));
  }
  EXPECT_EQ(1, withoutConfiguration);
}

TEST(DexFormatsData, FormatsByDataKindCarryTheKindAndPassTheFilter) {
  vyn_vector<int> points;
  registry().getSupportedFormatsByDataType(points, vyn::ie::POINTS, DexCommonType::EXPORT_ONLY, {}, {});
  vyn_vector<int> exports;
  registry().getSupportedFormats(exports, DexCommonType::EXPORT_ONLY, {}, {});
  ASSERT_FALSE(points.empty());
  EXPECT_LT(points.size(), exports.size());
  EXPECT_TRUE(std::is_sorted(points.begin(), points.end()));
  for (const int index : points) {
    const DexFormat* format = registry().getFormatByIndex(static_cast<unsigned int>(index));
    EXPECT_TRUE(format->isDataTypeSupported(vyn::ie::POINTS));
    EXPECT_NE(exports.end(), std::find(exports.begin(), exports.end(), index));
  }
  // The kind's own direction is not consulted: Parcels is an import-only kind, yet exports carry it.
  vyn_vector<int> parcels;
  registry().getSupportedFormatsByDataType(parcels, vyn::ie::PARCELS, DexCommonType::EXPORT_ONLY, {},
                                           DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_FALSE(parcels.empty());
}

TEST(DexFormatsData, FormatsOfAnUnregisteredDataKindAreNoneAlthoughFormatsCarryIt) {
  const dex_test::LogCapture log;
  vyn_vector<int> roadStrings;
  registry().getSupportedFormatsByDataType(roadStrings, vyn::ie::ROAD_STRINGS, DexCommonType::IMPORT_ONLY, {},
                                           DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_TRUE(roadStrings.empty());
  EXPECT_EQ(1, log.count(kSource, 2039));
  EXPECT_TRUE(registry()
                  .getFormatById(L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}")
                  ->isDataTypeSupported(vyn::ie::ROAD_STRINGS));
}
