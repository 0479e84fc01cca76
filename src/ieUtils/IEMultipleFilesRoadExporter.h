#pragma once

#include <cstdio>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IExporter.h"

// The base of the exporters of road formats that keep one road in three files of one base name: a
// horizontal-alignment file, a vertical-alignment file and a cross-section file, told apart by suffix.
//
// Error-log record (source ieUtils\IEMultipleFilesRoadExporter, empty message):
// - line 61: the settings request none of ROADS, H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS.
namespace vyn::ie {

class DexCrossSectionSet;
class DexHorizontalAlignment;
class DexVerticalAlignment;

// Cuts an export into steps, one item a step: with ROADS each alignment of the current dataset (its
// primary horizontal, vertical and cross-section parts, the files named after the alignment); else,
// for the first of H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS requested, each part of that kind in the
// parts dictionary (the files named after the part). The step after the last item answers false and
// ends the export; so does an alignment of which nothing could be written. Every step closes its files
// before the next begins.
//
// The plug-in writes each part through the protected openHAlFile, openVAlFile and openXSectFile, which
// place the file in the export folder (the export file name is taken as a folder), ask before an
// existing file is overwritten, and record each file created so that a stopped export deletes it. A
// file that cannot be created sets the result to DEX_RESULT_FILE_ERROR.
//
// Virtual operations, in this order (the plug-in ABI): the destructor, doExport, getNumberOfSteps,
// singleStep, getIEResult, writeHAl, writeVAl, writeXSect.
class DEX_API IDexMultipleFilesRoadExporter : public DexExporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  IDexMultipleFilesRoadExporter(const IDexMultipleFilesRoadExporter&) = delete;
  IDexMultipleFilesRoadExporter& operator=(const IDexMultipleFilesRoadExporter&) = delete;

 protected:
  // No stream open, no alignment name, currentStep -1.
  IDexMultipleFilesRoadExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  // Closes what is still open.
  ~IDexMultipleFilesRoadExporter() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  // The items to write plus one (the final step that answers false); 1 with an error-log record
  // (line 61) when no road data type is requested.
  int getNumberOfSteps() override;
  // Advances currentStep and writes the item of that step; false when there is none or it failed.
  bool singleStep() override;
  // Each writes one part through the matching open operation; false when it wrote nothing.
  // verticalAlignment is the vertical alignment of the same road, or null.
  virtual bool writeHAl(const DexHorizontalAlignment* horizontalAlignment) = 0;
  virtual bool writeVAl(const DexVerticalAlignment* verticalAlignment) = 0;
  virtual bool writeXSect(const DexCrossSectionSet* crossSectionSet,
                          const DexVerticalAlignment* verticalAlignment) = 0;

  // ---- For the plug-in's write operations -----------------------------------------------------
  // Opens the part's stream on <export folder>/<alignmentName, or the part's name>extension, only
  // when the part has content (an element; a long section; a cross section). Whether it is open.
  bool openHAlFile(const DexHorizontalAlignment* horizontalAlignment, const CVynStringT<wchar_t>& extension);
  bool openVAlFile(const DexVerticalAlignment* verticalAlignment, const CVynStringT<wchar_t>& extension);
  bool openXSectFile(const DexCrossSectionSet* crossSectionSet, const CVynStringT<wchar_t>& extension);
  // Opens path for writing ("wb+") once the overwrite question allows it and records it as exported;
  // a refused file leaves stream as it was. Whether stream is open.
  bool openFile(const CVynStringT<wchar_t>& path, FILE*& stream);
  // Closes the horizontal, vertical and cross-section streams that are open.
  void closeFiles();
  // Writes the primary parts of the alignment at index of the current dataset under its name; true
  // when there is no such alignment or at least one part was written.
  bool exportAlignment(int index);

  FILE* vAlFile = nullptr;
  FILE* hAlFile = nullptr;
  FILE* xSectFile = nullptr;
  CVynStringT<wchar_t> alignmentName;

 private:
  bool openPartFile(bool hasContent, const CVynStringT<wchar_t>& partName,
                    const CVynStringT<wchar_t>& extension, FILE*& stream);
  int numberOfParts(int kind) const;
};

}  // namespace vyn::ie
