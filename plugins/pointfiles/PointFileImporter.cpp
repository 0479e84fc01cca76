#include "PointFileImporter.h"

#include <sys/stat.h>

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "CodeText.h"
#include "LineValues.h"
#include "PointLayout.h"
#include "hostlibs/VynLogging.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieUtils/IEFileReaders.h"

namespace vyn::ie::point_files {

namespace {

constexpr int kReadBlockSize = 1 << 20;
// Lines between two looks at the stop flag and two progress reports.
constexpr int kStopCheckLines = 1024;
constexpr int kProgressLines = 16384;

std::uint64_t fileSize(const CVynStringT<wchar_t>& fileName) {
  struct stat info {};
  if (::stat(vyn_text::toUtf8(fileName.view()).c_str(), &info) != 0) return 0;
  return static_cast<std::uint64_t>(info.st_size);
}

// Turns the values of one line into a design point.
class PointBuilder {
 public:
  PointBuilder(DexData* data, const PointLayout& layout) : layout_(layout), data_(data), codes_(data) {
    for (const ascii_fields::DexFieldFormat& field : layout.fields)
      columns_.push_back(columnOf(field.type));
    hasName_ = layout.findColumn(EColumn::NAME) >= 0;
    hasNorth_ = layout.findColumn(EColumn::NORTH) >= 0;
    hasEast_ = layout.findColumn(EColumn::EAST) >= 0;
  }

  // The point of the values, or null with the reason.
  std::unique_ptr<DexDesignPoint> build(const std::vector<std::wstring_view>& values,
                                        const wchar_t*& reason) {
    auto point = std::make_unique<DexDesignPoint>();
    double north = kNoValue;
    double east = kNoValue;
    double height = kNoValue;
    double geoidHeight = kNoValue;
    bool named = false;
    for (std::size_t i = 0; i < values.size(); ++i) {
      const std::wstring_view value = values[i];
      if (i >= columns_.size()) {
        if (!value.empty()) {
          reason = L"more values than columns";
          return nullptr;
        }
        continue;
      }
      switch (columns_[i]) {
        case EColumn::NAME:
          if (value.empty()) break;
          assignText(text_, value);
          point->setName(text_);
          named = true;
          break;
        case EColumn::NORTH:
          if (!readDistance(value, north, true)) return fail(reason, L"northing is not a number");
          break;
        case EColumn::EAST:
          if (!readDistance(value, east, true)) return fail(reason, L"easting is not a number");
          break;
        case EColumn::HEIGHT:
          if (!readDistance(value, height, false)) return fail(reason, L"height is not a number");
          break;
        case EColumn::GEOID_HEIGHT:
          if (!readDistance(value, geoidHeight, false)) return fail(reason, L"geoid height is not a number");
          break;
        case EColumn::NOTES:
          if (!value.empty()) setNotes(*point, value);
          break;
        case EColumn::CODES:
        case EColumn::CODES_STRINGS:
        case EColumn::CODES_ATTRS:
        case EColumn::FULL_CODES:
          if (!codes_.read(value, *point)) return fail(reason, L"malformed code");
          break;
        case EColumn::LAYER:
          if (!value.empty()) point->setLayer(layer(value), false);
          break;
        case EColumn::IGNORED:
          break;
      }
    }
    if (hasName_ && !named) return fail(reason, L"no point name");
    if (hasNorth_ && north == kNoValue) return fail(reason, L"no northing");
    if (hasEast_ && east == kNoValue) return fail(reason, L"no easting");
    if (geoidHeight == kNoValue) {
      point->setCoords(north, east, height);
    } else {
      point->setCoords(north, east, height, geoidHeight);
    }
    return point;
  }

 private:
  static std::unique_ptr<DexDesignPoint> fail(const wchar_t*& reason, const wchar_t* why) {
    reason = why;
    return nullptr;
  }

  // An empty value leaves kNoValue (refused when required); a number is converted to meters.
  bool readDistance(std::wstring_view value, double& meters, bool required) const {
    if (value.empty()) return !required;
    double number = 0.0;
    if (!parseNumber(value, number)) return false;
    meters = utils::toMetersFactor(number, layout_.units);
    return true;
  }

  void setNotes(DexDesignPoint& point, std::wstring_view notes) {
    DexStation station = point.getStation();
    assignText(text_, notes);
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

  const PointLayout& layout_;
  DexData* data_;
  TextMap<const DexLayer*> layers_;
  std::vector<EColumn> columns_;
  bool hasName_ = false;
  bool hasNorth_ = false;
  bool hasEast_ = false;
  CodeReader codes_;
  CVynStringT<wchar_t> text_;
};

// Whether the first line names the columns rather than holding a point: every coordinate column
// holds a text that is not a number.
bool isHeaderLine(const PointLayout& layout, const std::vector<std::wstring_view>& values) {
  if (layout.headerLine) return true;
  bool anyCoordinate = false;
  for (std::size_t i = 0; i < values.size() && i < layout.fields.size(); ++i) {
    const EColumn column = columnOf(layout.fields[i].type);
    if (column != EColumn::NORTH && column != EColumn::EAST && column != EColumn::HEIGHT) continue;
    double number = 0.0;
    if (values[i].empty() || parseNumber(values[i], number)) return false;
    anyCoordinate = true;
  }
  return anyCoordinate;
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
  if (!makeLayout(format, settings, layout)) return DEX_RESULT_NO_PARSER;
  if (!settings.hasDataType(POINTS) && !settings.hasDataType(POINT_LISTS)) return DEX_RESULT_OK;

  DexTextFile file(kReadBlockSize);
  if (file.Open(fileName) == 0) return DEX_RESULT_FILE_ERROR;
  const std::uint64_t bytesTotal = fileSize(fileName);
  DexRunProgress& progress = data->getProgress();
  progress.setImportPosition(0, bytesTotal);

  DexDataset* dataset = data->getCurDataset();
  LineSplitter splitter(layout);
  PointBuilder builder(data, layout);
  CVynStringT<wchar_t> line;
  std::uint64_t charactersRead = 0;
  int lineNumber = 0;
  int points = 0;
  int skipped = 0;
  bool firstLine = true;
  while (file.ReadString(line)) {
    ++lineNumber;
    charactersRead += static_cast<std::uint64_t>(line.GetLength()) + 1;
    if (lineNumber % kStopCheckLines == 0 && DexData::stopProcess_) return DEX_RESULT_STOPPED;
    if (lineNumber % kProgressLines == 0)
      progress.setImportPosition(std::min(charactersRead, bytesTotal), bytesTotal);
    if (isBlankText(line.view())) continue;

    const std::vector<std::wstring_view>& values = splitter.split(line);
    if (firstLine) {
      firstLine = false;
      if (isHeaderLine(layout, values)) continue;
    }
    const wchar_t* reason = L"";
    std::unique_ptr<DexDesignPoint> point = builder.build(values, reason);
    if (!point) {
      if (++skipped <= kTracedSkippedLines)
        VYN_TRACE_ALWAYS(L"%ls(%d): line skipped, %ls", fileName.GetString(), lineNumber, reason);
      continue;
    }
    dataset->add(point.release());
    ++points;
  }
  progress.setImportPosition(bytesTotal, bytesTotal);
  if (DexData::stopProcess_) return DEX_RESULT_STOPPED;
  if (skipped == 0) return DEX_RESULT_OK;
  VYN_TRACE_ALWAYS(L"%ls: %d malformed lines skipped, %d points read", fileName.GetString(), skipped, points);
  return points > 0 ? kResultLinesSkipped : DEX_RESULT_WRONG_FORMAT;
}

}  // namespace vyn::ie::point_files
