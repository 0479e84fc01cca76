#include "support/LogCapture.h"

namespace dex_test {

LogCapture::LogCapture() {
  vyn_logging::setLogSink([this](const vyn_logging::LogRecord& record) {
    const std::lock_guard<std::mutex> lock(mutex_);
    records_.push_back(record);
  });
}

LogCapture::~LogCapture() {
  vyn_logging::setLogSink({});
}

std::vector<vyn_logging::LogRecord> LogCapture::records() const {
  const std::lock_guard<std::mutex> lock(mutex_);
  return records_;
}

std::size_t LogCapture::size() const {
  const std::lock_guard<std::mutex> lock(mutex_);
  return records_.size();
}

int LogCapture::count(const std::wstring& source, int line) const {
  const std::lock_guard<std::mutex> lock(mutex_);
  int found = 0;
  for (const auto& record : records_) {
    if (record.source == source && record.line == line) ++found;
  }
  return found;
}

int LogCapture::countMessage(const std::wstring& text) const {
  const std::lock_guard<std::mutex> lock(mutex_);
  int found = 0;
  for (const auto& record : records_) {
    if (record.message.find(text) != std::wstring::npos) ++found;
  }
  return found;
}

void LogCapture::clear() {
  const std::lock_guard<std::mutex> lock(mutex_);
  records_.clear();
}

}  // namespace dex_test
