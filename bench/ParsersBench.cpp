// Splitting typical point lines of a CSV file: a million lines such as
// P1001,5000123.456,600123.789,123.456,"CODE A", read one line at a time as an importer does.

#include <benchmark/benchmark.h>

#include <string>
#include <vector>

#include "ieUtils/IEUtilsParsers.h"

namespace {

using String = CVynStringT<wchar_t>;
using vyn::ie::utils::StringArray;

constexpr int kLineCount = 1000000;

const std::vector<String>& pointFile() {
  static const std::vector<String> lines = [] {
    std::vector<String> file;
    file.reserve(kLineCount);
    String line;
    for (int i = 0; i < kLineCount; ++i) {
      line.Format(L"P%d,%.3f,%.3f,%.3f,\"CODE %c\"", 1001 + i, 5000123.456 + i * 0.25, 600123.789 - i * 0.125,
                  123.456 + (i % 1000) * 0.01, static_cast<wchar_t>(L'A' + i % 26));
      file.push_back(line);
    }
    return file;
  }();
  return lines;
}

template <class Split>
void splitEveryLine(benchmark::State& state, Split split) {
  const std::vector<String>& lines = pointFile();
  std::int64_t characters = 0;
  for (const String& line : lines)
    characters += line.GetLength();
  StringArray values;
  for (auto _ : state) {
    for (const String& line : lines) {
      values.RemoveAll();
      split(line, values);
      benchmark::DoNotOptimize(values.GetData());
    }
  }
  state.SetItemsProcessed(state.iterations() * kLineCount);
  state.SetBytesProcessed(state.iterations() * characters * static_cast<std::int64_t>(sizeof(wchar_t)));
}

void ParseValues(benchmark::State& state) {
  splitEveryLine(state, [](const String& line, StringArray& values) {
    vyn::ie::utils::parseValues(line, values, L',', String());
  });
}

void ParseValuesWithForbiddenCharacters(benchmark::State& state) {
  const String forbidden = L"|{}";
  splitEveryLine(state, [&forbidden](const String& line, StringArray& values) {
    vyn::ie::utils::parseValues(line, values, L',', forbidden);
  });
}

void ParseValuesInQuotes(benchmark::State& state) {
  splitEveryLine(state, [](const String& line, StringArray& values) {
    vyn::ie::utils::parseValuesInQuotes(line, values, L',');
  });
}

}  // namespace

BENCHMARK(ParseValues)->Unit(benchmark::kMillisecond);
BENCHMARK(ParseValuesWithForbiddenCharacters)->Unit(benchmark::kMillisecond);
BENCHMARK(ParseValuesInQuotes)->Unit(benchmark::kMillisecond);
