// Total-station records: values, the owned records and their copies, clones of the eight kinds, the
// job-history copies a clone owns, resections, images and stakeout stations.
#include "ieObjects/IETSRawData.h"

#include <gtest/gtest.h>

#include <functional>
#include <memory>

#include "RawDataTestHelpers.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IETSRawRecords.h"
#include "ieObjects/detail/RawDataLog.h"
#include "support/LogCapture.h"
#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
using namespace raw_test;
using Record = IDexTSRawDataInterface;

constexpr const wchar_t* kSource = detail::kTSRawDataLogSource;

TEST(DexTSRawData, PlacesOutsideTheFourValuesReadMinusOneAndAreIgnored) {
  DexTSRawData data(DexTSRawData::CONTENTS_HV);
  for (const int place : {-1, 0, 3, 4})
    data.setTSRawData(place, 12.5);
  const std::pair<int, double> reads[] = {{-1, -1.0}, {0, 12.5}, {1, 0.0}, {3, 12.5}, {4, -1.0}};
  for (const auto& [place, expected] : reads)
    EXPECT_EQ(expected, data.getTSRawData(place)) << place;
  EXPECT_EQ(DexTSRawData::CONTENTS_HV, data.getContentsType());
}

TEST(IDexTSRawDataInterface, EveryValueSetterCopiesItsArgumentAndNullRemovesTheValues) {
  using Setter = std::function<void(DexTSRawFS&, const DexTSRawData*)>;
  using Getter = std::function<const DexTSRawData*(const DexTSRawFS&)>;
  const std::pair<Setter, Getter> members[] = {
      {&DexTSRawFS::setTSRawData, &DexTSRawFS::getTSRawData},
      {&DexTSRawFS::setAveragedTSRawData, &DexTSRawFS::getAveragedTSRawData},
      {[](DexTSRawFS& r, const DexTSRawData* d) { r.setXyz(d); }, &DexTSRawFS::getXyz},
      {&DexTSRawFS::setSecondData, &DexTSRawFS::getSecondData},
  };
  for (const auto& [set, get] : members) {
    DexTSRawFS record;
    DexTSRawData data = values({90.0});
    set(record, &data);
    ASSERT_NE(nullptr, get(record));
    EXPECT_NE(&data, get(record));
    data.setTSRawData(0, 45.0);
    EXPECT_EQ(90.0, get(record)->getTSRawData(0));
    set(record, get(record));
    EXPECT_EQ(90.0, get(record)->getTSRawData(0));
    set(record, nullptr);
    EXPECT_EQ(nullptr, get(record));
  }
}

TEST(DexTSRawDataSightInterface, CoordinatesByValueKeepAHeldRecordsContents) {
  DexTSRawSS shot;
  shot.setXyz(1.0, 2.0, 3.0);
  EXPECT_EQ(DexTSRawData::CONTENTS_NEU, shot.getXyz()->getContentsType());
  const DexTSRawData held = values({0, 0, 0, 9.0}, DexTSRawData::CONTENTS_HVD);
  shot.setXyz(&held);
  shot.setXyz(4.0, 5.0, 6.0);
  EXPECT_EQ(DexTSRawData::CONTENTS_HVD, shot.getXyz()->getContentsType());
  EXPECT_EQ(6.0, shot.getXyz()->getTSRawData(2));
  EXPECT_EQ(9.0, shot.getXyz()->getTSRawData(3));
}

TEST(IDexTSRawDataInterface, InfoRecordsAreAbsentUntilSetAndThenCopiedOut) {
  DexTSRawMlm record;
  DexWeatherInfo weather;
  DexSurveyorInfo surveyor;
  DexSessionPattern session;
  EXPECT_FALSE(record.getWeatherInfo(weather) || record.getSurveyorInfo(surveyor) ||
               record.getSessionPattern(session));
  weather.values = {20.5, 1013.0, 60.0};
  surveyor.trailingTexts[1] = L"Ann";
  session.numbers[3] = 7;
  record.setWeatherInfo(weather);
  record.setSurveyorInfo(surveyor);
  record.setSessionPattern(session);
  weather = DexWeatherInfo();
  surveyor = DexSurveyorInfo();
  session = DexSessionPattern();
  ASSERT_TRUE(record.getWeatherInfo(weather) && record.getSurveyorInfo(surveyor) &&
              record.getSessionPattern(session));
  EXPECT_EQ(1013.0, weather.values[1]);
  EXPECT_EQ(L"Ann", surveyor.trailingTexts[1]);
  EXPECT_EQ(7, session.numbers[3]);
}

