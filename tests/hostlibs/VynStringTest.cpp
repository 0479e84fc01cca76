#include "hostlibs/VynString.h"

#include <gtest/gtest.h>

#include <climits>
#include <string>

using String = CVynStringT<wchar_t>;

TEST(CVynString, EmptyAndNullTextsAreTheSameEmptyString) {
  const String empty;
  const String fromNull(static_cast<const wchar_t*>(nullptr));
  EXPECT_TRUE(empty.IsEmpty());
  EXPECT_TRUE(fromNull.IsEmpty());
  EXPECT_EQ(0, fromNull.GetLength());
  EXPECT_STREQ(L"", static_cast<const wchar_t*>(fromNull));
  EXPECT_EQ(empty, fromNull);
  EXPECT_EQ(String(L"x", 0), empty);
  EXPECT_EQ(String(L'x', -3), empty);
  EXPECT_EQ(String(L'x', 3), L"xxx");
}

TEST(CVynString, IndexesOutsideTheTextNeverCrash) {
  String text(L"abc");
  EXPECT_EQ(L'\0', text.GetAt(-1));
  EXPECT_EQ(L'\0', text.GetAt(3));
  EXPECT_EQ(L'\0', text[INT_MAX]);
  text.SetAt(3, L'x');
  text.SetAt(-1, L'x');
  EXPECT_EQ(text, L"abc");
  text.SetAt(1, L'B');
  EXPECT_EQ(text, L"aBc");

  EXPECT_EQ(text.Mid(5), L"");
  EXPECT_EQ(text.Mid(-2, 2), L"aB");
  EXPECT_EQ(text.Mid(1, 100), L"Bc");
  EXPECT_EQ(text.Mid(1, -1), L"");
  EXPECT_EQ(text.Left(-1), L"");
  EXPECT_EQ(text.Left(10), L"aBc");
  EXPECT_EQ(text.Right(2), L"Bc");
  EXPECT_EQ(text.Right(10), L"aBc");
  EXPECT_EQ(text.Right(-1), L"");

  EXPECT_EQ(3, text.Delete(5, 2));
  EXPECT_EQ(3, text.Delete(-1, 2));
  EXPECT_EQ(2, text.Delete(2, 100));
  EXPECT_EQ(text, L"aB");
  EXPECT_EQ(3, text.Insert(100, L'!'));
  EXPECT_EQ(4, text.Insert(-5, L'^'));
  EXPECT_EQ(text, L"^aB!");
}

TEST(CVynString, FindAnswersIndexOrMinusOne) {
  const String text(L"P10,P11;P12");
  EXPECT_EQ(3, text.Find(L','));
  EXPECT_EQ(-1, text.Find(L',', 4));
  EXPECT_EQ(-1, text.Find(L'P', 11));
  EXPECT_EQ(-1, text.Find(L'P', -1));
  EXPECT_EQ(4, text.Find(L"P11"));
  EXPECT_EQ(8, text.Find(L"P1", 5));
  EXPECT_EQ(-1, text.Find(L"P13"));
  EXPECT_EQ(-1, text.Find(static_cast<const wchar_t*>(nullptr)));
  EXPECT_EQ(11, text.Find(L"", 11));
  EXPECT_EQ(3, text.FindOneOf(L";,"));
  EXPECT_EQ(-1, text.FindOneOf(L""));
  EXPECT_EQ(8, text.ReverseFind(L'P'));
  EXPECT_EQ(-1, text.ReverseFind(L'x'));
}

TEST(CVynString, EditingOperationsCountTheirChanges) {
  String text(L"a,b,,c");
  EXPECT_EQ(3, text.Remove(L','));
  EXPECT_EQ(text, L"abc");

  text = L"one two one";
  EXPECT_EQ(2, text.Replace(L"one", L"three"));
  EXPECT_EQ(text, L"three two three");
  EXPECT_EQ(0, text.Replace(L"", L"x"));
  EXPECT_EQ(2, text.Replace(L"three", L""));
  EXPECT_EQ(text, L" two ");
  EXPECT_EQ(2, text.Replace(L' ', L'_'));
  EXPECT_EQ(text, L"_two_");

  // Replacing with a text that contains the searched one must not loop.
  text = L"aa";
  EXPECT_EQ(2, text.Replace(L"a", L"aa"));
  EXPECT_EQ(text, L"aaaa");

  text = L"12";
  text.Insert(1, L"--");
  EXPECT_EQ(text, L"1--2");
}

TEST(CVynString, SelfReferencingArgumentsAreSafe) {
  String text(L"abc");
  text += text;
  EXPECT_EQ(text, L"abcabc");
  text = text.GetString() + 3;
  EXPECT_EQ(text, L"abc");
  text += text.GetString();
  EXPECT_EQ(text, L"abcabc");
  text.Insert(1, text.GetString());
  EXPECT_EQ(text, L"aabcabcbcabc");
  text.Format(L"<%ls>", text.GetString());
  EXPECT_EQ(text, L"<aabcabcbcabc>");
}

