#pragma once

#include <array>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEJobHistoryRecords.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IEPhotoNotes.h"
#include "ieObjects/IEStation.h"
#include "ieObjects/IETSRawData.h"
#include "ieUtils/IEUtilsStringArray.h"

// The eight kinds of total-station raw records, in the order of EDexTSRawDataType: backbearing,
// backsight, foresight, sideshot, missing-line measurement, resection shot, station set-up and
// stakeout, with the resections of a set-up and their additional data.
//
// Error-log records (source ieObjects\IETSRawData, empty message):
// - lines 707, 677, 697, 717: DexTSRawSS::addImage, getNumberOfImages, getImageAt, removeAllImages
//   were given an image type other than 0 or 1;
// - line 1083: DexTSRawStakeout::getStation was asked for a station type outside 0 to 3.
//
// Setters of two kinds: those of value records (setTSRawData, setXyz, setSecondData) copy their
// argument; those of owned objects (setResultCoords, setPhotoNotes, setCoords,
// setTSRawDataResidials, setAdditionalResectionData) take the pointer and delete the object held
// before, unless it is the same pointer. References to points of the dataset (setBSPoint) and to
// job-history records are not owned.
namespace vyn::ie {

class DexDesignPoint;

// ---- Backbearing and backsight --------------------------------------------------------------------

// The part backbearings and backsights share: a sight with a reference to the design point sighted
// (not owned: a point of the dataset). New sights are active.
class DEX_API DexTSRawBackSightBase : public DexTSRawDataSightInterface {
 public:
  ~DexTSRawBackSightBase() override;

  void setBSPoint(const DexDesignPoint* point) noexcept { bsPoint_ = point; }
  const DexDesignPoint* getBSPoint() const noexcept { return bsPoint_; }

 protected:
  DexTSRawBackSightBase();
  DexTSRawBackSightBase(const DexTSRawBackSightBase&) = default;
  DexTSRawBackSightBase& operator=(const DexTSRawBackSightBase&) = default;

  // The sight data and the reference to the same backsight point.
  void copyCommonData(DexTSRawDataSightInterface* target) const override;

 private:
  const DexDesignPoint* bsPoint_ = nullptr;
};

// A backbearing: the sight along the bearing to a backsight point.
class DEX_API DexTSRawBkb : public DexTSRawBackSightBase {
 public:
  VYN_CLASS_ALLOCATOR

  DexTSRawBkb();
  DexTSRawBkb(const DexTSRawBkb&) = default;
  DexTSRawBkb& operator=(const DexTSRawBkb&) = default;
  ~DexTSRawBkb() override;

  // TS_RAW_BACKBEARING.
  EDexTSRawDataType getType() const override { return TS_RAW_BACKBEARING; }
  // The sight data and the reference to the same backsight point.
  IDexTSRawDataInterface* clone() const override;
};

// A backsight: the sight to the backsight point that orients a set-up.
class DEX_API DexTSRawBS : public DexTSRawBackSightBase {
 public:
  VYN_CLASS_ALLOCATOR

  DexTSRawBS();
  DexTSRawBS(const DexTSRawBS&) = default;
  DexTSRawBS& operator=(const DexTSRawBS&) = default;
  ~DexTSRawBS() override;

  // TS_RAW_BACKSIGHT.
  EDexTSRawDataType getType() const override { return TS_RAW_BACKSIGHT; }
  // The sight data and the reference to the same backsight point.
  IDexTSRawDataInterface* clone() const override;
};

// ---- Foresight and sideshot -----------------------------------------------------------------------

// A foresight: a sight to a new point, with its codes, its link to the job history, a second set of
// measured values, the coordinates computed for the point, photo notes and the measurement type.
//
// Ownership: the sight owns its codes, its second values, its result coordinates, its photo notes and
// the job-history copies a clone received; copies duplicate them. The job-history records a reader
// points it at are not owned.
class DEX_API DexTSRawFS : public DexTSRawDataSightInterface,
                           public DexCodesDataInterface,
                           public DexJobHistoryInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // How the point was measured: directly or by one of the offset methods of the field software. Any
  // value cast from a number is stored.
  enum EMeasType : std::int32_t {
    MEAS_UNKNOWN = -1,
    MEAS_SHOT = 0,  // a sideshot or foresight
    MEAS_PTM_OFFSET = 1,
    MEAS_PTL_OFFSET = 2,
    MEAS_TWO_POINT_HA_D_OFFSET = 3,
    MEAS_HA_VA_OFFSET = 4,
    MEAS_HIDDEN_POINT_OFFSET = 5,
    MEAS_TWO_LINES_OFFSET = 6,
    MEAS_LINE_AND_CORNER_OFFSET = 7,
    MEAS_PLANE_AND_CORNER_OFFSET = 8,
  };

