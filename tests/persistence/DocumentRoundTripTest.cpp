// Random workspaces saved, restored and saved again: into a fresh workspace the second document must
// equal the first, and into the same workspace every panel object must come back.
#include "workspace/WorkspaceDoubles.h"

#include "layout/LayoutManager.h"
#include "persistence/WorkspaceDocument.h"

#include <random>
#include <set>

using namespace orvtest;
using orvcore::proplist::PropList;
using orvui::ui::RectT;

namespace {

constexpr char const* Types[] = {"editor", "browser", "mixer", "scope", "notes"};

class DocumentRoundTrip : public WorkspaceTest {
protected:
    void SetUp() override {
        WorkspaceTest::SetUp();
        // One kind hides its panels when closed, one obliterates them but keeps their state.
        Register({"scope", {0.5f, 0.5f, 0.1f, 1}, true});
        Register({"notes", {0.1f, 0.5f, 0.5f, 1}, false, true, true});
    }

    static std::string Xml(PropList const& list) {
        std::string text;
        list.OutputAsXMLFragment(text);
        return text;
    }

    std::string Pick(std::mt19937& rng) { return Types[rng() % std::size(Types)]; }

    // Every tabbed frame of every window, shown or not.
    std::vector<WorkspaceFrame*> AllFrames() const {
        std::vector<WorkspaceFrame*> frames;
        for (TopLevelWindow* window : workspace->GetWindows()) {
            for (unsigned long f = 0; f < window->GetFrameCount(); ++f) {
                frames.push_back(window->GetFrame(f));
            }
        }
        return frames;
    }

    // Every panel the workspace holds: tabs, hidden tabs (of frames, of placeholders and of closed
    // windows) and static bars. Panels of one type may trade places; none may be lost or made.
    std::set<TabPanel*> AllPanels() const {
        std::set<TabPanel*> panels;
        for (WorkspaceFrame* frame : AllFrames()) {
            for (long t = 0; t < frame->GetTabCount(); ++t) {
                panels.insert(frame->GetTabPanel(t));
            }
            for (auto const& hidden : frame->HiddenTabs()) {
                panels.insert(hidden.get());
            }
        }
        for (TopLevelWindow* window : workspace->GetWindows()) {
            for (auto const& frame : window->HiddenFrames()) {
                for (auto const& hidden : frame->HiddenTabs()) {
                    panels.insert(hidden.get());
                }
            }
            for (auto side :
                 {LayoutManager::Top, LayoutManager::Left, LayoutManager::Bottom, LayoutManager::Right}) {
                if (window->HasStaticElement(side)) {
                    panels.insert(window->GetStaticElement(side));
                }
            }
        }
        for (auto const& record : workspace->GetRemovedWindowData()) {
            for (auto const& hidden : record->hiddenPanels) {
                panels.insert(hidden.get());
            }
        }
        return panels;
    }

