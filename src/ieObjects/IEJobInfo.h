#pragma once

#include <array>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/IEUtilsUnits.h"

namespace vyn::ie {

// The job-wide information that travels with one exchange: seven texts that the plug-ins fill and
// read (the library only copies them), the display coordinate-system settings, the job's creation
// time and its distance and angle units. The data container holds one by value. Each of the display
// settings, the creation time and the two units counts as set only once its setter has been called.
// A plain value: copying copies every member.
class DEX_API DexJobInfo {
 public:
  VYN_CLASS_ALLOCATOR

  static constexpr int kNumberOfTexts = 7;

  // Empty texts; display settings of a grid system (not set); nothing set; units ANY_UNITS (27) and
  // angle_units::ANY_UNITS (5).
  DexJobInfo() = default;
  DexJobInfo(const DexJobInfo&) = default;
  DexJobInfo& operator=(const DexJobInfo&) = default;
  virtual ~DexJobInfo();

  // ---- Texts for the plug-ins -------------------------------------------------------------------
  // The text at index 0 to 6; an empty text for any other index.
  CVynStringT<wchar_t> getText(int index) const;
  // Stores text at index 0 to 6; any other index changes nothing.
  void setText(int index, const CVynStringT<wchar_t>& text);

  // ---- Display settings -------------------------------------------------------------------------
  void setDisplaySettings(const DexDisplaySettings& settings);
  // False, leaving settings alone, until setDisplaySettings() was called.
  bool getDisplaySettings(DexDisplaySettings& settings) const;

  // ---- Creation time ----------------------------------------------------------------------------
  // A UTC file time.
  void setCreateTime(const FILETIME& time);
  // False, leaving time alone, until setCreateTime() was called.
  bool getCreateTime(FILETIME& time) const;
  // The creation time in local time: date "dd/mm/yy" (day, month, year modulo 100) and time
  // "hh:mm:ss". False, leaving both alone, when no time is set or it cannot be converted to local
  // time.
  bool getCreateTimeString(CVynStringT<wchar_t>& date, CVynStringT<wchar_t>& time) const;

  // ---- Units ------------------------------------------------------------------------------------
  void setDistUnits(EDistUnits units);
  void setAngleUnits(EAngleUnits units);
  // False, leaving units alone, until the setter was called.
  bool getDistUnits(EDistUnits& units) const;
  bool getAngleUnits(EAngleUnits& units) const;
  // The unit set, or ANY_UNITS (27) when none is.
  EDistUnits getDistUnits() const;
  // The unit set, or DECDEG (3, decimal degrees) when none is.
  EAngleUnits getAngleUnits() const;

 private:
  // Which of the values below were set.
  enum EDefinedFlag : unsigned {
    CREATE_TIME_DEFINED = 1,
    DIST_UNITS_DEFINED = 2,
    ANGLE_UNITS_DEFINED = 4,
  };
  bool isDefined(EDefinedFlag flag) const noexcept { return (definedFlags_ & flag) != 0; }

  std::array<CVynStringT<wchar_t>, kNumberOfTexts> texts_;
  bool displaySettingsDefined_ = false;
  DexDisplaySettings displaySettings_{CS_GRID};
  unsigned definedFlags_ = 0;
  FILETIME createTime_;
  EDistUnits distUnits_ = ANY_UNITS;
  EAngleUnits angleUnits_ = angle_units::ANY_UNITS;
};

}  // namespace vyn::ie
