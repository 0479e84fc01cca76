#pragma once
// TEMPORARY STUB: stands in for the container until it lands; same signatures as the real one.
#include <atomic>
#include <vector>
#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieUtils/IERunProgress.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/IEUtilsStringArray.h"
namespace vyn::ie {
class DexDataset;
class DEX_API DexData {
 public:
  VYN_CLASS_ALLOCATOR
  explicit DexData(const DexSettings& settings);
  virtual ~DexData();
  DexData(const DexData&) = delete;
  DexData& operator=(const DexData&) = delete;
  const DexSettings& getSettings() const { return settings_; }
  void setSettings(const DexSettings& s) { settings_ = s; }
  bool addDataset(DexDataset* d);
  int getNumberOfDatasets() const { return static_cast<int>(datasets_.size()); }
  DexDataset* getDatasetAt(int i) const;
  void setCurDataset(int i);
  DexDataset* getCurDataset();
  const DexDataset* getCurDataset() const;
  DexDataDictionary* getIEDataDictionary();
  bool addCodeToIEDataDictionary(DexCodeDescription* d);
  void addFileNameToExported(const CVynStringT<wchar_t>& name);
  const utils::StringArray& getExportedFileNames() const noexcept { return exported_; }
  void clearExportedFileNames() { exported_.RemoveAll(); }
  bool prepareDatasetsForMultipleFilesExport(bool multipleFiles);
  DexRunProgress& getProgress() { return progress_; }
  const DexRunProgress& getProgress() const { return progress_; }
  static std::atomic<bool> stopProcess_;

 private:
  DexSettings settings_;
  std::vector<DexDataset*> datasets_;
  int cur_ = 0;
  DexDataDictionary* dictionary_ = nullptr;
  utils::StringArray exported_;
  DexRunProgress progress_;
};
}  // namespace vyn::ie
