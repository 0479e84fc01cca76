#pragma once

#include <array>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"

// The instruments and controllers that raw observations were recorded with, and the interface of the
// records that refer to them.
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

// A raw record that refers to the instrument and the controller it was recorded with. The records
// referred to belong to the data container (DexData::addEquipment); the implementing record stores the
// references and never deletes them.
//
// The virtual table: the destructor, setEquipment, getEquipment, setController, getController (the
// plug-in ABI).
class DEX_API IDexEquipment {
 public:
  virtual ~IDexEquipment();

  // Null clears the reference.
  virtual void setEquipment(const DexRawDataEquipment* equipment) = 0;
  virtual const DexRawDataEquipment* getEquipment() const = 0;
  virtual void setController(const DexRawDataEquipment* controller) = 0;
  virtual const DexRawDataEquipment* getController() const = 0;

 protected:
  IDexEquipment() = default;
  IDexEquipment(const IDexEquipment&) = default;
  IDexEquipment& operator=(const IDexEquipment&) = default;
};

}  // namespace vyn::ie
