// Runs one fuzz target as an ordinary test: the target function is called once for every file of the
// folders named on the command line (its seed corpus and its regression inputs), in name order, so
// any compiler and any sanitizer build replays what the fuzzers found. A folder that does not exist is
// skipped, but at least one file must be replayed. When a file crashes the program or breaks a check,
// the program says which file before it dies; sanitizer reports name it through their death callback.

#include <signal.h>
#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <system_error>
#include <vector>

#include "support/TestLocale.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);
extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv) __attribute__((weak));
extern "C" void __sanitizer_set_death_callback(void (*callback)()) __attribute__((weak));

namespace {

namespace fs = std::filesystem;

// The file being replayed, kept as a plain buffer so that a signal handler may print it.
char currentFile[4096] = "";

void sayCurrentFile() {
  if (currentFile[0] == '\0') return;
  const char prefix[] = "\nreplay: the failing input is ";
  [[maybe_unused]] ssize_t ignored = ::write(STDERR_FILENO, prefix, sizeof prefix - 1);
  ignored = ::write(STDERR_FILENO, currentFile, std::strlen(currentFile));
  ignored = ::write(STDERR_FILENO, "\n", 1);
}

void onFatalSignal(int signal) {
  sayCurrentFile();
  ::signal(signal, SIG_DFL);
  ::raise(signal);
}

// Signals a sanitizer already handles keep its handler, which reports through the death callback.
void watchFatalSignals() {
  for (const int signal : {SIGABRT, SIGSEGV, SIGBUS, SIGFPE, SIGILL}) {
    struct sigaction current {};
    if (::sigaction(signal, nullptr, &current) == 0 && current.sa_handler == SIG_DFL)
      ::signal(signal, onFatalSignal);
  }
  if (__sanitizer_set_death_callback != nullptr) __sanitizer_set_death_callback(sayCurrentFile);
}

std::vector<fs::path> filesIn(const fs::path& folder) {
  std::vector<fs::path> files;
  std::error_code error;
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
    if (it->is_regular_file(error)) files.push_back(it->path());
  }
  std::sort(files.begin(), files.end());
  return files;
}

std::string contentOf(const fs::path& file) {
  std::ifstream in(file, std::ios::binary);
  return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

void replay(const fs::path& file) {
  std::snprintf(currentFile, sizeof currentFile, "%s", file.c_str());
  const std::string bytes = contentOf(file);
  LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
  currentFile[0] = '\0';
}

}  // namespace

int main(int argc, char** argv) {
  std::string problem;
  if (!dex_test::applyTestLocale(problem)) {
    std::fprintf(stderr, "%s\n", problem.c_str());
    return 2;
  }
  if (argc < 2) {
    std::fprintf(stderr, "usage: %s <folder>...\n", argv[0]);
    return 2;
  }
  watchFatalSignals();
  if (LLVMFuzzerInitialize != nullptr) LLVMFuzzerInitialize(&argc, &argv);
  std::size_t replayed = 0;
  for (int i = 1; i < argc; ++i) {
    for (const fs::path& file : filesIn(argv[i])) {
      replay(file);
      ++replayed;
    }
  }
  std::printf("replayed %zu inputs\n", replayed);
  if (replayed == 0) {
    std::fprintf(stderr, "replay: no input found in the folders given\n");
    return 1;
  }
  return 0;
}
