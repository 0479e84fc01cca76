#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/winport.h"

// Starting threads. A started thread is known by its handle, which the winport.h calls work on:
// ResumeThread, WaitForSingleObject, GetExitCodeThread and CloseHandle. The caller owns the handle and
// releases it with CloseHandle; the thread itself lives on until its function returns.
namespace vyn::thread {

// The function a thread runs; its result becomes the thread's exit code.
using ThreadFunction = unsigned (*)(void* argument);

// Starts a thread that calls function(argument) and returns its handle.
//
// flags: CREATE_SUSPENDED (0x4) makes the thread wait, before it calls the function, until
// ResumeThread brings its suspend count to 0. STACK_SIZE_PARAM_IS_A_RESERVATION (0x10000) only says
// how stackSize is meant and changes nothing here; other bits are ignored.
// stackSize: 0 keeps the system's default; any other size is rounded up to the page size and to the
// system's minimum thread stack.
// threadName: shown by the system tools (its first 15 UTF-8 bytes, whole characters only); null or
// empty leaves the inherited name.
//
// Returns INVALID_HANDLE_VALUE when the thread cannot be started (a null function included), after
// writing one error-log record with sourceFile and line.
//
// The exit code reads STILL_ACTIVE (259) until the function returns (so a function should not return
// 259 itself). An exception that leaves the function ends the thread with the exit code 0xFFFFFFFF and
// one error-log record with sourceFile and line; it never reaches the process.
//
// Closing the handle of a thread that was started suspended and never resumed releases the thread: it
// runs its function and ends normally, so that a function owning its argument still frees it and no
// thread stays blocked for ever.
DEX_API HANDLE startThread(const wchar_t* sourceFile, int line, const wchar_t* threadName,
                           ThreadFunction function, void* argument, unsigned flags, unsigned stackSize);

// Test seams. failNextStartForTesting makes the next startThread call fail as if the system had
// refused the thread. liveThreadCountForTesting counts the threads whose state is still held, by a
// handle or by the running thread (a closed handle of an ended thread no longer counts).
DEX_API void failNextStartForTesting() noexcept;
DEX_API int liveThreadCountForTesting() noexcept;

}  // namespace vyn::thread
