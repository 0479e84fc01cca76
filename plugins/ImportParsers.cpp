// The import plug-in "ImportParsers": the point files (CSV and customizable ASCII points) and LandXML.

#include "ieUtils/IImporter.h"
#include "landxml/LandXmlImporter.h"
#include "landxml/LandXmlWords.h"
#include "pointfiles/PointFileImporter.h"
#include "pointfiles/PointLayout.h"

DEX_MAKE_IMPORTER(data, fileName, format) {
  if (data == nullptr) return nullptr;
  if (vyn::ie::point_files::isPointFileFormat(format))
    return new vyn::ie::point_files::PointFileImporter(data, fileName, format);
  if (vyn::ie::landxml::isLandXmlFormat(format))
    return new vyn::ie::landxml::LandXmlImporter(data, fileName, format);
  return nullptr;
}
