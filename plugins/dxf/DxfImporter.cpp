#include "DxfImporter.h"

#include <algorithm>
#include <string>

#include "DxfGroupReader.h"
#include "DxfObjectBuilder.h"
#include "DxfRecord.h"
#include "DxfWords.h"
#include "hostlibs/VynLogging.h"
#include "ieObjects/IEData.h"

namespace vyn::ie::dxf {

namespace {

// Groups between two looks at the stop flag and two progress reports.
constexpr int kStopCheckGroups = 1 << 13;
constexpr int kProgressGroups = 1 << 16;

enum class ESection { NONE, HEADER, TABLES, BLOCKS, ENTITIES, OTHER };

ESection sectionOf(std::string_view name) {
  if (name == word::kHeader) return ESection::HEADER;
  if (name == word::kTables) return ESection::TABLES;
  if (name == word::kBlocks) return ESection::BLOCKS;
  if (name == word::kEntities) return ESection::ENTITIES;
  return ESection::OTHER;
}

bool isEntityWord(std::string_view type) {
  static constexpr std::string_view kEntities[] = {
      word::kPoint,       word::kLine,   word::kLwPolyline, word::kPolyline, word::kVertex,
      word::kSequenceEnd, word::kArc,    word::kCircle,     word::kText,     word::kMText,
      word::kFace,        word::kInsert, word::kAttribute};
  return std::find(std::begin(kEntities), std::end(kEntities), type) != std::end(kEntities);
}

// Walks the sections of a drawing and hands each finished record to the builder.
class SectionWalker {
 public:
  SectionWalker(DxfGroupReader& reader, DxfObjectBuilder& builder, DxfImportReport& report,
                DexRunProgress& progress)
      : reader_(reader), builder_(builder), report_(report), progress_(progress) {}

  // False when stopped.
  bool walk() {
    int groups = 0;
    while (!ended_) {
      if (!reader_.next()) {
        if (!reader_.badCode()) break;
        report_.badGroupCode(reader_.line());
        record_.reset({}, 0);  // the damaged structure is dropped
        if (!reader_.resync()) break;
      }
      onGroup();
      if (++groups % kStopCheckGroups != 0) continue;
      if (DexData::stopProcess_) return false;
      if (groups % kProgressGroups == 0) progress_.setImportPosition(reader_.bytesRead(), reader_.fileSize());
    }
    if (reader_.truncated()) report_.valueMissing(reader_.line());
    finishRecord();
    builder_.finish();
    if (inSection_ && !ended_) report_.endsInside(sectionName_);
    return true;
  }

  // Whether the file held any DXF structure.
  bool recognized() const noexcept { return recognized_; }

 private:
  void onGroup() {
    const int code = reader_.code();
    const std::string_view value = reader_.value();
    if (code == group::kComment) return;
    if (code == group::kStructure) {
      finishRecord();
      if (value == word::kSection) {
        awaitingName_ = true;
        inSection_ = true;
        recognized_ = true;
        section_ = ESection::NONE;
      } else if (value == word::kEndSection) {
        inSection_ = false;
        section_ = ESection::NONE;
      } else if (value == word::kEndOfFile) {
        ended_ = true;
      } else {
        record_.reset(value, reader_.line());
      }
      return;
    }
    if (awaitingName_ && code == group::kName) {
      awaitingName_ = false;
      sectionName_.assign(value);
      section_ = sectionOf(value);
      return;
    }
    if (section_ == ESection::HEADER && code == group::kVariable) {
      finishRecord();
      record_.reset(value, reader_.line());
      return;
    }
    if (record_.empty()) return;
    record_.add(code, value);
    if (reader_.valueCut()) record_.markMalformed(code);
  }

  void finishRecord() {
    if (record_.empty()) return;
    const std::string_view type = record_.type();
    switch (section_) {
      case ESection::HEADER:
        readVariable();
        break;
      case ESection::TABLES:
        if (type == word::kLayer) builder_.addLayer(record_);
        break;
      case ESection::BLOCKS:
        if (type == word::kBlock) builder_.beginBlock(record_);
        if (type == word::kAttributeDefinition) builder_.addAttributeDefinition(record_);
        break;
      case ESection::ENTITIES:
        builder_.addEntity(record_);
        break;
      case ESection::NONE:  // entities without their section around them are read all the same
        if (isEntityWord(type)) {
          recognized_ = true;
          builder_.addEntity(record_);
        }
        break;
      case ESection::OTHER:
        break;
    }
    record_.reset({}, 0);
  }

  void readVariable() {
    const std::string_view name = record_.type();
    if (name == word::kVersionVariable) {
      builder_.setUtf8(record_.text(group::kText) >= word::kFirstUtf8Version);
    } else if (name == word::kUnitsVariable) {
      const int code = record_.integer(group::kFlags, 0);
      if (!record_.malformed()) builder_.setUnitsCode(code);
    }
  }

  DxfGroupReader& reader_;
  DxfObjectBuilder& builder_;
  DxfImportReport& report_;
  DexRunProgress& progress_;
  DxfRecord record_;
  ESection section_ = ESection::NONE;
  std::string sectionName_;
  bool awaitingName_ = false;
  bool inSection_ = false;
  bool ended_ = false;
  bool recognized_ = false;
};

// The reason a file that opened is not read, or null.
const wchar_t* refusalOf(EFileKind kind) {
  switch (kind) {
    case EFileKind::EMPTY:
      return L"the file is empty";
    case EFileKind::BINARY_DXF:
      return L"a binary DXF file; only ASCII DXF is read (save the drawing as ASCII DXF)";
    case EFileKind::DWG:
      return L"a DWG drawing, not a DXF file (save it as ASCII DXF)";
    case EFileKind::ASCII:
      break;
  }
  return nullptr;
}

}  // namespace

DxfImporter::DxfImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
    : DexImporterImpl(data, fileName, format) {}

DxfImporter::~DxfImporter() = default;

EDexResult DxfImporter::doImport() {
  if (data == nullptr) return DEX_RESULT_FAILED;
  DxfGroupReader reader;
  if (!reader.open(vyn_text::toUtf8(fileName.view()))) return DEX_RESULT_FILE_ERROR;
  if (const wchar_t* refusal = refusalOf(reader.kind()); refusal != nullptr) {
    VYN_TRACE_ALWAYS(L"%ls: %ls", fileName.GetString(), refusal);
    return DEX_RESULT_WRONG_FORMAT;
  }
  DexRunProgress& progress = data->getProgress();
  progress.setImportPosition(0, reader.fileSize());
  DxfImportReport report(fileName);
  DxfObjectBuilder builder(*data, report);
  SectionWalker walker(reader, builder, report, progress);
  const bool finished = walker.walk();
  progress.setImportPosition(reader.fileSize(), reader.fileSize());
  const bool leftOut = report.finish();
  if (!finished) return DEX_RESULT_STOPPED;
  if (!walker.recognized()) {
    VYN_TRACE_ALWAYS(L"%ls: no DXF section or entity in the file", fileName.GetString());
    return DEX_RESULT_WRONG_FORMAT;
  }
  return leftOut ? kResultEntitiesSkipped : DEX_RESULT_OK;
}

}  // namespace vyn::ie::dxf
