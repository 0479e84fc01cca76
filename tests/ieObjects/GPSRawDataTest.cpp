#include "ieObjects/IEGPSRawData.h"

#include <gtest/gtest.h>

#include <memory>

#include "ieObjects/IEObjects.h"

namespace {

using vyn::ie::DexGpsBaseStation;
using vyn::ie::DexObject;
using vyn::ie::DexPosition3D;
using vyn::ie::DexStation;
using vyn::ie::IDexRawDataInterface;

// A station that counts its deletions.
class CountedStation : public DexStation {
 public:
  explicit CountedStation(int& deletions) : deletions_(deletions) {}
  ~CountedStation() override { ++deletions_; }

 private:
  int& deletions_;
};

TEST(DexGpsBaseStation, IsAGnssRecordAndAGnssRawPoint) {
  DexGpsBaseStation station;
  EXPECT_EQ(IDexRawDataInterface::RAW_DATA_GNSS, station.getRawDataType());
  EXPECT_EQ(vyn::ie::GPS_RAW_BASE_STATION, station.getGpsRawDataType());
  EXPECT_EQ(vyn::ie::OBJECT_TYPE_GPS_RAW_POINT, station.getType());
  EXPECT_EQ(0, station.getVirtStationId());
  EXPECT_EQ(nullptr, station.getXyzCoords());
  EXPECT_EQ(nullptr, station.getPlaneStation());
}

TEST(DexGpsBaseStation, RecordNameIsThePointName) {
  DexGpsBaseStation station;
  IDexRawDataInterface& record = station;
  record.setName(L"BASE");
  EXPECT_EQ(L"BASE", station.getStation().getName());
  station.DexDesignPoint::setName(L"B2");
  EXPECT_EQ(L"B2", record.getName());
}

TEST(DexGpsBaseStation, ReplacingThePlaneStationDeletesThePreviousOne) {
  int deletions = 0;
  auto* const first = new CountedStation(deletions);
  {
    DexGpsBaseStation station;
    station.setPlaneStation(first);
    station.setPlaneStation(first);
    EXPECT_EQ(0, deletions);
    station.setPlaneStation(new DexStation());
    EXPECT_EQ(1, deletions);
  }
  EXPECT_EQ(1, deletions);
}

TEST(DexGpsBaseStation, CloneCopiesThePointTheRecordAndTheStation) {
  DexGpsBaseStation station;
  station.setName(L"BASE");
  station.setCoords(1, 2, 3);
  station.setTime(base::CTime(77));
  station.setAntennaHeight(1.8);
  station.setPlaneStation(new DexStation());
  station.setXyzCoords(new DexPosition3D(4, 5, 6));
  station.setAntennaType(L"TRM");
  station.setStationIds(3, 4);

  const std::unique_ptr<DexObject> clone(station.clone());
  const auto* const copy = dynamic_cast<const DexGpsBaseStation*>(clone.get());
  ASSERT_NE(nullptr, copy);
  EXPECT_EQ(L"BASE", copy->getName());
  EXPECT_EQ(3.0, copy->getStation().z);
  EXPECT_EQ(base::CTime(77), copy->getTime());
  EXPECT_EQ(1.8, copy->getAntennaHeight());
  ASSERT_NE(nullptr, copy->getPlaneStation());
  EXPECT_NE(station.getPlaneStation(), copy->getPlaneStation());
  ASSERT_NE(nullptr, copy->getXyzCoords());
  EXPECT_EQ(DexPosition3D(4, 5, 6), *copy->getXyzCoords());
  EXPECT_NE(station.getXyzCoords(), copy->getXyzCoords());
  EXPECT_EQ(L"TRM", copy->getAntennaType());
  EXPECT_EQ(4, copy->getPhysStationId());
}

}  // namespace
