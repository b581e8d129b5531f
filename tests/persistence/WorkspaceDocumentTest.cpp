// The workspace document: its exact keys, restoring into the same or a fresh workspace, versions,
// frames without creators, the maximised path, window reuse, and documents built to hurt.
#include "workspace/WorkspaceDoubles.h"

#include "host/core/Error.h"
#include "host/core/PropListUtils.h"
#include "host/ui/MonitorInfo.h"
#include "layout/Splitter.h"
#include "persistence/WorkspaceDocument.h"

using namespace orvtest;
using orvcore::proplist::PropList;
using orvui::ui::RectT;

namespace {

class WorkspaceDocument : public WorkspaceTest {
protected:
    static std::string Xml(PropList const& list) {
        std::string text;
        list.OutputAsXMLFragment(text);
        return text;
    }
};

} // namespace

// The state text a painted panel saves.
std::string StateText(std::string const& state) {
    PropList list;
    list.SetValue("state", state);
    std::string text;
    list.OutputAsXMLFragment(text);
    return text;
}

TEST_F(WorkspaceDocument, ASmallWorkspaceIsWrittenKeyByKey) {
    BuildTwoFrames();
    right->AddTab("mixer", true);
    Painted(right->GetTabPanel(0))->state = "bookmarks";
    right->AddRemovedTabData("scope", "<prop.list/>");
    PropList doc;
    SaveWorkspace(*workspace, doc, u"Editing");

    PropList expected;
    expected.SetValue("ORV_Wrkspce", std::string("1.2"));
    expected.SetValue("UserName", std::u16string(u"Editing"));
    workspace->ORV_GetMonitorInfo()->SaveToPropList(*expected.NewSubList("MonitorInfo"));
    expected.SetValue("SerCfgMax", std::int32_t(1));
    PropList* window = expected.NewSubList("TopLevelFrame-0");
    RectT outer = main->UI_GetGlobalStructureRect();
    window->SetValue("SzPos", std::vector<std::int32_t>{outer.left, outer.top, outer.width, outer.height});
    main->SaveWindowStateData(*window->NewSubList("WinState"));
    for (char const* key : {"HasToolBar", "HasLeftBar", "HasRightBar", "HasStatBar"}) {
        window->SetValue(key, false);
    }
    // The root splitter holds the vertical split of the two frames on its left or top side.
    PropList* root = window->NewSubList("Splitter");
    root->SetValue("Orient", false);
    root->SetValue("Place", 0.5f);
    root->SetValue("Sub1Vis", true);
    root->SetValue("Sub2Vis", false);
    PropList* split = root->NewSubList("Sub1")->NewSubList("Splitter");
    split->SetValue("Orient", true);
    split->SetValue("Place",
                    AsSplitter(main->GetLayoutManager()->GetRootSplitter()->GetLeftOrTop())->GetPlacement());
    split->SetValue("Sub1Vis", true);
    split->SetValue("Sub2Vis", true);
    PropList* editor = split->NewSubList("Sub1")->NewSubList("Frame");
    editor->SetValue("Vis", true);
    editor->SetValue("CurrTab", std::int32_t(0));
    editor->SetValue("TabIDs", std::vector<std::string>{"editor"});
    editor->SetValue("VisTabState-0", StateText("fresh"));
    PropList* tabs = split->NewSubList("Sub2")->NewSubList("Frame");
    tabs->SetValue("Vis", true);
    tabs->SetValue("CurrTab", std::int32_t(1));
    tabs->SetValue("TabIDs", std::vector<std::string>{"browser", "mixer"});
    tabs->SetValue("VisTabState-0", StateText("bookmarks"));
    tabs->SetValue("VisTabState-1", StateText("fresh"));
    tabs->SetValue("ReanimTabs", std::vector<std::string>{"scope"});
    tabs->SetValue("HidTabState-0", std::string("<prop.list/>"));

    expected.NewSubList("WSInstanceData")->SetValue("FrameReanimMax", std::int32_t(0));

    EXPECT_TRUE(doc == expected) << Xml(doc) << "\n-- expected --\n" << Xml(expected);
    EXPECT_EQ(GetWorkspaceUserName(doc), u"Editing");
    EXPECT_TRUE(IsCompatibleVersion(doc));
}

