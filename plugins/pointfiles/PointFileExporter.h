#pragma once

#include <cstdio>
#include <string>

#include "PointLayout.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IExporter.h"

namespace vyn::ie {
class DexDataset;
class DexDesignPoint;
}  // namespace vyn::ie

namespace vyn::ie::point_files {

// Writes the points of the container's current dataset to a point file, one line a point, columns
// by PointLayout, UTF-8 with CR LF line ends. Coordinates and heights are written in the settings'
// distance unit with the settings' decimals (an undefined coordinate or height is written empty);
// objects that are not design points (lines, areas, labels, sheet points) are not written. Writes
// no point when the settings request neither POINTS nor POINT_LISTS.
//
// Steps: opening the file (after the overwrite question; the file is recorded as exported as soon as
// it exists), one step per block of points, closing it. Results: DEX_RESULT_OK;
// DEX_RESULT_FILE_ERROR when the overwrite is refused or the file cannot be created or written;
// DEX_RESULT_STOPPED (through the driver) when stopped, after which the run deletes the file.
class PointFileExporter final : public DexExporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  PointFileExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  // Closes a file left open by a stopped export.
  ~PointFileExporter() override;
  PointFileExporter(const PointFileExporter&) = delete;
  PointFileExporter& operator=(const PointFileExporter&) = delete;

 protected:
  int getNumberOfSteps() override;
  bool singleStep() override;

 private:
  bool open();
  bool writeBlock();
  bool close();
  void writeHeader();
  void writePoint(const DexDesignPoint& point);
  void appendValue(std::size_t column, std::wstring_view value, bool isText);
  bool flush();

  PointLayout layout_;
  DexDataset* dataset_ = nullptr;
  int objectCount_ = 0;
  int nextObject_ = 0;
  std::FILE* file_ = nullptr;
  bool writeFailed_ = false;
  std::wstring line_;
  std::wstring value_;
  std::string bytes_;
};

}  // namespace vyn::ie::point_files
