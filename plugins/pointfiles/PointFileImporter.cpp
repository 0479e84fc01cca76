#include "PointFileImporter.h"

#include <sys/stat.h>

#include <cstdint>
#include <deque>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "CodeText.h"
#include "ImportNotes.h"
#include "LayoutFinding.h"
#include "LineValues.h"
#include "PointLayout.h"
#include "hostlibs/VynLogging.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieUtils/IEFileReaders.h"
#include "ieUtils/IENaturalNames.h"

namespace vyn::ie::point_files {

namespace {

constexpr int kReadBlockSize = 1 << 20;
// Lines between two looks at the stop flag and two progress reports.
constexpr int kStopCheckLines = 1024;
constexpr int kProgressLines = 16384;
// The non-blank lines the delimiter and the header line are found from, and the most lines read ahead
// for them (a file of blank lines is not held).
constexpr std::size_t kSampleLines = 20;
constexpr std::size_t kMostLinesAhead = 1000;
// Between the texts a point's notes keep.
constexpr std::wstring_view kNotesSeparator = L"; ";

std::uint64_t fileSize(const CVynStringT<wchar_t>& fileName) {
  struct stat info {};
  if (::stat(vyn_text::toUtf8(fileName.view()).c_str(), &info) != 0) return 0;
  return static_cast<std::uint64_t>(info.st_size);
}

// The lines of a file with their numbers; the first non-blank ones can be looked at before they are
// read.
class NumberedLines {
 public:
  explicit NumberedLines(DexTextFile& file) : file_(file) {}

  // The first count non-blank lines (read ahead).
  std::vector<NumberedLine> sample(std::size_t count) {
    std::vector<NumberedLine> lines;
    CVynStringT<wchar_t> line;
    while (lines.size() < count && ahead_.size() < kMostLinesAhead && readFromFile(line)) {
      ahead_.emplace_back(number_, std::wstring(line.view()));
      if (!isBlankText(line.view())) lines.push_back(ahead_.back());
    }
    return lines;
  }

  // The next line into line (reusing its storage) with its number.
  bool next(CVynStringT<wchar_t>& line, int& number) {
    if (!ahead_.empty()) {
      assignText(line, ahead_.front().second);
      number = ahead_.front().first;
      ahead_.pop_front();
      return true;
    }
    if (!readFromFile(line)) return false;
    number = number_;
    return true;
  }

 private:
  bool readFromFile(CVynStringT<wchar_t>& line) {
    if (!file_.ReadString(line)) return false;
    ++number_;
    return true;
  }

  DexTextFile& file_;
  std::deque<NumberedLine> ahead_;
  int number_ = 0;
};

// What became of one line besides its point.
struct LineOutcome {
  const wchar_t* dropped = nullptr;     // why no point came of it
  const wchar_t* unreadable = nullptr;  // why a value went to the notes instead of its column
  bool extra = false;                   // values after the last column went to the notes
};

// Turns the values of one line into a design point.
class PointBuilder {
 public:
  PointBuilder(DexData* data, const PointLayout& layout) : layout_(layout), data_(data), codes_(data) {
    for (std::size_t i = 0; i < layout.fields.size(); ++i) {
      columns_.push_back(columnOf(layout.fields[i].type));
      labels_.push_back(layout.label(i));
    }
    hasName_ = layout.findColumn(EColumn::NAME) >= 0;
    hasNorth_ = layout.findColumn(EColumn::NORTH) >= 0;
    hasEast_ = layout.findColumn(EColumn::EAST) >= 0;
    if (!hasName_) startFreeNames();
  }

  // The point of the values, or null with the reason in outcome.
  std::unique_ptr<DexDesignPoint> build(const std::vector<std::wstring_view>& values, LineOutcome& outcome) {
    auto point = std::make_unique<DexDesignPoint>();
    north_ = east_ = height_ = geoidHeight_ = kNoValue;
    notes_.clear();
    kept_.clear();
    bool named = false;
    for (std::size_t i = 0; i < values.size(); ++i) {
      const std::wstring_view value = values[i];
      if (i >= columns_.size()) {
        if (!value.empty()) keep(std::wstring_view(), value);
        outcome.extra |= !value.empty();
        continue;
      }
      if (!readValue(i, value, *point, named, outcome)) return nullptr;
    }
    if (hasName_ && !named) return drop(outcome, L"no point name");
    if (hasNorth_ && north_ == kNoValue) return drop(outcome, L"no northing");
    if (hasEast_ && east_ == kNoValue) return drop(outcome, L"no easting");
    if (!hasName_) point->setName(freeNames_->getNameFor(CVynStringT<wchar_t>()));
    if (geoidHeight_ == kNoValue) {
      point->setCoords(north_, east_, height_);
    } else {
      point->setCoords(north_, east_, height_, geoidHeight_);
    }
    setNotes(*point);
    return point;
  }

