#pragma once

#include <cstddef>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/vynmathCurves.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IETypedValues.h"

// The elements of a horizontal alignment: straights, circular arcs, transition spirals and tangent
// intersection points. Each element keeps the coordinates, azimuths and lengths that its plug-in gives
// it; the library computes geometry only in the three createSegment factories, which read an element
// of the host math library (hostlibs/vynmathCurves.h, whose conventions they follow).
//
// Every position stores the northing in x and the easting in y, and the two-number setPosition
// overloads take (northing, easting) in this order. Azimuths are decimal degrees clockwise from north.
//
// Error-log records (source ieObjects\IEAlignmentPartsDictionary, empty message): getPosition() asked
// for a kind outside the element's range (line 811 for a line, 812 for a curve, 813 for a spiral), an
// unknown stored spiral type in getSpiralTypeAsString() (814), an unknown math spiral type in
// DexSpiral::createSegment() (815).
namespace vyn::ie {

// The element kinds, the value of each element's getType().
enum EDexAlignmentObjType : int {
  ALIGNMENT_OBJ_LINE = 0,                // DexLine2D
  ALIGNMENT_OBJ_CURVE = 1,               // DexCurve
  ALIGNMENT_OBJ_SPIRAL = 2,              // DexSpiral
  ALIGNMENT_OBJ_INTERSECTION_POINT = 3,  // DexIntersectionPoint
};

// The abstract base of the four element kinds. The virtual operations keep their order (the plug-in
// ABI): getType, getStartPosition, destructor.
class DEX_API IDexAlignmentObjInterface {
 public:
  IDexAlignmentObjInterface() = default;
  IDexAlignmentObjInterface(const IDexAlignmentObjInterface&) = default;
  IDexAlignmentObjInterface& operator=(const IDexAlignmentObjInterface&) = default;

  virtual EDexAlignmentObjType getType() const = 0;
  // The start point of a line, curve or spiral (its position 0); an intersection point's own position.
  virtual const DexPosition2D& getStartPosition() const = 0;
  virtual ~IDexAlignmentObjInterface();

 protected:
  // Writes the error-log record of a position kind outside the range of an element of this type.
  static void logPositionKindOutOfRange(EDexAlignmentObjType type);
};

// What the line, the curve and the spiral share: NPositions positions and NData doubles, each indexed
// by the element's own kinds, and the flag telling that the element's azimuth refers to the element
// before it in the alignment. Not used on its own.
template <std::size_t NPositions, std::size_t NData>
class DexAlignmentElementRecord : public IDexAlignmentObjInterface {
 public:
  static constexpr int kNumberOfPositions = static_cast<int>(NPositions);
  static constexpr int kNumberOfData = static_cast<int>(NData);

  // ---- Positions ------------------------------------------------------------------------------
  // The position of kind; for a kind outside the element's range, position 0 after an error-log
  // record.
  const DexPosition2D& getPosition(int kind) const {
    if (!positions_.contains(kind)) logPositionKindOutOfRange(getType());
    return positions_.contains(kind) ? positions_.get(kind) : positions_.get(0);
  }
  // A kind outside the element's range is ignored.
  void setPosition(int kind, const DexPosition2D& position) { positions_.set(kind, position); }
  void setPosition(int kind, double northing, double easting) {
    positions_.set(kind, DexPosition2D(northing, easting));
  }
  const DexPosition2D& getStartPosition() const override { return positions_.get(0); }

  // ---- Values ---------------------------------------------------------------------------------
  // The value of kind; 0.0 for a kind outside the element's range, which setData ignores.
  double getData(int kind) const { return data_.get(kind); }
  void setData(int kind, double value) { data_.set(kind, value); }

  // ---- Chaining -------------------------------------------------------------------------------
  bool isAzToPrevEl() const noexcept { return azToPrevEl_; }
  // Marks the element's azimuth as referring to the element before it; nothing clears the mark.
  void setAzToPrevEl() noexcept { azToPrevEl_ = true; }

 protected:
  // Positions at (0, 0), every value initialData.
  explicit DexAlignmentElementRecord(double initialData = 0.0) : data_(initialData) {}
  DexAlignmentElementRecord(const DexAlignmentElementRecord&) = default;
  DexAlignmentElementRecord& operator=(const DexAlignmentElementRecord&) = default;

 private:
  DexTypedPositions<int, NPositions, DexPosition2D> positions_;
  DexTypedValues<int, NData> data_;
  bool azToPrevEl_ = false;
};

// A straight (element kind 0): start and end point, start azimuth and length, and the two values the
// caller gave to createSegment.
class DEX_API DexLine2D : public DexAlignmentElementRecord<2, 4> {
 public:
  VYN_CLASS_ALLOCATOR

  enum ELinePositionType : int {
    START_POINT = 0,
    END_POINT = 1,
  };
  enum ELineDataType : int {
    START_AZIMUTH = 0,  // decimal degrees
    LENGTH = 1,
    CALLER_VALUE_A = 2,  // the caller's a and b of createSegment, stored unchanged
    CALLER_VALUE_B = 3,
  };

