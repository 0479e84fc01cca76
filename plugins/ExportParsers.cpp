// The export plug-in "ExportParsers": the point files (CSV and customizable ASCII points) and LandXML.

#include "ieUtils/IExporter.h"
#include "landxml/LandXmlExporter.h"
#include "landxml/LandXmlWords.h"
#include "pointfiles/PointFileExporter.h"
#include "pointfiles/PointLayout.h"

DEX_MAKE_EXPORTER(data, fileName, format) {
  if (data == nullptr) return nullptr;
  if (vyn::ie::point_files::isPointFileFormat(format))
    return new vyn::ie::point_files::PointFileExporter(data, fileName, format);
  if (vyn::ie::landxml::isLandXmlFormat(format))
    return new vyn::ie::landxml::LandXmlExporter(data, fileName, format);
  return nullptr;
}