// ---- Clones ---------------------------------------------------------------------------------------

// Every kind, filled with the common data that clones copy and that they leave behind.
struct KindCase {
  EDexTSRawDataType type;
  std::function<Record*()> make;
};

TEST(IDexTSRawDataInterface, CloneOfEveryKindCopiesNameTimeHeightAndValuesButNotDepthModelOrInfo) {
  const KindCase kKinds[] = {
      {TS_RAW_BACKBEARING, [] { return new DexTSRawBkb(); }},
      {TS_RAW_BACKSIGHT, [] { return new DexTSRawBS(); }},
      {TS_RAW_FORESIGHT, [] { return new DexTSRawFS(); }},
      {TS_RAW_SIDESHOT, [] { return new DexTSRawSS(); }},
      {TS_RAW_MISSING_LINE, [] { return new DexTSRawMlm(); }},
      {TS_RAW_RESECTION_SHOT, [] { return new DexTSRawResShot(); }},
      {TS_RAW_STATION, [] { return new DexTSRawStn(0); }},
      {TS_RAW_STAKEOUT, [] { return new DexTSRawStakeout(1); }},
  };
  for (const KindCase& kind : kKinds) {
    const std::unique_ptr<Record> record(kind.make());
    record->setName(L"P7");
    record->setTime(at(9, 15));
    record->setTargetHeight(1.65);
    record->setNameSource(3);
    const DexTSRawData data = values({1.0, 2.0, 3.0});
    record->setTSRawData(&data);
    record->setAveragedTSRawData(&data);
    record->setDepth(2.0);
    record->setModelName(L"TS16");
    record->setIsEmptyName(true);
    record->setWeatherInfo(DexWeatherInfo());

    const std::unique_ptr<Record> clone(record->clone());
    ASSERT_NE(nullptr, clone);
    EXPECT_EQ(kind.type, clone->getType());
    EXPECT_EQ(0, clone->getRawDataType());
    EXPECT_EQ(L"P7", clone->getName());
    EXPECT_EQ(at(9, 15), clone->getTime());
    EXPECT_EQ(1.65, clone->getTargetHeight());
    EXPECT_EQ(3, clone->getNameSource());
    ASSERT_NE(nullptr, clone->getTSRawData());
    EXPECT_NE(record->getTSRawData(), clone->getTSRawData());
    EXPECT_EQ(3.0, clone->getTSRawData()->getTSRawData(2));
    EXPECT_NE(nullptr, clone->getAveragedTSRawData());
    EXPECT_EQ(0.0, clone->getDepth());
    EXPECT_TRUE(clone->getModelName().IsEmpty());
    EXPECT_FALSE(clone->getIsEmptyName());
    DexWeatherInfo weather;
    EXPECT_FALSE(clone->getWeatherInfo(weather)) << kind.type;
  }
}

TEST(DexTSRawBS, SightClonesKeepTheirBacksightPointNoteStateAndCoordinates) {
  const DexDesignPoint point;
  DexTSRawBkb backbearing;
  backbearing.setBSPoint(&point);
  backbearing.setNote(L"check");
  backbearing.setStateType(IDexStateInterface::INACTIVE_STATE);
  backbearing.setXyz(1.0, 2.0, 3.0);
  const std::unique_ptr<Record> clone(backbearing.clone());
  const auto& copy = dynamic_cast<const DexTSRawBkb&>(*clone);
  EXPECT_EQ(&point, copy.getBSPoint());
  EXPECT_EQ(L"check", copy.getNote());
  EXPECT_EQ(IDexStateInterface::INACTIVE_STATE, copy.getStateType());
  EXPECT_EQ(2.0, copy.getXyz()->getTSRawData(1));
}

// A sideshot carrying everything a foresight owns.
std::unique_ptr<DexTSRawSS> fullSideshot(DexJobHistoryUnits& units, DexCommonJobHistoryRecord& common) {
  auto shot = std::make_unique<DexTSRawSS>(DexTSRawFS::MEAS_HA_VA_OFFSET);
  const DexTSRawData second = values({4.0});
  shot->setSecondData(&second);
  shot->setResultCoords(new DexPosition3D(10.0, 20.0, 30.0));
  shot->setPhotoNotes(new DexPhotoNotes());
  shot->getPhotoNotes()->addPhotoNote(new DexPhotoNote());
  shot->addCode(new DexCodeValues(nullptr));
  shot->addImage(DexTSRawSS::IMAGE_SECONDARY, L"sketch.png");
  shot->setJHUnits(&units);
  shot->setCommonJHRecord(&common);
  return shot;
}

