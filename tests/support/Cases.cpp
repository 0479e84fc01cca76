#include "support/Cases.h"

#include <gtest/gtest.h>

#include <charconv>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <sstream>

#include "hostlibs/VynString.h"
#include "support/TempDir.h"

namespace dex_test {

namespace {

// A decimal number read the same under every locale; false unless the whole text is one.
bool parsed(std::string_view text, double& value) {
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
  return error == std::errc() && end == text.data() + text.size();
}

std::string trimmed(const std::string& text) {
  const std::size_t first = text.find_first_not_of(" \t\r");
  if (first == std::string::npos) return "";
  return text.substr(first, text.find_last_not_of(" \t\r") - first + 1);
}

// The fields of a line, split at each '|' that is not escaped.
std::vector<std::string> fieldsOf(const std::string& line) {
  std::vector<std::string> fields;
  std::string field;
  for (std::size_t i = 0; i < line.size(); ++i) {
    if (line[i] == '\\' && i + 1 < line.size()) {
      field += line.substr(i++, 2);
    } else if (line[i] == '|') {
      fields.push_back(trimmed(field));
      field.clear();
    } else {
      field += line[i];
    }
  }
  fields.push_back(trimmed(field));
  return fields;
}

void appendUtf8(std::string& out, char32_t point) {
  if (point < 0x80) {
    out += static_cast<char>(point);
  } else if (point < 0x800) {
    out += static_cast<char>(0xC0 | (point >> 6));
    out += static_cast<char>(0x80 | (point & 0x3F));
  } else if (point < 0x10000) {
    out += static_cast<char>(0xE0 | (point >> 12));
    out += static_cast<char>(0x80 | ((point >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (point & 0x3F));
  } else {
    out += static_cast<char>(0xF0 | (point >> 18));
    out += static_cast<char>(0x80 | ((point >> 12) & 0x3F));
    out += static_cast<char>(0x80 | ((point >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (point & 0x3F));
  }
}

enum class Piece { kPlainByte, kEscapedByte, kCodePoint };

// Resolves the escapes of a field, handing each plain byte, escaped byte (\xNN, \t, ...) and escaped
// code point (\uXXXX, \UXXXXXXXX) to emit.
template <class Emit>
void resolve(std::string field, Emit emit) {
  if (field.size() >= 2 && field.front() == '"' && field.back() == '"')
    field = field.substr(1, field.size() - 2);
  for (std::size_t i = 0; i < field.size(); ++i) {
    if (field[i] != '\\' || i + 1 == field.size()) {
      emit(static_cast<unsigned char>(field[i]), Piece::kPlainByte);
      continue;
    }
    const char kind = field[++i];
    const auto hex = [&](std::size_t digits) {
      const char32_t value =
          static_cast<char32_t>(std::strtoul(field.substr(i + 1, digits).c_str(), nullptr, 16));
      i += digits;
      return value;
    };
    switch (kind) {
      case 't':
        emit(U'\t', Piece::kEscapedByte);
        break;
      case 'n':
        emit(U'\n', Piece::kEscapedByte);
        break;
      case 'r':
        emit(U'\r', Piece::kEscapedByte);
        break;
      case '0':
        emit(U'\0', Piece::kEscapedByte);
        break;
      case 'x':
        emit(hex(2), Piece::kEscapedByte);
        break;
      case 'u':
        emit(hex(4), Piece::kCodePoint);
        break;
      case 'U':
        emit(hex(8), Piece::kCodePoint);
        break;
      default:
        emit(static_cast<unsigned char>(kind), Piece::kPlainByte);
        break;
    }
  }
}

}  // namespace

const std::string& Case::operator[](std::size_t index) const {
  static const std::string kNone;
  return index < fields.size() ? fields[index] : kNone;
}

std::string Case::bytes(std::size_t index) const {
  std::string out;
  const std::string& field = (*this)[index];
  resolve(field, [&out](char32_t point, Piece piece) {
    if (piece == Piece::kCodePoint) {
      appendUtf8(out, point);
    } else {
      out += static_cast<char>(point);
    }
  });
  return out;
}

std::wstring Case::text(std::size_t index) const {
  std::wstring out;
  std::string plain;
  const auto flush = [&] {
    out += widen(plain);
    plain.clear();
  };
  resolve((*this)[index], [&](char32_t point, Piece piece) {
    if (piece == Piece::kPlainByte) {
      plain += static_cast<char>(point);
      return;
    }
    flush();
    out += static_cast<wchar_t>(point);
  });
  flush();
  return out;
}

double Case::number(std::size_t index) const {
  std::string field = (*this)[index];
  const bool negative = !field.empty() && field.front() == '-';
  if (negative) field.erase(0, 1);
  double value = 0.0;
  if (field == "nan") {
    value = std::numeric_limits<double>::quiet_NaN();
  } else if (field == "inf") {
    value = std::numeric_limits<double>::infinity();
  } else if (field == "max") {
    value = std::numeric_limits<double>::max();
  } else if (field == "min") {
    value = std::numeric_limits<double>::min();
  } else if (const std::size_t colon = field.find(':'); colon != std::string::npos) {
    const std::size_t second = field.find(':', colon + 1);
    double degrees = 0.0;
    double minutes = 0.0;
    double seconds = 0.0;
    EXPECT_TRUE(second != std::string::npos && parsed(field.substr(0, colon), degrees) &&
                parsed(field.substr(colon + 1, second - colon - 1), minutes) &&
                parsed(field.substr(second + 1), seconds))
        << where << ": not d:m:s: " << (*this)[index];
    value = degrees + minutes / 60.0 + seconds / 3600.0;
  } else {
    EXPECT_TRUE(parsed(field, value)) << where << ": not a number: " << (*this)[index];
  }
  return negative ? -value : value;
}

int Case::integer(std::size_t index) const {
  int value = 0;
  const std::string& field = (*this)[index];
  std::from_chars(field.data(), field.data() + field.size(), value);
  return value;
}

std::vector<double> Case::numbers(std::size_t index) const {
  std::vector<double> values;
  std::istringstream words((*this)[index]);
  Case single{where, {""}};
  while (words >> single.fields[0])  // words, not numbers: no locale involved
    values.push_back(single.number(0));
  return values;
}

void expectNumber(double actual, const Case& c, std::size_t expected, std::size_t tolerance) {
  const double wanted = c.number(expected);
  if (std::isnan(wanted)) {
    EXPECT_TRUE(std::isnan(actual)) << actual;
  } else if (c[tolerance].empty()) {
    EXPECT_EQ(actual, wanted);
  } else {
    EXPECT_NEAR(actual, wanted, c.number(tolerance));
  }
}

std::vector<Case> casesOf(std::string_view name) {
  const std::string path = dataFile("cases/" + std::string(name));
  std::istringstream content(readFile(path));
  std::vector<Case> cases;
  std::string line;
  for (int number = 1; std::getline(content, line); ++number) {
    const std::string kept = trimmed(line);
    if (kept.empty() || kept.front() == '#') continue;
    cases.push_back({path + ":" + std::to_string(number), fieldsOf(kept)});
  }
  return cases;
}

void forEachCase(std::string_view name, const std::function<void(const Case&)>& check) {
  const std::vector<Case> cases = casesOf(name);
  EXPECT_FALSE(cases.empty()) << "no case in " << name;
  for (const Case& one : cases) {
    SCOPED_TRACE(one.where);
    check(one);
  }
}

}  // namespace dex_test
