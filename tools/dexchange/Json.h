#pragma once

#include <string>
#include <vector>

// A JSON text written member by member: objects and arrays one element a line, indented by two
// blanks; arrays of texts on one line. Numbers are written independently of the locale.
namespace dexchange_tool {

// text as a JSON string (quoted, escaped; UTF-8 passes through).
std::string jsonString(const std::string& text);

class JsonWriter {
 public:
  JsonWriter& beginObject();
  JsonWriter& endObject();
  JsonWriter& beginArray();
  JsonWriter& endArray();
  // The name of the next member of the open object.
  JsonWriter& key(const std::string& name);

  JsonWriter& value(const std::string& text);
  JsonWriter& value(const char* text) { return value(std::string(text)); }
  JsonWriter& value(int number);
  JsonWriter& value(double number);
  JsonWriter& value(bool flag);
  JsonWriter& null();
  JsonWriter& texts(const std::vector<std::string>& items);

  // The text written so far, with a line end once everything is closed.
  std::string text() const { return depth_.empty() ? text_ + "\n" : text_; }

 private:
  // Starts an element: the comma and line break after the previous one, unless a key went before.
  void element();
  JsonWriter& open(char bracket);
  JsonWriter& close(char bracket);

  std::string text_;
  std::vector<bool> depth_;  // per open container: whether it holds an element yet
  bool afterKey_ = false;
};

}  // namespace dexchange_tool
