#include "GsiImporter.h"

#include <algorithm>
#include <cstdint>
#include <filesystem>
#include <string>
#include <system_error>

#include "GsiReader.h"
#include "GsiRecordBuilder.h"
#include "GsiWords.h"
#include "hostlibs/VynLogging.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieUtils/IEFileReaders.h"

namespace vyn::ie::gsi {

namespace {

constexpr int kReadBlockSize = 1 << 20;
// Lines between two looks at the stop flag and two progress reports.
constexpr int kStopCheckLines = 1024;
constexpr int kProgressLines = 16384;

std::uint64_t fileSizeOf(const CVynStringT<wchar_t>& fileName) {
  std::error_code error;
  const auto size = std::filesystem::file_size(vyn_text::toUtf8(fileName.view()), error);
  return error ? 0 : static_cast<std::uint64_t>(size);
}

// The notes of the run, traced at its end.
class GsiImportReport {
 public:
  explicit GsiImportReport(const CVynStringT<wchar_t>& fileName) : file_(fileName.GetString()) {}

  void badWords(int line, const std::vector<GsiBadWord>& words) {
    for (const GsiBadWord& word : words) {
      if (++tracedBad_ > kTracedProblems) return;
      VYN_TRACE_ALWAYS(L"%ls: line %d, column %d: %ls; the word is left out", file_, line, word.column,
                       word.reason);
    }
  }

  void variant(EVariant variant) { seen_[variant == EVariant::GSI16 ? 1 : 0] = true; }

  void finish(const GsiTally& tally) const {
    if (tally.badWords > 0) VYN_TRACE_ALWAYS(L"%ls: %d bad words left out", file_, tally.badWords);
    if (tally.emptyLines > 0)
      VYN_TRACE_ALWAYS(L"%ls: %d lines without a good word left out", file_, tally.emptyLines);
    if (tally.unknownWords > 0) {
      std::wstring indexes;
      for (const int index : tally.unknownIndexes)
        indexes += (indexes.empty() ? L"" : L", ") + std::to_wstring(index);
      VYN_TRACE_ALWAYS(L"%ls: %d words of an index without place left out (word %ls)", file_,
                       tally.unknownWords, indexes.c_str());
    }
    if (seen_[0] && seen_[1])
      VYN_TRACE_ALWAYS(L"%ls: GSI-8 and GSI-16 lines in one file; each line was read in its own variant",
                       file_);
    VYN_TRACE_ALWAYS(L"%ls: %d set-ups, %d backsights, %d sideshots, %d points, %d notes", file_,
                     tally.stations, tally.backsights, tally.sideshots, tally.points, tally.notes);
  }

 private:
  const wchar_t* file_;
  int tracedBad_ = 0;
  bool seen_[2] = {false, false};
};

}  // namespace

GsiImporter::GsiImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
    : DexImporterImpl(data, fileName, format) {}

GsiImporter::~GsiImporter() = default;

EDexResult GsiImporter::doImport() {
  if (data == nullptr) return DEX_RESULT_FAILED;
  const DexSettings& settings = data->getSettings();
  const bool withRaw = settings.hasDataType(RAW_DATA);
  const bool withPoints = settings.hasDataType(POINTS) || settings.hasDataType(POINT_LISTS);
  if (!withRaw && !withPoints) return DEX_RESULT_OK;

  DexTextFile file(kReadBlockSize);
  if (file.Open(fileName) == 0) return DEX_RESULT_FILE_ERROR;
  const std::uint64_t bytesTotal = fileSizeOf(fileName);
  DexRunProgress& progress = data->getProgress();
  progress.setImportPosition(0, bytesTotal);

  GsiRecordBuilder builder(*data, *data->getCurDataset(), withRaw, withPoints,
                           metersPerFoot(settings.distUnits));
  GsiImportReport report(fileName);
  GsiLineReader reader;
  std::vector<GsiBadWord> bad;
  CVynStringT<wchar_t> line;
  std::uint64_t charactersRead = 0;
  int lineNumber = 0;
  int records = 0;
  bool stopped = false;
  while (file.ReadString(line)) {
    ++lineNumber;
    charactersRead += static_cast<std::uint64_t>(line.GetLength()) + 1;
    if (lineNumber % kStopCheckLines == 0 && DexData::stopProcess_) {
      stopped = true;
      break;
    }
    if (lineNumber % kProgressLines == 0)
      progress.setImportPosition(std::min(charactersRead, bytesTotal), bytesTotal);
    if (!reader.read(line.view())) continue;
    report.variant(reader.variant());
    bad = reader.badWords();
    if (builder.add(reader.words(), bad)) ++records;
    report.badWords(lineNumber, bad);
  }
  progress.setImportPosition(bytesTotal, bytesTotal);
  const GsiTally& tally = builder.tally();
  report.finish(tally);
  if (stopped) return DEX_RESULT_STOPPED;
  if (records == 0) {
    VYN_TRACE_ALWAYS(L"%ls: no GSI record in the file", fileName.GetString());
    return DEX_RESULT_WRONG_FORMAT;
  }
  return tally.badWords > 0 || tally.emptyLines > 0 ? kResultWordsSkipped : DEX_RESULT_OK;
}

}  // namespace vyn::ie::gsi
