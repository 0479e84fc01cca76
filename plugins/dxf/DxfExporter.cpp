#include "DxfExporter.h"

#include <algorithm>

#include "DxfEntityWriter.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"

namespace vyn::ie::dxf {

namespace {

constexpr int kObjectsPerStep = 16384;

}  // namespace

DxfExporter::DxfExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
    : DexExporterImpl(data, fileName, format) {}

DxfExporter::~DxfExporter() = default;

int DxfExporter::getNumberOfSteps() {
  return 3 + (objectCount_ + kObjectsPerStep - 1) / kObjectsPerStep + surfaceCount_;
}

bool DxfExporter::open() {
  if (data == nullptr) return false;
  const DexSettings& settings = data->getSettings();
  if (!utils::isExportFileWithSameName(fileName, settings.messageBox, settings.parentWindow)) return false;
  entities_ = std::make_unique<DxfEntityWriter>(*data);
  if (!entities_->begin(vyn_text::toUtf8(fileName.view()))) return false;
  data->addFileNameToExported(fileName);
  if (DexDataset* dataset = entities_->dataset(); dataset != nullptr) {
    objectCount_ = dataset->getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE);
    surfaceCount_ = entities_->writesSurfaces() ? dataset->getNumberOfSurfaces() : 0;
  }
  regionsWritten_ = !entities_->writesRegions();
  return entities_->flush();
}

bool DxfExporter::singleStep() {
  if (currentStep < 0) {
    if (!open()) return false;
    currentStep = 0;
    return true;
  }
  DexDataset* dataset = entities_->dataset();
  bool more = true;
  if (nextObject_ < objectCount_) {
    const int end = std::min(objectCount_, nextObject_ + kObjectsPerStep);
    for (; nextObject_ < end; ++nextObject_)
      entities_->writeObject(dataset->getObjectAt(nextObject_));
  } else if (!regionsWritten_) {
    for (int i = 0; i < dataset->getNumberOfRegions(); ++i)
      entities_->writeRegion(*dataset->getRegionAt(i));
    regionsWritten_ = true;
  } else if (nextSurface_ < surfaceCount_) {
    entities_->writeSurface(*dataset->getSurfaceAt(nextSurface_++));
  } else {
    if (!entities_->end()) ieResult = DEX_RESULT_FILE_ERROR;
    more = false;
  }
  if (more && !entities_->flush()) {
    ieResult = DEX_RESULT_FILE_ERROR;
    more = false;
  }
  ++currentStep;
  return more;
}

}  // namespace vyn::ie::dxf
