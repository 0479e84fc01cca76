#include "ieDefinitions/IEFormats.h"

#include "hostlibs/VynLogging.h"

namespace vyn::ie {

namespace {

constexpr const wchar_t* kLogSource = L"ieDefinitions\\IEFormats";
constexpr int kLineUnknownQueryDirection = 62;

constexpr DexCommonType::ESupportedConfigurations kAllConfigurations[] = {
    DexCommonType::REGULAR, DexCommonType::ONBOARD, DexCommonType::JAPAN};
constexpr DexCommonType::EUsingModes kAllUsingModes[] = {DexCommonType::EXPORT_IN_JAPAN,
                                                         DexCommonType::ONBOARD_WITH_SCANNING};

// True when text is a braced GUID text; guid then holds it.
bool parseGuid(const wchar_t* text, GUID& guid) {
  return text != nullptr && CLSIDFromString(text, &guid) == S_OK;
}

}  // namespace

// ---- DexCommonType ------------------------------------------------------------------------------

DexCommonType::DexCommonType(const CVynStringT<wchar_t>& name, EDataDirections directionType,
                             DexFlags<ESupportedConfigurations> configurations,
                             DexFlags<EUsingModes> usingModes)
    : name_(name), directionType_(directionType), configurations_(configurations), usingModes_(usingModes) {}

DexCommonType::DexCommonType(const DexCommonType& other) = default;
DexCommonType& DexCommonType::operator=(const DexCommonType& other) = default;
DexCommonType::~DexCommonType() = default;

const CVynStringT<wchar_t>& DexCommonType::getName() const {
  return name_;
}

DexCommonType::EDataDirections DexCommonType::getDataDirections() const {
  return directionType_;
}

bool DexCommonType::isConfigurationSupported(ESupportedConfigurations c) const {
  return configurations_.has(c);
}

bool DexCommonType::isUsingModeApplied(EUsingModes m) const {
  return usingModes_.has(m);
}

bool DexCommonType::compareCommonData(EDataDirections direction,
                                      DexFlags<ESupportedConfigurations> configurations,
                                      DexFlags<EUsingModes> modes) const {
  const EDataDirections own = getDataDirections();
  switch (direction) {
    case IMPORT_ONLY:
      if (own != IMPORT_ONLY && own != IMPORT_AND_EXPORT) return false;
      break;
    case EXPORT_ONLY:
      if (own != EXPORT_ONLY && own != IMPORT_AND_EXPORT) return false;
      break;
    case IMPORT_AND_EXPORT:
      if (own != IMPORT_AND_EXPORT) return false;
      break;
    default:
      vyn_logging::vyn_err_log(kLogSource, kLineUnknownQueryDirection);
      break;
  }
  for (const ESupportedConfigurations configuration : kAllConfigurations) {
    if (configurations.has(configuration) && !isConfigurationSupported(configuration)) return false;
  }
  for (const EUsingModes mode : kAllUsingModes) {
    if (isUsingModeApplied(mode) && !modes.has(mode)) return false;
  }
  return true;
}

// ---- DexDataType --------------------------------------------------------------------------------

DexDataType::DexDataType(EDexDataType typeId, const CVynStringT<wchar_t>& name, EDataDirections directionType,
                         DexFlags<ESupportedConfigurations> configurations, DexFlags<EUsingModes> usingModes)
    : DexCommonType(name, directionType, configurations, usingModes), typeId_(typeId) {}

DexDataType::DexDataType(const DexDataType& other) = default;
DexDataType& DexDataType::operator=(const DexDataType& other) = default;
DexDataType::~DexDataType() = default;

bool DexDataType::isPointDataType() const {
  return typeId_ == POINTS || typeId_ == POINT_LISTS || typeId_ == MULTIPLE;
}

bool DexDataType::isLineDataType() const {
  return typeId_ == LINES || typeId_ == MULTIPLE;
}

bool DexDataType::isRoadDataType() const {
  switch (typeId_) {
    case PARCELS:
    case H_ALIGNMENTS:
    case V_ALIGNMENTS:
    case X_SECTIONS:
    case ROADS:
    case MULTIPLE:
      return true;
    default:
      return false;
  }
}

// ---- DexFormat ----------------------------------------------------------------------------------

DexFormat::DexFormat(const GUID& guid, const CVynStringT<wchar_t>& name, EDataDirections directionType,
                     const CVynStringT<wchar_t>& exportDLL, const CVynStringT<wchar_t>& importDLL,
                     const CVynStringT<wchar_t>& titleForVerticalScreen,
                     const CVynStringT<wchar_t>& extension, const CVynStringT<wchar_t>& filterExtension,
                     DexFlags<ESupportedConfigurations> configurations, DexFlags<EUsingModes> usingModes,
                     DexFlags<EDexDataType> dataTypes, DexFlags<EDistUnits> distanceUnits,
                     DexFlags<EAngleUnits> angleUnits, DexFlags<EParameterName> parameters)
    : DexCommonType(name, directionType, configurations, usingModes),
      guid_(guid),
      exportDLL_(exportDLL),
      importDLL_(importDLL),
      titleForVerticalScreen_(titleForVerticalScreen),
      extension_(extension),
      filterExtension_(filterExtension),
      dataTypes_(dataTypes),
      distanceUnits_(distanceUnits),
      angleUnits_(angleUnits),
      parameters_(parameters) {}

DexFormat::DexFormat(const DexFormat& other) = default;
DexFormat& DexFormat::operator=(const DexFormat& other) = default;
DexFormat::~DexFormat() = default;

const CVynStringT<wchar_t> DexFormat::getGuidAsString() const {
  wchar_t* text = nullptr;
  if (StringFromCLSID(guid_, &text) != S_OK) return CVynStringT<wchar_t>();
  const CVynStringT<wchar_t> guidText(text);
  CoTaskMemFree(text);
  return guidText;
}

bool DexFormat::isIdEqual(const wchar_t* id) const {
  GUID parsed;
  return parseGuid(id, parsed) && parsed == guid_;
}

const CVynStringT<wchar_t> DexFormat::getDllName(bool forExport) const {
  return forExport ? exportDLL_ : importDLL_;
}

const CVynStringT<wchar_t> DexFormat::getTitle() const {
  return titleForVerticalScreen_;
}

const CVynStringT<wchar_t> DexFormat::getExtension(bool withDot) const {
  if (!withDot || extension_.IsEmpty()) return extension_;
  return L'.' + extension_;
}

bool DexFormat::hasUnitsToSelect() const {
  if (distanceUnits_.isEmpty() && angleUnits_.isEmpty()) return false;
  if (distanceUnits_.has(EDistUnits::ANY_UNITS) || angleUnits_.has(EAngleUnits::ANY_UNITS)) return true;
  return distanceUnits_.count() > 1 || angleUnits_.count() > 1;
}

// ---- format_id ----------------------------------------------------------------------------------

bool format_id::isFormatIdEqual(const wchar_t* const& a, const wchar_t* const& b) {
  GUID first;
  GUID second;
  return parseGuid(a, first) && parseGuid(b, second) && first == second;
}

}  // namespace vyn::ie
