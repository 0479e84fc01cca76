#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"

// The records of a field job's history that travel with the exchange data.
//
// So far the observation information is here as a record without content; its values, the job
// information, the history records and the link from raw records to them are still to come.
namespace vyn::ie {

// The atmospheric and scale settings under which a set of observations was made. Shared between the
// exchange data and its datasets through a reference-counting pointer: a record lives while anything
// still refers to it. Copying copies every value.
class DEX_API DexObservationInfo {
 public:
  VYN_CLASS_ALLOCATOR

  DexObservationInfo();
  DexObservationInfo(const DexObservationInfo&) = default;
  DexObservationInfo& operator=(const DexObservationInfo&) = default;
  virtual ~DexObservationInfo();
};

}  // namespace vyn::ie
