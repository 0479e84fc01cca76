#include "ieObjects/IERawData.h"

#include <algorithm>
#include <array>

#include "ieObjects/IETSRawRecords.h"
#include "ieObjects/detail/RawDataNameIndex.h"
#include "ieUtils/IENaturalNames.h"

namespace vyn::ie {
namespace {

using ERawDataType = IDexRawDataInterface::ERawDataType;

bool isActiveShot(const IDexRawDataInterface& record) {
  const auto* const sight = dynamic_cast<const DexTSRawDataSightInterface*>(&record);
  if (sight == nullptr) return false;
  const EDexTSRawDataType type = sight->getType();
  return (type == TS_RAW_FORESIGHT || type == TS_RAW_SIDESHOT) &&
         sight->getStateType() == IDexStateInterface::ACTIVE_STATE;
}

// The query kinds a record kind answers: each kind its own, and the combined kind 4 the GNSS and the
// level queries besides.
bool answersKind(ERawDataType recordKind, ERawDataType type) {
  switch (recordKind) {
    case IDexRawDataInterface::RAW_DATA_TOTAL_STATION:
      return type == IDexRawDataInterface::RAW_DATA_TOTAL_STATION ||
             type == IDexRawDataInterface::RAW_DATA_GNSS_AND_LEVEL;
    case IDexRawDataInterface::RAW_DATA_GNSS:
    case IDexRawDataInterface::RAW_DATA_DIGITAL_LEVEL:
      return type == recordKind || type == IDexRawDataInterface::RAW_DATA_GNSS_AND_LEVEL;
    case IDexRawDataInterface::RAW_DATA_GNSS_AND_LEVEL:
      return type == IDexRawDataInterface::RAW_DATA_GNSS ||
             type == IDexRawDataInterface::RAW_DATA_DIGITAL_LEVEL ||
             type == IDexRawDataInterface::RAW_DATA_GNSS_AND_LEVEL;
    default:
      return false;  // notes, and kinds the library does not know
  }
}

// The kind rules of findRawData, without the name.
auto kindMatch(ERawDataType type, bool onlyActiveSights) {
  return [type, onlyActiveSights](const IDexRawDataInterface& record) {
    const ERawDataType kind = record.getRawDataType();
    if (!answersKind(kind, type)) return false;
    return kind != IDexRawDataInterface::RAW_DATA_TOTAL_STATION || !onlyActiveSights || isActiveShot(record);
  };
}

bool isSet(const base::CTime& time) {
  return time != base::CTime();
}

// The earlier (later) of two times, a time that is not set counting as none.
base::CTime earlierOf(const base::CTime& a, const base::CTime& b) {
  return !isSet(b) || (isSet(a) && a < b) ? a : b;
}
base::CTime laterOf(const base::CTime& a, const base::CTime& b) {
  return !isSet(b) || (isSet(a) && a > b) ? a : b;
}

// The first set time in list order and the latest time of one kind of records.
struct TimeRange {
  base::CTime first;
  base::CTime latest;

