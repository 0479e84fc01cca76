#include "hostlibs/VynThread.h"

#include <gtest/gtest.h>
#include <pthread.h>

#include <atomic>
#include <chrono>
#include <climits>
#include <condition_variable>
#include <cstddef>
#include <functional>
#include <mutex>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

#include "support/LogCapture.h"

namespace {

constexpr unsigned kOneMiB = 0x100000;
constexpr DWORD kBadHandleAnswer = 0xFFFFFFFFu;
const wchar_t* const kSource = L"tests\\VynThreadTest";

// What a test thread reports back, and a gate that holds it until the test opens it.
struct Probe {
  std::atomic<bool> started{false};
  std::atomic<bool> finished{false};
  unsigned result = 0;
  bool holdUntilOpened = false;

  void open() {
    const std::lock_guard<std::mutex> lock(mutex);
    opened = true;
    changed.notify_all();
  }
  void waitUntilOpened() {
    std::unique_lock<std::mutex> lock(mutex);
    changed.wait(lock, [this] { return opened; });
  }

  std::mutex mutex;
  std::condition_variable changed;
  bool opened = false;
};

unsigned runProbe(void* argument) {
  auto& probe = *static_cast<Probe*>(argument);
  probe.started = true;
  if (probe.holdUntilOpened) probe.waitUntilOpened();
  probe.finished = true;
  return probe.result;
}

HANDLE startProbe(Probe& probe, unsigned flags = 0, unsigned stackSize = 0) {
  return vyn::thread::startThread(kSource, 1, L"probe", runProbe, &probe, flags, stackSize);
}

bool eventually(const std::function<bool()>& condition,
                std::chrono::milliseconds timeout = std::chrono::seconds(10)) {
  const auto deadline = std::chrono::steady_clock::now() + timeout;
  while (!condition()) {
    if (std::chrono::steady_clock::now() > deadline) return false;
    std::this_thread::sleep_for(std::chrono::milliseconds(1));
  }
  return true;
}

// The live count once threads of earlier tests, whose handles are closed, have let go of their state.
int settledLiveThreadCount() {
  eventually([] { return vyn::thread::liveThreadCountForTesting() == 0; }, std::chrono::seconds(2));
  return vyn::thread::liveThreadCountForTesting();
}

DWORD exitCodeOf(HANDLE thread) {
  DWORD code = 0;
  EXPECT_TRUE(GetExitCodeThread(thread, &code));
  return code;
}

// Starts a thread running function(argument), waits for its end and closes it.
void runToEnd(vyn::thread::ThreadFunction function, void* argument, const wchar_t* name, unsigned flags = 0,
              unsigned stackSize = 0) {
  const HANDLE thread = vyn::thread::startThread(kSource, 2, name, function, argument, flags, stackSize);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  if ((flags & CREATE_SUSPENDED) != 0) ResumeThread(thread);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_TRUE(CloseHandle(thread));
}

std::size_t stackSizeOfThisThread() {
  pthread_attr_t attributes;
  if (pthread_getattr_np(pthread_self(), &attributes) != 0) return 0;
  void* address = nullptr;
  std::size_t size = 0;
  pthread_attr_getstack(&attributes, &address, &size);
  pthread_attr_destroy(&attributes);
  return size;
}

unsigned recordStackSize(void* argument) {
  *static_cast<std::size_t*>(argument) = stackSizeOfThisThread();
  return 0;
}

unsigned recordName(void* argument) {
  char name[32] = {};
  pthread_getname_np(pthread_self(), name, sizeof name);
  *static_cast<std::string*>(argument) = name;
  return 0;
}

std::string nameGivenFor(const wchar_t* threadName) {
  std::string name;
  runToEnd(recordName, &name, threadName);
  return name;
}

unsigned throwFromThread(void*) {
  throw std::runtime_error("thrown in a worker");
}

}  // namespace

// Start, suspension and exit code.

TEST(VynThread, SuspendedThreadDoesNotRunUntilResumed) {
  Probe probe;
  probe.result = 17;
  const HANDLE thread = startProbe(probe, CREATE_SUSPENDED);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  ASSERT_NE(thread, nullptr);

  EXPECT_EQ(WaitForSingleObject(thread, 50), static_cast<DWORD>(WAIT_TIMEOUT));
  EXPECT_FALSE(probe.started);
  EXPECT_EQ(exitCodeOf(thread), STILL_ACTIVE);

  EXPECT_EQ(ResumeThread(thread), 1u);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_TRUE(probe.finished);
  EXPECT_EQ(exitCodeOf(thread), 17u);
  EXPECT_EQ(ResumeThread(thread), 0u);
  EXPECT_TRUE(CloseHandle(thread));
}

