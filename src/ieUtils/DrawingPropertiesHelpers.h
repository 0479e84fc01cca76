#pragma once

#include <concepts>

#include "hostlibs/DexApi.h"
#include "ieObjects/IEDrawProperties.h"

// Style resolution for drawing exporters: the one drawing value (colour, mark, dash style, width, fill
// style, fill transparency) that applies to a survey object, whether the object defines it itself or
// leaves it to its layer, its first code, that code's layer or the default layer.
//
// Error-log record (source ieUtils\DrawingPropertiesHelpers, empty message):
// - line 101: not even the default layer defines the value. A message of level 4, "couldn't read
//   color even from default layer style", follows it (for every value type).
namespace vyn::ie {

class DexLayer;
class DexObject;

// Where a resolved value came from.
enum EStyleDefinitionObject : int {
  STYLE_FROM_OBJECT = 0,         // the object's own drawing properties
  STYLE_FROM_LAYER = 1,          // the object's layer
  STYLE_FROM_DEFAULT_LAYER = 2,  // the default layer passed by the caller
  STYLE_FROM_CODE = 3,           // the drawing properties of the object's first code
  STYLE_FROM_CODE_LAYER = 4,     // the layer of the object's first code
  STYLE_NOT_FOUND = 5,
};

// The six value types a style can be resolved for, and the property each reads:
// unsigned long the colour, EMarkStyleType the point mark, EDashStyleType the dash style,
// unsigned char the line width, EFillStyleType the fill style, short the fill transparency.
template <class T>
concept DexStyleValue =
    std::same_as<T, unsigned long> || std::same_as<T, DexDrawPointProperties::EMarkStyleType> ||
    std::same_as<T, DexDrawLineProperties::EDashStyleType> || std::same_as<T, unsigned char> ||
    std::same_as<T, DexDrawAreaProperties::EFillStyleType> || std::same_as<T, short>;

// Finds the value of type T that applies when object is drawn as type (IDexDrawProperties::
// EDexDrawType), writes it to value and answers its source. The first of these that reads a value
// answers:
// 1. the object's own properties (for type DRAW_AREA on an area, its area properties), when they are
//    of that type: STYLE_FROM_OBJECT;
// 2. when the object has a layer and its own properties mark the value by layer, the layer's
//    properties of that type: STYLE_FROM_LAYER;
// 3. when the object has codes: the drawing properties of that type of the first code's description,
//    STYLE_FROM_CODE; then, when those mark the value by layer, the properties of that type of the
//    description's layer, STYLE_FROM_CODE_LAYER. When it has no code but a layer and no own
//    properties at all: the layer's properties of that type, STYLE_FROM_LAYER;
// 4. defaultLayer's properties of that type: STYLE_FROM_DEFAULT_LAYER.
// A property object of another form (a width asked of point properties) reads nothing. value is
// written only when a source is found. STYLE_NOT_FOUND when none is: silently when defaultLayer is
// null, otherwise with the error-log record (line 101) and the level-4 message. A null object reads
// only from defaultLayer.
template <DexStyleValue T>
DEX_API EStyleDefinitionObject getObjectStyle(int type, const DexObject* object, T& value,
                                              const DexLayer* defaultLayer);

}  // namespace vyn::ie