  void add(const base::CTime& time) {
    if (!isSet(first)) first = time;
    latest = laterOf(latest, time);
  }
};

// A record's own time and, for a station, the times of its resections' shots.
void addTimesOf(const IDexRawDataInterface& record, TimeRange& range) {
  range.add(record.getTime());
  const auto* const station = dynamic_cast<const DexTSRawStn*>(&record);
  if (station == nullptr) return;
  for (int r = 0; r < station->getNumberOfTSRawResections(); ++r) {
    const DexTSRawResection* const resection = station->getTSRawResectionAt(r);
    for (int s = 0; s < resection->getNumberOfTSResShots(); ++s)
      range.add(resection->getTSResShotAt(s)->getTime());
  }
}

IDexTSRawDataInterface* asTotalStation(IDexRawDataInterface* record) {
  if (record == nullptr || record->getRawDataType() != IDexRawDataInterface::RAW_DATA_TOTAL_STATION)
    return nullptr;
  return dynamic_cast<IDexTSRawDataInterface*>(record);
}

}  // namespace

// Out of line so that each class has one virtual table and type identity, in the library.
IDexRawDataInterface::~IDexRawDataInterface() = default;

DexRawNote::~DexRawNote() = default;

DexRawData::DexRawData() : index_(new detail::RawDataNameIndex()) {}

DexRawData::~DexRawData() = default;

// ---- The list -------------------------------------------------------------------------------------

void DexRawData::addRawData(IDexRawDataInterface* record) {
  insertRawData(getNumberOfRawData(), record);
}

bool DexRawData::insertRawData(int index, IDexRawDataInterface* record) {
  if (record == nullptr || isHeld(*record) || !records_.insert(index, record)) return false;
  index_->insert(index, record->getName());
  return true;
}

bool DexRawData::removeRawData(int index) {
  if (!records_.remove(index)) return false;
  index_->remove(index);
  return true;
}

IDexRawDataInterface* DexRawData::detachRawData(int index) {
  IDexRawDataInterface* const record = records_.detach(index);
  if (record != nullptr) index_->remove(index);
  return record;
}

int DexRawData::getNumberOfRawData() const noexcept {
  return records_.count();
}

void DexRawData::reindexRawData() {
  index_->clear();
  index_->reserve(records_.count());
  for (const IDexRawDataInterface* const record : records_)
    index_->append(record->getName());
}

bool DexRawData::isHeld(const IDexRawDataInterface& record) const {
  return findFirstIndex(record.getName(),
                        [&record](const IDexRawDataInterface& held) { return &held == &record; }) >= 0;
}

// ---- Searches by name -----------------------------------------------------------------------------

IDexRawDataInterface* DexRawData::findRawData(IDexRawDataInterface::ERawDataType type,
                                              const CVynStringT<wchar_t>& name, bool onlyActiveSights,
                                              bool lastOnly) const {
  const auto match = kindMatch(type, onlyActiveSights);
  if (lastOnly) {
    const IDexRawDataInterface* const last = records_.at(records_.count() - 1);
    const bool matches = last != nullptr && last->getName() == name && match(*last);
    return matches ? const_cast<IDexRawDataInterface*>(last) : nullptr;
  }
  return const_cast<IDexRawDataInterface*>(records_.at(findLastIndex(name, match)));
}

IDexRawDataInterface* DexRawData::findFirstRawData(IDexRawDataInterface::ERawDataType type,
                                                   const CVynStringT<wchar_t>& name,
                                                   bool onlyActiveSights) const {
  return const_cast<IDexRawDataInterface*>(
      records_.at(findFirstIndex(name, kindMatch(type, onlyActiveSights))));
}

int DexRawData::firstIndexOfName(const CVynStringT<wchar_t>& name) const {
  return index_->first(name);
}

int DexRawData::lastIndexOfName(const CVynStringT<wchar_t>& name) const {
  return index_->last(name);
}

int DexRawData::nextIndexOfName(int index) const noexcept {
  return index_->next(index);
}

int DexRawData::previousIndexOfName(int index) const noexcept {
  return index_->previous(index);
}

// ---- Names and times ------------------------------------------------------------------------------

void DexRawData::getMaxNumericRawDataName(utils::FreeNumericNames& names) const {
  for (const IDexRawDataInterface* const record : records_)
    names.addObject(record->getName());
  names.init();
}

bool DexRawData::getRawTime(base::CTime& first, base::CTime& last) const {
  if (records_.isEmpty()) return false;
  std::array<TimeRange, 3> ranges;  // total station, GNSS, digital level
  for (const IDexRawDataInterface* const record : records_) {
    const int kind = record->getRawDataType();
    if (kind >= 0 && kind < static_cast<int>(ranges.size()))
      addTimesOf(*record, ranges[static_cast<std::size_t>(kind)]);
  }
  first = base::CTime();
  last = base::CTime();
  for (const TimeRange& range : ranges) {
    first = earlierOf(first, range.first);
    last = laterOf(last, range.latest);
  }
  return isSet(first);
}

// ---- Edits ----------------------------------------------------------------------------------------

void DexRawData::addVAToBkbRecords() {
  for (int i = 0; i + 1 < records_.count(); ++i) {
    IDexTSRawDataInterface* const backbearing = asTotalStation(records_.at(i));
    const IDexTSRawDataInterface* const backsight = asTotalStation(records_.at(i + 1));
    if (backbearing == nullptr || backsight == nullptr || backbearing->getType() != TS_RAW_BACKBEARING ||
        backsight->getType() != TS_RAW_BACKSIGHT || backbearing->getTSRawData() == nullptr ||
        backsight->getTSRawData() == nullptr)
      continue;
    DexTSRawData values(*backbearing->getTSRawData());
    values.setTSRawData(DexTSRawData::THIRD_VALUE,
                        backsight->getTSRawData()->getTSRawData(DexTSRawData::SECOND_VALUE));
    backbearing->setTSRawData(&values);
  }
}

}  // namespace vyn::ie
