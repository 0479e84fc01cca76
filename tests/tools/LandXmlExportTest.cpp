// The model written as LandXML 1.2 through the loader and the shipped export plug-in, checked against
// the schema and read back.

#include <gtest/gtest.h>

#include <fstream>
#include <memory>
#include <string>

#include "LandXmlFixture.h"
#include "ieObjects/IEArcs.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEObjectList.h"
#include "ieObjects/IEParcel.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IERegion.h"
#include "ieObjects/IETextLabel.h"
#include "support/LogCapture.h"

namespace {

using namespace landxml_test;
using dex_test::TempDir;

constexpr EDexResult kNotHeld = static_cast<EDexResult>(23);
// Three written decimals keep a coordinate to half a millimetre; bulges follow from rounded centres.
constexpr double kWritten = 5.0001e-4;
constexpr double kBulge = 1e-3;

// ---- A dataset with one of everything the plug-in writes ------------------------------------------

DexDesignPoint* addPoint(DexData& data, const wchar_t* name, double x, double y, double z,
                         const wchar_t* code = nullptr) {
  auto* point = new DexDesignPoint();
  point->setName(name);
  point->setCoords(x, y, z);
  if (code != nullptr) {
    auto* description = new DexCodeDescription(code);
    if (!data.getIEDataDictionary()->addCodeDescription(description)) {
      delete description;
    }
    auto* value = new DexCodeValues(data.getIEDataDictionary()->findCodeDiscription(code));
    point->addCode(value);
  }
  data.getCurDataset()->add(point);
  return point;
}

DexStation station(double x, double y, double z, double bulge = 0.0) {
  DexStation s;
  s.setPosition(x, y, z);
  s.setBulge(bulge);
  return s;
}

void fillModel(DexData& data) {
  DexDataset& dataset = *data.getCurDataset();
  DexDesignPoint* kerb = addPoint(data, L"K1", 5000.1234, 2000.5678, 101.25, L"EP");
  kerb->getCode(0)->addCodeString(L"1");
  kerb->getCode(0)->insertAttr(L"Material", L"Stone");
  DexStation notes = kerb->getStation();
  notes.setNotes(L"kerb & \"corner\" <north>");
  notes.addPointAttr(7);  // "existing"
  kerb->setStation(notes);
  DexDesignPoint* gate = addPoint(data, L"Tor Ü", 5010.0, 2010.0, kNoValue, L"GATE");
  DexDesignPoint* centre = addPoint(data, L"C1", 4990.0, 1990.0, kNoValue);

  auto* road = new DexPolyLine(false);
  road->setName(L"Road edge");
  road->addStation(station(5000, 2000, 100, 0.25));
  road->addStation(station(5000, 2050, 101, -1.0));
  road->addStation(station(5030, 2050, 102));
  dataset.add(road);
  auto* pad = new DexPolyLine(false);
  pad->setName(L"Pad");
  pad->setCloseStatus(true);
  for (const auto& [x, y] : {std::pair{0.0, 0.0}, {0.0, 10.0}, {10.0, 10.0}})
    pad->addStation(station(x, y, kNoValue));
  dataset.add(pad);
  auto* fence = new DexPolyLine(true);
  fence->setName(L"Fence");
  fence->addPoint(kerb);
  fence->addPoint(centre);
  dataset.add(fence);

  auto* surface = new DexSurface();
  surface->setName(L"EG");
  for (const auto& [x, y, z] :
       {std::tuple{0.0, 0.0, 1.0}, {0.0, 10.0, 2.0}, {10.0, 10.0, 3.0}, {10.0, 0.0, 2.5}})
    surface->addPosition(DexPosition3D(x, y, z));
  for (const auto& corners : {std::array{0, 1, 2}, std::array{0, 2, 3}}) {
    auto* triangle = new DexTriangle();
    triangle->setPositions(corners.data());
    surface->addTriangle(triangle);
  }
  auto* ridge = new DexBreakline(L"EG");
  ridge->setName(L"ridge");
  ridge->setBreaklineType(2);
  ridge->addStation(station(0, 0, 1));
  ridge->addStation(station(10, 10, 3));
  dataset.add(ridge);
  surface->addBreakline(ridge);
  dataset.add(surface);

  auto* alignment = new DexHorizontalAlignment();
  alignment->setName(L"Lot 1");
  data.getIEAlignmentPartsDictionary()->addAlignmentPart(alignment);
  auto* parcel = new DexParcel();
  parcel->setName(L"Lot 1");
  parcel->setCentralPoint(centre);
  parcel->setHAlignment(alignment);
  dataset.add(parcel);
  auto* boundary = new DexRegion();
  boundary->setName(L"Lot 1");
  boundary->setRegionType(1);
  boundary->addVertex(DexPositionWithBulge(4980, 1980, 0, 0));
  boundary->addVertex(DexPositionWithBulge(4980, 2000, 0, 0.4));
  boundary->addVertex(DexPositionWithBulge(5000, 2000, 0, 0));
  dataset.addRegion(boundary);

  auto* control = new DexObjectList();
  control->setName(L"Control");
  control->addObject(gate);
  dataset.addObjectList(control);
}

std::wstring codesOf(const DexDesignPoint& point) {
  std::wstring text;
  for (int c = 0; c < point.getNumberOfCodes(); ++c) {
    const DexCodeValues& code = *point.getCode(c);
    text += L"[" + std::wstring(code.getDescription()->getName().view());
    for (int s = 0; s < code.getNumberOfTheCodeStrings(); ++s)
      text += L":" + std::wstring(code.getCodeStringAt(s).view());
    for (int a = 0; a < code.getNumberOfAttrs(); ++a)
      text += L";" + std::wstring(code.getAttrAt(a).view());
    text += L"]";
  }
  return text;
}

void expectSameStation(const DexStation& a, const DexStation& b, double tolerance, const std::string& what) {
  EXPECT_EQ(a.isHorizCoordsDefined(), b.isHorizCoordsDefined()) << what;
  EXPECT_NEAR(a.getX(), b.getX(), tolerance) << what;
  EXPECT_NEAR(a.getY(), b.getY(), tolerance) << what;
  EXPECT_EQ(a.isHeightDefined(), b.isHeightDefined()) << what;
  if (a.isHeightDefined() && b.isHeightDefined()) {
    EXPECT_NEAR(a.getZ(), b.getZ(), tolerance) << what;
  }
}

// Every point, code, line, arc, triangle and parcel of first is in second, to tolerance.
void expectSameContent(const DexDataset& first, const DexDataset& second, double tolerance) {
  ASSERT_EQ(countsOf(first), countsOf(second));
  // The objects come back in their order: points, plan features, then breaklines with their surfaces.
  std::vector<const DexObject*> a, b;
  for (const DexDataset* dataset : {&first, &second}) {
    auto& list = dataset == &first ? a : b;
    for (int i = 0; i < dataset->getNumberOfElements(OBJECT_TYPE_ALL, 2); ++i)
      list.push_back(dataset->getObjectAt(i));
  }
  for (std::size_t i = 0; i < a.size(); ++i) {
    const std::string what = "object " + std::to_string(i);
    if (const auto* point = dynamic_cast<const DexDesignPoint*>(a[i])) {
      const auto* other = dynamic_cast<const DexDesignPoint*>(b[i]);
      ASSERT_NE(nullptr, other) << what;
      EXPECT_EQ(point->getName(), other->getName()) << what;
      EXPECT_EQ(codesOf(*point), codesOf(*other)) << what;
      EXPECT_EQ(point->getStation().getNotes(), other->getStation().getNotes()) << what;
      EXPECT_EQ(point->getStation().getStationAttrs(), other->getStation().getStationAttrs()) << what;
      expectSameStation(point->getStation(), other->getStation(), tolerance, what);
    } else if (const auto* line = dynamic_cast<const DexPolyLine*>(a[i])) {
      const auto* other = dynamic_cast<const DexPolyLine*>(b[i]);
      ASSERT_NE(nullptr, other) << what;
      EXPECT_EQ(line->getName(), other->getName()) << what;
      EXPECT_EQ(line->isClosed(), other->isClosed()) << what;
      EXPECT_EQ(line->isUsingPoints(), other->isUsingPoints()) << what;
      ASSERT_EQ(line->getNumberOfNodes(), other->getNumberOfNodes()) << what;
      for (int n = 0; n < line->getNumberOfNodes(); ++n) {
        expectSameStation(line->getNodeStation(n), other->getNodeStation(n), tolerance, what);
        EXPECT_NEAR(line->getNodeBulge(n), other->getNodeBulge(n), kBulge) << what << " node " << n;
      }
    }
  }
  for (int s = 0; s < first.getNumberOfSurfaces(); ++s) {
    const DexSurface& x = *first.getSurfaceAt(s);
    const DexSurface& y = *second.getSurfaceAt(s);
    EXPECT_EQ(x.getName(), y.getName());
    for (int p = 0; p < x.getNumberOfPositions(); ++p)
      EXPECT_NEAR(x.getPositionAt(p).getZ(), y.getPositionAt(p).getZ(), tolerance);
    for (int t = 0; t < x.getNumberOfTriangles(); ++t)
      EXPECT_EQ(*x.getTriangleAt(t), *y.getTriangleAt(t)) << "triangle " << t;
    EXPECT_EQ(x.getNumberOfBreaklines(), y.getNumberOfBreaklines());
  }
  for (int p = 0; p < first.getNumberOfParcels(); ++p) {
    const DexParcel& x = *first.getParcelAt(p);
    const DexParcel& y = *second.getParcelAt(p);
    EXPECT_EQ(x.getName(), y.getName());
    expectSameStation(x.getCentralPoint()->getStation(), y.getCentralPoint()->getStation(), tolerance,
                      "centre");
    const DexRegion& u = *first.getRegionAt(p);
    const DexRegion& v = *second.getRegionAt(p);
    ASSERT_EQ(u.getVerticesCount(), v.getVerticesCount());
    for (std::size_t i = 0; i < u.getVerticesCount(); ++i) {
      EXPECT_NEAR(u.getVertexAt(i).getX(), v.getVertexAt(i).getX(), tolerance);
      EXPECT_NEAR(u.getVertexAt(i).getBulge(), v.getVertexAt(i).getBulge(), kBulge);
    }
  }
}

class LandXmlExport : public ::testing::Test {
 protected:
  void TearDown() override { DexData::stopProcess_ = false; }

