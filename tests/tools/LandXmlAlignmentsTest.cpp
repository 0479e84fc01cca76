// Roads through the LandXML plug-in: horizontal elements, station equations and profiles read,
// written schema-valid and read back.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "LandXmlFixture.h"
#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEStationEquations.h"
#include "ieObjects/IEVerticalAlignment.h"

namespace {

using namespace landxml_test;
using dex_test::TempDir;

constexpr EDexResult kNotHeld = static_cast<EDexResult>(23);
constexpr EDexResult kMalformed = static_cast<EDexResult>(24);
constexpr EDexResult kTruncated = static_cast<EDexResult>(25);
constexpr double kTight = 1e-9;
constexpr double kWritten = 5.0001e-4;  // three decimals of coordinates
constexpr double kAngle = 1e-4;         // degrees, from positions written to three decimals

// A road of every element kind: a line north-east, a spiral into a left curve of radius 400, a
// spiral out; two equations; a profile of each vertex kind.
constexpr const char* kRoad = R"(<Alignments><Alignment name="Main" length="960" staStart="100">
<CoordGeom>
<Line><Start>4500 5000</Start><End>4759.807621135332 5150</End></Line>
<Spiral length="80" radiusStart="INF" radiusEnd="400" rot="ccw" spiType="clothoid">
<Start>4759.807621135332 5150</Start><PI>4806.019859579980 5176.680648305874</PI>
<End>4830.352784728756 5187.652266484913</End></Spiral>
<Curve rot="ccw" radius="400"><Start>4830.352784728756 5187.652266484913</Start>
<Center>4994.770307799261 4823.006029554706</Center><End>5025.301075223637 5221.839167897646</End></Curve>
<Spiral length="80" radiusStart="400" radiusEnd="INF" rot="ccw" spiType="cubicParabola" constant="178.885">
<Start>5025.301075223637 5221.839167897646</Start><PI>5051.915299968832 5219.801842942023</PI>
<End>5104.448515045761 5210.437586977566</End></Spiral>
</CoordGeom>
<StaEquation staInternal="400" staBack="400" staAhead="1000" desc="E1"/>
<StaEquation staInternal="700" staAhead="2000"/>
<Profile name="Main"><ProfAlign name="FG">
<PVI>100 50</PVI><ParaCurve length="100">300 54</ParaCurve>
<UnsymParaCurve lengthIn="40" lengthOut="60">500 50</UnsymParaCurve>
<CircCurve length="80" radius="2000">700 52</CircCurve><PVI>1060 43</PVI>
</ProfAlign></Profile>
</Alignment></Alignments>)";

LandXmlRun readText(TempDir& dir, const std::string& text, const std::string& name = "road.xml") {
  return importFile(dir.write(name, text));
}

const DexAlignment& onlyAlignment(const LandXmlRun& run) {
  EXPECT_EQ(1, run.dataset().getNumberOfAlignments());
  return *run.dataset().getAlignmentAt(0);
}

