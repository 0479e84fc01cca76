#include "DxfStyles.h"

#include <algorithm>
#include <unordered_map>

namespace vyn::ie::dxf {

namespace {

constexpr unsigned long kByteMask = 0xFFu;

// The lowest palette index from 1 of each colour of the palette.
const std::unordered_map<unsigned long, int>& exactIndexes() {
  static const std::unordered_map<unsigned long, int> kIndexes = [] {
    const DexAutoCadUtils cad;
    std::unordered_map<unsigned long, int> indexes;
    for (int index = DexAutoCadUtils::kPaletteSize - 1; index >= 1; --index)
      indexes[cad.convert256ToRgb(index)] = index;
    return indexes;
  }();
  return kIndexes;
}

}  // namespace

unsigned long DxfStyles::colorOfTrueColor(long long trueColor) {
  const auto value = static_cast<unsigned long>(trueColor);
  const unsigned long red = (value >> 16) & kByteMask;
  const unsigned long green = (value >> 8) & kByteMask;
  const unsigned long blue = value & kByteMask;
  return red | (green << 8) | (blue << 16);
}

long long DxfStyles::trueColorOf(unsigned long color) {
  const unsigned long red = color & kByteMask;
  const unsigned long green = (color >> 8) & kByteMask;
  const unsigned long blue = (color >> 16) & kByteMask;
  return static_cast<long long>((red << 16) | (green << 8) | blue);
}

int DxfStyles::indexOf(unsigned long color, bool& exact) const {
  color &= 0xFFFFFFu;
  if (const auto found = exactIndexes().find(color); found != exactIndexes().end()) {
    exact = true;
    return found->second;
  }
  exact = false;
  return cad_.convertRgbTo256(color);
}

DexDrawLineProperties::EDashStyleType DxfStyles::dashStyleOf(const std::wstring& lineType) const {
  return cad_.convertCustomLineTypeToPredefined(CVynStringT<wchar_t>(std::wstring_view(lineType)));
}

std::wstring DxfStyles::lineTypeOf(DexDrawLineProperties::EDashStyleType style) const {
  return std::wstring(cad_.convertPredefinedStylesToCadStyles(style).view());
}

unsigned char DxfStyles::widthOf(int lineWeight) const {
  return static_cast<unsigned char>(std::clamp(cad_.convertLineWeightFromMmtoPixels(lineWeight), 1, 255));
}

}  // namespace vyn::ie::dxf
