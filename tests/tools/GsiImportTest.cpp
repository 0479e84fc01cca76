// The GSI importer of libImportParsers.so through the loader: every unit digit and sign of both
// variants, set-ups and shots in recording order, coordinate lines as points, an instrument's file,
// and bad input.

#include <gtest/gtest.h>

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

constexpr EDexResult kSkipped = gsi::kResultWordsSkipped;

std::string realFile() {
  return std::string(DEXCHANGE_TEST_DATA_DIR) + "/gsi/geodepy_gsisample.gsi";
}

class GsiImport : public ::testing::Test {
 protected:
  void SetUp() override { DexData::stopProcess_ = false; }
  void TearDown() override { DexData::stopProcess_ = false; }

  EDexResult readFile(const std::string& path, const DexSettings& settings = gsi_test::rawAndPoints()) {
    loader_ = gsi_test::loaderWith(settings);
    return gsi_test::run(*loader_, path, gsi::kLeicaGsiFormatId, false);
  }
  EDexResult read(const std::string& text, const DexSettings& settings = gsi_test::rawAndPoints()) {
    return readFile(dir_.write("in.gsi", text), settings);
  }
  DexData& data() { return *loader_->getIEData(); }
  Lines raw() { return gsi_test::rawRecords(data()); }
  Lines points() { return dxf_test::describe(data()); }

  TempDir dir_;
  std::unique_ptr<DexParsersLoader> loader_;
};

struct WordCase {
  const char* word;  // put after a point number on a line of its own
  const char* record;
};

TEST_F(GsiImport, EveryUnitDigitAndSignOfBothVariantsGivesItsValue) {
  const WordCase cases[] = {
      {"21.102+12345670", "ss 'P1' HV(111.11103 - -) th=0.00000"},
      {"21.103+12345670", "ss 'P1' HV(123.45670 - -) th=0.00000"},
      {"21.104+12345300", "ss 'P1' HV(123.75833 - -) th=0.00000"},
      {"21.105+32000000", "ss 'P1' HV(180.00000 - -) th=0.00000"},
      {"22.103-01000000", "ss 'P1' HV(- -10.00000 -) th=0.00000"},
      {"31..00+00012345", "ss 'P1' HVS(- - 12.34500) th=0.00000"},
      {"31..01+00012345", "ss 'P1' HVS(- - 3.76276) th=0.00000"},
      {"31..06+00012345", "ss 'P1' HVS(- - 1.23450) th=0.00000"},
      {"31..07+00012345", "ss 'P1' HVS(- - 0.37628) th=0.00000"},
      {"31..08+00012345", "ss 'P1' HVS(- - 0.12345) th=0.00000"},
      {"32..00+00012345", "ss 'P1' HVD(- 12.34500 -) th=0.00000"},
      {"33..10-00001234", "ss 'P1' HVD(- - -1.23400) th=0.00000"},
      {"31..00+00001000 58..16-00000300", "ss 'P1' HVS(- - 1.00000) th=0.00000 pc=-0.03000"},
      {"21.324+0000000035959561", "ss 'P1' HV(359.99892 - -) th=0.00000"},
      {"87..16-0000000000012345 31..08+0000000000012345", "ss 'P1' HVS(- - 0.12345) th=-1.23450"},
  };
  for (const WordCase& c : cases) {
    const std::string word = c.word;
    const bool wide = word.size() > 16 && word[15] != ' ';
    const std::string line = wide ? "*110001+00000000000000P1 " + word : "110001+000000P1 " + word;
    EXPECT_EQ(DEX_RESULT_OK, read(line + "\n")) << c.word;
    EXPECT_EQ(Lines{c.record}, raw()) << c.word;
  }
}

TEST_F(GsiImport, FeetAreUsSurveyFeetWhenTheSettingsSaySo) {
  ASSERT_EQ(DEX_RESULT_OK, read("110001+000000P1 31..01+01000000\n", gsi_test::rawAndPoints(USFEET)));
  EXPECT_EQ(Lines{"ss 'P1' HVS(- - 304.80061) th=0.00000"}, raw());
}

