// LandXML documents read through the loader and the shipped import plug-in.

#include <gtest/gtest.h>

#include <cmath>
#include <numbers>
#include <string>
#include <vector>

#include "LandXmlFixture.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEObjectList.h"
#include "ieObjects/IEParcel.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IERegion.h"
#include "support/LogCapture.h"

namespace {

using namespace landxml_test;
using dex_test::TempDir;

constexpr double kPi = std::numbers::pi;
constexpr EDexResult kNotHeld = static_cast<EDexResult>(23);
constexpr EDexResult kMalformed = static_cast<EDexResult>(24);
constexpr EDexResult kTruncated = static_cast<EDexResult>(25);

const DexDesignPoint* pointAt(const LandXmlRun& run, int index) {
  return dynamic_cast<const DexDesignPoint*>(run.dataset().getObjectAt(index));
}

const DexPolyLine* polylineAt(const LandXmlRun& run, int index) {
  int seen = 0;
  for (int i = 0; i < run.dataset().getNumberOfElements(OBJECT_TYPE_ALL, 2); ++i) {
    const auto* line = dynamic_cast<const DexPolyLine*>(run.dataset().getObjectAt(i));
    if (line != nullptr && seen++ == index) return line;
  }
  return nullptr;
}

std::string cgPoints(const std::string& points) {
  return "<CgPoints>" + points + "</CgPoints>";
}

std::string planFeature(const std::string& geometry) {
  return "<PlanFeatures><PlanFeature name=\"F\"><CoordGeom>" + geometry +
         "</CoordGeom></PlanFeature></PlanFeatures>";
}

class LandXmlImport : public ::testing::Test {
 protected:
  void TearDown() override { DexData::stopProcess_ = false; }

  LandXmlRun importText(const std::string& text, const DexSettings& settings = everyKind()) {
    return importFile(dir_.write("in.xml", text), settings);
  }

