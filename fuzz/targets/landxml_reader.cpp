// The LandXML reader of the shipped plug-in on raw bytes. The first byte chooses the data kinds the
// settings ask for (bit 0 points, 1 point lists, 2 lines, 3 surfaces, 4 parcels, 5 roads; no bit set
// asks for all) and the rest is the file. It is imported as a loader's run would import it, the model
// it gives is checked (triangle corners among the positions, polylines of two vertices or more, the
// points of point-mode polylines and parcels in the dataset), and then written as LandXML, which must
// read back with the same surfaces, parcels and triangles (of surfaces of three positions or more)
// and no fewer points.

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <memory>
#include <unordered_set>

#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEParcel.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IESurface.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"
#include "landxml/LandXmlExporter.h"
#include "landxml/LandXmlImporter.h"
#include "landxml/LandXmlWords.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/ScratchFile.h"

namespace {

using namespace vyn::ie;
using String = CVynStringT<wchar_t>;

IDexImporter* makeImporter(DexData* data, const String& fileName, const DexFormat* format) {
  return new landxml::LandXmlImporter(data, fileName, format);
}

IDexExporter* makeExporter(DexData* data, const String& fileName, const DexFormat* format) {
  return new landxml::LandXmlExporter(data, fileName, format);
}

const DexFormat* landXml() {
  static const DexFormat* const format = getIEFormatsData().getFormatById(landxml::kFormatId);
  return format;
}

DexSettings settingsOf(std::uint8_t kinds) {
  static constexpr EDexDataType kKinds[] = {POINTS, POINT_LISTS, LINES, SURFACES, PARCELS, ROADS};
  DexSettings settings;
  for (std::size_t bit = 0; bit < std::size(kKinds); ++bit) {
    if ((kinds & (1u << bit)) != 0 || (kinds & 0x3F) == 0) settings.addDataType(kKinds[bit]);
  }
  return settings;
}

// One run of the plug-in's importer or exporter through the library's run functions.
EDexResult run(DexData& data, const dex_fuzz::ScratchFile& file, bool import) {
  auto* params = new DexParserThreadParams();
  params->data = &data;
  params->fileName = String(file.wpath().c_str());
  params->format = landXml();
  if (import) {
    params->makeParser = &makeImporter;
    return ImportFunction(params);
  }
  params->makeParser = &makeExporter;
  return exportFunction(params);
}

struct Totals {
  int points = 0, surfaces = 0, triangles = 0, parcels = 0, alignments = 0, elements = 0;
};

// Checks what an import gave and answers its totals.
Totals checkModel(DexData& data) {
  Totals totals;
  if (data.getNumberOfDatasets() == 0) return totals;
  const DexDataset& dataset = *data.getCurDataset();
  std::unordered_set<const DexObject*> objects;
  const int count = dataset.getNumberOfElements(OBJECT_TYPE_ALL, 2);
  for (int i = 0; i < count; ++i) {
    const DexObject* object = dataset.getObjectAt(i);
    DEX_FUZZ_CHECK(object != nullptr);
    objects.insert(object);
    if (dynamic_cast<const DexDesignPoint*>(object) != nullptr) ++totals.points;
  }
  for (int i = 0; i < count; ++i) {
    const auto* line = dynamic_cast<const DexPolyLine*>(dataset.getObjectAt(i));
    if (line == nullptr || dynamic_cast<const DexBreakline*>(line) != nullptr) continue;
    DEX_FUZZ_CHECK(line->getNumberOfNodes() >= 2);
    for (int p = 0; p < line->getNumberOfPoints(); ++p)
      DEX_FUZZ_CHECK(objects.count(line->getPoint(p)) == 1);
  }
  totals.surfaces = dataset.getNumberOfSurfaces();
  for (int s = 0; s < totals.surfaces; ++s) {
    const DexSurface& surface = *dataset.getSurfaceAt(s);
    for (int t = 0; t < surface.getNumberOfTriangles(); ++t) {
      for (int corner = 0; corner < DexTriangle::kNumberOfPositions; ++corner) {
        const int index = surface.getTriangleAt(t)->getPosition(corner);
        DEX_FUZZ_CHECK(index >= 0 && index < surface.getNumberOfPositions());
      }
    }
    // A TIN is written with three positions at least.
    if (surface.getNumberOfPositions() >= 3) totals.triangles += surface.getNumberOfTriangles();
  }
  totals.parcels = dataset.getNumberOfParcels();
  for (int p = 0; p < totals.parcels; ++p) {
    const DexDesignPoint* centre = dataset.getParcelAt(p)->getCentralPoint();
    DEX_FUZZ_CHECK(centre == nullptr || objects.count(centre) == 1);
  }
  totals.alignments = dataset.getNumberOfAlignments();
  for (int a = 0; a < totals.alignments; ++a) {
    const auto* plan = dynamic_cast<const DexHorizontalAlignment*>(
        dataset.getAlignmentAt(a)->getAlignmentPart(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
    if (plan == nullptr) continue;
    for (int e = 0; e < plan->getNumberOfSegments(); ++e)
      DEX_FUZZ_CHECK(plan->getSegmentAt(e) != nullptr);
    totals.elements += plan->getNumberOfSegments();
  }
  return totals;
}

bool isImportResult(EDexResult result) {
  return result == DEX_RESULT_OK || result == landxml::kResultNotHeld ||
         result == landxml::kResultMalformedSkipped || result == landxml::kResultTruncated ||
         result == DEX_RESULT_WRONG_FORMAT;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  dex_fuzz::silenceLogs();
  static const dex_fuzz::ScratchFile input("landxml-in");
  static const dex_fuzz::ScratchFile output("landxml-out");
  DexData::stopProcess_ = false;
  dex_fuzz::FuzzInput bytes(data, size);
  const DexSettings settings = settingsOf(bytes.takeByte());
  if (!input.write(bytes.takeRest())) return 0;

  DexData first(settings);
  const EDexResult imported = run(first, input, true);
  DEX_FUZZ_CHECK(isImportResult(imported));
  if (imported == DEX_RESULT_WRONG_FORMAT) return 0;
  const Totals read = checkModel(first);

  std::remove(output.path().c_str());  // a file of the name would need a yes to be overwritten
  const EDexResult exported = run(first, output, false);
  DEX_FUZZ_CHECK(exported == DEX_RESULT_OK || exported == landxml::kResultNotHeld);
  DexData second(settings);
  const EDexResult again = run(second, output, true);
  DEX_FUZZ_CHECK(again == DEX_RESULT_OK || again == landxml::kResultNotHeld ||
                 again == landxml::kResultMalformedSkipped);
  const Totals reread = checkModel(second);
  DEX_FUZZ_CHECK(reread.points >= read.points && reread.points <= read.points + read.parcels);
  DEX_FUZZ_CHECK(reread.surfaces == read.surfaces);
  DEX_FUZZ_CHECK(reread.triangles == read.triangles);
  DEX_FUZZ_CHECK(reread.parcels == read.parcels);
  DEX_FUZZ_CHECK(reread.alignments == read.alignments);
  DEX_FUZZ_CHECK(reread.elements == read.elements);
  return 0;
}
