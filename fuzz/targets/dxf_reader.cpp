// The DXF importer on raw bytes, and the exporter on what it read. The first byte picks the data
// kinds (bits 0 to 3: points, lines, areas, surfaces) and the distance unit of the settings (bits 4
// to 6); the rest is the file. An import must answer one of its documented results; whatever it took
// into the model is exported, and that drawing must read back to the same objects, regions and
// triangles.

#include <cstddef>
#include <cstdint>

#include "dxf/DxfExporter.h"
#include "dxf/DxfImporter.h"
#include "dxf/DxfWords.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IESurface.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IExporter.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/PluginRun.h"
#include "support/ScratchFile.h"

namespace {

using namespace vyn::ie;

constexpr EDistUnits kUnits[] = {ANY_UNITS, METERS, IFEET, USFEET, MILLIMETERS, MILE, INCHES, KILOMETERS};

EDexResult run(DexData& data, const std::wstring& path, bool exportRun) {
  return dex_fuzz::runParser<dxf::DxfImporter, dxf::DxfExporter>(data, path, dxf::kDxfFormatId, exportRun);
}

struct Content {
  int objects = 0;
  int regions = 0;
  int triangles = 0;
};

Content contentOf(DexData& data) {
  Content content;
  if (data.getNumberOfDatasets() == 0) return content;
  const DexDataset& dataset = *data.getCurDataset();
  content.objects = dataset.getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE);
  content.regions = dataset.getNumberOfRegions();
  for (int i = 0; i < dataset.getNumberOfSurfaces(); ++i)
    content.triangles += dataset.getSurfaceAt(i)->getNumberOfTriangles();
  return content;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const dex_fuzz::ScratchFile input("dxf-in");
  static const dex_fuzz::ScratchFile drawing("dxf-out");
  dex_fuzz::silenceLogs();
  dex_fuzz::FuzzInput bytes(data, size);
  const std::uint8_t steering = bytes.takeByte();
  if (!input.write(bytes.takeRest())) return 0;

  DexSettings settings;
  const EDexDataType kinds[] = {POINTS, LINES, AREAS, SURFACES};
  for (int bit = 0; bit < 4; ++bit) {
    if ((steering & (1u << bit)) != 0) settings.addDataType(kinds[bit]);
  }
  settings.distUnits = kUnits[(steering >> 4) & 7u];
  settings.messageBox = new dex_fuzz::YesBox();
  DexData::stopProcess_ = false;

  DexData first(settings);
  const EDexResult read = run(first, input.wpath(), false);
  DEX_FUZZ_CHECK(read == DEX_RESULT_OK || read == dxf::kResultEntitiesSkipped ||
                 read == DEX_RESULT_WRONG_FORMAT);
  const Content taken = contentOf(first);
  if (read == DEX_RESULT_WRONG_FORMAT) DEX_FUZZ_CHECK(taken.objects == 0 && taken.triangles == 0);

  DEX_FUZZ_CHECK(run(first, drawing.wpath(), true) == DEX_RESULT_OK);
  DexData second(settings);
  const EDexResult readAgain = run(second, drawing.wpath(), false);
  const Content again = contentOf(second);
  DEX_FUZZ_CHECK(again.objects == taken.objects);
  DEX_FUZZ_CHECK(again.regions == taken.regions);
  // Corners nearer than the written decimals fall together: such a triangle is left out, and said so.
  DEX_FUZZ_CHECK(readAgain == DEX_RESULT_OK
                     ? again.triangles == taken.triangles
                     : readAgain == dxf::kResultEntitiesSkipped && again.triangles < taken.triangles);
  return 0;
}
