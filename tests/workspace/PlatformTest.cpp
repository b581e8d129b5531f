// The platform windows under the workspace: overlays and their creation errors, native windows
// parked during a drag, captions and enablement shared by the application's windows, and the mouse
// feeding the workspace's tracker.
#include "WorkspaceDoubles.h"

#include "host/core/DebugDatabase.h"
#include "host/core/Error.h"
#include "platform/OS_OverlayWindow.h"
#include "platform/OS_TabDragger.h"

using namespace orvtest;
using orvui::ui::PointT;
using orvui::ui::RectT;

namespace {

// A tracker that records its steps and how it ended.
class RecordingTracker : public OS_Tracker {
public:
    explicit RecordingTracker(std::vector<std::string>* log)
        : log_(log) {}
    bool WantsKeyEvents() const override { return false; }
    bool WantsIdleEvents() const override { return false; }
    void Track(PointT const& p, orvui::ui::KeyboardEvent const*) override {
        log_->push_back("track " + std::to_string(p.x) + "," + std::to_string(p.y));
        if (cancelAfterMoves > 0 && --cancelAfterMoves == 0) {
            cancelled = true;
        }
    }
    void Cancel() override {
        log_->push_back("cancel");
        cancelled = true;
        OS_Tracker::Cancel();
    }
    // Ending comes with destruction, as for the workspace's own trackers.
    ~RecordingTracker() override {
        log_->push_back("end");
        OS_Tracker::End();
    }
    bool HasBeenCancelled() const override { return cancelled; }
    int cancelAfterMoves = 0;
    bool cancelled = false;

private:
    std::vector<std::string>* log_;
};

class Platform : public WorkspaceTest {
protected:
    void TearDown() override {
        OS_Workspace::SetIsSyncWindowActivationEnabled(false);
        orvcore::debug::DebugDatabase::Instance().SetEntry("orvworkspace", "ORV_syncWindowEnablement", "");
        WorkspaceTest::TearDown();
    }
    RecordingTracker* StartTracking(PointT at) {
        auto tracker = std::make_unique<RecordingTracker>(&trackLog);
        RecordingTracker* raw = tracker.get();
        tracker->SetTrackedWindow(main->GetPlatformWindow());
        workspace->SetTracker(std::move(tracker));
        bool cancelled = true;
        raw->Begin(at, &cancelled);
        EXPECT_FALSE(cancelled);
        return raw;
    }
    std::vector<std::string> trackLog;
};

int ErrorCode(std::function<void()> const& action) {
    try {
        action();
    } catch (orvcore::config::Error const& e) {
        return e.Facility() * 1000 + e.Code();
    }
    return 0;
}

} // namespace

TEST_F(Platform, OverlaysAreMouseTransparentPopupsAndRefuseToBeEmptyOrOrphaned) {
    boost::intrusive_ptr<OS_OverlayWindow> overlay(
        new OS_OverlayWindow(appWindow, 0, nullptr, RectT(200, 200, 300, 100), false));
    NativeWindow w = overlay->GetPlatformWindow();
    ASSERT_TRUE(overlay->OSWindowBacked());
    EXPECT_EQ(Desktop::Get().GetStyle(w), OS_OverlayWindow::OverlayStyle);
    EXPECT_EQ(Desktop::Get().GetExStyle(w), OS_OverlayWindow::OverlayExStyle);
    EXPECT_EQ(Desktop::Get().GetOwner(w), appWindow);

    EXPECT_EQ(ErrorCode([&] { OS_OverlayWindow(appWindow, 0, nullptr, RectT(0, 0, 0, 50), false); }), 102021);
    EXPECT_EQ(ErrorCode([&] { OS_OverlayWindow(appWindow, 0, nullptr, RectT(0, 0, 50, -1), false); }),
              102021);
    EXPECT_EQ(ErrorCode([&] { OS_OverlayWindow(987654, 0, nullptr, RectT(0, 0, 50, 50), false); }), 102020);

    // As a plain view it needs no native window, nor a size.
    boost::intrusive_ptr<OS_OverlayWindow> view(new OS_OverlayWindow(0, 0, nullptr, RectT(), true));
    EXPECT_FALSE(view->OSWindowBacked());
    EXPECT_EQ(view->GetPlatformWindow(), 0u);
}

TEST_F(Platform, ATabDraggerDestroysTheWindowsItParkedOnlyWhenItGoes) {
    BuildTwoFrames();
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    floating->UI_Show(true);
    NativeWindow frameWindow = right->GetPlatformWindow();
    NativeWindow floatingWindow = floating->GetPlatformWindow();
    {
        OS_TabDragger dragger;
        dragger.DetachFrameWindow(main, right);
        dragger.DetachTopLevelWindow(floating.get());
        EXPECT_EQ(dragger.KeptWindows(), (std::vector<NativeWindow>{frameWindow, floatingWindow}));
        EXPECT_FALSE(right->UI_IsShown());
        EXPECT_EQ(right->GetPlatformWindow(), 0u);
        EXPECT_TRUE(Desktop::Get().IsWindow(frameWindow)); // still there while the drag runs
        EXPECT_FALSE(Desktop::Get().IsVisible(floatingWindow));
    }
    EXPECT_FALSE(Desktop::Get().IsWindow(frameWindow));
    EXPECT_FALSE(Desktop::Get().IsWindow(floatingWindow));
}