    // A workspace made by a random series of what users do.
    void BuildRandomWorkspace(std::mt19937& rng) {
        main->CreateRootFrame(Pick(rng), true, true);
        int steps = 4 + int(rng() % 14);
        for (int step = 0; step < steps; ++step) {
            std::vector<WorkspaceFrame*> frames = AllFrames();
            WorkspaceFrame* frame = frames.empty() ? nullptr : frames[rng() % frames.size()];
            switch (rng() % 10) {
            case 0:
            case 1:
                if (frame) {
                    frame->GetTopLevelWindow()->AddTabbedFrame(frame, Pick(rng),
                                                               LayoutManager::InsertionType(rng() % 4));
                }
                break;
            case 2:
            case 3:
                if (frame) {
                    frame->AddTab(Pick(rng), rng() % 2 == 0);
                }
                break;
            case 4:
                if (frame && frame->GetTabCount() > 0) {
                    Painted(frame->GetTabPanel(long(rng() % frame->GetTabCount())))->state =
                        "state " + std::to_string(rng() % 1000);
                }
                break;
            case 5:
                // Closing a tab: hidden, obliterated with its state kept, or remembered by type.
                if (frame && frame->GetTabCount() > 0) {
                    workspace->RemoveTab(frame, long(rng() % frame->GetTabCount()), true, true);
                }
                break;
            case 6:
                // A closed panel remembered by type and state (kinds that hide keep their panel).
                if (std::string type = Pick(rng); frame && type != "scope") {
                    PropList state;
                    state.SetValue("state", "kept " + std::to_string(rng() % 100));
                    std::string text;
                    state.OutputAsXMLFragment(text);
                    frame->AddRemovedTabData(type, text);
                }
                break;
            case 7: {
                RectT rect(200 + int(rng() % 300), 150 + int(rng() % 200), 300 + int(rng() % 200),
                           200 + int(rng() % 150));
                auto floating = workspace->AddTopLevelWindow(false, &rect);
                floating->UI_Show(true);
                floating->CreateRootFrame(Pick(rng), true, true);
                break;
            }
            case 8: {
                // Bars belong to the main window; only its bars are restored.
                auto side = LayoutManager::InsertionType(rng() % 4);
                if (!main->HasStaticElement(side)) {
                    main->SetStaticElement(Pick(rng), side, true);
                }
                break;
            }
            case 9:
                if (frame && frame->GetTabCount() > 1) {
                    frame->BringTabToFront(long(rng() % frame->GetTabCount()));
                }
                break;
            }
        }
        // Now and then one window shows a single frame maximised.
        if (rng() % 3 == 0) {
            TopLevelWindow* window = workspace->GetWindows()[rng() % workspace->GetWindows().size()];
            if (window->GetFrameCount() > 1) {
                WorkspaceFrame* frame = window->GetFrame(rng() % window->GetFrameCount());
                window->GetLayoutManager()->SetMaximizedFrame(frame->GetLMFrame());
            }
        }
    }
};

} // namespace

TEST_F(DocumentRoundTrip, RandomWorkspacesComeBackExactlyAndKeepTheirPanels) {
    int placeholders = 0, maximised = 0, hidden = 0, floating = 0, bars = 0;
    for (unsigned seed = 1; seed <= 150; ++seed) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        std::mt19937 rng(seed);
        BuildRandomWorkspace(rng);
        PropList first;
        SaveWorkspace(*workspace, first, u"Random");
        std::string text = Xml(first);
        placeholders += text.find("<key>FrameProxy</key>") != std::string::npos;
        maximised += text.find("<key>MaxFramePath</key>") != std::string::npos;
        hidden += text.find("<key>ReanimTabs</key>") != std::string::npos;
        floating += text.find("<key>TopLevelFrame-1</key>") != std::string::npos;
        bars += text.find("BarTabType") != std::string::npos;

        // The same workspace: nothing new is made and nothing is lost.
        std::set<TabPanel*> before = AllPanels();
        ASSERT_TRUE(RestoreWorkspace(*workspace, first, true, true, false));
        PropList same;
        SaveWorkspace(*workspace, same, u"Random");
        EXPECT_TRUE(first == same) << "first:\n" << text << "\nagain:\n" << Xml(same);
        std::set<TabPanel*> after = AllPanels();
        EXPECT_EQ(before, after);

        // A fresh workspace, as after a restart.
        CloseWindows();
        Desktop::Reset();
        SetUp();
        ASSERT_TRUE(RestoreWorkspace(*workspace, first, true, true, false));
        PropList fresh;
        SaveWorkspace(*workspace, fresh, u"Random");
        EXPECT_TRUE(first == fresh) << "first:\n" << text << "\nfresh:\n" << Xml(fresh);

        CloseWindows();
        Desktop::Reset();
        SetUp();
        if (HasFailure()) {
            break;
        }
    }
    // The seeds cover what the documents can hold.
    EXPECT_GT(placeholders, 0);
    EXPECT_GT(maximised, 0);
    EXPECT_GT(hidden, 0);
    EXPECT_GT(floating, 0);
    EXPECT_GT(bars, 0);
}
