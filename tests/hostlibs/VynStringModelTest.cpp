#include "hostlibs/VynString.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <string>
#include <utility>
#include <vector>

namespace {

using String = CVynStringT<wchar_t>;

// Random edits applied to a string and to a std::wstring model side by side: the representation
// (shared one-character blocks, reused and grown blocks, texts taken from inside the block) must never
// show through.
TEST(CVynStringModel, RandomEditsMatchAPlainWideString) {
  std::mt19937 random(20261206);
  const std::vector<std::wstring> pieces = {L"", L"a", L"B", L" ", L"xy", L"é", L"long piece of text", L"aa"};
  const auto piece = [&] { return pieces[random() % pieces.size()]; };
  String text;
  std::wstring model;
  std::vector<std::pair<String, std::wstring>> copies;  // taken along the way, checked at the end
  for (int step = 0; step < 20000; ++step) {
    const int index = static_cast<int>(random() % (model.size() + 2)) - 1;
    switch (random() % 12) {
      case 0:
        model = piece();
        if (random() % 2 == 0) {
          text = model.c_str();  // into the block the text holds
        } else {
          text = String(model.c_str());  // a fresh block, or a shared one
        }
        break;
      case 1: {
        const std::wstring added = piece();
        model += added;
        text += added.c_str();
        break;
      }
      case 2:
        if (model.size() < 1000) {
          model += model;
          text += text;
        }
        break;
      case 3:
        if (index >= 0 && static_cast<std::size_t>(index) < model.size()) {
          model = model.substr(static_cast<std::size_t>(index));
          text = text.GetString() + index;
        }
        break;
      case 4:
        if (index >= 0 && static_cast<std::size_t>(index) < model.size()) {
          model.erase(static_cast<std::size_t>(index), 2);
          text.Delete(index, 2);
        }
        break;
      case 5:
        model.erase(std::remove(model.begin(), model.end(), L'a'), model.end());
        text.Remove(L'a');
        break;
      case 6:
        std::replace(model.begin(), model.end(), L'x', L'a');
        text.Replace(L'x', L'a');
        break;
      case 7: {
        const std::size_t first = model.find_first_not_of(L" a");
        model = first == std::wstring::npos ? L"" : model.substr(first);
        text.TrimLeft(L" a");
        break;
      }
      case 8:
        if (index >= 0 && static_cast<std::size_t>(index) < model.size()) {
          model[static_cast<std::size_t>(index)] = L'Z';
          text.SetAt(index, L'Z');
        }
        break;
      case 9: {
        const int length = static_cast<int>(model.size());
        wchar_t* buffer = text.GetBuffer(length + 3);
        buffer[length] = L'!';
        model += L'!';
        text.ReleaseBuffer(length + 1);
        break;
      }
      case 10:
        copies.emplace_back(text, model);
        text = String(text);  // a block of the exact size, or a shared one
        break;
      default:
        model.clear();
        text.Empty();
        break;
    }
    ASSERT_EQ(std::wstring(text.view()), model) << "step " << step;
    ASSERT_EQ(text.GetLength(), static_cast<int>(model.size()));
    ASSERT_EQ(text.GetString()[model.size()], L'\0');
  }
  for (const auto& [copy, expected] : copies)
    ASSERT_EQ(std::wstring(copy.view()), expected);
}

}  // namespace
