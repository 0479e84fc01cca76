#pragma once

#include <atomic>
#include <map>
#include <memory>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IECrossSections.h"
#include "ieObjects/IEDLRawData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEDatasetProperties.h"
#include "ieObjects/IEGPSAntennaSettings.h"
#include "ieObjects/IEJobHistoryRecords.h"
#include "ieObjects/IEJobInfo.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IEOwningMap.h"
#include "ieObjects/IERawDataEquipment.h"
#include "ieObjects/IEStationEquations.h"
#include "ieUtils/IELocalization.h"
#include "ieUtils/IERunProgress.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/IEUtilsStringArray.h"
#include "ieUtils/IEUtilsUnits.h"

// The exchange data: the root of everything one import or export exchanges.
//
// Error-log records (source ieObjects\IEData, empty message):
// - line 601 (DexData::kLogLineNoCurrentDataset): a const operation needed the current dataset and
//   there is none (no dataset at all, or the current index is past the list).
namespace vyn::ie {

namespace utils {
class FreeNumericNames;
}

// The index of a coordinate: 0 and 1 the plane coordinates (latitude and longitude in a geographic
// system), 2 the height.
using TCoordInd = int;

// The data of one exchange: the datasets with the current one, the shared dictionaries (code library,
// layers, road templates, alignment parts, station-equation sets), the localization, a copy of the
// settings, the job information and the raw-data side tables (digital-level runs, GNSS antennas,
// equipment, observation information). The parsers loader makes one from the host's settings and
// hands it to an importer, which fills it, or to an exporter, which reads it.
//
// Ownership: the data owns every object that an add or attach operation stores, from that call on,
// and deletes it with itself (or when an attach replaces it). An add that declines its argument (null,
// or a name already present) leaves it with the caller, and says so by answering false; handing over
// an object the data holds already changes nothing and is never a reason to delete it. Objects inside
// a dataset belong to the dataset. The observation information is shared with the datasets and lives
// while any of them refers to it. The getters hand out the data's own objects: never delete them.
//
// Destruction deletes, in this order: the datasets; the code library, road templates, localization,
// layers, alignment parts and station-equation sets; the level runs; the GNSS antennas; the equipment,
// the references to the observation information, the list of exported files, the job information and
// the settings. Alignments in the datasets may thus refer to parts of the dictionaries until the end.
//
// Not copyable. One run uses one data at a time; only stopProcess_ and the progress record may be
// touched from another thread.
class DEX_API DexData {
 public:
  VYN_CLASS_ALLOCATOR

  static constexpr int kLogLineNoCurrentDataset = 601;

  // The stop request of the process: importer and exporter loops poll it between records and end
  // with DEX_RESULT_STOPPED once it is set. The host sets it to abort a run and clears it again; the
  // library never writes it. Safe to set from any thread.
  static std::atomic<bool> stopProcess_;

  // ---- Construction ---------------------------------------------------------------------------
  // A copy of settings; default job information; no dataset (current index 0), no dictionary, no
  // localization, empty side tables.
  explicit DexData(const DexSettings& settings);
  DexData(const DexData&) = delete;
  DexData& operator=(const DexData&) = delete;
  // The only virtual operation.
  virtual ~DexData();

  // ---- Settings and job information -----------------------------------------------------------
  const DexSettings& getSettings() const noexcept { return settings_; }
  // Assigns settings by the settings' own rules (notifiers the argument lacks are kept).
  void setSettings(const DexSettings& settings) { settings_ = settings; }
  const DexJobInfo& getJobInfo() const noexcept { return jobInfo_; }
  void setJobInfo(const DexJobInfo& jobInfo) { jobInfo_ = jobInfo; }

