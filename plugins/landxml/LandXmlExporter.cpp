#include "LandXmlExporter.h"

#include <algorithm>
#include <ctime>
#include <string>

#include "LandXmlWords.h"
#include "LandXmlWriter.h"
#include "RepeatedNames.h"
#include "hostlibs/VynLogging.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEObjectList.h"
#include "ieObjects/IEParcel.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IERegion.h"
#include "ieObjects/IESurface.h"
#include "ieUtils/IEVersion.h"

namespace vyn::ie::landxml {

namespace {

// Objects (points, polylines, positions, triangles) written in one step.
constexpr int kObjectsPerStep = 16384;

bool wantsPoints(const DexSettings& settings) {
  return settings.hasDataType(POINTS) || settings.hasDataType(POINT_LISTS);
}

bool wantsAlignments(const DexSettings& settings) {
  return settings.hasDataType(ROADS) || settings.hasDataType(H_ALIGNMENTS) ||
         settings.hasDataType(V_ALIGNMENTS);
}

// The breaklines a written surface holds (they are written with it, not as plan features).
std::unordered_set<const DexObject*> surfaceBreaklines(const DexDataset& dataset) {
  std::unordered_set<const DexObject*> held;
  for (int i = 0; i < dataset.getNumberOfSurfaces(); ++i) {
    const DexSurface* surface = dataset.getSurfaceAt(i);
    for (int b = 0; b < surface->getNumberOfBreaklines(); ++b)
      held.insert(surface->getBreaklineAt(b));
  }
  return held;
}

// The boundary of a parcel: the region of its horizontal alignment's name (or its own), a parcel
// boundary region first.
const DexRegion* boundaryOf(const DexDataset& dataset, const DexParcel& parcel) {
  const CVynStringT<wchar_t>& name =
      parcel.getHAlignment() != nullptr ? parcel.getHAlignment()->getName() : parcel.getName();
  const DexRegion* found = nullptr;
  for (int i = 0; i < dataset.getNumberOfRegions(); ++i) {
    const DexRegion* region = dataset.getRegionAt(i);
    if (region->getName() != name) continue;
    if (region->getRegionType() == kParcelBoundaryRegion) return region;
    if (found == nullptr) found = region;
  }
  return found;
}

void localDateAndTime(std::string& date, std::string& time) {
  const std::time_t now = std::time(nullptr);
  std::tm local{};
  localtime_r(&now, &local);
  char text[16] = {};
  std::strftime(text, sizeof text, "%Y-%m-%d", &local);
  date = text;
  std::strftime(text, sizeof text, "%H:%M:%S", &local);
  time = text;
}

}  // namespace

LandXmlExporter::LandXmlExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
    : DexExporterImpl(data, fileName, format) {}

LandXmlExporter::~LandXmlExporter() {
  if (file_ != nullptr) std::fclose(file_);
}

int LandXmlExporter::getNumberOfSteps() {
  const int alignments = dataset_ != nullptr ? dataset_->getNumberOfAlignments() : 0;  // one a step
  return 2 + (objectCount_ + kObjectsPerStep - 1) / kObjectsPerStep + alignments;
}

bool LandXmlExporter::singleStep() {
  if (currentStep < 0) {
    if (!open()) return false;
    currentStep = 0;
    return true;
  }
  if (stage_ != Stage::CLOSE) {
    if (!writeBlock() || !flush()) {
      ieResult = DEX_RESULT_FILE_ERROR;
      return false;
    }
    ++currentStep;
    return true;
  }
  if (!close()) {
    ieResult = DEX_RESULT_FILE_ERROR;
  } else if (notWritten_ > 0) {
    VYN_TRACE_ALWAYS(L"%ls: %lld objects LandXML cannot carry were not written", fileName.GetString(),
                     static_cast<long long>(notWritten_));
    ieResult = kResultNotHeld;
  }
  ++currentStep;
  return false;
}

bool LandXmlExporter::open() {
  if (data == nullptr || !isLandXmlFormat(format)) return false;
  const DexSettings& settings = data->getSettings();
  if (!utils::isExportFileWithSameName(fileName, settings.messageBox, settings.parentWindow)) return false;
  file_ = std::fopen(vyn_text::toUtf8(fileName.view()).c_str(), "wb");
  if (file_ == nullptr) return false;
  data->addFileNameToExported(fileName);
  if (data->getNumberOfDatasets() > 0) dataset_ = data->getCurDataset();
  objectCount_ =
      dataset_ == nullptr ? 0 : dataset_->getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE);
  writer_ = std::make_unique<LandXmlWriter>(settings, text_);
  std::string date;
  std::string time;
  localDateAndTime(date, time);
  writer_->header(date, time, getLibraryVersionString());
  if (dataset_ != nullptr) {
    for (int i = 0; i < objectCount_; ++i) {
      const EDexObjectsType kind = const_cast<DexObject*>(dataset_->getObjectAt(i))->getType();
      if (kind == OBJECT_TYPE_ARC || kind == OBJECT_TYPE_CIRCLE || kind == OBJECT_TYPE_TEXT_LABEL ||
          kind == OBJECT_TYPE_SHEET_POINT)
        ++notWritten_;
    }
  }
  stage_ = Stage::POINTS;
  if (dataset_ == nullptr || !wantsPoints(settings)) nextStage();
  return flush();
}

