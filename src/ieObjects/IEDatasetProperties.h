#pragma once

#include <array>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IETypedValues.h"

// Records that describe a dataset as a whole: its extent, with the symbol, text and dash sizes drawing
// exports derive from it, and its coordinate system.
namespace vyn::ie {

class DexStation;

// The extent of a dataset (a minimum and a maximum border, once a station with horizontal coordinates
// has been seen) and three further numbers that the model keeps for hosts and plug-ins and only copies.
// A value type without virtual operations.
class DEX_API DexDatasetProperties {
 public:
  VYN_CLASS_ALLOCATOR

  enum EMinMax : std::int32_t {
    MIN_BORDER = 0,
    MAX_BORDER = 1,
  };
  static constexpr int kNumberOfExtraValues = 3;

  // Sizes derived from the extent.
  static constexpr double kDefaultTextSize = 0.2;  // without an extent
  static constexpr double kMaxTextSize = 1.5;
  static constexpr double kTextSizeFactor = 0.001;  // of the largest extent
  static constexpr double kSymbolSizeFactor = 0.015;
  static constexpr double kDashSizeFactor = 0.05;
  static constexpr double kMaxDashSize = 1.0;
  // A border coordinate of this magnitude or more takes no part in the extent's width.
  static constexpr double kFarBorder = 1e10;

  // Borders at the origin, no extent, further numbers 0.
  DexDatasetProperties() = default;
  DexDatasetProperties(const DexDatasetProperties&) = default;
  DexDatasetProperties& operator=(const DexDatasetProperties&) = default;
  ~DexDatasetProperties() = default;

  // ---- State ----------------------------------------------------------------------------------
  // Forgets the extent and sets the further numbers to 0; the borders keep their values.
  void reset() noexcept;
  // Takes every value of other.
  void clone(const DexDatasetProperties& other) { *this = other; }
  // The border of which (an EMinMax value or its number); the origin for any other value.
  const DexPosition3D& getBorder(int which) const noexcept { return borders_.get(which); }
  bool isMinMaxDefined() const noexcept { return minMaxDefined_; }
  // The further number at index 0 to 2; 0 for another index, which setExtraValue ignores.
  std::int32_t getExtraValue(int index) const noexcept { return extraValues_.get(index); }
  void setExtraValue(int index, std::int32_t value) noexcept { extraValues_.set(index, value); }

  // ---- Extent ---------------------------------------------------------------------------------
  // Widens the extent by station when its horizontal coordinates are defined (other stations change
  // nothing): the first such station sets both borders to its x, y and z, later ones widen them. z
  // counts even when the station's height is not defined.
  void updateBorders(const DexStation& station) noexcept;

  // ---- Sizes for drawing exports --------------------------------------------------------------
  // kDefaultTextSize without an extent; otherwise the width of the extent (see below) times
  // kTextSizeFactor, kMaxTextSize at most.
  double calcAutoTextSize() const noexcept;
  // size = the width of the extent times kSymbolSizeFactor; size is left alone without an extent.
  void calcAutoSymbolSize(double& size) const noexcept;
  // With s = the width of the extent times kDashSizeFactor, kMaxDashSize at most: dash = s,
  // second = 2s/3, third = -s/3. All three are left alone without an extent.
  void calcAutoDashSize(double& dash, double& second, double& third) const noexcept;

 private:
  // The width of the extent: the larger of its x and y extents, -1 without an extent. Far borders
  // (kFarBorder or more in magnitude) make an axis count 0: either x border for x, the maximum y
  // border for y; when only the minimum y border is far, the x extent alone counts.
  double calcMaxDiff() const noexcept;

  DexTypedPositions<EMinMax, 2, DexPosition3D> borders_;
  bool minMaxDefined_ = false;
  DexTypedArray<int, kNumberOfExtraValues, std::int32_t> extraValues_;
};

namespace cs_utils {

// The coordinate system of a dataset, as hosts and plug-ins exchange it: a kind and five texts and a
// number that the library only copies. The library reads the kind alone: kGeographicKind makes the
// exchange data write x and y as latitude and longitude. A plain record, copied member by member.
struct DEX_API DexCoordinateSystemInfo {
  VYN_CLASS_ALLOCATOR

  static constexpr std::int32_t kGeographicKind = 1;
  static constexpr std::int32_t kDefaultKind = 4;
  static constexpr int kNumberOfTexts = 5;

  std::int32_t kind = kDefaultKind;
  std::array<CVynStringT<wchar_t>, kNumberOfTexts> texts;
  std::int64_t value = 0;
};

}  // namespace cs_utils

}  // namespace vyn::ie
