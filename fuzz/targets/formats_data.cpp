// The formats data file: the input's raw bytes are the file. It is read token by token through
// DexXmlParser, as the registry's loader reads it, and then a registry is started from it as the
// process-wide one would be. Whatever the start-up took, file or built-in table, must answer the
// registry's lookups consistently.

#include <cstddef>
#include <cstdint>
#include <memory>

#include "ieDefinitions/IEFormatsData.h"
#include "ieDefinitions/detail/FormatsDataAccess.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/ScratchFile.h"
#include "support/XmlTokens.h"

namespace {

using String = CVynStringT<wchar_t>;
using vyn::ie::DexCommonType;
using vyn::ie::DexFlags;
using vyn::ie::DexFormat;
using vyn::ie::DexFormatsData;

// Lookups are linear: the formats checked one by one are capped so that a file of thousands of formats
// costs no more than a few milliseconds.
constexpr unsigned kMostFormatsChecked = 200;

void readTokens(const dex_fuzz::ScratchFile& scratch, std::size_t byteCount) {
  vyn::ie::DexXmlParser* opened = nullptr;
  if (vyn::ie::DexXmlParser::initialize(String(scratch.wpath().c_str()), opened) != vyn::ie::DEX_RESULT_OK)
    return;
  const std::unique_ptr<vyn::ie::DexXmlParser> parser(opened);
  dex_fuzz::readXmlToEnd(*parser, byteCount);
}

void checkFormat(const DexFormatsData& data, unsigned index) {
  const DexFormat* format = data.getFormatByIndex(index);
  DEX_FUZZ_CHECK(format != nullptr);
  const String id = format->getGuidAsString();
  DEX_FUZZ_CHECK(id.GetLength() == 38 && format->isIdEqual(id));
  // GUIDs need not be unique: every lookup finds the first format with this one.
  const DexFormat* first = data.getFormatById(id);
  DEX_FUZZ_CHECK(first != nullptr && first->isIdEqual(id));
  DEX_FUZZ_CHECK(data.getFormatByGuid(format->getGuid()) == first);
  const unsigned firstIndex = data.getIndexFormatById(id);
  DEX_FUZZ_CHECK(firstIndex <= index && data.getFormatByIndex(firstIndex) == first);
  const String extension = format->getExtension(false);
  if (!extension.IsEmpty()) DEX_FUZZ_CHECK(data.getFormatByExtension(extension, false) != nullptr);
  DEX_FUZZ_CHECK(extension.IsEmpty() == format->getExtension(true).IsEmpty());
  [[maybe_unused]] const bool units = format->hasUnitsToSelect();
  [[maybe_unused]] const String names = format->getName() + format->getDllName(true) +
                                        format->getDllName(false) + format->getTitle() +
                                        format->getFilterExtension();
}

void checkFilters(const DexFormatsData& data) {
  const auto count = static_cast<int>(data.getNumberOfFormats());
  for (int direction = 0; direction <= 2; ++direction) {
    const auto query = static_cast<DexCommonType::EDataDirections>(direction);
    const auto everyConfiguration = DexFlags<DexCommonType::ESupportedConfigurations>::fromMask(0x7);
    vyn_vector<int> indexes;
    data.getSupportedFormats(indexes, query, {}, {});
    data.getSupportedFormatsByDataType(indexes, vyn::ie::POINTS, query, everyConfiguration, {});
    for (const int index : indexes)
      DEX_FUZZ_CHECK(index >= 0 && index < count);
    vyn_vector<const vyn::ie::DexDataType*> types;
    data.getDataTypes(types, query, {}, {});
    for (const vyn::ie::DexDataType* type : types)
      DEX_FUZZ_CHECK(type != nullptr);
  }
}

// The start-up of the registry (see DexFormatsData's constructor) on one registry kept for the whole
// run: the formats from the file when it is usable, else the built-in table. Its last step, writing
// the built-in table over a file it could not use, depends on nothing in the input and would cost
// more than all the rest; the tests of the registry cover it.
void startRegistry(const dex_fuzz::ScratchFile& scratch) {
  using Access = vyn::ie::detail::FormatsDataAccess;
  static const std::unique_ptr<DexFormatsData> data = Access::create(String());
  Access::clearFormats(*data);
  bool storeFile = false;
  if (!Access::loadDataFromFile(*data, String(scratch.wpath().c_str()), storeFile)) {
    DEX_FUZZ_CHECK(data->getNumberOfFormats() == 0);
    Access::fillFormatsDataByDefault(*data);
  }
  const unsigned count = data->getNumberOfFormats();
  // From the file or from the built-in table, there are always formats.
  DEX_FUZZ_CHECK(count > 0);
  DEX_FUZZ_CHECK(data->getFormatByIndex(count) == nullptr);
  for (unsigned index = 0; index < count && index < kMostFormatsChecked; ++index)
    checkFormat(*data, index);
  checkFormat(*data, count - 1);
  checkFilters(*data);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  dex_fuzz::silenceLogs();
  static const dex_fuzz::ScratchFile scratch("formats-data");
  dex_fuzz::FuzzInput input(data, size);
  if (!scratch.write(input.takeRest())) return 0;
  readTokens(scratch, size);
  startRegistry(scratch);
  return 0;
}