void LandXmlExporter::nextStage() {
  const DexSettings& settings = data->getSettings();
  next_ = 0;
  nextPart_ = 0;
  collectionOpen_ = false;
  const auto wanted = [&](Stage stage) {
    if (dataset_ == nullptr) return stage == Stage::CLOSE;
    switch (stage) {
      case Stage::POINTS:
        return wantsPoints(settings);
      case Stage::POINT_LISTS:
        return settings.hasDataType(POINT_LISTS);
      case Stage::LINES:
        return settings.hasDataType(LINES);
      case Stage::SURFACES:
        return settings.hasDataType(SURFACES);
      case Stage::PARCELS:
        return settings.hasDataType(PARCELS);
      case Stage::ALIGNMENTS:
        return wantsAlignments(settings);
      case Stage::CLOSE:
        return true;
    }
    return true;
  };
  do {
    stage_ = static_cast<Stage>(static_cast<int>(stage_) + 1);
  } while (!wanted(stage_));
}

bool LandXmlExporter::writeBlock() {
  bool stageDone = false;
  switch (stage_) {
    case Stage::POINTS:
      stageDone = writePoints();
      break;
    case Stage::POINT_LISTS:
      stageDone = writePointLists();
      break;
    case Stage::LINES:
      stageDone = writeLines();
      break;
    case Stage::SURFACES:
      stageDone = writeSurfaces();
      break;
    case Stage::PARCELS:
      stageDone = writeParcels();
      break;
    case Stage::ALIGNMENTS:
      stageDone = writeAlignments();
      break;
    case Stage::CLOSE:
      return true;
  }
  if (stageDone) nextStage();
  return true;
}

// ---- Names written -------------------------------------------------------------------------------

// Writes the next block of the CgPoints being written; true when every point is written. The first
// CgPoints takes the dataset's points, each further one the points whose names the one before had.
bool LandXmlExporter::writePoints() {
  const bool fromDataset = pass_ == 0;
  const int count = fromDataset ? objectCount_ : static_cast<int>(pointsLeft_.size());
  const auto pointAt = [&](int at) -> const DexDesignPoint* {
    return fromDataset ? dynamic_cast<const DexDesignPoint*>(dataset_->getObjectAt(at))
                       : pointsLeft_[static_cast<std::size_t>(at)];
  };
  if (!collectionOpen_) {
    writer_->startCollection("CgPoints");
    collectionOpen_ = true;
    repeatedNames_ = markRepeatedNames(static_cast<std::uint32_t>(count), [&](std::uint32_t at) {
      const DexDesignPoint* point = pointAt(static_cast<int>(at));
      return point != nullptr ? point->getName().view() : std::wstring_view();
    });
  }
  const int end = std::min(count, next_ + kObjectsPerStep);
  for (; next_ < end; ++next_) {
    const DexDesignPoint* point = pointAt(next_);
    if (point == nullptr) continue;
    if (repeatedNames_[static_cast<std::size_t>(next_)]) {
      pointsLater_.push_back(point);
      continue;
    }
    writer_->point(*point);
  }
  if (next_ < count) return false;
  writer_->endCollection("CgPoints");
  collectionOpen_ = false;
  pointsLeft_ = std::move(pointsLater_);
  pointsLater_.clear();
  next_ = 0;
  ++pass_;
  return pointsLeft_.empty();
}

