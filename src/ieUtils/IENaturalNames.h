#pragma once

#include <cstddef>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"

namespace vyn::ie::utils {

class FreeNumericNames;

// An unbounded natural number held as its decimal text: digits 0 to 9 only, no leading zeros, zero is
// "0"; the text is never empty. Fresh object names may run past the 32-bit range, so they are counted
// in this form.
class DEX_API StringNatural {
  VYN_CLASS_ALLOCATOR

 public:
  // Construction.
  StringNatural();  // "0"
  explicit StringNatural(unsigned int value);
  // The digits of text without leading zeros; "0" when text is empty, all zeros, or holds any character
  // other than 0 to 9 (a blank or a sign included): "000120" is 120, "12a" and " 7" are 0.
  explicit StringNatural(const CVynStringT<wchar_t>& text);

  // Arithmetic and order.
  StringNatural& operator++();  // in place, with carry: 999 becomes 1000
  // Numeric order: a shorter text is smaller, texts of equal length compare digit by digit.
  bool operator<(const StringNatural& other) const;

  // Access.
  // The value as the runtime's _wtoi reads the text; a value above 2147483647 answers 2147483647
  // (the Windows runtime clamps, and so do we).
  int toInt() const;
  const CVynStringT<wchar_t>& get() const;

 private:
  friend class FreeNumericNames;
  // Rewrites the digits in place, reusing the text's storage.
  void assignDecimal(unsigned long long value);

  CVynStringT<wchar_t> digits_;
};

// Hands out fresh numeric names to imported objects whose names are not plain numbers. The names in
// use are collected with addObject, init() picks the first candidate (above the highest number in use
// when every object to rename fits below 2147483647, otherwise the first gap between used numbers that
// holds them all), and getNameFor hands the candidates out one by one, skipping numbers in use.
//
// The current number has two reserved values: -1 after an addObject not yet followed by init()
// (nothing may be handed out), and 2147483647 when numbers are no longer tracked and only the current
// name counts (after init() with no used numbers, or past the 32-bit range, where names go on as
// decimal text: 2147483647, 2147483648, ...).
//
// When no gap holds every object to rename, names start at 1 if the lowest used number is above 1, and
// at 2147483647 otherwise. In both cases the scan has passed every used number, so none is skipped any
// more: names handed out from 1 then meet numbers in use.
//
// Copying copies every member, so a copy hands out the same names as the original.
class DEX_API FreeNumericNames {
  VYN_CLASS_ALLOCATOR

 public:
  // Error-log lines (source "ieUtils\IEUtils", empty message) of a name or number asked for after
  // addObject and before init().
  static constexpr int kLogLineNameBeforeInit = 901;
  static constexpr int kLogLineNumberBeforeInit = 902;

  // A new object hands out 1, 2, 3, ... and knows no used numbers.
  FreeNumericNames();

  // Collecting. Each call sets the current number to -1 until the next init().
  // A valid numeric name (see getNameFor) is recorded as a used number; any other name counts as one
  // object to rename.
  void addObject(const CVynStringT<wchar_t>& name);
  // A number of 0 or above is recorded as used; a negative number counts as one object to rename.
  void addObject(int number);
  // Sorts the used numbers and picks the first candidate. The used numbers and the count to rename are
  // kept, so init() may follow further addObject calls.
  void init();

  // Handing out.
  // The next name to hand out; an empty text (and an error-log record) when objects were added since
  // the last init().
  CVynStringT<wchar_t> getFirstAvailableName() const;
  // The next number to hand out: 2147483647 when numbers are not tracked (then the name counts: after
  // init() with no used numbers it is "1"); 0 (and an error-log record) when objects were added since
  // the last init().
  int getFirstAvailableNumber() const;
  // A valid numeric name ("0" or a number from 1 to 2147483646 written without leading zeros or
  // blanks) is returned unchanged. Any other name receives getFirstAvailableName(), and the candidate
  // moves on past the numbers in use (it stays put, and the result is empty, before init()).
  CVynStringT<wchar_t> getNameFor(const CVynStringT<wchar_t>& name);
  // The number the last object to rename will receive, counted from the current candidate: 0 before
  // init(); when numbers are not tracked, the count to rename while the current name is below
  // 2147483647, else 2147483647. A result past the 32-bit range answers 2147483647. Exact directly
  // after init(); once names have been handed out, a count that fills a gap up to a used number counts
  // that number as free.
  int getLastObject() const;
  // Names added that are not valid numeric names, plus negative numbers added.
  int getObjectsToRename() const;

 private:
  void advance();
  void walkGaps();
  bool isValidNumeric(const CVynStringT<wchar_t>& name) const;

  StringNatural currentName_;    // the next name to hand out
  int currentNumber_;            // the same candidate as a number, or a reserved value
  std::size_t scanPosition_;     // where the next look for a used number starts; only moves on
  vyn_vector<int> usedNumbers_;  // sorted by init(), duplicates kept
  int objectsToRename_;          // added names that are not numeric, and negative numbers
  StringNatural limitName_;      // 2147483647: the first name not valid as a number
};

}  // namespace vyn::ie::utils
