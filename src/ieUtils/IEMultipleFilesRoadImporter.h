#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/TextFile.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IImporter.h"

// The base of the importers of road formats that keep one road in three files of one base name: a
// horizontal-alignment file, a vertical-alignment file and a cross-section file, told apart by suffix.
namespace vyn::ie {

class DexCrossSectionSet;
class DexHorizontalAlignment;
class DexVerticalAlignment;

// Decides which of the three files to open for the requested data types (H_ALIGNMENTS, V_ALIGNMENTS,
// X_SECTIONS, ROADS), reads them in the order horizontal, vertical, cross sections, puts the parts read
// into the parts dictionary and, for ROADS, joins them into one DexAlignment of the current dataset.
// The plug-in supplies the three suffixes and the reading of each part from its reader.
//
// Files: with ROADS the three files are the import file's base name plus each suffix; otherwise each
// requested part is read from the import file itself. Results: DEX_RESULT_FILE_ERROR when no file
// opens, DEX_RESULT_WRONG_FORMAT when a part cannot be read (the later parts are then not read; parts
// read so far stay in the dictionary, the alignment is dropped), DEX_RESULT_STOPPED when the run was
// stopped, else DEX_RESULT_OK.
//
// Virtual operations, in this order (the plug-in ABI): the destructor, doImport, getHAlExtension,
// getVAlExtension, getXSectExtension, readHAl, readVAl, readXSect.
class DEX_API IDexMultipleFilesRoadImporter : public DexImporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  IDexMultipleFilesRoadImporter(const IDexMultipleFilesRoadImporter&) = delete;
  IDexMultipleFilesRoadImporter& operator=(const IDexMultipleFilesRoadImporter&) = delete;

 protected:
  IDexMultipleFilesRoadImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  ~IDexMultipleFilesRoadImporter() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  EDexResult doImport() override;
  // The suffix of each file, with its leading point (".hal").
  virtual CVynStringT<wchar_t> getHAlExtension() = 0;
  virtual CVynStringT<wchar_t> getVAlExtension() = 0;
  virtual CVynStringT<wchar_t> getXSectExtension() = 0;
  // Each reads its reader (hAlFile, vAlFile, xSectFile; a reader whose file did not open is closed) and
  // gives a new part owned by the caller, or null when the file holds none, and true; false for a file
  // it cannot read (a part given with false is deleted).
  virtual bool readHAl(DexHorizontalAlignment*& horizontalAlignment) = 0;
  virtual bool readVAl(DexVerticalAlignment*& verticalAlignment) = 0;
  virtual bool readXSect(DexCrossSectionSet*& crossSectionSet) = 0;

  // ---- The steps of doImport ------------------------------------------------------------------
  // Opens the reader of every requested part; true when at least one opened.
  bool openFiles();
  // Reads the parts in order and joins them; the import's result.
  EDexResult readFile();
  void closeFiles();

  CTextFile hAlFile;
  CTextFile vAlFile;
  CTextFile xSectFile;
};

}  // namespace vyn::ie
