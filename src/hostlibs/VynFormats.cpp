#include "hostlibs/VynFormats.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>
#include <vector>

#include "hostlibs/detail/DecimalText.h"

namespace vyn_formats {

namespace {

using detail::parseDecimal;

constexpr int kMaxDecimals = 100;
// Sign, the 309 digits of the largest double, the point and the decimals.
constexpr std::size_t kFixedCapacity = 1 + 309 + 1 + kMaxDecimals + 8;

CVynStringT<wchar_t> toWide(std::string_view text) {
  CVynStringT<wchar_t> wide;
  const int length = static_cast<int>(text.size());
  std::copy(text.begin(), text.end(), wide.GetBuffer(length));
  wide.ReleaseBuffer(length);
  return wide;
}

CVynStringT<wchar_t> nonFiniteText(double value) {
  if (std::isnan(value)) return CVynStringT<wchar_t>(L"nan");
  return CVynStringT<wchar_t>(value < 0.0 ? L"-inf" : L"inf");
}

// "-0.000" and the like: a minus sign before nothing but zeros.
bool isNegativeZeroText(std::string_view text) {
  return !text.empty() && text.front() == '-' && text.find_first_not_of("0.", 1) == std::string_view::npos;
}

using FixedBuffer = std::array<char, kFixedCapacity>;

// The fixed-notation text of a finite value in buffer.
std::string_view fixedText(FixedBuffer& buffer, double value, int decimals) {
  const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value,
                                    std::chars_format::fixed, std::clamp(decimals, 0, kMaxDecimals));
  if (result.ec != std::errc()) return {};
  std::string_view text(buffer.data(), static_cast<std::size_t>(result.ptr - buffer.data()));
  if (isNegativeZeroText(text)) text.remove_prefix(1);
  return text;
}

template <typename Integer>
CVynStringT<wchar_t> integerText(Integer value) {
  std::array<char, 24> buffer{};
  const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
  return toWide(std::string_view(buffer.data(), static_cast<std::size_t>(result.ptr - buffer.data())));
}

}  // namespace

// ---- Writing numbers ----------------------------------------------------------------------------

CVynStringT<wchar_t> DoubleToString(double value) {
  if (!std::isfinite(value)) return nonFiniteText(value);
  if (value == 0.0) return CVynStringT<wchar_t>(L"0");
  std::array<char, 32> buffer{};
  const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
  if (result.ec != std::errc()) return {};
  return toWide(std::string_view(buffer.data(), static_cast<std::size_t>(result.ptr - buffer.data())));
}

CVynStringT<wchar_t> DoubleToString(double value, int decimals) {
  if (!std::isfinite(value)) return nonFiniteText(value);
  FixedBuffer buffer;
  return toWide(fixedText(buffer, value, decimals));
}

void AppendDoubleToString(std::wstring& out, double value, int decimals) {
  if (!std::isfinite(value)) {
    out += nonFiniteText(value).view();
    return;
  }
  FixedBuffer buffer;
  const std::string_view text = fixedText(buffer, value, decimals);
  out.append(text.begin(), text.end());
}

CVynStringT<wchar_t> IntToString(int value) {
  return integerText(value);
}

CVynStringT<wchar_t> UIntToString(unsigned value) {
  return integerText(value);
}

bool WriteString(FILE* file, const wchar_t* text) {
  if (file == nullptr) return false;
  const std::string bytes = vyn_text::toUtf8(text);
  if (bytes.empty()) return true;
  return std::fwrite(bytes.data(), 1, bytes.size(), file) == bytes.size();
}

// ---- Reading angles -----------------------------------------------------------------------------

