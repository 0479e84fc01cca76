#include "ieObjects/IEData.h"

#include <gtest/gtest.h>

#include <atomic>
#include <memory>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/ObjectsTestHelpers.h"
#include "ieUtils/IENaturalNames.h"
#include "ieUtils/IEUtilsCoords.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/Rows.h"

namespace {

using namespace vyn::ie;
using objects_test::codeOf;
using Text = CVynStringT<wchar_t>;
using Names = std::vector<std::wstring>;
using DeletionLog = std::vector<std::string>;
namespace cs = vyn::ie::cs_utils;

constexpr const wchar_t* kDataLogSource = L"ieObjects\\IEData";
constexpr int kAny = IDexStateInterface::ANY_STATE;

DexSettings settingsWith(std::initializer_list<EDexDataType> types) {
  DexSettings settings;
  for (const EDexDataType type : types)
    settings.addDataType(type);
  return settings;
}

DexDesignPoint* pointWithCodes(const wchar_t* name,
                               std::initializer_list<const DexCodeDescription*> codes = {}) {
  auto* const point = new DexDesignPoint();
  point->setName(name);
  for (const DexCodeDescription* const description : codes)
    point->addCode(codeOf(description));
  return point;
}

Names datasetNamesOf(const DexData& data) {
  Names names;
  for (int i = 0; i < data.getNumberOfDatasets(); ++i)
    names.emplace_back(data.getDatasetAt(i)->getName().view());
  return names;
}

// Each object of dataset as "name:code+code".
Names objectsOf(const DexDataset& dataset) {
  Names objects;
  for (int i = 0; i < dataset.getNumberOfElements(-1, kAny); ++i) {
    const DexObject* const object = dataset.getObjectAt(i);
    std::wstring entry = std::wstring(object->getName().view()) + L":";
    for (int k = 0; k < object->getNumberOfCodes(); ++k)
      entry += (k > 0 ? L"+" : L"") + std::wstring(object->getCode(k)->getDescription()->getName().view());
    objects.push_back(entry);
  }
  return objects;
}

template <class Base>
class Recorded : public Base {
 public:
  template <class... Args>
  Recorded(DeletionLog& log, std::string label, Args&&... args)
      : Base(std::forward<Args>(args)...), log_(log), label_(std::move(label)) {}
  ~Recorded() override { log_.push_back(label_); }

 private:
  DeletionLog& log_;
  std::string label_;
};

class Part : public IDexAlignmentPart {
 public:
  Part(int kind, const wchar_t* name) : kind_(kind) { setName(name); }
  EDexAlignmentPartType getType() const override { return static_cast<EDexAlignmentPartType>(kind_); }

