// A host built outside the tree against the installed package (bench/point_files.sh builds it with
// `pkg-config --cflags --libs dexchange` alone): it imports a point file through the loader in a
// worker thread, as a host application does, and prints the CPU seconds and peak memory of the run.
//
//   import_host FILE.csv

#include <sys/resource.h>

#include <cstdio>

#include "PointFileRun.h"
#include "dexchange.h"

namespace {

using namespace vyn::ie;

// A host learns of the end of a threaded run through its notifier (called in the worker thread).
class FinishFlag : public IDexFinishNotifier {
 public:
  void onFinished(EDexResult result) override { result_ = result; }
  IDexFinishNotifier* clone() const override { return new FinishFlag(*this); }

 private:
  EDexResult result_ = DEX_RESULT_OK;
};

double cpuSeconds() {
  rusage usage{};
  getrusage(RUSAGE_SELF, &usage);
  return static_cast<double>(usage.ru_utime.tv_sec + usage.ru_stime.tv_sec) +
         static_cast<double>(usage.ru_utime.tv_usec + usage.ru_stime.tv_usec) / 1e6;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) {
    std::fprintf(stderr, "usage: import_host FILE.csv\n");
    return 2;
  }
  const auto format = dexchange_bench::csvBothWays();
  DexSettings settings;
  settings.addDataType(POINTS);
  settings.importNotifier = new FinishFlag;
  DexParsersLoader loader;
  loader.initIEData(settings);

  const double start = cpuSeconds();
  const HANDLE worker = loader.startImportInSeparateThread(CVynStringT<wchar_t>(argv[1], vyn_text::CP_UTF8),
                                                           format.get(), nullptr);
  DWORD result = 0;
  const bool ended = worker != INVALID_HANDLE_VALUE &&
                     WaitForSingleObject(worker, INFINITE) == WAIT_OBJECT_0 &&
                     GetExitCodeThread(worker, &result);
  if (worker != INVALID_HANDLE_VALUE) CloseHandle(worker);
  const double seconds = cpuSeconds() - start;
  if (!ended || static_cast<EDexResult>(result) != DEX_RESULT_OK) {
    std::fprintf(stderr, "import_host: the import failed (%d)\n", static_cast<int>(result));
    return 1;
  }
  std::printf("%.2f s CPU, %.0f MB peak, %d points, %s\n", seconds, dexchange_bench::peakMegabytes(),
              loader.getIEData()->getCurDataset()->getNumberOfElements(OBJECT_TYPE_ALL, 2),
              vyn_block_allocator());
  return 0;
}
