// The localization, its control points, and the importer base that recognises control points among
// the ordinary points of a file.
#include "ieUtils/IELocalization.h"

#include <gtest/gtest.h>

#include <memory>
#include <numbers>

#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/IImporter.h"

namespace {

using namespace vyn::ie;

// A control point whose observation is named observationName, with a plane station.
DexLocalizationPoint* controlPoint(const wchar_t* observationName, const wchar_t* stationName = L"",
                                   double x = 0.0) {
  auto* const observation = new DexGpsPosition();
  observation->setName(observationName);
  auto* const station = new DexStation();
  station->setName(stationName);
  station->setPosition(x, 2.0, 3.0);
  observation->setPlaneStation(station);
  auto* const point = new DexLocalizationPoint();
  point->setRawData(observation);
  return point;
}

TEST(DexLocalization, NewLocalizationHasDatumWGS84AndParametersOutsideTheTableAreIgnored) {
  const DexLocalization localization;
  EXPECT_EQ(L"WGS84", localization.getDatumName());
  EXPECT_TRUE(localization.getName().IsEmpty());
  EXPECT_TRUE(localization.getGridName().IsEmpty());
  EXPECT_FALSE(localization.isKeepScale1());
  EXPECT_EQ(0, localization.getNumberOfPoints());
  EXPECT_EQ(0, localization.getNumberOfStations());
  for (int param = 0; param < DexLocalization::kNumberOfParams; ++param)
    EXPECT_EQ(0.0, localization.getData(param)) << param;
  DexLocalization changed;
  for (const int param : {15, -1, 14})
    changed.setData(param, 1.0);
  EXPECT_EQ(0.0, changed.getData(15));
  EXPECT_EQ(0.0, changed.getData(-1));
  EXPECT_EQ(1.0, changed.getData(DexLocalization::PARAM_METHOD));
}

TEST(DexLocalization, AngleAndScaleComeFromParametersTwoAndThree) {
  constexpr double pi = std::numbers::pi;
  struct Case {
    double cosTerm;
    double sinTerm;
    bool keepScale1;
    double angle;
    double scale;
  };
  const Case cases[] = {{0.0, 2.0, false, pi / 2, 2.0},      {0.0, 2.0, true, pi / 2, 1.0},
                        {0.0, -1.0, false, 3 * pi / 2, 1.0}, {-3.0, 0.0, false, pi, 3.0},
                        {1.0, -1e-17, false, 0.0, 1.0},      {0.0, 0.0, false, 0.0, 0.0}};
  for (const Case& c : cases) {
    DexLocalization localization;
    localization.setData(DexLocalization::PARAM_SCALE_COS, c.cosTerm);
    localization.setData(DexLocalization::PARAM_SCALE_SIN, c.sinTerm);
    localization.setKeepScale1(c.keepScale1);
    double angle = -1.0;
    double scale = -1.0;
    localization.getAngleAndScale(angle, scale);
    EXPECT_NEAR(c.angle, angle, 1e-15) << c.cosTerm << " " << c.sinTerm;
    EXPECT_GE(angle, 0.0);
    EXPECT_LT(angle, 2 * pi);
    EXPECT_NEAR(c.scale, scale, 1e-15) << c.cosTerm << " " << c.sinTerm;
  }
  DexLocalization localization;
  localization.setKeepScale1(true);
  localization.setAngleAndScale(pi / 2, 2.0);
  EXPECT_NEAR(2.0, localization.getData(DexLocalization::PARAM_SCALE_SIN), 1e-15);
  EXPECT_TRUE(localization.isKeepScale1());
}

TEST(DexLocalizationPoint, UsageFlagsReadBackInTheOrderTheyWereSet) {
  const bool patterns[][3] = {
      {true, false, false}, {false, true, false}, {false, false, true}, {true, true, false}};
  for (const auto& pattern : patterns) {
    DexLocalizationPoint point;
    point.setUsage(pattern[0], pattern[1], pattern[2]);
    bool a = !pattern[0];
    bool b = !pattern[1];
    bool c = !pattern[2];
    point.getUsage(a, b, c);
    EXPECT_EQ(pattern[0], a);
    EXPECT_EQ(pattern[1], b);
    EXPECT_EQ(pattern[2], c);
  }
}

TEST(DexLocalization, CopiesOwnTheirOwnControlPoints) {
  auto original = std::make_unique<DexLocalization>();
  DexLocalizationPoint* const point = controlPoint(L"CP1");
  point->setResiduals(new DexPosition3D(0.01, 0.02, 0.03));
  point->setUsage(true, false, true);
  point->setNotes(L"fence corner");
  original->addPoint(point);
  original->addPoint(nullptr);
  cs_utils::DexLocalizationStation station;
  station.bytes[213] = 0x5A;
  original->addStation(station);
  DexLocalization assigned;
  assigned = *original;
  const DexLocalization constructed(*original);
  const DexLocalizationPoint* const originalPoint = original->getPointAt(0);
  for (const DexLocalization* const copy : {static_cast<const DexLocalization*>(&assigned), &constructed}) {
    ASSERT_EQ(1, copy->getNumberOfPoints());
    const DexLocalizationPoint* const copied = copy->getPointAt(0);
    EXPECT_NE(originalPoint, copied);
    EXPECT_NE(originalPoint->getRawData(), copied->getRawData());
    EXPECT_NE(originalPoint->getResiduals(), copied->getResiduals());
    EXPECT_EQ(L"fence corner", copied->getNotes());
    EXPECT_EQ(0x5A, copy->getStationAt(0)->bytes[213]);
  }
  original.reset();
  EXPECT_EQ(L"CP1", assigned.getPointAt(0)->getRawData()->getName());
  EXPECT_EQ(DexPosition3D(0.01, 0.02, 0.03), *constructed.getPointAt(0)->getResiduals());
  for (const int index : {-1, 1}) {
    EXPECT_EQ(nullptr, assigned.getPointAt(index));
    EXPECT_EQ(nullptr, assigned.getStationAt(index));
  }
}

TEST(DexLocalization, PointCodesGoToTheFirstControlPointOfThatName) {
  DexLocalization localization;
  DexLocalizationPoint withoutObservation;
  localization.addPoint(new DexLocalizationPoint());
  localization.addPoint(controlPoint(L"CP1"));
  localization.addPoint(controlPoint(L"CP1"));
  DexCodesDataInterface codes;
  codes.addCode(new DexCodeValues(nullptr));
  localization.addPointCodes(L"CP1", &codes);
  localization.addPointCodes(L"CP1", nullptr);
  localization.addPointCodes(L"cp1", &codes);
  withoutObservation.attachCodes(codes);
  EXPECT_EQ(1, localization.getPointAt(1)->getRawData()->getNumberOfCodes());
  EXPECT_EQ(0, localization.getPointAt(2)->getRawData()->getNumberOfCodes());

  DexData data{DexSettings()};
  data.attachLocalizationPointCodes(L"CP1", &codes);  // no localization: nothing
  auto* const attached = new DexLocalization();
  attached->addPoint(controlPoint(L"CP9"));
  data.attachIELocalization(attached);
  data.attachLocalizationPointCodes(L"CP9", &codes);
  EXPECT_EQ(1, attached->getPointAt(0)->getRawData()->getNumberOfCodes());
}

// An importer that reads the control points it is given.
class LocalizationImporter : public DexImporterImplWithLocalization {
 public:
  explicit LocalizationImporter(DexData* data) : DexImporterImplWithLocalization(data, L"job.loc", nullptr) {}
  ~LocalizationImporter() override = default;