TEST(DexTSRawSS, CloneCopiesWhatTheForesightOwnsAndOwnsItsJobHistoryCopies) {
  auto units = std::make_unique<DexJobHistoryUnits>();
  units->setDistanceUnits(USFEET);
  auto common = std::make_unique<DexCommonJobHistoryRecord>();
  const auto shot = fullSideshot(*units, *common);
  std::unique_ptr<Record> clone(shot->clone());
  units.reset();  // the reader's records go; the clone's copies stay
  common.reset();
  const auto& copy = dynamic_cast<const DexTSRawSS&>(*clone);
  EXPECT_EQ(TS_RAW_SIDESHOT, copy.getType());
  EXPECT_EQ(DexTSRawFS::MEAS_HA_VA_OFFSET, copy.getMeasType());
  EXPECT_EQ(JH_DATA_NONE, copy.getJHDataType());
  ASSERT_NE(nullptr, copy.getJHUnits());
  EXPECT_EQ(USFEET, copy.getJHUnits()->getDistanceUnits());
  EXPECT_NE(nullptr, copy.getCommonJHRecord());
  EXPECT_EQ(nullptr, copy.getJHBackSight());
  EXPECT_EQ(1, copy.getNumberOfCodes());
  EXPECT_EQ(4.0, copy.getSecondData()->getTSRawData(0));
  ASSERT_NE(nullptr, copy.getResultCoords());
  EXPECT_NE(shot->getResultCoords(), copy.getResultCoords());
  EXPECT_EQ(1, copy.getPhotoNotes()->getNumberOfPhotoNotes());
  EXPECT_EQ(L"sketch.png", copy.getImageAt(DexTSRawSS::IMAGE_SECONDARY, 0));

  // Copies of the clone own copies of its copies: the clone may go first.
  DexTSRawSS assigned;
  assigned = copy;
  const DexTSRawSS constructed(copy);
  clone.reset();
  EXPECT_EQ(USFEET, assigned.getJHUnits()->getDistanceUnits());
  EXPECT_EQ(USFEET, constructed.getJHUnits()->getDistanceUnits());
}

TEST(DexTSRawFS, CopiesOfAReadersRecordShareItsJobHistoryRecordsAndCloneNoMissingParts) {
  DexJobHistoryUnits units;
  DexTSRawFS foresight(DexTSRawFS::MEAS_SHOT, JH_DATA_SURVEYED_POINT);
  foresight.setJHUnits(&units);
  const DexTSRawFS copy(foresight);
  EXPECT_EQ(&units, copy.getJHUnits());
  EXPECT_EQ(JH_DATA_SURVEYED_POINT, copy.getJHDataType());
  const std::unique_ptr<Record> clone(DexTSRawFS().clone());
  EXPECT_EQ(nullptr, dynamic_cast<const DexTSRawFS&>(*clone).getPhotoNotes());
  EXPECT_EQ(nullptr, dynamic_cast<const DexTSRawFS&>(*clone).getResultCoords());
}

// A station with a resection of two shots, resection results, notes and a job-history link.
std::unique_ptr<DexTSRawStn> fullStation(DexStation& occupation) {
  auto station = std::make_unique<DexTSRawStn>(JH_DATA_OCCUPATION);
  auto* const resection = new DexTSRawResection();
  resection->setName(L"R1");
  for (int i = 0; i < 2; ++i) {
    auto* const shot = new DexTSRawResShot();
    shot->setCoords(new DexPosition3D(i, i, i));
    shot->setTSRawDataResidials(new DexTSRawData());
    shot->setUsedData(DexTSRawResShot::USED_HV);
    resection->addTSResShot(shot);
  }
  station->addTSRawResection(resection);
  station->setAdditionalResectionData(new DexAdditionalResectionData());
  station->setPhotoNotes(new DexPhotoNotes());
  station->setNote(L"over nail");
  station->setScaleFactor(0.9996);
  station->addCode(new DexCodeValues(nullptr));
  station->setJHOccupation(&occupation);
  return station;
}

