#include "ieObjects/IESurface.h"

#include <cstddef>

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/PositionOctree.h"
#include "ieObjects/detail/SurfaceLog.h"

namespace vyn::ie {

namespace {

using detail::PositionOctree;

void logRefusedPosition(PositionOctree::InsertResult result) {
  switch (result) {
    case PositionOctree::InsertResult::kInserted:
      return;
    case PositionOctree::InsertResult::kDuplicate:
      vyn_logging::vyn_err_log(detail::kSurfaceLogSource, detail::kSurfaceDuplicatePositionLine);
      return;
    case PositionOctree::InsertResult::kNotFinite:
      vyn_logging::vyn_err_log(detail::kSurfaceLogSource, detail::kSurfaceNonFinitePositionLine);
      return;
    case PositionOctree::InsertResult::kOutOfReach:
      vyn_logging::vyn_err_log(detail::kSurfaceLogSource, detail::kSurfacePositionOutOfReachLine);
      return;
  }
}

// The answer to a position asked for where there is none. The mutable one is reset on every use, so
// that what one caller wrote into it never reaches the next.
DexPosition3D& scratchPosition() {
  thread_local DexPosition3D position;
  position = DexPosition3D();
  return position;
}

}  // namespace

// ---- DexTriangle --------------------------------------------------------------------------------

void DexTriangle::setPositions(const int* positionIndexes) noexcept {
  if (positionIndexes == nullptr) return;
  for (int corner = 0; corner < kNumberOfPositions; ++corner)
    corners_[toIndex(corner)] = positionIndexes[corner];
}

// ---- DexSurface ---------------------------------------------------------------------------------

DexSurface::DexSurface() : positionIndex_(new PositionOctree(kPositionIndexCapacity)) {}

DexSurface::DexSurface(const DexSurface& other) = default;

DexSurface& DexSurface::operator=(const DexSurface& other) = default;

DexSurface::~DexSurface() = default;

int DexSurface::addPosition(const DexPosition3D& position) {
  const int index = getNumberOfPositions();
  positions_.push_back(position);
  logRefusedPosition(positionIndex_.get()->insert(position.x, position.y, position.z, index));
  return index;
}

DexPosition3D& DexSurface::getPositionAt(int index) {
  if (isPositionIndex(index)) return positions_[static_cast<std::size_t>(index)];
  vyn_logging::vyn_err_log(detail::kSurfaceLogSource, detail::kSurfacePositionIndexLine);
  return scratchPosition();
}

const DexPosition3D& DexSurface::getPositionAt(int index) const {
  return const_cast<DexSurface*>(this)->getPositionAt(index);
}

bool DexSurface::getCoords(int index, vyn_math::TAbstractPoint3<double>& point) const {
  if (!isPositionIndex(index)) return false;
  const DexPosition3D& position = positions_[static_cast<std::size_t>(index)];
  point = vyn_math::TAbstractPoint3<double>(position.x, position.y, position.z);
  return true;
}

bool DexSurface::isEqual(int index, const vyn_math::TAbstractPoint3<double>& point) const {
  if (!isPositionIndex(index)) return false;
  const DexPosition3D& position = positions_[static_cast<std::size_t>(index)];
  return position.x == point.x && position.y == point.y && position.z == point.z;
}

int DexSurface::getPositionIndex(const DexPosition3D& position) const {
  const int index = positionIndex_.get()->find(position.x, position.y, position.z);
  return isEqual(index, vyn_math::TAbstractPoint3<double>(position.x, position.y, position.z)) ? index : -1;
}

void DexSurface::setNumberOfPositions(int count) {
  positions_.resize(count > 0 ? static_cast<std::size_t>(count) : 0);
}

void DexSurface::reservePositions(int count) {
  if (count > 0) positions_.reserve(static_cast<std::size_t>(count));
}

void DexSurface::addBreakline(DexBreakline* breakline) {
  if (breakline != nullptr) breaklines_.push_back(breakline);
}

DexBreakline* DexSurface::getBreaklineAt(int index) noexcept {
  return index >= 0 && index < getNumberOfBreaklines() ? breaklines_[static_cast<std::size_t>(index)]
                                                       : nullptr;
}

const DexBreakline* DexSurface::getBreaklineAt(int index) const noexcept {
  return const_cast<DexSurface*>(this)->getBreaklineAt(index);
}

}  // namespace vyn::ie
