#pragma once

// What the point-file benchmark and the installed host share: the CSV format both ways and the
// process's peak memory. Header-only, so that a host built against the installed package can use it.

#include <fstream>
#include <memory>
#include <string>

#include "ieDefinitions/IEFormatsData.h"

namespace dexchange_bench {

// The registry lists CSV for export only; the shipped import library reads it too.
inline std::unique_ptr<vyn::ie::DexFormat> csvBothWays() {
  using vyn::ie::DexFormat;
  const DexFormat& format =
      *vyn::ie::getIEFormatsData().getFormatById(L"{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}");
  return std::make_unique<DexFormat>(
      format.getGuid(), format.getName(), DexFormat::IMPORT_AND_EXPORT, L"ExportParsers", L"ImportParsers",
      format.getTitle(), format.getExtension(false), format.getFilterExtension(), format.getConfigurations(),
      format.getUsingModes(), format.getDataTypes(), format.getDistanceUnits(), format.getAngleUnits(),
      format.getParameters());
}

// Peak resident memory of the process so far, in MB.
inline double peakMegabytes() {
  std::ifstream status("/proc/self/status");
  std::string line;
  while (std::getline(status, line)) {
    if (line.rfind("VmHWM:", 0) == 0) return std::stod(line.substr(6)) / 1024.0;
  }
  return 0.0;
}

}  // namespace dexchange_bench
