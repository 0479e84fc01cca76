#include "hostlibs/VynThread.h"

#include <cxxabi.h>
#include <pthread.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <chrono>
#include <condition_variable>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <mutex>
#include <string>
#include <system_error>
#include <thread>
#include <unordered_map>
#include <utility>

#include "hostlibs/VynLogging.h"
#include "hostlibs/VynString.h"

namespace vyn::thread {
namespace {

// The system keeps at most 15 bytes of a thread name (plus the terminator).
constexpr std::size_t kMaxNameBytes = 15;
// Exit code of a thread whose function ended by an exception or by pthread_exit.
constexpr DWORD kAbnormalExitCode = 0xFFFFFFFFu;
constexpr DWORD kBadHandleAnswer = 0xFFFFFFFFu;

std::atomic<bool> failNextStart{false};
std::atomic<int> liveStates{0};

std::wstring wideText(const wchar_t* text) {
  return text != nullptr ? std::wstring(text) : std::wstring();
}

// The first bytes of the UTF-8 name that fit the system's limit, never cutting a character in two.
std::string systemThreadName(const std::wstring& name) {
  std::string utf8 = vyn_text::toUtf8(name);
  if (utf8.size() <= kMaxNameBytes) return utf8;
  std::size_t cut = kMaxNameBytes;
  while (cut > 0 && (static_cast<unsigned char>(utf8[cut]) & 0xC0u) == 0x80u)
    --cut;
  utf8.resize(cut);
  return utf8;
}

std::size_t roundedStackSize(unsigned requested) {
  const long pageSize = sysconf(_SC_PAGESIZE);
  const std::size_t page = pageSize > 0 ? static_cast<std::size_t>(pageSize) : 4096;
  const std::size_t size = std::max<std::size_t>(requested, static_cast<std::size_t>(PTHREAD_STACK_MIN));
  return (size + page - 1) / page * page;
}

// What a handle and its thread share. The handle table holds one reference and the running thread
// another, so the state lives until both the handle is closed and the thread has ended.
class ThreadState {
 public:
  ThreadState(ThreadFunction function, void* argument, std::wstring name, std::wstring source, int line,
              bool suspended)
      : function_(function),
        argument_(argument),
        name_(std::move(name)),
        source_(std::move(source)),
        line_(line),
        suspendCount_(suspended ? 1 : 0) {
    ++liveStates;
  }
  ~ThreadState() { --liveStates; }
  ThreadState(const ThreadState&) = delete;
  ThreadState& operator=(const ThreadState&) = delete;

  // Runs in the new thread: name it, wait for the resume, call the function, signal the end.
  void runInThread() {
    nameCurrentThread();
    waitUntilResumed();
    EndSignal end(*this);
    end.exitCode = callFunction();
  }

  // Answers the previous suspend count.
  DWORD resume() {
    const std::lock_guard<std::mutex> lock(mutex_);
    const DWORD previous = suspendCount_;
    if (suspendCount_ > 0 && --suspendCount_ == 0) changed_.notify_all();
    return previous;
  }

  // The handle is gone: nobody can resume the thread any more, so it is let go.
  void releaseSuspension() {
    const std::lock_guard<std::mutex> lock(mutex_);
    suspendCount_ = 0;
    changed_.notify_all();
  }

  // True when the thread ended within the time (INFINITE waits as long as it takes).
  bool waitForEnd(DWORD milliseconds) {
    std::unique_lock<std::mutex> lock(mutex_);
    const auto ended = [this] { return finished_; };
    if (milliseconds == INFINITE) {
      changed_.wait(lock, ended);
      return true;
    }
    return changed_.wait_for(lock, std::chrono::milliseconds(milliseconds), ended);
  }

  DWORD exitCode() const {
    const std::lock_guard<std::mutex> lock(mutex_);
    return exitCode_;
  }

 private:
  // Marks the end however the function leaves, pthread_exit and cancellation included.
  struct EndSignal {
    explicit EndSignal(ThreadState& state) : state(state) {}
    ~EndSignal() { state.finish(exitCode); }
    EndSignal(const EndSignal&) = delete;
    EndSignal& operator=(const EndSignal&) = delete;
    ThreadState& state;
    DWORD exitCode = kAbnormalExitCode;
  };

  void nameCurrentThread() const {
    const std::string systemName = systemThreadName(name_);
    if (!systemName.empty()) pthread_setname_np(pthread_self(), systemName.c_str());
  }

  void waitUntilResumed() {
    std::unique_lock<std::mutex> lock(mutex_);
    changed_.wait(lock, [this] { return suspendCount_ == 0; });
  }

  DWORD callFunction() {
    try {
      return function_(argument_);
    } catch (abi::__forced_unwind&) {
      throw;  // pthread_exit or cancellation must unwind; EndSignal still reports the end
    } catch (...) {
      // An exception must not end the process from a worker thread; it becomes an exit code.
      vyn_logging::vyn_err_log(source_.c_str(), line_,
                               (L"thread " + name_ + L" ended by an exception").c_str());
      return kAbnormalExitCode;
    }
  }

  void finish(DWORD exitCode) {
    const std::lock_guard<std::mutex> lock(mutex_);
    exitCode_ = exitCode;
    finished_ = true;
    changed_.notify_all();
  }

  const ThreadFunction function_;
  void* const argument_;
  const std::wstring name_;
  const std::wstring source_;
  const int line_;

