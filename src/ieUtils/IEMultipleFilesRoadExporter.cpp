#include "ieUtils/IEMultipleFilesRoadExporter.h"

#include "hostlibs/VynLogging.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IECrossSections.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/IEUtilsFiles.h"
#include "ieUtils/detail/RunLog.h"

namespace vyn::ie {

namespace {

using EPart = IDexAlignmentPart::EDexAlignmentPartType;

void closeStream(FILE*& stream) {
  if (stream == nullptr) return;
  std::fclose(stream);
  stream = nullptr;
}

template <class Part>
const Part* primaryPart(const DexAlignment& alignment, EPart kind) {
  return dynamic_cast<const Part*>(alignment.getAlignmentPart(kind));
}

}  // namespace

IDexMultipleFilesRoadExporter::IDexMultipleFilesRoadExporter(DexData* data,
                                                             const CVynStringT<wchar_t>& fileName,
                                                             const DexFormat* format)
    : DexExporterImpl(data, fileName, format) {
  currentStep = -1;
}

IDexMultipleFilesRoadExporter::~IDexMultipleFilesRoadExporter() {
  closeFiles();
}

int IDexMultipleFilesRoadExporter::numberOfParts(int kind) const {
  const DexAlignmentPartsDictionary* const dictionary =
      data != nullptr ? static_cast<const DexData*>(data)->getIEAlignmentPartsDictionary() : nullptr;
  return dictionary != nullptr ? dictionary->getNumberOfElements(kind) : 0;
}

int IDexMultipleFilesRoadExporter::getNumberOfSteps() {
  const DexSettings& settings = data->getSettings();
  if (settings.hasDataType(ROADS)) {
    const DexDataset* const dataset = data->getCurDataset();
    return (dataset != nullptr ? dataset->getNumberOfAlignments() : 0) + 1;
  }
  if (settings.hasDataType(H_ALIGNMENTS)) return numberOfParts(IDexAlignmentPart::HORIZONTAL_ALIGNMENT) + 1;
  if (settings.hasDataType(V_ALIGNMENTS)) return numberOfParts(IDexAlignmentPart::VERTICAL_ALIGNMENT) + 1;
  if (settings.hasDataType(X_SECTIONS)) return numberOfParts(IDexAlignmentPart::CROSS_SECTION_SET) + 1;
  vyn_logging::vyn_err_log(detail::kMultipleFilesRoadExporterLogSource, detail::kNoRoadDataTypeLine);
  return 1;
}

bool IDexMultipleFilesRoadExporter::singleStep() {
  ++currentStep;
  const DexSettings& settings = data->getSettings();
  const DexDataset* const dataset = data->getCurDataset();
  const int alignments = dataset != nullptr ? dataset->getNumberOfAlignments() : 0;
  DexAlignmentPartsDictionary* const dictionary = data->getIEAlignmentPartsDictionary();
  const auto partAt = [&](EPart kind) { return dictionary->getAlignmentPartAt(kind, currentStep); };
  bool result = false;
  if (settings.hasDataType(ROADS) && currentStep < alignments) {
    result = exportAlignment(currentStep);
  } else if (settings.hasDataType(H_ALIGNMENTS) &&
             currentStep < numberOfParts(IDexAlignmentPart::HORIZONTAL_ALIGNMENT)) {
    result = writeHAl(
        dynamic_cast<const DexHorizontalAlignment*>(partAt(IDexAlignmentPart::HORIZONTAL_ALIGNMENT)));
  } else if (settings.hasDataType(V_ALIGNMENTS) &&
             currentStep < numberOfParts(IDexAlignmentPart::VERTICAL_ALIGNMENT)) {
    result =
        writeVAl(dynamic_cast<const DexVerticalAlignment*>(partAt(IDexAlignmentPart::VERTICAL_ALIGNMENT)));
  } else if (settings.hasDataType(X_SECTIONS) &&
             currentStep < numberOfParts(IDexAlignmentPart::CROSS_SECTION_SET)) {
    result = writeXSect(dynamic_cast<const DexCrossSectionSet*>(partAt(IDexAlignmentPart::CROSS_SECTION_SET)),
                        nullptr);
  }
  closeFiles();
  return result;
}

bool IDexMultipleFilesRoadExporter::exportAlignment(int index) {
  const DexDataset* const dataset = data->getCurDataset();
  const DexAlignment* const alignment = dataset != nullptr ? dataset->getAlignmentAt(index) : nullptr;
  if (alignment == nullptr) return true;
  alignmentName = alignment->getName();
  const auto* const horizontal =
      primaryPart<DexHorizontalAlignment>(*alignment, IDexAlignmentPart::HORIZONTAL_ALIGNMENT);
  const auto* const vertical =
      primaryPart<DexVerticalAlignment>(*alignment, IDexAlignmentPart::VERTICAL_ALIGNMENT);
  const auto* const crossSections =
      primaryPart<DexCrossSectionSet>(*alignment, IDexAlignmentPart::CROSS_SECTION_SET);
  bool written = false;
  if (horizontal != nullptr) written = writeHAl(horizontal);
  if (vertical != nullptr && writeVAl(vertical)) written = true;
  if (crossSections != nullptr && writeXSect(crossSections, vertical)) written = true;
  return written;
}

bool IDexMultipleFilesRoadExporter::openPartFile(bool hasContent, const CVynStringT<wchar_t>& partName,
                                                 const CVynStringT<wchar_t>& extension, FILE*& stream) {
  if (!hasContent) return false;
  CVynStringT<wchar_t> path =
      utils::createFileName(fileName, alignmentName.IsEmpty() ? partName : alignmentName, true);
  path += extension;
  openFile(path, stream);
  if (stream == nullptr) ieResult = DEX_RESULT_FILE_ERROR;
  return stream != nullptr;
}

bool IDexMultipleFilesRoadExporter::openHAlFile(const DexHorizontalAlignment* horizontalAlignment,
                                                const CVynStringT<wchar_t>& extension) {
  if (horizontalAlignment == nullptr) return false;
  return openPartFile(horizontalAlignment->getNumberOfSegments() > 0, horizontalAlignment->getName(),
                      extension, hAlFile);
}

bool IDexMultipleFilesRoadExporter::openVAlFile(const DexVerticalAlignment* verticalAlignment,
                                                const CVynStringT<wchar_t>& extension) {
  if (verticalAlignment == nullptr) return false;
  return openPartFile(verticalAlignment->getNumberOfLongSections() > 0, verticalAlignment->getName(),
                      extension, vAlFile);
}

bool IDexMultipleFilesRoadExporter::openXSectFile(const DexCrossSectionSet* crossSectionSet,
                                                  const CVynStringT<wchar_t>& extension) {
  if (crossSectionSet == nullptr) return false;
  return openPartFile(crossSectionSet->getNumberOfCrossSections() > 0, crossSectionSet->getName(), extension,
                      xSectFile);
}

bool IDexMultipleFilesRoadExporter::openFile(const CVynStringT<wchar_t>& path, FILE*& stream) {
  const DexSettings& settings = data->getSettings();
  if (!utils::isExportFileWithSameName(path, settings.messageBox, settings.parentWindow))
    return stream != nullptr;
  // A stream opened before for this part would otherwise be lost.
  closeStream(stream);
  stream = std::fopen(vyn_text::toUtf8(path.view()).c_str(), "wb+");
  if (stream != nullptr) data->addFileNameToExported(path);
  return stream != nullptr;
}

void IDexMultipleFilesRoadExporter::closeFiles() {
  closeStream(hAlFile);
  closeStream(vAlFile);
  closeStream(xSectFile);
}

}  // namespace vyn::ie
