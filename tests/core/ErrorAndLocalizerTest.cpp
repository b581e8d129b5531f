// Errors carry their table entry and a localised, filled-in message; the localiser and the
// placeholder and truncation helpers behave at their edges.
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/Localizer.h"
#include "host/core/StringUtils.h"
#include "host/core/TextConversion.h"

#include <functional>
#include <gtest/gtest.h>
#include <set>

using namespace orvcore::config;
using orvcore::utility::ReplaceInString;
using orvcore::utility::TruncateUIStringInMiddle;

namespace {

class LocalizerTest : public ::testing::Test {
protected:
    void TearDown() override { Localizer::Get().ClearTranslations(); }
};

Error Catch(std::function<void()> const& raise) {
    try {
        raise();
    } catch (Error const& e) {
        return e;
    }
    ADD_FAILURE() << "nothing was raised";
    return Error(0, "", 0, 0, false, u"");
}

} // namespace

TEST_F(LocalizerTest, RaisedErrorLeadsBackToItsTableEntry) {
    Error e = Catch([] { ThrowError(errors::UnknownWorkspace); });
    EXPECT_EQ(e.Level(), 1);
    EXPECT_TRUE(e.ShouldReport());
    EXPECT_EQ(e.Facility(), 102);
    EXPECT_EQ(e.Code(), 28);
    EXPECT_EQ(e.Message(), u"Unknown workspace.");
    EXPECT_STREQ(e.what(), "Unknown workspace.");
    ASSERT_NE(e.Entry(), nullptr);
    EXPECT_STREQ(e.Entry()->key, errors::UnknownWorkspace.key);
    EXPECT_EQ(e.Key(), errors::UnknownWorkspace.key);

    Error outside = Catch([] { ThrowError(2, "$$$/x/y=Z", 999, 1, false); });
    EXPECT_EQ(outside.Entry(), nullptr);
    EXPECT_FALSE(outside.ShouldReport());
    EXPECT_EQ(outside.Message(), u"Z");
}

TEST_F(LocalizerTest, EveryPublicErrorHasItsFixedKeyAndMessage) {
    struct Expected {
        int facility, code;
        char const* key;
        char16_t const* message;
    };
    Expected const expected[] = {
        {102, 20, "$$$/orvworkspace/Error/CannotCreateOverlayWindow", u"Unable to create overlay window."},
        {102, 21, "$$$/orvworkspace/Error/CannotCreateEmptyOverlayWindow",
         u"Attempted to create empty overlay window."},
        {102, 22, "$$$/orvworkspace/workspace/Error/InvalidWorkspace", u"Not a valid workspace definition."},
        {102, 23, "$$$/orvworkspace/workspace/Error/UnableToLoadWorkspace",
         u"Unable to load workspace; Incompatible workspace definition version."},
        {102, 24, "$$$/orvworkspace/workspace/Error/WorkspaceManager/AlreadyIntialized",
         u"Workspaces Manager already initialized"},
        {102, 25, "$$$/orvworkspace/workspace/Error/WorkspaceManager/NotInitialized",
         u"Workspaces Manager not initialized"},
        {102, 26, "$$$/orvworkspace/workspace/Error/WorkspaceManager/WorkspaceAlreadyExists",
         u"A workspace with this name already exists."},
        {102, 27, "$$$/orvworkspace/workspace/Error/WorkspaceManager/CannotCreateWorkspace",
         u"Could not create workspace."},
        {102, 28, "$$$/orvworkspace/workspace/Error/WorkspaceManager/UnknownWorkspace",
         u"Unknown workspace."},
        {105, 20, "$$$/orvworkspace/utility/Error/ResourceUtils/UnableToAccessResource",
         u"Unable to access resource."},
        {105, 21, "$$$/orvcore/utility/Error/InvalidTypeConversion", u"Invalid type conversion."},
        {107, 0, "$$$/orvcore/geom/matrix/Error/NonInvertableMatrix", u"Matrix cannot be inverted."},
        {108, 20, "$$$/orvworkspace/sharedui/Error/InvalidToolMapAccess", u"Invalid tool map access."},
    };
    for (Expected const& x : expected) {
        ErrorEntry const* entry = FindErrorEntry(x.facility, x.code);
        ASSERT_NE(entry, nullptr) << x.key;
        EXPECT_EQ(std::string(entry->key), std::string(x.key) + "=" + orvcore::utility::UTF16to8(x.message));
        Error e = Catch([&] { ThrowError(*entry); });
        EXPECT_EQ(e.Message(), x.message);
        EXPECT_EQ(e.Entry(), entry);
    }
}

TEST_F(LocalizerTest, TableHoldsEveryErrorOnceWithItsDefaultText) {
    std::set<std::pair<int, int>> codes;
    for (ErrorEntry const* e = ErrorTableBegin(); e != ErrorTableEnd(); ++e) {
        EXPECT_TRUE(codes.insert({e->facility, e->code}).second) << e->key;
        EXPECT_EQ(FindErrorEntry(e->facility, e->code), e);
        EXPECT_FALSE(Localizer::Get().Localize(e->key).empty()) << e->key;
    }
    EXPECT_EQ(codes.size(), 16u);
    EXPECT_EQ(FindErrorEntry(107, 0)->key,
              std::string("$$$/orvcore/geom/matrix/Error/NonInvertableMatrix=Matrix cannot be inverted."));
    EXPECT_EQ(Localizer::Get().Localize(FindErrorEntry(102, 24)->key),
              u"Workspaces Manager already initialized");
}

