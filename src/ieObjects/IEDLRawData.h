#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"

// Digital-level raw data: the runs that staff readings are grouped in.
namespace vyn::ie {

// One run of a digital-level job: its name (the key under which the data container keeps it) and a
// second text that the plug-ins give its meaning. The data container owns the runs; sights refer to
// them. A plain value: copying copies both texts.
struct DEX_API DexDLRun {
  VYN_CLASS_ALLOCATOR

  DexDLRun() = default;
  DexDLRun(const CVynStringT<wchar_t>& runName, const CVynStringT<wchar_t>& runText)
      : name(runName), text(runText) {}

  CVynStringT<wchar_t> name;
  CVynStringT<wchar_t> text;
};

}  // namespace vyn::ie
