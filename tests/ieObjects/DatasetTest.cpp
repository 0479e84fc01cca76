#include "ieObjects/IEDataset.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "ObjectsTestHelpers.h"
#include "RawDataTestHelpers.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEGPSRawData.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/detail/AlignmentLog.h"
#include "ieObjects/detail/DatasetLog.h"
#include "ieUtils/IENaturalNames.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using objects_test::codeOf;
using objects_test::CountedPhotoNotes;
using raw_test::TestLevelRecord;
using raw_test::TestTSRecord;
using vyn::ie::DexAlignment;
using vyn::ie::DexArc;
using vyn::ie::DexArea;
using vyn::ie::DexBreakline;
using vyn::ie::DexCircle;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexDataset;
using vyn::ie::DexDatasetProperties;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexFieldReport;
using vyn::ie::DexFindChainageReport;
using vyn::ie::DexFlags;
using vyn::ie::DexGpsBaseStation;
using vyn::ie::DexHorizontalAlignment;
using vyn::ie::DexJobHistory;
using vyn::ie::DexLayer;
using vyn::ie::DexObject;
using vyn::ie::DexObjectList;
using vyn::ie::DexObservationInfo;
using vyn::ie::DexOffsetStation;
using vyn::ie::DexOrientationJob;
using vyn::ie::DexParcel;
using vyn::ie::DexPolyLine;
using vyn::ie::DexPtlPoint;
using vyn::ie::DexRawData;
using vyn::ie::DexRawNote;
using vyn::ie::DexRegion;
using vyn::ie::DexScanningSession;
using vyn::ie::DexSheetPoint;
using vyn::ie::DexStakeoutReport;
using vyn::ie::DexStation;
using vyn::ie::DexSurface;
using vyn::ie::DexSurveyXSection;
using vyn::ie::DexTextLabel;
using vyn::ie::EDexObjectsType;
using vyn::ie::IDexStateInterface;
using vyn::ie::utils::FreeNumericNames;
namespace detail = vyn::ie::detail;

constexpr int kAllKinds = vyn::ie::OBJECT_TYPE_ALL;
constexpr int kAnyState = IDexStateInterface::ANY_STATE;
const std::wstring kSource = detail::kDatasetLogSource;

// A member of the dataset that counts its deletions.
template <class T>
class Counted : public T {
 public:
  template <class... Arguments>
  explicit Counted(int& deletions, Arguments&&... arguments)
      : T(std::forward<Arguments>(arguments)...), deletions_(deletions) {}
  ~Counted() override { ++deletions_; }

 private:
  int& deletions_;
};

DexDesignPoint* pointNamed(const wchar_t* name, int state = IDexStateInterface::ACTIVE_STATE) {
  auto* const point = new DexDesignPoint();
  point->setName(name);
  point->setStateType(static_cast<IDexStateInterface::ECurrentState>(state));
  return point;
}

// A design point entered by hand between observations (point attribute 2 only).
DexDesignPoint* enteredPointNamed(const wchar_t* name) {
  DexDesignPoint* const point = pointNamed(name);
  DexStation station = point->getStation();
  station.setStationAttrs(1u << vyn::ie::POINT_ATTR_ENTERED);
  point->setStation(station);
  return point;
}

DexPolyLine* polylineNamed(const wchar_t* name, int state = IDexStateInterface::ACTIVE_STATE) {
  auto* const line = new DexPolyLine(false);
  line->setName(name);
  line->setStateType(static_cast<IDexStateInterface::ECurrentState>(state));
  return line;
}

// A station-mode polyline on layer with one node per bulge (at x = 0, 1, 2, ...).
DexPolyLine* polylineWithBulges(const DexLayer* layer, std::initializer_list<double> bulges, bool closed,
                                DexPolyLine* line = nullptr) {
  if (line == nullptr) line = new DexPolyLine(false);
  double x = 0.0;
  for (const double bulge : bulges)
    line->addStation(objects_test::stationAt(x++, 0.0, 0.0, L"", bulge));
  line->setCloseStatus(closed);
  line->setLayer(layer, false);
  return line;
}

DexArc* arcWithAngles(const DexLayer* layer, double start, double end,
                      int state = IDexStateInterface::ACTIVE_STATE) {
  auto* const arc = new DexArc();
  arc->setData(DexArc::ARC_START_ANGLE, start);
  arc->setData(DexArc::ARC_END_ANGLE, end);
  arc->setLayer(layer, false);
  arc->setStateType(static_cast<IDexStateInterface::ECurrentState>(state));
  return arc;
}

DexTextLabel* labelWithText(const DexLayer* layer, const wchar_t* text) {
  auto* const label = new DexTextLabel();
  label->setText(text);
  label->setLayer(layer, false);
  return label;
}

// A sheet point named name with one offset station per station name.
DexSheetPoint* sheetPointWith(const wchar_t* name, std::initializer_list<const wchar_t*> stationNames) {
  auto* const sheet = new DexSheetPoint();
  sheet->setName(name);
  double x = 1.0;
  for (const wchar_t* stationName : stationNames) {
    auto* const station = new DexOffsetStation();
    station->setName(stationName);
    station->setPosition(x, x * 2, x * 3);
    x += 1.0;
    sheet->addStation(station);
  }
  return sheet;
}

DexGpsBaseStation* gnssRecordNamed(const wchar_t* name) {
  auto* const record = new DexGpsBaseStation();
  record->setName(name);
  return record;
}

// Raw data of the given records, which it takes over.
DexRawData* rawDataOf(std::initializer_list<vyn::ie::IDexRawDataInterface*> records) {
  auto* const rawData = new DexRawData();
  for (vyn::ie::IDexRawDataInterface* record : records)
    rawData->addRawData(record);
  return rawData;
}

std::vector<std::wstring> namesOf(const std::vector<const DexDesignPoint*>& points) {
  std::vector<std::wstring> names;
  for (const DexDesignPoint* point : points)
    names.emplace_back(point->getName().view());
  return names;
}

std::vector<std::wstring> objectNamesOf(const DexDataset& dataset) {
  std::vector<std::wstring> names;
  for (int i = 0; i < dataset.getNumberOfElements(kAllKinds, kAnyState); ++i) {
    const DexObject* const object = dataset.getObjectAt(i);
    names.emplace_back(object != nullptr ? object->getName().view() : L"<slot>");
  }
  return names;
}

// ---- Construction and copy ----------------------------------------------------------------------

TEST(DexDataset, NewDatasetIsEmptyWithDefaultRecords) {
  const DexDataset dataset(L"Import dataset");
  EXPECT_EQ(L"Import dataset", dataset.getName());
  EXPECT_EQ(0, dataset.getNumberOfElements(kAllKinds, kAnyState));
  EXPECT_EQ(nullptr, dataset.getObjectAt(0));
  EXPECT_EQ(0, dataset.getNumberOfSurfaces());
  EXPECT_EQ(0, dataset.getNumberOfAlignments());
  EXPECT_EQ(nullptr, dataset.getRawData());
  EXPECT_EQ(nullptr, dataset.getJobHistory());
  EXPECT_EQ(nullptr, dataset.getDatasetProperties());
  EXPECT_NE(nullptr, dataset.getObservationInfo());
  EXPECT_EQ(4, dataset.getCoordinateSystem().kind);
  EXPECT_FALSE(dataset.isCodesExist());
  EXPECT_FALSE(dataset.isObjectWithoutCodes());
}

