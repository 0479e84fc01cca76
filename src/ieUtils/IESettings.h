#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <type_traits>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEDataType.h"
#include "ieDefinitions/IEFlags.h"
#include "ieDefinitions/IEResult.h"
#include "ieObjects/IENoValue.h"
#include "ieObjects/IEStation.h"
#include "ieUtils/IEAsciiFields.h"
#include "ieUtils/IEUtilsCoords.h"
#include "ieUtils/IEUtilsUnits.h"

// The settings of one import or export run: the record of the host's choices that the data container
// copies and that importers, exporters and the loader read, with the host's question and notification
// objects it carries.

namespace vyn::ie {

// ---- Host objects held by the settings ------------------------------------------------------------

// The host's way of asking the user. The settings own their message box and delete it; copies of the
// settings hold a clone. The virtual operations keep their order: destructor, clone, confirmOverwrite.
class DEX_API IDexMessageBox {
 public:
  VYN_CLASS_ALLOCATOR

  virtual ~IDexMessageBox();
  // A new message box owned by the caller; null when it cannot be made. Implement either form: each
  // default answers the other (the const default answers null).
  virtual IDexMessageBox* clone();
  // Asks whether the file shown as shortPath may be overwritten, as a child of parentWindow. Answers
  // the dialog's button: IDYES (6) allows the overwrite, any other answer declines it. Implement either
  // form: the library asks through this one, whose default asks the const form (whose default is IDNO).
  virtual int confirmOverwrite(HWND parentWindow, const wchar_t* shortPath);
  virtual IDexMessageBox* clone() const;
  virtual int confirmOverwrite(HWND parentWindow, const wchar_t* shortPath) const;

 protected:
  IDexMessageBox() = default;
  IDexMessageBox(const IDexMessageBox&) = default;
  IDexMessageBox& operator=(const IDexMessageBox&) = default;
};

// Told the result when a run in a thread of its own ends. It is called in the worker thread; carrying
// the news to a user-interface thread is its own business. The settings own their notifiers and delete
// them; copies of the settings hold clones. The virtual operations keep their order: destructor, clone,
// onFinished.
class DEX_API IDexFinishNotifier {
 public:
  VYN_CLASS_ALLOCATOR

  virtual ~IDexFinishNotifier();
  // A new notifier owned by the caller; null when it cannot be made. Implement either form: each
  // default answers the other (the const default answers null).
  virtual IDexFinishNotifier* clone();
  virtual void onFinished(EDexResult result) = 0;
  virtual IDexFinishNotifier* clone() const;

 protected:
  IDexFinishNotifier() = default;
  IDexFinishNotifier(const IDexFinishNotifier&) = default;
  IDexFinishNotifier& operator=(const IDexFinishNotifier&) = default;
};

// ---- Records carried for the plug-ins ---------------------------------------------------------------

// A text layout that the host hands to the plug-ins: a title, a field list of the kind a custom ASCII
// layout holds, then seven and six texts. The plug-ins fix what the texts say; the library only copies
// them, the field list included.
struct DEX_API DexTextLayout {
  VYN_CLASS_ALLOCATOR

  CVynStringT<wchar_t> title;
  ascii_fields::FieldList fields;
  std::array<CVynStringT<wchar_t>, 7> headerTexts;
  std::array<CVynStringT<wchar_t>, 6> footerTexts;
};

// A block of 32 bytes of options whose layout the host and the plug-ins agree on. The library copies
// it byte for byte and reads none of it. New blocks are all zeros.
struct DEX_API DexOptionBlock {
  VYN_CLASS_ALLOCATOR

  static constexpr std::size_t kSize = 32;
  std::uint8_t bytes[kSize] = {};
};
static_assert(sizeof(DexOptionBlock) == DexOptionBlock::kSize &&
              std::is_trivially_copyable_v<DexOptionBlock>);

// The value of a tolerance that is not set: the smallest positive normal double, 2.2250738585072014e-308
// (the data model's no-height marker), so that 0.0 stays a real tolerance.
inline constexpr double kToleranceNotSet = kNoHeight;

// The stakeout tolerance filter: the largest deviation accepted north, east and in elevation, in
// meters. A value equal to kToleranceNotSet is not set, and a new filter has none set.
struct DEX_API DexToleranceFilter {
  VYN_CLASS_ALLOCATOR

  double north = kToleranceNotSet;
  double east = kToleranceNotSet;
  double elevation = kToleranceNotSet;

  // Whether at least one of the three tolerances is set.
  bool isAnySet() const noexcept {
    return north != kToleranceNotSet || east != kToleranceNotSet || elevation != kToleranceNotSet;
  }
};

// ---- The settings of a run --------------------------------------------------------------------------

// The choices the host makes for one import or export. The host fills the public fields, hands the
// settings to the loader or to the data container, and the container keeps its own copy.
//
// Ownership: the settings own every object their pointer fields hold (the message box, both notifiers,
// the custom ASCII layout, the text layout, the option block, the tolerance filter and the optional
// text) and delete them with themselves. Assigning an object to such a field hands it over: assign
// only objects made with new (of their class, so that a plug-in's object may be deleted here), never
// give one object to two settings, and delete the old object first when replacing one by hand.
//
// Copy construction and assignment duplicate the owned objects (the host objects through their own
// clone(), the records as deep copies) and never share them. Assignment treats two groups differently:
//  - messageBox, userAsciiSettings, textLayout and optionBlock always follow the source: the target's
//    object is deleted and replaced by a copy of the source's, or by null when the source has none;
//  - exportNotifier, importNotifier, toleranceFilter and pluginText are replaced only when the source
//    has one; when it has none the target keeps its own, so that assigning a container's settings
//    does not silence the notifiers the host set up.
//
// The library reads dataTypes, messageBox, both notifiers, coordsStyle, coordDecimals,
// maxNumericPointName and parentWindow; the other fields travel unchanged from the host to the
// plug-ins, which give them their meaning.
struct DEX_API DexSettings {
  VYN_CLASS_ALLOCATOR

