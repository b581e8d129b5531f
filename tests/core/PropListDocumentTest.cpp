// The XML form of property lists: exact bytes, faithful round trips, and refusal of bad documents
// without touching the caller's list.
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/PropListUtils.h"
#include "support/FileSizeLimit.h"
#include "support/TempDir.h"

#include <algorithm>
#include <cfloat>
#include <climits>
#include <cmath>
#include <gtest/gtest.h>

using orvcore::config::Error;
using orvcore::proplist::PropList;
using namespace orvcore::proplist::utils;
using orvtest::TempDir;
namespace fs = std::filesystem;

namespace {

PropList RoundTrip(PropList const& list) {
    std::string xml;
    list.OutputAsXMLFragment(xml);
    PropList back;
    ReadPropList(xml, back);
    return back;
}

// Every value kind, extremes included, nested two levels.
PropList EveryKind() {
    PropList list;
    list.SetValue("utf8", "Gr\xC3\xBC\xC3\x9F"
                          "e \xF0\x9F\x8E\xAC");
    list.SetValue("utf16", u"\u65E5\u672C");
    list.SetValue("empty", "");
    list.SetByteString("bytes", std::string("\x01\x7F\xFE\xFF", 4));
    list.SetValue("intMin", std::int32_t(INT32_MIN));
    list.SetValue("intMax", std::int32_t(INT32_MAX));
    list.SetValue("uintMax", std::uint32_t(UINT32_MAX));
    list.SetValue("float", 4.5f);
    list.SetValue("double", -0.015625);
    list.SetValue("huge", DBL_MAX > 1e308 ? 1.79769e308 : 0.0);
    list.SetValue("yes", true);
    list.SetValue("no", false);
    list.SetValue("ints", std::vector<std::int32_t>{0, -1, INT32_MAX});
    list.SetValue("noInts", std::vector<std::int32_t>{});
    list.SetValue("names8", std::vector<std::string>{"a", "", "<&>"});
    list.SetValue("names16", std::vector<std::u16string>{u"\u00E9", u" "});
    PropList* sub = list.NewSubList("sub");
    sub->SetValue("depth", 1);
    sub->NewSubList("deeper")->SetValue("depth", 2);
    list.NewSubList("emptySub");
    return list;
}

Error CatchError(std::function<void()> const& f) {
    try {
        f();
    } catch (Error const& e) {
        return e;
    }
    ADD_FAILURE() << "no error was raised";
    return Error(0, "", 0, 0, false, u"");
}

} // namespace

TEST(PropListDocument, ExactBytesOfASmallDocument) {
    PropList list;
    list.SetValue("b", 1);
    list.SetValue("B", "x<&>'\"");
    list.SetValue("a", true);
    list.SetValue("f", 4.5f);
    list.SetValue("d", 19.0);
    list.SetValue("u", std::uint32_t(3));
    list.NewSubList("n");
    std::string expected =
        "<?xml version='1.0'?>\r\n"
        "<prop.map version='4'>\r\n"
        "<prop.list>\r\n"
        "<prop.pair>\r\n<key>B</key>\r\n<ustring>x&lt;&amp;&gt;'\"</ustring>\r\n</prop.pair>\r\n"
        "<prop.pair>\r\n<key>a</key>\r\n<true/>\r\n</prop.pair>\r\n"
        "<prop.pair>\r\n<key>b</key>\r\n<int type='signed' size='32'>1</int>\r\n</prop.pair>\r\n"
        "<prop.pair>\r\n<key>d</key>\r\n<double>19</double>\r\n</prop.pair>\r\n"
        "<prop.pair>\r\n<key>f</key>\r\n<float>4.5</float>\r\n</prop.pair>\r\n"
        "<prop.pair>\r\n<key>n</key>\r\n<prop.list>\r\n</prop.list>\r\n</prop.pair>\r\n"
        "<prop.pair>\r\n<key>u</key>\r\n<int type='unsigned' size='32'>3</int>\r\n</prop.pair>\r\n"
        "</prop.list>\r\n"
        "</prop.map>\r\n";
    EXPECT_EQ(DocumentText(list), expected);

    TempDir tmp;
    SavePropList(tmp.U16("doc.xml"), list);
    EXPECT_EQ(orvtest::ReadFile(tmp.Path() / "doc.xml"), expected);
}

