// The DXF importer of libImportParsers.so through the loader: what each entity becomes, layers and
// colours, units and encodings, drawings of other programs, and bad input.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "DxfTestModel.h"
#include "dxf/DxfWords.h"
#include "ieObjects/IEData.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::ie;
using dex_test::TempDir;
using Lines = std::vector<std::string>;

constexpr EDexResult kSkipped = dxf::kResultEntitiesSkipped;

std::string entities(const std::string& body) {
  return dxf_test::groups("0 SECTION|2 ENTITIES|" + body + "|0 ENDSEC|0 EOF");
}

// The description lines of the objects, regions and surfaces (not of the layers) unless withLayers.
Lines objectsOf(DexData& data, bool withLayers = false) {
  Lines lines = dxf_test::describe(data);
  if (!withLayers)
    std::erase_if(lines, [](const std::string& line) { return line.rfind("layer '", 0) == 0; });
  return lines;
}

class DxfImport : public ::testing::Test {
 protected:
  void SetUp() override { DexData::stopProcess_ = false; }
  void TearDown() override { DexData::stopProcess_ = false; }

  // Imports bytes as a file and answers the result; the loader is kept in loader_.
  EDexResult read(const std::string& bytes, DexSettings settings = dxf_test::drawingSettings()) {
    loader_ = dxf_test::loaderWith(settings);
    return dxf_test::importDxf(*loader_, dir_.write("in.dxf", bytes));
  }
  DexData& data() { return *loader_->getIEData(); }

  TempDir dir_;
  std::unique_ptr<DexParsersLoader> loader_;
};

struct EntityCase {
  const char* what;
  std::string dxf;
  Lines objects;
};

