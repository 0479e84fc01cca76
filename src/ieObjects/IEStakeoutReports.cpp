#include "ieObjects/IEStakeoutReports.h"

namespace vyn::ie {

DexStakeoutReport::DexStakeoutReport(int reportType) : reportType_(static_cast<EStkReportType>(reportType)) {}

DexStakeoutReport::~DexStakeoutReport() = default;

DexFieldReport::DexFieldReport(bool nez) : nez_(nez) {}

DexFieldReport::~DexFieldReport() = default;

}  // namespace vyn::ie
