#pragma once

#include <map>
#include <memory>
#include <optional>
#include <unordered_map>
#include <vector>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieDefinitions/IEFlags.h"
#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEDatasetProperties.h"
#include "ieObjects/IEFindChainage.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEJobHistory.h"
#include "ieObjects/IEJobHistoryRecords.h"
#include "ieObjects/IEObjects.h"
#include "ieObjects/IEOrientationJob.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IEParcel.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IERegion.h"
#include "ieObjects/IEScanningSession.h"
#include "ieObjects/IEStakeoutReports.h"
#include "ieObjects/IESurface.h"

// The dataset: one named set of survey data inside the exchange data.
//
// Error-log records (source ieObjects\IEDataset, empty message):
// - line 731: findRawPoint() was asked of a dataset without raw data;
// - line 732: getNextRawPointName() met a raw record that is neither a total-station, a GNSS nor a
//   digital-level record (a note, for example); the walk goes on after it.
namespace vyn::ie {

class DexCodeDescription;
class DexGpsBaseStation;
class DexLayer;

namespace utils {
class FreeNumericNames;
}

// One named set of survey data: the survey objects in insertion order, and lists of surfaces,
// alignments, parcels, regions, object lists, surveyed cross sections, chainage reports, scanning
// sessions, orientation jobs, stakeout and field reports, named arrays of design points, the raw data,
// the job history, the observation information, the coordinate system and the extent. Importers add to
// it; exporters walk it by index and by kind and look objects up by name.
//
// Ownership: the dataset owns everything added to it (objects, list members, raw data, job history,
// properties, the points-array vectors but not the points in them) and deletes it when it is reset or
// destroyed. The observation information is shared: it lives while anything refers to it. Copy
// construction and assignment copy only the name and the dataset properties, never the content.
//
// Name index. A dataset created with the name index files every object it is given, except sheet
// points, under the name the object has when it is added; the first object of a name keeps the entry,
// so the index answers what a search in insertion order would. With the index, findObject() answers
// from it in constant time whatever kind was asked for; without it, findObject() searches the list. An
// object renamed after it was added stays filed under its old name. The index is never ordered: no
// operation shows its order.
//
// Object list slots. The constructor can make room for a number of empty (null) entries; they count
// in the size of the object list (getNumberOfElements with kind -1), getObjectAt() answers null for
// them, every walk over the objects passes over them, and removeObject() takes them out.
class DEX_API DexDataset : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The object list starts with room for this many objects.
  static constexpr int kReservedObjects = 1024;

  // ---- Construction and copy ------------------------------------------------------------------
  // numberOfSlots empty entries (none for 0 or below) and, when withNameIndex is true, a name index.
  // The coordinate system is the default record and the observation information a new default record.
  explicit DexDataset(const CVynStringT<wchar_t>& name, int numberOfSlots = 0, bool withNameIndex = false);
  // The name and a copy of other's dataset properties (default properties when other has none); the
  // new dataset is otherwise empty, without name index.
  DexDataset(const DexDataset& other);
  // Takes other's name and dataset properties (this dataset's record, made when it has none, becomes a
  // copy of other's or a default one); the content stays as it is.
  DexDataset& operator=(const DexDataset& other);
  ~DexDataset() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // ---- Adding (each add takes ownership of what it keeps) -------------------------------------
  // Appends object and answers true; false for null. Records whether an object with codes, or one
  // without, has been added, and files the object in the name index (when there is one and the object
  // is not a sheet point) unless its name is already there. Several objects may share a name.
  bool add(DexObject* object);
  // Append; a null argument is ignored.
  void add(DexAlignment* alignment) { alignments_.add(alignment); }
  void add(DexParcel* parcel) { parcels_.add(parcel); }
  void add(DexSurface* surface) { surfaces_.add(surface); }
  void addRegion(DexRegion* region) { regions_.add(region); }
  void addFieldReport(DexFieldReport* report) { fieldReports_.add(report); }
  void addFindChainageReport(DexFindChainageReport* report) { findChainageReports_.add(report); }
  void addOrientationJob(DexOrientationJob* job) { orientationJobs_.add(job); }
  void addScanningSession(DexScanningSession* session) { scanningSessions_.add(session); }
  void addStakeoutReport(DexStakeoutReport* report) { stakeoutReports_.add(report); }
  void addSurveyXSection(DexSurveyXSection* section) { surveyXSections_.add(section); }
  // Appends list and answers true. Declined (false), and left with the caller, when list is null or a
  // list of the same name (exact) is present.
  bool addObjectList(DexObjectList* list);
  // Files points (the vector is owned, the points in it are not) under name and answers true. Declined
  // (false), and left with the caller, when points is null or an array of that name is present.
  bool addPointsArray(const CVynStringT<wchar_t>& name, vyn_vector<const DexDesignPoint*>* points);
  // The array filed under exactly name, or null.
  vyn_vector<const DexDesignPoint*>* findPointsArray(const CVynStringT<wchar_t>& name) const;
  int getNumberOfPointsArrays() const noexcept { return static_cast<int>(pointsArrays_.size()); }

