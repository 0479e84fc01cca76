#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IETypedValues.h"

namespace vyn::ie {

// The kind of coordinate system a station's coordinates are given in. The library itself reads only
// CS_GEOGRAPHIC (angular coordinates, compared with a far tighter tolerance when polyline vertices are
// merged); the other names are labels that hosts and plug-ins share. Any value cast from a number is
// stored and copied unchanged.
enum EDexCSType : int {
  CS_UNKNOWN = 0,
  CS_GEOGRAPHIC = 1,  // latitude, longitude in degrees, and height
  CS_GEOCENTRIC = 2,  // earth-centred X, Y, Z
  CS_GRID = 3,        // projected grid coordinates; the default of the display settings
  CS_GROUND = 4,      // grid coordinates scaled to the ground
  CS_LOCAL = 5,       // local plane coordinates; the default of every station
};

// Point attribute flags of a station: flag n is bit n of the station's attribute set. Flags 1 to 4 say
// where a point comes from and exclude one another; a station starts with POINT_ATTR_DESIGN. The other
// bits (0 and 5 to 31) are free for hosts and plug-ins.
enum EPointAttrFlags : int {
  POINT_ATTR_DESIGN = 1,    // a design or imported point
  POINT_ATTR_ENTERED = 2,   // entered by hand between observations
  POINT_ATTR_MEASURED = 3,  // measured
  POINT_ATTR_COMPUTED = 4,  // computed from other points
};

// A survey station: a spatial position with name, identifier, notes, time-stamp text, point attribute
// flags, coordinate-system kind, geoid height, bulge and scale factor, and the flags that tell whether
// its horizontal coordinates, height and geoid height carry values. Every point-like object of the
// model keeps its coordinates in one. A value type: it owns nothing beyond its strings.
//
// The virtual table after DexPosition3D's (destructor, shiftValues) continues with reset() and
// shiftCoords(); that order is the plug-in ABI.
//
// Copying is deliberately asymmetric: copy() takes every property of another station except its
// coordinates, while the copy constructor and the assignment take the coordinates as well.
class DEX_API DexStation : public DexPosition3D,
                           public IDexNameInterface,
                           public IDexIdInterface,
                           public ICoordInfo {
 public:
  VYN_CLASS_ALLOCATOR

  // ---- Construction, reset and copy -----------------------------------------------------------
  // Coordinates (0, 0, 0), the given attribute flags (2: only POINT_ATTR_DESIGN) and coordinate-system
  // kind, empty texts, height and horizontal coordinates defined, no geoid height, bulge 0 and scale
  // factor 1.0.
  explicit DexStation(unsigned int stationAttrs = 2, EDexCSType csType = CS_LOCAL);
  // The coordinates, then copy(other).
  DexStation(const DexStation& other);
  // Nothing on self-assignment; otherwise the coordinates, then copy(other).
  DexStation& operator=(const DexStation& other);
  ~DexStation() override;

  // Empties notes, time stamps, name and id; height and horizontal coordinates defined, no geoid height;
  // geoid height, bulge and coordinates 0. The attribute flags, the coordinate-system kind and the
  // scale factor keep their values.
  virtual void reset();
  // shiftValues (through the virtual table, so a subclass's shift applies), then the geoid height
  // follows the height: geoidHeight * scaleZ + origin.z, whether it is defined or not.
  virtual void shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                           double rotation);

  // Takes every property of other except its coordinates: notes, time stamps, name, attribute flags,
  // the height flag (other.isHeightDefined()), the horizontal flag, the geoid height (or only its
  // undefined flag, the value staying as it was), bulge, id, coordinate-system kind and scale factor.
  void copy(const DexStation& other);

  // ---- Name and identifier (stored and returned unchanged) ------------------------------------
  void setName(const CVynStringT<wchar_t>& name) override;
  const CVynStringT<wchar_t>& getName() const override;
  void setId(const CVynStringT<wchar_t>& id) override;
  const CVynStringT<wchar_t>& getId() const override;

  // ---- Definedness ----------------------------------------------------------------------------
  // The horizontal-coordinates flag.
  bool isHorizCoordsDefined() const override;
  // The height flag, and z is not kNoHeight.
  bool isHeightDefined() const override;
  bool isGeoidHeightDefined() const noexcept { return geoidHeightDefined_; }

  void setHorizCoordsDefined(bool defined) noexcept { horizCoordsDefined_ = defined; }
  void setHorizCoordsUndefined() noexcept { horizCoordsDefined_ = false; }
  void setHeightDefined(bool defined) noexcept { heightDefined_ = defined; }
  void setHeightUndefined() noexcept { heightDefined_ = false; }
  void setGeoidHeightDefined(bool defined) noexcept { geoidHeightDefined_ = defined; }

  // ---- Position and heights -------------------------------------------------------------------
  // Stores x, y and z. An x or y equal to kNoValue marks the horizontal coordinates undefined, a z
  // equal to kNoValue the height; other values never mark them defined again.
  void setPosition(double x, double y, double z);
  // setPosition(x, y, z), then setGeoidHeight(geoidHeight).
  void setPosition(double x, double y, double z, double geoidHeight);
  void setPosition(const DexPosition3D& position);

