// The delimited-line parsers on one line of text. The first byte is the delimiter, the second says how
// many of the following bytes are forbidden characters; the rest is the line, in lenient UTF-8 (see
// decodeLenientUtf8). Every parser runs on the same line and its values are checked against what the
// parsers promise: trimmed, free of line ends, and as many as the delimiters allow.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "ieUtils/IEUtilsParsers.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/FuzzText.h"

namespace {

namespace utils = vyn::ie::utils;
using String = CVynStringT<wchar_t>;

constexpr std::wstring_view kTrimmed = L" \t\r\n";

bool isCleanValue(const String& value) {
  const std::wstring_view text = value.view();
  if (text.find_first_of(L"\r\n") != std::wstring_view::npos) return false;
  return text.empty() || (kTrimmed.find(text.front()) == std::wstring_view::npos &&
                          kTrimmed.find(text.back()) == std::wstring_view::npos);
}

void checkValues(const utils::StringArray& values) {
  for (int i = 0; i < values.GetSize(); ++i)
    DEX_FUZZ_CHECK(isCleanValue(values[i]));
}

int countOf(const String& line, wchar_t ch) {
  return static_cast<int>(std::count(line.view().begin(), line.view().end(), ch));
}

void splitAtEveryDelimiter(const String& line, wchar_t delimiter, const String& forbidden) {
  utils::StringArray values;
  const bool clean = utils::parseValues(line, values, delimiter, forbidden);
  checkValues(values);
  DEX_FUZZ_CHECK(values.GetSize() <= countOf(line, delimiter) + 1);
  if (forbidden.IsEmpty()) DEX_FUZZ_CHECK(clean && values.GetSize() == countOf(line, delimiter) + 1);

  // The list is appended to, never cleared.
  const int before = values.GetSize();
  utils::parseValues(line, values, delimiter, String());
  DEX_FUZZ_CHECK(values.GetSize() == before + countOf(line, delimiter) + 1);
}

void splitOutsideQuotes(const String& line, wchar_t delimiter) {
  utils::StringArray values;
  utils::parseValuesInQuotes(line, values, delimiter);
  checkValues(values);
  DEX_FUZZ_CHECK(values.GetSize() <= countOf(line, delimiter) + 1);

  utils::StringArray spaced;
  utils::parseSpacedValuesInQuotes(line, spaced);
  checkValues(spaced);
  DEX_FUZZ_CHECK(spaced.GetSize() <= countOf(line, L' ') + 1);
}

void splitLeadingValues(const String& line, char delimiter, const String& forbidden) {
  utils::StringArray apa;
  DEX_FUZZ_CHECK(utils::parseValuesForApaFormat(line, apa, delimiter, forbidden));
  checkValues(apa);
  DEX_FUZZ_CHECK(apa.GetSize() <= 5);

  utils::StringArray sima;
  DEX_FUZZ_CHECK(utils::parseValuesForSimaFormat(line, sima, delimiter, forbidden));
  checkValues(sima);
  DEX_FUZZ_CHECK(sima.GetSize() <= 6 && sima.GetSize() >= apa.GetSize());
}

void tidyText(const String& line, wchar_t delimiter) {
  String unquoted = line;
  utils::removeBorderQuotes(unquoted);
  DEX_FUZZ_CHECK(unquoted.GetLength() <= line.GetLength());

  String reduced = line;
  utils::removeUnnecessaryDelimiters(reduced, delimiter);
  const std::wstring_view text = reduced.view();
  DEX_FUZZ_CHECK(text.empty() || (text.front() != delimiter && text.back() != delimiter));
  DEX_FUZZ_CHECK(text.find(std::wstring{delimiter, delimiter}) == std::wstring_view::npos);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  dex_fuzz::FuzzInput input(data, size);
  const std::uint8_t delimiterByte = input.takeByte();
  const auto delimiter = static_cast<wchar_t>(delimiterByte);
  const String forbidden(dex_fuzz::decodeLenientUtf8(input.takeBytes(input.takeByte() % 4)));
  const String line(dex_fuzz::decodeLenientUtf8(input.takeRest()));

  splitAtEveryDelimiter(line, delimiter, forbidden);
  splitOutsideQuotes(line, delimiter);
  splitLeadingValues(line, static_cast<char>(delimiterByte), forbidden);
  tidyText(line, delimiter);
  return 0;
}