  // ---- Datasets -------------------------------------------------------------------------------
  // Appends dataset and takes ownership: true. A null dataset is declined (false); a dataset the data
  // holds already is not appended again (true).
  bool addDataset(DexDataset* dataset);
  int getNumberOfDatasets() const noexcept { return datasets_.count(); }
  // The dataset at index, or null when index is outside the list. The data keeps ownership.
  DexDataset* getDatasetAt(int index) const noexcept;
  int getCurDatasetId() const noexcept { return curDatasetId_; }
  // Makes the dataset at index the current one; an index outside the list changes nothing.
  void setCurDataset(int index) noexcept;
  // The current dataset, never null, so that an importer can always write into it: a current index
  // past the list falls back to 0, and without any dataset a new empty one named "STOPGAP" is added.
  DexDataset* getCurDataset();
  // The current dataset; null, with an error-log record (line 601), when the current index is past
  // the list (always so without a dataset).
  const DexDataset* getCurDataset() const;
  // The objects of every dataset: the size of each object list summed up.
  int getNumberOfObjectsInAllDatasets() const;
  // The coordinate system of the current dataset. Without a current dataset: the error-log record of
  // the const getCurDataset() and a default record.
  const cs_utils::DexCoordinateSystemInfo& getCoordinateSystem() const;
  // The observation information of the current dataset. Without a current dataset: the error-log
  // record of the const getCurDataset() and null.
  std::shared_ptr<DexObservationInfo> getCurObservationInfo() const;

  // Used by the export run of a format that can write one file per dataset; multipleFiles says
  // whether the format can. Answers false, changing nothing, without a dataset, for multipleFiles
  // false, and when the settings request none of POINTS, POINT_LISTS, LINES and AREAS. Otherwise
  // splits by code every dataset that holds objects and has seen an object with codes, and answers
  // true (also when no dataset needed splitting). Such a dataset is replaced, at the end of the list,
  // by: for each code description of the code library, in its order, that the dataset uses, a dataset
  // named after the code with a copy of every object carrying that code; then, when the dataset has
  // objects without codes, a dataset of its own name with a copy of each of those. Each new dataset
  // gets a copy of the source's dataset properties; the source is deleted. Objects whose codes the
  // code library does not describe are not copied anywhere. The current index is left as it was: the
  // export run sets it for each dataset it writes.
  bool prepareDatasetsForMultipleFilesExport(bool multipleFiles);

  // ---- Dictionaries ---------------------------------------------------------------------------
  // These getters make the dictionary on first use (an empty one) and keep it.
  DexDataDictionary* getIEDataDictionary();
  DexDrawDictionary* getIEDrawDictionary();
  DexAlignmentPartsDictionary* getIEAlignmentPartsDictionary();
  DexStaEquationSetDictionary* getIEStaEquationSetDictionary();
  // The road templates are never made here: null until attached or until a template is added.
  DexRoadTemplatesDictionary* getIERoadTemplatesDictionary() noexcept { return roadTemplates_.get(); }
  // The const getters answer what is held, null included.
  const DexDataDictionary* getIEDataDictionary() const noexcept { return dataDictionary_.get(); }
  const DexDrawDictionary* getIEDrawDictionary() const noexcept { return drawDictionary_.get(); }
  const DexAlignmentPartsDictionary* getIEAlignmentPartsDictionary() const noexcept {
    return alignmentParts_.get();
  }
  const DexStaEquationSetDictionary* getIEStaEquationSetDictionary() const noexcept {
    return staEquationSets_.get();
  }
  const DexRoadTemplatesDictionary* getIERoadTemplatesDictionary() const noexcept {
    return roadTemplates_.get();
  }

  // Attaching replaces the whole dictionary and takes ownership of the argument; the one held before
  // is deleted. Attaching the pointer held already changes nothing.
  // A null argument is ignored:
  void attachIEDataDictionary(DexDataDictionary* dictionary);
  void attachIERoadTemplatesDictionary(DexRoadTemplatesDictionary* dictionary);
  void attachIEAlignmentPartsDictionary(DexAlignmentPartsDictionary* dictionary);
  void attachIELayers(DexDrawDictionary* dictionary);
  // A null argument deletes the dictionary held, leaving none:
  void attachIEStaEquationSetDictionary(DexStaEquationSetDictionary* dictionary);