  TempDir dir_;
};

TEST_F(LandXmlImport, FilesOfOtherProgramsImportWithTheCountsTheyHold) {
  struct Case {
    const char* file;
    EDexResult result;
    Counts counts;
    const wchar_t* remark;
  };
  const Case cases[] = {
      // 639 CgPoints and a centre point for each of the 83 parcels; 2 TINs of 713 + 2716 points and
      // 1284 + 5241 faces; the surface profiles of the alignments and the pipe network are counted.
      {"crews_subdivision.xml", kNotHeld, {722, 0, 2, 3429, 6525, 0, 83, 83, 0}, L"not held: 6 ProfSurf"},
      {"crews_polyline.xml", kNotHeld, {0, 1, 0, 0, 0, 0, 0, 0, 0}, L"not held: 1 Project"},
      {"mac999_landxml_road_cl_sample.xml", kNotHeld, {}, L"not held: 1 Alignment@desc"},
  };
  for (const Case& c : cases) {
    const dex_test::LogCapture log;
    const LandXmlRun run = importFile(dex_test::dataFile(std::string("landxml/") + c.file));
    EXPECT_EQ(c.result, run.result) << c.file;
    EXPECT_EQ(c.counts, countsOf(run.dataset())) << c.file;
    EXPECT_EQ(1, log.countMessage(c.remark)) << c.file;
  }
}

TEST_F(LandXmlImport, ARealSubdivisionKeepsItsCodesUnitsParcelsAndArcs) {
  const LandXmlRun run = importFile(dex_test::dataFile("landxml/crews_subdivision.xml"));
  EXPECT_EQ(IFEET, run.data().getSettings().distUnits);
  EXPECT_EQ(DECDEG, run.data().getSettings().angleUnits);
  EXPECT_EQ(6, run.data().getIEDataDictionary()->getSize());
  const DexDesignPoint& first = *pointAt(run, 0);  // 1 PCOR 1145.99755444 -626.27773323 0
  EXPECT_EQ(L"1", first.getName());
  EXPECT_EQ(L"PCOR", first.getCode(0)->getDescription()->getName());
  EXPECT_NEAR(1145.99755444 * 0.3048, first.getStation().getX(), 1e-9);
  EXPECT_NEAR(-626.27773323 * 0.3048, first.getStation().getY(), 1e-9);
  const DexParcel& lot = *run.dataset().getParcelAt(0);
  EXPECT_EQ(L"Lot #1", lot.getName());
  ASSERT_NE(nullptr, lot.getHAlignment());
  EXPECT_EQ(L"Lot #1", lot.getHAlignment()->getName());
  EXPECT_NEAR(1316.52447736 * 0.3048, lot.getCentralPoint()->getStation().getX(), 1e-9);
  const DexRegion& boundary = *run.dataset().getRegionAt(0);
  EXPECT_EQ(L"Lot #1", boundary.getName());
  ASSERT_EQ(5u, boundary.getVerticesCount());  // 4 lines and a ccw curve of radius 43 ft, closed
  EXPECT_NEAR(std::tan(49.15 / 43 / 4), boundary.getVertexAt(3).getBulge(), 1e-4);
  EXPECT_EQ(0.0, boundary.getVertexAt(4).getBulge());
}

TEST_F(LandXmlImport, UnitsBecomeTheSettingsUnitsAndCoordinatesMeters) {
  struct Case {
    const char* units;
    double north;  // of the text "1 2 3", in meters
    EDistUnits distUnits;
    EAngleUnits angleUnits;
  };
  const char* const metric =
      "<Metric areaUnit=\"squareMeter\" volumeUnit=\"cubicMeter\" temperatureUnit=\"celsius\" ";
  const char* const imperial =
      "<Imperial areaUnit=\"acre\" volumeUnit=\"cubicFeet\" temperatureUnit=\"fahrenheit\" ";
  const Case cases[] = {
      {"linearUnit=\"meter\" angularUnit=\"radians\"", 1.0, METERS, RADIANS},
      {"linearUnit=\"millimeter\" angularUnit=\"grads\"", 0.001, MILLIMETERS, GRADS_GONS},
      {"linearUnit=\"kilometer\"", 1000.0, KILOMETERS, RADIANS},
      {"linearUnit=\"foot\" angularUnit=\"decimal dd.mm.ss\"", 0.3048, IFEET, DDDMMSSS},
      {"linearUnit=\"USSurveyFoot\" angularUnit=\"decimal degrees\"", 1200.0 / 3937.0, USFEET, DECDEG},
      {"linearUnit=\"inch\"", 0.0254, INCHES, RADIANS},
      {"linearUnit=\"mile\"", 1609.344, MILE, RADIANS},
  };
  for (const Case& c : cases) {
    const std::string element = std::string(c.units).find("meter") != std::string::npos ? metric : imperial;
    const std::string units = element + c.units + " pressureUnit=\"HPA\"/>";
    const LandXmlRun run = importText(document(cgPoints("<CgPoint name=\"P\">1 2 3</CgPoint>"), units));
    ASSERT_EQ(DEX_RESULT_OK, run.result) << c.units;
    EXPECT_NEAR(c.north, pointAt(run, 0)->getStation().getX(), 1e-12) << c.units;
    EXPECT_NEAR(3 * c.north, pointAt(run, 0)->getStation().getZ(), 1e-9) << c.units;
    EXPECT_EQ(c.distUnits, run.data().getSettings().distUnits) << c.units;
    EXPECT_EQ(c.angleUnits, run.data().getSettings().angleUnits) << c.units;
    // A curve's radius is in the unit of its points: a quarter circle.
    const LandXmlRun arc = importText(document(
        planFeature("<Curve rot=\"ccw\" radius=\"10\"><Start>0 10</Start><End>10 0</End></Curve>"), units));
    EXPECT_NEAR(std::tan(kPi / 8), polylineAt(arc, 0)->getNodeBulge(0), 1e-9) << c.units;
  }
}

TEST_F(LandXmlImport, BadInputGivesItsRemarkAndKeepsWhatWasReadWell) {
  std::string manyPoints;
  for (int i = 0; i < 2000; ++i)
    manyPoints += "<CgPoint name=\"" + std::to_string(i) + "\">1 2 3</CgPoint>\n";
  const std::string good = "<CgPoint name=\"G\">1 2 3</CgPoint>";
  const std::string triangle = "<P id=\"1\">0 0 1</P><P id=\"2\">0 1 1</P><P id=\"3\">1 0 1</P>";
  struct Case {
    const char* what;
    std::string text;
    EDexResult result;
    int points;
    int polylines;
    int triangles;
    const wchar_t* trace;
  };
  const Case cases[] = {
      {"truncated", document(cgPoints(manyPoints)).substr(0, 60000), kTruncated, -1, 0, 0, L"breaks off"},
      {"no closing root", document(cgPoints(good)).substr(0, document(cgPoints(good)).rfind("</LandXML>")),
       kTruncated, 1, 0, 0, L"breaks off"},
      {"unknown unit", document(cgPoints(good), "<Metric linearUnit=\"furlong\"/>"), kMalformed, 1, 0, 0,
       L"unknown linear unit, the fallback unit is used: furlong"},
      {"one value", document(cgPoints("<CgPoint name=\"A\">5</CgPoint>" + good)), kMalformed, 1, 0, 0,
       L"CgPoint skipped, its text is not 2 or 3 numbers: A: 5"},
      {"four values", document(cgPoints("<CgPoint name=\"A\">1 2 3 4</CgPoint>" + good)), kMalformed, 1, 0, 0,
       L"not 2 or 3 numbers"},
      {"not a number", document(cgPoints("<CgPoint name=\"A\">1 x 3</CgPoint>" + good)), kMalformed, 1, 0, 0,
       L"not 2 or 3 numbers"},
      {"infinite", document(cgPoints("<CgPoint name=\"A\">1 inf 3</CgPoint>" + good)), kMalformed, 1, 0, 0,
       L"not 2 or 3 numbers"},
      {"missing pntRef", document(cgPoints("<CgPoint name=\"A\" pntRef=\"Z\"/>" + good)), kMalformed, 1, 0, 0,
       L"CgPoint skipped, its pntRef names no point read before: Z"},
      {"face of a missing point",
       document("<Surfaces><Surface name=\"S\"><Definition surfType=\"TIN\"><Pnts>" + triangle +
                "</Pnts><Faces><F>1 2 3</F><F>1 2 9</F><F>1 2</F></Faces></Definition></Surface></Surfaces>"),
       kMalformed, 0, 0, 1, L"face skipped, it names a point the surface does not have: 1 2 9"},
      {"zero radius",
       document(
           planFeature("<Curve rot=\"cw\"><Start>0 0</Start><Center>0 0</Center><End>5 5</End></Curve>")),
       kMalformed, 0, 1, 0, L"Curve of zero radius read as its chord"},
      {"malformed Start", document(planFeature("<Line><Start>0</Start><End>5 5</End></Line>")), kMalformed, 0,
       0, 0, L"Start skipped, its text is not 2 or 3 numbers: 0"},
      {"not LandXML", "<?xml version=\"1.0\"?><Other><CgPoint>1 2 3</CgPoint></Other>",
       DEX_RESULT_WRONG_FORMAT, 0, 0, 0, nullptr},
      {"not XML", "northing easting\n1 2\n", DEX_RESULT_WRONG_FORMAT, 0, 0, 0, nullptr},
  };
  for (const Case& c : cases) {
    const dex_test::LogCapture log;
    const LandXmlRun run = importText(c.text);
    EXPECT_EQ(c.result, run.result) << c.what;
    const Counts counts = countsOf(run.dataset());
    if (c.points >= 0) {
      EXPECT_EQ(c.points, counts.points) << c.what;
    } else {
      EXPECT_GT(counts.points, 1000) << c.what;  // the points before the break
    }
    EXPECT_EQ(c.polylines, counts.polylines) << c.what;
    EXPECT_EQ(c.triangles, counts.triangles) << c.what;
    if (c.trace != nullptr) {
      EXPECT_LE(1, log.countMessage(c.trace)) << c.what;
    }
  }
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, importFile(dir_.file("missing.xml")).result);
}

