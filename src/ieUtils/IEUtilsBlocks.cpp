#include "ieUtils/IEUtilsBlocks.h"

#include <cstddef>
#include <string>
#include <string_view>

#include "hostlibs/VynFormats.h"
#include "hostlibs/detail/Utf.h"

namespace vyn::ie::utils {

namespace {

using String = CVynStringT<wchar_t>;

constexpr wchar_t kStartOfText = 0x02;
constexpr wchar_t kEndOfText = 0x03;
constexpr std::wstring_view kRecordEnd = L"\r\n";
constexpr std::size_t kChecksumMinDigits = 3;
constexpr std::size_t kLineLength = kBlockLineLength;
constexpr std::size_t kDataLength = kBlockDataLength;

wchar_t nextSequenceDigit(wchar_t digit) {
  return digit >= L'0' && digit < L'9' ? static_cast<wchar_t>(digit + 1) : L'0';
}

unsigned checksum(std::wstring_view line) {
  unsigned sum = 0;
  for (const char16_t unit : vyn_text::detail::toUtf16(line))
    sum ^= unit;
  return sum;
}

std::wstring checksumText(unsigned sum) {
  std::wstring digits = std::to_wstring(sum);
  if (digits.size() < kChecksumMinDigits) digits.insert(0, kChecksumMinDigits - digits.size(), L'0');
  return digits;
}

// Appends the record of a full pending line to out and restarts the line with the next digit.
void emitRecord(std::wstring& line, std::wstring& out) {
  const wchar_t digit = line.front();
  out.push_back(kStartOfText);
  out.append(line, 1, kDataLength);
  out.push_back(digit);
  out.append(checksumText(checksum(line)));
  out.push_back(kEndOfText);
  out.append(kRecordEnd);
  line.assign(1, nextSequenceDigit(digit));
}

}  // namespace

bool createBlockString(const String& text, String& line, String& out, bool final) {
  std::wstring pending = line.IsEmpty() ? std::wstring(1, L'0') : std::wstring(line.view());
  std::wstring overflow;
  std::wstring_view rest = text.view();
  if (pending.size() > kLineLength) {
    overflow = pending.substr(kLineLength);
    overflow.append(rest);
    pending.resize(kLineLength);
    rest = overflow;
  }

  std::wstring records(out.view());
  std::size_t room = kLineLength - pending.size();
  while (rest.size() >= room) {
    pending.append(rest.substr(0, room));
    rest.remove_prefix(room);
    emitRecord(pending, records);
    room = kDataLength;
  }
  pending.append(rest);
  if (final) pending.resize(kLineLength, L' ');
  if (pending.size() == kLineLength) emitRecord(pending, records);

  line = String(std::wstring_view(pending));
  out = String(std::wstring_view(records));
  return true;
}

bool writeBlockString(FILE* file, const String& text, String& line, bool final) {
  String records;
  if (!createBlockString(text, line, records, final)) return false;
  return vyn_formats::WriteString(file, records);
}

}  // namespace vyn::ie::utils
