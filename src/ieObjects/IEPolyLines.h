#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieObjects/IEObjectBase.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEStation.h"

// The line objects of a dataset: polylines, areas and breaklines.
namespace vyn::ie {

class DexDesignPoint;

// A polyline: a name, an id, a closed flag, its own (line) drawing properties and its vertices, held
// in one of two modes chosen at construction:
// - station mode (usingPoints false): the polyline's own stations, each with the bulge of the arc to
//   the next vertex;
// - point mode (usingPoints true): references to design points of the dataset, each with a bulge.
//   The points are not owned; they must outlive the polyline (both live in one dataset).
// The node operations read either mode.
//
// The polyline owns its drawing properties (see DexObject for copy and clone). Copies of a point-mode
// polyline refer to the same points. clone() copies the common part, the vertices (point entries, or
// stations through addStation), the name, the id and the closed flag.
class DEX_API DexPolyLine : public DexObject, public IDexIdInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // A vertex of a point-mode polyline: the referenced design point (not owned) and the bulge of the
  // arc to the next vertex.
  struct PointEntry {
    DexDesignPoint* point = nullptr;
    double bulge = 0.0;
  };

  // Tolerances within which a station added to the polyline repeats the last one (see addStation):
  // geographic coordinates (csType CS_GEOGRAPHIC) in degrees, all others in meters.
  static constexpr double kGeographicVertexTolerance = 9e-9;
  static constexpr double kVertexTolerance = 0.0001;

  // ---- Construction ---------------------------------------------------------------------------
  // An open polyline without vertices in the given mode.
  explicit DexPolyLine(bool usingPoints = false);
  DexPolyLine(const DexPolyLine& other) = default;
  DexPolyLine& operator=(const DexPolyLine& other) = default;
  ~DexPolyLine() override;

  // ---- DexObject ------------------------------------------------------------------------------
  DexObject* clone() const override;
  // Each own station's shiftCoords; referenced points are not shifted here (the dataset shifts them
  // as objects of their own).
  void shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                   double rotation) override;
  // GROUP_LINES.
  EGroupType getGroupType() override;
  const IDexDrawProperties* getDrawProperties() const override { return drawProperties_.get(); }
  void setDrawProperties(IDexDrawProperties* properties) override { drawProperties_.reset(properties); }

  // OBJECT_TYPE_POLYLINE.
  EDexObjectsType getType() override;
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  void setId(const CVynStringT<wchar_t>& id) override { id_ = id; }
  const CVynStringT<wchar_t>& getId() const override { return id_; }

  bool isUsingPoints() const noexcept { return usingPoints_; }
  bool isClosed() const noexcept { return closed_; }
  void setCloseStatus(bool closed) noexcept { closed_ = closed; }
  // The drawing properties as line properties; null when there are none or they are of another class.
  const DexDrawLineProperties* getDrawLineProperties() const;
  DexDrawLineProperties* getDrawLineProperties();

  // ---- Station mode ---------------------------------------------------------------------------
  // Appends a copy of station, unless it repeats the last station: when both match within
  // kGeographicVertexTolerance (station's csType is CS_GEOGRAPHIC) or kVertexTolerance (any other
  // csType) in x, y and z, a station with bulge exactly 0 is dropped and one with a bulge replaces the
  // last station, so the bulge of a repeated vertex wins.
  void addStation(const DexStation& station);
  int getNumberOfStations() const noexcept { return static_cast<int>(stations_.size()); }
  // The station at index. For an index outside the list an error-log record is written (line 503)
  // and a shared read-only default station is answered, which the caller must not use as a vertex.
  const DexStation& getStation(int index) const;
  // The last station, or null when there is none.
  DexStation* getLastStation() noexcept;
  const DexStation* getLastStation() const noexcept;
  // Assigns station to the station at index (or the last one) and answers true; false, with nothing
  // changed, when there is no such station.
  bool changeStation(int index, const DexStation& station);
  bool changeLastStation(const DexStation& station);
  // Removes the station at index and answers true; false for an index outside the list.
  bool removeStation(int index);
  // Makes room for count stations (a count of 0 or below changes nothing).
  void reserveNumberOfStations(int count);

  // ---- Point mode -----------------------------------------------------------------------------
  // Appends an entry referring to point (not owned, not checked, never merged).
  void addPoint(DexDesignPoint* point, double bulge = 0.0);
  int getNumberOfPoints() const noexcept { return static_cast<int>(points_.size()); }
  // The point of the entry at index, or null when index is outside the list.
  DexDesignPoint* getPoint(int index) const noexcept;
  // The entry at index, or null when index is outside the list.
  const PointEntry* getPointEntry(int index) const noexcept;
  // Removes the entry at index (the point stays) and answers true; false for an index outside the list.
  bool removePoint(int index);

  // ---- Either mode ----------------------------------------------------------------------------
  // The number of point entries (point mode) or stations (station mode).
  int getNumberOfNodes() const noexcept;
  // The station of node index: the own station, or the referenced point's station. For an index
  // outside the nodes (line 504), or an entry without point (line 505), an error-log record is written
  // and the shared read-only default station is answered.
  const DexStation& getNodeStation(int index) const;
  // The bulge of node index: the station's, or the entry's; 0.0 for an index outside the nodes.
  double getNodeBulge(int index) const noexcept;
  // Sets the bulge of node index and answers true; false for an index outside the nodes.
  bool setNodeBulge(int index, double bulge) noexcept;

  // ---- Code string ----------------------------------------------------------------------------
  // True when the polyline is in point mode and its points carry its name as a code string: a code of
  // the first point has a code string s with s, or the code's name followed by s, equal to the name,
  // and every following point has a code with a code string equal to the name (exact comparisons).
  // False in station mode, without points, and when a point is missing or has no codes.
  bool isCodeString() const;

 protected:
  // Gives target the vertices of this polyline: the point entries in point mode, otherwise the
  // stations (through addStation). The clones of the subclasses share it.
  void copyVerticesTo(DexPolyLine& target) const;
  // Gives target every station through addStation.
  void copyStationsTo(DexPolyLine& target) const;

 private:
  vyn_vector<DexStation> stations_;
  vyn_vector<PointEntry> points_;
  bool closed_ = false;
  bool usingPoints_ = false;
  CVynStringT<wchar_t> name_;
  CVynStringT<wchar_t> id_;
  DexOwnedDrawProperties drawProperties_;
};