  // Adding single entries; the dictionary is made when missing (not for a null entry). Each answers
  // true when the data holds the entry afterwards (it was taken, or was held already), false when it
  // declined it: the caller keeps a declined entry. Names are compared exactly.
  // Declined for null and when the code library has a description of that name.
  bool addCodeToIEDataDictionary(DexCodeDescription* description);
  // Declined for null and when a template of that name exists. A missing dictionary is made with
  // neither central offsets nor absolute heights.
  bool addIERoadTemplateToDictionary(DexRoadTemplate* roadTemplate);
  // Declined for null, when a part of the same kind and name exists, and (with the dictionary's
  // error-log record) for a part of an unknown kind.
  bool addIEAlignmentPartToDictionary(IDexAlignmentPart* part);
  // Declined for null and when a set of that name exists (a set with an empty name is never found by
  // name, so it is taken).
  bool addIEStaEquationSetToDictionary(DexStaEquationSet* set);

  // ---- Localization ---------------------------------------------------------------------------
  // Takes ownership and deletes the localization held before. A null argument, or the localization
  // held already, changes nothing.
  void attachIELocalization(DexLocalization* localization);
  // The localization held, or null.
  DexLocalization* getIELocalization() noexcept { return localization_.get(); }
  const DexLocalization* getIELocalization() const noexcept { return localization_.get(); }
  // Hands a copy of codes to the localization's control point named pointName; nothing without a
  // localization.
  void attachLocalizationPointCodes(const CVynStringT<wchar_t>& pointName,
                                    const DexCodesDataInterface* codes);
  // Stores method as parameter PARAM_METHOD (14) and point as PARAM_POINT (13) of the localization;
  // nothing without a localization.
  void setLocalizationMode(EDexLocalizationMethod method, EDexLocalizationPoint point);

  // ---- Digital-level runs ---------------------------------------------------------------------
  using DLRunIterator = DexOwningMap<CVynStringT<wchar_t>, DexDLRun>::const_iterator;
  // Files run under its name and takes ownership: true. Declined (false; the caller keeps it) for
  // null and when a run of that name is filed (the filed one stays). A run held already: true.
  bool addDLRun(DexDLRun* run);
  // The run filed under exactly name, or null.
  DexDLRun* findDLRun(const CVynStringT<wchar_t>& name) noexcept { return dlRuns_.find(name); }
  const DexDLRun* findDLRun(const CVynStringT<wchar_t>& name) const noexcept { return dlRuns_.find(name); }
  int getNumberOfDLRuns() const noexcept { return dlRuns_.count(); }
  // The pairs (name, run) in name order.
  DLRunIterator getDLRunsBegin() const noexcept { return dlRuns_.begin(); }
  DLRunIterator getDLRunsEnd() const noexcept { return dlRuns_.end(); }

  // ---- GNSS antennas --------------------------------------------------------------------------
  // Appends antenna and takes ownership: true. Names are not checked. Declined (false) for null; an
  // antenna held already is not appended again (true).
  bool addGpsAntenna(DexGpsAntennaSettings* antenna);
  int getNumberOfGpsAntennas() const noexcept { return gpsAntennas_.count(); }
  // The antenna at index, or null when index is outside the list.
  DexGpsAntennaSettings* getGpsAntennaAt(int index) noexcept { return gpsAntennas_.at(index); }
  const DexGpsAntennaSettings* getGpsAntennaAt(int index) const noexcept { return gpsAntennas_.at(index); }
  // The first antenna whose name equals name exactly, or null.
  DexGpsAntennaSettings* findGpsAntenna(const CVynStringT<wchar_t>& name);
  const DexGpsAntennaSettings* findGpsAntenna(const CVynStringT<wchar_t>& name) const;

  // ---- Equipment ------------------------------------------------------------------------------
  using EquipmentIterator = std::map<int, DexRawDataEquipment>::const_iterator;
  // Stores a copy of equipment under id and answers the stored record. When id is present the stored
  // record stays unchanged and is answered.
  DexRawDataEquipment* addEquipment(int id, const DexRawDataEquipment& equipment);
  // The record stored under id, or null.
  DexRawDataEquipment* getEquipmentById(int id) noexcept;
  const DexRawDataEquipment* getEquipmentById(int id) const noexcept;
  int getNumberOfEquipment() const noexcept { return static_cast<int>(equipment_.size()); }
  // The pairs (id, record) in id order.
  EquipmentIterator getEquipmentBegin() const noexcept { return equipment_.begin(); }
  EquipmentIterator getEquipmentEnd() const noexcept { return equipment_.end(); }

