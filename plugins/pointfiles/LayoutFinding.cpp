#include "LayoutFinding.h"

#include <algorithm>
#include <cwctype>

#include "LineValues.h"

namespace vyn::ie::point_files {

using namespace ascii_fields;

namespace {

struct OrderLetter {
  wchar_t letter;
  EType type;
};
constexpr OrderLetter kOrderLetters[] = {{L'P', FIELD_NAME},
                                         {L'N', FIELD_NORTHING},
                                         {L'E', FIELD_EASTING},
                                         {L'Z', FIELD_HEIGHT},
                                         {L'D', FIELD_FULL_CODES}};

// The common header names beside the library's field names, written as normalized (see below).
struct HeaderName {
  const wchar_t* name;
  EType type;
};
constexpr HeaderName kHeaderNames[] = {
    {L"point", FIELD_NAME},
    {L"name", FIELD_NAME},
    {L"ptno", FIELD_NAME},
    {L"id", FIELD_NAME},
    {L"pt", FIELD_NAME},
    {L"pointno", FIELD_NAME},
    {L"pointnumber", FIELD_NAME},
    {L"pointname", FIELD_NAME},
    {L"pointid", FIELD_NAME},
    {L"ptnum", FIELD_NAME},
    {L"p", FIELD_NAME},
    {L"n", FIELD_NORTHING},
    {L"northing", FIELD_NORTHING},
    {L"north", FIELD_NORTHING},
    {L"y", FIELD_Y},
    {L"e", FIELD_EASTING},
    {L"easting", FIELD_EASTING},
    {L"east", FIELD_EASTING},
    {L"x", FIELD_X},
    {L"z", FIELD_Z},
    {L"elevation", FIELD_HEIGHT},
    {L"elev", FIELD_HEIGHT},
    {L"height", FIELD_HEIGHT},
    {L"h", FIELD_HEIGHT},
    {L"rl", FIELD_HEIGHT},
    {L"code", FIELD_CODES},
    {L"codes", FIELD_CODES},
    {L"description", FIELD_CODES_AND_DESCRIPTIONS},
    {L"desc", FIELD_CODES_AND_DESCRIPTIONS},
    {L"d", FIELD_CODES_AND_DESCRIPTIONS},
    {L"notes", FIELD_NOTES},
    {L"note", FIELD_NOTES},
    {L"remarks", FIELD_NOTES},
    {L"comment", FIELD_NOTES},
    {L"layer", FIELD_LAYER_NAME},
};

// Lower case without blanks, tabs and underscores.
std::wstring normalized(std::wstring_view name) {
  std::wstring text;
  for (const wchar_t ch : name) {
    if (ch != L' ' && ch != L'\t' && ch != L'_') text += static_cast<wchar_t>(std::towlower(ch));
  }
  return text;
}

EType typeOfName(const std::wstring& name) {
  for (const HeaderName& known : kHeaderNames) {
    if (name == known.name) return known.type;
  }
  FieldList pointFields;
  getSupportedFieldsByOwner(pointFields, OWNER_POINTS);
  for (const DexFieldFormat& field : pointFields) {
    if (name == normalized(typeToField(field.type).view())) return field.type;
  }
  return FIELD_UNKNOWN;
}

// The field a header name stands for: the whole name, else the name without a trailing "(unit)".
EType typeOfHeader(std::wstring_view header) {
  const std::wstring name = normalized(header);
  const EType type = typeOfName(name);
  const std::size_t open = name.rfind(L'(');
  if (type != FIELD_UNKNOWN || open == std::wstring::npos || open == 0 || name.back() != L')') return type;
  return typeOfName(name.substr(0, open));
}

bool isCoordinate(EColumn column) {
  return column == EColumn::NORTH || column == EColumn::EAST || column == EColumn::HEIGHT;
}

bool isCodes(EColumn column) {
  return column == EColumn::CODES || column == EColumn::CODES_STRINGS || column == EColumn::CODES_ATTRS ||
         column == EColumn::FULL_CODES;
}

int numbersIn(const std::vector<std::wstring_view>& values, bool decimalComma) {
  double number = 0.0;
  return static_cast<int>(std::count_if(values.begin(), values.end(), [&](std::wstring_view value) {
    return parseNumber(value, number, decimalComma);
  }));
}

// Whether two column lists read the same (every code column reads the codes with all their parts).
bool sameKinds(const FieldList& first, const FieldList& second) {
  return std::equal(first.begin(), first.end(), second.begin(), second.end(),
                    [](const DexFieldFormat& a, const DexFieldFormat& b) {
                      const EColumn kindA = columnOf(a.type);
                      const EColumn kindB = columnOf(b.type);
                      return kindA == kindB || (isCodes(kindA) && isCodes(kindB));
                    });
}

}  // namespace

bool fieldsFromOrder(std::wstring_view order, FieldList& fields) {
  FieldList parsed;
  for (const wchar_t ch : order) {
    const auto letter = std::find_if(
        std::begin(kOrderLetters), std::end(kOrderLetters),
        [ch](const OrderLetter& known) { return known.letter == static_cast<wchar_t>(std::towupper(ch)); });
    if (letter == std::end(kOrderLetters) || findTypeInArray(letter->type, parsed) >= 0) return false;
    parsed.push_back({letter->type, 0, 0});
  }
  if (findTypeInArray(FIELD_NORTHING, parsed) < 0 || findTypeInArray(FIELD_EASTING, parsed) < 0) return false;
  fields = parsed;
  return true;
}

std::wstring orderOf(const FieldList& fields) {
  std::wstring order;
  for (const DexFieldFormat& field : fields) {
    const EColumn column = columnOf(field.type);
    const auto letter =
        std::find_if(std::begin(kOrderLetters), std::end(kOrderLetters), [column](const OrderLetter& known) {
          const EColumn kind = columnOf(known.type);
          return kind == column || (isCodes(kind) && isCodes(column));
        });
    if (letter == std::end(kOrderLetters)) return {};
    order += letter->letter;
  }
  return order;
}

bool readHeader(const std::vector<std::wstring_view>& values, PointLayout& layout) {
  FieldList fields;
  std::vector<std::wstring> labels;
  bool namesCode = false;
  for (const std::wstring_view value : values) {
    const EType type = typeOfHeader(value);
    namesCode |= isCodes(columnOf(type)) && type != FIELD_CODES_AND_DESCRIPTIONS;
    fields.push_back({type, 0, 0});
    labels.emplace_back(value);
  }
  bool namesCoordinate = false;
  std::vector<EColumn> seen;
  for (DexFieldFormat& field : fields) {
    const EColumn column = columnOf(field.type);
    const bool description = field.type == FIELD_CODES_AND_DESCRIPTIONS && namesCode;
    const bool again = column != EColumn::OTHER && std::find(seen.begin(), seen.end(), column) != seen.end();
    if (description || again) field.type = FIELD_UNKNOWN;
    seen.push_back(columnOf(field.type));
    namesCoordinate |= isCoordinate(columnOf(field.type));
  }
  if (!namesCoordinate || numbersIn(values, layout.decimalComma()) > 0) return false;
  layout.fields = fields;
  layout.labels = labels;
  return true;
}

wchar_t findDelimiter(const std::vector<NumberedLine>& lines, wchar_t fallback) {
  static constexpr wchar_t kCandidates[] = {L'\t', L';', L',', L'|', L' '};
  const PointLayout delimited;
  LineSplitter splitter(delimited);
  wchar_t best = fallback;
  int bestLines = 0;
  for (const wchar_t candidate : kCandidates) {
    const int lineCount =
        static_cast<int>(std::count_if(lines.begin(), lines.end(), [&](const NumberedLine& line) {
          return numbersIn(splitter.split(line.second, candidate), candidate != L',') >= 2;
        }));
    if (lineCount > bestLines) {
      best = candidate;
      bestLines = lineCount;
    }
  }
  return best;
}

std::wstring delimiterWord(wchar_t delimiter) {
  switch (delimiter) {
    case L',':
      return L"comma";
    case L';':
      return L"semicolon";
    case L'\t':
      return L"tab";
    case L' ':
      return L"blanks";
    case L'|':
      return L"pipe";
    default:
      return std::wstring(L"\"") + delimiter + L"\"";
  }
}

bool findLayout(const std::vector<NumberedLine>& firstLines, PointLayout& layout) {
  if (!layout.fixedWidth && layout.delimiterFrom == ESource::FOUND) {
    layout.delimiter = findDelimiter(firstLines, kDelimiterToFind);
    if (layout.delimiter == kDelimiterToFind) {
      layout.delimiter = L',';
      layout.delimiterFrom = ESource::ASSUMED;
    }
  }
  LineSplitter splitter(layout);
  const FieldList before = layout.fields;
  const ESource columnsBefore = layout.columnsFrom;
  for (const auto& [number, text] : firstLines) {
    const std::vector<std::wstring_view>& values = splitter.split(CVynStringT<wchar_t>(text));
    // Fixed-width columns keep their widths: their header line is only passed over.
    PointLayout named = layout;
    if (readHeader(values, layout.fixedWidth ? named : layout)) {
      if (!layout.fixedWidth) layout.columnsFrom = ESource::HEADER;
      layout.headerLineNumber = number;
    } else if (layout.headerLine && number == firstLines.front().first) {
      layout.headerLineNumber = number;
    }
    if (layout.headerLine || numbersIn(values, layout.decimalComma()) >= 2) break;
  }
  return columnsBefore == ESource::GIVEN && layout.columnsFrom == ESource::HEADER &&
         !sameKinds(before, layout.fields);
}

}  // namespace vyn::ie::point_files
