#include "ieObjects/IEHorizontalAlignment.h"

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <limits>
#include <memory>
#include <numbers>
#include <string>

#include "ieObjects/detail/AlignmentPartsLog.h"
#include "support/LogCapture.h"

namespace {

using vyn::ie::DexCurve;
using vyn::ie::DexHorizontalAlignment;
using vyn::ie::DexIntersectionPoint;
using vyn::ie::DexLine2D;
using vyn::ie::DexPosition2D;
using vyn::ie::DexSpiral;
using vyn::ie::IDexAlignmentObjInterface;
namespace detail = vyn::ie::detail;

constexpr const wchar_t* kSource = detail::kAlignmentPartsLogSource;
constexpr double kPi = std::numbers::pi;
constexpr double kTolerance = 1e-9;

// A line that counts its deletions.
class CountedLine : public DexLine2D {
 public:
  explicit CountedLine(int& deletions) : deletions_(deletions) {}
  ~CountedLine() override { ++deletions_; }

 private:
  int& deletions_;
};

void expectAt(double northing, double easting, const DexPosition2D& position) {
  EXPECT_NEAR(northing, position.x, kTolerance);
  EXPECT_NEAR(easting, position.y, kTolerance);
}

// ---- Element records ----------------------------------------------------------------------------

TEST(DexCurve, EveryDatumStartsUnsetAndNaNUnsetsOne) {
  DexCurve curve;
  for (int kind = 0; kind < 7; ++kind) {
    EXPECT_FALSE(curve.hasData(kind));
    EXPECT_EQ(0.0, curve.getData(kind));
  }
  curve.setData(DexCurve::RADIUS, 25.0);
  curve.setData(7, 1.0);
  for (int kind = -1; kind <= 7; ++kind)
    EXPECT_EQ(kind == 1, curve.hasData(kind)) << kind;
  EXPECT_EQ(25.0, curve.getData(DexCurve::RADIUS));
  curve.setData(DexCurve::RADIUS, std::numeric_limits<double>::quiet_NaN());
  EXPECT_FALSE(curve.hasData(DexCurve::RADIUS));
  EXPECT_TRUE(curve.isTurnClockwised());
  EXPECT_EQ(0, curve.getCurveType());
}

TEST(DexLine2D, SettingTheStartAzimuthDefinesItWhateverTheValue) {
  DexLine2D line;
  line.setData(DexLine2D::LENGTH, 5.0);
  EXPECT_FALSE(line.isStartAzimuthDefined());
  line.setData(DexLine2D::START_AZIMUTH, 0.0);
  EXPECT_TRUE(line.isStartAzimuthDefined());
  EXPECT_FALSE(line.isAzToPrevEl());
  line.setAzToPrevEl();
  EXPECT_TRUE(line.isAzToPrevEl());
}

TEST(HorizontalElements, DataKindsOutsideTheRecordAreIgnoredAndReadAsZero) {
  DexLine2D line;
  DexSpiral spiral;
  DexIntersectionPoint point(false);
  const struct {
    std::function<void(int, double)> set;
    std::function<double(int)> get;
    int size;
  } records[] = {
      {[&](int k, double v) { line.setData(k, v); }, [&](int k) { return line.getData(k); }, 4},
      {[&](int k, double v) { spiral.setData(k, v); }, [&](int k) { return spiral.getData(k); }, 8},
      {[&](int k, double v) { point.setData(k, v); }, [&](int k) { return point.getData(k); }, 3},
  };
  for (const auto& record : records) {
    for (int kind = -1; kind <= record.size; ++kind)
      record.set(kind, 7.0);
    EXPECT_EQ(0.0, record.get(-1));
    EXPECT_EQ(0.0, record.get(record.size));
    EXPECT_EQ(7.0, record.get(record.size - 1));
  }
}

TEST(HorizontalElements, PositionKindsOutsideTheRangeLogAndReadPositionZero) {
  DexLine2D line;
  DexCurve curve;
  DexSpiral spiral;
  const struct {
    std::function<void(int, double, double)> set;
    std::function<const DexPosition2D&(int)> get;
    int size;
    int logLine;
  } elements[] = {
      {[&](int k, double n, double e) { line.setPosition(k, n, e); },
       [&](int k) -> const DexPosition2D& { return line.getPosition(k); }, 2, detail::kLinePositionKindLine},
      {[&](int k, double n, double e) { curve.setPosition(k, n, e); },
       [&](int k) -> const DexPosition2D& { return curve.getPosition(k); }, 4,
       detail::kCurvePositionKindLine},
      {[&](int k, double n, double e) { spiral.setPosition(k, n, e); },
       [&](int k) -> const DexPosition2D& { return spiral.getPosition(k); }, 3,
       detail::kSpiralPositionKindLine},
  };
  for (const auto& element : elements) {
    element.set(0, 10.0, 20.0);
    element.set(element.size - 1, 30.0, 40.0);
    element.set(element.size, 99.0, 99.0);  // ignored
    const dex_test::LogCapture log;
    expectAt(30.0, 40.0, element.get(element.size - 1));
    EXPECT_EQ(0u, log.size());
    expectAt(10.0, 20.0, element.get(element.size));
    expectAt(10.0, 20.0, element.get(-1));
    EXPECT_EQ(2, log.count(kSource, element.logLine));
    EXPECT_EQ(2u, log.size());
  }
}

TEST(DexSpiral, NamesItsSixteenTypesAndFallsBackToClothoid) {
  const wchar_t* const names[] = {
      L"biquadratic",   L"biquadraticParabola", L"bloss",    L"clothoid",       L"cosine",   L"cubic",
      L"cubicParabola", L"japaneseCubic",       L"radioid",  L"revBiquadratic", L"revBloss", L"revCosine",
      L"revSinusoid",   L"sineHalfWave",        L"sinusoid", L"weinerBogen"};
  DexSpiral spiral;
  EXPECT_EQ(L"clothoid", spiral.getSpiralTypeAsString());
  for (int type = 0; type < 16; ++type) {
    spiral.setSpiralType(type);
    EXPECT_EQ(names[type], spiral.getSpiralTypeAsString());
  }
  const dex_test::LogCapture log;
  for (const int type : {16, -1}) {
    spiral.setSpiralType(type);
    EXPECT_EQ(L"clothoid", spiral.getSpiralTypeAsString());
  }
  EXPECT_EQ(2, log.count(kSource, detail::kUnknownSpiralTypeLine));
}

// ---- Intersection point -------------------------------------------------------------------------

TEST(DexIntersectionPoint, OwnsItsFittedElementsButHandsBackAReplacedOne) {
  int deletions = 0;
  auto* const replaced = new CountedLine(deletions);
  {
    DexIntersectionPoint point(true);
    point.setPosition(100.0, 200.0);
    expectAt(100.0, 200.0, point.getStartPosition());
    EXPECT_TRUE(point.isSimplePoint());
    point.setSegment(replaced);
    point.setSegment(replaced);  // the same pointer again: nothing changes
    point.setSegment(new CountedLine(deletions));
    point.setFirstSpiral(new DexSpiral());
    point.setCurve(new DexCurve());
    point.setSecondSpiral(new DexSpiral());
    EXPECT_EQ(0, deletions);

    const DexIntersectionPoint copy(point);
    EXPECT_NE(point.getCurve(), copy.getCurve());
    ASSERT_NE(nullptr, copy.getSecondSpiral());
  }
  EXPECT_EQ(1, deletions);  // the held one; the replaced one is the caller's again
  delete replaced;
}

// ---- Horizontal alignment -----------------------------------------------------------------------

TEST(DexHorizontalAlignment, KeepsItsElementsInTheOrderAddedAndInserted) {
  DexHorizontalAlignment alignment;
  auto* const first = new DexLine2D();
  auto* const second = new DexCurve();
  auto* const middle = new DexSpiral();
  EXPECT_TRUE(alignment.addSegment(first));
  EXPECT_TRUE(alignment.insertSegmentAt(1, second));
  EXPECT_TRUE(alignment.insertSegmentAt(1, middle));
  EXPECT_FALSE(alignment.addSegment(nullptr));
  EXPECT_FALSE(alignment.insertSegmentAt(0, nullptr));
  auto* const misplaced = new DexLine2D();
  EXPECT_FALSE(alignment.insertSegmentAt(4, misplaced));
  delete misplaced;
  ASSERT_EQ(3, alignment.getNumberOfSegments());
  EXPECT_EQ(first, alignment.getSegmentAt(0));
  EXPECT_EQ(middle, alignment.getSegmentAt(1));
  EXPECT_EQ(second, alignment.getSegmentAt(2));
  EXPECT_EQ(nullptr, alignment.getSegmentAt(3));
  EXPECT_EQ(vyn::ie::IDexAlignmentPart::HORIZONTAL_ALIGNMENT, alignment.getType());
}

TEST(DexHorizontalAlignment, RemovedElementsSurviveAndTheRestDieWithIt) {
  int deletions = 0;
  IDexAlignmentObjInterface* removed = nullptr;
  {
    DexHorizontalAlignment alignment;
    alignment.addSegment(new CountedLine(deletions));
    alignment.addSegment(new CountedLine(deletions));
    EXPECT_FALSE(alignment.removeSegmentAt(2));
    EXPECT_EQ(2, alignment.getNumberOfSegments());
    removed = alignment.getSegmentAt(0);
    EXPECT_TRUE(alignment.removeSegmentAt(0));
    EXPECT_EQ(1, alignment.getNumberOfSegments());
  }
  EXPECT_EQ(1, deletions);
  delete removed;
  EXPECT_EQ(2, deletions);
}

TEST(DexHorizontalAlignment, CopyHasItsOwnElementsOfTheSameKinds) {
  DexHorizontalAlignment alignment;
  alignment.setName(L"H1");
  auto* const line = new DexLine2D();
  line->setData(DexLine2D::LENGTH, 42.0);
  alignment.addSegment(line);
  auto* const point = new DexIntersectionPoint(false);
  point->setCurve(new DexCurve());
  alignment.addSegment(point);
  alignment.addSegment(new DexSpiral());
  const DexHorizontalAlignment copy(alignment);
  ASSERT_EQ(3, copy.getNumberOfSegments());
  EXPECT_EQ(L"H1", copy.getName());
  const auto* const copiedLine = dynamic_cast<const DexLine2D*>(copy.getSegmentAt(0));
  ASSERT_NE(nullptr, copiedLine);
  EXPECT_NE(line, copiedLine);
  EXPECT_EQ(42.0, copiedLine->getData(DexLine2D::LENGTH));
  const auto* const copiedPoint = dynamic_cast<const DexIntersectionPoint*>(copy.getSegmentAt(1));
  ASSERT_NE(nullptr, copiedPoint);
  EXPECT_NE(point->getCurve(), copiedPoint->getCurve());
  EXPECT_EQ(vyn::ie::ALIGNMENT_OBJ_SPIRAL, copy.getSegmentAt(2)->getType());
}

// ---- Factories ----------------------------------------------------------------------------------

TEST(DexLine2D, FactoryTakesEndPointsAzimuthLengthAndCallerValues) {
  const std::unique_ptr<DexLine2D> line(DexLine2D::createSegment(
      CCurveSegment(CCurveDataSegment(50.0), 1000.0, 2000.0, CMathAngle(90.0)), 7.0, 8.0));
  ASSERT_NE(nullptr, line);
  expectAt(1000.0, 2000.0, line->getStartPosition());
  expectAt(1000.0, 2050.0, line->getPosition(DexLine2D::END_POINT));
  EXPECT_TRUE(line->isStartAzimuthDefined());
  EXPECT_EQ(90.0, line->getData(DexLine2D::START_AZIMUTH));
  EXPECT_EQ(50.0, line->getData(DexLine2D::LENGTH));
  EXPECT_EQ(7.0, line->getData(DexLine2D::CALLER_VALUE_A));
  EXPECT_EQ(8.0, line->getData(DexLine2D::CALLER_VALUE_B));
}

TEST(DexCurve, FactoryOnQuarterCirclesTurningRightAndLeft) {
  // Northwards from (1000, 2000) on a quarter circle of radius 100: the side of the turn decides
  // where the centre, the end and the azimuths lie.
  struct Case {
    double signedRadius;
    double centreEasting;
    double endEasting;
    double endAzimuth;
    bool clockwise;
  };
  const Case cases[] = {{100.0, 2100.0, 2100.0, 90.0, true}, {-100.0, 1900.0, 1900.0, 270.0, false}};
  for (const Case& c : cases) {
    const CCurveArc arc(CCurveDataArc(50.0 * kPi, c.signedRadius), 1000.0, 2000.0, CMathAngle(0.0));
    const std::unique_ptr<DexCurve> curve(DexCurve::createSegment(arc, 1.0, 2.0));
    ASSERT_NE(nullptr, curve);
    expectAt(1000.0, 2000.0, curve->getPosition(DexCurve::START_POINT));
    expectAt(1000.0, c.centreEasting, curve->getPosition(DexCurve::CENTER_POINT));
    expectAt(1100.0, c.endEasting, curve->getPosition(DexCurve::END_POINT));
    expectAt(1100.0, 2000.0, curve->getPosition(DexCurve::PI_POINT));
    EXPECT_EQ(100.0, curve->getData(DexCurve::RADIUS));
    EXPECT_EQ(c.clockwise, curve->isTurnClockwised());
    EXPECT_NEAR(c.endAzimuth, curve->getData(DexCurve::END_AZIMUTH), 1e-12);
    EXPECT_EQ(0.0, curve->getData(DexCurve::START_AZIMUTH));
    EXPECT_NEAR(c.endAzimuth, curve->getData(DexCurve::DEFLECTION), 1e-12);  // not wrapped
    EXPECT_NEAR(50.0 * kPi, curve->getData(DexCurve::LENGTH), 1e-12);
    EXPECT_EQ(2.0, curve->getData(DexCurve::CALLER_VALUE_B));
  }
}

TEST(DexCurve, FactoryLeavesThePointOfIntersectionUnsetForHalfACircle) {
  const CCurveArc arc(CCurveDataArc(1.2 * kPi * 10.0, 10.0), 0.0, 0.0, CMathAngle(0.0));
  const std::unique_ptr<DexCurve> curve(DexCurve::createSegment(arc, 0.0, 0.0));
  expectAt(0.0, 0.0, curve->getPosition(DexCurve::PI_POINT));
}

TEST(DexSpiral, FactoryOnSpiralsTurningRightAndLeftIntoAndOutOfCurves) {
  using Data = CCurveDataSpiral;
  struct Case {
    Data data;
    bool clockwise;
    double startRadius;  // 0.0: not set
    double endRadius;
  };
  const Case cases[] = {
      {Data(Data::CLOTHOID, 100.0, 0.0, 400.0), true, 0.0, 400.0},
      {Data(Data::CLOTHOID, 100.0, 0.0, -400.0), false, 0.0, 400.0},
      {Data(Data::CUBIC_PARABOLA, 100.0, -400.0, 0.0), false, 400.0, 0.0},
      {Data(Data::CLOTHOID, 100.0, 800.0, 400.0), true, 800.0, 400.0},
  };
  for (const Case& c : cases) {
    const CCurveSpiral spiral(c.data, 500.0, 600.0, CMathAngle(30.0));
    const std::unique_ptr<DexSpiral> element(DexSpiral::createSegment(spiral, 3.0, 4.0));
    ASSERT_NE(nullptr, element);
    const int expectedType =
        c.data.getSpiralMathType() == Data::CLOTHOID ? DexSpiral::CLOTHOID : DexSpiral::CUBIC_PARABOLA;
    EXPECT_EQ(expectedType, element->getSpiralType());
    EXPECT_EQ(c.clockwise, element->isTurnClockwised());
    EXPECT_EQ(c.startRadius, element->getData(DexSpiral::START_RADIUS));
    EXPECT_EQ(c.endRadius, element->getData(DexSpiral::END_RADIUS));
    expectAt(500.0, 600.0, element->getPosition(DexSpiral::START_POINT));
    expectAt(spiral.getFinalNorthing(), spiral.getFinalEasting(), element->getPosition(DexSpiral::END_POINT));
    EXPECT_TRUE(element->getPosition(DexSpiral::PI_POINT).isDefined());
    EXPECT_EQ(spiral.getFinalAzimut().getDeg(), element->getData(DexSpiral::END_AZIMUTH));
    EXPECT_EQ(30.0, element->getData(DexSpiral::START_AZIMUTH));
    EXPECT_EQ(4.0, element->getData(DexSpiral::CALLER_VALUE_B));
  }
  // A = sqrt(R L) for a spiral from the tangent; A^2 = L / (1/400 - 1/800) between the two arcs.
  const std::unique_ptr<DexSpiral> fromTangent(
      DexSpiral::createSegment(CCurveSpiral(cases[0].data, 0.0, 0.0, CMathAngle(0.0)), 0.0, 0.0));
  EXPECT_NEAR(200.0, fromTangent->getData(DexSpiral::SPIRAL_CONSTANT), 1e-12);
  const std::unique_ptr<DexSpiral> betweenArcs(
      DexSpiral::createSegment(CCurveSpiral(cases[3].data, 0.0, 0.0, CMathAngle(0.0)), 0.0, 0.0));
  EXPECT_NEAR(std::sqrt(80000.0), betweenArcs->getData(DexSpiral::SPIRAL_CONSTANT), 1e-9);
}

TEST(DexSpiral, FactoryKeepsTheClothoidForAnUnknownMathTypeAndLogs) {
  const dex_test::LogCapture log;
  const CCurveDataSpiral data(static_cast<CCurveDataSpiral::ESpiralMathType>(5), 10.0, 0.0, 50.0);
  const std::unique_ptr<DexSpiral> spiral(
      DexSpiral::createSegment(CCurveSpiral(data, 0.0, 0.0, CMathAngle(0.0)), 0, 0));
  ASSERT_NE(nullptr, spiral);
  EXPECT_EQ(DexSpiral::CLOTHOID, spiral->getSpiralType());
  EXPECT_EQ(1, log.count(kSource, detail::kUnknownSpiralMathTypeLine));
}

}  // namespace
