#include "ieObjects/IECodesDataInterface.h"

#include <algorithm>
#include <cstddef>
#include <string_view>

#include "hostlibs/VynLogging.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/detail/CodesDataInterfaceLog.h"

namespace vyn::ie {

namespace {

using ascii_fields::EType;

bool isControlCodePlace(int place) noexcept {
  return place >= 0 && place < DexCodeValues::kNumberOfControlCodes;
}

// The name of a code, or null for a code without description (which no name search matches).
const CVynStringT<wchar_t>* codeNameOf(const DexCodeValues& code) noexcept {
  const DexCodeDescription* const description = code.getDescription();
  return description != nullptr ? &description->getName() : nullptr;
}

// name == codeName + codeString, without building the joined text.
bool isCodeNameWithString(std::wstring_view name, std::wstring_view codeName, std::wstring_view codeString) {
  return name.size() == codeName.size() + codeString.size() && name.starts_with(codeName) &&
         name.ends_with(codeString);
}

bool matchesCodeStrings(const DexCodeValues& code, const CVynStringT<wchar_t>& codeName,
                        const CVynStringT<wchar_t>& name) {
  for (int i = 0; i < code.getNumberOfTheCodeStrings(); ++i) {
    if (isCodeNameWithString(name.view(), codeName.view(), code.getCodeStringAt(i).view())) return true;
  }
  return false;
}

// Which attribute items a code style lists; the attribute block writes them in a fixed order.
struct AttributeItems {
  bool name = false;
  bool nameSeparator = false;
  bool value = false;
  bool valueSeparator = false;

  explicit AttributeItems(const ascii_fields::FieldList& fields) {
    for (const auto& field : fields) {
      name = name || field.type == ascii_fields::FIELD_ATTRIBUTE_NAME;
      nameSeparator = nameSeparator || field.type == ascii_fields::FIELD_ATTRIBUTE_NAME_SEPARATOR;
      value = value || field.type == ascii_fields::FIELD_ATTRIBUTE_VALUE;
      valueSeparator = valueSeparator || field.type == ascii_fields::FIELD_ATTRIBUTE_VALUE_SEPARATOR;
    }
  }
};

bool isAttributeItem(EType type) noexcept {
  return type >= ascii_fields::FIELD_ATTRIBUTE_NAME && type <= ascii_fields::FIELD_ATTRIBUTE_VALUE_SEPARATOR;
}

// Writes the code texts of one object: one call of append() per code.
class CodeTextWriter {
 public:
  CodeTextWriter(const DexCodesDataInterface& codes, const DexCodeStyle& style,
                 const CVynStringT<wchar_t>& note)
      : codes_(codes), style_(style), note_(note), attributeItems_(style.fields) {}

  void append(const DexCodeValues& code, const DexCodeDescription& description, bool isLast) {
    bool attributesWritten = false;
    for (const auto& field : style_.fields) {
      if (isAttributeItem(field.type)) {
        if (!attributesWritten) appendAttributes(code, description);
        attributesWritten = true;
      } else {
        appendItem(field.type, code, description, isLast);
      }
    }
  }

  // An object without codes: the note alone, or the note with its separator in field order.
  void appendNoteWithoutCodes() {
    const int noteSeparatorPosition =
        ascii_fields::findTypeInArray(ascii_fields::FIELD_NOTE_SEPARATOR, style_.fields);
    if (noteSeparatorPosition < 0) {
      text_ += note_;
      return;
    }
    const int notePosition = ascii_fields::findTypeInArray(ascii_fields::FIELD_NOTE, style_.fields);
    if (notePosition < 0 || note_.IsEmpty()) return;
    if (notePosition <= noteSeparatorPosition) {
      text_ += note_;
      text_ += style_.noteSeparator;
    } else {
      text_ += style_.noteSeparator;
      text_ += note_;
    }
  }

  const CVynStringT<wchar_t>& text() const noexcept { return text_; }

