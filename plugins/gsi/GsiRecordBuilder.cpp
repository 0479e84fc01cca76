#include "GsiRecordBuilder.h"

#include <algorithm>
#include <memory>

#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IETSRawRecords.h"
#include "ieUtils/IEUtilsUnits.h"

namespace vyn::ie::gsi {

namespace {

constexpr std::wstring_view kNotesSeparator = L"; ";
// Decimals of the values a note keeps: enough for the last place of every unit digit.
constexpr int kNoteDecimals = 5;

std::wstring indexText(int index) {
  return std::to_wstring(index);
}

DexTSRawData valuesOf(int contents, double first, double second, double third) {
  DexTSRawData values(contents);
  values.setTSRawData(DexTSRawData::FIRST_VALUE, first);
  values.setTSRawData(DexTSRawData::SECOND_VALUE, second);
  values.setTSRawData(DexTSRawData::THIRD_VALUE, third);
  return values;
}

}  // namespace

GsiRecordBuilder::GsiRecordBuilder(DexData& data, DexDataset& dataset, bool withRaw, bool withPoints,
                                   double metersPerFoot)
    : data_(data),
      dataset_(dataset),
      withRaw_(withRaw),
      withPoints_(withPoints),
      metersPerFoot_(metersPerFoot),
      codes_(&data) {}

bool GsiRecordBuilder::add(const std::vector<GsiWord>& words, std::vector<GsiBadWord>& bad) {
  values_.fill(kNoValue);
  name_ = {};
  named_ = false;
  codeTexts_.clear();
  kept_.clear();
  for (const GsiWord& word : words)
    collect(word, bad);
  tally_.badWords += static_cast<int>(bad.size());

  using namespace word;
  const bool observed = has(kHorizontalAngle) || has(kVerticalAngle) || has(kSlopeDistance) ||
                        has(kHorizontalDistance) || has(kHeightDifference);
  const bool located = has(kEasting) || has(kNorthing) || has(kHeight);
  const bool station = has(kStationEasting) || has(kStationNorthing) || has(kStationHeight) ||
                       (has(kInstrumentHeight) && !observed && !located);
  if (station) {
    addStation();
  } else if (observed) {
    addShot();
  }
  if (located && named_) addPoint();
  if (station || observed || (located && named_)) return true;
  if (!named_ && codeTexts_.empty() && kept_.empty()) {
    if (!bad.empty()) ++tally_.emptyLines;
    return false;
  }
  addNote(words);
  return true;
}

void GsiRecordBuilder::collect(const GsiWord& word, std::vector<GsiBadWord>& bad) {
  double number = 0.0;
  const wchar_t* why = nullptr;
  switch (kindOf(word.index)) {
    case EWordKind::TEXT:
      if (word.index == word::kPointNumber) {
        name_ = textOf(word);
        named_ = true;
      } else if (word.index == word::kCode || word.index == word::kPointCode) {
        codeTexts_.push_back(textOf(word));
      } else {
        keepText(indexText(word.index), textOf(word));
      }
      return;
    case EWordKind::ANGLE:
      why = angleOf(word, number);
      break;
    case EWordKind::DISTANCE:
      why = distanceOf(word, metersPerFoot_, number);
      break;
    case EWordKind::PRISM_CONSTANT:
      why = prismConstantOf(word, number);
      break;
    case EWordKind::PPM:
      why = ppmOf(word, number);
      if (why == nullptr) keepText(L"ppm", utils::doubleToString(number, -1).view());
      return;
    case EWordKind::UNKNOWN:
      countUnknown(word.index);
      return;
  }
  if (why != nullptr) {
    bad.push_back({word.column, why});
    return;
  }
  values_[static_cast<std::size_t>(word.index)] = number;
}

void GsiRecordBuilder::keepText(std::wstring_view label, std::wstring_view text) {
  if (text.empty()) return;
  if (!kept_.empty()) kept_ += kNotesSeparator;
  (kept_ += label) += L'=';
  kept_ += text;
}

void GsiRecordBuilder::countUnknown(int index) {
  ++tally_.unknownWords;
  if (std::find(tally_.unknownIndexes.begin(), tally_.unknownIndexes.end(), index) ==
      tally_.unknownIndexes.end())
    tally_.unknownIndexes.push_back(index);
}

DexRawData& GsiRecordBuilder::rawData() {
  if (dataset_.getRawData() == nullptr) dataset_.setRawData(new DexRawData());
  return *dataset_.getRawData();
}

void GsiRecordBuilder::readCodes(DexCodesDataInterface& target) {
  for (const std::wstring_view code : codeTexts_) {
    rejected_.clear();
    if (!codes_.read(code, target, rejected_)) keepText(L"code", rejected_);
  }
}

void GsiRecordBuilder::addStation() {
  using namespace word;
  awaitingBacksight_ = true;
  backsightName_.clear();
  if (has(kReflectorHeight)) reflectorHeight_ = value(kReflectorHeight);
  ++tally_.stations;
  if (!withRaw_) return;
  auto record = std::make_unique<DexTSRawStn>();
  point_files::assignText(text_, name_);
  record->setName(text_);
  record->setIsEmptyName(!named_);
  const DexTSRawData coords = valuesOf(DexTSRawData::CONTENTS_NEU, value(kStationNorthing),
                                       value(kStationEasting), value(kStationHeight));
  record->setTSRawData(&coords);
  record->setTargetHeight(has(kInstrumentHeight) ? value(kInstrumentHeight) : 0.0);
  readCodes(*record);
  if (!kept_.empty()) {
    point_files::assignText(text_, kept_);
    record->setNote(text_);
  }
  rawData().addRawData(record.release());
}

void GsiRecordBuilder::addShot() {
  using namespace word;
  if (has(kReflectorHeight)) reflectorHeight_ = value(kReflectorHeight);
  const bool backsight = awaitingBacksight_ || (!backsightName_.empty() && name_ == backsightName_);
  if (awaitingBacksight_) backsightName_.assign(name_);
  awaitingBacksight_ = false;
  ++(backsight ? tally_.backsights : tally_.sideshots);
  if (!withRaw_) return;

  const double horizontal = value(kHorizontalAngle);
  const bool slope = has(kSlopeDistance);
  const bool level = has(kHorizontalDistance) || has(kHeightDifference);
  DexTSRawData values =
      slope   ? valuesOf(DexTSRawData::CONTENTS_HVS, horizontal, value(kVerticalAngle), value(kSlopeDistance))
      : level ? valuesOf(DexTSRawData::CONTENTS_HVD, horizontal, value(kHorizontalDistance),
                         value(kHeightDifference))
              : valuesOf(DexTSRawData::CONTENTS_HV, horizontal, value(kVerticalAngle), kNoValue);
  if (has(kPrismConstant)) values.setPrismConst(value(kPrismConstant));
  const DexTSRawData second =
      valuesOf(DexTSRawData::CONTENTS_HVD, horizontal, value(kHorizontalDistance), value(kHeightDifference));

  std::unique_ptr<DexTSRawDataSightInterface> record;
  if (backsight) {
    record = std::make_unique<DexTSRawBS>();
    if (slope && level) {
      if (has(kHorizontalDistance))
        keepText(L"32", utils::doubleToString(value(kHorizontalDistance), kNoteDecimals).view());
      if (has(kHeightDifference))
        keepText(L"33", utils::doubleToString(value(kHeightDifference), kNoteDecimals).view());
    }
    for (const std::wstring_view code : codeTexts_)
      keepText(L"code", code);
  } else {
    auto sideshot = std::make_unique<DexTSRawSS>(DexTSRawFS::MEAS_SHOT);
    if (slope && level) sideshot->setSecondData(&second);
    readCodes(*sideshot);
    record = std::move(sideshot);
  }
  point_files::assignText(text_, name_);
  record->setName(text_);
  record->setIsEmptyName(!named_);
  record->setTSRawData(&values);
  record->setTargetHeight(reflectorHeight_);
  if (has(kEasting) || has(kNorthing) || has(kHeight))
    record->setXyz(value(kNorthing), value(kEasting), value(kHeight));
  if (!kept_.empty()) {
    point_files::assignText(text_, kept_);
    record->setNote(text_);
  }
  rawData().addRawData(record.release());
}

void GsiRecordBuilder::addPoint() {
  using namespace word;
  ++tally_.points;
  if (!withPoints_) return;
  auto point = std::make_unique<DexDesignPoint>();
  point_files::assignText(text_, name_);
  point->setName(text_);
  point->setCoords(value(kNorthing), value(kEasting), value(kHeight));
  readCodes(*point);
  if (!kept_.empty()) {
    DexStation station = point->getStation();
    point_files::assignText(text_, kept_);
    station.setNotes(text_);
    point->setStation(station);
  }
  dataset_.add(point.release());
}

void GsiRecordBuilder::addNote(const std::vector<GsiWord>& words) {
  ++tally_.notes;
  if (!withRaw_) return;
  std::wstring text;
  for (const GsiWord& word : words) {
    if (kindOf(word.index) != EWordKind::TEXT) continue;
    if (!text.empty()) text += kNotesSeparator;
    (text += indexText(word.index)) += L'=';
    text += textOf(word);
  }
  auto note = std::make_unique<DexRawNote>();
  point_files::assignText(text_, text);
  note->setName(text_);
  rawData().addRawData(note.release());
}

}  // namespace vyn::ie::gsi
