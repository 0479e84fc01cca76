#include "ieObjects/IEData.h"

#include <gtest/gtest.h>

#include <atomic>
#include <memory>
#include <string>
#include <thread>
#include <type_traits>
#include <utility>
#include <vector>

#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/ObjectsTestHelpers.h"
#include "ieUtils/IENaturalNames.h"
#include "ieUtils/IEUtilsCoords.h"
#include "ieUtils/IEUtilsUnits.h"
#include "support/LogCapture.h"

namespace {

using objects_test::codeOf;
using vyn::ie::DexAlignmentPartsDictionary;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexData;
using vyn::ie::DexDataDictionary;
using vyn::ie::DexDataset;
using vyn::ie::DexDatasetProperties;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexDLRun;
using vyn::ie::DexDrawDictionary;
using vyn::ie::DexGpsAntennaSettings;
using vyn::ie::DexJobInfo;
using vyn::ie::DexLayer;
using vyn::ie::DexLocalization;
using vyn::ie::DexObject;
using vyn::ie::DexObservationInfo;
using vyn::ie::DexRawDataEquipment;
using vyn::ie::DexRoadTemplate;
using vyn::ie::DexRoadTemplatesDictionary;
using vyn::ie::DexSettings;
using vyn::ie::DexStaEquationSet;
using vyn::ie::DexStaEquationSetDictionary;
using vyn::ie::EDexDataType;
using vyn::ie::EDexLocalizationMethod;
using vyn::ie::EDexLocalizationPoint;
using vyn::ie::IDexAlignmentPart;
using vyn::ie::IDexStateInterface;
using vyn::ie::utils::FreeNumericNames;
namespace cs_utils = vyn::ie::cs_utils;

using Text = CVynStringT<wchar_t>;

constexpr const wchar_t* kDataLogSource = L"ieObjects\\IEData";

// ---- Builders ---------------------------------------------------------------------------------------

DexSettings settingsWith(std::initializer_list<EDexDataType> types) {
  DexSettings settings;
  for (const EDexDataType type : types)
    settings.addDataType(type);
  return settings;
}

// A design point named name carrying a code of each description given; the caller owns it.
DexDesignPoint* pointWithCodes(const wchar_t* name,
                               std::initializer_list<const DexCodeDescription*> codes = {}) {
  auto* const point = new DexDesignPoint();
  point->setName(name);
  for (const DexCodeDescription* const description : codes)
    point->addCode(codeOf(description));
  return point;
}

std::vector<std::wstring> datasetNamesOf(const DexData& data) {
  std::vector<std::wstring> names;
  for (int i = 0; i < data.getNumberOfDatasets(); ++i)
    names.emplace_back(data.getDatasetAt(i)->getName().view());
  return names;
}

std::vector<std::wstring> objectNamesOf(const DexDataset& dataset) {
  std::vector<std::wstring> names;
  for (int i = 0; i < dataset.getNumberOfElements(-1, IDexStateInterface::ANY_STATE); ++i) {
    const DexObject* const object = dataset.getObjectAt(i);
    if (object != nullptr) names.emplace_back(object->getName().view());
  }
  return names;
}

// The names of the codes of every object of dataset, in object order, joined with "+" per object.
std::vector<std::wstring> codeNamesOf(const DexDataset& dataset) {
  std::vector<std::wstring> result;
  for (int i = 0; i < dataset.getNumberOfElements(-1, IDexStateInterface::ANY_STATE); ++i) {
    const DexObject* const object = dataset.getObjectAt(i);
    if (object == nullptr) continue;
    std::wstring codes;
    for (int k = 0; k < object->getNumberOfCodes(); ++k) {
      if (k > 0) codes += L"+";
      codes += object->getCode(k)->getDescription()->getName().view();
    }
    result.push_back(codes);
  }
  return result;
}

// ---- Members that record their deletion -------------------------------------------------------------

using DeletionLog = std::vector<std::string>;

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

// ---- Construction and settings ------------------------------------------------------------------

TEST(Data, StartsEmptyWithoutDictionariesAndWithCurrentIndexZero) {
  const DexData data(DexSettings{});
  EXPECT_EQ(0, data.getNumberOfDatasets());
  EXPECT_EQ(0, data.getCurDatasetId());
  EXPECT_EQ(nullptr, data.getIEDataDictionary());
  EXPECT_EQ(nullptr, data.getIEDrawDictionary());
  EXPECT_EQ(nullptr, data.getIEAlignmentPartsDictionary());
  EXPECT_EQ(nullptr, data.getIEStaEquationSetDictionary());
  EXPECT_EQ(nullptr, data.getIERoadTemplatesDictionary());
  EXPECT_EQ(nullptr, data.getIELocalization());
  EXPECT_EQ(0, data.getNumberOfDLRuns());
  EXPECT_EQ(data.getDLRunsBegin(), data.getDLRunsEnd());
  EXPECT_EQ(0, data.getNumberOfGpsAntennas());
  EXPECT_EQ(0, data.getNumberOfEquipment());
  EXPECT_EQ(data.getEquipmentBegin(), data.getEquipmentEnd());
  EXPECT_EQ(0, data.getNumberOfObservationInfos());
  EXPECT_EQ(0, data.getExportedFileNames().GetSize());
  EXPECT_EQ(0, data.getNumberOfObjectsInAllDatasets());
  EXPECT_EQ(vyn::ie::ANY_UNITS, data.getJobInfo().getDistUnits());
}

TEST(Data, KeepsItsOwnCopyOfTheSettings) {
  DexSettings settings = settingsWith({vyn::ie::POINTS});
  settings.maxNumericPointName = 12;
  const DexData data(settings);
  settings.removeAllDataTypes();
  settings.maxNumericPointName = 99;

  EXPECT_TRUE(data.getSettings().hasDataType(vyn::ie::POINTS));
  EXPECT_EQ(12, data.getSettings().maxNumericPointName);
}

TEST(Data, SetSettingsAndSetJobInfoAssign) {
  DexData data(DexSettings{});
  data.setSettings(settingsWith({vyn::ie::LINES}));
  DexJobInfo jobInfo;
  jobInfo.setText(3, L"crew");
  jobInfo.setDistUnits(vyn::ie::IFEET);
  data.setJobInfo(jobInfo);

  EXPECT_TRUE(data.getSettings().hasDataType(vyn::ie::LINES));
  EXPECT_EQ(Text(L"crew"), data.getJobInfo().getText(3));
  EXPECT_EQ(vyn::ie::IFEET, data.getJobInfo().getDistUnits());
}

TEST(Data, IsNotCopyableAndHasAVirtualDestructor) {
  static_assert(!std::is_copy_constructible_v<DexData>);
  static_assert(!std::is_copy_assignable_v<DexData>);
  static_assert(std::has_virtual_destructor_v<DexData>);
}

// ---- Stop request ---------------------------------------------------------------------------------

TEST(DataStopProcess, IsOneProcessWideAtomicFlagSeenAcrossThreads) {
  static_assert(std::is_same_v<decltype(DexData::stopProcess_), std::atomic<bool>>);
  EXPECT_FALSE(DexData::stopProcess_);

  std::thread host([] { DexData::stopProcess_ = true; });
  host.join();
  EXPECT_TRUE(DexData::stopProcess_);
  DexData::stopProcess_ = false;
  EXPECT_FALSE(DexData::stopProcess_);
}

// ---- Datasets -------------------------------------------------------------------------------------

TEST(DataDatasets, FirstNonConstCurrentDatasetCreatesOneStopgapDatasetAndKeepsIt) {
  DexData data(DexSettings{});
  DexDataset* const first = data.getCurDataset();
  ASSERT_NE(nullptr, first);
  EXPECT_EQ(Text(L"STOPGAP"), first->getName());
  EXPECT_EQ(1, data.getNumberOfDatasets());
  EXPECT_EQ(0, first->getNumberOfElements(-1, IDexStateInterface::ANY_STATE));

  EXPECT_EQ(first, data.getCurDataset());
  EXPECT_EQ(1, data.getNumberOfDatasets());
  EXPECT_EQ(first, std::as_const(data).getCurDataset());
}

TEST(DataDatasets, ConstCurrentDatasetOfEmptyDataIsNullWithAnErrorRecord) {
  dex_test::LogCapture log;
  const DexData data(DexSettings{});
  EXPECT_EQ(nullptr, data.getCurDataset());
  ASSERT_EQ(1, log.count(kDataLogSource, DexData::kLogLineNoCurrentDataset));
  EXPECT_TRUE(log.records()[0].message.empty());
  EXPECT_EQ(0, data.getNumberOfDatasets());
}

TEST(DataDatasets, AddsInOrderAndAnswersNullOutsideTheList) {
  DexData data(DexSettings{});
  auto* const first = new DexDataset(L"first");
  auto* const second = new DexDataset(L"second");
  EXPECT_TRUE(data.addDataset(first));
  EXPECT_TRUE(data.addDataset(second));

  EXPECT_EQ(2, data.getNumberOfDatasets());
  EXPECT_EQ(first, data.getDatasetAt(0));
  EXPECT_EQ(second, data.getDatasetAt(1));
  EXPECT_EQ(nullptr, data.getDatasetAt(2));
  EXPECT_EQ(nullptr, data.getDatasetAt(-1));
  EXPECT_EQ(first, data.getCurDataset());
}

TEST(DataDatasets, DeclinesNullAndTakesADatasetItHoldsOnlyOnce) {
  DexData data(DexSettings{});
  EXPECT_FALSE(data.addDataset(nullptr));
  EXPECT_EQ(0, data.getNumberOfDatasets());

  auto* const dataset = new DexDataset(L"once");
  EXPECT_TRUE(data.addDataset(dataset));
  EXPECT_TRUE(data.addDataset(dataset));
  EXPECT_EQ(1, data.getNumberOfDatasets());
}

TEST(DataDatasets, SetCurrentDatasetTakesOnlyAValidIndex) {
  DexData data(DexSettings{});
  data.addDataset(new DexDataset(L"a"));
  data.addDataset(new DexDataset(L"b"));

  data.setCurDataset(1);
  EXPECT_EQ(1, data.getCurDatasetId());
  data.setCurDataset(5);
  EXPECT_EQ(1, data.getCurDatasetId());
  data.setCurDataset(2);
  EXPECT_EQ(1, data.getCurDatasetId());
  data.setCurDataset(-1);
  EXPECT_EQ(1, data.getCurDatasetId());
  EXPECT_EQ(Text(L"b"), data.getCurDataset()->getName());
  data.setCurDataset(0);
  EXPECT_EQ(0, data.getCurDatasetId());
}

TEST(DataDatasets, CountsTheObjectsOfEveryDatasetWhateverTheirKindAndState) {
  DexData data(DexSettings{});
  auto* const first = new DexDataset(L"first");
  first->add(pointWithCodes(L"1"));
  DexDesignPoint* const inactive = pointWithCodes(L"2");
  inactive->setStateType(IDexStateInterface::INACTIVE_STATE);
  first->add(inactive);
  auto* const second = new DexDataset(L"second");
  second->add(new vyn::ie::DexPolyLine());
  data.addDataset(first);
  data.addDataset(second);
  data.addDataset(new DexDataset(L"empty"));

  EXPECT_EQ(3, data.getNumberOfObjectsInAllDatasets());
}

TEST(DataDatasets, CoordinateSystemAndObservationInfoAreTheCurrentDatasets) {
  DexData data(DexSettings{});
  data.addDataset(new DexDataset(L"a"));
  auto* const second = new DexDataset(L"b");
  cs_utils::DexCoordinateSystemInfo geographic;
  geographic.kind = cs_utils::DexCoordinateSystemInfo::kGeographicKind;
  geographic.texts[0] = L"WGS84";
  second->setCoordinateSystem(geographic);
  auto info = std::make_shared<DexObservationInfo>();
  second->setObservationInfo(info);
  data.addDataset(second);

  EXPECT_EQ(cs_utils::DexCoordinateSystemInfo::kDefaultKind, data.getCoordinateSystem().kind);
  data.setCurDataset(1);
  EXPECT_EQ(cs_utils::DexCoordinateSystemInfo::kGeographicKind, data.getCoordinateSystem().kind);
  EXPECT_EQ(Text(L"WGS84"), data.getCoordinateSystem().texts[0]);
  EXPECT_EQ(info, data.getCurObservationInfo());
}

TEST(DataDatasets, CoordinateSystemAndObservationInfoWithoutDatasetAreDefaultsWithAnErrorRecord) {
  dex_test::LogCapture log;
  const DexData data(DexSettings{});
  EXPECT_EQ(cs_utils::DexCoordinateSystemInfo::kDefaultKind, data.getCoordinateSystem().kind);
  EXPECT_EQ(nullptr, data.getCurObservationInfo());
  EXPECT_EQ(2, log.count(kDataLogSource, DexData::kLogLineNoCurrentDataset));
}

// ---- Dictionaries ---------------------------------------------------------------------------------

TEST(DataDictionaries, NonConstGettersMakeTheDictionaryOnceExceptRoadTemplates) {
  DexData data(DexSettings{});
  EXPECT_EQ(nullptr, data.getIERoadTemplatesDictionary());

  DexDrawDictionary* const layers = data.getIEDrawDictionary();
  ASSERT_NE(nullptr, layers);
  EXPECT_EQ(0, layers->getNumberOfLayers());
  EXPECT_EQ(layers, data.getIEDrawDictionary());
  EXPECT_EQ(layers, std::as_const(data).getIEDrawDictionary());

  DexDataDictionary* const codes = data.getIEDataDictionary();
  ASSERT_NE(nullptr, codes);
  EXPECT_EQ(0, codes->getSize());
  EXPECT_EQ(codes, data.getIEDataDictionary());

  DexAlignmentPartsDictionary* const parts = data.getIEAlignmentPartsDictionary();
  ASSERT_NE(nullptr, parts);
  EXPECT_EQ(parts, data.getIEAlignmentPartsDictionary());

  DexStaEquationSetDictionary* const sets = data.getIEStaEquationSetDictionary();
  ASSERT_NE(nullptr, sets);
  EXPECT_EQ(0, sets->getNumberOfElements());
  EXPECT_EQ(sets, data.getIEStaEquationSetDictionary());

  EXPECT_EQ(nullptr, data.getIERoadTemplatesDictionary());
}

TEST(DataDictionaries, AttachingReplacesAndDeletesTheOldDictionary) {
  DeletionLog deleted;
  DexData data(DexSettings{});
  auto* const first = new Recorded<DexDataDictionary>(deleted, "first");
  data.attachIEDataDictionary(first);
  EXPECT_EQ(first, data.getIEDataDictionary());

  data.attachIEDataDictionary(first);
  EXPECT_TRUE(deleted.empty());
  data.attachIEDataDictionary(nullptr);
  EXPECT_EQ(first, data.getIEDataDictionary());
  EXPECT_TRUE(deleted.empty());

  auto* const second = new Recorded<DexDataDictionary>(deleted, "second");
  data.attachIEDataDictionary(second);
  EXPECT_EQ(DeletionLog{"first"}, deleted);
  EXPECT_EQ(second, data.getIEDataDictionary());
}

// Attaches held, then held again and null (neither may delete it), checks it is the one held, and
// finally attaches a fresh dictionary, which must delete it.
template <class Dictionary, class Attach, class Get>
void expectAttachKeepsTheHeldUntilReplaced(DexData& data, const DeletionLog& deleted, Attach attach, Get get,
                                           Dictionary* held, Dictionary* replacement) {
  const std::size_t deletedBefore = deleted.size();
  (data.*attach)(held);
  (data.*attach)(held);
  (data.*attach)(nullptr);
  EXPECT_EQ(held, (data.*get)());
  EXPECT_EQ(deletedBefore, deleted.size());
  (data.*attach)(replacement);
}

TEST(DataDictionaries, OtherDictionariesIgnoreNullAndTheHeldPointer) {
  DeletionLog deleted;
  DexData data(DexSettings{});
  using Templates = DexRoadTemplatesDictionary;
  using Parts = DexAlignmentPartsDictionary;
  expectAttachKeepsTheHeldUntilReplaced<Templates>(
      data, deleted, &DexData::attachIERoadTemplatesDictionary,
      static_cast<Templates* (DexData::*)()>(&DexData::getIERoadTemplatesDictionary),
      new Recorded<Templates>(deleted, "templates", true, false), new Templates(false, false));
  expectAttachKeepsTheHeldUntilReplaced<Parts>(
      data, deleted, &DexData::attachIEAlignmentPartsDictionary,
      static_cast<Parts* (DexData::*)()>(&DexData::getIEAlignmentPartsDictionary),
      new Recorded<Parts>(deleted, "parts"), new Parts());
  expectAttachKeepsTheHeldUntilReplaced<DexDrawDictionary>(
      data, deleted, &DexData::attachIELayers,
      static_cast<DexDrawDictionary* (DexData::*)()>(&DexData::getIEDrawDictionary),
      new Recorded<DexDrawDictionary>(deleted, "layers"), new DexDrawDictionary());
  expectAttachKeepsTheHeldUntilReplaced<DexLocalization>(
      data, deleted, &DexData::attachIELocalization,
      static_cast<DexLocalization* (DexData::*)()>(&DexData::getIELocalization),
      new Recorded<DexLocalization>(deleted, "localization"), new DexLocalization());
  EXPECT_EQ((DeletionLog{"templates", "parts", "layers", "localization"}), deleted);
}

TEST(DataDictionaries, StationEquationSetsAttachNullToDropTheHeldDictionary) {
  DeletionLog deleted;
  DexData data(DexSettings{});
  auto* const sets = new Recorded<DexStaEquationSetDictionary>(deleted, "sets");
  data.attachIEStaEquationSetDictionary(sets);
  data.attachIEStaEquationSetDictionary(sets);
  EXPECT_TRUE(deleted.empty());
  EXPECT_EQ(sets, data.getIEStaEquationSetDictionary());

  data.attachIEStaEquationSetDictionary(nullptr);
  EXPECT_EQ(DeletionLog{"sets"}, deleted);
  EXPECT_EQ(nullptr, std::as_const(data).getIEStaEquationSetDictionary());
}

TEST(DataDictionaries, SecondCodeOfAnExistingNameLeavesTheDictionaryUnchanged) {
  DexData data(DexSettings{});
  auto* const fence = new DexCodeDescription(L"FENCE");
  EXPECT_TRUE(data.addCodeToIEDataDictionary(fence));

  auto* const again = new DexCodeDescription(L"FENCE");
  EXPECT_FALSE(data.addCodeToIEDataDictionary(again));
  delete again;  // declined: still the caller's

  EXPECT_EQ(1, data.getIEDataDictionary()->getSize());
  EXPECT_EQ(fence, data.getIEDataDictionary()->findCodeDiscription(L"FENCE"));
  EXPECT_TRUE(data.addCodeToIEDataDictionary(fence));  // held already: never the caller's again
  EXPECT_EQ(1, data.getIEDataDictionary()->getSize());

  auto* const lowerCase = new DexCodeDescription(L"fence");
  EXPECT_TRUE(data.addCodeToIEDataDictionary(lowerCase));
  EXPECT_EQ(2, data.getIEDataDictionary()->getSize());
}

TEST(DataDictionaries, NullEntriesAreIgnoredWithoutMakingADictionary) {
  DexData data(DexSettings{});
  EXPECT_FALSE(data.addCodeToIEDataDictionary(nullptr));
  EXPECT_FALSE(data.addIERoadTemplateToDictionary(nullptr));
  EXPECT_FALSE(data.addIEAlignmentPartToDictionary(nullptr));
  EXPECT_FALSE(data.addIEStaEquationSetToDictionary(nullptr));

  const DexData& view = data;
  EXPECT_EQ(nullptr, view.getIEDataDictionary());
  EXPECT_EQ(nullptr, view.getIERoadTemplatesDictionary());
  EXPECT_EQ(nullptr, view.getIEAlignmentPartsDictionary());
  EXPECT_EQ(nullptr, view.getIEStaEquationSetDictionary());
}

TEST(DataDictionaries, RoadTemplateMakesAPlainDictionaryAndKeepsTheFirstOfAName) {
  DexData data(DexSettings{});
  auto* const crown = new DexRoadTemplate(L"crown");
  EXPECT_TRUE(data.addIERoadTemplateToDictionary(crown));
  const DexRoadTemplatesDictionary* const templates = data.getIERoadTemplatesDictionary();
  ASSERT_NE(nullptr, templates);
  EXPECT_FALSE(templates->areCentralOffsetsUsed());
  EXPECT_FALSE(templates->areAbsHeightsUsed());

  auto* const again = new DexRoadTemplate(L"crown");
  EXPECT_FALSE(data.addIERoadTemplateToDictionary(again));
  delete again;
  EXPECT_TRUE(data.addIERoadTemplateToDictionary(crown));
  EXPECT_TRUE(data.addIERoadTemplateToDictionary(new DexRoadTemplate(L"ditch")));

  EXPECT_EQ(2, templates->getNumberOfRoadTemplates());
  EXPECT_EQ(crown, templates->findRoadTemplate(L"crown"));
}

// An alignment part of any kind, for the dictionary tests.
class Part : public IDexAlignmentPart {
 public:
  Part(int kind, const wchar_t* name) : kind_(kind) { setName(name); }
  EDexAlignmentPartType getType() const override { return static_cast<EDexAlignmentPartType>(kind_); }

