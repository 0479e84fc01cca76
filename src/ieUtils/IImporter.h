#pragma once

#include <map>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEResult.h"
#include "ieObjects/IECoords.h"

// The importer side of a parser plug-in: the interface the loader runs, the base every importer
// derives from (and the one of importers that read a localization), the plug-in's "MakeImporter" entry
// point, and the run function of one import.

namespace vyn::ie {

class DexData;
class DexLocalizationPoint;
class IDexImporter;
struct DexParserThreadParams;

// ---- The run of one import ------------------------------------------------------------------------

// Runs one import described by params and returns its result; params is freed in every case (it must
// come from new, as DexParsersLoader makes it). The steps:
//  - no data gives DEX_RESULT_FAILED, no format or no "MakeImporter" DEX_RESULT_NO_PARSER;
//  - otherwise the plug-in makes the importer; none gives DEX_RESULT_NO_PARSER; the importer's
//    doImport() gives the result, and the importer is deleted;
//  - for a run in a thread of its own (params->ownThread) the import notifier of the data's settings
//    is told the result in this thread; without a notifier an error-log record (ieUtils\IImporter,
//    line 92) is written instead.
// Nothing a plug-in throws leaves the function: an exception from making, running or deleting the
// importer ends the run with DEX_RESULT_FAILED and one error-log record (ieUtils\IImporter, line 901);
// one from the notifier leaves the result as it was and one record (line 902).
// A null params gives DEX_RESULT_FAILED.
DEX_API EDexResult ImportFunction(DexParserThreadParams* params);

// ImportFunction as a thread function (vyn::thread::ThreadFunction): its exit code is the result, an
// EDexResult stored in 32 bits (read it back with DexParsersLoader::resultFromExitCode).
DEX_API unsigned ImportThreadFunction(void* params);

// ---- Interfaces ------------------------------------------------------------------------------------

// What the loader runs: one importer reads one file into the data container, once, and is then deleted
// by the library through the virtual destructor. Only ImportFunction calls doImport.
class DEX_API IDexImporter {
 public:
  VYN_CLASS_ALLOCATOR

  // Virtual operations, in this order (the plug-in ABI): the destructor, doImport.
  virtual ~IDexImporter();

 protected:
  // Reads the file into the container and returns the result: DEX_RESULT_OK, another value of 0 or
  // above for a success with a remark of the plug-in's own, or a negative failure. Importers poll
  // DexData::stopProcess_ between records and return DEX_RESULT_STOPPED when it is set.
  virtual EDexResult doImport() = 0;

  IDexImporter() = default;
  IDexImporter(const IDexImporter&) = default;
  IDexImporter& operator=(const IDexImporter&) = default;

 private:
  friend EDexResult ImportFunction(DexParserThreadParams* params);
};

// The base of every importer: the container to fill, the file to read and the format being read.
// Nothing is owned: the container and the format belong to the caller of the run.
//
// Constructing an importer prepares the container: when the data's settings request object data (any
// of POINTS, LINES, AREAS, PARCELS, ROADS, SURFACES, POINT_LISTS, ROAD_SURVEY, SCANNING_DATA,
// JOB_HISTORY, RAW_DATA, MULTIPLE) and the container has no dataset yet, the dataset
// "Import dataset" is added, so an importer of object data always finds a current dataset and an
// import into a container that has datasets adds to them. A null data skips the preparation.
//
// Importers publish how much of the file they have read through data->getProgress()
// .setImportPosition(bytesRead, bytesTotal).
class DEX_API DexImporterImpl : public IDexImporter {
 public:
  VYN_CLASS_ALLOCATOR

  // Copies the three fields; the copy shares the container and the format.
  DexImporterImpl(const DexImporterImpl& other) = default;
  DexImporterImpl& operator=(const DexImporterImpl& other) = default;

  DexData* getData() const { return data; }
  const CVynStringT<wchar_t>& getFileName() const { return fileName; }
  const DexFormat* getFormat() const { return format; }

 protected:
  // Stores the fields, then prepares the container as described above.
  DexImporterImpl(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  ~DexImporterImpl() override;

  DexData* data;                  // the container to fill; not owned
  CVynStringT<wchar_t> fileName;  // the file to read
  const DexFormat* format;        // the format being read; not owned
};

// The base of the importers of formats that carry a localization together with ordinary points. While
// reading the localization the importer hands each control point to addLocalizationPt, which
// remembers the plane coordinates of its station by the station's name; for each ordinary point read
// afterwards, isPointUsedInLocalization tells whether it is one of the control points. The remembered
// coordinates live as long as the importer.
//
// Virtual operations, in this order: the destructor, doImport.
class DEX_API DexImporterImplWithLocalization : public DexImporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  // Copies the fields and the remembered coordinates.
  DexImporterImplWithLocalization(const DexImporterImplWithLocalization& other) = default;
  DexImporterImplWithLocalization& operator=(const DexImporterImplWithLocalization& other) = default;

 protected:
  // The base constructor; no coordinates remembered.
  DexImporterImplWithLocalization(DexData* data, const CVynStringT<wchar_t>& fileName,
                                  const DexFormat* format);
  ~DexImporterImplWithLocalization() override;

  // Remembers the x, y, z of the plane station of point's observation under the station's name. A
  // point without observation or plane station changes nothing; a name remembered already keeps its
  // first coordinates.
  void addLocalizationPt(const DexLocalizationPoint& point);
  // True when the data holds a localization and position equals (each coordinate within 1e-12) the
  // coordinates remembered under exactly name.
  bool isPointUsedInLocalization(const CVynStringT<wchar_t>& name, const DexPosition3D& position) const;

 private:
  std::map<CVynStringT<wchar_t>, DexPosition3D> localizationPoints;
};

// ---- The plug-in's entry point ---------------------------------------------------------------------

// The type of "MakeImporter": a new importer for the file in that format, owned by the caller (the
// library deletes it after the run), or null when the plug-in does not import the format.
using MakeImporterFunction = IDexImporter* (*)(DexData* data, const CVynStringT<wchar_t>& fileName,
                                               const DexFormat* format);

// The export name the loader looks up.
inline constexpr const char* kMakeImporterEntryPoint = "MakeImporter";

}  // namespace vyn::ie

// Defines a plug-in's "MakeImporter" with C linkage, exported, and with the exact parameter types the
// loader calls it with; the arguments name the parameters:
//
//   DEX_MAKE_IMPORTER(data, fileName, format) {
//     if (format == nullptr || !format->isIdEqual(kMyFormatId)) return nullptr;
//     return new MyImporter(data, fileName, format);
//   }
// NOLINTBEGIN(bugprone-macro-parentheses): the arguments are parameter names
#define DEX_MAKE_IMPORTER(data, fileName, format)           \
  extern "C" DEX_API ::vyn::ie::IDexImporter* MakeImporter( \
      ::vyn::ie::DexData* data, const CVynStringT<wchar_t>& fileName, const ::vyn::ie::DexFormat* format)
// NOLINTEND(bugprone-macro-parentheses)