 private:
  // Reads one value into the point; false (with the reason) when the line gives no point.
  bool readValue(std::size_t column, std::wstring_view value, DexDesignPoint& point, bool& named,
                 LineOutcome& outcome) {
    switch (columns_[column]) {
      case EColumn::NAME:
        if (value.empty()) break;
        assignText(text_, value);
        point.setName(text_);
        named = true;
        break;
      case EColumn::NORTH:
        if (readDistance(value, north_)) break;
        outcome.dropped = L"northing is not a number";
        return false;
      case EColumn::EAST:
        if (readDistance(value, east_)) break;
        outcome.dropped = L"easting is not a number";
        return false;
      case EColumn::HEIGHT:
        if (!readDistance(value, height_)) unreadable(column, value, L"height is not a number", outcome);
        break;
      case EColumn::GEOID_HEIGHT:
        if (!readDistance(value, geoidHeight_))
          unreadable(column, value, L"geoid height is not a number", outcome);
        break;
      case EColumn::NOTES:
        appendNote(notes_, value);
        break;
      case EColumn::CODES:
      case EColumn::CODES_STRINGS:
      case EColumn::CODES_ATTRS:
      case EColumn::FULL_CODES:
        rejected_.clear();
        if (!codes_.read(value, point, rejected_)) unreadable(column, rejected_, L"malformed code", outcome);
        break;
      case EColumn::LAYER:
        if (!value.empty()) point.setLayer(layer(value), false);
        break;
      case EColumn::OTHER:
        if (!value.empty()) keep(labels_[column], value);
        break;
    }
    return true;
  }

  static std::unique_ptr<DexDesignPoint> drop(LineOutcome& outcome, const wchar_t* why) {
    outcome.dropped = why;
    return nullptr;
  }

  void unreadable(std::size_t column, std::wstring_view value, const wchar_t* why, LineOutcome& outcome) {
    keep(labels_[column], value);
    outcome.unreadable = why;
  }

  // An empty value leaves kNoValue; a number is converted to meters.
  bool readDistance(std::wstring_view value, double& meters) const {
    if (value.empty()) return true;
    double number = 0.0;
    if (!parseNumber(value, number, layout_.decimalComma())) return false;
    meters = utils::toMetersFactor(number, layout_.units);
    return true;
  }

  // A value the point has no place for, in its notes as "label=value" (a value without column as it is).
  void keep(std::wstring_view label, std::wstring_view value) {
    if (!kept_.empty()) kept_ += kNotesSeparator;
    if (!label.empty()) (kept_ += label) += L'=';
    kept_ += value;
  }

  static void appendNote(std::wstring& notes, std::wstring_view text) {
    if (text.empty()) return;
    if (!notes.empty()) notes += kNotesSeparator;
    notes += text;
  }

  void setNotes(DexDesignPoint& point) {
    appendNote(notes_, kept_);
    if (notes_.empty()) return;
    DexStation station = point.getStation();
    assignText(text_, notes_);
    station.setNotes(text_);
    point.setStation(station);
  }

  // The draw dictionary's layer of that name, added when missing.
  const DexLayer* layer(std::wstring_view name) {
    if (const auto found = layers_.find(name); found != layers_.end()) return found->second;
    assignText(text_, name);
    DexDrawDictionary* dictionary = data_->getIEDrawDictionary();
    DexLayer* held = dictionary->findLayer(text_);
    if (held == nullptr) {
      held = new DexLayer();
      held->setName(text_);
      dictionary->addLayer(held);
    }
    layers_.emplace(std::wstring(name), held);
    return held;
  }

  // Points of a file without a name column are numbered after the numeric names in use (those of the
  // container's objects and the settings' highest).
  void startFreeNames() {
    freeNames_.emplace();
    data_->getMaxNumericPointName(*freeNames_);
    for (int d = 0; d < data_->getNumberOfDatasets(); ++d) {
      const DexDataset* dataset = data_->getDatasetAt(d);
      const int count = dataset->getNumberOfElements(OBJECT_TYPE_ALL, 2);
      for (int i = 0; i < count; ++i) {
        if (const DexObject* object = dataset->getObjectAt(i)) freeNames_->addObject(object->getName());
      }
    }
    freeNames_->init();
  }