  // The measurement type and the job-history kind (EMeasType and EDexJobHistoryDataType values or
  // their numbers); active, no codes, no second values, no result coordinates, no photo notes.
  explicit DexTSRawFS(int measType = MEAS_SHOT, int jhDataType = JH_DATA_NONE);
  DexTSRawFS(const DexTSRawFS& other);
  DexTSRawFS& operator=(const DexTSRawFS& other);
  ~DexTSRawFS() override;

  // TS_RAW_FORESIGHT.
  EDexTSRawDataType getType() const override { return TS_RAW_FORESIGHT; }
  // A foresight of the same measurement type with job-history kind JH_DATA_NONE and everything
  // copyCommonData copies.
  IDexTSRawDataInterface* clone() const override;

  // The record's time (one for both the raw record and its job-history link).
  void setTime(const base::CTime& time) override { IDexTSRawDataInterface::setTime(time); }
  const base::CTime& getTime() const override { return IDexTSRawDataInterface::getTime(); }

  EMeasType getMeasType() const noexcept { return measType_; }
  // As setTSRawData, for the second values.
  void setSecondData(const DexTSRawData* data);
  const DexTSRawData* getSecondData() const noexcept { return secondData_.get(); }
  // Takes ownership of coords (null allowed).
  void setResultCoords(DexPosition3D* coords) noexcept { resultCoords_.reset(coords); }
  const DexPosition3D* getResultCoords() const noexcept { return resultCoords_.get(); }
  // Takes ownership of notes (null allowed).
  void setPhotoNotes(DexPhotoNotes* notes) noexcept { photoNotes_.reset(notes); }
  DexPhotoNotes* getPhotoNotes() noexcept { return photoNotes_.get(); }
  const DexPhotoNotes* getPhotoNotes() const noexcept { return photoNotes_.get(); }

 protected:
  // The sight data, then the codes (appended), the job-history records (as copies the target owns),
  // the second values, a copy of the result coordinates (none when this sight has none) and the photo
  // notes (assigned to the target's, copied when it has none, removed when this sight has none).
  void copyCommonData(DexTSRawDataSightInterface* target) const override;

 private:
  DexOwnedPointer<DexTSRawData> secondData_;
  DexOwnedPointer<DexPosition3D> resultCoords_;
  DexOwnedPointer<DexPhotoNotes> photoNotes_;
  EMeasType measType_;
  DexJobHistoryCopies jhCopies_;
};

// A sideshot: a foresight that does not carry the traverse on, with two lists of image files.
class DEX_API DexTSRawSS : public DexTSRawFS {
 public:
  VYN_CLASS_ALLOCATOR

  // The two image lists. Any other value is refused with an error-log record.
  enum EImageType : std::int32_t {
    IMAGE_PRIMARY = 0,
    IMAGE_SECONDARY = 1,
  };
  static constexpr int kNumberOfImageTypes = 2;

  // A foresight of the measurement type with job-history kind JH_DATA_NONE, and no images.
  explicit DexTSRawSS(int measType = MEAS_SHOT);
  DexTSRawSS(const DexTSRawSS&) = default;
  DexTSRawSS& operator=(const DexTSRawSS&) = default;
  ~DexTSRawSS() override;

  // TS_RAW_SIDESHOT.
  EDexTSRawDataType getType() const override { return TS_RAW_SIDESHOT; }
  // A sideshot of the same measurement type with everything copyCommonData copies.
  IDexTSRawDataInterface* clone() const override;

  // Appends path to the list of type (line 707 for another type).
  void addImage(int type, const CVynStringT<wchar_t>& path);
  // The length of the list of type; 0 for another type (line 677).
  int getNumberOfImages(int type) const;
  // A copy of entry index of the list of type; empty for an index outside the list, and for another
  // type (line 697).
  CVynStringT<wchar_t> getImageAt(int type, int index) const;
  // Empties the list of type (line 717 for another type).
  void removeAllImages(int type);

 protected:
  // The foresight's data, then the two image lists.
  void copyCommonData(DexTSRawDataSightInterface* target) const override;

 private:
  // The list of type, or null after the error-log record of line.
  const utils::StringArray* imagesOf(int type, int line) const;
  utils::StringArray* imagesOf(int type, int line);

  std::array<utils::StringArray, kNumberOfImageTypes> images_;
};

// ---- Missing line and resection -------------------------------------------------------------------

