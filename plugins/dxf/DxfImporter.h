#pragma once

#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IImporter.h"

namespace vyn::ie::dxf {

// Reads an ASCII DXF drawing (R12, R2000 and later; HEADER, TABLES, BLOCKS and ENTITIES sections)
// into the container's current dataset, streaming it group by group:
//  - layers (with colour, line type, line weight, on/off and plot status) into the draw dictionary;
//  - POINT as a design point; INSERT of a block whose attributes carry a name, height or code tag
//    (DxfWords.h) as a design point with that name, height and codes; an INSERT right after a POINT
//    at the same place names that point rather than making a second one;
//  - LINE, LWPOLYLINE and 2D or 3D POLYLINE as polylines (bulges kept, closed flag); the exporter's
//    extended data makes areas, regions and breaklines of them again;
//  - ARC and CIRCLE as arcs and circles; TEXT and MTEXT as text labels (MTEXT formatting removed,
//    "\P" a line end);
//  - 3DFACE, polyface and polygon meshes as the triangles of one surface per layer (or per name the
//    extended data gives).
// Entities of the model space only; objects get their layer, and an explicit colour, line type or
// line weight as their own drawing properties (by layer otherwise, see DxfObjectBuilder). Coordinates
// are converted to meters by $INSUNITS or, without it, the settings' distance unit.
//
// Results: DEX_RESULT_OK when everything was taken; kResultEntitiesSkipped when something was left
// out (entities the model cannot hold, by type; entities with values that are not numbers; paper
// space; damaged group codes, after which reading goes on at the next group 0; a file that ends
// inside a section), each traced, with all that was read well kept; DEX_RESULT_WRONG_FORMAT for an
// empty file, a binary DXF file, a DWG drawing, or a file with no DXF section or entity;
// DEX_RESULT_FILE_ERROR when the file cannot be opened; DEX_RESULT_STOPPED when DexData::stopProcess_
// was set (the objects read so far stay).
class DxfImporter final : public DexImporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  DxfImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  ~DxfImporter() override;

 protected:
  EDexResult doImport() override;
};

}  // namespace vyn::ie::dxf
