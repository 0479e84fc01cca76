#pragma once

#include <cstddef>
#include <string_view>

#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEResult.h"

// The words, group codes and limits of AutoCAD DXF that the DXF importer and exporter share.
//
// A DXF file is a list of groups, each two lines: an integer group code, then its value. Group 0
// starts a structure (SECTION, TABLE, an entity); group 2 names a section, table or block; group 9 a
// header variable. The drawing's X axis is the easting and its Y axis the northing: the model's x
// (northing) is written as Y and its y (easting) as X. Angles are degrees counter-clockwise from the
// X axis, and a positive bulge turns counter-clockwise, both as seen on the drawing; the model keeps
// them so.
namespace vyn::ie::dxf {

// "AutoCAD DXF (*.dxf)".
inline constexpr const wchar_t* kDxfFormatId = L"{5373CF88-2FB9-458D-B233-3F539F08C588}";

// True for the DXF format of the registry.
inline bool isDxfFormat(const DexFormat* format) {
  return format != nullptr && format->isIdEqual(kDxfFormatId);
}

// The remark of an import that read the drawing but left something out: entities the model cannot
// hold, entities whose values are not numbers, paper space, or a file that ends inside a section.
// Each kind is traced with its count; the first kTracedProblems malformed entities with their line.
inline constexpr EDexResult kResultEntitiesSkipped = static_cast<EDexResult>(23);
inline constexpr int kTracedProblems = 10;

// ---- Group codes ----------------------------------------------------------------------------------
namespace group {
inline constexpr int kStructure = 0;  // SECTION, ENDSEC, TABLE, an entity type, EOF
inline constexpr int kText = 1;       // the text of TEXT, MTEXT, ATTRIB; an attribute's value
inline constexpr int kName = 2;       // a section, table entry, block or attribute tag
inline constexpr int kMoreText = 3;   // the leading chunks of a long MTEXT text
inline constexpr int kHandle = 5;
inline constexpr int kLineType = 6;
inline constexpr int kTextStyle = 7;
inline constexpr int kLayer = 8;
inline constexpr int kVariable = 9;  // a header variable, "$INSUNITS"
inline constexpr int kX = 10;        // the first point; 11 to 13 the next ones
inline constexpr int kY = 20;
inline constexpr int kZ = 30;
inline constexpr int kElevation = 38;
inline constexpr int kRadius = 40;  // also a text's height
inline constexpr int kBulge = 42;
inline constexpr int kStartAngle = 50;  // also a text's rotation
inline constexpr int kEndAngle = 51;
inline constexpr int kColor = 62;  // an AutoCAD Color Index, 0 by block, 256 by layer
inline constexpr int kEntitiesFollow = 66;
inline constexpr int kPaperSpace = 67;
inline constexpr int kFlags = 70;
inline constexpr int kFlags71 = 71;  // MTEXT attachment point; mesh and face vertex indexes
inline constexpr int kFlags72 = 72;  // TEXT horizontal justification
inline constexpr int kFlags73 = 73;  // TEXT vertical justification
inline constexpr int kFlags74 = 74;
inline constexpr int kVertexCount = 90;
inline constexpr int kSubclass = 100;
inline constexpr int kExtrusionX = 210;
inline constexpr int kExtrusionY = 220;
inline constexpr int kExtrusionZ = 230;
inline constexpr int kPlot = 290;
inline constexpr int kOwner = 330;
inline constexpr int kLineWeight = 370;
inline constexpr int kTrueColor = 420;  // 0x00RRGGBB
inline constexpr int kComment = 999;
inline constexpr int kXdataText = 1000;
inline constexpr int kXdataApplication = 1001;
}  // namespace group

// The offset from the X group of a point to its Y and Z groups (10, 20, 30; 11, 21, 31; ...).
inline constexpr int kToY = 10;
inline constexpr int kToZ = 20;

// ---- Colours, line types and weights -----------------------------------------------------------
inline constexpr int kColorByBlock = 0;
inline constexpr int kColorByLayer = 256;
inline constexpr int kColorForeground = 7;  // white on a dark screen, black on paper
inline constexpr int kLineWeightByLayer = -1;
inline constexpr int kLineWeightByBlock = -2;
inline constexpr int kLineWeightDefault = -3;
inline constexpr std::string_view kLineTypeByLayer = "BYLAYER";
inline constexpr std::string_view kLineTypeByBlock = "BYBLOCK";

// ---- Words ----------------------------------------------------------------------------------------
namespace word {
inline constexpr std::string_view kSection = "SECTION";
inline constexpr std::string_view kEndSection = "ENDSEC";
inline constexpr std::string_view kEndOfFile = "EOF";
inline constexpr std::string_view kHeader = "HEADER";
inline constexpr std::string_view kTables = "TABLES";
inline constexpr std::string_view kBlocks = "BLOCKS";
inline constexpr std::string_view kEntities = "ENTITIES";
inline constexpr std::string_view kTable = "TABLE";
inline constexpr std::string_view kEndTable = "ENDTAB";
inline constexpr std::string_view kLayer = "LAYER";
inline constexpr std::string_view kBlock = "BLOCK";
inline constexpr std::string_view kEndBlock = "ENDBLK";
inline constexpr std::string_view kPoint = "POINT";
inline constexpr std::string_view kLine = "LINE";
inline constexpr std::string_view kLwPolyline = "LWPOLYLINE";
inline constexpr std::string_view kPolyline = "POLYLINE";
inline constexpr std::string_view kVertex = "VERTEX";
inline constexpr std::string_view kSequenceEnd = "SEQEND";
inline constexpr std::string_view kArc = "ARC";
inline constexpr std::string_view kCircle = "CIRCLE";
inline constexpr std::string_view kText = "TEXT";
inline constexpr std::string_view kMText = "MTEXT";
inline constexpr std::string_view kFace = "3DFACE";
inline constexpr std::string_view kInsert = "INSERT";
inline constexpr std::string_view kAttribute = "ATTRIB";
inline constexpr std::string_view kAttributeDefinition = "ATTDEF";

// Header variables.
inline constexpr std::string_view kVersionVariable = "$ACADVER";
inline constexpr std::string_view kUnitsVariable = "$INSUNITS";
inline constexpr std::string_view kCodePageVariable = "$DWGCODEPAGE";
// The first version whose texts are UTF-8 (AutoCAD 2007); older files use their code page.
inline constexpr std::string_view kFirstUtf8Version = "AC1021";
}  // namespace word

// POLYLINE flags (group 70).
namespace polyline_flag {
inline constexpr int kClosed = 1;
inline constexpr int k3dPolyline = 8;
inline constexpr int kPolygonMesh = 16;
inline constexpr int kMeshClosedN = 32;
inline constexpr int kPolyfaceMesh = 64;
}  // namespace polyline_flag
// VERTEX flags (group 70): a position of a polyface mesh has both bits, a face only the second.
inline constexpr int kVertexMeshPosition = 64;
inline constexpr int kVertexFaceRecord = 128;

// ---- The exchange's own conventions -------------------------------------------------------------

// The block every exported point is inserted as, and the tags of its attributes. An INSERT whose
// attributes carry one of the tags of each list (any case) is read as a point: the first list names
// it, the second gives its height, the third its codes (the point files' code text, "EP:1 KERB:L").
inline constexpr std::string_view kPointBlock = "DEX_POINT";
inline constexpr std::string_view kNameTag = "NAME";
inline constexpr std::string_view kHeightTag = "HEIGHT";
inline constexpr std::string_view kCodeTag = "CODE";
inline constexpr std::string_view kNameTags[] = {"NAME", "POINT", "PNTNO", "PTNO", "PT", "NUMBER", "ID"};
inline constexpr std::string_view kHeightTags[] = {"HEIGHT", "ELEV", "ELEVATION", "Z", "HT"};
inline constexpr std::string_view kCodeTags[] = {"CODE", "CODES", "DESC", "DESCRIPTION", "DESCRIPTOR"};

// The application of the extended data (groups 1001 and 1000) that carries what DXF has no place
// for: the kind of the model object, its name, its codes and, for a breakline, its surface.
inline constexpr std::string_view kApplication = "DEXCHANGE";
namespace kind {
inline constexpr std::string_view kPolyline = "POLYLINE";
inline constexpr std::string_view kArea = "AREA";
inline constexpr std::string_view kRegion = "REGION";
inline constexpr std::string_view kBreakline = "BREAKLINE";
inline constexpr std::string_view kArc = "ARC";
inline constexpr std::string_view kClockwiseArc = "CLOCKWISE_ARC";
inline constexpr std::string_view kCircle = "CIRCLE";
inline constexpr std::string_view kLabel = "LABEL";
inline constexpr std::string_view kSurface = "SURFACE";
}  // namespace kind

// ---- Limits ---------------------------------------------------------------------------------------

// A line longer than this is cut (and its entity skipped as malformed): bounded memory for files
// that are not DXF.
inline constexpr std::size_t kMaxLineBytes = 1 << 16;
// Room made ahead for the vertices a count in the file announces, at most.
inline constexpr std::size_t kMaxReservedVertices = 1 << 16;
// The texts DXF holds in one group (extended data strings, MTEXT chunks).
inline constexpr std::size_t kMaxXdataTextBytes = 255;
inline constexpr std::size_t kMTextChunkBytes = 250;

}  // namespace vyn::ie::dxf
