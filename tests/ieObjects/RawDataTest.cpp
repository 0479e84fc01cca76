// The raw-data list: ownership, the searches by name against a walk in recording order, times, names,
// the backbearing fill and the summary.
#include "ieObjects/IERawData.h"

#include <gtest/gtest.h>

#include <memory>
#include <random>
#include <vector>

#include "RawDataTestHelpers.h"
#include "ieObjects/IERawDataSummary.h"
#include "ieUtils/IENaturalNames.h"

namespace {

using namespace vyn::ie;
using namespace raw_test;
using Kind = IDexRawDataInterface::ERawDataType;
using State = IDexStateInterface::ECurrentState;

// A note that counts its deletions.
class CountedNote : public DexRawNote {
 public:
  explicit CountedNote(int& deletions) : deletions_(deletions) {}
  ~CountedNote() override { ++deletions_; }

 private:
  int& deletions_;
};

DexRawData* listOf(std::initializer_list<IDexRawDataInterface*> records) {
  auto* const rawData = new DexRawData();
  for (IDexRawDataInterface* const record : records)
    rawData->addRawData(record);
  return rawData;
}

int indexOf(const DexRawData& rawData, const IDexRawDataInterface* record) {
  for (int i = 0; i < rawData.getNumberOfRawData(); ++i) {
    if (rawData.getRawDataAt(i) == record) return i;
  }
  return -1;
}

// ---- The list -------------------------------------------------------------------------------------

TEST(DexRawData, DeclinesNullAndHeldRecordsAndAnswersNullOutsideTheList) {
  DexRawData rawData;
  auto* const note = new DexRawNote();
  rawData.addRawData(nullptr);
  rawData.addRawData(note);
  rawData.addRawData(note);
  EXPECT_FALSE(rawData.insertRawData(0, note));
  EXPECT_FALSE(rawData.insertRawData(0, nullptr));
  EXPECT_EQ(1, rawData.getNumberOfRawData());
  for (const int index : {-1, 1})
    EXPECT_EQ(nullptr, rawData.getRawDataAt(index)) << index;
  EXPECT_FALSE(rawData.removeRawData(1));
  EXPECT_EQ(nullptr, rawData.detachRawData(-1));
  const std::unique_ptr<DexRawNote> outside(new DexRawNote());
  EXPECT_FALSE(rawData.insertRawData(3, outside.get()));
}

TEST(DexRawData, DeletesWhatItHoldsButNotWhatItHandsBack) {
  int deletions = 0;
  {
    DexRawData rawData;
    for (int i = 0; i < 3; ++i)
      rawData.addRawData(new CountedNote(deletions));
    EXPECT_TRUE(rawData.removeRawData(0));
    EXPECT_EQ(1, deletions);
    const std::unique_ptr<IDexRawDataInterface> detached(rawData.detachRawData(0));
    EXPECT_EQ(1, rawData.getNumberOfRawData());
    EXPECT_EQ(1, deletions);
  }
  EXPECT_EQ(3, deletions);
}

// ---- Searches -------------------------------------------------------------------------------------

// The job the search table asks: A station, B foresight (inactive), B sideshot (active), G GNSS,
// G4 GNSS of kind 4, L level, B note, A level.
std::unique_ptr<DexRawData> searchJob() {
  return std::unique_ptr<DexRawData>(
      listOf({named<DexTSRawStn>(L"A"), sight<DexTSRawFS>(L"B", State::INACTIVE_STATE),
              sight<DexTSRawSS>(L"B", State::ACTIVE_STATE), position(L"G"), position(L"G4", 4),
              new TestLevelRecord(L"L"), named<DexRawNote>(L"B"), new TestLevelRecord(L"A")}));
}

TEST(DexRawData, FindRawDataAnswersTheLastMatchOfKindNameAndState) {
  struct Case {
    int type;
    const wchar_t* name;
    bool onlyActive;
    bool lastOnly;
    int expected;  // index in searchJob(), -1 for none
  };
  const Case cases[] = {
      {0, L"B", true, false, 2},    {0, L"B", false, false, 2},  {4, L"B", false, false, 2},
      {3, L"B", false, false, -1},  {0, L"b", false, false, -1}, {0, L"A", true, false, -1},
      {0, L"A", false, false, 0},   {1, L"G", false, false, 3},  {2, L"G", false, false, -1},
      {4, L"G", false, false, 3},   {1, L"G4", false, false, 4}, {2, L"G4", false, false, 4},
      {0, L"G4", false, false, -1}, {2, L"L", false, false, 5},  {1, L"L", false, false, -1},
      {4, L"A", false, false, 7},   {0, L"A", false, true, -1},  {2, L"A", false, true, 7},
      {0, L"B", false, true, -1},   {9, L"A", false, false, -1},
  };
  const auto job = searchJob();
  for (const Case& c : cases) {
    const IDexRawDataInterface* const found =
        job->findRawData(static_cast<Kind>(c.type), c.name, c.onlyActive, c.lastOnly);
    EXPECT_EQ(c.expected, found != nullptr ? indexOf(*job, found) : -1)
        << c.type << " " << c.name << " " << c.onlyActive << c.lastOnly;
  }
}

TEST(DexRawData, FindFirstRawDataAnswersTheFirstMatch) {
  const auto job = searchJob();
  EXPECT_EQ(1, indexOf(*job, job->findFirstRawData(Kind::RAW_DATA_TOTAL_STATION, L"B", false)));
  EXPECT_EQ(2, indexOf(*job, job->findFirstRawData(Kind::RAW_DATA_TOTAL_STATION, L"B", true)));
  EXPECT_EQ(0, indexOf(*job, job->findFirstRawData(Kind::RAW_DATA_GNSS_AND_LEVEL, L"A", false)));
  EXPECT_EQ(nullptr, job->findFirstRawData(Kind::RAW_DATA_NOTE, L"B", false));
}

// The searches of a walk over the list, to hold the indexed answers against.
const IDexRawDataInterface* walkFor(const DexRawData& rawData, Kind type, const CVynStringT<wchar_t>& name,
                                    bool onlyActive, bool last) {
  const IDexRawDataInterface* answer = nullptr;
  for (int i = 0; i < rawData.getNumberOfRawData(); ++i) {
    const IDexRawDataInterface* const record = rawData.getRawDataAt(i);
    const Kind kind = record->getRawDataType();
    const bool kindMatches = (kind == 0 && (type == 0 || type == 4)) ||
                             ((kind == 1 || kind == 4) && (type == 1 || type == 4)) ||
                             ((kind == 2 || kind == 4) && (type == 2 || type == 4));
    const auto* const shot = dynamic_cast<const DexTSRawDataSightInterface*>(record);
    const bool active =
        shot != nullptr && (shot->getType() == 2 || shot->getType() == 3) && shot->getStateType() == 1;
    if (record->getName() == name && kindMatches && (kind != 0 || !onlyActive || active)) {
      answer = record;
      if (!last) break;
    }
  }
  return answer;
}

IDexRawDataInterface* randomRecord(std::mt19937& random, const CVynStringT<wchar_t>& name) {
  switch (random() % 6) {
    case 0:
      return named<DexTSRawStn>(name);
    case 1:
      return sight<DexTSRawFS>(name, static_cast<State>(random() % 2));
    case 2:
      return sight<DexTSRawSS>(name, static_cast<State>(random() % 2));
    case 3:
      return position(name, random() % 2 != 0 ? 1 : 4);
    case 4:
      return new TestLevelRecord(name);
    default:
      return named<DexRawNote>(name);
  }
}

TEST(DexRawData, IndexedSearchesAnswerAsAWalkThroughAppendsInsertsRemovalsAndRenames) {
  const CVynStringT<wchar_t> names[] = {L"P1", L"P2", L"P3", L"P4", L"STN", L""};
  std::mt19937 random(20240514);
  DexRawData rawData;
  for (int step = 0; step < 250; ++step) {
    const int count = rawData.getNumberOfRawData();
    const int operation = static_cast<int>(random() % 20);
    const int at = count > 0 ? static_cast<int>(random() % static_cast<unsigned>(count)) : 0;
    const CVynStringT<wchar_t>& name = names[random() % std::size(names)];
    if (operation < 11 || count == 0) {
      rawData.addRawData(randomRecord(random, name));
    } else if (operation < 15) {
      ASSERT_TRUE(rawData.insertRawData(at, randomRecord(random, name)));
    } else if (operation < 17) {
      ASSERT_TRUE(rawData.removeRawData(at));
    } else if (operation < 18) {
      delete rawData.detachRawData(at);
    } else {
      rawData.getRawDataAt(at)->setName(name);
      rawData.reindexRawData();
    }
    for (const CVynStringT<wchar_t>& query : names) {
      for (int type = 0; type <= 4; ++type) {
        for (const bool onlyActive : {false, true}) {
          const auto kind = static_cast<Kind>(type);
          ASSERT_EQ(walkFor(rawData, kind, query, onlyActive, true),
                    rawData.findRawData(kind, query, onlyActive, false))
              << "step " << step;
          ASSERT_EQ(walkFor(rawData, kind, query, onlyActive, false),
                    rawData.findFirstRawData(kind, query, onlyActive))
              << "step " << step;
        }
      }
    }
  }
}

TEST(DexRawData, ARenamedRecordIsFoundUnderItsNewNameOnceReindexed) {
  DexRawData rawData;
  DexTSRawStn* const station = named<DexTSRawStn>(L"OLD");
  rawData.addRawData(station);
  station->setName(L"NEW");
  EXPECT_EQ(nullptr, rawData.findRawData(Kind::RAW_DATA_TOTAL_STATION, L"OLD", false, false));
  EXPECT_EQ(nullptr, rawData.findRawData(Kind::RAW_DATA_TOTAL_STATION, L"NEW", false, false));
  rawData.reindexRawData();
  EXPECT_EQ(station, rawData.findRawData(Kind::RAW_DATA_TOTAL_STATION, L"NEW", false, false));
}

// ---- Times ----------------------------------------------------------------------------------------

// A station without time of its own whose resection shot was taken at time.
DexTSRawStn* stationWithShotAt(const base::CTime& time) {
  auto* const resection = new DexTSRawResection();
  resection->addTSResShot(timed(new DexTSRawResShot(), time));
  auto* const station = new DexTSRawStn();
  station->addTSRawResection(resection);
  return station;
}

TEST(DexRawData, RawTimeTakesEachKindsFirstTimeInListOrderAndTheLatestTime) {
  struct Case {
    const char* what;
    std::vector<IDexRawDataInterface*> records;
    bool expected;
    base::CTime first;
    base::CTime last;
  };
  const Case cases[] = {
      {"GNSS and total station",
       {timed(position(L"G1"), at(10, 0)), timed(position(L"G2"), at(10, 5)),
        timed(new DexTSRawFS(), at(9, 30)), timed(new DexTSRawFS(), at(11, 0))},
       true,
       at(9, 30),
       at(11, 0)},
      {"first in list order, not the earliest",
       {timed(new DexTSRawFS(), at(10, 0)), timed(new DexTSRawFS(), at(9, 0))},
       true,
       at(10, 0),
       at(10, 0)},
      {"resection shots count",
       {stationWithShotAt(at(8, 0)), timed(new TestLevelRecord(L"L"), at(12, 0))},
       true,
       at(8, 0),
       at(12, 0)},
      {"notes and kind 4 do not count",
       {timed(new DexRawNote(), at(6, 0)), timed(position(L"G", 4), at(7, 0))},
       false,
       base::CTime(),
       base::CTime()},
      {"records without times", {new DexTSRawFS(), position(L"G")}, false, base::CTime(), base::CTime()},
  };
  for (const Case& c : cases) {
    DexRawData rawData;
    for (IDexRawDataInterface* const record : c.records)
      rawData.addRawData(record);
    base::CTime first(1);
    base::CTime last(1);
    EXPECT_EQ(c.expected, rawData.getRawTime(first, last)) << c.what;
    EXPECT_EQ(c.first, first) << c.what;
    EXPECT_EQ(c.last, last) << c.what;
  }
  base::CTime untouched(5);
  EXPECT_FALSE(DexRawData().getRawTime(untouched, untouched));
  EXPECT_EQ(base::CTime(5), untouched);
}

// ---- Names, backbearings, summary -----------------------------------------------------------------

TEST(DexRawData, NumericNamesContinueAfterTheHighestRawName) {
  const std::unique_ptr<DexRawData> rawData(
      listOf({named<DexTSRawFS>(L"5"), position(L"12"), named<DexRawNote>(L"X")}));
  utils::FreeNumericNames names;
  rawData->getMaxNumericRawDataName(names);
  EXPECT_EQ(L"13", names.getFirstAvailableName());
}

TEST(DexRawData, BackbearingsTakeTheVerticalAngleOfTheBacksightThatFollows) {
  struct Case {
    const char* what;
    IDexTSRawDataInterface* second;
    bool firstHasValues;
    double expectedThird;  // value 2 of the first record afterwards; -2 for no values
  };
  const DexTSRawData sightValues = values({10.0, 91.5, 0.0});
  auto* const backsight = new DexTSRawBS();
  backsight->setTSRawData(&sightValues);
  auto* const foresight = new DexTSRawFS();
  foresight->setTSRawData(&sightValues);
  auto* const lateBacksight = new DexTSRawBS();
  lateBacksight->setTSRawData(&sightValues);
  const Case cases[] = {{"backsight", backsight, true, 91.5},
                        {"foresight", foresight, true, 7.0},
                        {"backbearing without values", lateBacksight, false, -2.0}};
  for (const Case& c : cases) {
    auto* const backbearing = new DexTSRawBkb();
    const DexTSRawData own = values({1.0, 2.0, 7.0});
    if (c.firstHasValues) backbearing->setTSRawData(&own);
    const std::unique_ptr<DexRawData> rawData(listOf({backbearing, c.second}));
    rawData->addVAToBkbRecords();
    const DexTSRawData* const result = backbearing->getTSRawData();
    EXPECT_EQ(c.expectedThird, result != nullptr ? result->getTSRawData(2) : -2.0) << c.what;
  }
}

TEST(DexRawData, SummaryCountsKindsStationsAndTimes) {
  const std::unique_ptr<DexRawData> rawData(
      listOf({timed(named<DexTSRawStn>(L"S1"), at(8, 0)), new DexTSRawBS(), new DexTSRawSS(),
              new DexTSRawSS(), named<DexTSRawStn>(L"S2"), timed(position(L"G"), at(9, 0)),
              new DexGpsBaseStation(), new TestLevelRecord(L"L"), new DexRawNote()}));
  const DexRawDataSummary summary = summarizeRawData(*rawData);
  EXPECT_EQ(9, summary.records);
  EXPECT_EQ((std::array<int, 5>{5, 2, 1, 1, 0}), summary.byRawKind);
  EXPECT_EQ((std::array<int, 8>{0, 1, 0, 2, 0, 0, 2, 0}), summary.byTotalStationKind);
  EXPECT_EQ((std::array<int, 3>{0, 1, 1}), summary.byGnssKind);
  ASSERT_EQ(2, summary.stations.GetCount());
  EXPECT_EQ(L"S2", summary.stations.GetAt(1));
  EXPECT_TRUE(summary.hasTime);
  EXPECT_EQ(at(9, 0), summary.lastTime);
}

}  // namespace