TEST_F(LocalizerTest, TranslationReplacesDefaultTextAndFillsPlaceholders) {
    Localizer::Get().SetTranslation("orvcore/proplist/Error/MalformedDocument", u"Kaputt: @0 (@1)");
    Error e = Catch([] { ThrowError(errors::MalformedPropList, "a.xml", "bad"); });
    EXPECT_EQ(e.Message(), u"Kaputt: a.xml (bad)");
    Localizer::Get().RemoveTranslation("orvcore/proplist/Error/MalformedDocument");
    e = Catch([] { ThrowError(errors::MalformedPropList, "a.xml", "bad"); });
    EXPECT_EQ(e.Message(), u"The property list 'a.xml' is malformed: bad.");
}

TEST_F(LocalizerTest, LocalizeKeepsPlainTextAndSplitsAtFirstEquals) {
    auto& loc = Localizer::Get();
    EXPECT_EQ(loc.Localize("Plain = text"), u"Plain = text");
    EXPECT_EQ(loc.Localize("$$$/a/b=x=y"), u"x=y");
    EXPECT_EQ(loc.Localize("$$$/a/b="), u"");
    EXPECT_EQ(loc.Localize("$$$/a/noDefault"), u"a/noDefault");
    EXPECT_EQ(loc.Localize("$$$/a/b=Caf\xC3\xA9"), u"Caf\u00E9");
    EXPECT_EQ(Localizer::KeyPath("$$$/a/b=x"), "a/b");
    EXPECT_EQ(Localizer::KeyPath("$$/a/b=x"), "");
}

TEST(ReplaceInString, FillsEveryPlaceholderInOnePass) {
    EXPECT_EQ(ReplaceInString(u"@0-@1-@2-@3-@4-@5-@6-@7-@8-@9", u"a", u"b", u"c", u"d", u"e", u"f", u"g",
                              u"h", u"i", u"j"),
              u"a-b-c-d-e-f-g-h-i-j");
    // A replacement that holds a placeholder is not filled again.
    EXPECT_EQ(ReplaceInString(u"@0 and @1", u"@1", u"x"), u"@1 and x");
    EXPECT_EQ(ReplaceInString(u"Reset \"@0\"...", u"Editing"), u"Reset \"Editing\"...");
    EXPECT_EQ(ReplaceInString(u"mail@host @ @@0 @", u"X"), u"mail@host @ @X @");
    EXPECT_EQ(ReplaceInString(u"@5 missing"), u" missing");
}

TEST(TruncateUIStringInMiddle, NeverLongerThanTheMaximum) {
    std::u16string text = u"abcdefghijklmnopqrstuvwxyz"; // 26
    EXPECT_EQ(TruncateUIStringInMiddle(text, 26, 0.25), text);
    EXPECT_EQ(TruncateUIStringInMiddle(text, 100, 0.25), text);
    std::u16string cut = TruncateUIStringInMiddle(text, 9, 0.25);
    EXPECT_EQ(cut, u"abcdef\u2026yz"); // 8 kept: 2 from the end, 6 from the start
    EXPECT_EQ(TruncateUIStringInMiddle(text, 9, 0.0), u"abcdefgh\u2026");
    EXPECT_EQ(TruncateUIStringInMiddle(text, 9, 1.0), u"\u2026stuvwxyz");
    EXPECT_EQ(TruncateUIStringInMiddle(text, 9, 7.0), u"\u2026stuvwxyz");
    EXPECT_EQ(TruncateUIStringInMiddle(text, 1, 0.5), u"\u2026");
    EXPECT_EQ(TruncateUIStringInMiddle(text, 0, 0.5), u"");
    for (std::size_t max = 0; max < 30; ++max) {
        EXPECT_LE(TruncateUIStringInMiddle(text, max, 0.25).size(), max);
    }
}

TEST(TruncateUIStringInMiddle, DoesNotSplitSurrogatePairs) {
    // Four musical symbols (each a surrogate pair) then plain letters.
    std::u16string text = u"\U0001D11E\U0001D11E\U0001D11E\U0001D11Eabcdef";
    std::u16string cut = TruncateUIStringInMiddle(text, 4, 0.0); // head of 3 code units would split a pair
    EXPECT_EQ(cut, u"\U0001D11E\u2026");
    std::u16string tailCut = TruncateUIStringInMiddle(u"abcdef\U0001D11E\U0001D11E", 4, 1.0);
    EXPECT_EQ(tailCut, u"\u2026\U0001D11E");
    // Valid UTF-16 in, valid UTF-16 out: no replacement characters appear in a round trip.
    for (std::size_t max = 1; max < text.size(); ++max) {
        std::u16string t = TruncateUIStringInMiddle(text, max, 0.5);
        EXPECT_EQ(orvcore::utility::UTF8to16(orvcore::utility::UTF16to8(t)), t) << max;
    }
}
