// The Surfaces handler.

#include <memory>

#include "LandXmlHandlers.h"
#include "LandXmlText.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IESurface.h"

namespace vyn::ie::landxml {

namespace {

// P ids up to this many times the positions read so far (plus a margin) are looked up in a vector;
// ids beyond in a map, so that a file of a few huge ids costs no memory for the ids between.
constexpr std::int64_t kDenseIdFactor = 4;
constexpr std::int64_t kDenseIdMargin = 1 << 16;
// A face lists three corners (TIN) or four (grid).
constexpr int kMostCorners = 4;

}  // namespace

bool SurfacesHandler::start(const ElementPath& path, std::wstring_view attributes) {
  const std::wstring_view name = path.name();
  const std::wstring_view parent = path.name(1);
  if (name == element::kSurfaces) {
    context_.notHeldAttributes(name, attributes);
    return true;
  }
  if (name == element::kSurface && parent == element::kSurfaces) {
    startSurface(attributes);
    return true;
  }
  if (surface_ == nullptr) return false;
  if (name == element::kP && parent == element::kPnts) {
    pointId_ = 0;
    forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
      if (attribute != attribute::kId) {
        context_.notHeld(name, attribute);
      } else if (!readPositiveInteger(value, pointId_)) {
        pointId_ = 0;
      }
    });
    return true;
  }
  if (name == element::kF && parent == element::kFaces) {
    forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
      // n (the neighbouring faces) follows from the triangles; an i of 0 says the face is visible.
      if (attribute == L"n" || (attribute == L"i" && value == L"0")) return;
      context_.notHeld(name, attribute);
    });
    return true;
  }
  const bool known = (name == element::kSourceData && parent == element::kSurface) ||
                     (name == element::kBreaklines && parent == element::kSourceData) ||
                     (name == element::kDefinition && parent == element::kSurface) ||
                     (name == element::kPnts && parent == element::kDefinition) ||
                     (name == element::kFaces && parent == element::kDefinition);
  if (name == element::kBreakline && parent == element::kBreaklines) {
    startBreakline(attributes);
    return true;
  }
  if ((name == element::kPntList2D || name == element::kPntList3D) && parent == element::kBreakline) {
    breaklineDimension_ = name == element::kPntList2D ? 2 : 3;
    return true;
  }
  if (!known) return false;
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (name == element::kDefinition && attribute == attribute::kSurfType) {
      if (value != kTin && value != L"grid") context_.malformed(L"Definition surfType unknown", value);
      return;
    }
    context_.notHeld(name, attribute);
  });
  if (name == element::kDefinition) {
    positionsById_.clear();
    sparsePositions_.clear();
  }
  return true;
}

void SurfacesHandler::text(const ElementPath& path, std::wstring_view text) {
  const std::wstring_view name = path.name();
  if (name == element::kP) {
    addPosition(pointId_, text);
  } else if (name == element::kF) {
    addFace(text);
  } else if (breakline_ && (name == element::kPntList2D || name == element::kPntList3D)) {
    if (!readNumberList(text, breaklineValues_)) {
      context_.malformed(L"Breakline skipped, its point list is not numbers", text);
      breaklineDimension_ = -1;
    }
  }
}

void SurfacesHandler::end(const ElementPath& path) {
  const std::wstring_view name = path.name();
  if (name == element::kBreakline) {
    endBreakline();
  } else if (name == element::kSurface) {
    surface_ = nullptr;
  }
}

void SurfacesHandler::startSurface(std::wstring_view attributes) {
  auto surface = std::make_unique<DexSurface>();
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (attribute == attribute::kName) {
      CVynStringT<wchar_t>& name = context_.scratch();
      point_files::assignText(name, value);
      surface->setName(name);
    } else {
      context_.notHeld(element::kSurface, attribute);
    }
  });
  surface_ = surface.get();
  context_.dataset().add(surface.release());
  positionsById_.clear();
  sparsePositions_.clear();
}