TEST_F(GsiImport, SetUpsBacksightsAndSideshotsFollowTheRecordingOrderWithTheirHeights) {
  const std::string file =
      "110001+0000000A 84..10+00001000 85..10+00002000 86..10+00000300 87..10+00001500 88..10+00001600\n"
      "110002+0000000B 21.103+00000000 22.103+09000000 31..00+00010000\n"
      "110003+0000000C 21.103+09000000 22.103+09000000 31..00+00020000 87..10+00002000 71....+0000TREE\n"
      "110004+0000000B 21.103+00000100 22.103+09000000 31..00+00010001\n"
      "110005+0000000D 88..10+00001400\n"
      "110006+0000000C 21.103+18000000 22.103+09000000 31..00+00005000 32..00+00004999 33..00+00000012\n"
      "110007+0000000E 21.103+27000000 22.103+09000000 31..00+00005000 32..00+00004999 33..00-00000012\n";
  ASSERT_EQ(DEX_RESULT_OK, read(file));
  const Lines expected = {
      "stn 'A' NEU(2.00000 1.00000 0.30000) th=1.60000",
      "bs 'B' HVS(0.00000 90.00000 10.00000) th=1.50000",
      "ss 'C' HVS(90.00000 90.00000 20.00000) th=2.00000 codes=TREE",
      "bs 'B' HVS(0.00100 90.00000 10.00100) th=2.00000",
      "stn 'D' NEU(- - -) th=1.40000",
      "bs 'C' HVS(180.00000 90.00000 5.00000) th=2.00000 note=32=4.99900; 33=0.01200",
      "ss 'E' HVS(270.00000 90.00000 5.00000) th=2.00000 2nd HVD(270.00000 4.99900 -0.01200)",
  };
  EXPECT_EQ(expected, raw());
  EXPECT_TRUE(points().empty());
}

TEST_F(GsiImport, CoordinateLinesAreDesignPointsWithCodesWordsInAnyOrder) {
  const std::string file =
      "110001+000000P1 81..00+00001000 82..00+00002000 83..00+00000300 71....+0000TREE 72....+00000OAK\n"
      "82..06-00020000 71....+000000EP 110002+000000P2 81..06+00010000\n"
      "*110003+00000000000000P3 81..00+0000000000001000 82..00+0000000000002000 41....+00000000000000K1\n";
  const dex_test::LogCapture log;
  ASSERT_EQ(DEX_RESULT_OK, read(file));
  const Lines expected = {
      "point 'P1' layer=- codes=TREE color=- (2.000 1.000 0.300)",
      "point 'P2' layer=- codes=EP color=- (-2.000 1.000 -)",
      "point 'P3' layer=- codes=K1 color=- (2.000 1.000 -)",
  };
  EXPECT_EQ(expected, points());
  EXPECT_TRUE(raw().empty());
  EXPECT_EQ(1, log.countMessage(L"GSI-8 and GSI-16 lines in one file"));
}

TEST_F(GsiImport, ShotsWithCoordinatesKeepThemAndGiveAPoint) {
  ASSERT_EQ(DEX_RESULT_OK, read("110001+000000P1 21.103+00000000 22.103+09000000 31..00+00010000 "
                                "81..00+00010000 82..00+00020000 83..00+00000500\n"));
  EXPECT_EQ(Lines{"ss 'P1' HVS(0.00000 90.00000 10.00000) th=0.00000 xyz NEU(20.00000 10.00000 0.50000)"},
            raw());
  EXPECT_EQ(Lines{"point 'P1' layer=- codes= color=- (20.000 10.000 0.500)"}, points());
}

TEST_F(GsiImport, TheSettingsDataKindsChooseRawRecordsOrPoints) {
  const std::string file =
      "110001+000000S1 84..00+00001000 85..00+00001000\n"
      "110002+000000P1 81..00+00001000 82..00+00002000\n";
  DexSettings pointsOnly;
  pointsOnly.addDataType(POINTS);
  ASSERT_EQ(DEX_RESULT_OK, read(file, pointsOnly));
  EXPECT_TRUE(raw().empty());
  EXPECT_EQ(1U, points().size());
  DexSettings rawOnly;
  rawOnly.addDataType(RAW_DATA);
  ASSERT_EQ(DEX_RESULT_OK, read(file, rawOnly));
  EXPECT_EQ(1U, raw().size());
  EXPECT_TRUE(points().empty());
}

TEST_F(GsiImport, AnInstrumentsFileGivesItsSetUpsShotsAndHandReadValues) {
  const dex_test::LogCapture log;
  ASSERT_EQ(DEX_RESULT_OK, readFile(realFile()));
  const Lines records = raw();
  ASSERT_EQ(147U, records.size());
  int stations = 0;
  int backsights = 0;
  int sideshots = 0;
  for (const std::string& record : records) {
    stations += record.rfind("stn ", 0) == 0;
    backsights += record.rfind("bs ", 0) == 0;
    sideshots += record.rfind("ss ", 0) == 0;
  }
  EXPECT_EQ(5, stations);
  EXPECT_EQ(56, backsights);
  EXPECT_EQ(86, sideshots);
  // Line 1: station 8 at E 999.9994 N 1049.4655 H 100.6701, instrument 1.645; line 2: 359°59'56.1",
  // 93°25'00.6", slope 57.8473, horizontal 57.7445, reflector 1.421; line 3: 18°42'39.1", 92°13'38.9",
  // slope 70.3127, horizontal 70.2596, reflector 0.
  EXPECT_EQ("stn '8' NEU(1049.46550 999.99940 100.67010) th=1.64500", records[0]);
  EXPECT_EQ("bs '9' HVS(359.99892 93.41683 57.84730) th=1.42100 note=32=57.74450", records[1]);
  EXPECT_EQ("ss '10' HVS(18.71086 92.22747 70.31270) th=0.00000 2nd HVD(18.71086 70.25960 -)", records[2]);
  EXPECT_EQ(1, log.countMessage(L"5 set-ups, 56 backsights, 86 sideshots, 0 points, 0 notes"));
}

