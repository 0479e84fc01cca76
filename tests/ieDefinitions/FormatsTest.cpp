#include "ieDefinitions/IEFormats.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "support/LogCapture.h"
#include "support/VtableSlot.h"

using vyn::ie::DexCommonType;
using vyn::ie::DexDataType;
using vyn::ie::DexFlags;
using vyn::ie::DexFormat;
using vyn::ie::EAngleUnits;
using vyn::ie::EDexDataType;
using vyn::ie::EDistUnits;

namespace {

using Configurations = DexFlags<DexCommonType::ESupportedConfigurations>;
using Modes = DexFlags<DexCommonType::EUsingModes>;

const std::wstring kFormatsSource = L"ieDefinitions\\IEFormats";
constexpr const wchar_t* kDwgGuid = L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}";

const Configurations kAll{DexCommonType::REGULAR, DexCommonType::ONBOARD, DexCommonType::JAPAN};
const Configurations kRegularOnboard{DexCommonType::REGULAR, DexCommonType::ONBOARD};

GUID guidOf(const wchar_t* text) {
  GUID guid;
  EXPECT_EQ(S_OK, CLSIDFromString(text, &guid));
  return guid;
}

std::wstring text(const CVynStringT<wchar_t>& value) {
  return std::wstring(value.view());
}

DexDataType kind(DexCommonType::EDataDirections direction, Configurations configurations = kAll,
                 Modes modes = {}) {
  return DexDataType(vyn::ie::POINTS, L"Points", direction, configurations, modes);
}

DexFormat formatWithUnits(DexFlags<EDistUnits> distance, DexFlags<EAngleUnits> angle) {
  return DexFormat(guidOf(kDwgGuid), L"Units", DexCommonType::EXPORT_ONLY, L"ExportParsers", L"", L"U", L"u",
                   L"U Files (*.u)|", kAll, {}, vyn::ie::POINTS, distance, angle, {});
}

DexFormat drawingFormat() {
  return DexFormat(guidOf(kDwgGuid), L"AutoCAD Drawing (*.dwg)", DexCommonType::IMPORT_AND_EXPORT,
                   L"DWG_2007Parser export", L"DWG_2007Parser import", L"DWG", L"dwg",
                   L"AutoCAD Drawing (*.dwg)|", kAll, {}, {vyn::ie::POINTS, vyn::ie::LINES},
                   EDistUnits::METERS, EAngleUnits::DECDEG,
                   {DexFormat::DRAW_DATA_EXP, DexFormat::BUILT_IN_PARAMETER_51});
}

// A data kind whose configuration and mode answers are its own, to show that the filter asks the
// virtual operations.
class EverywhereDataType : public DexDataType {
 public:
  EverywhereDataType() : DexDataType(vyn::ie::POINTS, L"Everywhere", IMPORT_ONLY, {}, EXPORT_IN_JAPAN) {}
  bool isConfigurationSupported(ESupportedConfigurations) const override { return true; }
  bool isUsingModeApplied(EUsingModes) const override { return false; }
};

}  // namespace

// ---- compareCommonData --------------------------------------------------------------------------

TEST(DexCommonType, TwoWayDescriptorsAnswerEveryDirectionAndOneWayOnlyTheirOwn) {
  const DexDataType both = kind(DexCommonType::IMPORT_AND_EXPORT);
  EXPECT_TRUE(both.compareCommonData(DexCommonType::IMPORT_ONLY, {}, {}));
  EXPECT_TRUE(both.compareCommonData(DexCommonType::EXPORT_ONLY, {}, {}));
  EXPECT_TRUE(both.compareCommonData(DexCommonType::IMPORT_AND_EXPORT, {}, {}));

  const DexDataType importOnly = kind(DexCommonType::IMPORT_ONLY);
  EXPECT_TRUE(importOnly.compareCommonData(DexCommonType::IMPORT_ONLY, {}, {}));
  EXPECT_FALSE(importOnly.compareCommonData(DexCommonType::EXPORT_ONLY, {}, {}));
  EXPECT_FALSE(importOnly.compareCommonData(DexCommonType::IMPORT_AND_EXPORT, {}, {}));

  const DexDataType exportOnly = kind(DexCommonType::EXPORT_ONLY);
  EXPECT_FALSE(exportOnly.compareCommonData(DexCommonType::IMPORT_ONLY, {}, {}));
  EXPECT_TRUE(exportOnly.compareCommonData(DexCommonType::EXPORT_ONLY, {}, {}));
  EXPECT_FALSE(exportOnly.compareCommonData(DexCommonType::IMPORT_AND_EXPORT, {}, {}));
}