void SurfacesHandler::startBreakline(std::wstring_view attributes) {
  breakline_ = std::make_unique<DexBreakline>(surface_->getName());
  breaklineValues_.clear();
  breaklineDimension_ = 0;
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (attribute == attribute::kName) {
      CVynStringT<wchar_t>& name = context_.scratch();
      point_files::assignText(name, value);
      breakline_->setName(name);
    } else if (attribute == attribute::kBrkType) {
      int type = 0;
      if (breaklineTypeFromWord(value, type)) {
        breakline_->setBreaklineType(type);
      } else {
        context_.malformed(L"Breakline brkType unknown, read as standard", value);
      }
    } else {
      context_.notHeld(element::kBreakline, attribute);
    }
  });
}

void SurfacesHandler::endBreakline() {
  std::unique_ptr<DexBreakline> breakline = std::move(breakline_);
  if (!breakline || breaklineDimension_ < 0) return;
  const auto dimension = static_cast<std::size_t>(breaklineDimension_);
  if (dimension == 0 || breaklineValues_.size() % dimension != 0 || breaklineValues_.size() < 2 * dimension ||
      !context_.toMeters(breaklineValues_)) {
    context_.malformed(L"Breakline skipped, its point list is not two whole points or more",
                       breakline->getName().view());
    return;
  }
  for (std::size_t i = 0; i < breaklineValues_.size(); i += dimension) {
    DexStation station;
    station.setPosition(breaklineValues_[i], breaklineValues_[i + 1],
                        dimension == 3 ? breaklineValues_[i + 2] : kNoValue);
    breakline->addStation(station);
  }
  DexBreakline* const added = breakline.get();
  context_.dataset().add(breakline.release());
  surface_->addBreakline(added);
}

void SurfacesHandler::addPosition(std::int64_t id, std::wstring_view text) {
  double values[3] = {};
  if (id == 0) {
    context_.malformed(L"surface point skipped, it has no id above 0", text);
    return;
  }
  if (context_.readCoordinates(text, values, 3) != 3) {
    context_.malformed(L"surface point skipped, its text is not 3 numbers", text);
    return;
  }
  if (positionOf(id) >= 0) {
    context_.malformed(L"surface point skipped, its id was given before", text);
    return;
  }
  const int index = surface_->addPosition(DexPosition3D(values[0], values[1], values[2]));
  if (id <= kDenseIdFactor * static_cast<std::int64_t>(positionsById_.size()) + kDenseIdMargin) {
    if (static_cast<std::size_t>(id) >= positionsById_.size())
      positionsById_.resize(static_cast<std::size_t>(id) + 1, 0);
    positionsById_[static_cast<std::size_t>(id)] = index + 1;
  } else {
    sparsePositions_.emplace(id, index);
  }
}

int SurfacesHandler::positionOf(std::int64_t id) const {
  if (id > 0 && static_cast<std::size_t>(id) < positionsById_.size()) {
    const int stored = positionsById_[static_cast<std::size_t>(id)];
    if (stored > 0) return stored - 1;
  }
  const auto found = sparsePositions_.find(id);
  return found == sparsePositions_.end() ? -1 : found->second;
}

void SurfacesHandler::addFace(std::wstring_view text) {
  Words words(text);
  std::wstring_view word;
  int corners[kMostCorners] = {};
  int count = 0;
  while (words.next(word)) {
    std::int64_t id = 0;
    if (count == kMostCorners || !readPositiveInteger(word, id)) {
      context_.malformed(L"face skipped, it is not 3 or 4 point ids", text);
      return;
    }
    corners[count] = positionOf(id);
    if (corners[count] < 0) {
      context_.malformed(L"face skipped, it names a point the surface does not have", text);
      return;
    }
    ++count;
  }
  if (count < 3) {
    context_.malformed(L"face skipped, it is not 3 or 4 point ids", text);
    return;
  }
  auto* triangle = new DexTriangle();
  triangle->setPositions(corners);
  surface_->addTriangle(triangle);
  if (count == kMostCorners) {
    const int second[3] = {corners[0], corners[2], corners[3]};
    auto* other = new DexTriangle();
    other->setPositions(second);
    surface_->addTriangle(other);
  }
}

}  // namespace vyn::ie::landxml
