#pragma once

#include <atomic>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"

// How far a running import or export has come, for a progress display.

namespace vyn::ie {

// The progress of the run that works on a data container, written by the run's thread and read by any
// other. Every data container holds one (DexData::getProgress()), so importers and exporters, which
// know the container, publish to it, and the host polls the container it handed to the run.
//
// Who writes what:
//  - the run functions start every run with begin() (the loader also does, before a worker starts, so
//    that a host polling right after the start never sees the previous run's figures);
//  - importers call setImportPosition(bytesRead, bytesTotal) as they read their file;
//  - the export driver (DexExporterImpl::doExport) calls setExportStep after every step.
//
// Thread safety: every figure is an atomic value, so the host may poll while a worker writes, which is
// the one exception (with DexData::stopProcess_) to the rule that a host leaves a running container
// alone. The step pair is published as one value and always reads consistently; the two byte counts
// are separate values, so a snapshot taken while an importer changes its total may pair a new position
// with the old total (getFraction() clamps, so a display never goes past 100 %).
class DEX_API DexRunProgress {
 public:
  VYN_CLASS_ALLOCATOR

  enum ERunKind : std::int32_t {
    NO_RUN = 0,
    IMPORT_RUN = 1,
    EXPORT_RUN = 2,
  };

  // The figures at one moment.
  struct Snapshot {
    ERunKind kind = NO_RUN;
    int currentStep = -2;  // the export step last carried out, as DexExporterImpl counts it
    int numberOfSteps = 0;
    std::uint64_t bytesRead = 0;
    std::uint64_t bytesTotal = 0;
  };

  // No run yet: kind NO_RUN, step -2 of 0, 0 of 0 bytes.
  DexRunProgress() noexcept;
  // Copies take the figures of the moment.
  DexRunProgress(const DexRunProgress& other) noexcept;
  DexRunProgress& operator=(const DexRunProgress& other) noexcept;

  // ---- Written by the run ---------------------------------------------------------------------------
  // A new run of that kind: every figure back to its start value.
  void begin(ERunKind kind) noexcept;
  // The importer has read bytesRead of bytesTotal bytes (0 when it does not know the total).
  void setImportPosition(std::uint64_t bytesRead, std::uint64_t bytesTotal) noexcept;
  // The export has carried out the step currentStep (counted from 0) of numberOfSteps.
  void setExportStep(int currentStep, int numberOfSteps) noexcept;

  // ---- Read by the host -----------------------------------------------------------------------------
  Snapshot get() const noexcept;
  // The part done, from 0 to 1: for an export (currentStep + 1) / numberOfSteps, for an import
  // bytesRead / bytesTotal, each clamped to [0, 1]. Negative when the run has not said how far it has
  // to go (no steps, no byte total, no run).
  double getFraction() const noexcept;

 private:
  void assign(const Snapshot& figures) noexcept;

  std::atomic<std::int32_t> kind_;
  std::atomic<std::uint64_t> steps_;  // current step in the high half, number of steps in the low half
  std::atomic<std::uint64_t> bytesRead_;
  std::atomic<std::uint64_t> bytesTotal_;
};

}  // namespace vyn::ie
