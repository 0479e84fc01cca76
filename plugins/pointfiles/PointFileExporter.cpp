#include "PointFileExporter.h"

#include <algorithm>

#include "CodeText.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"

namespace vyn::ie::point_files {

namespace {

constexpr int kPointsPerStep = 16384;
constexpr wchar_t kQuote = L'"';

bool needsQuotes(std::wstring_view value, wchar_t delimiter) {
  if (value.empty()) return false;
  const auto isBlank = [](wchar_t ch) { return ch == L' ' || ch == L'\t'; };
  if (isBlank(value.front()) || isBlank(value.back())) return true;
  return std::any_of(value.begin(), value.end(), [delimiter](wchar_t ch) {
    return ch == delimiter || ch == kQuote || ch == L'\r' || ch == L'\n';
  });
}

}  // namespace

PointFileExporter::PointFileExporter(DexData* data, const CVynStringT<wchar_t>& fileName,
                                     const DexFormat* format)
    : DexExporterImpl(data, fileName, format) {}

PointFileExporter::~PointFileExporter() {
  if (file_ != nullptr) std::fclose(file_);
}

int PointFileExporter::getNumberOfSteps() {
  return 2 + (objectCount_ + kPointsPerStep - 1) / kPointsPerStep;
}

bool PointFileExporter::singleStep() {
  if (currentStep < 0) {
    if (!open()) return false;
    currentStep = 0;
    return true;
  }
  if (nextObject_ < objectCount_) {
    if (!writeBlock()) {
      ieResult = DEX_RESULT_FILE_ERROR;
      return false;
    }
    ++currentStep;
    return true;
  }
  if (!close()) ieResult = DEX_RESULT_FILE_ERROR;
  ++currentStep;
  return false;
}

bool PointFileExporter::open() {
  if (data == nullptr || !makeLayout(format, data->getSettings(), false, layout_)) return false;
  const DexSettings& settings = data->getSettings();
  if (!utils::isExportFileWithSameName(fileName, settings.messageBox, settings.parentWindow)) return false;
  file_ = std::fopen(vyn_text::toUtf8(fileName.view()).c_str(), "wb");
  if (file_ == nullptr) return false;
  data->addFileNameToExported(fileName);
  if ((settings.hasDataType(POINTS) || settings.hasDataType(POINT_LISTS)) &&
      data->getNumberOfDatasets() > 0) {
    dataset_ = data->getCurDataset();
    objectCount_ = dataset_ == nullptr ? 0 : dataset_->getNumberOfElements(OBJECT_TYPE_ALL, 2);
  }
  if (layout_.headerLine) writeHeader();
  return true;
}

bool PointFileExporter::writeBlock() {
  const int end = std::min(objectCount_, nextObject_ + kPointsPerStep);
  for (; nextObject_ < end; ++nextObject_) {
    const auto* point = dynamic_cast<const DexDesignPoint*>(dataset_->getObjectAt(nextObject_));
    if (point != nullptr) writePoint(*point);
  }
  return flush();
}

bool PointFileExporter::close() {
  const bool flushed = flush();
  const bool closed = std::fclose(file_) == 0;
  file_ = nullptr;
  return flushed && closed;
}

void PointFileExporter::writeHeader() {
  line_.clear();
  for (std::size_t column = 0; column < layout_.fields.size(); ++column)
    appendValue(column, ascii_fields::typeToField(layout_.fields[column].type).view(), false);
  line_ += L"\r\n";
  vyn_text::appendUtf8(bytes_, line_);
}

void PointFileExporter::writePoint(const DexDesignPoint& point) {
  const DexStation& station = point.getStation();
  const bool horizontal = station.isHorizCoordsDefined();
  // A number column: the value in the layout's units and decimals, or empty when it is undefined.
  const auto appendNumber = [this](std::size_t column, bool defined, double meters, int decimalsIndex) {
    value_.clear();
    if (defined) {
      utils::appendDistByStyle(value_, layout_.units, meters,
                               layout_.decimals[static_cast<std::size_t>(decimalsIndex)]);
    }
    appendValue(column, value_, false);
  };
  line_.clear();
  for (std::size_t column = 0; column < layout_.fields.size(); ++column) {
    switch (columnOf(layout_.fields[column].type)) {
      case EColumn::NAME:
        appendValue(column, point.getName().view(), true);
        break;
      case EColumn::NORTH:
        appendNumber(column, horizontal, station.getX(), 0);
        break;
      case EColumn::EAST:
        appendNumber(column, horizontal, station.getY(), 1);
        break;
      case EColumn::HEIGHT:
        appendNumber(column, station.isHeightDefined(), station.getZ(), 2);
        break;
      case EColumn::GEOID_HEIGHT:
        appendNumber(column, station.isGeoidHeightDefined(), station.getGeoidHeight(), 2);
        break;
      case EColumn::NOTES:
        appendValue(column, station.getNotes().view(), true);
        break;
      case EColumn::CODES:
      case EColumn::CODES_STRINGS:
      case EColumn::CODES_ATTRS:
      case EColumn::FULL_CODES: {
        const EColumn kind = columnOf(layout_.fields[column].type);
        value_.clear();
        appendCodesText(point, kind == EColumn::CODES_STRINGS || kind == EColumn::FULL_CODES,
                        kind == EColumn::CODES_ATTRS || kind == EColumn::FULL_CODES, value_);
        appendValue(column, value_, true);
        break;
      }
      case EColumn::LAYER:
        appendValue(column,
                    point.getLayer() != nullptr ? point.getLayer()->getName().view() : std::wstring_view(),
                    true);
        break;
      case EColumn::OTHER:
        appendValue(column, std::wstring_view(), false);
        break;
    }
  }
  line_ += L"\r\n";
  vyn_text::appendUtf8(bytes_, line_);
}

void PointFileExporter::appendValue(std::size_t column, std::wstring_view value, bool isText) {
  if (layout_.fixedWidth) {
    line_ += ascii_fields::alignByFormat(layout_.fields[column], CVynStringT<wchar_t>(value)).view();
    return;
  }
  if (column > 0) line_ += layout_.delimiter;
  if (!(isText && layout_.quoteAlways) && !needsQuotes(value, layout_.delimiter)) {
    line_ += value;
    return;
  }
  line_ += kQuote;
  for (const wchar_t ch : value) {
    if (ch == kQuote) line_ += kQuote;
    line_ += ch;
  }
  line_ += kQuote;
}

bool PointFileExporter::flush() {
  if (!bytes_.empty() && !writeFailed_) {
    writeFailed_ = std::fwrite(bytes_.data(), 1, bytes_.size(), file_) != bytes_.size();
  }
  bytes_.clear();
  return !writeFailed_;
}

}  // namespace vyn::ie::point_files
