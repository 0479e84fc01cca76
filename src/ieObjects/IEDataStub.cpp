// TEMPORARY STUB: stands in for the container until it lands.
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
namespace vyn::ie {
std::atomic<bool> DexData::stopProcess_{false};
DexData::DexData(const DexSettings& s) : settings_(s) {}
DexData::~DexData() {
  for (auto* d : datasets_)
    delete d;
  delete dictionary_;
}
bool DexData::addDataset(DexDataset* d) {
  if (!d) return false;
  for (auto* e : datasets_)
    if (e == d) return true;
  datasets_.push_back(d);
  return true;
}
DexDataset* DexData::getDatasetAt(int i) const {
  return i >= 0 && i < getNumberOfDatasets() ? datasets_[i] : nullptr;
}
void DexData::setCurDataset(int i) {
  if (i >= 0 && i < getNumberOfDatasets()) cur_ = i;
}
DexDataset* DexData::getCurDataset() {
  if (cur_ >= getNumberOfDatasets()) cur_ = 0;
  if (datasets_.empty()) addDataset(new DexDataset(L"STOPGAP"));
  return datasets_[cur_];
}
const DexDataset* DexData::getCurDataset() const {
  return cur_ < getNumberOfDatasets() ? datasets_[cur_] : nullptr;
}
DexDataDictionary* DexData::getIEDataDictionary() {
  if (!dictionary_) dictionary_ = new DexDataDictionary();
  return dictionary_;
}
bool DexData::addCodeToIEDataDictionary(DexCodeDescription* d) {
  if (!d) return false;
  if (getIEDataDictionary()->findCodeDiscription(d->getName())) return false;
  return getIEDataDictionary()->addCodeDescription(d);
}
void DexData::addFileNameToExported(const CVynStringT<wchar_t>& n) {
  for (auto& e : exported_)
    if (e == n) return;
  exported_.Add(n);
}
bool DexData::prepareDatasetsForMultipleFilesExport(bool multipleFiles) {
  if (datasets_.empty() || !multipleFiles) return false;
  if (!settings_.hasDataType(POINTS) && !settings_.hasDataType(POINT_LISTS) &&
      !settings_.hasDataType(LINES) && !settings_.hasDataType(AREAS))
    return false;
  const std::vector<DexDataset*> copy = datasets_;
  for (DexDataset* source : copy) {
    if (source->getNumberOfElements(-1, 2, false, false) <= 0 || !source->isCodesExist()) continue;
    DexDataDictionary* dict = getIEDataDictionary();
    dict->reset();
    while (const DexCodeDescription* d = dict->getNextCodeDescription()) {
      if (!source->isCodeDefinitionUsed(d)) continue;
      auto* ds = new DexDataset(d->getName());
      source->copyIEObjectsWithTheCodeToTheNewDataset(ds, d->getName());
      addDataset(ds);
    }
    if (source->isObjectWithoutCodes()) {
      auto* ds = new DexDataset(source->getName());
      for (int i = 0; i < source->getNumberOfElements(-1, 2); ++i) {
        const DexObject* o = source->getObjectAt(i);
        if (o && o->getNumberOfCodes() == 0) ds->add(o->clone());
      }
      addDataset(ds);
    }
    for (std::size_t k = 0; k < datasets_.size(); ++k)
      if (datasets_[k] == source) {
        datasets_.erase(datasets_.begin() + static_cast<long>(k));
        break;
      }
    delete source;
  }
  return true;
}
DexDataset::DexDataset(const CVynStringT<wchar_t>& n, int, bool) : name_(n) {}
DexDataset::~DexDataset() {
  for (auto* o : objects_)
    delete o;
}
bool DexDataset::add(DexObject* o) {
  if (!o) return false;
  if (o->getNumberOfCodes() > 0)
    codes_ = true;
  else
    noCodes_ = true;
  objects_.push_back(o);
  return true;
}
DexObject* DexDataset::getObjectAt(int i) noexcept {
  return i >= 0 && i < static_cast<int>(objects_.size()) ? objects_[i] : nullptr;
}
const DexObject* DexDataset::getObjectAt(int i) const noexcept {
  return i >= 0 && i < static_cast<int>(objects_.size()) ? objects_[i] : nullptr;
}
int DexDataset::getNumberOfElements(int, int, bool, bool) const {
  return static_cast<int>(objects_.size());
}
bool DexDataset::isCodeDefinitionUsed(const DexCodeDescription* d) const {
  for (auto* o : objects_)
    if (o->findCode(d->getName())) return true;
  return false;
}
void DexDataset::copyIEObjectsWithTheCodeToTheNewDataset(DexDataset* t,
                                                         const CVynStringT<wchar_t>& code) const {
  for (auto* o : objects_)
    if (o->findCode(code)) t->add(o->clone());
}
}  // namespace vyn::ie
