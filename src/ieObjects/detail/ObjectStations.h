#pragma once

#include "ieObjects/IEStation.h"

namespace vyn::ie::detail {

// The station rule of every object that keeps its name in its station (design points, arcs, circles,
// text labels): the whole station is taken, except that a named object given an unnamed station keeps
// its name.
inline void assignStationKeepingName(DexStation& target, const DexStation& source) {
  if (&target == &source) return;
  const bool keepName = !target.getName().IsEmpty() && source.getName().IsEmpty();
  const CVynStringT<wchar_t> name = keepName ? target.getName() : CVynStringT<wchar_t>();
  target = source;
  if (keepName) target.setName(name);
}

// Sets a centre's coordinates as given, without the no-value tests of DexStation::setPosition.
inline void setCoordinatesDirectly(DexStation& station, double x, double y, double z) noexcept {
  station.x = x;
  station.y = y;
  station.z = z;
}

}  // namespace vyn::ie::detail