TEST_F(WorkspaceDocument, RestoringIntoTheSameWorkspaceReusesEveryPanel) {
    BuildTwoFrames();
    TabPanel* mixer = right->AddTab("mixer", true);
    right->BringTabToFront(0L);
    WorkspaceFrame* bottom = main->AddTabbedFrame(left, "mixer", LayoutManager::Bottom);
    Painted(bottom->GetFrontTabPanel())->state = "bus 2";
    TabPanel* editor = left->GetFrontTabPanel();
    PropList before;
    SaveWorkspace(*workspace, before, u"");

    ASSERT_TRUE(RestoreWorkspace(*workspace, before, true, true, false));
    PropList after;
    SaveWorkspace(*workspace, after, u"");
    EXPECT_TRUE(before == after) << Xml(after);
    // The same panel objects, in their old places.
    ASSERT_EQ(main->GetFrameCount(), 3u);
    std::vector<TabPanel*> panels;
    for (unsigned long f = 0; f < main->GetFrameCount(); ++f) {
        for (long t = 0; t < main->GetFrame(f)->GetTabCount(); ++t) {
            panels.push_back(main->GetFrame(f)->GetTabPanel(t));
        }
    }
    EXPECT_NE(std::find(panels.begin(), panels.end(), editor), panels.end());
    EXPECT_NE(std::find(panels.begin(), panels.end(), mixer), panels.end());
    EXPECT_EQ(editor->GetFrame()->GetTopLevelWindow(), main);
}

TEST_F(WorkspaceDocument, AFreshWorkspaceRestoresTheSameDocument) {
    BuildTwoFrames();
    right->AddTab("mixer", true);
    Painted(right->GetTabPanel(1))->state = "solo";
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    floating->UI_Show(true);
    floating->CreateRootFrame("browser", true, true);
    PropList doc;
    SaveWorkspace(*workspace, doc, u"Mixing");

    CloseWindows();
    Desktop::Reset();
    SetUp();
    ASSERT_TRUE(RestoreWorkspace(*workspace, doc, true, true, false));
    PropList again;
    SaveWorkspace(*workspace, again, u"Mixing");
    EXPECT_TRUE(doc == again) << Xml(again);
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    EXPECT_EQ(Painted(workspace->GetWindows()[0]->GetFrame(1)->GetTabPanel(1))->state, "solo");
}

TEST_F(WorkspaceDocument, OtherVersionsAreRefusedAndChangeNothing) {
    BuildTwoFrames();
    PropList doc;
    SaveWorkspace(*workspace, doc, u"");
    main->AddTabbedFrame(right, "mixer", LayoutManager::Bottom);
    PropList now;
    SaveWorkspace(*workspace, now, u"");

    auto code = [&](PropList const& list) {
        try {
            RestoreWorkspace(*workspace, list, true, true, false);
        } catch (orvcore::config::Error const& e) {
            return e.Facility() * 1000 + e.Code();
        }
        return 0;
    };
    for (char const* version : {"1.20", "1.1", ""}) {
        PropList other = doc;
        other.SetValue("ORV_Wrkspce", std::string(version));
        EXPECT_EQ(code(other), 102023) << version;
        EXPECT_FALSE(IsCompatibleVersion(other));
    }
    PropList none = doc;
    none.RemoveValue("ORV_Wrkspce");
    EXPECT_EQ(code(none), 102022);
    EXPECT_FALSE(IsCompatibleVersion(none));
    EXPECT_EQ(GetWorkspaceUserName(none), u"");

    PropList unchanged;
    SaveWorkspace(*workspace, unchanged, u"");
    EXPECT_TRUE(unchanged == now);
    EXPECT_EQ(orvworkspace::config::GetVersionString(), u"2.0.0.420171");
}

TEST_F(WorkspaceDocument, FrontTabsAreClampedAndFramesWithoutCreatorsGiveWay) {
    BuildTwoFrames();
    right->AddTabs(std::vector<std::string>{"mixer", "editor"});
    PropList doc;
    SaveWorkspace(*workspace, doc, u"");
    PropList* split =
        doc.GetSubList("TopLevelFrame-0")->GetSubList("Splitter")->GetSubList("Sub1")->GetSubList("Splitter");
    split->GetSubList("Sub2")->GetSubList("Frame")->SetValue("CurrTab", std::int32_t(7));
    PropList* gone = split->GetSubList("Sub1")->GetSubList("Frame");
    gone->SetValue("TabIDs", std::vector<std::string>{"unknown", "also unknown"});

    ASSERT_TRUE(RestoreWorkspace(*workspace, doc, true, false, false));
    ASSERT_EQ(main->GetFrameCount(), 1u);
    WorkspaceFrame* kept = main->GetFrame(0);
    EXPECT_EQ(kept->GetTabCount(), 3);
    EXPECT_EQ(kept->GetFrontTabIndex(), 2);
    EXPECT_FALSE(main->HasReanimatableFrames());

    // With remembered tabs, a placeholder keeps the dropped frame's place, its side hidden.
    gone->SetValue("ReanimTabs", std::vector<std::string>{"browser"});
    gone->SetValue("HidTabState-0", StateText("history"));
    ASSERT_TRUE(RestoreWorkspace(*workspace, doc, true, false, false));
    EXPECT_EQ(main->GetFrameCount(), 1u);
    ASSERT_TRUE(main->CanReanimateFrame("browser"));
    ASSERT_TRUE(main->ReanimateFrame("browser"));
    EXPECT_EQ(main->GetFrameCount(), 2u);
}

