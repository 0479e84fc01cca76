#include "ieObjects/IEDataDictionary.h"

#include <array>
#include <utility>

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/DataDictionaryLog.h"

namespace vyn::ie {

namespace {

// The attribute type table: text, maximal length and binary size of each type, indexed by its value.
struct AttrTypeRow {
  const wchar_t* text;
  int maxLength;
  int attrSize;
};

constexpr std::array<AttrTypeRow, 6> kAttrTypes{{
    {L"String", 255, -1},
    {L"Bool", 10, 4},
    {L"Integer", 10, 4},
    {L"Float", 18, 8},
    {L"List", 255, -1},
    {L"Date-Time", 19, -1},
}};

constexpr AttrTypeRow kUnsupportedAttrType{L"NotSupported", 255, -1};
constexpr int kDefaultMaxFracLength = 18;
constexpr int kDefaultExtraInt = 1;

const AttrTypeRow* findAttrType(DexAttrDescription::EAttributeType type) noexcept {
  const auto index = static_cast<long long>(type);
  if (index < 0 || index >= static_cast<long long>(kAttrTypes.size())) return nullptr;
  return &kAttrTypes[static_cast<std::size_t>(index)];
}

const AttrTypeRow& attrTypeOrUnsupported(DexAttrDescription::EAttributeType type) noexcept {
  const AttrTypeRow* const row = findAttrType(type);
  return row != nullptr ? *row : kUnsupportedAttrType;
}

}  // namespace

// DexAttrDescription

DexAttrDescription::DexAttrDescription() {
  resetAll();
}

DexAttrDescription::DexAttrDescription(const CVynStringT<wchar_t>& name, EAttributeType type)
    : type_(type), name_(name) {
  resetAll();
}

DexAttrDescription::~DexAttrDescription() = default;

void DexAttrDescription::resetAll() {
  update();
  maxFracLength_ = kDefaultMaxFracLength;
  extraInt = kDefaultExtraInt;
  extraText1.Empty();
  extraText2.Empty();
  extraText3.Empty();
}

CVynStringT<wchar_t> DexAttrDescription::getTypeAsString() const {
  return attrTypeOrUnsupported(type_).text;
}

void DexAttrDescription::setTypeFromString(const CVynStringT<wchar_t>& text) {
  type_ = ATTR_STRING;
  for (std::size_t i = 0; i < kAttrTypes.size(); ++i) {
    if (text.CompareNoCase(kAttrTypes[i].text) == 0) {
      type_ = static_cast<EAttributeType>(i);
      break;
    }
  }
  update();
}

void DexAttrDescription::update() {
  maxLength_ = getMaxLength();
}

int DexAttrDescription::getMaxLength() const {
  const AttrTypeRow* const row = findAttrType(type_);
  if (row != nullptr) return row->maxLength;
  vyn_logging::vyn_err_log(detail::kDataDictionaryLogSource, detail::kUnsupportedAttrTypeLine);
  return kUnsupportedAttrType.maxLength;
}

int DexAttrDescription::getMaxFracLength() const noexcept {
  return type_ == ATTR_FLOAT ? maxFracLength_ : 0;
}

int DexAttrDescription::getAttrSize() const noexcept {
  return attrTypeOrUnsupported(type_).attrSize;
}

// DexCodeDescription

DexCodeDescription::DexCodeDescription(const CVynStringT<wchar_t>& name) : name_(name) {}

DexCodeDescription::~DexCodeDescription() = default;

DexAttrDescription* DexCodeDescription::findAttrDescription(const CVynStringT<wchar_t>& name) {
  return const_cast<DexAttrDescription*>(std::as_const(*this).findAttrDescription(name));
}

const DexAttrDescription* DexCodeDescription::findAttrDescription(const CVynStringT<wchar_t>& name) const {
  return attrDescriptions_.at(findAttrDescriptionIndex(name));
}

int DexCodeDescription::findAttrDescriptionIndex(const CVynStringT<wchar_t>& name) const {
  for (int i = 0; i < attrDescriptions_.count(); ++i) {
    if (attrDescriptions_.at(i)->getName() == name) return i;
  }
  return -1;
}

bool DexCodeDescription::isOnlyCodeNameDefined() const noexcept {
  return attrDescriptions_.isEmpty() && !drawProperties_.hasAny() && layer_ == nullptr &&
         descCodeName_.IsEmpty() && codeType_ == CODE_TYPE_UNDEFINED &&
         attribPromptType_ == ATTRIB_PROMPT_UNDEFINED;
}

IDexDrawProperties* DexCodeDescription::createDrawPropertiesFromString(const CVynStringT<wchar_t>& text) {
  return DexDrawPropertiesByType::createFromString(text);
}

// DexDataDictionary

DexDataDictionary::DexDataDictionary(const DexDataDictionary& other) {
  for (const auto& [name, description] : other.descriptions_) {
    // A failed allocation (null from the class allocator) leaves that code out of the copy.
    std::unique_ptr<DexCodeDescription> copy(new DexCodeDescription(*description));
    if (copy) descriptions_.emplace(name, std::move(copy));
  }
}

DexDataDictionary& DexDataDictionary::operator=(const DexDataDictionary& other) {
  if (&other != this) {
    DexDataDictionary copy(other);
    descriptions_.swap(copy.descriptions_);
    cursor_.reset();
  }
  return *this;
}

DexDataDictionary::~DexDataDictionary() = default;

bool DexDataDictionary::addCodeDescription(DexCodeDescription* description) {
  if (description == nullptr) return false;
  const auto present = descriptions_.find(description->getName());
  if (present != descriptions_.end()) return present->second.get() == description;
  descriptions_.emplace(description->getName(), std::unique_ptr<DexCodeDescription>(description));
  return true;
}

DexCodeDescription* DexDataDictionary::findCodeDiscription(const CVynStringT<wchar_t>& name) {
  return const_cast<DexCodeDescription*>(std::as_const(*this).findCodeDiscription(name));
}

const DexCodeDescription* DexDataDictionary::findCodeDiscription(const CVynStringT<wchar_t>& name) const {
  const auto found = descriptions_.find(name);
  return found != descriptions_.end() ? found->second.get() : nullptr;
}

DexCodeDescription* DexDataDictionary::takeNext() const noexcept {
  if (!cursor_) cursor_ = descriptions_.cbegin();
  auto& position = *cursor_;
  if (position == descriptions_.cend()) return nullptr;
  DexCodeDescription* const description = position->second.get();
  ++position;
  return description;
}

}  // namespace vyn::ie