TEST(DexTSRawStn, CloneAndCopiesDuplicateResectionsShotsAndResults) {
  DexStation occupation;
  occupation.setName(L"STN1");
  const auto station = fullStation(occupation);
  const std::unique_ptr<Record> clone(station->clone());
  const auto& cloned = dynamic_cast<const DexTSRawStn&>(*clone);
  DexTSRawStn assigned;
  assigned = *station;
  for (const DexTSRawStn* const copy : {&cloned, static_cast<const DexTSRawStn*>(&assigned)}) {
    const DexTSRawResection* const resection = copy->findTSRawResection(L"R1");
    ASSERT_NE(nullptr, resection);
    EXPECT_NE(station->getTSRawResectionAt(0), resection);
    ASSERT_EQ(2, resection->getNumberOfTSResShots());
    EXPECT_NE(station->getTSRawResectionAt(0)->getTSResShotAt(1)->getCoords(),
              resection->getTSResShotAt(1)->getCoords());
    EXPECT_EQ(DexTSRawResShot::USED_HV, resection->getTSResShotAt(1)->getUsedData());
    EXPECT_NE(station->getAdditionalResectionData(), copy->getAdditionalResectionData());
    EXPECT_NE(nullptr, copy->getPhotoNotes());
    EXPECT_EQ(L"over nail", copy->getNote());
    EXPECT_EQ(0.9996, copy->getScaleFactor());
    EXPECT_EQ(1, copy->getNumberOfCodes());
    EXPECT_EQ(L"STN1", copy->getJHOccupation()->getName());
  }
  EXPECT_NE(&occupation, cloned.getJHOccupation());
  EXPECT_EQ(&occupation, assigned.getJHOccupation());
  EXPECT_EQ(nullptr, station->findTSRawResection(L"R2"));
}

TEST(DexTSRawResShot, CloneCopiesResidualsCoordinatesAndUsedData) {
  DexTSRawResShot shot;
  shot.setCoords(new DexPosition3D(1.0, 2.0, 3.0));
  shot.setTSRawDataResidials(new DexTSRawData(values({0.001})));
  shot.setUsedData(DexTSRawResShot::USED_SD);
  const std::unique_ptr<Record> clone(shot.clone());
  const auto& copy = dynamic_cast<const DexTSRawResShot&>(*clone);
  EXPECT_NE(shot.getCoords(), copy.getCoords());
  EXPECT_EQ(0.001, copy.getTSRawDataResidials()->getTSRawData(0));
  EXPECT_EQ(DexTSRawResShot::USED_SD, copy.getUsedData());
}

// ---- Resections, images, stakeout stations --------------------------------------------------------

TEST(DexTSRawResection, ResectionAndShotNameEachOther) {
  struct Case {
    const wchar_t* resection;
    const wchar_t* shot;
    const wchar_t* resectionAfter;
    const wchar_t* shotAfter;
  };
  const Case cases[] = {{L"R1", L"", L"R1", L"R1"},
                        {L"", L"P5", L"P5", L"P5"},
                        {L"R1", L"P5", L"R1", L"P5"},
                        {L"", L"", L"", L""}};
  for (const Case& c : cases) {
    DexTSRawResection resection;
    resection.setName(c.resection);
    auto* const shot = named<DexTSRawResShot>(c.shot);
    resection.addTSResShot(shot);
    resection.addTSResShot(nullptr);
    EXPECT_EQ(c.resectionAfter, resection.getName());
    EXPECT_EQ(c.shotAfter, shot->getName());
    EXPECT_EQ(1, resection.getNumberOfTSResShots());
  }
}

TEST(DexTSRawSS, ImageTypesOutsideTheTwoListsAreLoggedAndChangeNothing) {
  dex_test::LogCapture log;
  DexTSRawSS shot;
  shot.addImage(DexTSRawSS::IMAGE_PRIMARY, L"a.jpg");
  shot.addImage(DexTSRawSS::IMAGE_PRIMARY, L"b.jpg");
  EXPECT_EQ(L"", shot.getImageAt(0, 5));
  EXPECT_EQ(L"", shot.getImageAt(0, -1));
  EXPECT_EQ(L"b.jpg", shot.getImageAt(0, 1));
  EXPECT_EQ(0u, log.size());
  const std::pair<std::function<void()>, int> misuses[] = {
      {[&] { shot.addImage(2, L"c.jpg"); }, detail::kTSImageAddLine},
      {[&] { EXPECT_EQ(0, shot.getNumberOfImages(-1)); }, detail::kTSImageCountLine},
      {[&] { EXPECT_EQ(L"", shot.getImageAt(2, 0)); }, detail::kTSImageGetLine},
      {[&] { shot.removeAllImages(7); }, detail::kTSImageRemoveLine},
  };
  for (const auto& [misuse, line] : misuses) {
    log.clear();
    misuse();
    EXPECT_EQ(1, log.count(kSource, line)) << line;
    EXPECT_EQ(1u, log.size());
  }
  EXPECT_EQ(2, shot.getNumberOfImages(0));
  shot.removeAllImages(0);
  EXPECT_EQ(0, shot.getNumberOfImages(0));
}

