#include "DxfRecord.h"

#include <climits>

#include "DxfGroupReader.h"
#include "DxfWords.h"

namespace vyn::ie::dxf {

void DxfRecord::reset(std::string_view type, int line) {
  type_.assign(type);
  line_ = line;
  groups_.clear();
  chars_.clear();
  malformedCode_ = -1;
}

void DxfRecord::add(int code, std::string_view value) {
  groups_.push_back(
      {code, static_cast<std::uint32_t>(chars_.size()), static_cast<std::uint32_t>(value.size())});
  chars_.append(value);
}

void DxfRecord::markMalformed(int code) noexcept {
  if (malformedCode_ < 0) malformedCode_ = code;
}

std::string_view DxfRecord::valueAt(std::size_t index) const noexcept {
  const Group& group = groups_[index];
  return std::string_view(chars_).substr(group.offset, group.length);
}

int DxfRecord::find(int code, std::size_t from) const noexcept {
  for (std::size_t i = from; i < groups_.size(); ++i) {
    if (groups_[i].code == code) return static_cast<int>(i);
  }
  return -1;
}

std::string_view DxfRecord::text(int code) const noexcept {
  const int index = find(code);
  return index < 0 ? std::string_view() : valueAt(static_cast<std::size_t>(index));
}

double DxfRecord::real(int code, double fallback) {
  const int index = find(code);
  return index < 0 ? fallback : realAt(static_cast<std::size_t>(index), fallback);
}

int DxfRecord::integer(int code, int fallback) {
  const int index = find(code);
  return index < 0 ? fallback : integerAt(static_cast<std::size_t>(index), fallback);
}

double DxfRecord::realAt(std::size_t index, double fallback) {
  double value = 0.0;
  if (parseReal(valueAt(index), value)) return value;
  markMalformed(groups_[index].code);
  return fallback;
}

int DxfRecord::integerAt(std::size_t index, int fallback) {
  long long value = 0;
  if (parseInteger(valueAt(index), value) && value >= INT_MIN && value <= INT_MAX)
    return static_cast<int>(value);
  markMalformed(groups_[index].code);
  return fallback;
}

std::vector<std::string_view> DxfRecord::applicationTexts(std::string_view application) const {
  std::vector<std::string_view> texts;
  bool inside = false;
  for (std::size_t i = 0; i < groups_.size(); ++i) {
    if (groups_[i].code == group::kXdataApplication) {
      if (inside) break;
      inside = valueAt(i) == application;
    } else if (inside && groups_[i].code == group::kXdataText) {
      texts.push_back(valueAt(i));
    }
  }
  return texts;
}

}  // namespace vyn::ie::dxf
