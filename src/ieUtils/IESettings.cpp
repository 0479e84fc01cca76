#include "ieUtils/IESettings.h"

#include <utility>

#include <cstring>

namespace {

using vyn::ie::DexOptionBlock;

// The last data kind that counts as a kind of its own; MULTIPLE (22) only says "several".
constexpr int kLastSingleDataType = vyn::ie::FIELD_REPORTS;

template <class T>
void release(T*& owned) noexcept {
  delete owned;
  owned = nullptr;
}

// Deletes the object held by owned and takes replacement instead (which may be null).
template <class T>
void replace(T*& owned, T* replacement) noexcept {
  delete owned;
  owned = replacement;
}

// The copies of the owned objects: host objects through their own clone(), records made anew. The
// source is taken as the settings hold it (not const), so a host object's plain clone() is reached.
template <class T>
T* copyOf(T* source) {
  if (source == nullptr) return nullptr;
  if constexpr (requires { source->clone(); })
    return source->clone();
  else
    return new T(*source);
}

// The option block's layout belongs to the host and the plug-ins, so it is copied as plain bytes.
DexOptionBlock* copyOf(DexOptionBlock* source) {
  if (source == nullptr) return nullptr;
  auto* const copy = new DexOptionBlock;
  if (copy != nullptr) std::memcpy(copy->bytes, source->bytes, DexOptionBlock::kSize);
  return copy;
}

// A field that always follows the source: its copy, or null when the source has none.
template <class T>
void takeCopy(T*& target, T* source) {
  replace(target, copyOf(source));
}

// A field that follows the source only when the source has an object; otherwise it keeps its own.
template <class T>
void takeCopyWhenPresent(T*& target, T* source) {
  if (source != nullptr) replace(target, copyOf(source));
}

}  // namespace

namespace vyn::ie {

// The interfaces' key functions: their virtual tables live in the library.
IDexMessageBox::~IDexMessageBox() = default;
IDexMessageBox* IDexMessageBox::clone() {
  return std::as_const(*this).clone();
}
IDexMessageBox* IDexMessageBox::clone() const {
  return nullptr;
}
int IDexMessageBox::confirmOverwrite(HWND parentWindow, const wchar_t* shortPath) {
  return std::as_const(*this).confirmOverwrite(parentWindow, shortPath);
}
int IDexMessageBox::confirmOverwrite(HWND /*parentWindow*/, const wchar_t* /*shortPath*/) const {
  return IDNO;
}

IDexFinishNotifier::~IDexFinishNotifier() = default;
IDexFinishNotifier* IDexFinishNotifier::clone() {
  return std::as_const(*this).clone();
}
IDexFinishNotifier* IDexFinishNotifier::clone() const {
  return nullptr;
}

DexSettings::DexSettings() {
  reset();
}

DexSettings::DexSettings(const DexSettings& other) {
  reset();
  clone(other);
}

DexSettings& DexSettings::operator=(const DexSettings& other) {
  if (this != &other) clone(other);
  return *this;
}

DexSettings::~DexSettings() {
  releaseOwnedObjects();
}

bool DexSettings::hasOnlyThisDataType(EDexDataType type) const {
  int count = 0;
  for (int kind = 0; kind <= kLastSingleDataType; ++kind) {
    if (dataTypes.has(static_cast<EDexDataType>(kind))) ++count;
  }
  const bool countable = type >= 0 && type <= kLastSingleDataType;
  return count == 1 && countable && dataTypes.has(type);
}

bool DexSettings::hasToleranceFilter() const {
  return toleranceFilter != nullptr && toleranceFilter->isAnySet();
}

void DexSettings::reset() {
  dataTypes.clear();
  messageBox = nullptr;
  exportNotifier = nullptr;
  importNotifier = nullptr;
  distUnits = ANY_UNITS;
  angleUnits = angle_units::ANY_UNITS;
  coordsStyle = PACKED_DMS;
  coordDecimals = {3, 3, 3};
  userAsciiSettings = nullptr;
  pluginFlags = {true, true};
  textLayout = nullptr;
  optionBlock = nullptr;
  toleranceFilter = nullptr;
  pluginOptions = {};
  pluginOptions[7] = true;
  pluginOptions[15] = true;
  maxNumericPointName = -1;
  pluginText = nullptr;
  pluginOption = false;
  pluginValue = 2;
  parentWindow = nullptr;
}

void DexSettings::clone(const DexSettings& other) {
  dataTypes = other.dataTypes;
  distUnits = other.distUnits;
  angleUnits = other.angleUnits;
  coordsStyle = other.coordsStyle;
  coordDecimals = other.coordDecimals;
  pluginFlags = other.pluginFlags;
  pluginOptions = other.pluginOptions;
  maxNumericPointName = other.maxNumericPointName;
  pluginOption = other.pluginOption;
  pluginValue = other.pluginValue;
  parentWindow = other.parentWindow;

  takeCopy(messageBox, other.messageBox);
  takeCopy(userAsciiSettings, other.userAsciiSettings);
  takeCopy(textLayout, other.textLayout);
  takeCopy(optionBlock, other.optionBlock);

  takeCopyWhenPresent(exportNotifier, other.exportNotifier);
  takeCopyWhenPresent(importNotifier, other.importNotifier);
  takeCopyWhenPresent(toleranceFilter, other.toleranceFilter);
  takeCopyWhenPresent(pluginText, other.pluginText);
}

void DexSettings::releaseOwnedObjects() {
  release(messageBox);
  release(exportNotifier);
  release(importNotifier);
  release(userAsciiSettings);
  release(textLayout);
  release(optionBlock);
  release(toleranceFilter);
  release(pluginText);
}

}  // namespace vyn::ie
