// A drawing of a million coded points and a hundred thousand polylines through the shipped DXF
// plug-ins and the loader: its import into the model and its export from it. The drawing is the
// exporter's own (each point a POINT and an INSERT with its NAME, HEIGHT and CODE attributes), written
// from a generated model when DEXCHANGE_BENCH_DXF is missing. Run one benchmark per process
// (bench/dxf.sh does, with GDAL's ogr2ogr on the same file and the peak memory of each process).

#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <memory>
#include <string>
#include <vector>

#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"

namespace {

using namespace vyn::ie;

constexpr int kPointCount = 1000000;
constexpr int kPolylineCount = 100000;
constexpr int kVerticesPerPolyline = 8;
constexpr int kLayerCount = 12;
constexpr const wchar_t* kDxfId = L"{5373CF88-2FB9-458D-B233-3F539F08C588}";

std::string drawingFile() {
  const char* given = std::getenv("DEXCHANGE_BENCH_DXF");
  return given != nullptr ? given : "/tmp/dexchange-bench-drawing.dxf";
}

DexSettings drawingSettings() {
  DexSettings settings;
  settings.addDataType(POINTS);
  settings.addDataType(LINES);
  return settings;
}

CVynStringT<wchar_t> wide(const std::string& path) {
  return CVynStringT<wchar_t>(path.c_str(), vyn_text::CP_UTF8);
}

// Coded points on a dozen layers, some with attributes, and polylines of eight vertices, every third
// with an arc.
void fillSurvey(DexData& data) {
  std::vector<const DexLayer*> layers;
  for (int i = 0; i < kLayerCount; ++i) {
    auto* layer = new DexLayer();
    layer->setName(CVynStringT<wchar_t>(std::to_wstring(i).insert(0, L"LAYER_").c_str()));
    auto* line = new DexDrawLineProperties(static_cast<unsigned long>(0x102030 * (i + 1)), 1,
                                           DexDrawLineProperties::DASH_SOLID);
    layer->setDrawProperties(IDexDrawProperties::DRAW_LINE, line);
    data.getIEDrawDictionary()->addLayer(layer);
    layers.push_back(layer);
  }
  const wchar_t* const codeNames[] = {L"GND", L"EP", L"KERB", L"TREE", L"MH", L"FENCE"};
  std::vector<const DexCodeDescription*> codes;
  for (const wchar_t* name : codeNames) {
    auto* description = new DexCodeDescription(name);
    data.addCodeToIEDataDictionary(description);
    codes.push_back(description);
  }
  DexDataset& dataset = *data.getCurDataset();
  for (int i = 0; i < kPointCount; ++i) {
    auto* point = new DexDesignPoint();
    point->setName(CVynStringT<wchar_t>(std::to_wstring(100000 + i).c_str()));
    point->setCoords(5432000.0 + (i % 1000) * 0.731 + (i / 1000) * 0.377,
                     312000.0 + (i / 1000) * 0.913 - (i % 1000) * 0.041, 84.0 + (i % 977) * 0.0123);
    auto* code = new DexCodeValues(codes[static_cast<std::size_t>(i) % codes.size()]);
    if (i % 3 == 1) code->addCodeString(L"1");
    point->addCode(code);
    point->setLayer(layers[static_cast<std::size_t>(i) % layers.size()], false);
    dataset.add(point);
  }
  for (int i = 0; i < kPolylineCount; ++i) {
    auto* line = new DexPolyLine(false);
    for (int v = 0; v < kVerticesPerPolyline; ++v) {
      DexStation station;
      station.setPosition(5433000.0 + i * 0.5 + v * 3.1, 313000.0 + (i % 400) * 2.0 + v * 1.7, 90.0);
      if (i % 3 == 0 && v == 3) station.setBulge(0.25);
      line->addStation(station);
    }
    line->setLayer(layers[static_cast<std::size_t>(i) % layers.size()], false);
    dataset.add(line);
  }
}

const std::string& drawing() {
  static const std::string path = [] {
    const std::string file = drawingFile();
    if (std::ifstream(file).good()) return file;
    DexParsersLoader loader;
    loader.initIEData(drawingSettings());
    fillSurvey(*loader.getIEData());
    loader.exportInTheSameThread(wide(file), getIEFormatsData().getFormatById(kDxfId), nullptr);
    return file;
  }();
  return path;
}

void report(benchmark::State& state, std::int64_t objects) {
  state.SetItemsProcessed(objects);
  state.counters["objects"] = static_cast<double>(objects);
}

void LoaderImport(benchmark::State& state) {
  const std::string& path = drawing();
  std::int64_t objects = 0;
  for (auto _ : state) {
    // The container of the round before goes untimed: its destruction is not the import's.
    state.PauseTiming();
    auto loader = std::make_unique<DexParsersLoader>();
    state.ResumeTiming();
    loader->initIEData(drawingSettings());
    const EDexResult result =
        loader->importInTheSameThread(wide(path), getIEFormatsData().getFormatById(kDxfId), nullptr);
    if (result != DEX_RESULT_OK) state.SkipWithError("the import failed");
    objects += loader->getIEData()->getCurDataset()->getNumberOfElements(OBJECT_TYPE_ALL, 2);
    state.PauseTiming();
    loader.reset();
    state.ResumeTiming();
  }
  report(state, objects);
}

void LoaderExport(benchmark::State& state) {
  DexParsersLoader loader;
  loader.initIEData(drawingSettings());
  fillSurvey(*loader.getIEData());
  const std::string out = drawingFile() + ".out.dxf";
  for (auto _ : state) {
    std::remove(out.c_str());
    if (loader.exportInTheSameThread(wide(out), getIEFormatsData().getFormatById(kDxfId), nullptr) !=
        DEX_RESULT_OK)
      state.SkipWithError("the export failed");
  }
  std::remove(out.c_str());
  report(state, static_cast<std::int64_t>(kPointCount + kPolylineCount) * state.iterations());
}

BENCHMARK(LoaderImport)->Unit(benchmark::kMillisecond)->Iterations(3);
BENCHMARK(LoaderExport)->Unit(benchmark::kMillisecond)->Iterations(3);

}  // namespace