  // ---- Observation information ----------------------------------------------------------------
  // Appends info (shared); when dataset is not null it also becomes the dataset's observation
  // information.
  void addObservationInfo(std::shared_ptr<DexObservationInfo> info, DexDataset* dataset);
  int getNumberOfObservationInfos() const noexcept { return static_cast<int>(observationInfos_.size()); }
  // The information at index; null when index is outside the list.
  std::shared_ptr<DexObservationInfo> getObservationInfoAt(int index) const;

  // ---- Exported files -------------------------------------------------------------------------
  // Appends name to the files the export wrote, unless it is listed already (exact comparison).
  void addFileNameToExported(const CVynStringT<wchar_t>& name);
  // The files the export wrote, in the order they were added.
  const utils::StringArray& getExportedFileNames() const noexcept { return exportedFileNames_; }
  // Empties the list, for a data reused by another export.
  void clearExportedFileNames() { exportedFileNames_.RemoveAll(); }

  // ---- Run progress ---------------------------------------------------------------------------
  // How far the run working on this data has come: importers and the export driver publish to it,
  // and the host may poll it from another thread while the run works.
  DexRunProgress& getProgress() noexcept { return progress_; }
  const DexRunProgress& getProgress() const noexcept { return progress_; }

  // ---- Numeric names --------------------------------------------------------------------------
  // When the settings hold a highest numeric point name (maxNumericPointName not -1), hands it to
  // names.addObject and calls names.init(); otherwise names stay untouched.
  void getMaxNumericPointName(utils::FreeNumericNames& names) const;
  // Stores names.getFirstAvailableNumber() - 1 as the settings' highest numeric point name.
  void setMaxNumericPointName(const utils::FreeNumericNames& names);

  // ---- Formatting -----------------------------------------------------------------------------
  // value (meters, or decimal degrees for latitude and longitude) as the settings want coordinate
  // index written. For index 0 or 1 in a dataset whose coordinate system is geographic: the settings'
  // coordinate style with precision 10, signed. Otherwise the distance in units (ANY_UNITS (27): the
  // job's distance unit) with the settings' decimals for index. An empty text for an index outside 0
  // to 2. The coordinate system is the one getCoordinateSystem() answers (a default one, with its
  // error-log record, without a current dataset).
  CVynStringT<wchar_t> formatCoordToDefinedStyle(TCoordInd index, double value, EDistUnits units) const;

 private:
  // Splits one dataset as prepareDatasetsForMultipleFilesExport() describes, then deletes it.
  void splitDatasetByCodes(DexDataset* source);

  // Declared in the reverse order of their destruction (see the class comment).
  DexSettings settings_;
  DexJobInfo jobInfo_;
  utils::StringArray exportedFileNames_;
  vyn_vector<std::shared_ptr<DexObservationInfo>> observationInfos_;
  std::map<int, DexRawDataEquipment> equipment_;
  DexOwningList<DexGpsAntennaSettings> gpsAntennas_;
  DexOwningMap<CVynStringT<wchar_t>, DexDLRun> dlRuns_;
  DexOwnedPointer<DexStaEquationSetDictionary> staEquationSets_;
  DexOwnedPointer<DexAlignmentPartsDictionary> alignmentParts_;
  DexOwnedPointer<DexDrawDictionary> drawDictionary_;
  DexOwnedPointer<DexLocalization> localization_;
  DexOwnedPointer<DexRoadTemplatesDictionary> roadTemplates_;
  DexOwnedPointer<DexDataDictionary> dataDictionary_;
  DexOwningList<DexDataset> datasets_;
  int curDatasetId_ = 0;
  DexRunProgress progress_;
};

}  // namespace vyn::ie
