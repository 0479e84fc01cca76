#pragma once

#include <memory>

#include "ieDefinitions/IEFormatsData.h"

// Reaches the private start-up steps of DexFormatsData, so that registries started from different
// formats data files can be built and examined side by side, apart from the process-wide one.
namespace vyn::ie::detail {

struct FormatsDataAccess {
  // A registry started as the process-wide one would be from fileName.
  static std::unique_ptr<DexFormatsData> create(const CVynStringT<wchar_t>& fileName) {
    return std::unique_ptr<DexFormatsData>(new DexFormatsData(fileName));
  }

  // The steps of the start-up, on an existing registry.
  static bool loadDataFromFile(DexFormatsData& data, const CVynStringT<wchar_t>& fileName, bool& storeFile) {
    return data.loadDataFromFile(fileName, storeFile);
  }
  static bool storeDataToTheFile(const DexFormatsData& data, const CVynStringT<wchar_t>& fileName) {
    return data.storeDataToTheFile(fileName);
  }
  static void clearFormats(DexFormatsData& data) { data.deleteFormats(); }
  static void fillFormatsDataByDefault(DexFormatsData& data) { data.fillFormatsDataByDefault(); }
  // Appends a format (taken over by the registry; null allowed, to show how writing treats it).
  static void appendFormat(DexFormatsData& data, DexFormat* format) { data.formats_.push_back(format); }
};

}  // namespace vyn::ie::detail
