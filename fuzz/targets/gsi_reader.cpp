// The GSI importer on raw bytes, the exporter on the points it read, and that file read back. The
// first byte steers: bit 0 points, bit 1 raw data (the data kinds of the settings), bits 2 and 3 the
// distance unit, bit 4 the variant written (GSI-16 when set), bits 5 and 6 the coordinate decimals;
// the rest is the file. An import must answer one of its documented results and take nothing from a
// file it calls not GSI; an export either writes every point or refuses; a written file reads back
// cleanly to as many points.

#include <cstddef>
#include <cstdint>

#include "gsi/GsiExporter.h"
#include "gsi/GsiImporter.h"
#include "gsi/GsiWords.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/PluginRun.h"
#include "support/ScratchFile.h"

namespace {

using namespace vyn::ie;

constexpr EDistUnits kUnits[] = {ANY_UNITS, METERS, IFEET, USFEET};
constexpr int kDecimals[] = {3, 4, 5, 2};

EDexResult run(DexData& data, const std::wstring& path, const wchar_t* formatId, bool exportRun) {
  return dex_fuzz::runParser<gsi::GsiImporter, gsi::GsiExporter>(data, path, formatId, exportRun);
}

struct Content {
  int points = 0;
  int records = 0;
};

Content contentOf(DexData& data) {
  Content content;
  if (data.getNumberOfDatasets() == 0) return content;
  const DexDataset& dataset = *data.getCurDataset();
  content.points = dataset.getNumberOfElements(OBJECT_TYPE_DESIGN_POINT, IDexStateInterface::ANY_STATE);
  content.records = dataset.getRawData() == nullptr ? 0 : dataset.getRawData()->getNumberOfRawData();
  return content;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const dex_fuzz::ScratchFile input("gsi-in");
  static const dex_fuzz::ScratchFile output("gsi-out");
  dex_fuzz::silenceLogs();
  dex_fuzz::FuzzInput bytes(data, size);
  const std::uint8_t steering = bytes.takeByte();
  if (!input.write(bytes.takeRest())) return 0;

  DexSettings settings;
  if ((steering & 1u) != 0) settings.addDataType(POINTS);
  if ((steering & 2u) != 0) settings.addDataType(RAW_DATA);
  settings.distUnits = kUnits[(steering >> 2) & 3u];
  const int decimals = kDecimals[(steering >> 5) & 3u];
  settings.coordDecimals = {decimals, decimals, decimals};
  settings.messageBox = new dex_fuzz::YesBox();
  DexData::stopProcess_ = false;

  DexData first(settings);
  const EDexResult read = run(first, input.wpath(), gsi::kLeicaGsiFormatId, false);
  const Content taken = contentOf(first);
  DEX_FUZZ_CHECK(read == DEX_RESULT_OK || read == gsi::kResultWordsSkipped ||
                 read == DEX_RESULT_WRONG_FORMAT);
  if (read == DEX_RESULT_WRONG_FORMAT) DEX_FUZZ_CHECK(taken.points == 0 && taken.records == 0);
  if (taken.points == 0) return 0;

  const wchar_t* variant = (steering & 16u) != 0 ? gsi::kGsi16FormatId : gsi::kGsi8FormatId;
  const EDexResult written = run(first, output.wpath(), variant, true);
  DEX_FUZZ_CHECK(written == DEX_RESULT_OK || written == DEX_RESULT_WRONG_FORMAT);
  if (written != DEX_RESULT_OK) return 0;
  DexData second(settings);
  DEX_FUZZ_CHECK(run(second, output.wpath(), gsi::kLeicaGsiFormatId, false) == DEX_RESULT_OK);
  DEX_FUZZ_CHECK(contentOf(second).points == taken.points);
  return 0;
}