TEST(VynThread, ThreadWithoutSuspendFlagRunsAtOnce) {
  Probe probe;
  probe.result = 3;
  const HANDLE thread = startProbe(probe);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_EQ(exitCodeOf(thread), 3u);
  EXPECT_EQ(ResumeThread(thread), 0u);
  EXPECT_TRUE(CloseHandle(thread));
}

TEST(VynThread, ExitCodeIsStillActiveWhileTheThreadRuns) {
  Probe probe;
  probe.holdUntilOpened = true;
  probe.result = 0xFFFFD8F0u;  // -10000 as the unsigned exit code
  const HANDLE thread = startProbe(probe);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  ASSERT_TRUE(eventually([&] { return probe.started.load(); }));

  EXPECT_EQ(exitCodeOf(thread), STILL_ACTIVE);
  EXPECT_EQ(WaitForSingleObject(thread, 0), WAIT_TIMEOUT);
  EXPECT_EQ(WaitForSingleObject(thread, 20), WAIT_TIMEOUT);

  probe.open();
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_EQ(exitCodeOf(thread), 0xFFFFD8F0u);
  EXPECT_EQ(WaitForSingleObject(thread, 0), WAIT_OBJECT_0);
  EXPECT_TRUE(CloseHandle(thread));
}

TEST(VynThread, ManyThreadsEachGiveTheirOwnExitCode) {
  std::vector<Probe> probes(8);
  std::vector<HANDLE> threads;
  for (std::size_t i = 0; i < probes.size(); ++i) {
    probes[i].result = static_cast<unsigned>(100 + i);
    threads.push_back(startProbe(probes[i], CREATE_SUSPENDED));
    ASSERT_NE(threads.back(), INVALID_HANDLE_VALUE);
  }
  for (const HANDLE thread : threads)
    EXPECT_EQ(ResumeThread(thread), 1u);
  for (std::size_t i = 0; i < threads.size(); ++i) {
    EXPECT_EQ(WaitForSingleObject(threads[i], INFINITE), WAIT_OBJECT_0);
    EXPECT_EQ(exitCodeOf(threads[i]), 100 + i);
    EXPECT_TRUE(CloseHandle(threads[i]));
  }
}

TEST(VynThread, ExceptionInTheFunctionBecomesAnExitCodeAndOneLogRecord) {
  const dex_test::LogCapture capture;
  const HANDLE thread = vyn::thread::startThread(kSource, 77, L"thrower", throwFromThread, nullptr, 0, 0);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_EQ(exitCodeOf(thread), 0xFFFFFFFFu);
  EXPECT_TRUE(CloseHandle(thread));
  EXPECT_EQ(capture.size(), 1u);
  EXPECT_EQ(capture.count(kSource, 77), 1);
}

// Stack size and name.

TEST(VynThread, ReservedStackSizeIsHonoured) {
  std::size_t stackSize = 0;
  runToEnd(recordStackSize, &stackSize, L"bigStack", CREATE_SUSPENDED | STACK_SIZE_PARAM_IS_A_RESERVATION,
           kOneMiB);
  EXPECT_GE(stackSize, kOneMiB);
  EXPECT_LT(stackSize, kOneMiB + 0x10000);
}

TEST(VynThread, TinyStackSizeIsRaisedToTheSystemMinimum) {
  std::size_t stackSize = 0;
  runToEnd(recordStackSize, &stackSize, L"tinyStack", 0, 1);
  EXPECT_GE(stackSize, static_cast<std::size_t>(PTHREAD_STACK_MIN));
}

TEST(VynThread, ThreadCarriesItsName) {
  EXPECT_EQ(nameGivenFor(L"ImportFunction"), "ImportFunction");
}

TEST(VynThread, LongNameIsCutToFifteenBytes) {
  EXPECT_EQ(nameGivenFor(L"exportFunctionWorker"), "exportFunctionW");
}

TEST(VynThread, NameIsCutBetweenCharactersNotInsideOne) {
  // Eight two-byte characters: the eighth would end on byte 16, so seven remain.
  std::string sevenCharacters;
  for (int i = 0; i < 7; ++i)
    sevenCharacters += "\xC3\x84";
  EXPECT_EQ(nameGivenFor(L"\u00C4\u00C4\u00C4\u00C4\u00C4\u00C4\u00C4\u00C4"), sevenCharacters);
}

// Failures.

TEST(VynThread, RefusedStartAnswersInvalidHandleAndLogsTheCallersLine) {
  const dex_test::LogCapture capture;
  Probe probe;
  vyn::thread::failNextStartForTesting();
  const HANDLE thread = vyn::thread::startThread(L"ieUtils\\IImporter", 41, L"ImportFunction", runProbe,
                                                 &probe, CREATE_SUSPENDED, 0);
  EXPECT_EQ(thread, INVALID_HANDLE_VALUE);
  EXPECT_EQ(capture.size(), 1u);
  EXPECT_EQ(capture.count(L"ieUtils\\IImporter", 41), 1);
  EXPECT_FALSE(probe.started);
}