TEST(PropListDocument, ListKindsHaveTheirOwnElements) {
    PropList list;
    list.SetValue("i", std::vector<std::int32_t>{1, -2});
    list.SetValue("s", std::vector<std::string>{"x"});
    list.SetValue("w", std::vector<std::u16string>{});
    std::string xml;
    list.OutputAsXMLFragment(xml);
    EXPECT_EQ(xml,
              "<prop.list>\r\n"
              "<prop.pair>\r\n<key>i</key>\r\n<array type='int32'>\r\n"
              "<int type='signed' size='32'>1</int>\r\n<int type='signed' size='32'>-2</int>\r\n"
              "</array>\r\n</prop.pair>\r\n"
              "<prop.pair>\r\n<key>s</key>\r\n<array type='utf8'>\r\n<ustring>x</ustring>\r\n</array>\r\n"
              "</prop.pair>\r\n"
              "<prop.pair>\r\n<key>w</key>\r\n<array type='utf16'>\r\n</array>\r\n</prop.pair>\r\n"
              "</prop.list>\r\n");
}

TEST(PropListDocument, RealNumbersUseSixSignificantDigits) {
    PropList list;
    list.SetValue("a", 4.5);
    list.SetValue("b", 19.0f);
    list.SetValue("c", DBL_MAX);
    list.SetValue("d", 1.0 / 3.0);
    list.SetValue("e", 1234567.0);
    list.SetValue("f", 0.1f);
    list.SetValue("g", -0.0);
    std::string xml;
    list.OutputAsXMLFragment(xml);
    for (char const* text : {"<double>4.5</double>", "<float>19</float>", "<double>1.79769e+308</double>",
                             "<double>0.333333</double>", "<double>1.23457e+06</double>",
                             "<float>0.1</float>", "<double>-0</double>"}) {
        EXPECT_NE(xml.find(text), std::string::npos) << text << " not in\n" << xml;
    }
    PropList back = RoundTrip(list);
    double d = 0;
    EXPECT_TRUE(back.GetValue("d", d));
    EXPECT_EQ(d, 0.333333);
    EXPECT_TRUE(back.GetValue("c", d));
    EXPECT_EQ(d, 1.79769e308);
}

TEST(PropListDocument, ExtremeRealsReadBackInsteadOfBreakingTheDocument) {
    PropList list;
    list.SetValue("inf", HUGE_VAL);
    list.SetValue("ninf", -HUGE_VALF);
    list.SetValue("tinyDouble", 4.9406564584124654e-324);
    list.SetValue("tinyFloat", 1e-40f);
    PropList back = RoundTrip(list);
    double d = 0;
    float f = 1;
    EXPECT_TRUE(back.GetValue("inf", d));
    EXPECT_EQ(d, HUGE_VAL);
    EXPECT_TRUE(back.GetValue("ninf", f));
    EXPECT_EQ(f, -HUGE_VALF);
    EXPECT_TRUE(back.GetValue("tinyDouble", d));
    EXPECT_GT(d, 0.0);
    EXPECT_LT(d, 1e-300);
    EXPECT_TRUE(back.GetValue("tinyFloat", f));
    EXPECT_NEAR(f, 1e-40f, 1e-44f);
}

TEST(PropListDocument, EveryKindSurvivesFragmentAndFile) {
    PropList list = EveryKind();
    EXPECT_EQ(RoundTrip(list), list);

    TempDir tmp;
    SavePropList(tmp.U16("all.xml"), list);
    PropList loaded;
    loaded.SetValue("stale", 1);
    ASSERT_TRUE(LoadPropList(tmp.U16("all.xml"), loaded, true));
    EXPECT_EQ(loaded, list);
    EXPECT_EQ(loaded.KindOf("utf16"), PropList::Kind::String);
    EXPECT_EQ(loaded.KindOf("names16"), PropList::Kind::String16List);
    EXPECT_EQ(loaded.KindOf("bytes"), PropList::Kind::ByteString);
}

TEST(PropListDocument, AwkwardTextReadsBackExactly) {
    std::vector<std::string> texts = {
        "line one\r\nline two\nline three\rend",
        "   ",
        "\t",
        "\r\n",
        " leading and trailing ",
        "quotes ' \" and <tags> & ampersands &amp; &#38;",
        std::string("nul \0 inside", 12),
        "\x01\x02\x1F control",
        "]]> end of CDATA",
        "<?xml version='1.0'?><prop.map version='4'></prop.map>",
        "\xE2\x80\xA8 \xEF\xBB\xBF \xF0\x9F\x98\x80",
        "invalid utf-8 \xFF\xC0 kept as bytes",
    };
    PropList list;
    for (std::size_t i = 0; i < texts.size(); ++i) {
        list.SetValue("t" + std::to_string(i), texts[i]);
        list.SetValue(texts[i], std::int32_t(i)); // the same texts as keys
    }
    PropList back = RoundTrip(list);
    ASSERT_EQ(back, list);
    for (std::size_t i = 0; i < texts.size(); ++i) {
        std::string out;
        EXPECT_TRUE(back.GetValue("t" + std::to_string(i), out));
        EXPECT_EQ(out, texts[i]) << "text " << i;
    }
}

