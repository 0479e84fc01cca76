#pragma once
// TEMPORARY STUB: stands in for the dataset until it lands.
#include <vector>
#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEObjectBase.h"
namespace vyn::ie {
class DexCodeDescription;
class DEX_API DexDataset : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR
  explicit DexDataset(const CVynStringT<wchar_t>& name, int slots = 0, bool index = false);
  ~DexDataset() override;
  DexDataset(const DexDataset&) = delete;
  void setName(const CVynStringT<wchar_t>& n) override { name_ = n; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  bool add(DexObject* o);
  DexObject* getObjectAt(int i) noexcept;
  const DexObject* getObjectAt(int i) const noexcept;
  int getNumberOfElements(int kind, int state, bool p = false, bool l = false) const;
  bool isCodesExist() const noexcept { return codes_; }
  bool isObjectWithoutCodes() const noexcept { return noCodes_; }
  bool isCodeDefinitionUsed(const DexCodeDescription* d) const;
  void copyIEObjectsWithTheCodeToTheNewDataset(DexDataset* target, const CVynStringT<wchar_t>& code) const;

 private:
  CVynStringT<wchar_t> name_;
  std::vector<DexObject*> objects_;
  bool codes_ = false, noCodes_ = false;
};
}  // namespace vyn::ie