TEST_F(WorkspaceDocument, TheMaximisedFrameIsFoundByItsPathBothWays) {
    BuildTwoFrames();
    Splitter* root = main->GetLayoutManager()->GetRootSplitter();
    EXPECT_EQ(GetMaximizedFramePath(left->GetLMFrame()), "00");
    EXPECT_EQ(GetMaximizedFramePath(right->GetLMFrame()), "01");
    EXPECT_EQ(FindFrameByPath("00", root), left->GetLMFrame());
    EXPECT_EQ(FindFrameByPath("01", root), right->GetLMFrame());
    EXPECT_EQ(FindFrameByPath("0", root), nullptr); // a splitter, not a frame
    EXPECT_EQ(FindFrameByPath("1", root), nullptr); // nothing there
    EXPECT_EQ(FindFrameByPath("02", root), nullptr);
    EXPECT_EQ(FindFrameByPath("", root), nullptr);
    EXPECT_EQ(FindFrameByPath("000", root), nullptr);

    main->GetLayoutManager()->SetMaximizedFrame(right->GetLMFrame());
    PropList doc;
    SaveWorkspace(*workspace, doc, u"");
    std::string path;
    ASSERT_TRUE(doc.GetSubList("TopLevelFrame-0")->GetValue("MaxFramePath", path));
    EXPECT_EQ(path, "01");
    ASSERT_TRUE(RestoreWorkspace(*workspace, doc, true, false, false));
    EXPECT_FALSE(main->GetLayoutManager()->HasMaximizedFrame());
    ASSERT_TRUE(RestoreWorkspace(*workspace, doc, true, true, false));
    Frame* maximised = main->GetLayoutManager()->GetMaximizedFrame();
    ASSERT_NE(maximised, nullptr);
    EXPECT_EQ(GetMaximizedFramePath(maximised), "01");
}

TEST_F(WorkspaceDocument, WindowsAreReusedInOrderAndTheRestRemovedOrMade) {
    BuildTwoFrames();
    auto second = workspace->AddTopLevelWindow(false, nullptr);
    second->CreateRootFrame("mixer", true, true);
    PropList two;
    SaveWorkspace(*workspace, two, u"");
    auto third = workspace->AddTopLevelWindow(false, nullptr);
    third->CreateRootFrame("browser", true, true);
    ASSERT_EQ(workspace->GetWindows().size(), 3u);

    ASSERT_TRUE(RestoreWorkspace(*workspace, two, true, false, false));
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    EXPECT_EQ(workspace->GetWindows()[1], second.get());

    // Three saved windows into one: two are made.
    auto extra = workspace->AddTopLevelWindow(false, nullptr);
    extra->CreateRootFrame("editor", true, true);
    PropList three;
    SaveWorkspace(*workspace, three, u"");
    workspace->RemoveWindow(extra.get(), false);
    workspace->RemoveWindow(second.get(), false);
    ASSERT_EQ(workspace->GetWindows().size(), 1u);
    ASSERT_TRUE(RestoreWorkspace(*workspace, three, true, false, false));
    ASSERT_EQ(workspace->GetWindows().size(), 3u);
    EXPECT_EQ(workspace->GetWindows()[2]->GetRootFrame()->GetFrontTabPanel()->GetTabType(), "editor");
}

