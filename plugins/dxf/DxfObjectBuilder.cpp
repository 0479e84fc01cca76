#include "DxfObjectBuilder.h"

#include <algorithm>
#include <cctype>
#include <cmath>
#include <memory>
#include <numbers>

#include "DxfGroupReader.h"
#include "DxfWords.h"
#include "hostlibs/VynLogging.h"
#include "ieObjects/IEArcs.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IERegion.h"
#include "ieObjects/IESurface.h"
#include "ieObjects/IETextLabel.h"
#include "ieUtils/IEUtilsUnits.h"

namespace vyn::ie::dxf {

namespace {

using EDashStyle = DexDrawLineProperties::EDashStyleType;

constexpr double kPlaneTolerance = 1e-9;
constexpr double kFullTurn = 360.0;
constexpr double kHalfTurn = 180.0;
constexpr int kFrozenLayer = 1;
constexpr int kConstantAttribute = 2;

bool equalsNoCase(std::string_view a, std::string_view b) {
  return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) {
           return std::toupper(static_cast<unsigned char>(x)) == std::toupper(static_cast<unsigned char>(y));
         });
}

std::string upperCase(std::string_view text) {
  std::string upper(text);
  for (char& ch : upper)
    ch = static_cast<char>(std::toupper(static_cast<unsigned char>(ch)));
  return upper;
}

// What an attribute tag gives a point.
enum class ERole { NONE, NAME, HEIGHT, CODE };

template <std::size_t N>
bool isOneOf(std::string_view tag, const std::string_view (&tags)[N]) {
  return std::any_of(std::begin(tags), std::end(tags),
                     [tag](std::string_view known) { return equalsNoCase(tag, known); });
}

ERole roleOf(std::string_view tag) {
  if (isOneOf(tag, kNameTags)) return ERole::NAME;
  if (isOneOf(tag, kHeightTags)) return ERole::HEIGHT;
  if (isOneOf(tag, kCodeTags)) return ERole::CODE;
  return ERole::NONE;
}

double normalizedAngle(double degrees) {
  const double angle = std::fmod(degrees, kFullTurn);
  return angle < 0.0 ? angle + kFullTurn : angle;
}

double degreesOf(double y, double x) {
  return normalizedAngle(std::atan2(y, x) * kHalfTurn / std::numbers::pi);
}

// The insertion point of a TEXT's justification (72 horizontal, 73 vertical): rows from the top,
// columns from the left, as DexTextLabel numbers them.
int insertionOf(int horizontal, int vertical) {
  constexpr int kMiddleJustified = 4;
  if (horizontal == kMiddleJustified) return DexTextLabel::INSERT_MIDDLE_CENTER;
  const int column = horizontal == 1 || horizontal == 2 ? horizontal : 0;
  const int row = vertical == 3 ? 0 : vertical == 2 ? 1 : 2;
  return row * 3 + column + 1;
}

}  // namespace

// ---- The report ----------------------------------------------------------------------------------

bool DxfImportReport::traceNext() {
  return ++traced_ <= kTracedProblems;
}

void DxfImportReport::malformed(std::string_view type, int line, int code) {
  ++malformed_;
  if (!traceNext()) return;
  const std::string what(type);
  VYN_TRACE_ALWAYS(L"%ls(%d): %s skipped, group %d is missing or not a number", fileName_.GetString(), line,
                   what.c_str(), code);
}

void DxfImportReport::badGroupCode(int line) {
  ++malformed_;
  if (traceNext())
    VYN_TRACE_ALWAYS(L"%ls(%d): not a group code; read on from the next group 0", fileName_.GetString(),
                     line);
}

void DxfImportReport::valueMissing(int line) {
  incomplete_ = true;
  VYN_TRACE_ALWAYS(L"%ls(%d): the file ends after a group code, without its value", fileName_.GetString(),
                   line);
}

void DxfImportReport::endsInside(std::string_view section) {
  incomplete_ = true;
  const std::string what(section);
  VYN_TRACE_ALWAYS(L"%ls: the file ends inside the %s section", fileName_.GetString(), what.c_str());
}

bool DxfImportReport::finish() const {
  for (const auto& [what, count] : notHeld_)
    VYN_TRACE_ALWAYS(L"%ls: %d %s not held by the model", fileName_.GetString(), count, what.c_str());
  if (malformed_ > 0)
    VYN_TRACE_ALWAYS(L"%ls: %d malformed entities skipped", fileName_.GetString(), malformed_);
  return incomplete_ || malformed_ > 0 || !notHeld_.empty();
}

// ---- Building --------------------------------------------------------------------------------------

