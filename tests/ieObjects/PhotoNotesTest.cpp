#include "ieObjects/IEPhotoNotes.h"

#include <gtest/gtest.h>

#include <climits>

namespace {

using vyn::ie::DexPhotoNote;
using vyn::ie::DexPhotoNotes;
using vyn::ie::EPhotoPropertyDataType;

DexPhotoNote* noteOf(const wchar_t* fileName, double angle) {
  auto* const note = new DexPhotoNote();
  note->setFileName(fileName);
  note->setData(vyn::ie::PHOTO_HORIZONTAL_ANGLE, angle);
  return note;
}

}  // namespace

TEST(DexPhotoNote, StartsWithZerosAndNoFile) {
  const DexPhotoNote note;
  for (int kind = 0; kind < 3; ++kind)
    EXPECT_EQ(0.0, note.getData(static_cast<EPhotoPropertyDataType>(kind)));
  EXPECT_TRUE(note.getFileName().IsEmpty());
}

TEST(DexPhotoNote, KindsPastTheThirdReadZeroAndAreIgnored) {
  DexPhotoNote note;
  note.setData(vyn::ie::PHOTO_DISTANCE, 12.5);
  note.setData(static_cast<EPhotoPropertyDataType>(3), 99.0);
  note.setData(static_cast<EPhotoPropertyDataType>(-1), 99.0);
  EXPECT_EQ(0.0, note.getData(static_cast<EPhotoPropertyDataType>(3)));
  EXPECT_EQ(0.0, note.getData(static_cast<EPhotoPropertyDataType>(INT_MAX)));
  EXPECT_EQ(0.0, note.getData(vyn::ie::PHOTO_HORIZONTAL_ANGLE));
  EXPECT_EQ(0.0, note.getData(vyn::ie::PHOTO_VERTICAL_ANGLE));
  EXPECT_EQ(12.5, note.getData(vyn::ie::PHOTO_DISTANCE));
}

TEST(DexPhotoNote, CopyTakesTheValuesAndTheFileName) {
  DexPhotoNote note;
  note.setFileName(L"/photos/P17.jpg");
  note.setData(vyn::ie::PHOTO_VERTICAL_ANGLE, 91.25);
  const DexPhotoNote copy(note);
  EXPECT_EQ(L"/photos/P17.jpg", copy.getFileName());
  EXPECT_EQ(91.25, copy.getData(vyn::ie::PHOTO_VERTICAL_ANGLE));
  DexPhotoNote assigned;
  assigned.setData(vyn::ie::PHOTO_DISTANCE, 3.0);
  assigned = note;
  EXPECT_EQ(0.0, assigned.getData(vyn::ie::PHOTO_DISTANCE));
  EXPECT_EQ(L"/photos/P17.jpg", assigned.getFileName());
}

TEST(DexPhotoNotes, KeepsNotesInOrderAndAnswersNullOutsideTheList) {
  DexPhotoNotes notes;
  EXPECT_EQ(0, notes.getNumberOfPhotoNotes());
  notes.addPhotoNote(noteOf(L"a.jpg", 1.0));
  notes.addPhotoNote(noteOf(L"b.jpg", 2.0));
  notes.addPhotoNote(nullptr);
  EXPECT_EQ(2, notes.getNumberOfPhotoNotes());
  EXPECT_EQ(L"a.jpg", notes.getPhotoNote(0)->getFileName());
  EXPECT_EQ(L"b.jpg", std::as_const(notes).getPhotoNote(1)->getFileName());
  for (const int index : {2, -1, INT_MAX}) {
    EXPECT_EQ(nullptr, notes.getPhotoNote(index));
    EXPECT_EQ(nullptr, std::as_const(notes).getPhotoNote(index));
  }
}

TEST(DexPhotoNotes, CloneAppendsCopiesToTheNotesAlreadyThere) {
  auto* const source = new DexPhotoNotes();
  source->addPhotoNote(noteOf(L"b.jpg", 2.0));
  source->addPhotoNote(noteOf(L"c.jpg", 3.0));
  DexPhotoNotes target;
  target.addPhotoNote(noteOf(L"a.jpg", 1.0));
  target.clone(*source);
  ASSERT_EQ(3, target.getNumberOfPhotoNotes());
  EXPECT_NE(source->getPhotoNote(0), target.getPhotoNote(1));
  EXPECT_EQ(2, source->getNumberOfPhotoNotes());
  delete source;
  EXPECT_EQ(L"a.jpg", target.getPhotoNote(0)->getFileName());
  EXPECT_EQ(L"b.jpg", target.getPhotoNote(1)->getFileName());
  EXPECT_EQ(3.0, target.getPhotoNote(2)->getData(vyn::ie::PHOTO_HORIZONTAL_ANGLE));
}

TEST(DexPhotoNotes, CloneIntoItselfChangesNothing) {
  DexPhotoNotes notes;
  notes.addPhotoNote(noteOf(L"a.jpg", 1.0));
  notes.addPhotoNote(noteOf(L"b.jpg", 2.0));
  const DexPhotoNote* const first = notes.getPhotoNote(0);
  notes.clone(notes);
  EXPECT_EQ(2, notes.getNumberOfPhotoNotes());
  EXPECT_EQ(first, notes.getPhotoNote(0));
}

TEST(DexPhotoNotes, CopyAndAssignmentOwnTheirOwnNotes) {
  auto* const original = new DexPhotoNotes();
  original->addPhotoNote(noteOf(L"a.jpg", 1.0));
  DexPhotoNotes copy(*original);
  DexPhotoNotes assigned;
  assigned.addPhotoNote(noteOf(L"old.jpg", 0.0));
  assigned = *original;
  delete original;
  for (const DexPhotoNotes* notes : {&copy, &assigned}) {
    ASSERT_EQ(1, notes->getNumberOfPhotoNotes());
    EXPECT_EQ(L"a.jpg", notes->getPhotoNote(0)->getFileName());
    EXPECT_EQ(1.0, notes->getPhotoNote(0)->getData(vyn::ie::PHOTO_HORIZONTAL_ANGLE));
  }
}

TEST(DexPhotoNotes, SelfAssignmentKeepsTheNotes) {
  DexPhotoNotes notes;
  notes.addPhotoNote(noteOf(L"a.jpg", 1.0));
  const DexPhotoNote* const first = notes.getPhotoNote(0);
  DexPhotoNotes& alias = notes;
  notes = alias;
  EXPECT_EQ(first, notes.getPhotoNote(0));
  EXPECT_EQ(L"a.jpg", first->getFileName());
}
