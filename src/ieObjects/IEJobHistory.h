#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"

// The field software's job-history file of a job, read into history records and total-station records.
//
// So far the job history is here as a holder of its code library; the reader, its tables, records and
// elements are still to come.
namespace vyn::ie {

class DexDataDictionary;

// The history of a field job as read from its job-history file. A dataset owns at most one.
//
// The code library given to the constructor is referred to, not owned (it belongs to the exchange
// data); codes read from the file are filed in it.
class DEX_API DexJobHistory {
 public:
  VYN_CLASS_ALLOCATOR

  // codeLibrary may be null.
  explicit DexJobHistory(DexDataDictionary* codeLibrary = nullptr);
  DexJobHistory(const DexJobHistory&) = default;
  DexJobHistory& operator=(const DexJobHistory&) = default;
  virtual ~DexJobHistory();

  DexDataDictionary* getCodeLibrary() const noexcept { return codeLibrary_; }

 private:
  DexDataDictionary* codeLibrary_;
};

}  // namespace vyn::ie