// The explicit drawing values of an entity; what is not explicit comes from its layer.
struct DxfObjectBuilder::Style {
  bool hasColor = false;
  unsigned long color = 0;
  bool hasDash = false;
  EDashStyle dash = DexDrawLineProperties::DASH_SOLID;
  bool hasWidth = false;
  unsigned char width = 1;

  bool any() const noexcept { return hasColor || hasDash || hasWidth; }
};

struct DxfObjectBuilder::Extras {
  std::string_view kind;
  std::string_view name;
  std::string_view codes;
  std::string_view surface;
};

DxfObjectBuilder::DxfObjectBuilder(DexData& data, DxfImportReport& report)
    : data_(data), dataset_(data.getCurDataset()), report_(report), codes_(&data) {
  const DexSettings& settings = data.getSettings();
  readPoints_ = settings.hasDataType(POINTS) || settings.hasDataType(POINT_LISTS);
  readLines_ = settings.hasDataType(LINES);
  readAreas_ = settings.hasDataType(AREAS);
  readSurfaces_ = settings.hasDataType(SURFACES);
  readLabels_ = readPoints_ || readLines_;
  setUnitsCode(0);
}

DxfObjectBuilder::~DxfObjectBuilder() = default;

void DxfObjectBuilder::setUnitsCode(int insUnits) {
  styles_.cad().setAutoCadDistUnits(insUnits, data_.getSettings().distUnits);
  toMeters_ = utils::toMetersFactor(1.0, styles_.cad().getDistUnits());
}

// ---- Tables and blocks ------------------------------------------------------------------------------

void DxfObjectBuilder::addLayer(DxfRecord& record) {
  const std::string_view rawName = record.text(group::kName);
  if (rawName.empty() || layers_.count(std::string(rawName)) > 0) return;
  const CVynStringT<wchar_t> name = wide(rawName);
  DexDrawDictionary* dictionary = data_.getIEDrawDictionary();
  if (DexLayer* held = dictionary->findLayer(name); held != nullptr) {
    layers_.emplace(rawName, held);
    return;
  }
  const int colorIndex = record.integer(group::kColor, kColorForeground);
  const Style style = readStyle(record);
  const int flags = record.integer(group::kFlags, 0);
  const bool plot = record.integer(group::kPlot, 1) != 0;
  auto layer = std::make_unique<DexLayer>();
  layer->setName(name);
  if (record.malformed()) {
    report_.malformed(record.type(), record.line(), record.malformedCode());
  } else {
    const unsigned long color = style.hasColor ? style.color : styles_.colorOfIndex(std::abs(colorIndex));
    auto* line = new DexDrawLineProperties();
    line->setColor(color);
    if (style.hasDash) line->setDashStyle(style.dash);
    if (style.hasWidth) line->setWidth(style.width);
    layer->setDrawProperties(IDexDrawProperties::DRAW_LINE, line);
    layer->setDrawProperties(IDexDrawProperties::DRAW_POINT, new DexDrawPointProperties());
    layer->setDrawProperties(IDexDrawProperties::DRAW_AREA, new DexDrawAreaProperties());
    layer->setColor(color);
    if (colorIndex < 0 || (flags & kFrozenLayer) != 0) layer->setActiveStatus(false);
    if (!plot) layer->setPlotStatus(false);
  }
  layers_.emplace(rawName, layer.get());
  dictionary->addLayer(layer.release());
}

const DexLayer* DxfObjectBuilder::layerOf(std::string_view rawName) {
  if (rawName.empty()) rawName = "0";
  if (const auto found = layers_.find(std::string(rawName)); found != layers_.end()) return found->second;
  const CVynStringT<wchar_t> name = wide(rawName);
  DexDrawDictionary* dictionary = data_.getIEDrawDictionary();
  DexLayer* layer = dictionary->findLayer(name);
  if (layer == nullptr) {
    layer = new DexLayer();
    layer->setName(name);
    dictionary->addLayer(layer);
  }
  layers_.emplace(rawName, layer);
  return layer;
}

void DxfObjectBuilder::beginBlock(DxfRecord& record) {
  currentBlock_ = &blocks_[upperCase(record.text(group::kName))];
}

void DxfObjectBuilder::addAttributeDefinition(DxfRecord& record) {
  if (currentBlock_ == nullptr) return;
  const std::string_view tag = record.text(group::kName);
  if (roleOf(tag) == ERole::NONE) return;
  currentBlock_->pointTags = true;
  if ((record.integer(group::kFlags, 0) & kConstantAttribute) != 0)
    currentBlock_->constants.emplace_back(tag, record.text(group::kText));
}