// A missing-line measurement: the line from the point the record is named after to a second point.
class DEX_API DexTSRawMlm : public IDexTSRawDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  DexTSRawMlm();
  DexTSRawMlm(const DexTSRawMlm&) = default;
  DexTSRawMlm& operator=(const DexTSRawMlm&) = default;
  ~DexTSRawMlm() override;

  // TS_RAW_MISSING_LINE.
  EDexTSRawDataType getType() const override { return TS_RAW_MISSING_LINE; }
  // The common data and the second point's name.
  IDexTSRawDataInterface* clone() const override;

  void setSecondName(const CVynStringT<wchar_t>& name) { secondName_ = name; }
  const CVynStringT<wchar_t>& getSecondName() const noexcept { return secondName_; }

 private:
  CVynStringT<wchar_t> secondName_;
};

// One shot of a resection: the observation of a known point, its residuals in the resection (a value
// record, owned), the point's coordinates (owned) and which parts of the observation the resection
// used.
class DEX_API DexTSRawResShot : public IDexTSRawDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The parts of the observation used: horizontal angle, vertical angle, slope distance, as the job
  // history writes them. Any value cast from a number is stored.
  enum EUsedData : std::int32_t {
    USED_HVSD = 0,
    USED_H = 1,
    USED_V = 2,
    USED_SD = 3,
    USED_HV = 4,
    USED_HSD = 5,
    USED_VSD = 6,
    USED_NONE = 7,
  };

  // No residuals, no coordinates, USED_HVSD.
  DexTSRawResShot();
  DexTSRawResShot(const DexTSRawResShot&) = default;
  DexTSRawResShot& operator=(const DexTSRawResShot&) = default;
  ~DexTSRawResShot() override;

  // TS_RAW_RESECTION_SHOT.
  EDexTSRawDataType getType() const override { return TS_RAW_RESECTION_SHOT; }
  // The common data, copies of the residuals and coordinates, and the used data.
  IDexTSRawDataInterface* clone() const override;

  // An EUsedData value or its number.
  void setUsedData(int usedData) noexcept { usedData_ = static_cast<EUsedData>(usedData); }
  EUsedData getUsedData() const noexcept { return usedData_; }
  // Takes ownership of coords (null allowed).
  void setCoords(DexPosition3D* coords) noexcept { coords_.reset(coords); }
  const DexPosition3D* getCoords() const noexcept { return coords_.get(); }
  // Takes ownership of residuals (null allowed).
  void setTSRawDataResidials(DexTSRawData* residuals) noexcept { residuals_.reset(residuals); }
  const DexTSRawData* getTSRawDataResidials() const noexcept { return residuals_.get(); }

 private:
  DexOwnedPointer<DexTSRawData> residuals_;
  DexOwnedPointer<DexPosition3D> coords_;
  EUsedData usedData_ = USED_HVSD;
};

// A resection of a set-up: a name and its shots, in order. Not a raw record itself: a station record
// holds its resections. The resection owns its shots; copies duplicate them.
class DEX_API DexTSRawResection : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  DexTSRawResection() = default;
  DexTSRawResection(const DexTSRawResection&) = default;
  DexTSRawResection& operator=(const DexTSRawResection&) = default;
  ~DexTSRawResection() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // Appends shot and takes ownership; a null shot is ignored. An unnamed shot takes the resection's
  // name, and an unnamed resection the name of a named shot.
  void addTSResShot(DexTSRawResShot* shot);
  int getNumberOfTSResShots() const noexcept { return shots_.count(); }
  // The shot at index, or null when index is outside the list.
  DexTSRawResShot* getTSResShotAt(int index) noexcept { return shots_.at(index); }
  const DexTSRawResShot* getTSResShotAt(int index) const noexcept { return shots_.at(index); }

 private:
  DexOwningList<DexTSRawResShot> shots_;
  CVynStringT<wchar_t> name_;
};

// The results of a set-up's resection as the field software reports them: the dimension, the
// backsight angle, the sigmas in north, east and up, the value "GG" and the backsight sigma. The
// library stores and copies them. A plain value.
class DEX_API DexAdditionalResectionData {
 public:
  VYN_CLASS_ALLOCATOR

  // Dimension 1, backsight angle 0, sigmas (0, 0, 0), GG 1.0, backsight sigma 0.
  DexAdditionalResectionData() = default;
  DexAdditionalResectionData(const DexAdditionalResectionData&) = default;
  DexAdditionalResectionData& operator=(const DexAdditionalResectionData&) = default;
  virtual ~DexAdditionalResectionData();

  std::int32_t dimension = 1;
  double bsAngle = 0.0;
  DexPosition3D sigmas{0.0, 0.0, 0.0};
  double gg = 1.0;
  double bsSigma = 0.0;
};

// ---- Station and stakeout -------------------------------------------------------------------------

