// The property list's data model: key order, kinds, defaults, ownership of sub-lists.
#include "host/core/PropList.h"

#include <climits>
#include <cmath>
#include <gtest/gtest.h>

using orvcore::proplist::PropList;

TEST(PropList, KeysAreHeldInByteOrder) {
    PropList list;
    list.SetValue("b", 1);
    list.SetValue("B", 2);
    list.SetValue("a", 3);
    list.SetValue("children", true);
    list.SetValue("AutoLayout", true);
    list.SetValue("Constraints", true);
    list.SetValue("\xC3\xA9", true); // bytes above 0x7F sort after ASCII
    EXPECT_EQ(list.Keys(),
              (std::vector<std::string>{"AutoLayout", "B", "Constraints", "a", "b", "children", "\xC3\xA9"}));
}

TEST(PropList, AbsentKeyOrOtherKindKeepsTheCallersDefault) {
    PropList list;
    list.SetValue("text", "hello");
    list.SetValue("flag", true);
    std::int32_t number = -5;
    EXPECT_FALSE(list.GetValue("missing", number));
    EXPECT_FALSE(list.GetValue("text", number));
    EXPECT_EQ(number, -5);
    bool flag = false;
    EXPECT_FALSE(list.GetValue("text", flag));
    EXPECT_FALSE(flag);
    std::string text = "default";
    EXPECT_FALSE(list.GetValue("flag", text));
    EXPECT_EQ(text, "default");
    std::vector<std::int32_t> ints{9};
    EXPECT_FALSE(list.GetValue("text", ints));
    EXPECT_EQ(ints, std::vector<std::int32_t>{9});
    EXPECT_EQ(list.GetSubList("text"), nullptr);
    EXPECT_EQ(list.GetSubList("missing"), nullptr);
}

TEST(PropList, LiteralTextIsTextNotBoolean) {
    PropList list;
    list.SetValue("k", "1.2");
    list.SetValue("w", u"Caf\u00E9");
    EXPECT_EQ(list.KindOf("k"), PropList::Kind::String);
    EXPECT_EQ(list.KindOf("w"), PropList::Kind::String); // UTF-16 text is stored as text
    std::string utf8;
    EXPECT_TRUE(list.GetValue("w", utf8));
    EXPECT_EQ(utf8, "Caf\xC3\xA9");
    std::u16string wide;
    EXPECT_TRUE(list.GetValue("k", wide));
    EXPECT_EQ(wide, u"1.2");
}

TEST(PropList, IntegersCrossSignednessOnlyWhenTheyFit) {
    PropList list;
    list.SetValue("neg", std::int32_t(-1));
    list.SetValue("big", std::uint32_t(UINT32_MAX));
    list.SetValue("small", std::uint32_t(3));
    std::int32_t s = 0;
    std::uint32_t u = 0;
    EXPECT_FALSE(list.GetValue("neg", u));
    EXPECT_FALSE(list.GetValue("big", s));
    EXPECT_TRUE(list.GetValue("small", s));
    EXPECT_EQ(s, 3);
    EXPECT_EQ(list.KindOf("small"), PropList::Kind::UInt32);
    float f = 0;
    double d = 0;
    list.SetValue("d", 2.5);
    EXPECT_TRUE(list.GetValue("d", f));
    EXPECT_EQ(f, 2.5f);
    list.SetValue("f", 0.25f);
    EXPECT_TRUE(list.GetValue("f", d));
    EXPECT_EQ(d, 0.25);
    EXPECT_FALSE(list.GetValue("neg", d)); // no integer-to-real guessing
    // A double a float cannot hold does not read as one (say a damaged splitter placement).
    list.SetValue("huge", 1e300);
    f = 0.5f;
    EXPECT_FALSE(list.GetValue("huge", f));
    EXPECT_EQ(f, 0.5f);
    list.SetValue("inf", HUGE_VAL);
    EXPECT_TRUE(list.GetValue("inf", f));
    EXPECT_EQ(f, HUGE_VALF);
}

TEST(PropList, SetValueReplacesWhateverWasThere) {
    PropList list;
    PropList* sub = list.NewSubList("k");
    sub->SetValue("inner", 1);
    list.SetValue("k", 7);
    EXPECT_EQ(list.GetSubList("k"), nullptr);
    EXPECT_EQ(list.Size(), 1u);
    PropList* fresh = list.NewSubList("k");
    EXPECT_TRUE(fresh->IsEmpty());
    EXPECT_EQ(list.GetSubList("k"), fresh);
    EXPECT_TRUE(list.RemoveValue("k"));
    EXPECT_FALSE(list.RemoveValue("k"));
    EXPECT_TRUE(list.IsEmpty());
}

TEST(PropList, SubListsStayPutWhileTheParentGrows) {
    PropList list;
    PropList* first = list.NewSubList("m");
    first->SetValue("x", 1);
    for (int i = 0; i < 100; ++i) {
        list.SetValue("k" + std::to_string(i), i); // inserts before and after "m"
        list.SetValue("a" + std::to_string(i), i);
    }
    EXPECT_EQ(list.GetSubList("m"), first);
    std::int32_t x = 0;
    EXPECT_TRUE(first->GetValue("x", x));
    EXPECT_EQ(x, 1);
}

TEST(PropList, CopiesAreDeep) {
    PropList list;
    list.NewSubList("a")->NewSubList("b")->SetValue("c", 1);
    list.SetValue("names", std::vector<std::u16string>{u"x", u"y"});
    PropList copy = list;
    EXPECT_EQ(copy, list);
    copy.GetSubList("a")->GetSubList("b")->SetValue("c", 2);
    EXPECT_NE(copy, list);
    std::int32_t c = 0;
    EXPECT_TRUE(list.GetSubList("a")->GetSubList("b")->GetValue("c", c));
    EXPECT_EQ(c, 1);
    EXPECT_NE(copy.GetSubList("a"), list.GetSubList("a"));

    PropList moved = std::move(copy);
    EXPECT_EQ(moved.GetSubList("a")->GetSubList("b")->Size(), 1u);
}

TEST(PropList, EqualityComparesKindsAndNestedValues) {
    PropList a, b;
    a.SetValue("k", std::int32_t(1));
    b.SetValue("k", std::uint32_t(1));
    EXPECT_NE(a, b);
    b.SetValue("k", std::int32_t(1));
    EXPECT_EQ(a, b);
    a.NewSubList("s")->SetValue("x", true);
    b.NewSubList("s")->SetValue("x", false);
    EXPECT_NE(a, b);
    a.SetByteString("bytes", "abc");
    b.GetSubList("s")->SetValue("x", true);
    b.SetValue("bytes", "abc");
    EXPECT_NE(a, b); // a byte string is not a UTF-8 string
    std::string bytes;
    EXPECT_TRUE(a.GetByteString("bytes", bytes));
    EXPECT_EQ(bytes, "abc");
}

TEST(PropList, StringListsOfEitherWidthReadAsEither) {
    PropList list;
    list.SetValue("u8", std::vector<std::string>{"a", "\xC3\xA9"});
    list.SetValue("u16", std::vector<std::u16string>{u"\U0001F600"});
    std::vector<std::u16string> wide;
    EXPECT_TRUE(list.GetValue("u8", wide));
    EXPECT_EQ(wide, (std::vector<std::u16string>{u"a", u"\u00E9"}));
    std::vector<std::string> narrow{"stale"};
    EXPECT_TRUE(list.GetValue("u16", narrow));
    EXPECT_EQ(narrow, std::vector<std::string>{"\xF0\x9F\x98\x80"});
}
