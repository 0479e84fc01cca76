#pragma once

// Error-log records of the run machinery: the loader, the import run and the export run, each under its
// own source tag. The lines are part of the log's contract: a host tells the records apart by them.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kLoaderLogSource = L"ieUtils\\IEParsersLoader";
// An export library that cannot be loaded, or has no "MakeExporter".
inline constexpr int kExportLibraryNotLoadedLine = 52;
// An import library that cannot be loaded, or has no "MakeImporter".
inline constexpr int kImportLibraryNotLoadedLine = 100;
// getIEData() before initIEData().
inline constexpr int kNoDataContainerLine = 132;
// initIEData() could not allocate the container.
inline constexpr int kDataContainerNotCreatedLine = 901;

inline constexpr const wchar_t* kImporterLogSource = L"ieUtils\\IImporter";
// The line an import thread is started under (startThread's own records carry it).
inline constexpr int kImportThreadStartLine = 41;
// The import thread could not be created.
inline constexpr int kImportThreadNotStartedLine = 48;
// A threaded import ended and the settings carry no import notifier.
inline constexpr int kNoImportNotifierLine = 92;
// The plug-in threw while making, running or deleting its importer.
inline constexpr int kImporterThrewLine = 901;
// The import notifier threw.
inline constexpr int kImportNotifierThrewLine = 902;

inline constexpr const wchar_t* kExporterLogSource = L"ieUtils\\IExporter";
// The line an export thread is started under (startThread's own records carry it).
inline constexpr int kExportThreadStartLine = 40;
// The export thread could not be created.
inline constexpr int kExportThreadNotStartedLine = 41;
// A threaded export ended and the settings carry no export notifier.
inline constexpr int kNoExportNotifierLine = 141;
// The plug-in threw while making, running or deleting an exporter.
inline constexpr int kExporterThrewLine = 901;
// The export notifier threw.
inline constexpr int kExportNotifierThrewLine = 902;

inline constexpr const wchar_t* kMultipleFilesRoadExporterLogSource = L"ieUtils\\IEMultipleFilesRoadExporter";
// A multi-file road export whose settings request none of ROADS, H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS.
inline constexpr int kNoRoadDataTypeLine = 61;

}  // namespace vyn::ie::detail
