#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"

// The GNSS antennas of a job, which GNSS positions and base stations refer to.
namespace vyn::ie {

// One GNSS antenna: its name, by which the data container finds it, between two texts that the
// plug-ins give their meaning. The data container owns the antennas; GNSS records refer to them.
// Copying copies the three texts.
struct DEX_API DexGpsAntennaSettings {
  VYN_CLASS_ALLOCATOR

  DexGpsAntennaSettings() = default;
  DexGpsAntennaSettings(const DexGpsAntennaSettings&) = default;
  DexGpsAntennaSettings& operator=(const DexGpsAntennaSettings&) = default;
  virtual ~DexGpsAntennaSettings();

  CVynStringT<wchar_t> firstText;
  CVynStringT<wchar_t> name;
  CVynStringT<wchar_t> thirdText;
};

}  // namespace vyn::ie
