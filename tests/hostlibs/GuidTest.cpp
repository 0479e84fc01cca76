#include <gtest/gtest.h>

#include "hostlibs/winport.h"

TEST(Guid, ReadsTheBracedFormInEitherCase) {
  GUID upper;
  GUID lower;
  ASSERT_EQ(S_OK, CLSIDFromString(L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}", &upper));
  ASSERT_EQ(S_OK, CLSIDFromString(L"{e1ee3440-4e57-491c-b580-2cc94dfdcd82}", &lower));
  EXPECT_EQ(upper, lower);
  EXPECT_EQ(0xE1EE3440u, upper.Data1);
  EXPECT_EQ(0x4E57, upper.Data2);
  EXPECT_EQ(0x491C, upper.Data3);
  EXPECT_EQ(0xB5, upper.Data4[0]);
  EXPECT_EQ(0x82, upper.Data4[7]);

  wchar_t buffer[39];
  EXPECT_EQ(39, StringFromGUID2(lower, buffer, 39));
  EXPECT_STREQ(L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}", buffer);
  EXPECT_EQ(0, StringFromGUID2(lower, buffer, 38));

  wchar_t* text = nullptr;
  ASSERT_EQ(S_OK, StringFromCLSID(upper, &text));
  EXPECT_STREQ(L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}", text);
  CoTaskMemFree(text);
}

TEST(Guid, RefusesEveryOtherForm) {
  const wchar_t* const refused[] = {
      L"",
      L"E1EE3440-4E57-491C-B580-2CC94DFDCD82",
      L"{E1EE3440-4E57-491C-B580-2CC94DFDCD8}",
      L"{E1EE3440-4E57-491C-B580-2CC94DFDCD822}",
      L"{E1EE3440-4E57-491C-B580-2CC94DFDCD8G}",
      L"{E1EE3440+4E57-491C-B580-2CC94DFDCD82}",
      L"{E1EE34404-E57-491C-B580-2CC94DFDCD82}",
      L"(E1EE3440-4E57-491C-B580-2CC94DFDCD82)",
      L" {E1EE3440-4E57-491C-B580-2CC94DFDCD82}",
  };
  for (const wchar_t* text : refused) {
    GUID guid;
    guid.Data1 = 7;
    EXPECT_EQ(CO_E_CLASSSTRING, CLSIDFromString(text, &guid)) << text;
    EXPECT_EQ(GUID{}, guid) << text;
  }
  GUID guid;
  EXPECT_EQ(CO_E_CLASSSTRING, CLSIDFromString(nullptr, &guid));
  EXPECT_EQ(E_INVALIDARG, CLSIDFromString(L"{E1EE3440-4E57-491C-B580-2CC94DFDCD82}", nullptr));
  EXPECT_EQ(E_INVALIDARG, StringFromCLSID(guid, nullptr));
}
