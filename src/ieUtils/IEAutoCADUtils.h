#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieUtils/IEUtilsUnits.h"

namespace vyn::ie {

// What a CAD exchange plug-in (DXF, DWG) needs to map the library's data onto AutoCAD conventions:
// legal names of named objects, the 256-entry AutoCAD Color Index palette with a nearest-colour search,
// line-type names, line weights, the AutoCAD unit codes of lengths and angles, and points of an entity's
// object coordinate system in world coordinates. The object owns its palette and the two units it
// converts codes for; copies are independent.
//
// Unknown naming kinds, unit codes and units without a code are written to the error log with the
// source "ieUtils\IEAutoCADUtils", one of the lines below and an empty message; the object then keeps
// its state or answers the neutral value documented on the operation. Nothing throws.
class DEX_API DexAutoCadUtils {
 public:
  VYN_CLASS_ALLOCATOR

  // The naming rule createCorrectCadName applies; which named objects use which rule is the caller's.
  enum EDexObjectTypeWithName : std::int32_t {
    // Replaces ! blank . , ? % * @ # $ ^ & ' " \ / | ~ ; [ ] { } ( ) < > ` TAB CR LF + =
    CAD_NAME_STRICT = 0,
    // Replaces < blank > \ / " : ? * | , + =
    CAD_NAME_SYMBOL_TABLE = 1,
    // Replaces nothing.
    CAD_NAME_UNCHANGED = 2,
  };

  // One palette entry, each component 0 to 255.
  struct PaletteEntry {
    std::int32_t red;
    std::int32_t green;
    std::int32_t blue;
  };
  static constexpr int kPaletteSize = 256;
  // The index convertRgbTo256 answers for black (and for every colour nearest to index 0).
  static constexpr int kBlackIndex = 250;

  // Error-log lines.
  static constexpr int kLogLineUnknownNameKind = 201;        // createCorrectCadName
  static constexpr int kLogLineUnknownAngleCode = 202;       // setAutoCadAngleUnits
  static constexpr int kLogLineAngleUnitsWithoutCode = 203;  // getAutoCadAngleUnits
  static constexpr int kLogLineUnknownDistCode = 204;        // setAutoCadDistUnits
  static constexpr int kLogLineDistUnitsWithoutCode = 205;   // getAutoCadDistUnits

  // ---- Construction -----------------------------------------------------------------------------
  // Radians and meters, and the computed palette (see convert256ToRgb).
  DexAutoCadUtils();
  DexAutoCadUtils(const DexAutoCadUtils& other);
  DexAutoCadUtils& operator=(const DexAutoCadUtils& other);
  virtual ~DexAutoCadUtils();

  // ---- Names ------------------------------------------------------------------------------------
  // With correct false, name unchanged. Otherwise "0" for an empty name, else name with every character
  // the kind forbids replaced by "_" (the length never changes). An unknown kind is logged
  // (kLogLineUnknownNameKind) and replaces nothing.
  CVynStringT<wchar_t> createCorrectCadName(EDexObjectTypeWithName kind, const CVynStringT<wchar_t>& name,
                                            bool correct) const;
  // createCorrectCadName(CAD_NAME_STRICT, name, true).
  CVynStringT<wchar_t> createCorrectCadName(const CVynStringT<wchar_t>& name) const;

  // ---- Colours ----------------------------------------------------------------------------------
  // Colours are 32-bit values with red in the lowest byte, then green, then blue; higher bits are
  // ignored. The palette: 0 and 7 black, 1 to 6 red, yellow, green, cyan, blue, magenta, 8 and 9 greys
  // 128 and 192; 10 to 249 24 hue groups of ten (hue 15 degrees apart, each a pure and a pale shade at
  // 100, 80, 60, 50 and 30 percent); 250 to 254 greys 51, 91, 132, 173, 214; 255 black.