  using DexImporterImplWithLocalization::addLocalizationPt;
  using DexImporterImplWithLocalization::isPointUsedInLocalization;

 protected:
  EDexResult doImport() override { return DEX_RESULT_OK; }
};

TEST(DexImporterImplWithLocalization, RemembersTheFirstStationOfANameAndNeedsALocalization) {
  DexData data{DexSettings()};
  LocalizationImporter importer(&data);
  const std::unique_ptr<DexLocalizationPoint> first(controlPoint(L"CP1", L"S1", 100.0));
  const std::unique_ptr<DexLocalizationPoint> second(controlPoint(L"CP2", L"S1", 200.0));
  const std::unique_ptr<DexLocalizationPoint> noStation(controlPoint(L"CP3", L"S3"));
  const_cast<DexGpsPosition*>(noStation->getRawData())->setPlaneStation(nullptr);
  importer.addLocalizationPt(*first);
  importer.addLocalizationPt(*second);
  importer.addLocalizationPt(*noStation);
  importer.addLocalizationPt(DexLocalizationPoint());
  EXPECT_FALSE(importer.isPointUsedInLocalization(L"S1", DexPosition3D(100.0, 2.0, 3.0)));

  data.attachIELocalization(new DexLocalization());
  struct Case {
    const wchar_t* name;
    DexPosition3D position;
    bool used;
  };
  const Case cases[] = {{L"S1", {100.0, 2.0, 3.0}, true},
                        {L"S1", {200.0, 2.0, 3.0}, false},
                        {L"S1", {100.0, 2.0, 3.0 + 1e-11}, false},
                        {L"s1", {100.0, 2.0, 3.0}, false},
                        {L"S3", {0.0, 2.0, 3.0}, false}};
  const LocalizationImporter copy(importer);
  for (const Case& c : cases) {
    EXPECT_EQ(c.used, importer.isPointUsedInLocalization(c.name, c.position)) << c.position.z;
    EXPECT_EQ(c.used, copy.isPointUsedInLocalization(c.name, c.position));
  }
}

}  // namespace
