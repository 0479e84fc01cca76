#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

// Reads the bytes of one fuzz input from the front: small numbers that steer a target (a delimiter, a
// width, a style) and then the rest as text or raw bytes. Taking past the end answers zeros and empty
// texts, so every input, even an empty one, drives a target to its end.
namespace dex_fuzz {

class FuzzInput {
 public:
  FuzzInput(const std::uint8_t* data, std::size_t size) noexcept
      : bytes_(reinterpret_cast<const char*>(data), size) {}

  bool empty() const noexcept { return bytes_.empty(); }
  std::size_t remaining() const noexcept { return bytes_.size(); }

  std::uint8_t takeByte() noexcept;
  // A number in [low, high] from one or two bytes.
  int takeInt(int low, int high) noexcept;
  // The next 8 bytes as the bit pattern of a double (zero bits beyond the end).
  double takeDoubleBits() noexcept;

  // The next count bytes (fewer at the end), or everything left.
  std::string_view takeBytes(std::size_t count) noexcept;
  std::string_view takeRest() noexcept;

  // Bytes up to the next separator byte (the separator is consumed, not returned).
  std::string_view takeUntil(char separator) noexcept;

 private:
  std::string_view bytes_;
};

}  // namespace dex_fuzz