TEST(DexCommonType, AnUnknownQueryDirectionIsLoggedAndPassesThatStep) {
  const dex_test::LogCapture log;
  const auto unknown = static_cast<DexCommonType::EDataDirections>(7);
  EXPECT_TRUE(kind(DexCommonType::IMPORT_ONLY).compareCommonData(unknown, {}, {}));
  EXPECT_EQ(1, log.count(kFormatsSource, 62));
  ASSERT_EQ(1u, log.size());
  EXPECT_TRUE(log.records().front().message.empty());

  // The later steps still apply.
  EXPECT_FALSE(
      kind(DexCommonType::IMPORT_ONLY, kRegularOnboard).compareCommonData(unknown, DexCommonType::JAPAN, {}));
  EXPECT_EQ(2, log.count(kFormatsSource, 62));
}

TEST(DexCommonType, EveryQueriedConfigurationMustBeSupported) {
  const Configurations regularJapan{DexCommonType::REGULAR, DexCommonType::JAPAN};
  EXPECT_TRUE(kind(DexCommonType::IMPORT_AND_EXPORT, kAll)
                  .compareCommonData(DexCommonType::IMPORT_ONLY, regularJapan, {}));
  EXPECT_FALSE(kind(DexCommonType::IMPORT_AND_EXPORT, kRegularOnboard)
                   .compareCommonData(DexCommonType::IMPORT_ONLY, regularJapan, {}));
  // An empty query set passes, even for a descriptor offered in no configuration.
  EXPECT_TRUE(
      kind(DexCommonType::IMPORT_AND_EXPORT, {}).compareCommonData(DexCommonType::IMPORT_ONLY, {}, {}));
  EXPECT_FALSE(kind(DexCommonType::IMPORT_AND_EXPORT, {})
                   .compareCommonData(DexCommonType::IMPORT_ONLY, DexCommonType::REGULAR, {}));
  // Values beyond the three configurations in a query are not consulted.
  const auto fourth = static_cast<DexCommonType::ESupportedConfigurations>(3);
  EXPECT_TRUE(kind(DexCommonType::IMPORT_AND_EXPORT, DexCommonType::REGULAR)
                  .compareCommonData(DexCommonType::IMPORT_ONLY, fourth, {}));
}