 private:
  void appendItem(EType type, const DexCodeValues& code, const DexCodeDescription& description, bool isLast) {
    switch (type) {
      case ascii_fields::FIELD_GENERAL_PREFIX:
        text_ += style_.generalPrefix;
        break;
      case ascii_fields::FIELD_CODE:
        text_ += description.getName();
        break;
      case ascii_fields::FIELD_CODE_SEPARATOR:
        if (codes_.getNumberOfCodes() >= 2 && !isLast) text_ += style_.codeSeparator;
        break;
      case ascii_fields::FIELD_CONTROL_CODE:
        appendControlCodes(code);
        break;
      case ascii_fields::FIELD_CONTROL_CODE_SEPARATOR:
        if (!code.getControlCode(DexCodeValues::FIRST_CONTROL_CODE).IsEmpty()) {
          text_ += style_.controlCodeSeparator;
        }
        break;
      case ascii_fields::FIELD_CODE_STRING:
        if (code.getNumberOfTheCodeStrings() > 0) text_ += code.getCodeStringAt(0);
        break;
      case ascii_fields::FIELD_STRING_SEPARATOR:
        if (code.getNumberOfTheCodeStrings() > 0) text_ += style_.stringSeparator;
        break;
      case ascii_fields::FIELD_NOTE:
        if (isLast) text_ += note_;
        break;
      case ascii_fields::FIELD_NOTE_SEPARATOR:
        if (isLast && !note_.IsEmpty()) text_ += style_.noteSeparator;
        break;
      default:
        vyn_logging::vyn_err_log(detail::kCodesDataInterfaceLogSource, detail::kUnknownCodeStyleFieldLine);
        break;
    }
  }

  void appendControlCodes(const DexCodeValues& code) {
    text_ += codes_.getUserControlCode(&style_, code.getControlCode(DexCodeValues::FIRST_CONTROL_CODE));
    const CVynStringT<wchar_t> second = code.getControlCode(DexCodeValues::SECOND_CONTROL_CODE);
    if (second.IsEmpty()) return;
    text_ += style_.controlCodeSeparator;
    text_ += codes_.getUserControlCode(&style_, second);
  }

  void appendAttributes(const DexCodeValues& code, const DexCodeDescription& description) {
    for (int k = 0; k < description.getSize(); ++k) {
      if (attributeItems_.nameSeparator) text_ += style_.attrNameSeparator;
      if (attributeItems_.name) text_ += description.getAttrDescriptionAt(k)->getName();
      if (attributeItems_.valueSeparator) text_ += style_.attrValueSeparator;
      if (attributeItems_.value) text_ += code.getAttrAt(k);
    }
  }

