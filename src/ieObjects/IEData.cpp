#include "ieObjects/IEData.h"

#include <memory>
#include <utility>
#include <vector>

#include "hostlibs/VynLogging.h"
#include "ieDefinitions/IEDataType.h"
#include "ieObjects/IEObjectBase.h"
#include "ieObjects/IEObjectsType.h"
#include "ieUtils/IENaturalNames.h"
#include "ieUtils/IEUtilsCoords.h"
#include "ieUtils/IEUtilsFiles.h"

namespace vyn::ie {

namespace {

constexpr const wchar_t* kDataLogSource = L"ieObjects\\IEData";
constexpr const wchar_t* kStopgapDatasetName = L"STOPGAP";
// Geographic coordinates are written with this precision whatever the settings' decimals.
constexpr int kGeographicPrecision = 10;
constexpr TCoordInd kHeightIndex = 2;
constexpr TCoordInd kNumberOfCoordIndexes = 3;

// The object count every dataset answers for "all objects, whatever their state".
int numberOfObjectsIn(const DexDataset& dataset) {
  return dataset.getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE, false, false);
}

// Whether the settings ask for any data kind that a split by code can separate.
bool requestsCodedData(const DexSettings& settings) {
  return settings.hasDataType(POINTS) || settings.hasDataType(POINT_LISTS) || settings.hasDataType(LINES) ||
         settings.hasDataType(AREAS);
}

// The dictionary held by holder, made (empty) when there is none. Null only when it cannot be made.
template <class T>
T* madeOnDemand(DexOwnedPointer<T>& holder) {
  if (!holder) holder.reset(new T());
  return holder.get();
}

// Replaces what holder holds by object unless object is null (or held already, which reset() leaves).
template <class T>
void replaceUnlessNull(DexOwnedPointer<T>& holder, T* object) {
  if (object != nullptr) holder.reset(object);
}

// A new empty dataset named name that describes the same data as source: a copy of its dataset
// properties, its coordinate system and its (shared) observation information. Null when it cannot be
// made.
std::unique_ptr<DexDataset> newDatasetLike(const DexDataset& source, const CVynStringT<wchar_t>& name) {
  std::unique_ptr<DexDataset> dataset(new DexDataset(name, 0, false));
  if (dataset == nullptr) return nullptr;
  if (const DexDatasetProperties* const properties = source.getDatasetProperties()) {
    dataset->setIEDatasetProperties(new DexDatasetProperties(*properties));
  }
  dataset->setCoordinateSystem(source.getCoordinateSystem());
  dataset->setObservationInfo(source.getObservationInfo());
  return dataset;
}

// Adds to target a copy of every object of source that carries no code.
void copyObjectsWithoutCodes(const DexDataset& source, DexDataset& target) {
  const int count = numberOfObjectsIn(source);
  for (int i = 0; i < count; ++i) {
    const DexObject* const object = source.getObjectAt(i);
    if (object != nullptr && object->getNumberOfCodes() == 0) target.add(object->clone());
  }
}

// Whether dictionary holds part in the list of its kind.
bool holdsPart(const DexAlignmentPartsDictionary& dictionary, const IDexAlignmentPart& part) {
  const int kind = part.getType();
  if (kind < 0 || kind >= IDexAlignmentPart::kNumberOfPartTypes) return false;
  const int count = dictionary.getNumberOfElements(kind);
  for (int i = 0; i < count; ++i) {
    if (dictionary.getAlignmentPartAt(kind, i) == &part) return true;
  }
  return false;
}

bool holdsSet(const DexStaEquationSetDictionary& dictionary, const DexStaEquationSet& set) {
  const int count = dictionary.getNumberOfElements();
  for (int i = 0; i < count; ++i) {
    if (dictionary.getStaEquationSetAt(i) == &set) return true;
  }
  return false;
}

}  // namespace

std::atomic<bool> DexData::stopProcess_{false};

DexData::DexData(const DexSettings& settings) : settings_(settings) {}

// The members are declared so that their own destruction follows the documented order.
DexData::~DexData() = default;

// ---- Datasets -------------------------------------------------------------------------------------

bool DexData::addDataset(DexDataset* dataset) {
  if (dataset == nullptr) return false;
  if (datasets_.indexOf(dataset) >= 0) return true;
  return datasets_.add(dataset);
}

DexDataset* DexData::getDatasetAt(int index) const noexcept {
  return const_cast<DexDataset*>(datasets_.at(index));
}

void DexData::setCurDataset(int index) noexcept {
  if (index >= 0 && index < getNumberOfDatasets()) curDatasetId_ = index;
}

DexDataset* DexData::getCurDataset() {
  if (curDatasetId_ >= getNumberOfDatasets()) curDatasetId_ = 0;
  if (datasets_.isEmpty()) addDataset(new DexDataset(kStopgapDatasetName, 0, false));
  return datasets_.at(curDatasetId_);
}

