#include "ieUtils/IImporter.h"

#include <memory>
#include <utility>

#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieUtils/IELocalization.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IERunProgress.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/detail/RunCommon.h"
#include "ieUtils/detail/RunLog.h"

namespace vyn::ie {
namespace {

constexpr detail::RunLog kImportLog{detail::kImporterLogSource, detail::kImporterThrewLine,
                                    detail::kNoImportNotifierLine, detail::kImportNotifierThrewLine};

// The name of the dataset an import of object data gets when the container has none.
constexpr const wchar_t* kImportDatasetName = L"Import dataset";

// The kinds of data that live in datasets, in the order they are looked for.
constexpr EDexDataType kObjectDataTypes[] = {POINTS,        LINES,       AREAS,       PARCELS,
                                             ROADS,         SURFACES,    POINT_LISTS, ROAD_SURVEY,
                                             SCANNING_DATA, JOB_HISTORY, RAW_DATA,    MULTIPLE};

bool requestsObjectData(const DexSettings& settings) {
  for (const EDexDataType type : kObjectDataTypes) {
    if (settings.hasDataType(type)) return true;
  }
  return false;
}

void prepareImportDataset(DexData& data) {
  if (!requestsObjectData(data.getSettings()) || data.getNumberOfDatasets() > 0) return;
  if (DexDataset* const dataset = new DexDataset(kImportDatasetName, 0, false)) data.addDataset(dataset);
}

}  // namespace

IDexImporter::~IDexImporter() = default;

DexImporterImpl::DexImporterImpl(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
    : data(data), fileName(fileName), format(format) {
  if (data != nullptr) prepareImportDataset(*data);
}

DexImporterImpl::~DexImporterImpl() = default;

DexImporterImplWithLocalization::DexImporterImplWithLocalization(DexData* data,
                                                                 const CVynStringT<wchar_t>& fileName,
                                                                 const DexFormat* format)
    : DexImporterImpl(data, fileName, format) {}

DexImporterImplWithLocalization::~DexImporterImplWithLocalization() = default;

void DexImporterImplWithLocalization::addLocalizationPt(const DexLocalizationPoint& point) {
  const DexGpsPosition* const rawData = point.getRawData();
  const DexStation* const station = rawData != nullptr ? rawData->getPlaneStation() : nullptr;
  if (station == nullptr) return;
  localizationPoints.try_emplace(station->getName(), station->getX(), station->getY(), station->getZ());
}

bool DexImporterImplWithLocalization::isPointUsedInLocalization(const CVynStringT<wchar_t>& name,
                                                                const DexPosition3D& position) const {
  if (data == nullptr || std::as_const(*data).getIELocalization() == nullptr) return false;
  const auto found = localizationPoints.find(name);
  return found != localizationPoints.end() && found->second == position;
}

EDexResult ImportFunction(DexParserThreadParams* params) {
  if (params == nullptr) return DEX_RESULT_FAILED;
  const std::unique_ptr<DexParserThreadParams> block(params);
  const MakeImporterFunction makeImporter = detail::entryPointOf<MakeImporterFunction>(*block);

  EDexResult result = detail::checkRunParams(*block, makeImporter != nullptr);
  if (result == DEX_RESULT_OK) {
    block->data->getProgress().begin(DexRunProgress::IMPORT_RUN);
    result = detail::guardPluginCall(kImportLog, [&block, makeImporter] {
      const std::unique_ptr<IDexImporter> importer(makeImporter(block->data, block->fileName, block->format));
      return importer ? importer->doImport() : DEX_RESULT_NO_PARSER;
    });
  }
  if (block->ownThread) detail::tellNotifier(block->data, &DexSettings::importNotifier, result, kImportLog);
  return result;
}

unsigned ImportThreadFunction(void* params) {
  return static_cast<unsigned>(ImportFunction(static_cast<DexParserThreadParams*>(params)));
}

}  // namespace vyn::ie
