#pragma once

#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IImporter.h"

namespace vyn::ie::point_files {

// Reads a point file (one point a line, columns by PointLayout) into the container's current dataset:
// one design point per line with its name, coordinates (converted from the settings' distance unit to
// meters), heights, notes and codes (descriptions added to the code library). Reads points only when
// the settings request POINTS or POINT_LISTS.
//
// Blank lines are passed over; a first line that names the columns (or any first line when the
// layout says it has a header) is skipped. A malformed line (no name where the layout has a name, a
// coordinate that is missing or not a number, a malformed code, a non-empty value beyond the last
// column) is skipped and traced. Results: DEX_RESULT_OK; kResultLinesSkipped when lines were skipped
// and at least one point was read; DEX_RESULT_WRONG_FORMAT when no line gave a point;
// DEX_RESULT_FILE_ERROR when the file cannot be opened; DEX_RESULT_STOPPED when DexData::stopProcess_
// was set (the points read so far stay). The importer publishes how much of the file it has read.
class PointFileImporter final : public DexImporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  PointFileImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  ~PointFileImporter() override;

 protected:
  EDexResult doImport() override;
};

}  // namespace vyn::ie::point_files