TEST(CVynString, TrimsWhiteSpaceOrGivenCharacters) {
  String text(L" \t value \r\n");
  EXPECT_EQ(text.TrimRight(), L" \t value");
  EXPECT_EQ(text.TrimLeft(), L"value");
  text = L"\"quoted\"";
  EXPECT_EQ(String(text).Trim(L'"'), L"quoted");
  EXPECT_EQ(String(text).TrimLeft(L'"'), L"quoted\"");
  EXPECT_EQ(String(L"xy-value-yx").Trim(L"xy"), L"-value-");
  EXPECT_EQ(String(L"  ").Trim(), L"");
  EXPECT_EQ(String(L"abc").TrimRight(L""), L"abc");
  EXPECT_EQ(String(L"abc").Trim(static_cast<const wchar_t*>(nullptr)), L"abc");
}

TEST(CVynString, TokenizeSkipsEmptyFieldsAndEndsWithMinusOne) {
  const String text(L",,A,,B;C,");
  int position = 0;
  EXPECT_EQ(text.Tokenize(L",;", position), L"A");
  EXPECT_EQ(text.Tokenize(L",;", position), L"B");
  EXPECT_EQ(text.Tokenize(L",;", position), L"C");
  EXPECT_EQ(text.Tokenize(L",;", position), L"");
  EXPECT_EQ(-1, position);
  EXPECT_EQ(text.Tokenize(L",;", position), L"");
  EXPECT_EQ(-1, position);

  position = 100;
  EXPECT_EQ(text.Tokenize(L",", position), L"");
  EXPECT_EQ(-1, position);

  const String last(L"A,B");
  position = 0;
  last.Tokenize(L",", position);
  EXPECT_EQ(last.Tokenize(L",", position), L"B");
  EXPECT_EQ(3, position);
  EXPECT_EQ(last.Tokenize(L",", position), L"");
  EXPECT_EQ(-1, position);
}

TEST(CVynString, ComparisonsAreExactAndCaseFoldingCoversNonAscii) {
  const String lower(L"straße ärger");
  const String upper(L"STRAßE ÄRGER");
  EXPECT_NE(lower, upper);
  EXPECT_NE(0, lower.Compare(upper));
  EXPECT_EQ(0, lower.CompareNoCase(upper));
  EXPECT_EQ(String(lower).MakeUpper(), upper);
  EXPECT_EQ(String(upper).MakeLower(), lower);
  EXPECT_LT(String(L"P1"), String(L"P2"));
  EXPECT_LT(String(L"P1"), L"P10");
  EXPECT_GT(L"b", String(L"a"));
  EXPECT_LE(String(L"a"), L"a");
  EXPECT_GE(String(L"a"), String(L"a"));
  EXPECT_TRUE(L"a" == String(L"a"));
  EXPECT_LT(String(L"a").Compare(L"b"), 0);
  EXPECT_GT(String(L"b").CompareNoCase(L"A"), 0);
  EXPECT_LT(String(L"ab").CompareNoCase(L"ABC"), 0);
  EXPECT_EQ(0, String().Compare(nullptr));
}

TEST(CVynString, ConcatenationKeepsNonAsciiAndAstralCharacters) {
  const String degrees = String(L"12") + L'\u00B0' + L"30'" + String(L"\U0001F4CD");
  EXPECT_EQ(7, degrees.GetLength());
  EXPECT_EQ(L'\u00B0', degrees[2]);
  EXPECT_EQ(static_cast<wchar_t>(0x1F4CD), degrees[6]);
  EXPECT_EQ(String(L"a") + String(L"b"), L"ab");
  EXPECT_EQ(L"a" + String(L"b"), L"ab");
  EXPECT_EQ(L'a' + String(L"b"), L"ab");
  EXPECT_EQ(String(L"abc").MakeReverse(), L"cba");
}