  // ---- Construction and copy ----------------------------------------------------------------------
  // Every field at the default given beside it.
  DexSettings();
  // The defaults, then the assignment of other.
  DexSettings(const DexSettings& other);
  // Nothing on self-assignment; otherwise every field follows other by the rules above.
  DexSettings& operator=(const DexSettings& other);
  // Deletes every owned object.
  virtual ~DexSettings();

  // ---- Data kinds ---------------------------------------------------------------------------------
  // Adding a kind already present or removing one that is absent changes nothing.
  void addDataType(EDexDataType type) { dataTypes.add(type); }
  void removeDataType(EDexDataType type) { dataTypes.remove(type); }
  void removeAllDataTypes() { dataTypes.clear(); }
  bool hasDataType(EDexDataType type) const { return dataTypes.has(type); }
  // Whether type is the one kind requested. MULTIPLE is never counted as a kind, so {POINTS, MULTIPLE}
  // has only POINTS and the answer for MULTIPLE itself is always false.
  bool hasOnlyThisDataType(EDexDataType type) const;

  // ---- Tolerance filter ---------------------------------------------------------------------------
  // Whether toleranceFilter exists and sets at least one of its tolerances.
  bool hasToleranceFilter() const;

  // ---- Fields, in their fixed order ---------------------------------------------------------------
  DexFlags<EDexDataType> dataTypes;  // the data kinds to exchange; none
  // Asks the overwrite question; null (the default) means the host message service. Owned.
  IDexMessageBox* messageBox;
  IDexFinishNotifier* exportNotifier;  // told the result when a threaded export ends; null. Owned.
  IDexFinishNotifier* importNotifier;  // told the result when a threaded import ends; null. Owned.
  EDistUnits distUnits;                // distance unit of the exchange; ANY_UNITS (27): the job's unit
  EAngleUnits angleUnits;              // angle unit of the exchange; angle_units::ANY_UNITS (5)
  ECoordsStyle coordsStyle;            // style of written geographic coordinates; PACKED_DMS (1)
  // Decimals of written plane coordinates and heights, by coordinate index 0, 1, 2; 3 each.
  std::array<int, 3> coordDecimals;
  DexUserAsciiSettingsData* userAsciiSettings;  // the user's custom ASCII layout; null. Owned.
  std::array<bool, 2> pluginFlags;              // carried for the plug-ins; both true
  DexTextLayout* textLayout;                    // carried for the plug-ins; null. Owned.
  DexOptionBlock* optionBlock;                  // carried for the plug-ins, copied as bytes; null. Owned.
  DexToleranceFilter* toleranceFilter;          // the stakeout tolerance filter; null. Owned.
  // Carried for the plug-ins; the eighth and the sixteenth (indexes 7 and 15) true, the rest false.
  std::array<bool, 16> pluginOptions;
  int maxNumericPointName;           // highest numeric point name in use; -1: none
  CVynStringT<wchar_t>* pluginText;  // carried for the plug-ins; null. Owned.
  bool pluginOption;                 // carried for the plug-ins; false
  int pluginValue;                   // carried for the plug-ins; 2
  HWND parentWindow;                 // parent of the questions and of the short path display; null

 private:
  // Gives every field its default. Owns nothing afterwards, and releases nothing: the constructors
  // call it before anything is owned.
  void reset();
  // The assignment: plain values copied, owned objects replaced by the rules above.
  void clone(const DexSettings& other);
  void releaseOwnedObjects();
};

// ---- Display settings ---------------------------------------------------------------------------------

// The display coordinate-system choices kept with the job information: the kind of coordinate system
// and two texts whose content the host and the plug-ins fix (the library only stores and copies them).
// A plain value, copied member by member.
struct DEX_API DexDisplaySettings {
  VYN_CLASS_ALLOCATOR

  // A grid coordinate system (CS_GRID) and empty texts.
  DexDisplaySettings() = default;
  // The given kind and empty texts.
  explicit DexDisplaySettings(EDexCSType kind) : csType(kind) {}
  DexDisplaySettings(EDexCSType kind, const CVynStringT<wchar_t>& systemName,
                     const CVynStringT<wchar_t>& zoneName)
      : csType(kind), coordSystemName(systemName), coordSystemZone(zoneName) {}

  EDexCSType csType = CS_GRID;
  CVynStringT<wchar_t> coordSystemName;
  CVynStringT<wchar_t> coordSystemZone;
};

}  // namespace vyn::ie
