#pragma once

#include <mutex>
#include <string>
#include <vector>

#include "hostlibs/VynLogging.h"

namespace dex_test {

// Collects every log record for the life of the object, then restores the default sink.
class LogCapture {
 public:
  LogCapture();
  ~LogCapture();
  LogCapture(const LogCapture&) = delete;
  LogCapture& operator=(const LogCapture&) = delete;

  std::vector<vyn_logging::LogRecord> records() const;
  std::size_t size() const;
  // Number of records with this source and line.
  int count(const std::wstring& source, int line) const;
  bool contains(const std::wstring& source, int line) const { return count(source, line) > 0; }
  // Number of records whose message contains the text.
  int countMessage(const std::wstring& text) const;
  void clear();

 private:
  mutable std::mutex mutex_;
  std::vector<vyn_logging::LogRecord> records_;
};

}  // namespace dex_test