TEST(DexCommonType, AnAppliedUsingModeRestrictsTheDescriptorToQueriesNamingIt) {
  const DexDataType japanese = kind(DexCommonType::EXPORT_ONLY, kAll, DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_FALSE(japanese.compareCommonData(DexCommonType::EXPORT_ONLY, {}, {}));
  EXPECT_FALSE(
      japanese.compareCommonData(DexCommonType::EXPORT_ONLY, {}, DexCommonType::ONBOARD_WITH_SCANNING));
  EXPECT_TRUE(japanese.compareCommonData(DexCommonType::EXPORT_ONLY, {}, DexCommonType::EXPORT_IN_JAPAN));
  EXPECT_TRUE(japanese.compareCommonData(
      DexCommonType::EXPORT_ONLY, {},
      Modes{DexCommonType::EXPORT_IN_JAPAN, DexCommonType::ONBOARD_WITH_SCANNING}));

  const DexDataType plain = kind(DexCommonType::EXPORT_ONLY);
  EXPECT_TRUE(plain.compareCommonData(DexCommonType::EXPORT_ONLY, {}, {}));
  EXPECT_TRUE(plain.compareCommonData(DexCommonType::EXPORT_ONLY, {}, DexCommonType::EXPORT_IN_JAPAN));
}

TEST(DexCommonType, TheFilterAsksTheVirtualOperations) {
  const EverywhereDataType everywhere;
  EXPECT_TRUE(everywhere.compareCommonData(DexCommonType::IMPORT_ONLY, kAll, {}));
  const DexCommonType& base = everywhere;
  EXPECT_TRUE(base.isConfigurationSupported(DexCommonType::JAPAN));
  EXPECT_FALSE(base.isUsingModeApplied(DexCommonType::EXPORT_IN_JAPAN));
  // The stored sets are what the subclass overrides.
  EXPECT_TRUE(everywhere.getConfigurations().isEmpty());
  EXPECT_EQ(Modes(DexCommonType::EXPORT_IN_JAPAN), everywhere.getUsingModes());
}

TEST(DexCommonType, DeclaresItsVirtualOperationsInSlotOrderWithTheDestructorLast) {
  if (!dex_test::vtableEntryOf(&DexCommonType::getName)) GTEST_SKIP() << "virtual table layout unknown here";
  EXPECT_EQ(0, dex_test::vtableEntryOf(&DexCommonType::getName));
  EXPECT_EQ(1, dex_test::vtableEntryOf(&DexCommonType::getDataDirections));
  EXPECT_EQ(2, dex_test::vtableEntryOf(&DexCommonType::isConfigurationSupported));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexCommonType::isUsingModeApplied));
  // The subclasses add no virtual operation of their own.
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexFormat::isUsingModeApplied));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexDataType::isUsingModeApplied));
}

// ---- DexDataType --------------------------------------------------------------------------------

TEST(DexDataType, GroupsItsKindAsPointLineOrRoadData) {
  const auto isPoint = [](EDexDataType type) {
    return DexDataType(type, L"", DexCommonType::IMPORT_ONLY, {}, {}).isPointDataType();
  };
  const auto isLine = [](EDexDataType type) {
    return DexDataType(type, L"", DexCommonType::IMPORT_ONLY, {}, {}).isLineDataType();
  };
  const auto isRoad = [](EDexDataType type) {
    return DexDataType(type, L"", DexCommonType::IMPORT_ONLY, {}, {}).isRoadDataType();
  };

  for (int value = 0; value < vyn::ie::kDexDataTypeCount; ++value) {
    const auto type = static_cast<EDexDataType>(value);
    const bool point = type == vyn::ie::POINTS || type == vyn::ie::POINT_LISTS || type == vyn::ie::MULTIPLE;
    const bool line = type == vyn::ie::LINES || type == vyn::ie::MULTIPLE;
    const bool road = type == vyn::ie::PARCELS || type == vyn::ie::H_ALIGNMENTS ||
                      type == vyn::ie::V_ALIGNMENTS || type == vyn::ie::X_SECTIONS ||
                      type == vyn::ie::ROADS || type == vyn::ie::MULTIPLE;
    EXPECT_EQ(point, isPoint(type)) << value;
    EXPECT_EQ(line, isLine(type)) << value;
    EXPECT_EQ(road, isRoad(type)) << value;
  }
  EXPECT_TRUE(isRoad(vyn::ie::PARCELS));
  EXPECT_FALSE(isRoad(vyn::ie::ROAD_STRINGS));
  EXPECT_FALSE(isRoad(vyn::ie::X_SECTION_TEMPLATES));
}

TEST(DexDataType, KeepsWhatItWasBuiltWithAndCopiesIt) {
  const DexDataType lines(vyn::ie::LINES, L"Lines", DexCommonType::IMPORT_AND_EXPORT, kAll,
                          DexCommonType::EXPORT_IN_JAPAN);
  const DexDataType copy(lines);
  EXPECT_EQ(vyn::ie::LINES, copy.getTypeId());
  EXPECT_EQ(L"Lines", text(copy.getName()));
  EXPECT_EQ(DexCommonType::IMPORT_AND_EXPORT, copy.getDataDirections());
  EXPECT_TRUE(copy.isConfigurationSupported(DexCommonType::JAPAN));
  EXPECT_TRUE(copy.isUsingModeApplied(DexCommonType::EXPORT_IN_JAPAN));
  EXPECT_FALSE(copy.isUsingModeApplied(DexCommonType::ONBOARD_WITH_SCANNING));
}

