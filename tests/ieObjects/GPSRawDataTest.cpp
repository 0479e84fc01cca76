// GNSS records: positions with their solution words and precisions, the dilution fill, base stations,
// offsets, and the copies of what each owns.
#include "ieObjects/IEGPSRawData.h"

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <memory>

#include "RawDataTestHelpers.h"
#include "ieObjects/IEGPSAntennaSettings.h"
#include "ieObjects/detail/RawDataLog.h"
#include "support/LogCapture.h"

namespace {

using namespace vyn::ie;

// A station that counts its deletions.
class CountedStation : public DexStation {
 public:
  explicit CountedStation(int& deletions) : deletions_(deletions) {}
  ~CountedStation() override { ++deletions_; }

 private:
  int& deletions_;
};

TEST(DexGpsPosition, NewPositionIsAGnssPositionWithoutSolutionOrCounts) {
  const DexGpsPosition position;
  EXPECT_EQ(IDexRawDataInterface::RAW_DATA_GNSS, position.getRawDataType());
  EXPECT_EQ(GPS_RAW_POSITION, position.getGpsRawDataType());
  EXPECT_EQ(L"NO_SOLUTION", position.getSolutionTypeAsString());
  for (int system = -1; system <= DexGpsPosition::kNumberOfSatelliteSystems; ++system)
    EXPECT_EQ(-1, position.getNumberOfSatellites(system)) << system;
  EXPECT_EQ(-1, position.getObsDuration());
  EXPECT_EQ(0, position.getNumOfEpochs());
  EXPECT_EQ(nullptr, position.getBaseStation());
}

TEST(DexGpsPosition, SolutionWordsReadBackExactlyAndAnythingElseIsUserInput) {
  const std::pair<int, const wchar_t*> words[] = {
      {0, L"NO_SOLUTION"},  {1, L"STANDALONE"},  {2, L"CODE_DIFF"},     {3, L"FLOAT"},
      {4, L"FIXED"},        {6, L"FIXED_SWING"}, {131, L"FLOAT_VRLAS"}, {132, L"FIXED_VRLAS"},
      {133, L"USER_INPUT"}, {5, L"USER_INPUT"},
  };
  DexGpsPosition position;
  for (const auto& [type, word] : words) {
    position.setSolutionType(type);
    EXPECT_EQ(word, position.getSolutionTypeAsString()) << type;
    if (type != 5) {
      EXPECT_EQ(type, DexGpsPosition::solutionTypeFromText(word)) << type;
    }
  }
  for (const wchar_t* const text : {L"fixed", L"FIXED ", L""})
    EXPECT_EQ(133, DexGpsPosition::solutionTypeFromText(text)) << text;
}

TEST(DexGpsDop, CombinedDilutionsFillTheMissingComponentsOrAreLogged) {
  struct Case {
    DexGpsDop before;
    double pdop;
    double gdop;
    DexGpsDop after;
    int line;  // 0: no log record
  };
  auto dop = [](double h, double v, double t) {
    DexGpsDop result;
    result.hdop = h;
    result.vdop = v;
    result.tdop = t;
    return result;
  };
  const double sqrt6 = std::sqrt(6.0);
  const double sqrt3 = std::sqrt(3.0);
  const Case cases[] = {
      {dop(0, 0, 0), 3, 0, dop(sqrt6, sqrt3, 0), 0},
      {dop(1, 0, 0), std::sqrt(5.0), 0, dop(1, 2, 0), 0},
      {dop(0, 2, 0), std::sqrt(5.0), 0, dop(1, 2, 0), 0},
      {dop(1, 0, 0), 0.5, 0, dop(1, 0, 0), detail::kGpsPdopTooSmallLine},
      {dop(1, 2, 0), 0, 3, dop(1, 2, 2), 0},
      {dop(1, 0, 2), 0, 3, dop(1, 2, 2), 0},
      {dop(0, 1, 2), 0, 3, dop(2, 1, 2), 0},
      {dop(1, 2, 0), 0, 2, dop(1, 2, 0), detail::kGpsGdopTooSmallLine},
      {dop(0, 0, 4), 0, -5, dop(sqrt6, sqrt3, 4), 0},
      {dop(0, 0, 4), 0, 4, dop(0, 0, 4), detail::kGpsGdopNotAboveTdopLine},
      {dop(1, 0, 0), 0, 5, dop(1, 0, 0), 0},
      {dop(1, 2, 3), 5, 9, dop(1, 2, 3), 0},
      {dop(0, 0, 1), 3, 4, dop(sqrt6, sqrt3, 1), 0},
  };
  for (const Case& c : cases) {
    dex_test::LogCapture log;
    DexGpsDop result = c.before;
    result.setCombinedDops(c.pdop, c.gdop);
    const std::string what = std::to_string(c.pdop) + " " + std::to_string(c.gdop);
    EXPECT_NEAR(c.after.hdop, result.hdop, 1e-12) << what;
    EXPECT_NEAR(c.after.vdop, result.vdop, 1e-12) << what;
    EXPECT_NEAR(c.after.tdop, result.tdop, 1e-12) << what;
    EXPECT_EQ(c.line != 0 ? 1u : 0u, log.size()) << what;
    EXPECT_EQ(c.line != 0 ? 1 : 0, log.count(detail::kGPSRawDataLogSource, c.line)) << what;
  }
}

TEST(DexGpsCoordCovMatrix, RmsValuesUseTheAbsoluteVariances) {
  DexGpsCoordCovMatrix cv;
  cv.variances = {4.0, -5.0, 16.0};
  EXPECT_DOUBLE_EQ(3.0, cv.getHrms());
  EXPECT_DOUBLE_EQ(4.0, cv.getVrms());
  EXPECT_DOUBLE_EQ(5.0, cv.getRms());
  DexGpsDop dop;
  dop.hdop = 3.0;
  dop.vdop = 4.0;
  dop.tdop = 12.0;
  EXPECT_DOUBLE_EQ(5.0, dop.getPDop());
  EXPECT_DOUBLE_EQ(13.0, dop.getGDop());
}

// A position carrying everything it owns and refers to.
std::unique_ptr<DexGpsPosition> fullPosition(DexGpsAntennaSettings& antenna,
                                             const DexRawDataEquipment& receiver) {
  auto position = std::make_unique<DexGpsPosition>();
  position->setName(L"CP1");
  position->setRawDataType(IDexRawDataInterface::RAW_DATA_GNSS_AND_LEVEL);
  position->setXyzCoords(new DexPosition3D(1.0, 2.0, 3.0));
  position->setWACoords(new DexPosition3D(4.0, 5.0, 6.0));
  position->setDxyz(new DexPosition3D(7.0, 8.0, 9.0));
  position->setBaseStation(raw_test::named<DexGpsBaseStation>(L"BASE"));
  position->setPlaneStation(new DexStation());
  position->setGpsAntennaModel(&antenna);
  position->setEquipment(&receiver);
  position->setSolutionType(DexGpsPosition::SOLUTION_FIXED);
  position->setNumberOfSatellites(DexGpsPosition::SATELLITES_GALILEO, 7);
  position->getDop().hdop = 0.8;
  position->getCVNeu().covariances[2] = 0.5;
  return position;
}

TEST(DexGpsPosition, CloneCopyAndAssignmentDuplicateWhatThePositionOwns) {
  DexGpsAntennaSettings antenna;
  const DexRawDataEquipment receiver;
  const auto source = fullPosition(antenna, receiver);
  const std::function<std::unique_ptr<DexGpsPosition>()> copies[] = {
      [&] { return std::unique_ptr<DexGpsPosition>(dynamic_cast<DexGpsPosition*>(source->clone())); },
      [&] { return std::make_unique<DexGpsPosition>(*source); },
      [&] {
        auto target = std::make_unique<DexGpsPosition>();
        target->setXyzCoords(new DexPosition3D());
        *target = *source;
        return target;
      },
  };
  for (const auto& copyOf : copies) {
    const auto copy = copyOf();
    ASSERT_NE(nullptr, copy);
    EXPECT_EQ(L"CP1", copy->getName());
    EXPECT_EQ(IDexRawDataInterface::RAW_DATA_GNSS_AND_LEVEL, copy->getRawDataType());
    for (const auto& [mine, theirs] : {std::pair{copy->getXyzCoords(), source->getXyzCoords()},
                                       std::pair{copy->getWACoords(), source->getWACoords()},
                                       std::pair{copy->getDxyz(), source->getDxyz()}}) {
      ASSERT_NE(nullptr, mine);
      EXPECT_NE(theirs, mine);
      EXPECT_EQ(*theirs, *mine);
    }
    ASSERT_NE(nullptr, copy->getBaseStation());
    EXPECT_NE(source->getBaseStation(), copy->getBaseStation());
    EXPECT_EQ(L"BASE", copy->getBaseStation()->getName());
    EXPECT_NE(source->getPlaneStation(), copy->getPlaneStation());
    EXPECT_EQ(&antenna, copy->getGpsAntennaModel());
    EXPECT_EQ(&receiver, copy->getEquipment());
    EXPECT_EQ(L"FIXED", copy->getSolutionTypeAsString());
    EXPECT_EQ(7, copy->getNumberOfSatellites(DexGpsPosition::SATELLITES_GALILEO));
    EXPECT_EQ(0.8, copy->getDop().hdop);
    EXPECT_EQ(0.5, copy->getCVNeu().covariances[2]);
  }
}

TEST(IDexGpsRawDataInterface, ReplacingAnOwnedRecordDeletesThePreviousOne) {
  int deletions = 0;
  auto* const first = new CountedStation(deletions);
  {
    DexGpsPosition position;
    position.setPlaneStation(first);
    position.setPlaneStation(first);
    EXPECT_EQ(0, deletions);
    position.setPlaneStation(new DexStation());
    EXPECT_EQ(1, deletions);
    position.setPlaneStation(new CountedStation(deletions));
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexGpsBaseStation, CloneCopiesThePointTheRecordAndTheStation) {
  DexGpsBaseStation station;
  station.setName(L"BASE");
  station.setCoords(1, 2, 3);
  station.setXyzCoords(new DexPosition3D(4, 5, 6));
  station.setAntennaType(L"TRM");
  station.setStationIds(3, 4);
  const std::unique_ptr<DexObject> clone(station.clone());
  auto& copy = dynamic_cast<DexGpsBaseStation&>(*clone);
  EXPECT_EQ(GPS_RAW_BASE_STATION, copy.getGpsRawDataType());
  EXPECT_EQ(OBJECT_TYPE_GPS_RAW_POINT, copy.getType());
  EXPECT_EQ(L"BASE", copy.getStation().getName());
  EXPECT_EQ(3.0, copy.getStation().z);
  EXPECT_EQ(DexPosition3D(4, 5, 6), *copy.getXyzCoords());
  EXPECT_NE(station.getXyzCoords(), copy.getXyzCoords());
  EXPECT_EQ(L"TRM", copy.getAntennaType());
  EXPECT_EQ(4, copy.getPhysStationId());
}

TEST(DexGpsOffset, ClonesOfEveryOffsetKeepTheirKindReferencesAndMeasurement) {
  auto* const azimuth = new DexAzimuthDistanceGpsOffset();
  azimuth->setRefPoint(L"R");
  auto* const ptl = new DexPtlGpsOffset();
  ptl->setRefPoint2(L"R2");
  auto* const twoDist = new DexTwoDistGpsOffset();
  twoDist->setRefPoint1(L"R1");
  twoDist->setRight(true);
  const std::unique_ptr<DexGpsOffset> offsets[] = {std::unique_ptr<DexGpsOffset>(azimuth),
                                                   std::unique_ptr<DexGpsOffset>(ptl),
                                                   std::unique_ptr<DexGpsOffset>(twoDist)};
  const DexTSRawData measurement = raw_test::values({45.0, 12.0});
  for (int kind = 0; kind < 3; ++kind) {
    DexGpsOffset& offset = *offsets[kind];
    offset.setTSRawData(&measurement);
    const std::unique_ptr<DexObject> clone(offset.clone());
    const auto& copy = dynamic_cast<const DexGpsOffset&>(*clone);
    EXPECT_EQ(GPS_RAW_OFFSET, copy.getGpsRawDataType());
    EXPECT_EQ(kind, copy.getOffsetType());
    ASSERT_NE(nullptr, copy.getTSRawData());
    EXPECT_NE(offset.getTSRawData(), copy.getTSRawData());
    EXPECT_EQ(12.0, copy.getTSRawData()->getTSRawData(1));
  }
  EXPECT_EQ(L"R",
            dynamic_cast<const DexAzimuthDistanceGpsOffset&>(*std::unique_ptr<DexObject>(azimuth->clone()))
                .getRefPoint());
  EXPECT_EQ(L"R2",
            dynamic_cast<const DexPtlGpsOffset&>(*std::unique_ptr<DexObject>(ptl->clone())).getRefPoint2());
  const std::unique_ptr<DexObject> twoDistClone(twoDist->clone());
  EXPECT_EQ(L"R1", dynamic_cast<const DexTwoDistGpsOffset&>(*twoDistClone).getRefPoint1());
  EXPECT_TRUE(dynamic_cast<const DexTwoDistGpsOffset&>(*twoDistClone).getRight());
  azimuth->setTSRawData(nullptr);
  EXPECT_EQ(nullptr, azimuth->getTSRawData());
}

}  // namespace
