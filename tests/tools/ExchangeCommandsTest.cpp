// dexchange convert and dexchange info, run as a user runs them.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <string>

#include "support/TempDir.h"
#include "support/ToolProcess.h"

namespace {

using dex_test::runScript;
using dex_test::runTool;
using dex_test::TempDir;

const std::string kFields = "--fields 'Name,Northing,Easting,Ht,FullCodes' --delimiter ';'";

std::string sample() {
  return dex_test::dataFile("../../samples/survey.csv");
}

// The sample's point lines, as the CSV exporter writes them (the sample is written that way).
std::string samplePoints() {
  const std::string text = dex_test::readFile(sample());
  return text.substr(text.find('\n') + 1);
}

bool contains(const std::string& text, const std::string& part) {
  return text.find(part) != std::string::npos;
}

TEST(ConvertCommand, ConvertsTheSampleSurveyToCustomAsciiAndBackWithoutLoss) {
  const TempDir dir;
  const auto there = runTool("convert '" + sample() + "' '" + dir.file("survey.pts") + "' " + kFields);
  ASSERT_EQ(0, there.exitCode) << there.output;
  EXPECT_TRUE(contains(there.output, "converted 325 objects")) << there.output;
  EXPECT_EQ(0u,
            dex_test::readFile(dir.file("survey.pts")).rfind("1000;5432100.000;312400.000;85.300;CP\r\n", 0));

  const auto back =
      runTool("convert '" + dir.file("survey.pts") + "' '" + dir.file("again.csv") + "' " + kFields);
  ASSERT_EQ(0, back.exitCode) << back.output;
  EXPECT_EQ(samplePoints(), dex_test::readFile(dir.file("again.csv")));
}

TEST(ConvertCommand, AnExistingOutputIsOverwrittenOnlyWithForce) {
  const TempDir dir;
  const std::string out = dir.write("out.csv", "precious\n");
  const auto refused = runTool("convert '" + sample() + "' '" + out + "'");
  EXPECT_EQ(1, refused.exitCode);
  EXPECT_EQ("dexchange: convert: " + out + " already exists (use --force to overwrite it)\n", refused.output);
  EXPECT_EQ("precious\n", dex_test::readFile(out));

  const auto forced = runTool("convert '" + sample() + "' '" + out + "' --force");
  EXPECT_EQ(0, forced.exitCode) << forced.output;
  EXPECT_EQ(samplePoints(), dex_test::readFile(out));
}

TEST(ConvertCommand, EveryFailureGivesOneLineAndANonZeroExitCode) {
  const TempDir dir;
  const std::string out = dir.file("out.pts");
  const std::pair<std::string, int> cases[] = {
      {"convert '" + dir.file("missing.csv") + "' '" + out + "'", 1},
      {"convert '" + sample() + "' '" + out + "' --to 'No Such Format'", 2},
      {"convert '" + sample() + "' '" + dir.file("noextension") + "'", 2},
      {"convert '" + sample() + "' '" + out + "' --fields 'Name,Colour'", 2},
      {"convert '" + sample() + "' '" + out + "' --units FURLONGS", 2},
      {"convert '" + sample() + "' '" + out + "' --delimiter '\"'", 2},
      {"convert '" + sample() + "' '" + out + "' --types POINTS,WIDGETS", 2},
      {"convert '" + sample() + "'", 2},
      {"convert '" + dex_test::dataFile("pointfiles/no_points.csv") + "' '" + out + "'", 1},
      {"convert '" + sample() + "' '" + dir.file("no/such/folder/out.pts") + "'", 1},
      {"convert '" + sample() + "' '" + dir.file("out.vxml") + "'", 1},
      {"info '" + dir.file("missing.csv") + "'", 1},
  };
  for (const auto& [arguments, exitCode] : cases) {
    const auto run = runTool(arguments);
    EXPECT_EQ(exitCode, run.exitCode) << arguments << "\n" << run.output;
    const std::string last = run.output.substr(
        run.output.rfind("dexchange: ") == std::string::npos ? 0 : run.output.rfind("dexchange: "));
    EXPECT_EQ(0u, last.rfind("dexchange: ", 0)) << run.output;
    EXPECT_EQ(1, std::count(last.begin(), last.end(), '\n')) << run.output;
  }
  EXPECT_TRUE(contains(runTool("convert '" + sample() + "' '" + dir.file("out.vxml") + "'").output,
                       "dexchange: convert: no plug-in writes Vyn XML (*.vxml)"));
  EXPECT_FALSE(std::ifstream(out).good());
}

TEST(ConvertCommand, SkippedLinesAreReportedAsNotes) {
  const TempDir dir;
  const auto run = runTool("convert '" + dex_test::dataFile("pointfiles/malformed_lines.csv") + "' '" +
                           dir.file("good.csv") + "'");
  EXPECT_EQ(0, run.exitCode) << run.output;
  EXPECT_TRUE(contains(run.output, "dexchange: note: ")) << run.output;
  EXPECT_TRUE(contains(run.output, "5 malformed lines skipped, 3 points read")) << run.output;
  EXPECT_TRUE(contains(run.output, "converted 3 objects")) << run.output;
}

TEST(ConvertCommand, CtrlCStopsTheRunWithExitCode130) {
  const TempDir dir;
  // The input is a pipe that delivers some lines, waits, then more: the signal comes in the wait.
  const auto run = runScript("cd '" + dir.path() +
                             "' || exit 1; mkfifo in.csv || exit 1; "
                             "{ for i in $(seq 2000); do echo \"$i,1.0,2.0,3.0,GND\"; done; sleep 2; "
                             "  for i in $(seq 2000); do echo \"x$i,1.0,2.0,3.0,GND\"; done; } > in.csv & "
                             "writer=$!; \"$DEXCHANGE\" convert in.csv out.pts & tool=$!; sleep 1; "
                             "kill -INT $tool; wait $tool; echo \"exit $?\"; kill $writer 2>/dev/null; wait; "
                             "test -e out.pts && echo 'out.pts written'");
  EXPECT_TRUE(contains(run.output, "dexchange: convert: stopped while reading in.csv\n")) << run.output;
  EXPECT_TRUE(contains(run.output, "exit 130")) << run.output;
  EXPECT_FALSE(contains(run.output, "out.pts written")) << run.output;
}

TEST(InfoCommand, ShowsDatasetsObjectKindsCodesAndExtent) {
  const auto run = runTool("info '" + sample() + "'");
  ASSERT_EQ(0, run.exitCode) << run.output;
  EXPECT_TRUE(contains(run.output, "format:   CSV (Comma delimited) (.csv)\n")) << run.output;
  EXPECT_TRUE(
      contains(run.output, "datasets: 1\n  \"Import dataset\": 325 objects\n    design points: 325\n"))
      << run.output;
  EXPECT_TRUE(contains(run.output, "codes: 11\n")) << run.output;
  EXPECT_TRUE(contains(run.output, "  EP                  120\n")) << run.output;
  EXPECT_TRUE(contains(run.output, "layers: 0\n")) << run.output;
  EXPECT_TRUE(contains(run.output, "  north   5432080.000 .. ")) << run.output;
}

TEST(InfoCommand, NamesTheFormatByGuidNameOrExtension) {
  const TempDir dir;
  const std::string file = dir.write("points.txt", "A 1.5 2.5 3.5 CP\nB 4.5 5.5 6.5 EP:1\n");
  for (const std::string& from : {std::string("'{5F39DDC1-F0FD-4F27-938A-96EFF426CD60}'"),
                                  std::string("'ASCII Points'"), std::string("pts")}) {
    const auto run = runTool("info '" + file + "' --from " + from + " --delimiter space");
    EXPECT_EQ(0, run.exitCode) << run.output;
    EXPECT_TRUE(contains(run.output, "design points: 2\n")) << from << "\n" << run.output;
  }
}

}  // namespace
