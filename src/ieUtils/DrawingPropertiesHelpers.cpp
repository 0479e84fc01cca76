#include "ieUtils/DrawingPropertiesHelpers.h"

#include "hostlibs/VynLogging.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEObjects.h"

namespace vyn::ie {

namespace {

constexpr const wchar_t* kDrawingPropertiesLogSource = L"ieUtils\\DrawingPropertiesHelpers";
constexpr int kNoStyleInDefaultLayerLine = 101;
constexpr int kNoStyleInDefaultLayerMessageLevel = 4;

// How one value type is read from a property object of the form that has it, and how its by-layer
// flag is tested. A property object of another form reads nothing and is not by layer.
template <class Properties, class T, bool (Properties::*Read)(T&) const, bool (Properties::*ByLayer)() const>
struct FormReader {
  static bool read(const IDexDrawProperties& properties, T& value) {
    const auto* const form = dynamic_cast<const Properties*>(&properties);
    return form != nullptr && (form->*Read)(value);
  }
  static bool isByLayer(const IDexDrawProperties& properties) {
    const auto* const form = dynamic_cast<const Properties*>(&properties);
    return form != nullptr && (form->*ByLayer)();
  }
};

template <class T>
struct StyleReader;

// Every form has a colour.
template <>
struct StyleReader<unsigned long> {
  static bool read(const IDexDrawProperties& properties, unsigned long& value) {
    return properties.getColor(value);
  }
  static bool isByLayer(const IDexDrawProperties& properties) { return properties.isColorByLayer(); }
};

template <>
struct StyleReader<DexDrawPointProperties::EMarkStyleType>
    : FormReader<DexDrawPointProperties, DexDrawPointProperties::EMarkStyleType,
                 &DexDrawPointProperties::getMarkStyle, &DexDrawPointProperties::isMarkStyleByLayer> {};

template <>
struct StyleReader<DexDrawLineProperties::EDashStyleType>
    : FormReader<DexDrawLineProperties, DexDrawLineProperties::EDashStyleType,
                 &DexDrawLineProperties::getDashStyle, &DexDrawLineProperties::isDashStyleByLayer> {};

template <>
struct StyleReader<unsigned char>
    : FormReader<DexDrawLineProperties, unsigned char, &DexDrawLineProperties::getWidth,
                 &DexDrawLineProperties::isWidthByLayer> {};

template <>
struct StyleReader<DexDrawAreaProperties::EFillStyleType>
    : FormReader<DexDrawAreaProperties, DexDrawAreaProperties::EFillStyleType,
                 &DexDrawAreaProperties::getFillStyleType, &DexDrawAreaProperties::isFillStyleByLayer> {};

template <>
struct StyleReader<short>
    : FormReader<DexDrawAreaProperties, short, &DexDrawAreaProperties::getFillTransparency,
                 &DexDrawAreaProperties::isFillTransparencyByLayer> {};

// Reading from a missing property object fails; a missing object is not by layer.
template <class T>
bool readFrom(const IDexDrawProperties* properties, T& value) {
  return properties != nullptr && StyleReader<T>::read(*properties, value);
}

template <class T>
bool isByLayer(const IDexDrawProperties* properties) {
  return properties != nullptr && StyleReader<T>::isByLayer(*properties);
}

const IDexDrawProperties* layerPropertiesOf(const DexLayer* layer, int type) {
  return layer != nullptr ? layer->getDrawProperties(type) : nullptr;
}

// An area keeps its fill apart from its outline. The class is tested rather than getType(), which is
// not const and whose answer would not make the cast safe.
const IDexDrawProperties* ownPropertiesOf(const DexObject& object, int type) {
  if (type == IDexDrawProperties::DRAW_AREA) {
    if (const auto* const area = dynamic_cast<const DexArea*>(&object)) return area->getAreaDrawProperties();
  }
  return object.getDrawProperties();
}

// Steps 1 to 3 of the resolution: what the object, its layer and its first code define.
template <class T>
EStyleDefinitionObject resolveFromObject(int type, const DexObject& object, T& value) {
  const IDexDrawProperties* const own = ownPropertiesOf(object, type);
  const DexLayer* const layer = object.getLayer();
  if (own != nullptr && own->getType() == type && readFrom(own, value)) return STYLE_FROM_OBJECT;
  if (layer != nullptr && isByLayer<T>(own) && readFrom(layerPropertiesOf(layer, type), value)) {
    return STYLE_FROM_LAYER;
  }
  if (object.getNumberOfCodes() > 0) {
    const IDexDrawProperties* const byCode = object.getDrawPropertiesByCode(type);
    if (readFrom(byCode, value)) return STYLE_FROM_CODE;
    if (isByLayer<T>(byCode) && readFrom(object.getDrawPropertiesByCodeLayer(type), value)) {
      return STYLE_FROM_CODE_LAYER;
    }
  } else if (layer != nullptr && own == nullptr && readFrom(layerPropertiesOf(layer, type), value)) {
    return STYLE_FROM_LAYER;
  }
  return STYLE_NOT_FOUND;
}

}  // namespace

template <DexStyleValue T>
EStyleDefinitionObject getObjectStyle(int type, const DexObject* object, T& value,
                                      const DexLayer* defaultLayer) {
  if (object != nullptr) {
    const EStyleDefinitionObject source = resolveFromObject(type, *object, value);
    if (source != STYLE_NOT_FOUND) return source;
  }
  if (defaultLayer == nullptr) return STYLE_NOT_FOUND;
  if (readFrom(layerPropertiesOf(defaultLayer, type), value)) return STYLE_FROM_DEFAULT_LAYER;
  vyn_logging::vyn_err_log(kDrawingPropertiesLogSource, kNoStyleInDefaultLayerLine);
  LOGMESSAGE(kNoStyleInDefaultLayerMessageLevel, L"couldn't read color even from default layer style");
  return STYLE_NOT_FOUND;
}

template DEX_API EStyleDefinitionObject getObjectStyle<unsigned long>(int, const DexObject*, unsigned long&,
                                                                      const DexLayer*);
template DEX_API EStyleDefinitionObject getObjectStyle<DexDrawPointProperties::EMarkStyleType>(
    int, const DexObject*, DexDrawPointProperties::EMarkStyleType&, const DexLayer*);
template DEX_API EStyleDefinitionObject getObjectStyle<DexDrawLineProperties::EDashStyleType>(
    int, const DexObject*, DexDrawLineProperties::EDashStyleType&, const DexLayer*);
template DEX_API EStyleDefinitionObject getObjectStyle<unsigned char>(int, const DexObject*, unsigned char&,
                                                                      const DexLayer*);
template DEX_API EStyleDefinitionObject getObjectStyle<DexDrawAreaProperties::EFillStyleType>(
    int, const DexObject*, DexDrawAreaProperties::EFillStyleType&, const DexLayer*);
template DEX_API EStyleDefinitionObject getObjectStyle<short>(int, const DexObject*, short&, const DexLayer*);

}  // namespace vyn::ie