// ---- DexFormat ----------------------------------------------------------------------------------

TEST(DexFormat, AnswersItsFieldsAsBuilt) {
  const DexFormat format = drawingFormat();
  EXPECT_EQ(L"AutoCAD Drawing (*.dwg)", text(format.getName()));
  EXPECT_EQ(DexCommonType::IMPORT_AND_EXPORT, format.getDataDirections());
  EXPECT_EQ(L"DWG_2007Parser export", text(format.getDllName(true)));
  EXPECT_EQ(L"DWG_2007Parser import", text(format.getDllName(false)));
  EXPECT_EQ(L"DWG", text(format.getTitle()));
  EXPECT_EQ(L"AutoCAD Drawing (*.dwg)|", text(format.getFilterExtension()));
  EXPECT_TRUE(format.isDataTypeSupported(vyn::ie::LINES));
  EXPECT_FALSE(format.isDataTypeSupported(vyn::ie::AREAS));
  EXPECT_TRUE(format.isDistUnitsTypeSupported(EDistUnits::METERS));
  EXPECT_FALSE(format.isDistUnitsTypeSupported(EDistUnits::USFEET));
  EXPECT_TRUE(format.isAngleUnitsTypeSupported(EAngleUnits::DECDEG));
  EXPECT_FALSE(format.isAngleUnitsTypeSupported(EAngleUnits::ANY_UNITS));
  EXPECT_TRUE(format.isParameterSupported(DexFormat::BUILT_IN_PARAMETER_51));
  EXPECT_FALSE(format.isParameterSupported(DexFormat::MULTIPLE_FILES_EXP));
  EXPECT_TRUE(format.areDistUnitsUsed());
  EXPECT_TRUE(format.areAngleUnitsUsed());
  EXPECT_FALSE(formatWithUnits({}, {}).areDistUnitsUsed());
  EXPECT_FALSE(formatWithUnits({}, {}).areAngleUnitsUsed());
}

TEST(DexFormat, ACopyHasEveryFieldOfItsOriginal) {
  const DexFormat original = drawingFormat();
  const std::unique_ptr<DexFormat> copy(new DexFormat(original));
  ASSERT_NE(nullptr, copy);
  EXPECT_EQ(original.getGuid(), copy->getGuid());
  EXPECT_EQ(text(original.getName()), text(copy->getName()));
  EXPECT_EQ(text(original.getDllName(true)), text(copy->getDllName(true)));
  EXPECT_EQ(text(original.getDllName(false)), text(copy->getDllName(false)));
  EXPECT_EQ(text(original.getExtension(false)), text(copy->getExtension(false)));
  EXPECT_EQ(original.getConfigurations(), copy->getConfigurations());
  EXPECT_EQ(original.getDataTypes(), copy->getDataTypes());
  EXPECT_EQ(original.getDistanceUnits(), copy->getDistanceUnits());
  EXPECT_EQ(original.getAngleUnits(), copy->getAngleUnits());
  EXPECT_EQ(original.getParameters(), copy->getParameters());
}

TEST(DexFormat, TheExtensionGetsADotOnlyWhenItHasText) {
  const DexFormat dxf(guidOf(kDwgGuid), L"AutoCAD DXF (*.dxf)", DexCommonType::IMPORT_AND_EXPORT, L"", L"",
                      L"DXF", L"dxf", L"", kAll, {}, {}, {}, {}, {});
  EXPECT_EQ(L".dxf", text(dxf.getExtension(true)));
  EXPECT_EQ(L"dxf", text(dxf.getExtension(false)));

  const DexFormat none(guidOf(kDwgGuid), L"Civil 3D", DexCommonType::IMPORT_ONLY, L"", L"", L"", L"", L"",
                       kAll, {}, {}, {}, {}, {});
  EXPECT_EQ(L"", text(none.getExtension(true)));
  EXPECT_EQ(L"", text(none.getExtension(false)));
}