  // Both points (0, 0), every value 0.0, no azimuth defined.
  DexLine2D() = default;
  DexLine2D(const DexLine2D&) = default;
  DexLine2D& operator=(const DexLine2D&) = default;
  ~DexLine2D() override;

  // A new line from a straight of the math library: its start and end point, start azimuth and
  // length, and a and b. Owned by the caller; null when memory is short.
  static DexLine2D* createSegment(const CCurveSegment& segment, double a, double b);

  EDexAlignmentObjType getType() const override { return ALIGNMENT_OBJ_LINE; }

  // As for every element; setting START_AZIMUTH, whatever the value, also defines the start azimuth.
  void setData(int kind, double value);
  // True once START_AZIMUTH was set; nothing clears it.
  bool isStartAzimuthDefined() const noexcept { return startAzimuthDefined_; }

 private:
  bool startAzimuthDefined_ = false;
};

// A circular arc (element kind 1): start, centre, end and tangent intersection point; length, radius
// (positive), end and start azimuth, the two caller values and the deflection (end minus start
// azimuth, in degrees, not wrapped). Unlike the other elements every value of a curve starts unset.
class DEX_API DexCurve : public DexAlignmentElementRecord<4, 7> {
 public:
  VYN_CLASS_ALLOCATOR

  enum ECurvePositionType : int {
    START_POINT = 0,
    CENTER_POINT = 1,
    END_POINT = 2,
    PI_POINT = 3,  // where the tangents at start and end meet
  };
  enum ECurveDataType : int {
    LENGTH = 0,
    RADIUS = 1,
    END_AZIMUTH = 2,
    START_AZIMUTH = 3,
    CALLER_VALUE_A = 4,
    CALLER_VALUE_B = 5,
    DEFLECTION = 6,
  };
  // What kind of curve it is; createSegment makes circular arcs, and the plug-ins that exchange an
  // alignment agree on any other value.
  enum ECurveType : int {
    CIRCULAR_ARC = 0,
  };

  // Every point (0, 0), every value unset, a circular arc turning clockwise.
  DexCurve();
  DexCurve(const DexCurve&) = default;
  DexCurve& operator=(const DexCurve&) = default;
  ~DexCurve() override;

  // A new curve from an arc of the math library: start, end, centre and (where the tangents meet)
  // intersection point, length, radius (its magnitude; the turn from its sign), both azimuths and the
  // deflection, and a and b. Owned by the caller; null when memory is short.
  static DexCurve* createSegment(const CCurveArc& arc, double a, double b);

  EDexAlignmentObjType getType() const override { return ALIGNMENT_OBJ_CURVE; }

  // Whether kind is within 0 to 6 and has a value (a NaN is none: setting NaN unsets it).
  bool hasData(int kind) const;
  // The value of kind; 0.0 while it is unset and for a kind outside 0 to 6.
  double getData(int kind) const;

  int getCurveType() const noexcept { return curveType_; }
  void setCurveType(int curveType) noexcept { curveType_ = curveType; }
  bool isTurnClockwised() const noexcept { return turnClockwised_; }
  void setTurn(bool clockwise) noexcept { turnClockwised_ = clockwise; }

 private:
  int curveType_ = CIRCULAR_ARC;
  bool turnClockwised_ = true;
};

// A transition spiral (element kind 2): start and end point and the intersection point of the
// tangents at both; length, start radius, end and start azimuth, the two caller values, end radius and
// spiral constant; the spiral type (one of the sixteen spiral kinds of LandXML; a clothoid by
// default).
class DEX_API DexSpiral : public DexAlignmentElementRecord<3, 8> {
 public:
  VYN_CLASS_ALLOCATOR

  enum ESpiralPositionType : int {
    START_POINT = 0,
    END_POINT = 1,
    PI_POINT = 2,
  };
  enum ESpiralDataType : int {
    LENGTH = 0,
    START_RADIUS = 1,
    END_AZIMUTH = 2,
    START_AZIMUTH = 3,
    CALLER_VALUE_A = 4,
    CALLER_VALUE_B = 5,
    END_RADIUS = 6,
    SPIRAL_CONSTANT = 7,
  };
  // The spiral kinds, in the alphabetical order of their LandXML names (getSpiralTypeAsString).
  enum ESpiralType : int {
    BIQUADRATIC = 0,
    BIQUADRATIC_PARABOLA = 1,
    BLOSS = 2,
    CLOTHOID = 3,
    COSINE = 4,
    CUBIC = 5,
    CUBIC_PARABOLA = 6,
    JAPANESE_CUBIC = 7,
    RADIOID = 8,
    REV_BIQUADRATIC = 9,
    REV_BLOSS = 10,
    REV_COSINE = 11,
    REV_SINUSOID = 12,
    SINE_HALF_WAVE = 13,
    SINUSOID = 14,
    WEINER_BOGEN = 15,
  };
  static constexpr int kNumberOfSpiralTypes = 16;

