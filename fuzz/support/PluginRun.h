#pragma once

#include <string>

#include "ieDefinitions/IEFormatsData.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/IExporter.h"
#include "ieUtils/IImporter.h"

// One import or export of a plug-in's own importer and exporter classes through the library's run
// functions, as the loader runs them, without loading the plug-in library.
namespace dex_fuzz {

template <class Importer, class Exporter>
struct PluginParsers {
  static vyn::ie::IDexImporter* makeImporter(vyn::ie::DexData* data, const CVynStringT<wchar_t>& fileName,
                                             const vyn::ie::DexFormat* format) {
    return new Importer(data, fileName, format);
  }
  static vyn::ie::IDexExporter* makeExporter(vyn::ie::DexData* data, const CVynStringT<wchar_t>& fileName,
                                             const vyn::ie::DexFormat* format) {
    return new Exporter(data, fileName, format);
  }
};

template <class Importer, class Exporter>
vyn::ie::EDexResult runParser(vyn::ie::DexData& data, const std::wstring& path, const wchar_t* formatId,
                              bool exportRun) {
  using Parsers = PluginParsers<Importer, Exporter>;
  auto* params = new vyn::ie::DexParserThreadParams();
  params->data = &data;
  params->fileName = CVynStringT<wchar_t>(path.c_str());
  params->format = vyn::ie::getIEFormatsData().getFormatById(formatId);
  if (exportRun) {
    params->makeParser = &Parsers::makeExporter;
    return vyn::ie::exportFunction(params);
  }
  params->makeParser = &Parsers::makeImporter;
  return vyn::ie::ImportFunction(params);
}

// Answers the overwrite question of a scratch file with yes.
class YesBox final : public vyn::ie::IDexMessageBox {
 public:
  vyn::ie::IDexMessageBox* clone() const override { return new YesBox(); }
  int confirmOverwrite(HWND, const wchar_t*) override { return IDYES; }
};

}  // namespace dex_fuzz