TEST_F(WorkspaceDocument, TheFirstWindowCanBeToldWhereToOpen) {
    BuildTwoFrames();
    workspace->AddTopLevelWindow(false, nullptr)->CreateRootFrame("mixer", true, true);
    PropList doc;
    SaveWorkspace(*workspace, doc, u"");
    PropList second = *doc.GetSubList("TopLevelFrame-1");
    SetMainWindowGlobalRect(doc, RectT(40, 30, 900, 600));
    PropList const* first = doc.GetSubList("TopLevelFrame-0");
    std::vector<std::int32_t> sz;
    ASSERT_TRUE(first->GetValue("SzPos", sz));
    EXPECT_EQ(sz, (std::vector<std::int32_t>{40, 30, 900, 600}));
    EXPECT_FALSE(first->HasKey("WinState"));
    EXPECT_TRUE(*doc.GetSubList("TopLevelFrame-1") == second);
    std::int32_t count = 0;
    EXPECT_TRUE(doc.GetValue("SerCfgMax", count) && count == 2);

    ASSERT_TRUE(RestoreWorkspace(*workspace, doc, true, false, false));
    EXPECT_EQ(main->UI_GetGlobalStructureRect(), RectT(40, 30, 900, 600));

    PropList empty;
    EXPECT_THROW(SetMainWindowGlobalRect(empty, RectT(0, 0, 10, 10)), orvcore::config::Error);
    empty.SetValue("ORV_Wrkspce", std::string("1.2"));
    EXPECT_THROW(SetMainWindowGlobalRect(empty, RectT(0, 0, 10, 10)), orvcore::config::Error);
}

TEST_F(WorkspaceDocument, HostileDocumentsRestoreWithoutHarm) {
    BuildTwoFrames();
    PropList doc;
    SaveWorkspace(*workspace, doc, u"");
    // Splitters nested far deeper than any screen could show (as deep as a read document may go).
    PropList* window = doc.GetSubList("TopLevelFrame-0");
    PropList* level = window->NewSubList("Splitter");
    for (int i = 0; i < 250; ++i) {
        level->SetValue("Sub1Vis", true);
        level = level->NewSubList("Sub1")->NewSubList("Splitter");
    }
    // Wrong kinds and missing keys everywhere else.
    doc.SetValue("SerCfgMax", std::int32_t(3));
    PropList* odd = doc.NewSubList("TopLevelFrame-1");
    odd->SetValue("SzPos", std::string("not a rectangle"));
    odd->NewSubList("Splitter")
        ->NewSubList("Sub2")
        ->NewSubList("Frame")
        ->SetValue("TabIDs", std::string("editor"));
    ASSERT_TRUE(RestoreWorkspace(*workspace, doc, true, true, true));
    EXPECT_EQ(workspace->GetWindows().size(), 1u);
    EXPECT_EQ(main->GetFrameCount(), 0u);
}

TEST_F(WorkspaceDocument, StaticBarsAreSavedByTypeAndPanelsNobodyNamesAreOrphaned) {
    BuildTwoFrames();
    main->SetStaticElement("mixer", LayoutManager::Top, true);
    PropList doc;
    SaveWorkspace(*workspace, doc, u"");
    PropList const* window = doc.GetSubList("TopLevelFrame-0");
    bool has = false;
    std::string type;
    ASSERT_TRUE(window->GetValue("HasToolBar", has) && has);
    ASSERT_TRUE(window->GetValue("ToolBarTabType", type));
    EXPECT_EQ(type, "mixer");
    EXPECT_FALSE(window->HasKey("StatBarTabType"));
    // Only the two tabbed frames are in the tree.
    std::string xml = Xml(*window);
    std::size_t frames = 0;
    for (std::size_t at = xml.find("<key>Frame</key>"); at != std::string::npos;
         at = xml.find("<key>Frame</key>", at + 1)) {
        ++frames;
    }
    EXPECT_EQ(frames, 2u);

    // A document without the browser frame: the browser panel is orphaned, while the bar keeps
    // its panel (bars come through the pool like tabs).
    TabPanel* bar = main->GetStaticElement(LayoutManager::Top);
    PropList* split =
        doc.GetSubList("TopLevelFrame-0")->GetSubList("Splitter")->GetSubList("Sub1")->GetSubList("Splitter");
    split->RemoveValue("Sub2");
    split->SetValue("Sub2Vis", false);
    workspace->log.clear();
    ASSERT_TRUE(RestoreWorkspace(*workspace, doc, true, false, false));
    EXPECT_EQ(workspace->log, (std::vector<std::string>{"pre-orphaning browser", "orphaning browser"}));
    EXPECT_EQ(main->GetFrameCount(), 1u);
    ASSERT_TRUE(main->HasStaticElement(LayoutManager::Top));
    EXPECT_EQ(main->GetStaticElement(LayoutManager::Top), bar);
    EXPECT_EQ(bar->GetTabType(), "mixer");
}