namespace {

constexpr wchar_t kDegreeSign = L'\u00B0';
constexpr wchar_t kPrime = L'\u2032';
constexpr wchar_t kDoublePrime = L'\u2033';

bool isBlank(wchar_t ch) {
  return ch == L' ' || ch == L'\t' || ch == L'\r' || ch == L'\n';
}
bool isDigit(wchar_t ch) {
  return ch >= L'0' && ch <= L'9';
}

std::wstring_view trimmed(std::wstring_view text) {
  while (!text.empty() && isBlank(text.front()))
    text.remove_prefix(1);
  while (!text.empty() && isBlank(text.back()))
    text.remove_suffix(1);
  return text;
}

// +1 for N and E, -1 for S and W (either case), 0 for any other character.
int hemisphereSign(wchar_t ch) {
  switch (ch) {
    case L'N':
    case L'n':
    case L'E':
    case L'e':
      return 1;
    case L'S':
    case L's':
    case L'W':
    case L'w':
      return -1;
    default:
      return 0;
  }
}

// One field of a degrees-minutes-seconds text: digits, with one point only where decimals may be.
std::optional<double> readField(std::wstring_view field, bool mayHaveDecimals) {
  std::string ascii;
  bool hasDigit = false;
  for (const wchar_t ch : field) {
    if (isDigit(ch)) {
      hasDigit = true;
    } else if (ch != L'.' || !mayHaveDecimals || ascii.find('.') != std::string::npos) {
      return std::nullopt;
    }
    ascii += static_cast<char>(ch);
  }
  double value = 0.0;
  if (!hasDigit || !parseDecimal(ascii, value)) return std::nullopt;
  return value;
}

// Degrees, minutes and seconds (one to three fields) to decimal degrees.
std::optional<double> fromFields(const std::vector<std::wstring_view>& fields) {
  if (fields.empty() || fields.size() > 3) return std::nullopt;
  std::array<double, 3> values{};
  for (std::size_t i = 0; i < fields.size(); ++i) {
    const std::optional<double> value = readField(fields[i], i + 1 == fields.size());
    if (!value || (i > 0 && *value >= 60.0)) return std::nullopt;
    values[i] = *value;
  }
  return values[0] + (values[1] * 60.0 + values[2]) / 3600.0;
}

// "12 30 15.5" or "12:30:15.5": two or three fields.
std::optional<double> fromSeparatedFields(std::wstring_view text, bool colons) {
  std::vector<std::wstring_view> fields;
  while (!text.empty()) {
    const auto separator = std::find_if(text.begin(), text.end(),
                                        [colons](wchar_t ch) { return colons ? ch == L':' : isBlank(ch); });
    const std::size_t length = static_cast<std::size_t>(separator - text.begin());
    fields.push_back(text.substr(0, length));
    if (separator == text.end()) break;
    text.remove_prefix(length + 1);
    if (!colons) {
      text = trimmed(text);
    } else if (text.empty()) {
      fields.emplace_back();  // a trailing colon leaves an empty field
    }
  }
  if (fields.size() < 2) return std::nullopt;
  return fromFields(fields);
}

// Removes a leading mark (one of marks) and the blanks after it; false when there is none.
bool skipMark(std::wstring_view& text, std::wstring_view marks) {
  if (text.empty() || marks.find(text.front()) == std::wstring_view::npos) return false;
  text.remove_prefix(1);
  text = trimmed(text);
  return true;
}

// The text up to the first of marks; the text is left at that mark.
std::wstring_view takeUntil(std::wstring_view& text, std::wstring_view marks) {
  const std::size_t at = std::min(text.find_first_of(marks), text.size());
  const std::wstring_view field = text.substr(0, at);
  text.remove_prefix(at);
  return field;
}

// The mark after the seconds: ", U+2033 or two apostrophes. Removes it and the blanks after it.
bool skipSecondMark(std::wstring_view& text) {
  if (text.starts_with(L"''")) {
    text = trimmed(text.substr(2));
    return true;
  }
  static constexpr wchar_t kSecondMarks[] = {L'"', kDoublePrime, L'\0'};
  return skipMark(text, kSecondMarks);
}

// "12°30'15.5\"": degrees with the degree sign, then optionally minutes with their mark, then
// optionally seconds with or without theirs.
std::optional<double> fromMarkedFields(std::wstring_view text) {
  static constexpr wchar_t kDegreeMarks[] = {kDegreeSign, L'\0'};
  static constexpr wchar_t kMinuteMarks[] = {L'\'', kPrime, L'\0'};
  static constexpr wchar_t kSecondStops[] = {L'"', kDoublePrime, L'\'', L'\0'};
  std::vector<std::wstring_view> fields;
  fields.push_back(takeUntil(text, kDegreeMarks));
  if (!skipMark(text, kDegreeMarks)) return std::nullopt;
  if (!text.empty()) {
    fields.push_back(takeUntil(text, kMinuteMarks));
    if (!skipMark(text, kMinuteMarks)) return std::nullopt;
  }
  if (!text.empty()) {
    fields.push_back(takeUntil(text, kSecondStops));
    if (!text.empty() && !skipSecondMark(text)) return std::nullopt;
    if (!text.empty()) return std::nullopt;
  }
  return fromFields(fields);
}

// A plain decimal number of degrees; the sign has been taken off already.
std::optional<double> fromDecimal(std::wstring_view text) {
  if (text.empty() || !(isDigit(text.front()) || text.front() == L'.')) return std::nullopt;
  std::string ascii;
  for (const wchar_t ch : text) {
    if (ch > 0x7F) return std::nullopt;
    ascii += static_cast<char>(ch);
  }
  double value = 0.0;
  if (!parseDecimal(ascii, value)) return std::nullopt;
  return value;
}

std::optional<double> unsignedDegrees(std::wstring_view text) {
  if (text.find(kDegreeSign) != std::wstring_view::npos) return fromMarkedFields(text);
  if (text.find(L':') != std::wstring_view::npos) return fromSeparatedFields(text, true);
  if (std::any_of(text.begin(), text.end(), isBlank)) return fromSeparatedFields(text, false);
  return fromDecimal(text);
}

}  // namespace

