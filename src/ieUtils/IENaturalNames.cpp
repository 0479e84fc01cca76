#include "ieUtils/IENaturalNames.h"

#include <algorithm>
#include <climits>
#include <cstdint>
#include <string_view>

#include "hostlibs/VynLogging.h"
#include "ieUtils/detail/UtilsLog.h"

namespace vyn::ie::utils {
namespace {

using String = CVynStringT<wchar_t>;

// Reserved values of the current number.
constexpr int kObjectsAddedSinceInit = -1;
constexpr int kNumbersNotTracked = INT_MAX;
// The highest number a candidate may take while numbers are tracked.
constexpr int kLastTrackedNumber = INT_MAX - 1;

constexpr bool isDigit(wchar_t ch) noexcept {
  return ch >= L'0' && ch <= L'9';
}

constexpr bool isCBlank(wchar_t ch) noexcept {
  return ch == L' ' || (ch >= L'\t' && ch <= L'\r');
}

// The digits of text without leading zeros; empty when text is empty, all zeros or not all digits.
std::wstring_view significantDigits(std::wstring_view text) noexcept {
  if (!std::all_of(text.begin(), text.end(), isDigit)) return {};
  const std::size_t first = text.find_first_not_of(L'0');
  return first == std::wstring_view::npos ? std::wstring_view() : text.substr(first);
}

// Numeric order of digit texts without leading zeros.
bool isNaturalLess(std::wstring_view a, std::wstring_view b) noexcept {
  if (a.size() != b.size()) return a.size() < b.size();
  return a < b;
}

int clampToInt(std::int64_t value) noexcept {
  return static_cast<int>(std::clamp<std::int64_t>(value, INT_MIN, INT_MAX));
}

// The runtime's _wtoi in the C locale: leading blanks, an optional sign, then digits up to the first
// other character; 0 when there are none. Out-of-range values clamp to INT_MIN or INT_MAX as the
// Windows runtime does (no wrap-around).
int readLeadingInt(std::wstring_view text) noexcept {
  std::size_t position = 0;
  while (position < text.size() && isCBlank(text[position]))
    ++position;
  bool negative = false;
  if (position < text.size() && (text[position] == L'+' || text[position] == L'-')) {
    negative = text[position] == L'-';
    ++position;
  }
  constexpr std::int64_t kMagnitudeLimit = std::int64_t{INT_MAX} + 1;
  std::int64_t magnitude = 0;
  for (; position < text.size() && isDigit(text[position]); ++position) {
    magnitude = std::min(magnitude * 10 + (text[position] - L'0'), kMagnitudeLimit);
  }
  return clampToInt(negative ? -magnitude : magnitude);
}

}  // namespace

// --- StringNatural ---

StringNatural::StringNatural() : digits_(L"0") {}

StringNatural::StringNatural(unsigned int value) {
  assignDecimal(value);
}

StringNatural::StringNatural(const String& text) {
  const std::wstring_view digits = significantDigits(text.view());
  digits_ = digits.empty() ? String(L"0") : String(digits);
}

StringNatural& StringNatural::operator++() {
  int position = digits_.GetLength() - 1;
  while (position >= 0 && digits_.GetAt(position) == L'9') {
    digits_.SetAt(position, L'0');
    --position;
  }
  if (position < 0) {
    digits_.Insert(0, L'1');
  } else {
    digits_.SetAt(position, static_cast<wchar_t>(digits_.GetAt(position) + 1));
  }
  return *this;
}

bool StringNatural::operator<(const StringNatural& other) const {
  return isNaturalLess(digits_.view(), other.digits_.view());
}

int StringNatural::toInt() const {
  return readLeadingInt(digits_.view());
}

const String& StringNatural::get() const {
  return digits_;
}

void StringNatural::assignDecimal(unsigned long long value) {
  wchar_t reversed[24];
  int count = 0;
  do {
    reversed[count++] = static_cast<wchar_t>(L'0' + value % 10);
    value /= 10;
  } while (value != 0);
  digits_ = reversed[--count];
  while (count > 0)
    digits_ += reversed[--count];
}

// --- FreeNumericNames ---

FreeNumericNames::FreeNumericNames()
    : currentName_(1u),
      currentNumber_(1),
      scanPosition_(0),
      objectsToRename_(0),
      limitName_(static_cast<unsigned int>(INT_MAX)) {}

void FreeNumericNames::addObject(const String& name) {
  currentNumber_ = kObjectsAddedSinceInit;
  if (isValidNumeric(name)) {
    usedNumbers_.push_back(readLeadingInt(name.view()));
  } else {
    ++objectsToRename_;
  }
}

void FreeNumericNames::addObject(int number) {
  currentNumber_ = kObjectsAddedSinceInit;
  if (number < 0) {
    ++objectsToRename_;
  } else {
    usedNumbers_.push_back(number);
  }
}

void FreeNumericNames::init() {
  scanPosition_ = 0;
  if (usedNumbers_.empty()) {
    currentNumber_ = kNumbersNotTracked;
    currentName_.assignDecimal(1);
    return;
  }
  std::sort(usedNumbers_.begin(), usedNumbers_.end());
  const int highest = usedNumbers_.back();  // 0 or above: negative numbers are never recorded
  if (kLastTrackedNumber - highest >= objectsToRename_) {
    currentNumber_ = highest + 1;
  } else {
    walkGaps();
  }
  if (currentNumber_ == kObjectsAddedSinceInit) {
    currentNumber_ = kNumbersNotTracked;
    currentName_ = limitName_;
    // The limit itself may be in use (only a number added as such can be).
    if (highest == kNumbersNotTracked) ++currentName_;
  } else {
    currentName_.assignDecimal(static_cast<unsigned int>(currentNumber_));
  }
}

// Moves the scan position through the gaps between used numbers until one holds every object to rename.
// The gap below the lowest used number is taken only when it fits: starting at 1 in a gap that is too
// small would hand out names of used numbers once the scan has passed them.
void FreeNumericNames::walkGaps() {
  for (; scanPosition_ < usedNumbers_.size(); ++scanPosition_) {
    if (scanPosition_ == 0) {
      const int lowest = usedNumbers_.front();
      if (lowest > 1 && lowest - 1 >= objectsToRename_) {
        currentNumber_ = 1;
        return;
      }
    } else {
      const int previous = usedNumbers_[scanPosition_ - 1];
      if (usedNumbers_[scanPosition_] - previous - 1 >= objectsToRename_) {
        currentNumber_ = previous + 1;
        return;
      }
    }
  }
}

String FreeNumericNames::getFirstAvailableName() const {
  if (currentNumber_ == kObjectsAddedSinceInit) {
    vyn_logging::vyn_err_log(detail::kUtilsLogSource, kLogLineNameBeforeInit, L"");
    return String();
  }
  return currentName_.get();
}

int FreeNumericNames::getFirstAvailableNumber() const {
  if (currentNumber_ == kObjectsAddedSinceInit) {
    vyn_logging::vyn_err_log(detail::kUtilsLogSource, kLogLineNumberBeforeInit, L"");
    return 0;
  }
  return currentNumber_;
}

String FreeNumericNames::getNameFor(const String& name) {
  if (isValidNumeric(name)) return name;
  String fresh = getFirstAvailableName();
  if (currentNumber_ != kObjectsAddedSinceInit) advance();
  return fresh;
}

// Counts the objects to rename through the free numbers from the current candidate on. A used number
// that a count of free numbers runs up to is not skipped by that step; directly after init() the
// first step always ends the count inside its gap.
int FreeNumericNames::getLastObject() const {
  if (currentNumber_ == kObjectsAddedSinceInit) return 0;
  if (currentNumber_ == kNumbersNotTracked) {
    return currentName_ < limitName_ ? objectsToRename_ : kNumbersNotTracked;
  }
  std::int64_t remaining = objectsToRename_;
  std::int64_t candidate = currentNumber_;
  for (std::size_t position = scanPosition_; position < usedNumbers_.size() && remaining > 0; ++position) {
    const std::int64_t used = usedNumbers_[position];
    if (used > candidate) {
      const std::int64_t taken = std::min(used - candidate, remaining);
      remaining -= taken;
      candidate += taken;
    } else if (used == candidate) {
      candidate = used + 1;
    }
  }
  return clampToInt(candidate - 1 + remaining);
}

int FreeNumericNames::getObjectsToRename() const {
  return objectsToRename_;
}

// The next candidate after the current one, skipping used numbers. The scan position never moves
// back, so handing out n names over u used numbers costs O(n + u). Only when 2147483647 itself is
// recorded as used does the candidate leave the 32-bit range; the name then goes on as decimal text.
void FreeNumericNames::advance() {
  if (currentNumber_ == kNumbersNotTracked) {
    ++currentName_;
    return;
  }
  const std::int64_t following = std::int64_t{currentNumber_} + 1;
  std::int64_t next = following;
  while (scanPosition_ < usedNumbers_.size()) {
    const int used = usedNumbers_[scanPosition_];
    if (next < used) break;
    if (next == used) ++next;
    ++scanPosition_;
  }
  if (next == following) {
    ++currentName_;
  } else {
    currentName_.assignDecimal(static_cast<unsigned long long>(next));
  }
  currentNumber_ = next > kNumbersNotTracked ? kNumbersNotTracked : static_cast<int>(next);
}

// "0" and the numbers 1 to 2147483646 written without leading zeros or blanks.
bool FreeNumericNames::isValidNumeric(const String& name) const {
  const std::wstring_view text = name.view();
  if (text.size() >= 2 && (text.front() == L' ' || text.front() == L'0')) return false;
  const std::wstring_view digits = significantDigits(text);
  if (digits.empty()) return text == L"0";
  return isNaturalLess(digits, limitName_.get().view());
}

}  // namespace vyn::ie::utils
