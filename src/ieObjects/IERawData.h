#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"

// The raw observations of a dataset: the common interface of every raw record, the free note, and the
// list of records in recording order. Total-station records are in IETSRawData.h, GNSS records in
// IEGPSRawData.h.
namespace vyn::ie {

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

// The raw records of a dataset in recording order. The list owns its records and deletes them with
// itself; it is not copied (a copy would have to share them).
class DEX_API DexRawData {
 public:
  VYN_CLASS_ALLOCATOR

  DexRawData();
  DexRawData(const DexRawData&) = delete;
  DexRawData& operator=(const DexRawData&) = delete;
  virtual ~DexRawData();

  // Appends record and takes ownership; a null record is ignored.
  void addRawData(IDexRawDataInterface* record) { records_.add(record); }
  int getNumberOfRawData() const noexcept { return records_.count(); }
  // The record at index, or null when index is outside the list. The list keeps ownership.
  IDexRawDataInterface* getRawDataAt(int index) noexcept { return records_.at(index); }
  const IDexRawDataInterface* getRawDataAt(int index) const noexcept { return records_.at(index); }

 private:
  DexOwningList<IDexRawDataInterface> records_;
};

}  // namespace vyn::ie
