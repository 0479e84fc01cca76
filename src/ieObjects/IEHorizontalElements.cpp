#include "ieObjects/IEHorizontalElements.h"

#include <array>
#include <cmath>
#include <limits>

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/AlignmentPartsLog.h"

namespace vyn::ie {

namespace {

using namespace detail;

constexpr std::array<const wchar_t*, DexSpiral::kNumberOfSpiralTypes> kSpiralTypeNames = {
    L"biquadratic",   L"biquadraticParabola", L"bloss",    L"clothoid",       L"cosine",   L"cubic",
    L"cubicParabola", L"japaneseCubic",       L"radioid",  L"revBiquadratic", L"revBloss", L"revCosine",
    L"revSinusoid",   L"sineHalfWave",        L"sinusoid", L"weinerBogen"};

DexPosition2D positionOf(const CCurveNE& point) {
  return {point.x, point.y};
}

// What every factory writes from the placed math element: start and end point, length, the
// azimuths (when the element has data kinds for them) and the caller's two values.
template <class Element, class Curve>
void writeCommonData(Element& element, const Curve& curve, double a, double b) {
  element.setPosition(Element::START_POINT, positionOf(curve.getStartNE()));
  element.setPosition(Element::END_POINT, positionOf(curve.getFinalNE()));
  element.setData(Element::LENGTH, curve.getLength());
  element.setData(Element::START_AZIMUTH, curve.getStartAzimut().getDeg());
  element.setData(Element::CALLER_VALUE_A, a);
  element.setData(Element::CALLER_VALUE_B, b);
}

// The intersection point of the tangents, when they meet.
template <class Element, class Curve>
void writeTangentIntersection(Element& element, const Curve& curve) {
  CCurveNE ip;
  if (curve.getCurveIp(ip)) element.setPosition(Element::PI_POINT, positionOf(ip));
}

DexSpiral::ESpiralType spiralTypeOf(int mathType) {
  switch (mathType) {
    case CCurveDataSpiral::CLOTHOID:
      return DexSpiral::CLOTHOID;
    case CCurveDataSpiral::CUBIC_PARABOLA:
      return DexSpiral::CUBIC_PARABOLA;
    default:
      vyn_logging::vyn_err_log(kAlignmentPartsLogSource, kUnknownSpiralMathTypeLine);
      return DexSpiral::CLOTHOID;
  }
}

template <class T>
void replaceWithoutDeleting(DexOwnedPointer<T>& held, T* element) noexcept {
  static_cast<void>(held.release());
  held.reset(element);
}

template <class T>
IDexAlignmentObjInterface* copyAs(const IDexAlignmentObjInterface& element) {
  const T* const typed = dynamic_cast<const T*>(&element);
  return typed != nullptr ? new T(*typed) : nullptr;
}

}  // namespace

// ---- Base ---------------------------------------------------------------------------------------

IDexAlignmentObjInterface::~IDexAlignmentObjInterface() = default;

void IDexAlignmentObjInterface::logPositionKindOutOfRange(EDexAlignmentObjType type) {
  const int line = type == ALIGNMENT_OBJ_CURVE    ? kCurvePositionKindLine
                   : type == ALIGNMENT_OBJ_SPIRAL ? kSpiralPositionKindLine
                                                  : kLinePositionKindLine;
  vyn_logging::vyn_err_log(kAlignmentPartsLogSource, line);
}

// ---- Line ---------------------------------------------------------------------------------------

DexLine2D::~DexLine2D() = default;

DexLine2D* DexLine2D::createSegment(const CCurveSegment& segment, double a, double b) {
  auto* const line = new DexLine2D();
  if (line != nullptr) writeCommonData(*line, segment, a, b);
  return line;
}

void DexLine2D::setData(int kind, double value) {
  DexAlignmentElementRecord::setData(kind, value);
  if (kind == START_AZIMUTH) startAzimuthDefined_ = true;
}

// ---- Curve --------------------------------------------------------------------------------------

DexCurve::DexCurve() : DexAlignmentElementRecord(std::numeric_limits<double>::quiet_NaN()) {}

DexCurve::~DexCurve() = default;

DexCurve* DexCurve::createSegment(const CCurveArc& arc, double a, double b) {
  auto* const curve = new DexCurve();
  if (curve == nullptr) return nullptr;
  writeCommonData(*curve, arc, a, b);
  writeTangentIntersection(*curve, arc);
  curve->setData(RADIUS, std::abs(arc.getRadius()));
  curve->setTurn(arc.getRadius() > 0.0);
  const double endAzimuth = arc.getFinalAzimut().getDeg();
  curve->setData(END_AZIMUTH, endAzimuth);
  curve->setData(DEFLECTION, endAzimuth - arc.getStartAzimut().getDeg());
  curve->setPosition(CENTER_POINT, positionOf(arc.curveNE2worldNE(arc.getCenterNE())));
  return curve;
}

bool DexCurve::hasData(int kind) const {
  return kind >= 0 && kind < kNumberOfData && !std::isnan(DexAlignmentElementRecord::getData(kind));
}

double DexCurve::getData(int kind) const {
  return hasData(kind) ? DexAlignmentElementRecord::getData(kind) : 0.0;
}

// ---- Spiral -------------------------------------------------------------------------------------

DexSpiral::~DexSpiral() = default;

DexSpiral* DexSpiral::createSegment(const CCurveSpiral& spiral, double a, double b) {
  auto* const element = new DexSpiral();
  if (element == nullptr) return nullptr;
  element->setSpiralType(spiralTypeOf(spiral.getSpiralMathType()));
  writeCommonData(*element, spiral, a, b);
  writeTangentIntersection(*element, spiral);
  element->setTurn(spiral.getRadius() > 0.0);
  if (!spiral.isCSST()) element->setData(END_RADIUS, std::abs(spiral.getEndRadius()));
  if (!spiral.isTSSC()) element->setData(START_RADIUS, std::abs(spiral.getStartRadius()));
  element->setData(END_AZIMUTH, spiral.getFinalAzimut().getDeg());
  element->setData(SPIRAL_CONSTANT, GetSpiralConstant(spiral.getLength(), spiral.getDefiningRadius()));
  return element;
}

CVynStringT<wchar_t> DexSpiral::getSpiralTypeAsString() const {
  if (spiralType_ < 0 || spiralType_ >= kNumberOfSpiralTypes) {
    vyn_logging::vyn_err_log(kAlignmentPartsLogSource, kUnknownSpiralTypeLine);
    return kSpiralTypeNames[CLOTHOID];
  }
  return kSpiralTypeNames[static_cast<std::size_t>(spiralType_)];
}

// ---- Intersection point -------------------------------------------------------------------------

DexIntersectionPoint::DexIntersectionPoint(bool simplePoint) : simplePoint_(simplePoint) {}

DexIntersectionPoint::~DexIntersectionPoint() = default;

void DexIntersectionPoint::setSegment(DexLine2D* segment) noexcept {
  replaceWithoutDeleting(segment_, segment);
}

void DexIntersectionPoint::setFirstSpiral(DexSpiral* spiral) noexcept {
  replaceWithoutDeleting(firstSpiral_, spiral);
}

void DexIntersectionPoint::setCurve(DexCurve* curve) noexcept {
  replaceWithoutDeleting(curve_, curve);
}

void DexIntersectionPoint::setSecondSpiral(DexSpiral* spiral) noexcept {
  replaceWithoutDeleting(secondSpiral_, spiral);
}

// ---- Copying ------------------------------------------------------------------------------------

IDexAlignmentObjInterface* DexCopyAlignmentElement::copy(const IDexAlignmentObjInterface& element) {
  switch (element.getType()) {
    case ALIGNMENT_OBJ_LINE:
      return copyAs<DexLine2D>(element);
    case ALIGNMENT_OBJ_CURVE:
      return copyAs<DexCurve>(element);
    case ALIGNMENT_OBJ_SPIRAL:
      return copyAs<DexSpiral>(element);
    case ALIGNMENT_OBJ_INTERSECTION_POINT:
      return copyAs<DexIntersectionPoint>(element);
    default:
      return nullptr;
  }
}

}  // namespace vyn::ie
