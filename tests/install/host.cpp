// A host built outside the source tree against the installed package: it uses a string, the error
// log, a thread and, when given a plug-in name, the plug-in search of the installed library.
// Prints one line per check and exits non-zero on the first failure.

#include <cstdio>
#include <string>

#include "dexchange.h"

namespace {

int failed(const char* what) {
  std::fprintf(stderr, "host: %s\n", what);
  return 1;
}

unsigned answer(void* argument) {
  return *static_cast<unsigned*>(argument);
}

bool logReachesTheSink() {
  std::wstring seen;
  vyn_logging::setLogSink([&seen](const vyn_logging::LogRecord& record) { seen = record.source; });
  vyn_logging::vyn_err_log(L"host\\Check", 1);
  vyn_logging::setLogSink({});
  return seen == L"host\\Check";
}

bool threadGivesItsExitCode() {
  unsigned value = 22;
  const HANDLE thread =
      vyn::thread::startThread(L"host", 1, L"hostCheck", answer, &value, CREATE_SUSPENDED, 0);
  if (thread == INVALID_HANDLE_VALUE) return false;
  ResumeThread(thread);
  DWORD code = 0;
  const bool ended =
      WaitForSingleObject(thread, INFINITE) == WAIT_OBJECT_0 && GetExitCodeThread(thread, &code);
  CloseHandle(thread);
  return ended && code == 22;
}

bool pluginIsFound(const std::string& name) {
  HINSTANCE module = nullptr;
  unsigned (*makeImporter)() = nullptr;
  const CVynStringT<wchar_t> library(name.c_str(), vyn_text::CP_UTF8);
  const LibraryResult result = GetLibraryFunction(module, makeImporter, library, "MakeImporter");
  if (!result) std::fprintf(stderr, "host: %s\n", vyn_text::toUtf8(result.errorText().view()).c_str());
  const bool called = result && makeImporter != nullptr && makeImporter() != 0;
  FreeLibraryFunction(module);
  return called;
}

}  // namespace

int main(int argc, char** argv) {
  CVynStringT<wchar_t> text(L"dex");
  text += L"change";
  if (text != L"dexchange" || text.GetLength() != 9) return failed("string operations");
  if (!logReachesTheSink()) return failed("log sink");
  if (!threadGivesItsExitCode()) return failed("thread");
  if (argc > 1 && !pluginIsFound(argv[1])) return failed("plug-in not found");
  std::printf("%s\n", vyn::ie::getLibraryVersionString());
  return 0;
}
