#include "ieDefinitions/IEFormatWords.h"

#include <gtest/gtest.h>

#include <string>

using vyn::ie::DexCommonType;
using vyn::ie::DexFormat;
using vyn::ie::EDexDataType;

namespace {

std::wstring text(const CVynStringT<wchar_t>& value) {
  return std::wstring(value.view());
}

}  // namespace

TEST(FormatWords, DirectionsAreReadIgnoringCaseAndDefaultToBoth) {
  EXPECT_EQ(L"Import", text(vyn::ie::keywordFromDirection(DexCommonType::IMPORT_ONLY)));
  EXPECT_EQ(L"Export", text(vyn::ie::keywordFromDirection(DexCommonType::EXPORT_ONLY)));
  EXPECT_EQ(L"ImportExport", text(vyn::ie::keywordFromDirection(DexCommonType::IMPORT_AND_EXPORT)));

  EXPECT_EQ(DexCommonType::IMPORT_ONLY, vyn::ie::directionFromKeyword(L"import"));
  EXPECT_EQ(DexCommonType::EXPORT_ONLY, vyn::ie::directionFromKeyword(L"EXPORT"));
  EXPECT_EQ(DexCommonType::IMPORT_AND_EXPORT, vyn::ie::directionFromKeyword(L"ImportExport"));
  EXPECT_EQ(DexCommonType::IMPORT_AND_EXPORT, vyn::ie::directionFromKeyword(L"Import "));
  EXPECT_EQ(DexCommonType::IMPORT_AND_EXPORT, vyn::ie::directionFromKeyword(L""));
}

TEST(FormatWords, ConfigurationsAndUsingModesAreTheirEnumeratorNames) {
  DexCommonType::ESupportedConfigurations configuration = DexCommonType::REGULAR;
  EXPECT_TRUE(vyn::ie::configurationFromKeyword(L"JAPAN", configuration));
  EXPECT_EQ(DexCommonType::JAPAN, configuration);
  EXPECT_FALSE(vyn::ie::configurationFromKeyword(L"onboard", configuration));
  EXPECT_FALSE(vyn::ie::configurationFromKeyword(L"CONTRACTOR", configuration));
  EXPECT_EQ(DexCommonType::JAPAN, configuration);
  EXPECT_EQ(L"ONBOARD", text(vyn::ie::keywordFromConfiguration(DexCommonType::ONBOARD)));
  EXPECT_EQ(L"",
            text(vyn::ie::keywordFromConfiguration(static_cast<DexCommonType::ESupportedConfigurations>(3))));

  DexCommonType::EUsingModes mode = DexCommonType::EXPORT_IN_JAPAN;
  EXPECT_TRUE(vyn::ie::usingModeFromKeyword(L"ONBOARD_WITH_SCANNING", mode));
  EXPECT_EQ(DexCommonType::ONBOARD_WITH_SCANNING, mode);
  EXPECT_EQ(L"EXPORT_IN_JAPAN", text(vyn::ie::keywordFromUsingMode(DexCommonType::EXPORT_IN_JAPAN)));
  EXPECT_EQ(L"", text(vyn::ie::keywordFromUsingMode(static_cast<DexCommonType::EUsingModes>(2))));
}

TEST(FormatWords, EveryDataKindHasItsWord) {
  const wchar_t* const words[] = {L"POINTS",
                                  L"CODES",
                                  L"LINES",
                                  L"AREAS",
                                  L"PARCELS",
                                  L"H_ALIGNMENTS",
                                  L"V_ALIGNMENTS",
                                  L"X_SECTIONS",
                                  L"ROAD_STRINGS",
                                  L"ROADS",
                                  L"SURFACES",
                                  L"POINT_LISTS",
                                  L"X_SECTION_TEMPLATES",
                                  L"ROAD_SURVEY",
                                  L"LOCALIZATION",
                                  L"SCANNING_DATA",
                                  L"JOB_HISTORY",
                                  L"LAYER_STATES",
                                  L"RAW_DATA",
                                  L"STAKE_REPORTS",
                                  L"STA_EQUATION_SETS",
                                  L"FIELD_REPORTS",
                                  L"MULTIPLE"};
  ASSERT_EQ(vyn::ie::kDexDataTypeCount, static_cast<int>(std::size(words)));
  for (int value = 0; value < vyn::ie::kDexDataTypeCount; ++value) {
    const auto type = static_cast<EDexDataType>(value);
    EXPECT_EQ(words[value], text(vyn::ie::keywordFromDataType(type)));
    EDexDataType read = vyn::ie::POINTS;
    EXPECT_TRUE(vyn::ie::dataTypeFromKeyword(words[value], read));
    EXPECT_EQ(type, read);
  }
  EDexDataType untouched = vyn::ie::LINES;
  EXPECT_FALSE(vyn::ie::dataTypeFromKeyword(L"points", untouched));
  EXPECT_FALSE(vyn::ie::dataTypeFromKeyword(L"", untouched));
  EXPECT_EQ(vyn::ie::LINES, untouched);
  EXPECT_EQ(L"", text(vyn::ie::keywordFromDataType(static_cast<EDexDataType>(23))));
}

TEST(FormatWords, ParametersZeroToFiftyHaveWordsAndFiftyOneAndFiftyTwoHaveNone) {
  for (int value = 0; value < DexFormat::kParameterCount; ++value) {
    const auto parameter = static_cast<DexFormat::EParameterName>(value);
    const CVynStringT<wchar_t> word = vyn::ie::keywordFromParameter(parameter);
    if (value >= 51) {
      EXPECT_TRUE(word.IsEmpty()) << value;
      continue;
    }
    ASSERT_FALSE(word.IsEmpty()) << value;
    DexFormat::EParameterName read = DexFormat::BUILT_IN_PARAMETER_52;
    EXPECT_TRUE(vyn::ie::parameterFromKeyword(word, read)) << value;
    EXPECT_EQ(parameter, read);
  }
  EXPECT_EQ(L"ABILITY_TO_ADD_ATTR_TYPE_TO_ATTR_EXP",
            text(vyn::ie::keywordFromParameter(DexFormat::ABILITY_TO_ADD_ATTR_TYPE_TO_ATTR_EXP)));
  EXPECT_EQ(L"MULTIPLE_STAION_POINTS",
            text(vyn::ie::keywordFromParameter(DexFormat::MULTIPLE_STAION_POINTS)));
  EXPECT_EQ(L"STORE_CONTROL_POINTS_IN_LOCALIZATION",
            text(vyn::ie::keywordFromParameter(DexFormat::STORE_CONTROL_POINTS_IN_LOCALIZATION)));
}

TEST(FormatWords, PredefinedCodeParameterIsReadFromBothWordsAndWrittenWithTheNewer) {
  DexFormat::EParameterName read = DexFormat::PHOTO_NOTES;
  EXPECT_TRUE(vyn::ie::parameterFromKeyword(L"PREDEFINED_CODE_STYLE_EXP", read));
  EXPECT_EQ(DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP, read);
  EXPECT_EQ(18, read);
  EXPECT_EQ(L"PREDEFINED_CODE_WITH_ATTRS_EXP",
            text(vyn::ie::keywordFromParameter(DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP)));
  EXPECT_FALSE(vyn::ie::parameterFromKeyword(L"MULTIPLE_STATION_POINTS", read));
  EXPECT_FALSE(vyn::ie::parameterFromKeyword(L"photo_notes", read));
}
