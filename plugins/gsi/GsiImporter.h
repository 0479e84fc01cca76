#pragma once

#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IImporter.h"

namespace vyn::ie::gsi {

// Reads a Leica GSI file of GSI-8 or GSI-16 lines (each line by its own first character, so a file
// may mix them) into the container's current dataset: set-ups, backsights and sideshots as the
// total-station records of its raw data in recording order, coordinate lines as design points with
// their codes (GsiRecordBuilder says what each word becomes). Raw records are read when the settings
// request RAW_DATA, points when they request POINTS or POINT_LISTS. Distances in feet are
// international feet, or US survey feet when the settings' distance unit is USFEET.
//
// Nothing read well is lost: a bad word (short or long for its line's variant, without index or
// sign, a non-digit in a value, a unit digit that does not fit the word) is left out with the rest of
// its line kept; words of an index the model has no place for are left out and counted. The run ends
// with notes (trace records): the first kTracedProblems bad words with their line and column, the
// counts of bad words, of lines without a good word and of unknown words by index, a file that mixes
// GSI-8 and GSI-16, and what was read.
//
// Results: DEX_RESULT_OK; kResultWordsSkipped when bad words or lines were left out and something was
// read; DEX_RESULT_WRONG_FORMAT for a file without a single good word (an empty file too);
// DEX_RESULT_FILE_ERROR when the file cannot be opened; DEX_RESULT_STOPPED when DexData::stopProcess_
// was set (the records read so far stay).
class GsiImporter final : public DexImporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  GsiImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  ~GsiImporter() override;

 protected:
  EDexResult doImport() override;
};

}  // namespace vyn::ie::gsi