const DexHorizontalAlignment& horizontalOf(const DexAlignment& alignment) {
  return *dynamic_cast<const DexHorizontalAlignment*>(
      alignment.getAlignmentPart(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
}

const DexVerticalAlignment& verticalOf(const DexAlignment& alignment) {
  return *dynamic_cast<const DexVerticalAlignment*>(
      alignment.getAlignmentPart(IDexAlignmentPart::VERTICAL_ALIGNMENT));
}

// Every position and value of every element, by kind, in one list (kind, positions then values).
std::vector<double> valuesOf(const IDexAlignmentObjInterface& element) {
  std::vector<double> values{static_cast<double>(element.getType())};
  const auto add = [&values](const auto& record, int spiralType, bool clockwise) {
    for (int p = 0; p < record.kNumberOfPositions; ++p) {
      values.push_back(record.getPosition(p).getX());
      values.push_back(record.getPosition(p).getY());
    }
    for (int d = 0; d < record.kNumberOfData; ++d)
      values.push_back(record.getData(d));
    values.push_back(spiralType);
    values.push_back(clockwise ? 1.0 : 0.0);
  };
  if (const auto* line = dynamic_cast<const DexLine2D*>(&element)) add(*line, -1, false);
  if (const auto* curve = dynamic_cast<const DexCurve*>(&element)) add(*curve, -1, curve->isTurnClockwised());
  if (const auto* spiral = dynamic_cast<const DexSpiral*>(&element))
    add(*spiral, spiral->getSpiralType(), spiral->isTurnClockwised());
  return values;
}

void expectSameRoad(const DexAlignment& a, const DexAlignment& b, double tolerance) {
  EXPECT_EQ(a.getName(), b.getName());
  EXPECT_NEAR(a.getStaStart(), b.getStaStart(), tolerance);
  EXPECT_NEAR(a.getLength(), b.getLength(), tolerance);
  const DexHorizontalAlignment& x = horizontalOf(a);
  const DexHorizontalAlignment& y = horizontalOf(b);
  ASSERT_EQ(x.getNumberOfSegments(), y.getNumberOfSegments());
  for (int i = 0; i < x.getNumberOfSegments(); ++i) {
    const std::vector<double> u = valuesOf(*x.getSegmentAt(i));
    const std::vector<double> v = valuesOf(*y.getSegmentAt(i));
    ASSERT_EQ(u.size(), v.size());
    for (std::size_t k = 0; k < u.size(); ++k)
      EXPECT_NEAR(u[k], v[k], std::max(tolerance, kAngle)) << "element " << i << " value " << k;
  }
  ASSERT_NE(nullptr, a.getStaEquationSet());
  ASSERT_NE(nullptr, b.getStaEquationSet());
  EXPECT_TRUE(*a.getStaEquationSet() == *b.getStaEquationSet());
  const DexVerticalAlignment& p = verticalOf(a);
  const DexVerticalAlignment& q = verticalOf(b);
  EXPECT_EQ(p.getName(), q.getName());
  ASSERT_EQ(p.getNumberOfVerticalElements(), q.getNumberOfVerticalElements());
  for (int i = 0; i < p.getNumberOfVerticalElements(); ++i) {
    EXPECT_EQ(p.getVerticalElementAt(i)->getElementType(), q.getVerticalElementAt(i)->getElementType());
    for (int d = 0; d < DexVerticalElement::kNumberOfDataTypes; ++d)
      EXPECT_NEAR(p.getVerticalElementAt(i)->getData(d), q.getVerticalElementAt(i)->getData(d), tolerance)
          << "vertex " << i << " value " << d;
  }
  EXPECT_EQ(p.getNumberOfLongSections(), q.getNumberOfLongSections());
}

class LandXmlAlignments : public ::testing::Test {
 protected:
  TempDir dir_;
};

TEST_F(LandXmlAlignments, EveryElementKindBecomesItsElementClassWithAzimuthsLengthsAndRadii) {
  const LandXmlRun run = readText(dir_, document(kRoad));
  EXPECT_EQ(DEX_RESULT_OK, run.result);
  const DexAlignment& road = onlyAlignment(run);
  EXPECT_EQ(100.0, road.getStaStart());
  EXPECT_EQ(960.0, road.getLength());
  const DexHorizontalAlignment& plan = horizontalOf(road);
  ASSERT_EQ(4, plan.getNumberOfSegments());
  const auto& line = dynamic_cast<const DexLine2D&>(*plan.getSegmentAt(0));
  EXPECT_NEAR(30.0, line.getData(DexLine2D::START_AZIMUTH), kTight);
  EXPECT_NEAR(300.0, line.getData(DexLine2D::LENGTH), kTight);
  const auto& in = dynamic_cast<const DexSpiral&>(*plan.getSegmentAt(1));
  EXPECT_EQ(DexSpiral::CLOTHOID, in.getSpiralType());
  EXPECT_FALSE(in.isTurnClockwised());
  EXPECT_EQ(0.0, in.getData(DexSpiral::START_RADIUS));  // INF, the straight end
  EXPECT_EQ(400.0, in.getData(DexSpiral::END_RADIUS));
  EXPECT_NEAR(30.0, in.getData(DexSpiral::START_AZIMUTH), kAngle);
  EXPECT_NEAR(24.2704, in.getData(DexSpiral::END_AZIMUTH), kAngle);
  EXPECT_NEAR(178.885438, in.getData(DexSpiral::SPIRAL_CONSTANT), 1e-6);  // sqrt(R L) without constant
  const auto& arc = dynamic_cast<const DexCurve&>(*plan.getSegmentAt(2));
  EXPECT_NEAR(400.0, arc.getData(DexCurve::RADIUS), 1e-5);
  EXPECT_NEAR(24.2704, arc.getData(DexCurve::START_AZIMUTH), kAngle);
  EXPECT_NEAR(-28.6479, arc.getData(DexCurve::DEFLECTION), kAngle);  // 200 m of a left turn
  EXPECT_NEAR(200.0, arc.getData(DexCurve::LENGTH), 1e-4);
  const auto& out = dynamic_cast<const DexSpiral&>(*plan.getSegmentAt(3));
  EXPECT_EQ(DexSpiral::CUBIC_PARABOLA, out.getSpiralType());
  EXPECT_EQ(178.885, out.getData(DexSpiral::SPIRAL_CONSTANT));
}

TEST_F(LandXmlAlignments, StationEquationsFormAValidatedSetOfTheAlignment) {
  const LandXmlRun run = readText(dir_, document(kRoad));
  const DexStaEquationSet* set = onlyAlignment(run).getStaEquationSet();
  ASSERT_NE(nullptr, set);
  EXPECT_EQ(set, horizontalOf(onlyAlignment(run)).getStaEquationSet());
  EXPECT_EQ(L"Main", set->getName());
  ASSERT_EQ(2, set->getNumberOfEquations());
  EXPECT_EQ(L"E1", set->getEquationAt(0)->getName());
  EXPECT_EQ(1300.0, set->getEquationAt(1)->getData(DexStaEquation::STATION_BACK));  // completed
  EXPECT_EQ(2000.0, set->getEquationAt(1)->getData(DexStaEquation::STATION_AHEAD));
}

TEST_F(LandXmlAlignments, ProfileVerticesBecomeVerticalElementsAndLongSectionsWithTheirGrades) {
  const LandXmlRun run = readText(dir_, document(kRoad));
  const DexVerticalAlignment& profile = verticalOf(onlyAlignment(run));
  EXPECT_EQ(L"FG", profile.getName());
  struct Case {
    DexVerticalElement::EElementType type;
    DexLongSection::ELSType section;
    double station, level, gradeIn, gradeOut, length, startStation, radius;
  };
  const Case cases[] = {
      {DexVerticalElement::VERTEX, DexLongSection::LEVEL_POINT, 100, 50, 0, 2, 0, 100, 0},
      {DexVerticalElement::PARABOLA, DexLongSection::PARABOLA_POINT, 300, 54, 2, -2, 100, 250, 0},
      {DexVerticalElement::ASYMMETRIC_PARABOLA, DexLongSection::PARABOLA_POINT, 500, 50, -2, 1, 100, 460, 0},
      {DexVerticalElement::CIRCULAR_CURVE, DexLongSection::CIRCULAR_POINT, 700, 52, 1, -2.5, 80, 660, 2000},
      {DexVerticalElement::VERTEX, DexLongSection::LEVEL_POINT, 1060, 43, -2.5, 0, 0, 1060, 0},
  };
  ASSERT_EQ(5, profile.getNumberOfVerticalElements());
  ASSERT_EQ(5, profile.getNumberOfLongSections());
  for (int i = 0; i < 5; ++i) {
    const Case& c = cases[i];
    const DexVerticalElement& element = *profile.getVerticalElementAt(i);
    EXPECT_EQ(c.type, element.getElementType()) << i;
    const double expected[] = {c.station, c.level, c.gradeIn, c.gradeOut, c.startStation, c.radius};
    const int kinds[] = {DexVerticalElement::VERTEX_STATION, DexVerticalElement::VERTEX_LEVEL,
                         DexVerticalElement::GRADE_IN,       DexVerticalElement::GRADE_OUT,
                         DexVerticalElement::START_STATION,  DexVerticalElement::RADIUS};
    for (int k = 0; k < 6; ++k)
      EXPECT_NEAR(expected[k], element.getData(kinds[k]), kTight) << "vertex " << i << " kind " << kinds[k];
    if (c.type != DexVerticalElement::VERTEX) {
      EXPECT_EQ(c.length, element.getData(DexVerticalElement::CURVE_LENGTH));
    }
    const DexLongSection& section = *profile.getLongSectionAt(i);
    EXPECT_EQ(c.section, section.getLSType()) << i;
    EXPECT_EQ(c.station, section.getData(DexLongSection::STATION));
    EXPECT_NEAR(c.gradeOut, section.getData(DexLongSection::GRADE), kTight);
    EXPECT_EQ(c.section == DexLongSection::PARABOLA_POINT ? &element : nullptr, section.getParabola());
  }
}

TEST_F(LandXmlAlignments, ARoadRoundTripsSchemaValidToTheWrittenDecimals) {
  const LandXmlRun first = readText(dir_, document(kRoad));
  const std::string file = dir_.file("written.xml");
  ASSERT_EQ(DEX_RESULT_OK, exportTo(first, file));
  EXPECT_TRUE(validates(file)) << dex_test::readFile(file);
  const LandXmlRun second = importFile(file);
  EXPECT_EQ(DEX_RESULT_OK, second.result);
  expectSameRoad(onlyAlignment(first), onlyAlignment(second), kWritten);
}

TEST_F(LandXmlAlignments, RealRoadsImportWithTheirCountsAndRoundTrip) {
  struct Case {
    const char* file;
    int alignments, elements, profiles, vertices;
    double footFactor;
  };
  const Case cases[] = {
      {"landxml/mac999_landxml_road_cl_sample.xml", 1, 5, 0, 0, 1.0},
      {"landxml/crews_subdivision.xml", 6, 29, 6, 31, 0.3048},
  };
  for (const Case& c : cases) {
    const LandXmlRun first = importFile(dex_test::dataFile(c.file));
    const DexDataset& dataset = first.dataset();
    ASSERT_EQ(c.alignments, dataset.getNumberOfAlignments()) << c.file;
    int elements = 0, profiles = 0, vertices = 0;
    for (int a = 0; a < dataset.getNumberOfAlignments(); ++a) {
      const DexAlignment& road = *dataset.getAlignmentAt(a);
      elements += horizontalOf(road).getNumberOfSegments();
      for (int p = 0; p < road.getNumberOfAlignmentParts(); ++p) {
        const auto* profile = dynamic_cast<const DexVerticalAlignment*>(road.getAlignmentPartAt(p));
        if (profile == nullptr) continue;
        ++profiles;
        vertices += profile->getNumberOfVerticalElements();
      }
    }
    EXPECT_EQ((std::vector{c.elements, c.profiles, c.vertices}), (std::vector{elements, profiles, vertices}))
        << c.file;
    const std::string file = dir_.file("real.xml");
    std::remove(file.c_str());
    ASSERT_EQ(DEX_RESULT_OK, exportTo(first, file)) << c.file;
    EXPECT_TRUE(validates(file)) << c.file;
    const LandXmlRun second = importFile(file);
    ASSERT_EQ(c.alignments, second.dataset().getNumberOfAlignments());
    for (int a = 0; a < c.alignments; ++a) {
      const DexHorizontalAlignment& x = horizontalOf(*dataset.getAlignmentAt(a));
      const DexHorizontalAlignment& y = horizontalOf(*second.dataset().getAlignmentAt(a));
      ASSERT_EQ(x.getNumberOfSegments(), y.getNumberOfSegments());
      for (int i = 0; i < x.getNumberOfSegments(); ++i) {
        const std::vector<double> u = valuesOf(*x.getSegmentAt(i));
        const std::vector<double> v = valuesOf(*y.getSegmentAt(i));
        for (std::size_t k = 0; k < u.size(); ++k)
          EXPECT_NEAR(u[k], v[k], std::max(kWritten * c.footFactor, 2 * kAngle)) << c.file << " value " << k;
      }
    }
  }
}

TEST_F(LandXmlAlignments, BadRoadPartsGiveTheirRemarkAndKeepWhatWasRead) {
  struct Case {
    const char* name;
    std::string geometry;  // inside CoordGeom
    std::string after;     // after CoordGeom
    EDexResult result;
    int elements;
    int firstType;  // of the first element, -1 for none
    int equations;  // -1: no set
    int vertices;
  };
  const std::string line = "<Line><Start>0 0</Start><End>0 10</End></Line>";
  const Case cases[] = {
      {"zero radius", "<Curve rot=\"cw\" radius=\"0\"><Start>0 0</Start><End>0 10</End></Curve>", "",
       kMalformed, 1, ALIGNMENT_OBJ_LINE, -1, 0},
      {"centre on start", "<Curve rot=\"cw\"><Start>0 0</Start><Center>0 0</Center><End>0 10</End></Curve>",
       "", kMalformed, 1, ALIGNMENT_OBJ_LINE, -1, 0},
      {"no centre", "<Curve rot=\"cw\" radius=\"10\"><Start>0 0</Start><End>0 10</End></Curve>", "",
       DEX_RESULT_OK, 1, ALIGNMENT_OBJ_CURVE, -1, 0},
      {"unknown spiType",
       "<Spiral length=\"10\" radiusStart=\"INF\" radiusEnd=\"50\" rot=\"cw\" spiType=\"wobbly\">"
       "<Start>0 0</Start><PI>5 0</PI><End>10 0.3</End></Spiral>",
       "", kMalformed, 1, ALIGNMENT_OBJ_SPIRAL, -1, 0},
      {"too few numbers", "<Line><Start>0</Start><End>0 10</End></Line>" + line, "", kMalformed, 1,
       ALIGNMENT_OBJ_LINE, -1, 0},
      {"equation without staAhead", line, "<StaEquation staInternal=\"5\"/>", kMalformed, 1,
       ALIGNMENT_OBJ_LINE, -1, 0},
      {"equations of one chainage", line,
       "<StaEquation staInternal=\"5\" staAhead=\"9\"/><StaEquation staInternal=\"5\" staAhead=\"20\"/>",
       kMalformed, 1, ALIGNMENT_OBJ_LINE, 1, 0},
      {"profile text", line,
       "<Profile><ProfAlign name=\"P\"><PVI>1</PVI><PVI>2 3</PVI></ProfAlign></Profile>", kMalformed, 1,
       ALIGNMENT_OBJ_LINE, -1, 1},
      {"cross sections", line, "<CrossSects><CrossSect sta=\"0\"/></CrossSects>", kNotHeld, 1,
       ALIGNMENT_OBJ_LINE, -1, 0},
  };
  for (const Case& c : cases) {
    const std::string body = "<Alignments><Alignment name=\"A\" length=\"10\" staStart=\"0\"><CoordGeom>" +
                             c.geometry + "</CoordGeom>" + c.after + "</Alignment></Alignments>";
    const LandXmlRun run = readText(dir_, document(body));
    EXPECT_EQ(c.result, run.result) << c.name;
    const DexAlignment& road = onlyAlignment(run);
    const DexHorizontalAlignment& plan = horizontalOf(road);
    ASSERT_EQ(c.elements, plan.getNumberOfSegments()) << c.name;
    if (c.firstType >= 0) {
      EXPECT_EQ(c.firstType, plan.getSegmentAt(0)->getType()) << c.name;
    }
    EXPECT_EQ(c.equations, road.getStaEquationSet() ? road.getStaEquationSet()->getNumberOfEquations() : -1)
        << c.name;
    const auto* profile = dynamic_cast<const DexVerticalAlignment*>(
        road.getAlignmentPart(IDexAlignmentPart::VERTICAL_ALIGNMENT));
    EXPECT_EQ(c.vertices, profile ? profile->getNumberOfVerticalElements() : 0) << c.name;
  }
}

TEST_F(LandXmlAlignments, ADocumentBrokenInsideARoadKeepsItsElementsEquationsAndProfile) {
  // The break comes inside a long comment, so that the XML reader has handed on all before it.
  std::string whole = document(kRoad);
  whole.insert(whole.find("<CircCurve"), "<!--" + std::string(65536, '-'));
  const std::string broken = whole.substr(0, whole.size() - 1000);
  const LandXmlRun run = readText(dir_, broken);
  EXPECT_EQ(kTruncated, run.result);
  const DexAlignment& road = onlyAlignment(run);
  EXPECT_EQ(4, horizontalOf(road).getNumberOfSegments());
  ASSERT_NE(nullptr, road.getStaEquationSet());
  EXPECT_EQ(2, road.getStaEquationSet()->getNumberOfEquations());
  EXPECT_EQ(3, verticalOf(road).getNumberOfVerticalElements());
}

TEST_F(LandXmlAlignments, IntersectionPointsAreCountedAndLongSectionsWrittenWithoutElements) {
  LandXmlRun run;
  run.loader->initIEData(settingsFor({ROADS}));
  auto* plan = new DexHorizontalAlignment();
  plan->setName(L"H");
  plan->addSegment(new DexIntersectionPoint(true));
  auto* line = new DexLine2D();
  line->setPosition(DexLine2D::END_POINT, 10.0, 0.0);
  line->setData(DexLine2D::LENGTH, 10.0);
  plan->addSegment(line);
  auto* profile = new DexVerticalAlignment();
  profile->setName(L"V");
  for (const auto& [station, level] : {std::pair{0.0, 5.0}, {10.0, 6.0}}) {
    auto* section = new DexLongSection(DexLongSection::LEVEL_POINT);
    section->setData(DexLongSection::STATION, station);
    section->setData(DexLongSection::LEVEL, level);
    profile->addLongSection(section);
  }
  run.data().getIEAlignmentPartsDictionary()->addAlignmentPart(plan);
  run.data().getIEAlignmentPartsDictionary()->addAlignmentPart(profile);
  auto* road = new DexAlignment();
  road->setName(L"R");
  road->setAlignmentPart(plan);
  road->setAlignmentPart(profile);
  run.dataset().add(road);
  const std::string file = dir_.file("parts.xml");
  EXPECT_EQ(kNotHeld, exportTo(run, file));
  EXPECT_TRUE(validates(file)) << dex_test::readFile(file);
  const LandXmlRun read = importFile(file);
  EXPECT_EQ(1, horizontalOf(onlyAlignment(read)).getNumberOfSegments());
  const DexVerticalAlignment& back = verticalOf(onlyAlignment(read));
  ASSERT_EQ(2, back.getNumberOfVerticalElements());
  EXPECT_NEAR(10.0, back.getVerticalElementAt(0)->getData(DexVerticalElement::GRADE_OUT), kTight);
}

}  // namespace
