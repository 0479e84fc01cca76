#include "ImportNotes.h"

#include <algorithm>

#include "LayoutFinding.h"

namespace vyn::ie::point_files {

namespace {

// The words of the notes; the reader below recognizes exactly these.
constexpr std::wstring_view kColumns = L"columns ";
constexpr std::wstring_view kFromHeader = L"named by the header line ";
constexpr std::wstring_view kGiven = L"as given";
constexpr std::wstring_view kHeaderSkipped = L", header line ";
constexpr std::wstring_view kSkippedSuffix = L" skipped";
constexpr std::wstring_view kAssumedColumns = L"assumed: no header line names them";
constexpr std::wstring_view kFixedWidth = L"fixed-width columns";
constexpr std::wstring_view kDelimiter = L"delimiter ";
constexpr std::wstring_view kFound = L"found in the first lines";
constexpr std::wstring_view kAssumedDelimiter = L"assumed: no delimiter gives numbers";
constexpr std::wstring_view kLineSkipped = L"line skipped, ";
constexpr std::wstring_view kKeptInPoint = L", kept in the point's notes";
constexpr std::wstring_view kSkippedCount = L" skipped (no name or no coordinates), ";
constexpr std::wstring_view kPointsRead = L" points read";
constexpr std::wstring_view kExtraCount = L" with values after the last column, kept in the points' notes (";
constexpr std::wstring_view kUnreadableCount =
    L" with values not read as their column, kept in the points' notes";
constexpr std::wstring_view kMore = L"...";

std::wstring lines(int count) {
  return std::to_wstring(count) + (count == 1 ? L" line" : L" lines");
}

std::wstring sourceText(const ImportFindings& findings) {
  std::wstring text = findings.order.empty() ? L"" : findings.order + L", ";
  const std::wstring headerLine = std::to_wstring(findings.headerLine);
  switch (findings.columnsFrom) {
    case ESource::HEADER:
      return text + std::wstring(kFromHeader) + headerLine;
    case ESource::ASSUMED:
      return text + std::wstring(kAssumedColumns);
    default:
      text += kGiven;
      if (findings.headerLine > 0)
        text += std::wstring(kHeaderSkipped) + headerLine + std::wstring(kSkippedSuffix);
      return text;
  }
}

std::wstring delimiterText(const ImportFindings& findings) {
  if (findings.delimiter.empty()) return std::wstring(kFixedWidth);
  const std::wstring_view how = findings.delimiterFrom == ESource::FOUND     ? kFound
                                : findings.delimiterFrom == ESource::ASSUMED ? kAssumedDelimiter
                                                                             : kGiven;
  return std::wstring(kDelimiter) + findings.delimiter + L" (" + std::wstring(how) + L")";
}

// ---- Reading ------------------------------------------------------------------------------------

bool consume(std::wstring_view& text, std::wstring_view prefix) {
  if (text.substr(0, prefix.size()) != prefix) return false;
  text.remove_prefix(prefix.size());
  return true;
}

bool consumeNumber(std::wstring_view& text, int& value) {
  std::size_t digits = 0;
  value = 0;
  while (digits < text.size() && digits < 9 && text[digits] >= L'0' && text[digits] <= L'9')
    value = value * 10 + (text[digits++] - L'0');
  text.remove_prefix(digits);
  return digits > 0;
}

bool consumeLines(std::wstring_view& text) {
  return consume(text, L" lines") || consume(text, L" line");
}

std::vector<std::wstring> splitColumns(std::wstring_view text) {
  std::vector<std::wstring> columns;
  while (!text.empty()) {
    const std::size_t comma = std::min(text.find(L", "), text.size());
    columns.emplace_back(text.substr(0, comma));
    text.remove_prefix(std::min(comma + 2, text.size()));
  }
  return columns;
}

bool readSource(std::wstring_view source, ImportFindings& findings) {
  const std::size_t comma = source.find(L", ");
  if (comma != std::wstring_view::npos && source.substr(0, comma).find(L' ') == std::wstring_view::npos) {
    findings.order = std::wstring(source.substr(0, comma));
    source.remove_prefix(comma + 2);
  }
  if (consume(source, kFromHeader)) {
    findings.columnsFrom = ESource::HEADER;
    return consumeNumber(source, findings.headerLine);
  }
  if (consume(source, kGiven)) {
    findings.columnsFrom = ESource::GIVEN;
    return source.empty() || (consume(source, kHeaderSkipped) && consumeNumber(source, findings.headerLine));
  }
  findings.columnsFrom = ESource::ASSUMED;
  return source == kAssumedColumns;
}

bool readDelimiter(std::wstring_view text, ImportFindings& findings) {
  if (text == kFixedWidth) return true;
  if (!consume(text, kDelimiter) || text.empty() || text.back() != L')') return false;
  const std::size_t open = text.rfind(L" (");
  if (open == std::wstring_view::npos) return false;
  findings.delimiter = std::wstring(text.substr(0, open));
  const std::wstring_view how = text.substr(open + 2, text.size() - open - 3);
  findings.delimiterFrom = how == kFound              ? ESource::FOUND
                           : how == kAssumedDelimiter ? ESource::ASSUMED
                                                      : ESource::GIVEN;
  return true;
}

bool readLayout(std::wstring_view text, ImportFindings& findings) {
  const std::size_t split = text.rfind(L"); ");
  if (split == std::wstring_view::npos) return false;
  const std::wstring_view columns = text.substr(0, split);
  const std::size_t open = columns.rfind(L" (");
  if (open == std::wstring_view::npos || !readDelimiter(text.substr(split + 3), findings) ||
      !readSource(columns.substr(open + 2), findings))
    return false;
  findings.columns = splitColumns(columns.substr(0, open));
  findings.layoutKnown = true;
  return true;
}

// "3, 4, 5, ..." into the first lines of tally.
void readLineList(std::wstring_view text, LineTally& tally) {
  int line = 0;
  while (consumeNumber(text, line)) {
    tally.first.push_back({line, {}});
    if (!consume(text, L", ")) break;
  }
}

bool readCount(std::wstring_view text, ImportFindings& findings) {
  int count = 0;
  if (!consumeNumber(text, count) || !consumeLines(text)) return false;
  if (consume(text, kSkippedCount)) {
    findings.skipped.count = count;
    return consumeNumber(text, findings.points) && text == kPointsRead;
  }
  if (consume(text, kExtraCount)) {
    findings.extra.count = count;
    consume(text, L"lines ") || consume(text, L"line ");
    readLineList(text, findings.extra);
    return true;
  }
  if (text == kUnreadableCount) {
    findings.unreadable.count = count;
    return true;
  }
  return false;
}

}  // namespace

std::wstring layoutText(const ImportFindings& findings) {
  std::wstring text(kColumns);
  for (std::size_t i = 0; i < findings.columns.size(); ++i)
    text += (i == 0 ? L"" : L", ") + findings.columns[i];
  return text + L" (" + sourceText(findings) + L"); " + delimiterText(findings);
}

void LineTally::add(int line, std::wstring_view reason) {
  if (++count <= kNotedLines) first.push_back({line, std::wstring(reason)});
}

void ImportFindings::describe(const PointLayout& layout) {
  layoutKnown = true;
  columns.clear();
  for (std::size_t i = 0; i < layout.fields.size(); ++i) {
    std::wstring label = layout.label(i);
    std::replace(label.begin(), label.end(), L',', L' ');  // the notes list the columns comma-separated
    columns.push_back(columnOf(layout.fields[i].type) == EColumn::OTHER && i < layout.labels.size()
                          ? L"\"" + label + L"\""
                          : std::wstring(ascii_fields::typeToField(layout.fields[i].type).view()));
  }
  order = orderOf(layout.fields);
  columnsFrom = layout.columnsFrom;
  headerLine = layout.headerLineNumber;
  delimiter = layout.fixedWidth ? std::wstring() : delimiterWord(layout.delimiter);
  delimiterFrom = layout.delimiterFrom;
}

std::vector<std::wstring> notesOf(std::wstring_view file, const ImportFindings& findings) {
  const std::wstring head(file);
  std::vector<std::wstring> notes;
  if (findings.layoutKnown) notes.push_back(head + L": " + layoutText(findings));
  for (const LineTally::Entry& entry : findings.skipped.first)
    notes.push_back(head + L"(" + std::to_wstring(entry.line) + L"): " + std::wstring(kLineSkipped) +
                    entry.reason);
  if (findings.skipped.count > 0) {
    notes.push_back(head + L": " + lines(findings.skipped.count) + std::wstring(kSkippedCount) +
                    std::to_wstring(findings.points) + std::wstring(kPointsRead));
  }
  if (findings.extra.count > 0) {
    std::wstring note = head + L": " + lines(findings.extra.count) + std::wstring(kExtraCount) +
                        (findings.extra.count == 1 ? L"line " : L"lines ");
    for (std::size_t i = 0; i < findings.extra.first.size(); ++i)
      note += (i == 0 ? L"" : L", ") + std::to_wstring(findings.extra.first[i].line);
    if (findings.extra.count > static_cast<int>(findings.extra.first.size()))
      note += L", " + std::wstring(kMore);
    notes.push_back(note + L")");
  }
  for (const LineTally::Entry& entry : findings.unreadable.first)
    notes.push_back(head + L"(" + std::to_wstring(entry.line) + L"): " + entry.reason +
                    std::wstring(kKeptInPoint));
  if (findings.unreadable.count > 0)
    notes.push_back(head + L": " + lines(findings.unreadable.count) + std::wstring(kUnreadableCount));
  return notes;
}

bool readNote(std::wstring_view file, std::wstring_view note, ImportFindings& findings) {
  if (!consume(note, file)) return false;
  int line = 0;
  if (consume(note, L"(")) {
    if (!consumeNumber(note, line) || !consume(note, L"): ")) return false;
    if (consume(note, kLineSkipped)) {
      findings.skipped.first.push_back({line, std::wstring(note)});
      return true;
    }
    if (note.size() <= kKeptInPoint.size() || note.substr(note.size() - kKeptInPoint.size()) != kKeptInPoint)
      return false;
    findings.unreadable.first.push_back(
        {line, std::wstring(note.substr(0, note.size() - kKeptInPoint.size()))});
    return true;
  }
  if (!consume(note, L": ")) return false;
  return consume(note, kColumns) ? readLayout(note, findings) : readCount(note, findings);
}

}  // namespace vyn::ie::point_files
