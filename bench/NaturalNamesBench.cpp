#include <benchmark/benchmark.h>

#include <algorithm>
#include <random>
#include <vector>

#include "ieUtils/IENaturalNames.h"

using vyn::ie::utils::FreeNumericNames;

namespace {

constexpr int kUsedNumbers = 1'000'000;
constexpr int kNamesHandedOut = 1'000'000;

std::vector<int> sequentialNumbers() {
  std::vector<int> numbers(kUsedNumbers);
  for (int i = 0; i < kUsedNumbers; ++i)
    numbers[static_cast<std::size_t>(i)] = i + 1;
  return numbers;
}

// Distinct and duplicate numbers spread over the whole 32-bit range, in random order.
std::vector<int> randomNumbers() {
  std::mt19937 random(7);
  std::uniform_int_distribution<int> number(0, 2147483646);
  std::vector<int> numbers(kUsedNumbers);
  for (int& value : numbers)
    value = number(random);
  return numbers;
}

FreeNumericNames filled(const std::vector<int>& numbers, int objectsToRename) {
  FreeNumericNames names;
  for (const int number : numbers)
    names.addObject(number);
  for (int i = 0; i < objectsToRename; ++i)
    names.addObject(-1);
  return names;
}

void runInit(benchmark::State& state, const std::vector<int>& numbers, int objectsToRename) {
  for (auto _ : state) {
    state.PauseTiming();
    FreeNumericNames names = filled(numbers, objectsToRename);
    state.ResumeTiming();
    names.init();
    benchmark::DoNotOptimize(names.getFirstAvailableNumber());
  }
  state.SetItemsProcessed(state.iterations() * kUsedNumbers);
}

void InitOnSequentialNumbers(benchmark::State& state) {
  runInit(state, sequentialNumbers(), 0);
}

void InitOnRandomNumbers(benchmark::State& state) {
  runInit(state, randomNumbers(), 0);
}

// The objects to rename do not fit above the highest number, so init() walks the gaps.
void InitWalkingTheGapsOfRandomNumbers(benchmark::State& state) {
  runInit(state, randomNumbers(), 100'000);
}

// Names handed out through a dense run of used numbers: every other number is in use.
void GetNameForThroughUsedNumbers(benchmark::State& state) {
  std::vector<int> numbers;
  for (int i = 0; i < kUsedNumbers; ++i)
    numbers.push_back(2 * i + 2);
  numbers.push_back(2147483646);
  const CVynStringT<wchar_t> oldName(L"P-old");
  for (auto _ : state) {
    state.PauseTiming();
    FreeNumericNames names = filled(numbers, 1);
    names.init();
    state.ResumeTiming();
    for (int i = 0; i < kNamesHandedOut; ++i)
      benchmark::DoNotOptimize(names.getNameFor(oldName));
  }
  state.SetItemsProcessed(state.iterations() * kNamesHandedOut);
}

// Names handed out above every used number, and numeric names that pass unchanged.
void GetNameForAboveUsedNumbers(benchmark::State& state) {
  const std::vector<int> numbers = sequentialNumbers();
  const CVynStringT<wchar_t> oldName(L"P-old");
  const CVynStringT<wchar_t> numericName(L"1234567");
  for (auto _ : state) {
    state.PauseTiming();
    FreeNumericNames names = filled(numbers, kNamesHandedOut);
    names.init();
    state.ResumeTiming();
    for (int i = 0; i < kNamesHandedOut; ++i) {
      benchmark::DoNotOptimize(names.getNameFor((i & 1) != 0 ? oldName : numericName));
    }
  }
  state.SetItemsProcessed(state.iterations() * kNamesHandedOut);
}

}  // namespace

BENCHMARK(InitOnSequentialNumbers)->Unit(benchmark::kMillisecond);
BENCHMARK(InitOnRandomNumbers)->Unit(benchmark::kMillisecond);
BENCHMARK(InitWalkingTheGapsOfRandomNumbers)->Unit(benchmark::kMillisecond);
BENCHMARK(GetNameForThroughUsedNumbers)->Unit(benchmark::kMillisecond);
BENCHMARK(GetNameForAboveUsedNumbers)->Unit(benchmark::kMillisecond);
