// A plug-in that handles no format: both entry points answer null.

#include "ieUtils/IExporter.h"
#include "ieUtils/IImporter.h"

DEX_MAKE_IMPORTER(/*data*/, /*fileName*/, /*format*/) {
  return nullptr;
}

DEX_MAKE_EXPORTER(/*data*/, /*fileName*/, /*format*/) {
  return nullptr;
}
