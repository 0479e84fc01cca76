#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEObjectBase.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IEStation.h"

// The point objects of a dataset: design points, point-to-line points and sheet points.
namespace vyn::ie {

// A design point: one station (which also holds the point's name), its own drawing properties, a list
// of texts that the model copies with the point and otherwise leaves to hosts and plug-ins, and whether
// the point takes part in a surface (true by default).
//
// The point owns its drawing properties (see DexObject for copy and clone). clone() copies the common
// part, the station and the text list, not the surface flag.
class DEX_API DexDesignPoint : public DexObject {
 public:
  VYN_CLASS_ALLOCATOR

  // ---- Construction ---------------------------------------------------------------------------
  // A station with attribute flags 2 and coordinate-system kind 5, no drawing properties, used in
  // surfaces, state 1.
  DexDesignPoint();
  DexDesignPoint(const DexDesignPoint& other) = default;
  DexDesignPoint& operator=(const DexDesignPoint& other) = default;
  ~DexDesignPoint() override;

  // ---- DexObject ------------------------------------------------------------------------------
  DexObject* clone() const override;
  // The station's shiftCoords.
  void shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                   double rotation) override;
  // GROUP_POINTS.
  EGroupType getGroupType() override;

 protected:
  // The common part, then the station (through the target's setStation) and the text list, when
  // target is a design point.
  void copyCommonData(DexObject* target) const override;

 public:
  const IDexDrawProperties* getDrawProperties() const override { return drawProperties_.get(); }
  void setDrawProperties(IDexDrawProperties* properties) override { drawProperties_.reset(properties); }

  // OBJECT_TYPE_DESIGN_POINT.
  EDexObjectsType getType() override;
  // The name is the station's.
  void setName(const CVynStringT<wchar_t>& name) override { station_.setName(name); }
  const CVynStringT<wchar_t>& getName() const override { return station_.getName(); }

  // ---- Station and coordinates ----------------------------------------------------------------
  const DexStation& getStation() const noexcept { return station_; }
  // Takes the whole station, except that a point with a name keeps it when station has none.
  void setStation(const DexStation& station);
  // The station's setPosition: kNoValue marks the horizontal coordinates or the height undefined.
  void setCoords(double x, double y, double z) { station_.setPosition(x, y, z); }
  // As above, then the station's geoid height.
  void setCoords(double x, double y, double z, double geoidHeight) {
    station_.setPosition(x, y, z, geoidHeight);
  }
  bool isHeightDefined() const { return station_.isHeightDefined(); }
  bool isHorizCoordsDefined() const { return station_.isHorizCoordsDefined(); }

  // ---- Further properties ---------------------------------------------------------------------
  bool isUsedInSurface() const noexcept { return usedInSurface_; }
  void setUsedInSurface(bool used) noexcept { usedInSurface_ = used; }
  // Texts free for hosts and plug-ins; the model only copies them with the point.
  CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&>& getUserStrings() noexcept {
    return userStrings_;
  }
  const CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&>& getUserStrings() const noexcept {
    return userStrings_;
  }

 private:
  DexStation station_{2, CS_LOCAL};
  DexOwnedDrawProperties drawProperties_;
  CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&> userStrings_;
  bool usedInSurface_ = true;
};

// A point given relative to the line through two reference points: the ids of the first and second
// reference points and the kind of its coordinates, which the model only stores and copies.
class DEX_API DexPtlPoint : public DexDesignPoint {
 public:
  VYN_CLASS_ALLOCATOR

  // How a point-to-line point's coordinates are given. Any value cast from a number is stored.
  enum ECoordType : std::int32_t {
    PTL_COORDS_GRID = 0,            // grid coordinates only
    PTL_COORDS_STATION_OFFSET = 1,  // station along the line and offset from it; the default
  };

  // ---- Construction ---------------------------------------------------------------------------
  // Reference point ids and coordinate type (an ECoordType value or its number), as setPtlParams.
  explicit DexPtlPoint(const CVynStringT<wchar_t>& firstReferencePointIds = CVynStringT<wchar_t>(),
                       const CVynStringT<wchar_t>& secondReferencePointIds = CVynStringT<wchar_t>(),
                       int coordType = PTL_COORDS_STATION_OFFSET);
  DexPtlPoint(const DexPtlPoint& other) = default;
  DexPtlPoint& operator=(const DexPtlPoint& other) = default;
  ~DexPtlPoint() override;

  // A new point-to-line point with the same reference ids and coordinate type, then the common part,
  // station and text list as for a design point.
  DexObject* clone() const override;
  // OBJECT_TYPE_PTL_POINT.
  EDexObjectsType getType() override;

  // ---- Reference line -------------------------------------------------------------------------
  void setPtlParams(const CVynStringT<wchar_t>& firstReferencePointIds,
                    const CVynStringT<wchar_t>& secondReferencePointIds, int coordType);
  const CVynStringT<wchar_t>& getFirstReferencePointIds() const noexcept { return firstReferencePointIds_; }
  const CVynStringT<wchar_t>& getSecondReferencePointIds() const noexcept { return secondReferencePointIds_; }
  ECoordType getCoordType() const noexcept { return coordType_; }

 private:
  CVynStringT<wchar_t> firstReferencePointIds_;
  CVynStringT<wchar_t> secondReferencePointIds_;
  ECoordType coordType_ = PTL_COORDS_STATION_OFFSET;
};

// A sheet point: a named list of offset stations with its own drawing properties.
//
// The sheet point owns its stations and drawing properties; copy construction and assignment
// duplicate every station. clone() copies the common part, every station and the name.
class DEX_API DexSheetPoint : public DexObject {
 public:
  VYN_CLASS_ALLOCATOR

  // ---- Construction ---------------------------------------------------------------------------
  DexSheetPoint() = default;
  DexSheetPoint(const DexSheetPoint& other) = default;
  DexSheetPoint& operator=(const DexSheetPoint& other) = default;
  ~DexSheetPoint() override;

  // ---- DexObject ------------------------------------------------------------------------------
  DexObject* clone() const override;
  // Each station's shiftCoords.
  void shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                   double rotation) override;
  // GROUP_SHEET_POINTS.
  EGroupType getGroupType() override;
  const IDexDrawProperties* getDrawProperties() const override { return drawProperties_.get(); }
  void setDrawProperties(IDexDrawProperties* properties) override { drawProperties_.reset(properties); }

  // OBJECT_TYPE_SHEET_POINT.
  EDexObjectsType getType() override;
  // The sheet point's own name (its stations keep names of their own).
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // ---- Stations (owned) -----------------------------------------------------------------------
  // Appends station and takes ownership; a null station is ignored.
  void addStation(DexOffsetStation* station) { stations_.add(station); }
  int getNumberOfStations() const noexcept { return stations_.count(); }
  // The station at index, or null when index is outside the list. The point keeps ownership.
  DexOffsetStation* getStation(int index) noexcept { return stations_.at(index); }
  const DexOffsetStation* getStation(int index) const noexcept { return stations_.at(index); }
  // Assigns *station to the station at index and answers true. False, with nothing changed, when
  // index is outside the list or station is null. The caller keeps station either way.
  bool changeStation(int index, const DexOffsetStation* station);
  // Deletes the station at index, closes the gap and answers true; false for an index outside the
  // list (an empty list included).
  bool removeStation(int index) { return stations_.remove(index); }

 private:
  DexOwningList<DexOffsetStation> stations_;
  CVynStringT<wchar_t> name_;
  DexOwnedDrawProperties drawProperties_;
};

}  // namespace vyn::ie
