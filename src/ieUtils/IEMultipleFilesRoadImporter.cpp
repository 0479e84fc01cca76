#include "ieUtils/IEMultipleFilesRoadImporter.h"

#include <memory>

#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IECrossSections.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieUtils/IESettings.h"

namespace vyn::ie {

namespace {

// The readers buffer little: road files are small and read line by line.
constexpr int kReaderBufferSize = 512;

// The import file name without its extension. Only a point in the file's own name starts an
// extension: a point in a folder name does not.
CVynStringT<wchar_t> baseNameOf(const CVynStringT<wchar_t>& fileName) {
  const std::wstring_view name = fileName.view();
  const auto point = name.find_last_of(L'.');
  const auto separator = name.find_last_of(L"/\\");
  if (point == std::wstring_view::npos || (separator != std::wstring_view::npos && point < separator)) {
    return fileName;
  }
  return CVynStringT<wchar_t>(fileName.GetString(), static_cast<int>(point));
}

// Runs one part's read: the part (owned by the caller) in part, and whether the file could be read. A
// part handed over together with a failure is dropped.
template <class Part, class Read>
bool readPart(Read read, std::unique_ptr<Part>& part) {
  Part* raw = nullptr;
  const bool ok = read(raw);
  part.reset(raw);
  if (!ok) part.reset();
  return ok;
}

}  // namespace

IDexMultipleFilesRoadImporter::IDexMultipleFilesRoadImporter(DexData* data,
                                                             const CVynStringT<wchar_t>& fileName,
                                                             const DexFormat* format)
    : DexImporterImpl(data, fileName, format),
      hAlFile(kReaderBufferSize),
      vAlFile(kReaderBufferSize),
      xSectFile(kReaderBufferSize) {}

IDexMultipleFilesRoadImporter::~IDexMultipleFilesRoadImporter() = default;

EDexResult IDexMultipleFilesRoadImporter::doImport() {
  if (!openFiles()) return DEX_RESULT_FILE_ERROR;
  const EDexResult result = readFile();
  closeFiles();
  return DexData::stopProcess_ ? DEX_RESULT_STOPPED : result;
}

bool IDexMultipleFilesRoadImporter::openFiles() {
  if (data == nullptr) return false;
  const DexSettings& settings = data->getSettings();
  const bool roads = settings.hasDataType(ROADS);
  const CVynStringT<wchar_t> baseName = baseNameOf(fileName);
  bool opened = false;
  const auto open = [&](EDexDataType type, CTextFile& reader, const CVynStringT<wchar_t>& extension) {
    if (!roads && !settings.hasDataType(type)) return;
    CVynStringT<wchar_t> path = roads ? baseName : fileName;
    if (roads) path += extension;
    opened = reader.Open(path.GetString()) != 0 || opened;
  };
  open(H_ALIGNMENTS, hAlFile, getHAlExtension());
  open(V_ALIGNMENTS, vAlFile, getVAlExtension());
  open(X_SECTIONS, xSectFile, getXSectExtension());
  return opened;
}

EDexResult IDexMultipleFilesRoadImporter::readFile() {
  const DexSettings& settings = data->getSettings();
  const bool roads = settings.hasDataType(ROADS);
  const auto requested = [&](EDexDataType type) { return roads || settings.hasDataType(type); };
  DexAlignmentPartsDictionary* const dictionary = data->getIEAlignmentPartsDictionary();
  std::unique_ptr<DexAlignment> alignment;
  // Files a part read well and, for roads, gives it to the alignment (named after the first part).
  const auto take = [&](auto& part) {
    if (!part) return;
    IDexAlignmentPart* const kept = part.release();
    dictionary->addAlignmentPart(kept);
    if (!roads) return;
    if (!alignment) {
      alignment = std::make_unique<DexAlignment>();
      alignment->setName(kept->getName());
    }
    alignment->setAlignmentPart(kept);
  };

  bool ok = true;
  if (requested(H_ALIGNMENTS)) {
    std::unique_ptr<DexHorizontalAlignment> horizontal;
    ok = readPart([this](DexHorizontalAlignment*& out) { return readHAl(out); }, horizontal);
    if (horizontal) {
      const double staStart = horizontal->getStaStart();
      take(horizontal);
      if (alignment) alignment->setStaStart(staStart);
    }
  }
  if (ok && requested(V_ALIGNMENTS)) {
    std::unique_ptr<DexVerticalAlignment> vertical;
    ok = readPart([this](DexVerticalAlignment*& out) { return readVAl(out); }, vertical);
    take(vertical);
  }
  if (requested(X_SECTIONS)) {
    if (!ok) return DEX_RESULT_WRONG_FORMAT;
    std::unique_ptr<DexCrossSectionSet> crossSections;
    if (!readPart([this](DexCrossSectionSet*& out) { return readXSect(out); }, crossSections)) {
      return DEX_RESULT_WRONG_FORMAT;
    }
    take(crossSections);
  } else if (!ok) {
    return DEX_RESULT_WRONG_FORMAT;
  }
  DexDataset* const dataset = data->getCurDataset();
  if (alignment && dataset != nullptr) dataset->add(alignment.release());
  return DEX_RESULT_OK;
}

void IDexMultipleFilesRoadImporter::closeFiles() {
  hAlFile.Close();
  vAlFile.Close();
  xSectFile.Close();
}

}  // namespace vyn::ie
