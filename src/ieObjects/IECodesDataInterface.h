#pragma once

#include <array>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEOwningList.h"
#include "ieUtils/IEAsciiFields.h"

// The codes a survey object carries: an ordered list of code values, each referring to a code
// description of the code library (IEDataDictionary.h) and holding the attribute values, code strings
// and control codes recorded with that code; and the rendering of an object's codes as one line of
// text by a code style.
//
// Error-log records (source ieObjects\IECodesDataInterface, empty message):
// - line 301: DexCodeValues::getCodeStringAt() was asked for an index outside the code strings;
// - line 302: DexCodesDataInterface::getCodesAsCodeStyle() met a field type that has no part in a
//   code text (one record for each such field of each code rendered).
namespace vyn::ie {

class DexCodeDescription;

// How an exporter writes an object's codes as one text (see
// DexCodesDataInterface::getCodesAsCodeStyle): the order of the items and the texts that separate
// them. Filled by the host or a plug-in; the library only reads it. Of each field only the type is read.
struct DEX_API DexCodeStyle {
  VYN_CLASS_ALLOCATOR

  DexCodeStyle() = default;
  DexCodeStyle(const DexCodeStyle&) = default;
  DexCodeStyle& operator=(const DexCodeStyle&) = default;
  virtual ~DexCodeStyle();

  ascii_fields::FieldList fields;             // the items of the text, in order
  CVynStringT<wchar_t> codeSeparator;         // between the codes of an object
  CVynStringT<wchar_t> stringSeparator;       // written when a code has code strings
  CVynStringT<wchar_t> controlCodeSeparator;  // before the second control code, and as its own item
  CVynStringT<wchar_t> noteSeparator;         // between the last code and the note
  CVynStringT<wchar_t> generalPrefix;         // written as its own item
  CVynStringT<wchar_t> attrNameSeparator;     // before each attribute name
  CVynStringT<wchar_t> attrValueSeparator;    // between an attribute's name and its value
  // The user's forms of the built-in control codes "AS", "AE", "R", "C", "BEG_LINE" and "END_LINE".
  CVynStringT<wchar_t> userAS;
  CVynStringT<wchar_t> userAE;
  CVynStringT<wchar_t> userR;
  CVynStringT<wchar_t> userC;
  CVynStringT<wchar_t> userBegLine;
  CVynStringT<wchar_t> userEndLine;
};

// One code of a survey object: the code description it refers to (not owned: the code library owns
// it), the attribute values (value k belongs to attribute description k of the description), the code
// strings (line-string identifiers) and three control codes. Copy construction and assignment copy
// all of it; the copy refers to the same description.
class DEX_API DexCodeValues {
 public:
  VYN_CLASS_ALLOCATOR

  // The three control-code places, in the order a code text writes them.
  enum ECodeControlCode : int {
    FIRST_CONTROL_CODE = 0,
    SECOND_CONTROL_CODE = 1,
    THIRD_CONTROL_CODE = 2,
  };
  static constexpr int kNumberOfControlCodes = 3;

  // description may be null; a value without description has no attributes by name.
  explicit DexCodeValues(const DexCodeDescription* description);
  DexCodeValues(const DexCodeValues&) = default;
  DexCodeValues& operator=(const DexCodeValues&) = default;
  virtual ~DexCodeValues();

  const DexCodeDescription* getDescription() const noexcept { return description_; }

  // Attribute values by position.
  void addAttr(const CVynStringT<wchar_t>& value) { attrs_.Add(value); }
  int getNumberOfAttrs() const noexcept { return attrs_.GetSize(); }
  // The value at index, or an empty text when index is outside the list.
  CVynStringT<wchar_t> getAttrAt(int index) const { return attrs_.GetAt(index); }

  // Attribute values by name (exact, case-sensitive).
  // Sets the value of the attribute named name. When the description has no such attribute, a new
  // String attribute description of that name is appended to the description, which every value
  // referring to it shares. The value list is first filled with empty texts up to the attribute's
  // index. Does nothing for a value without description. The description must not be a const object:
  // the value changes it through its const pointer.
  void insertAttr(const CVynStringT<wchar_t>& name, const CVynStringT<wchar_t>& value);
  // False (value unchanged) when there is no description or it has no attribute named name; otherwise
  // value is set to the value at that attribute's index (empty when the list is shorter) and true.
  bool getAttrByName(const CVynStringT<wchar_t>& name, CVynStringT<wchar_t>& value) const;
  // The value of the attribute named name, or an empty text.
  CVynStringT<wchar_t> getAttrByName(const CVynStringT<wchar_t>& name) const;