  // ---- Owned members and records --------------------------------------------------------------
  // Take ownership of the argument (null allowed) and delete the one held before, unless it is the
  // same pointer.
  void setRawData(DexRawData* rawData) noexcept { rawData_.reset(rawData); }
  void setIEDatasetProperties(DexDatasetProperties* properties) noexcept {
    datasetProperties_.reset(properties);
  }
  void setJobHistory(DexJobHistory* jobHistory) noexcept { jobHistory_.reset(jobHistory); }
  DexRawData* getRawData() noexcept { return rawData_.get(); }
  const DexRawData* getRawData() const noexcept { return rawData_.get(); }
  DexJobHistory* getJobHistory() noexcept { return jobHistory_.get(); }
  const DexJobHistory* getJobHistory() const noexcept { return jobHistory_.get(); }
  // The dataset properties, made on first use.
  DexDatasetProperties* getDatasetProperties();
  // The dataset properties, or null while none have been made.
  const DexDatasetProperties* getDatasetProperties() const noexcept { return datasetProperties_.get(); }
  // Replaces the shared reference (null allowed).
  void setObservationInfo(std::shared_ptr<DexObservationInfo> info) noexcept {
    observationInfo_ = std::move(info);
  }
  const std::shared_ptr<DexObservationInfo>& getObservationInfo() const noexcept { return observationInfo_; }
  void setCoordinateSystem(const cs_utils::DexCoordinateSystemInfo& info) { coordinateSystem_ = info; }
  const cs_utils::DexCoordinateSystemInfo& getCoordinateSystem() const noexcept { return coordinateSystem_; }

  // ---- Access by index (null when the index is outside the list; the dataset keeps ownership) --
  DexObject* getObjectAt(int index) noexcept;
  const DexObject* getObjectAt(int index) const noexcept;
  DexSurface* getSurfaceAt(int index) noexcept { return surfaces_.at(index); }
  const DexSurface* getSurfaceAt(int index) const noexcept { return surfaces_.at(index); }
  DexAlignment* getAlignmentAt(int index) noexcept { return alignments_.at(index); }
  const DexAlignment* getAlignmentAt(int index) const noexcept { return alignments_.at(index); }
  DexParcel* getParcelAt(int index) noexcept { return parcels_.at(index); }
  const DexParcel* getParcelAt(int index) const noexcept { return parcels_.at(index); }
  DexRegion* getRegionAt(int index) noexcept { return regions_.at(index); }
  const DexRegion* getRegionAt(int index) const noexcept { return regions_.at(index); }
  DexObjectList* getObjectListAt(int index) noexcept { return objectLists_.at(index); }
  const DexObjectList* getObjectListAt(int index) const noexcept { return objectLists_.at(index); }
  DexSurveyXSection* getSurveyXSectionAt(int index) noexcept { return surveyXSections_.at(index); }
  const DexSurveyXSection* getSurveyXSectionAt(int index) const noexcept {
    return surveyXSections_.at(index);
  }
  DexFindChainageReport* getFindChainageReportAt(int index) noexcept {
    return findChainageReports_.at(index);
  }
  const DexFindChainageReport* getFindChainageReportAt(int index) const noexcept {
    return findChainageReports_.at(index);
  }
  DexScanningSession* getScanningSessionAt(int index) noexcept { return scanningSessions_.at(index); }
  const DexScanningSession* getScanningSessionAt(int index) const noexcept {
    return scanningSessions_.at(index);
  }
  DexOrientationJob* getOrientationJobAt(int index) noexcept { return orientationJobs_.at(index); }
  const DexOrientationJob* getOrientationJobAt(int index) const noexcept {
    return orientationJobs_.at(index);
  }
  DexStakeoutReport* getStakeoutReportAt(int index) noexcept { return stakeoutReports_.at(index); }
  const DexStakeoutReport* getStakeoutReportAt(int index) const noexcept {
    return stakeoutReports_.at(index);
  }
  DexFieldReport* getFieldReportAt(int index) noexcept { return fieldReports_.at(index); }
  const DexFieldReport* getFieldReportAt(int index) const noexcept { return fieldReports_.at(index); }

