#include "ieDefinitions/IEFormats.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <string>

#include "ieDefinitions/IEFlags.h"
#include "ieDefinitions/IEFormatWords.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
using Configurations = DexFlags<DexCommonType::ESupportedConfigurations>;
using Modes = DexFlags<DexCommonType::EUsingModes>;
using Kinds = DexFlags<EDexDataType>;

constexpr const wchar_t* kDwgGuid = L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}";
const Configurations kAll{DexCommonType::REGULAR, DexCommonType::ONBOARD, DexCommonType::JAPAN};
const Configurations kRegularOnboard{DexCommonType::REGULAR, DexCommonType::ONBOARD};

GUID guidOf(const wchar_t* text) {
  GUID guid;
  EXPECT_EQ(S_OK, CLSIDFromString(text, &guid));
  return guid;
}

DexDataType kind(DexCommonType::EDataDirections direction, Configurations configurations = kAll,
                 Modes modes = {}) {
  return DexDataType(POINTS, L"Points", direction, configurations, modes);
}

DexFormat formatWithUnits(DexFlags<EDistUnits> distance, DexFlags<EAngleUnits> angle) {
  return DexFormat(guidOf(kDwgGuid), L"Units", DexCommonType::EXPORT_ONLY, L"ExportParsers", L"", L"U", L"u",
                   L"U Files (*.u)|", kAll, {}, POINTS, distance, angle, {});
}

TEST(DexFlags, ValueVIsBitVAndValuesOutsideTheMaskAreNeverMembers) {
  EXPECT_EQ(std::uint64_t{1} << 22, Kinds(MULTIPLE).getMask());
  Kinds set{LINES, SURFACES};
  EXPECT_EQ((std::uint64_t{1} << 2) | (std::uint64_t{1} << 10), set.getMask());
  EXPECT_EQ(set, Kinds::fromMask(set.getMask()));
  const Kinds joined = Kinds(POINTS) | LINES;
  EXPECT_TRUE(joined.has(POINTS) && joined.has(LINES) && !joined.has(AREAS) && joined.count() == 2);
  set |= joined;
  set.add(MULTIPLE).remove(SURFACES).remove(AREAS);
  EXPECT_EQ((Kinds{POINTS, LINES, MULTIPLE}), set);
  set.clear();
  EXPECT_TRUE(set.isEmpty());
  set.add(static_cast<EDexDataType>(-1))
      .add(static_cast<EDexDataType>(64))
      .add(static_cast<EDexDataType>(63));
  EXPECT_EQ(1, set.count());
  EXPECT_TRUE(set.has(static_cast<EDexDataType>(63)) && !set.has(static_cast<EDexDataType>(64)));
  set.remove(static_cast<EDexDataType>(-1));
  EXPECT_EQ(1, set.count());
  constexpr Kinds kPoints{POINTS, POINT_LISTS};
  static_assert(kPoints.count() == 2 && kPoints.has(POINT_LISTS) && sizeof(Kinds) == sizeof(std::uint64_t));
}