// ---- Common parts ------------------------------------------------------------------------------------

bool DxfObjectBuilder::skipMalformed(DxfRecord& record) {
  if (!record.malformed()) return false;
  report_.malformed(record.type(), record.line(), record.malformedCode());
  return true;
}

DxfObjectBuilder::Style DxfObjectBuilder::readStyle(DxfRecord& record) {
  Style style;
  if (record.has(group::kTrueColor)) {
    style.hasColor = true;
    style.color = DxfStyles::colorOfTrueColor(record.integer(group::kTrueColor, 0));
  } else if (record.has(group::kColor)) {
    const int index = std::abs(record.integer(group::kColor, kColorByLayer));
    if (index >= 1 && index <= 255) {
      style.hasColor = true;
      style.color = styles_.colorOfIndex(index);
    } else if (index == kColorByBlock) {
      style.hasColor = true;  // outside a block, by block draws in the foreground colour
      style.color = styles_.colorOfIndex(kColorForeground);
    }
  }
  const std::string_view lineType = record.text(group::kLineType);
  if (!lineType.empty() && !equalsNoCase(lineType, kLineTypeByLayer) &&
      !equalsNoCase(lineType, kLineTypeByBlock)) {
    style.hasDash = true;
    style.dash = styles_.dashStyleOf(decoder_.plain(lineType));
  }
  const int weight = record.integer(group::kLineWeight, kLineWeightByLayer);
  if (weight >= 0) {
    style.hasWidth = true;
    style.width = styles_.widthOf(weight);
  }
  return style;
}

void DxfObjectBuilder::applyStyle(DexObject& object, const Style& style, int drawType) {
  // Without own properties an object without codes takes every value from its layer; with codes the
  // layer's values have to be named as such, or the codes' would win.
  if (!style.any() && object.getNumberOfCodes() == 0) return;
  const auto setColor = [&style](IDexDrawProperties& properties) {
    if (style.hasColor) {
      properties.setColor(style.color);
    } else {
      properties.setColorByLayer();
    }
  };
  if (drawType == IDexDrawProperties::DRAW_POINT) {
    auto* point = new DexDrawPointProperties();
    setColor(*point);
    object.setDrawProperties(point);
    return;
  }
  auto* line = new DexDrawLineProperties();
  setColor(*line);
  if (style.hasDash) {
    line->setDashStyle(style.dash);
  } else {
    line->setDashStyleByLayer();
  }
  if (style.hasWidth) {
    line->setWidth(style.width);
  } else {
    line->setWidthByLayer();
  }
  object.setDrawProperties(line);
  if (auto* area = dynamic_cast<DexArea*>(&object); area != nullptr) {
    auto* fill = new DexDrawAreaProperties();
    setColor(*fill);
    area->setAreaDrawProperties(fill);
  }
}

DxfObjectBuilder::Extras DxfObjectBuilder::readExtras(DxfRecord& record) {
  Extras extras;
  const std::vector<std::string_view> texts = record.applicationTexts(kApplication);
  if (!texts.empty()) extras.kind = texts[0];
  if (texts.size() > 1) extras.name = texts[1];
  if (texts.size() > 2) extras.codes = texts[2];
  if (texts.size() > 3) extras.surface = texts[3];
  return extras;
}

void DxfObjectBuilder::readCodes(std::wstring_view text, DexObject& object) {
  std::wstring rejected;
  if (!codes_.read(text, object, rejected)) report_.notHeld("code texts that are not a code list");
}

void DxfObjectBuilder::finishObject(DexObject* object, DxfRecord& record, const Extras& extras,
                                    const Style& style, int drawType) {
  if (!extras.name.empty()) object->setName(wide(extras.name));
  if (!extras.codes.empty()) readCodes(decoder_.plain(extras.codes), *object);
  object->setLayer(layerOf(record.text(group::kLayer)), false);
  applyStyle(*object, style, drawType);
  dataset_->add(object);
  ++made_;
}

bool DxfObjectBuilder::horizontal(DxfRecord& record, double& normalZ) {
  const double nx = record.real(group::kExtrusionX, 0.0);
  const double ny = record.real(group::kExtrusionY, 0.0);
  normalZ = record.real(group::kExtrusionZ, 1.0);
  return std::fabs(nx) < kPlaneTolerance && std::fabs(ny) < kPlaneTolerance &&
         std::fabs(normalZ) > kPlaneTolerance;
}

