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

// Finding a library.

TEST_F(VynLibrary, FindsBareNameInThePluginPath) {
  EntryPoint makeImporter = nullptr;
  const LibraryResult result = GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter");
  ASSERT_TRUE(result) << vyn_text::toUtf8(result.errorText().view());
  EXPECT_NE(module_, nullptr);
  ASSERT_NE(makeImporter, nullptr);
  EXPECT_EQ(makeImporter(), kImporterMagic);
  EXPECT_TRUE(result.errorText().IsEmpty());
}

TEST_F(VynLibrary, SearchesEveryFolderOfThePluginPathInOrder) {
  setPluginPath("/nonexistent/dexchange::" + kPluginDir + ":");
  EntryPoint makeExporter = nullptr;
  EXPECT_TRUE(GetLibraryFunction(module_, makeExporter, L"DexTestHello", "MakeExporter"));
  ASSERT_NE(makeExporter, nullptr);
  EXPECT_EQ(makeExporter(), kExporterMagic);
}

TEST_F(VynLibrary, TakesANameEndingInSoAsTheFileName) {
  EntryPoint makeImporter = nullptr;
  EXPECT_TRUE(GetLibraryFunction(module_, makeImporter, L"libDexTestHello.so", "MakeImporter"));
  EXPECT_NE(makeImporter, nullptr);
}

TEST_F(VynLibrary, OpensANameWithASlashAsAPath) {
  clearPluginPath();
  EntryPoint makeExporter = nullptr;
  EXPECT_TRUE(GetLibraryFunction(module_, makeExporter, dex_test::widen(kHelloPath).c_str(), "MakeExporter"));
  ASSERT_NE(makeExporter, nullptr);
  EXPECT_EQ(makeExporter(), kExporterMagic);
}

TEST_F(VynLibrary, BareNameOutsideTheSearchFoldersIsNotFound) {
  clearPluginPath();
  EntryPoint makeImporter = staleEntryPoint();
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  EXPECT_EQ(module_, nullptr);
  EXPECT_EQ(makeImporter, nullptr);
}

TEST_F(VynLibrary, PluginLogsReachTheHostsSink) {
  LogEntryPoint logHello = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, logHello, L"DexTestHello", "DexTestHelloLog"));
  const dex_test::LogCapture capture;
  logHello(7);
  EXPECT_EQ(capture.count(L"tests\\DexTestHello", 7), 1);
}

// Failures.

TEST_F(VynLibrary, MissingLibraryAnswersFalseAndClearsBothOutputs) {
  EntryPoint makeImporter = staleEntryPoint();
  const LibraryResult result = GetLibraryFunction(module_, makeImporter, L"DexNoSuchPlugin", "MakeImporter");
  EXPECT_FALSE(result);
  EXPECT_EQ(module_, nullptr);
  EXPECT_EQ(makeImporter, nullptr);
  EXPECT_NE(result.errorText().Find(L"libDexNoSuchPlugin.so"), -1);
}

TEST_F(VynLibrary, MissingPathAnswersFalse) {
  EntryPoint makeImporter = staleEntryPoint();
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"/nonexistent/libDexTestHello.so", "MakeImporter"));
  EXPECT_EQ(module_, nullptr);
  EXPECT_EQ(makeImporter, nullptr);
}

TEST_F(VynLibrary, MissingEntryPointAnswersFalseAndReleasesTheLibrary) {
  ASSERT_FALSE(isResident(kNoEntryPointsPath));
  EntryPoint makeImporter = staleEntryPoint();
  const LibraryResult result =
      GetLibraryFunction(module_, makeImporter, L"DexTestNoEntryPoints", "MakeImporter");
  EXPECT_FALSE(result);
  EXPECT_EQ(module_, nullptr);
  EXPECT_EQ(makeImporter, nullptr);
  EXPECT_NE(result.errorText().Find(L"MakeImporter"), -1);
  EXPECT_FALSE(isResident(kNoEntryPointsPath));
}

