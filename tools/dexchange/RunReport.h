#pragma once

#include <ostream>
#include <string>

#include "ExchangeRun.h"
#include "FormatChoice.h"
#include "pointfiles/ImportNotes.h"

namespace vyn::ie {
class DexData;
}

// What info and convert report of their runs: the text of "dexchange info" and the JSON report.
namespace dexchange_tool {

// One side of a command (the file read or the file written) and how its run went.
struct RunSide {
  std::string file;
  const FormatChoice* format = nullptr;
  bool ran = false;
  RunOutcome outcome;
  // For a point-file import: what its notes tell of the layout and the lines (layoutKnown false
  // for other formats).
  vyn::ie::point_files::ImportFindings findings;

  // Keeps the outcome of the side's run and reads the findings back from its notes.
  void finish(const RunOutcome& runOutcome);
};

// The whole report of a command.
struct RunReport {
  std::string command;  // "info" or "convert"
  RunSide input;
  RunSide output;                    // convert only
  vyn::ie::DexData* data = nullptr;  // the loader's container after the runs
  std::string units;                 // the distance unit keyword of the run
  int lineworkPolylines = -1;        // polylines made from point codes (convert --linework), -1 none asked
  int exitCode = kExitOk;
  std::string error;  // the failure line, empty on success
};

// The text of "dexchange info" for a successful import.
void printInfo(std::ostream& out, const RunReport& report);

// The JSON report (schema in the README).
std::string jsonReport(const RunReport& report);

}  // namespace dexchange_tool
