#include "Json.h"

#include <charconv>
#include <cmath>

namespace dexchange_tool {

std::string jsonString(const std::string& text) {
  std::string quoted = "\"";
  for (const char ch : text) {
    const auto byte = static_cast<unsigned char>(ch);
    if (ch == '"' || ch == '\\') {
      quoted += '\\';
      quoted += ch;
    } else if (byte < 0x20) {
      static constexpr char kHex[] = "0123456789abcdef";
      quoted += "\\u00";
      quoted += kHex[byte >> 4];
      quoted += kHex[byte & 0xF];
    } else {
      quoted += ch;
    }
  }
  return quoted + '"';
}

void JsonWriter::element() {
  if (afterKey_) {
    afterKey_ = false;
    return;
  }
  if (depth_.empty()) return;
  text_ += depth_.back() ? ",\n" : "\n";
  depth_.back() = true;
  text_.append(depth_.size() * 2, ' ');
}

JsonWriter& JsonWriter::open(char bracket) {
  element();
  text_ += bracket;
  depth_.push_back(false);
  return *this;
}

JsonWriter& JsonWriter::close(char bracket) {
  const bool any = depth_.back();
  depth_.pop_back();
  if (any) {
    text_ += '\n';
    text_.append(depth_.size() * 2, ' ');
  }
  text_ += bracket;
  return *this;
}

JsonWriter& JsonWriter::beginObject() {
  return open('{');
}
JsonWriter& JsonWriter::endObject() {
  return close('}');
}
JsonWriter& JsonWriter::beginArray() {
  return open('[');
}
JsonWriter& JsonWriter::endArray() {
  return close(']');
}

JsonWriter& JsonWriter::key(const std::string& name) {
  element();
  text_ += jsonString(name) + ": ";
  afterKey_ = true;
  return *this;
}

JsonWriter& JsonWriter::value(const std::string& text) {
  element();
  text_ += jsonString(text);
  return *this;
}

JsonWriter& JsonWriter::value(int number) {
  element();
  text_ += std::to_string(number);
  return *this;
}

JsonWriter& JsonWriter::value(double number) {
  if (!std::isfinite(number)) return null();
  element();
  char digits[32];
  text_.append(digits, std::to_chars(digits, digits + sizeof digits, number).ptr);
  return *this;
}

JsonWriter& JsonWriter::value(bool flag) {
  element();
  text_ += flag ? "true" : "false";
  return *this;
}

JsonWriter& JsonWriter::null() {
  element();
  text_ += "null";
  return *this;
}

JsonWriter& JsonWriter::texts(const std::vector<std::string>& items) {
  element();
  text_ += '[';
  for (std::size_t i = 0; i < items.size(); ++i)
    text_ += (i == 0 ? "" : ", ") + jsonString(items[i]);
  text_ += ']';
  return *this;
}

}  // namespace dexchange_tool
