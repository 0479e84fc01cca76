// The texts the library writes and the numbers it reads do not depend on the process locale. One set
// of texts, written by the number writers and read back by the number readers, is compared byte for
// byte with a golden file: under the locale the run uses (the C locale in `make test`, a comma-decimal
// one in `make locale-test`) and again with a comma-decimal locale switched on inside the test.

#include <gtest/gtest.h>

#include <fstream>
#include <limits>
#include <string>

#include "hostlibs/VynFormats.h"
#include "hostlibs/XmlParser.h"
#include "ieUtils/IEUtilsCoords.h"
#include "ieUtils/IEUtilsUnits.h"
#include "support/CommaLocale.h"
#include "support/TempDir.h"

namespace {

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;
using vyn::ie::ECoordsSign;
using vyn::ie::ECoordsStyle;
using vyn::ie::EDistUnits;

constexpr const char* kGoldenFile = "locale/written_and_read_numbers.txt";

class Texts {
 public:
  void add(const wchar_t* label, const String& text) {
    texts_ += label;
    texts_ += L" = ";
    texts_ += text.view();
    texts_ += L'\n';
  }
  // A number read back, written in the exact scientific form, with the reader's verdict.
  void addRead(const wchar_t* label, bool ok, double value) {
    String exact;
    if (!utils::doubleToStringWithExp(value, exact)) exact = L"(not finite)";
    add(label, String(ok ? L"ok " : L"fails ") + exact);
  }
  std::string utf8() const { return dex_test::narrow(texts_); }