TEST(PropListDocument, FragmentsNestInsideTextValues) {
    // A panel's state is stored as the fragment text of its own list inside the workspace
    // document, which is itself stored inside the closed-window memory.
    PropList state = EveryKind();
    std::string stateText;
    state.OutputAsXMLFragment(stateText);
    PropList window;
    window.SetValue("VisTabState-0", stateText);
    std::string windowText;
    window.OutputAsXMLFragment(windowText);
    PropList doc;
    doc.SetValue("windowXml", windowText);

    TempDir tmp;
    SavePropList(tmp.U16("nested.xml"), doc);
    PropList loaded;
    ASSERT_TRUE(LoadPropList(tmp.U16("nested.xml"), loaded, true));
    std::string text;
    ASSERT_TRUE(loaded.GetValue("windowXml", text));
    EXPECT_EQ(text, windowText);
    PropList windowBack, stateBack;
    ReadPropList(text, windowBack);
    ASSERT_TRUE(windowBack.GetValue("VisTabState-0", text));
    ReadPropList(text, stateBack);
    EXPECT_EQ(stateBack, state);
}

TEST(PropListDocument, ReadPropListAcceptsAWholeDocument) {
    PropList list = EveryKind();
    PropList back;
    ReadPropList(DocumentText(list), back);
    EXPECT_EQ(back, list);
}

TEST(PropListDocument, HandWrittenDocumentsReadAsExpected) {
    PropList list;
    ASSERT_TRUE(LoadPropList(TempDir::PathU16(fs::path(ORV_TEST_DATA_DIR) / "proplist" / "handwritten.xml"),
                             list, true));
    std::string name;
    EXPECT_TRUE(list.GetValue("Name", name));
    EXPECT_EQ(name, "Edit <1> & \"Colour\"");
    std::int32_t count = 0;
    EXPECT_TRUE(list.GetValue("Count", count));
    EXPECT_EQ(count, -12);
    std::uint32_t flags = 0;
    EXPECT_TRUE(list.GetValue("Flags", flags));
    EXPECT_EQ(flags, 4000000000u);
    std::vector<std::int32_t> rect;
    EXPECT_TRUE(list.GetValue("SzPos", rect));
    EXPECT_EQ(rect, (std::vector<std::int32_t>{0, 0, 1280, 800}));
    ASSERT_NE(list.GetSubList("Sub"), nullptr);
    bool vis = false;
    EXPECT_TRUE(list.GetSubList("Sub")->GetValue("Vis", vis));
    EXPECT_TRUE(vis);
}

TEST(PropListDocument, EveryMalformedDocumentIsRefusedAndNamed) {
    fs::path folder = fs::path(ORV_TEST_DATA_DIR) / "proplist" / "malformed";
    int seen = 0;
    for (auto const& entry : fs::directory_iterator(folder)) {
        ++seen;
        PropList list;
        list.SetValue("keep", "me");
        PropList before = list;
        std::u16string path = TempDir::PathU16(entry.path());
        Error e = CatchError([&] { LoadPropList(path, list, true); });
        EXPECT_EQ(e.Facility(), 110) << entry.path();
        EXPECT_EQ(e.Code(), 20) << entry.path() << ": " << e.what();
        EXPECT_NE(e.Message().find(path), std::u16string::npos) << e.what();
        EXPECT_EQ(list, before) << entry.path();
        EXPECT_FALSE(LoadPropList(path, list, false));
        EXPECT_EQ(list, before);
    }
    EXPECT_GE(seen, 15);
}

TEST(PropListDocument, TruncationAtAnyByteIsRefused) {
    std::string doc = DocumentText(EveryKind());
    std::size_t end = doc.rfind("</prop.map>");
    for (std::size_t cut = 0; cut < end; ++cut) {
        PropList list;
        EXPECT_THROW(ParseDocument(doc.substr(0, cut), list, u"cut"), Error) << "cut at " << cut;
        EXPECT_TRUE(list.IsEmpty());
    }
}

