// The import plug-in "ImportParsers": the point files (CSV and customizable ASCII points) and DXF.

#include "dxf/DxfImporter.h"
#include "dxf/DxfWords.h"
#include "ieUtils/IImporter.h"
#include "pointfiles/PointFileImporter.h"
#include "pointfiles/PointLayout.h"

DEX_MAKE_IMPORTER(data, fileName, format) {
  if (data == nullptr) return nullptr;
  if (vyn::ie::dxf::isDxfFormat(format)) return new vyn::ie::dxf::DxfImporter(data, fileName, format);
  if (!vyn::ie::point_files::isPointFileFormat(format)) return nullptr;
  return new vyn::ie::point_files::PointFileImporter(data, fileName, format);
}