TEST(DexDataset, DatasetPropertiesAreMadeOnFirstUse) {
  DexDataset dataset(L"D");
  DexDatasetProperties* const properties = dataset.getDatasetProperties();
  ASSERT_NE(nullptr, properties);
  EXPECT_EQ(properties, dataset.getDatasetProperties());
  EXPECT_EQ(properties, std::as_const(dataset).getDatasetProperties());
}

TEST(DexDataset, SlotsAreEmptyEntriesThatWalksPassOver) {
  DexDataset dataset(L"D", 3, true);
  EXPECT_EQ(3, dataset.getNumberOfElements(kAllKinds, kAnyState));
  EXPECT_EQ(nullptr, dataset.getObjectAt(0));
  EXPECT_EQ(nullptr, dataset.getObjectAt(2));
  dataset.add(pointNamed(L"1"));
  EXPECT_EQ(L"1", dataset.getObjectAt(3)->getName());
  EXPECT_EQ(1, dataset.getNumberOfElements(0, kAnyState));
  EXPECT_EQ(1, dataset.getNumberOfElements(0, kAnyState, true, false));
  EXPECT_EQ(nullptr, dataset.findObject(L"", vyn::ie::OBJECT_TYPE_SHEET_POINT));
  dataset.transformStationsToPoints();

  EXPECT_TRUE(dataset.removeObject(0));
  EXPECT_EQ(3, dataset.getNumberOfElements(kAllKinds, kAnyState));
  EXPECT_EQ(L"1", dataset.findObject(L"1")->getName());
}

TEST(DexDataset, NegativeSlotCountMakesNoSlots) {
  const DexDataset dataset(L"D", -4);
  EXPECT_EQ(0, dataset.getNumberOfElements(kAllKinds, kAnyState));
}

TEST(DexDataset, CopyTakesTheNameAndPropertiesButNoContent) {
  DexDataset source(L"SOURCE", 0, true);
  source.add(pointNamed(L"P1"));
  source.updateMinMax(objects_test::stationAt(10, 20, 0));
  source.updateMinMax(objects_test::stationAt(30, 50, 0));

  const DexDataset copy(source);
  EXPECT_EQ(L"SOURCE", copy.getName());
  EXPECT_EQ(0, copy.getNumberOfElements(kAllKinds, kAnyState));
  ASSERT_NE(nullptr, copy.getDatasetProperties());
  EXPECT_NE(source.getDatasetProperties(), copy.getDatasetProperties());
  EXPECT_EQ(vyn::ie::DexPosition3D(30, 50, 0), copy.getDatasetProperties()->getBorder(1));

  DexDataset target(L"TARGET");
  target.add(pointNamed(L"Q"));
  target = source;
  EXPECT_EQ(L"SOURCE", target.getName());
  EXPECT_EQ(1, target.getNumberOfElements(kAllKinds, kAnyState));
  EXPECT_EQ(L"Q", target.getObjectAt(0)->getName());
  EXPECT_TRUE(target.getDatasetProperties()->isMinMaxDefined());
}

TEST(DexDataset, CopyOfADatasetWithoutPropertiesHasDefaultOnes) {
  DexDataset target(L"T");
  target.updateMinMax(objects_test::stationAt(1, 1, 1));
  target = DexDataset(L"EMPTY");
  ASSERT_NE(nullptr, target.getDatasetProperties());
  EXPECT_FALSE(target.getDatasetProperties()->isMinMaxDefined());
}

// ---- Adding -------------------------------------------------------------------------------------

TEST(DexDataset, AddRefusesNullAndRecordsWhetherObjectsCarryCodes) {
  DexDataset dataset(L"D");
  EXPECT_FALSE(dataset.add(static_cast<DexObject*>(nullptr)));
  EXPECT_EQ(0, dataset.getNumberOfElements(kAllKinds, kAnyState));

  EXPECT_TRUE(dataset.add(pointNamed(L"1")));
  EXPECT_FALSE(dataset.isCodesExist());
  EXPECT_TRUE(dataset.isObjectWithoutCodes());

  DexDataset coded(L"C");
  const DexCodeDescription fence(L"FENCE");
  DexDesignPoint* const point = pointNamed(L"2");
  point->addCode(codeOf(&fence));
  coded.add(point);
  EXPECT_TRUE(coded.isCodesExist());
  EXPECT_FALSE(coded.isObjectWithoutCodes());
}

TEST(DexDataset, KeepsObjectsInInsertionOrderWithDuplicateNames) {
  DexDataset dataset(L"D");
  dataset.add(pointNamed(L"B"));
  dataset.add(pointNamed(L"A"));
  dataset.add(pointNamed(L"B"));
  EXPECT_EQ((std::vector<std::wstring>{L"B", L"A", L"B"}), objectNamesOf(dataset));
  EXPECT_EQ(nullptr, dataset.getObjectAt(3));
  EXPECT_EQ(nullptr, dataset.getObjectAt(-1));
}

TEST(DexDataset, ObjectListsOfTheSameNameAreDeclined) {
  DexDataset dataset(L"D");
  auto* const first = new DexObjectList();
  first->setName(L"SEL");
  EXPECT_TRUE(dataset.addObjectList(first));
  DexObjectList second;
  second.setName(L"SEL");
  EXPECT_FALSE(dataset.addObjectList(&second));
  EXPECT_FALSE(dataset.addObjectList(nullptr));
  EXPECT_EQ(1, dataset.getNumberOfObjectLists());
  EXPECT_EQ(first, dataset.findObjectListByName(L"SEL"));
  EXPECT_EQ(nullptr, dataset.findObjectListByName(L"sel"));
  EXPECT_EQ(first, dataset.getObjectListAt(0));
  EXPECT_EQ(nullptr, dataset.getObjectListAt(1));
}

TEST(DexDataset, PointsArraysKeepTheFirstVectorOfAName) {
  DexDataset dataset(L"D");
  DexDesignPoint* const point = pointNamed(L"1");
  dataset.add(point);
  auto* const first = new vyn_vector<const DexDesignPoint*>{point};
  EXPECT_TRUE(dataset.addPointsArray(L"RUN", first));
  vyn_vector<const DexDesignPoint*> second;
  EXPECT_FALSE(dataset.addPointsArray(L"RUN", &second));
  EXPECT_FALSE(dataset.addPointsArray(L"OTHER", nullptr));
  EXPECT_EQ(1, dataset.getNumberOfPointsArrays());
  EXPECT_EQ(first, dataset.findPointsArray(L"RUN"));
  EXPECT_EQ(nullptr, dataset.findPointsArray(L"OTHER"));
}

