// A million coded points through the shipped point-file plug-ins and the loader, against bare
// baselines: an fread + splitter + std::from_chars parse of the same file, a std::to_chars write of
// the same points, and the model's heap blocks allocated with nothing parsed. Run one benchmark per process
// (bench/point_files.sh does) so that each reports its own peak memory. The file is DEXCHANGE_BENCH_CSV,
// generated when missing. Each benchmark is labelled with the allocator of the model's blocks
// (DEXCHANGE_ALLOCATOR=malloc in the environment chooses the C library's malloc).

#include <benchmark/benchmark.h>

#include <array>
#include <charconv>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "host/PointFileRun.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynThread.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPoints.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"

namespace {

using namespace vyn::ie;
using dexchange_bench::csvBothWays;
using dexchange_bench::peakMegabytes;

constexpr int kPointCount = 1000000;

std::string benchFile() {
  const char* given = std::getenv("DEXCHANGE_BENCH_CSV");
  return given != nullptr ? given : "/tmp/dexchange-bench-1m.csv";
}

// A coded survey of kPointCount points: numeric names, metre coordinates, one or two codes with code
// strings, now and then an attribute.
void writeSurvey(const std::string& path) {
  static const char* const kCodes[] = {
      "GND", "EP:1", "EP:2",  "CL:1",        "KERB:L", "FENCE:A", "TREE;Species=Oak",
      "MH",  "LP",   "BLD:3", "EP:1 KERB:L", "DITCH:4"};
  std::FILE* file = std::fopen(path.c_str(), "wb");
  if (file == nullptr) return;
  std::array<char, 160> line{};
  for (int i = 0; i < kPointCount; ++i) {
    const double north = 5432000.0 + (i % 1000) * 0.731 + (i / 1000) * 0.377;
    const double east = 312000.0 + (i / 1000) * 0.913 - (i % 1000) * 0.041;
    const double height = 84.0 + (i % 977) * 0.0123;
    const int length = std::snprintf(line.data(), line.size(), "%d,%.3f,%.3f,%.3f,%s\r\n", 100000 + i, north,
                                     east, height, kCodes[i % std::size(kCodes)]);
    std::fwrite(line.data(), 1, static_cast<std::size_t>(length), file);
  }
  std::fclose(file);
}

const std::string& surveyFile() {
  static const std::string path = [] {
    const std::string file = benchFile();
    if (!std::ifstream(file).good()) writeSurvey(file);
    return file;
  }();
  return path;
}

struct BarePoint {
  double north, east, height;
};

// fread in blocks, split lines and values, std::from_chars the three numbers.
std::vector<BarePoint> bareParse(const std::string& path, bool keep) {
  std::vector<BarePoint> points;
  std::FILE* file = std::fopen(path.c_str(), "rb");
  if (file == nullptr) return points;
  std::vector<char> block(1 << 20);
  std::string carry;
  std::size_t count = 0;
  const auto parseLine = [&](std::string_view line) {
    std::array<std::string_view, 5> values{};
    std::size_t n = 0;
    std::size_t start = 0;
    while (n < values.size()) {
      const std::size_t comma = line.find(',', start);
      values[n++] =
          line.substr(start, comma == std::string_view::npos ? std::string_view::npos : comma - start);
      if (comma == std::string_view::npos) break;
      start = comma + 1;
    }
    BarePoint point{};
    std::from_chars(values[1].data(), values[1].data() + values[1].size(), point.north);
    std::from_chars(values[2].data(), values[2].data() + values[2].size(), point.east);
    std::from_chars(values[3].data(), values[3].data() + values[3].size(), point.height);
    if (keep) points.push_back(point);
    ++count;
  };
  std::size_t got = 0;
  while ((got = std::fread(block.data(), 1, block.size(), file)) > 0) {
    std::string_view data(block.data(), got);
    std::size_t start = 0;
    for (std::size_t end = data.find('\n'); end != std::string_view::npos; end = data.find('\n', start)) {
      if (!carry.empty()) {
        carry.append(data.substr(start, end - start));
        parseLine(carry);
        carry.clear();
      } else {
        parseLine(data.substr(start, end - start));
      }
      start = end + 1;
    }
    carry.append(data.substr(start));
  }
  std::fclose(file);
  benchmark::DoNotOptimize(count);
  return points;
}

CVynStringT<wchar_t> wide(const std::string& path) {
  return CVynStringT<wchar_t>(path.c_str(), vyn_text::CP_UTF8);
}

void report(benchmark::State& state, std::int64_t points) {
  state.SetLabel(vyn_block_allocator());
  state.SetItemsProcessed(points);
  state.counters["points"] = static_cast<double>(points);
  state.counters["peak_MB"] = peakMegabytes();
}

void BareParse(benchmark::State& state) {
  const std::string& path = surveyFile();
  for (auto _ : state)
    benchmark::DoNotOptimize(bareParse(path, false));
  report(state, kPointCount * state.iterations());
}

void BareWrite(benchmark::State& state) {
  const std::vector<BarePoint> points = bareParse(surveyFile(), true);
  const std::string out = benchFile() + ".bare-out.csv";
  std::string text;
  for (auto _ : state) {
    std::FILE* file = std::fopen(out.c_str(), "wb");
    std::array<char, 32> number{};
    int name = 100000;
    for (const BarePoint& point : points) {
      text += std::to_string(name++);
      for (const double value : {point.north, point.east, point.height}) {
        text += ',';
        const auto end =
            std::to_chars(number.data(), number.data() + number.size(), value, std::chars_format::fixed, 3);
        text.append(number.data(), end.ptr);
      }
      text += ",GND\r\n";
      if (text.size() > (1u << 20)) {
        std::fwrite(text.data(), 1, text.size(), file);
        text.clear();
      }
    }
    std::fwrite(text.data(), 1, text.size(), file);
    text.clear();
    std::fclose(file);
  }
  std::remove(out.c_str());
  report(state, static_cast<std::int64_t>(points.size()) * state.iterations());
}

DexSettings pointSettings() {
  DexSettings settings;
  settings.addDataType(POINTS);
  return settings;
}

void LoaderImport(benchmark::State& state) {
  const std::string& path = surveyFile();
  const auto format = csvBothWays();
  std::int64_t points = 0;
  // The containers are destroyed after the timed loop: their destruction is not the import's.
  std::vector<std::unique_ptr<DexParsersLoader>> loaders;
  for (auto _ : state) {
    auto& loader = loaders.emplace_back(std::make_unique<DexParsersLoader>());
    loader->initIEData(pointSettings());
    if (loader->importInTheSameThread(wide(path), format.get(), nullptr) != DEX_RESULT_OK)
      state.SkipWithError("import failed");
    points += loader->getIEData()->getCurDataset()->getNumberOfElements(OBJECT_TYPE_ALL, 2);
  }
  const double peak = peakMegabytes();
  loaders.clear();
  report(state, points);
  state.counters["peak_MB"] = peak;
}

// Jobs of a long-running host: each import runs in a worker thread of its own, and the host's thread
// frees the container before the next job. The peak after all jobs shows whether the memory of a
// freed model serves the next one (it stays near one job's peak) or is lost to it.
void LoaderImportJobs(benchmark::State& state) {
  const std::string& path = surveyFile();
  const auto format = csvBothWays();
  std::int64_t points = 0;
  for (auto _ : state) {
    DexParsersLoader loader;
    loader.initIEData(pointSettings());
    const HANDLE worker = loader.startImportInSeparateThread(wide(path), format.get(), nullptr);
    DWORD result = 0;
    if (worker == INVALID_HANDLE_VALUE || WaitForSingleObject(worker, INFINITE) != WAIT_OBJECT_0 ||
        !GetExitCodeThread(worker, &result) || static_cast<EDexResult>(result) != DEX_RESULT_OK)
      state.SkipWithError("import failed");
    if (worker != INVALID_HANDLE_VALUE) CloseHandle(worker);
    points += loader.getIEData()->getCurDataset()->getNumberOfElements(OBJECT_TYPE_ALL, 2);
  }
  report(state, points);
}

// The floor of any import into the model on this machine: the heap blocks of a coded point (the point,
// a seven-character name, one code) allocated from the library's allocator and written, with nothing
// parsed. On virtual machines touching fresh memory is the larger part of it.
void ModelBlocks(benchmark::State& state) {
  constexpr std::size_t kNameBlock = 2 * sizeof(std::uint32_t) + 8 * sizeof(wchar_t);
  const std::array<std::size_t, 3> sizes{sizeof(DexDesignPoint), kNameBlock, sizeof(DexCodeValues)};
  std::vector<std::vector<void*>> kept;
  for (auto _ : state) {
    std::vector<void*>& blocks = kept.emplace_back();
    for (int i = 0; i < kPointCount; ++i) {
      for (const std::size_t size : sizes) {
        void* const block = vyn_block_new(size);
        if (block != nullptr) std::memset(block, 0, size);
        blocks.push_back(block);
      }
    }
  }
  const double peak = peakMegabytes();
  for (const auto& blocks : kept) {
    for (void* const block : blocks)
      vyn_block_delete(block);
  }
  report(state, kPointCount * state.iterations());
  state.counters["peak_MB"] = peak;
}

void LoaderExport(benchmark::State& state) {
  const auto format = csvBothWays();
  DexParsersLoader loader;
  DexSettings settings = pointSettings();
  loader.initIEData(settings);
  if (loader.importInTheSameThread(wide(surveyFile()), format.get(), nullptr) != DEX_RESULT_OK)
    state.SkipWithError("import failed");
  const std::string out = benchFile() + ".loader-out.csv";
  for (auto _ : state) {
    std::remove(out.c_str());
    if (loader.exportInTheSameThread(wide(out), format.get(), nullptr) != DEX_RESULT_OK)
      state.SkipWithError("export failed");
  }
  std::remove(out.c_str());
  report(state, kPointCount * state.iterations());
}

BENCHMARK(BareParse)->Unit(benchmark::kMillisecond)->Iterations(3);
BENCHMARK(BareWrite)->Unit(benchmark::kMillisecond)->Iterations(3);
BENCHMARK(ModelBlocks)->Unit(benchmark::kMillisecond)->Iterations(1);
BENCHMARK(LoaderImport)->Unit(benchmark::kMillisecond)->Iterations(1);
BENCHMARK(LoaderImportJobs)->Unit(benchmark::kMillisecond)->Iterations(5)->MeasureProcessCPUTime();
BENCHMARK(LoaderExport)->Unit(benchmark::kMillisecond)->Iterations(3);

}  // namespace