  // The index of the palette entry nearest to rgb by the sum of the component differences; of equally
  // near entries the lowest index wins. An answer of index 0 becomes kBlackIndex, so black gives 250.
  int convertRgbTo256(unsigned long rgb) const;
  // The colour of a palette index; 0 for an index below 0 or above 255.
  unsigned long convert256ToRgb(int index) const;

  // ---- Line types and weights -------------------------------------------------------------------
  // "CONTINUOUS", "DASHED", "DOTTED", "DASHDOTTED", "DASHDOTDOTTED" in any case give the dash styles 0
  // to 4; any other name gives DASH_SOLID.
  DexDrawLineProperties::EDashStyleType convertCustomLineTypeToPredefined(
      const CVynStringT<wchar_t>& name) const;
  // The line-type name of a dash style: "DASHED", "DOTTED", "DASHDOTTED", "DASHDOTDOTTED" for 1 to 4,
  // "Continuous" for any other value.
  CVynStringT<wchar_t> convertPredefinedStylesToCadStyles(DexDrawLineProperties::EDashStyleType style) const;
  // A line weight (hundredths of a millimetre) as a width in pixels: up to 30 (and negative or NaN) 1,
  // up to 60 2, up to 90 3, up to 106 4, above 106 5.
  int convertLineWeightFromMmtoPixels(double weight) const;
  // A width in pixels as a line weight: 0, 1 and negative 30, 2 60, 3 90, 4 106, 5 140, 6 and more 200.
  int convertLineWeightFromPixelsToMm(int pixels) const;

  // ---- Units ------------------------------------------------------------------------------------
  EAngleUnits getAngleUnits() const { return angleUnits_; }
  EDistUnits getDistUnits() const { return distUnits_; }
  // Stores units; mils are stored as decimal degrees.
  void setAngleUnits(EAngleUnits units);
  // Stores units; US and international feet and inches are stored as the plain feet.
  void setDistUnits(EDistUnits units);

  // The AutoCAD angle code (AUNITS) of the stored units: decimal degrees and mils 0, DDD.MMSS 1, grads
  // 4, radians 3. Other units are logged (kLogLineAngleUnitsWithoutCode) and give 0.
  int getAutoCadAngleUnits() const;
  // The AutoCAD length code (INSUNITS) of the stored units: meters and ANY_UNITS 6, feet 2, miles 3,
  // inches 1, US inches 22, ... (see the table in the source). Feet and inches, chains and values outside
  // the enumeration are logged (kLogLineDistUnitsWithoutCode) and give 6.
  int getAutoCadDistUnits() const;
  // Stores the units of an AutoCAD angle code: 0 decimal degrees, 1 DDD.MMSS, 2 grads, 3 radians,
  // 4 fallback (stored as given). Another code is logged (kLogLineUnknownAngleCode) and changes nothing.
  void setAutoCadAngleUnits(int code, EAngleUnits fallback);
  // Stores the units of an AutoCAD length code. 0 stores fallback as setDistUnits does; 1 inches when
  // fallback is INCHES, else US inches; 2 international feet when fallback is IFEET or IFEETINCHES, else
  // US feet; 3 to 20 and 22 their units (see the table in the source). Another code (21 among them) is
  // logged (kLogLineUnknownDistCode) and changes nothing.
  void setAutoCadDistUnits(int code, EDistUnits fallback);

  // ---- Object coordinate system -----------------------------------------------------------------
  // The world coordinates (wx, wy, wz) of the point (x, y, z) of an entity whose extrusion direction is
  // (nx, ny, nz), by the arbitrary axis algorithm of DXF: the object x axis is (0, 1, 0) x n when |nx|
  // and |ny| are both below 1/64, else (0, 0, 1) x n; the y axis is n x (x axis); both are normalised
  // (a zero axis stays zero). n itself is used as given, not normalised.
  void convertCPInOcsToWcs(double x, double y, double z, double nx, double ny, double nz, double& wx,
                           double& wy, double& wz) const;

 private:
  vyn_vector<PaletteEntry> palette_;
  EAngleUnits angleUnits_ = RADIANS;
  EDistUnits distUnits_ = METERS;
};

}  // namespace vyn::ie
