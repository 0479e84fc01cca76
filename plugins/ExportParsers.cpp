// The export plug-in "ExportParsers": the point files (CSV and customizable ASCII points) and DXF.

#include "dxf/DxfExporter.h"
#include "dxf/DxfWords.h"
#include "ieUtils/IExporter.h"
#include "pointfiles/PointFileExporter.h"
#include "pointfiles/PointLayout.h"

DEX_MAKE_EXPORTER(data, fileName, format) {
  if (data == nullptr) return nullptr;
  if (vyn::ie::dxf::isDxfFormat(format)) return new vyn::ie::dxf::DxfExporter(data, fileName, format);
  if (!vyn::ie::point_files::isPointFileFormat(format)) return nullptr;
  return new vyn::ie::point_files::PointFileExporter(data, fileName, format);
}