TEST(FormatWords, DirectionsConfigurationsModesKindsAndParametersHaveTheirWordsBothWays) {
  EXPECT_EQ(L"ImportExport", keywordFromDirection(DexCommonType::IMPORT_AND_EXPORT));
  EXPECT_EQ(L"Export", keywordFromDirection(DexCommonType::EXPORT_ONLY));
  EXPECT_EQ(DexCommonType::IMPORT_ONLY, directionFromKeyword(L"import"));  // case ignored
  EXPECT_EQ(DexCommonType::EXPORT_ONLY, directionFromKeyword(L"EXPORT"));
  EXPECT_EQ(DexCommonType::IMPORT_AND_EXPORT, directionFromKeyword(L"Import "));  // anything else: both
  DexCommonType::ESupportedConfigurations configuration = DexCommonType::REGULAR;
  EXPECT_TRUE(configurationFromKeyword(L"JAPAN", configuration));
  EXPECT_FALSE(configurationFromKeyword(L"onboard", configuration) ||
               configurationFromKeyword(L"CONTRACTOR", configuration));
  EXPECT_EQ(DexCommonType::JAPAN, configuration);
  EXPECT_EQ(L"ONBOARD", keywordFromConfiguration(DexCommonType::ONBOARD));
  EXPECT_EQ(L"", keywordFromConfiguration(static_cast<DexCommonType::ESupportedConfigurations>(3)));
  DexCommonType::EUsingModes mode = DexCommonType::EXPORT_IN_JAPAN;
  EXPECT_TRUE(usingModeFromKeyword(L"ONBOARD_WITH_SCANNING", mode));
  EXPECT_EQ(DexCommonType::ONBOARD_WITH_SCANNING, mode);
  EXPECT_EQ(L"EXPORT_IN_JAPAN", keywordFromUsingMode(DexCommonType::EXPORT_IN_JAPAN));
  EXPECT_EQ(L"", keywordFromUsingMode(static_cast<DexCommonType::EUsingModes>(2)));
  for (int value = 0; value < kDexDataTypeCount; ++value) {
    EDexDataType read = static_cast<EDexDataType>(value == 0 ? 1 : 0);
    EXPECT_TRUE(dataTypeFromKeyword(keywordFromDataType(static_cast<EDexDataType>(value)), read)) << value;
    EXPECT_EQ(value, read);
  }
  EXPECT_EQ(L"STA_EQUATION_SETS", keywordFromDataType(STA_EQUATION_SETS));
  EDexDataType untouched = LINES;
  EXPECT_FALSE(dataTypeFromKeyword(L"points", untouched) || dataTypeFromKeyword(L"", untouched));
  EXPECT_EQ(LINES, untouched);
  EXPECT_EQ(L"", keywordFromDataType(static_cast<EDexDataType>(23)));
  for (int value = 0; value < DexFormat::kParameterCount; ++value) {  // 51 and 52 have no word
    const CVynStringT<wchar_t> word = keywordFromParameter(static_cast<DexFormat::EParameterName>(value));
    DexFormat::EParameterName read = DexFormat::BUILT_IN_PARAMETER_52;
    EXPECT_EQ(parameterFromKeyword(word, read), value < 51) << value;
    if (value < 51) {
      EXPECT_EQ(value, read);
    }
  }
  EXPECT_EQ(L"MULTIPLE_STAION_POINTS", keywordFromParameter(DexFormat::MULTIPLE_STAION_POINTS));
  EXPECT_EQ(L"PREDEFINED_CODE_WITH_ATTRS_EXP",
            keywordFromParameter(DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP));
  DexFormat::EParameterName read = DexFormat::PHOTO_NOTES;
  EXPECT_TRUE(parameterFromKeyword(L"PREDEFINED_CODE_STYLE_EXP", read));  // the older word reads too
  EXPECT_EQ(18, read);
  EXPECT_FALSE(parameterFromKeyword(L"MULTIPLE_STATION_POINTS", read) ||
               parameterFromKeyword(L"photo_notes", read));
}

