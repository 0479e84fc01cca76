// Datasets and surfaces at survey scale: filling a dataset with named, coded design points (with and
// without the name index), finding every name again, counting, collecting numeric names, and a surface
// whose positions are all added and found again. A bare std::unordered_map<std::wstring, T*> is
// measured in the same run as the baseline of the name lookups.
//
// Every benchmark reports the process's peak resident memory (peak_rss_MB, from getrusage). It only
// grows during a run, so run one benchmark per process to read a benchmark's own peak:
//   dexchange_bench_DatasetBench --benchmark_filter='FindEveryName/index/1000000'

#include <benchmark/benchmark.h>
#include <sys/resource.h>

#include <cmath>
#include <cstddef>
#include <map>
#include <memory>
#include <random>
#include <string>
#include <unordered_map>
#include <vector>

#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieUtils/IENaturalNames.h"

namespace {

using vyn::ie::DexCodeDescription;
using vyn::ie::DexCodeValues;
using vyn::ie::DexDataset;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexObject;
using vyn::ie::DexPosition3D;
using vyn::ie::DexSurface;

constexpr int kMaxPoints = 1'000'000;
constexpr int kNumberOfCodes = 32;
// One name in this many is not numeric, so that numeric names have objects to rename.
constexpr int kTextNameEvery = 10;

double peakMemoryMB() {
  rusage usage{};
  getrusage(RUSAGE_SELF, &usage);
  return static_cast<double>(usage.ru_maxrss) / 1024.0;  // kilobytes on Linux
}

void reportPeakMemory(benchmark::State& state) {
  state.counters["peak_rss_MB"] = peakMemoryMB();
}

// The names of the points: mostly numbers as surveys number them, with some text names between.
const std::vector<std::wstring>& plainNames() {
  static const std::vector<std::wstring> names = [] {
    std::vector<std::wstring> result;
    result.reserve(kMaxPoints);
    for (int i = 0; i < kMaxPoints; ++i)
      result.push_back(i % kTextNameEvery == 0 ? L"PT" + std::to_wstring(i) : std::to_wstring(100000 + i));
    return result;
  }();
  return names;
}

const std::vector<CVynStringT<wchar_t>>& names() {
  static const std::vector<CVynStringT<wchar_t>> texts = [] {
    std::vector<CVynStringT<wchar_t>> result;
    result.reserve(kMaxPoints);
    for (const std::wstring& name : plainNames())
      result.emplace_back(std::wstring_view(name));
    return result;
  }();
  return texts;
}

const std::vector<std::unique_ptr<DexCodeDescription>>& codeDescriptions() {
  static const std::vector<std::unique_ptr<DexCodeDescription>> codes = [] {
    std::vector<std::unique_ptr<DexCodeDescription>> result;
    for (int i = 0; i < kNumberOfCodes; ++i)
      result.emplace_back(new DexCodeDescription((L"CODE" + std::to_wstring(i)).c_str()));
    return result;
  }();
  return codes;
}

void fillWithPoints(DexDataset& dataset, int count) {
  const auto& pointNames = names();
  const auto& codes = codeDescriptions();
  for (int i = 0; i < count; ++i) {
    auto* const point = new DexDesignPoint();
    point->setName(pointNames[static_cast<std::size_t>(i)]);
    point->setCoords(500000.0 + (i % 1000) * 0.5, 4000000.0 + (i / 1000) * 0.5, 100.0 + (i % 97) * 0.01);
    point->addCode(new DexCodeValues(codes[static_cast<std::size_t>(i % kNumberOfCodes)].get()));
    dataset.add(point);
  }
}

// One filled dataset per size and index flag, kept for the benchmarks that read it.
const DexDataset& filledDataset(int count, bool withIndex) {
  static std::map<std::pair<int, bool>, std::unique_ptr<DexDataset>> datasets;
  std::unique_ptr<DexDataset>& dataset = datasets[{count, withIndex}];
  if (!dataset) {
    dataset = std::make_unique<DexDataset>(L"BENCH", 0, withIndex);
    fillWithPoints(*dataset, count);
  }
  return *dataset;
}

// The surveyed positions of a surface: a 10 km square and 100 m of height, in millimetres.
const std::vector<DexPosition3D>& surfacePositions() {
  static const std::vector<DexPosition3D> positions = [] {
    std::mt19937_64 random(2024);
    std::uniform_int_distribution<long long> plan(0, 10'000'000);
    std::uniform_int_distribution<long long> height(0, 100'000);
    std::vector<DexPosition3D> result;
    result.reserve(kMaxPoints);
    for (int i = 0; i < kMaxPoints; ++i) {
      result.emplace_back(500000.0 + static_cast<double>(plan(random)) / 1000.0,
                          4000000.0 + static_cast<double>(plan(random)) / 1000.0,
                          static_cast<double>(height(random)) / 1000.0);
    }
    return result;
  }();
  return positions;
}

const DexSurface& filledSurface(int count) {
  static std::map<int, std::unique_ptr<DexSurface>> surfaces;
  std::unique_ptr<DexSurface>& surface = surfaces[count];
  if (!surface) {
    surface = std::make_unique<DexSurface>();
    surface->reservePositions(count);
    for (int i = 0; i < count; ++i)
      surface->addPosition(surfacePositions()[static_cast<std::size_t>(i)]);
  }
  return *surface;
}

// ---- Dataset ------------------------------------------------------------------------------------

void FillDataset(benchmark::State& state, bool withIndex) {
  const int count = static_cast<int>(state.range(0));
  names();
  codeDescriptions();
  for (auto _ : state) {
    auto dataset = std::make_unique<DexDataset>(L"BENCH", 0, withIndex);
    fillWithPoints(*dataset, count);
    benchmark::DoNotOptimize(dataset.get());
    state.PauseTiming();
    dataset.reset();
    state.ResumeTiming();
  }
  state.SetItemsProcessed(state.iterations() * count);
  state.SetComplexityN(count);
  reportPeakMemory(state);
}

void FindEveryName(benchmark::State& state, bool withIndex) {
  const int count = static_cast<int>(state.range(0));
  const DexDataset& dataset = filledDataset(count, withIndex);
  const auto& pointNames = names();
  // Without the index a lookup searches the list: a thousand names spread over it stand for all.
  const int step = withIndex ? 1 : count / 1000;
  int lookups = 0;
  for (auto _ : state) {
    for (int i = 0; i < count; i += step) {
      const DexObject* const object = dataset.findObject(pointNames[static_cast<std::size_t>(i)]);
      benchmark::DoNotOptimize(object);
      ++lookups;
    }
  }
  state.SetItemsProcessed(lookups);
  state.SetComplexityN(count);
  reportPeakMemory(state);
}

// The baseline: a bare hash map from the same names to the same objects.
void FindEveryNameBaseline(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const DexDataset& dataset = filledDataset(count, true);
  const auto& keys = plainNames();
  std::unordered_map<std::wstring, const DexObject*> map;
  for (int i = 0; i < count; ++i)
    map.try_emplace(keys[static_cast<std::size_t>(i)], dataset.getObjectAt(i));
  for (auto _ : state) {
    for (int i = 0; i < count; ++i) {
      const auto found = map.find(keys[static_cast<std::size_t>(i)]);
      benchmark::DoNotOptimize(found->second);
    }
  }
  state.SetItemsProcessed(state.iterations() * count);
  state.SetComplexityN(count);
  reportPeakMemory(state);
}

// The baseline of filling: the same names into a bare hash map (the points are made outside).
void FillBaseline(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const auto& keys = plainNames();
  DexDesignPoint point;
  for (auto _ : state) {
    std::unordered_map<std::wstring, DexDesignPoint*> map;
    for (int i = 0; i < count; ++i)
      map.try_emplace(keys[static_cast<std::size_t>(i)], &point);
    benchmark::DoNotOptimize(map.size());
  }
  state.SetItemsProcessed(state.iterations() * count);
  state.SetComplexityN(count);
  reportPeakMemory(state);
}

void GetNumberOfElements(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const DexDataset& dataset = filledDataset(count, true);
  for (auto _ : state) {
    benchmark::DoNotOptimize(dataset.getNumberOfElements(vyn::ie::OBJECT_TYPE_DESIGN_POINT,
                                                         vyn::ie::IDexStateInterface::ACTIVE_STATE));
    benchmark::DoNotOptimize(dataset.getNumberOfElements(
        vyn::ie::OBJECT_TYPE_ALL, vyn::ie::IDexStateInterface::ANY_STATE, true, false));
  }
  state.SetItemsProcessed(state.iterations() * count * 2);
  state.SetComplexityN(count);
  reportPeakMemory(state);
}

void GetMaxNumericObjectName(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const DexDataset& dataset = filledDataset(count, true);
  for (auto _ : state) {
    vyn::ie::utils::FreeNumericNames freeNames;
    dataset.getMaxNumericObjectName(vyn::ie::OBJECT_TYPE_DESIGN_POINT, freeNames);
    benchmark::DoNotOptimize(freeNames.getFirstAvailableNumber());
  }
  state.SetItemsProcessed(state.iterations() * count);
  state.SetComplexityN(count);
  reportPeakMemory(state);
}

// ---- Surface ------------------------------------------------------------------------------------

void SurfaceAddPositions(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const auto& positions = surfacePositions();
  for (auto _ : state) {
    auto surface = std::make_unique<DexSurface>();
    surface->reservePositions(count);
    for (int i = 0; i < count; ++i)
      surface->addPosition(positions[static_cast<std::size_t>(i)]);
    benchmark::DoNotOptimize(surface.get());
    state.PauseTiming();
    surface.reset();
    state.ResumeTiming();
  }
  state.SetItemsProcessed(state.iterations() * count);
  state.SetComplexityN(count);
  reportPeakMemory(state);
}

void SurfaceFindEveryPosition(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const DexSurface& surface = filledSurface(count);
  const auto& positions = surfacePositions();
  for (auto _ : state) {
    for (int i = 0; i < count; ++i) {
      const int index = surface.getPositionIndex(positions[static_cast<std::size_t>(i)]);
      if (index != i) state.SkipWithError("a position was not found under its own index");
      benchmark::DoNotOptimize(index);
    }
  }
  state.SetItemsProcessed(state.iterations() * count);
  state.SetComplexityN(count);
  reportPeakMemory(state);
}

void sizes(benchmark::internal::Benchmark* benchmark) {
  benchmark->RangeMultiplier(4)->Range(kMaxPoints / 16, kMaxPoints);
  benchmark->Unit(benchmark::kMillisecond)->Complexity(benchmark::oNLogN);
}

}  // namespace

BENCHMARK_CAPTURE(FillDataset, index, true)->Apply(sizes)->Iterations(2);
BENCHMARK_CAPTURE(FillDataset, no_index, false)->Apply(sizes)->Iterations(2);
BENCHMARK(FillBaseline)->Apply(sizes)->Iterations(2);
BENCHMARK_CAPTURE(FindEveryName, index, true)->Apply(sizes);
BENCHMARK_CAPTURE(FindEveryName, no_index_sample, false)->Apply(sizes)->Complexity(benchmark::oN);
BENCHMARK(FindEveryNameBaseline)->Apply(sizes);
BENCHMARK(GetNumberOfElements)->Apply(sizes);
BENCHMARK(GetMaxNumericObjectName)->Apply(sizes);
BENCHMARK(SurfaceAddPositions)->Apply(sizes)->Iterations(2);
BENCHMARK(SurfaceFindEveryPosition)->Apply(sizes);
