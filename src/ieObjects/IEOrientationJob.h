#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"

// Image-orientation jobs of a dataset.
//
// So far a job is here with its name only; its orientation sessions and stereo pairs are still to come.
namespace vyn::ie {

// A group of orientation sessions and stereo pairs of images. A dataset owns its jobs.
//
// Not copyable: it will own its sessions and pairs.
class DEX_API DexOrientationJob : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // Empty name.
  DexOrientationJob();
  DexOrientationJob(const DexOrientationJob&) = delete;
  DexOrientationJob& operator=(const DexOrientationJob&) = delete;
  ~DexOrientationJob() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

 private:
  CVynStringT<wchar_t> name_;
};

}  // namespace vyn::ie
