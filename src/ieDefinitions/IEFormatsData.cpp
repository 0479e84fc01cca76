#include "ieDefinitions/IEFormatsData.h"

#include <atomic>
#include <mutex>

#include "hostlibs/VynLogging.h"
#include "ieDefinitions/detail/BuiltInFormats.h"
#include "ieDefinitions/detail/FormatsDataLog.h"

namespace vyn::ie {

namespace {

// The process-wide registry. Constant-initialised, so it is usable from any static initialiser; the
// registry it holds is deleted when the library is unloaded.
struct RegistryHolder {
  std::mutex creation;
  std::atomic<DexFormatsData*> registry{nullptr};
  ~RegistryHolder() { delete registry.load(); }
};

constinit RegistryHolder holder;

// The registry, created by make() when there is none yet. Readers after the creation take no lock.
template <class Make>
const DexFormatsData& registryCreatedBy(Make make) {
  if (const DexFormatsData* existing = holder.registry.load(std::memory_order_acquire)) return *existing;
  const std::lock_guard<std::mutex> lock(holder.creation);
  if (const DexFormatsData* existing = holder.registry.load(std::memory_order_relaxed)) return *existing;
  DexFormatsData* created = make();
  holder.registry.store(created, std::memory_order_release);
  return *created;
}

void logError(int line) {
  vyn_logging::vyn_err_log(detail::kFormatsDataLogSource, line);
}

}  // namespace

// ---- The process-wide registry ------------------------------------------------------------------

const DexFormatsData& getIEFormatsData() {
  return registryCreatedBy([] { return new DexFormatsData(CVynStringT<wchar_t>()); });
}

void intializeIEformatsDataFromFile(const CVynStringT<wchar_t>& fileName) {
  registryCreatedBy([&fileName] { return new DexFormatsData(fileName); });
}

// ---- Start-up -----------------------------------------------------------------------------------

DexFormatsData::DexFormatsData(const CVynStringT<wchar_t>& fileName) {
  fillDataTypes();
  bool storeFile = true;
  if (loadDataFromFile(fileName, storeFile)) return;
  deleteFormats();
  fillFormatsDataByDefault();
  // A file that cannot be written leaves the registry as it is: the built-in table serves.
  if (!fileName.IsEmpty() && storeFile) storeDataToTheFile(fileName);
}

DexFormatsData::~DexFormatsData() {
  deleteFormats();
  for (const DexDataType* type : dataTypes_)
    delete type;
}

void DexFormatsData::deleteFormats() {
  for (const DexFormat* format : formats_)
    delete format;
  formats_.clear();
}

void DexFormatsData::fillDataTypes() {
  for (const detail::BuiltInDataTypeRow& row : detail::builtInDataTypeRows()) {
    if (auto* type = new DexDataType(row.typeId, row.name, row.direction, row.configurations, row.usingModes))
      dataTypes_.push_back(type);
  }
}

void DexFormatsData::fillFormatsDataByDefault() {
  for (const detail::BuiltInFormatRow& row : detail::builtInFormatRows()) {
    GUID guid;
    if (CLSIDFromString(row.guid, &guid) != S_OK) continue;
    if (auto* format =
            new DexFormat(guid, row.name, row.direction, row.exportDLL, row.importDLL,
                          row.titleForVerticalScreen, row.extension, row.filterExtension, row.configurations,
                          row.usingModes, row.dataTypes, row.distanceUnits, row.angleUnits, row.parameters))
      formats_.push_back(format);
  }
}

// ---- Formats ------------------------------------------------------------------------------------

unsigned int DexFormatsData::getNumberOfFormats() const {
  return static_cast<unsigned int>(formats_.size());
}

const DexFormat* DexFormatsData::getFormatByIndex(unsigned int i) const {
  if (i >= formats_.size()) {
    logError(detail::kLogFormatIndexOutOfRange);
    return nullptr;
  }
  return formats_[i];
}

const DexFormat* DexFormatsData::getFormatByGuid(const GUID& g) const {
  for (const DexFormat* format : formats_) {
    if (format != nullptr && format->getGuid() == g) return format;
  }
  return nullptr;
}

const DexFormat* DexFormatsData::getFormatById(const wchar_t* id) const {
  GUID guid;
  if (id == nullptr || CLSIDFromString(id, &guid) != S_OK) return nullptr;
  return getFormatByGuid(guid);
}

unsigned int DexFormatsData::getIndexFormatById(const wchar_t* id) const {
  for (unsigned int i = 0; i < formats_.size(); ++i) {
    if (formats_[i] != nullptr && formats_[i]->isIdEqual(id)) return i;
  }
  return 0;
}

const DexFormat* DexFormatsData::getFormatByExtension(const CVynStringT<wchar_t>& extension,
                                                      bool withDot) const {
  for (const DexFormat* format : formats_) {
    if (format != nullptr && format->getExtension(withDot).CompareNoCase(extension) == 0) return format;
  }
  return nullptr;
}

// ---- Data kinds ---------------------------------------------------------------------------------

unsigned int DexFormatsData::getNumberOfDataTypes() const {
  return static_cast<unsigned int>(dataTypes_.size());
}

const DexDataType* DexFormatsData::getDataTypeById(EDexDataType id) const {
  for (const DexDataType* type : dataTypes_) {
    if (type->getTypeId() == id) return type;
  }
  logError(detail::kLogDataTypeNotRegistered);
  return nullptr;
}

// ---- Filters ------------------------------------------------------------------------------------

void DexFormatsData::getDataTypes(vyn_vector<const DexDataType*>& out,
                                  DexCommonType::EDataDirections direction,
                                  DexFlags<DexCommonType::ESupportedConfigurations> configurations,
                                  DexFlags<DexCommonType::EUsingModes> modes) const {
  for (const DexDataType* type : dataTypes_) {
    if (type->compareCommonData(direction, configurations, modes)) out.push_back(type);
  }
}

void DexFormatsData::getSupportedFormats(vyn_vector<int>& out, DexCommonType::EDataDirections direction,
                                         DexFlags<DexCommonType::ESupportedConfigurations> configurations,
                                         DexFlags<DexCommonType::EUsingModes> modes) const {
  for (std::size_t i = 0; i < formats_.size(); ++i) {
    if (formats_[i] != nullptr && formats_[i]->compareCommonData(direction, configurations, modes))
      out.push_back(static_cast<int>(i));
  }
}

void DexFormatsData::getSupportedFormatsByDataType(
    vyn_vector<int>& out, EDexDataType type, DexCommonType::EDataDirections direction,
    DexFlags<DexCommonType::ESupportedConfigurations> configurations,
    DexFlags<DexCommonType::EUsingModes> modes) const {
  // An unregistered kind answers nothing (and leaves the lookup's error-log record).
  if (getDataTypeById(type) == nullptr) return;
  for (std::size_t i = 0; i < formats_.size(); ++i) {
    const DexFormat* format = formats_[i];
    if (format != nullptr && format->isDataTypeSupported(type) &&
        format->compareCommonData(direction, configurations, modes))
      out.push_back(static_cast<int>(i));
  }
}

}  // namespace vyn::ie