TEST(DexDataset, MemberListsIgnoreNullAndAnswerNullPastTheEnd) {
  DexDataset dataset(L"D");
  dataset.add(static_cast<DexSurface*>(nullptr));
  dataset.add(static_cast<DexAlignment*>(nullptr));
  dataset.add(static_cast<DexParcel*>(nullptr));
  dataset.addRegion(nullptr);
  dataset.addFieldReport(nullptr);
  dataset.addFindChainageReport(nullptr);
  dataset.addOrientationJob(nullptr);
  dataset.addScanningSession(nullptr);
  dataset.addStakeoutReport(nullptr);
  dataset.addSurveyXSection(nullptr);
  EXPECT_EQ(0, dataset.getNumberOfSurfaces());
  EXPECT_EQ(0, dataset.getNumberOfAlignments());
  EXPECT_EQ(0, dataset.getNumberOfParcels());
  EXPECT_EQ(0, dataset.getNumberOfRegions());
  EXPECT_EQ(0, dataset.getNumberOfFieldReports());
  EXPECT_EQ(0, dataset.getNumberOfFindChainageReports());
  EXPECT_EQ(0, dataset.getNumberOfOrientationJobs());
  EXPECT_EQ(0, dataset.getNumberOfScanningSessions());
  EXPECT_EQ(0, dataset.getNumberOfStakeoutReports());
  EXPECT_EQ(0, dataset.getNumberOfSurveyXSections());

  auto* const surface = new DexSurface();
  dataset.add(surface);
  EXPECT_EQ(surface, dataset.getSurfaceAt(0));
  EXPECT_EQ(nullptr, dataset.getSurfaceAt(1));
  EXPECT_EQ(nullptr, dataset.getRegionAt(0));
  EXPECT_EQ(nullptr, dataset.getFieldReportAt(-1));
}

TEST(DexDataset, OwnedSettersDeleteWhatTheyReplaceUnlessItIsTheSame) {
  int rawDataDeletions = 0;
  int jobHistoryDeletions = 0;
  {
    DexDataset dataset(L"D");
    auto* const rawData = new Counted<DexRawData>(rawDataDeletions);
    dataset.setRawData(rawData);
    dataset.setRawData(rawData);
    EXPECT_EQ(0, rawDataDeletions);
    dataset.setRawData(new DexRawData());
    EXPECT_EQ(1, rawDataDeletions);

    auto* const jobHistory = new Counted<DexJobHistory>(jobHistoryDeletions);
    dataset.setJobHistory(jobHistory);
    dataset.setJobHistory(jobHistory);
    EXPECT_EQ(jobHistory, dataset.getJobHistory());
    dataset.setJobHistory(new Counted<DexJobHistory>(jobHistoryDeletions));
    EXPECT_EQ(1, jobHistoryDeletions);

    auto* const properties = new DexDatasetProperties();
    dataset.setIEDatasetProperties(properties);
    EXPECT_EQ(properties, dataset.getDatasetProperties());
    dataset.setIEDatasetProperties(nullptr);
    EXPECT_EQ(nullptr, std::as_const(dataset).getDatasetProperties());
  }
  EXPECT_EQ(1, rawDataDeletions);
  EXPECT_EQ(2, jobHistoryDeletions);
}

TEST(DexDataset, ObservationInfoIsSharedAndCoordinateSystemCopied) {
  DexDataset dataset(L"D");
  const auto info = std::make_shared<DexObservationInfo>();
  dataset.setObservationInfo(info);
  EXPECT_EQ(info, dataset.getObservationInfo());
  EXPECT_EQ(2, info.use_count());

  vyn::ie::cs_utils::DexCoordinateSystemInfo system;
  system.kind = 1;
  system.texts[0] = L"UTM 33N";
  dataset.setCoordinateSystem(system);
  system.kind = 3;
  EXPECT_EQ(1, dataset.getCoordinateSystem().kind);
  EXPECT_EQ(L"UTM 33N", dataset.getCoordinateSystem().texts[0]);
}

// ---- Name index ---------------------------------------------------------------------------------

TEST(DexDataset, FirstObjectOfANameIsFoundWithAndWithoutTheIndex) {
  for (const bool withIndex : {false, true}) {
    DexDataset dataset(L"D", 0, withIndex);
    DexDesignPoint* const first = pointNamed(L"P1");
    dataset.add(first);
    dataset.add(pointNamed(L"P1"));
    EXPECT_EQ(2, dataset.getNumberOfElements(0, kAnyState)) << "index " << withIndex;
    EXPECT_EQ(first, dataset.findObject(L"P1", kAllKinds)) << "index " << withIndex;
    EXPECT_EQ(first, dataset.findObject(L"P1", 0)) << "index " << withIndex;
    EXPECT_EQ(nullptr, dataset.findObject(L"p1", kAllKinds)) << "index " << withIndex;
  }
}

TEST(DexDataset, IndexAnswersWhateverKindWasAskedFor) {
  DexDataset indexed(L"D", 0, true);
  DexDesignPoint* const point = pointNamed(L"A");
  indexed.add(point);
  EXPECT_EQ(point, indexed.findObject(L"A", vyn::ie::OBJECT_TYPE_POLYLINE));

  DexDataset plain(L"D");
  plain.add(pointNamed(L"A"));
  EXPECT_EQ(nullptr, plain.findObject(L"A", vyn::ie::OBJECT_TYPE_POLYLINE));
  EXPECT_NE(nullptr, plain.findObject(L"A", vyn::ie::OBJECT_TYPE_DESIGN_POINT));
}

TEST(DexDataset, WithoutIndexTheKindPicksAmongObjectsOfOneName) {
  DexDataset dataset(L"D");
  dataset.add(pointNamed(L"X"));
  DexPolyLine* const line = polylineNamed(L"X");
  dataset.add(line);
  EXPECT_EQ(line, dataset.findObject(L"X", vyn::ie::OBJECT_TYPE_POLYLINE));
}

TEST(DexDataset, SheetPointsAreKeptOutOfTheIndex) {
  DexDataset dataset(L"D", 0, true);
  DexSheetPoint* const sheet = sheetPointWith(L"S", {L""});
  dataset.add(sheet);
  EXPECT_EQ(nullptr, dataset.findObject(L"S", kAllKinds));
  EXPECT_EQ(sheet, dataset.findObject(L"S", vyn::ie::OBJECT_TYPE_SHEET_POINT));

  // A later point of the same name takes the entry the sheet point never had.
  DexDesignPoint* const point = pointNamed(L"S");
  dataset.add(point);
  EXPECT_EQ(point, dataset.findObject(L"S", kAllKinds));
  EXPECT_EQ(sheet, dataset.findObject(L"S", vyn::ie::OBJECT_TYPE_SHEET_POINT));
}

TEST(DexDataset, ObjectRenamedAfterAddingStaysFiledUnderItsOldName) {
  DexDataset dataset(L"D", 0, true);
  DexDesignPoint* const point = pointNamed(L"OLD");
  dataset.add(point);
  point->setName(L"NEW");
  EXPECT_EQ(point, dataset.findObject(L"OLD"));
  EXPECT_EQ(nullptr, dataset.findObject(L"NEW"));
}

// ---- Removing -----------------------------------------------------------------------------------

TEST(DexDataset, RemoveObjectHandsTheObjectBack) {
  DexDataset dataset(L"D", 0, true);
  DexDesignPoint* const point = pointNamed(L"P1");
  dataset.add(point);
  dataset.add(pointNamed(L"P2"));

  EXPECT_FALSE(dataset.removeObject(2));
  EXPECT_FALSE(dataset.removeObject(-1));
  ASSERT_EQ(point, dataset.getObjectAt(0));
  EXPECT_TRUE(dataset.removeObject(0));
  EXPECT_EQ(1, dataset.getNumberOfElements(kAllKinds, kAnyState));
  EXPECT_EQ(L"P2", dataset.getObjectAt(0)->getName());
  EXPECT_EQ(nullptr, dataset.findObject(L"P1"));

  // The object is alive and may join another dataset, which then owns it.
  EXPECT_EQ(L"P1", point->getName());
  DexDataset other(L"OTHER", 0, true);
  EXPECT_TRUE(other.add(point));
  EXPECT_EQ(point, other.findObject(L"P1"));
}

