#include "GsiExporter.h"

#include <algorithm>

#include "GsiWords.h"
#include "GsiWriter.h"
#include "hostlibs/VynLogging.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPoints.h"

namespace vyn::ie::gsi {

namespace {

constexpr int kPointsPerStep = 16384;
constexpr const char* kLineEnd = "\r\n";

EVariant variantOf(const DexFormat* format) {
  return format != nullptr && format->isIdEqual(kGsi16FormatId) ? EVariant::GSI16 : EVariant::GSI8;
}

}  // namespace

GsiExporter::GsiExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
    : DexExporterImpl(data, fileName, format) {}

GsiExporter::~GsiExporter() {
  if (file_ != nullptr) std::fclose(file_);
}

int GsiExporter::getNumberOfSteps() {
  return 2 + (objectCount_ + kPointsPerStep - 1) / kPointsPerStep;
}

bool GsiExporter::singleStep() {
  if (currentStep < 0) {
    if (data == nullptr) return false;
    writer_ = std::make_unique<GsiLineWriter>(variantOf(format), data->getSettings());
    if (!checkPoints()) {
      ieResult = DEX_RESULT_WRONG_FORMAT;
      currentStep = 0;
      return false;
    }
    if (!open()) return false;
    currentStep = 0;
    return true;
  }
  bool more = true;
  if (nextObject_ < objectCount_) {
    if (!writeBlock()) {
      ieResult = DEX_RESULT_FILE_ERROR;
      more = false;
    }
  } else {
    if (!close()) ieResult = DEX_RESULT_FILE_ERROR;
    more = false;
  }
  ++currentStep;
  return more;
}

bool GsiExporter::checkPoints() {
  const DexSettings& settings = data->getSettings();
  if (!settings.hasDataType(POINTS) && !settings.hasDataType(POINT_LISTS)) return true;
  if (data->getNumberOfDatasets() == 0) return true;
  dataset_ = data->getCurDataset();
  objectCount_ =
      dataset_ == nullptr ? 0 : dataset_->getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE);
  int block = 0;
  for (int i = 0; i < objectCount_; ++i) {
    const auto* point = dynamic_cast<const DexDesignPoint*>(dataset_->getObjectAt(i));
    if (point == nullptr || writer_->write(*point, ++block, line_)) continue;
    VYN_TRACE_ALWAYS(L"%ls: %ls; nothing is written", fileName.GetString(), writer_->problem().c_str());
    return false;
  }
  return true;
}

bool GsiExporter::open() {
  const DexSettings& settings = data->getSettings();
  if (!utils::isExportFileWithSameName(fileName, settings.messageBox, settings.parentWindow)) return false;
  file_ = std::fopen(vyn_text::toUtf8(fileName.view()).c_str(), "wb");
  if (file_ == nullptr) return false;
  data->addFileNameToExported(fileName);
  return true;
}

bool GsiExporter::writeBlock() {
  bytes_.clear();
  const int end = std::min(objectCount_, nextObject_ + kPointsPerStep);
  for (; nextObject_ < end; ++nextObject_) {
    const auto* point = dynamic_cast<const DexDesignPoint*>(dataset_->getObjectAt(nextObject_));
    if (point == nullptr) continue;
    writer_->write(*point, ++block_, line_);  // every point was checked before the file was opened
    (bytes_ += line_) += kLineEnd;
  }
  return std::fwrite(bytes_.data(), 1, bytes_.size(), file_) == bytes_.size();
}

bool GsiExporter::close() {
  const bool closed = std::fclose(file_) == 0;
  file_ = nullptr;
  return closed;
}

}  // namespace vyn::ie::gsi
