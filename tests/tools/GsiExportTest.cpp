// The GSI exporter of libExportParsers.so through the loader: coordinate lines of both variants in
// the settings' units, read back to the same points, and the values that do not fit.

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "DxfTestModel.h"
#include "GsiTestRun.h"
#include "ToolRun.h"
#include "gsi/GsiWords.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::ie;
using dex_test::TempDir;
using Lines = std::vector<std::string>;

// Points with codes, one without height, one with negative coordinates.
constexpr const char* kPoints =
    "110001+000000P1 81..00+00001000 82..00+00002000 83..00+00000300 71....+0000TREE 71....+000000EP\n"
    "110002+0000A102 81..00-00002000 82..00+00001000\n";

DexSettings settingsOf(EDistUnits units, int decimals) {
  DexSettings settings = gsi_test::rawAndPoints(units);
  settings.coordDecimals = {decimals, decimals, decimals};
  return settings;
}

class GsiExport : public ::testing::Test {
 protected:
  // Imports text, exports it in the format with settings; the exported file's text.
  std::string exportOf(const std::string& text, const wchar_t* formatId, const DexSettings& settings) {
    loader_ = gsi_test::loaderWith(settings);
    EXPECT_EQ(DEX_RESULT_OK, gsi_test::run(*loader_, dir_.write("in.gsi", text), gsi::kGsi8FormatId, false));
    source_ = dxf_test::describe(*loader_->getIEData());
    out_ = dir_.file("out" + std::to_string(++runs_) + ".gsi");
    result_ = gsi_test::run(*loader_, out_, formatId, true);
    return dex_test::readFile(out_);
  }
  // The points of the exported file, read back.
  Lines readBack(const DexSettings& settings) {
    auto loader = gsi_test::loaderWith(settings);
    EXPECT_EQ(DEX_RESULT_OK, gsi_test::run(*loader, out_, gsi::kLeicaGsiFormatId, false));
    return dxf_test::describe(*loader->getIEData());
  }

  TempDir dir_;
  std::unique_ptr<DexParsersLoader> loader_;
  Lines source_;
  int runs_ = 0;
  std::string out_;
  EDexResult result_ = DEX_RESULT_FAILED;
};

TEST_F(GsiExport, PointsBecomeCoordinateLinesOfTheFormatsVariant) {
  const std::string gsi8 = exportOf(kPoints, gsi::kGsi8FormatId, settingsOf(METERS, 3));
  EXPECT_EQ(DEX_RESULT_OK, result_);
  EXPECT_EQ(
      "110001+000000P1 81..10+00001000 82..10+00002000 83..10+00000300 71....+0000TREE 71....+000000EP\r\n"
      "110002+0000A102 81..10-00002000 82..10+00001000\r\n",
      gsi8);
  const std::string gsi16 = exportOf(kPoints, gsi::kGsi16FormatId, settingsOf(METERS, 4));
  EXPECT_EQ(
      "*110001+00000000000000P1 81..16+0000000000010000 82..16+0000000000020000 83..16+0000000000003000 "
      "71....+000000000000TREE 71....+00000000000000EP\r\n"
      "*110002+000000000000A102 81..16-0000000000020000 82..16+0000000000010000\r\n",
      gsi16);
}

struct UnitCase {
  const wchar_t* format;
  EDistUnits units;
  int decimals;
  char unitDigit;
};

TEST_F(GsiExport, EveryVariantAndUnitReadsBackToTheSamePoints) {
  const UnitCase cases[] = {
      {gsi::kGsi8FormatId, METERS, 3, '0'},    {gsi::kGsi8FormatId, METERS, 4, '6'},
      {gsi::kGsi8FormatId, ANY_UNITS, 5, '8'}, {gsi::kGsi8FormatId, IFEET, 3, '1'},
      {gsi::kGsi16FormatId, USFEET, 4, '7'},   {gsi::kGsi16FormatId, METERS, 3, '0'},
  };
  for (const UnitCase& c : cases) {
    const DexSettings settings = settingsOf(c.units, c.decimals);
    const std::string text = exportOf(kPoints, c.format, settings);
    EXPECT_EQ(DEX_RESULT_OK, result_) << c.unitDigit;
    EXPECT_NE(std::string::npos, text.find(std::string("81..1") + c.unitDigit)) << c.unitDigit;
    EXPECT_EQ(source_, readBack(settings)) << c.unitDigit;
  }
}

