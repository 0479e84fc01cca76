// CTextFile line reading on raw bytes: every byte-order mark, odd byte counts, lone surrogates, NUL
// bytes and every kind of line end come straight from the input. The first byte picks the block size,
// small enough that lines and marks straddle blocks; the same file is then read again in one large
// block. Both readings must give the lines a plain reference decoder gives for the whole file at once.

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "hostlibs/TextFile.h"
#include "ieUtils/IEFileReaders.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/ScratchFile.h"

namespace {

using Lines = std::vector<std::wstring>;

// ---- The reference: the whole file decoded at once, as the reader's header describes it --------

constexpr wchar_t kReplacement = 0xFFFD;

// The length of the well-formed UTF-8 sequence at the start of bytes (Unicode table 3-7), 0 if none.
std::size_t wellFormedUtf8(std::string_view bytes, char32_t& decoded) {
  const auto at = [&](std::size_t i) { return static_cast<unsigned char>(bytes[i]); };
  const auto inRange = [&](std::size_t i, unsigned low, unsigned high) {
    return i < bytes.size() && at(i) >= low && at(i) <= high;
  };
  const unsigned lead = at(0);
  std::size_t length = 0;
  if (lead < 0x80) return decoded = lead, 1;
  if (lead >= 0xC2 && lead <= 0xDF) {
    length = inRange(1, 0x80, 0xBF) ? 2 : 0;
  } else if (lead >= 0xE0 && lead <= 0xEF) {
    const unsigned low = lead == 0xE0 ? 0xA0 : 0x80;
    const unsigned high = lead == 0xED ? 0x9F : 0xBF;
    length = inRange(1, low, high) && inRange(2, 0x80, 0xBF) ? 3 : 0;
  } else if (lead >= 0xF0 && lead <= 0xF4) {
    const unsigned low = lead == 0xF0 ? 0x90 : 0x80;
    const unsigned high = lead == 0xF4 ? 0x8F : 0xBF;
    length = inRange(1, low, high) && inRange(2, 0x80, 0xBF) && inRange(3, 0x80, 0xBF) ? 4 : 0;
  }
  if (length == 0) return 0;
  static constexpr unsigned kLeadBits[] = {0, 0, 0x1F, 0x0F, 0x07};
  decoded = lead & kLeadBits[length];
  for (std::size_t i = 1; i < length; ++i)
    decoded = (decoded << 6) | (at(i) & 0x3Fu);
  return length;
}

// UTF-8 in which a byte that starts no well-formed sequence is the Latin-1 character of its value.
std::wstring decodeUtf8(std::string_view bytes) {
  std::wstring text;
  while (!bytes.empty()) {
    char32_t decoded = 0;
    std::size_t used = wellFormedUtf8(bytes, decoded);
    if (used == 0) {
      decoded = static_cast<unsigned char>(bytes.front());
      used = 1;
    }
    text.push_back(static_cast<wchar_t>(decoded));
    bytes.remove_prefix(used);
  }
  return text;
}

// UTF-16 units with surrogate pairs joined and lone surrogates replaced.
std::wstring decodeUtf16(const std::u16string& units) {
  std::wstring text;
  for (std::size_t i = 0; i < units.size(); ++i) {
    const char16_t unit = units[i];
    const bool high = unit >= 0xD800 && unit <= 0xDBFF;
    const bool low = unit >= 0xDC00 && unit <= 0xDFFF;
    if (high && i + 1 < units.size() && units[i + 1] >= 0xDC00 && units[i + 1] <= 0xDFFF) {
      text.push_back(static_cast<wchar_t>(0x10000 + ((unit - 0xD800) << 10) + (units[i + 1] - 0xDC00)));
      ++i;
    } else {
      text.push_back(high || low ? kReplacement : static_cast<wchar_t>(unit));
    }
  }
  return text;
}

// Splits code units at CR LF, LF and a lone CR; decode turns the units of one line into text. A line
// end at the very end gives no empty line after it.
template <class Units, class Decode>
Lines splitLines(const Units& units, Decode decode) {
  Lines lines;
  std::size_t start = 0;
  for (std::size_t i = 0; i < units.size(); ++i) {
    if (units[i] != '\r' && units[i] != '\n') continue;
    lines.push_back(decode(units.substr(start, i - start)));
    if (units[i] == '\r' && i + 1 < units.size() && units[i + 1] == '\n') ++i;
    start = i + 1;
  }
  if (start < units.size()) lines.push_back(decode(units.substr(start)));
  return lines;
}

Lines referenceLines(std::string_view bytes) {
  const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(bytes[i]); };
  const bool little = bytes.size() >= 2 && byte(0) == 0xFF && byte(1) == 0xFE;
  const bool big = bytes.size() >= 2 && byte(0) == 0xFE && byte(1) == 0xFF;
  if (!little && !big) {
    if (bytes.size() >= 3 && byte(0) == 0xEF && byte(1) == 0xBB && byte(2) == 0xBF) bytes.remove_prefix(3);
    return splitLines(bytes, [](std::string_view line) { return decodeUtf8(line); });
  }
  std::u16string units;
  for (std::size_t i = 2; i + 1 < bytes.size(); i += 2) {
    units.push_back(little ? static_cast<char16_t>(byte(i) | (byte(i + 1) << 8))
                           : static_cast<char16_t>((byte(i) << 8) | byte(i + 1)));
  }
  Lines lines = splitLines(units, [](const std::u16string& line) { return decodeUtf16(line); });
  // A byte left over from an odd count ends the last line as one replacement character; after a line
  // end it is a line of its own.
  if (bytes.size() % 2 != 0) {
    const bool afterLineEnd = units.empty() || units.back() == u'\r' || units.back() == u'\n';
    if (lines.empty() || afterLineEnd) lines.emplace_back();
    lines.back().push_back(kReplacement);
  }
  return lines;
}

