#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"

// Road survey results that travel with a dataset: find-chainage reports and surveyed cross-section
// points.
//
// So far both are here as records without content; their values, the report's road name and its
// per-point records are still to come.
namespace vyn::ie {

// A report giving, for surveyed points, their position relative to a named road. A dataset owns its
// reports.
class DEX_API DexFindChainageReport {
 public:
  VYN_CLASS_ALLOCATOR

  DexFindChainageReport();
  DexFindChainageReport(const DexFindChainageReport&) = delete;
  DexFindChainageReport& operator=(const DexFindChainageReport&) = delete;
  virtual ~DexFindChainageReport();
};

// One surveyed cross-section point. A dataset owns its surveyed cross sections.
class DEX_API DexSurveyXSection {
 public:
  VYN_CLASS_ALLOCATOR

  DexSurveyXSection();
  DexSurveyXSection(const DexSurveyXSection&) = default;
  DexSurveyXSection& operator=(const DexSurveyXSection&) = default;
  virtual ~DexSurveyXSection();
};

}  // namespace vyn::ie