struct OverflowCase {
  const char* what;
  const wchar_t* format;
  std::string point;   // one GSI-16 line
  const char* remark;  // "" when it fits
};

TEST_F(GsiExport, AValueThatDoesNotFitRefusesTheExportAndWritesNothing) {
  const OverflowCase cases[] = {
      {"the largest GSI-8 value", gsi::kGsi8FormatId,
       "*110001+00000000000000P1 81..00-0000000099999999 82..00+0000000099999999", ""},
      {"one more", gsi::kGsi8FormatId,
       "*110001+00000000000000P1 81..00+0000000000000001 82..00+0000000100000000",
       "point 'P1': the northing 100000.000 m does not fit in a GSI-8 word (at most 99999.999 m); nothing is "
       "written"},
      {"a negative height", gsi::kGsi8FormatId,
       "*110001+00000000000000P1 81..00+0000000000000001 82..00+0000000000000001 83..00-0000000100000000",
       "the height -100000.000 m does not fit in a GSI-8 word"},
      {"fine decimals narrow the range", gsi::kGsi16FormatId,
       "*110001+00000000000000P1 81..00+1000000000000000 82..00+0000000000000001",
       "the easting 1000000000000.0000 m does not fit in a GSI-16 word"},
      {"a long point number", gsi::kGsi8FormatId,
       "*110001+0000000PT1234567 81..00+0000000000000001 82..00+0000000000000001",
       "the point number 'PT1234567' is longer than 8 characters"},
      {"a long code", gsi::kGsi8FormatId,
       "*110001+00000000000000P1 81..00+0000000000000001 82..00+0000000000000001 71....+0000000CODE12345",
       "the code 'CODE12345' is longer than 8 characters"},
      {"a point number with a blank", gsi::kGsi16FormatId,
       "*110001+        P 1      81..00+0000000000000001 82..00+0000000000000001",
       "the point number 'P 1' holds a character GSI cannot carry"},
  };
  for (const OverflowCase& c : cases) {
    const dex_test::LogCapture log;
    const bool fine = c.format == gsi::kGsi16FormatId && std::string(c.what).rfind("fine", 0) == 0;
    const std::string text = exportOf(c.point + "\n", c.format, settingsOf(METERS, fine ? 4 : 3));
    if (*c.remark == '\0') {
      EXPECT_EQ(DEX_RESULT_OK, result_) << c.what;
      EXPECT_EQ(source_, readBack(settingsOf(METERS, 3))) << c.what;
      continue;
    }
    EXPECT_EQ(DEX_RESULT_WRONG_FORMAT, result_) << c.what;
    EXPECT_TRUE(text.empty()) << c.what;
    EXPECT_FALSE(std::filesystem::exists(out_)) << c.what;
    EXPECT_EQ(1, log.countMessage(dex_test::widen(c.remark))) << c.what;
  }
}

TEST_F(GsiExport, OnlyPointsAreWrittenAndOnlyWhenTheSettingsAskForThem) {
  DexSettings rawOnly;
  rawOnly.addDataType(RAW_DATA);
  EXPECT_TRUE(
      exportOf("110001+000000S1 84..00+00001000\n" + std::string(kPoints), gsi::kGsi8FormatId, rawOnly)
          .empty());
  EXPECT_EQ(DEX_RESULT_OK, result_);
  EXPECT_EQ(2U, dex_test::linesOf(exportOf("110001+000000S1 84..00+00001000\n" + std::string(kPoints),
                                           gsi::kGsi8FormatId, settingsOf(METERS, 3)))
                    .size());
}

}  // namespace
