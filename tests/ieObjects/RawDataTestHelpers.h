#pragma once

#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IETSRawData.h"

// Raw records for the tests of the raw data and of the dataset's walks over it: a total-station record
// of any kind and a stand-in for a digital-level sight.
namespace raw_test {

// A total-station record of the given kind, name and name source.
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

// A record that reports itself as a digital-level sight.
class TestLevelRecord : public vyn::ie::IDexRawDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  explicit TestLevelRecord(const wchar_t* name) : name_(name) {}

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  ERawDataType getRawDataType() const override { return RAW_DATA_DIGITAL_LEVEL; }
  void setTime(const base::CTime& time) override { time_ = time; }
  const base::CTime& getTime() const override { return time_; }

 private:
  CVynStringT<wchar_t> name_;
  base::CTime time_;
};

}  // namespace raw_test
