#include "ieUtils/IERunProgress.h"

#include <algorithm>

namespace vyn::ie {
namespace {

// Relaxed order is enough for the figures: each stands alone, and the run's end reaches the host through
// the thread handle or the notifier, which order everything written before them.
constexpr auto kOrder = std::memory_order_relaxed;

std::uint64_t packSteps(int currentStep, int numberOfSteps) noexcept {
  return (std::uint64_t{static_cast<std::uint32_t>(currentStep)} << 32) |
         std::uint64_t{static_cast<std::uint32_t>(numberOfSteps)};
}

int currentStepOf(std::uint64_t packed) noexcept {
  return static_cast<int>(static_cast<std::int32_t>(static_cast<std::uint32_t>(packed >> 32)));
}

int numberOfStepsOf(std::uint64_t packed) noexcept {
  return static_cast<int>(static_cast<std::int32_t>(static_cast<std::uint32_t>(packed)));
}

double clampedRatio(double done, double total) noexcept {
  return std::clamp(done / total, 0.0, 1.0);
}

}  // namespace

DexRunProgress::DexRunProgress() noexcept {
  assign(Snapshot());
}

DexRunProgress::DexRunProgress(const DexRunProgress& other) noexcept {
  assign(other.get());
}

DexRunProgress& DexRunProgress::operator=(const DexRunProgress& other) noexcept {
  if (this != &other) assign(other.get());
  return *this;
}

void DexRunProgress::begin(ERunKind kind) noexcept {
  Snapshot figures;
  figures.kind = kind;
  assign(figures);
}

void DexRunProgress::setImportPosition(std::uint64_t bytesRead, std::uint64_t bytesTotal) noexcept {
  bytesTotal_.store(bytesTotal, kOrder);
  bytesRead_.store(bytesRead, kOrder);
}

void DexRunProgress::setExportStep(int currentStep, int numberOfSteps) noexcept {
  steps_.store(packSteps(currentStep, numberOfSteps), kOrder);
}

DexRunProgress::Snapshot DexRunProgress::get() const noexcept {
  Snapshot figures;
  figures.kind = static_cast<ERunKind>(kind_.load(std::memory_order_acquire));
  const std::uint64_t steps = steps_.load(kOrder);
  figures.currentStep = currentStepOf(steps);
  figures.numberOfSteps = numberOfStepsOf(steps);
  figures.bytesRead = bytesRead_.load(kOrder);
  figures.bytesTotal = bytesTotal_.load(kOrder);
  return figures;
}

double DexRunProgress::getFraction() const noexcept {
  const Snapshot figures = get();
  switch (figures.kind) {
    case EXPORT_RUN:
      if (figures.numberOfSteps <= 0) return -1.0;
      return clampedRatio(static_cast<double>(figures.currentStep) + 1.0, figures.numberOfSteps);
    case IMPORT_RUN:
      if (figures.bytesTotal == 0) return -1.0;
      return clampedRatio(static_cast<double>(figures.bytesRead), static_cast<double>(figures.bytesTotal));
    default:
      return -1.0;
  }
}

// The kind goes last and is read first (release, acquire), so that a reader who sees a new run also sees
// its figures reset.
void DexRunProgress::assign(const Snapshot& figures) noexcept {
  steps_.store(packSteps(figures.currentStep, figures.numberOfSteps), kOrder);
  bytesRead_.store(figures.bytesRead, kOrder);
  bytesTotal_.store(figures.bytesTotal, kOrder);
  kind_.store(figures.kind, std::memory_order_release);
}

}  // namespace vyn::ie