bool DxfObjectBuilder::pointAt(DxfRecord& record, int code, bool ocs, Vertex& vertex) {
  const int xAt = record.find(code);
  const int yAt = record.find(code + kToY);
  if (xAt < 0 || yAt < 0) {
    record.markMalformed(xAt < 0 ? code : code + kToY);
    return false;
  }
  vertex.x = record.realAt(static_cast<std::size_t>(xAt), 0.0);
  vertex.y = record.realAt(static_cast<std::size_t>(yAt), 0.0);
  vertex.z = record.real(code + kToZ, 0.0);
  if (ocs && record.has(group::kExtrusionZ)) {
    const double nx = record.real(group::kExtrusionX, 0.0);
    const double ny = record.real(group::kExtrusionY, 0.0);
    const double nz = record.real(group::kExtrusionZ, 1.0);
    styles_.cad().convertCPInOcsToWcs(vertex.x, vertex.y, vertex.z, nx, ny, nz, vertex.x, vertex.y, vertex.z);
  }
  // A coordinate the unit conversion (or the plane) takes beyond the doubles is no coordinate.
  if (!isFiniteLength(vertex.x) || !isFiniteLength(vertex.y) || !isFiniteLength(vertex.z)) {
    record.markMalformed(code);
    return false;
  }
  return true;
}

// ---- Entities ----------------------------------------------------------------------------------------

void DxfObjectBuilder::addEntity(DxfRecord& record) {
  const std::string_view type = record.type();
  if (pending_ == EPending::POLYLINE) {
    if (type == word::kVertex) {
      Vertex vertex;
      if (readVertex(record, vertex)) vertices_.push_back(vertex);
      return;
    }
    finishPolyline();
    if (type == word::kSequenceEnd) return;
  } else if (pending_ == EPending::INSERT) {
    if (type == word::kAttribute) {
      attributes_.emplace_back(record.text(group::kName), record.text(group::kText));
      return;
    }
    finishInsert();
    if (type == word::kSequenceEnd) return;
  }
  if (type != word::kInsert) lastPoint_ = nullptr;

  if (type == word::kPolyline || type == word::kInsert) {
    owner_ = record;
    vertices_.clear();
    attributes_.clear();
    pending_ = type == word::kPolyline ? EPending::POLYLINE : EPending::INSERT;
    if (pending_ == EPending::INSERT && record.integer(group::kEntitiesFollow, 0) == 0) finishInsert();
    return;
  }
  if (!takeEntity(record)) return;
  if (type == word::kPoint) {
    if (readPoints_) addPoint(record);
  } else if (type == word::kLine) {
    if (readLines_) addLine(record);
  } else if (type == word::kLwPolyline) {
    addLwPolyline(record);
  } else if (type == word::kArc || type == word::kCircle) {
    if (readLines_) addArc(record, type == word::kCircle);
  } else if (type == word::kText || type == word::kMText) {
    if (readLabels_) addText(record, type == word::kMText);
  } else if (type == word::kFace) {
    if (readSurfaces_) addFace(record);
  } else if (type == word::kVertex || type == word::kAttribute || type == word::kSequenceEnd) {
    report_.notHeld(std::string(type) + " entities outside a POLYLINE or INSERT");
  } else {
    report_.notHeld(std::string(type) + " entities");
  }
}

void DxfObjectBuilder::finish() {
  if (pending_ == EPending::POLYLINE) finishPolyline();
  if (pending_ == EPending::INSERT) finishInsert();
  for (const auto& [breakline, surfaceName] : breaklines_) {
    for (int i = 0; i < dataset_->getNumberOfSurfaces(); ++i) {
      if (dataset_->getSurfaceAt(i)->getName() == surfaceName) {
        dataset_->getSurfaceAt(i)->addBreakline(breakline);
        break;
      }
    }
  }
  breaklines_.clear();
}

bool DxfObjectBuilder::takeEntity(DxfRecord& record) {
  if (record.integer(group::kPaperSpace, 0) == 0) return true;
  report_.notHeld("entities of paper space");
  return false;
}

void DxfObjectBuilder::addPoint(DxfRecord& record) {
  Vertex at;
  pointAt(record, group::kX, false, at);
  const Style style = readStyle(record);
  if (skipMalformed(record)) return;
  auto* point = new DexDesignPoint();
  point->setCoords(meters(at.y), meters(at.x), meters(at.z));
  finishObject(point, record, Extras{}, style, IDexDrawProperties::DRAW_POINT);
  lastPoint_ = point;
  lastX_ = at.x;
  lastY_ = at.y;
}