TEST_F(LandXmlImport, CoordGeomElementsBecomeVerticesWithBulges) {
  // Around the centre (0, 0): east of it (N 0, E 10) and north of it (N 10, E 0).
  const std::string east = "<Start>0 10</Start>";
  const std::string north = "<End>10 0</End>";
  const double quarter = std::tan(kPi / 8);
  struct Case {
    const char* what;
    std::string geometry;
    int polylines;
    std::vector<double> bulges;  // of the first polyline's nodes
    bool closed;
  };
  const Case cases[] = {
      {"ccw by its centre",
       "<Curve rot=\"ccw\">" + east + "<Center>0 0</Center>" + north + "</Curve>",
       1,
       {quarter, 0},
       false},
      {"cw the long way",
       "<Curve rot=\"cw\">" + east + "<Center>0 0</Center>" + north + "</Curve>",
       1,
       {-std::tan(3 * kPi / 8), 0},
       false},
      {"by its tangents",
       "<Curve rot=\"ccw\">" + east + "<PI>10 10</PI>" + north + "</Curve>",
       1,
       {quarter, 0},
       false},
      {"by its radius",
       "<Curve rot=\"ccw\" radius=\"10\">" + east + north + "</Curve>",
       1,
       {quarter, 0},
       false},
      {"a full circle",
       "<Curve rot=\"cw\">" + east + "<Center>0 0</Center><End>0 10</End></Curve>",
       1,
       {-1, -1},
       true},
      {"a line and a curve",
       "<Line><Start>0 20</Start><End>0 10</End></Line><Curve rot=\"ccw\">" + east + "<Center>0 0</Center>" +
           north + "</Curve>",
       1,
       {0, quarter, 0},
       false},
      {"an irregular line",
       "<IrregularLine><Start>0 0</Start><End>10 0</End><PntList2D>0 0 5 5 10 0</PntList2D></IrregularLine>",
       1,
       {0, 0, 0},
       false},
      {"a gap",
       "<Line><Start>0 0</Start><End>1 1</End></Line><Line><Start>5 5</Start><End>6 6</End></Line>",
       2,
       {0, 0},
       false},
      {"a spiral between lines",
       "<Line><Start>0 0</Start><End>1 0</End></Line><Spiral><Start>1 0</Start><End>2 1</End></Spiral>"
       "<Line><Start>2 1</Start><End>3 1</End></Line>",
       2,
       {0, 0},
       false},
      {"a closed figure",
       "<Line><Start>0 0</Start><End>0 5</End></Line><Line><Start>0 5</Start><End>5 5</End></Line>"
       "<Line><Start>5 5</Start><End>0 0</End></Line>",
       1,
       {0, 0, 0},
       true},
  };
  for (const Case& c : cases) {
    const LandXmlRun run = importText(document(planFeature(c.geometry)));
    ASSERT_EQ(c.polylines, countsOf(run.dataset()).polylines) << c.what;
    const DexPolyLine& line = *polylineAt(run, 0);
    EXPECT_EQ(L"F", line.getName()) << c.what;
    EXPECT_EQ(c.closed, line.isClosed()) << c.what;
    ASSERT_EQ(static_cast<int>(c.bulges.size()), line.getNumberOfNodes()) << c.what;
    for (int i = 0; i < line.getNumberOfNodes(); ++i)
      EXPECT_NEAR(c.bulges[static_cast<std::size_t>(i)], line.getNodeBulge(i), 1e-12)
          << c.what << " node " << i;
  }
}

