#include "ieObjects/IEDrawProperties.h"

#include <cstddef>
#include <cstdint>

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/DrawPropertiesLog.h"

namespace vyn::ie {

namespace {

// The texts of one style enumeration, indexed by its value, with the log line of a value outside it.
template <class Style, std::size_t N>
struct StyleTable {
  std::array<const wchar_t*, N> texts;
  int unknownStyleLine;

  CVynStringT<wchar_t> textOf(Style style) const {
    const auto index = static_cast<std::int64_t>(style);
    if (index >= 0 && index < static_cast<std::int64_t>(N)) return texts[static_cast<std::size_t>(index)];
    vyn_logging::vyn_err_log(detail::kDrawPropertiesLogSource, unknownStyleLine);
    return {};
  }

  bool find(const CVynStringT<wchar_t>& text, Style& style) const {
    for (std::size_t i = 0; i < N; ++i) {
      if (text.CompareNoCase(texts[i]) == 0) {
        style = static_cast<Style>(i);
        return true;
      }
    }
    return false;
  }

  // The text of a defined attribute; false when it is not defined.
  bool textOf(const DexDrawAttribute<Style>& attribute, CVynStringT<wchar_t>& text) const {
    Style style{};
    if (!attribute.get(style)) return false;
    text = textOf(style);
    return true;
  }

