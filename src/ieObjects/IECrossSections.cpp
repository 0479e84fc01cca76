#include "ieObjects/IECrossSections.h"

#include <algorithm>
#include <cmath>
#include <memory>

#include "hostlibs/VynFormats.h"

namespace vyn::ie {

namespace {

using ETSDataType = DexTemplateSegment::ETSDataType;

// Templates are compared as surveyors read them: to the millimetre.
constexpr int kCompareDecimals = 3;
// A point within this distance of the centre line is its centre point.
constexpr double kCentreLineReach = 0.1;

double rounded(double value) {
  return vyn::math::round_prec(value, kCompareDecimals);
}

double offsetOf(const DexTemplateSegment& segment) {
  return segment.getData(DexTemplateSegment::OFFSET);
}

double heightOf(const DexTemplateSegment& segment) {
  return segment.getData(DexTemplateSegment::HEIGHT);
}

bool isCentrePoint(const DexTemplateSegment* segment) {
  return segment != nullptr && rounded(offsetOf(*segment)) == 0.0 && rounded(heightOf(*segment)) == 0.0;
}

bool haveEqualNames(const DexTemplateSegment& a, const DexTemplateSegment& b) {
  if (a.getName().IsEmpty() || b.getName().IsEmpty()) return a.getName().IsEmpty() && b.getName().IsEmpty();
  return a.getName().Compare(b.getName()) == 0;
}

bool areRoundedEqual(const DexTemplateSegment& a, const DexTemplateSegment& b) {
  return rounded(offsetOf(a)) == rounded(offsetOf(b)) && rounded(heightOf(a)) == rounded(heightOf(b)) &&
         haveEqualNames(a, b);
}

// Replaces the chosen values of every segment of roadTemplate by convert(value, previous unconverted
// value, running sum), walking the segments in order.
template <class Convert>
void convertSegments(DexRoadTemplate& roadTemplate, bool offsets, bool heights, Convert convert) {
  double previous[2] = {0.0, 0.0};
  double sum[2] = {0.0, 0.0};
  const bool chosen[2] = {offsets, heights};
  for (int i = 0; i < roadTemplate.getNumberOfSegments(); ++i) {
    DexTemplateSegment* const segment = roadTemplate.getSegmentAt(i);
    for (const int kind : {DexTemplateSegment::OFFSET, DexTemplateSegment::HEIGHT}) {
      const double value = segment->getData(kind);
      sum[kind] += value;
      if (chosen[kind]) segment->setData(kind, convert(value, previous[kind], sum[kind]));
      previous[kind] = value;
    }
  }
}

}  // namespace

// ---- DexTemplateSegment --------------------------------------------------------------------------

DexTemplateSegment::DexTemplateSegment(double offset, double height, const CVynStringT<wchar_t>& name)
    : name_(name) {
  data_.set(OFFSET, offset);
  data_.set(HEIGHT, height);
}

DexTemplateSegment::~DexTemplateSegment() = default;

DexTemplateSegment* DexTemplateSegment::clone() const {
  return new DexTemplateSegment(*this);
}

// ---- DexRoadTemplate -----------------------------------------------------------------------------

DexRoadTemplate::~DexRoadTemplate() = default;

int DexRoadTemplate::findSegment(const DexTemplateSegment* segment) const {
  if (segment == nullptr) return -1;
  for (int i = 0; i < getNumberOfSegments(); ++i) {
    const DexTemplateSegment& candidate = *segments_.at(i);
    if (offsetOf(candidate) == offsetOf(*segment) && heightOf(candidate) == heightOf(*segment) &&
        candidate.getName().Compare(segment->getName()) == 0) {
      return i;
    }
  }
  return -1;
}

double DexRoadTemplate::getCLHeight() const {
  const DexTemplateSegment* const centre = segments_.findFirst([](const DexTemplateSegment& segment) {
    return std::fabs(rounded(offsetOf(segment))) < kCentreLineReach;
  });
  return centre != nullptr ? heightOf(*centre) : 0.0;
}

void DexRoadTemplate::removeCLHeight(double height) {
  for (DexTemplateSegment* segment : segments_)
    segment->setData(DexTemplateSegment::HEIGHT, heightOf(*segment) - height);
}

void DexRoadTemplate::makeOffsetsOrdered() {
  segments_.sort(
      [](const DexTemplateSegment& a, const DexTemplateSegment& b) { return offsetOf(a) < offsetOf(b); });
}

void DexRoadTemplate::makeOffsetsPositiveAndOrdered(bool reorder) {
  for (int i = getNumberOfSegments() - 1; i >= 0; --i) {
    DexTemplateSegment* const segment = segments_.at(i);
    const double offset = offsetOf(*segment);
    if (!(offset < 0.0)) continue;
    const double mirrored = std::fabs(offset);
    segment->setData(DexTemplateSegment::OFFSET, mirrored);
    if (!reorder) continue;
    int found = getNumberOfSegments() - 1;
    while (found >= 0 && !(offsetOf(*segments_.at(found)) < mirrored))
      --found;
    if (found < 0 || found == i - 1) continue;
    // Segments between the found one and this one (behind it) are not negative: skipping them is safe.
    const int target = found > i ? found : found + 1;
    segments_.insert(target, segments_.detach(i));
  }
}

DexRoadTemplate* DexRoadTemplate::separateLeftPart() {
  std::unique_ptr<DexRoadTemplate> left;
  for (int i = 0; i < getNumberOfSegments();) {
    const double offset = offsetOf(*segments_.at(i));
    if (!(offset <= 0.0)) {
      ++i;
      continue;
    }
    if (!left) left = std::make_unique<DexRoadTemplate>();
    if (offset < 0.0) {
      left->addSegment(segments_.detach(i));
    } else {
      left->addSegment(segments_.at(i)->clone());
      ++i;
    }
  }
  const auto holdsOnlyCentre = [](const DexRoadTemplate& t) {
    return t.getNumberOfSegments() == 1 && offsetOf(*t.getSegmentAt(0)) == 0.0;
  };
  if (!left || holdsOnlyCentre(*left)) return nullptr;
  left->setName(name_);
  if (holdsOnlyCentre(*this)) segments_.clear();
  return left.release();
}

void DexRoadTemplate::addCentrePointMissingHere(const DexRoadTemplate& other) {
  const DexTemplateSegment* const otherFirst = other.getSegmentAt(0);
  const DexTemplateSegment* const otherLast = other.getSegmentAt(other.getNumberOfSegments() - 1);
  if (isCentrePoint(otherFirst) && !isCentrePoint(getSegmentAt(0))) {
    segments_.insert(0, otherFirst->clone());
  } else if (isCentrePoint(otherLast) && !isCentrePoint(getSegmentAt(getNumberOfSegments() - 1))) {
    segments_.add(otherLast->clone());
  }
}

bool DexRoadTemplate::isEqual(const DexRoadTemplate* other, bool adjust) {
  if (other == nullptr || name_.Compare(other->getName()) != 0) return false;
  const int difference = getNumberOfSegments() - other->getNumberOfSegments();
  if (adjust ? std::abs(difference) > 1 : difference != 0) return false;
  if (adjust) addCentrePointMissingHere(*other);
  for (int i = 0; i < other->getNumberOfSegments(); ++i) {
    const DexTemplateSegment* const mine = getSegmentAt(i);
    if (mine == nullptr || !areRoundedEqual(*mine, *other->getSegmentAt(i))) return false;
  }
  return true;
}

// ---- DexRoadTemplatesDictionary ------------------------------------------------------------------

DexRoadTemplatesDictionary::~DexRoadTemplatesDictionary() = default;

void DexRoadTemplatesDictionary::convertOffsetsCentralToSeq(bool offsets, bool heights) {
  if (!offsets && !heights) return;
  centralOffsetsUsed_ = false;
  for (const auto& entry : templates_) {
    convertSegments(*entry.second, offsets, heights,
                    [](double value, double previous, double /*sum*/) { return value - previous; });
  }
}

void DexRoadTemplatesDictionary::convertOffsetsSeqToCentral(bool offsets, bool heights) {
  if (!offsets && !heights) return;
  centralOffsetsUsed_ = true;
  for (const auto& entry : templates_) {
    convertSegments(*entry.second, offsets, heights,
                    [](double /*value*/, double /*previous*/, double sum) { return sum; });
  }
}

// ---- DexCrossSection -----------------------------------------------------------------------------

DexCrossSection::DexCrossSection(const DexRoadTemplate* roadTemplate) {
  templates_.push_back(roadTemplate);
}

DexCrossSection::~DexCrossSection() = default;

void DexCrossSection::setLevelAtCL(double level, const DexVerticalAlignment* verticalAlignment) {
  levelsAtCL_.try_emplace(verticalAlignment, level);
}

double DexCrossSection::getLevelAtCL(const DexVerticalAlignment* verticalAlignment) const {
  const auto found = levelsAtCL_.find(verticalAlignment);
  return found != levelsAtCL_.end() ? found->second : 0.0;
}

void DexCrossSection::addRoadTemplate(DexRoadTemplate* roadTemplate) {
  if (roadTemplate != nullptr) templates_.push_back(roadTemplate);
}

const DexRoadTemplate* DexCrossSection::getRoadTemplateAt(int index) const noexcept {
  return index >= 0 && index < getNumberOfRoadTemplates() ? templates_[static_cast<std::size_t>(index)]
                                                          : nullptr;
}

const DexRoadTemplate* DexCrossSection::findRoadTemplate(const CVynStringT<wchar_t>& name) const {
  const auto found = std::find_if(templates_.begin(), templates_.end(), [&name](const DexRoadTemplate* t) {
    return t != nullptr && t->getName().Compare(name) == 0;
  });
  return found != templates_.end() ? *found : nullptr;
}

bool DexCrossSection::removeRoadTemplate(const CVynStringT<wchar_t>& name) {
  const auto found = std::find_if(templates_.begin(), templates_.end(), [&name](const DexRoadTemplate* t) {
    return t != nullptr && t->getName().Compare(name) == 0;
  });
  if (found == templates_.end()) return false;
  templates_.erase(found);
  return true;
}

void DexCrossSection::copyData(const DexCrossSection* other) {
  if (other == nullptr || other == this) return;
  levelsAtCL_ = other->levelsAtCL_;
  sta_ = other->getSta();
  templates_ = other->templates_;
  turn_ = other->getTurn();
}

// ---- DexCrossSectionSet --------------------------------------------------------------------------

DexCrossSectionSet::DexCrossSectionSet(bool useTemplateMap) : useTemplateMap_(useTemplateMap) {}

DexCrossSectionSet::~DexCrossSectionSet() = default;

bool DexCrossSectionSet::addCrossSection(DexCrossSection* crossSection) {
  if (crossSection == nullptr) return false;
  if (useTemplateMap_) {
    for (int i = 0; i < crossSection->getNumberOfRoadTemplates(); ++i) {
      const DexRoadTemplate* const roadTemplate = crossSection->getRoadTemplateAt(i);
      if (roadTemplate != nullptr) templateNames_.insert(roadTemplate->getName());
    }
  }
  return crossSections_.add(crossSection);
}

}  // namespace vyn::ie
