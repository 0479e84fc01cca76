#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

#include "LandXmlGeometry.h"
#include "LandXmlReader.h"
#include "pointfiles/CodeText.h"

// The handlers of the collections the plug-in reads, one per collection of the root. Each turns the
// elements it is handed into model objects of the run's dataset as the elements end, so that a
// document that breaks off keeps everything read before the break.
namespace vyn::ie {
class DexBreakline;
class DexObjectList;
class DexSurface;
}  // namespace vyn::ie

namespace vyn::ie::landxml {

// Units: the Metric or Imperial element sets the file's units (linearUnit, angularUnit,
// directionUnit). An unknown word, or a file without Units, leaves the fallback: the settings' unit
// when it is one LandXML can name, else meters (radians for angles, the schema's default). The units
// of values the plug-in does not read (area, volume, temperature, pressure, elevation attributes,
// latitudes and the rest) are read over.
class UnitsHandler final : public CollectionHandler {
 public:
  UnitsHandler(ReadContext& context, const FileUnits& fallback);
  bool start(const ElementPath& path, std::wstring_view attributes) override;

 private:
  ReadContext& context_;
};

// CgPoints: one design point per CgPoint, named by name, with its coordinates from the "northing
// easting [elevation]" text (in the file's linear unit) or, for a point without text, from the point
// its pntRef names; desc becomes the station's notes, state one of the state flags (LandXmlWords.h)
// and code the point's codes (codes separated by blanks, each as CODE[:STRING...][;ATTRIBUTE=VALUE...]
// like the point files; a code text that is not of that form is one code). A text that is not 2 or 3
// numbers, or a pntRef to no point read before, skips the point (malformed); a point with neither
// text nor pntRef has no coordinates. With lists wanted, a named CgPoints group becomes an object list of its
// points, and a CgPoint without name and text that only names a point with pntRef adds that point to it.
class CgPointsHandler final : public CollectionHandler {
 public:
  CgPointsHandler(ReadContext& context, bool withLists);
  bool start(const ElementPath& path, std::wstring_view attributes) override;
  void text(const ElementPath& path, std::wstring_view text) override;
  void end(const ElementPath& path) override;

 private:
  void startGroup(std::wstring_view attributes);
  void startPoint(std::wstring_view attributes);
  void endPoint();
  bool readCoordinates(double& north, double& east, double& height);
  void addCodes(DexDesignPoint& point);

  ReadContext& context_;
  const bool withLists_;
  point_files::CodeReader codes_;
  std::wstring rejectedCodes_;
  std::vector<DexObjectList*> groups_;  // the open CgPoints, null for one without a list
  std::wstring name_;
  std::wstring code_;
  std::wstring desc_;
  std::wstring reference_;
  std::wstring text_;
  bool hasName_ = false;
  bool hasText_ = false;
  unsigned stateFlag_ = 0;
};

// PlanFeatures: each PlanFeature's CoordGeom becomes polylines named after the feature, one per run of
// connected elements (LandXmlGeometry.h); a closed run is a closed polyline without the repeated
// vertex. A feature whose geometry is only Chains refers to the design points it names (point mode);
// any other holds its own stations.
class PlanFeaturesHandler final : public CollectionHandler {
 public:
  explicit PlanFeaturesHandler(ReadContext& context) : context_(context), geometry_(context) {}
  bool start(const ElementPath& path, std::wstring_view attributes) override;
  void text(const ElementPath& path, std::wstring_view text) override;
  void end(const ElementPath& path) override;

 private:
  void addPolylines();

  ReadContext& context_;
  CoordGeomReader geometry_;
  std::wstring name_;
};

// Surfaces: one surface per Surface, named by name; its Definition's Pnts become positions (by id) and
// its Faces triangles (a face of four corners, as grids have, two triangles); a face that names a
// point the Pnts did not give is skipped (malformed). Breaklines of its SourceData become breaklines of
// the dataset (station mode, with the surface's name and the breakline type of brkType) that the
// surface refers to.
class SurfacesHandler final : public CollectionHandler {
 public:
  explicit SurfacesHandler(ReadContext& context) : context_(context) {}
  bool start(const ElementPath& path, std::wstring_view attributes) override;
  void text(const ElementPath& path, std::wstring_view text) override;
  void end(const ElementPath& path) override;

