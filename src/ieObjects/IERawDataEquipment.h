#pragma once

#include <array>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"

// The instruments and controllers that raw observations were recorded with.
namespace vyn::ie {

// The description of one instrument or controller, filled and read by the plug-ins: a number, six
// texts and a number. The library stores and copies it and reads nothing inside. The data container
// keeps the records by id; raw records refer to them.
struct DEX_API DexRawDataEquipment {
  VYN_CLASS_ALLOCATOR

  static constexpr int kNumberOfTexts = 6;

  // Both numbers 0, the texts empty.
  DexRawDataEquipment() = default;
  DexRawDataEquipment(const DexRawDataEquipment&) = default;
  DexRawDataEquipment& operator=(const DexRawDataEquipment&) = default;
  virtual ~DexRawDataEquipment();

  std::int64_t leadingValue = 0;
  std::array<CVynStringT<wchar_t>, kNumberOfTexts> texts;
  std::int64_t trailingValue = 0;
};

}  // namespace vyn::ie
