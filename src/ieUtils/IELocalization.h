#pragma once

#include <array>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEGPSRawData.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IETypedValues.h"

// The localization of a job: the plane transformation that ties the local grid to GNSS observations,
// its control points and the names of datum, grid and geoid. The data container owns at most one.
namespace vyn::ie {

// How a localization is computed, and which points it uses. The host and the plug-ins fix the values;
// the library stores them as numbers (DexData::setLocalizationMode), so any value may be passed cast
// from its number.
enum EDexLocalizationMethod : int {};
enum EDexLocalizationPoint : int {};

namespace cs_utils {

// One station record of a localization as the host's coordinate-system component defines it: 214
// bytes that the library keeps and copies as a whole, reading nothing inside.
struct DEX_API DexLocalizationStation {
  VYN_CLASS_ALLOCATOR

  static constexpr int kSize = 214;

  std::array<std::uint8_t, kSize> bytes{};
};
static_assert(sizeof(DexLocalizationStation) == DexLocalizationStation::kSize);

}  // namespace cs_utils

// One control point of a localization: the GNSS observation of the point, its residuals in the
// transformation, three flags for how the transformation uses it, a name and notes.
//
// Ownership: the point owns its observation and its residuals and deletes them with itself; copy
// construction and assignment duplicate both (the observation through its clone()).
//
// The virtual operations: destructor, setName, getName.
class DEX_API DexLocalizationPoint : private IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // No observation, no residuals, flags false, empty texts.
  DexLocalizationPoint();
  DexLocalizationPoint(const DexLocalizationPoint&) = default;
  DexLocalizationPoint& operator=(const DexLocalizationPoint&) = default;
  ~DexLocalizationPoint() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  void setNotes(const CVynStringT<wchar_t>& notes) { notes_ = notes; }
  const CVynStringT<wchar_t>& getNotes() const noexcept { return notes_; }

  // Takes ownership of rawData (null allowed) and deletes the observation held before, unless it is
  // the same pointer.
  void setRawData(DexGpsPosition* rawData) noexcept { rawData_.reset(rawData); }
  const DexGpsPosition* getRawData() const noexcept { return rawData_.get(); }
  // Takes ownership of residuals (null allowed) as setRawData does.
  void setResiduals(DexPosition3D* residuals) noexcept { residuals_.reset(residuals); }
  const DexPosition3D* getResiduals() const noexcept { return residuals_.get(); }

  // The three usage flags; getUsage answers them in the order setUsage takes them.
  void setUsage(bool a, bool b, bool c) noexcept;
  void getUsage(bool& a, bool& b, bool& c) const noexcept;

  // Appends a copy of codes to the observation's codes; nothing without an observation.
  void attachCodes(const DexCodesDataInterface& codes);

 private:
  DexOwnedPointer<DexGpsPosition, DexCopyByCloneAs> rawData_;
  DexOwnedPointer<DexPosition3D> residuals_;
  // Laid out as the host's record has them: the second and third flag of setUsage, then the first.
  bool usageB_ = false;
  bool usageC_ = false;
  bool usageA_ = false;
  CVynStringT<wchar_t> name_;
  CVynStringT<wchar_t> notes_;
};

// A localization: 15 transformation parameters, whether the plane scale is held at exactly 1, the
// control points, the station records of the host's coordinate-system component, and the geoid, grid,
// datum and localization names.
//
// Ownership: the localization owns its control points and deletes them with itself; copy construction
// and assignment duplicate every point (two localizations never share one).
//
// The virtual operations keep their order: destructor, setName, getName, setData, getData.
class DEX_API DexLocalization : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The parameters with a meaning fixed by the library; the others are stored and returned unchanged.
  enum ELocalizationParam : int {
    PARAM_SCALE_COS = 2,  // scale times the cosine of the plane rotation
    PARAM_SCALE_SIN = 3,  // scale times the sine of the plane rotation
    PARAM_POINT = 13,     // the localization point choice (EDexLocalizationPoint)
    PARAM_METHOD = 14,    // the localization method (EDexLocalizationMethod)
  };
  static constexpr int kNumberOfParams = 15;

  // All parameters 0, scale not held, no points or stations, datum "WGS84", the other names empty.
  DexLocalization();
  DexLocalization(const DexLocalization&) = default;
  DexLocalization& operator=(const DexLocalization&) = default;
  ~DexLocalization() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  // Stores value for a parameter 0 to 14; any other parameter changes nothing.
  virtual void setData(int param, double value) { params_.set(param, value); }
  // The value of a parameter 0 to 14; 0.0 for any other parameter.
  virtual double getData(int param) const { return params_.get(param); }

  // ---- Names --------------------------------------------------------------------------------------
  void setDatumName(const CVynStringT<wchar_t>& name) { datumName_ = name; }
  const CVynStringT<wchar_t>& getDatumName() const noexcept { return datumName_; }
  void setGeoidName(const CVynStringT<wchar_t>& name) { geoidName_ = name; }
  const CVynStringT<wchar_t>& getGeoidName() const noexcept { return geoidName_; }
  void setGridName(const CVynStringT<wchar_t>& name) { gridName_ = name; }
  const CVynStringT<wchar_t>& getGridName() const noexcept { return gridName_; }

  // ---- Rotation and scale -------------------------------------------------------------------------
  void setKeepScale1(bool keep) noexcept { keepScale1_ = keep; }
  bool isKeepScale1() const noexcept { return keepScale1_; }
  // angle in radians in [0, 2 pi) from parameters 2 and 3; scale 1.0 when it is held, otherwise the
  // length of (parameter 2, parameter 3).
  void getAngleAndScale(double& angle, double& scale) const;
  // Parameter 2 = cos(angle) * scale, then parameter 3 = sin(angle) * scale, both through setData.
  // Whether the scale is held does not change.
  void setAngleAndScale(double angle, double scale);

  // ---- Control points (owned) ---------------------------------------------------------------------
  // Appends point and takes ownership; a null point is ignored.
  void addPoint(DexLocalizationPoint* point) { points_.add(point); }
  int getNumberOfPoints() const noexcept { return points_.count(); }
  // The point at index, or null when index is outside the list.
  const DexLocalizationPoint* getPointAt(int index) const noexcept { return points_.at(index); }
  // Hands a copy of codes to the observation of the first control point (in insertion order) whose
  // observation is named exactly pointName. Null codes, or no such point, change nothing.
  void addPointCodes(const CVynStringT<wchar_t>& pointName, const DexCodesDataInterface* codes);

  // ---- Station records ----------------------------------------------------------------------------
  // Appends a copy of station.
  void addStation(const cs_utils::DexLocalizationStation& station) { stations_.push_back(station); }
  int getNumberOfStations() const noexcept { return static_cast<int>(stations_.size()); }
  // The stored record at index, or null when index is outside the list.
  const cs_utils::DexLocalizationStation* getStationAt(int index) const noexcept;

 private:
  DexTypedValues<ELocalizationParam, kNumberOfParams> params_;
  bool keepScale1_ = false;
  DexOwningList<DexLocalizationPoint> points_;
  vyn_vector<cs_utils::DexLocalizationStation> stations_;
  CVynStringT<wchar_t> geoidName_;
  CVynStringT<wchar_t> gridName_;
  CVynStringT<wchar_t> datumName_;
  CVynStringT<wchar_t> name_;
};

}  // namespace vyn::ie
