#include "DxfDocument.h"

#include <algorithm>
#include <cmath>

namespace vyn::ie::dxf {

namespace {

// The frame's own handles (below kFirstFreeHandle).
enum EFrameHandle : unsigned long long {
  VPORT_TABLE = 0x01,
  ACTIVE_VPORT = 0x02,
  LTYPE_TABLE = 0x03,
  FIRST_LTYPE = 0x04,  // ByBlock, ByLayer, Continuous, then the dashed types
  STYLE_TABLE = 0x11,
  STANDARD_STYLE = 0x12,
  VIEW_TABLE = 0x13,
  UCS_TABLE = 0x14,
  APPID_TABLE = 0x15,
  ACAD_APPID = 0x16,
  OWN_APPID = 0x17,
  DIMSTYLE_TABLE = 0x18,
  STANDARD_DIMSTYLE = 0x19,
  BLOCK_RECORD_TABLE = 0x1F,
  PAPER_SPACE = 0x21,
  MODEL_BLOCK = 0x23,
  MODEL_BLOCK_END = 0x24,
  PAPER_BLOCK = 0x25,
  PAPER_BLOCK_END = 0x26,
  POINT_BLOCK = 0x27,
  FIRST_ATTDEF = 0x28,
  POINT_BLOCK_END = 0x2B,
  ROOT_DICTIONARY = 0x30,
  GROUP_DICTIONARY = 0x31,
  LAYOUT_DICTIONARY = 0x32,
  MODEL_LAYOUT = 0x33,
  PAPER_LAYOUT = 0x34,
};

constexpr std::size_t kHandleSeedWidth = 12;
constexpr double kViewMargin = 1.1;
constexpr double kViewAspect = 1.34;

// A line type: name, description and its pattern in meters (dashes positive, gaps negative, dots 0).
struct LineTypeRow {
  std::string_view name;
  std::string_view description;
  std::vector<double> pattern;
};

const std::vector<LineTypeRow>& lineTypes() {
  static const std::vector<LineTypeRow> kRows = {
      {"ByBlock", "", {}},
      {"ByLayer", "", {}},
      {"Continuous", "Solid line", {}},
      {"DASHED", "Dashed __ __ __ __", {1.0, -0.5}},
      {"DOTTED", "Dotted . . . . .", {0.0, -0.25}},
      {"DASHDOTTED", "Dash dot __ . __ .", {1.0, -0.25, 0.0, -0.25}},
      {"DASHDOTDOTTED", "Dash dot dot __ . . __", {1.0, -0.25, 0.0, -0.25, 0.0, -0.25}},
  };
  return kRows;
}

void beginTable(DxfWriter& writer, std::string_view name, unsigned long long tableHandle, int entries) {
  writer.group(0, word::kTable);
  writer.group(2, name);
  writer.reference(5, tableHandle);
  writer.reference(330, 0);
  writer.group(100, "AcDbSymbolTable");
  writer.group(70, entries);
}

void beginEntry(DxfWriter& writer, std::string_view type, std::string_view subclass,
                unsigned long long tableHandle, unsigned long long entryHandle, int handleCode = 5) {
  writer.group(0, type);
  if (entryHandle == 0) {
    writer.handle(handleCode);
  } else {
    writer.reference(handleCode, entryHandle);
  }
  writer.reference(330, tableHandle);
  writer.group(100, "AcDbSymbolTableRecord");
  writer.group(100, subclass);
}

void endTable(DxfWriter& writer) {
  writer.group(0, word::kEndTable);
}

void writeHeader(DxfWriter& writer, const DxfFrame& frame) {
  writer.group(0, word::kSection);
  writer.group(2, word::kHeader);
  const auto variable = [&writer](std::string_view name) { writer.group(9, name); };
  variable("$ACADVER");
  writer.group(1, "AC1015");
  variable("$DWGCODEPAGE");
  writer.group(3, "ANSI_1252");
  variable("$INSBASE");
  writer.point(10, 0.0, 0.0, 0.0, 1);
  if (frame.minX <= frame.maxX) {
    variable("$EXTMIN");
    writer.point(10, frame.minX, frame.minY, frame.minZ, frame.decimals);
    variable("$EXTMAX");
    writer.point(10, frame.maxX, frame.maxY, frame.maxZ, frame.decimals);
  }
  variable("$INSUNITS");
  writer.group(70, frame.unitsCode);
  variable("$MEASUREMENT");
  writer.group(70, frame.metric ? 1 : 0);
  variable("$HANDSEED");
  writer.placeholder(5, kHandleSeedWidth);
  writer.group(0, word::kEndSection);
  writer.group(0, word::kSection);
  writer.group(2, "CLASSES");
  writer.group(0, word::kEndSection);
}

void writeViewport(DxfWriter& writer, const DxfFrame& frame) {
  beginTable(writer, "VPORT", VPORT_TABLE, 1);
  beginEntry(writer, "VPORT", "AcDbViewportTableRecord", VPORT_TABLE, ACTIVE_VPORT);
  writer.group(2, "*Active");
  writer.group(70, 0);
  writer.point(10, 0.0, 0.0, 0.0, 1);
  writer.real(11, 1.0, 1);
  writer.real(21, 1.0, 1);
  const bool empty = frame.minX > frame.maxX;
  const double centreX = empty ? 0.0 : (frame.minX + frame.maxX) / 2.0;
  const double centreY = empty ? 0.0 : (frame.minY + frame.maxY) / 2.0;
  const double height =
      empty ? 1000.0
            : std::max({frame.maxY - frame.minY, (frame.maxX - frame.minX) / kViewAspect, 1.0}) * kViewMargin;
  writer.real(12, centreX, frame.decimals);
  writer.real(22, centreY, frame.decimals);
  writer.real(13, 0.0, 1);
  writer.real(23, 0.0, 1);
  writer.real(14, 0.5, 1);
  writer.real(24, 0.5, 1);
  writer.real(15, 0.5, 1);
  writer.real(25, 0.5, 1);
  writer.point(16, 0.0, 0.0, 1.0, 1);
  writer.point(17, 0.0, 0.0, 0.0, 1);
  writer.real(40, height, frame.decimals);
  writer.real(41, kViewAspect, 2);
  writer.real(42, 50.0, 1);
  writer.real(43, 0.0, 1);
  writer.real(44, 0.0, 1);
  writer.real(50, 0.0, 1);
  writer.real(51, 0.0, 1);
  writer.group(71, 0);
  writer.group(72, 1000);
  writer.group(73, 1);
  writer.group(74, 3);
  writer.group(75, 0);
  writer.group(76, 0);
  writer.group(77, 0);
  writer.group(78, 0);
  endTable(writer);
}

void writeLineTypes(DxfWriter& writer, const DxfFrame& frame) {
  const std::vector<LineTypeRow>& rows = lineTypes();
  beginTable(writer, "LTYPE", LTYPE_TABLE, static_cast<int>(rows.size()));
  unsigned long long entry = FIRST_LTYPE;
  for (const LineTypeRow& row : rows) {
    beginEntry(writer, "LTYPE", "AcDbLinetypeTableRecord", LTYPE_TABLE, entry++);
    writer.group(2, row.name);
    writer.group(70, 0);
    writer.group(3, row.description);
    writer.group(72, 65);
    writer.group(73, static_cast<int>(row.pattern.size()));
    double length = 0.0;
    for (const double element : row.pattern)
      length += std::fabs(element);
    writer.real(40, length * frame.toUnits, frame.decimals);
    for (const double element : row.pattern) {
      writer.real(49, element * frame.toUnits, frame.decimals);
      writer.group(74, 0);
    }
  }
  endTable(writer);
}

void writeLayers(DxfWriter& writer, const DxfFrame& frame) {
  beginTable(writer, "LAYER", handle::kLayerTable, static_cast<int>(frame.layers.size()));
  for (const DxfLayerRow& layer : frame.layers) {
    beginEntry(writer, "LAYER", "AcDbLayerTableRecord", handle::kLayerTable, 0);
    writer.group(2, layer.name);
    writer.group(70, 0);
    writer.group(62, layer.on ? layer.color : -layer.color);
    if (layer.trueColor >= 0) writer.group(420, layer.trueColor);
    writer.group(6, layer.lineType);
    if (!layer.plot) writer.group(290, 0);
    writer.group(370, layer.lineWeight);
  }
  endTable(writer);
}

void writeSmallTables(DxfWriter& writer) {
  beginTable(writer, "STYLE", STYLE_TABLE, 1);
  beginEntry(writer, "STYLE", "AcDbTextStyleTableRecord", STYLE_TABLE, STANDARD_STYLE);
  writer.group(2, "Standard");
  writer.group(70, 0);
  writer.real(40, 0.0, 1);
  writer.real(41, 1.0, 1);
  writer.real(50, 0.0, 1);
  writer.group(71, 0);
  writer.real(42, 2.5, 1);
  writer.group(3, "txt");
  writer.group(4, "");
  endTable(writer);

  beginTable(writer, "VIEW", VIEW_TABLE, 0);
  endTable(writer);
  beginTable(writer, "UCS", UCS_TABLE, 0);
  endTable(writer);

  beginTable(writer, "APPID", APPID_TABLE, 2);
  for (const auto& [name, entry] :
       {std::pair{std::string_view("ACAD"), ACAD_APPID}, std::pair{kApplication, OWN_APPID}}) {
    beginEntry(writer, "APPID", "AcDbRegAppTableRecord", APPID_TABLE, entry);
    writer.group(2, name);
    writer.group(70, 0);
  }
  endTable(writer);

  beginTable(writer, "DIMSTYLE", DIMSTYLE_TABLE, 1);
  writer.group(100, "AcDbDimStyleTable");
  beginEntry(writer, "DIMSTYLE", "AcDbDimStyleTableRecord", DIMSTYLE_TABLE, STANDARD_DIMSTYLE, 105);
  writer.group(2, "Standard");
  writer.group(70, 0);
  endTable(writer);

  beginTable(writer, "BLOCK_RECORD", BLOCK_RECORD_TABLE, 3);
  const std::pair<std::string_view, unsigned long long> records[] = {
      {"*Model_Space", handle::kModelSpace},
      {"*Paper_Space", PAPER_SPACE},
      {kPointBlock, handle::kPointBlockRecord}};
  for (const auto& [name, entry] : records) {
    beginEntry(writer, "BLOCK_RECORD", "AcDbBlockTableRecord", BLOCK_RECORD_TABLE, entry);
    writer.group(2, name);
    const unsigned long long layout = entry == handle::kModelSpace ? MODEL_LAYOUT
                                      : entry == PAPER_SPACE       ? PAPER_LAYOUT
                                                                   : 0ULL;
    writer.reference(340, layout);
  }
  endTable(writer);
}

void writeBlock(DxfWriter& writer, std::string_view name, unsigned long long record, unsigned long long begin,
                int flags) {
  writer.group(0, word::kBlock);
  writer.reference(5, begin);
  writer.reference(330, record);
  writer.group(100, "AcDbEntity");
  writer.group(8, "0");
  writer.group(100, "AcDbBlockBegin");
  writer.group(2, name);
  writer.group(70, flags);
  writer.point(10, 0.0, 0.0, 0.0, 1);
  writer.group(3, name);
  writer.group(1, "");
}

void writeBlockEnd(DxfWriter& writer, unsigned long long record, unsigned long long end) {
  writer.group(0, word::kEndBlock);
  writer.reference(5, end);
  writer.reference(330, record);
  writer.group(100, "AcDbEntity");
  writer.group(8, "0");
  writer.group(100, "AcDbBlockEnd");
}

void writeBlocks(DxfWriter& writer, const DxfFrame& frame) {
  constexpr int kHasAttributes = 2;
  writer.group(0, word::kSection);
  writer.group(2, word::kBlocks);
  writeBlock(writer, "*Model_Space", handle::kModelSpace, MODEL_BLOCK, 0);
  writeBlockEnd(writer, handle::kModelSpace, MODEL_BLOCK_END);
  writeBlock(writer, "*Paper_Space", PAPER_SPACE, PAPER_BLOCK, 0);
  writeBlockEnd(writer, PAPER_SPACE, PAPER_BLOCK_END);
  writeBlock(writer, kPointBlock, handle::kPointBlockRecord, POINT_BLOCK, kHasAttributes);
  unsigned long long attribute = FIRST_ATTDEF;
  for (const DxfPointTag& tag : kPointTags) {
    writer.group(0, word::kAttributeDefinition);
    writer.reference(5, attribute++);
    writer.reference(330, handle::kPointBlockRecord);
    writer.group(100, "AcDbEntity");
    writer.group(8, "0");
    writer.group(100, "AcDbText");
    writer.point(10, tag.dx * frame.attributeHeight, tag.dy * frame.attributeHeight, 0.0, frame.decimals);
    writer.real(40, frame.attributeHeight, frame.decimals);
    writer.group(1, "");
    writer.group(100, "AcDbAttributeDefinition");
    writer.group(3, tag.tag);
    writer.group(2, tag.tag);
    writer.group(70, 0);
  }
  writeBlockEnd(writer, handle::kPointBlockRecord, POINT_BLOCK_END);
  writer.group(0, word::kEndSection);
}

void writeDictionary(DxfWriter& writer, unsigned long long self, unsigned long long owner,
                     std::initializer_list<std::pair<std::string_view, unsigned long long>> entries) {
  writer.group(0, "DICTIONARY");
  writer.reference(5, self);
  writer.reference(330, owner);
  writer.group(100, "AcDbDictionary");
  writer.group(281, 1);
  for (const auto& [name, entry] : entries) {
    writer.group(3, name);
    writer.reference(350, entry);
  }
}

void writeLayout(DxfWriter& writer, unsigned long long self, std::string_view name, int order,
                 unsigned long long blockRecord) {
  writer.group(0, "LAYOUT");
  writer.reference(5, self);
  writer.reference(330, LAYOUT_DICTIONARY);
  writer.group(100, "AcDbPlotSettings");
  writer.group(1, "");
  writer.group(2, "none_device");
  writer.group(4, "");
  writer.group(6, "");
  for (const int code : {40, 41, 42, 43, 44, 45, 46, 47, 48, 49})
    writer.real(code, 0.0, 1);
  writer.real(140, 0.0, 1);
  writer.real(141, 0.0, 1);
  writer.real(142, 1.0, 1);
  writer.real(143, 1.0, 1);
  writer.group(70, order == 0 ? 1024 : 0);
  writer.group(72, 1);
  writer.group(73, 0);
  writer.group(74, 5);
  writer.group(7, "");
  writer.group(75, 16);
  writer.real(147, 1.0, 1);
  writer.real(148, 0.0, 1);
  writer.real(149, 0.0, 1);
  writer.group(100, "AcDbLayout");
  writer.group(1, name);
  writer.group(70, 1);
  writer.group(71, order);
  writer.real(10, 0.0, 1);
  writer.real(20, 0.0, 1);
  writer.real(11, 420.0, 1);
  writer.real(21, 297.0, 1);
  writer.point(12, 0.0, 0.0, 0.0, 1);
  writer.point(14, 1e20, 1e20, 1e20, 1);
  writer.point(15, -1e20, -1e20, -1e20, 1);
  writer.real(146, 0.0, 1);
  writer.point(13, 0.0, 0.0, 0.0, 1);
  writer.point(16, 1.0, 0.0, 0.0, 1);
  writer.point(17, 0.0, 1.0, 0.0, 1);
  writer.group(76, 0);
  writer.reference(330, blockRecord);
}

}  // namespace

void writeFrameStart(DxfWriter& writer, const DxfFrame& frame) {
  writer.setNextHandle(handle::kFirstFreeHandle);
  writeHeader(writer, frame);
  writer.group(0, word::kSection);
  writer.group(2, word::kTables);
  writeViewport(writer, frame);
  writeLineTypes(writer, frame);
  writeLayers(writer, frame);
  writeSmallTables(writer);
  writer.group(0, word::kEndSection);
  writeBlocks(writer, frame);
  writer.group(0, word::kSection);
  writer.group(2, word::kEntities);
}

bool writeFrameEnd(DxfWriter& writer) {
  writer.group(0, word::kEndSection);
  writer.group(0, word::kSection);
  writer.group(2, "OBJECTS");
  writeDictionary(writer, ROOT_DICTIONARY, 0,
                  {{"ACAD_GROUP", GROUP_DICTIONARY}, {"ACAD_LAYOUT", LAYOUT_DICTIONARY}});
  writeDictionary(writer, GROUP_DICTIONARY, ROOT_DICTIONARY, {});
  writeDictionary(writer, LAYOUT_DICTIONARY, ROOT_DICTIONARY,
                  {{"Model", MODEL_LAYOUT}, {"Layout1", PAPER_LAYOUT}});
  writeLayout(writer, MODEL_LAYOUT, "Model", 0, handle::kModelSpace);
  writeLayout(writer, PAPER_LAYOUT, "Layout1", 1, PAPER_SPACE);
  writer.group(0, word::kEndSection);
  writer.group(0, word::kEndOfFile);
  return writer.patch(handleText(writer.nextHandle()));
}

}  // namespace vyn::ie::dxf
