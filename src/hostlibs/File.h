#pragma once

#include <cstddef>
#include <string>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"

namespace base {

// A binary file opened for reading, writing or appending. Writes are collected in memory and reach
// the disk in large blocks (at Flush, Close, destruction, or when the collected bytes grow large), so
// many small writes cost little. The object owns the open file and closes it in its destructor; it can
// be moved but not copied.
class DEX_API CFile {
 public:
  VYN_CLASS_ALLOCATOR

  CFile() noexcept;
  ~CFile();
  CFile(CFile&& other) noexcept;
  CFile& operator=(CFile&& other) noexcept;
  CFile(const CFile&) = delete;
  CFile& operator=(const CFile&) = delete;

  // Opening. Each closes any file opened before and answers whether the new one is open. Writing
  // creates the file or empties an existing one; appending creates it or writes after its end. A null
  // or empty path, a folder, a path in a missing folder or a file the system refuses answer false.
  bool OpenForReading(const wchar_t* path);
  bool OpenForWriting(const wchar_t* path);
  bool OpenForAppending(const wchar_t* path);
  bool Opened() const noexcept;

  // Reads up to size bytes; answers the bytes read: fewer at the end of the file, 0 when the file is
  // not open for reading.
  std::size_t Read(void* buffer, std::size_t size);

  // Writes size bytes; false when the file is not open for writing or the system refuses bytes. A
  // failure of collected bytes shows at the Flush or Close that hands them to the system.
  bool Write(const void* data, std::size_t size);
  bool Flush();

  // Writes what is collected and closes the file; false when those bytes could not be written.
  // Closing a closed file answers true.
  bool Close();

 private:
  bool open(const wchar_t* path, int flags);

  int fd_ = -1;
  bool writing_ = false;
  std::string pending_;  // bytes written but not yet handed to the system
};

}  // namespace base
