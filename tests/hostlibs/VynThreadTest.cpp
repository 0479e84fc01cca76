#include "hostlibs/VynThread.h"

#include <gtest/gtest.h>
#include <pthread.h>

#include <atomic>
#include <chrono>
#include <condition_variable>
#include <functional>
#include <mutex>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

#include "support/LogCapture.h"

namespace {

constexpr DWORD kBadHandleAnswer = 0xFFFFFFFFu;
const wchar_t* const kSource = L"tests\\VynThreadTest";

// What a test thread reports back, and a gate that holds it until the test opens it.
struct Probe {
  std::atomic<bool> started{false};
  std::atomic<bool> finished{false};
  unsigned result = 0;
  bool holdUntilOpened = false;
  std::mutex mutex;
  std::condition_variable changed;
  bool opened = false;

  void open() {
    const std::lock_guard<std::mutex> lock(mutex);
    opened = true;
    changed.notify_all();
  }
};

unsigned runProbe(void* argument) {
  auto& probe = *static_cast<Probe*>(argument);
  probe.started = true;
  if (probe.holdUntilOpened) {
    std::unique_lock<std::mutex> lock(probe.mutex);
    probe.changed.wait(lock, [&probe] { return probe.opened; });
  }
  probe.finished = true;
  return probe.result;
}

HANDLE startProbe(Probe& probe, unsigned flags = 0) {
  return vyn::thread::startThread(kSource, 1, L"probe", runProbe, &probe, flags, 0);
}

bool eventually(const std::function<bool()>& condition) {
  const auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(10);
  while (!condition()) {
    if (std::chrono::steady_clock::now() > deadline) return false;
    std::this_thread::sleep_for(std::chrono::milliseconds(1));
  }
  return true;
}

DWORD exitCodeOf(HANDLE thread) {
  DWORD code = 0;
  EXPECT_TRUE(GetExitCodeThread(thread, &code));
  return code;
}

// What a thread started with the name and stack size sees of itself.
struct Seen {
  std::string name;
  std::size_t stackSize = 0;
};

unsigned recordSelf(void* argument) {
  auto& seen = *static_cast<Seen*>(argument);
  char name[32] = {};
  pthread_getname_np(pthread_self(), name, sizeof name);
  seen.name = name;
  pthread_attr_t attributes;
  void* address = nullptr;
  if (pthread_getattr_np(pthread_self(), &attributes) == 0) {
    pthread_attr_getstack(&attributes, &address, &seen.stackSize);
    pthread_attr_destroy(&attributes);
  }
  return 0;
}

Seen seenBy(const wchar_t* name, unsigned flags, unsigned stackSize) {
  Seen seen;
  const HANDLE thread = vyn::thread::startThread(kSource, 2, name, recordSelf, &seen, flags, stackSize);
  if ((flags & CREATE_SUSPENDED) != 0) ResumeThread(thread);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_TRUE(CloseHandle(thread));
  return seen;
}

TEST(VynThread, SuspendedThreadRunsOnlyWhenResumedAndGivesItsExitCode) {
  Probe probe;
  probe.result = 0xFFFFD8F0u;  // -10000 as the unsigned exit code
  const HANDLE thread = startProbe(probe, CREATE_SUSPENDED);
  ASSERT_NE(thread, INVALID_HANDLE_VALUE);
  EXPECT_EQ(WaitForSingleObject(thread, 50), static_cast<DWORD>(WAIT_TIMEOUT));
  EXPECT_FALSE(probe.started);
  EXPECT_EQ(exitCodeOf(thread), STILL_ACTIVE);
  EXPECT_EQ(ResumeThread(thread), 1u);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_EQ(exitCodeOf(thread), 0xFFFFD8F0u);
  EXPECT_EQ(ResumeThread(thread), 0u);
  EXPECT_FALSE(GetExitCodeThread(thread, nullptr));
  EXPECT_TRUE(CloseHandle(thread));
}

TEST(VynThread, ManyRunningThreadsEachGiveTheirOwnExitCodeAlsoToAWaiterInAnotherThread) {
  std::vector<Probe> probes(6);
  std::vector<HANDLE> threads;
  for (std::size_t i = 0; i < probes.size(); ++i) {
    probes[i].result = static_cast<unsigned>(100 + i);
    probes[i].holdUntilOpened = true;
    threads.push_back(startProbe(probes[i]));
  }
  ASSERT_TRUE(eventually([&] { return probes[0].started.load(); }));
  EXPECT_EQ(exitCodeOf(threads[0]), STILL_ACTIVE);
  EXPECT_EQ(WaitForSingleObject(threads[0], 0), WAIT_TIMEOUT);
  std::atomic<DWORD> waited{WAIT_FAILED};
  std::thread waiter([&] { waited = WaitForSingleObject(threads[0], INFINITE); });
  for (Probe& probe : probes)
    probe.open();
  waiter.join();
  EXPECT_EQ(waited.load(), WAIT_OBJECT_0);
  for (std::size_t i = 0; i < threads.size(); ++i) {
    EXPECT_EQ(WaitForSingleObject(threads[i], INFINITE), WAIT_OBJECT_0);
    EXPECT_EQ(exitCodeOf(threads[i]), 100 + i);
    EXPECT_TRUE(CloseHandle(threads[i]));
  }
}

TEST(VynThread, StackSizeAndNameAreHonouredWithinTheSystemsLimits) {
  constexpr unsigned kOneMiB = 0x100000;
  const Seen big = seenBy(L"ImportFunction", CREATE_SUSPENDED | STACK_SIZE_PARAM_IS_A_RESERVATION, kOneMiB);
  EXPECT_EQ(big.name, "ImportFunction");
  EXPECT_GE(big.stackSize, kOneMiB);
  EXPECT_LT(big.stackSize, kOneMiB + 0x10000);
  EXPECT_GE(seenBy(L"tiny", 0, 1).stackSize, static_cast<std::size_t>(PTHREAD_STACK_MIN));
  EXPECT_EQ(seenBy(L"exportFunctionWorker", 0, 0).name, "exportFunctionW");
  // Eight two-byte characters: the eighth would end on byte 16, so seven remain.
  std::string seven;
  for (int i = 0; i < 7; ++i)
    seven += "\xC3\x84";
  EXPECT_EQ(seenBy(L"\u00C4\u00C4\u00C4\u00C4\u00C4\u00C4\u00C4\u00C4", 0, 0).name, seven);
}

unsigned throwFromThread(void*) {
  throw std::runtime_error("thrown in a worker");
}

TEST(VynThread, FailuresAreLoggedOnceWithTheCallersLine) {
  const dex_test::LogCapture capture;
  const HANDLE thrower = vyn::thread::startThread(kSource, 77, L"thrower", throwFromThread, nullptr, 0, 0);
  EXPECT_EQ(WaitForSingleObject(thrower, INFINITE), WAIT_OBJECT_0);
  EXPECT_EQ(exitCodeOf(thrower), 0xFFFFFFFFu);
  EXPECT_TRUE(CloseHandle(thrower));
  EXPECT_EQ(vyn::thread::startThread(kSource, 5, L"none", nullptr, nullptr, 0, 0), INVALID_HANDLE_VALUE);
  Probe refused;
  vyn::thread::failNextStartForTesting();
  EXPECT_EQ(vyn::thread::startThread(L"ieUtils\\IImporter", 41, L"ImportFunction", runProbe, &refused,
                                     CREATE_SUSPENDED, 0),
            INVALID_HANDLE_VALUE);
  EXPECT_FALSE(refused.started);
  EXPECT_EQ(capture.size(), 3u);
  EXPECT_EQ(capture.count(kSource, 77) + capture.count(kSource, 5) + capture.count(L"ieUtils\\IImporter", 41),
            3);
  // The refusal applies to the next start only.
  Probe accepted;
  const HANDLE thread = startProbe(accepted);
  EXPECT_EQ(WaitForSingleObject(thread, INFINITE), WAIT_OBJECT_0);
  EXPECT_TRUE(CloseHandle(thread));
}

TEST(VynThread, InvalidAndClosedHandlesAnswerFailureValues) {
  Probe probe;
  const HANDLE closed = startProbe(probe);
  EXPECT_EQ(WaitForSingleObject(closed, INFINITE), WAIT_OBJECT_0);
  EXPECT_TRUE(CloseHandle(closed));
  int notAHandle = 0;
  for (const HANDLE handle :
       {HANDLE{nullptr}, INVALID_HANDLE_VALUE, static_cast<HANDLE>(&notAHandle), closed}) {
    DWORD code = 12345;
    EXPECT_EQ(ResumeThread(handle), kBadHandleAnswer);
    EXPECT_EQ(WaitForSingleObject(handle, 0), WAIT_FAILED);
    EXPECT_EQ(WaitForSingleObject(handle, INFINITE), WAIT_FAILED);
    EXPECT_FALSE(GetExitCodeThread(handle, &code));
    EXPECT_EQ(code, 12345u);
    EXPECT_FALSE(CloseHandle(handle));
  }
}

TEST(VynThread, ClosingTheHandleOfARunningSuspendedOrEndedThreadFreesItsStateWhenItEnds) {
  ASSERT_TRUE(eventually([] { return vyn::thread::liveThreadCountForTesting() == 0; }));
  Probe running;
  running.holdUntilOpened = true;
  const HANDLE thread = startProbe(running);
  ASSERT_TRUE(eventually([&] { return running.started.load(); }));
  EXPECT_TRUE(CloseHandle(thread));
  EXPECT_EQ(vyn::thread::liveThreadCountForTesting(), 1);
  EXPECT_FALSE(running.finished);
  running.open();
  EXPECT_TRUE(eventually([] { return vyn::thread::liveThreadCountForTesting() == 0; }));

  Probe suspended;
  EXPECT_TRUE(CloseHandle(startProbe(suspended, CREATE_SUSPENDED)));
  EXPECT_TRUE(
      eventually([&] { return suspended.finished && vyn::thread::liveThreadCountForTesting() == 0; }));

  Probe ended;
  const HANDLE endedThread = startProbe(ended);
  EXPECT_EQ(WaitForSingleObject(endedThread, INFINITE), WAIT_OBJECT_0);
  EXPECT_EQ(vyn::thread::liveThreadCountForTesting(), 1);
  EXPECT_TRUE(CloseHandle(endedThread));
  EXPECT_TRUE(eventually([] { return vyn::thread::liveThreadCountForTesting() == 0; }));
}

TEST(VynThread, SleepWaitsAtLeastTheGivenTime) {
  const auto start = std::chrono::steady_clock::now();
  Sleep(30);
  EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(30));
}

}  // namespace
