#pragma once

#include <span>

#include "ieDefinitions/IEDataType.h"
#include "ieDefinitions/IEFlags.h"
#include "ieDefinitions/IEFormats.h"

// The built-in tables of the formats registry, kept as data: one row per data kind and per format.
namespace vyn::ie::detail {

struct BuiltInDataTypeRow {
  EDexDataType typeId;
  const wchar_t* name;
  DexCommonType::EDataDirections direction;
  DexFlags<DexCommonType::ESupportedConfigurations> configurations;
  DexFlags<DexCommonType::EUsingModes> usingModes;
};

// The fields in the order of the DexFormat constructor; guid is the braced GUID text.
struct BuiltInFormatRow {
  const wchar_t* guid;
  const wchar_t* name;
  DexCommonType::EDataDirections direction;
  const wchar_t* exportDLL;
  const wchar_t* importDLL;
  const wchar_t* titleForVerticalScreen;
  const wchar_t* extension;
  const wchar_t* filterExtension;
  DexFlags<DexCommonType::ESupportedConfigurations> configurations;
  DexFlags<DexCommonType::EUsingModes> usingModes;
  DexFlags<EDexDataType> dataTypes;
  DexFlags<EDistUnits> distanceUnits;
  DexFlags<EAngleUnits> angleUnits;
  DexFlags<DexFormat::EParameterName> parameters;
};

// The 21 data kinds and the 154 formats, in registry order.
std::span<const BuiltInDataTypeRow> builtInDataTypeRows();
std::span<const BuiltInFormatRow> builtInFormatRows();

}  // namespace vyn::ie::detail
