#include "ieObjects/IELayers.h"

#include <utility>

namespace vyn::ie {

// DexLayer

DexLayer::~DexLayer() = default;

DexDrawPointProperties* DexLayer::getDrawPointProperties() {
  return dynamic_cast<DexDrawPointProperties*>(getDrawProperties(IDexDrawProperties::DRAW_POINT));
}

const DexDrawPointProperties* DexLayer::getDrawPointProperties() const {
  return dynamic_cast<const DexDrawPointProperties*>(getDrawProperties(IDexDrawProperties::DRAW_POINT));
}

DexDrawLineProperties* DexLayer::getDrawLineProperties() {
  return dynamic_cast<DexDrawLineProperties*>(getDrawProperties(IDexDrawProperties::DRAW_LINE));
}

const DexDrawLineProperties* DexLayer::getDrawLineProperties() const {
  return dynamic_cast<const DexDrawLineProperties*>(getDrawProperties(IDexDrawProperties::DRAW_LINE));
}

DexDrawAreaProperties* DexLayer::getDrawAreaProperties() {
  return dynamic_cast<DexDrawAreaProperties*>(getDrawProperties(IDexDrawProperties::DRAW_AREA));
}

const DexDrawAreaProperties* DexLayer::getDrawAreaProperties() const {
  return dynamic_cast<const DexDrawAreaProperties*>(getDrawProperties(IDexDrawProperties::DRAW_AREA));
}

void DexLayer::setActiveStatus(bool active) {
  active_ = active;
  statusByDefault_ = false;
}

void DexLayer::setPlotStatus(bool plot) {
  plot_ = plot;
  statusByDefault_ = false;
}

void DexLayer::setNotes(const CVynStringT<wchar_t>& notes) {
  notes_ = notes;
  statusByDefault_ = false;
}

EDexAvoidanceMode DexLayer::getAvoidance(double& value, EDexSurfaceAvoidanceMode& surfaceMode) const {
  value = avoidanceValue_;
  surfaceMode = surfaceAvoidanceMode_;
  return avoidanceMode_;
}

void DexLayer::setAvoidance(EDexAvoidanceMode mode, EDexSurfaceAvoidanceMode surfaceMode, double value) {
  avoidanceMode_ = mode;
  surfaceAvoidanceMode_ = surfaceMode;
  avoidanceValue_ = value;
}

bool DexLayer::areAllParamsByDefault() const {
  return statusByDefault_ && avoidanceMode_ == AVOIDANCE_NONE && !drawProperties_.isAnyDefined();
}

IDexDrawProperties* DexLayer::createDrawPropertiesFromString(const CVynStringT<wchar_t>& text) {
  return DexDrawPropertiesByType::createFromString(text);
}

// DexDrawDictionary

DexDrawDictionary::~DexDrawDictionary() = default;

DexLayer* DexDrawDictionary::findLayer(const CVynStringT<wchar_t>& name) {
  return const_cast<DexLayer*>(std::as_const(*this).findLayer(name));
}

const DexLayer* DexDrawDictionary::findLayer(const CVynStringT<wchar_t>& name) const {
  return layers_.findFirst([&name](const DexLayer& layer) { return layer.getName() == name; });
}

bool DexDrawDictionary::setDefaultLayer(int index) {
  if (index < 0 || index >= getNumberOfLayers()) return false;
  defaultLayerIndex_ = index;
  return true;
}

}  // namespace vyn::ie
