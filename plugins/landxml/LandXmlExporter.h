#pragma once

#include <cstdint>
#include <cstdio>
#include <memory>
#include <string_view>
#include <unordered_set>
#include <utility>
#include <vector>

#include "LandXmlText.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IExporter.h"

namespace vyn::ie {
class DexDataset;
class DexDesignPoint;
class DexObject;
}  // namespace vyn::ie

namespace vyn::ie::landxml {

class LandXmlWriter;

// Writes the container's current dataset as one LandXML 1.2 document, UTF-8: the LandXML root with
// Units (the settings' units when LandXML can name them, else meters and decimal degrees) and
// Application, then the collections the settings ask for:
//  - POINTS or POINT_LISTS: CgPoints with every design point (a point whose name was written before
//    goes into a further CgPoints, as names are unique in one); with POINT_LISTS each object list
//    of the dataset as a named CgPoints of pntRef members;
//  - LINES: PlanFeatures with the polylines and areas, and the breaklines that no written surface
//    holds (a closed polyline ends where it starts; see LandXmlWriter for Chains);
//  - SURFACES: Surfaces, each with its breaklines and, with three positions and a triangle at least,
//    its TIN Definition;
//  - PARCELS: Parcels with their central points and boundaries (the region of the parcel's name);
//  - ROADS, H_ALIGNMENTS, V_ALIGNMENTS or STA_EQUATION_SETS: Alignments with the dataset's alignments (see
//    LandXmlWriter::alignment).
// Coordinates are written in the settings' decimals. Objects the document cannot carry (arcs,
// circles, text labels, sheet points, linework of fewer than two plan positions, triangles with a
// corner outside the positions, intersection points of horizontal alignments) are counted, traced and not
// written; the export then answers kResultNotHeld.
//
// Steps: opening the file (after the overwrite question; the file is recorded as exported as soon as
// it exists) and writing the header, one step per block of objects, closing it. Results:
// DEX_RESULT_OK or kResultNotHeld; DEX_RESULT_FILE_ERROR when the overwrite is refused or the file
// cannot be created or written; DEX_RESULT_STOPPED (through the driver) when stopped, after which the
// run deletes the file.
class LandXmlExporter final : public DexExporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  LandXmlExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  // Closes a file left open by a stopped export.
  ~LandXmlExporter() override;
  LandXmlExporter(const LandXmlExporter&) = delete;
  LandXmlExporter& operator=(const LandXmlExporter&) = delete;

 protected:
  int getNumberOfSteps() override;
  bool singleStep() override;

 private:
  enum class Stage { POINTS, POINT_LISTS, LINES, SURFACES, PARCELS, ALIGNMENTS, CLOSE };

  bool open();
  bool writeBlock();
  bool writePoints();
  bool writePointLists();
  bool writeLines();
  bool writeSurfaces();
  bool writeParcels();
  bool writeAlignments();
  bool close();
  bool flush();
  void nextStage();

  DexDataset* dataset_ = nullptr;
  std::FILE* file_ = nullptr;
  bool writeFailed_ = false;
  XmlText text_;
  std::unique_ptr<LandXmlWriter> writer_;
  Stage stage_ = Stage::POINTS;
  int next_ = 0;      // the next object (point, list, surface, parcel) of the stage
  int nextPart_ = 0;  // the next position or triangle of the surface being written
  bool collectionOpen_ = false;
  int objectCount_ = 0;
  // The points whose name was written in the CgPoints being written go into the next one.
  int pass_ = 0;  // the CgPoints being written: 0 takes the dataset's points, others pointsLeft_
  std::vector<const DexDesignPoint*> pointsLeft_;
  std::vector<const DexDesignPoint*> pointsLater_;
  std::vector<bool> repeatedNames_;  // of the CgPoints being written: to be written in a later one
  std::unordered_set<const DexObject*> surfaceLines_;  // breaklines written with their surfaces
  std::int64_t notWritten_ = 0;
};

}  // namespace vyn::ie::landxml
