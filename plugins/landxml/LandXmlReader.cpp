#include "LandXmlReader.h"

#include <algorithm>
#include <cmath>

#include "LandXmlText.h"

#include "hostlibs/VynLogging.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPoints.h"

namespace vyn::ie::landxml {

namespace {

// Tokens between two looks at the stop flag.
constexpr std::int64_t kStopCheckTokens = 4096;
// Characters of a malformed text that its trace quotes.
constexpr std::size_t kTracedDetail = 80;

}  // namespace

std::wstring_view localName(std::wstring_view tag) noexcept {
  const std::size_t colon = tag.find(L':');
  return colon == std::wstring_view::npos ? tag : tag.substr(colon + 1);
}

// ---- ElementPath ---------------------------------------------------------------------------------

std::wstring_view ElementPath::name(int levelsUp) const noexcept {
  const int index = depth_ - 1 - levelsUp;
  return index >= 0 && levelsUp >= 0 ? std::wstring_view(names_[static_cast<std::size_t>(index)])
                                     : std::wstring_view();
}

void ElementPath::push(std::wstring_view name) {
  if (static_cast<std::size_t>(depth_) == names_.size()) names_.emplace_back();
  names_[static_cast<std::size_t>(depth_++)].assign(name);
}

// ---- ReadContext ---------------------------------------------------------------------------------

ReadContext::ReadContext(DexData& data, const CVynStringT<wchar_t>& fileName)
    : data_(data), dataset_(*data.getCurDataset()), fileName_(fileName) {
  firstObject_ = dataset_.getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE);
}

ReadContext::~ReadContext() = default;

namespace {

// value in meters, false when it is not a finite number other than the no-value marker.
bool convert(double& value, EDistUnits units) {
  value = utils::toMetersFactor(value, units);
  return std::isfinite(value) && std::fabs(value) < kNoValue;
}

}  // namespace

int ReadContext::readCoordinates(std::wstring_view text, double* meters, int capacity) const {
  const int count = readNumbers(text, meters, capacity);
  if (count < 0 || count > capacity) return -1;
  for (int i = 0; i < count; ++i) {
    if (!convert(meters[i], units_.linear)) return -1;
  }
  return count;
}

bool ReadContext::toMeters(std::vector<double>& values) const {
  return std::all_of(values.begin(), values.end(),
                     [this](double& value) { return convert(value, units_.linear); });
}

void ReadContext::notHeld(std::wstring_view element) {
  const auto found = notHeld_.find(element);
  if (found != notHeld_.end()) {
    ++found->second;
  } else {
    notHeld_.emplace(std::wstring(element), 1);
  }
}

void ReadContext::notHeld(std::wstring_view element, std::wstring_view attribute) {
  if (isDerivedAttribute(attribute)) return;
  std::wstring key(element);
  key += L'@';
  key += attribute;
  notHeld(key);
}

void ReadContext::notHeldAttributes(std::wstring_view element, std::wstring_view attributes) {
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view /*value*/) {
    notHeld(element, attribute);
  });
}

void ReadContext::malformed(std::wstring_view kind, std::wstring_view detail) {
  const auto found = malformed_.find(kind);
  if (found != malformed_.end()) {
    ++found->second;
  } else {
    malformed_.emplace(std::wstring(kind), 1);
  }
  if (++tracedProblems_ <= kTracedProblems) {
    VYN_TRACE_ALWAYS(L"%ls: %ls: %ls", fileName_.GetString(), std::wstring(kind).c_str(),
                     std::wstring(detail.substr(0, kTracedDetail)).c_str());
  }
}

EDexResult ReadContext::finish(bool truncated) {
  for (const auto& [what, count] : notHeld_)
    VYN_TRACE_ALWAYS(L"%ls: not held: %lld %ls", fileName_.GetString(), static_cast<long long>(count),
                     what.c_str());
  for (const auto& [kind, count] : malformed_)
    VYN_TRACE_ALWAYS(L"%ls: %ls (%lld in all)", fileName_.GetString(), kind.c_str(),
                     static_cast<long long>(count));
  if (truncated) {
    VYN_TRACE_ALWAYS(L"%ls: the document breaks off; what was read before the break is kept",
                     fileName_.GetString());
    return kResultTruncated;
  }
  if (!malformed_.empty()) return kResultMalformedSkipped;
  if (!notHeld_.empty()) return kResultNotHeld;
  return DEX_RESULT_OK;
}

void ReadContext::addPoint(DexDesignPoint* point) {
  if (pointsByName_) pointsByName_->emplace(std::wstring(point->getName().view()), point);
}

DexDesignPoint* ReadContext::findPoint(std::wstring_view name) {
  if (!pointsByName_) indexPoints();
  const auto found = pointsByName_->find(name);
  return found == pointsByName_->end() ? nullptr : found->second;
}

