#pragma once

// Helpers of the tests of the run machinery: formats that name the scripted test plug-ins, notifiers
// that record what they are told, and the stop flag put back after every test.

#include <atomic>
#include <initializer_list>
#include <memory>
#include <string>
#include <thread>

#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEFormats.h"
#include "ieObjects/IEData.h"
#include "ieUtils/IESettings.h"

namespace dex_test {

inline const std::string kTestPluginDir = DEXCHANGE_TEST_PLUGIN_DIR;

// Library names as paths, so that no search path is involved.
inline std::wstring testPlugin(const std::string& name) {
  const std::string path = kTestPluginDir + "/lib" + name + ".so";
  return std::wstring(CVynStringT<wchar_t>(path.c_str(), vyn_text::CP_UTF8).view());
}
inline std::wstring scriptedPlugin() {
  return testPlugin("DexTestScripted");
}
inline std::wstring nullParsersPlugin() {
  return testPlugin("DexTestNullParsers");
}
inline std::wstring noEntryPointsPlugin() {
  return testPlugin("DexTestNoEntryPoints");
}

inline constexpr const wchar_t* kAutoCadDrawingId = L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}";

// A format of both directions whose libraries are the given ones.
inline vyn::ie::DexFormat makeFormat(const wchar_t* guidText, const std::wstring& importLibrary,
                                     const std::wstring& exportLibrary, const wchar_t* extension = L"txt",
                                     vyn::ie::DexFlags<vyn::ie::DexFormat::EParameterName> parameters = {}) {
  GUID guid;
  CLSIDFromString(guidText, &guid);
  return vyn::ie::DexFormat(guid, L"Test format", vyn::ie::DexCommonType::IMPORT_AND_EXPORT,
                            exportLibrary.c_str(), importLibrary.c_str(), L"TEST", extension, L"Test|", {},
                            {}, vyn::ie::DexFlags<vyn::ie::EDexDataType>{vyn::ie::POINTS}, {}, {},
                            parameters);
}

inline vyn::ie::DexFormat scriptedFormat(
    const wchar_t* guidText = L"{11111111-2222-3333-4444-555555555555}") {
  return makeFormat(guidText, scriptedPlugin(), scriptedPlugin());
}

// What a RecordingNotifier was told. Written in the worker thread; read after the thread is joined.
struct NotifierRecord {
  std::atomic<int> calls{0};
  std::atomic<int> result{0};
  std::thread::id thread;
  bool throws = false;
};

// A notifier that records its calls; its clones (the settings copy it) record into the same record.
class RecordingNotifier : public vyn::ie::IDexFinishNotifier {
 public:
  explicit RecordingNotifier(std::shared_ptr<NotifierRecord> record) : record_(std::move(record)) {}
  IDexFinishNotifier* clone() const override { return new RecordingNotifier(record_); }
  void onFinished(vyn::ie::EDexResult result) override {
    record_->thread = std::this_thread::get_id();
    record_->result = result;
    ++record_->calls;
    if (record_->throws) throw std::runtime_error("notifier failure");
  }

 private:
  std::shared_ptr<NotifierRecord> record_;
};

// Settings requesting points, with recording notifiers for both directions.
struct RecordedSettings {
  std::shared_ptr<NotifierRecord> imports = std::make_shared<NotifierRecord>();
  std::shared_ptr<NotifierRecord> exports = std::make_shared<NotifierRecord>();
  vyn::ie::DexSettings settings;

  RecordedSettings() {
    settings.addDataType(vyn::ie::POINTS);
    settings.importNotifier = new RecordingNotifier(imports);
    settings.exportNotifier = new RecordingNotifier(exports);
  }
};

// Settings requesting exactly types.
inline vyn::ie::DexSettings settingsWith(std::initializer_list<vyn::ie::EDexDataType> types) {
  vyn::ie::DexSettings settings;
  for (const vyn::ie::EDexDataType type : types)
    settings.addDataType(type);
  return settings;
}

// Clears DexData::stopProcess_ when the test ends, whatever happened.
class StopFlagReset {
 public:
  StopFlagReset() { vyn::ie::DexData::stopProcess_ = false; }
  ~StopFlagReset() { vyn::ie::DexData::stopProcess_ = false; }
  StopFlagReset(const StopFlagReset&) = delete;
  StopFlagReset& operator=(const StopFlagReset&) = delete;
};

}  // namespace dex_test
