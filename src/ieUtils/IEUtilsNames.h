#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"

// The rules for point, object and code names and for texts that stand for numbers. Checks answer
// false for a text that breaks a rule; nothing here throws or logs.
namespace vyn::ie::utils {

// Characters a code name may not hold: comma, vertical bar, both braces, TAB, CR and LF.
inline constexpr wchar_t kCodeNameForbiddenCharacters[] = L",|{}\t\r\n";
// The forbidden code-name characters that correctCodeName replaces by "_".
inline constexpr wchar_t kCodeNameReplaceableCharacters[] = L",|{}";
// Characters an object name may not hold (32 of them; the percent sign stands twice).
inline constexpr wchar_t kObjectNameForbiddenCharacters[] = L"!,?%*@#$%^&'\"\\/|~;[]{}()<>`\t\r\n+=";
// Characters a point name may not hold: those of an object name and the blank.
inline constexpr wchar_t kPointNameForbiddenCharacters[] = L"!,?%*@#$%^&'\"\\/|~;[]{}()<>`\t\r\n+= ";

// The longest point or code name, and the longest text that is checked as a number.
inline constexpr int kMaxNameLength = 50;
inline constexpr int kMaxNumberLength = 40;

// Single characters.
DEX_API bool isAdmissibleCodeNameCharacter(wchar_t ch);
DEX_API bool isAdmissibleObjectNameCharacter(wchar_t ch);
DEX_API bool isAdmissiblePointNameCharacter(wchar_t ch);

// Names. isValidName: a point name of 1 to 50 admissible characters. isValidCodeName: a code name of
// 1 to 50 admissible characters. checkName: true for an empty text or one without any forbidden
// code-name character, whatever its length.
DEX_API bool isValidName(const CVynStringT<wchar_t>& name);
DEX_API bool isValidCodeName(const CVynStringT<wchar_t>& name);
DEX_API bool checkName(const CVynStringT<wchar_t>& name);

// Makes a code name of in: comma, vertical bar and braces become "_", TAB becomes a blank, CR and LF
// are dropped. When the result is a valid code name it goes to out and the answer is true; otherwise
// out is left unchanged and the answer is false.
DEX_API bool correctCodeName(const CVynStringT<wchar_t>& in, CVynStringT<wchar_t>& out);

// Numbers, 1 to 40 characters. isValidInteger: digits, with a "-" allowed in the first place only
// ("-" alone passes). isValidDecimalNumber: digits, "." and "," (any number of them), with a "-" or
// "+" allowed in the first place only.
DEX_API bool isValidInteger(const CVynStringT<wchar_t>& text);
DEX_API bool isValidDecimalNumber(const CVynStringT<wchar_t>& text);

}  // namespace vyn::ie::utils