const DexDataset* DexData::getCurDataset() const {
  const DexDataset* const dataset = datasets_.at(curDatasetId_);
  if (dataset == nullptr) vyn_logging::vyn_err_log(kDataLogSource, kLogLineNoCurrentDataset);
  return dataset;
}

int DexData::getNumberOfObjectsInAllDatasets() const {
  int count = 0;
  for (const DexDataset* const dataset : datasets_)
    count += numberOfObjectsIn(*dataset);
  return count;
}

const cs_utils::DexCoordinateSystemInfo& DexData::getCoordinateSystem() const {
  static const cs_utils::DexCoordinateSystemInfo defaultSystem;
  const DexDataset* const dataset = getCurDataset();
  return dataset != nullptr ? dataset->getCoordinateSystem() : defaultSystem;
}

std::shared_ptr<DexObservationInfo> DexData::getCurObservationInfo() const {
  const DexDataset* const dataset = getCurDataset();
  return dataset != nullptr ? dataset->getObservationInfo() : nullptr;
}

bool DexData::prepareDatasetsForMultipleFilesExport(bool multipleFiles) {
  if (datasets_.isEmpty() || !multipleFiles || !requestsCodedData(settings_)) return false;
  // The walk covers the datasets present at the start; the split appends to the list it walks.
  std::vector<DexDataset*> sources;
  sources.reserve(static_cast<std::size_t>(datasets_.count()));
  for (DexDataset* const dataset : datasets_)
    sources.push_back(dataset);
  for (DexDataset* const source : sources) {
    if (numberOfObjectsIn(*source) > 0 && source->isCodesExist()) splitDatasetByCodes(source);
  }
  return true;
}

void DexData::splitDatasetByCodes(DexDataset* source) {
  if (const DexDataDictionary* const dictionary = dataDictionary_.get()) {
    dictionary->reset();
    while (const DexCodeDescription* const description = dictionary->getNextCodeDescription()) {
      if (!source->isCodeDefinitionUsed(description)) continue;
      std::unique_ptr<DexDataset> part = newDatasetLike(*source, description->getName());
      if (part == nullptr) continue;
      source->copyIEObjectsWithTheCodeToTheNewDataset(part.get(), description->getName());
      addDataset(part.release());
    }
  }
  if (source->isObjectWithoutCodes()) {
    std::unique_ptr<DexDataset> rest = newDatasetLike(*source, source->getName());
    if (rest != nullptr) {
      copyObjectsWithoutCodes(*source, *rest);
      addDataset(rest.release());
    }
  }
  datasets_.remove(datasets_.indexOf(source));
}

// ---- Dictionaries -----------------------------------------------------------------------------------

DexDataDictionary* DexData::getIEDataDictionary() {
  return madeOnDemand(dataDictionary_);
}

DexDrawDictionary* DexData::getIEDrawDictionary() {
  return madeOnDemand(drawDictionary_);
}

DexAlignmentPartsDictionary* DexData::getIEAlignmentPartsDictionary() {
  return madeOnDemand(alignmentParts_);
}

DexStaEquationSetDictionary* DexData::getIEStaEquationSetDictionary() {
  return madeOnDemand(staEquationSets_);
}

void DexData::attachIEDataDictionary(DexDataDictionary* dictionary) {
  replaceUnlessNull(dataDictionary_, dictionary);
}

void DexData::attachIERoadTemplatesDictionary(DexRoadTemplatesDictionary* dictionary) {
  replaceUnlessNull(roadTemplates_, dictionary);
}

void DexData::attachIEAlignmentPartsDictionary(DexAlignmentPartsDictionary* dictionary) {
  replaceUnlessNull(alignmentParts_, dictionary);
}

void DexData::attachIELayers(DexDrawDictionary* dictionary) {
  replaceUnlessNull(drawDictionary_, dictionary);
}

void DexData::attachIEStaEquationSetDictionary(DexStaEquationSetDictionary* dictionary) {
  staEquationSets_.reset(dictionary);
}

bool DexData::addCodeToIEDataDictionary(DexCodeDescription* description) {
  if (description == nullptr) return false;
  DexDataDictionary* const dictionary = getIEDataDictionary();
  // The dictionary itself declines a second description of a name and accepts one it holds.
  return dictionary != nullptr && dictionary->addCodeDescription(description);
}

bool DexData::addIERoadTemplateToDictionary(DexRoadTemplate* roadTemplate) {
  if (roadTemplate == nullptr) return false;
  if (!roadTemplates_) roadTemplates_.reset(new DexRoadTemplatesDictionary(false, false));
  DexRoadTemplatesDictionary* const dictionary = roadTemplates_.get();
  return dictionary != nullptr && dictionary->addRoadTemplate(roadTemplate);
}

bool DexData::addIEAlignmentPartToDictionary(IDexAlignmentPart* part) {
  if (part == nullptr) return false;
  DexAlignmentPartsDictionary* const dictionary = getIEAlignmentPartsDictionary();
  if (dictionary == nullptr) return false;
  if (holdsPart(*dictionary, *part)) return true;
  const int kind = part->getType();
  const bool validKind = kind >= 0 && kind < IDexAlignmentPart::kNumberOfPartTypes;
  if (validKind && dictionary->findAlignmentPart(kind, part->getName()) != nullptr) return false;
  return dictionary->addAlignmentPart(part);
}

