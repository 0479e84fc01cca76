#include "hostlibs/VynLibrary.h"

#include <dlfcn.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <optional>
#include <string>

#include "support/LogCapture.h"
#include "support/TempDir.h"

namespace {

using EntryPoint = unsigned (*)();
using LogEntryPoint = void (*)(int);
using AnswerEntryPoint = int (*)();

constexpr unsigned kImporterMagic = 0x1A2B0001u;
constexpr unsigned kExporterMagic = 0x1A2B0002u;

const std::string kPluginDir = DEXCHANGE_TEST_PLUGIN_DIR;
const std::string kHelloPath = kPluginDir + "/libDexTestHello.so";
const std::string kNoEntryPointsPath = kPluginDir + "/libDexTestNoEntryPoints.so";

// A non-null value that no loader call would produce, to show that failures clear it.
EntryPoint staleEntryPoint() {
  return [] { return 0u; };
}

// True when the library at the path is loaded in the process at the moment.
bool isResident(const std::string& path) {
  void* const handle = dlopen(path.c_str(), RTLD_NOW | RTLD_NOLOAD);
  if (handle == nullptr) return false;
  dlclose(handle);
  return true;
}

// Sets DEXCHANGE_PLUGIN_PATH for one test and puts the previous value back afterwards.
class VynLibrary : public ::testing::Test {
 protected:
  void SetUp() override {
    if (const char* previous = std::getenv("DEXCHANGE_PLUGIN_PATH")) previous_ = previous;
    setPluginPath(kPluginDir);
  }
  void TearDown() override {
    FreeLibraryFunction(module_);
    if (previous_) {
      setenv("DEXCHANGE_PLUGIN_PATH", previous_->c_str(), 1);
    } else {
      unsetenv("DEXCHANGE_PLUGIN_PATH");
    }
  }

  static void setPluginPath(const std::string& path) { setenv("DEXCHANGE_PLUGIN_PATH", path.c_str(), 1); }
  static void clearPluginPath() { unsetenv("DEXCHANGE_PLUGIN_PATH"); }

  HINSTANCE module_ = nullptr;

 private:
  std::optional<std::string> previous_;
};

}  // namespace

TEST_F(VynLibrary, FindsBareNamesInEveryPluginFolderInOrderFileNamesAndPaths) {
  EntryPoint makeImporter = nullptr;
  const LibraryResult result = GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter");
  ASSERT_TRUE(result) << vyn_text::toUtf8(result.errorText().view());
  ASSERT_TRUE(module_ != nullptr && makeImporter != nullptr);
  EXPECT_TRUE(makeImporter() == kImporterMagic && result.errorText().IsEmpty());
  setPluginPath("/nonexistent/dexchange::" + kPluginDir + ":");
  EntryPoint makeExporter = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, makeExporter, L"DexTestHello", "MakeExporter"));
  EXPECT_EQ(kExporterMagic, makeExporter());
  EXPECT_TRUE(
      GetLibraryFunction(module_, makeImporter, L"libDexTestHello.so", "MakeImporter"));  // a file name
  clearPluginPath();  // a name with a slash is a path
  makeExporter = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, makeExporter, dex_test::widen(kHelloPath).c_str(), "MakeExporter"));
  EXPECT_EQ(kExporterMagic, makeExporter());
  makeImporter = staleEntryPoint();  // a bare name outside the search folders is not found
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  EXPECT_TRUE(module_ == nullptr && makeImporter == nullptr);
}

TEST_F(VynLibrary, PluginLogsReachTheHostsSink) {
  LogEntryPoint logHello = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, logHello, L"DexTestHello", "DexTestHelloLog"));
  const dex_test::LogCapture capture;
  logHello(7);
  EXPECT_EQ(1, capture.count(L"tests\\DexTestHello", 7));
}

TEST_F(VynLibrary, FailuresAnswerFalseWithAReasonClearBothOutputsAndReleaseTheLibrary) {
  const dex_test::TempDir folder;
  const std::string broken = folder.write("libDexBroken.so", "not a shared object");
  ASSERT_FALSE(isResident(kNoEntryPointsPath));
  const struct {
    const wchar_t* library;
    const char* function;
    std::wstring reason;
  } rows[] = {{L"DexNoSuchPlugin", "MakeImporter", L"libDexNoSuchPlugin.so"},
              {L"/nonexistent/libDexTestHello.so", "MakeImporter", L""},
              {L"DexTestNoEntryPoints", "MakeImporter", L"MakeImporter"},
              {L"DexBroken", "MakeImporter", dex_test::widen(broken)},  // a file that is no library
              {nullptr, "MakeImporter", L""},
              {L"", "MakeImporter", L""},
              {L"DexTestHello", nullptr, L""},
              {L"DexTestHello", "", L""}};
  setPluginPath(kPluginDir + ":" + folder.path());
  for (const auto& row : rows) {
    EntryPoint makeImporter = staleEntryPoint();
    const LibraryResult result = GetLibraryFunction(module_, makeImporter, row.library, row.function);
    EXPECT_FALSE(result) << row.reason;
    EXPECT_TRUE(module_ == nullptr && makeImporter == nullptr) << row.reason;
    EXPECT_NE(-1, result.errorText().Find(row.reason.c_str())) << vyn_text::toUtf8(result.errorText().view());
  }
  EXPECT_FALSE(isResident(kNoEntryPointsPath));
}

TEST_F(VynLibrary, AHandleSetOnEntryIsReleasedBeforeTheNextLoadAndByFree) {
  EntryPoint makeImporter = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, makeImporter, dex_test::widen(kHelloPath).c_str(), "MakeImporter"));
  ASSERT_TRUE(isResident(kHelloPath));
  AnswerEntryPoint answer = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, answer, L"DexTestNoEntryPoints", "DexTestNoEntryPointsAnswer"));
  EXPECT_EQ(42, answer());
  EXPECT_TRUE(!isResident(kHelloPath) && isResident(kNoEntryPointsPath));
  ASSERT_TRUE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  EXPECT_FALSE(
      GetLibraryFunction(module_, makeImporter, L"DexNoSuchPlugin", "MakeImporter"));  // also on failure
  EXPECT_TRUE(module_ == nullptr && !isResident(kHelloPath));
  ASSERT_TRUE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  HINSTANCE other = nullptr;  // two handles of one library are released independently
  EntryPoint makeExporter = nullptr;
  ASSERT_TRUE(GetLibraryFunction(other, makeExporter, L"DexTestHello", "MakeExporter"));
  FreeLibraryFunction(other);
  EXPECT_EQ(kImporterMagic, makeImporter());  // still held through module_
  FreeLibraryFunction(module_);
  EXPECT_TRUE(module_ == nullptr && !isResident(kHelloPath));
  FreeLibraryFunction(module_);  // harmless on a null handle
  EXPECT_EQ(nullptr, module_);
}

TEST_F(VynLibrary, CountsEveryCallAndEverySuccessfulLoad) {
  const unsigned calls = vyn::plugins::loadCallCountForTesting();
  const unsigned loads = vyn::plugins::successfulLoadCountForTesting();
  EntryPoint makeImporter = nullptr;
  EXPECT_TRUE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"DexNoSuchPlugin", "MakeImporter"));
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"DexTestNoEntryPoints", "MakeImporter"));
  EXPECT_EQ(calls + 3, vyn::plugins::loadCallCountForTesting());
  EXPECT_EQ(loads + 1, vyn::plugins::successfulLoadCountForTesting());
}
