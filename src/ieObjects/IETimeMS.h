#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynTime.h"
#include "hostlibs/winport.h"

namespace vyn::ie {

// A time with milliseconds: a base::CTime (whole seconds since 1970 UTC; this class is one, so its
// calendar accessors and Format apply) and the milliseconds ms. The arithmetic keeps ms in 0 to 999;
// setMS stores any value unchanged, and the arithmetic then carries or borrows the whole seconds such a
// value holds (10 s with -5 ms plus nothing is 9 s 995 ms).
class DEX_API DexTimeMS : public base::CTime {
 public:
  VYN_CLASS_ALLOCATOR

  // ---- Construction ---------------------------------------------------------------------------
  // The empty time (0) and 0 ms.
  DexTimeMS() noexcept = default;
  // The calendar forms are local times, handed with the daylight-saving flag dst to the matching
  // base::CTime constructor (above 0 summer time, 0 standard time, below 0 the zone rules decide); an
  // invalid date gives the empty time. The milliseconds of the SYSTEMTIME are not read: ms is given.
  DexTimeMS(const SYSTEMTIME& localTime, short ms, int dst) noexcept;
  DexTimeMS(int year, int month, int day, int hour, int minute, int second, short ms, int dst) noexcept;
  DexTimeMS(const base::CTime& time, short ms) noexcept : base::CTime(time), ms_(ms) {}
  // time in seconds since 1970-01-01 00:00:00 UTC.
  DexTimeMS(__int64 time, short ms) noexcept : base::CTime(time), ms_(ms) {}
  DexTimeMS(const DexTimeMS&) noexcept = default;
  DexTimeMS& operator=(const DexTimeMS&) noexcept = default;
  virtual ~DexTimeMS();

  // ---- Access ---------------------------------------------------------------------------------
  short getMS() const noexcept { return ms_; }
  void setMS(short ms) noexcept { ms_ = ms; }

  // ---- Arithmetic -----------------------------------------------------------------------------
  // The right-hand side is a duration: its seconds value and its ms. Adding carries one second when
  // the milliseconds reach 1000; subtracting borrows one when they would fall below 0. A time that would
  // leave the 64-bit range stops at its ends.
  DexTimeMS& operator+=(const DexTimeMS& duration) noexcept;
  DexTimeMS& operator-=(const DexTimeMS& duration) noexcept;

  // ---- Comparison -----------------------------------------------------------------------------
  // Both parts: by time, then by ms. (Compared as base::CTime, the milliseconds would be ignored.)
  friend bool operator==(const DexTimeMS&, const DexTimeMS&) = default;
  friend auto operator<=>(const DexTimeMS&, const DexTimeMS&) = default;

 private:
  short ms_ = 0;
};

}  // namespace vyn::ie