TEST(DexDataset, RemovingADuplicateKeepsTheEntryOfTheFirst) {
  DexDataset dataset(L"D", 0, true);
  DexDesignPoint* const first = pointNamed(L"P");
  dataset.add(first);
  dataset.add(pointNamed(L"P"));
  const std::unique_ptr<DexObject> second(dataset.getObjectAt(1));
  ASSERT_TRUE(dataset.removeObject(1));
  EXPECT_EQ(first, dataset.findObject(L"P"));
}

TEST(DexDataset, RemovingTheFirstOfANameMakesTheNextOneFindable) {
  DexDataset dataset(L"D", 0, true);
  dataset.add(pointNamed(L"P"));
  dataset.add(sheetPointWith(L"P", {}));
  DexDesignPoint* const second = pointNamed(L"P");
  dataset.add(second);
  const std::unique_ptr<DexObject> first(dataset.getObjectAt(0));
  ASSERT_TRUE(dataset.removeObject(0));
  EXPECT_EQ(second, dataset.findObject(L"P"));

  const std::unique_ptr<DexObject> last(dataset.getObjectAt(1));
  ASSERT_TRUE(dataset.removeObject(1));
  EXPECT_EQ(nullptr, dataset.findObject(L"P"));
}

TEST(DexDataset, RemovingARenamedObjectLeavesNoEntryBehind) {
  DexDataset dataset(L"D", 0, true);
  DexDesignPoint* const point = pointNamed(L"OLD");
  dataset.add(point);
  dataset.add(pointNamed(L"NEW"));
  point->setName(L"NEW");
  ASSERT_TRUE(dataset.removeObject(0));
  delete point;
  EXPECT_EQ(nullptr, dataset.findObject(L"OLD"));
  EXPECT_EQ(L"NEW", dataset.findObject(L"NEW")->getName());
}

// ---- Counting -----------------------------------------------------------------------------------

// One object of most kinds, some of them inactive, and the other members of a dataset.
class DatasetCounts : public ::testing::Test {
 protected:
  DatasetCounts() {
    dataset_.add(pointNamed(L"1"));
    dataset_.add(pointNamed(L"2", IDexStateInterface::INACTIVE_STATE));
    dataset_.add(new DexPtlPoint());
    dataset_.add(sheetPointWith(L"S", {L"A"}));
    dataset_.add(gnssRecordNamed(L"G"));
    dataset_.add(polylineNamed(L"L1"));
    dataset_.add(polylineNamed(L"L2", IDexStateInterface::INACTIVE_STATE));
    dataset_.add(new DexArea());
    dataset_.add(new DexBreakline(L"SURF"));
    dataset_.add(arcWithAngles(nullptr, 0, 90));
    dataset_.add(new DexCircle());
    dataset_.add(new DexTextLabel());
    dataset_.add(new DexSurface());
    dataset_.add(new DexSurface());
    auto* const inactive = new DexAlignment();
    inactive->setStateType(IDexStateInterface::INACTIVE_STATE);
    dataset_.add(inactive);
    dataset_.add(new DexAlignment());
    dataset_.add(new DexAlignment());
    for (int i = 0; i < 3; ++i)
      dataset_.add(new DexParcel());
    dataset_.addRegion(new DexRegion());
  }

  int count(int kind, int state, bool pointsOnly = false, bool linesOnly = false) const {
    return dataset_.getNumberOfElements(kind, state, pointsOnly, linesOnly);
  }

  DexDataset dataset_{L"COUNTS"};
};

TEST_F(DatasetCounts, AllKindsCountsTheWholeListInEveryState) {
  EXPECT_EQ(12, count(kAllKinds, kAnyState));
  EXPECT_EQ(12, count(kAllKinds, IDexStateInterface::ACTIVE_STATE));
  EXPECT_EQ(12, count(kAllKinds, IDexStateInterface::INACTIVE_STATE));
}

TEST_F(DatasetCounts, KindCountsFollowTheState) {
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_POLYLINE, IDexStateInterface::ACTIVE_STATE));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_POLYLINE, IDexStateInterface::INACTIVE_STATE));
  EXPECT_EQ(2, count(vyn::ie::OBJECT_TYPE_POLYLINE, kAnyState));
  EXPECT_EQ(2, count(vyn::ie::OBJECT_TYPE_DESIGN_POINT, kAnyState));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_PTL_POINT, kAnyState));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_GPS_RAW_POINT, kAnyState));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_SHEET_POINT, kAnyState));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_AREA, kAnyState));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_BREAKLINE, kAnyState));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_ARC, kAnyState));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_TEXT_LABEL, kAnyState));
  EXPECT_EQ(1, count(vyn::ie::OBJECT_TYPE_CIRCLE, kAnyState));
  EXPECT_EQ(0, count(vyn::ie::OBJECT_TYPE_CIRCLE, 5));
}

TEST_F(DatasetCounts, MembersOutsideTheObjectListAreCountedWhateverTheState) {
  EXPECT_EQ(2, count(vyn::ie::OBJECT_TYPE_SURFACE, IDexStateInterface::INACTIVE_STATE));
  EXPECT_EQ(3, count(vyn::ie::OBJECT_TYPE_ALIGNMENT, IDexStateInterface::ACTIVE_STATE));
  EXPECT_EQ(3, count(vyn::ie::OBJECT_TYPE_PARCEL, kAnyState));
  EXPECT_EQ(0, count(vyn::ie::OBJECT_TYPE_REGION, kAnyState));
  EXPECT_EQ(1, dataset_.getNumberOfRegions());
  EXPECT_EQ(0, count(14, kAnyState));
  EXPECT_EQ(0, count(-2, kAnyState));
}

TEST_F(DatasetCounts, PointsOnlyAndLinesOnlyCountTheirKinds) {
  EXPECT_EQ(5, count(kAllKinds, kAnyState, true, false));
  EXPECT_EQ(4, count(vyn::ie::OBJECT_TYPE_POLYLINE, IDexStateInterface::ACTIVE_STATE, true, false));
  // Polylines, breaklines, arcs and circles; the area is not a line.
  EXPECT_EQ(5, count(kAllKinds, kAnyState, false, true));
  EXPECT_EQ(4, count(kAllKinds, IDexStateInterface::ACTIVE_STATE, false, true));
  EXPECT_EQ(12, count(vyn::ie::OBJECT_TYPE_ARC, IDexStateInterface::INACTIVE_STATE, true, true));
}

TEST_F(DatasetCounts, AlignmentsAreCountedByState) {
  EXPECT_EQ(3, dataset_.getNumberOfAlignments(kAnyState));
  EXPECT_EQ(2, dataset_.getNumberOfAlignments(IDexStateInterface::ACTIVE_STATE));
  EXPECT_EQ(1, dataset_.getNumberOfAlignments(IDexStateInterface::INACTIVE_STATE));
}