TEST(PropListDocument, NestingIsLimited) {
    auto nested = [](int depth) {
        std::string xml;
        for (int i = 1; i < depth; ++i) {
            xml += "<prop.list><prop.pair><key>k</key>";
        }
        xml += "<prop.list></prop.list>";
        for (int i = 1; i < depth; ++i) {
            xml += "</prop.pair></prop.list>";
        }
        return xml;
    };
    PropList list;
    ReadPropList(nested(MaxNestingDepth), list);
    EXPECT_FALSE(list.IsEmpty());
    PropList deep;
    Error e = CatchError([&] { ReadPropList(nested(MaxNestingDepth + 1), deep); });
    EXPECT_NE(std::string(e.what()).find("deeper"), std::string::npos) << e.what();
    EXPECT_TRUE(deep.IsEmpty());
    // Far beyond the limit: refused the same way, and the stack is never at risk.
    EXPECT_THROW(ReadPropList(nested(100000), deep), Error);
}

TEST(PropListDocument, HugeAndMissingFilesAreRefusedWithoutReading) {
    TempDir tmp;
    fs::path huge = tmp.Path() / "huge.xml";
    { std::ofstream(huge) << "<prop.map><prop.list><prop.pair><key>k</key><ustring>"; }
    fs::resize_file(huge, std::uintmax_t(2) << 30); // a sparse 2 GB file: one endless line
    PropList list;
    Error e = CatchError([&] { LoadPropList(TempDir::PathU16(huge), list, true); });
    EXPECT_EQ(e.Code(), 21);
    EXPECT_NE(std::string(e.what()).find("limit"), std::string::npos) << e.what();
    e = CatchError([&] { LoadPropList(tmp.U16("absent.xml"), list, true); });
    EXPECT_EQ(e.Code(), 21);
    EXPECT_FALSE(LoadPropList(tmp.U16("absent.xml"), list, false));
    EXPECT_TRUE(list.IsEmpty());
}

TEST(PropListDocument, FragmentsMustBeLists) {
    PropList list;
    EXPECT_THROW(ReadPropList("", list), Error);
    EXPECT_THROW(ReadPropList("<ustring>x</ustring>", list), Error);
    EXPECT_THROW(ReadPropList("<prop.list></prop.list><prop.list></prop.list>", list), Error);
    EXPECT_THROW(ParseDocument("<prop.list></prop.list>", list, u"doc"), Error); // a document needs its map
    ReadPropList("<prop.list>\r\n</prop.list>\r\n", list);
    EXPECT_TRUE(list.IsEmpty());
}

TEST(PropListDocument, KeysOutOfOrderAreSortedAndRepeatsRefused) {
    // Written by another tool: keys in descending order, many of them.
    std::string xml = "<prop.list>";
    for (int i = 20000; i > 0; --i) {
        xml += "<prop.pair><key>k" + std::to_string(i) + "</key><int>" + std::to_string(i) +
               "</int></prop.pair>";
    }
    xml += "</prop.list>";
    PropList list;
    ReadPropList(xml, list);
    ASSERT_EQ(list.Size(), 20000u);
    std::vector<std::string> keys = list.Keys();
    EXPECT_TRUE(std::is_sorted(keys.begin(), keys.end()));
    std::int32_t v = 0;
    EXPECT_TRUE(list.GetValue("k777", v));
    EXPECT_EQ(v, 777);
    std::string repeated = "<prop.list><prop.pair><key>b</key><true/></prop.pair>"
                           "<prop.pair><key>a</key><true/></prop.pair>"
                           "<prop.pair><key>b</key><false/></prop.pair></prop.list>";
    Error e = CatchError([&] { ReadPropList(repeated, list); });
    EXPECT_NE(std::string(e.what()).find("'b' occurs twice"), std::string::npos) << e.what();
    EXPECT_EQ(list.Size(), 20000u);
}

TEST(PropListDocument, FailedSaveKeepsThePreviousDocument) {
    TempDir tmp;
    PropList small;
    small.SetValue("v", 1);
    SavePropList(tmp.U16("doc.xml"), small);
    PropList big;
    big.SetValue("text", std::string(100000, 'x'));
    bool raised = false;
    ASSERT_TRUE(orvtest::WithFileSizeLimit(4096, [&] {
        try {
            SavePropList(tmp.U16("doc.xml"), big);
        } catch (Error const&) {
            raised = true;
        }
    }));
    EXPECT_TRUE(raised);
    PropList back;
    ASSERT_TRUE(LoadPropList(tmp.U16("doc.xml"), back, true));
    EXPECT_EQ(back, small);
}
