// The import plug-in "ImportParsers": the point files (CSV and customizable ASCII points), DXF, LandXML
// and Leica GSI.

#include "dxf/DxfImporter.h"
#include "dxf/DxfWords.h"
#include "gsi/GsiImporter.h"
#include "gsi/GsiWords.h"
#include "ieUtils/IImporter.h"
#include "landxml/LandXmlImporter.h"
#include "landxml/LandXmlWords.h"
#include "pointfiles/PointFileImporter.h"
#include "pointfiles/PointLayout.h"

DEX_MAKE_IMPORTER(data, fileName, format) {
  if (data == nullptr) return nullptr;
  if (vyn::ie::dxf::isDxfFormat(format)) return new vyn::ie::dxf::DxfImporter(data, fileName, format);
  if (vyn::ie::landxml::isLandXmlFormat(format))
    return new vyn::ie::landxml::LandXmlImporter(data, fileName, format);
  if (vyn::ie::gsi::isGsiFormat(format)) return new vyn::ie::gsi::GsiImporter(data, fileName, format);
  if (!vyn::ie::point_files::isPointFileFormat(format)) return nullptr;
  return new vyn::ie::point_files::PointFileImporter(data, fileName, format);
}
