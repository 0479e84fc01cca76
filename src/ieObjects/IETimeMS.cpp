#include "ieObjects/IETimeMS.h"

namespace {

constexpr int kMillisecondsPerSecond = 1000;

// A count of milliseconds split into whole seconds (rounded down) and the milliseconds 0 to 999 that
// remain, also for negative counts.
struct SplitMilliseconds {
  int seconds;
  short milliseconds;
};

SplitMilliseconds split(int milliseconds) noexcept {
  int seconds = milliseconds / kMillisecondsPerSecond;
  int remainder = milliseconds % kMillisecondsPerSecond;
  if (remainder < 0) {
    remainder += kMillisecondsPerSecond;
    --seconds;
  }
  return {seconds, static_cast<short>(remainder)};
}

}  // namespace

namespace vyn::ie {

DexTimeMS::DexTimeMS(const SYSTEMTIME& localTime, short ms, int dst) noexcept
    : base::CTime(localTime, dst), ms_(ms) {}

DexTimeMS::DexTimeMS(int year, int month, int day, int hour, int minute, int second, short ms,
                     int dst) noexcept
    : base::CTime(year, month, day, hour, minute, second, dst), ms_(ms) {}

DexTimeMS::~DexTimeMS() = default;

// With milliseconds in 0 to 999 the carry is 0 or 1 and the borrow 0 or 1; milliseconds stored outside
// that range carry or borrow as many seconds as they hold.
DexTimeMS& DexTimeMS::operator+=(const DexTimeMS& duration) noexcept {
  const __int64 seconds = duration.GetTime();  // read before writing: duration may be this object
  const SplitMilliseconds sum = split(ms_ + duration.ms_);
  ms_ = sum.milliseconds;
  base::CTime::operator+=(base::CTimeSpan(seconds));
  base::CTime::operator+=(base::CTimeSpan(sum.seconds));
  return *this;
}

DexTimeMS& DexTimeMS::operator-=(const DexTimeMS& duration) noexcept {
  const __int64 seconds = duration.GetTime();
  const SplitMilliseconds difference = split(ms_ - duration.ms_ + kMillisecondsPerSecond);
  ms_ = difference.milliseconds;
  base::CTime::operator-=(base::CTimeSpan(seconds));
  base::CTime::operator-=(base::CTimeSpan(1 - difference.seconds));  // 1 when the milliseconds borrowed
  return *this;
}

}  // namespace vyn::ie
