#include "ieUtils/IELocalization.h"

#include <cmath>
#include <numbers>

namespace vyn::ie {

// ---- DexLocalizationPoint -------------------------------------------------------------------------

DexLocalizationPoint::DexLocalizationPoint() = default;

DexLocalizationPoint::~DexLocalizationPoint() = default;

void DexLocalizationPoint::setUsage(bool a, bool b, bool c) noexcept {
  usageA_ = a;
  usageB_ = b;
  usageC_ = c;
}

void DexLocalizationPoint::getUsage(bool& a, bool& b, bool& c) const noexcept {
  a = usageA_;
  b = usageB_;
  c = usageC_;
}

void DexLocalizationPoint::attachCodes(const DexCodesDataInterface& codes) {
  if (DexGpsPosition* const rawData = rawData_.get()) codes.copyCodesData(rawData);
}

// ---- DexLocalization ------------------------------------------------------------------------------

DexLocalization::DexLocalization() : datumName_(L"WGS84") {}

DexLocalization::~DexLocalization() = default;

void DexLocalization::getAngleAndScale(double& angle, double& scale) const {
  const double scaledCos = getData(PARAM_SCALE_COS);
  const double scaledSin = getData(PARAM_SCALE_SIN);
  scale = keepScale1_ ? 1.0 : std::sqrt(scaledCos * scaledCos + scaledSin * scaledSin);
  constexpr double kFullTurn = 2.0 * std::numbers::pi;
  angle = std::atan2(scaledSin, scaledCos);
  if (angle < 0.0) angle += kFullTurn;
  if (angle >= kFullTurn) angle = 0.0;  // a tiny negative angle rounds up to a full turn
}

void DexLocalization::setAngleAndScale(double angle, double scale) {
  setData(PARAM_SCALE_COS, std::cos(angle) * scale);
  setData(PARAM_SCALE_SIN, std::sin(angle) * scale);
}

void DexLocalization::addPointCodes(const CVynStringT<wchar_t>& pointName,
                                    const DexCodesDataInterface* codes) {
  if (codes == nullptr) return;
  for (DexLocalizationPoint* const point : points_) {
    const DexGpsPosition* const rawData = point->getRawData();
    if (rawData != nullptr && rawData->getName() == pointName) {
      point->attachCodes(*codes);
      return;
    }
  }
}

const cs_utils::DexLocalizationStation* DexLocalization::getStationAt(int index) const noexcept {
  return index >= 0 && index < getNumberOfStations() ? &stations_[static_cast<std::size_t>(index)] : nullptr;
}

}  // namespace vyn::ie
