#include "ieObjects/IEHorizontalAlignment.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <memory>
#include <numbers>

#include "ieObjects/detail/AlignmentPartsLog.h"
#include "support/LogCapture.h"

namespace {

using namespace vyn::ie;
constexpr const wchar_t* kSource = detail::kAlignmentPartsLogSource;
constexpr double kPi = std::numbers::pi;

// A line that counts its deletions.
class CountedLine : public DexLine2D {
 public:
  explicit CountedLine(int& deletions) : deletions_(deletions) {}
  ~CountedLine() override { ++deletions_; }

 private:
  int& deletions_;
};

void expectAt(double northing, double easting, const DexPosition2D& position) {
  EXPECT_NEAR(northing, position.x, 1e-9);
  EXPECT_NEAR(easting, position.y, 1e-9);
}

// Sets the first and last position of element, then reads past both ends: position 0 with one log
// record each.
template <class Element>
void expectPositionRange(Element element, int size, int logLine) {
  element.setPosition(0, 10.0, 20.0);
  element.setPosition(size, 99.0, 99.0);
  const dex_test::LogCapture log;
  expectAt(10.0, 20.0, element.getPosition(size));
  expectAt(10.0, 20.0, element.getPosition(-1));
  expectAt(0.0, 0.0, element.getPosition(size - 1));
  EXPECT_EQ(2, log.count(kSource, logLine));
  EXPECT_EQ(2u, log.size());
}

TEST(HorizontalElements, PositionKindsOutsideTheRangeLogAndReadPositionZero) {
  expectPositionRange(DexLine2D(), 2, detail::kLinePositionKindLine);
  expectPositionRange(DexCurve(), 4, detail::kCurvePositionKindLine);
  expectPositionRange(DexSpiral(), 3, detail::kSpiralPositionKindLine);
}

TEST(HorizontalElements, CurveDataStartUnsetAndTheLineMarksItsAzimuth) {
  DexCurve curve;
  curve.setData(DexCurve::RADIUS, 25.0);
  curve.setData(DexCurve::LENGTH, std::numeric_limits<double>::quiet_NaN());
  for (int kind = -1; kind <= 7; ++kind) {
    EXPECT_EQ(kind == DexCurve::RADIUS, curve.hasData(kind)) << kind;
    EXPECT_EQ(kind == DexCurve::RADIUS ? 25.0 : 0.0, curve.getData(kind)) << kind;
  }
  DexLine2D line;
  line.setData(DexLine2D::LENGTH, 5.0);
  EXPECT_FALSE(line.isStartAzimuthDefined());
  line.setData(DexLine2D::START_AZIMUTH, 0.0);
  EXPECT_TRUE(line.isStartAzimuthDefined());
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

TEST(DexIntersectionPoint, OwnsItsFittedElementsButHandsBackAReplacedOne) {
  int deletions = 0;
  auto* const replaced = new CountedLine(deletions);
  {
    DexIntersectionPoint point(true);
    point.setSegment(replaced);
    point.setSegment(replaced);  // the same pointer again changes nothing
    point.setSegment(new CountedLine(deletions));
    point.setCurve(new DexCurve());
    const DexIntersectionPoint copy(point);
    EXPECT_NE(point.getCurve(), copy.getCurve());
    EXPECT_EQ(0, deletions);
  }
  EXPECT_EQ(1, deletions);  // the held one (the copy's is a plain line); the replaced one is the caller's
  delete replaced;
}

TEST(DexHorizontalAlignment, OwnsItsElementsInOrderUntilOneIsRemoved) {
  int deletions = 0;
  auto* const middle = new CountedLine(deletions);
  {
    DexHorizontalAlignment alignment;
    auto* const last = new DexSpiral();
    EXPECT_TRUE(alignment.addSegment(new CountedLine(deletions)));
    EXPECT_TRUE(alignment.insertSegmentAt(1, last));
    EXPECT_TRUE(alignment.insertSegmentAt(1, middle));
    EXPECT_FALSE(alignment.addSegment(nullptr));
    EXPECT_FALSE(alignment.insertSegmentAt(0, nullptr));
    EXPECT_FALSE(alignment.insertSegmentAt(4, middle));
    EXPECT_EQ(last, alignment.getSegmentAt(2));
    EXPECT_EQ(nullptr, alignment.getSegmentAt(3));

    const DexHorizontalAlignment copy(alignment);
    ASSERT_EQ(3, copy.getNumberOfSegments());
    EXPECT_NE(last, copy.getSegmentAt(2));
    EXPECT_EQ(ALIGNMENT_OBJ_SPIRAL, copy.getSegmentAt(2)->getType());

    EXPECT_FALSE(alignment.removeSegmentAt(3));
    EXPECT_TRUE(alignment.removeSegmentAt(1));
    EXPECT_EQ(last, alignment.getSegmentAt(1));
  }
  EXPECT_EQ(1, deletions);  // the first line (the copies are plain lines), not the removed one
  delete middle;
}

TEST(DexLine2D, FactoryTakesEndPointsAzimuthLengthAndCallerValues) {
  const CCurveSegment segment(CCurveDataSegment(50.0), 1000.0, 2000.0, CMathAngle(90.0));
  const std::unique_ptr<DexLine2D> line(DexLine2D::createSegment(segment, 7.0, 8.0));
  expectAt(1000.0, 2050.0, line->getPosition(DexLine2D::END_POINT));
  EXPECT_TRUE(line->isStartAzimuthDefined());
  const double data[] = {90.0, 50.0, 7.0, 8.0};
  for (int kind = 0; kind < 4; ++kind)
    EXPECT_EQ(data[kind], line->getData(kind));
}

TEST(DexCurve, FactoryOnQuarterCirclesTurningRightAndLeft) {
  // Northwards from (1000, 2000) on a quarter circle of radius 100.
  const struct {
    double signedRadius, easting, endAzimuth;
  } cases[] = {{100.0, 2100.0, 90.0}, {-100.0, 1900.0, 270.0}};
  for (const auto& c : cases) {
    const CCurveArc arc(CCurveDataArc(50.0 * kPi, c.signedRadius), 1000.0, 2000.0, CMathAngle(0.0));
    const std::unique_ptr<DexCurve> curve(DexCurve::createSegment(arc, 1.0, 2.0));
    expectAt(1000.0, c.easting, curve->getPosition(DexCurve::CENTER_POINT));
    expectAt(1100.0, c.easting, curve->getPosition(DexCurve::END_POINT));
    expectAt(1100.0, 2000.0, curve->getPosition(DexCurve::PI_POINT));
    EXPECT_EQ(100.0, curve->getData(DexCurve::RADIUS));
    EXPECT_EQ(c.signedRadius > 0.0, curve->isTurnClockwised());
    EXPECT_NEAR(c.endAzimuth, curve->getData(DexCurve::END_AZIMUTH), 1e-12);
    EXPECT_NEAR(c.endAzimuth, curve->getData(DexCurve::DEFLECTION), 1e-12);  // 270, not -90
    EXPECT_EQ(2.0, curve->getData(DexCurve::CALLER_VALUE_B));
  }
  const CCurveArc halfCircle(CCurveDataArc(1.2 * kPi * 10.0, 10.0), 5.0, 5.0, CMathAngle(0.0));
  EXPECT_FALSE(
      std::unique_ptr<DexCurve>(DexCurve::createSegment(halfCircle, 0, 0))->getPosition(3).isDefined());
}

TEST(DexSpiral, FactoryOnSpiralsTurningRightAndLeftIntoAndOutOfCurves) {
  using Data = CCurveDataSpiral;
  const struct {
    Data data;
    int type;
    bool clockwise;
    double startRadius, endRadius, constant;
  } cases[] = {
      {Data(Data::CLOTHOID, 100.0, 0.0, 400.0), DexSpiral::CLOTHOID, true, 0.0, 400.0, 200.0},
      {Data(Data::CLOTHOID, 100.0, 0.0, -400.0), DexSpiral::CLOTHOID, false, 0.0, 400.0, 200.0},
      {Data(Data::CUBIC_PARABOLA, 100.0, -400.0, 0.0), DexSpiral::CUBIC_PARABOLA, false, 400.0, 0.0, 200.0},
      {Data(Data::CLOTHOID, 100.0, 800.0, 400.0), DexSpiral::CLOTHOID, true, 800.0, 400.0,
       std::sqrt(80000.0)},
  };
  for (const auto& c : cases) {
    const CCurveSpiral spiral(c.data, 500.0, 600.0, CMathAngle(30.0));
    const std::unique_ptr<DexSpiral> element(DexSpiral::createSegment(spiral, 3.0, 4.0));
    EXPECT_EQ(c.type, element->getSpiralType());
    EXPECT_EQ(c.clockwise, element->isTurnClockwised());
    EXPECT_EQ(c.startRadius, element->getData(DexSpiral::START_RADIUS));
    EXPECT_EQ(c.endRadius, element->getData(DexSpiral::END_RADIUS));
    EXPECT_NEAR(c.constant, element->getData(DexSpiral::SPIRAL_CONSTANT), 1e-9);
    expectAt(spiral.getFinalNorthing(), spiral.getFinalEasting(), element->getPosition(DexSpiral::END_POINT));
    EXPECT_TRUE(element->getPosition(DexSpiral::PI_POINT).isDefined());
    EXPECT_EQ(spiral.getFinalAzimut().getDeg(), element->getData(DexSpiral::END_AZIMUTH));
    EXPECT_EQ(30.0, element->getData(DexSpiral::START_AZIMUTH));
  }
  const dex_test::LogCapture log;
  const Data unknown(static_cast<Data::ESpiralMathType>(5), 10.0, 0.0, 50.0);
  const std::unique_ptr<DexSpiral> spiral(
      DexSpiral::createSegment(CCurveSpiral(unknown, 0, 0, CMathAngle()), 0, 0));
  EXPECT_EQ(DexSpiral::CLOTHOID, spiral->getSpiralType());
  EXPECT_EQ(1, log.count(kSource, detail::kUnknownSpiralMathTypeLine));
}

}  // namespace
