// The demo's headless tour, step by step on the headless desktop: every step leaves a snapshot, the
// arrangement changes as the step says, and the final document holds what the screen shows.
#include "DemoHost.h"
#include "Tour.h"

#include "frames/WorkspaceFrame.h"
#include "host/core/PropList.h"
#include "host/core/PropListUtils.h"
#include "host/ui/Desktop.h"
#include "support/SnapshotOnFailure.h"
#include "support/TempDir.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/WorkspaceUtils.h"

#include <cstdlib>
#include <fstream>
#include <gtest/gtest.h>
#include <sstream>

using orvcore::proplist::PropList;
using orvtest::TempDir;
using orvworkspace::workspace::LayoutManager;
using orvworkspace::workspace::TabPanel;

namespace {

// Frames in a saved window list, placeholders of closed frames not counted.
int FramesIn(PropList const& list) {
    int frames = 0;
    for (std::string const& key : list.Keys()) {
        if (PropList const* sub = list.GetSubList(key)) {
            frames += (key == "Frame") + FramesIn(*sub);
        }
    }
    return frames;
}

class DemoTour : public orvtest::DesktopScenario {
protected:
    void SetUp() override {
        setenv("ORV_PREFS_DIR", (out.Path() / "prefs").c_str(), 1);
        std::filesystem::create_directories(out.Path() / "prefs");
        orvtest::DesktopScenario::SetUp();
        orvui::ui::Desktop::Get().SetMonitors({orvdemo::DemoApp::Monitor});
        std::string shipped = ORVDEMO_WORKSPACES_DIR;
        app = std::make_unique<orvdemo::DemoApp>(std::u16string(shipped.begin(), shipped.end()), u"Editing");
    }
    void CloseWindows() override { app.reset(); }
    void TearDown() override {
        orvtest::DesktopScenario::TearDown();
        unsetenv("ORV_PREFS_DIR");
    }
    // Frames of the main window, and how many windows there are.
    std::pair<unsigned long, std::size_t> Shape() const {
        auto& workspace = app->GetWorkspace();
        return {workspace.GetMainTopLevelWindow()->GetFrameCount(), workspace.GetWindows().size()};
    }

    TempDir out;
    std::unique_ptr<orvdemo::DemoApp> app;
};

} // namespace

TEST_F(DemoTour, EveryStepDoesWhatItSaysAndLeavesASnapshot) {
    orvdemo::Tour tour(*app, out.Path() / "tour");
    using Form = std::pair<unsigned long, std::size_t>;
    // Each line of the built-in tour with the main window's frames and the windows after it.
    std::vector<std::pair<std::string, Form>> const steps{
        {"drag controls onto program right", {6, 1}},
        {"float info 1700 400", {6, 2}},
        {"drag info onto timeline bottom", {7, 1}},
        {"maximize timeline", {7, 1}},
        {"maximize timeline", {7, 1}},
        {"menu Audio Meters", {6, 1}},
        {"menu Audio Meters", {7, 1}},
        {"new My Edit", {7, 1}},
        {"menu Color", {3, 1}},
        {"switch My Edit", {7, 1}},
        {"reset", {7, 1}},
    };
    EXPECT_EQ(Shape(), Form(5, 1));
    std::istringstream script(orvdemo::Tour::BuiltInScript());
    std::size_t checked = 0;
    for (std::string line; std::getline(script, line);) {
        if (line.empty() || line[0] == '#') {
            continue;
        }
        ASSERT_LT(checked, steps.size());
        ASSERT_EQ(line, steps[checked].first);
        ASSERT_NO_THROW(tour.Run(line)) << line;
        EXPECT_EQ(Shape(), steps[checked].second) << line;
        if (line == "maximize timeline") {
            bool maximized =
                app->GetWorkspace().GetMainTopLevelWindow()->GetLayoutManager()->GetMaximizedFrame();
            EXPECT_EQ(maximized, checked == 3) << "the first press maximises, the second restores";
        }
        ++checked;
    }
    EXPECT_EQ(checked, steps.size());
    EXPECT_EQ(app->GetManager().GetCurrentWorkspace(), u"My Edit");

    // A snapshot for the start and for every step, each a real PNG of the screen.
    ASSERT_EQ(tour.GetSnapshots().size(), steps.size() + 1);
    for (auto const& file : tour.GetSnapshots()) {
        std::ifstream png(file, std::ios::binary);
        char magic[8] = {};
        png.read(magic, 8);
        EXPECT_EQ(std::string(magic + 1, 3), "PNG") << file;
        EXPECT_GT(std::filesystem::file_size(file), 10000u) << file;
    }

    // The final document holds the seven frames on screen, and the graph names them all.
    tour.WriteFinalDocuments();
    PropList document;
    orvcore::proplist::utils::LoadPropList(orvtest::TempDir::PathU16(out.Path() / "tour" / "workspace.xml"),
                                           document, true);
    EXPECT_EQ(FramesIn(document), 7);
    std::ifstream dot(out.Path() / "tour" / "layout.dot");
    std::string graph((std::istreambuf_iterator<char>(dot)), std::istreambuf_iterator<char>());
    EXPECT_EQ(graph.rfind("digraph layout {", 0), 0u);
    for (char const* type : {"source", "program", "controls", "project", "timeline", "info", "meters"}) {
        EXPECT_NE(graph.find(type), std::string::npos) << type;
    }
}