TEST(DexTSRawStakeout, StationTypesOutsideTheFourReadStationZeroAfterALogRecord) {
  dex_test::LogCapture log;
  DexTSRawStakeout stakeout;
  DexStation design;
  design.setName(L"D1");
  stakeout.setStation(DexTSRawStakeout::STAKE_DESIGN, design);
  DexStation line;
  line.setName(L"L1");
  stakeout.setStation(DexTSRawStakeout::STAKE_LINE, line);
  stakeout.setStation(4, line);
  stakeout.setStation(-1, line);
  EXPECT_EQ(L"L1", stakeout.getStation(3).getName());
  EXPECT_EQ(0u, log.size());
  for (const int type : {4, -1}) {
    EXPECT_EQ(L"D1", stakeout.getStation(type).getName());
  }
  EXPECT_EQ(2, log.count(kSource, detail::kTSStakeoutStationLine));
  const std::unique_ptr<Record> clone(stakeout.clone());
  EXPECT_EQ(L"L1", dynamic_cast<const DexTSRawStakeout&>(*clone).getStation(3).getName());
}

// ---- Plug-in interface ----------------------------------------------------------------------------

TEST(IDexTSRawDataInterface, VirtualOperationsKeepTheirSlots) {
  if (!dex_test::vtableEntryOf(&Record::getType)) GTEST_SKIP() << "virtual table layout unknown";
  const std::pair<std::optional<std::ptrdiff_t>, std::ptrdiff_t> slots[] = {
      {dex_test::vtableEntryOf(&Record::getRawDataType), 4},
      {dex_test::vtableEntryOf(&Record::getType), 5},
      {dex_test::vtableEntryOf(&Record::setWeatherInfo), 17},
      {dex_test::vtableEntryOf(&Record::getSessionPattern), 22},
      {dex_test::vtableEntryOf(&Record::getModelName), 26},
      {dex_test::vtableEntryOf(&DexTSRawData::getPrismConst), 15},
      {dex_test::vtableEntryOf(&DexJobHistoryInterface::copyJHData), 4},
      {dex_test::vtableEntryOf(&DexJobHistoryInterface::setJHOccupation), 13},
  };
  for (const auto& [entry, expected] : slots)
    EXPECT_EQ(expected, entry);
}

// ---- Job-history records --------------------------------------------------------------------------

TEST(DexCommonJobHistoryRecord, EqualIgnoringCaseAndBeyondFourDecimals) {
  struct Case {
    const wchar_t* job;
    double temperature;
    bool equal;
  };
  const Case cases[] = {{L"job1", 20.00002, true},
                        {L"JOB1", 20.00001, true},
                        {L"job1", 20.0002, false},
                        {L"job2", 20.00001, false}};
  DexCommonJobHistoryRecord reference;
  reference.setJobName(L"Job1");
  reference.setTemperature(20.00001);
  for (const Case& c : cases) {
    DexCommonJobHistoryRecord other = reference;
    other.setJobName(c.job);
    other.setTemperature(c.temperature);
    EXPECT_EQ(c.equal, reference == other) << c.temperature;
    EXPECT_NE(c.equal, reference != other);
  }
}

TEST(DexJobHistoryInterface, CopyJHDataHandsOnlyTheRecordsHeld) {
  DexJobHistoryUnits units;
  DexTSRawStakeout source(JH_DATA_POINT_STAKEOUT);
  source.setJHUnits(&units);
  DexBackSightJobHistoryRecord backsight;
  DexTSRawStakeout target;
  target.setJHBackSight(&backsight);
  source.copyJHData(&target);
  source.copyJHData(nullptr);
  ASSERT_NE(nullptr, target.getJHUnits());
  EXPECT_NE(&units, target.getJHUnits());
  EXPECT_EQ(&backsight, target.getJHBackSight());
  EXPECT_EQ(nullptr, target.getCommonJHRecord());
  delete target.getJHUnits();  // copies handed to a record that did not adopt them are the caller's
}

}  // namespace