  // Sets the attribute from a text of the table, or leaves it undefined.
  bool assign(DexDrawAttribute<Style>& attribute, const CVynStringT<wchar_t>& text) const {
    Style style{};
    if (find(text, style)) {
      attribute.set(style);
      return true;
    }
    attribute.undefine();
    return false;
  }
};

const StyleTable<DexDrawPointProperties::EMarkStyleType, 16> kMarkStyles{
    {L"Dot", L"Filled Rect", L"Filled Diamond", L"Filled Circle", L"Filled Triangle", L"Rect", L"Diamond",
     L"Circle", L"Triangle", L"Cross", L"Tree", L"SmallCross", L"Upside Triangle", L"Filled Upside Triangle",
     L"XCross", L"None"},
    detail::kUnknownMarkStyleLine};

const StyleTable<DexDrawLineProperties::EDashStyleType, 5> kDashStyles{
    {L"Solid", L"Dash", L"Dot", L"Dash Dot", L"Dash Dot Dot"}, detail::kUnknownDashStyleLine};

const StyleTable<DexDrawAreaProperties::EFillStyleType, 6> kFillStyles{
    {L"None", L"Solid", L"Grid", L"Checkered", L"Horz. Lines", L"Vert. Lines"},
    detail::kUnknownFillStyleLine};

}  // namespace

// IDexDrawProperties

IDexDrawProperties::~IDexDrawProperties() = default;

bool IDexDrawProperties::getColor(unsigned long& color) const {
  return color_.get(color);
}

void IDexDrawProperties::setColor(unsigned long color) {
  color_.set(color);
}

bool IDexDrawProperties::isColorByLayer() const {
  return color_.isByLayer();
}

void IDexDrawProperties::setColorByLayer() {
  color_.setByLayer();
}

// DexDrawPointProperties

DexDrawPointProperties::~DexDrawPointProperties() = default;

IDexDrawProperties* DexDrawPointProperties::clone() const {
  auto* const copy = new DexDrawPointProperties();
  if (copy == nullptr) return nullptr;
  transferColorTo(*copy);
  markStyle_.transferTo(copy->markStyle_);
  return copy;
}

CVynStringT<wchar_t> DexDrawPointProperties::getObjTypeAsString() const {
  return L"Point";
}

bool DexDrawPointProperties::isDefined() const {
  return isColorDefined() || markStyle_.isDefined();
}

bool DexDrawPointProperties::getMarkStyleAsString(CVynStringT<wchar_t>& text) const {
  return kMarkStyles.textOf(markStyle_, text);
}

bool DexDrawPointProperties::setMarkStyleFromString(const CVynStringT<wchar_t>& text) {
  return kMarkStyles.assign(markStyle_, text);
}

CVynStringT<wchar_t> DexDrawPointProperties::getMarkStyleAsString(EMarkStyleType style) {
  return kMarkStyles.textOf(style);
}

// DexDrawLineProperties

DexDrawLineProperties::DexDrawLineProperties(unsigned long color, unsigned char width,
                                             EDashStyleType dashStyle) {
  setColor(color);
  setWidth(width);
  setDashStyle(dashStyle);
}

DexDrawLineProperties::~DexDrawLineProperties() = default;

IDexDrawProperties* DexDrawLineProperties::clone() const {
  auto* const copy = new DexDrawLineProperties();
  if (copy == nullptr) return nullptr;
  transferColorTo(*copy);
  dashStyle_.transferTo(copy->dashStyle_);
  width_.transferTo(copy->width_);
  return copy;
}

CVynStringT<wchar_t> DexDrawLineProperties::getObjTypeAsString() const {
  return L"Line";
}

bool DexDrawLineProperties::isDefined() const {
  return isColorDefined() || dashStyle_.isDefined() || width_.isDefined();
}

bool DexDrawLineProperties::getDashStyleTypeAsString(CVynStringT<wchar_t>& text) const {
  return kDashStyles.textOf(dashStyle_, text);
}

bool DexDrawLineProperties::setDashStyleFromString(const CVynStringT<wchar_t>& text) {
  return kDashStyles.assign(dashStyle_, text);
}

CVynStringT<wchar_t> DexDrawLineProperties::getDashStyleTypeAsString(EDashStyleType style) {
  return kDashStyles.textOf(style);
}

// DexDrawAreaProperties

DexDrawAreaProperties::~DexDrawAreaProperties() = default;

IDexDrawProperties* DexDrawAreaProperties::clone() const {
  auto* const copy = new DexDrawAreaProperties();
  if (copy == nullptr) return nullptr;
  transferColorTo(*copy);
  fillStyle_.transferTo(copy->fillStyle_);
  fillTransparency_.transferTo(copy->fillTransparency_);
  return copy;
}

CVynStringT<wchar_t> DexDrawAreaProperties::getObjTypeAsString() const {
  return L"Area";
}

bool DexDrawAreaProperties::isDefined() const {
  return isColorDefined() || fillStyle_.isDefined() || fillTransparency_.isDefined();
}

bool DexDrawAreaProperties::getFillStyleTypeAsString(CVynStringT<wchar_t>& text) const {
  return kFillStyles.textOf(fillStyle_, text);
}

bool DexDrawAreaProperties::setFillStyleFromString(const CVynStringT<wchar_t>& text) {
  return kFillStyles.assign(fillStyle_, text);
}

CVynStringT<wchar_t> DexDrawAreaProperties::getFillStyleTypeAsString(EFillStyleType style) {
  return kFillStyles.textOf(style);
}

// DexDrawPropertiesByType

namespace {

bool isDrawType(int type) {
  const auto index = static_cast<std::int64_t>(type);
  return index >= 0 && index < IDexDrawProperties::kNumberOfDrawTypes;
}

}  // namespace

DexDrawPropertiesByType::DexDrawPropertiesByType(const DexDrawPropertiesByType& other) {
  for (std::size_t i = 0; i < objects_.size(); ++i) {
    if (other.objects_[i]) objects_[i].reset(other.objects_[i]->clone());
  }
}

DexDrawPropertiesByType& DexDrawPropertiesByType::operator=(const DexDrawPropertiesByType& other) {
  if (&other != this) {
    DexDrawPropertiesByType copy(other);
    objects_.swap(copy.objects_);
  }
  return *this;
}

DexDrawPropertiesByType::~DexDrawPropertiesByType() = default;

IDexDrawProperties* DexDrawPropertiesByType::get(int type) noexcept {
  return isDrawType(type) ? objects_[static_cast<std::size_t>(type)].get() : nullptr;
}

const IDexDrawProperties* DexDrawPropertiesByType::get(int type) const noexcept {
  return isDrawType(type) ? objects_[static_cast<std::size_t>(type)].get() : nullptr;
}

bool DexDrawPropertiesByType::set(int type, IDexDrawProperties* properties) {
  if (!isDrawType(type)) return false;
  auto& slot = objects_[static_cast<std::size_t>(type)];
  if (slot.get() == properties) return true;
  for (const auto& held : objects_) {
    if (properties != nullptr && held.get() == properties) return false;
  }
  slot.reset(properties);
  return true;
}

bool DexDrawPropertiesByType::hasAny() const noexcept {
  for (const auto& held : objects_) {
    if (held) return true;
  }
  return false;
}

bool DexDrawPropertiesByType::isAnyDefined() const {
  for (const auto& held : objects_) {
    if (held && held->isDefined()) return true;
  }
  return false;
}

void DexDrawPropertiesByType::setColor(unsigned long color) {
  for (const auto& held : objects_) {
    if (held) held->setColor(color);
  }
}

IDexDrawProperties* DexDrawPropertiesByType::createFromString(const CVynStringT<wchar_t>& text) {
  if (text == L"Point") return new DexDrawPointProperties();
  if (text == L"Line") return new DexDrawLineProperties();
  if (text == L"Area") return new DexDrawAreaProperties();
  return nullptr;
}

}  // namespace vyn::ie