 private:
  void startSurface(std::wstring_view attributes);
  void startBreakline(std::wstring_view attributes);
  void addPosition(std::int64_t id, std::wstring_view text);
  void addFace(std::wstring_view text);
  void endBreakline();
  int positionOf(std::int64_t id) const;

  ReadContext& context_;
  DexSurface* surface_ = nullptr;
  std::int64_t pointId_ = 0;  // of the P being read, 0 when it has none
  // Position index + 1 by P id: dense ids in the vector, others in the map.
  std::vector<int> positionsById_;
  std::unordered_map<std::int64_t, int> sparsePositions_;
  std::unique_ptr<DexBreakline> breakline_;
  std::vector<double> breaklineValues_;
  int breaklineDimension_ = 0;
};

// Parcels: one parcel per Parcel (nested Parcels are read as parcels of the dataset too), named by name.
// Its Center becomes the parcel's central point: the design point its pntRef names, or a new design
// point named after the parcel at the Center's coordinates. Its CoordGeom becomes its boundary: a
// region of the dataset with the parcel's name and the type kParcelBoundaryRegion, and a horizontal
// alignment of the same name (in the alignment parts dictionary) that the parcel refers to.
class ParcelsHandler final : public CollectionHandler {
 public:
  explicit ParcelsHandler(ReadContext& context) : context_(context), geometry_(context) {}
  bool start(const ElementPath& path, std::wstring_view attributes) override;
  void text(const ElementPath& path, std::wstring_view text) override;
  void end(const ElementPath& path) override;

 private:
  struct Parcel {
    std::wstring name;
    Vertex center;
    bool hasCenter = false;
    DexDesignPoint* centerPoint = nullptr;
    std::vector<Vertex> boundary;
  };

  void startParcel(std::wstring_view attributes);
  void endCenter();
  void addBoundary();
  void endParcel();

  ReadContext& context_;
  CoordGeomReader geometry_;
  PointReader center_;
  std::vector<Parcel> open_;  // the parcels being read, innermost last
};

// Alignments: one alignment of the dataset per Alignment (name, staStart, length), with
//  - its CoordGeom as a horizontal alignment of the same name in the parts dictionary: a Line becomes
//    a DexLine2D, a Curve a DexCurve, a Spiral a DexSpiral (spiType, rot, radiusStart and radiusEnd,
//    "INF" held as 0, the radius of a straight end; constant), lengths in meters and azimuths in
//    decimal degrees clockwise from north: dir, dirStart and dirEnd where given (in the file's
//    direction unit), else from the element's points (a Curve from its centre, a Spiral from its
//    tangents through PI). A Curve without Center takes the minor arc of its radius; a
//    Curve of zero radius becomes the Line of its chord, a malformed part;
//  - its StaEquations as a station-equation set named after the alignment (staInternal the running
//    chainage), validated; a set the dictionary refuses is a malformed part;
//  - each ProfAlign of its Profiles as a vertical alignment named after the ProfAlign, holding both a
//    vertical element and a long section per PVI, ParaCurve, UnsymParaCurve and CircCurve (see
//    README: grades in percent, stations and levels in meters).
// CrossSects, ProfSurf, Superelevation, AlignPIs and the rest are counted as not held.
class AlignmentsHandler final : public CollectionHandler {
 public:
  explicit AlignmentsHandler(ReadContext& context);
  ~AlignmentsHandler() override;
  bool start(const ElementPath& path, std::wstring_view attributes) override;
  void text(const ElementPath& path, std::wstring_view text) override;
  void end(const ElementPath& path) override;
  void finish() override;

 private:
  struct Road;
  bool startInAlignment(const ElementPath& path, std::wstring_view attributes);
  void startAlignment(std::wstring_view attributes);
  void endAlignment();
  void startGeometry(std::wstring_view name, std::wstring_view attributes);
  void endGeometry();
  void addStaEquation(std::wstring_view attributes);
  void startProfile(std::wstring_view attributes);
  void startProfAlign(std::wstring_view attributes);
  void startVertex(std::wstring_view name, std::wstring_view attributes);
  void endVertex();
  void endProfAlign();

  ReadContext& context_;
  std::unique_ptr<Road> road_;  // the Alignment being read, null outside one
};

}  // namespace vyn::ie::landxml
