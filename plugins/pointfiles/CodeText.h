#pragma once

#include <string>
#include <string_view>

#include "LineValues.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IECodesDataInterface.h"

// The codes of a point as one text in a point-file column:
//
//   CODE[:STRING...][;ATTRIBUTE=VALUE...] [CODE...]
//
// Codes are separated by blanks. Each code may be followed by its code strings, each after a colon,
// and by its attribute values, each as name=value after a semicolon ("EP:1 TREE;Species=Oak;Girth=0.8").
// A reader accepts every part whatever column it reads; a writer writes the parts its column names.
// Code names, code strings and attribute texts hold no blank, colon, semicolon or equals sign.
namespace vyn::ie {
class DexData;
class DexCodeDescription;
}  // namespace vyn::ie

namespace vyn::ie::point_files {

// Copies text into target, reusing target's storage.
void assignText(CVynStringT<wchar_t>& target, std::wstring_view text);

// Appends the codes' text to out: every code that has a description, with its code strings when
// withStrings and its attribute values (by the description's attribute names) when withAttributes.
void appendCodesText(const DexCodesDataInterface& codes, bool withStrings, bool withAttributes,
                     std::wstring& out);

// Reads code texts into objects. Each code name is looked up once in the data's code library; a
// code it does not hold yet is added to it (the library owns it). Meant for one import run: it keeps
// the descriptions it met, so the container's code library must not lose them meanwhile.
class CodeReader {
 public:
  explicit CodeReader(DexData* data) : data_(data) {}

  // Adds to target one code value per code of text. A malformed code (an empty code name, or an
  // attribute without a name or without "=") is not added: its text is appended to rejected (blank
  // separated), and the answer is false; the other codes are read all the same.
  bool read(std::wstring_view text, DexCodesDataInterface& target, std::wstring& rejected);

 private:
  // The library's description of that code, added when missing; null only without data.
  const DexCodeDescription* description(std::wstring_view name);
  bool readOne(std::wstring_view item, DexCodesDataInterface& target);

  DexData* data_;
  TextMap<const DexCodeDescription*> known_;
  CVynStringT<wchar_t> first_;
  CVynStringT<wchar_t> second_;
};

}  // namespace vyn::ie::point_files
