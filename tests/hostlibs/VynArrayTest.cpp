#include "hostlibs/VynArray.h"

#include <gtest/gtest.h>

#include "hostlibs/VynString.h"

using StringArray = CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&>;

TEST(CVynArray, AddAppendAndInsertKeepOrder) {
  StringArray names;
  EXPECT_TRUE(names.IsEmpty());
  EXPECT_EQ(-1, names.GetUpperBound());
  EXPECT_EQ(0, names.Add(L"P1"));
  EXPECT_EQ(1, names.Add(L"P3"));
  names.InsertAt(1, L"P2");
  names.InsertAt(100, L"P4");
  names.InsertAt(-1, L"P0");
  names.InsertAt(0, L"never", 0);
  ASSERT_EQ(5, names.GetSize());
  for (int i = 0; i < names.GetSize(); ++i) {
    CVynStringT<wchar_t> expected;
    expected.Format(L"P%d", i);
    EXPECT_EQ(expected, names[i]);
  }
  EXPECT_EQ(5, names.Append(names));
  EXPECT_EQ(10, names.GetCount());
  EXPECT_EQ(names[9], L"P4");
}

TEST(CVynArray, BadIndexesAnswerDefaultsAndChangeNothing) {
  StringArray names;
  names.Add(L"A");
  const StringArray& view = names;
  EXPECT_TRUE(view.GetAt(-1).IsEmpty());
  EXPECT_TRUE(view[1].IsEmpty());
  names.SetAt(3, L"X");
  names[7] = L"scratch";  // lands in a scratch element, not in the array
  EXPECT_TRUE(names.ElementAt(7).IsEmpty());
  names.RemoveAt(5);
  names.RemoveAt(-1);
  names.RemoveAt(0, 0);
  ASSERT_EQ(1, names.GetSize());
  EXPECT_EQ(names[0], L"A");
}

TEST(CVynArray, RemoveAtClampsTheCountAndSetAtGrowExtends) {
  CVynArray<int> values;
  for (int i = 0; i < 5; ++i)
    values.Add(i);
  values.RemoveAt(3, 100);
  EXPECT_EQ(3, values.GetSize());
  values.SetAtGrow(5, 9);
  ASSERT_EQ(6, values.GetSize());
  EXPECT_EQ(0, values[4]);
  EXPECT_EQ(9, values[5]);
  values.SetAtGrow(-1, 1);
  EXPECT_EQ(6, values.GetSize());
  values.SetAtGrow(6, values[5]);  // the argument lives in the array that grows
  EXPECT_EQ(9, values[6]);
  values.SetSize(2);
  EXPECT_EQ(2, values.GetSize());
  values.SetSize(-4);
  EXPECT_TRUE(values.IsEmpty());

  CVynArray<int> copy;
  values.Add(1);
  copy.Copy(values);
  copy[0] = 2;
  EXPECT_EQ(1, values[0]);
  int sum = 0;
  for (const int value : copy)
    sum += value;
  EXPECT_EQ(2, sum);
}