bool DexData::addIEStaEquationSetToDictionary(DexStaEquationSet* set) {
  if (set == nullptr) return false;
  DexStaEquationSetDictionary* const dictionary = getIEStaEquationSetDictionary();
  if (dictionary == nullptr) return false;
  if (holdsSet(*dictionary, *set)) return true;
  if (dictionary->findStaEquationSet(set->getName()) != nullptr) return false;
  return dictionary->addStaEquationSet(set);
}

// ---- Localization -----------------------------------------------------------------------------------

void DexData::attachIELocalization(DexLocalization* localization) {
  replaceUnlessNull(localization_, localization);
}

void DexData::attachLocalizationPointCodes(const CVynStringT<wchar_t>& pointName,
                                           const DexCodesDataInterface* codes) {
  if (localization_) localization_.get()->addPointCodes(pointName, codes);
}

void DexData::setLocalizationMode(EDexLocalizationMethod method, EDexLocalizationPoint point) {
  DexLocalization* const localization = localization_.get();
  if (localization == nullptr) return;
  localization->setData(DexLocalization::PARAM_METHOD, static_cast<double>(method));
  localization->setData(DexLocalization::PARAM_POINT, static_cast<double>(point));
}

// ---- Raw-data side tables -----------------------------------------------------------------------------

bool DexData::addDLRun(DexDLRun* run) {
  return run != nullptr && dlRuns_.add(run->name, run);
}

bool DexData::addGpsAntenna(DexGpsAntennaSettings* antenna) {
  if (antenna == nullptr) return false;
  if (gpsAntennas_.indexOf(antenna) >= 0) return true;
  return gpsAntennas_.add(antenna);
}

DexGpsAntennaSettings* DexData::findGpsAntenna(const CVynStringT<wchar_t>& name) {
  return const_cast<DexGpsAntennaSettings*>(std::as_const(*this).findGpsAntenna(name));
}

const DexGpsAntennaSettings* DexData::findGpsAntenna(const CVynStringT<wchar_t>& name) const {
  return gpsAntennas_.findFirst(
      [&name](const DexGpsAntennaSettings& antenna) { return antenna.name.Compare(name) == 0; });
}

DexRawDataEquipment* DexData::addEquipment(int id, const DexRawDataEquipment& equipment) {
  return &equipment_.try_emplace(id, equipment).first->second;
}

DexRawDataEquipment* DexData::getEquipmentById(int id) noexcept {
  return const_cast<DexRawDataEquipment*>(std::as_const(*this).getEquipmentById(id));
}

const DexRawDataEquipment* DexData::getEquipmentById(int id) const noexcept {
  const auto found = equipment_.find(id);
  return found != equipment_.end() ? &found->second : nullptr;
}

void DexData::addObservationInfo(std::shared_ptr<DexObservationInfo> info, DexDataset* dataset) {
  observationInfos_.push_back(info);
  if (dataset != nullptr) dataset->setObservationInfo(std::move(info));
}

std::shared_ptr<DexObservationInfo> DexData::getObservationInfoAt(int index) const {
  if (index < 0 || index >= getNumberOfObservationInfos()) return nullptr;
  return observationInfos_[static_cast<std::size_t>(index)];
}

void DexData::addFileNameToExported(const CVynStringT<wchar_t>& name) {
  if (!utils::isStringInStringArray(exportedFileNames_, name)) exportedFileNames_.Add(name);
}

// ---- Numeric names ------------------------------------------------------------------------------------

void DexData::getMaxNumericPointName(utils::FreeNumericNames& names) const {
  if (settings_.maxNumericPointName == -1) return;
  names.addObject(settings_.maxNumericPointName);
  names.init();
}

void DexData::setMaxNumericPointName(const utils::FreeNumericNames& names) {
  settings_.maxNumericPointName = names.getFirstAvailableNumber() - 1;
}

// ---- Formatting ---------------------------------------------------------------------------------------

CVynStringT<wchar_t> DexData::formatCoordToDefinedStyle(TCoordInd index, double value,
                                                        EDistUnits units) const {
  if (index < 0 || index >= kNumberOfCoordIndexes) return {};
  const bool geographic = getCoordinateSystem().kind == cs_utils::DexCoordinateSystemInfo::kGeographicKind;
  if (geographic && index != kHeightIndex) {
    return utils::coordsByStyleToString(settings_.coordsStyle, value, kGeographicPrecision, SIGNED_NUMBER);
  }
  const EDistUnits unitsToWrite = units == ANY_UNITS ? jobInfo_.getDistUnits() : units;
  return utils::distByStyleToString(unitsToWrite, value,
                                    settings_.coordDecimals[static_cast<std::size_t>(index)]);
}

}  // namespace vyn::ie
