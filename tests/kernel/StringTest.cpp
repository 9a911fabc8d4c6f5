#include <gtest/gtest.h>

#include "VORString.h"
#include "VORUnicodeString.h"

namespace {

TEST(UnicodeStringTest, CountsCodePointsNotBytes) {
  VORUnicodeString s("Schweißzange Ö 🚗");
  EXPECT_EQ(s.GetLengthInChar(), 16);
  EXPECT_EQ(s.ConvertToUTF8(), "Schweißzange Ö 🚗");
  // Through UTF-16 (surrogate pair for the car) and back.
  std::u16string wide = s.ConvertToUTF16();
  EXPECT_EQ(wide.size(), 17u);
  EXPECT_EQ(VORUnicodeString::FromUTF16(wide.c_str()), s);
}

TEST(UnicodeStringTest, FindsFromEitherEndAndCutsSubStrings) {
  VORUnicodeString path("Doc/Underbody/Station 10/Underbody");
  EXPECT_EQ(path.Find("Underbody"), 4);
  EXPECT_EQ(path.Find("Underbody", 5), 25);
  EXPECT_EQ(path.ReverseFind("/"), 24);
  EXPECT_EQ(path.ReverseFind("/", 23), 13);
  EXPECT_EQ(path.Find("missing"), -1);
  EXPECT_EQ(path.SubString(4, 9), VORUnicodeString("Underbody"));
  EXPECT_EQ(path.SubString(30, 100), VORUnicodeString("body"));
  EXPECT_TRUE(path.SubString(100, 2).IsEmpty());
}

TEST(UnicodeStringTest, MalformedUtf8BecomesReplacementCharacters) {
  const char bad[] = {'a', static_cast<char>(0xC3), 'b', static_cast<char>(0xE2), 0};
  VORUnicodeString s(bad);
  ASSERT_EQ(s.GetLengthInChar(), 4);
  EXPECT_EQ(s[0], U'a');
  EXPECT_EQ(s[1], U'\uFFFD');
  EXPECT_EQ(s[2], U'b');
  EXPECT_EQ(s[3], U'\uFFFD');
}

TEST(UnicodeStringTest, CopiesStayIndependentWhenOneGrows) {
  // Short strings live inline, longer ones share a block between copies: appending to one copy
  // must leave the others as they were, whatever the storage.
  for (const char* text : {"", "ab", "abc", "abcd", "Underbody station"}) {
    VORUnicodeString original(text);
    VORUnicodeString copy = original;
    VORUnicodeString assigned;
    assigned = copy;
    copy += VORUnicodeString("/1");
    assigned.Append(assigned);
    EXPECT_EQ(original.ConvertToUTF8(), text);
    EXPECT_EQ(copy.ConvertToUTF8(), std::string(text) + "/1");
    EXPECT_EQ(assigned.ConvertToUTF8(), std::string(text) + text);
    VORUnicodeString moved = std::move(copy);
    EXPECT_EQ(moved.ConvertToUTF8(), std::string(text) + "/1");
    EXPECT_EQ(original + VORUnicodeString("!"), VORUnicodeString(std::string(text) + "!"));
  }
}

TEST(UnicodeStringTest, GrowsInPlaceAndOrdersByCodePoint) {
  VORUnicodeString grown;
  std::string expected;
  for (int i = 0; i < 50; ++i) {
    grown += VORUnicodeString("ä");
    expected += "ä";
  }
  EXPECT_EQ(grown.GetLengthInChar(), 50);
  EXPECT_EQ(grown.ConvertToUTF8(), expected);
  // Three multi-byte code points fit where three ASCII ones do.
  EXPECT_EQ(VORUnicodeString("äöü").GetLengthInChar(), 3);
  EXPECT_EQ(VORUnicodeString("äöü"), VORUnicodeString::FromUTF16(u"äöü"));
  EXPECT_LT(VORUnicodeString("Station 1"), VORUnicodeString("Station 2"));
  EXPECT_LT(VORUnicodeString("abc"), VORUnicodeString("abcd"));
  EXPECT_EQ(std::hash<VORUnicodeString>()(VORUnicodeString("Station 10")),
            std::hash<std::u32string>()(U"Station 10"));
}

TEST(StringTest, NarrowStringsConvertThroughUtf8) {
  VORString name(VORUnicodeString("Zelle Ä1"));
  EXPECT_STREQ(name.CastToCharPtr(), "Zelle Ä1");
  EXPECT_EQ(name.ToUnicode().GetLengthInChar(), 8);
  EXPECT_EQ(VORString("a") + VORString("b"), VORString("ab"));
}

}  // namespace