struct BadCase {
  const char* what;
  std::string text;
  EDexResult result;
  Lines records;
  const char* note;  // a trace the run leaves
};

TEST_F(GsiImport, BadInputHasItsDocumentedResultAndKeepsTheGoodWords) {
  const BadCase cases[] = {
      {"an empty file", "", DEX_RESULT_WRONG_FORMAT, {}, "no GSI record in the file"},
      {"no GSI at all", "hello world\n\n", DEX_RESULT_WRONG_FORMAT, {}, "line 1, column 1: a short word"},
      {"a short word",
       "110001+000000P1 21.103+1234 31..00+00001000\n",
       kSkipped,
       {"ss 'P1' HVS(- - 1.00000) th=0.00000"},
       "line 1, column 17: a short word"},
      {"a non-digit",
       "110001+000000P1 21.103+0001X000 31..00+00001000\n",
       kSkipped,
       {"ss 'P1' HVS(- - 1.00000) th=0.00000"},
       "line 1, column 17: a non-digit in the value"},
      {"an unknown unit digit",
       "110001+000000P1 21.109+00010000 31..00+00001000\n",
       kSkipped,
       {"ss 'P1' HVS(- - 1.00000) th=0.00000"},
       "column 17: a unit digit that is no angle unit"},
      {"an angle unit on a distance",
       "110001+000000P1 31..02+00001000 21.103+00010000\n",
       kSkipped,
       {"ss 'P1' HV(0.10000 - -) th=0.00000"},
       "column 17: a unit digit that is no distance unit"},
      {"sixty minutes",
       "110001+000000P1 21.104+00060000 22.104+09000000\n",
       kSkipped,
       {"ss 'P1' HV(- 90.00000 -) th=0.00000"},
       "minutes or seconds of 60 or more"},
      {"no sign",
       "110001+000000P1 21.103*00010000 22.103+09000000\n",
       kSkipped,
       {"ss 'P1' HV(- 90.00000 -) th=0.00000"},
       "a word without sign"},
      {"a GSI-16 word on a GSI-8 line",
       "110001+000000P1 21.103+0000000000010000 22.103+09000000\n",
       kSkipped,
       {"ss 'P1' HV(- 90.00000 -) th=0.00000"},
       "a long word"},
      {"a line of bad words between good ones",
       "110001+000000P1 31..00+00001000\nXX..00+0000 ????\n110002+000000P2 31..00+00002000\n",
       kSkipped,
       {"ss 'P1' HVS(- - 1.00000) th=0.00000", "ss 'P2' HVS(- - 2.00000) th=0.00000"},
       "1 lines without a good word left out"},
      {"unknown words are counted, not a fault",
       "110001+000000P1 19....+12345678 51..1.+0000+000 31..00+00001000\n",
       DEX_RESULT_OK,
       {"ss 'P1' HVS(- - 1.00000) th=0.00000"},
       "2 words of an index without place left out (word 19, 51)"},
      {"a code line without a point is a note",
       "410001+0000TREE 42....+00000OAK\n",
       DEX_RESULT_OK,
       {"note '41=TREE; 42=OAK'"},
       "0 points, 1 notes"},
  };
  for (const BadCase& c : cases) {
    const dex_test::LogCapture log;
    EXPECT_EQ(c.result, read(c.text)) << c.what;
    EXPECT_EQ(c.records, raw()) << c.what;
    EXPECT_EQ(1, log.countMessage(dex_test::widen(c.note))) << c.what;
  }
}

TEST_F(GsiImport, TheToolsInfoShowsTheSetUpsAndShots) {
  const dex_test::ToolRun run = dex_test::runApart("info '" + realFile() + "'");
  EXPECT_EQ(0, run.exitCode);
  for (const char* line : {"        backsights: 56", "        sideshots: 86", "        stations: 5",
                           "      stations set up: 5 (8, 10, 11, 6, 7)"})
    EXPECT_TRUE(dex_test::contains(run.out, line)) << line << "\n" << run.out;
}

TEST_F(GsiImport, AMissingFileIsAFileError) {
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, readFile(dir_.file("missing.gsi")));
}

TEST_F(GsiImport, AStopRequestEndsTheRunKeepingWhatWasRead) {
  std::string file;
  for (int i = 0; i < 3000; ++i)
    file += "110001+000000P1 31..00+00001000\n";
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, read(file));
  EXPECT_EQ(1023U, raw().size());
}

}  // namespace