// An area: a polyline that starts closed and has area drawing properties besides its line ones.
//
// The area owns both property objects. clone() copies the common part, the area drawing properties,
// the vertices, the name and the closed flag, but not the id.
class DEX_API DexArea : public DexPolyLine {
 public:
  VYN_CLASS_ALLOCATOR

  // A closed area without vertices in the given mode.
  explicit DexArea(bool usingPoints = false);
  DexArea(const DexArea& other) = default;
  DexArea& operator=(const DexArea& other) = default;
  ~DexArea() override;

  DexObject* clone() const override;
  // OBJECT_TYPE_AREA.
  EDexObjectsType getType() override;

  DexDrawAreaProperties* getAreaDrawProperties() noexcept { return areaDrawProperties_.get(); }
  const DexDrawAreaProperties* getAreaDrawProperties() const noexcept { return areaDrawProperties_.get(); }
  // Takes ownership of properties (null allowed) and deletes the object held before, unless it is the
  // same pointer.
  void setAreaDrawProperties(DexDrawAreaProperties* properties) noexcept {
    areaDrawProperties_.reset(properties);
  }

 private:
  DexOwnedPointer<DexDrawAreaProperties, DexCopyByCloneAs> areaDrawProperties_;
};

// A breakline of a surface: a station-mode polyline with the name of its surface and a breakline
// type, which the model only stores.
//
// clone() copies the common part, the stations and the name only: not the id, the closed flag or the
// breakline type.
class DEX_API DexBreakline : public DexPolyLine {
 public:
  VYN_CLASS_ALLOCATOR

  // How the surface behaves across the line. Any value cast from a number is stored.
  enum EDexBreaklineType : std::int32_t {
    BREAKLINE_HARD = 0,  // the surface may change slope sharply across the line; the default
    BREAKLINE_SOFT = 1,  // the surface stays smooth across the line
  };

  // A station-mode polyline of the surface named surfaceName.
  explicit DexBreakline(const CVynStringT<wchar_t>& surfaceName = CVynStringT<wchar_t>());
  DexBreakline(const DexBreakline& other) = default;
  DexBreakline& operator=(const DexBreakline& other) = default;
  ~DexBreakline() override;

  // The one operation the breakline adds to the virtual table, after those of the polyline.
  virtual const CVynStringT<wchar_t>& getSurfaceName() const;

  DexObject* clone() const override;
  // OBJECT_TYPE_BREAKLINE.
  EDexObjectsType getType() override;

  EDexBreaklineType getBreaklineType() const noexcept { return breaklineType_; }
  // A EDexBreaklineType value or its number.
  void setBreaklineType(int type) noexcept { breaklineType_ = static_cast<EDexBreaklineType>(type); }

 private:
  CVynStringT<wchar_t> surfaceName_;
  EDexBreaklineType breaklineType_ = BREAKLINE_HARD;
};

}  // namespace vyn::ie
