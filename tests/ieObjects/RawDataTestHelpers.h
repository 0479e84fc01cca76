#pragma once

#include <initializer_list>

#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IEDLRawData.h"
#include "ieObjects/IEGPSRawData.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IETSRawData.h"
#include "ieObjects/IETSRawRecords.h"

// Raw records for the tests of the raw data and of the dataset's walks over it.
namespace raw_test {

// A total-station record of any kind, name and name source: the common base on its own.
class TestTSRecord : public vyn::ie::IDexTSRawDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  explicit TestTSRecord(vyn::ie::EDexTSRawDataType type, const wchar_t* name = L"", int nameSource = 0)
      : type_(type) {
    setName(name);
    setNameSource(nameSource);
  }

  vyn::ie::EDexTSRawDataType getType() const override { return type_; }
  IDexTSRawDataInterface* clone() const override {
    auto* const copy = new TestTSRecord(type_);
    copyData(copy);
    return copy;
  }

 private:
  vyn::ie::EDexTSRawDataType type_;
};

// A digital-level sight with a name.
class TestLevelRecord : public vyn::ie::DexDLRawDataSight {
 public:
  VYN_CLASS_ALLOCATOR

  explicit TestLevelRecord(const wchar_t* name) { setName(name); }
};

// A new record of class T (default-constructed) named name.
template <class T>
T* named(const wchar_t* name) {
  auto* const record = new T();
  record->setName(name);
  return record;
}

// A sight of class T named name in the given state.
template <class T>
T* sight(const wchar_t* name, vyn::ie::IDexStateInterface::ECurrentState state) {
  T* const record = named<T>(name);
  record->setStateType(state);
  return record;
}

// A GNSS position named name of raw kind kind.
inline vyn::ie::DexGpsPosition* position(const wchar_t* name, int kind = 1) {
  auto* const record = named<vyn::ie::DexGpsPosition>(name);
  record->setRawDataType(kind);
  return record;
}

// Measured values of the given contents, values in place order.
inline vyn::ie::DexTSRawData values(std::initializer_list<double> places, int contents = 0) {
  vyn::ie::DexTSRawData data(contents);
  int place = 0;
  for (const double value : places)
    data.setTSRawData(place++, value);
  return data;
}

// A local time on the test day.
inline base::CTime at(int hour, int minute) {
  return base::CTime(2024, 5, 14, hour, minute, 0);
}

// Record with its time set.
template <class Record>
Record* timed(Record* record, const base::CTime& time) {
  record->setTime(time);
  return record;
}

}  // namespace raw_test