 private:
  std::wstring texts_;
};

void writeNumbers(Texts& texts) {
  texts.add(L"DoubleToString(0.1)", vyn_formats::DoubleToString(0.1));
  texts.add(L"DoubleToString(1234567.891)", vyn_formats::DoubleToString(1234567.891));
  texts.add(L"DoubleToString(1e21)", vyn_formats::DoubleToString(1e21));
  texts.add(L"DoubleToString(1e-7)", vyn_formats::DoubleToString(1e-7));
  texts.add(L"DoubleToString(no value)", vyn_formats::DoubleToString(vyn::ie::kNoValue));
  texts.add(L"DoubleToString(-inf)", vyn_formats::DoubleToString(-std::numeric_limits<double>::infinity()));
  texts.add(L"DoubleToString(12.5, 3)", vyn_formats::DoubleToString(12.5, 3));
  texts.add(L"DoubleToString(2.675, 2)", vyn_formats::DoubleToString(2.675, 2));
  texts.add(L"DoubleToString(-0.0001, 3)", vyn_formats::DoubleToString(-0.0001, 3));
  texts.add(L"DoubleToString(1234567.891, 1)", vyn_formats::DoubleToString(1234567.891, 1));
  texts.add(L"IntToString(-1234567)", vyn_formats::IntToString(-1234567));
  texts.add(L"UIntToString(4000000000)", vyn_formats::UIntToString(4000000000u));
  texts.add(L"doubleToString(123.456, 4)", utils::doubleToString(123.456, 4));
  texts.add(L"doubleToString(-0.05, -1)", utils::doubleToString(-0.05, -1));
  String exponent;
  utils::doubleToStringWithExp(-0.05, exponent);
  texts.add(L"doubleToStringWithExp(-0.05)", exponent);
  utils::doubleToStringWithExp(vyn::ie::kNoValue, exponent);
  texts.add(L"doubleToStringWithExp(no value)", exponent);
  texts.add(L"distByStyleToString(USFEET, 100, 3)", utils::distByStyleToString(EDistUnits::USFEET, 100.0, 3));
  texts.add(L"distByStyleToString(USFEETINCHES, 1.6764, 4)",
            utils::distByStyleToString(EDistUnits::USFEETINCHES, 1.6764, 4));
  texts.add(L"angleByStyleToString(GRADS_GONS, 90, 4)",
            utils::angleByStyleToString(vyn::ie::GRADS_GONS, 90.0, 4));
  texts.add(L"angleByStyleToString(DDDMMSSS, 12.5042, 6)",
            utils::angleByStyleToString(vyn::ie::DDDMMSSS, 12.5042, 6));
}

void writeCoordinates(Texts& texts) {
  for (int style = 0; style <= 6; ++style) {
    const auto coordsStyle = static_cast<ECoordsStyle>(style);
    texts.add((L"coordsByStyleToString(" + std::to_wstring(style) + L", 12.5, -1, N)").c_str(),
              utils::coordsByStyleToString(coordsStyle, 12.5, -1, ECoordsSign::LATITUDE_LETTER));
    texts.add((L"coordsByStyleToString(" + std::to_wstring(style) + L", -45.2541, 6, W)").c_str(),
              utils::coordsByStyleToString(coordsStyle, -45.2541, 6, ECoordsSign::LONGITUDE_LETTER));
  }
}

void writeFormattedTexts(Texts& texts) {
  String formatted;
  formatted.Format(L"%.3f|%g|%e|%10.2f|%d|%ls", 1234.5678, 0.0001, 12345.678, -3.14159, 1234567, L"12.5");
  texts.add(L"Format(%.3f|%g|%e|%10.2f|%d|%ls)", formatted);
  texts.add(L"FormAttrib(x, 1000.500)", CXmlParserBase::FormAttrib(L"x", utils::doubleToString(1000.5, 3)));
}

void readNumbers(Texts& texts) {
  double value = 0.0;
  bool ok = utils::stringToDouble(String(L"12.5"), value);
  texts.addRead(L"stringToDouble(12.5)", ok, value);
  value = 0.0;
  ok = utils::stringToDouble(String(L" -1.5e3 \t"), value);
  texts.addRead(L"stringToDouble( -1.5e3 )", ok, value);
  value = 0.0;
  ok = utils::stringToDouble(String(L"12,5"), value);
  texts.addRead(L"stringToDouble(12,5)", ok, value);
  texts.addRead(L"stringByStyleToDist(IFEET, 100.5)", true,
                utils::stringByStyleToDist(EDistUnits::IFEET, String(L"100.5")));
  texts.addRead(L"stringByStyleToDist(IFEET, 100,5)", true,
                utils::stringByStyleToDist(EDistUnits::IFEET, String(L"100,5")));
  texts.addRead(L"stringByStyleToAngle(GRADS_GONS, 100.25)", true,
                utils::stringByStyleToAngle(vyn::ie::GRADS_GONS, String(L"100.25")));
  value = utils::stringByStyleToCoords(ECoordsStyle::DMS_WITH_MARKS, String(L"12\u00B030'15.5\"S"), ok);
  texts.addRead(L"stringByStyleToCoords(DMS_WITH_MARKS, 12°30'15.5\"S)", ok, value);
  value = utils::stringByStyleToCoords(ECoordsStyle::DMS_BLANK_SEPARATED, String(L"12 30 15,5"), ok);
  texts.addRead(L"stringByStyleToCoords(DMS_BLANK_SEPARATED, 12 30 15,5)", ok, value);
  value = 0.0;
  ok = vyn_formats::StringToDegree(L"12\u00B030'15.5\"", value);
  texts.addRead(L"StringToDegree(12°30'15.5\")", ok, value);
  texts.addRead(L"round_prec(2.675, 2)", true, vyn::math::round_prec(2.675, 2));
}

std::string writtenAndReadNumbers() {
  Texts texts;
  writeNumbers(texts);
  writeCoordinates(texts);
  writeFormattedTexts(texts);
  readNumbers(texts);
  return texts.utf8();
}

// Compares with the golden file; on a difference the texts written are left in the working folder
// (build/tests) for a look with diff.
void expectGoldenTexts(const std::string& actual, const char* underLocale) {
  const std::string golden = dex_test::readFile(dex_test::dataFile(kGoldenFile));
  ASSERT_FALSE(golden.empty()) << "missing " << dex_test::dataFile(kGoldenFile);
  if (actual == golden) return;
  const std::string kept = std::string("written_and_read_numbers.") + underLocale + ".txt";
  std::ofstream(kept, std::ios::binary) << actual;
  ADD_FAILURE() << "the numbers written and read under " << underLocale << " differ from "
                << dex_test::dataFile(kGoldenFile) << "; see " << kept;
}

TEST(LocaleIndependence, NumbersWrittenAndReadMatchTheGoldenTextsUnderTheRunsLocale) {
  expectGoldenTexts(writtenAndReadNumbers(), "the-runs-locale");
}

TEST(LocaleIndependence, NumbersWrittenAndReadMatchTheGoldenTextsUnderACommaLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  expectGoldenTexts(writtenAndReadNumbers(), "a-comma-locale");
}

}  // namespace
