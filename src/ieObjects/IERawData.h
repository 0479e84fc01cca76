#pragma once

#include <cstdint>
#include <memory>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"

// The raw observations of a dataset: the common interface of every raw record, the free note, and the
// list of records in recording order with its searches. Total-station records are in IETSRawData.h and
// IETSRawRecords.h, GNSS records in IEGPSRawData.h, digital-level records in IEDLRawData.h.
namespace vyn::ie {

namespace utils {
class FreeNumericNames;
}
namespace detail {
class RawDataNameIndex;
}

// A raw record: a name, a time stamp and its kind. Total-station sights, GNSS positions,
// digital-level sights and notes implement it.
//
// The virtual table after the destructor: setName, getName, getRawDataType (the plug-in ABI); the time
// interface has its own table.
class DEX_API IDexRawDataInterface : public IDexNameInterface, public IDexTimeInterface {
 public:
  // The kind of a record.
  enum ERawDataType : std::int32_t {
    RAW_DATA_TOTAL_STATION = 0,
    RAW_DATA_GNSS = 1,
    RAW_DATA_DIGITAL_LEVEL = 2,
    RAW_DATA_NOTE = 3,
    RAW_DATA_GNSS_AND_LEVEL = 4,  // a GNSS position that GNSS and level queries both find
  };

  ~IDexRawDataInterface() override;

  virtual ERawDataType getRawDataType() const = 0;

 protected:
  IDexRawDataInterface() = default;
  IDexRawDataInterface(const IDexRawDataInterface&) = default;
  IDexRawDataInterface& operator=(const IDexRawDataInterface&) = default;
};

// A free text record among the observations; its name is the text.
class DEX_API DexRawNote : public IDexRawDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // Empty text, empty time.
  DexRawNote() = default;
  DexRawNote(const DexRawNote&) = default;
  DexRawNote& operator=(const DexRawNote&) = default;
  ~DexRawNote() override;

  void setName(const CVynStringT<wchar_t>& text) override { text_ = text; }
  const CVynStringT<wchar_t>& getName() const override { return text_; }
  // RAW_DATA_NOTE.
  ERawDataType getRawDataType() const override { return RAW_DATA_NOTE; }
  void setTime(const base::CTime& time) override { time_ = time; }
  const base::CTime& getTime() const override { return time_; }

 private:
  base::CTime time_;
  CVynStringT<wchar_t> text_;
};

// The raw records of a dataset in recording order: total-station, GNSS and digital-level records and
// notes. The list owns its records and deletes them with itself; it is not copied (a copy would have
// to share them).
//
// The searches by name use an index of the records' names, so that an importer may look up every
// record it reads without walking the job: their answers are those of a walk over the list in
// recording order. The index files a record under the name it has when it is added; a record renamed
// while the list holds it is refiled by reindexRawData() (until then it is found under neither name).
class DEX_API DexRawData {
 public:
  VYN_CLASS_ALLOCATOR

  DexRawData();
  DexRawData(const DexRawData&) = delete;
  DexRawData& operator=(const DexRawData&) = delete;
  virtual ~DexRawData();

  // ---- The list -------------------------------------------------------------------------------
  // Appends record and takes ownership. A null record is ignored; a record the list holds already is
  // not added again.
  void addRawData(IDexRawDataInterface* record);
  // Inserts record before index (count appends) and takes ownership: true. Declined (false; the
  // caller keeps record) for null, for an index outside 0 to count and for a record held already.
  bool insertRawData(int index, IDexRawDataInterface* record);
  // Deletes the record at index and closes the gap: true; false for an index outside the list.
  bool removeRawData(int index);
  // Takes the record at index out of the list without deleting it: the caller owns the result. Null
  // for an index outside the list.
  IDexRawDataInterface* detachRawData(int index);
  int getNumberOfRawData() const noexcept;
  // The record at index, or null when index is outside the list. The list keeps ownership.
  IDexRawDataInterface* getRawDataAt(int index) noexcept { return records_.at(index); }
  const IDexRawDataInterface* getRawDataAt(int index) const noexcept { return records_.at(index); }
  // Files every record again under its current name, after records were renamed.
  void reindexRawData();

  // ---- Searches by name -----------------------------------------------------------------------
  // The last record in recording order named exactly name that matches type, or null:
  // - notes never match, nor does a query for RAW_DATA_NOTE;
  // - a GNSS record (kind 1 or 4) matches a query for 1 or 4, a digital-level record (kind 2 or 4) a
  //   query for 2 or 4, and a total-station record (kind 0) a query for 0 or 4;
  // - with onlyActiveSights a total-station record matches only when it is a foresight or sideshot
  //   in ACTIVE_STATE.
  // With lastOnly only the last record of the list is looked at.
  IDexRawDataInterface* findRawData(IDexRawDataInterface::ERawDataType type, const CVynStringT<wchar_t>& name,
                                    bool onlyActiveSights, bool lastOnly) const;
  // As findRawData without lastOnly, for the first record in recording order.
  IDexRawDataInterface* findFirstRawData(IDexRawDataInterface::ERawDataType type,
                                         const CVynStringT<wchar_t>& name, bool onlyActiveSights) const;
  // The index of the first (last) record in recording order named exactly name for which
  // match(const IDexRawDataInterface&) is true, or -1. Only the records of that name are looked at.
  template <class Match>
  int findFirstIndex(const CVynStringT<wchar_t>& name, Match match) const {
    for (int i = firstIndexOfName(name); i >= 0; i = nextIndexOfName(i)) {
      if (isNamedMatch(i, name, match)) return i;
    }
    return -1;
  }
  template <class Match>
  int findLastIndex(const CVynStringT<wchar_t>& name, Match match) const {
    for (int i = lastIndexOfName(name); i >= 0; i = previousIndexOfName(i)) {
      if (isNamedMatch(i, name, match)) return i;
    }
    return -1;
  }

  // ---- Names and times ------------------------------------------------------------------------
  // Hands every record's name to names.addObject, then calls names.init().
  void getMaxNumericRawDataName(utils::FreeNumericNames& names) const;
  // The time range of the total-station, GNSS and digital-level records (the shots of a station's
  // resections count with the station; notes and kind 4 records do not): first is the earliest of the
  // three kinds' first set times in list order, last the latest time of any of them. True when some
  // record carries a time; first and last are then set, and the empty time when none does. An empty
  // list answers false and leaves both alone.
  bool getRawTime(base::CTime& first, base::CTime& last) const;

  // ---- Edits ----------------------------------------------------------------------------------
  // Gives each backbearing that a backsight follows (both with measured values) the backsight's
  // vertical angle: value 2 of the backbearing's values becomes value 1 of the backsight's.
  void addVAToBkbRecords();

 private:
  int firstIndexOfName(const CVynStringT<wchar_t>& name) const;
  int lastIndexOfName(const CVynStringT<wchar_t>& name) const;
  int nextIndexOfName(int index) const noexcept;
  int previousIndexOfName(int index) const noexcept;
  // True when the list holds record (looked for among the records of its current name).
  bool isHeld(const IDexRawDataInterface& record) const;

  template <class Match>
  bool isNamedMatch(int index, const CVynStringT<wchar_t>& name, Match& match) const {
    const IDexRawDataInterface* const record = records_.at(index);
    return record != nullptr && record->getName() == name && match(*record);
  }

  DexOwningList<IDexRawDataInterface> records_;
  std::unique_ptr<detail::RawDataNameIndex> index_;
};

}  // namespace vyn::ie
