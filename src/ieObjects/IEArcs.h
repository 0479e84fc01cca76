#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEObjectBase.h"
#include "ieObjects/IEStation.h"
#include "ieObjects/IETypedValues.h"

// The curve objects of a dataset: arcs and circles, each given by its centre station.
namespace vyn::ie {

// An arc: its centre station (which also holds the arc's name), five numbers (radius, two direction
// angles and two optional values), its own (line) drawing properties and its direction.
//
// The arc owns its drawing properties (see DexObject for copy and clone). clone() copies the common
// part, the station, the five numbers and the direction.
class DEX_API DexArc : public DexObject {
 public:
  VYN_CLASS_ALLOCATOR

  // The numbers of an arc. The radius scales with the coordinates and the two angles (degrees, in the
  // unit of the rotation of shiftCoords) turn with them; the optional values are only stored, and
  // kNoValue says that one is absent.
  enum EADataType : std::int32_t {
    ARC_RADIUS = 0,
    ARC_START_ANGLE = 1,
    ARC_END_ANGLE = 2,
    ARC_OPTIONAL_VALUE_1 = 3,
    ARC_OPTIONAL_VALUE_2 = 4,
  };
  static constexpr int kNumberOfDataValues = 5;

  // ---- Construction ---------------------------------------------------------------------------
  // Centre station (flags 2, kind 5) at the origin, radius and angles 0, both optional values kNoValue,
  // counter-clockwise, no drawing properties, state 1.
  DexArc();
  DexArc(const DexArc& other) = default;
  DexArc& operator=(const DexArc& other) = default;
  ~DexArc() override;

  // ---- DexObject ------------------------------------------------------------------------------
  DexObject* clone() const override;
  // Only a uniform scale (scaleX, scaleY and scaleZ exactly equal) keeps an arc an arc: then the
  // centre station's shiftCoords, both angles become (angle - rotation) brought into [0, 360), and
  // the radius is multiplied by scaleX. Any other scale changes nothing but the state, which becomes
  // INACTIVE_STATE.
  void shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                   double rotation) override;
  // GROUP_LINES.
  EGroupType getGroupType() override;
  const IDexDrawProperties* getDrawProperties() const override { return drawProperties_.get(); }
  void setDrawProperties(IDexDrawProperties* properties) override { drawProperties_.reset(properties); }

  // OBJECT_TYPE_ARC.
  EDexObjectsType getType() override;
  // The name is the centre station's.
  void setName(const CVynStringT<wchar_t>& name) override { station_.setName(name); }
  const CVynStringT<wchar_t>& getName() const override { return station_.getName(); }

  // ---- Centre ---------------------------------------------------------------------------------
  const DexStation& getStation() const noexcept { return station_; }
  // Takes the whole station, except that an arc with a name keeps it when station has none.
  void setStation(const DexStation& station);
  // Sets the centre's coordinates as given (kNoValue marks nothing undefined here).
  void setCenter(double x, double y, double z) noexcept;
  // As above, then the centre's geoid height.
  void setCenter(double x, double y, double z, double geoidHeight) noexcept;

  // ---- Numbers and direction ------------------------------------------------------------------
  // The number of kind (an EADataType value or its number); 0.0 for a kind outside 0 to 4, which
  // setData ignores.
  double getData(int kind) const noexcept { return data_.get(kind); }
  void setData(int kind, double value) noexcept { data_.set(kind, value); }
  // True only for an optional value (kind 3 or 4) that is not kNoValue; radius and angles always
  // answer false.
  bool isDataDefined(int kind) const noexcept;
  bool isClockwise() const noexcept { return clockwise_; }
  void setDirection(bool clockwise) noexcept { clockwise_ = clockwise; }

 private:
  DexStation station_{2, CS_LOCAL};
  DexTypedValues<EADataType, kNumberOfDataValues> data_;
  DexOwnedDrawProperties drawProperties_;
  bool clockwise_ = false;
};

// A circle: its centre station (which also holds the circle's name), its radius and its own drawing
// properties.
//
// The circle owns its drawing properties (see DexObject for copy and clone). clone() copies the common
// part, the station and the radius.
class DEX_API DexCircle : public DexObject {
 public:
  VYN_CLASS_ALLOCATOR

  // The one number of a circle.
  enum ECDataType : std::int32_t {
    CIRCLE_RADIUS = 0,
  };
  static constexpr int kNumberOfDataValues = 1;

  // ---- Construction ---------------------------------------------------------------------------
  // Centre station (flags 2, kind 5) at the origin, radius 0, no drawing properties, state 1.
  DexCircle();
  DexCircle(const DexCircle& other) = default;
  DexCircle& operator=(const DexCircle& other) = default;
  ~DexCircle() override;

  // ---- DexObject ------------------------------------------------------------------------------
  DexObject* clone() const override;
  // Only a uniform scale (scaleX, scaleY and scaleZ exactly equal) keeps a circle a circle: then the
  // centre station's shiftCoords and the radius multiplied by scaleX. Any other scale changes nothing
  // but the state, which becomes INACTIVE_STATE.
  void shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                   double rotation) override;
  // GROUP_LINES.
  EGroupType getGroupType() override;
  const IDexDrawProperties* getDrawProperties() const override { return drawProperties_.get(); }
  void setDrawProperties(IDexDrawProperties* properties) override { drawProperties_.reset(properties); }

  // OBJECT_TYPE_CIRCLE.
  EDexObjectsType getType() override;
  // The name is the centre station's.
  void setName(const CVynStringT<wchar_t>& name) override { station_.setName(name); }
  const CVynStringT<wchar_t>& getName() const override { return station_.getName(); }

  // ---- Centre ---------------------------------------------------------------------------------
  const DexStation& getStation() const noexcept { return station_; }
  // Takes the whole station, except that a circle with a name keeps it when station has none.
  void setStation(const DexStation& station);
  // Sets the centre's coordinates as given (kNoValue marks nothing undefined here).
  void setCenter(double x, double y, double z) noexcept;
  // As above, then the centre's geoid height.
  void setCenter(double x, double y, double z, double geoidHeight) noexcept;

  // ---- Radius ---------------------------------------------------------------------------------
  // The radius for kind 0 (CIRCLE_RADIUS); 0.0 for any other kind, which setData ignores.
  double getData(int kind) const noexcept { return data_.get(kind); }
  void setData(int kind, double value) noexcept { data_.set(kind, value); }

 private:
  DexStation station_{2, CS_LOCAL};
  DexTypedValues<ECDataType, kNumberOfDataValues> data_;
  DexOwnedDrawProperties drawProperties_;
};

}  // namespace vyn::ie
