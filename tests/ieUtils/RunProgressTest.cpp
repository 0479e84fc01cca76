#include "ieUtils/IERunProgress.h"

#include <gtest/gtest.h>

#include <atomic>
#include <cstdint>
#include <thread>

using vyn::ie::DexRunProgress;

TEST(RunProgress, StartsWithoutARunAndWithoutAFraction) {
  const DexRunProgress progress;
  const DexRunProgress::Snapshot figures = progress.get();
  EXPECT_EQ(DexRunProgress::NO_RUN, figures.kind);
  EXPECT_EQ(-2, figures.currentStep);
  EXPECT_EQ(0, figures.numberOfSteps);
  EXPECT_EQ(0u, figures.bytesRead);
  EXPECT_EQ(0u, figures.bytesTotal);
  EXPECT_LT(progress.getFraction(), 0.0);
}

TEST(RunProgress, ExportFractionCountsTheStepsCarriedOut) {
  DexRunProgress progress;
  progress.begin(DexRunProgress::EXPORT_RUN);
  EXPECT_LT(progress.getFraction(), 0.0);  // no number of steps yet
  progress.setExportStep(0, 4);
  EXPECT_DOUBLE_EQ(0.25, progress.getFraction());
  progress.setExportStep(3, 4);
  EXPECT_DOUBLE_EQ(1.0, progress.getFraction());
  const DexRunProgress::Snapshot figures = progress.get();
  EXPECT_EQ(3, figures.currentStep);
  EXPECT_EQ(4, figures.numberOfSteps);
}

TEST(RunProgress, ExportStepsKeepTheirSignThroughThePackedValue) {
  DexRunProgress progress;
  progress.begin(DexRunProgress::EXPORT_RUN);
  progress.setExportStep(-1, 7);
  EXPECT_EQ(-1, progress.get().currentStep);
  EXPECT_EQ(7, progress.get().numberOfSteps);
  EXPECT_DOUBLE_EQ(0.0, progress.getFraction());
}

TEST(RunProgress, ExportFractionIsClampedWhenAnExporterMiscounts) {
  DexRunProgress progress;
  progress.begin(DexRunProgress::EXPORT_RUN);
  progress.setExportStep(9, 3);
  EXPECT_DOUBLE_EQ(1.0, progress.getFraction());
  progress.setExportStep(-5, 3);
  EXPECT_DOUBLE_EQ(0.0, progress.getFraction());
}

TEST(RunProgress, ImportFractionIsThePartOfTheFileRead) {
  DexRunProgress progress;
  progress.begin(DexRunProgress::IMPORT_RUN);
  progress.setImportPosition(250, 1000);
  EXPECT_DOUBLE_EQ(0.25, progress.getFraction());
  const std::uint64_t large = std::uint64_t{1} << 40;  // files beyond 4 GiB
  progress.setImportPosition(large, large * 2);
  EXPECT_DOUBLE_EQ(0.5, progress.getFraction());
  progress.setImportPosition(1200, 1000);
  EXPECT_DOUBLE_EQ(1.0, progress.getFraction());
}

TEST(RunProgress, ImportWithoutATotalHasNoFraction) {
  DexRunProgress progress;
  progress.begin(DexRunProgress::IMPORT_RUN);
  progress.setImportPosition(300, 0);
  EXPECT_LT(progress.getFraction(), 0.0);
  EXPECT_EQ(300u, progress.get().bytesRead);
}

TEST(RunProgress, BeginResetsTheFiguresOfThePreviousRun) {
  DexRunProgress progress;
  progress.begin(DexRunProgress::IMPORT_RUN);
  progress.setImportPosition(10, 20);
  progress.setExportStep(1, 2);
  progress.begin(DexRunProgress::EXPORT_RUN);
  const DexRunProgress::Snapshot figures = progress.get();
  EXPECT_EQ(DexRunProgress::EXPORT_RUN, figures.kind);
  EXPECT_EQ(-2, figures.currentStep);
  EXPECT_EQ(0, figures.numberOfSteps);
  EXPECT_EQ(0u, figures.bytesRead);
  EXPECT_EQ(0u, figures.bytesTotal);
}

TEST(RunProgress, CopiesTakeTheFiguresOfTheMoment) {
  DexRunProgress progress;
  progress.begin(DexRunProgress::EXPORT_RUN);
  progress.setExportStep(1, 5);
  DexRunProgress copy(progress);
  progress.setExportStep(2, 5);
  EXPECT_EQ(1, copy.get().currentStep);
  copy = progress;
  EXPECT_EQ(2, copy.get().currentStep);
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
