#include "CodeText.h"

#include <algorithm>

#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"

namespace vyn::ie::point_files {

namespace {

constexpr wchar_t kStringMark = L':';
constexpr wchar_t kAttributeMark = L';';
constexpr wchar_t kValueMark = L'=';

bool isBlank(wchar_t ch) {
  return ch == L' ' || ch == L'\t';
}

}  // namespace

void assignText(CVynStringT<wchar_t>& target, std::wstring_view text) {
  const int length = static_cast<int>(text.size());
  wchar_t* buffer = target.GetBuffer(length);
  std::copy(text.begin(), text.end(), buffer);
  target.ReleaseBuffer(length);
}

void appendCodesText(const DexCodesDataInterface& codes, bool withStrings, bool withAttributes,
                     std::wstring& out) {
  bool first = true;
  for (int i = 0; i < codes.getNumberOfCodes(); ++i) {
    const DexCodeValues* code = codes.getCode(i);
    const DexCodeDescription* description = code->getDescription();
    if (description == nullptr) continue;
    if (!first) out += L' ';
    first = false;
    out += description->getName().view();
    if (withStrings) {
      for (int s = 0; s < code->getNumberOfTheCodeStrings(); ++s) {
        out += kStringMark;
        out += code->getCodeStringAt(s).view();
      }
    }
    if (withAttributes) {
      for (int a = 0; a < description->getSize(); ++a) {
        const CVynStringT<wchar_t> value = code->getAttrAt(a);
        if (value.IsEmpty()) continue;
        out += kAttributeMark;
        out += description->getAttrDescriptionAt(a)->getName().view();
        out += kValueMark;
        out += value.view();
      }
    }
  }
}

bool CodeReader::read(std::wstring_view text, DexCodesDataInterface& target, std::wstring& rejected) {
  bool wellFormed = true;
  std::size_t position = 0;
  while (position < text.size()) {
    while (position < text.size() && isBlank(text[position]))
      ++position;
    std::size_t end = position;
    while (end < text.size() && !isBlank(text[end]))
      ++end;
    const std::wstring_view item = text.substr(position, end - position);
    if (!item.empty() && !readOne(item, target)) {
      if (!rejected.empty()) rejected += L' ';
      rejected += item;
      wellFormed = false;
    }
    position = end;
  }
  return wellFormed;
}

namespace {

// The parts after the first mark of a text, each up to the next mark (the first part is empty when
// the text does not start with the mark).
template <class Visit>
void forEachPart(std::wstring_view text, wchar_t mark, Visit visit) {
  std::size_t position = text.find(mark);
  while (position < text.size()) {
    const std::size_t next = std::min(text.find(mark, position + 1), text.size());
    visit(text.substr(position + 1, next - position - 1));
    position = next;
  }
}

bool isAttributeWellFormed(std::wstring_view attribute) {
  const std::size_t equals = attribute.find(kValueMark);
  return attribute.empty() || (equals != std::wstring_view::npos && equals > 0);
}

}  // namespace

bool CodeReader::readOne(std::wstring_view item, DexCodesDataInterface& target) {
  const std::size_t attributesAt = std::min(item.find(kAttributeMark), item.size());
  const std::wstring_view head = item.substr(0, attributesAt);
  const std::wstring_view attributes = item.substr(attributesAt);
  const std::wstring_view name = head.substr(0, std::min(head.find(kStringMark), head.size()));
  bool wellFormed = !name.empty();
  forEachPart(attributes, kAttributeMark,
              [&wellFormed](std::wstring_view attribute) { wellFormed &= isAttributeWellFormed(attribute); });
  const DexCodeDescription* codeDescription = wellFormed ? description(name) : nullptr;
  if (codeDescription == nullptr) return false;

  auto* code = new DexCodeValues(codeDescription);
  target.addCode(code);
  forEachPart(head, kStringMark, [this, code](std::wstring_view string) {
    assignText(first_, string);
    code->addCodeString(first_);
  });
  forEachPart(attributes, kAttributeMark, [this, code](std::wstring_view attribute) {
    if (attribute.empty()) return;
    const std::size_t equals = attribute.find(kValueMark);
    assignText(first_, attribute.substr(0, equals));
    assignText(second_, attribute.substr(equals + 1));
    code->insertAttr(first_, second_);
  });
  return true;
}

const DexCodeDescription* CodeReader::description(std::wstring_view name) {
  if (const auto found = known_.find(name); found != known_.end()) return found->second;
  if (data_ == nullptr) return nullptr;
  assignText(first_, name);
  DexDataDictionary* dictionary = data_->getIEDataDictionary();
  const DexCodeDescription* held = dictionary->findCodeDiscription(first_);
  if (held == nullptr) {
    auto* added = new DexCodeDescription(first_);
    if (!data_->addCodeToIEDataDictionary(added)) {
      delete added;
      return nullptr;
    }
    held = added;
  }
  known_.emplace(std::wstring(name), held);
  return held;
}

}  // namespace vyn::ie::point_files