TEST_F(DxfImport, EachEntityBecomesItsModelObjectInWorldCoordinatesNorthingFirst) {
  const EntityCase cases[] = {
      {"POINT",
       entities("0 POINT|8 PTS|10 1.5|20 2.5|30 3"),
       {"point '' layer=PTS codes= color=- (2.500 1.500 3.000)"}},
      {"INSERT after a POINT names it; tags of civil programs",
       entities("0 POINT|8 PTS|62 1|10 1|20 2|30 0|0 INSERT|8 PTS|66 1|2 SURVEY|10 1|20 2|30 0|0 ATTRIB|2 "
                "PNTNO|1 17|"
                "0 ATTRIB|2 ELEV|1 12.5|0 ATTRIB|2 DESC|1 EP:1 TREE;Species=Oak|0 SEQEND"),
       {"point '17' layer=PTS codes=EP:1 TREE;Species=Oak color=255 (2.000 1.000 12.500)"}},
      {"INSERT alone; an empty HEIGHT is no height",
       entities(
           "0 INSERT|8 P|66 1|2 DEX_POINT|10 5|20 6|30 7|0 ATTRIB|2 NAME|1 A1|0 ATTRIB|2 HEIGHT|1 |0 SEQEND"),
       {"point 'A1' layer=P codes= color=- (6.000 5.000 -)"}},
      {"LWPOLYLINE closed, bulge, elevation",
       entities("0 LWPOLYLINE|8 L|90 3|70 1|38 4|10 0|20 0|42 1|10 10|20 0|10 10|20 10"),
       {"line '' layer=L codes= color=- dash=- width=- closed (0.000 0.000 4.000)b1.000 (0.000 10.000 "
        "4.000)b0.000 "
        "(10.000 10.000 4.000)b0.000"}},
      {"LWPOLYLINE without elevation has no heights",
       entities("0 LWPOLYLINE|8 L|10 1|20 2|10 3|20 4"),
       {"line '' layer=L codes= color=- dash=- width=- open (2.000 1.000 -)b0.000 (4.000 3.000 -)b0.000"}},
      {"LINE",
       entities("0 LINE|8 L|10 1|20 2|30 3|11 4|21 5|31 6"),
       {"line '' layer=L codes= color=- dash=- width=- open (2.000 1.000 3.000)b0.000 (5.000 4.000 "
        "6.000)b0.000"}},
      {"2D POLYLINE seen from below is mirrored and turns the other way",
       entities("0 POLYLINE|8 L|66 1|70 0|10 0|20 0|30 2|210 0|220 0|230 -1|0 VERTEX|8 L|10 1|20 1|42 0.5|0 "
                "VERTEX|8 L|"
                "10 3|20 1|0 SEQEND"),
       {"line '' layer=L codes= color=- dash=- width=- open (1.000 -1.000 -2.000)b-0.500 (1.000 -3.000 "
        "-2.000)b0.000"}},
      {"3D POLYLINE closed, ended by the next entity",
       entities("0 POLYLINE|8 L|66 1|70 9|0 VERTEX|10 1|20 2|30 3|70 32|0 VERTEX|10 4|20 5|30 6|70 32|0 "
                "POINT|10 0|20 0"),
       {"line '' layer=L codes= color=- dash=- width=- closed (2.000 1.000 3.000)b0.000 (5.000 4.000 "
        "6.000)b0.000",
        "point '' layer=0 codes= color=- (0.000 0.000 0.000)"}},
      {"polyface mesh",
       entities("0 POLYLINE|8 S|66 1|70 64|0 VERTEX|10 0|20 0|30 1|70 192|0 VERTEX|10 1|20 0|30 2|70 192|"
                "0 VERTEX|10 1|20 1|30 3|70 192|0 VERTEX|10 0|20 1|30 4|70 192|0 VERTEX|10 0|20 0|30 0|"
                "70 128|71 1|72 2|73 -3|74 4|0 SEQEND"),
       {"surface 'S' layer=S breaklines=0 [0.000,0.000,1.000 0.000,1.000,2.000 1.000,1.000,3.000] "
        "[0.000,0.000,1.000 1.000,1.000,3.000 1.000,0.000,4.000]"}},
      {"3DFACE of three corners",
       entities("0 3DFACE|8 F|10 0|20 0|30 0|11 1|21 0|31 0|12 1|22 1|32 1|13 1|23 1|33 1"),
       {"surface 'F' layer=F breaklines=0 [0.000,0.000,0.000 0.000,1.000,0.000 1.000,1.000,1.000]"}},
      {"ARC seen from below",
       entities("0 ARC|8 A|10 1|20 2|30 0|40 5|50 0|51 90|230 -1"),
       {"arc '' layer=A codes= color=- dash=- width=- (2.000 -1.000 0.000) r=5.000 from 90.000 to 180.000"}},
      {"CIRCLE",
       entities("0 CIRCLE|8 C|10 1|20 2|30 3|40 0.5"),
       {"circle '' layer=C codes= color=- (2.000 1.000 3.000) r=0.500"}},
      {"TEXT justified at its second point, control codes",
       entities("0 TEXT|8 T|10 0|20 0|30 0|40 2|1 %%c50 %%d%%%|50 45|72 1|11 5|21 6|31 0|100 AcDbText|73 2"),
       {"text '' layer=T codes= color=- (6.000 5.000 0.000) '\xC3\x98"
        "50 \xC2\xB0%' h=2.000 rot=45.000 at=5"}},
      {"MTEXT in chunks, formatting removed",
       entities("0 MTEXT|8 T|10 1|20 2|30 0|40 1.5|71 7|3 {\\fArial;Hel|3 lo}\\P|1 W\\U+00F6rld \\S1^2;|11 "
                "0|21 1|31 0"),
       {"text '' layer=T codes= color=- (2.000 1.000 0.000) 'Hello\nW\xC3\xB6rld 1/2' h=1.500 rot=90.000 "
        "at=7"}},
      {"entities without their section",
       dxf_test::groups("0 POINT|10 1|20 2|0 EOF"),
       {"point '' layer=0 codes= color=- (2.000 1.000 0.000)"}},
  };
  for (const EntityCase& entity : cases) {
    EXPECT_EQ(DEX_RESULT_OK, read(entity.dxf)) << entity.what;
    EXPECT_EQ(entity.objects, objectsOf(data())) << entity.what;
  }
}

