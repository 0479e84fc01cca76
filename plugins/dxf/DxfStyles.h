#pragma once

#include <string>
#include <string_view>

#include "ieObjects/IEDrawProperties.h"
#include "ieUtils/IEAutoCADUtils.h"

// The drawing styles of DXF (AutoCAD Color Index and true colours, line-type names, line weights)
// against the model's colours, dash styles and widths, in both directions.
namespace vyn::ie::dxf {

// Model colours hold red in the lowest byte, then green and blue; DXF true colours (group 420) hold
// 0x00RRGGBB.
class DxfStyles {
 public:
  // The model colour of a palette index (1 to 255); of a true colour.
  unsigned long colorOfIndex(int index) const { return cad_.convert256ToRgb(index); }
  static unsigned long colorOfTrueColor(long long trueColor);
  static long long trueColorOf(unsigned long color);
  // The palette index of a model colour: the lowest index from 1 whose colour it is exactly (so black
  // is 7), else the nearest (exact false: the exporter then writes the true colour too).
  int indexOf(unsigned long color, bool& exact) const;

  // The dash style of a line-type name ("DASHED"; any case); Solid for any other name.
  DexDrawLineProperties::EDashStyleType dashStyleOf(const std::wstring& lineType) const;
  // The line-type name of a dash style ("Continuous" for Solid).
  std::wstring lineTypeOf(DexDrawLineProperties::EDashStyleType style) const;
  // Line weights (hundredths of a millimetre) against widths in pixels.
  unsigned char widthOf(int lineWeight) const;
  int lineWeightOf(unsigned char width) const { return cad_.convertLineWeightFromPixelsToMm(width); }

  const DexAutoCadUtils& cad() const noexcept { return cad_; }
  DexAutoCadUtils& cad() noexcept { return cad_; }

 private:
  DexAutoCadUtils cad_;
};

}  // namespace vyn::ie::dxf
