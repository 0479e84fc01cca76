#include "ieObjects/IEGPSRawData.h"

#include <cmath>
#include <utility>

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/RawDataLog.h"
#include "ieObjects/detail/RawRecordCopy.h"

namespace vyn::ie {
namespace {

// The words of the solution types, in the order of their values.
constexpr std::pair<DexGpsPosition::ESolutionType, const wchar_t*> kSolutionWords[] = {
    {DexGpsPosition::SOLUTION_NONE, L"NO_SOLUTION"},
    {DexGpsPosition::SOLUTION_STANDALONE, L"STANDALONE"},
    {DexGpsPosition::SOLUTION_CODE_DIFF, L"CODE_DIFF"},
    {DexGpsPosition::SOLUTION_FLOAT, L"FLOAT"},
    {DexGpsPosition::SOLUTION_FIXED, L"FIXED"},
    {DexGpsPosition::SOLUTION_FIXED_SWING, L"FIXED_SWING"},
    {DexGpsPosition::SOLUTION_FLOAT_VRLAS, L"FLOAT_VRLAS"},
    {DexGpsPosition::SOLUTION_FIXED_VRLAS, L"FIXED_VRLAS"},
};
constexpr const wchar_t* kUserInputWord = L"USER_INPUT";

// How a position dilution splits into horizontal and vertical when neither is known.
const double kHorizontalShare = std::sqrt(2.0 / 3.0);
const double kVerticalShare = std::sqrt(1.0 / 3.0);

void logDops(int line) {
  vyn_logging::vyn_err_log(detail::kGPSRawDataLogSource, line);
}

// Fills the one missing component of a combined dilution: sqrt(combined^2 - knownSquares) when that
// is positive; false when it is not.
bool fillMissing(double& missing, double combined, double knownSquares) {
  const double rest = combined * combined - knownSquares;
  if (rest <= 0.0) return false;
  missing = std::sqrt(rest);
  return true;
}

void splitPosition(DexGpsDop& dop, double pdop) {
  dop.hdop = kHorizontalShare * pdop;
  dop.vdop = kVerticalShare * pdop;
}

void fillFromPdop(DexGpsDop& dop, double pdop) {
  const bool hasH = dop.hdop != 0.0;
  const bool hasV = dop.vdop != 0.0;
  if (hasH == hasV) {
    if (!hasH) splitPosition(dop, pdop);
    return;
  }
  double& missing = hasH ? dop.vdop : dop.hdop;
  const double known = hasH ? dop.hdop : dop.vdop;
  if (!fillMissing(missing, pdop, known * known)) logDops(detail::kGpsPdopTooSmallLine);
}

void fillFromGdop(DexGpsDop& dop, double gdop) {
  double* const components[] = {&dop.hdop, &dop.vdop, &dop.tdop};
  int present = 0;
  double squares = 0.0;
  double* missing = nullptr;
  for (double* const component : components) {
    if (*component != 0.0) {
      ++present;
      squares += *component * *component;
    } else if (missing == nullptr) {
      missing = component;
    }
  }
  if (present == 2) {
    if (!fillMissing(*missing, gdop, squares)) logDops(detail::kGpsGdopTooSmallLine);
  } else if (present == 1 && dop.tdop != 0.0) {
    if (std::fabs(gdop) > std::fabs(dop.tdop)) {
      splitPosition(dop, std::sqrt(gdop * gdop - dop.tdop * dop.tdop));
    } else {
      logDops(detail::kGpsGdopNotAboveTdopLine);
    }
  }
}

}  // namespace

// ---- IDexGpsRawDataInterface --------------------------------------------------------------------

IDexGpsRawDataInterface::IDexGpsRawDataInterface() = default;

IDexGpsRawDataInterface::~IDexGpsRawDataInterface() = default;

EDexObjectsType IDexGpsRawDataInterface::getType() {
  return OBJECT_TYPE_GPS_RAW_POINT;
}

void IDexGpsRawDataInterface::copyCommonData(DexObject* target) const {
  DexDesignPoint::copyCommonData(target);
  auto* const record = dynamic_cast<IDexGpsRawDataInterface*>(target);
  if (record == nullptr || record == this) return;
  record->setTime(time_);
  record->setTimeMS(timeMS_);
  record->antennaHeight_ = antennaHeight_;
  record->depth_ = depth_;
  record->planeStation_ = planeStation_;
}

// ---- DexGpsBaseStation --------------------------------------------------------------------------

DexGpsBaseStation::DexGpsBaseStation() = default;

DexGpsBaseStation::~DexGpsBaseStation() = default;

DexObject* DexGpsBaseStation::clone() const {
  return detail::makeFilled([] { return new DexGpsBaseStation(); },
                            [this](DexGpsBaseStation* copy) { copyCommonData(copy); });
}

void DexGpsBaseStation::copyCommonData(DexObject* target) const {
  IDexGpsRawDataInterface::copyCommonData(target);
  auto* const station = dynamic_cast<DexGpsBaseStation*>(target);
  if (station == nullptr || station == this) return;
  station->gpsAntennaModel_ = gpsAntennaModel_;
  station->antennaType_ = antennaType_;
  station->xyzCoords_ = xyzCoords_;
  station->virtStationId_ = virtStationId_;
  station->physStationId_ = physStationId_;
}

// ---- Precisions -----------------------------------------------------------------------------------

DexGpsCoordCovMatrix::~DexGpsCoordCovMatrix() = default;

double DexGpsCoordCovMatrix::getHrms() const {
  return std::sqrt(std::fabs(variances[0]) + std::fabs(variances[1]));
}

double DexGpsCoordCovMatrix::getVrms() const {
  return std::sqrt(std::fabs(variances[2]));
}

double DexGpsCoordCovMatrix::getRms() const {
  return std::sqrt(std::fabs(variances[0]) + std::fabs(variances[1]) + std::fabs(variances[2]));
}

DexGpsDop::~DexGpsDop() = default;

double DexGpsDop::getPDop() const {
  return std::sqrt(hdop * hdop + vdop * vdop);
}

double DexGpsDop::getGDop() const {
  return std::sqrt(hdop * hdop + vdop * vdop + tdop * tdop);
}

void DexGpsDop::setCombinedDops(double pdop, double gdop) {
  if (pdop != 0.0) fillFromPdop(*this, pdop);
  if (gdop != 0.0) fillFromGdop(*this, gdop);
}

// ---- DexGpsPosition -------------------------------------------------------------------------------

DexGpsPosition::DexGpsPosition() = default;

DexGpsPosition::~DexGpsPosition() = default;

DexObject* DexGpsPosition::clone() const {
  return detail::makeFilled([] { return new DexGpsPosition(); },
                            [this](DexGpsPosition* copy) { copyCommonData(copy); });
}

void DexGpsPosition::copyCommonData(DexObject* target) const {
  IDexGpsRawDataInterface::copyCommonData(target);
  auto* const position = dynamic_cast<DexGpsPosition*>(target);
  if (position == nullptr || position == this) return;
  position->gpsAntennaModel_ = gpsAntennaModel_;
  position->rawDataType_ = rawDataType_;
  position->cv_ = cv_;
  position->cvNeu_ = cvNeu_;
  position->dop_ = dop_;
  position->xyzCoords_ = xyzCoords_;
  position->waCoords_ = waCoords_;
  position->dxyz_ = dxyz_;
  position->solutionType_ = solutionType_;
  position->satellites_ = satellites_;
  position->obsDuration_ = obsDuration_;
  position->numOfEpochs_ = numOfEpochs_;
  position->antennaType_ = antennaType_;
  position->baseStation_ = baseStation_;
  position->rtkReset_ = rtkReset_;
  position->ppVector_ = ppVector_;
  position->equipment_ = equipment_;
  position->controller_ = controller_;
}

CVynStringT<wchar_t> DexGpsPosition::getSolutionTypeAsString() const {
  for (const auto& [type, word] : kSolutionWords) {
    if (type == solutionType_) return word;
  }
  return kUserInputWord;
}

DexGpsPosition::ESolutionType DexGpsPosition::solutionTypeFromText(const CVynStringT<wchar_t>& text) {
  for (const auto& [type, word] : kSolutionWords) {
    if (text == word) return type;
  }
  return SOLUTION_USER_INPUT;
}

// ---- Offsets --------------------------------------------------------------------------------------

DexGpsOffset::DexGpsOffset() = default;

DexGpsOffset::~DexGpsOffset() = default;

void DexGpsOffset::setTSRawData(const DexTSRawData* data) {
  detail::assignHeldCopy(tsRawData_, data);
}

void DexGpsOffset::copyCommonData(DexObject* target) const {
  IDexGpsRawDataInterface::copyCommonData(target);
  auto* const offset = dynamic_cast<DexGpsOffset*>(target);
  if (offset != nullptr && offset != this) offset->tsRawData_ = tsRawData_;
}

DexAzimuthDistanceGpsOffset::DexAzimuthDistanceGpsOffset() = default;

DexAzimuthDistanceGpsOffset::~DexAzimuthDistanceGpsOffset() = default;

DexObject* DexAzimuthDistanceGpsOffset::clone() const {
  return detail::makeFilled([] { return new DexAzimuthDistanceGpsOffset(); },
                            [this](DexAzimuthDistanceGpsOffset* copy) { copyCommonData(copy); });
}

void DexAzimuthDistanceGpsOffset::copyCommonData(DexObject* target) const {
  DexGpsOffset::copyCommonData(target);
  auto* const offset = dynamic_cast<DexAzimuthDistanceGpsOffset*>(target);
  if (offset != nullptr && offset != this) offset->setRefPoint(refPoint_);
}

DexPtlGpsOffset::DexPtlGpsOffset() = default;

DexPtlGpsOffset::~DexPtlGpsOffset() = default;

DexObject* DexPtlGpsOffset::clone() const {
  return detail::makeFilled([] { return new DexPtlGpsOffset(); },
                            [this](DexPtlGpsOffset* copy) { copyCommonData(copy); });
}

void DexPtlGpsOffset::copyCommonData(DexObject* target) const {
  DexGpsOffset::copyCommonData(target);
  auto* const offset = dynamic_cast<DexPtlGpsOffset*>(target);
  if (offset == nullptr || offset == this) return;
  offset->setRefPoint1(refPoint1_);
  offset->setRefPoint2(refPoint2_);
}

DexTwoDistGpsOffset::DexTwoDistGpsOffset() = default;

DexTwoDistGpsOffset::~DexTwoDistGpsOffset() = default;

DexObject* DexTwoDistGpsOffset::clone() const {
  return detail::makeFilled([] { return new DexTwoDistGpsOffset(); },
                            [this](DexTwoDistGpsOffset* copy) { copyCommonData(copy); });
}

void DexTwoDistGpsOffset::copyCommonData(DexObject* target) const {
  DexGpsOffset::copyCommonData(target);
  auto* const offset = dynamic_cast<DexTwoDistGpsOffset*>(target);
  if (offset == nullptr || offset == this) return;
  offset->setRefPoint1(refPoint1_);
  offset->setRefPoint2(refPoint2_);
  offset->setRight(right_);
}

}  // namespace vyn::ie
