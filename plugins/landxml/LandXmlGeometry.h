#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "LandXmlReader.h"
#include "ieUtils/IEUtilsUnits.h"

// Plan geometry of LandXML read into vertices with bulges: the points of a Start, End, Center or PI
// element (coordinates or a pntRef), and the CoordGeom of plan features and parcels (Line, Curve,
// IrregularLine, Chain) as runs of connected vertices.
//
// A bulge is tan(delta / 4) of the arc from a vertex to the next, delta its central angle; it is
// positive when the arc turns counter-clockwise on the plan (north up, east to the right: LandXML's
// rot="ccw") and negative when it turns clockwise. Coordinates are in meters, north and east.
namespace vyn::ie::landxml {

// A vertex of linework. point is set for a vertex that stands for a design point (the vertices of a
// Chain); its coordinates are then the point's.
struct Vertex {
  double north = 0.0;
  double east = 0.0;
  double height = kNoValue;  // kNoValue: no height
  double bulge = 0.0;        // of the arc to the next vertex
  DexDesignPoint* point = nullptr;
};

// Vertices that follow one another without a gap.
struct Run {
  std::vector<Vertex> vertices;
  // True when the last vertex lies on the first (the run is closed: the last vertex is a repetition
  // of the first).
  bool isClosed() const;
};

// Plan distances below this count as the same position (joints of elements, closed runs).
inline constexpr double kSamePosition = 1e-4;
bool isSamePosition(const Vertex& a, const Vertex& b);

// The point of a Start, End, Center or PI element (LandXML's PointType): "northing easting
// [elevation]" text or a pntRef naming a design point read before.
class PointReader {
 public:
  // At the start tag: the attributes of element (pntRef; name, code and the others are counted as not
  // held).
  void start(ReadContext& context, std::wstring_view element, std::wstring_view attributes);
  void text(std::wstring_view text);
  // At the end tag: false, with a malformed record, when the text is not two or three numbers or the
  // reference names no point read before (and the element has no text of its own).
  bool end(ReadContext& context, std::wstring_view element, Vertex& vertex);
  // The pntRef of the element read last; empty when it had none.
  const std::wstring& reference() const noexcept { return reference_; }

 private:
  std::wstring text_;
  std::wstring reference_;
  bool hasText_ = false;
};

// Reads the elements of one CoordGeom. The owner calls begin() at the CoordGeom start tag and, while
// isOpen(), hands on every element inside it and the CoordGeom's own end tag; when end() answers true
// (the CoordGeom ended) runs() holds the geometry.
//  - Line: its Start and End.
//  - Curve: the bulge from Start, Center, End and rot (without Center: from the tangents through PI,
//    or from the radius as the minor arc); a full circle (Start on End) becomes two half arcs; a zero
//    radius is read as the chord, a malformed part.
//  - IrregularLine: the vertices of its point list, between Start and End.
//  - Chain: the design points it names (a name that names no point read before is skipped, a
//    malformed part).
//  - Spiral (the model's polylines hold none) is counted as not held; like any gap it ends the run.
// An element with a malformed point is skipped; elements join a run while each starts where the
// previous one ended.
class CoordGeomReader {
 public:
  explicit CoordGeomReader(ReadContext& context) : context_(context) {}

  // The CoordGeom's attributes are counted as not held.
  void begin(const ElementPath& path, std::wstring_view attributes);
  bool isOpen() const noexcept { return base_ > 0; }
  bool start(const ElementPath& path, std::wstring_view attributes);
  void text(const ElementPath& path, std::wstring_view text);
  bool end(const ElementPath& path);

  std::vector<Run>& runs() noexcept { return runs_; }
  // True when every vertex read came from a Chain.
  bool onlyChains() const noexcept { return onlyChains_; }

 private:
  enum class Kind { NONE, LINE, CURVE, IRREGULAR_LINE, CHAIN };

  int level(const ElementPath& path) const noexcept { return path.depth() - base_; }
  void startElement(std::wstring_view name, std::wstring_view attributes);
  void endElement();
  void addCurve();
  void addIrregularLine();
  void addChain();
  void addSegment(const Vertex& start, const Vertex& end, double bulge);
  void addVertex(const Vertex& vertex);

  ReadContext& context_;
  int base_ = 0;
  std::vector<Run> runs_;
  bool onlyChains_ = true;

  // The element being read.
  Kind kind_ = Kind::NONE;
  bool broken_ = false;  // a point of it was malformed
  PointReader point_;
  Vertex start_, end_, center_, pi_;
  bool hasStart_ = false, hasEnd_ = false, hasCenter_ = false, hasPi_ = false;
  int rotation_ = 0;  // 1 ccw, -1 cw, 0 not given
  double radius_ = kNoValue;
  std::vector<double> list_;
  int listDimension_ = 0;
  std::wstring chainText_;
};

}  // namespace vyn::ie::landxml
