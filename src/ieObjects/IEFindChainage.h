#pragma once

#include <memory>
#include <vector>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IETypedValues.h"

// Road survey results that travel with a dataset: find-chainage reports (for surveyed points, their
// position relative to a named road) and surveyed cross-section points. Plug-ins fill and read them;
// the library computes nothing from them.
namespace vyn::ie {

class DexCodeDescription;

// The record of one surveyed point: seven values the plug-ins give their meaning, of which kind 5 is
// the cut value, and the point's name. The virtual operations keep their order: destructor, setData,
// getData, setPtName, getPtName.
class DEX_API DexFindChainage {
 public:
  VYN_CLASS_ALLOCATOR

  // The kinds of the record; only CUT is read by the record itself.
  enum EFCDataType : int {
    FC_VALUE_0 = 0,
    FC_VALUE_1 = 1,
    FC_VALUE_2 = 2,
    FC_VALUE_3 = 3,
    FC_VALUE_4 = 4,
    CUT = 5,
    FC_VALUE_6 = 6,
  };

  // Every value 0.0, no cut, no name.
  DexFindChainage() = default;
  DexFindChainage(const DexFindChainage&) = default;
  DexFindChainage& operator=(const DexFindChainage&) = default;
  virtual ~DexFindChainage();

  // A kind outside 0 to 6 is ignored and reads as 0.0. Setting the cut (kind 5), whatever the value,
  // marks it used for good.
  virtual void setData(int kind, double value);
  virtual double getData(int kind) const { return data_.get(kind); }
  virtual void setPtName(const CVynStringT<wchar_t>& name) { ptName_ = name; }
  virtual const CVynStringT<wchar_t>& getPtName() const { return ptName_; }

  bool isCutUsed() const noexcept { return cutUsed_; }

 private:
  DexTypedValues<EFCDataType, 7> data_;
  bool cutUsed_ = false;
  CVynStringT<wchar_t> ptName_;
};

// The find-chainage records of a road named by roadName, in order of addition. The report owns its
// records; copies duplicate them.
class DEX_API DexFindChainageReport {
 public:
  VYN_CLASS_ALLOCATOR

  DexFindChainageReport();
  DexFindChainageReport(const DexFindChainageReport& other);
  DexFindChainageReport& operator=(const DexFindChainageReport& other);
  virtual ~DexFindChainageReport();

  // Appends record and takes ownership. A null record is kept as an entry too (readers skip null
  // entries), so the indexes of a report match the points of the file it was read from.
  void addFindChainage(DexFindChainage* record);
  int getNumberOfFindChainages() const noexcept { return static_cast<int>(findChainages_.size()); }
  // The record at index, or null outside the list (or for a null entry).
  DexFindChainage* getFindChainageAt(int index) noexcept;
  const DexFindChainage* getFindChainageAt(int index) const noexcept;

  const CVynStringT<wchar_t>& getRoadName() const noexcept { return roadName_; }
  void setRoadName(const CVynStringT<wchar_t>& roadName) { roadName_ = roadName; }

 private:
  std::vector<std::unique_ptr<DexFindChainage>> findChainages_;
  CVynStringT<wchar_t> roadName_;
};

// One surveyed cross-section point: three values the plug-ins give their meaning and the code
// description of the point, which belongs to the code library (not owned). The virtual operations keep
// their order: destructor, setData, getData.
class DEX_API DexSurveyXSection {
 public:
  VYN_CLASS_ALLOCATOR

  // The kinds of the record; the library reads none of them.
  enum ESXSDataType : int {
    SXS_VALUE_0 = 0,
    SXS_VALUE_1 = 1,
    SXS_VALUE_2 = 2,
  };

  // Every value 0.0, no code description.
  DexSurveyXSection();
  DexSurveyXSection(const DexSurveyXSection&) = default;
  DexSurveyXSection& operator=(const DexSurveyXSection&) = default;
  virtual ~DexSurveyXSection();

  // A kind outside 0 to 2 is ignored and reads as 0.0.
  virtual void setData(int kind, double value) { data_.set(kind, value); }
  virtual double getData(int kind) const { return data_.get(kind); }

  DexCodeDescription* getCodeDescription() const noexcept { return codeDescription_; }
  void setCodeDescription(DexCodeDescription* codeDescription) noexcept {
    codeDescription_ = codeDescription;
  }

 private:
  DexTypedValues<ESXSDataType, 3> data_;
  DexCodeDescription* codeDescription_ = nullptr;
};

}  // namespace vyn::ie