TEST(CVynString, NarrowTextIsDecodedByCodePage) {
  EXPECT_EQ(String("Vy\xC5\x88", vyn_text::CP_UTF8), L"Vy\u0148");
  EXPECT_EQ(String("Vy\xC5\x88", vyn_text::CP_ACP), L"Vy\u0148");
  EXPECT_EQ(String("\x80 \xE9", vyn_text::CP_WINDOWS_1252), L"\u20AC \u00E9");
  // Invalid UTF-8 bytes keep their Latin-1 meaning instead of being dropped.
  EXPECT_EQ(String("caf\xE9", vyn_text::CP_UTF8), L"caf\u00E9");
  EXPECT_EQ(String("\xC0\xAF", vyn_text::CP_UTF8), L"\u00C0\u00AF");
  EXPECT_EQ(String("\xED\xA0\x80", vyn_text::CP_UTF8), L"\u00ED\u00A0\u0080");
  EXPECT_EQ(String("\xF0\x9F\x93\x8D", vyn_text::CP_UTF8), String(L"\U0001F4CD"));
  EXPECT_TRUE(String(static_cast<const char*>(nullptr), vyn_text::CP_UTF8).IsEmpty());
  EXPECT_EQ(vyn_text::toUtf8(L"Vy\u0148 \U0001F4CD"), "Vy\xC5\x88 \xF0\x9F\x93\x8D");
  EXPECT_EQ(vyn_text::toUtf8(static_cast<const wchar_t*>(nullptr)), "");
  // Appending keeps what the buffer holds; a lone surrogate becomes U+FFFD, never invalid UTF-8.
  std::string bytes = "kept;";
  const wchar_t loneSurrogate[] = {L'a', static_cast<wchar_t>(0xD800), L'\0'};
  vyn_text::appendUtf8(bytes, loneSurrogate);
  vyn_text::appendUtf8(bytes, L"\u0148");
  EXPECT_EQ(bytes, "kept;a\xEF\xBF\xBD\xC5\x88");
}

TEST(CVynString, FormatRendersPrintfStyleText) {
  String text;
  text.Format(L"%ls=%d;%.3f;%5s|", L"P7", 42, 1.23456, "ab");
  EXPECT_EQ(text, L"P7=42;1.235;   ab|");
  text.AppendFormat(L"%c%ls", L'x', L"\u00B0");
  EXPECT_EQ(text, L"P7=42;1.235;   ab|x\u00B0");
  text.Format(L"%s", "Vy\xC5\x88");
  EXPECT_EQ(text, L"Vy\u0148");

  // Longer than any first guess of the buffer.
  const std::wstring longText(5000, L'z');
  text.Format(L"[%ls]", longText.c_str());
  EXPECT_EQ(5002, text.GetLength());

  text = L"kept";
  text.Format(nullptr);
  EXPECT_TRUE(text.IsEmpty());
  text = L"kept";
  text.AppendFormat(nullptr);
  EXPECT_EQ(text, L"kept");
}

TEST(CVynString, GetBufferLetsCStyleWritersFillTheText) {
  String text(L"ab");
  wchar_t* buffer = text.GetBuffer(10);
  buffer[2] = L'c';
  buffer[3] = L'\0';
  text.ReleaseBuffer();
  EXPECT_EQ(text, L"abc");
  text.GetBuffer(0);
  text.ReleaseBuffer(1);
  EXPECT_EQ(text, L"a");
  text.ReleaseBuffer(50);
  EXPECT_EQ(text, L"a");
}

TEST(CVynString, CopiesAreIndependentAndMovesLeaveAValidSource) {
  String original(L"original");
  String copy(original);
  copy.SetAt(0, L'O');
  EXPECT_EQ(original, L"original");
  String moved(std::move(copy));
  EXPECT_EQ(moved, L"Original");
  copy = L"reused";  // NOLINT(bugprone-use-after-move): a moved-from string stays usable
  EXPECT_EQ(copy, L"reused");
  original = L'c';
  EXPECT_EQ(original, L"c");
  String* heap = new String(L"heap");
  EXPECT_NE(nullptr, heap);
  delete heap;
}

// One-character texts share a read-only block; every writer must give the text its own first.
TEST(CVynString, SharedOneCharacterTextsAreNeverWrittenThrough) {
  static_assert(sizeof(String) == sizeof(void*), "a text is one pointer wide");
  const String a(L"A");
  String b(L"A");
  EXPECT_EQ(a.GetString(), b.GetString());
  b.SetAt(0, L'x');
  EXPECT_EQ(a, L"A");
  EXPECT_EQ(b, L"x");

  String c(L"A");
  c.MakeLower();
  c += L"bc";
  EXPECT_EQ(c, L"abc");
  String d(L"A");
  d.GetBuffer(3)[1] = L'z';
  d.ReleaseBuffer(2);
  EXPECT_EQ(d, L"Az");
  String e(L"A");
  e.Delete(0);
  e.Replace(L'A', L'B');
  String f(L"A");
  f.Replace(L'A', L'B');
  f.TrimRight(L'B');
  String g(L"A");
  g.MakeReverse();
  g.ReleaseBuffer(0);
  EXPECT_TRUE(e.IsEmpty());
  EXPECT_TRUE(f.IsEmpty());
  EXPECT_TRUE(g.IsEmpty());
  EXPECT_EQ(a, L"A");
  EXPECT_EQ(String(L"A"), L"A");

  // A block large enough is reused, also for a text that lies inside it.
  String h(L"long enough text");
  h = h.GetString() + 5;
  EXPECT_EQ(h, L"enough text");
  h = L"é";
  h.Empty();
  EXPECT_EQ(h.GetLength(), 0);
  EXPECT_STREQ(h.GetString(), L"");
}
