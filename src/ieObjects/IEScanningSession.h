#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"

// Scanning sessions of a dataset.
//
// So far a session is here with its name only; its scanned points, control points and instrument and
// orientation records are still to come.
namespace vyn::ie {

// One scanning job of an imaging instrument. A dataset owns its sessions.
//
// Not copyable: it will own its points and records.
class DEX_API DexScanningSession : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // Empty name.
  DexScanningSession();
  DexScanningSession(const DexScanningSession&) = delete;
  DexScanningSession& operator=(const DexScanningSession&) = delete;
  ~DexScanningSession() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

 private:
  CVynStringT<wchar_t> name_;
};

}  // namespace vyn::ie