void DxfObjectBuilder::finishInsert() {
  pending_ = EPending::NONE;
  DexDesignPoint* const last = lastPoint_;
  lastPoint_ = nullptr;
  if (!takeEntity(owner_) || !readPoints_) return;
  const BlockInfo* block = nullptr;
  if (const auto known = blocks_.find(upperCase(owner_.text(group::kName))); known != blocks_.end())
    block = &known->second;
  // The first value of each role, from the attributes, then from the block's constants.
  std::string_view values[4];
  bool found[4] = {false, false, false, false};
  const auto take = [&](std::string_view tag, std::string_view value) {
    const auto role = static_cast<std::size_t>(roleOf(tag));
    if (role == 0 || found[role]) return;
    found[role] = true;
    values[role] = value;
  };
  for (const auto& [tag, value] : attributes_)
    take(tag, value);
  if (block != nullptr) {
    for (const auto& [tag, value] : block->constants)
      take(tag, value);
  }
  if (!found[1] && !found[2] && !found[3] && (block == nullptr || !block->pointTags)) {
    report_.notHeld("INSERT entities of blocks without point attributes");
    return;
  }
  Vertex at;
  pointAt(owner_, group::kX, true, at);
  const Style style = readStyle(owner_);
  if (skipMalformed(owner_)) return;

  const bool merged = last != nullptr && lastX_ == at.x && lastY_ == at.y;
  DexDesignPoint* point = merged ? last : new DexDesignPoint();
  double height = meters(at.z);
  if (merged) height = point->isHeightDefined() ? point->getStation().getZ() : kNoValue;
  if (found[static_cast<int>(ERole::HEIGHT)]) {
    const std::string_view text = values[static_cast<int>(ERole::HEIGHT)];
    double value = 0.0;
    if (text.find_first_not_of(" \t") == std::string_view::npos) {
      height = kNoValue;
    } else if (parseReal(text, value)) {
      height = meters(value);
    }
  }
  if (merged) {
    DexStation station = point->getStation();
    station.setHeightDefined(height != kNoValue);
    station.setPosition(station.getX(), station.getY(), height);
    point->setStation(station);
  } else {
    point->setCoords(meters(at.y), meters(at.x), height);
  }
  if (found[static_cast<int>(ERole::NAME)])
    point->setName(CVynStringT<wchar_t>(decoder_.text(values[static_cast<int>(ERole::NAME)])));
  if (found[static_cast<int>(ERole::CODE)])
    readCodes(decoder_.text(values[static_cast<int>(ERole::CODE)]), *point);
  if (merged) {
    if (point->getNumberOfCodes() > 0 && point->getDrawProperties() == nullptr) {
      auto* properties = new DexDrawPointProperties();
      properties->setColorByLayer();
      point->setDrawProperties(properties);
    }
    return;
  }
  finishObject(point, owner_, Extras{}, style, IDexDrawProperties::DRAW_POINT);
}

void DxfObjectBuilder::addLine(DxfRecord& record) {
  std::vector<Vertex> ends(2);
  pointAt(record, group::kX, false, ends[0]);
  pointAt(record, group::kX + 1, false, ends[1]);
  makeLine(record, ends, false, true);
}

void DxfObjectBuilder::addLwPolyline(DxfRecord& record) {
  std::vector<Vertex> vertices;
  vertices.reserve(std::min<std::size_t>(
      static_cast<std::size_t>(std::max(0, record.integer(group::kVertexCount, 0))), kMaxReservedVertices));
  const double elevation = record.real(group::kElevation, 0.0);
  for (std::size_t i = 0; i < record.size(); ++i) {
    const int code = record.codeAt(i);
    if (code == group::kX) {
      vertices.emplace_back();
      vertices.back().x = record.realAt(i, 0.0);
      vertices.back().z = elevation;
    } else if (!vertices.empty() && code == group::kY) {
      vertices.back().y = record.realAt(i, 0.0);
    } else if (!vertices.empty() && code == group::kBulge) {
      vertices.back().bulge = record.realAt(i, 0.0);
    }
  }
  double normalZ = 1.0;
  const bool flat = horizontal(record, normalZ);
  if (!flat || normalZ < 0.0) {
    const double nx = record.real(group::kExtrusionX, 0.0);
    const double ny = record.real(group::kExtrusionY, 0.0);
    for (Vertex& vertex : vertices) {
      styles_.cad().convertCPInOcsToWcs(vertex.x, vertex.y, vertex.z, nx, ny, normalZ, vertex.x, vertex.y,
                                        vertex.z);
      if (normalZ < 0.0) vertex.bulge = -vertex.bulge;
    }
  }
  const bool closed = (record.integer(group::kFlags, 0) & polyline_flag::kClosed) != 0;
  makeLine(record, vertices, closed, record.has(group::kElevation));
}