  // Code strings.
  void addCodeString(const CVynStringT<wchar_t>& codeString) { codeStrings_.Add(codeString); }
  int getNumberOfTheCodeStrings() const noexcept { return codeStrings_.GetSize(); }
  // The code string at index; an empty text and an error-log record (line 301) when index is outside
  // the list.
  CVynStringT<wchar_t> getCodeStringAt(int index) const;

  // Control codes. A place outside 0 to 2 reads as an empty text and is ignored by the setter.
  CVynStringT<wchar_t> getControlCode(int place) const;
  void setControlCode(int place, const CVynStringT<wchar_t>& controlCode);
  // True when controlCode equals one of the three control codes (exact), including an empty text
  // against an empty place.
  bool doesCodeHasControlCode(const CVynStringT<wchar_t>& controlCode) const;

 private:
  using StringList = CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&>;

  StringList attrs_;
  const DexCodeDescription* description_ = nullptr;
  StringList codeStrings_;
  // Most codes carry no control code: the three texts get a block when the first is set.
  DexOwnedPointer<std::array<CVynStringT<wchar_t>, kNumberOfControlCodes>> controlCodes_;
};

// The codes of one survey object (and of some raw observations), in order. The same code may occur
// more than once. The list owns its code values and deletes them with itself; copy construction and
// assignment duplicate every code value (the copies refer to the same descriptions).
class DEX_API DexCodesDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  DexCodesDataInterface() = default;
  DexCodesDataInterface(const DexCodesDataInterface&) = default;
  DexCodesDataInterface& operator=(const DexCodesDataInterface&) = default;
  virtual ~DexCodesDataInterface();

  // The list.
  // Appends code and takes ownership; a null code is ignored.
  void addCode(DexCodeValues* code) { codes_.add(code); }
  int getNumberOfCodes() const noexcept { return codes_.count(); }
  // The code at index, or null when index is outside the list.
  DexCodeValues* getCode(int index) noexcept { return codes_.at(index); }
  const DexCodeValues* getCode(int index) const noexcept { return codes_.at(index); }

  // Searches by code name (exact, case-sensitive); codes without description never match.
  // The first code whose description name equals name or, when withCodeStrings is true, whose
  // description name followed directly by one of its code strings equals name; null when none does.
  const DexCodeValues* findCode(const CVynStringT<wchar_t>& name, bool withCodeStrings = false) const;
  // The index of the first code whose description name equals name, or -1.
  int getCodePos(const CVynStringT<wchar_t>& name) const;
  // The value of the attribute attrName of the first code named codeName (code strings not
  // considered); an empty text when there is no such code or attribute.
  CVynStringT<wchar_t> getCodeAttrValue(const CVynStringT<wchar_t>& codeName,
                                        const CVynStringT<wchar_t>& attrName) const;

  // Removing. removeCode deletes the first code whose description name equals name and answers true;
  // false when there is none.
  bool removeCode(const CVynStringT<wchar_t>& name);
  void removeAllCodes() noexcept { codes_.clear(); }

  // Appends a copy of every code to target, whose own codes stay. Copying into this object doubles
  // its codes. A null target does nothing.
  void copyCodesData(DexCodesDataInterface* target) const;

  // The codes as one text by style (empty for a null style). For each code that has a description,
  // the items of style.fields are written in order:
  //   General Prefix (61): generalPrefix; Code (62): the code name;
  //   Code Separator (63): codeSeparator after every code but the last;
  //   Control Code (64): the user form of the first control code, then, when the second is not
  //     empty, controlCodeSeparator and the user form of the second;
  //   Control Code Separator (65): controlCodeSeparator when the first control code is not empty;
  //   Code String (66) and String Separator (67): the first code string and stringSeparator, each
  //     only when the code has code strings;
  //   Note (68): note, and Note Separator (69): noteSeparator when note is not empty, both only for
  //     the last code of the list;
  //   Attribute Name, Name Separator, Value, Value Separator (70 to 73): the attribute block, once per
  //     code: for each attribute description in order, attrNameSeparator, the name, attrValueSeparator
  //     and the value, each only when the style lists its type;
  //   any other type: nothing, and an error-log record (line 302).
  // An object without codes writes note alone when the style has no Note Separator; otherwise, when
  // it has a Note and note is not empty, note and noteSeparator in the order of their fields.
  CVynStringT<wchar_t> getCodesAsCodeStyle(const DexCodeStyle* style, const CVynStringT<wchar_t>& note) const;
  // The user's form of the built-in control codes "AS", "AE", "R", "C", "BEG_LINE" and "END_LINE"
  // (exact) by style; any other control code, and every one for a null style, unchanged.
  CVynStringT<wchar_t> getUserControlCode(const DexCodeStyle* style,
                                          const CVynStringT<wchar_t>& controlCode) const;

 private:
  DexOwningList<DexCodeValues> codes_;
};

}  // namespace vyn::ie
