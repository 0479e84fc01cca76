#pragma once

#include <array>
#include <string_view>
#include <vector>

#include "LandXmlText.h"
#include "LandXmlWords.h"
#include "ieUtils/IEUtilsUnits.h"

// Forms the text of the LandXML 1.2 document the exporter writes, one model object at a time, in the
// units and decimals of the settings. Coordinates are written "northing easting [elevation]"; arcs of
// linework (bulges, see LandXmlGeometry.h) become Curves with their centre.
namespace vyn::ie {
class DexAlignment;
class DexCurve;
class DexDesignPoint;
class DexLine2D;
class DexPosition2D;
class DexSpiral;
class DexStaEquationSet;
class DexVerticalAlignment;
class DexParcel;
class DexPolyLine;
class DexRegion;
class DexSurface;
struct DexSettings;
}  // namespace vyn::ie

namespace vyn::ie::landxml {

class LandXmlWriter {
 public:
  // The units are the settings' when LandXML can name them (meters and decimal degrees otherwise);
  // the decimals are coordDecimals (north, east, height), at most kMostDecimals.
  LandXmlWriter(const DexSettings& settings, XmlText& out);

  EDistUnits units() const noexcept { return units_; }

  // The XML declaration, the LandXML start tag with date and time, Units and Application.
  void header(std::string_view date, std::string_view time, std::string_view libraryVersion);
  // The LandXML end tag.
  void footer();

  // A collection element (CgPoints, PlanFeatures, Surfaces, Parcels) and its end; a group name (the
  // name of a CgPoints group) is written when it is not empty.
  void startCollection(std::string_view element, std::wstring_view groupName = {});
  void endCollection(std::string_view element);

  // ---- Points ------------------------------------------------------------------------------------
  // A CgPoint: name (left out when empty), code (the codes with their strings and attributes), desc
  // (the notes), state (the state flag) and the coordinates (no text when the point has none).
  void point(const DexDesignPoint& point);
  // A member of a CgPoints group: a CgPoint that only names the point with pntRef.
  void pointReference(const DexDesignPoint& point);

  // ---- Linework ------------------------------------------------------------------------------------
  // A PlanFeature named after the polyline; false (nothing written) when it has fewer than two nodes
  // with plan coordinates. With chainsAllowed, a point-mode polyline of straight segments between
  // points whose names are single words is written as a Chain of those names.
  bool planFeature(const DexPolyLine& polyline, bool chainsAllowed);

  // ---- Surfaces ------------------------------------------------------------------------------------
  // The start of a Surface with its breaklines; hasDefinition opens its Definition and Pnts (a TIN
  // needs three positions and a face at least).
  void startSurface(const DexSurface& surface, bool hasDefinition);
  // Positions [first, last) as P elements, with ids index + 1.
  void positions(const DexSurface& surface, int first, int last);
  void startFaces();
  // Triangles [first, last) as F elements; answers how many were left out because a corner is not a
  // position of the surface.
  int faces(const DexSurface& surface, int first, int last);
  void endSurface(bool hasDefinition);

  // ---- Parcels -------------------------------------------------------------------------------------
  // A Parcel: its name, its central point as Center (with pntRef when pointsWritten) and its boundary
  // (may be null) as a closed CoordGeom.
  void parcel(const DexParcel& parcel, const DexRegion* boundary, bool pointsWritten);

  // ---- Alignments ----------------------------------------------------------------------------------
  // An Alignment: name, length and staStart; the elements of its horizontal alignment as a CoordGeom
  // of Lines, Curves and Spirals (a spiral's radius 0 written "INF"); the equations of its
  // station-equation set (or its horizontal alignment's) as StaEquations; its vertical alignments as
  // the ProfAligns of one Profile, from their vertical elements or, without any, their long sections.
  // Answers how many elements were left out (intersection points, which LandXML keeps apart from the
  // geometry).
  int alignment(const DexAlignment& alignment);

 private:
  struct Node {
    double north;
    double east;
    double height;  // kNoValue: none
    double bulge;
  };

  void coordinates(double north, double east, double height);
  void pointElement(std::string_view element, const Node& node);
  void coordGeom(const std::vector<Node>& nodes, bool closed);
  void segment(const Node& start, const Node& end);
  double distance(double meters) const;
  // An azimuth (decimal degrees clockwise from north) in the document's direction unit.
  void direction(std::string_view name, double azimuth);
  void planPoint(std::string_view element, const DexPosition2D& position);
  void line(const DexLine2D& line);
  void curve(const DexCurve& curve);
  void spiral(const DexSpiral& spiral);
  void staEquations(const DexStaEquationSet& set);
  void profile(const DexVerticalAlignment& profile);
  void profileVertex(std::string_view element, double station, double level);

  XmlText& out_;
  EDistUnits units_ = METERS;
  EAngleUnits angleUnits_ = DECDEG;
  std::array<int, 3> decimals_{3, 3, 3};
  std::wstring codes_;
  std::vector<Node> nodes_;
};

}  // namespace vyn::ie::landxml
