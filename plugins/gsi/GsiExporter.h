#pragma once

#include <cstdio>
#include <memory>
#include <string>

#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IExporter.h"

namespace vyn::ie {
class DexDataset;
}

namespace vyn::ie::gsi {

class GsiLineWriter;

// Writes the design points of the container's current dataset as GSI coordinate lines (GsiWriter.h),
// GSI-16 for "GSI16 (*.gsi)" and GSI-8 otherwise, one line per point ended by CR LF, when the settings
// request POINTS or POINT_LISTS.
//
// Every line is made before the file is: when a value does not fit the variant (or a name or code
// cannot be written), the export is refused with DEX_RESULT_WRONG_FORMAT, the reason traced with the
// point's name ("point 'P1': the northing ... does not fit in a GSI-8 word (at most 99999.999 m)"),
// and no file written. Steps: checking every point and opening the file (after the overwrite question;
// the file is recorded as exported as soon as it exists), one step per block of points, closing it.
// Results: DEX_RESULT_OK; DEX_RESULT_WRONG_FORMAT as said; DEX_RESULT_FILE_ERROR when the overwrite is
// refused or the file cannot be created or written; DEX_RESULT_STOPPED (through the driver), after
// which the run deletes the file.
class GsiExporter final : public DexExporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  GsiExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  // Closes a file left open by a stopped export.
  ~GsiExporter() override;
  GsiExporter(const GsiExporter&) = delete;
  GsiExporter& operator=(const GsiExporter&) = delete;

 protected:
  int getNumberOfSteps() override;
  bool singleStep() override;

 private:
  bool checkPoints();
  bool open();
  bool writeBlock();
  bool close();

  std::unique_ptr<GsiLineWriter> writer_;
  DexDataset* dataset_ = nullptr;
  int objectCount_ = 0;
  int nextObject_ = 0;
  int block_ = 0;
  std::FILE* file_ = nullptr;
  std::string line_;
  std::string bytes_;
};

}  // namespace vyn::ie::gsi