bool DxfObjectBuilder::readVertex(DxfRecord& record, Vertex& vertex) {
  pointAt(record, group::kX, false, vertex);
  vertex.bulge = record.real(group::kBulge, 0.0);
  vertex.flags = record.integer(group::kFlags, 0);
  for (int k = 0; k < 4; ++k)
    vertex.corners[k] = record.integer(group::kFlags71 + k, 0);
  return !skipMalformed(record);
}

void DxfObjectBuilder::finishPolyline() {
  pending_ = EPending::NONE;
  if (!takeEntity(owner_)) return;
  const int flags = owner_.integer(group::kFlags, 0);
  if ((flags & (polyline_flag::kPolyfaceMesh | polyline_flag::kPolygonMesh)) != 0) {
    if (readSurfaces_) makeSurfaceFaces(owner_, vertices_, flags);
    return;
  }
  const bool closed = (flags & polyline_flag::kClosed) != 0;
  if ((flags & polyline_flag::k3dPolyline) != 0) {
    makeLine(owner_, vertices_, closed, true);
    return;
  }
  // A 2D polyline: its vertices lie in its own plane at its elevation.
  Vertex elevation;
  elevation.z = owner_.real(group::kZ, 0.0);
  double normalZ = 1.0;
  const bool flat = horizontal(owner_, normalZ);
  const double nx = owner_.real(group::kExtrusionX, 0.0);
  const double ny = owner_.real(group::kExtrusionY, 0.0);
  for (Vertex& vertex : vertices_) {
    vertex.z = elevation.z;
    if (!flat || normalZ < 0.0) {
      styles_.cad().convertCPInOcsToWcs(vertex.x, vertex.y, vertex.z, nx, ny, normalZ, vertex.x, vertex.y,
                                        vertex.z);
      if (normalZ < 0.0) vertex.bulge = -vertex.bulge;
    }
  }
  makeLine(owner_, vertices_, closed, owner_.has(group::kZ));
}

void DxfObjectBuilder::makeLine(DxfRecord& record, const std::vector<Vertex>& vertices, bool closed,
                                bool heights) {
  const Extras extras = readExtras(record);
  const bool area = extras.kind == kind::kArea;
  const bool region = extras.kind == kind::kRegion;
  if (!((area || region) ? readAreas_ : readLines_)) return;
  const Style style = readStyle(record);
  if (skipMalformed(record)) return;
  if (vertices.empty()) {
    report_.notHeld(std::string(record.type()) + " entities without vertices");
    return;
  }
  const auto northOf = [this](const Vertex& vertex) { return meters(vertex.y); };
  const auto eastOf = [this](const Vertex& vertex) { return meters(vertex.x); };
  const auto heightOf = [this, heights](const Vertex& vertex) {
    return heights ? meters(vertex.z) : kNoValue;
  };
  if (region) {
    auto* outline = new DexRegion();
    for (const Vertex& vertex : vertices)
      outline->addVertex(
          DexPositionWithBulge(northOf(vertex), eastOf(vertex), heightOf(vertex), vertex.bulge));
    if (!extras.name.empty()) outline->setName(wide(extras.name));
    outline->setLayer(layerOf(record.text(group::kLayer)));
    if (style.hasColor) {
      auto* fill = new DexDrawAreaProperties();
      fill->setColor(style.color);
      outline->setAreaDrawProperties(fill);
    }
    dataset_->addRegion(outline);
    ++made_;
    return;
  }
  DexPolyLine* line = nullptr;
  if (area) {
    line = new DexArea();
  } else if (extras.kind == kind::kBreakline) {
    auto* breakline = new DexBreakline(wide(extras.surface));
    breaklines_.emplace_back(breakline, breakline->getSurfaceName());
    line = breakline;
  } else {
    line = new DexPolyLine(false);
  }
  line->reserveNumberOfStations(static_cast<int>(std::min(vertices.size(), kMaxReservedVertices)));
  for (const Vertex& vertex : vertices) {
    DexStation station;
    station.setPosition(northOf(vertex), eastOf(vertex), heightOf(vertex));
    station.setBulge(vertex.bulge);
    line->addStation(station);
  }
  line->setCloseStatus(closed || area);
  finishObject(line, record, extras, style,
               area ? IDexDrawProperties::DRAW_AREA : IDexDrawProperties::DRAW_LINE);
}