// ---- Entity counts for drawing exports ----------------------------------------------------------

TEST(DexDataset, ElementsOnALayerCountArcsAndTextLinesTwice) {
  const DexLayer layer;
  const DexLayer other;
  DexDataset dataset(L"D");
  DexDesignPoint* const point = pointNamed(L"1");
  point->setLayer(&layer, false);
  dataset.add(point);
  DexDesignPoint* const inactive = pointNamed(L"2", IDexStateInterface::INACTIVE_STATE);
  inactive->setLayer(&layer, false);
  dataset.add(inactive);
  dataset.add(arcWithAngles(&layer, 45, 45));
  dataset.add(arcWithAngles(&layer, 0, 90));
  dataset.add(arcWithAngles(&other, 45, 45));
  dataset.add(labelWithText(&layer, L"A\n\nB\n"));
  dataset.add(labelWithText(&layer, L""));
  dataset.add(labelWithText(&other, L"C"));

  EXPECT_EQ(1, dataset.getNumberOfElementsWithTheLayer(&layer, vyn::ie::OBJECT_TYPE_DESIGN_POINT));
  EXPECT_EQ(3, dataset.getNumberOfElementsWithTheLayer(&layer, vyn::ie::OBJECT_TYPE_ARC));
  EXPECT_EQ(4, dataset.getNumberOfElementsWithTheLayer(&layer, vyn::ie::OBJECT_TYPE_TEXT_LABEL));
  EXPECT_EQ(2, dataset.getNumberOfElementsWithTheLayer(&other, vyn::ie::OBJECT_TYPE_TEXT_LABEL));
  EXPECT_EQ(8, dataset.getNumberOfElementsWithTheLayer(&layer, kAllKinds));
  EXPECT_EQ(0, dataset.getNumberOfElementsWithTheLayer(nullptr, vyn::ie::OBJECT_TYPE_ARC));
}

struct SegmentCase {
  const char* name;
  std::initializer_list<double> bulges;
  bool closed;
  int segments;
  int arcs;
};

TEST(DexDataset, SegmentsOfOpenAndClosedPolylinesWithAndWithoutBulges) {
  const SegmentCase cases[] = {
      {"closed straight", {0, 0, 0, 0}, true, 4, 1},
      {"open straight", {0, 0, 0, 0}, false, 3, 0},
      {"closed with bulges", {0, 0.5, 0, 0.5}, true, 2, 3},
      {"open ending in a bulge", {0, 0.5, 0, 0.5}, false, 2, 1},
      {"open ending straight", {0.5, 0, 0}, false, 1, 1},
      {"open single node", {0}, false, 1, 0},
      {"open single arc node", {0.5}, false, 0, 1},
      {"closed single node", {0}, true, 1, 1},
      {"no nodes", {}, true, 0, 0},
  };
  const DexLayer layer;
  for (const SegmentCase& line : cases) {
    DexDataset dataset(L"D");
    dataset.add(polylineWithBulges(&layer, line.bulges, line.closed));
    int arcs = 0;
    EXPECT_EQ(line.segments,
              dataset.getNumberOfSegmentsWithTheLayer(&layer, arcs, vyn::ie::OBJECT_TYPE_POLYLINE))
        << line.name;
    EXPECT_EQ(line.arcs, arcs) << line.name;
  }
}

TEST(DexDataset, SegmentsAddUpOverObjectsOfTheKindOnTheLayerOnly) {
  const DexLayer layer;
  const DexLayer other;
  DexDataset dataset(L"D");
  dataset.add(polylineWithBulges(&layer, {0, 0, 0}, false));
  dataset.add(polylineWithBulges(&layer, {0, 0.5}, true));
  dataset.add(polylineWithBulges(&other, {0, 0, 0}, true));
  dataset.add(
      polylineWithBulges(&layer, {0, 0}, false, polylineNamed(L"OFF", IDexStateInterface::INACTIVE_STATE)));
  dataset.add(polylineWithBulges(&layer, {0, 0, 0, 0}, true, new DexArea()));
  auto* const pointMode = new DexPolyLine(true);
  DexDesignPoint* const a = pointNamed(L"A");
  DexDesignPoint* const b = pointNamed(L"B");
  dataset.add(a);
  dataset.add(b);
  pointMode->addPoint(a, 0.0);
  pointMode->addPoint(b, 0.25);
  pointMode->setLayer(&layer, false);
  dataset.add(pointMode);

  int arcs = 10;
  // Open 3 straight: 2; closed (0, 0.5): 1 segment, 2 arcs; point mode open ending in a bulge: 1, 0.
  EXPECT_EQ(4, dataset.getNumberOfSegmentsWithTheLayer(&layer, arcs, vyn::ie::OBJECT_TYPE_POLYLINE));
  EXPECT_EQ(12, arcs);
  arcs = 0;
  EXPECT_EQ(4, dataset.getNumberOfSegmentsWithTheLayer(&layer, arcs, vyn::ie::OBJECT_TYPE_AREA));
  EXPECT_EQ(1, arcs);
  arcs = 0;
  EXPECT_EQ(0, dataset.getNumberOfSegmentsWithTheLayer(&layer, arcs, vyn::ie::OBJECT_TYPE_ARC));
  EXPECT_EQ(0, arcs);
}

TEST(DexDataset, SeparatedArcsCountFullCirclesTwice) {
  const DexLayer layer;
  DexDataset dataset(L"D");
  dataset.add(arcWithAngles(&layer, 10, 10));
  dataset.add(arcWithAngles(&layer, 10, 20));
  dataset.add(arcWithAngles(&layer, 10, 20, IDexStateInterface::INACTIVE_STATE));
  dataset.add(arcWithAngles(nullptr, 10, 20));
  dataset.add(new DexCircle());
  int arcs = 0;
  EXPECT_EQ(3, dataset.getNumberOfSeparatedArcsWithTheLayer(&layer, arcs));
  EXPECT_EQ(2, arcs);
}

// ---- Finding the other members ------------------------------------------------------------------

