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
// The first lines decide the layout (findLayout): the delimiter when the settings leave it to the
// file, the columns when a header line names them; points of a layout without a name column are
// numbered. Blank lines and the header line are passed over. Nothing read well is lost: a value the
// point has no column for (after the last column, in a column the header names but no field matches,
// a height that is no number, a malformed code) is kept in the point's notes, "label=value" joined by
// "; " after the Notes column; only a line without a name or without coordinates is dropped. The run
// ends with notes (trace records, ImportNotes.h) on the layout and on the lines dropped or kept.
// Results: DEX_RESULT_OK; kResultLinesSkipped when lines were dropped and at least one point was
// read; DEX_RESULT_WRONG_FORMAT when lines were dropped and none gave a point; DEX_RESULT_FILE_ERROR
// when the file cannot be opened; DEX_RESULT_STOPPED when DexData::stopProcess_ was set (the points
// read so far stay). The importer publishes how much of the file it has read.
class PointFileImporter final : public DexImporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  PointFileImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  ~PointFileImporter() override;

 protected:
  EDexResult doImport() override;
};

}  // namespace vyn::ie::point_files