TEST_F(DxfImport, LayersAndExplicitColoursLineTypesAndWeightsBecomeDrawingProperties) {
  const std::string layers =
      "0 SECTION|2 TABLES|0 TABLE|2 LAYER|0 LAYER|2 RED|70 0|62 1|6 DASHED|370 50|0 LAYER|2 OFF|70 1|62 "
      "-3|290 0|"
      "0 ENDTAB|0 ENDSEC|";
  ASSERT_EQ(DEX_RESULT_OK,
            read(dxf_test::groups(layers + "0 SECTION|2 ENTITIES|0 LINE|8 RED|10 0|20 0|11 1|21 0|"
                                           "0 LINE|8 RED|420 33023|370 106|6 DOTTED|10 0|20 0|11 1|21 0|"
                                           "0 CIRCLE|8 OFF|62 0|10 0|20 0|40 1|0 ENDSEC|0 EOF")));
  EXPECT_EQ(
      (Lines{"layer 'RED' color=255 dash=1 width=2", "layer 'OFF' color=65280 dash=- width=- off not plotted",
             "line '' layer=RED codes= color=255 dash=1 width=2 open (0.000 0.000 0.000)b0.000 (0.000 1.000 "
             "0.000)b0.000",
             "line '' layer=RED codes= color=16744448 dash=2 width=4 open (0.000 0.000 0.000)b0.000 "
             "(0.000 1.000 0.000)b0.000",
             "circle '' layer=OFF codes= color=0 (0.000 0.000 0.000) r=1.000"}),
      objectsOf(data(), true));
}

TEST_F(DxfImport, InsUnitsOrElseTheSettingsUnitConvertToMeters) {
  struct Case {
    const char* header;
    EDistUnits settingsUnits;
    const char* point;
  };
  const std::string point = "0 SECTION|2 ENTITIES|0 POINT|10 1000|20 1000|30 10|0 ENDSEC|0 EOF";
  for (const Case& unit :
       {Case{"", ANY_UNITS, "(1000.000 1000.000 10.000)"}, Case{"", IFEET, "(304.800 304.800 3.048)"},
        Case{"9 $INSUNITS|70 2|", ANY_UNITS, "(304.801 304.801 3.048)"},
        Case{"9 $INSUNITS|70 2|", IFEET, "(304.800 304.800 3.048)"},
        Case{"9 $INSUNITS|70 4|", IFEET, "(1.000 1.000 0.010)"}}) {
    DexSettings settings = dxf_test::drawingSettings();
    settings.distUnits = unit.settingsUnits;
    ASSERT_EQ(DEX_RESULT_OK,
              read(dxf_test::groups(std::string("0 SECTION|2 HEADER|") + unit.header + "0 ENDSEC|" + point),
                   settings));
    EXPECT_EQ(Lines{std::string("point '' layer=0 codes= color=- ") + unit.point}, objectsOf(data()))
        << unit.header;
  }
}

TEST_F(DxfImport, TextsAreUtf8FromAutoCad2007AndWindows1252Before) {
  for (const char* version : {"AC1021", "AC1015"}) {
    const std::string name = std::string(version) == "AC1021" ? "\xC3\x9C" : "\xDC";
    ASSERT_EQ(DEX_RESULT_OK, read(dxf_test::groups(std::string("0 SECTION|2 HEADER|9 $ACADVER|1 ") + version +
                                                   "|0 ENDSEC|0 SECTION|2 ENTITIES|0 POINT|8 " + name +
                                                   "|10 0|20 0|0 ENDSEC|0 EOF")));
    EXPECT_EQ(Lines{"point '' layer=\xC3\x9C codes= color=- (0.000 0.000 0.000)"}, objectsOf(data()))
        << version;
  }
}

struct FileCase {
  const char* file;
  EDexResult result;
  std::map<std::string, int> counts;
};

TEST_F(DxfImport, DrawingsOfOtherProgramsAreRead) {
  const FileCase cases[] = {
      {"dxfparser_polylines.dxf", DEX_RESULT_OK, {{"line|LaserWeb", 12}}},
      {"ezdxf_ASCII_R12.dxf",
       kSkipped,
       {{"line|\xCE\x9B\xCE\x91\xCE\x93\xCE\x95\xCE\xA1\xC3\x84\xC3\x9C\xC3\x96", 2}}},
      {"ezdxf_POLI-ALL210_12.DXF", DEX_RESULT_OK, {{"line|T-2DPLINE-ALL", 30}, {"face|0", 2}}},
  };
  for (const FileCase& drawing : cases) {
    loader_ = dxf_test::loaderWith();
    EXPECT_EQ(drawing.result,
              dxf_test::importDxf(*loader_, dex_test::dataFile(std::string("dxf/") + drawing.file)));
    EXPECT_EQ(drawing.counts, dxf_test::countByKindAndLayer(data())) << drawing.file;
  }
}