TEST(DexDataset, FindsAlignmentsByNameAndByPartName) {
  DexHorizontalAlignment h1;
  h1.setName(L"H1");
  DexHorizontalAlignment h2;
  h2.setName(L"H2");
  DexDataset dataset(L"D");
  auto* const first = new DexAlignment();
  first->setName(L"ROAD");
  first->setAlignmentPart(&h1);
  auto* const second = new DexAlignment();
  second->setName(L"ROAD");
  second->setAlignmentPart(&h2);
  dataset.add(first);
  dataset.add(second);

  EXPECT_EQ(first, dataset.findAlignment(L"ROAD"));
  EXPECT_EQ(nullptr, dataset.findAlignment(L"road"));
  EXPECT_EQ(second,
            dataset.findAlignmentByPartName(L"H2", vyn::ie::IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
  EXPECT_EQ(nullptr,
            dataset.findAlignmentByPartName(L"H2", vyn::ie::IDexAlignmentPart::VERTICAL_ALIGNMENT));

  const dex_test::LogCapture log;
  EXPECT_EQ(nullptr, dataset.findAlignmentByPartName(L"H1", 4));
  EXPECT_EQ(2, log.count(detail::kAlignmentLogSource, detail::kAlignmentPartTypeLine));
}

TEST(DexDataset, FindsParcelsByTheirAlignmentsName) {
  DexHorizontalAlignment h1;
  h1.setName(L"H1");
  DexDataset dataset(L"D");
  dataset.add(new DexParcel());
  auto* const parcel = new DexParcel();
  parcel->setHAlignment(&h1);
  dataset.add(parcel);
  EXPECT_EQ(parcel, dataset.findParcelByHAlignmentName(L"H1"));
  EXPECT_EQ(nullptr, dataset.findParcelByHAlignmentName(L"H2"));
  EXPECT_EQ(nullptr, dataset.findParcelByHAlignmentName(L""));
}

// ---- Codes --------------------------------------------------------------------------------------

TEST(DexDataset, CodeDefinitionIsUsedWhenSomeObjectCarriesItsName) {
  const DexCodeDescription fence(L"FENCE");
  const DexCodeDescription otherFence(L"FENCE");
  const DexCodeDescription tree(L"TREE");
  DexDataset dataset(L"D");
  DexDesignPoint* const point = pointNamed(L"1");
  point->addCode(codeOf(&fence, {L"01"}));
  dataset.add(point);
  EXPECT_TRUE(dataset.isCodeDefinitionUsed(&fence));
  EXPECT_TRUE(dataset.isCodeDefinitionUsed(&otherFence));
  EXPECT_FALSE(dataset.isCodeDefinitionUsed(&tree));
  EXPECT_FALSE(dataset.isCodeDefinitionUsed(nullptr));
}

TEST(DexDataset, CopiesObjectsWithACodeAsClonesCarryingOnlyThatCode) {
  const DexCodeDescription fence(L"FENCE");
  const DexCodeDescription tree(L"TREE");
  DexDataset source(L"SOURCE");
  DexDesignPoint* const both = pointNamed(L"1");
  both->addCode(codeOf(&fence));
  both->addCode(codeOf(&tree, {L"T7"}));
  source.add(both);
  DexPolyLine* const line = polylineNamed(L"L");
  line->addCode(codeOf(&tree));
  source.add(line);
  source.add(pointNamed(L"3"));

  DexDataset target(L"TARGET", 0, true);
  source.copyIEObjectsWithTheCodeToTheNewDataset(&target, L"TREE");
  ASSERT_EQ(2, target.getNumberOfElements(kAllKinds, kAnyState));
  const DexObject* const copy = target.findObject(L"1");
  ASSERT_NE(nullptr, copy);
  EXPECT_NE(both, copy);
  ASSERT_EQ(1, copy->getNumberOfCodes());
  EXPECT_EQ(&tree, copy->getCode(0)->getDescription());
  EXPECT_EQ(L"T7", copy->getCode(0)->getCodeStringAt(0));
  EXPECT_EQ(vyn::ie::OBJECT_TYPE_POLYLINE, target.findObject(L"L")->getType());
  EXPECT_EQ(2, both->getNumberOfCodes());

  source.copyIEObjectsWithTheCodeToTheNewDataset(nullptr, L"TREE");
  source.copyIEObjectsWithTheCodeToTheNewDataset(&source, L"FENCE");
  EXPECT_EQ(4, source.getNumberOfElements(kAllKinds, kAnyState));
}

// ---- Names, extent and sheet points -------------------------------------------------------------

TEST(DexDataset, MaxNumericNameLooksAtTheKindsAsked) {
  DexDataset dataset(L"D");
  dataset.add(pointNamed(L"1"));
  dataset.add(pointNamed(L"7"));
  dataset.add(pointNamed(L"A"));
  dataset.add(polylineNamed(L"100"));

  FreeNumericNames points;
  dataset.getMaxNumericObjectName(DexFlags<EDexObjectsType>(vyn::ie::OBJECT_TYPE_DESIGN_POINT), points);
  EXPECT_EQ(8, points.getFirstAvailableNumber());
  EXPECT_EQ(1, points.getObjectsToRename());

  FreeNumericNames pointsAndLines;
  dataset.getMaxNumericObjectName({vyn::ie::OBJECT_TYPE_DESIGN_POINT, vyn::ie::OBJECT_TYPE_POLYLINE},
                                  pointsAndLines);
  EXPECT_EQ(101, pointsAndLines.getFirstAvailableNumber());
}

TEST(DexDataset, UpdateMinMaxMakesThePropertiesWhenNeeded) {
  DexDataset dataset(L"D");
  dataset.updateMinMax(objects_test::stationAt(3, 4, 5));
  ASSERT_NE(nullptr, std::as_const(dataset).getDatasetProperties());
  EXPECT_TRUE(dataset.getDatasetProperties()->isMinMaxDefined());
}

TEST(DexDataset, SheetPointWithThreeUnnamedStationsBecomesThreePoints) {
  const DexCodeDescription wall(L"WALL");
  DexDataset dataset(L"D", 0, true);
  dataset.add(pointNamed(L"BEFORE"));
  DexSheetPoint* const sheet = sheetPointWith(L"S", {L"", L"", L""});
  sheet->addCode(codeOf(&wall, {L"W1"}));
  dataset.add(sheet);
  dataset.add(pointNamed(L"AFTER"));

  dataset.transformStationsToPoints();
  EXPECT_EQ((std::vector<std::wstring>{L"BEFORE", L"AFTER", L"", L"S_st", L"S_st1"}), objectNamesOf(dataset));
  EXPECT_EQ(0, dataset.getNumberOfElements(vyn::ie::OBJECT_TYPE_SHEET_POINT, kAnyState));

  const auto* const second = dynamic_cast<const DexDesignPoint*>(dataset.getObjectAt(3));
  ASSERT_NE(nullptr, second);
  EXPECT_EQ(vyn::ie::DexPosition3D(2, 4, 6), second->getStation());
  ASSERT_EQ(1, second->getNumberOfCodes());
  EXPECT_EQ(&wall, second->getCode(0)->getDescription());
  EXPECT_EQ(L"W1", second->getCode(0)->getCodeStringAt(0));
  EXPECT_EQ(second, dataset.findObject(L"S_st"));
}

TEST(DexDataset, SheetPointStationsKeepTheirOwnNamesUnlessTheyRepeatTheSheetPoints) {
  DexDataset dataset(L"D");
  dataset.add(sheetPointWith(L"S", {L"S", L"S", L"B", L"", L"S"}));
  dataset.add(sheetPointWith(L"T", {L"T1"}));
  dataset.transformStationsToPoints();
  EXPECT_EQ((std::vector<std::wstring>{L"S", L"S_st", L"B", L"S_st2", L"S_st3", L"T1"}),
            objectNamesOf(dataset));
}

TEST(DexDataset, SheetPointsAreDeletedWhenTurnedIntoPoints) {
  int deletions = 0;
  DexDataset dataset(L"D");
  auto* const sheet = new Counted<DexSheetPoint>(deletions);
  sheet->setName(L"S");
  sheet->addStation(new DexOffsetStation());
  dataset.add(sheet);
  dataset.transformStationsToPoints();
  EXPECT_EQ(1, deletions);
  EXPECT_EQ(1, dataset.getNumberOfElements(vyn::ie::OBJECT_TYPE_DESIGN_POINT, kAnyState));
}

// ---- Raw points ---------------------------------------------------------------------------------

TEST(DexDataset, NextRawPointNeedsRawData) {
  const DexDataset dataset(L"D");
  CVynStringT<wchar_t> next(L"UNCHANGED");
  EXPECT_FALSE(dataset.getNextRawPointName(L"P1", 0, next));
  EXPECT_EQ(L"UNCHANGED", next);
}

TEST(DexDataset, NextRawPointAfterGnssRecords) {
  DexDataset dataset(L"D");
  dataset.setRawData(rawDataOf({gnssRecordNamed(L"P1"), gnssRecordNamed(L"P2"), gnssRecordNamed(L"P3")}));
  CVynStringT<wchar_t> next;
  EXPECT_TRUE(dataset.getNextRawPointName(L"P1", 0, next));
  EXPECT_EQ(L"P2", next);
  EXPECT_TRUE(dataset.getNextRawPointName(L"", 0, next));
  EXPECT_EQ(L"P1", next);
  EXPECT_TRUE(dataset.getNextRawPointName(L"P3", 0, next));
  EXPECT_TRUE(next.IsEmpty());
  // The walk starts at the start index (0 for a negative one).
  EXPECT_TRUE(dataset.getNextRawPointName(L"", 1, next));
  EXPECT_EQ(L"P2", next);
  EXPECT_TRUE(dataset.getNextRawPointName(L"", -3, next));
  EXPECT_EQ(L"P1", next);
  EXPECT_TRUE(dataset.getNextRawPointName(L"P1", 1, next));
  EXPECT_TRUE(next.IsEmpty());
}

TEST(DexDataset, NextRawPointTakesOnlyOwnNamedForesightsAndSideshots) {
  DexDataset dataset(L"D");
  dataset.setRawData(rawDataOf({new TestTSRecord(vyn::ie::TS_RAW_STATION, L"STN"),
                                new TestTSRecord(vyn::ie::TS_RAW_BACKSIGHT, L"BS"),
                                new TestTSRecord(vyn::ie::TS_RAW_FORESIGHT, L"F1"),
                                new TestTSRecord(vyn::ie::TS_RAW_SIDESHOT, L"S1", 1),
                                new TestTSRecord(vyn::ie::TS_RAW_SIDESHOT, L"S2")}));
  CVynStringT<wchar_t> next;
  EXPECT_TRUE(dataset.getNextRawPointName(L"STN", 0, next));
  EXPECT_EQ(L"F1", next);
  EXPECT_TRUE(dataset.getNextRawPointName(L"F1", 0, next));
  EXPECT_EQ(L"S2", next);
  EXPECT_TRUE(dataset.getNextRawPointName(L"", 0, next));
  EXPECT_EQ(L"F1", next);
}

TEST(DexDataset, DigitalLevelRecordEndsTheWalkWithoutAName) {
  DexDataset dataset(L"D");
  dataset.setRawData(rawDataOf({gnssRecordNamed(L"P1"), new TestLevelRecord(L"BM"), gnssRecordNamed(L"P2")}));
  CVynStringT<wchar_t> next(L"KEPT");
  EXPECT_TRUE(dataset.getNextRawPointName(L"P1", 0, next));
  EXPECT_EQ(L"KEPT", next);
}

TEST(DexDataset, NotesAreReportedAndPassedOver) {
  const dex_test::LogCapture log;
  DexDataset dataset(L"D");
  auto* const note = new DexRawNote();
  note->setName(L"P1");
  dataset.setRawData(rawDataOf({gnssRecordNamed(L"P1"), note, gnssRecordNamed(L"P2")}));
  CVynStringT<wchar_t> next;
  EXPECT_TRUE(dataset.getNextRawPointName(L"P1", 0, next));
  EXPECT_EQ(L"P2", next);
  EXPECT_EQ(1, log.count(kSource, detail::kDatasetUnexpectedRawRecordLine));
}

TEST(DexDataset, FindRawPointWithoutRawDataIsReported) {
  const dex_test::LogCapture log;
  const DexDataset dataset(L"D");
  EXPECT_EQ(nullptr, dataset.findRawPoint(L"P1"));
  EXPECT_EQ(nullptr, dataset.findRawPointRecord(L"P1"));
  EXPECT_EQ(1, log.count(kSource, detail::kDatasetFindRawPointWithoutRawDataLine));
}

TEST(DexDataset, FindRawPointAnswersOnlyABaseStation) {
  DexDataset dataset(L"D");
  DexGpsBaseStation* const base = gnssRecordNamed(L"B1");
  auto* const total = new TestTSRecord(vyn::ie::TS_RAW_FORESIGHT, L"X");
  auto* const note = new DexRawNote();
  note->setName(L"N");
  dataset.setRawData(rawDataOf({note, total, gnssRecordNamed(L"X"), base}));

  EXPECT_EQ(base, dataset.findRawPoint(L"B1"));
  EXPECT_EQ(base, dataset.findRawPointRecord(L"B1"));
  // The first record named X is a total-station record: it is not handed out as a base station.
  EXPECT_EQ(nullptr, dataset.findRawPoint(L"X"));
  EXPECT_EQ(total, dataset.findRawPointRecord(L"X"));
  EXPECT_EQ(nullptr, dataset.findRawPoint(L"N"));
  EXPECT_EQ(nullptr, dataset.findRawPointRecord(L"N"));
}

// Design points P1, E1 (entered), X (not entered), E2 (entered), P2, E3 (entered).
class EnteredPoints : public ::testing::Test {
 protected:
  EnteredPoints() {
    dataset_.add(pointNamed(L"P1"));
    dataset_.add(enteredPointNamed(L"E1"));
    dataset_.add(pointNamed(L"X"));
    dataset_.add(polylineNamed(L"LINE"));
    dataset_.add(enteredPointNamed(L"E2"));
    dataset_.add(pointNamed(L"P2"));
    dataset_.add(enteredPointNamed(L"E3"));
  }

  std::vector<std::wstring> enteredAfter(const wchar_t* name, int start = 0) const {
    vyn_vector<const DexDesignPoint*> out;
    dataset_.getDesignPointsEnteredFromTheRawPointTillTheNextOne(name, start, out);
    return namesOf(out);
  }

  DexDataset dataset_{L"D"};
};

TEST_F(EnteredPoints, CollectsTheEnteredPointsUpToTheNextRawPoint) {
  dataset_.setRawData(rawDataOf({gnssRecordNamed(L"P1"), gnssRecordNamed(L"P2")}));
  EXPECT_EQ((std::vector<std::wstring>{L"E1", L"E2"}), enteredAfter(L"P1"));
  EXPECT_EQ((std::vector<std::wstring>{L"E3"}), enteredAfter(L"P2"));
}

TEST_F(EnteredPoints, PassesOverRawPointsThatAreNoObjects) {
  // From the first design point: Q is no object, so the walk asks again from record 1 and finds P2.
  dataset_.setRawData(rawDataOf({gnssRecordNamed(L"Q"), gnssRecordNamed(L"P2")}));
  EXPECT_EQ((std::vector<std::wstring>{L"E1", L"E2"}), enteredAfter(L""));
}

TEST_F(EnteredPoints, AskingAgainFromALaterRecordNoLongerSeesTheStartPoint) {
  // After P1 comes Q, which is no object; the walk from record 1 on never meets P1, so it ends
  // without a next raw point and the points are collected to the end.
  dataset_.setRawData(rawDataOf({gnssRecordNamed(L"P1"), gnssRecordNamed(L"Q"), gnssRecordNamed(L"P2")}));
  EXPECT_EQ((std::vector<std::wstring>{L"E1", L"E2", L"E3"}), enteredAfter(L"P1"));
}

TEST_F(EnteredPoints, WithoutANextRawPointCollectsToTheEnd) {
  dataset_.setRawData(rawDataOf({gnssRecordNamed(L"P1"), gnssRecordNamed(L"Q"), new TestLevelRecord(L"BM")}));
  EXPECT_EQ((std::vector<std::wstring>{L"E1", L"E2", L"E3"}), enteredAfter(L"P1"));
}

TEST_F(EnteredPoints, WithoutRawDataAppendsThePointsOfTheName) {
  EXPECT_EQ((std::vector<std::wstring>{L"P1"}), enteredAfter(L"P1"));
  EXPECT_EQ((std::vector<std::wstring>{L"P1", L"E1", L"X", L"E2", L"P2", L"E3"}), enteredAfter(L""));
  EXPECT_TRUE(enteredAfter(L"NONE").empty());
}

TEST_F(EnteredPoints, StartIndexPastTheRecordsFindsNoNextRawPoint) {
  dataset_.setRawData(rawDataOf({gnssRecordNamed(L"P1"), gnssRecordNamed(L"P2")}));
  EXPECT_EQ((std::vector<std::wstring>{L"E1", L"E2", L"E3"}), enteredAfter(L"P1", 2147483647));
  EXPECT_EQ((std::vector<std::wstring>{L"E1", L"E2"}), enteredAfter(L"P1", -5));
}

// ---- Ownership ----------------------------------------------------------------------------------

// Adds one member of every kind, each counting its deletion, and answers how many were added.
int fillWithEveryKindOfMember(DexDataset& dataset, int& deletions) {
  int added = 0;
  // An object is counted through its photo notes, which it deletes with itself.
  const auto withNotes = [&](DexObject* object) {
    object->setPhotoNotes(new CountedPhotoNotes(deletions));
    object->setDrawProperties(objects_test::linePropertiesOf(1));
    ++added;
    return object;
  };
  dataset.add(withNotes(pointNamed(L"P")));
  dataset.add(withNotes(new DexPtlPoint(L"A", L"B")));
  dataset.add(withNotes(sheetPointWith(L"S", {L"S1", L""})));
  dataset.add(withNotes(gnssRecordNamed(L"G")));
  dataset.add(withNotes(polylineWithBulges(nullptr, {0, 0.5}, false)));
  dataset.add(withNotes(new DexArea()));
  dataset.add(withNotes(new DexBreakline(L"SURF")));
  dataset.add(withNotes(arcWithAngles(nullptr, 0, 1)));
  dataset.add(withNotes(new DexCircle()));
  dataset.add(withNotes(labelWithText(nullptr, L"T")));

  auto* const surface = new Counted<DexSurface>(deletions);
  surface->addPosition(vyn::ie::DexPosition3D(1, 2, 3));
  surface->addTriangle(new vyn::ie::DexTriangle());
  surface->setDrawProperties(objects_test::linePropertiesOf(2));
  dataset.add(surface);
  auto* const alignment = new Counted<DexAlignment>(deletions);
  alignment->setDrawProperties(objects_test::linePropertiesOf(3));
  dataset.add(alignment);
  dataset.add(new Counted<DexParcel>(deletions));
  auto* const region = new Counted<DexRegion>(deletions);
  region->setAreaDrawProperties(new vyn::ie::DexDrawAreaProperties());
  dataset.addRegion(region);
  dataset.addObjectList(new Counted<DexObjectList>(deletions));
  dataset.addSurveyXSection(new Counted<DexSurveyXSection>(deletions));
  dataset.addFindChainageReport(new Counted<DexFindChainageReport>(deletions));
  dataset.addScanningSession(new Counted<DexScanningSession>(deletions));
  dataset.addOrientationJob(new Counted<DexOrientationJob>(deletions));
  dataset.addStakeoutReport(new Counted<DexStakeoutReport>(deletions, 0));
  dataset.addFieldReport(new Counted<DexFieldReport>(deletions, true));
  added += 11;

  auto* const rawData = new Counted<DexRawData>(deletions);
  auto* const shot = new TestTSRecord(vyn::ie::TS_RAW_FORESIGHT, L"F");
  const vyn::ie::DexTSRawData values;
  shot->setTSRawData(&values);
  rawData->addRawData(shot);
  DexGpsBaseStation* const base = gnssRecordNamed(L"B");
  base->setPlaneStation(new DexStation());
  base->setXyzCoords(new vyn::ie::DexPosition3D(1, 1, 1));
  rawData->addRawData(base);
  rawData->addRawData(new DexRawNote());
  dataset.setRawData(rawData);
  dataset.setJobHistory(new Counted<DexJobHistory>(deletions));
  dataset.addPointsArray(L"ARRAY", new vyn_vector<const DexDesignPoint*>{nullptr});
  dataset.updateMinMax(objects_test::stationAt(1, 1, 1));
  added += 2;
  return added;
}

TEST(DexDataset, DestroyingADatasetReleasesEveryMemberOnce) {
  int deletions = 0;
  int added = 0;
  {
    DexDataset dataset(L"ALL", 2, true);
    added = fillWithEveryKindOfMember(dataset, deletions);
    EXPECT_EQ(0, deletions);
  }
  EXPECT_EQ(added, deletions);
}

TEST(DexDataset, ResetReleasesEveryMemberAndKeepsNameSystemObservationInfoAndIndex) {
  int deletions = 0;
  DexDataset dataset(L"ALL", 0, true);
  vyn::ie::cs_utils::DexCoordinateSystemInfo system;
  system.kind = 1;
  dataset.setCoordinateSystem(system);
  const std::shared_ptr<DexObservationInfo> info = dataset.getObservationInfo();
  const int added = fillWithEveryKindOfMember(dataset, deletions);

  dataset.resetAllData();
  EXPECT_EQ(added, deletions);
  EXPECT_EQ(L"ALL", dataset.getName());
  EXPECT_EQ(1, dataset.getCoordinateSystem().kind);
  EXPECT_EQ(info, dataset.getObservationInfo());
  EXPECT_EQ(0, dataset.getNumberOfElements(kAllKinds, kAnyState));
  EXPECT_EQ(0, dataset.getNumberOfSurfaces());
  EXPECT_EQ(0, dataset.getNumberOfPointsArrays());
  EXPECT_EQ(nullptr, dataset.getRawData());
  EXPECT_EQ(nullptr, dataset.getJobHistory());
  EXPECT_EQ(nullptr, std::as_const(dataset).getDatasetProperties());
  EXPECT_FALSE(dataset.isObjectWithoutCodes());
  EXPECT_EQ(nullptr, dataset.findObject(L"P"));

  // Still indexed: the kind asked for does not matter.
  dataset.add(pointNamed(L"NEW"));
  EXPECT_NE(nullptr, dataset.findObject(L"NEW", vyn::ie::OBJECT_TYPE_ARC));
}

}  // namespace
