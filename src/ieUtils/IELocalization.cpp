#include "ieUtils/IELocalization.h"

#include <cmath>
#include <numbers>

namespace vyn::ie {

DexLocalization::DexLocalization() : datumName_(L"WGS84") {}

DexLocalization::~DexLocalization() = default;

void DexLocalization::getAngleAndScale(double& angle, double& scale) const {
  const double scaledCos = getData(PARAM_SCALE_COS);
  const double scaledSin = getData(PARAM_SCALE_SIN);
  scale = keepScale1_ ? 1.0 : std::sqrt(scaledCos * scaledCos + scaledSin * scaledSin);
  angle = std::atan2(scaledSin, scaledCos);
  if (angle < 0.0) angle += 2.0 * std::numbers::pi;
}

void DexLocalization::setAngleAndScale(double angle, double scale) {
  setData(PARAM_SCALE_COS, std::cos(angle) * scale);
  setData(PARAM_SCALE_SIN, std::sin(angle) * scale);
}

// The control points come with the GNSS observations they refer to; until a localization holds any,
// there is no point to hand the codes to.
void DexLocalization::addPointCodes(const CVynStringT<wchar_t>& /*pointName*/,
                                    const DexCodesDataInterface* /*codes*/) {}

}  // namespace vyn::ie
