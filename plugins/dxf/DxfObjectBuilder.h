#pragma once

#include <cmath>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "DxfRecord.h"
#include "DxfStyles.h"
#include "DxfText.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IEUtilsUnits.h"
#include "pointfiles/CodeText.h"

namespace vyn::ie {
class DexData;
class DexDataset;
class DexDesignPoint;
class DexLayer;
class DexObject;
class DexSurface;
class DexBreakline;
struct DexSettings;
}  // namespace vyn::ie

namespace vyn::ie::dxf {

// What an import left out, traced as it goes and summed up at the end: entities the model cannot
// hold (by type), malformed entities (the first kTracedProblems with their line), damaged group
// codes and a file that ends inside a section.
class DxfImportReport {
 public:
  explicit DxfImportReport(const CVynStringT<wchar_t>& fileName) : fileName_(fileName) {}

  void notHeld(std::string_view what) { ++notHeld_[std::string(what)]; }
  void malformed(std::string_view type, int line, int code);
  void badGroupCode(int line);
  void valueMissing(int line);
  void endsInside(std::string_view section);

  // Writes the counts; true when anything was left out.
  bool finish() const;

 private:
  bool traceNext();

  CVynStringT<wchar_t> fileName_;
  std::map<std::string, int> notHeld_;
  int malformed_ = 0;
  int traced_ = 0;
  bool incomplete_ = false;
};

// Turns the records of a drawing's tables, blocks and entities into the model: layers into the draw
// dictionary, entities into objects of the container's current dataset, 3D faces and meshes into
// surfaces. Feed it the records in file order; a POLYLINE gathers its VERTEX records and an INSERT
// its ATTRIB records up to their SEQEND (or the next other entity). finish() ends what is pending.
//
// Which objects are made follows the settings' data types: points for POINTS or POINT_LISTS; lines,
// breaklines, arcs and circles for LINES; areas and regions for AREAS; surfaces for SURFACES; text
// labels for POINTS or LINES. Coordinates are converted to meters by $INSUNITS, or by the settings'
// distance unit when the drawing gives none.
class DxfObjectBuilder {
 public:
  DxfObjectBuilder(DexData& data, DxfImportReport& report);
  ~DxfObjectBuilder();
  DxfObjectBuilder(const DxfObjectBuilder&) = delete;
  DxfObjectBuilder& operator=(const DxfObjectBuilder&) = delete;

  // ---- Header ---------------------------------------------------------------------------------
  void setUnitsCode(int insUnits);
  void setUtf8(bool utf8) { decoder_.setUtf8(utf8); }

  // ---- Tables and blocks ----------------------------------------------------------------------
  void addLayer(DxfRecord& record);
  void beginBlock(DxfRecord& record);
  void addAttributeDefinition(DxfRecord& record);

  // ---- Entities -------------------------------------------------------------------------------
  // One entity of model or paper space; ATTDEF, ENDBLK and table words are not entities.
  void addEntity(DxfRecord& record);
  void finish();

  // The objects and surfaces made so far.
  int made() const noexcept { return made_; }

 private:
  struct Style;
  struct Vertex {
    double x = 0.0, y = 0.0, z = 0.0, bulge = 0.0;
    int flags = 0;
    int corners[4] = {0, 0, 0, 0};
  };
  struct Extras;  // what the extended data carries
  struct BlockInfo {
    bool pointTags = false;                                      // an ATTDEF has a point tag
    std::vector<std::pair<std::string, std::string>> constants;  // constant ATTDEFs: tag, value
  };

  // Entities.
  void addPoint(DxfRecord& record);
  void addLine(DxfRecord& record);
  void addLwPolyline(DxfRecord& record);
  void addArc(DxfRecord& record, bool circle);
  void addText(DxfRecord& record, bool mtext);
  void addFace(DxfRecord& record);
  void finishPolyline();
  void finishInsert();
  bool readVertex(DxfRecord& record, Vertex& vertex);

  // Makes the line object the extended data names (a polyline when it names none) from vertices in
  // drawing coordinates and file units.
  void makeLine(DxfRecord& record, const std::vector<Vertex>& vertices, bool closed, bool heights);
  void makeSurfaceFaces(DxfRecord& record, const std::vector<Vertex>& vertices, int flags);
  // The triangles of one entity; their surface is found (or made) with the first of them.
  struct Faces;
  void addTriangle(Faces& faces, const Vertex& a, const Vertex& b, const Vertex& c);
  DexSurface* surfaceFor(DxfRecord& record, const Extras& extras);

  // Common parts.
  bool takeEntity(DxfRecord& record);  // false (and counted) when the entity cannot be taken
  bool skipMalformed(DxfRecord& record);
  Style readStyle(DxfRecord& record);
  void applyStyle(DexObject& object, const Style& style, int drawType);
  void finishObject(DexObject* object, DxfRecord& record, const Extras& extras, const Style& style,
                    int drawType);
  Extras readExtras(DxfRecord& record);
  // Adds the codes of a code text (the point files' syntax) to object; a malformed one is counted.
  void readCodes(std::wstring_view text, DexObject& object);
  const DexLayer* layerOf(std::string_view name);
  // The drawing point at code (10, 11, ...) in world coordinates; ocs for an entity's own plane.
  bool pointAt(DxfRecord& record, int code, bool ocs, Vertex& vertex);
  bool horizontal(DxfRecord& record, double& normalZ);
  CVynStringT<wchar_t> wide(std::string_view bytes) { return CVynStringT<wchar_t>(decoder_.plain(bytes)); }
  double meters(double value) const noexcept { return value * toMeters_; }
  // A length the model can hold: finite in meters and not its no-value marker.
  bool isFiniteLength(double value) const noexcept {
    return std::isfinite(meters(value)) && std::fabs(meters(value)) < kNoValue;
  }

  DexData& data_;
  DexDataset* dataset_;
  DxfImportReport& report_;
  DxfStyles styles_;
  DxfTextDecoder decoder_;
  point_files::CodeReader codes_;
  double toMeters_ = 1.0;
  bool readPoints_, readLines_, readAreas_, readSurfaces_, readLabels_;
  int made_ = 0;

  std::unordered_map<std::string, const DexLayer*> layers_;
  std::unordered_map<std::string, BlockInfo> blocks_;
  BlockInfo* currentBlock_ = nullptr;
  std::map<std::pair<const DexLayer*, std::wstring>, DexSurface*> surfaceByKey_;
  std::vector<std::pair<DexBreakline*, CVynStringT<wchar_t>>> breaklines_;

  // The entity that gathers the records after it, if any.
  enum class EPending { NONE, POLYLINE, INSERT } pending_ = EPending::NONE;
  DxfRecord owner_;
  std::vector<Vertex> vertices_;
  std::vector<std::pair<std::string, std::string>> attributes_;
  // The last POINT made, which an INSERT at the same place names.
  DexDesignPoint* lastPoint_ = nullptr;
  double lastX_ = 0.0, lastY_ = 0.0;
};

}  // namespace vyn::ie::dxf