  mutable std::mutex mutex_;
  std::condition_variable changed_;
  DWORD suspendCount_;
  bool finished_ = false;
  DWORD exitCode_ = STILL_ACTIVE;
};

using StatePtr = std::shared_ptr<ThreadState>;

// Live handles. Handles are numbers handed out once, never addresses, so a closed or made-up handle is
// recognised and answered with a failure instead of being dereferenced.
class HandleTable {
 public:
  HANDLE add(StatePtr state) {
    const std::lock_guard<std::mutex> lock(mutex_);
    const std::uintptr_t key = next_;
    states_.emplace(key, std::move(state));
    next_ += kHandleStep;
    return reinterpret_cast<HANDLE>(key);
  }

  StatePtr find(HANDLE handle) const {
    const std::lock_guard<std::mutex> lock(mutex_);
    const auto found = states_.find(reinterpret_cast<std::uintptr_t>(handle));
    return found != states_.end() ? found->second : nullptr;
  }

  StatePtr remove(HANDLE handle) {
    const std::lock_guard<std::mutex> lock(mutex_);
    const auto found = states_.find(reinterpret_cast<std::uintptr_t>(handle));
    if (found == states_.end()) return nullptr;
    StatePtr state = std::move(found->second);
    states_.erase(found);
    return state;
  }

 private:
  static constexpr std::uintptr_t kFirstHandle = 0x1000;
  static constexpr std::uintptr_t kHandleStep = 4;

  mutable std::mutex mutex_;
  std::unordered_map<std::uintptr_t, StatePtr> states_;
  std::uintptr_t next_ = kFirstHandle;
};

// Never destroyed: threads and late CloseHandle calls may outlive static destruction.
HandleTable& handleTable() {
  static HandleTable* const table = new HandleTable();
  return *table;
}

void* threadEntry(void* raw) {
  const StatePtr state = std::move(*static_cast<StatePtr*>(raw));
  delete static_cast<StatePtr*>(raw);
  state->runInThread();
  return nullptr;
}

// pthread attributes with their destruction.
class ThreadAttributes {
 public:
  ThreadAttributes() : error_(pthread_attr_init(&attributes_)) {}
  ~ThreadAttributes() {
    if (error_ == 0) pthread_attr_destroy(&attributes_);
  }
  ThreadAttributes(const ThreadAttributes&) = delete;
  ThreadAttributes& operator=(const ThreadAttributes&) = delete;

  // 0 or the error number of the first failing setting.
  int configure(unsigned stackSize) {
    if (error_ != 0) return error_;
    const int detached = pthread_attr_setdetachstate(&attributes_, PTHREAD_CREATE_DETACHED);
    if (detached != 0) return detached;
    if (stackSize == 0) return 0;
    return pthread_attr_setstacksize(&attributes_, roundedStackSize(stackSize));
  }

  const pthread_attr_t* get() const { return &attributes_; }

 private:
  pthread_attr_t attributes_{};
  int error_;
};

HANDLE refuseStart(const wchar_t* sourceFile, int line, const std::wstring& name, const std::string& reason) {
  const std::wstring message = L"cannot start thread " + name + L": " +
                               std::wstring(CVynStringT<wchar_t>(reason.c_str(), vyn_text::CP_UTF8).view());
  vyn_logging::vyn_err_log(sourceFile, line, message.c_str());
  return INVALID_HANDLE_VALUE;
}

std::string systemError(int error) {
  return std::system_category().message(error);
}

}  // namespace

HANDLE startThread(const wchar_t* sourceFile, int line, const wchar_t* threadName, ThreadFunction function,
                   void* argument, unsigned flags, unsigned stackSize) {
  const std::wstring name = wideText(threadName);
  if (function == nullptr) return refuseStart(sourceFile, line, name, "no thread function");
  if (failNextStart.exchange(false)) return refuseStart(sourceFile, line, name, "refused for testing");
  try {
    ThreadAttributes attributes;
    const int configured = attributes.configure(stackSize);
    if (configured != 0) return refuseStart(sourceFile, line, name, systemError(configured));

    const bool suspended = (flags & CREATE_SUSPENDED) != 0;
    StatePtr state =
        std::make_shared<ThreadState>(function, argument, name, wideText(sourceFile), line, suspended);
    auto threadReference = std::make_unique<StatePtr>(state);
    // Registered before the thread exists, so that no thread ever runs without a handle to reach it.
    const HANDLE handle = handleTable().add(std::move(state));
    pthread_t thread{};
    const int created = pthread_create(&thread, attributes.get(), threadEntry, threadReference.get());
    if (created != 0) {
      handleTable().remove(handle);
      return refuseStart(sourceFile, line, name, systemError(created));
    }
    static_cast<void>(threadReference.release());  // the thread owns it now
    return handle;
  } catch (...) {
    return refuseStart(sourceFile, line, name, "out of memory");
  }
}

void failNextStartForTesting() noexcept {
  failNextStart = true;
}

int liveThreadCountForTesting() noexcept {
  return liveStates.load();
}

}  // namespace vyn::thread

using vyn::thread::handleTable;

DWORD ResumeThread(HANDLE thread) {
  const auto state = handleTable().find(thread);
  return state ? state->resume() : vyn::thread::kBadHandleAnswer;
}

DWORD WaitForSingleObject(HANDLE handle, DWORD milliseconds) {
  const auto state = handleTable().find(handle);
  if (!state) return WAIT_FAILED;
  return state->waitForEnd(milliseconds) ? WAIT_OBJECT_0 : WAIT_TIMEOUT;
}

BOOL GetExitCodeThread(HANDLE thread, DWORD* exitCode) {
  if (exitCode == nullptr) return 0;
  const auto state = handleTable().find(thread);
  if (!state) return 0;
  *exitCode = state->exitCode();
  return 1;
}

BOOL CloseHandle(HANDLE handle) {
  const auto state = handleTable().remove(handle);
  if (!state) return 0;
  state->releaseSuspension();
  return 1;
}

void Sleep(DWORD milliseconds) {
  std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
}