TEST_F(LandXmlImport, PointsKeepCodesNotesStatesReferencesAndGroups) {
  const dex_test::LogCapture log;
  const LandXmlRun run = importText(document(
      cgPoints(
          "<CgPoint name=\"K1\" code=\"EP:1 KERB;Material=Stone\" desc=\"kerb corner\" state=\"proposed\" "
          "oID=\"7\">10 20 3</CgPoint>"
          "<CgPoint name=\"K2\" code=\"TREE OAK;Girth\">11 21</CgPoint>"
          "<CgPoint name=\"K3\" pntRef=\"K1\"/>"
          "<CgPoints name=\"Control\"><CgPoint pntRef=\"K2\"/></CgPoints>") +
      planFeature("<Chain>K2 K3</Chain>")));
  EXPECT_EQ(kNotHeld, run.result);
  EXPECT_EQ(1, log.countMessage(L"not held: 1 CgPoint@oID"));
  ASSERT_EQ(3, countsOf(run.dataset()).points);
  const DexDesignPoint& k1 = *pointAt(run, 0);
  ASSERT_EQ(2, k1.getNumberOfCodes());
  EXPECT_EQ(L"1", k1.getCode(0)->getCodeStringAt(0));
  EXPECT_EQ(L"Stone", k1.getCode(1)->getAttrByName(L"Material"));
  EXPECT_EQ(L"kerb corner", k1.getStation().getNotes());
  EXPECT_TRUE(k1.getStation().hasPointAttr(8));  // "proposed", the fourth state flag from 5
  const DexDesignPoint& k2 = *pointAt(run, 1);
  ASSERT_EQ(1, k2.getNumberOfCodes());  // not a code text of the point files: one code
  EXPECT_EQ(L"TREE OAK;Girth", k2.getCode(0)->getDescription()->getName());
  EXPECT_FALSE(k2.isHeightDefined());
  const DexDesignPoint& k3 = *pointAt(run, 2);
  EXPECT_EQ(k1.getStation().getX(), k3.getStation().getX());
  EXPECT_EQ(3.0, k3.getStation().getZ());
  const DexObjectList& control = *run.dataset().findObjectListByName(L"Control");
  EXPECT_EQ(1, control.getNumberOfObjects());
  EXPECT_EQ(&k2, control.findObjectInTheList(L"K2"));
  const DexPolyLine& chain = *polylineAt(run, 0);
  ASSERT_TRUE(chain.isUsingPoints());
  EXPECT_EQ(&k2, chain.getPoint(0));
  EXPECT_EQ(&k3, chain.getPoint(1));
}