  int getNumberOfSurfaces() const noexcept { return surfaces_.count(); }
  int getNumberOfParcels() const noexcept { return parcels_.count(); }
  int getNumberOfRegions() const noexcept { return regions_.count(); }
  int getNumberOfObjectLists() const noexcept { return objectLists_.count(); }
  int getNumberOfSurveyXSections() const noexcept { return surveyXSections_.count(); }
  int getNumberOfFindChainageReports() const noexcept { return findChainageReports_.count(); }
  int getNumberOfScanningSessions() const noexcept { return scanningSessions_.count(); }
  int getNumberOfOrientationJobs() const noexcept { return orientationJobs_.count(); }
  int getNumberOfStakeoutReports() const noexcept { return stakeoutReports_.count(); }
  int getNumberOfFieldReports() const noexcept { return fieldReports_.count(); }

  // ---- Finding (names compared exactly) -------------------------------------------------------
  // With a name index and kind other than OBJECT_TYPE_SHEET_POINT: the object filed under name,
  // whatever its kind. Otherwise the first object in insertion order whose name is name and whose kind
  // is kind (any kind for OBJECT_TYPE_ALL). Null when there is none. kind is an EDexObjectsType value
  // or its number.
  DexObject* findObject(const CVynStringT<wchar_t>& name, int kind = OBJECT_TYPE_ALL);
  const DexObject* findObject(const CVynStringT<wchar_t>& name, int kind = OBJECT_TYPE_ALL) const;
  // The first object list or alignment of that name, or null.
  DexObjectList* findObjectListByName(const CVynStringT<wchar_t>& name);
  const DexObjectList* findObjectListByName(const CVynStringT<wchar_t>& name) const;
  DexAlignment* findAlignment(const CVynStringT<wchar_t>& name);
  const DexAlignment* findAlignment(const CVynStringT<wchar_t>& name) const;
  // The first alignment whose primary part of type (an IDexAlignmentPart::EDexAlignmentPartType value
  // or its number) is named name, or null. A type outside 0 to 3 finds nothing (each alignment asked
  // writes its error-log record).
  const DexAlignment* findAlignmentByPartName(const CVynStringT<wchar_t>& name, int type) const;
  // The first parcel whose horizontal alignment is named name, or null; parcels without alignment are
  // passed over.
  const DexParcel* findParcelByHAlignmentName(const CVynStringT<wchar_t>& name) const;
  // The first raw record of kind total station or GNSS named name, when that record is a GNSS base
  // station; null when the first such record is of another class (a total-station record or another
  // GNSS record: use findRawPointRecord() to reach those) or there is none. Without raw data: null and
  // an error-log record (line 731).
  const DexGpsBaseStation* findRawPoint(const CVynStringT<wchar_t>& name) const;
  // The first raw record of kind total station or GNSS named name, whatever its class, or null (also
  // without raw data, which is not logged here).
  const IDexRawDataInterface* findRawPointRecord(const CVynStringT<wchar_t>& name) const;