bool StringToDegree(const wchar_t* text, double& degrees) {
  if (text == nullptr) return false;
  std::wstring_view rest = trimmed(text);
  if (rest.empty()) return false;

  int letterSign = hemisphereSign(rest.back());
  if (letterSign != 0) {
    rest = trimmed(rest.substr(0, rest.size() - 1));
  } else if ((letterSign = hemisphereSign(rest.front())) != 0) {
    rest = trimmed(rest.substr(1));
  }
  int sign = 1;
  if (!rest.empty() && (rest.front() == L'+' || rest.front() == L'-')) {
    if (letterSign != 0) return false;
    sign = rest.front() == L'-' ? -1 : 1;
    rest.remove_prefix(1);
  }
  if (letterSign != 0) sign = letterSign;

  const std::optional<double> magnitude = unsignedDegrees(rest);
  if (!magnitude || !std::isfinite(*magnitude)) return false;
  degrees = sign * *magnitude;
  return true;
}

}  // namespace vyn_formats

// ---- Rounding -----------------------------------------------------------------------------------

namespace vyn::math {

namespace {

// Adds one to the last digit of a decimal digit string, carrying ("199" gives "200", "99" "100").
void incrementDigits(std::string& digits) {
  for (auto digit = digits.rbegin(); digit != digits.rend(); ++digit) {
    if (*digit != '9') {
      ++*digit;
      return;
    }
    *digit = '0';
  }
  digits.insert(digits.begin(), '1');
}

}  // namespace

double round_prec(double value, int decimals) {
  if (!std::isfinite(value)) return value;
  if (value == 0.0) return 0.0;
  decimals = std::clamp(decimals, -400, 400);

  const vyn_formats::detail::DecimalDigits shortest = vyn_formats::detail::shortestDigits(value);
  const int kept = shortest.exponent + 1 + decimals;  // significant digits before the rounding digit
  if (kept >= static_cast<int>(shortest.digits.size())) return value;
  if (kept < 0) return 0.0;

  std::string digits = shortest.digits.substr(0, static_cast<std::size_t>(kept));
  if (shortest.digits[static_cast<std::size_t>(kept)] >= '5') incrementDigits(digits);
  if (digits.empty()) return 0.0;
  // digits is now the integer count of units of 10^-decimals.
  const std::string text = digits + 'e' + std::to_string(-decimals);
  double magnitude = 0.0;
  if (!vyn_formats::detail::parseDecimal(text, magnitude)) return value;
  return value < 0.0 ? -magnitude : magnitude;
}

}  // namespace vyn::math