  // The geoid height when one is defined, otherwise z.
  double getHeight() const noexcept { return geoidHeightDefined_ ? geoidHeight_ : getZ(); }
  // The stored geoid height, defined or not.
  double getGeoidHeight() const noexcept { return geoidHeight_; }
  // Stores the geoid height and marks it defined.
  void setGeoidHeight(double geoidHeight) noexcept;

  // ---- Point attribute flags ------------------------------------------------------------------
  unsigned int getStationAttrs() const noexcept { return stationAttrs_; }
  void setStationAttrs(unsigned int stationAttrs) noexcept { stationAttrs_ = stationAttrs; }
  // Bit flag (taken modulo 32) of the attribute set.
  bool hasPointAttr(unsigned int flag) const noexcept;
  // Sets bit flag (modulo 32). When afterwards none or more than one of the exclusive flags 1 to 4 is
  // set, one error-log record is written (source ieObjects\IECoords, line 201, empty message); the bit
  // stays set either way.
  void addPointAttr(unsigned int flag);

  // ---- Further properties ---------------------------------------------------------------------
  EDexCSType getCSType() const noexcept { return csType_; }
  void setCSType(EDexCSType csType) noexcept { csType_ = csType; }
  const CVynStringT<wchar_t>& getNotes() const noexcept;
  void setNotes(const CVynStringT<wchar_t>& notes);
  const CVynStringT<wchar_t>& getTimeStamps() const noexcept;
  void setTimeStamps(const CVynStringT<wchar_t>& timeStamps);
  double getBulge() const noexcept { return bulge_; }
  void setBulge(double bulge) noexcept { bulge_ = bulge; }
  double getScaleFactor() const noexcept { return scaleFactor_; }
  void setScaleFactor(double scaleFactor) noexcept { scaleFactor_ = scaleFactor; }

  // ---- Comparison -----------------------------------------------------------------------------
  // Coordinates within 1e-12; notes, time stamps and names exactly equal; the same attribute flags
  // and isHeightDefined(); the same geoid-height flag and, when set, geoid heights within 1e-12; bulges
  // within 1e-12. The id, coordinate-system kind, scale factor and horizontal flag are not compared.
  bool operator==(const DexStation& other) const;
  bool operator!=(const DexStation& other) const { return !(*this == other); }

 private:
  // Notes, time stamps and id are empty in most stations (every polyline vertex is one), so they
  // share one block, made when the first of them is set.
  struct Texts;
  const Texts* texts() const noexcept { return texts_.get(); }
  Texts& textsToWrite();

  unsigned int stationAttrs_ = 1u << POINT_ATTR_DESIGN;
  EDexCSType csType_ = CS_LOCAL;
  CVynStringT<wchar_t> name_;
  DexOwnedPointer<Texts> texts_;
  bool heightDefined_ = true;
  bool horizCoordsDefined_ = true;
  bool geoidHeightDefined_ = false;
  double geoidHeight_ = 0.0;
  double bulge_ = 0.0;
  double scaleFactor_ = 1.0;
};

// The station of a sheet point: a station with two number-and-text pairs and ten further numbers. The
// library gives them no meaning; it initialises them (0 and empty texts) and copies them, and the
// plug-ins that exchange sheet points agree on their use.
class DEX_API DexOffsetStation : public DexStation {
 public:
  VYN_CLASS_ALLOCATOR

  static constexpr int kExtraValueCount = 10;

  explicit DexOffsetStation(unsigned int stationAttrs = 2, EDexCSType csType = CS_LOCAL);
  // The station part as the station copy constructor makes it, then copy(other).
  DexOffsetStation(const DexOffsetStation& other);
  // copy(other), then the station assignment.
  DexOffsetStation& operator=(const DexOffsetStation& other);
  ~DexOffsetStation() override;

  // Takes the fourteen added values of other, in order; the station part stays as it is.
  void copy(const DexOffsetStation& other);
  using DexStation::copy;

  double getFirstValue() const noexcept { return firstValue_; }
  void setFirstValue(double value) noexcept { firstValue_ = value; }
  const CVynStringT<wchar_t>& getFirstText() const noexcept { return firstText_; }
  void setFirstText(const CVynStringT<wchar_t>& text) { firstText_ = text; }
  double getSecondValue() const noexcept { return secondValue_; }
  void setSecondValue(double value) noexcept { secondValue_ = value; }
  const CVynStringT<wchar_t>& getSecondText() const noexcept { return secondText_; }
  void setSecondText(const CVynStringT<wchar_t>& text) { secondText_ = text; }
  // The further value at index 0 to 9; 0.0 for another index, which setExtraValue ignores.
  double getExtraValue(int index) const noexcept { return extraValues_.get(index); }
  void setExtraValue(int index, double value) noexcept { extraValues_.set(index, value); }

 private:
  double firstValue_ = 0.0;
  CVynStringT<wchar_t> firstText_;
  double secondValue_ = 0.0;
  CVynStringT<wchar_t> secondText_;
  DexTypedValues<int, kExtraValueCount> extraValues_;
};

}  // namespace vyn::ie
