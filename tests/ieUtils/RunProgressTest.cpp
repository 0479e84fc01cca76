#include "ieUtils/IERunProgress.h"

#include <gtest/gtest.h>

#include <atomic>
#include <cstdint>
#include <string>
#include <thread>

namespace {

using vyn::ie::DexRunProgress;

// The figures as "kind step/steps read/total".
std::string figuresOf(const DexRunProgress& progress) {
  const DexRunProgress::Snapshot s = progress.get();
  return std::to_string(s.kind) + " " + std::to_string(s.currentStep) + "/" +
         std::to_string(s.numberOfSteps) + " " + std::to_string(s.bytesRead) + "/" +
         std::to_string(s.bytesTotal);
}

TEST(RunProgress, ExportFractionCountsTheStepsCarriedOutAndImportFractionTheBytesRead) {
  DexRunProgress progress;
  EXPECT_EQ(figuresOf(progress), std::to_string(DexRunProgress::NO_RUN) + " -2/0 0/0");
  EXPECT_LT(progress.getFraction(), 0.0);
  progress.begin(DexRunProgress::EXPORT_RUN);
  EXPECT_LT(progress.getFraction(), 0.0);  // no number of steps yet
  const std::pair<int, double> steps[] = {{0, 0.25}, {3, 1.0}, {9, 1.0}, {-5, 0.0}, {-1, 0.0}};  // clamped
  for (const auto& [step, fraction] : steps) {
    progress.setExportStep(step, 4);
    EXPECT_DOUBLE_EQ(fraction, progress.getFraction()) << step;
  }
  EXPECT_EQ(figuresOf(progress),
            std::to_string(DexRunProgress::EXPORT_RUN) + " -1/4 0/0");  // the sign survives
  progress.begin(DexRunProgress::IMPORT_RUN);
  progress.setImportPosition(300, 0);
  EXPECT_LT(progress.getFraction(), 0.0);  // no total, no fraction
  progress.setImportPosition(250, 1000);
  EXPECT_DOUBLE_EQ(0.25, progress.getFraction());
  const std::uint64_t large = std::uint64_t{1} << 40;  // files beyond 4 GiB
  progress.setImportPosition(large, large * 2);
  EXPECT_DOUBLE_EQ(0.5, progress.getFraction());
  progress.setImportPosition(1200, 1000);
  EXPECT_DOUBLE_EQ(1.0, progress.getFraction());
  progress.setExportStep(1, 2);
  DexRunProgress copy(progress);               // copies take the figures of the moment
  progress.begin(DexRunProgress::EXPORT_RUN);  // begin resets the figures
  EXPECT_EQ(figuresOf(progress), std::to_string(DexRunProgress::EXPORT_RUN) + " -2/0 0/0");
  EXPECT_EQ(figuresOf(copy), std::to_string(DexRunProgress::IMPORT_RUN) + " 1/2 1200/1000");
  copy = progress;
  EXPECT_EQ(figuresOf(copy), figuresOf(progress));
}

// One thread publishes while another polls: every snapshot pairs a step with its own count.
TEST(RunProgress, PollingWhileAnotherThreadPublishesSeesConsistentSteps) {
  DexRunProgress progress;
  progress.begin(DexRunProgress::EXPORT_RUN);
  std::atomic<bool> done{false};
  std::thread writer([&] {
    for (int step = 0; step < 20000; ++step)
      progress.setExportStep(step, step + 1);
    done = true;
  });
  bool consistent = true;
  while (!done) {
    const DexRunProgress::Snapshot figures = progress.get();
    if (figures.numberOfSteps != 0 && figures.numberOfSteps != figures.currentStep + 1) consistent = false;
  }
  writer.join();
  EXPECT_TRUE(consistent);
  EXPECT_DOUBLE_EQ(1.0, progress.getFraction());
}

}  // namespace