 private:
  int kind_;
};

TEST(Data, CurrentDatasetIsAStopgapMadeOnFirstUseOrNullWithARecordWhenConst) {
  dex_test::LogCapture log;
  const DexData empty(DexSettings{});
  EXPECT_TRUE(empty.getCurDataset() == nullptr && empty.getCurObservationInfo() == nullptr);
  EXPECT_EQ(cs::DexCoordinateSystemInfo::kDefaultKind, empty.getCoordinateSystem().kind);
  EXPECT_EQ(3, log.count(kDataLogSource, DexData::kLogLineNoCurrentDataset));
  EXPECT_TRUE(log.records()[0].message.empty());
  DexData data(settingsWith({POINTS}));
  DexDataset* const first = data.getCurDataset();
  EXPECT_TRUE(first->getName() == L"STOPGAP" && data.getCurDataset() == first &&
              data.getNumberOfDatasets() == 1);
  auto* const second = new DexDataset(L"b");
  second->add(pointWithCodes(L"1"));
  second->add(new DexPolyLine());
  cs::DexCoordinateSystemInfo geographic;
  geographic.kind = cs::DexCoordinateSystemInfo::kGeographicKind;
  second->setCoordinateSystem(geographic);
  const auto info = std::make_shared<DexObservationInfo>();
  second->setObservationInfo(info);
  EXPECT_FALSE(data.addDataset(nullptr));
  EXPECT_TRUE(data.addDataset(second) && data.addDataset(second));  // once
  EXPECT_EQ((Names{L"STOPGAP", L"b"}), datasetNamesOf(data));
  EXPECT_TRUE(data.getDatasetAt(2) == nullptr && data.getDatasetAt(-1) == nullptr);
  EXPECT_EQ(2, data.getNumberOfObjectsInAllDatasets());
  data.setCurDataset(1);
  for (const int invalid : {5, 2, -1})  // only a valid index is taken
    data.setCurDataset(invalid);
  EXPECT_TRUE(data.getCurDatasetId() == 1 && data.getCurObservationInfo() == info);
  EXPECT_EQ(cs::DexCoordinateSystemInfo::kGeographicKind, data.getCoordinateSystem().kind);
  std::thread host([] { DexData::stopProcess_ = true; });  // the stop flag is seen across threads
  host.join();
  EXPECT_TRUE(DexData::stopProcess_);
  DexData::stopProcess_ = false;
}

// A valid station-equation set of one equation; distinct aheads keep sets unequal.
DexStaEquationSet* newSet(const wchar_t* name, double ahead) {
  auto* const set = new DexStaEquationSet(name);
  vyn::ie::DexStaEquation equation;
  equation.setData(vyn::ie::DexStaEquation::RUNNING_CHAINAGE, 0.0);
  equation.setData(vyn::ie::DexStaEquation::STATION_AHEAD, ahead);
  set->addEquation(&equation);
  return set;
}

// The held dictionaries as "codes templates parts sets layers localization", "-" for none.
std::string dictionariesOf(const DexData& data) {
  std::string held;
  for (const void* dictionary : {static_cast<const void*>(data.getIEDataDictionary()),
                                 static_cast<const void*>(data.getIERoadTemplatesDictionary()),
                                 static_cast<const void*>(data.getIEAlignmentPartsDictionary()),
                                 static_cast<const void*>(data.getIEStaEquationSetDictionary()),
                                 static_cast<const void*>(data.getIEDrawDictionary()),
                                 static_cast<const void*>(data.getIELocalization())})
    held += dictionary != nullptr ? "+" : "-";
  return held;
}

TEST(Data, DictionariesAreMadeOnFirstUseAndAttachingReplacesAndDeletesTheOldOne) {
  DeletionLog deleted;
  DexData data(DexSettings{});
  EXPECT_FALSE(data.addCodeToIEDataDictionary(nullptr) || data.addIERoadTemplateToDictionary(nullptr) ||
               data.addIEAlignmentPartToDictionary(nullptr) || data.addIEStaEquationSetToDictionary(nullptr));
  EXPECT_EQ("------", dictionariesOf(data));
  data.getIEDataDictionary();
  data.getIEAlignmentPartsDictionary();
  data.getIEStaEquationSetDictionary();
  data.getIEDrawDictionary();
  data.getIERoadTemplatesDictionary();  // never made on its own
  EXPECT_EQ("+-+++-", dictionariesOf(data));

  auto* const codes = new Recorded<DexDataDictionary>(deleted, "codes");
  auto* const layers = new Recorded<DexDrawDictionary>(deleted, "layers");
  auto* const sets = new Recorded<DexStaEquationSetDictionary>(deleted, "sets");
  for (int twice = 0; twice < 2; ++twice) {  // the held pointer again and null change nothing
    data.attachIEDataDictionary(twice == 0 ? codes : nullptr);
    data.attachIELayers(twice == 0 ? layers : nullptr);
    data.attachIEStaEquationSetDictionary(sets);
  }
  data.attachIERoadTemplatesDictionary(
      new Recorded<DexRoadTemplatesDictionary>(deleted, "templates", true, false));
  data.attachIEAlignmentPartsDictionary(new Recorded<DexAlignmentPartsDictionary>(deleted, "parts"));
  data.attachIELocalization(new Recorded<DexLocalization>(deleted, "localization"));
  data.attachIERoadTemplatesDictionary(nullptr);
  data.attachIELocalization(nullptr);
  EXPECT_TRUE(deleted.empty());
  EXPECT_TRUE(data.getIEDataDictionary() == codes && data.getIEDrawDictionary() == layers);
  data.attachIEDataDictionary(new DexDataDictionary());
  data.attachIERoadTemplatesDictionary(new DexRoadTemplatesDictionary(false, false));
  data.attachIEAlignmentPartsDictionary(new DexAlignmentPartsDictionary());
  data.attachIELayers(new DexDrawDictionary());
  data.attachIELocalization(new DexLocalization());
  data.attachIEStaEquationSetDictionary(nullptr);  // station-equation sets take null to drop the held one
  EXPECT_EQ((DeletionLog{"codes", "templates", "parts", "layers", "localization", "sets"}), deleted);
  EXPECT_EQ("+++-++", dictionariesOf(data));
}

TEST(Data, DictionaryEntriesOfAnExistingNameAreDeclinedAndLeftWithTheCaller) {
  DexData data(DexSettings{});
  auto* const fence = new DexCodeDescription(L"FENCE");
  auto* const crown = new DexRoadTemplate(L"crown");
  auto* const horizontal = new Part(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"R1");
  auto* const main = newSet(L"main", 1.0);
  DexCodeDescription fenceAgain(L"FENCE");
  DexRoadTemplate crownAgain(L"crown");
  Part partAgain(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"R1");
  Part oddKind(7, L"odd");
  const std::unique_ptr<DexStaEquationSet> mainAgain(newSet(L"main", 2.0));
  const dex_test::LogCapture log;
  // An entry held already is taken again; one of an existing name (and kind) is declined.
  EXPECT_TRUE(data.addCodeToIEDataDictionary(fence) && data.addCodeToIEDataDictionary(fence) &&
              data.addCodeToIEDataDictionary(new DexCodeDescription(L"fence")) &&
              data.addIERoadTemplateToDictionary(crown) && data.addIERoadTemplateToDictionary(crown) &&
              data.addIEAlignmentPartToDictionary(horizontal) &&
              data.addIEAlignmentPartToDictionary(horizontal) &&
              data.addIEAlignmentPartToDictionary(new Part(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"R1")) &&
              data.addIEStaEquationSetToDictionary(main) && data.addIEStaEquationSetToDictionary(main) &&
              data.addIEStaEquationSetToDictionary(newSet(L"", 4.0)) &&
              data.addIEStaEquationSetToDictionary(newSet(L"", 5.0)));
  EXPECT_FALSE(
      data.addCodeToIEDataDictionary(&fenceAgain) || data.addIERoadTemplateToDictionary(&crownAgain) ||
      data.addIEAlignmentPartToDictionary(&partAgain) || data.addIEAlignmentPartToDictionary(&oddKind) ||
      data.addIEStaEquationSetToDictionary(mainAgain.get()));
  EXPECT_EQ(1, log.count(L"ieObjects\\IEAlignmentPartsDictionary", 802));
  EXPECT_EQ(fence, data.getIEDataDictionary()->findCodeDiscription(L"FENCE"));
  const DexRoadTemplatesDictionary* const templates = data.getIERoadTemplatesDictionary();
  EXPECT_FALSE(templates->areCentralOffsetsUsed() || templates->areAbsHeightsUsed());
  EXPECT_EQ(crown, templates->findRoadTemplate(L"crown"));
  EXPECT_EQ(3, data.getIEStaEquationSetDictionary()->getNumberOfElements());
  EXPECT_EQ(main, data.getIEStaEquationSetDictionary()->findStaEquationSet(L"main"));
}

TEST(Data, LocalizationModeAndPointCodesNeedALocalization) {
  DexData data(DexSettings{});
  const auto method = static_cast<EDexLocalizationMethod>(2);
  const auto point = static_cast<EDexLocalizationPoint>(3);
  data.setLocalizationMode(method, point);
  data.attachLocalizationPointCodes(L"CP1", nullptr);
  EXPECT_EQ(nullptr, data.getIELocalization());
  auto* const localization = new DexLocalization();
  data.attachIELocalization(localization);
  data.setLocalizationMode(method, point);
  EXPECT_TRUE(localization->getData(DexLocalization::PARAM_METHOD) == 2.0 &&
              localization->getData(DexLocalization::PARAM_POINT) == 3.0);
}

TEST(Data, RawDataSideTablesKeepTheFirstOfANameOrId) {
  DexData data(DexSettings{});
  auto* const run = new DexDLRun(L"R2", L"first");
  DexDLRun runAgain(L"R2", L"second");
  EXPECT_TRUE(data.addDLRun(run) && data.addDLRun(run));
  EXPECT_FALSE(data.addDLRun(&runAgain) || data.addDLRun(nullptr));
  EXPECT_TRUE(data.addDLRun(new DexDLRun(L"R1", L"")));
  EXPECT_TRUE(data.addDLRun(new DexDLRun(L"r2", L"")));
  EXPECT_EQ(Text(L"first"), std::as_const(data).findDLRun(L"R2")->text);
  EXPECT_EQ(nullptr, data.findDLRun(L"R3"));
  Names runs;
  for (auto it = data.getDLRunsBegin(); it != data.getDLRunsEnd(); ++it)
    runs.emplace_back(it->second->name.view());
  EXPECT_EQ((Names{L"R1", L"R2", L"r2"}), runs);

  auto* const antenna = new DexGpsAntennaSettings();
  antenna->name = L"ANT";
  auto* const sameName = new DexGpsAntennaSettings();
  sameName->name = L"ANT";
  EXPECT_TRUE(data.addGpsAntenna(antenna) && data.addGpsAntenna(sameName) && data.addGpsAntenna(antenna));
  EXPECT_FALSE(data.addGpsAntenna(nullptr));
  EXPECT_EQ(2, data.getNumberOfGpsAntennas());
  EXPECT_TRUE(data.getGpsAntennaAt(1) == sameName && data.getGpsAntennaAt(2) == nullptr &&
              data.getGpsAntennaAt(-1) == nullptr);
  EXPECT_EQ(antenna, data.findGpsAntenna(L"ANT"));
  EXPECT_EQ(nullptr, std::as_const(data).findGpsAntenna(L"ant"));

  DexRawDataEquipment instrument;
  instrument.texts[0] = L"TS16";
  DexRawDataEquipment* const stored = data.addEquipment(4, instrument);
  instrument.texts[0] = L"GS18";
  EXPECT_EQ(stored, data.addEquipment(4, instrument));
  data.addEquipment(-2, instrument);
  EXPECT_EQ(Text(L"TS16"), data.getEquipmentById(4)->texts[0]);
  EXPECT_EQ(nullptr, std::as_const(data).getEquipmentById(5));
  std::vector<int> ids;
  for (auto it = data.getEquipmentBegin(); it != data.getEquipmentEnd(); ++it)
    ids.push_back(it->first);
  EXPECT_EQ((std::vector<int>{-2, 4}), ids);
}

TEST(Data, ObservationInfosAreSharedAndExportedFileNamesKeptOnceInOrder) {
  auto info = std::make_shared<DexObservationInfo>();
  {
    DexData data(DexSettings{});
    auto* const dataset = new DexDataset(L"a");
    data.addDataset(dataset);
    data.addObservationInfo(info, dataset);
    data.addObservationInfo(std::make_shared<DexObservationInfo>(), nullptr);
    EXPECT_EQ(info, dataset->getObservationInfo());
    EXPECT_EQ(2, data.getNumberOfObservationInfos());
    EXPECT_TRUE(data.getObservationInfoAt(0) == info && data.getObservationInfoAt(2) == nullptr &&
                data.getObservationInfoAt(-1) == nullptr);
    EXPECT_EQ(3, info.use_count());
    for (const wchar_t* name : {L"/out/a.txt", L"/out/b.txt", L"/out/a.txt", L"/out/A.txt"})
      data.addFileNameToExported(name);
    const auto& names = data.getExportedFileNames();
    ASSERT_EQ(3, names.GetSize());
    EXPECT_EQ(Text(L"/out/A.txt"), names[2]);
    data.clearExportedFileNames();
    EXPECT_EQ(0, data.getExportedFileNames().GetSize());
  }
  EXPECT_EQ(1, info.use_count());
}

TEST(Data, StoredHighestNumericNameInitialisesThePoolOfFreeNames) {
  DexData data(DexSettings{});
  utils::FreeNumericNames collecting;
  collecting.addObject(L"A");
  data.getMaxNumericPointName(collecting);  // nothing stored: the pool is left collecting
  EXPECT_EQ(0, collecting.getFirstAvailableNumber());
  utils::FreeNumericNames names;
  names.addObject(10);
  names.addObject(L"SIGN");
  names.init();
  data.setMaxNumericPointName(names);
  EXPECT_EQ(10, data.getSettings().maxNumericPointName);
  utils::FreeNumericNames again;
  again.addObject(L"7");
  data.getMaxNumericPointName(again);
  EXPECT_EQ(11, again.getFirstAvailableNumber());
  EXPECT_EQ(Text(L"11"), again.getNameFor(L"X"));
}

TEST(Data, CoordinatesAreFormattedWithTheDecimalsOfTheirIndexInTheUnitGiven) {
  DexSettings settings;
  settings.coordDecimals = {2, 3, 1};
  DexData data(settings);
  auto* const grid = new DexDataset(L"grid");
  data.addDataset(grid);
  const auto format = [&data](int index, double value, EDistUnits units) {
    return data.formatCoordToDefinedStyle(index, value, units);
  };
  const std::pair<Text, const wchar_t*> plane[] = {{format(0, 1234.5678, METERS), L"1234.57"},
                                                   {format(1, 1234.5678, METERS), L"1234.568"},
                                                   {format(2, 1234.5678, METERS), L"1234.6"},
                                                   {format(0, 304.8, IFEET), L"1000.00"},
                                                   {format(0, 304.8, ANY_UNITS), L"304.80"},
                                                   {format(3, 1.0, METERS), L""},
                                                   {format(-1, 1.0, METERS), L""}};
  dex_test::expectRows(plane);
  DexJobInfo jobInfo;  // any units means the job's distance unit
  jobInfo.setDistUnits(IFEET);
  data.setJobInfo(jobInfo);
  EXPECT_EQ(Text(L"1000.00"), format(0, 304.8, ANY_UNITS));

  // Geographic latitude and longitude follow the coordinate style; the height stays a distance.
  cs::DexCoordinateSystemInfo geographic;
  geographic.kind = cs::DexCoordinateSystemInfo::kGeographicKind;
  grid->setCoordinateSystem(geographic);
  settings.coordsStyle = DECIMAL_DEGREES;
  data.setSettings(settings);
  const std::pair<Text, const wchar_t*> geo[] = {{format(0, 12.5, METERS), L"12.5000000000"},
                                                 {format(1, -48.25, IFEET), L"-48.2500000000"},
                                                 {format(2, 310.26, METERS), L"310.3"}};
  dex_test::expectRows(geo);
  settings.coordsStyle = PACKED_DMS;
  data.setSettings(settings);
  EXPECT_EQ(Text(L"12.3000000000"), format(0, 12.5, METERS));
}

// A code library of A, B and C (C used by no object) and one dataset "Job" with properties (extra
// value 7): 1 {A}, 2 {B}, 3 {A, B}, 4 without code, 5 {A}.
class DataPrepare : public ::testing::Test {
 protected:
  DataPrepare() : data_(settingsWith({POINTS})) {
    auto* const a = new DexCodeDescription(L"A");
    auto* const b = new DexCodeDescription(L"B");
    data_.addCodeToIEDataDictionary(b);
    data_.addCodeToIEDataDictionary(new DexCodeDescription(L"C"));
    data_.addCodeToIEDataDictionary(a);
    job_ = new Recorded<DexDataset>(deleted_, "Job", L"Job");
    job_->getDatasetProperties()->setExtraValue(0, 7);
    cs::DexCoordinateSystemInfo geographic;
    geographic.kind = cs::DexCoordinateSystemInfo::kGeographicKind;
    job_->setCoordinateSystem(geographic);
    for (DexDesignPoint* point :
         {pointWithCodes(L"1", {a}), pointWithCodes(L"2", {b}), pointWithCodes(L"3", {a, b}),
          pointWithCodes(L"4"), pointWithCodes(L"5", {a})})
      job_->add(point);
    data_.addDataset(job_);
  }