TEST_F(Platform, SynchronisedWindowsShowActiveCaptionsTogether) {
    RectT rect(300, 300, 300, 200);
    auto floating = workspace->AddTopLevelWindow(false, &rect);
    floating->UI_Show(true);
    Desktop& desktop = Desktop::Get();

    desktop.Activate(floating->GetPlatformWindow());
    EXPECT_TRUE(desktop.IsCaptionActive(floating->GetPlatformWindow()));
    EXPECT_FALSE(desktop.IsCaptionActive(appWindow));

    OS_Workspace::SetIsSyncWindowActivationEnabled(true);
    desktop.Activate(appWindow);
    desktop.Activate(floating->GetPlatformWindow());
    EXPECT_TRUE(desktop.IsCaptionActive(floating->GetPlatformWindow()));
    EXPECT_TRUE(desktop.IsCaptionActive(appWindow));

    // Leaving the application takes every caption down together.
    desktop.SetApplicationActive(false);
    EXPECT_FALSE(desktop.IsCaptionActive(floating->GetPlatformWindow()));
    EXPECT_FALSE(desktop.IsCaptionActive(appWindow));
}

TEST_F(Platform, FloatingToolWindowsFollowTheMainWindowsEnablementWhenAsked) {
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    NativeWindow w = floating->GetPlatformWindow();
    Desktop::Get().EnableWindow(appWindow, false);
    EXPECT_TRUE(Desktop::Get().IsEnabled(w)); // off unless the debug setting says "true"
    Desktop::Get().EnableWindow(appWindow, true);

    orvcore::debug::DebugDatabase::Instance().SetEntry("orvworkspace", "ORV_syncWindowEnablement", "true");
    Desktop::Get().EnableWindow(appWindow, false);
    EXPECT_FALSE(Desktop::Get().IsEnabled(w));
    Desktop::Get().EnableWindow(appWindow, true);
    EXPECT_TRUE(Desktop::Get().IsEnabled(w));
}

TEST_F(Platform, TheMouseFeedsTheTrackerUntilTheButtonComesUp) {
    BuildTwoFrames();
    RectT client = main->UI_GetGlobalClientRect();
    PointT start(client.left + 100, client.top + 100);
    Desktop::Get().MouseDown(start);
    StartTracking(start);
    Desktop::Get().MouseMove(PointT(start.x + 10, start.y + 5));
    Desktop::Get().MouseMove(PointT(1500, 900)); // outside the window: the capture keeps it coming
    Desktop::Get().MouseUp(PointT(1500, 900));
    EXPECT_EQ(trackLog, (std::vector<std::string>{"track " + std::to_string(start.x + 10) + "," +
                                                      std::to_string(start.y + 5),
                                                  "track 1500,900", "end"}));
    EXPECT_EQ(workspace->GetTracker(), nullptr);
    EXPECT_EQ(Desktop::Get().GetCapture(), 0u);
}

TEST_F(Platform, LosingTheCaptureOrCancellingEndsTheTrackerCancelled) {
    RectT client = main->UI_GetGlobalClientRect();
    PointT start(client.left + 50, client.top + 50);
    StartTracking(start);
    Desktop::Get().ReleaseCapture();
    EXPECT_EQ(trackLog, (std::vector<std::string>{"cancel", "end"}));
    EXPECT_EQ(workspace->GetTracker(), nullptr);

    trackLog.clear();
    RecordingTracker* tracker = StartTracking(start);
    tracker->cancelAfterMoves = 1;
    Desktop::Get().MouseMove(PointT(start.x + 1, start.y));
    EXPECT_EQ(trackLog.back(), "end");
    EXPECT_EQ(workspace->GetTracker(), nullptr);
}

namespace {
std::vector<std::pair<NativeWindow, unsigned>> hostMessages;
void HostEventFunction(orvui::ui::OS_Event* event) {
    hostMessages.emplace_back(event->window, event->message);
}
bool Saw(NativeWindow w, unsigned message) {
    return std::find(hostMessages.begin(), hostMessages.end(), std::make_pair(w, message)) !=
           hostMessages.end();
}
} // namespace

TEST_F(Platform, AHostsEventFunctionSeesTheMessagesOfItsWindowsAndPanels) {
    hostMessages.clear();
    boost::intrusive_ptr<TopLevelWindow> floating(
        new TopLevelWindow(workspace.get(), false, nullptr, &HostEventFunction, false));
    workspace->ChildPushBack(floating);
    Desktop::Get().SendMessage(floating->GetPlatformWindow(), orvui::ui::message::Enable, 1, 0);
    EXPECT_TRUE(Saw(floating->GetPlatformWindow(), orvui::ui::message::Enable));

    WorkspaceFrame* frame = floating->CreateRootFrame("editor", true, true);
    boost::intrusive_ptr<TabPanel> panel(
        new TabPanel(workspace.get(), frame, true, "plain", u"Plain", &HostEventFunction, false));
    frame->AddTab(panel, true);
    Desktop::Get().SendMessage(panel->GetPlatformWindow(), orvui::ui::message::MouseMove, 0, 0);
    EXPECT_TRUE(Saw(panel->GetPlatformWindow(), orvui::ui::message::MouseMove));
    // Windows made without one are not watched.
    Desktop::Get().SendMessage(main->GetPlatformWindow(), orvui::ui::message::Enable, 1, 0);
    EXPECT_FALSE(Saw(main->GetPlatformWindow(), orvui::ui::message::Enable));
}