void ReadContext::indexPoints() {
  pointsByName_ = std::make_unique<point_files::TextMap<DexDesignPoint*>>();
  const int count = dataset_.getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE);
  for (int i = firstObject_; i < count; ++i) {
    if (auto* point = dynamic_cast<DexDesignPoint*>(dataset_.getObjectAt(i)))
      pointsByName_->emplace(std::wstring(point->getName().view()), point);
  }
}

// ---- CollectionHandler ---------------------------------------------------------------------------

CollectionHandler::~CollectionHandler() = default;
void CollectionHandler::text(const ElementPath& /*path*/, std::wstring_view /*text*/) {}
void CollectionHandler::end(const ElementPath& /*path*/) {}
void CollectionHandler::finish() {}

// ---- LandXmlReader -------------------------------------------------------------------------------

namespace {

constexpr int kRootDepth = 1;
constexpr int kCollectionDepth = 2;

}  // namespace

void LandXmlReader::addCollection(std::wstring_view name, CollectionHandler& handler) {
  collections_.push_back({std::wstring(name), &handler});
}

void LandXmlReader::skipCollection(std::wstring_view name) {
  collections_.push_back({std::wstring(name), nullptr});
}

const LandXmlReader::Collection* LandXmlReader::findCollection(std::wstring_view name) const {
  const auto found = std::find_if(collections_.begin(), collections_.end(),
                                  [name](const Collection& collection) { return collection.name == name; });
  return found == collections_.end() ? nullptr : &*found;
}

EDexResult LandXmlReader::read(CXmlParserBase& parser) {
  std::wstring_view tag;
  std::wstring_view attributes;
  std::wstring_view value;
  bool rootClosed = false;
  bool stopped = false;
  std::int64_t tokens = 0;
  while (parser.ReadToken(tag, attributes, value)) {
    if (++tokens % kStopCheckTokens == 0 && DexData::stopProcess_) {
      stopped = true;
      break;
    }
    const std::wstring_view name = tag;
    if (name.empty()) continue;  // the XML declaration
    if (name.front() == L'/') {
      endElement();
      if (path_.depth() == 0) {
        rootClosed = true;
        break;
      }
      continue;
    }
    if (!value.empty()) {
      if (skipDepth_ == 0 && current_ != nullptr) current_->handler->text(path_, value);
      continue;
    }
    if (path_.depth() == 0) {
      if (localName(name) != element::kLandXml) return DEX_RESULT_WRONG_FORMAT;
      path_.push(element::kLandXml);
      forEachAttribute(attributes, [this](std::wstring_view attribute, std::wstring_view text) {
        if (attribute == attribute::kVersion && text != kWrittenVersion) {
          VYN_TRACE_ALWAYS(L"LandXML version %ls: read where its elements agree with 1.2",
                           std::wstring(text).c_str());
        }
        if (!isFramingAttribute(attribute)) context_.notHeld(element::kLandXml, attribute);
      });
      continue;
    }
    path_.push(localName(name));
    startElement(attributes);
  }
  if (!stopped && path_.depth() == 0 && !rootClosed) return DEX_RESULT_WRONG_FORMAT;  // no element at all
  std::vector<CollectionHandler*> finished;
  for (const Collection& collection : collections_) {
    if (collection.handler == nullptr ||
        std::find(finished.begin(), finished.end(), collection.handler) != finished.end())
      continue;
    collection.handler->finish();
    finished.push_back(collection.handler);
  }
  if (stopped) return DEX_RESULT_STOPPED;
  return rootClosed ? DEX_RESULT_OK : kResultTruncated;
}

void LandXmlReader::startElement(std::wstring_view attributes) {
  if (skipDepth_ > 0) return;
  const int depth = path_.depth();
  if (depth == kCollectionDepth) {
    current_ = findCollection(path_.name());
    if (current_ == nullptr) context_.notHeld(path_.name());
    if (current_ == nullptr || current_->handler == nullptr) {
      skipDepth_ = depth;
      return;
    }
  }
  if (current_ == nullptr) return;
  if (!current_->handler->start(path_, attributes)) {
    context_.notHeld(path_.name());
    skipDepth_ = depth;
  }
}

void LandXmlReader::endElement() {
  const int depth = path_.depth();
  if (skipDepth_ > 0) {
    if (depth == skipDepth_) skipDepth_ = 0;
  } else if (current_ != nullptr && depth >= kCollectionDepth) {
    current_->handler->end(path_);
  }
  if (depth <= kCollectionDepth) current_ = nullptr;
  if (depth >= kRootDepth) path_.pop();
}

}  // namespace vyn::ie::landxml