TEST(DexFormat, GivesItsGuidInRegistryForm) {
  const DexFormat format(guidOf(L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}"), L"", DexCommonType::IMPORT_ONLY,
                         L"", L"", L"", L"", L"", {}, {}, {}, {}, {}, {});
  EXPECT_EQ(L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}", text(format.getGuidAsString()));
  EXPECT_EQ(38, format.getGuidAsString().GetLength());
}

TEST(DexFormat, IsIdEqualParsesBracedGuidTextsOfEitherCase) {
  const DexFormat format = drawingFormat();
  EXPECT_TRUE(format.isIdEqual(L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}"));
  EXPECT_TRUE(format.isIdEqual(L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}"));
  EXPECT_FALSE(format.isIdEqual(L"E1EE3440"));
  EXPECT_FALSE(format.isIdEqual(L"E1EE3440-4E57-491C-B580-2CC94DFDCD82"));
  EXPECT_FALSE(format.isIdEqual(L"{E1EE3440-4E57-491C-B580-2CC94DFDCD83}"));
  EXPECT_FALSE(format.isIdEqual(L""));
  EXPECT_FALSE(format.isIdEqual(nullptr));
}

TEST(DexFormat, AUnitChoiceIsNeededForAnyUnitOrMoreThanOne) {
  EXPECT_FALSE(formatWithUnits({}, {}).hasUnitsToSelect());
  EXPECT_FALSE(formatWithUnits(EDistUnits::METERS, {}).hasUnitsToSelect());
  EXPECT_FALSE(formatWithUnits({}, EAngleUnits::DECDEG).hasUnitsToSelect());
  EXPECT_FALSE(formatWithUnits(EDistUnits::USFEET, EAngleUnits::DECDEG).hasUnitsToSelect());
  EXPECT_TRUE(formatWithUnits({EDistUnits::METERS, EDistUnits::USFEET}, {}).hasUnitsToSelect());
  EXPECT_TRUE(formatWithUnits({}, {EAngleUnits::RADIANS, EAngleUnits::DECDEG}).hasUnitsToSelect());
  EXPECT_TRUE(formatWithUnits(EDistUnits::ANY_UNITS, {}).hasUnitsToSelect());
  EXPECT_TRUE(formatWithUnits({}, EAngleUnits::ANY_UNITS).hasUnitsToSelect());
  EXPECT_TRUE(formatWithUnits(EDistUnits::METERS, EAngleUnits::ANY_UNITS).hasUnitsToSelect());
}

TEST(DexFormat, IsDeletedThroughTheHostAllocator) {
  DexFormat* const format = new DexFormat(drawingFormat());
  ASSERT_NE(nullptr, format);
  const DexCommonType& base = *format;
  EXPECT_EQ(L"AutoCAD Drawing (*.dwg)", text(base.getName()));
  delete format;
}

// ---- format_id ----------------------------------------------------------------------------------

TEST(FormatId, ComparesTwoGuidTextsByTheirGuids) {
  const wchar_t* const upper = L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}";
  const wchar_t* const lower = L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}";
  const wchar_t* const other = L"{79241EB7-2DDB-4fbf-A677-8E0DB4DF8204}";
  const wchar_t* const broken = L"{E1EE3440}";
  const wchar_t* const null = nullptr;
  EXPECT_TRUE(vyn::ie::format_id::isFormatIdEqual(upper, lower));
  EXPECT_FALSE(vyn::ie::format_id::isFormatIdEqual(upper, other));
  EXPECT_FALSE(vyn::ie::format_id::isFormatIdEqual(upper, broken));
  EXPECT_FALSE(vyn::ie::format_id::isFormatIdEqual(broken, broken));
  EXPECT_FALSE(vyn::ie::format_id::isFormatIdEqual(null, upper));
  EXPECT_FALSE(vyn::ie::format_id::isFormatIdEqual(upper, null));
}
