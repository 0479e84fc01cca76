#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"

// Stakeout and field reports of a dataset.
//
// So far both reports are here with the value given to their constructors; the stakeout report's
// records and header, and the field report's texts, date, picture, station, labels and units, are still
// to come.
namespace vyn::ie {

// A table of text fields per staked point with a header row. A dataset owns its reports.
//
// Not copyable: it will own its records.
class DEX_API DexStakeoutReport {
 public:
  VYN_CLASS_ALLOCATOR

  // The kind of report: a number agreed between the plug-ins; the model only stores it.
  enum EStkReportType : std::int32_t {
    STAKEOUT_REPORT_DEFAULT = 0,
  };

  // An EStkReportType value or its number.
  explicit DexStakeoutReport(int reportType);
  DexStakeoutReport(const DexStakeoutReport&) = delete;
  DexStakeoutReport& operator=(const DexStakeoutReport&) = delete;
  virtual ~DexStakeoutReport();

  EStkReportType getReportType() const noexcept { return reportType_; }

 private:
  EStkReportType reportType_;
};

// A page about one place of the field work: who, when, where, a picture and labels. A dataset owns its
// reports.
class DEX_API DexFieldReport {
 public:
  VYN_CLASS_ALLOCATOR

  // nez: the report's coordinates are in the order north, east, height.
  explicit DexFieldReport(bool nez);
  DexFieldReport(const DexFieldReport&) = default;
  DexFieldReport& operator=(const DexFieldReport&) = default;
  virtual ~DexFieldReport();

  bool isNez() const noexcept { return nez_; }
  void setNez(bool nez) noexcept { nez_ = nez; }

 private:
  bool nez_;
};

}  // namespace vyn::ie