  // Every point (0, 0), every value 0.0, a clothoid turning clockwise.
  DexSpiral() = default;
  DexSpiral(const DexSpiral&) = default;
  DexSpiral& operator=(const DexSpiral&) = default;
  ~DexSpiral() override;

  // A new spiral from a spiral of the math library: its type (a clothoid or a cubic parabola; another
  // math type keeps the clothoid after an error-log record, line 815), start, end and (where the
  // tangents meet) intersection point, length, the magnitudes of the radii of its curved ends (only
  // the end radius for one from the tangent, only the start radius for one to the tangent), both
  // azimuths, the turn, the spiral constant, and a and b. Owned by the caller; null when memory is
  // short.
  static DexSpiral* createSegment(const CCurveSpiral& spiral, double a, double b);

  EDexAlignmentObjType getType() const override { return ALIGNMENT_OBJ_SPIRAL; }

  int getSpiralType() const noexcept { return spiralType_; }
  void setSpiralType(int spiralType) noexcept { spiralType_ = spiralType; }
  // The LandXML name of the type ("biquadratic" to "weinerBogen"); "clothoid" after an error-log
  // record (line 814) for a stored value outside 0 to 15.
  CVynStringT<wchar_t> getSpiralTypeAsString() const;

  bool isTurnClockwised() const noexcept { return turnClockwised_; }
  void setTurn(bool clockwise) noexcept { turnClockwised_ = clockwise; }

 private:
  int spiralType_ = CLOTHOID;
  bool turnClockwised_ = true;
};

// A tangent intersection point (element kind 3): its position, three values that the plug-ins give
// their meaning, and up to four elements fitted at it (a line, a first spiral, a curve, a second
// spiral). The point owns the elements it holds and deletes them with itself; a copy has copies of
// them.
class DEX_API DexIntersectionPoint : public IDexAlignmentObjInterface {
 public:
  VYN_CLASS_ALLOCATOR

  enum EIPDataType : int {
    IP_VALUE_1 = 0,
    IP_VALUE_2 = 1,
    IP_VALUE_3 = 2,
  };

  // Position (0, 0), every value 0.0, no fitted elements. A simple point is one the plug-in marks so;
  // the mark cannot change.
  explicit DexIntersectionPoint(bool simplePoint);
  DexIntersectionPoint(const DexIntersectionPoint&) = default;
  DexIntersectionPoint& operator=(const DexIntersectionPoint&) = default;
  ~DexIntersectionPoint() override;

  EDexAlignmentObjType getType() const override { return ALIGNMENT_OBJ_INTERSECTION_POINT; }
  // The intersection point itself.
  const DexPosition2D& getStartPosition() const override { return position_; }

  const DexPosition2D& getPosition() const noexcept { return position_; }
  void setPosition(const DexPosition2D& position) { position_ = position; }
  void setPosition(double northing, double easting) { position_ = DexPosition2D(northing, easting); }

  // The value of kind; 0.0 for a kind outside 0 to 2, which setData ignores.
  double getData(int kind) const { return data_.get(kind); }
  void setData(int kind, double value) { data_.set(kind, value); }

  bool isSimplePoint() const noexcept { return simplePoint_; }

  // ---- Fitted elements (owned) ----------------------------------------------------------------
  // Each setter takes ownership of its element (null allowed). The element held before is not
  // deleted: it goes back to the caller, as removeSegmentAt() hands back an alignment's element.
  const DexLine2D* getSegment() const noexcept { return segment_.get(); }
  void setSegment(DexLine2D* segment) noexcept;
  const DexSpiral* getFirstSpiral() const noexcept { return firstSpiral_.get(); }
  void setFirstSpiral(DexSpiral* spiral) noexcept;
  const DexCurve* getCurve() const noexcept { return curve_.get(); }
  void setCurve(DexCurve* curve) noexcept;
  const DexSpiral* getSecondSpiral() const noexcept { return secondSpiral_.get(); }
  void setSecondSpiral(DexSpiral* spiral) noexcept;

 private:
  DexPosition2D position_;
  DexTypedValues<EIPDataType, 3> data_;
  DexOwnedPointer<DexLine2D> segment_;
  DexOwnedPointer<DexSpiral> firstSpiral_;
  DexOwnedPointer<DexCurve> curve_;
  DexOwnedPointer<DexSpiral> secondSpiral_;
  bool simplePoint_;
};

// Copy policy of the owning lists of elements: a copy of the element's own class (a line, curve,
// spiral or intersection point), or null for an element of another class, which a copy then lacks.
struct DEX_API DexCopyAlignmentElement {
  static IDexAlignmentObjInterface* copy(const IDexAlignmentObjInterface& element);
};

}  // namespace vyn::ie
