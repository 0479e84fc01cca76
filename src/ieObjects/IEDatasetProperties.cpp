#include "ieObjects/IEDatasetProperties.h"

#include <algorithm>
#include <cmath>

#include "ieObjects/IEStation.h"

namespace vyn::ie {

void DexDatasetProperties::reset() noexcept {
  minMaxDefined_ = false;
  extraValues_.fill(0);
}

void DexDatasetProperties::updateBorders(const DexStation& station) noexcept {
  if (!station.isHorizCoordsDefined()) return;
  DexPosition3D minimum = borders_.get(MIN_BORDER);
  DexPosition3D maximum = borders_.get(MAX_BORDER);
  if (!minMaxDefined_) {
    minimum = DexPosition3D(station.x, station.y, station.z);
    maximum = minimum;
    minMaxDefined_ = true;
  }
  for (unsigned int axis = 0; axis < 3; ++axis) {
    minimum[axis] = std::min(minimum[axis], station[axis]);
    maximum[axis] = std::max(maximum[axis], station[axis]);
  }
  borders_.set(MIN_BORDER, minimum);
  borders_.set(MAX_BORDER, maximum);
}

double DexDatasetProperties::calcMaxDiff() const noexcept {
  if (!minMaxDefined_) return -1.0;
  const DexPosition3D& minimum = borders_.get(MIN_BORDER);
  const DexPosition3D& maximum = borders_.get(MAX_BORDER);
  const auto isFar = [](double value) { return std::fabs(value) >= kFarBorder; };
  const double xExtent = isFar(minimum.x) || isFar(maximum.x) ? 0.0 : maximum.x - minimum.x;
  if (isFar(maximum.y) || isFar(minimum.y)) return xExtent;
  return std::max(xExtent, maximum.y - minimum.y);
}

double DexDatasetProperties::calcAutoTextSize() const noexcept {
  const double width = calcMaxDiff();
  if (width < 0.0) return kDefaultTextSize;
  return std::min(width * kTextSizeFactor, kMaxTextSize);
}

void DexDatasetProperties::calcAutoSymbolSize(double& size) const noexcept {
  const double width = calcMaxDiff();
  if (width >= 0.0) size = width * kSymbolSizeFactor;
}

void DexDatasetProperties::calcAutoDashSize(double& dash, double& second, double& third) const noexcept {
  const double width = calcMaxDiff();
  if (width < 0.0) return;
  const double size = std::min(width * kDashSizeFactor, kMaxDashSize);
  dash = size;
  second = size * 2.0 / 3.0;
  third = -size / 3.0;
}

}  // namespace vyn::ie
