#pragma once

#include <memory>

#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IExporter.h"

namespace vyn::ie::dxf {

class DxfEntityWriter;

// Writes the container's current dataset as an ASCII DXF drawing of AutoCAD 2000 (AC1015), which
// every common CAD and GIS reader opens:
//  - the LAYER table from the draw dictionary (names made legal by the symbol-table rule, colours as
//    the nearest AutoCAD Color Index with the true colour beside it when that is not exact, line
//    types, line weights, on and plot status), and layer "0";
//  - each design point as a POINT and an INSERT of the block DEX_POINT with the attributes NAME,
//    HEIGHT (empty without height) and CODE (the codes with their strings and attribute values);
//  - polylines and breaklines as LWPOLYLINE with bulges (a 3D POLYLINE when their heights differ),
//    areas and regions as closed ones, arcs as ARC, circles as CIRCLE, text labels as TEXT (MTEXT
//    when they have several lines), surfaces as one 3DFACE per triangle;
//  - every object's colour, line type and line weight as getObjectStyle resolves them: written on the
//    entity unless they come from the object's own layer (then BYLAYER);
//  - what DXF has no place for (an object's kind, its name and codes, a breakline's surface, a
//    surface's name) as extended data of the application DEXCHANGE, which the importer reads back.
// Coordinates are written in the settings' distance unit ($INSUNITS; meters for units without an
// AutoCAD code) with the settings' decimals; X is the easting, Y the northing. The settings' data
// types choose the objects: points for POINTS or POINT_LISTS, lines for LINES, areas and regions
// for AREAS, surfaces for SURFACES, text labels for POINTS or LINES.
//
// Steps: opening the file (after the overwrite question; the file is recorded as exported as soon as
// it exists) with the tables and blocks, one step per block of objects, one for the regions, one per
// surface, and closing it. Results: DEX_RESULT_OK; DEX_RESULT_FILE_ERROR when the overwrite is
// refused or the file cannot be created or written; DEX_RESULT_STOPPED (through the driver), after
// which the run deletes the file.
class DxfExporter final : public DexExporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  DxfExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  ~DxfExporter() override;
  DxfExporter(const DxfExporter&) = delete;
  DxfExporter& operator=(const DxfExporter&) = delete;

 protected:
  int getNumberOfSteps() override;
  bool singleStep() override;

 private:
  bool open();

  std::unique_ptr<DxfEntityWriter> entities_;
  int objectCount_ = 0;
  int nextObject_ = 0;
  int surfaceCount_ = 0;
  int nextSurface_ = 0;
  bool regionsWritten_ = false;
};

}  // namespace vyn::ie::dxf