TEST_F(VynLibrary, FileInAPluginFolderThatIsNoLibraryReportsItsOwnError) {
  const dex_test::TempDir folder;
  const std::string broken = folder.write("libDexBroken.so", "not a shared object");
  setPluginPath(folder.path());
  EntryPoint makeImporter = staleEntryPoint();
  const LibraryResult result = GetLibraryFunction(module_, makeImporter, L"DexBroken", "MakeImporter");
  EXPECT_FALSE(result);
  EXPECT_EQ(module_, nullptr);
  EXPECT_EQ(makeImporter, nullptr);
  EXPECT_NE(result.errorText().Find(dex_test::widen(broken).c_str()), -1);
}

TEST_F(VynLibrary, MissingNamesAnswerFalseWithAReason) {
  EntryPoint makeImporter = staleEntryPoint();
  const LibraryResult noLibrary = GetLibraryFunction(module_, makeImporter, nullptr, "MakeImporter");
  EXPECT_FALSE(noLibrary);
  EXPECT_FALSE(noLibrary.errorText().IsEmpty());
  EXPECT_EQ(makeImporter, nullptr);

  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"", "MakeImporter"));
  const LibraryResult noFunction = GetLibraryFunction(module_, makeImporter, L"DexTestHello", nullptr);
  EXPECT_FALSE(noFunction);
  EXPECT_FALSE(noFunction.errorText().IsEmpty());
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", ""));
  EXPECT_EQ(module_, nullptr);
}

// The handle.

TEST_F(VynLibrary, HandleSetOnEntryIsReleasedBeforeTheNextLoad) {
  EntryPoint makeImporter = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, makeImporter, dex_test::widen(kHelloPath).c_str(), "MakeImporter"));
  ASSERT_TRUE(isResident(kHelloPath));

  AnswerEntryPoint answer = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, answer, L"DexTestNoEntryPoints", "DexTestNoEntryPointsAnswer"));
  EXPECT_EQ(answer(), 42);
  EXPECT_FALSE(isResident(kHelloPath));
  EXPECT_TRUE(isResident(kNoEntryPointsPath));
}

TEST_F(VynLibrary, HandleSetOnEntryIsReleasedAlsoWhenTheLoadFails) {
  EntryPoint makeImporter = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"DexNoSuchPlugin", "MakeImporter"));
  EXPECT_EQ(module_, nullptr);
  EXPECT_FALSE(isResident(kHelloPath));
}

TEST_F(VynLibrary, FreeReleasesTheLibraryAndClearsTheHandle) {
  EntryPoint makeImporter = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  FreeLibraryFunction(module_);
  EXPECT_EQ(module_, nullptr);
  EXPECT_FALSE(isResident(kHelloPath));
}

TEST_F(VynLibrary, FreeOfANullHandleIsHarmless) {
  HINSTANCE module = nullptr;
  FreeLibraryFunction(module);
  FreeLibraryFunction(module);
  EXPECT_EQ(module, nullptr);
}

TEST_F(VynLibrary, TwoHandlesOfOneLibraryAreReleasedIndependently) {
  HINSTANCE other = nullptr;
  EntryPoint makeImporter = nullptr;
  EntryPoint makeExporter = nullptr;
  ASSERT_TRUE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  ASSERT_TRUE(GetLibraryFunction(other, makeExporter, L"DexTestHello", "MakeExporter"));
  FreeLibraryFunction(other);
  EXPECT_EQ(makeImporter(), kImporterMagic);  // still held through module_
}

// The test seam.

TEST_F(VynLibrary, CountsEveryCallAndEverySuccessfulLoad) {
  const unsigned calls = vyn::plugins::loadCallCountForTesting();
  const unsigned loads = vyn::plugins::successfulLoadCountForTesting();
  EntryPoint makeImporter = nullptr;
  EXPECT_TRUE(GetLibraryFunction(module_, makeImporter, L"DexTestHello", "MakeImporter"));
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"DexNoSuchPlugin", "MakeImporter"));
  EXPECT_FALSE(GetLibraryFunction(module_, makeImporter, L"DexTestNoEntryPoints", "MakeImporter"));
  EXPECT_EQ(vyn::plugins::loadCallCountForTesting(), calls + 3);
  EXPECT_EQ(vyn::plugins::successfulLoadCountForTesting(), loads + 1);
}
