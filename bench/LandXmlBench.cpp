// LandXML through the shipped plug-ins and the loader, against bare baselines on the same files: a
// million coded CgPoints, and a surface of a million triangles (501 x 1001 grid positions).
//  - BarePass: one xmlTextReader pass over a file, reading every node's name, value and attributes
//    (what any reader of the file has to do at least);
//  - LoaderImport: the import through the loader into the model;
//  - BareWrite: the same document text formed with std::to_chars and written with buffered fwrite;
//  - LoaderExport: the export of the imported model through the loader.
// Run one benchmark per process (bench/landxml.sh does, with the point-file benchmark's ModelBlocks
// floor in the same run). The files are DEXCHANGE_BENCH_LANDXML_POINTS and
// DEXCHANGE_BENCH_LANDXML_SURFACE, generated when missing.

#include <benchmark/benchmark.h>
#include <libxml/xmlreader.h>

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

#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IESurface.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"

namespace {

using namespace vyn::ie;

constexpr int kPointCount = 1000000;
constexpr int kGridRows = 501;
constexpr int kGridColumns = 1001;  // (rows - 1) * (columns - 1) * 2 = 1,000,000 triangles
constexpr const wchar_t* kLandXmlId = L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}";

std::string fileFrom(const char* variable, const char* fallback) {
  const char* given = std::getenv(variable);
  return given != nullptr ? given : fallback;
}

// ---- The documents: formed once by the generator and by BareWrite alike ----------------------------

class Text {
 public:
  std::string bytes;
  void number(double value, int decimals) {
    const auto end = std::to_chars(digits_.data(), digits_.data() + digits_.size(), value,
                                   std::chars_format::fixed, decimals);
    bytes.append(digits_.data(), end.ptr);
  }
  void integer(long long value) {
    const auto end = std::to_chars(digits_.data(), digits_.data() + digits_.size(), value);
    bytes.append(digits_.data(), end.ptr);
  }

 private:
  std::array<char, 64> digits_{};
};

const char* const kHead =
    "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
    "<LandXML xmlns=\"http://www.landxml.org/schema/LandXML-1.2\" version=\"1.2\" date=\"2024-01-15\" "
    "time=\"12:00:00\">\n"
    " <Units>\n  <Metric areaUnit=\"squareMeter\" linearUnit=\"meter\" volumeUnit=\"cubicMeter\" "
    "temperatureUnit=\"celsius\" pressureUnit=\"milliBars\" angularUnit=\"decimal degrees\" "
    "directionUnit=\"decimal degrees\"/>\n </Units>\n";

struct Point {
  double north, east, height;
};

Point surveyPoint(int i) {
  return {5432000.0 + (i % 1000) * 0.731 + (i / 1000) * 0.377,
          312000.0 + (i / 1000) * 0.913 - (i % 1000) * 0.041, 84.0 + (i % 977) * 0.0123};
}

const char* const kCodes[] = {"GND", "EP:1", "EP:2",  "CL:1",        "KERB:L", "FENCE:A", "TREE;Species=Oak",
                              "MH",  "LP",   "BLD:3", "EP:1 KERB:L", "DITCH:4"};

// Forms the points document in blocks, handing each full block to flush.
template <class Flush>
void formPoints(Text& text, Flush&& flush) {
  text.bytes += kHead;
  text.bytes += " <CgPoints>\n";
  for (int i = 0; i < kPointCount; ++i) {
    const Point p = surveyPoint(i);
    text.bytes += "  <CgPoint name=\"";
    text.integer(100000 + i);
    text.bytes += "\" code=\"";
    text.bytes += kCodes[i % std::size(kCodes)];
    text.bytes += "\">";
    text.number(p.north, 3);
    text.bytes += ' ';
    text.number(p.east, 3);
    text.bytes += ' ';
    text.number(p.height, 3);
    text.bytes += "</CgPoint>\n";
    if (text.bytes.size() > (1u << 20)) flush(text.bytes);
  }
  text.bytes += " </CgPoints>\n</LandXML>\n";
  flush(text.bytes);
}

