// dexchange convert and dexchange info, run as a user runs them.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <string>

#include "ToolRun.h"
#include "ieDefinitions/IEFormatsData.h"
#include "pointfiles/PointLayout.h"
#include "support/TempDir.h"
#include "support/ToolProcess.h"

namespace {

using dex_test::contains;
using dex_test::runApart;
using dex_test::runScript;
using dex_test::runTool;
using dex_test::TempDir;

constexpr const char* kFields = "--fields 'Name,Northing,Easting,Ht,FullCodes' --delimiter ';'";

std::string quoted(const std::string& path) {
  return "'" + path + "'";
}

std::string sample() {
  return quoted(dex_test::dataFile("../../samples/survey.csv"));
}

std::string realJob() {
  return quoted(dex_test::dataFile("pointfiles/geodepy_Site13-134.txt"));
}

// The sample's point lines, as the CSV exporter writes them (the sample is written that way).
std::string samplePoints() {
  const std::string text = dex_test::readFile(dex_test::dataFile("../../samples/survey.csv"));
  return text.substr(text.find('\n') + 1);
}

TEST(ConvertCommand, ConvertsTheSampleToCustomAsciiAndBackOverwritingOnlyWithForce) {
  const TempDir dir;
  const auto there = runTool("convert " + sample() + " '" + dir.file("survey.pts") + "' " + kFields);
  ASSERT_EQ(0, there.exitCode) << there.output;
  EXPECT_TRUE(contains(there.output, "converted 325 objects")) << there.output;
  EXPECT_EQ(0u,
            dex_test::readFile(dir.file("survey.pts")).rfind("1000;5432100.000;312400.000;85.300;CP\r\n", 0));
  // Back onto an existing file: refused without --force, and the file left alone.
  const std::string again = dir.write("again.csv", "precious\n");
  const std::string command = "convert '" + dir.file("survey.pts") + "' '" + again + "' " + kFields;
  const auto refused = runTool(command);
  EXPECT_EQ(1, refused.exitCode);
  EXPECT_EQ("dexchange: convert: " + again + " already exists (use --force to overwrite it)\n",
            refused.output);
  EXPECT_EQ("precious\n", dex_test::readFile(again));
  const auto back = runTool(command + " --force");
  ASSERT_EQ(0, back.exitCode) << back.output;
  EXPECT_EQ(samplePoints(), dex_test::readFile(again));
}

TEST(ConvertCommand, ARealJobInEastingNorthingOrderKeepsEveryLine) {
  const TempDir dir;
  const auto run = runTool("convert " + realJob() + " '" + dir.file("job.csv") + "' --order PENZD");
  ASSERT_EQ(0, run.exitCode) << run.output;
  EXPECT_TRUE(contains(run.output, "converted 27 objects")) << run.output;
  EXPECT_TRUE(
      contains(run.output, ": 25 lines with values after the last column, kept in the points' notes"));
  const std::string written = dex_test::readFile(dir.file("job.csv"));
  EXPECT_EQ(27, std::count(written.begin(), written.end(), '\n'));
  EXPECT_EQ(0u, written.rfind(
                    "13,7001264.043,294137.723,394.008,\r\n1302,7001228.560,293989.188,397.528,Bs\r\n", 0));
}

TEST(ConvertCommand, EveryFailureGivesOneLineAndANonZeroExitCode) {
  const TempDir dir;
  const std::string out = " '" + dir.file("out.pts") + "'";
  const struct {
    std::string arguments;
    int exitCode;
    const char* message;
  } cases[] = {
      {"convert '" + dir.file("missing.csv") + "'" + out, 1, " not found"},
      {"convert " + sample() + out + " --to 'No Such Format'", 2, "no format named No Such Format"},
      {"convert " + sample() + " '" + dir.file("noextension") + "'", 2, "(no extension): name it with --to"},
      {"convert " + sample() + out + " --fields 'Name,Colour'", 2,
       "--fields: unknown point field \"Colour\""},
      {"convert " + sample() + out + " --order PNNE", 2, "--order: \"PNNE\" is no order of the letters"},
      {"convert " + sample() + out + " --order PNE --fields Name", 2, "give --fields or --order, not both"},
      {"convert " + sample() + out + " --units FURLONGS", 2, "--units: unknown distance unit"},
      {"convert " + sample() + out + " --delimiter '\"'", 2, "--delimiter: give one character"},
      {"convert " + sample() + out + " --types POINTS,WIDGETS", 2, "--types: unknown data kind"},
      {"convert " + sample() + out + " --from vyn", 2, "\"vyn\" fits 34 formats: 0 Vyn XML (*.vxml), 1 "},
      {"convert " + sample() + out + " --from 9999", 2,
       "no format with the index 9999 (see dexchange formats: 0 to 153)"},
      {"convert " + sample(), 2, "convert: give IN and OUT"},
      {"convert '" + dex_test::dataFile("pointfiles/no_points.csv") + "'" + out, 1,
       "holds nothing readable as CSV"},
      {"convert " + sample() + " '" + dir.file("no/such/folder/out.pts") + "'", 1, "cannot write "},
      {"convert " + sample() + " '" + dir.file("out.vxml") + "'", 1, "no plug-in writes Vyn XML (*.vxml)"},
      {"info '" + dir.file("missing.csv") + "'", 1, " not found"},
  };
  for (const auto& [arguments, exitCode, message] : cases) {
    const auto run = runApart(arguments);
    EXPECT_EQ(exitCode, run.exitCode) << arguments << "\n" << run.err;
    const std::string last = run.err.substr(std::min(run.err.rfind("dexchange: "), run.err.size()));
    EXPECT_EQ(1, std::count(last.begin(), last.end(), '\n')) << run.err;
    EXPECT_TRUE(contains(last, message)) << arguments << "\n" << run.err;
    EXPECT_EQ("", run.out) << arguments;
  }
  EXPECT_FALSE(std::ifstream(dir.file("out.pts")).good());
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

TEST(InfoCommand, ShowsLayoutLinesDatasetsObjectKindsCodesAndExtent) {
  const auto run = runApart("info " + realJob() + " --order PENZD");
  ASSERT_EQ(0, run.exitCode) << run.err;
  for (const char* part :
       {"format:   Customizable ASCII Point Files (*.pts; *.asc; *.xyz; *.csv; *.txt; *.ctf)\n",
        "layout:   columns Name, Easting, Northing, Ht, FullCodes (PENZD, as given); delimiter comma (found "
        "in the "
        "first lines)\n",
        "lines:    0 skipped (no name or no coordinates), 25 with values after the last column, 0 with "
        "values",
        "result:   22 (ok)\n", "datasets: 1\n  \"Import dataset\": 27 objects\n    design points: 27\n",
        "  Cra                 2\n", "extent:   (ANY_UNITS)\n  north   7001228.560 .. 7001309.300\n",
        "  east    293989.188 .. 294139.253\n"})
    EXPECT_TRUE(contains(run.out, part)) << part << "\n" << run.out;
  EXPECT_TRUE(contains(run.err, "dexchange: note: ")) << run.err;
}

TEST(InfoCommand, NamesTheFormatByGuidIndexNameTitlePrefixOrExtension) {
  const TempDir dir;
  const std::string file = dir.write("points.txt", "A 1.5 2.5 3.5 CP\nB 4.5 5.5 6.5 EP:1\n");
  const unsigned int index =
      vyn::ie::getIEFormatsData().getIndexFormatById(vyn::ie::point_files::kCustomAsciiFormatId);
  for (const std::string& from :
       {std::string("'{5f39ddc1-f0fd-4f27-938a-96eff426cd60}'"), std::to_string(index),
        std::string("'customizable ascii point files'"), std::string("'ASCII Points'"),
        std::string("Customizable"), std::string("pts"), std::string(".PTS")}) {
    const auto run = runApart("info '" + file + "' --from " += from);
    EXPECT_EQ(0, run.exitCode) << from << "\n" << run.err;
    EXPECT_TRUE(contains(run.out, "format:   Customizable ASCII")) << from << "\n" << run.out;
    EXPECT_TRUE(contains(run.out, "design points: 2\n")) << from << "\n" << run.out;
  }
  // A name that two formats share picks the one the tool reads.
  EXPECT_TRUE(
      contains(runApart("info " + sample() + " --from csv").out, "format:   CSV (Comma delimited) (.csv)"));
}

// The JSON report, read by Python's json module as a script would.
TEST(InfoCommand, TheJsonReportTellsTheLayoutTheLinesAndTheContents) {
  const TempDir dir;
  const std::string bad = dir.write("bad.csv", "Point,E,N,Z\n1,2,3,4,x\n,5,6,7\n2,abc,8,9\n");
  const std::string check =
      "import json, sys\n"
      "d = json.load(sys.stdin)\n"
      "i = d['input']; l = i['layout']; n = i['lines']\n"
      "print(d['version'], d['command'], d['exitCode'], d['error'], i['result'], i['format']['name'])\n"
      "print(l['columns'], l['order'], l['columnsFrom'], l['headerLine'], l['delimiter'], "
      "l['delimiterFrom'])\n"
      "print(n['skipped']['count'], n['skipped']['first'], n['keptExtra'], n['keptUnreadable']['count'])\n"
      "print(d['datasets'], d['objects'], d['codes'], d['layers'], d['extent']['north'], d['units'])\n";
  const auto run =
      runScript("\"$DEXCHANGE\" info '" + bad + "' --json 2>/dev/null | /usr/bin/python3 -c \"" + check +
                "\"; \"$DEXCHANGE\" convert " + realJob() + " '" + dir.file("out.pts") +
                "' --order PENZD --json 2>/dev/null | /usr/bin/python3 -c \"import json, sys; "
                "d = json.load(sys.stdin); print(d['output']['result'], d['output']['format']['index'], "
                "d['input']['lines']['keptExtra']['count'], d['objects'])\"");
  EXPECT_EQ(
      "1 info 0 None 23 CSV (Comma delimited) (.csv)\n"
      "['Name', 'Easting', 'Northing', 'Z'] PENZ header 1 comma found\n"
      "2 [{'line': 3, 'reason': 'no point name'}, {'line': 4, 'reason': 'easting is not a number'}] "
      "{'count': 1, 'first': [{'line': 2, 'reason': 'values after the last column'}]} 0\n"
      "[{'name': 'Import dataset', 'objects': 1, 'kinds': {'design points': 1}}] {'design points': 1} {} {} "
      "{'min': 3, 'max': 3} ANY_UNITS\n"
      "22 " +
          std::to_string(
              vyn::ie::getIEFormatsData().getIndexFormatById(vyn::ie::point_files::kCustomAsciiFormatId)) +
          " 25 {'design points': 27}\n",
      run.output);
}

}  // namespace
