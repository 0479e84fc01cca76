#pragma once

#include <initializer_list>
#include <utility>

#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieObjects/IEObjects.h"
#include "ieObjects/IEPhotoNotes.h"
#include "ieObjects/IEStation.h"

// Shared fixtures of the survey-object tests: property objects and photo notes that count their
// deletions, so that ownership becomes visible, and small builders of stations, codes and notes.
namespace objects_test {

// Any class of the model that counts its deletions (constructor arguments follow the counter).
template <class T>
class Counted : public T {
 public:
  template <class... Arguments>
  explicit Counted(int& deletions, Arguments&&... arguments)
      : T(std::forward<Arguments>(arguments)...), deletions_(deletions) {}
  ~Counted() override { ++deletions_; }

 private:
  int& deletions_;
};

// A new object of class T with the name (and, where T has one, the edit state); the caller owns it.
template <class T>
T* named(const wchar_t* name,
         vyn::ie::IDexStateInterface::ECurrentState state = vyn::ie::IDexStateInterface::ACTIVE_STATE) {
  auto* const object = new T();
  object->setName(name);
  if constexpr (requires { object->setStateType(state); }) object->setStateType(state);
  return object;
}

// Line properties that count their deletions. Their clones are plain line properties.
class CountedLineProperties : public vyn::ie::DexDrawLineProperties {
 public:
  explicit CountedLineProperties(int& deletions) : deletions_(deletions) {}
  ~CountedLineProperties() override { ++deletions_; }

 private:
  int& deletions_;
};

// Area properties that count their deletions.
class CountedAreaProperties : public vyn::ie::DexDrawAreaProperties {
 public:
  explicit CountedAreaProperties(int& deletions) : deletions_(deletions) {}
  ~CountedAreaProperties() override { ++deletions_; }

 private:
  int& deletions_;
};

// Photo notes that count their deletions.
class CountedPhotoNotes : public vyn::ie::DexPhotoNotes {
 public:
  explicit CountedPhotoNotes(int& deletions) : deletions_(deletions) {}
  ~CountedPhotoNotes() override { ++deletions_; }

 private:
  int& deletions_;
};

// Offset stations that count their deletions.
class CountedOffsetStation : public vyn::ie::DexOffsetStation {
 public:
  explicit CountedOffsetStation(int& deletions) : deletions_(deletions) {}
  ~CountedOffsetStation() override { ++deletions_; }

 private:
  int& deletions_;
};

// A station at (x, y, z) with the given name, bulge and coordinate-system kind.
inline vyn::ie::DexStation stationAt(double x, double y, double z, const wchar_t* name = L"",
                                     double bulge = 0.0, vyn::ie::EDexCSType csType = vyn::ie::CS_LOCAL) {
  vyn::ie::DexStation station(2, csType);
  station.setPosition(x, y, z);
  station.setName(name);
  station.setBulge(bulge);
  return station;
}

// Photo notes with one note per file name; the caller owns them.
inline vyn::ie::DexPhotoNotes* photoNotesOf(std::initializer_list<const wchar_t*> fileNames) {
  auto* const notes = new vyn::ie::DexPhotoNotes();
  for (const wchar_t* fileName : fileNames) {
    auto* const note = new vyn::ie::DexPhotoNote();
    note->setFileName(fileName);
    notes->addPhotoNote(note);
  }
  return notes;
}

// A new code value of description (may be null) with the given code strings; the caller owns it.
inline vyn::ie::DexCodeValues* codeOf(const vyn::ie::DexCodeDescription* description,
                                      std::initializer_list<const wchar_t*> codeStrings = {}) {
  auto* const code = new vyn::ie::DexCodeValues(description);
  for (const wchar_t* codeString : codeStrings)
    code->addCodeString(codeString);
  return code;
}

// Line properties of the given colour and width, defined.
inline vyn::ie::DexDrawLineProperties* linePropertiesOf(unsigned long color, unsigned char width = 1) {
  return new vyn::ie::DexDrawLineProperties(color, width, vyn::ie::DexDrawLineProperties::DASH_SOLID);
}

// The defined colour of properties, or 0 when there are none or no colour is defined.
inline unsigned long colorOf(const vyn::ie::IDexDrawProperties* properties) {
  unsigned long color = 0;
  if (properties != nullptr) properties->getColor(color);
  return color;
}

// The file name of the first photo note of an object, or an empty text.
inline CVynStringT<wchar_t> firstPhotoFileOf(const vyn::ie::DexObject& object) {
  const vyn::ie::DexPhotoNotes* const notes = object.getPhotoNotes();
  const vyn::ie::DexPhotoNote* const note = notes != nullptr ? notes->getPhotoNote(0) : nullptr;
  return note != nullptr ? note->getFileName() : CVynStringT<wchar_t>();
}

}  // namespace objects_test