  // ---- Counting -------------------------------------------------------------------------------
  // Objects and other members counted by kind (an EDexObjectsType value or its number) and edit state
  // (IDexStateInterface::ECurrentState or its number; ANY_STATE passes every object, any other value
  // only the objects in exactly that state):
  // - pointsOnly and linesOnly: the size of the object list;
  // - pointsOnly: the point objects (kinds 0 to 3) in the state;
  // - linesOnly: polylines, breaklines, arcs and circles (kinds 4, 6, 7, 12; not areas) in the state;
  // - otherwise by kind: OBJECT_TYPE_ALL gives the size of the object list, whatever the state; kinds
  //   0 to 7, 11 and 12 the objects of that kind in the state; 8 the surfaces, 9 the alignments and 10
  //   the parcels, whatever their state; any other kind (regions, 13, included) 0. getNumberOfRegions()
  //   counts the regions.
  int getNumberOfElements(int kind, int state, bool pointsOnly = false, bool linesOnly = false) const;
  // The alignments in state (all for ANY_STATE).
  int getNumberOfAlignments(int state = IDexStateInterface::ANY_STATE) const;

  // Entity counts for drawing exports; each looks only at objects on exactly the layer pointer given
  // (null: objects without layer).
  // Objects of kind (any kind for OBJECT_TYPE_ALL) in state ACTIVE_STATE, 1 each; an arc whose start
  // and end angles are equal counts 1 more, and a text label 1 more for each non-empty line of its text
  // (lines split at "\n").
  int getNumberOfElementsWithTheLayer(const DexLayer* layer, int kind) const;
  // For polylines (kind 4) or areas (kind 5) not in state INACTIVE_STATE; 0 for any other kind. Adds to
  // the result and to arcs (which the caller sets first): each node with bulge 0 adds 1 to the result
  // and each node with a bulge 1 to arcs; then a closed object with nodes adds 1 to arcs, and an open
  // object of two nodes or more takes 1 back from arcs when its last node has a bulge, from the result
  // otherwise.
  int getNumberOfSegmentsWithTheLayer(const DexLayer* layer, int& arcs, int kind) const;
  // For each arc in state ACTIVE_STATE: 1 added to the result (2 when its start and end angles are
  // equal) and 1 added to arcs (which the caller sets first).
  int getNumberOfSeparatedArcsWithTheLayer(const DexLayer* layer, int& arcs) const;

  // ---- Removing and resetting -----------------------------------------------------------------
  // Takes the entry at index out of the object list and answers true; false for an index outside the
  // list. The object is not deleted: the caller, who read it with getObjectAt(index) beforehand, owns
  // it from then on. Its name index entry goes with it (an entry that files another object of the same
  // name stays); the first object left in the list with that name, if any, then takes the entry, so
  // findObject() goes on answering what a search in insertion order would.
  bool removeObject(int index);
  // Deletes everything the dataset owns (name index entries, dataset properties, objects, surfaces,
  // alignments, parcels, raw data, object lists, surveyed cross sections, chainage reports, points
  // arrays, scanning sessions, job history, orientation jobs, stakeout and field reports, regions, in
  // this order) and empties every list; the code flags become false. The name, coordinate system and
  // observation information stay, and so does the name index (empty) of a dataset created with one.
  void resetAllData();

  // ---- Codes ----------------------------------------------------------------------------------
  // Whether an object with at least one code, or one without codes, has been added.
  bool isCodesExist() const noexcept { return codesExist_; }
  bool isObjectWithoutCodes() const noexcept { return objectWithoutCodes_; }
  // True when some object has a code named like description (code strings not considered); false
  // for a null description.
  bool isCodeDefinitionUsed(const DexCodeDescription* description) const;
  // Adds to target, for every object that has a code named code (code strings not considered), a clone
  // of the object whose codes are replaced by a copy of that code value. A null target does nothing.
  // Only the objects present when the call starts are looked at, so target may be this dataset.
  void copyIEObjectsWithTheCodeToTheNewDataset(DexDataset* target, const CVynStringT<wchar_t>& code) const;