void DxfObjectBuilder::addArc(DxfRecord& record, bool circle) {
  double normalZ = 1.0;
  if (!horizontal(record, normalZ)) {
    report_.notHeld(std::string(record.type()) + " entities outside a horizontal plane");
    return;
  }
  Vertex centre;
  pointAt(record, group::kX, true, centre);
  const double radius = record.real(group::kRadius, 0.0);
  double start = record.real(group::kStartAngle, 0.0);
  double end = record.real(group::kEndAngle, kFullTurn);
  const Extras extras = readExtras(record);
  const Style style = readStyle(record);
  if (skipMalformed(record)) return;
  if (!(radius > 0.0) || !isFiniteLength(radius)) {
    report_.notHeld(std::string(record.type()) + " entities without a radius");
    return;
  }
  if (circle) {
    auto* object = new DexCircle();
    object->setCenter(meters(centre.y), meters(centre.x), meters(centre.z));
    object->setData(DexCircle::CIRCLE_RADIUS, meters(radius));
    finishObject(object, record, extras, style, IDexDrawProperties::DRAW_LINE);
    return;
  }
  if (normalZ < 0.0) {  // seen from below: mirrored, and turning the other way
    const double mirroredStart = kHalfTurn - end;
    end = kHalfTurn - start;
    start = mirroredStart;
  }
  auto* arc = new DexArc();
  arc->setCenter(meters(centre.y), meters(centre.x), meters(centre.z));
  arc->setData(DexArc::ARC_RADIUS, meters(radius));
  const bool clockwise = extras.kind == kind::kClockwiseArc;
  arc->setData(DexArc::ARC_START_ANGLE, normalizedAngle(clockwise ? end : start));
  arc->setData(DexArc::ARC_END_ANGLE, normalizedAngle(clockwise ? start : end));
  arc->setDirection(clockwise);
  finishObject(arc, record, extras, style, IDexDrawProperties::DRAW_LINE);
}

void DxfObjectBuilder::addText(DxfRecord& record, bool mtext) {
  double normalZ = 1.0;
  if (!horizontal(record, normalZ)) {
    report_.notHeld(std::string(record.type()) + " entities outside a horizontal plane");
    return;
  }
  Vertex at;
  int insertion = DexTextLabel::INSERT_BOTTOM_LEFT;
  double rotation = record.real(group::kStartAngle, 0.0);
  std::wstring text;
  if (mtext) {
    pointAt(record, group::kX, false, at);
    insertion = std::clamp(record.integer(group::kFlags71, DexTextLabel::INSERT_TOP_LEFT), 1, 9);
    if (!record.has(group::kStartAngle) && record.has(group::kX + 1))
      rotation = degreesOf(record.real(group::kY + 1, 0.0), record.real(group::kX + 1, 1.0));
    std::string bytes;
    for (std::size_t i = 0; i < record.size(); ++i) {
      if (record.codeAt(i) == group::kMoreText) bytes += record.valueAt(i);
    }
    bytes += record.text(group::kText);
    text = decoder_.mtext(bytes);
  } else {
    const int horizontalJustification = record.integer(group::kFlags72, 0);
    const int verticalJustification = record.integer(group::kFlags73, 0);
    const bool aligned = horizontalJustification == 3 || horizontalJustification == 5;
    const bool second =
        (horizontalJustification != 0 || verticalJustification != 0) && !aligned && record.has(group::kX + 1);
    pointAt(record, second ? group::kX + 1 : group::kX, true, at);
    insertion = aligned ? DexTextLabel::INSERT_BOTTOM_LEFT
                        : insertionOf(horizontalJustification, verticalJustification);
    text = decoder_.text(record.text(group::kText));
    if (normalZ < 0.0) rotation = kHalfTurn - rotation;
  }
  const double height = record.real(group::kRadius, 0.0);
  if (!isFiniteLength(height)) record.markMalformed(group::kRadius);
  const Extras extras = readExtras(record);
  const Style style = readStyle(record);
  if (skipMalformed(record)) return;
  auto* label = new DexTextLabel();
  label->setCoords(meters(at.y), meters(at.x), meters(at.z));
  label->setText(CVynStringT<wchar_t>(std::wstring_view(text)));
  label->setHeightInMeters(meters(height));
  label->setRotationAngle(normalizedAngle(rotation));
  label->setInsertionPoint(insertion);
  finishObject(label, record, extras, style, IDexDrawProperties::DRAW_POINT);
}

// ---- Surfaces ----------------------------------------------------------------------------------------

DexSurface* DxfObjectBuilder::surfaceFor(DxfRecord& record, const Extras& extras) {
  const DexLayer* layer = layerOf(record.text(group::kLayer));
  const std::wstring name = extras.kind == kind::kSurface && !extras.name.empty()
                                ? decoder_.plain(extras.name)
                                : std::wstring(layer->getName().view());
  DexSurface*& surface = surfaceByKey_[{layer, name}];
  if (surface == nullptr) {
    surface = new DexSurface();
    surface->setName(CVynStringT<wchar_t>(std::wstring_view(name)));
    surface->setLayer(layer);
    dataset_->add(surface);
    ++made_;
  }
  return surface;
}