TEST(VynThread, RefusalAppliesToTheNextStartOnly) {
  const dex_test::LogCapture capture;
  vyn::thread::failNextStartForTesting();
  Probe refused;
  EXPECT_EQ(startProbe(refused), INVALID_HANDLE_VALUE);
  Probe accepted;
  const HANDLE thread = startProbe(accepted);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_TRUE(CloseHandle(thread));
}

TEST(VynThread, NullFunctionIsRefusedWithOneLogRecord) {
  const dex_test::LogCapture capture;
  EXPECT_EQ(vyn::thread::startThread(kSource, 5, L"none", nullptr, nullptr, 0, 0), INVALID_HANDLE_VALUE);
  EXPECT_EQ(capture.count(kSource, 5), 1);
}

TEST(VynThread, InvalidHandlesAnswerFailureValues) {
  int notAHandle = 0;
  for (const HANDLE handle : {HANDLE{nullptr}, INVALID_HANDLE_VALUE, static_cast<HANDLE>(&notAHandle)}) {
    DWORD code = 12345;
    EXPECT_EQ(ResumeThread(handle), kBadHandleAnswer);
    EXPECT_EQ(WaitForSingleObject(handle, 0), WAIT_FAILED);
    EXPECT_EQ(WaitForSingleObject(handle, INFINITE), WAIT_FAILED);
    EXPECT_FALSE(GetExitCodeThread(handle, &code));
    EXPECT_EQ(code, 12345u);
    EXPECT_FALSE(CloseHandle(handle));
  }
}

TEST(VynThread, ExitCodeNeedsSomewhereToGo) {
  Probe probe;
  const HANDLE thread = startProbe(probe);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  EXPECT_FALSE(GetExitCodeThread(thread, nullptr));
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_TRUE(CloseHandle(thread));
}

// Closing handles.

TEST(VynThread, ClosedHandleAnswersLikeAnInvalidOne) {
  Probe probe;
  const HANDLE thread = startProbe(probe);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_TRUE(CloseHandle(thread));

  DWORD code = 0;
  EXPECT_FALSE(CloseHandle(thread));
  EXPECT_FALSE(GetExitCodeThread(thread, &code));
  EXPECT_EQ(WaitForSingleObject(thread, 0), WAIT_FAILED);
  EXPECT_EQ(ResumeThread(thread), kBadHandleAnswer);
}

TEST(VynThread, ClosingTheHandleOfARunningThreadLetsItFinishAndFreesItsState) {
  const int before = settledLiveThreadCount();
  Probe probe;
  probe.holdUntilOpened = true;
  const HANDLE thread = startProbe(probe);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  ASSERT_TRUE(eventually([&] { return probe.started.load(); }));

  EXPECT_TRUE(CloseHandle(thread));
  EXPECT_EQ(vyn::thread::liveThreadCountForTesting(), before + 1);
  EXPECT_FALSE(probe.finished);

  probe.open();
  EXPECT_TRUE(eventually([&] { return vyn::thread::liveThreadCountForTesting() == before; }));
  EXPECT_TRUE(probe.finished);
}

TEST(VynThread, ClosingTheHandleOfASuspendedThreadReleasesItToRun) {
  const int before = settledLiveThreadCount();
  Probe probe;
  const HANDLE thread = startProbe(probe, CREATE_SUSPENDED);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  EXPECT_TRUE(CloseHandle(thread));
  EXPECT_TRUE(eventually([&] { return vyn::thread::liveThreadCountForTesting() == before; }));
  EXPECT_TRUE(probe.finished);
}

TEST(VynThread, StateOfAnEndedThreadIsFreedWhenItsHandleCloses) {
  const int before = settledLiveThreadCount();
  Probe probe;
  const HANDLE thread = startProbe(probe);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_EQ(vyn::thread::liveThreadCountForTesting(), before + 1);
  EXPECT_TRUE(CloseHandle(thread));
  EXPECT_TRUE(eventually([&] { return vyn::thread::liveThreadCountForTesting() == before; }));
}

TEST(VynThread, WaitFromAnotherThreadSeesTheEnd) {
  Probe probe;
  probe.holdUntilOpened = true;
  probe.result = 9;
  const HANDLE thread = startProbe(probe);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  std::atomic<DWORD> waited{WAIT_FAILED};
  std::thread waiter([&] { waited = WaitForSingleObject(thread, INFINITE); });
  probe.open();
  waiter.join();
  EXPECT_EQ(waited.load(), WAIT_OBJECT_0);
  EXPECT_EQ(exitCodeOf(thread), 9u);
  EXPECT_TRUE(CloseHandle(thread));
}

// Sleep.

TEST(VynThread, SleepWaitsAtLeastTheGivenTime) {
  const auto start = std::chrono::steady_clock::now();
  Sleep(30);
  EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(30));
}
