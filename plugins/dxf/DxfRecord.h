#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

// One structure of a DXF file (an entity, a table entry, a header variable) as the groups that
// follow its group 0, kept until the next one starts.
namespace vyn::ie::dxf {

// The groups of one structure, read through typed look-ups. A value that a look-up wants as a number
// and that is not one marks the record malformed (with that group's code); the look-up answers its
// fallback, so a caller builds on and then asks malformed() once. The record keeps its storage from
// one structure to the next.
class DxfRecord {
 public:
  // Starts a new structure of that type (the value of its group 0) at that line.
  void reset(std::string_view type, int line);
  void add(int code, std::string_view value);
  // Marks the record malformed (a group line was cut, say).
  void markMalformed(int code) noexcept;

  std::string_view type() const noexcept { return type_; }
  int line() const noexcept { return line_; }
  bool empty() const noexcept { return type_.empty(); }
  std::size_t size() const noexcept { return groups_.size(); }
  int codeAt(std::size_t index) const noexcept { return groups_[index].code; }
  std::string_view valueAt(std::size_t index) const noexcept;

  // The index of the first group of code at or after from, or -1.
  int find(int code, std::size_t from = 0) const noexcept;
  bool has(int code) const noexcept { return find(code) >= 0; }
  // The value of the first group of code; empty when there is none.
  std::string_view text(int code) const noexcept;
  double real(int code, double fallback);
  int integer(int code, int fallback);
  double realAt(std::size_t index, double fallback);
  int integerAt(std::size_t index, int fallback);

  bool malformed() const noexcept { return malformedCode_ >= 0; }
  // The code of the first value that was not a number, or -1.
  int malformedCode() const noexcept { return malformedCode_; }

  // The texts (groups 1000) of the extended data of application, in order; empty when there is none.
  std::vector<std::string_view> applicationTexts(std::string_view application) const;

 private:
  struct Group {
    int code;
    std::uint32_t offset;
    std::uint32_t length;
  };

  std::string type_;
  int line_ = 0;
  std::vector<Group> groups_;
  std::string chars_;
  int malformedCode_ = -1;
};

}  // namespace vyn::ie::dxf
