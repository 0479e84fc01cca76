#include "ieObjects/IEObjectBase.h"

#include "hostlibs/VynLogging.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/detail/ObjectsLog.h"

namespace vyn::ie {

namespace {

// The description of an object's first code; logs (at line) and answers null when there is no code.
const DexCodeDescription* firstCodeDescription(const DexCodesDataInterface& codes, int line) {
  const DexCodeValues* const firstCode = codes.getCode(0);
  if (firstCode == nullptr) {
    vyn_logging::vyn_err_log(detail::kObjectsLogSource, line);
    return nullptr;
  }
  return firstCode->getDescription();
}

}  // namespace

DexObject::~DexObject() = default;

void DexObject::setStateType(ECurrentState state) {
  state_ = state;
}

IDexStateInterface::ECurrentState DexObject::getStateType() const {
  return state_;
}

void DexObject::copyCommonData(DexObject* target) const {
  if (target == nullptr || target == this) return;
  copyCodesData(target);
  target->setLayer(getLayer(), false);
  const IDexDrawProperties* const properties = getDrawProperties();
  target->setDrawProperties(properties != nullptr ? properties->clone() : nullptr);
  target->setStateType(getStateType());
  if (photoNotes_.get() == nullptr) {
    target->setPhotoNotes(nullptr);
  } else if (target->photoNotes_.get() == nullptr) {
    target->setPhotoNotes(new DexPhotoNotes(*photoNotes_.get()));
  } else {
    *target->photoNotes_.get() = *photoNotes_.get();
  }
}

void DexObject::setLayer(const DexLayer* layer, bool byCode) noexcept {
  layer_ = layer;
  layerByCode_ = byCode;
}

const IDexDrawProperties* DexObject::getDrawPropertiesByCode(int type) const {
  const DexCodeDescription* const description =
      firstCodeDescription(*this, detail::kDrawPropertiesByCodeWithoutCodeLine);
  return description != nullptr ? description->getDrawProperties(type) : nullptr;
}

const IDexDrawProperties* DexObject::getDrawPropertiesByCodeLayer(int type) const {
  const DexCodeDescription* const description =
      firstCodeDescription(*this, detail::kDrawPropertiesByCodeLayerWithoutCodeLine);
  const DexLayer* const layer = description != nullptr ? description->getLayer() : nullptr;
  return layer != nullptr ? layer->getDrawProperties(type) : nullptr;
}

}  // namespace vyn::ie