struct BadCase {
  const char* what;
  std::string bytes;
  EDexResult result;
  int objects;          // what was read well and kept
  const wchar_t* note;  // in the traces
};

TEST_F(DxfImport, BadInputGivesItsResultKeepsWhatWasReadAndNeverHangs) {
  const std::string point = "0 POINT|10 1|20 1|";
  const BadCase cases[] = {
      {"empty", "", DEX_RESULT_WRONG_FORMAT, 0, L"the file is empty"},
      {"blanks", " \r\n\t\n", DEX_RESULT_WRONG_FORMAT, 0, L"the file is empty"},
      {"binary DXF", std::string("AutoCAD Binary DXF\r\n\x1a\0", 22) + "\x00\x00", DEX_RESULT_WRONG_FORMAT, 0,
       L"binary DXF"},
      {"DWG", std::string("AC1015\0\0\0\0\0\x01", 12), DEX_RESULT_WRONG_FORMAT, 0, L"a DWG drawing"},
      {"not DXF", "hello world\nthis is text\n", DEX_RESULT_WRONG_FORMAT, 0, L"no DXF section or entity"},
      {"truncated in an entity", dxf_test::groups("0 SECTION|2 ENTITIES|" + point + "0 POINT|10 2"), kSkipped,
       1, L"ends inside the ENTITIES section"},
      {"a code without its value", dxf_test::groups("0 SECTION|2 ENTITIES|" + point) + "10\n", kSkipped, 1,
       L"without its value"},
      {"a damaged group code",
       entities("0 POINT|10 1|20 1|abc x|0 POINT|10 2|20 2|" + point.substr(0, point.size() - 1)), kSkipped,
       2, L"not a group code"},
      {"a value that is not a number",
       entities(point + "0 POINT|10 1,5|20 2|" + point + "0 LINE|10 nan|20 0|11 1|21 1"), kSkipped, 2,
       L"POINT skipped, group 10 is missing or not a number"},
      {"a point without its Y", entities("0 POINT|10 1|0 ARC|10 0|20 0|40 x"), kSkipped, 0,
       L"POINT skipped, group 20 is missing or not a number"},
      {"huge counts",
       entities("0 LWPOLYLINE|90 2000000000|10 0|20 0|10 1|20 1|0 POLYLINE|70 16|71 100000|72 100000|"
                "0 VERTEX|10 0|20 0|0 SEQEND|0 POLYLINE|70 64|0 VERTEX|10 0|20 0|70 128|71 99999|72 1|"
                "73 2|0 SEQEND"),
       kSkipped, 1, L"POLYLINE meshes without cells"},
      {"a line past the limit", entities(point + "0 POINT|8 " + std::string(70000, 'x') + "|10 1|20 1"),
       kSkipped, 1, L"POINT skipped, group 8"},
      {"what the model cannot hold",
       entities(point + "0 SPLINE|10 0|0 POINT|67 1|10 0|20 0|0 INSERT|2 TITLE|10 0|20 0"), kSkipped, 1,
       L"1 SPLINE entities not held"},
  };
  for (const BadCase& input : cases) {
    const dex_test::LogCapture log;
    EXPECT_EQ(input.result, read(input.bytes)) << input.what;
    int objects = 0;
    for (const auto& [key, count] : dxf_test::countByKindAndLayer(data()))
      objects += count;
    EXPECT_EQ(input.objects, objects) << input.what;
    EXPECT_EQ(1, log.countMessage(input.note)) << input.what;
  }
}

TEST_F(DxfImport, AMissingFileCannotBeOpenedAndTheStopFlagEndsTheImport) {
  loader_ = dxf_test::loaderWith();
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, dxf_test::importDxf(*loader_, dir_.file("missing.dxf")));
  const std::string path =
      dir_.writeRepeated("many.dxf", dxf_test::groups("0 SECTION|2 ENTITIES"),
                         dxf_test::groups("0 POINT|10 1|20 2|30 3"), 10000, dxf_test::groups("0 EOF"));
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, dxf_test::importDxf(*loader_, path));
}

}  // namespace
