#pragma once

#include <cstddef>
#include <string_view>

// Byte-order marks at the start of a text file, shared by the text file reader and the XML reader.
namespace vyn_text::detail {

enum class ByteOrderMark { None, Utf8, Utf16LE, Utf16BE };

struct DetectedMark {
  ByteOrderMark mark = ByteOrderMark::None;
  std::size_t length = 0;  // bytes the mark takes
};

// The mark that begins bytes, if any.
constexpr DetectedMark detectByteOrderMark(std::string_view bytes) noexcept {
  const auto at = [&](std::size_t i) { return static_cast<unsigned char>(bytes[i]); };
  if (bytes.size() >= 3 && at(0) == 0xEF && at(1) == 0xBB && at(2) == 0xBF) return {ByteOrderMark::Utf8, 3};
  if (bytes.size() >= 2 && at(0) == 0xFF && at(1) == 0xFE) return {ByteOrderMark::Utf16LE, 2};
  if (bytes.size() >= 2 && at(0) == 0xFE && at(1) == 0xFF) return {ByteOrderMark::Utf16BE, 2};
  return {};
}

}  // namespace vyn_text::detail