template <class Flush>
void formSurface(Text& text, Flush&& flush) {
  text.bytes += kHead;
  text.bytes += " <Surfaces>\n  <Surface name=\"Grid\">\n   <Definition surfType=\"TIN\">\n    <Pnts>\n";
  for (int r = 0; r < kGridRows; ++r) {
    for (int c = 0; c < kGridColumns; ++c) {
      text.bytes += "     <P id=\"";
      text.integer(r * kGridColumns + c + 1);
      text.bytes += "\">";
      text.number(5432000.0 + r * 2.0, 3);
      text.bytes += ' ';
      text.number(312000.0 + c * 2.0, 3);
      text.bytes += ' ';
      text.number(84.0 + ((r * 7 + c * 3) % 977) * 0.0123, 3);
      text.bytes += "</P>\n";
      if (text.bytes.size() > (1u << 20)) flush(text.bytes);
    }
  }
  text.bytes += "    </Pnts>\n    <Faces>\n";
  for (int r = 0; r + 1 < kGridRows; ++r) {
    for (int c = 0; c + 1 < kGridColumns; ++c) {
      const long long a = r * kGridColumns + c + 1;
      const long long corners[2][3] = {{a, a + 1, a + kGridColumns},
                                       {a + 1, a + kGridColumns + 1, a + kGridColumns}};
      for (const auto& face : corners) {
        text.bytes += "     <F>";
        text.integer(face[0]);
        text.bytes += ' ';
        text.integer(face[1]);
        text.bytes += ' ';
        text.integer(face[2]);
        text.bytes += "</F>\n";
      }
      if (text.bytes.size() > (1u << 20)) flush(text.bytes);
    }
  }
  text.bytes += "    </Faces>\n   </Definition>\n  </Surface>\n </Surfaces>\n</LandXML>\n";
  flush(text.bytes);
}

template <class Form>
void writeFile(const std::string& path, Form&& form) {
  std::FILE* file = std::fopen(path.c_str(), "wb");
  if (file == nullptr) return;
  Text text;
  form(text, [file](std::string& bytes) {
    std::fwrite(bytes.data(), 1, bytes.size(), file);
    bytes.clear();
  });
  std::fclose(file);
}

const std::string& pointsFile() {
  static const std::string path = [] {
    const std::string file = fileFrom("DEXCHANGE_BENCH_LANDXML_POINTS", "/tmp/dexchange-bench-1m-points.xml");
    if (!std::ifstream(file).good())
      writeFile(file, [](Text& text, auto&& flush) { formPoints(text, flush); });
    return file;
  }();
  return path;
}

const std::string& surfaceFile() {
  static const std::string path = [] {
    const std::string file =
        fileFrom("DEXCHANGE_BENCH_LANDXML_SURFACE", "/tmp/dexchange-bench-1m-triangles.xml");
    if (!std::ifstream(file).good())
      writeFile(file, [](Text& text, auto&& flush) { formSurface(text, flush); });
    return file;
  }();
  return path;
}

const std::string& fileOf(int which) {
  return which == 0 ? pointsFile() : surfaceFile();
}

double peakMegabytes() {
  std::ifstream status("/proc/self/status");
  std::string line;
  while (std::getline(status, line)) {
    if (line.rfind("VmHWM:", 0) == 0) return std::stod(line.substr(6)) / 1024.0;
  }
  return 0.0;
}

// ---- Benchmarks ----------------------------------------------------------------------------------

void BarePass(benchmark::State& state) {
  const std::string& path = fileOf(static_cast<int>(state.range(0)));
  std::int64_t nodes = 0;
  for (auto _ : state) {
    xmlTextReaderPtr reader = xmlReaderForFile(path.c_str(), nullptr, XML_PARSE_NONET);
    std::size_t characters = 0;
    while (xmlTextReaderRead(reader) == 1) {
      ++nodes;
      const xmlChar* name = xmlTextReaderConstName(reader);
      characters += name != nullptr ? std::strlen(reinterpret_cast<const char*>(name)) : 0;
      if (xmlTextReaderNodeType(reader) == XML_READER_TYPE_ELEMENT) {
        while (xmlTextReaderMoveToNextAttribute(reader) == 1)
          characters += std::strlen(reinterpret_cast<const char*>(xmlTextReaderConstValue(reader)));
        xmlTextReaderMoveToElement(reader);
      } else if (const xmlChar* value = xmlTextReaderConstValue(reader)) {
        characters += std::strlen(reinterpret_cast<const char*>(value));
      }
    }
    xmlFreeTextReader(reader);
    benchmark::DoNotOptimize(characters);
  }
  state.counters["nodes"] = static_cast<double>(nodes);
}