TEST_F(DemoTour, ABadLineIsReportedWithItsNumberAndChangesNothing) {
    orvdemo::Tour tour(*app, out.Path() / "tour");
    std::istringstream script("# a user's tour\n"
                              "drag controls onto program right\n"
                              "drag nothing onto program right\n");
    try {
        tour.RunScript(script);
        FAIL() << "the bad line was accepted";
    } catch (orvdemo::TourError const& e) {
        EXPECT_EQ(std::string(e.what()), "line 3: no panel of type 'nothing' is shown");
    }
    EXPECT_EQ(Shape(), std::make_pair(6ul, std::size_t(1)));
    for (char const* bad : {"jump", "drag source onto program sideways", "switch Nowhere", "float info",
                            "float info here there", "toggle unicorn"}) {
        EXPECT_THROW(tour.Run(bad), orvdemo::TourError) << bad;
    }
    EXPECT_EQ(Shape(), std::make_pair(6ul, std::size_t(1)));
    EXPECT_EQ(tour.GetSnapshots().size(), 2u); // the start and the one good step
}

TEST_F(DemoTour, TheShippedWorkspaceIsOfferedAndCopiedWhenChosen) {
    std::vector<std::u16string> names;
    app->GetManager().GetWorkspaces(names);
    EXPECT_EQ(names, (std::vector<std::u16string>{u"Audio", u"Color", u"Editing", u"Effects", u"Review"}));
    ASSERT_TRUE(app->GetManager().SetCurrentWorkspace(u"Review"));
    // Its floating meters come with it; the user's copy is made, the shipped file left alone.
    EXPECT_EQ(Shape(), std::make_pair(5ul, std::size_t(2)));
    EXPECT_TRUE(app->GetManager().GetWorkspaceTable().count(u"Review"));
    std::u16string path = app->GetManager().GetWorkspaceTable().at(u"Review")->GetFilePath();
    std::string shipped = ORVDEMO_WORKSPACES_DIR;
    EXPECT_EQ(std::string(path.begin(), path.end()).rfind(shipped, 0), std::string::npos);
}

TEST_F(DemoTour, TheWindowMenuListsTheWorkspacesAboveTheHostsItemsWithCheckMarks) {
    auto const& menu = app->GetWindowMenu();
    std::vector<std::u16string> texts;
    for (auto const& item : menu.Items()) {
        texts.push_back(item.separator ? u"-" : item.text);
    }
    std::vector<std::u16string> top(texts.begin(), texts.begin() + 6);
    EXPECT_EQ(top,
              (std::vector<std::u16string>{u"Audio", u"Color", u"Editing", u"Effects", u"Review", u"-"}));
    auto checked = [&](std::u16string const& text) {
        for (auto const& item : menu.Items()) {
            if (item.text == text) {
                return item.checked;
            }
        }
        ADD_FAILURE() << "no item";
        return false;
    };
    EXPECT_TRUE(checked(u"Editing"));
    EXPECT_FALSE(checked(u"Color"));
    EXPECT_TRUE(checked(u"Timeline"));
    EXPECT_FALSE(checked(u"History"));                                 // not in the Editing workspace
    ASSERT_TRUE(app->HandleCommand(orvdemo::DemoApp::FirstPanel + 9)); // History
    EXPECT_TRUE(app->GetWindowMenu().Items().at(texts.size() - 1).checked);
    EXPECT_FALSE(app->HandleCommand(99999));

    // Maximise the focused panel's frame, and back.
    auto& workspace = app->GetWorkspace();
    TabPanel* timeline = orvworkspace::workspace::WorkspaceUtils::FindFirstTabOfType(workspace, "timeline");
    workspace.SetFocusedTabPanel(timeline);
    LayoutManager* layout = workspace.GetMainTopLevelWindow()->GetLayoutManager();
    ASSERT_TRUE(app->HandleCommand(orvdemo::DemoApp::MaximizeFrame));
    ASSERT_NE(layout->GetMaximizedFrame(), nullptr);
    EXPECT_EQ(layout->GetMaximizedFrame(),
              dynamic_cast<orvworkspace::workspace::WorkspaceFrame*>(timeline->GetFrame())->GetLMFrame());
    ASSERT_TRUE(app->HandleCommand(orvdemo::DemoApp::MaximizeFrame));
    EXPECT_EQ(layout->GetMaximizedFrame(), nullptr);
}
