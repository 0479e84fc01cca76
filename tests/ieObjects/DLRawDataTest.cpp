// Digital-level readings: the measured values, what a sight owns and what it only refers to.
#include "ieObjects/IEDLRawData.h"

#include <gtest/gtest.h>

#include "ieObjects/IEPoints.h"

namespace {

using namespace vyn::ie;

TEST(DexDLRawData, PlacesOutsideTheThreeValuesReadMinusOneAndAreIgnored) {
  DexDLRawData data(2);
  for (const int place : {-1, 0, 2, 3})
    data.setDLRawData(place, 1.25);
  const std::pair<int, double> reads[] = {{-1, -1.0}, {0, 1.25}, {1, 0.0}, {2, 1.25}, {3, -1.0}};
  for (const auto& [place, expected] : reads)
    EXPECT_EQ(expected, data.getDLRawData(place)) << place;
  EXPECT_EQ(2, data.getContentsType());
}

TEST(DexDLRawDataSight, OwnsItsValuesAndOnlyRefersToItsPointAndRun) {
  DexDesignPoint point;
  DexDLRun run(L"RUN1", L"forward");
  DexDLRawData values;
  values.setDLRawData(0, 1.4321);
  DexDLRawDataSight copy(0);
  {
    DexDLRawDataSight sight(3);
    EXPECT_EQ(IDexRawDataInterface::RAW_DATA_DIGITAL_LEVEL, sight.getRawDataType());
    sight.setMeasData(&values);
    values.setDLRawData(0, 9.0);
    sight.setTargetPoint(&point);
    sight.setDLRun(&run);
    sight.setBPName(L"BM7");
    sight.setDistance(25.5);
    const DexDLRawDataSight constructed(sight);
    copy = constructed;
    EXPECT_NE(sight.getMeasData(), copy.getMeasData());
  }  // the sight and its first copy are gone; the point and run are not theirs
  EXPECT_EQ(3, copy.getType());
  EXPECT_EQ(1.4321, copy.getMeasData()->getDLRawData(0));
  EXPECT_EQ(&point, copy.getTargetPoint());
  EXPECT_EQ(L"forward", copy.getDLRun()->text);
  EXPECT_EQ(L"BM7", copy.getBPName());
  EXPECT_EQ(25.5, copy.getDistance());
  copy.setMeasData(nullptr);
  EXPECT_EQ(nullptr, copy.getMeasData());
}

}  // namespace