// ---- The reader ---------------------------------------------------------------------------------

struct Reading {
  Lines lines;
  CTextFile::ETextEncoding encoding = CTextFile::ETextEncoding::Utf8;
};

Reading readAll(CTextFile& file, const std::wstring& path, std::size_t byteCount) {
  Reading reading;
  if (file.Open(path.c_str()) == 0) return reading;
  reading.encoding = file.GetEncoding();
  CVynStringT<wchar_t> line;
  while (file.ReadString(line)) {
    // A line never holds its line end, and there are never more lines than bytes (plus one).
    DEX_FUZZ_CHECK(line.Find(L'\n') < 0 && line.Find(L'\r') < 0);
    DEX_FUZZ_CHECK(reading.lines.size() <= byteCount);
    reading.lines.emplace_back(line.view());
    DEX_FUZZ_CHECK(file.GetLineNumber() == static_cast<int>(reading.lines.size()));
  }
  DEX_FUZZ_CHECK(line.IsEmpty());
  DEX_FUZZ_CHECK(!file.ReadString(line) && line.IsEmpty());
  file.Close();
  DEX_FUZZ_CHECK(!file.IsOpen() && !file.ReadString(line));
  return reading;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const dex_fuzz::ScratchFile scratch("text-file");
  dex_fuzz::FuzzInput input(data, size);
  const int blockSize = 48 + input.takeByte();  // below the smallest block too, which counts as 64
  const auto bytes = input.takeRest();
  if (!scratch.write(bytes)) return 0;

  CTextFile small(blockSize);
  const Reading inBlocks = readAll(small, scratch.wpath(), bytes.size());
  vyn::ie::DexTextFile large(1 << 16);
  const Reading whole = readAll(large, scratch.wpath(), bytes.size());

  DEX_FUZZ_CHECK(inBlocks.encoding == whole.encoding);
  DEX_FUZZ_CHECK(inBlocks.lines == whole.lines);
  DEX_FUZZ_CHECK(whole.lines == referenceLines(bytes));
  return 0;
}
