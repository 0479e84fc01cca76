#include "ieUtils/IEUtilsCoords.h"

#include <cmath>

#include "hostlibs/vynmath.h"
#include "ieUtils/detail/FlagReader.h"

namespace vyn::ie::utils {

namespace {

constexpr wchar_t kDegreeSign = L'\u00B0';
constexpr wchar_t kMinuteMark = L'\'';
constexpr wchar_t kSecondMark = L'"';
constexpr const wchar_t* kNegativeHemispheres = L"SWsw";

// DDD.MMSSsss: two digits of minutes and two of seconds follow the point.
constexpr int kMinuteDigits = 2;
constexpr int kMinutesAndSecondsDigits = 4;
// DDDMMSS.sss reads as DDD.MMSSsss times this.
constexpr double kPointShift = 10000.0;

int defaultPrecision(ECoordsStyle style) {
  switch (style) {
    case ECoordsStyle::DECIMAL_DEGREES:
    case ECoordsStyle::PACKED_DMS:
      return 12;
    case ECoordsStyle::PLAIN_NUMBER:
      return 3;
    case ECoordsStyle::DMS_WHOLE_SECONDS:
      return kMinutesAndSecondsDigits;
    default:
      return 9;
  }
}

// decDeg as the fixed text of its packed DDD.MMSSsss value.
CVynStringT<wchar_t> packedText(double decDeg, int precision) {
  return doubleToString(Deg2DDDMMSS(decDeg, precision, false), precision);
}

// Turns packed DDD.MMSSsss into DDDMMSS.sss and tells where the degrees end. False, with the text
// untouched, when it has no point or fewer than four digits after it (a precision below 4, NaN, an
// infinity): there are no minutes and seconds to move the point behind.
bool movePointBehindSeconds(CVynStringT<wchar_t>& packed, int& degreesEnd) {
  const int point = packed.Find(L'.');
  if (point < 0 || packed.GetLength() - point - 1 < kMinutesAndSecondsDigits) return false;
  packed.Delete(point);
  packed.Insert(point + kMinutesAndSecondsDigits, L'.');
  degreesEnd = point;
  return true;
}

wchar_t hemisphereLetter(ECoordsSign sign, double decDeg) {
  const bool negative = decDeg < 0.0;
  switch (sign) {
    case ECoordsSign::LATITUDE_LETTER:
      return negative ? L'S' : L'N';
    case ECoordsSign::LONGITUDE_LETTER:
      return negative ? L'W' : L'E';
    default:
      return L'\0';
  }
}

CVynStringT<wchar_t> separatedDms(double decDeg, int precision, wchar_t degreeMark, wchar_t minuteMark) {
  CVynStringT<wchar_t> text = packedText(decDeg, precision);
  int degreesEnd = 0;
  if (!movePointBehindSeconds(text, degreesEnd)) return CVynStringT<wchar_t>();
  text.Insert(degreesEnd + kMinuteDigits, minuteMark);
  text.Insert(degreesEnd, degreeMark);
  return text;
}

CVynStringT<wchar_t> dmsWithMarks(double decDeg, int precision, ECoordsSign sign) {
  const double shown = sign == ECoordsSign::SIGNED_NUMBER ? decDeg : std::fabs(decDeg);
  CVynStringT<wchar_t> text = separatedDms(shown, precision, kDegreeSign, kMinuteMark);
  if (text.IsEmpty()) return text;
  text += kSecondMark;
  const wchar_t letter = hemisphereLetter(sign, decDeg);
  if (letter != L'\0') text += letter;
  return text;
}

// ---- Reading the separated forms ----------------------------------------------------------------
// The separated forms are rebuilt into packed DDD.MMSSsss by deleting their separators and padding
// minutes and seconds to two digits. Every edit checks its index: a text whose separators are missing
// or out of order fails instead of being edited at a clamped place.

// Deletes the first ch at or after start and answers its index, or -1 when there is none.
int takeOut(CVynStringT<wchar_t>& text, wchar_t ch, int start = 0) {
  const int index = text.Find(ch, start);
  if (index >= 0) text.Delete(index);
  return index;
}

// Inserts count zeros at index; false when index lies outside the text.
bool insertZeros(CVynStringT<wchar_t>& text, int index, int count) {
  if (index < 0 || index > text.GetLength()) return false;
  text.Insert(index, CVynStringT<wchar_t>(L'0', count).GetString());
  return true;
}

struct DmsFields {
  int degreesEnd = -1;  // where the minutes begin once the separators are out
  int minutesEnd = -1;  // where the seconds begin
};

// DDD MM SS.sss: the first blank ends the degrees, the next one the minutes.
bool takeOutBlanks(CVynStringT<wchar_t>& text, DmsFields& fields) {
  const int degreesEnd = takeOut(text, L' ');
  if (degreesEnd < 0) return false;
  const int minutesEnd = takeOut(text, L' ', degreesEnd);
  if (minutesEnd < 0) return false;
  fields.degreesEnd = degreesEnd;
  fields.minutesEnd = minutesEnd;
  if (minutesEnd < degreesEnd + kMinuteDigits) {
    if (!insertZeros(text, degreesEnd, degreesEnd + kMinuteDigits - minutesEnd)) return false;
    fields.minutesEnd = degreesEnd + kMinuteDigits;
  }
  return true;
}

// D°MM'SS.sss": the degree sign ends the degrees, the apostrophe after it the minutes. Minutes are
// padded by one zero only, as this form has always been read.
bool takeOutMarks(CVynStringT<wchar_t>& text, DmsFields& fields) {
  const int degreesEnd = takeOut(text, kDegreeSign);
  if (degreesEnd < 0) return false;
  int minutesEnd = takeOut(text, kMinuteMark);
  if (minutesEnd < degreesEnd) return false;  // none, or before the degree sign
  if (minutesEnd < degreesEnd + kMinuteDigits) {
    if (!insertZeros(text, degreesEnd, 1)) return false;
    ++minutesEnd;
  }
  fields.degreesEnd = degreesEnd;
  fields.minutesEnd = minutesEnd;
  return true;
}

// Takes out the decimal point of the seconds and pads the seconds to two digits.
bool takeOutSecondsPoint(CVynStringT<wchar_t>& text, const DmsFields& fields) {
  const int point = takeOut(text, L'.');
  if (point < fields.minutesEnd) return false;  // none, or inside the degrees or minutes
  const int secondsEnd = fields.minutesEnd + kMinuteDigits;
  return point >= secondsEnd || insertZeros(text, fields.minutesEnd, secondsEnd - point);
}

// The text rebuilt as DDD.MMSSsss and read: the first S or W anywhere makes it negative.
double readRebuiltPacked(CVynStringT<wchar_t>& text, const DmsFields& fields, bool cutAtSecondMark,
                         bool& ok) {
  double sign = 1.0;
  const int hemisphere = text.FindOneOf(kNegativeHemispheres);
  if (hemisphere >= 0) {
    text.Delete(hemisphere);
    sign = -1.0;
  }
  if (fields.degreesEnd > text.GetLength()) {
    ok = false;
    return 0.0;
  }
  text.Insert(fields.degreesEnd, L'.');
  if (cutAtSecondMark) {
    const int mark = text.Find(kSecondMark);
    if (mark >= 0) text = text.Left(mark);
  }
  double packed = 0.0;
  ok = stringToDouble(text, packed);
  return ok ? DDDMMSS2Deg(packed) * sign : 0.0;
}

using FieldSeparators = bool (*)(CVynStringT<wchar_t>&, DmsFields&);

double readSeparatedDms(const CVynStringT<wchar_t>& text, FieldSeparators takeOutSeparators,
                        bool cutAtSecondMark, bool& ok) {
  CVynStringT<wchar_t> packed(text);
  DmsFields fields;
  if (!takeOutSeparators(packed, fields) || !takeOutSecondsPoint(packed, fields)) {
    ok = false;
    return 0.0;
  }
  return readRebuiltPacked(packed, fields, cutAtSecondMark, ok);
}

}  // namespace

CVynStringT<wchar_t> coordsByStyleToString(ECoordsStyle style, double decDeg, int precision,
                                           ECoordsSign sign) {
  const int decimals = precision == -1 ? defaultPrecision(style) : precision;
  switch (style) {
    case ECoordsStyle::DECIMAL_DEGREES:
      return doubleToString(decDeg, decimals);
    case ECoordsStyle::PACKED_DMS:
      return packedText(decDeg, decimals);
    case ECoordsStyle::DMS_DIGITS: {
      CVynStringT<wchar_t> text = packedText(decDeg, decimals);
      int degreesEnd = 0;
      return movePointBehindSeconds(text, degreesEnd) ? text : CVynStringT<wchar_t>();
    }
    case ECoordsStyle::DMS_BLANK_SEPARATED:
      return separatedDms(decDeg, decimals, L' ', L' ');
    case ECoordsStyle::DMS_WHOLE_SECONDS: {
      CVynStringT<wchar_t> text = packedText(decDeg, kMinutesAndSecondsDigits);
      text.Remove(L'.');
      return text;
    }
    case ECoordsStyle::PLAIN_NUMBER:
      return doubleToString(checkZeroVal(decDeg), decimals);
    case ECoordsStyle::DMS_WITH_MARKS:
      return dmsWithMarks(decDeg, decimals, sign);
    default:
      return CVynStringT<wchar_t>();
  }
}

double stringByStyleToCoords(ECoordsStyle style, const CVynStringT<wchar_t>& text, bool& ok) {
  switch (style) {
    case ECoordsStyle::DMS_BLANK_SEPARATED:
      return readSeparatedDms(text, takeOutBlanks, false, ok);
    case ECoordsStyle::DMS_WITH_MARKS:
      return readSeparatedDms(text, takeOutMarks, true, ok);
    default:
      break;
  }

  double value = 0.0;
  ok = stringToDouble(text, value);
  if (!ok) return 0.0;
  switch (style) {
    case ECoordsStyle::PACKED_DMS:
      return DDDMMSS2Deg(value);
    case ECoordsStyle::DMS_DIGITS:
    case ECoordsStyle::DMS_WHOLE_SECONDS:
      return DDDMMSS2Deg(value / kPointShift);
    default:
      return value;
  }
}

double stringByStyleToCoordsEx(ECoordsStyle style, const CVynStringT<wchar_t>& text, EFlagFltValues& flag) {
  return detail::readWithVerdict(text, flag, [style](const CVynStringT<wchar_t>& field, bool& ok) {
    return stringByStyleToCoords(style, field, ok);
  });
}

}  // namespace vyn::ie::utils
