#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEOwningList.h"
#include "ieObjects/IETypedValues.h"

namespace vyn::ie {

// The three numbers that describe a photo note's picture. The library stores them for the plug-ins
// and reads none of them; the names give the usual meaning (angles in decimal degrees, distance in
// meters).
enum EPhotoPropertyDataType : int {
  PHOTO_HORIZONTAL_ANGLE = 0,  // direction in which the picture was taken
  PHOTO_VERTICAL_ANGLE = 1,    // tilt of the camera
  PHOTO_DISTANCE = 2,          // distance from the camera to the object
};

// A picture attached to a survey object or a total-station foresight: the picture file's name and the
// three numbers that describe it (0.0 until set). Copies take all of them.
class DEX_API DexPhotoNote {
 public:
  VYN_CLASS_ALLOCATOR

  DexPhotoNote() = default;
  DexPhotoNote(const DexPhotoNote&) = default;
  DexPhotoNote& operator=(const DexPhotoNote&) = default;
  virtual ~DexPhotoNote();

  // The value of kind; 0.0 for a kind outside 0 to 2, which setData ignores.
  double getData(int kind) const { return data_.get(kind); }
  void setData(int kind, double value) { data_.set(kind, value); }

  const CVynStringT<wchar_t>& getFileName() const noexcept { return fileName_; }
  void setFileName(const CVynStringT<wchar_t>& fileName) { fileName_ = fileName; }

 private:
  DexTypedValues<EPhotoPropertyDataType, 3> data_;
  CVynStringT<wchar_t> fileName_;
};

// The photo notes of one survey object or foresight, in insertion order. The list owns its notes and
// deletes them with itself; copy construction and assignment duplicate every note.
class DEX_API DexPhotoNotes {
 public:
  VYN_CLASS_ALLOCATOR

  DexPhotoNotes() = default;
  DexPhotoNotes(const DexPhotoNotes&) = default;
  DexPhotoNotes& operator=(const DexPhotoNotes&) = default;
  virtual ~DexPhotoNotes();

  // Appends note and takes ownership. A null note is ignored.
  void addPhotoNote(DexPhotoNote* note) { notes_.add(note); }
  int getNumberOfPhotoNotes() const noexcept { return notes_.count(); }
  // The note at index, or null when index is outside the list.
  DexPhotoNote* getPhotoNote(int index) noexcept { return notes_.at(index); }
  const DexPhotoNote* getPhotoNote(int index) const noexcept { return notes_.at(index); }

  // Appends a copy of each of other's notes; the notes already in this list stay. Cloning a list into
  // itself changes nothing.
  void clone(const DexPhotoNotes& other) { notes_.appendCopiesOf(other.notes_); }

 private:
  DexOwningList<DexPhotoNote> notes_;
};

}  // namespace vyn::ie
