#include "LandXmlImporter.h"

#include <memory>

#include "LandXmlHandlers.h"
#include "LandXmlReader.h"
#include "LandXmlWords.h"
#include "ieObjects/IEData.h"
#include "ieUtils/IEFileReaders.h"
#include "ieUtils/IESettings.h"

namespace vyn::ie::landxml {

namespace {

// The units a file without (readable) Units is read in: the settings' when LandXML can name them.
FileUnits fallbackUnits(const DexSettings& settings) {
  FileUnits units;
  if (!wordOfLinearUnit(settings.distUnits).empty()) units.linear = settings.distUnits;
  if (!wordOfAngularUnit(settings.angleUnits).empty()) units.angular = units.direction = settings.angleUnits;
  return units;
}

bool wantsRoads(const DexSettings& settings) {
  for (const EDexDataType type : {ROADS, H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, STA_EQUATION_SETS}) {
    if (settings.hasDataType(type)) return true;
  }
  return false;
}

}  // namespace

LandXmlImporter::LandXmlImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
    : DexImporterImpl(data, fileName, format) {}

LandXmlImporter::~LandXmlImporter() = default;

EDexResult LandXmlImporter::doImport() {
  if (data == nullptr) return DEX_RESULT_FAILED;
  if (!isLandXmlFormat(format)) return DEX_RESULT_NO_PARSER;
  const DexSettings& settings = data->getSettings();
  const bool points = settings.hasDataType(POINTS) || settings.hasDataType(POINT_LISTS);
  if (!points && !settings.hasDataType(LINES) && !settings.hasDataType(SURFACES) &&
      !settings.hasDataType(PARCELS) && !wantsRoads(settings))
    return DEX_RESULT_OK;  // nothing the plug-in reads is asked for
  DexXmlParser* opened = nullptr;
  const EDexResult openResult = DexXmlParser::initialize(fileName, opened);
  if (openResult != DEX_RESULT_OK) return openResult;
  const std::unique_ptr<DexXmlParser> parser(opened);

  ReadContext context(*data, fileName);
  UnitsHandler units(context, fallbackUnits(settings));
  CgPointsHandler pointsHandler(context, settings.hasDataType(POINT_LISTS));
  PlanFeaturesHandler features(context);
  SurfacesHandler surfaces(context);
  ParcelsHandler parcels(context);
  AlignmentsHandler roads(context);

  LandXmlReader reader(context);
  reader.addCollection(element::kUnits, units);
  reader.skipCollection(element::kApplication);  // the program that wrote the file, not its data
  const auto collection = [&reader](std::wstring_view name, bool wanted, CollectionHandler& handler) {
    if (wanted) {
      reader.addCollection(name, handler);
    } else {
      reader.skipCollection(name);
    }
  };
  collection(element::kCgPoints, points, pointsHandler);
  collection(element::kPlanFeatures, settings.hasDataType(LINES), features);
  collection(element::kSurfaces, settings.hasDataType(SURFACES), surfaces);
  collection(element::kParcels, settings.hasDataType(PARCELS), parcels);
  collection(element::kAlignments, wantsRoads(settings), roads);

  const EDexResult read = reader.read(*parser);
  if (read == DEX_RESULT_WRONG_FORMAT) return read;
  DexSettings withUnits = settings;
  withUnits.distUnits = context.units().linear;
  withUnits.angleUnits = context.units().angular;
  data->setSettings(withUnits);
  const EDexResult remark = context.finish(read == kResultTruncated);
  return read == DEX_RESULT_STOPPED ? read : remark;
}

}  // namespace vyn::ie::landxml
