// The import plug-in "ImportParsers": the point files (CSV and customizable ASCII points).

#include "ieUtils/IImporter.h"
#include "pointfiles/PointFileImporter.h"
#include "pointfiles/PointLayout.h"

DEX_MAKE_IMPORTER(data, fileName, format) {
  if (data == nullptr || !vyn::ie::point_files::isPointFileFormat(format)) return nullptr;
  return new vyn::ie::point_files::PointFileImporter(data, fileName, format);
}
