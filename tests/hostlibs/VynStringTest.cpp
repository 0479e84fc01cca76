#include "hostlibs/VynString.h"

#include <gtest/gtest.h>

#include <climits>
#include <functional>
#include <map>
#include <string>
#include <utility>

#include "support/Cases.h"
#include "support/PrintString.h"

namespace {

using String = CVynStringT<wchar_t>;
using dex_test::Case;

String number(int value) {
  return std::to_wstring(value).c_str();
}

String edited(int count, const String& text) {
  return number(count) + L":" + text;
}

// Field i of a case as a text, as a number and as its first character.
String t(const Case& c, std::size_t i) {
  return c.text(i).c_str();
}
int n(const Case& c, std::size_t i) {
  return c.integer(i);
}
wchar_t ch(const Case& c, std::size_t i) {
  return c.text(i)[0];
}

// The operations of tests/data/cases/vynstring.txt, given the case and the text of its field 1. A name
// ending in "Char" takes a character where the other takes a text; Mid2 and Find2 take two arguments.
using Operation = std::function<String(const Case&, String)>;
const std::map<std::string, Operation> kOperations = {
    {"Mid", [](const Case& c, String s) { return s.Mid(n(c, 2)); }},
    {"Mid2", [](const Case& c, String s) { return s.Mid(n(c, 2), n(c, 3)); }},
    {"Left", [](const Case& c, String s) { return s.Left(n(c, 2)); }},
    {"Right", [](const Case& c, String s) { return s.Right(n(c, 2)); }},
    {"GetAt", [](const Case& c, String s) { return number(s.GetAt(n(c, 2))); }},
    {"SetAt", [](const Case& c, String s) { return s.SetAt(n(c, 2), ch(c, 3)), edited(0, s); }},
    {"Delete", [](const Case& c, String s) { return edited(s.Delete(n(c, 2), n(c, 3)), s); }},
    {"InsertChar", [](const Case& c, String s) { return edited(s.Insert(n(c, 2), ch(c, 3)), s); }},
    {"Insert", [](const Case& c, String s) { return edited(s.Insert(n(c, 2), t(c, 3)), s); }},
    {"FindChar", [](const Case& c, String s) { return number(s.Find(ch(c, 2))); }},
    {"FindChar2", [](const Case& c, String s) { return number(s.Find(ch(c, 2), n(c, 3))); }},
    {"Find", [](const Case& c, String s) { return number(s.Find(t(c, 2))); }},
    {"Find2", [](const Case& c, String s) { return number(s.Find(t(c, 2), n(c, 3))); }},
    {"FindOneOf", [](const Case& c, String s) { return number(s.FindOneOf(t(c, 2))); }},
    {"ReverseFind", [](const Case& c, String s) { return number(s.ReverseFind(ch(c, 2))); }},
    {"Remove", [](const Case& c, String s) { return edited(s.Remove(ch(c, 2)), s); }},
    {"ReplaceChar", [](const Case& c, String s) { return edited(s.Replace(ch(c, 2), ch(c, 3)), s); }},
    {"Replace", [](const Case& c, String s) { return edited(s.Replace(t(c, 2), t(c, 3)), s); }},
    {"TrimRight",
     [](const Case& c, String s) { return c.size() > 3 ? s.TrimRight(t(c, 2)) : s.TrimRight(); }},
    {"TrimLeft", [](const Case&, String s) { return s.TrimLeft(); }},
    {"TrimLeftChar", [](const Case& c, String s) { return s.TrimLeft(ch(c, 2)); }},
    {"Trim", [](const Case& c, String s) { return c.size() > 3 ? s.Trim(t(c, 2)) : s.Trim(); }},
    {"TrimChar", [](const Case& c, String s) { return s.Trim(ch(c, 2)); }},
    {"Compare",
     [](const Case& c, String s) { return number((s.Compare(t(c, 2)) > 0) - (s.Compare(t(c, 2)) < 0)); }},
    {"CompareNoCase",
     [](const Case& c, String s) {
       return number((s.CompareNoCase(t(c, 2)) > 0) - (s.CompareNoCase(t(c, 2)) < 0));
     }},
    {"Less", [](const Case& c, String s) { return number(s < t(c, 2)); }},
    {"MakeUpper", [](const Case&, String s) { return s.MakeUpper(); }},
    {"MakeLower", [](const Case&, String s) { return s.MakeLower(); }},
    {"MakeReverse", [](const Case&, String s) { return s.MakeReverse(); }},
    {"Utf8", [](const Case& c, String) { return String(c.bytes(1).c_str(), vyn_text::CP_UTF8); }},
    {"Ansi", [](const Case& c, String) { return String(c.bytes(1).c_str(), vyn_text::CP_ACP); }},
    {"Windows1252",
     [](const Case& c, String) { return String(c.bytes(1).c_str(), vyn_text::CP_WINDOWS_1252); }}};

TEST(CVynString, OperationsAnswerAsTheCasesGiveAndIndexesOutsideTheTextNeverCrash) {
  dex_test::forEachCase("vynstring.txt", [](const Case& c) {
    EXPECT_EQ(kOperations.at(c[0])(c, t(c, 1)), t(c, c.size() - 1));
  });
  String text(L"abc");
  EXPECT_EQ(L'\0', text[INT_MAX]);
  EXPECT_TRUE(String(static_cast<const wchar_t*>(nullptr)).IsEmpty() && String(L"x", 0).IsEmpty() &&
              String(L'x', -3).IsEmpty() &&
              String(static_cast<const char*>(nullptr), vyn_text::CP_UTF8).IsEmpty());
  EXPECT_EQ(String(L'x', 3), L"xxx");
  EXPECT_EQ(-1, text.Find(static_cast<const wchar_t*>(nullptr)));
  EXPECT_EQ(text.Trim(static_cast<const wchar_t*>(nullptr)), L"abc");
  EXPECT_EQ(0, String().Compare(nullptr));
  EXPECT_TRUE(L"b" > String(L"a") && String(L"a") <= L"a" && String(L"a") >= String(L"a") &&
              L"a" == String(L"a"));
}

TEST(CVynString, SelfReferencingArgumentsAreSafe) {
  String text(L"abc");
  text += text;
  text = text.GetString() + 3;
  text += text.GetString();
  text.Insert(1, text.GetString());
  text.Format(L"<%ls>", text.GetString());
  EXPECT_EQ(text, L"<aabcabcbcabc>");
}

TEST(CVynString, TokenizeSkipsEmptyFieldsAndEndsWithMinusOne) {
  const String text(L",,A,,B;C,");
  int at = 0;
  std::wstring tokens;
  for (String token = text.Tokenize(L",;", at); at != -1; token = text.Tokenize(L",;", at))
    tokens += std::wstring(token.view()) + L"|";
  EXPECT_EQ(tokens, L"A|B|C|");
  EXPECT_EQ(text.Tokenize(L",;", at), L"");
  at = 100;
  EXPECT_EQ(text.Tokenize(L",", at), L"");
  EXPECT_EQ(-1, at);
  const String last(L"A,B");
  at = 0;
  last.Tokenize(L",", at);
  EXPECT_EQ(last.Tokenize(L",", at), L"B");
  EXPECT_EQ(3, at);
}

TEST(CVynString, ConcatenatesFormatsAndWritesUtf8KeepingNonAsciiAndAstralCharacters) {
  const String degrees = String(L"12") + L'\u00B0' + L"30'" + String(L"\U0001F4CD");
  EXPECT_EQ(7, degrees.GetLength());
  EXPECT_EQ(static_cast<wchar_t>(0x1F4CD), degrees[6]);
  EXPECT_EQ(L"a" + String(L"b") + (L'c' + String(L"d")), L"abcd");
  EXPECT_EQ(vyn_text::toUtf8(L"Vy\u0148 \U0001F4CD"), "Vy\xC5\x88 \xF0\x9F\x93\x8D");
  EXPECT_EQ(vyn_text::toUtf8(static_cast<const wchar_t*>(nullptr)), "");
  // Appending keeps what the buffer holds; a lone surrogate becomes U+FFFD, never invalid UTF-8.
  std::string bytes = "kept;";
  const wchar_t loneSurrogate[] = {L'a', static_cast<wchar_t>(0xD800), L'\0'};
  vyn_text::appendUtf8(bytes, loneSurrogate);
  vyn_text::appendUtf8(bytes, L"\u0148");
  EXPECT_EQ(bytes, "kept;a\xEF\xBF\xBD\xC5\x88");

  String text;
  text.Format(L"%ls=%d;%.3f;%5s|", L"P7", 42, 1.23456, "ab");
  text.AppendFormat(L"%c%ls", L'x', L"\u00B0");
  EXPECT_EQ(text, L"P7=42;1.235;   ab|x\u00B0");
  text.Format(L"%s", "Vy\xC5\x88");
  EXPECT_EQ(text, L"Vy\u0148");
  text.Format(L"[%ls]", std::wstring(5000, L'z').c_str());  // longer than any first guess of the buffer
  text.AppendFormat(nullptr);
  EXPECT_EQ(5002, text.GetLength());
  text.Format(nullptr);
  EXPECT_TRUE(text.IsEmpty());
}

TEST(CVynString, BuffersCopiesAndMovesLeaveEveryTextValid) {
  String text(L"ab");
  wchar_t* buffer = text.GetBuffer(10);
  buffer[2] = L'c';
  buffer[3] = L'\0';
  text.ReleaseBuffer();
  EXPECT_EQ(text, L"abc");
  text.GetBuffer(0);
  text.ReleaseBuffer(1);
  text.ReleaseBuffer(50);
  EXPECT_EQ(text, L"a");
  String copy(text);
  copy.SetAt(0, L'O');
  String moved(std::move(copy));
  copy = L"reused";  // NOLINT(bugprone-use-after-move): a moved-from string stays usable
  EXPECT_TRUE(text == L"a" && moved == L"O" && copy == L"reused");
}

// One-character texts share a read-only block; every writer must give the text its own first.
TEST(CVynString, SharedOneCharacterTextsAreNeverWrittenThrough) {
  static_assert(sizeof(String) == sizeof(void*), "a text is one pointer wide");
  const String a(L"A");
  String b(L"A");
  EXPECT_EQ(a.GetString(), b.GetString());
  b.SetAt(0, L'x');
  String c(L"A");
  c.MakeLower();
  c += L"bc";
  String d(L"A");
  d.GetBuffer(3)[1] = L'z';
  d.ReleaseBuffer(2);
  String e(L"A");
  e.Delete(0);
  e.Replace(L'A', L'B');
  String f(L"A");
  f.Replace(L'A', L'B');
  f.TrimRight(L'B');
  String g(L"A");
  g.MakeReverse();
  g.ReleaseBuffer(0);
  String h(L"long enough text");  // a block large enough is reused, also for a text inside it
  h = h.GetString() + 5;
  EXPECT_TRUE(a == L"A" && b == L"x" && c == L"abc" && d == L"Az" && e.IsEmpty() && f.IsEmpty() &&
              g.IsEmpty());
  EXPECT_TRUE(String(L"A") == L"A" && h == L"enough text");
  h = L"é";
  h.Empty();
  EXPECT_STREQ(h.GetString(), L"");
}

}  // namespace
