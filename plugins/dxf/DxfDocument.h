#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "DxfWords.h"
#include "DxfWriter.h"

// The fixed frame of an exported drawing (AutoCAD 2000, AC1015): the header, the symbol tables, the
// blocks, the start and end of the entities and the objects section that AutoCAD 2000 and later
// expect. The entities between them are the exporter's.
namespace vyn::ie::dxf {

// The handles of the frame; the exporter's own start at kFirstFreeHandle.
namespace handle {
inline constexpr unsigned long long kLayerTable = 0x10;
inline constexpr unsigned long long kModelSpace = 0x20;  // the block record every entity belongs to
inline constexpr unsigned long long kPointBlockRecord = 0x22;
inline constexpr unsigned long long kFirstFreeHandle = 0x100;
}  // namespace handle

// One row of the layer table; the texts are encoded already.
struct DxfLayerRow {
  std::string name;
  int color = kColorForeground;
  long long trueColor = -1;  // none
  std::string lineType = "Continuous";
  int lineWeight = kLineWeightDefault;
  bool on = true;
  bool plot = true;
};

// Where the attribute texts of a point stand beside it, in text heights.
struct DxfPointTag {
  std::string_view tag;
  double dx;
  double dy;
};
inline constexpr DxfPointTag kPointTags[] = {
    {kNameTag, 1.0, 0.5}, {kHeightTag, 1.0, -1.0}, {kCodeTag, 1.0, -2.5}};

// What the frame needs to know of the drawing.
struct DxfFrame {
  int unitsCode = 6;              // $INSUNITS
  bool metric = true;             // $MEASUREMENT
  double toUnits = 1.0;           // drawing units per meter (line-type patterns)
  double attributeHeight = 0.25;  // of the point attributes, in drawing units
  int decimals = 3;
  // The drawing's extent in drawing units; min above max when it is empty.
  double minX = 1.0, minY = 1.0, minZ = 0.0, maxX = 0.0, maxY = 0.0, maxZ = 0.0;
  std::vector<DxfLayerRow> layers;  // layer "0" first
};

// HEADER (with a placeholder for $HANDSEED), CLASSES, TABLES and BLOCKS, then the start of ENTITIES.
void writeFrameStart(DxfWriter& writer, const DxfFrame& frame);
// The end of ENTITIES, OBJECTS and EOF; $HANDSEED is then set to the next free handle. False when
// that cannot be written.
bool writeFrameEnd(DxfWriter& writer);

}  // namespace vyn::ie::dxf
