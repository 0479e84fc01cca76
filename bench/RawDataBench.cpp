// A field job's raw observations at survey scale: set-ups with their backsight, side shots and GNSS
// positions appended in recording order, each record looked up by its point name as an importer does
// for every record it reads (is the point recorded already? which set-up does the backsight refer to,
// first in recording order?), then the whole job destroyed. A bare vector of the same records plus a
// hash map from name to the first and last record is measured in the same run as the baseline, and
// the records alone (made and destroyed in a bare vector) as what every variant pays.
//
//   dexchange_bench_RawDataBench --benchmark_filter='RawJob'
//
// The ratio of the two, and the fitted complexity over 10^4, 10^5 and 10^6 records, are the figures
// to read. Every benchmark reports the process's peak resident memory (peak_rss_MB); it only grows,
// so run one benchmark per process to read its own.

#include <benchmark/benchmark.h>
#include <sys/resource.h>

#include <memory>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

#include "ieObjects/IEGPSRawData.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IETSRawRecords.h"

namespace {

using vyn::ie::DexGpsPosition;
using vyn::ie::DexRawData;
using vyn::ie::DexTSRawBS;
using vyn::ie::DexTSRawSS;
using vyn::ie::DexTSRawStn;
using vyn::ie::IDexRawDataInterface;
using Kind = IDexRawDataInterface::ERawDataType;

constexpr int kMaxRecords = 1'000'000;
// Of every 100 records: a set-up, its backsight, 78 side shots and 20 GNSS positions.
constexpr int kSetupEvery = 100;
constexpr int kGnssFrom = 80;
// One side shot in this many re-observes a point shot before, so that some lookups find a record.
constexpr int kRepeatEvery = 10;

double peakMemoryMB() {
  rusage usage{};
  getrusage(RUSAGE_SELF, &usage);
  return static_cast<double>(usage.ru_maxrss) / 1024.0;  // kilobytes on Linux
}

// What record i of the job is, and the name it carries and the name it refers to.
struct JobRecord {
  Kind kind;
  int place;  // within its set-up: 0 station, 1 backsight, then shots
  std::wstring name;
  std::wstring reference;  // the station a backsight points at
};

const std::vector<JobRecord>& job() {
  static const std::vector<JobRecord> records = [] {
    std::vector<JobRecord> result;
    result.reserve(kMaxRecords);
    for (int i = 0; i < kMaxRecords; ++i) {
      const int setup = i / kSetupEvery;
      const int place = i % kSetupEvery;
      const std::wstring station = L"STN" + std::to_wstring(setup);
      const std::wstring previous = L"STN" + std::to_wstring(setup > 0 ? setup - 1 : 0);
      if (place == 0) {
        result.push_back({Kind::RAW_DATA_TOTAL_STATION, place, station, {}});
      } else if (place == 1) {
        result.push_back({Kind::RAW_DATA_TOTAL_STATION, place, previous, previous});
      } else {
        const int point = place % kRepeatEvery == 0 && i > kSetupEvery ? i - kSetupEvery : i;
        const Kind kind = place >= kGnssFrom ? Kind::RAW_DATA_GNSS : Kind::RAW_DATA_TOTAL_STATION;
        result.push_back({kind, place, std::to_wstring(100000 + point), {}});
      }
    }
    return result;
  }();
  return records;
}

const std::vector<CVynStringT<wchar_t>>& names() {
  static const std::vector<CVynStringT<wchar_t>> texts = [] {
    std::vector<CVynStringT<wchar_t>> result;
    result.reserve(kMaxRecords);
    for (const JobRecord& record : job())
      result.emplace_back(std::wstring_view(record.name));
    return result;
  }();
  return texts;
}

IDexRawDataInterface* makeRecord(const JobRecord& record, const CVynStringT<wchar_t>& name) {
  IDexRawDataInterface* made = nullptr;
  if (record.kind == Kind::RAW_DATA_GNSS) {
    made = new DexGpsPosition();
  } else if (record.place == 0) {
    made = new DexTSRawStn();
  } else if (record.place == 1) {
    made = new DexTSRawBS();
  } else {
    made = new DexTSRawSS();
  }
  made->setName(name);
  return made;
}

void reportJob(benchmark::State& state, int count, long long found) {
  state.SetItemsProcessed(state.iterations() * count);
  state.SetComplexityN(count);
  state.counters["found"] = static_cast<double>(found);
  state.counters["peak_rss_MB"] = peakMemoryMB();
}

// The job through DexRawData: the last record of the name among the active shots (or GNSS records),
// and for a backsight the first record of its station, then the append.
void RawJob(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const auto& records = job();
  const auto& texts = names();
  long long found = 0;
  for (auto _ : state) {
    auto rawData = std::make_unique<DexRawData>();
    for (int i = 0; i < count; ++i) {
      const JobRecord& record = records[static_cast<std::size_t>(i)];
      const CVynStringT<wchar_t>& name = texts[static_cast<std::size_t>(i)];
      if (rawData->findRawData(record.kind, name, record.place > 1, false) != nullptr) ++found;
      if (record.place == 1 &&
          rawData->findFirstRawData(Kind::RAW_DATA_TOTAL_STATION, name, false) != nullptr)
        ++found;
      rawData->addRawData(makeRecord(record, name));
    }
    benchmark::DoNotOptimize(rawData.get());
    rawData.reset();
  }
  reportJob(state, count, found / static_cast<long long>(state.iterations()));
}

// The baseline: the same records in a bare vector, and a hash map from name to the first and last
// record of the name (no kind or state rules).
void RawJobBaseline(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const auto& records = job();
  const auto& texts = names();
  long long found = 0;
  for (auto _ : state) {
    auto list = std::make_unique<std::vector<std::unique_ptr<IDexRawDataInterface>>>();
    auto byName = std::make_unique<
        std::unordered_map<std::wstring, std::pair<IDexRawDataInterface*, IDexRawDataInterface*>>>();
    for (int i = 0; i < count; ++i) {
      const JobRecord& record = records[static_cast<std::size_t>(i)];
      const auto known = byName->find(record.name);
      if (known != byName->end()) ++found;
      if (record.place == 1 && known != byName->end() && known->second.first != nullptr) ++found;
      IDexRawDataInterface* const made = makeRecord(record, texts[static_cast<std::size_t>(i)]);
      list->emplace_back(made);
      auto& ends = (*byName)[record.name];
      if (ends.first == nullptr) ends.first = made;
      ends.second = made;
    }
    benchmark::DoNotOptimize(list.get());
    byName.reset();
    list.reset();
  }
  reportJob(state, count, found / static_cast<long long>(state.iterations()));
}

// The records alone, made into a bare vector and destroyed: what every variant pays.
void RawJobRecordsOnly(benchmark::State& state) {
  const int count = static_cast<int>(state.range(0));
  const auto& records = job();
  const auto& texts = names();
  for (auto _ : state) {
    auto list = std::make_unique<std::vector<std::unique_ptr<IDexRawDataInterface>>>();
    for (int i = 0; i < count; ++i)
      list->emplace_back(
          makeRecord(records[static_cast<std::size_t>(i)], texts[static_cast<std::size_t>(i)]));
    benchmark::DoNotOptimize(list.get());
    list.reset();
  }
  reportJob(state, count, 0);
}

}  // namespace

BENCHMARK(RawJob)
    ->RangeMultiplier(10)
    ->Range(10'000, kMaxRecords)
    ->Unit(benchmark::kMillisecond)
    ->Complexity();
BENCHMARK(RawJobBaseline)
    ->RangeMultiplier(10)
    ->Range(10'000, kMaxRecords)
    ->Unit(benchmark::kMillisecond)
    ->Complexity();
BENCHMARK(RawJobRecordsOnly)
    ->RangeMultiplier(10)
    ->Range(10'000, kMaxRecords)
    ->Unit(benchmark::kMillisecond)
    ->Complexity();
