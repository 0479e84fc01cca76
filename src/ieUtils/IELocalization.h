#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IETypedValues.h"

// The localization of a job: the parameters of the plane transformation that ties the local grid to
// GNSS observations, and the names of datum, grid and geoid. The data container owns at most one.
namespace vyn::ie {

// How a localization is computed, and which points it uses. The host and the plug-ins fix the values;
// the library stores them as numbers (DexData::setLocalizationMode), so any value may be passed cast
// from its number.
enum EDexLocalizationMethod : int {};
enum EDexLocalizationPoint : int {};

// A localization: 15 transformation parameters, whether the plane scale is held at exactly 1, and the
// geoid, grid, datum and localization names.
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

  // All parameters 0, scale not held, datum "WGS84", the other names empty.
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

  // ---- Control points -------------------------------------------------------------------------------
  // Hands a copy of codes to the GNSS observation of the first control point of that name. A
  // localization without control points, or null codes, changes nothing.
  void addPointCodes(const CVynStringT<wchar_t>& pointName, const DexCodesDataInterface* codes);

 private:
  DexTypedValues<ELocalizationParam, kNumberOfParams> params_;
  bool keepScale1_ = false;
  CVynStringT<wchar_t> geoidName_;
  CVynStringT<wchar_t> gridName_;
  CVynStringT<wchar_t> datumName_;
  CVynStringT<wchar_t> name_;
};

}  // namespace vyn::ie
