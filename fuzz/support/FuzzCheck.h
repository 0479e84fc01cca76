#pragma once

// A target's own consistency checks. A failed check prints what failed and aborts, so libFuzzer keeps
// the input as a crash artifact and the replay test fails naming the input file.
namespace dex_fuzz {

[[noreturn]] void failCheck(const char* condition, const char* file, int line);

// Drops the error-log records from here on: the readers trace every malformed part by design, and
// printing them would slow the fuzzing down. Cheap to call for every input.
void silenceLogs();

}  // namespace dex_fuzz

#define DEX_FUZZ_CHECK(condition) \
  ((condition) ? static_cast<void>(0) : ::dex_fuzz::failCheck(#condition, __FILE__, __LINE__))
