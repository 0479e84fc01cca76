#include "hostlibs/VynLogging.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <thread>
#include <vector>

#include "support/LogCapture.h"
#include "support/TempDir.h"

TEST(VynLogging, ErrorRecordsCarrySourceLineAndMessage) {
  const dex_test::LogCapture log;
  vyn_logging::vyn_err_log(L"ieUtils\\IEParsersLoader", 132, L"");
  vyn_logging::vyn_err_log(L"ieObjects\\IEDataset", 7);
  vyn_logging::vyn_err_log(nullptr, 1, nullptr);
  const auto records = log.records();
  ASSERT_EQ(3u, records.size());
  EXPECT_EQ(L"ieUtils\\IEParsersLoader", records[0].source);
  EXPECT_EQ(132, records[0].line);
  EXPECT_TRUE(records[0].message.empty());
  EXPECT_EQ(vyn_logging::kErrorLevel, records[0].level);
  EXPECT_TRUE(log.contains(L"ieObjects\\IEDataset", 7));
  EXPECT_TRUE(records[2].source.empty());
}

TEST(VynLogging, TracesAndMessagesAreFormatted) {
  const dex_test::LogCapture log;
  VYN_TRACE_ALWAYS(L"file %ls cannot be removed", L"/tmp/a.csv");
  LOGMESSAGE(3, L"%d points, %.2f m", 12, 1.5);
  const auto records = log.records();
  ASSERT_EQ(2u, records.size());
  EXPECT_EQ(L"file /tmp/a.csv cannot be removed", records[0].message);
  EXPECT_EQ(vyn_logging::kTraceLevel, records[0].level);
  EXPECT_TRUE(records[0].source.empty());
  EXPECT_EQ(0, records[0].line);
  EXPECT_EQ(L"12 points, 1.50 m", records[1].message);
  EXPECT_EQ(3, records[1].level);
}

TEST(VynLogging, RecordsFromManyThreadsAreAllDelivered) {
  const dex_test::LogCapture log;
  std::vector<std::thread> threads;
  for (int t = 0; t < 4; ++t) {
    threads.emplace_back([t] {
      for (int i = 0; i < 250; ++i)
        vyn_logging::vyn_err_log(L"worker", t);
    });
  }
  for (auto& thread : threads)
    thread.join();
  EXPECT_EQ(1000u, log.size());
  EXPECT_EQ(250, log.count(L"worker", 2));
}

TEST(VynLogging, ASinkThatLogsOrThrowsDoesNotHangOrUnwind) {
  int calls = 0;
  vyn_logging::setLogSink([&calls](const vyn_logging::LogRecord&) {
    ++calls;
    vyn_logging::vyn_err_log(L"nested", 1);  // reaches the default sink
    throw 1;
  });
  vyn_logging::vyn_err_log(L"outer", 1);
  vyn_logging::vyn_err_log(L"outer", 2);
  vyn_logging::setLogSink({});
  EXPECT_EQ(2, calls);
}

TEST(VynLogging, DefaultSinkAppendsToTheFileNamedByTheEnvironment) {
  const dex_test::TempDir folder;
  const std::string logFile = folder.file("dex.log");
  ::setenv("DEXCHANGE_LOG", logFile.c_str(), 1);
  vyn_logging::vyn_err_log(L"ieUtils\\IImporter", 92, L"");
  VYN_TRACE_ALWAYS(L"file %ls cannot be removed", L"\u00E9.csv");
  ::unsetenv("DEXCHANGE_LOG");
  const std::string text = dex_test::readFile(logFile);
  EXPECT_NE(std::string::npos, text.find("ieUtils\\IImporter(92)"));
  EXPECT_NE(std::string::npos, text.find("file \xC3\xA9.csv cannot be removed"));
}
