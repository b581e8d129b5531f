// UTF-8/UTF-16 conversion never fails and never loses valid text; numbers parse strictly.
#include "host/core/TextConversion.h"

#include <climits>
#include <gtest/gtest.h>

using namespace orvcore::utility;

TEST(TextConversion, RoundTripsEveryPlane) {
    std::u16string text = u"A\u00E9\u20AC\U0001F600z";
    std::string utf8 = UTF16to8(text);
    EXPECT_EQ(utf8, "A\xC3\xA9\xE2\x82\xAC\xF0\x9F\x98\x80z");
    EXPECT_EQ(UTF8to16(utf8), text);
    EXPECT_EQ(UTF8to16(""), u"");
}

TEST(TextConversion, InvalidUTF8BecomesReplacementCharactersAndKeepsTheRest) {
    EXPECT_EQ(UTF8to16("a\xFF"
                       "b"),
              u"a\uFFFDb");
    EXPECT_EQ(UTF8to16("\xC0\xAF"), u"\uFFFD\uFFFD");                     // overlong slash
    EXPECT_EQ(UTF8to16("\xED\xA0\x80x"), u"\uFFFD\uFFFD\uFFFDx");         // encoded surrogate
    EXPECT_EQ(UTF8to16("\xF4\x90\x80\x80"), u"\uFFFD\uFFFD\uFFFD\uFFFD"); // beyond U+10FFFF
    EXPECT_EQ(UTF8to16("ok\xE2\x82"), u"ok\uFFFD\uFFFD");                 // truncated at the end
    EXPECT_EQ(UTF8to16("\xE2\x82z"), u"\uFFFD\uFFFDz");                   // continuation missing
    EXPECT_EQ(UTF8to16(std::string("a\0b", 3)), std::u16string(u"a\0b", 3));
}

TEST(TextConversion, UnpairedSurrogatesBecomeReplacementCharacters) {
    EXPECT_EQ(UTF16to8(std::u16string(1, char16_t(0xD800)) + u"x"), "\xEF\xBF\xBDx");
    EXPECT_EQ(UTF16to8(u"x" + std::u16string(1, char16_t(0xDC00))), "x\xEF\xBF\xBD");
    EXPECT_EQ(AsciiToUTF16("ab\xC3\xA9"), u"ab\uFFFD\uFFFD");
}

TEST(StringToNumber, AcceptsOnlyWholeNumbersThatFit) {
    long n = 42;
    EXPECT_TRUE(StringToNumber(n, std::string("-17")));
    EXPECT_EQ(n, -17);
    EXPECT_TRUE(StringToNumber(n, std::string("+5")));
    EXPECT_EQ(n, 5);
    EXPECT_TRUE(StringToNumber(n, std::to_string(LONG_MIN)));
    EXPECT_EQ(n, LONG_MIN);
    EXPECT_TRUE(StringToNumber(n, std::to_string(LONG_MAX)));
    EXPECT_EQ(n, LONG_MAX);

    n = 7;
    for (char const* bad : {"", "-", "+-1", "--1", "12a", " 12", "12 ", "0x10", "9223372036854775808",
                            "-9223372036854775809", "1.5"}) {
        EXPECT_FALSE(StringToNumber(n, std::string(bad))) << bad;
        EXPECT_EQ(n, 7) << bad;
    }
}

TEST(StringToNumber, FlagsAllowHexAndSpaces) {
    long n = 0;
    EXPECT_TRUE(StringToNumber(n, std::string("0x1F"), StringToNumberAllowHex));
    EXPECT_EQ(n, 31);
    EXPECT_TRUE(StringToNumber(n, std::string("-0X10"), StringToNumberAllowHex));
    EXPECT_EQ(n, -16);
    EXPECT_FALSE(StringToNumber(n, std::string("0x"), StringToNumberAllowHex));
    EXPECT_TRUE(StringToNumber(n, std::string(" \t12 "), StringToNumberAllowSpace));
    EXPECT_EQ(n, 12);
    EXPECT_FALSE(StringToNumber(n, std::string("1 2"), StringToNumberAllowSpace));
    EXPECT_TRUE(StringToNumber(n, std::u16string(u"-300")));
    EXPECT_EQ(n, -300);
    EXPECT_FALSE(StringToNumber(n, std::u16string(u"\uFF11"))); // a full-width digit is no ASCII digit
}