  const DexCodesDataInterface& codes_;
  const DexCodeStyle& style_;
  const CVynStringT<wchar_t>& note_;
  const AttributeItems attributeItems_;
  CVynStringT<wchar_t> text_;
};

}  // namespace

// DexCodeStyle

DexCodeStyle::~DexCodeStyle() = default;

// DexCodeValues

DexCodeValues::DexCodeValues(const DexCodeDescription* description) : description_(description) {}

DexCodeValues::~DexCodeValues() = default;

void DexCodeValues::insertAttr(const CVynStringT<wchar_t>& name, const CVynStringT<wchar_t>& value) {
  if (description_ == nullptr) return;
  int index = description_->findAttrDescriptionIndex(name);
  if (index < 0) {
    // The description is owned by the code library as a mutable object; the value only refers to it.
    auto* const shared = const_cast<DexCodeDescription*>(description_);
    shared->addAttrDescription(new DexAttrDescription(name, DexAttrDescription::ATTR_STRING));
    index = description_->findAttrDescriptionIndex(name);
    if (index < 0) return;  // the allocation failed
  }
  attrs_.SetAtGrow(index, value);
}

bool DexCodeValues::getAttrByName(const CVynStringT<wchar_t>& name, CVynStringT<wchar_t>& value) const {
  if (description_ == nullptr) return false;
  const int index = description_->findAttrDescriptionIndex(name);
  if (index < 0) return false;
  value = getAttrAt(index);
  return true;
}

CVynStringT<wchar_t> DexCodeValues::getAttrByName(const CVynStringT<wchar_t>& name) const {
  CVynStringT<wchar_t> value;
  getAttrByName(name, value);
  return value;
}

CVynStringT<wchar_t> DexCodeValues::getCodeStringAt(int index) const {
  if (index < 0 || index >= codeStrings_.GetSize()) {
    vyn_logging::vyn_err_log(detail::kCodesDataInterfaceLogSource, detail::kCodeStringIndexLine);
    return {};
  }
  return codeStrings_.GetAt(index);
}

CVynStringT<wchar_t> DexCodeValues::getControlCode(int place) const {
  if (!isControlCodePlace(place) || !controlCodes_) return {};
  return (*controlCodes_.get())[static_cast<std::size_t>(place)];
}

void DexCodeValues::setControlCode(int place, const CVynStringT<wchar_t>& controlCode) {
  if (!isControlCodePlace(place)) return;
  if (!controlCodes_) {
    if (controlCode.IsEmpty()) return;
    controlCodes_.reset(new std::array<CVynStringT<wchar_t>, kNumberOfControlCodes>());
  }
  (*controlCodes_.get())[static_cast<std::size_t>(place)] = controlCode;
}

bool DexCodeValues::doesCodeHasControlCode(const CVynStringT<wchar_t>& controlCode) const {
  if (!controlCodes_) return controlCode.IsEmpty();
  const auto& held = *controlCodes_.get();
  return std::find(held.begin(), held.end(), controlCode) != held.end();
}

// DexCodesDataInterface

DexCodesDataInterface::~DexCodesDataInterface() = default;

const DexCodeValues* DexCodesDataInterface::findCode(const CVynStringT<wchar_t>& name,
                                                     bool withCodeStrings) const {
  return codes_.findFirst([&](const DexCodeValues& code) {
    const CVynStringT<wchar_t>* const codeName = codeNameOf(code);
    if (codeName == nullptr) return false;
    return (withCodeStrings && matchesCodeStrings(code, *codeName, name)) || *codeName == name;
  });
}

int DexCodesDataInterface::getCodePos(const CVynStringT<wchar_t>& name) const {
  for (int i = 0; i < codes_.count(); ++i) {
    const CVynStringT<wchar_t>* const codeName = codeNameOf(*codes_.at(i));
    if (codeName != nullptr && *codeName == name) return i;
  }
  return -1;
}

CVynStringT<wchar_t> DexCodesDataInterface::getCodeAttrValue(const CVynStringT<wchar_t>& codeName,
                                                             const CVynStringT<wchar_t>& attrName) const {
  const DexCodeValues* const code = findCode(codeName, false);
  return code != nullptr ? code->getAttrByName(attrName) : CVynStringT<wchar_t>();
}

bool DexCodesDataInterface::removeCode(const CVynStringT<wchar_t>& name) {
  return codes_.remove(getCodePos(name));
}

void DexCodesDataInterface::copyCodesData(DexCodesDataInterface* target) const {
  if (target == nullptr) return;
  // Counted first, so that copying into this object copies each code once.
  const int count = codes_.count();
  for (int i = 0; i < count; ++i) {
    target->addCode(new DexCodeValues(*codes_.at(i)));
  }
}

CVynStringT<wchar_t> DexCodesDataInterface::getCodesAsCodeStyle(const DexCodeStyle* style,
                                                                const CVynStringT<wchar_t>& note) const {
  if (style == nullptr) return {};
  CodeTextWriter writer(*this, *style, note);
  const int count = codes_.count();
  if (count == 0) writer.appendNoteWithoutCodes();
  for (int i = 0; i < count; ++i) {
    const DexCodeValues& code = *codes_.at(i);
    const DexCodeDescription* const description = code.getDescription();
    if (description != nullptr) writer.append(code, *description, i == count - 1);
  }
  return writer.text();
}

CVynStringT<wchar_t> DexCodesDataInterface::getUserControlCode(
    const DexCodeStyle* style, const CVynStringT<wchar_t>& controlCode) const {
  if (style == nullptr) return controlCode;
  if (controlCode == L"AS") return style->userAS;
  if (controlCode == L"AE") return style->userAE;
  if (controlCode == L"R") return style->userR;
  if (controlCode == L"C") return style->userC;
  if (controlCode == L"BEG_LINE") return style->userBegLine;
  if (controlCode == L"END_LINE") return style->userEndLine;
  return controlCode;
}

}  // namespace vyn::ie