// A station set-up: the instrument over the point the record is named after, with its codes, its link
// to the job history, its resections, the resection results, photo notes, a note and the scale
// factor.
//
// Ownership: the station owns its codes, resections (with their shots), resection results, photo
// notes and the job-history copies a clone received; copies duplicate them.
class DEX_API DexTSRawStn : public IDexTSRawDataInterface,
                            public DexCodesDataInterface,
                            public DexJobHistoryInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The job-history kind (an EDexJobHistoryDataType value or its number); no resections, no
  // resection results, no photo notes, an empty note, scale factor 1.0.
  explicit DexTSRawStn(int jhDataType = JH_DATA_NONE);
  DexTSRawStn(const DexTSRawStn& other);
  DexTSRawStn& operator=(const DexTSRawStn& other);
  ~DexTSRawStn() override;

  // TS_RAW_STATION.
  EDexTSRawDataType getType() const override { return TS_RAW_STATION; }
  // A station with job-history kind JH_DATA_NONE: the common data, job-history copies, codes, note,
  // scale factor, a copy of every resection and copies of the resection results and photo notes.
  IDexTSRawDataInterface* clone() const override;

  void setTime(const base::CTime& time) override { IDexTSRawDataInterface::setTime(time); }
  const base::CTime& getTime() const override { return IDexTSRawDataInterface::getTime(); }

  // Resections, in order. addTSRawResection takes ownership; a null resection is ignored.
  void addTSRawResection(DexTSRawResection* resection) { resections_.add(resection); }
  int getNumberOfTSRawResections() const noexcept { return resections_.count(); }
  // The resection at index, or null when index is outside the list.
  DexTSRawResection* getTSRawResectionAt(int index) noexcept { return resections_.at(index); }
  const DexTSRawResection* getTSRawResectionAt(int index) const noexcept { return resections_.at(index); }
  // The first resection named exactly name, or null.
  const DexTSRawResection* findTSRawResection(const CVynStringT<wchar_t>& name) const;

  // Takes ownership of data (null allowed).
  void setAdditionalResectionData(DexAdditionalResectionData* data) noexcept { additionalData_.reset(data); }
  const DexAdditionalResectionData* getAdditionalResectionData() const noexcept {
    return additionalData_.get();
  }
  // Takes ownership of notes (null allowed).
  void setPhotoNotes(DexPhotoNotes* notes) noexcept { photoNotes_.reset(notes); }
  DexPhotoNotes* getPhotoNotes() noexcept { return photoNotes_.get(); }
  const DexPhotoNotes* getPhotoNotes() const noexcept { return photoNotes_.get(); }

  void setNote(const CVynStringT<wchar_t>& note) { note_ = note; }
  const CVynStringT<wchar_t>& getNote() const noexcept { return note_; }
  void setScaleFactor(double scaleFactor) noexcept { scaleFactor_ = scaleFactor; }
  double getScaleFactor() const noexcept { return scaleFactor_; }

 private:
  DexOwningList<DexTSRawResection> resections_;
  DexOwnedPointer<DexAdditionalResectionData> additionalData_;
  DexOwnedPointer<DexPhotoNotes> photoNotes_;
  CVynStringT<wchar_t> note_;
  double scaleFactor_ = 1.0;
  DexJobHistoryCopies jhCopies_;
};

// A stakeout shot: the design, staked and end stations of a point or line stakeout and the station on
// the line, with the link to the job history.
class DEX_API DexTSRawStakeout : public IDexTSRawDataInterface, public DexJobHistoryInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The four stations. Any other value is refused.
  enum EStationType : std::int32_t {
    STAKE_DESIGN = 0,  // the point to stake out
    STAKE_STAKED = 1,  // where it was staked
    STAKE_END = 2,     // the end of the line staked
    STAKE_LINE = 3,    // the station on the line
  };
  static constexpr int kNumberOfStations = 4;

  // The job-history kind (an EDexJobHistoryDataType value or its number); four default stations.
  explicit DexTSRawStakeout(int jhDataType = JH_DATA_NONE);
  DexTSRawStakeout(const DexTSRawStakeout& other);
  DexTSRawStakeout& operator=(const DexTSRawStakeout& other);
  ~DexTSRawStakeout() override;

  // TS_RAW_STAKEOUT.
  EDexTSRawDataType getType() const override { return TS_RAW_STAKEOUT; }
  // A stakeout with job-history kind JH_DATA_NONE: the common data, job-history copies and the four
  // stations.
  IDexTSRawDataInterface* clone() const override;

  void setTime(const base::CTime& time) override { IDexTSRawDataInterface::setTime(time); }
  const base::CTime& getTime() const override { return IDexTSRawDataInterface::getTime(); }

  // Assigns station to type (0 to 3); another type changes nothing.
  void setStation(int type, const DexStation& station);
  // The station of type; station 0, after an error-log record (line 1083), for another type.
  const DexStation& getStation(int type) const;

 private:
  std::array<DexStation, kNumberOfStations> stations_;
  DexJobHistoryCopies jhCopies_;
};

}  // namespace vyn::ie