  const PointLayout& layout_;
  DexData* data_;
  TextMap<const DexLayer*> layers_;
  std::vector<EColumn> columns_;
  std::vector<std::wstring> labels_;
  bool hasName_ = false;
  bool hasNorth_ = false;
  bool hasEast_ = false;
  std::optional<utils::FreeNumericNames> freeNames_;
  CodeReader codes_;
  double north_ = kNoValue;
  double east_ = kNoValue;
  double height_ = kNoValue;
  double geoidHeight_ = kNoValue;
  std::wstring notes_;     // the Notes column
  std::wstring kept_;      // the values kept for want of a column
  std::wstring rejected_;  // the malformed codes of a code text
  CVynStringT<wchar_t> text_;
};

// The notes of the run, as trace records.
void traceNotes(const CVynStringT<wchar_t>& fileName, const ImportFindings& findings) {
  for (const std::wstring& note : notesOf(fileName.view(), findings))
    VYN_TRACE_ALWAYS(L"%ls", note.c_str());
}

// A given delimiter that gave no point while the first lines look delimited by another.
void traceOtherDelimiter(const CVynStringT<wchar_t>& fileName, const PointLayout& layout,
                         const std::vector<NumberedLine>& firstLines) {
  const wchar_t likely = findDelimiter(firstLines, layout.delimiter);
  if (layout.fixedWidth || likely == layout.delimiter) return;
  VYN_TRACE_ALWAYS(L"%ls: no line gave a point with the delimiter %ls; the first lines look delimited by %ls",
                   fileName.GetString(), delimiterWord(layout.delimiter).c_str(),
                   delimiterWord(likely).c_str());
}

}  // namespace

PointFileImporter::PointFileImporter(DexData* data, const CVynStringT<wchar_t>& fileName,
                                     const DexFormat* format)
    : DexImporterImpl(data, fileName, format) {}

PointFileImporter::~PointFileImporter() = default;

EDexResult PointFileImporter::doImport() {
  if (data == nullptr) return DEX_RESULT_FAILED;
  const DexSettings& settings = data->getSettings();
  PointLayout layout;
  if (!makeLayout(format, settings, true, layout)) return DEX_RESULT_NO_PARSER;
  if (!settings.hasDataType(POINTS) && !settings.hasDataType(POINT_LISTS)) return DEX_RESULT_OK;

  DexTextFile file(kReadBlockSize);
  if (file.Open(fileName) == 0) return DEX_RESULT_FILE_ERROR;
  const std::uint64_t bytesTotal = fileSize(fileName);
  DexRunProgress& progress = data->getProgress();
  progress.setImportPosition(0, bytesTotal);

  NumberedLines lines(file);
  const std::vector<NumberedLine> firstLines = lines.sample(kSampleLines);
  if (findLayout(firstLines, layout)) {
    VYN_TRACE_ALWAYS(
        L"%ls: the header line %d names other columns than the settings give; read by the header",
        fileName.GetString(), layout.headerLineNumber);
  }
  ImportFindings findings;
  findings.describe(layout);

  DexDataset* dataset = data->getCurDataset();
  {
    LineSplitter splitter(layout);
    PointBuilder builder(data, layout);
    CVynStringT<wchar_t> line;
    std::uint64_t charactersRead = 0;
    int lineNumber = 0;
    while (lines.next(line, lineNumber)) {
      charactersRead += static_cast<std::uint64_t>(line.GetLength()) + 1;
      if (lineNumber % kStopCheckLines == 0 && DexData::stopProcess_) break;
      if (lineNumber % kProgressLines == 0)
        progress.setImportPosition(std::min(charactersRead, bytesTotal), bytesTotal);
      if (lineNumber == layout.headerLineNumber || isBlankText(line.view())) continue;

      LineOutcome outcome;
      std::unique_ptr<DexDesignPoint> point = builder.build(splitter.split(line), outcome);
      if (!point) {
        findings.skipped.add(lineNumber, outcome.dropped);
        continue;
      }
      if (outcome.extra) findings.extra.add(lineNumber, {});
      if (outcome.unreadable != nullptr) findings.unreadable.add(lineNumber, outcome.unreadable);
      dataset->add(point.release());
      ++findings.points;
    }
  }
  progress.setImportPosition(bytesTotal, bytesTotal);
  traceNotes(fileName, findings);
  if (DexData::stopProcess_) return DEX_RESULT_STOPPED;
  if (findings.points == 0 && layout.delimiterFrom == ESource::GIVEN)
    traceOtherDelimiter(fileName, layout, firstLines);
  if (findings.skipped.count == 0) return DEX_RESULT_OK;
  return findings.points > 0 ? kResultLinesSkipped : DEX_RESULT_WRONG_FORMAT;
}

}  // namespace vyn::ie::point_files
