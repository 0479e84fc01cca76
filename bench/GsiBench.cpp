// A million GSI-16 coordinate lines imported through the loader and the GSI plug-in, against the
// point-file import of the same million coded points as CSV in the same run (the target: within 1.5
// times its time), and the GSI-16 export of those points. The files are DEXCHANGE_BENCH_GSI and
// DEXCHANGE_BENCH_GSI_CSV, generated when missing.

#include <benchmark/benchmark.h>

#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <memory>
#include <string>
#include <vector>

#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"

namespace {

using namespace vyn::ie;

constexpr int kPointCount = 1000000;
constexpr const wchar_t* kGsi16Id = L"{A3D1B6CC-AAC9-4DE1-8AF3-91D1B5583B3B}";
// "Customizable ASCII Point Files": its plain layout reads the CSV (name, northing, easting, height, code).
constexpr const wchar_t* kCsvId = L"{5F39DDC1-F0FD-4F27-938A-96EFF426CD60}";
constexpr const char* kCodes[] = {"GND", "EP", "CL", "KERB", "FENCE", "TREE", "MH", "LP", "BLD", "DITCH"};

std::string fileFrom(const char* variable, const char* fallback) {
  const char* given = std::getenv(variable);
  return given != nullptr ? given : fallback;
}

struct SurveyPoint {
  int name;
  long long north;  // 0.1 mm
  long long east;
  long long height;
  const char* code;
};

SurveyPoint pointAt(int i) {
  return {100000 + i, 54320000000LL + (i % 1000) * 7310 + (i / 1000) * 3770,
          3120000000LL + (i / 1000) * 9130 - (i % 1000) * 410, 840000 + (i % 977) * 123,
          kCodes[i % std::size(kCodes)]};
}

// Writes kPointCount lines made by format for each point.
template <class Format>
void writeLines(const std::string& path, Format format) {
  std::FILE* file = std::fopen(path.c_str(), "wb");
  if (file == nullptr) return;
  std::array<char, 200> line{};
  for (int i = 0; i < kPointCount; ++i) {
    const int length = format(pointAt(i), line.data(), line.size());
    std::fwrite(line.data(), 1, static_cast<std::size_t>(length), file);
  }
  std::fclose(file);
}

const std::string& gsiFile() {
  static const std::string path = [] {
    const std::string file = fileFrom("DEXCHANGE_BENCH_GSI", "/tmp/dexchange-bench-1m.gsi");
    if (!std::ifstream(file).good()) {
      writeLines(file, [](const SurveyPoint& p, char* out, std::size_t size) {
        const std::string code = std::string(16 - std::strlen(p.code), '0') + p.code;
        return std::snprintf(out, size,
                             "*11%04d+%016d 81..16+%016lld 82..16+%016lld 83..16+%016lld 71....+%s\r\n",
                             p.name % 10000, p.name, p.east, p.north, p.height, code.c_str());
      });
    }
    return file;
  }();
  return path;
}

const std::string& csvFile() {
  static const std::string path = [] {
    const std::string file = fileFrom("DEXCHANGE_BENCH_GSI_CSV", "/tmp/dexchange-bench-1m-gsi.csv");
    if (!std::ifstream(file).good()) {
      writeLines(file, [](const SurveyPoint& p, char* out, std::size_t size) {
        return std::snprintf(out, size, "%d,%.4f,%.4f,%.4f,%s\r\n", p.name,
                             static_cast<double>(p.north) * 1e-4, static_cast<double>(p.east) * 1e-4,
                             static_cast<double>(p.height) * 1e-4, p.code);
      });
    }
    return file;
  }();
  return path;
}

CVynStringT<wchar_t> wide(const std::string& path) {
  return CVynStringT<wchar_t>(path.c_str(), vyn_text::CP_UTF8);
}

DexSettings pointSettings() {
  DexSettings settings;
  settings.addDataType(POINTS);
  settings.coordDecimals = {4, 4, 4};
  return settings;
}

// Imports path in the format once per iteration; the containers are destroyed after the timed loop.
void importRuns(benchmark::State& state, const std::string& path, const wchar_t* formatId) {
  const DexFormat* format = getIEFormatsData().getFormatById(formatId);
  std::int64_t points = 0;
  std::vector<std::unique_ptr<DexParsersLoader>> loaders;
  for (auto _ : state) {
    auto& loader = loaders.emplace_back(std::make_unique<DexParsersLoader>());
    loader->initIEData(pointSettings());
    if (loader->importInTheSameThread(wide(path), format, nullptr) != DEX_RESULT_OK)
      state.SkipWithError("import failed");
    points += loader->getIEData()->getCurDataset()->getNumberOfElements(OBJECT_TYPE_ALL, 2);
  }
  loaders.clear();
  state.SetItemsProcessed(points);
  state.counters["points"] = static_cast<double>(points);
}

void GsiImport(benchmark::State& state) {
  importRuns(state, gsiFile(), kGsi16Id);
}

void CsvImport(benchmark::State& state) {
  importRuns(state, csvFile(), kCsvId);
}

void GsiExport(benchmark::State& state) {
  DexParsersLoader loader;
  loader.initIEData(pointSettings());
  const DexFormat* format = getIEFormatsData().getFormatById(kGsi16Id);
  if (loader.importInTheSameThread(wide(gsiFile()), format, nullptr) != DEX_RESULT_OK)
    state.SkipWithError("import failed");
  const std::string out = gsiFile() + ".out";
  for (auto _ : state) {
    std::remove(out.c_str());
    if (loader.exportInTheSameThread(wide(out), format, nullptr) != DEX_RESULT_OK)
      state.SkipWithError("export failed");
  }
  std::remove(out.c_str());
  state.SetItemsProcessed(kPointCount * state.iterations());
}

}  // namespace

BENCHMARK(CsvImport)->Unit(benchmark::kMillisecond)->Iterations(3);
BENCHMARK(GsiImport)->Unit(benchmark::kMillisecond)->Iterations(3);
BENCHMARK(GsiExport)->Unit(benchmark::kMillisecond)->Iterations(3);