  LandXmlRun modelRun(const DexSettings& settings = everyKind()) {
    LandXmlRun run;
    run.loader->initIEData(settings);
    fillModel(run.data());
    return run;
  }

  TempDir dir_;
};

TEST_F(LandXmlExport, TheModelWritesAValidDocumentThatReadsBackWhole) {
  const LandXmlRun written = modelRun();
  const std::string file = dir_.file("model.xml");
  ASSERT_EQ(DEX_RESULT_OK, exportTo(written, file));
  EXPECT_TRUE(validates(file)) << dex_test::readFile(file);
  const LandXmlRun read = importFile(file);
  EXPECT_EQ(DEX_RESULT_OK, read.result);
  expectSameContent(written.dataset(), read.dataset(), kWritten);
  EXPECT_EQ(1, read.dataset().findObjectListByName(L"Control")->getNumberOfObjects());
  EXPECT_EQ(2, read.dataset().getSurfaceAt(0)->getBreaklineAt(0)->getBreaklineType());
}

TEST_F(LandXmlExport, ARealSubdivisionRoundTripsToTheWrittenDecimals) {
  const LandXmlRun first = importFile(dex_test::dataFile("landxml/crews_subdivision.xml"));
  const std::string file = dir_.file("subdivision.xml");
  ASSERT_EQ(DEX_RESULT_OK, exportTo(first, file));
  EXPECT_TRUE(validates(file));
  const LandXmlRun second = importFile(file);
  EXPECT_EQ(DEX_RESULT_OK, second.result);
  expectSameContent(first.dataset(), second.dataset(), kWritten * 0.3048);  // written in feet
}

TEST_F(LandXmlExport, CoordinatesAreWrittenInTheSettingsUnitsAndDecimals) {
  struct Case {
    EDistUnits units;
    std::array<int, 3> decimals;
    const char* unitsElement;
    const char* point;  // of the point K1 of the model, N E Z
  };
  const Case cases[] = {
      {METERS,
       {3, 3, 3},
       "<Metric areaUnit=\"squareMeter\" linearUnit=\"meter\"",
       ">5000.123 2000.568 101.250<"},
      {IFEET, {2, 2, 1}, "<Imperial areaUnit=\"squareFoot\" linearUnit=\"foot\"", ">16404.60 6563.54 332.2<"},
      {USFEET, {1, 1, 0}, "linearUnit=\"USSurveyFoot\"", ">16404.6 6563.5 332<"},
      {MILLIMETERS, {0, 0, 0}, "linearUnit=\"millimeter\"", ">5000123 2000568 101250<"},
      {ANY_UNITS, {4, 4, 4}, "linearUnit=\"meter\"", ">5000.1234 2000.5678 101.2500<"},
      {USCHAINS, {3, 3, 3}, "linearUnit=\"meter\"", ">5000.123 2000.568 101.250<"},  // no LandXML word
  };
  for (const Case& c : cases) {
    DexSettings settings = settingsFor({POINTS});
    settings.distUnits = c.units;
    settings.coordDecimals = c.decimals;
    const std::string file = dir_.file("units.xml");
    std::remove(file.c_str());
    ASSERT_EQ(DEX_RESULT_OK, exportTo(modelRun(settings), file)) << c.unitsElement;
    const std::string text = dex_test::readFile(file);
    EXPECT_NE(std::string::npos, text.find(c.unitsElement)) << text;
    EXPECT_NE(std::string::npos, text.find(c.point)) << text;
    EXPECT_EQ(std::string::npos, text.find("<PlanFeatures")) << "only the points were asked for";
    EXPECT_TRUE(validates(file)) << c.unitsElement;
  }
}

TEST_F(LandXmlExport, ObjectsLandXmlCannotCarryAreCountedAndTheRestIsWritten) {
  const dex_test::LogCapture log;
  LandXmlRun run = modelRun();
  auto* label = new DexTextLabel();
  label->setText(L"note");
  run.dataset().add(label);
  run.dataset().add(new DexArc());
  auto* single = new DexPolyLine(false);
  single->addStation(station(1, 2, 3));
  run.dataset().add(single);
  const std::string file = dir_.file("remarks.xml");
  EXPECT_EQ(kNotHeld, exportTo(run, file));
  EXPECT_EQ(1, log.countMessage(L"3 objects LandXML cannot carry were not written"));
  EXPECT_TRUE(validates(file));
}

TEST_F(LandXmlExport, PointsOfOneNameGoIntoCgPointsOfTheirOwnAndAreasIntoClosedFeatures) {
  LandXmlRun run;
  run.loader->initIEData(settingsFor({POINTS, LINES}));
  for (const double x : {1.0, 2.0, 3.0})
    addPoint(run.data(), L"P", x, 0, 0);
  auto* area = new DexArea(false);
  for (const auto& [x, y] : {std::pair{0.0, 0.0}, {0.0, 10.0}, {10.0, 10.0}})
    area->addStation(station(x, y, kNoValue));
  run.dataset().add(area);
  const std::string file = dir_.file("names.xml");
  ASSERT_EQ(DEX_RESULT_OK, exportTo(run, file));
  EXPECT_TRUE(validates(file));
  const LandXmlRun read = importFile(file);
  EXPECT_EQ((Counts{3, 1}), countsOf(read.dataset()));
  for (int i = 0; i < 3; ++i)
    EXPECT_EQ(i + 1.0,
              dynamic_cast<const DexDesignPoint*>(read.dataset().getObjectAt(i))->getStation().getX());
  EXPECT_TRUE(dynamic_cast<const DexPolyLine*>(read.dataset().getObjectAt(3))->isClosed());
}

TEST_F(LandXmlExport, RefusedOverwritesAndStoppedExportsLeaveNoDocument) {
  const std::string before = "keep me";
  const std::string existing = dir_.write("existing.xml", before);
  const LandXmlRun run = modelRun();
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, exportTo(run, existing));  // no message box: the host's "no"
  EXPECT_EQ(before, dex_test::readFile(existing));
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, exportTo(run, dir_.file("no/such/folder.xml")));
  DexData::stopProcess_ = true;
  const std::string stopped = dir_.file("stopped.xml");
  EXPECT_EQ(DEX_RESULT_STOPPED, exportTo(run, stopped));
  EXPECT_FALSE(std::ifstream(stopped).good());
}

}  // namespace
