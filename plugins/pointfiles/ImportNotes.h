#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "PointLayout.h"

// What one import found out about a point file, and the notes (trace records) that tell it. The
// importer writes the notes at the end of its run; a host reads them back from its log sink to report
// them in its own form (the command-line tool's --json does).
namespace vyn::ie::point_files {

// Line numbers with the reason for each, the first kNotedLines of them, and how many there were.
struct LineTally {
  struct Entry {
    int line = 0;
    std::wstring reason;
  };
  int count = 0;
  std::vector<Entry> first;

  void add(int line, std::wstring_view reason);
};

struct ImportFindings {
  // The layout the lines were read by.
  bool layoutKnown = false;           // a layout was described (or read back from a note)
  std::vector<std::wstring> columns;  // field names; a column kept in the notes as "header name" in quotes
  std::wstring order;                 // the columns as an order name ("PENZD"), empty when they have none
  ESource columnsFrom = ESource::ASSUMED;
  int headerLine = 0;      // the line skipped as the header, 0 when none
  std::wstring delimiter;  // its word (delimiterWord); empty for fixed-width columns
  ESource delimiterFrom = ESource::GIVEN;

  // The lines.
  int points = 0;
  LineTally skipped;     // dropped: no name or no coordinates (the reason says which)
  LineTally extra;       // values after the last column, kept in the points' notes (no reason)
  LineTally unreadable;  // values not read as their column (a height that is no number, a malformed
                         // code), kept in the points' notes

  void describe(const PointLayout& layout);
};

// The layout as the notes tell it: "columns Name, Northing, ... (PNEZD, as given); delimiter comma
// (found in the first lines)".
std::wstring layoutText(const ImportFindings& findings);

// The notes of an import of file: the layout, each noted skipped and unreadable line, and the counts
// (a count note only for what happened).
std::vector<std::wstring> notesOf(std::wstring_view file, const ImportFindings& findings);

// Adds what one note of an import of file tells to findings; false for a text that is no such note.
bool readNote(std::wstring_view file, std::wstring_view note, ImportFindings& findings);

}  // namespace vyn::ie::point_files