TEST(DexCommonType, FiltersByDirectionEveryConfigurationAskedAndAnAppliedUsingMode) {
  const DexDataType both = kind(DexCommonType::IMPORT_AND_EXPORT);
  const DexDataType importOnly = kind(DexCommonType::IMPORT_ONLY);
  const DexDataType exportOnly = kind(DexCommonType::EXPORT_ONLY);
  for (const auto direction :
       {DexCommonType::IMPORT_ONLY, DexCommonType::EXPORT_ONLY, DexCommonType::IMPORT_AND_EXPORT}) {
    EXPECT_TRUE(both.compareCommonData(direction, {}, {}));
    EXPECT_EQ(importOnly.compareCommonData(direction, {}, {}), direction == DexCommonType::IMPORT_ONLY);
    EXPECT_EQ(exportOnly.compareCommonData(direction, {}, {}), direction == DexCommonType::EXPORT_ONLY);
  }
  const Configurations regularJapan{DexCommonType::REGULAR, DexCommonType::JAPAN};
  EXPECT_TRUE(kind(DexCommonType::IMPORT_AND_EXPORT, kAll)
                  .compareCommonData(DexCommonType::IMPORT_ONLY, regularJapan, {}));
  EXPECT_FALSE(kind(DexCommonType::IMPORT_AND_EXPORT, kRegularOnboard)
                   .compareCommonData(DexCommonType::IMPORT_ONLY, regularJapan, {}));
  EXPECT_TRUE(
      kind(DexCommonType::IMPORT_AND_EXPORT, {}).compareCommonData(DexCommonType::IMPORT_ONLY, {}, {}));
  EXPECT_FALSE(kind(DexCommonType::IMPORT_AND_EXPORT, {})
                   .compareCommonData(DexCommonType::IMPORT_ONLY, DexCommonType::REGULAR, {}));
  const auto fourth = static_cast<DexCommonType::ESupportedConfigurations>(3);  // not consulted
  EXPECT_TRUE(kind(DexCommonType::IMPORT_AND_EXPORT, DexCommonType::REGULAR)
                  .compareCommonData(DexCommonType::IMPORT_ONLY, fourth, {}));
  const DexDataType japanese = kind(DexCommonType::EXPORT_ONLY, kAll, DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_FALSE(
      japanese.compareCommonData(DexCommonType::EXPORT_ONLY, {}, {}) ||
      japanese.compareCommonData(DexCommonType::EXPORT_ONLY, {}, DexCommonType::ONBOARD_WITH_SCANNING));
  EXPECT_TRUE(japanese.compareCommonData(
      DexCommonType::EXPORT_ONLY, {},
      Modes{DexCommonType::EXPORT_IN_JAPAN, DexCommonType::ONBOARD_WITH_SCANNING}));
  EXPECT_TRUE(exportOnly.compareCommonData(DexCommonType::EXPORT_ONLY, {}, DexCommonType::EXPORT_IN_JAPAN));
  // An unknown query direction is logged and passes that step; the later steps still apply.
  const dex_test::LogCapture log;
  const auto unknown = static_cast<DexCommonType::EDataDirections>(7);
  EXPECT_TRUE(importOnly.compareCommonData(unknown, {}, {}));
  EXPECT_FALSE(
      kind(DexCommonType::IMPORT_ONLY, kRegularOnboard).compareCommonData(unknown, DexCommonType::JAPAN, {}));
  EXPECT_EQ(2, log.count(L"ieDefinitions\\IEFormats", 62));
  EXPECT_EQ(2u, log.size());
  EXPECT_TRUE(log.records().front().message.empty());
}

// A data kind whose configuration and mode answers are its own, to show that the filter asks the
// virtual operations.
class EverywhereDataType : public DexDataType {
 public:
  EverywhereDataType() : DexDataType(POINTS, L"Everywhere", IMPORT_ONLY, {}, EXPORT_IN_JAPAN) {}
  bool isConfigurationSupported(ESupportedConfigurations) const override { return true; }
  bool isUsingModeApplied(EUsingModes) const override { return false; }
};

TEST(DexCommonType, TheFilterAsksTheVirtualOperationsInTheirSlotOrder) {
  const EverywhereDataType everywhere;
  EXPECT_TRUE(everywhere.compareCommonData(DexCommonType::IMPORT_ONLY, kAll, {}));
  EXPECT_TRUE(everywhere.getConfigurations().isEmpty());
  EXPECT_EQ(Modes(DexCommonType::EXPORT_IN_JAPAN), everywhere.getUsingModes());
  if (!dex_test::vtableEntryOf(&DexCommonType::getName)) GTEST_SKIP() << "virtual table layout unknown here";
  EXPECT_EQ(0, dex_test::vtableEntryOf(&DexCommonType::getName));
  EXPECT_EQ(1, dex_test::vtableEntryOf(&DexCommonType::getDataDirections));
  EXPECT_EQ(2, dex_test::vtableEntryOf(&DexCommonType::isConfigurationSupported));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexCommonType::isUsingModeApplied));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexFormat::isUsingModeApplied));  // the subclasses add none
}

TEST(DexDataType, GroupsItsKindAsPointLineOrRoadData) {
  for (int value = 0; value < kDexDataTypeCount; ++value) {
    const auto type = static_cast<EDexDataType>(value);
    const DexDataType kindOf(type, L"", DexCommonType::IMPORT_ONLY, {}, {});
    EXPECT_EQ(kindOf.isPointDataType(), type == POINTS || type == POINT_LISTS || type == MULTIPLE) << value;
    EXPECT_EQ(kindOf.isLineDataType(), type == LINES || type == MULTIPLE) << value;
    EXPECT_EQ(kindOf.isRoadDataType(), type == PARCELS || type == H_ALIGNMENTS || type == V_ALIGNMENTS ||
                                           type == X_SECTIONS || type == ROADS || type == MULTIPLE)
        << value;
  }
}