std::unique_ptr<DexFormat> landXml() {
  return std::make_unique<DexFormat>(*getIEFormatsData().getFormatById(kLandXmlId));
}

CVynStringT<wchar_t> wide(const std::string& path) {
  return CVynStringT<wchar_t>(path.c_str(), vyn_text::CP_UTF8);
}

DexSettings landXmlSettings() {
  DexSettings settings;
  settings.addDataType(POINTS);
  settings.addDataType(SURFACES);
  return settings;
}

std::int64_t importedCount(DexData& data) {
  const DexDataset& dataset = *data.getCurDataset();
  std::int64_t count = dataset.getNumberOfElements(OBJECT_TYPE_ALL, 2);
  for (int i = 0; i < dataset.getNumberOfSurfaces(); ++i)
    count += dataset.getSurfaceAt(i)->getNumberOfTriangles();
  return count;
}

void LoaderImport(benchmark::State& state) {
  const std::string& path = fileOf(static_cast<int>(state.range(0)));
  const auto format = landXml();
  std::int64_t items = 0;
  // The containers are destroyed after the timed loop: their destruction is not the import's.
  std::vector<std::unique_ptr<DexParsersLoader>> loaders;
  for (auto _ : state) {
    auto& loader = loaders.emplace_back(std::make_unique<DexParsersLoader>());
    loader->initIEData(landXmlSettings());
    if (loader->importInTheSameThread(wide(path), format.get(), nullptr) != DEX_RESULT_OK)
      state.SkipWithError("import failed");
    items += importedCount(*loader->getIEData());
  }
  state.counters["peak_MB"] = peakMegabytes();
  loaders.clear();
  state.counters["items"] = static_cast<double>(items);
}

void BareWrite(benchmark::State& state) {
  const std::string out = fileOf(static_cast<int>(state.range(0))) + ".bare-out.xml";
  for (auto _ : state) {
    if (state.range(0) == 0) {
      writeFile(out, [](Text& text, auto&& flush) { formPoints(text, flush); });
    } else {
      writeFile(out, [](Text& text, auto&& flush) { formSurface(text, flush); });
    }
  }
  std::remove(out.c_str());
}

void LoaderExport(benchmark::State& state) {
  const auto format = landXml();
  DexParsersLoader loader;
  loader.initIEData(landXmlSettings());
  if (loader.importInTheSameThread(wide(fileOf(static_cast<int>(state.range(0)))), format.get(), nullptr) !=
      DEX_RESULT_OK)
    state.SkipWithError("import failed");
  const std::string out = fileOf(static_cast<int>(state.range(0))) + ".loader-out.xml";
  for (auto _ : state) {
    std::remove(out.c_str());
    if (loader.exportInTheSameThread(wide(out), format.get(), nullptr) != DEX_RESULT_OK)
      state.SkipWithError("export failed");
  }
  std::remove(out.c_str());
  state.counters["peak_MB"] = peakMegabytes();
}

// Argument 0: the points file; 1: the surface file.
BENCHMARK(BarePass)->Unit(benchmark::kMillisecond)->Iterations(3)->Arg(0)->Arg(1);
BENCHMARK(LoaderImport)->Unit(benchmark::kMillisecond)->Iterations(1)->Arg(0)->Arg(1);
BENCHMARK(BareWrite)->Unit(benchmark::kMillisecond)->Iterations(3)->Arg(0)->Arg(1);
BENCHMARK(LoaderExport)->Unit(benchmark::kMillisecond)->Iterations(3)->Arg(0)->Arg(1);

}  // namespace