  DeletionLog deleted_;
  DexData data_;
  DexDataset* job_ = nullptr;
};

TEST_F(DataPrepare, SplitsADatasetIntoOnePerUsedCodeAndOneForObjectsWithoutCode) {
  const auto info = job_->getObservationInfo();
  EXPECT_TRUE(data_.prepareDatasetsForMultipleFilesExport(true));
  EXPECT_EQ(DeletionLog{"Job"}, deleted_);
  ASSERT_EQ((Names{L"A", L"B", L"Job"}), datasetNamesOf(data_));
  EXPECT_EQ((Names{L"1:A", L"3:A", L"5:A"}), objectsOf(*data_.getDatasetAt(0)));
  EXPECT_EQ((Names{L"2:B", L"3:B"}), objectsOf(*data_.getDatasetAt(1)));
  EXPECT_EQ((Names{L"4:"}), objectsOf(*data_.getDatasetAt(2)));
  // Each new dataset has its own copy of the properties, the coordinate system and the observation info.
  const DexDatasetProperties* seen = nullptr;
  for (int i = 0; i < data_.getNumberOfDatasets(); ++i) {
    const DexDataset& dataset = *data_.getDatasetAt(i);
    ASSERT_NE(nullptr, dataset.getDatasetProperties());
    EXPECT_EQ(7, dataset.getDatasetProperties()->getExtraValue(0));
    EXPECT_NE(seen, dataset.getDatasetProperties());
    seen = dataset.getDatasetProperties();
    EXPECT_EQ(cs::DexCoordinateSystemInfo::kGeographicKind, dataset.getCoordinateSystem().kind);
    EXPECT_EQ(info, dataset.getObservationInfo());
  }
}

TEST_F(DataPrepare, ChangesNothingForAOneFileFormatOrWithoutPointLineOrAreaKinds) {
  EXPECT_FALSE(data_.prepareDatasetsForMultipleFilesExport(false));
  data_.setSettings(settingsWith({CODES, SURFACES, RAW_DATA, MULTIPLE}));
  EXPECT_FALSE(data_.prepareDatasetsForMultipleFilesExport(true));
  EXPECT_TRUE(deleted_.empty());
  EXPECT_EQ(job_, data_.getDatasetAt(0));
  for (const EDexDataType kind : {POINTS, POINT_LISTS, LINES, AREAS}) {
    DexData plain(settingsWith({kind}));
    EXPECT_FALSE(plain.prepareDatasetsForMultipleFilesExport(true)) << "no dataset";
    plain.addDataset(new DexDataset(L"plain"));
    EXPECT_TRUE(plain.prepareDatasetsForMultipleFilesExport(true)) << kind;
  }
}

TEST(DataPrepareKinds, OnlyCodedDatasetsAreSplitAndObjectsOfUnknownCodesDropped) {
  DexData data(settingsWith({AREAS}));
  auto* const fence = new DexCodeDescription(L"FENCE");
  const DexCodeDescription unknown(L"UNKNOWN");
  data.addCodeToIEDataDictionary(fence);
  auto* const empty = new DexDataset(L"empty");
  auto* const coded = new DexDataset(L"coded");
  coded->add(pointWithCodes(L"1", {fence}));
  auto* const plain = new DexDataset(L"plain");
  plain->add(pointWithCodes(L"2"));
  auto* const lost = new DexDataset(L"lost");
  lost->add(pointWithCodes(L"3", {&unknown}));
  for (DexDataset* dataset : {empty, coded, plain, lost})
    data.addDataset(dataset);
  data.setCurDataset(3);
  EXPECT_TRUE(data.prepareDatasetsForMultipleFilesExport(true));
  EXPECT_EQ((Names{L"empty", L"plain", L"FENCE"}), datasetNamesOf(data));
  EXPECT_EQ(plain, data.getDatasetAt(1));
  // The current index now lies past the list: the const getter says so, the other falls back to 0.
  dex_test::LogCapture log;
  EXPECT_EQ(nullptr, std::as_const(data).getCurDataset());
  EXPECT_EQ(1, log.count(kDataLogSource, DexData::kLogLineNoCurrentDataset));
  EXPECT_EQ(empty, data.getCurDataset());
  EXPECT_EQ(0, data.getCurDatasetId());
}

TEST(Data, DestructionDeletesEveryKindOfMemberInItsFixedOrder) {
  DeletionLog deleted;
  {
    DexData data(settingsWith({POINTS}));
    data.addGpsAntenna(new Recorded<DexGpsAntennaSettings>(deleted, "antenna"));
    data.attachIEStaEquationSetDictionary(new Recorded<DexStaEquationSetDictionary>(deleted, "sets"));
    data.attachIEAlignmentPartsDictionary(new Recorded<DexAlignmentPartsDictionary>(deleted, "parts"));
    data.attachIELayers(new Recorded<DexDrawDictionary>(deleted, "layers"));
    data.attachIELocalization(new Recorded<DexLocalization>(deleted, "localization"));
    data.attachIERoadTemplatesDictionary(
        new Recorded<DexRoadTemplatesDictionary>(deleted, "templates", false, false));
    data.attachIEDataDictionary(new Recorded<DexDataDictionary>(deleted, "codes"));
    auto* const dataset = new Recorded<DexDataset>(deleted, "dataset", L"1");
    data.addDataset(dataset);
    data.addObservationInfo(std::make_shared<Recorded<DexObservationInfo>>(deleted, "observation info"),
                            nullptr);
    auto* const fence = new DexCodeDescription(L"FENCE");
    data.addCodeToIEDataDictionary(fence);
    dataset->add(pointWithCodes(L"1", {fence}));
    data.getIEDrawDictionary()->addLayer(new DexLayer());
    data.addIERoadTemplateToDictionary(new DexRoadTemplate(L"crown"));
    data.addIEAlignmentPartToDictionary(new Part(IDexAlignmentPart::CROSS_SECTION_SET, L"X"));
    EXPECT_TRUE(data.addIEStaEquationSetToDictionary(newSet(L"main", 1.0)));
    data.addDLRun(new DexDLRun(L"R1", L""));
    data.addEquipment(1, DexRawDataEquipment());
    EXPECT_TRUE(deleted.empty());
  }
  EXPECT_EQ((DeletionLog{"dataset", "codes", "templates", "localization", "layers", "parts", "sets",
                         "antenna", "observation info"}),
            deleted);
}

}  // namespace
