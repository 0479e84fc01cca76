#include "support/FuzzInput.h"

#include <algorithm>
#include <cstring>

namespace dex_fuzz {

std::uint8_t FuzzInput::takeByte() noexcept {
  if (bytes_.empty()) return 0;
  const auto value = static_cast<std::uint8_t>(bytes_.front());
  bytes_.remove_prefix(1);
  return value;
}

int FuzzInput::takeInt(int low, int high) noexcept {
  if (high <= low) return low;
  const auto span = static_cast<unsigned>(high - low) + 1u;
  unsigned raw = takeByte();
  if (span > 256) raw = (raw << 8) | takeByte();
  return low + static_cast<int>(raw % span);
}

double FuzzInput::takeDoubleBits() noexcept {
  unsigned char bits[sizeof(double)] = {};
  const std::string_view taken = takeBytes(sizeof bits);
  std::memcpy(bits, taken.data(), taken.size());
  double value = 0.0;
  std::memcpy(&value, bits, sizeof value);
  return value;
}

std::string_view FuzzInput::takeBytes(std::size_t count) noexcept {
  const std::string_view taken = bytes_.substr(0, std::min(count, bytes_.size()));
  bytes_.remove_prefix(taken.size());
  return taken;
}

std::string_view FuzzInput::takeRest() noexcept {
  return takeBytes(bytes_.size());
}

std::string_view FuzzInput::takeUntil(char separator) noexcept {
  const std::size_t at = bytes_.find(separator);
  if (at == std::string_view::npos) return takeRest();
  const std::string_view taken = bytes_.substr(0, at);
  bytes_.remove_prefix(at + 1);
  return taken;
}

}  // namespace dex_fuzz
