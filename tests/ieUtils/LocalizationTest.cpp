#include "ieUtils/IELocalization.h"

#include <gtest/gtest.h>

#include <numbers>

namespace {

using vyn::ie::DexLocalization;

TEST(Localization, NewLocalizationHasDatumWGS84AndAllParametersZero) {
  const DexLocalization localization;
  EXPECT_EQ(CVynStringT<wchar_t>(L"WGS84"), localization.getDatumName());
  EXPECT_TRUE(localization.getName().IsEmpty());
  EXPECT_TRUE(localization.getGridName().IsEmpty());
  EXPECT_TRUE(localization.getGeoidName().IsEmpty());
  EXPECT_FALSE(localization.isKeepScale1());
  for (int param = 0; param < DexLocalization::kNumberOfParams; ++param)
    EXPECT_EQ(0.0, localization.getData(param)) << param;
}

TEST(Localization, ParameterOutsideTheTableIsIgnoredAndReadsZero) {
  DexLocalization localization;
  localization.setData(15, 1.0);
  localization.setData(-1, 1.0);
  EXPECT_EQ(0.0, localization.getData(15));
  localization.setData(DexLocalization::PARAM_METHOD, 2.0);
  EXPECT_EQ(2.0, localization.getData(14));
}

TEST(Localization, AngleAndScaleRoundTripAndAHeldScaleReadsOne) {
  DexLocalization localization;
  localization.setAngleAndScale(std::numbers::pi / 2, 2.0);
  double angle = 0.0;
  double scale = 0.0;
  localization.getAngleAndScale(angle, scale);
  EXPECT_NEAR(std::numbers::pi / 2, angle, 1e-15);
  EXPECT_NEAR(2.0, scale, 1e-15);
  localization.setKeepScale1(true);
  localization.getAngleAndScale(angle, scale);
  EXPECT_NEAR(std::numbers::pi / 2, angle, 1e-15);
  EXPECT_EQ(1.0, scale);
}

TEST(Localization, NegativeSineGivesAnAngleBelowTwoPi) {
  DexLocalization localization;
  localization.setData(DexLocalization::PARAM_SCALE_COS, 0.0);
  localization.setData(DexLocalization::PARAM_SCALE_SIN, -1.0);
  double angle = 0.0;
  double scale = 0.0;
  localization.getAngleAndScale(angle, scale);
  EXPECT_DOUBLE_EQ(3 * std::numbers::pi / 2, angle);
  EXPECT_EQ(1.0, scale);
}

TEST(Localization, PointCodesWithoutControlPointsChangeNothing) {
  DexLocalization localization;
  vyn::ie::DexCodesDataInterface codes;
  localization.addPointCodes(L"P1", &codes);
  localization.addPointCodes(L"P1", nullptr);
  EXPECT_EQ(CVynStringT<wchar_t>(L"WGS84"), localization.getDatumName());
}

}  // namespace
