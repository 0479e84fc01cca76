#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

namespace dex_test {

// One line of a case file under tests/data/cases/: its fields, separated by '|'. A field keeps its
// inner spaces; the spaces around it go. Escapes: \t \n \r \\ \| \" \0, \xNN (a byte, or the code point
// NN in a text), \uXXXX and \UXXXXXXXX (a code point); a field in double quotes keeps every space.
struct Case {
  std::string where;  // "file:line", for failure messages
  std::vector<std::string> fields;

  // The field as written (escapes left in), "" past the end.
  const std::string& operator[](std::size_t index) const;
  std::size_t size() const { return fields.size(); }
  // The field as UTF-8 bytes with its escapes resolved (\xNN is the raw byte NN).
  std::string bytes(std::size_t index) const;
  // The field as a wide text (\xNN and \uXXXX are code points; lone surrogates are kept).
  std::wstring text(std::size_t index) const;
  // The field as a number: a decimal number, "nan", "inf", "max" (the largest finite double), "min"
  // (the smallest positive normal one), each with an optional minus sign, or degrees written as
  // d:m:s (d + m / 60 + s / 3600, the sign on the whole value).
  double number(std::size_t index) const;
  int integer(std::size_t index) const;
  // The field as numbers separated by spaces.
  std::vector<double> numbers(std::size_t index) const;
};

// Checks a number against the case's expected field: NaN matches NaN, and a tolerance field, when
// given, allows that much difference; otherwise the two must be equal.
void expectNumber(double actual, const Case& c, std::size_t expected, std::size_t tolerance);

// The cases of tests/data/cases/<name>; blank lines and lines starting with '#' are left out.
std::vector<Case> casesOf(std::string_view name);

// Runs check on every case of the file, naming the case's line in any failure; fails when the file
// holds no case.
void forEachCase(std::string_view name, const std::function<void(const Case&)>& check);

}  // namespace dex_test
