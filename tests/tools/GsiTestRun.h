#pragma once

// What the GSI plug-in tests share: runs through the loader by format, and the raw records of the
// current dataset as text to compare.

#include <memory>
#include <string>
#include <vector>

#include "hostlibs/VynString.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IETSRawRecords.h"
#include "ieUtils/IEParsersLoader.h"
#include "pointfiles/CodeText.h"
#include "support/FixedText.h"
#include "support/TempDir.h"

namespace gsi_test {

using namespace vyn::ie;

inline DexSettings rawAndPoints(EDistUnits units = ANY_UNITS) {
  DexSettings settings;
  settings.addDataType(POINTS);
  settings.addDataType(RAW_DATA);
  settings.distUnits = units;
  return settings;
}

inline std::unique_ptr<DexParsersLoader> loaderWith(const DexSettings& settings) {
  auto loader = std::make_unique<DexParsersLoader>();
  loader->initIEData(settings);
  return loader;
}

inline EDexResult run(DexParsersLoader& loader, const std::string& path, const wchar_t* formatId,
                      bool exporting) {
  const DexFormat* format = getIEFormatsData().getFormatById(formatId);
  const std::wstring file = dex_test::widen(path);
  return exporting ? loader.exportInTheSameThread(file.c_str(), format, nullptr)
                   : loader.importInTheSameThread(file.c_str(), format, nullptr);
}

inline std::string number(double value) {
  if (value == kNoValue) return "-";
  return dex_test::fixedText(value, 5);
}

inline std::string valuesText(const DexTSRawData* values) {
  if (values == nullptr) return "none";
  static const char* const kContents[] = {"HVS", "HVD", "HV", "OFFSET", "NEU", "BRGAZ"};
  std::string text = kContents[values->getContentsType()];
  for (int place = 0; place < 3; ++place)
    text += (place == 0 ? "(" : " ") + number(values->getTSRawData(place));
  return text + ")";
}

// "stn 'name' NEU(n e h) th=instrument height codes=..." / "bs|ss 'name' HVS(...) th=... [2nd HVD(...)]
// [xyz ...] [pc=...] codes=... note=..." / "note 'text'".
inline std::string describe(const IDexRawDataInterface& record) {
  const auto* ts = dynamic_cast<const IDexTSRawDataInterface*>(&record);
  if (ts == nullptr) return "note '" + vyn_text::toUtf8(record.getName().view()) + "'";
  static const char* const kKinds[] = {"bkb", "bs", "fs", "ss", "mlm", "res", "stn", "stake"};
  std::string text = std::string(kKinds[ts->getType()]) + " '" + vyn_text::toUtf8(ts->getName().view()) +
                     "' " + valuesText(ts->getTSRawData()) + " th=" + number(ts->getTargetHeight());
  if (ts->getTSRawData() != nullptr && ts->getTSRawData()->getPrismConst() != 0.0)
    text += " pc=" + number(ts->getTSRawData()->getPrismConst());
  std::wstring codes;
  std::wstring note;
  if (const auto* shot = dynamic_cast<const DexTSRawFS*>(ts)) {
    if (shot->getSecondData() != nullptr) text += " 2nd " + valuesText(shot->getSecondData());
    point_files::appendCodesText(*shot, false, false, codes);
  }
  if (const auto* sight = dynamic_cast<const DexTSRawDataSightInterface*>(ts)) {
    if (sight->getXyz() != nullptr) text += " xyz " + valuesText(sight->getXyz());
    note = sight->getNote().view();
  }
  if (const auto* station = dynamic_cast<const DexTSRawStn*>(ts)) {
    point_files::appendCodesText(*station, false, false, codes);
    note = station->getNote().view();
  }
  if (!codes.empty()) text += " codes=" + vyn_text::toUtf8(codes);
  if (!note.empty()) text += " note=" + vyn_text::toUtf8(note);
  return text;
}

inline std::vector<std::string> rawRecords(DexData& data) {
  std::vector<std::string> lines;
  const DexRawData* raw = data.getNumberOfDatasets() > 0 ? data.getCurDataset()->getRawData() : nullptr;
  for (int i = 0; raw != nullptr && i < raw->getNumberOfRawData(); ++i)
    lines.push_back(describe(*raw->getRawDataAt(i)));
  return lines;
}

}  // namespace gsi_test