struct DxfObjectBuilder::Faces {
  DxfRecord& record;
  const Extras& extras;
  DexSurface* surface = nullptr;
};

void DxfObjectBuilder::addTriangle(Faces& faces, const Vertex& a, const Vertex& b, const Vertex& c) {
  const auto same = [](const Vertex& p, const Vertex& q) { return p.x == q.x && p.y == q.y && p.z == q.z; };
  if (same(a, b) || same(b, c) || same(a, c)) {
    report_.notHeld("surface faces without area");
    return;
  }
  if (faces.surface == nullptr) faces.surface = surfaceFor(faces.record, faces.extras);
  int corners[3];
  const Vertex* vertices[3] = {&a, &b, &c};
  for (int k = 0; k < 3; ++k) {
    const DexPosition3D position(meters(vertices[k]->y), meters(vertices[k]->x), meters(vertices[k]->z));
    corners[k] = faces.surface->getPositionIndex(position);
    if (corners[k] < 0) corners[k] = faces.surface->addPosition(position);
  }
  auto* triangle = new DexTriangle();
  triangle->setPositions(corners);
  faces.surface->addTriangle(triangle);
}

void DxfObjectBuilder::addFace(DxfRecord& record) {
  Vertex corners[4];
  for (int k = 0; k < 3; ++k)
    pointAt(record, group::kX + k, false, corners[k]);
  corners[3] = corners[2];
  if (record.has(group::kX + 3)) pointAt(record, group::kX + 3, false, corners[3]);
  const Extras extras = readExtras(record);
  if (skipMalformed(record)) return;
  Faces faces{record, extras};
  addTriangle(faces, corners[0], corners[1], corners[2]);
  const bool quad =
      corners[3].x != corners[2].x || corners[3].y != corners[2].y || corners[3].z != corners[2].z;
  if (quad) addTriangle(faces, corners[0], corners[2], corners[3]);
}

void DxfObjectBuilder::makeSurfaceFaces(DxfRecord& record, const std::vector<Vertex>& vertices, int flags) {
  const Extras extras = readExtras(record);
  if (skipMalformed(record)) return;
  Faces faces{record, extras};
  if ((flags & polyline_flag::kPolyfaceMesh) != 0) {
    std::vector<const Vertex*> positions;
    for (const Vertex& vertex : vertices) {
      if ((vertex.flags & kVertexMeshPosition) != 0) positions.push_back(&vertex);
    }
    const auto corner = [&positions](int index) -> const Vertex* {
      const std::size_t at = static_cast<std::size_t>(std::abs(index));
      return at >= 1 && at <= positions.size() ? positions[at - 1] : nullptr;
    };
    for (const Vertex& face : vertices) {
      if ((face.flags & kVertexMeshPosition) != 0 || (face.flags & kVertexFaceRecord) == 0) continue;
      const Vertex* a = corner(face.corners[0]);
      const Vertex* b = corner(face.corners[1]);
      const Vertex* c = corner(face.corners[2]);
      if (a == nullptr || b == nullptr || c == nullptr) {
        report_.notHeld("mesh faces without their vertices");
        continue;
      }
      addTriangle(faces, *a, *b, *c);
      if (const Vertex* d = face.corners[3] != 0 ? corner(face.corners[3]) : nullptr; d != nullptr)
        addTriangle(faces, *a, *c, *d);
    }
    return;
  }
  // A polygon mesh: M rows of N vertices, two triangles a cell.
  const long long columns = std::max(0, record.integer(group::kFlags72, 0));
  const long long rows = columns > 0 ? std::min<long long>(std::max(0, record.integer(group::kFlags71, 0)),
                                                           static_cast<long long>(vertices.size()) / columns)
                                     : 0;
  if (rows < 2 || columns < 2) {
    report_.notHeld("POLYLINE meshes without cells");
    return;
  }
  const auto at = [&](long long row, long long column) -> const Vertex& {
    return vertices[static_cast<std::size_t>(row * columns + column)];
  };
  for (long long row = 0; row + 1 < rows; ++row) {
    for (long long column = 0; column + 1 < columns; ++column) {
      addTriangle(faces, at(row, column), at(row, column + 1), at(row + 1, column + 1));
      addTriangle(faces, at(row, column), at(row + 1, column + 1), at(row + 1, column));
    }
  }
}

}  // namespace vyn::ie::dxf