TEST_F(LandXmlImport, SurfacesKeepTheirBreaklinesAndSplitGridFaces) {
  const LandXmlRun run = importText(document(
      "<Surfaces><Surface name=\"EG\"><SourceData><Breaklines><Breakline name=\"ridge\" brkType=\"wall\">"
      "<PntList3D>0 0 1 0 5 2 0 9 1</PntList3D></Breakline></Breaklines></SourceData>"
      "<Definition surfType=\"grid\"><Pnts><P id=\"10\">0 0 1</P><P id=\"20\">0 9 1</P><P id=\"30\">9 9 2</P>"
      "<P id=\"4000000000\">9 0 2</P></Pnts><Faces><F>10 20 30 4000000000</F></Faces></Definition>"
      "</Surface></Surfaces>"));
  ASSERT_EQ(DEX_RESULT_OK, run.result);
  const DexSurface& surface = *run.dataset().getSurfaceAt(0);
  EXPECT_EQ(L"EG", surface.getName());
  ASSERT_EQ(2, surface.getNumberOfTriangles());
  EXPECT_EQ(3, surface.getTriangleAt(1)->getPosition(2));  // the sparse id's position
  ASSERT_EQ(1, surface.getNumberOfBreaklines());
  const DexBreakline& ridge = *surface.getBreaklineAt(0);
  EXPECT_EQ(L"ridge", ridge.getName());
  EXPECT_EQ(L"EG", ridge.getSurfaceName());
  EXPECT_EQ(2, ridge.getBreaklineType());
  EXPECT_EQ(3, ridge.getNumberOfStations());
}

TEST_F(LandXmlImport, OtherVersionsPrefixesAndUnaskedCollectionsAreReadWhereTheyAgree) {
  const std::string older =
      "<lx:LandXML xmlns:lx=\"http://www.landxml.org/schema/LandXML-1.1\" version=\"1.1\"><lx:CgPoints>"
      "<lx:CgPoint name=\"P\">1 2 3</lx:CgPoint></lx:CgPoints><lx:Surfaces><lx:Surface name=\"S\"/>"
      "</lx:Surfaces></lx:LandXML>";
  const LandXmlRun all = importText(older);
  EXPECT_EQ(DEX_RESULT_OK, all.result);
  EXPECT_EQ((Counts{1, 0, 1}), countsOf(all.dataset()));
  const LandXmlRun pointsOnly = importText(older, settingsFor({POINTS}));
  EXPECT_EQ(DEX_RESULT_OK, pointsOnly.result);  // the surfaces were not asked for: no remark
  EXPECT_EQ((Counts{1}), countsOf(pointsOnly.dataset()));
}

TEST_F(LandXmlImport, TheStopFlagEndsTheImportWithThePointsReadSoFar) {
  std::string points;
  for (int i = 0; i < 20000; ++i)
    points += "<CgPoint name=\"" + std::to_string(i) + "\">1 2 3</CgPoint>";
  DexData::stopProcess_ = true;
  const LandXmlRun run = importText(document(cgPoints(points)));
  EXPECT_EQ(DEX_RESULT_STOPPED, run.result);
  EXPECT_LT(countsOf(run.dataset()).points, 20000);
}

}  // namespace
