#include "ieObjects/IEDataset.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <string>
#include <utility>

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
#include "support/Rows.h"

namespace {

using namespace vyn::ie;
using objects_test::codeOf;
using objects_test::Counted;
using raw_test::TestLevelRecord;
using raw_test::TestTSRecord;
namespace detail = vyn::ie::detail;

constexpr int kAll = OBJECT_TYPE_ALL;
constexpr int kAny = IDexStateInterface::ANY_STATE;
constexpr auto kActive = IDexStateInterface::ACTIVE_STATE;
constexpr auto kInactive = IDexStateInterface::INACTIVE_STATE;
const std::wstring kSource = detail::kDatasetLogSource;

template <class T = DexDesignPoint>
T* named(const wchar_t* name, IDexStateInterface::ECurrentState state = kActive) {
  return objects_test::named<T>(name, state);
}

template <class T>
T* onLayer(const DexLayer* layer, T* object) {
  object->setLayer(layer, false);
  return object;
}

// A station-mode polyline on layer with one node per bulge (at x = 0, 1, 2, ...).
template <class T = DexPolyLine>
T* withBulges(const DexLayer* layer, std::initializer_list<double> bulges, bool closed, T* line = new T()) {
  double x = 0.0;
  for (const double bulge : bulges)
    line->addStation(objects_test::stationAt(x++, 0.0, 0.0, L"", bulge));
  line->setCloseStatus(closed);
  return onLayer(layer, line);
}

DexArc* arc(const DexLayer* layer, double start, double end,
            IDexStateInterface::ECurrentState state = kActive) {
  auto* const made = new DexArc();
  made->setData(DexArc::ARC_START_ANGLE, start);
  made->setData(DexArc::ARC_END_ANGLE, end);
  made->setStateType(state);
  return onLayer(layer, made);
}

DexTextLabel* label(const DexLayer* layer, const wchar_t* text) {
  auto* const made = new DexTextLabel();
  made->setText(text);
  return onLayer(layer, made);
}

// A sheet point with one offset station per name, at (1, 2, 3), (2, 4, 6), ...
DexSheetPoint* sheetPoint(const wchar_t* name, std::initializer_list<const wchar_t*> stations) {
  auto* const sheet = named<DexSheetPoint>(name);
  double x = 1.0;
  for (const wchar_t* stationName : stations) {
    auto* const station = new DexOffsetStation();
    station->setName(stationName);
    station->setPosition(x, x * 2, x * 3);
    x += 1.0;
    sheet->addStation(station);
  }
  return sheet;
}

DexRawData* rawDataOf(std::initializer_list<IDexRawDataInterface*> records) {
  auto* const rawData = new DexRawData();
  for (IDexRawDataInterface* record : records)
    rawData->addRawData(record);
  return rawData;
}

void addAll(DexDataset& dataset, std::initializer_list<DexObject*> objects) {
  for (DexObject* object : objects)
    dataset.add(object);
}

// The names of the objects in list order, "|"-separated, "." for an empty slot.
std::wstring namesOf(const DexDataset& dataset) {
  std::wstring names;
  for (int i = 0; i < dataset.getNumberOfElements(kAll, kAny); ++i) {
    const DexObject* const object = dataset.getObjectAt(i);
    names += (object != nullptr ? std::wstring(object->getName().view()) : L".") + L"|";
  }
  return names;
}

TEST(DexDataset, KeepsObjectsInOrderAndCopiesOnlyNameAndProperties) {
  DexDataset dataset(L"D", 2, true);
  EXPECT_FALSE(dataset.add(static_cast<DexObject*>(nullptr)));
  addAll(dataset, {named(L"B"), named(L"A"), named(L"B")});
  EXPECT_EQ(L".|.|B|A|B|", namesOf(dataset));
  EXPECT_TRUE(dataset.getObjectAt(5) == nullptr && dataset.getObjectAt(-1) == nullptr);
  EXPECT_TRUE(dataset.isObjectWithoutCodes() && !dataset.isCodesExist());
  EXPECT_EQ(0, DexDataset(L"D", -4).getNumberOfElements(kAll, kAny));
  EXPECT_EQ(4, dataset.getCoordinateSystem().kind);
  dataset.updateMinMax(objects_test::stationAt(10, 20, 0));
  dataset.updateMinMax(objects_test::stationAt(30, 50, 0));
  const DexDataset copy(dataset);
  EXPECT_TRUE(copy.getName() == L"D" && namesOf(copy).empty());
  EXPECT_NE(dataset.getDatasetProperties(), copy.getDatasetProperties());
  EXPECT_EQ(DexPosition3D(30, 50, 0), copy.getDatasetProperties()->getBorder(1));
  DexDataset target(L"TARGET");
  target.add(named(L"Q"));
  target = dataset;
  EXPECT_TRUE(target.getName() == L"D" && namesOf(target) == L"Q|");
  target = DexDataset(L"EMPTY");  // a dataset without properties gives default ones
  EXPECT_FALSE(target.getDatasetProperties()->isMinMaxDefined());
}

TEST(DexDataset, MemberListsDeclineNullAndTakenNames) {
  DexDataset dataset(L"D");
  dataset.add(static_cast<DexSurface*>(nullptr));
  dataset.add(static_cast<DexAlignment*>(nullptr));
  dataset.add(static_cast<DexParcel*>(nullptr));
  dataset.addRegion(nullptr);
  dataset.addFieldReport(nullptr);
  dataset.addStakeoutReport(nullptr);
  EXPECT_EQ(0, dataset.getNumberOfSurfaces() + dataset.getNumberOfAlignments() +
                   dataset.getNumberOfParcels() + dataset.getNumberOfRegions() +
                   dataset.getNumberOfFieldReports() + dataset.getNumberOfStakeoutReports());
  EXPECT_TRUE(dataset.getSurfaceAt(0) == nullptr && dataset.getFieldReportAt(-1) == nullptr);
  auto* const list = named<DexObjectList>(L"SEL");
  DexObjectList sameName;
  sameName.setName(L"SEL");
  EXPECT_TRUE(dataset.addObjectList(list));
  EXPECT_FALSE(dataset.addObjectList(&sameName) || dataset.addObjectList(nullptr));
  EXPECT_TRUE(dataset.findObjectListByName(L"SEL") == list &&
              dataset.findObjectListByName(L"sel") == nullptr);
  auto* const run = new vyn_vector<const DexDesignPoint*>{};
  vyn_vector<const DexDesignPoint*> sameRun;
  EXPECT_TRUE(dataset.addPointsArray(L"RUN", run));
  EXPECT_FALSE(dataset.addPointsArray(L"RUN", &sameRun) || dataset.addPointsArray(L"OTHER", nullptr));
  EXPECT_TRUE(dataset.findPointsArray(L"RUN") == run && dataset.findPointsArray(L"OTHER") == nullptr);
}

TEST(DexDataset, FindsTheFirstObjectOfANameWithAndWithoutTheIndex) {
  for (const bool indexed : {false, true}) {
    DexDataset dataset(L"D", 0, indexed);
    DexDesignPoint* const first = named(L"P1");
    DexPolyLine* const line = named<DexPolyLine>(L"X");
    addAll(dataset, {first, named(L"P1"), line});
    EXPECT_TRUE(dataset.findObject(L"P1", kAll) == first && dataset.findObject(L"p1", kAll) == nullptr);
    // The index answers whatever kind was asked for; the walk picks the kind.
    EXPECT_EQ(indexed ? first : nullptr, dataset.findObject(L"P1", OBJECT_TYPE_POLYLINE)) << indexed;
    EXPECT_EQ(line, dataset.findObject(L"X", OBJECT_TYPE_POLYLINE)) << indexed;
  }
  DexDataset dataset(L"D", 0, true);  // the index leaves out sheet points
  DexSheetPoint* const sheet = sheetPoint(L"S", {L""});
  dataset.add(sheet);
  EXPECT_TRUE(dataset.findObject(L"S", kAll) == nullptr &&
              dataset.findObject(L"S", OBJECT_TYPE_SHEET_POINT) == sheet);
  DexDesignPoint* const renamed = named(L"OLD");
  dataset.add(renamed);
  renamed->setName(L"NEW");  // the index keeps the old name
  EXPECT_TRUE(dataset.findObject(L"OLD") == renamed && dataset.findObject(L"NEW") == nullptr);
}

TEST(DexDataset, RemovingHandsTheObjectBackAndMakesTheNextOfItsNameFindable) {
  DexDataset dataset(L"D", 0, true);
  DexDesignPoint* const first = named(L"P");
  DexDesignPoint* const second = named(L"P");
  DexDesignPoint* const renamed = named(L"OLD");
  addAll(dataset, {first, sheetPoint(L"P", {}), second, renamed, named(L"NEW")});
  EXPECT_FALSE(dataset.removeObject(5) || dataset.removeObject(-1));
  ASSERT_TRUE(dataset.removeObject(0));
  EXPECT_EQ(second, dataset.findObject(L"P"));
  DexDataset other(L"OTHER", 0, true);  // the object lives on and may join another dataset
  EXPECT_TRUE(other.add(first));
  const std::unique_ptr<DexObject> sheet(dataset.getObjectAt(0));
  ASSERT_TRUE(dataset.removeObject(0) && dataset.removeObject(0));
  delete second;
  EXPECT_EQ(nullptr, dataset.findObject(L"P"));
  renamed->setName(L"NEW");  // removing it leaves no entry behind
  ASSERT_TRUE(dataset.removeObject(0));
  delete renamed;
  EXPECT_TRUE(dataset.findObject(L"OLD") == nullptr && dataset.findObject(L"NEW")->getName() == L"NEW");
  DexDataset slots(L"S", 3, true);  // slots pass unseen
  slots.add(named(L"1"));
  EXPECT_TRUE(slots.removeObject(0));
  EXPECT_EQ(L".|.|1|", namesOf(slots));
}

TEST(DexDataset, CountsObjectsByKindStateAndPointOrLineGroup) {
  DexDataset dataset(L"COUNTS");
  addAll(dataset, {named(L"1"), named(L"2", kInactive), new DexPtlPoint(), sheetPoint(L"S", {L"A"}),
                   named<DexGpsBaseStation>(L"G"), named<DexPolyLine>(L"L1"),
                   named<DexPolyLine>(L"L2", kInactive), new DexArea(), new DexBreakline(L"SURF"),
                   arc(nullptr, 0, 90), new DexCircle(), new DexTextLabel()});
  dataset.add(new DexSurface());
  dataset.add(named<DexAlignment>(L"A", kInactive));
  dataset.add(new DexAlignment());
  dataset.add(new DexParcel());
  const auto count = [&dataset](int kind, int state, bool points = false, bool lines = false) {
    return dataset.getNumberOfElements(kind, state, points, lines);
  };
  const std::pair<int, int> rows[] = {{count(kAll, kAny), 12},
                                      {count(kAll, kActive), 12},
                                      {count(OBJECT_TYPE_POLYLINE, kActive), 1},
                                      {count(OBJECT_TYPE_POLYLINE, kInactive), 1},
                                      {count(OBJECT_TYPE_DESIGN_POINT, kAny), 2},
                                      {count(OBJECT_TYPE_CIRCLE, 5), 0},
                                      {count(OBJECT_TYPE_SURFACE, kInactive), 1},
                                      {count(OBJECT_TYPE_ALIGNMENT, kActive), 2},
                                      {count(OBJECT_TYPE_PARCEL, kAny), 1},
                                      {count(14, kAny) + count(-2, kAny), 0},
                                      {count(kAll, kAny, true, false), 5},
                                      {count(OBJECT_TYPE_POLYLINE, kActive, true), 4},
                                      {count(kAll, kAny, false, true), 5},  // the area is no line
                                      {count(kAll, kActive, false, true), 4},
                                      {count(OBJECT_TYPE_ARC, kInactive, true, true), 12},
                                      {dataset.getNumberOfAlignments(kActive), 1},
                                      {dataset.getNumberOfAlignments(kInactive), 1}};
  dex_test::expectRows(rows);
}

TEST(DexDataset, CountsDrawingEntitiesOnALayer) {
  const DexLayer layer;
  const DexLayer other;
  DexDataset dataset(L"D");
  addAll(dataset,
         {onLayer(&layer, named(L"1")), onLayer(&layer, named(L"2", kInactive)),
          arc(&layer, 45, 45),                                                  // a full circle counts twice
          arc(&layer, 0, 90), arc(&other, 45, 45), label(&layer, L"A\n\nB\n"),  // so does each line of a text
          label(&layer, L""), label(&other, L"C")});
  const std::pair<int, int> rows[] = {
      {dataset.getNumberOfElementsWithTheLayer(&layer, OBJECT_TYPE_DESIGN_POINT), 1},
      {dataset.getNumberOfElementsWithTheLayer(&layer, OBJECT_TYPE_ARC), 3},
      {dataset.getNumberOfElementsWithTheLayer(&layer, OBJECT_TYPE_TEXT_LABEL), 4},
      {dataset.getNumberOfElementsWithTheLayer(&other, OBJECT_TYPE_TEXT_LABEL), 2},
      {dataset.getNumberOfElementsWithTheLayer(&layer, kAll), 8},
      {dataset.getNumberOfElementsWithTheLayer(nullptr, OBJECT_TYPE_ARC), 0}};
  dex_test::expectRows(rows);
  DexDataset arcs(L"A");
  addAll(arcs, {arc(&layer, 10, 10), arc(&layer, 10, 20), arc(&layer, 10, 20, kInactive),
                arc(nullptr, 10, 20), new DexCircle()});
  int full = 0;
  EXPECT_EQ(3, arcs.getNumberOfSeparatedArcsWithTheLayer(&layer, full));
  EXPECT_EQ(2, full);
}

TEST(DexDataset, CountsSegmentsAndArcsOfPolylines) {
  const struct {
    std::initializer_list<double> bulges;
    bool closed;
    int segments;
    int arcs;
  } cases[] = {{{0, 0, 0, 0}, true, 4, 1},
               {{0, 0, 0, 0}, false, 3, 0},
               {{0, 0.5, 0, 0.5}, true, 2, 3},
               {{0, 0.5, 0, 0.5}, false, 2, 1},
               {{0.5, 0, 0}, false, 1, 1},
               {{0.5}, false, 0, 1},
               {{0}, true, 1, 1},
               {{}, true, 0, 0}};
  const DexLayer layer;
  for (const auto& line : cases) {
    DexDataset dataset(L"D");
    dataset.add(withBulges(&layer, line.bulges, line.closed));
    int arcs = 0;
    EXPECT_EQ(line.segments, dataset.getNumberOfSegmentsWithTheLayer(&layer, arcs, OBJECT_TYPE_POLYLINE));
    EXPECT_EQ(line.arcs, arcs);
  }
  // Over the objects of the kind on the layer only, added to the arcs counted already.
  const DexLayer other;
  DexDataset dataset(L"D");
  DexDesignPoint* const a = named(L"A");
  DexDesignPoint* const b = named(L"B");
  auto* const pointMode = onLayer(&layer, new DexPolyLine(true));
  pointMode->addPoint(a, 0.0);
  pointMode->addPoint(b, 0.25);
  addAll(dataset, {withBulges(&layer, {0, 0, 0}, false), withBulges(&layer, {0, 0.5}, true),
                   withBulges(&other, {0, 0, 0}, true),
                   withBulges(&layer, {0, 0}, false, named<DexPolyLine>(L"OFF", kInactive)),
                   withBulges(&layer, {0, 0, 0, 0}, true, new DexArea()), a, b, pointMode});
  int arcs = 10;
  EXPECT_EQ(4, dataset.getNumberOfSegmentsWithTheLayer(&layer, arcs, OBJECT_TYPE_POLYLINE));
  EXPECT_EQ(12, arcs);
  EXPECT_EQ(4, dataset.getNumberOfSegmentsWithTheLayer(&layer, arcs, OBJECT_TYPE_AREA));
  EXPECT_EQ(0, dataset.getNumberOfSegmentsWithTheLayer(&layer, arcs, OBJECT_TYPE_ARC));
}

TEST(DexDataset, FindsAlignmentsByNameOrPartAndParcelsByAlignment) {
  DexHorizontalAlignment h1;
  h1.setName(L"H1");
  DexHorizontalAlignment h2;
  h2.setName(L"H2");
  DexDataset dataset(L"D");
  auto* const first = named<DexAlignment>(L"ROAD");
  first->setAlignmentPart(&h1);
  auto* const second = named<DexAlignment>(L"ROAD");
  second->setAlignmentPart(&h2);
  dataset.add(first);
  dataset.add(second);
  auto* const parcel = new DexParcel();
  parcel->setHAlignment(&h1);
  dataset.add(new DexParcel());
  dataset.add(parcel);
  EXPECT_TRUE(dataset.findAlignment(L"ROAD") == first && dataset.findAlignment(L"road") == nullptr);
  EXPECT_EQ(second, dataset.findAlignmentByPartName(L"H2", IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
  EXPECT_EQ(nullptr, dataset.findAlignmentByPartName(L"H2", IDexAlignmentPart::VERTICAL_ALIGNMENT));
  EXPECT_TRUE(dataset.findParcelByHAlignmentName(L"H1") == parcel &&
              dataset.findParcelByHAlignmentName(L"H2") == nullptr);
  const dex_test::LogCapture log;
  EXPECT_EQ(nullptr, dataset.findAlignmentByPartName(L"H1", 4));
  EXPECT_EQ(2, log.count(detail::kAlignmentLogSource, detail::kAlignmentPartTypeLine));
}

TEST(DexDataset, CopiesObjectsWithACodeAsClonesCarryingOnlyThatCode) {
  const DexCodeDescription fence(L"FENCE");
  const DexCodeDescription otherFence(L"FENCE");
  const DexCodeDescription tree(L"TREE");
  DexDataset source(L"SOURCE");
  DexDesignPoint* const both = named(L"1");
  both->addCode(codeOf(&fence));
  both->addCode(codeOf(&tree, {L"T7"}));
  DexPolyLine* const line = named<DexPolyLine>(L"L");
  line->addCode(codeOf(&tree));
  addAll(source, {both, line, named(L"3")});
  EXPECT_TRUE(source.isCodesExist() && source.isObjectWithoutCodes());
  EXPECT_TRUE(source.isCodeDefinitionUsed(&fence) && source.isCodeDefinitionUsed(&otherFence));
  const DexCodeDescription unused(L"X");
  EXPECT_FALSE(source.isCodeDefinitionUsed(nullptr) || source.isCodeDefinitionUsed(&unused));
  DexDataset target(L"TARGET", 0, true);
  source.copyIEObjectsWithTheCodeToTheNewDataset(&target, L"TREE");
  ASSERT_EQ(L"1|L|", namesOf(target));
  const DexObject* const copy = target.findObject(L"1");
  ASSERT_TRUE(copy != both && copy->getNumberOfCodes() == 1);
  EXPECT_EQ(&tree, copy->getCode(0)->getDescription());
  EXPECT_EQ(L"T7", copy->getCode(0)->getCodeStringAt(0));
  source.copyIEObjectsWithTheCodeToTheNewDataset(nullptr, L"TREE");
  source.copyIEObjectsWithTheCodeToTheNewDataset(&source, L"FENCE");
  EXPECT_EQ(L"1|L|3|1|", namesOf(source));
}

TEST(DexDataset, MaxNumericNameLooksAtTheKindsAsked) {
  DexDataset dataset(L"D");
  addAll(dataset, {named(L"1"), named(L"7"), named(L"A"), named<DexPolyLine>(L"100")});
  utils::FreeNumericNames points;
  dataset.getMaxNumericObjectName(DexFlags<EDexObjectsType>(OBJECT_TYPE_DESIGN_POINT), points);
  EXPECT_EQ(8, points.getFirstAvailableNumber());
  EXPECT_EQ(1, points.getObjectsToRename());
  utils::FreeNumericNames both;
  dataset.getMaxNumericObjectName({OBJECT_TYPE_DESIGN_POINT, OBJECT_TYPE_POLYLINE}, both);
  EXPECT_EQ(101, both.getFirstAvailableNumber());
}

TEST(DexDataset, SheetPointStationsBecomeCodedPoints) {
  int deletions = 0;
  const DexCodeDescription wall(L"WALL");
  DexDataset dataset(L"D", 0, true);
  DexSheetPoint* const sheet = sheetPoint(L"S", {L"", L"", L""});
  sheet->addCode(codeOf(&wall, {L"W1"}));
  auto* const counted = new Counted<DexSheetPoint>(deletions);
  counted->setName(L"S");
  counted->addStation(new DexOffsetStation());
  addAll(dataset, {named(L"BEFORE"), sheet, counted, sheetPoint(L"T", {L"T", L"T", L"B", L"", L"T"}),
                   named(L"AFTER")});
  dataset.transformStationsToPoints();
  // Stations keep their own names unless they repeat the sheet point's.
  EXPECT_EQ(L"BEFORE|AFTER||S_st|S_st1||T|T_st|B|T_st2|T_st3|", namesOf(dataset));
  EXPECT_EQ(1, deletions);
  const auto* const second = dynamic_cast<const DexDesignPoint*>(dataset.getObjectAt(3));
  ASSERT_NE(nullptr, second);
  EXPECT_EQ(DexPosition3D(2, 4, 6), second->getStation());
  EXPECT_EQ(L"W1", second->getCode(0)->getCodeStringAt(0));
  EXPECT_EQ(second, dataset.findObject(L"S_st"));
}

TEST(DexDataset, NextRawPointIsTheNextOwnNamedForesightSideshotOrGnssRecord) {
  const auto next = [](DexDataset& dataset, const wchar_t* after, int start) {
    CVynStringT<wchar_t> name(L"KEPT");
    return dataset.getNextRawPointName(after, start, name) ? std::wstring(name.view()) : L"no raw data";
  };
  DexDataset empty(L"D");
  EXPECT_EQ(L"no raw data", next(empty, L"P1", 0));
  DexDataset gnss(L"D");
  gnss.setRawData(
      rawDataOf({named<DexGpsBaseStation>(L"P1"), named<DexRawNote>(L"P1"), named<DexGpsBaseStation>(L"P2"),
                 named<DexGpsBaseStation>(L"P3"), new TestLevelRecord(L"BM")}));
  {
    const dex_test::LogCapture log;
    EXPECT_EQ(L"P2", next(gnss, L"P1", 0));
    EXPECT_EQ(1, log.count(kSource, detail::kDatasetUnexpectedRawRecordLine));  // the note is passed over
  }
  // The walk starts at the start index (0 for a negative one); a level record ends it without a name.
  const std::pair<std::wstring, const wchar_t*> rows[] = {{next(gnss, L"", 0), L"P1"},
                                                          {next(gnss, L"", 2), L"P2"},
                                                          {next(gnss, L"", -3), L"P1"},
                                                          {next(gnss, L"P1", 2), L"KEPT"},
                                                          {next(gnss, L"P3", 0), L"KEPT"}};
  dex_test::expectRows(rows);
  DexDataset total(L"D");
  total.setRawData(
      rawDataOf({new TestTSRecord(TS_RAW_STATION, L"STN"), new TestTSRecord(TS_RAW_BACKSIGHT, L"BS"),
                 new TestTSRecord(TS_RAW_FORESIGHT, L"F1"), new TestTSRecord(TS_RAW_SIDESHOT, L"S1", 1),
                 new TestTSRecord(TS_RAW_SIDESHOT, L"S2")}));
  EXPECT_EQ(L"F1", next(total, L"STN", 0));
  EXPECT_EQ(L"S2", next(total, L"F1", 0));
  EXPECT_EQ(L"", next(total, L"S2", 0));  // the last one has no next
}

TEST(DexDataset, FindRawPointAnswersOnlyABaseStationAndReportsMissingRawData) {
  const dex_test::LogCapture log;
  const DexDataset empty(L"D");
  EXPECT_TRUE(empty.findRawPoint(L"P1") == nullptr && empty.findRawPointRecord(L"P1") == nullptr);
  EXPECT_EQ(1, log.count(kSource, detail::kDatasetFindRawPointWithoutRawDataLine));
  DexDataset dataset(L"D");
  DexGpsBaseStation* const base = named<DexGpsBaseStation>(L"B1");
  auto* const total = new TestTSRecord(TS_RAW_FORESIGHT, L"X");
  dataset.setRawData(rawDataOf({named<DexRawNote>(L"N"), total, named<DexGpsBaseStation>(L"X"), base}));
  EXPECT_TRUE(dataset.findRawPoint(L"B1") == base && dataset.findRawPointRecord(L"B1") == base);
  // The first record named X is a total-station record: it is not handed out as a base station.
  EXPECT_TRUE(dataset.findRawPoint(L"X") == nullptr && dataset.findRawPointRecord(L"X") == total);
  EXPECT_TRUE(dataset.findRawPoint(L"N") == nullptr && dataset.findRawPointRecord(L"N") == nullptr);
}

TEST(DexDataset, CollectsThePointsEnteredAfterARawPointUpToTheNextOne) {
  const auto entered = [](const wchar_t* name) {
    DexDesignPoint* const point = named(name);
    DexStation station = point->getStation();
    station.setStationAttrs(1u << POINT_ATTR_ENTERED);
    point->setStation(station);
    return point;
  };
  DexDataset dataset(L"D");
  addAll(dataset, {named(L"P1"), entered(L"E1"), named(L"X"), named<DexPolyLine>(L"LINE"), entered(L"E2"),
                   named(L"P2"), entered(L"E3")});
  const auto collect = [&dataset](const wchar_t* name, int start = 0) {
    vyn_vector<const DexDesignPoint*> out;
    dataset.getDesignPointsEnteredFromTheRawPointTillTheNextOne(name, start, out);
    std::wstring names;
    for (const DexDesignPoint* point : out)
      names += std::wstring(point->getName().view()) + L"|";
    return names;
  };
  // Without raw data: the points of the name.
  EXPECT_EQ(L"P1|", collect(L"P1"));
  EXPECT_EQ(L"P1|E1|X|E2|P2|E3|", collect(L""));
  const auto gnss = [](const wchar_t* name) { return named<DexGpsBaseStation>(name); };
  dataset.setRawData(rawDataOf({gnss(L"P1"), gnss(L"P2")}));
  EXPECT_EQ(L"E1|E2|", collect(L"P1"));
  EXPECT_EQ(L"E3|", collect(L"P2"));
  EXPECT_EQ(L"E1|E2|E3|", collect(L"P1", 2147483647));
  EXPECT_EQ(L"E1|E2|", collect(L"P1", -5));
  // Q is no object, so the walk asks again from the next record.
  dataset.setRawData(rawDataOf({gnss(L"Q"), gnss(L"P2")}));
  EXPECT_EQ(L"E1|E2|", collect(L""));
  dataset.setRawData(rawDataOf({gnss(L"P1"), gnss(L"Q"), new TestLevelRecord(L"BM")}));
  EXPECT_EQ(L"E1|E2|E3|", collect(L"P1"));
}
// Adds one member of every kind, each counting its deletion, and answers how many were added.
int fillWithEveryKindOfMember(DexDataset& dataset, int& deletions) {
  const auto withNotes = [&deletions](DexObject* object) {  // an object counts through its notes
    object->setPhotoNotes(new objects_test::CountedPhotoNotes(deletions));
    object->setDrawProperties(objects_test::linePropertiesOf(1));
    return object;
  };
  for (DexObject* object :
       {withNotes(named(L"P")), withNotes(new DexPtlPoint(L"A", L"B")),
        withNotes(sheetPoint(L"S", {L"S1", L""})), withNotes(named<DexGpsBaseStation>(L"G")),
        withNotes(withBulges(nullptr, {0, 0.5}, false)), withNotes(new DexArea()),
        withNotes(new DexBreakline(L"SURF")), withNotes(arc(nullptr, 0, 1)), withNotes(new DexCircle()),
        withNotes(label(nullptr, L"T"))})
    dataset.add(object);
  auto* const surface = new Counted<DexSurface>(deletions);
  surface->addPosition(DexPosition3D(1, 2, 3));
  surface->addTriangle(new DexTriangle());
  surface->setDrawProperties(objects_test::linePropertiesOf(2));
  dataset.add(surface);
  auto* const alignment = new Counted<DexAlignment>(deletions);
  alignment->setDrawProperties(objects_test::linePropertiesOf(3));
  dataset.add(alignment);
  dataset.add(new Counted<DexParcel>(deletions));
  auto* const region = new Counted<DexRegion>(deletions);
  region->setAreaDrawProperties(new DexDrawAreaProperties());
  dataset.addRegion(region);
  dataset.addObjectList(new Counted<DexObjectList>(deletions));
  dataset.addSurveyXSection(new Counted<DexSurveyXSection>(deletions));
  dataset.addFindChainageReport(new Counted<DexFindChainageReport>(deletions));
  dataset.addScanningSession(new Counted<DexScanningSession>(deletions));
  dataset.addOrientationJob(new Counted<DexOrientationJob>(deletions));
  dataset.addStakeoutReport(new Counted<DexStakeoutReport>(deletions, 0));
  dataset.addFieldReport(new Counted<DexFieldReport>(deletions, true));
  auto* const rawData = new Counted<DexRawData>(deletions);
  auto* const shot = new TestTSRecord(TS_RAW_FORESIGHT, L"F");
  const DexTSRawData values;
  shot->setTSRawData(&values);
  rawData->addRawData(shot);
  DexGpsBaseStation* const base = named<DexGpsBaseStation>(L"B");
  base->setPlaneStation(new DexStation());
  base->setXyzCoords(new DexPosition3D(1, 1, 1));
  rawData->addRawData(base);
  rawData->addRawData(new DexRawNote());
  dataset.setRawData(rawData);
  dataset.setJobHistory(new Counted<DexJobHistory>(deletions));
  dataset.addPointsArray(L"ARRAY", new vyn_vector<const DexDesignPoint*>{nullptr});
  dataset.updateMinMax(objects_test::stationAt(1, 1, 1));
  return 10 + 11 + 2;
}

TEST(DexDataset, DestroyingOrResettingADatasetReleasesEveryMemberOnce) {
  int deletions = 0;
  int added = 0;
  {
    DexDataset dataset(L"ALL", 2, true);
    added = fillWithEveryKindOfMember(dataset, deletions);
    EXPECT_EQ(0, deletions);
  }
  EXPECT_EQ(added, deletions);
  deletions = 0;
  DexDataset dataset(L"ALL", 0, true);
  auto* const rawData = new Counted<DexRawData>(deletions);  // the owned setters delete what they replace
  auto* const history = new Counted<DexJobHistory>(deletions);
  for (int twice = 0; twice < 2; ++twice) {
    dataset.setRawData(rawData);
    dataset.setJobHistory(history);
  }
  dataset.setIEDatasetProperties(nullptr);
  EXPECT_EQ(nullptr, std::as_const(dataset).getDatasetProperties());
  EXPECT_NE(nullptr, dataset.getDatasetProperties());  // made on first use
  EXPECT_EQ(0, deletions);
  cs_utils::DexCoordinateSystemInfo system;
  system.kind = 1;
  dataset.setCoordinateSystem(system);
  const std::shared_ptr<DexObservationInfo> info = dataset.getObservationInfo();
  added = fillWithEveryKindOfMember(dataset, deletions) + 2;
  dataset.resetAllData();  // keeps the name, the coordinate system, the observation info and the index
  EXPECT_EQ(added, deletions);
  EXPECT_TRUE(dataset.getName() == L"ALL" && dataset.getCoordinateSystem().kind == 1 &&
              dataset.getObservationInfo() == info);
  EXPECT_EQ(0, dataset.getNumberOfElements(kAll, kAny) + dataset.getNumberOfSurfaces() +
                   dataset.getNumberOfPointsArrays());
  EXPECT_TRUE(dataset.getRawData() == nullptr && dataset.getJobHistory() == nullptr &&
              std::as_const(dataset).getDatasetProperties() == nullptr);
  EXPECT_FALSE(dataset.isObjectWithoutCodes());
  EXPECT_EQ(nullptr, dataset.findObject(L"P"));
  dataset.add(named(L"NEW"));
  EXPECT_NE(nullptr, dataset.findObject(L"NEW", OBJECT_TYPE_ARC));
}

}  // namespace