bool LandXmlExporter::writePointLists() {
  const int count = dataset_->getNumberOfObjectLists();
  if (next_ >= count) return true;
  const DexObjectList* list = dataset_->getObjectListAt(next_++);
  bool open = false;
  list->reset();
  for (const DexObject* object = list->getNextObjectInTheList(); object != nullptr;
       object = list->getNextObjectInTheList()) {
    const auto* point = dynamic_cast<const DexDesignPoint*>(object);
    if (point == nullptr || point->getName().IsEmpty()) continue;
    if (!open) writer_->startCollection("CgPoints", list->getName().view());
    open = true;
    writer_->pointReference(*point);
  }
  if (open) writer_->endCollection("CgPoints");
  return next_ >= count;
}

bool LandXmlExporter::writeLines() {
  const DexSettings& settings = data->getSettings();
  if (next_ == 0 && settings.hasDataType(SURFACES)) surfaceLines_ = surfaceBreaklines(*dataset_);
  const bool chains = wantsPoints(settings);
  const int end = std::min(objectCount_, next_ + kObjectsPerStep);
  for (; next_ < end; ++next_) {
    const auto* polyline = dynamic_cast<const DexPolyLine*>(dataset_->getObjectAt(next_));
    if (polyline == nullptr || surfaceLines_.count(polyline) > 0) continue;
    if (!collectionOpen_) {
      writer_->startCollection("PlanFeatures");
      collectionOpen_ = true;
    }
    if (!writer_->planFeature(*polyline, chains)) ++notWritten_;
  }
  if (next_ < objectCount_) return false;
  if (collectionOpen_) writer_->endCollection("PlanFeatures");
  return true;
}

bool LandXmlExporter::writeSurfaces() {
  const int count = dataset_->getNumberOfSurfaces();
  if (next_ >= count) {
    if (collectionOpen_) writer_->endCollection("Surfaces");
    return true;
  }
  if (!collectionOpen_) {
    writer_->startCollection("Surfaces");
    collectionOpen_ = true;
  }
  const DexSurface& surface = *dataset_->getSurfaceAt(next_);
  const int positions = surface.getNumberOfPositions();
  const int triangles = surface.getNumberOfTriangles();
  const bool definition = positions >= 3 && triangles >= 1;
  if (nextPart_ == 0) writer_->startSurface(surface, definition);
  if (definition && nextPart_ < positions) {
    const int end = std::min(positions, nextPart_ + kObjectsPerStep);
    writer_->positions(surface, nextPart_, end);
    nextPart_ = end;
    if (nextPart_ == positions) writer_->startFaces();
    return false;
  }
  if (definition && nextPart_ < positions + triangles) {
    const int end = std::min(positions + triangles, nextPart_ + kObjectsPerStep);
    notWritten_ += writer_->faces(surface, nextPart_ - positions, end - positions);
    nextPart_ = end;
    if (nextPart_ < positions + triangles) return false;
  }
  if (!definition) notWritten_ += triangles;
  writer_->endSurface(definition);
  ++next_;
  nextPart_ = 0;
  return false;
}

bool LandXmlExporter::writeParcels() {
  const int count = dataset_->getNumberOfParcels();
  const int end = std::min(count, next_ + kObjectsPerStep);
  const bool pointsWritten = wantsPoints(data->getSettings());
  for (; next_ < end; ++next_) {
    if (!collectionOpen_) {
      writer_->startCollection("Parcels");
      collectionOpen_ = true;
    }
    const DexParcel& parcel = *dataset_->getParcelAt(next_);
    writer_->parcel(parcel, boundaryOf(*dataset_, parcel), pointsWritten);
  }
  if (next_ < count) return false;
  if (collectionOpen_) writer_->endCollection("Parcels");
  return true;
}

bool LandXmlExporter::close() {
  writer_->footer();
  const bool flushed = flush();
  const bool closed = std::fclose(file_) == 0;
  file_ = nullptr;
  return flushed && closed;
}

bool LandXmlExporter::flush() {
  if (text_.size() > 0 && !writeFailed_)
    writeFailed_ = std::fwrite(text_.bytes().data(), 1, text_.size(), file_) != text_.size();
  text_.clear();
  return !writeFailed_;
}

// One alignment a step; Alignments is opened at the first (it holds one at least).
bool LandXmlExporter::writeAlignments() {
  const int count = dataset_->getNumberOfAlignments();
  if (next_ < count) {
    if (!collectionOpen_) writer_->startCollection("Alignments");
    collectionOpen_ = true;
    notWritten_ += writer_->alignment(*dataset_->getAlignmentAt(next_++));
  }
  if (next_ < count) return false;
  if (collectionOpen_) writer_->endCollection("Alignments");
  return true;
}

}  // namespace vyn::ie::landxml
