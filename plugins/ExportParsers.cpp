// The export plug-in "ExportParsers": the point files (CSV and customizable ASCII points), DXF, LandXML
// and Leica GSI.

#include "dxf/DxfExporter.h"
#include "dxf/DxfWords.h"
#include "gsi/GsiExporter.h"
#include "gsi/GsiWords.h"
#include "ieUtils/IExporter.h"
#include "landxml/LandXmlExporter.h"
#include "landxml/LandXmlWords.h"
#include "pointfiles/PointFileExporter.h"
#include "pointfiles/PointLayout.h"

DEX_MAKE_EXPORTER(data, fileName, format) {
  if (data == nullptr) return nullptr;
  if (vyn::ie::dxf::isDxfFormat(format)) return new vyn::ie::dxf::DxfExporter(data, fileName, format);
  if (vyn::ie::landxml::isLandXmlFormat(format))
    return new vyn::ie::landxml::LandXmlExporter(data, fileName, format);
  if (vyn::ie::gsi::isGsiFormat(format)) return new vyn::ie::gsi::GsiExporter(data, fileName, format);
  if (!vyn::ie::point_files::isPointFileFormat(format)) return nullptr;
  return new vyn::ie::point_files::PointFileExporter(data, fileName, format);
}