TEST(DexFormat, AnswersItsFieldsAsBuiltAndCopiesThem) {
  const DexFormat built(guidOf(L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}"), L"AutoCAD Drawing (*.dwg)",
                        DexCommonType::IMPORT_AND_EXPORT, L"DWG_2007Parser export", L"DWG_2007Parser import",
                        L"DWG", L"dwg", L"AutoCAD Drawing (*.dwg)|", kAll, {}, {POINTS, LINES},
                        EDistUnits::METERS, EAngleUnits::DECDEG,
                        {DexFormat::DRAW_DATA_EXP, DexFormat::BUILT_IN_PARAMETER_51});
  const std::unique_ptr<DexFormat> format(new DexFormat(built));  // through the host allocator
  EXPECT_EQ(L"AutoCAD Drawing (*.dwg)", static_cast<const DexCommonType&>(*format).getName());
  EXPECT_TRUE(format->getDllName(true) == L"DWG_2007Parser export" &&
              format->getDllName(false) == L"DWG_2007Parser import");
  EXPECT_TRUE(format->getTitle() == L"DWG" && format->getFilterExtension() == L"AutoCAD Drawing (*.dwg)|");
  EXPECT_TRUE(format->getExtension(true) == L".dwg" && format->getExtension(false) == L"dwg");
  EXPECT_EQ(L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}", format->getGuidAsString());
  EXPECT_TRUE(format->isDataTypeSupported(LINES) && !format->isDataTypeSupported(AREAS));
  EXPECT_TRUE(format->isDistUnitsTypeSupported(EDistUnits::METERS) &&
              !format->isDistUnitsTypeSupported(EDistUnits::USFEET));
  EXPECT_TRUE(format->isAngleUnitsTypeSupported(EAngleUnits::DECDEG) &&
              !format->isAngleUnitsTypeSupported(EAngleUnits::ANY_UNITS));
  EXPECT_TRUE(format->isParameterSupported(DexFormat::BUILT_IN_PARAMETER_51) &&
              !format->isParameterSupported(DexFormat::MULTIPLE_FILES_EXP));
  EXPECT_TRUE(format->getConfigurations() == kAll &&
              format->getDataDirections() == DexCommonType::IMPORT_AND_EXPORT);
  EXPECT_TRUE(format->areDistUnitsUsed() && format->areAngleUnitsUsed());
  EXPECT_FALSE(formatWithUnits({}, {}).areDistUnitsUsed() || formatWithUnits({}, {}).areAngleUnitsUsed());
  const DexFormat none(guidOf(kDwgGuid), L"Civil 3D", DexCommonType::IMPORT_ONLY, L"", L"", L"", L"", L"",
                       kAll, {}, {}, {}, {}, {});
  EXPECT_EQ(L"", none.getExtension(true));  // a dot only when there is an extension
  for (const wchar_t* same :
       {L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}", L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}"})
    EXPECT_TRUE(format->isIdEqual(same));
  for (const wchar_t* other :
       {L"E1EE3440", L"E1EE3440-4E57-491C-B580-2CC94DFDCD82", L"{E1EE3440-4E57-491C-B580-2CC94DFDCD83}", L""})
    EXPECT_FALSE(format->isIdEqual(other)) << other;
  EXPECT_FALSE(format->isIdEqual(nullptr));
}

TEST(DexFormat, NeedsAUnitChoiceForAnyUnitOrMoreThanOne) {
  EXPECT_FALSE(formatWithUnits({}, {}).hasUnitsToSelect() ||
               formatWithUnits(EDistUnits::METERS, {}).hasUnitsToSelect() ||
               formatWithUnits({}, EAngleUnits::DECDEG).hasUnitsToSelect() ||
               formatWithUnits(EDistUnits::USFEET, EAngleUnits::DECDEG).hasUnitsToSelect());
  EXPECT_TRUE(formatWithUnits({EDistUnits::METERS, EDistUnits::USFEET}, {}).hasUnitsToSelect() &&
              formatWithUnits({}, {EAngleUnits::RADIANS, EAngleUnits::DECDEG}).hasUnitsToSelect() &&
              formatWithUnits(EDistUnits::ANY_UNITS, {}).hasUnitsToSelect() &&
              formatWithUnits(EDistUnits::METERS, EAngleUnits::ANY_UNITS).hasUnitsToSelect());
}

TEST(FormatId, ComparesTwoGuidTextsByTheirGuids) {
  const wchar_t* const upper = L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}";
  EXPECT_TRUE(format_id::isFormatIdEqual(upper, L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}"));
  EXPECT_FALSE(format_id::isFormatIdEqual(upper, L"{79241EB7-2DDB-4fbf-A677-8E0DB4DF8204}") ||
               format_id::isFormatIdEqual(upper, L"{E1EE3440}") ||
               format_id::isFormatIdEqual(L"{E1EE3440}", L"{E1EE3440}") ||
               format_id::isFormatIdEqual(nullptr, upper) || format_id::isFormatIdEqual(upper, nullptr));
}

}  // namespace