  // ---- Algorithms -----------------------------------------------------------------------------
  // Hands the name of every object whose kind is in kinds to names.addObject, then calls names.init().
  void getMaxNumericObjectName(DexFlags<EDexObjectsType> kinds, utils::FreeNumericNames& names) const;
  // Widens the extent of the dataset properties (made when needed) by station.
  void updateMinMax(const DexStation& station);
  // Replaces every sheet point by design points, one for each of its stations in order, appended at
  // the end of the object list (the other objects keep their order). The point of station k takes the
  // station with this name: the station's own, except that from the second station on a name that is
  // empty or equal to the sheet point's becomes the sheet point's name followed by "_st", and from the
  // third on also by k - 1 (S_st, S_st1, S_st2, ...). Each point gets a copy of every code of its sheet
  // point. The sheet points are deleted.
  void transformStationsToPoints();
  // The name of the raw point recorded after the one named name, walking the raw records from index
  // start (0 for a negative start). With an empty name the first raw point counts. Total-station
  // foresights and sideshots whose name source is NAME_SOURCE_DEFAULT and GNSS records are raw points;
  // a digital-level record ends the walk with next left as it was; a record of any other kind is
  // passed over with an error-log record (line 732). At the end of the records next becomes empty.
  // False (next unchanged) without raw data; true otherwise.
  bool getNextRawPointName(const CVynStringT<wchar_t>& name, int start, CVynStringT<wchar_t>& next) const;
  // Appends to out the design points entered by hand after a raw point, walking the design points
  // (kind 0) in object order. The first one named name (the first of all for an empty name) is the
  // start point; next = getNextRawPointName(name, start); while next names no object, next is asked
  // again from start + 1, start + 2 and so on (such a walk no longer meets records before its start, so
  // it may end with an empty next). Then, from the start point on, every point named other than name
  // whose station has point attribute POINT_ATTR_ENTERED is appended, until a point named next. Without
  // raw data every design point named name (every one for an empty name) is appended instead.
  void getDesignPointsEnteredFromTheRawPointTillTheNextOne(const CVynStringT<wchar_t>& name, int start,
                                                           vyn_vector<const DexDesignPoint*>& out) const;

 private:
  using NameIndex = std::unordered_map<CVynStringT<wchar_t>, DexObject*>;

  void fileInNameIndex(DexObject* object);
  void takeOutOfNameIndex(DexObject* object);
  const DexObject* findObjectInList(const CVynStringT<wchar_t>& name, int kind) const;
  void clearContent() noexcept;

  CVynStringT<wchar_t> name_;
  cs_utils::DexCoordinateSystemInfo coordinateSystem_;
  DexOwnedPointer<DexDatasetProperties> datasetProperties_;
  std::vector<std::unique_ptr<DexObject>> objects_;
  DexOwningList<DexSurface> surfaces_;
  DexOwningList<DexAlignment> alignments_;
  DexOwningList<DexParcel> parcels_;
  DexOwnedPointer<DexRawData> rawData_;
  DexOwningList<DexObjectList> objectLists_;
  DexOwningList<DexSurveyXSection> surveyXSections_;
  DexOwningList<DexFindChainageReport> findChainageReports_;
  std::map<CVynStringT<wchar_t>, std::unique_ptr<vyn_vector<const DexDesignPoint*>>> pointsArrays_;
  DexOwningList<DexScanningSession> scanningSessions_;
  DexOwnedPointer<DexJobHistory> jobHistory_;
  DexOwningList<DexOrientationJob> orientationJobs_;
  DexOwningList<DexStakeoutReport> stakeoutReports_;
  DexOwningList<DexFieldReport> fieldReports_;
  DexOwningList<DexRegion> regions_;
  std::shared_ptr<DexObservationInfo> observationInfo_;
  std::optional<NameIndex> nameIndex_;
  bool codesExist_ = false;
  bool objectWithoutCodes_ = false;
};

}  // namespace vyn::ie
