// The export plug-in "ExportParsers": the point files (CSV and customizable ASCII points).

#include "ieUtils/IExporter.h"
#include "pointfiles/PointFileExporter.h"
#include "pointfiles/PointLayout.h"

DEX_MAKE_EXPORTER(data, fileName, format) {
  if (data == nullptr || !vyn::ie::point_files::isPointFileFormat(format)) return nullptr;
  return new vyn::ie::point_files::PointFileExporter(data, fileName, format);
}
