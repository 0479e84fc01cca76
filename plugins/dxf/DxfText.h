#pragma once

#include <string>
#include <string_view>

// The texts of DXF groups: their bytes, their escapes and their formatting, in both directions.
//
// Drawings from AutoCAD 2007 on are UTF-8; older ones are in their code page ($DWGCODEPAGE), here
// Windows-1252 unless the bytes are valid UTF-8. Any character may also be written as "\U+XXXX"
// (a UTF-16 unit in hexadecimal, pairs joining), which is how the exporter writes every character
// beyond ASCII, so that its files read the same under any code page.
namespace vyn::ie::dxf {

// Turns group values into wide texts. Keeps its buffers from one call to the next.
class DxfTextDecoder {
 public:
  // Whether the drawing's bytes are UTF-8 (AutoCAD 2007 and later).
  void setUtf8(bool utf8) noexcept { utf8_ = utf8; }

  // A name or a plain value: the bytes decoded, "\U+XXXX" escapes resolved.
  const std::wstring& plain(std::string_view bytes);
  // The value of TEXT or ATTRIB: as plain, and the control codes "%%d" (degree), "%%p" (plus-minus),
  // "%%c" (diameter), "%%%" and "%%nnn" (a character by number) resolved, the toggles "%%u", "%%o"
  // and "%%k" removed.
  const std::wstring& text(std::string_view bytes);
  // The text of MTEXT: as plain, with "\P" a line end ("\n"), "\~" a blank, "\\", "\{" and "\}" the
  // characters, and the formatting ("{...}", "\f...;", "\H...;", "\L", ...) removed; "\S...;" keeps
  // its stacked text.
  const std::wstring& mtext(std::string_view bytes);

 private:
  void decodeBytes(std::string_view bytes);
  void resolveEscapes();

  bool utf8_ = false;
  std::string bytes_;
  std::wstring decoded_;
  std::wstring result_;
};

// Appends text as the bytes of a group value: ASCII as it is, every other character as "\U+XXXX",
// control characters (line ends among them) as blanks.
void appendEncoded(std::string& out, std::wstring_view text);
// text for the value of TEXT or ATTRIB: each "%%" written so that it reads back as itself, not as a
// control code.
std::wstring withControlCodesEscaped(std::wstring_view text);
// Appends text as the value of MTEXT: as appendEncoded, with "\n" written as "\P" and "\", "{" and "}"
// escaped.
void appendMTextEncoded(std::string& out, std::wstring_view text);

}  // namespace vyn::ie::dxf