 private:
  int kind_;
};

TEST(DataDictionaries, AlignmentPartIsDeclinedOnlyForTheSameKindAndName) {
  DexData data(DexSettings{});
  auto* const horizontal = new Part(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"R1");
  EXPECT_TRUE(data.addIEAlignmentPartToDictionary(horizontal));

  auto* const sameName = new Part(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"R1");
  EXPECT_FALSE(data.addIEAlignmentPartToDictionary(sameName));
  delete sameName;
  EXPECT_TRUE(data.addIEAlignmentPartToDictionary(horizontal));
  EXPECT_TRUE(data.addIEAlignmentPartToDictionary(new Part(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"R1")));
  EXPECT_TRUE(data.addIEAlignmentPartToDictionary(new Part(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"r1")));

  const DexAlignmentPartsDictionary* const parts = data.getIEAlignmentPartsDictionary();
  EXPECT_EQ(2, parts->getNumberOfElements(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
  EXPECT_EQ(1, parts->getNumberOfElements(IDexAlignmentPart::VERTICAL_ALIGNMENT));
  EXPECT_EQ(horizontal, parts->getAlignmentPartAt(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, 0));
}

TEST(DataDictionaries, AlignmentPartOfAnUnknownKindIsDeclinedWithTheDictionarysRecord) {
  dex_test::LogCapture log;
  DexData data(DexSettings{});
  auto* const odd = new Part(7, L"odd");
  EXPECT_FALSE(data.addIEAlignmentPartToDictionary(odd));
  delete odd;
  EXPECT_EQ(1, log.count(L"ieObjects\\IEAlignmentPartsDictionary", 802));
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

TEST(DataDictionaries, StationEquationSetIsDeclinedForAnExistingName) {
  DexData data(DexSettings{});
  auto* const main = newSet(L"main", 1.0);
  EXPECT_TRUE(data.addIEStaEquationSetToDictionary(main));

  auto* const again = newSet(L"main", 2.0);
  EXPECT_FALSE(data.addIEStaEquationSetToDictionary(again));
  delete again;
  EXPECT_TRUE(data.addIEStaEquationSetToDictionary(main));
  EXPECT_TRUE(data.addIEStaEquationSetToDictionary(newSet(L"ramp", 3.0)));
  EXPECT_TRUE(data.addIEStaEquationSetToDictionary(newSet(L"", 4.0)));
  EXPECT_TRUE(data.addIEStaEquationSetToDictionary(newSet(L"", 5.0)));

  EXPECT_EQ(4, data.getIEStaEquationSetDictionary()->getNumberOfElements());
  EXPECT_EQ(main, data.getIEStaEquationSetDictionary()->findStaEquationSet(L"main"));
}

// ---- Localization -----------------------------------------------------------------------------------

TEST(DataLocalization, ModeSetsMethodAndPointParameters) {
  DexData data(DexSettings{});
  data.setLocalizationMode(static_cast<EDexLocalizationMethod>(2), static_cast<EDexLocalizationPoint>(3));
  data.attachLocalizationPointCodes(L"CP1", nullptr);
  EXPECT_EQ(nullptr, data.getIELocalization());

  auto* const localization = new DexLocalization();
  data.attachIELocalization(localization);
  data.setLocalizationMode(static_cast<EDexLocalizationMethod>(2), static_cast<EDexLocalizationPoint>(3));
  EXPECT_EQ(2.0, localization->getData(DexLocalization::PARAM_METHOD));
  EXPECT_EQ(3.0, localization->getData(DexLocalization::PARAM_POINT));
  EXPECT_EQ(0.0, localization->getData(0));
}

TEST(DataLocalization, PointCodesWithoutControlPointsChangeNothing) {
  DexData data(DexSettings{});
  auto* const localization = new DexLocalization();
  data.attachIELocalization(localization);
  DexDesignPoint codes;
  DexCodeDescription fence(L"FENCE");
  codes.addCode(codeOf(&fence));
  data.attachLocalizationPointCodes(L"CP1", &codes);
  data.attachLocalizationPointCodes(L"CP1", nullptr);
  EXPECT_EQ(localization, data.getIELocalization());
}

// ---- Raw-data side tables -----------------------------------------------------------------------------

TEST(DataLevelRuns, KeepTheFirstRunOfANameAndIterateInNameOrder) {
  DexData data(DexSettings{});
  auto* const first = new DexDLRun(L"R2", L"first");
  EXPECT_TRUE(data.addDLRun(first));
  auto* const sameName = new DexDLRun(L"R2", L"second");
  EXPECT_FALSE(data.addDLRun(sameName));
  delete sameName;
  EXPECT_TRUE(data.addDLRun(first));
  EXPECT_FALSE(data.addDLRun(nullptr));
  EXPECT_TRUE(data.addDLRun(new DexDLRun(L"R1", L"")));
  EXPECT_TRUE(data.addDLRun(new DexDLRun(L"r2", L"")));

  EXPECT_EQ(first, data.findDLRun(L"R2"));
  EXPECT_EQ(Text(L"first"), std::as_const(data).findDLRun(L"R2")->text);
  EXPECT_EQ(nullptr, data.findDLRun(L"R3"));
  std::vector<std::wstring> names;
  for (auto it = data.getDLRunsBegin(); it != data.getDLRunsEnd(); ++it)
    names.emplace_back(it->second->name.view());
  EXPECT_EQ((std::vector<std::wstring>{L"R1", L"R2", L"r2"}), names);
}

TEST(DataGpsAntennas, AppendAndFindTheFirstOfAName) {
  DexData data(DexSettings{});
  auto* const first = new DexGpsAntennaSettings();
  first->name = L"ANT";
  first->firstText = L"1";
  auto* const second = new DexGpsAntennaSettings();
  second->name = L"ANT";
  EXPECT_TRUE(data.addGpsAntenna(first));
  EXPECT_TRUE(data.addGpsAntenna(second));
  EXPECT_TRUE(data.addGpsAntenna(first));
  EXPECT_FALSE(data.addGpsAntenna(nullptr));

  EXPECT_EQ(2, data.getNumberOfGpsAntennas());
  EXPECT_EQ(second, data.getGpsAntennaAt(1));
  EXPECT_EQ(nullptr, data.getGpsAntennaAt(2));
  EXPECT_EQ(nullptr, data.getGpsAntennaAt(-1));
  EXPECT_EQ(first, data.findGpsAntenna(L"ANT"));
  EXPECT_EQ(nullptr, std::as_const(data).findGpsAntenna(L"ant"));
}

TEST(DataEquipment, StoresACopyAndKeepsTheFirstRecordOfAnId) {
  DexData data(DexSettings{});
  DexRawDataEquipment instrument;
  instrument.texts[0] = L"TS16";
  DexRawDataEquipment* const stored = data.addEquipment(4, instrument);
  ASSERT_NE(nullptr, stored);
  EXPECT_NE(&instrument, stored);
  instrument.texts[0] = L"changed";
  EXPECT_EQ(Text(L"TS16"), stored->texts[0]);

  DexRawDataEquipment other;
  other.texts[0] = L"GS18";
  EXPECT_EQ(stored, data.addEquipment(4, other));
  EXPECT_EQ(Text(L"TS16"), data.getEquipmentById(4)->texts[0]);
  data.addEquipment(-2, other);

  EXPECT_EQ(nullptr, std::as_const(data).getEquipmentById(5));
  std::vector<int> ids;
  for (auto it = data.getEquipmentBegin(); it != data.getEquipmentEnd(); ++it)
    ids.push_back(it->first);
  EXPECT_EQ((std::vector<int>{-2, 4}), ids);
}

TEST(DataObservationInfos, AreSharedWithTheDatasetTheyAreGiven) {
  auto info = std::make_shared<DexObservationInfo>();
  auto other = std::make_shared<DexObservationInfo>();
  {
    DexData data(DexSettings{});
    auto* const dataset = new DexDataset(L"a");
    data.addDataset(dataset);
    data.addObservationInfo(info, dataset);
    data.addObservationInfo(other, nullptr);

    EXPECT_EQ(info, dataset->getObservationInfo());
    EXPECT_EQ(2, data.getNumberOfObservationInfos());
    EXPECT_EQ(info, data.getObservationInfoAt(0));
    EXPECT_EQ(other, data.getObservationInfoAt(1));
    EXPECT_EQ(nullptr, data.getObservationInfoAt(2));
    EXPECT_EQ(nullptr, data.getObservationInfoAt(-1));
    EXPECT_EQ(3, info.use_count());
  }
  EXPECT_EQ(1, info.use_count());
  EXPECT_EQ(1, other.use_count());
}

TEST(DataExportedFiles, KeepEachNameOnceInOrder) {
  DexData data(DexSettings{});
  data.addFileNameToExported(L"/out/a.txt");
  data.addFileNameToExported(L"/out/b.txt");
  data.addFileNameToExported(L"/out/a.txt");
  data.addFileNameToExported(L"/out/A.txt");

  const auto& names = data.getExportedFileNames();
  ASSERT_EQ(3, names.GetSize());
  EXPECT_EQ(Text(L"/out/a.txt"), names[0]);
  EXPECT_EQ(Text(L"/out/b.txt"), names[1]);
  EXPECT_EQ(Text(L"/out/A.txt"), names[2]);

  data.clearExportedFileNames();
  EXPECT_EQ(0, data.getExportedFileNames().GetSize());
}

// ---- Numeric names ------------------------------------------------------------------------------------

TEST(DataNumericNames, WithoutAStoredHighestNameThePoolIsLeftAlone) {
  const DexData data(DexSettings{});
  ASSERT_EQ(-1, data.getSettings().maxNumericPointName);
  FreeNumericNames names;
  names.addObject(L"A");  // collecting: nothing may be handed out until init()
  dex_test::LogCapture log;
  data.getMaxNumericPointName(names);
  EXPECT_EQ(0, names.getFirstAvailableNumber());  // still collecting: init() was not called
  EXPECT_EQ(1, names.getObjectsToRename());
}

TEST(DataNumericNames, AStoredHighestNameIsUsedAndThePoolInitialized) {
  DexSettings settings;
  settings.maxNumericPointName = 41;
  const DexData data(settings);
  FreeNumericNames names;
  names.addObject(L"7");
  data.getMaxNumericPointName(names);
  EXPECT_EQ(42, names.getFirstAvailableNumber());
  EXPECT_EQ(Text(L"42"), names.getNameFor(L"X"));
}

TEST(DataNumericNames, StoresOneBelowTheFirstAvailableNumber) {
  DexData data(DexSettings{});
  FreeNumericNames names;
  names.addObject(10);
  names.addObject(L"SIGN");
  names.init();
  data.setMaxNumericPointName(names);
  EXPECT_EQ(10, data.getSettings().maxNumericPointName);

  FreeNumericNames again;
  data.getMaxNumericPointName(again);
  EXPECT_EQ(11, again.getFirstAvailableNumber());
}

// ---- Formatting ---------------------------------------------------------------------------------------

TEST(DataFormatting, PlaneCoordinatesUseTheDecimalsOfTheirIndexAndTheUnitGiven) {
  DexSettings settings;
  settings.coordDecimals = {2, 3, 1};
  DexData data(settings);
  data.addDataset(new DexDataset(L"grid"));

  EXPECT_EQ(Text(L"1234.57"), data.formatCoordToDefinedStyle(0, 1234.5678, vyn::ie::METERS));
  EXPECT_EQ(Text(L"1234.568"), data.formatCoordToDefinedStyle(1, 1234.5678, vyn::ie::METERS));
  EXPECT_EQ(Text(L"1234.6"), data.formatCoordToDefinedStyle(2, 1234.5678, vyn::ie::METERS));
  EXPECT_EQ(Text(L"1000.00"), data.formatCoordToDefinedStyle(0, 304.8, vyn::ie::IFEET));
}

TEST(DataFormatting, AnyUnitsMeansTheJobsDistanceUnit) {
  DexSettings settings;
  settings.coordDecimals = {3, 3, 3};
  DexData data(settings);
  data.addDataset(new DexDataset(L"grid"));
  EXPECT_EQ(Text(L"304.800"), data.formatCoordToDefinedStyle(0, 304.8, vyn::ie::ANY_UNITS));

  DexJobInfo jobInfo;
  jobInfo.setDistUnits(vyn::ie::IFEET);
  data.setJobInfo(jobInfo);
  EXPECT_EQ(Text(L"1000.000"), data.formatCoordToDefinedStyle(0, 304.8, vyn::ie::ANY_UNITS));
}

TEST(DataFormatting, GeographicLatitudeAndLongitudeUseTheCoordinateStyleButHeightStaysADistance) {
  DexSettings settings;
  settings.coordsStyle = vyn::ie::DECIMAL_DEGREES;
  settings.coordDecimals = {2, 2, 2};
  DexData data(settings);
  auto* const dataset = new DexDataset(L"geo");
  cs_utils::DexCoordinateSystemInfo geographic;
  geographic.kind = cs_utils::DexCoordinateSystemInfo::kGeographicKind;
  dataset->setCoordinateSystem(geographic);
  data.addDataset(dataset);

  EXPECT_EQ(Text(L"12.5000000000"), data.formatCoordToDefinedStyle(0, 12.5, vyn::ie::METERS));
  EXPECT_EQ(Text(L"-48.2500000000"), data.formatCoordToDefinedStyle(1, -48.25, vyn::ie::IFEET));
  EXPECT_EQ(Text(L"310.25"), data.formatCoordToDefinedStyle(2, 310.25, vyn::ie::METERS));

  data.setSettings([] {
    DexSettings packed;
    packed.coordsStyle = vyn::ie::PACKED_DMS;
    return packed;
  }());
  EXPECT_EQ(vyn::ie::utils::coordsByStyleToString(vyn::ie::PACKED_DMS, 12.5, 10, vyn::ie::SIGNED_NUMBER),
            data.formatCoordToDefinedStyle(0, 12.5, vyn::ie::METERS));
  EXPECT_EQ(Text(L"12.3000000000"), data.formatCoordToDefinedStyle(0, 12.5, vyn::ie::METERS));
}

TEST(DataFormatting, AnIndexOutsideTheThreeCoordinatesGivesAnEmptyText) {
  DexData data(DexSettings{});
  data.addDataset(new DexDataset(L"grid"));
  EXPECT_TRUE(data.formatCoordToDefinedStyle(3, 1.0, vyn::ie::METERS).IsEmpty());
  EXPECT_TRUE(data.formatCoordToDefinedStyle(-1, 1.0, vyn::ie::METERS).IsEmpty());
}

// ---- Preparing one file per dataset -------------------------------------------------------------------

// A data whose code library holds A, B and C (C used by no object) and one dataset "Job" with
// properties (extra value 7): 1 {A}, 2 {B}, 3 {A, B}, 4 without code, 5 {A}.
class DataPrepare : public ::testing::Test {
 protected:
  DataPrepare() : data_(settingsWith({vyn::ie::POINTS})) {
    a_ = new DexCodeDescription(L"A");
    b_ = new DexCodeDescription(L"B");
    data_.addCodeToIEDataDictionary(b_);
    data_.addCodeToIEDataDictionary(new DexCodeDescription(L"C"));
    data_.addCodeToIEDataDictionary(a_);
    job_ = new Recorded<DexDataset>(deleted_, "Job", L"Job");
    job_->getDatasetProperties()->setExtraValue(0, 7);
    job_->add(pointWithCodes(L"1", {a_}));
    job_->add(pointWithCodes(L"2", {b_}));
    job_->add(pointWithCodes(L"3", {a_, b_}));
    job_->add(pointWithCodes(L"4"));
    job_->add(pointWithCodes(L"5", {a_}));
    data_.addDataset(job_);
  }

  DeletionLog deleted_;
  DexData data_;
  DexCodeDescription* a_ = nullptr;
  DexCodeDescription* b_ = nullptr;
  DexDataset* job_ = nullptr;
};

TEST_F(DataPrepare, SplitsADatasetIntoOnePerUsedCodeAndOneForObjectsWithoutCode) {
  EXPECT_TRUE(data_.prepareDatasetsForMultipleFilesExport(true));

  EXPECT_EQ(DeletionLog{"Job"}, deleted_);
  ASSERT_EQ((std::vector<std::wstring>{L"A", L"B", L"Job"}), datasetNamesOf(data_));
  const DexDataset& a = *data_.getDatasetAt(0);
  const DexDataset& b = *data_.getDatasetAt(1);
  const DexDataset& rest = *data_.getDatasetAt(2);
  EXPECT_EQ((std::vector<std::wstring>{L"1", L"3", L"5"}), objectNamesOf(a));
  EXPECT_EQ((std::vector<std::wstring>{L"A", L"A", L"A"}), codeNamesOf(a));
  EXPECT_EQ((std::vector<std::wstring>{L"2", L"3"}), objectNamesOf(b));
  EXPECT_EQ((std::vector<std::wstring>{L"B", L"B"}), codeNamesOf(b));
  EXPECT_EQ((std::vector<std::wstring>{L"4"}), objectNamesOf(rest));
  EXPECT_EQ((std::vector<std::wstring>{L""}), codeNamesOf(rest));
  EXPECT_EQ(6, data_.getNumberOfObjectsInAllDatasets());
}

TEST_F(DataPrepare, EachNewDatasetGetsItsOwnCopyOfTheDatasetProperties) {
  ASSERT_TRUE(data_.prepareDatasetsForMultipleFilesExport(true));
  std::vector<const DexDatasetProperties*> seen;
  for (int i = 0; i < data_.getNumberOfDatasets(); ++i) {
    const DexDatasetProperties* const properties =
        std::as_const(*data_.getDatasetAt(i)).getDatasetProperties();
    ASSERT_NE(nullptr, properties);
    EXPECT_EQ(7, properties->getExtraValue(0));
    for (const DexDatasetProperties* const other : seen)
      EXPECT_NE(other, properties);
    seen.push_back(properties);
  }
}

TEST_F(DataPrepare, NewDatasetsKeepTheCoordinateSystemAndObservationInfo) {
  cs_utils::DexCoordinateSystemInfo geographic;
  geographic.kind = cs_utils::DexCoordinateSystemInfo::kGeographicKind;
  job_->setCoordinateSystem(geographic);
  const auto info = job_->getObservationInfo();

  ASSERT_TRUE(data_.prepareDatasetsForMultipleFilesExport(true));
  for (int i = 0; i < data_.getNumberOfDatasets(); ++i) {
    EXPECT_EQ(cs_utils::DexCoordinateSystemInfo::kGeographicKind,
              data_.getDatasetAt(i)->getCoordinateSystem().kind);
    EXPECT_EQ(info, data_.getDatasetAt(i)->getObservationInfo());
  }
}

TEST_F(DataPrepare, AnswersFalseAndChangesNothingWhenTheFormatWritesOneFile) {
  EXPECT_FALSE(data_.prepareDatasetsForMultipleFilesExport(false));
  EXPECT_TRUE(deleted_.empty());
  EXPECT_EQ(job_, data_.getDatasetAt(0));
  EXPECT_EQ(1, data_.getNumberOfDatasets());
}

TEST_F(DataPrepare, AnswersFalseWhenNoPointLineOrAreaKindIsRequested) {
  data_.setSettings(settingsWith({vyn::ie::CODES, vyn::ie::SURFACES, vyn::ie::RAW_DATA, vyn::ie::MULTIPLE}));
  EXPECT_FALSE(data_.prepareDatasetsForMultipleFilesExport(true));
  EXPECT_EQ(job_, data_.getDatasetAt(0));
  EXPECT_TRUE(deleted_.empty());
}

TEST(DataPrepareKinds, EachOfPointsPointListsLinesAndAreasAllowsTheSplit) {
  for (const EDexDataType kind : {vyn::ie::POINTS, vyn::ie::POINT_LISTS, vyn::ie::LINES, vyn::ie::AREAS}) {
    DexData data(settingsWith({kind}));
    data.addDataset(new DexDataset(L"plain"));
    EXPECT_TRUE(data.prepareDatasetsForMultipleFilesExport(true)) << kind;
  }
}

TEST(DataPrepareKinds, AnswersFalseWithoutDatasets) {
  DexData data(settingsWith({vyn::ie::POINTS}));
  EXPECT_FALSE(data.prepareDatasetsForMultipleFilesExport(true));
  EXPECT_EQ(0, data.getNumberOfDatasets());
}

TEST(DataPrepareKinds, DatasetsWithoutObjectsOrCodesStayAsTheyAre) {
  DexData data(settingsWith({vyn::ie::LINES}));
  auto* const empty = new DexDataset(L"empty");
  auto* const plain = new DexDataset(L"plain");
  plain->add(pointWithCodes(L"1"));
  data.addDataset(empty);
  data.addDataset(plain);

  EXPECT_TRUE(data.prepareDatasetsForMultipleFilesExport(true));
  EXPECT_EQ(empty, data.getDatasetAt(0));
  EXPECT_EQ(plain, data.getDatasetAt(1));
  EXPECT_EQ(2, data.getNumberOfDatasets());
}

TEST(DataPrepareKinds, OnlyTheDatasetsPresentAtTheStartAreSplitAndNewOnesGoToTheEnd) {
  DexData data(settingsWith({vyn::ie::AREAS}));
  auto* const fence = new DexCodeDescription(L"FENCE");
  data.addCodeToIEDataDictionary(fence);
  auto* const coded = new DexDataset(L"coded");
  coded->add(pointWithCodes(L"1", {fence}));
  auto* const plain = new DexDataset(L"plain");
  plain->add(pointWithCodes(L"2"));
  data.addDataset(coded);
  data.addDataset(plain);

  EXPECT_TRUE(data.prepareDatasetsForMultipleFilesExport(true));
  EXPECT_EQ((std::vector<std::wstring>{L"plain", L"FENCE"}), datasetNamesOf(data));
  EXPECT_EQ(plain, data.getDatasetAt(0));
}

TEST(DataPrepareKinds, ObjectsWithCodesTheLibraryDoesNotDescribeAreDropped) {
  DexData data(settingsWith({vyn::ie::POINTS}));
  DexCodeDescription unknown(L"UNKNOWN");
  data.addDataset(new DexDataset(L"kept"));
  auto* const coded = new DexDataset(L"coded");
  coded->add(pointWithCodes(L"1", {&unknown}));
  data.addDataset(coded);
  data.setCurDataset(1);

  EXPECT_TRUE(data.prepareDatasetsForMultipleFilesExport(true));
  EXPECT_EQ((std::vector<std::wstring>{L"kept"}), datasetNamesOf(data));

  // The current index now lies past the list: the const getter says so, the other falls back to 0.
  dex_test::LogCapture log;
  EXPECT_EQ(nullptr, std::as_const(data).getCurDataset());
  EXPECT_EQ(1, log.count(kDataLogSource, DexData::kLogLineNoCurrentDataset));
  EXPECT_EQ(Text(L"kept"), data.getCurDataset()->getName());
  EXPECT_EQ(0, data.getCurDatasetId());
}

// ---- Ownership and destruction ------------------------------------------------------------------------

TEST(DataOwnership, DestructionDeletesMembersInTheirFixedOrder) {
  DeletionLog deleted;
  {
    DexData data(DexSettings{});
    data.addGpsAntenna(new Recorded<DexGpsAntennaSettings>(deleted, "antenna"));
    data.attachIEStaEquationSetDictionary(new Recorded<DexStaEquationSetDictionary>(deleted, "sets"));
    data.attachIEAlignmentPartsDictionary(new Recorded<DexAlignmentPartsDictionary>(deleted, "parts"));
    data.attachIELayers(new Recorded<DexDrawDictionary>(deleted, "layers"));
    data.attachIELocalization(new Recorded<DexLocalization>(deleted, "localization"));
    data.attachIERoadTemplatesDictionary(
        new Recorded<DexRoadTemplatesDictionary>(deleted, "templates", false, false));
    data.attachIEDataDictionary(new Recorded<DexDataDictionary>(deleted, "codes"));
    data.addDataset(new Recorded<DexDataset>(deleted, "dataset", L"1"));
    data.addObservationInfo(std::make_shared<Recorded<DexObservationInfo>>(deleted, "observation info"),
                            nullptr);
    EXPECT_TRUE(deleted.empty());
  }
  EXPECT_EQ((DeletionLog{"dataset", "codes", "templates", "localization", "layers", "parts", "sets",
                         "antenna", "observation info"}),
            deleted);
}

TEST(DataOwnership, ReleasesEveryKindOfMember) {
  DexData data(settingsWith({vyn::ie::POINTS}));
  auto* const fence = new DexCodeDescription(L"FENCE");
  data.addCodeToIEDataDictionary(fence);
  DexDataset* const current = data.getCurDataset();
  current->add(pointWithCodes(L"1", {fence}));
  data.getIEDrawDictionary()->addLayer(new DexLayer());
  data.addIERoadTemplateToDictionary(new DexRoadTemplate(L"crown"));
  data.addIEAlignmentPartToDictionary(new Part(IDexAlignmentPart::CROSS_SECTION_SET, L"X"));
  EXPECT_TRUE(data.addIEStaEquationSetToDictionary(newSet(L"main", 1.0)));
  data.attachIELocalization(new DexLocalization());
  data.addDLRun(new DexDLRun(L"R1", L""));
  data.addGpsAntenna(new DexGpsAntennaSettings());
  data.addEquipment(1, DexRawDataEquipment());
  data.addObservationInfo(std::make_shared<DexObservationInfo>(), current);
  data.addFileNameToExported(L"/out/job.txt");
  EXPECT_EQ(1, data.getNumberOfObjectsInAllDatasets());
  // The sanitizer run reports anything left behind.
}

}  // namespace
