// The desktop's windows: hit testing through z-order, capture, activation, chrome drags, enabling,
// placements.
#include "UiDoubles.h"

#include "host/ui/InputCapture.h"
#include "host/ui/MonitorInfo.h"

using namespace orvtest;

TEST_F(DesktopTest, WindowFromPointFollowsZOrderAndSkipsWhatCannotBeHit) {
    auto back = MakeWindow(RectT(0, 0, 400, 300));
    auto front = MakeWindow(RectT(200, 100, 400, 300));
    EXPECT_EQ(desktop().WindowFromPoint(PointT(250, 150)), front->GetPlatformWindow());
    EXPECT_EQ(desktop().WindowFromPoint(PointT(50, 50)), back->GetPlatformWindow());
    EXPECT_EQ(desktop().WindowFromPoint(PointT(700, 700)), 0u);
    back->UI_Activate(); // to the front
    EXPECT_EQ(desktop().WindowFromPoint(PointT(250, 150)), back->GetPlatformWindow());
    EXPECT_EQ(desktop().EnumerateWindows().front(), back->GetPlatformWindow());

    back->UI_Show(false);
    EXPECT_EQ(desktop().WindowFromPoint(PointT(250, 150)), front->GetPlatformWindow());
    back->UI_Show(true);
    back->UI_SetOpacity(0.5f); // a window following the pointer: the one beneath is the target
    EXPECT_EQ(desktop().WindowFromPoint(PointT(250, 150)), front->GetPlatformWindow());
    back->UI_SetOpacity(1.0f);
    desktop().SetExStyle(back->GetPlatformWindow(), style::Layered | style::MouseTransparent);
    EXPECT_EQ(desktop().WindowFromPoint(PointT(250, 150)), front->GetPlatformWindow());
}

TEST_F(DesktopTest, ChildWindowsResolveToTheDeepestAndKnowTheirThread) {
    auto top = MakeWindow(RectT(100, 100, 400, 300));
    boost::intrusive_ptr<RecordingWindow> frame(new RecordingWindow);
    top->ChildPushBack(frame);
    frame->UI_CreateWindow(u"Frame", top->GetPlatformWindow(), RectT(10, 10, 200, 200),
                           style::Child | style::Visible, 0);
    boost::intrusive_ptr<RecordingWindow> panel(new RecordingWindow);
    frame->ChildPushBack(panel);
    panel->UI_CreateWindow(u"Panel", frame->GetPlatformWindow(), RectT(5, 30, 100, 100), style::Child, 0);
    RectT client = top->UI_GetGlobalClientRect();
    PointT overPanel(client.left + 10 + 5 + 20, client.top + 10 + 30 + 20);
    EXPECT_EQ(desktop().WindowFromPoint(overPanel), frame->GetPlatformWindow()); // the panel starts hidden
    panel->UI_Show(true);
    EXPECT_EQ(desktop().WindowFromPoint(overPanel), panel->GetPlatformWindow());
    EXPECT_EQ(desktop().GetWindowRect(panel->GetPlatformWindow()),
              RectT(overPanel.x - 20, overPanel.y - 20, 100, 100));
    EXPECT_EQ(desktop().GetParent(panel->GetPlatformWindow()), frame->GetPlatformWindow());
    EXPECT_EQ(desktop().GetProperty(panel->GetPlatformWindow(), OS_Window::PropertyName), panel.get());
    frame->UI_Show(false); // a hidden parent hides its children from the pointer
    EXPECT_EQ(desktop().WindowFromPoint(overPanel), top->GetPlatformWindow());

    NativeWindow foreign = desktop().CreateForeignWindow(RectT(1000, 0, 100, 100), 77);
    EXPECT_EQ(desktop().WindowFromPoint(PointT(1050, 50)), foreign);
    EXPECT_EQ(desktop().GetWindowThreadId(foreign), 77u);
    EXPECT_EQ(desktop().GetWindowThreadId(top->GetPlatformWindow()), Desktop::CurrentThreadId());
    EXPECT_EQ(OS_Window::FromNative(foreign), nullptr);
}

TEST_F(DesktopTest, OwnedWindowsStayAboveTheirOwner) {
    auto owner = MakeWindow(RectT(0, 0, 400, 300));
    auto tool = MakeWindow(RectT(100, 100, 100, 100), 0, owner->GetPlatformWindow());
    auto other = MakeWindow(RectT(50, 50, 300, 300));
    owner->UI_Activate();
    std::vector<NativeWindow> order = desktop().EnumerateWindows();
    ASSERT_EQ(order.size(), 3u);
    EXPECT_EQ(order[0], tool->GetPlatformWindow());
    EXPECT_EQ(order[1], owner->GetPlatformWindow());
    EXPECT_EQ(desktop().GetOwner(tool->GetPlatformWindow()), owner->GetPlatformWindow());
}

TEST_F(DesktopTest, AWindowOwnedThroughAChildIsOwnedByItsTopLevelWindow) {
    auto owner = MakeWindow(RectT(0, 0, 400, 300));
    NativeWindow child = desktop().CreateNativeWindow(u"child", style::Child | style::Visible, 0,
                                                      owner->GetPlatformWindow(), RectT(10, 10, 50, 50));
    NativeWindow popup =
        desktop().CreateNativeWindow(u"popup", style::Popup, 0, child, RectT(20, 20, 30, 30));
    EXPECT_EQ(desktop().GetOwner(popup), owner->GetPlatformWindow());
    desktop().DestroyNativeWindow(child);
    EXPECT_EQ(desktop().GetOwner(popup), owner->GetPlatformWindow());
    NativeWindow ownerWindow = owner->GetPlatformWindow();
    owner.reset(); // destroys its native window
    EXPECT_FALSE(desktop().IsWindow(ownerWindow));
    EXPECT_EQ(desktop().GetOwner(popup), 0u);
}

TEST_F(DesktopTest, PressActivatesWithCaptionAndApplicationMessages) {
    auto a = MakeWindow(RectT(0, 0, 400, 300));
    auto b = MakeWindow(RectT(500, 0, 400, 300));
    desktop().MouseDown(PointT(100, 100));
    desktop().MouseUp(PointT(100, 100));
    EXPECT_EQ(desktop().GetActiveWindow(), a->GetPlatformWindow());
    EXPECT_EQ(a->Messages(message::ActivateApp).size(), 1u);
    EXPECT_EQ(b->Messages(message::ActivateApp).size(), 1u); // every window hears the application wake
    EXPECT_TRUE(desktop().IsCaptionActive(a->GetPlatformWindow()));
    a->messages.clear();
    desktop().MouseDown(PointT(600, 100));
    desktop().MouseUp(PointT(600, 100));
    ASSERT_EQ(a->Messages(message::CaptionActivate).size(), 1u);
    EXPECT_EQ(a->messages.front().wParam, 0u); // a loses the active caption
    EXPECT_FALSE(desktop().IsCaptionActive(a->GetPlatformWindow()));
    EXPECT_TRUE(desktop().IsCaptionActive(b->GetPlatformWindow()));
    EXPECT_EQ(b->activations, (std::vector<bool>{true}));
    EXPECT_EQ(a->activations, (std::vector<bool>{true, false}));
    EXPECT_EQ(b->Messages(message::ActivateApp).size(), 1u); // the application was already active
    desktop().SetApplicationActive(false);
    EXPECT_FALSE(desktop().IsCaptionActive(b->GetPlatformWindow()));
}

TEST_F(DesktopTest, CaptureTakesMovesAndReleaseAndLossIsAnnounced) {
    auto a = MakeWindow(RectT(0, 0, 400, 300));
    auto b = MakeWindow(RectT(500, 0, 400, 300));
    desktop().SetCapture(a->GetPlatformWindow());
    desktop().MouseMove(PointT(600, 100)); // over b
    desktop().MouseUp(PointT(650, 120));
    EXPECT_TRUE(b->Messages(message::MouseMove).empty());
    ASSERT_EQ(a->Messages(message::MouseMove).size(), 1u);
    ASSERT_EQ(a->Messages(message::LeftButtonUp).size(), 1u);
    OS_Event const& up = a->messages.back();
    RectT client = a->UI_GetGlobalClientRect();
    EXPECT_EQ(PointParamX(up.lParam), 650 - client.left); // client coordinates, even outside
    EXPECT_EQ(PointParamY(up.lParam), 120 - client.top);
    desktop().SetCapture(b->GetPlatformWindow()); // taken by another: a hears of the loss
    EXPECT_EQ(a->Messages(message::CaptureLost).size(), 1u);
    desktop().ReleaseCapture();
    EXPECT_EQ(b->Messages(message::CaptureLost).size(), 1u);
    EXPECT_EQ(desktop().GetCapture(), 0u);
}

TEST_F(DesktopTest, TitleBarMovesAndBordersResizeWithNotifications) {
    auto w = MakeWindow(RectT(100, 100, 400, 300));
    std::vector<std::string> heard;
    UI_NodeManager::Get()->InstallUserResizeFunction([&](bool begin, UI_Node* node, bool resize) {
        heard.push_back(std::string(begin ? "begin" : "end") + (resize ? " resize" : " move") +
                        (node == w.get() ? "" : " of another"));
    });
    desktop().MouseDown(PointT(200, 110)); // in the title bar
    desktop().MouseMove(PointT(250, 160));
    desktop().MouseUp(PointT(250, 160));
    EXPECT_EQ(w->UI_GetGlobalStructureRect(), RectT(150, 150, 400, 300));
    int sizeChanges = w->sizeChanges;
    desktop().MouseDown(PointT(549, 300)); // the right border
    desktop().MouseMove(PointT(599, 300));
    desktop().MouseUp(PointT(599, 300));
    EXPECT_EQ(w->UI_GetGlobalStructureRect(), RectT(150, 150, 450, 300));
    EXPECT_EQ(w->UI_GetRect().width, 450 - 2 * BorderWidth); // the node is the client area
    EXPECT_GT(w->sizeChanges, sizeChanges);
    EXPECT_EQ(heard, (std::vector<std::string>{"begin move", "end move", "begin resize", "end resize"}));
    EXPECT_TRUE(w->Messages(message::LeftButtonDown).empty()); // chrome presses are not client presses
    UI_NodeManager::Get()->InstallUserResizeFunction(nullptr);
}

TEST_F(DesktopTest, DisabledWindowsBeepAndEnablingIsAnnounced) {
    auto w = MakeWindow(RectT(0, 0, 400, 300));
    EXPECT_FALSE(desktop().EnableWindow(w->GetPlatformWindow(), false));
    ASSERT_EQ(w->Messages(message::Enable).size(), 1u);
    EXPECT_EQ(w->messages.back().wParam, 0u);
    desktop().MouseDown(PointT(100, 100));
    EXPECT_EQ(desktop().GetBeepCount(), 1);
    EXPECT_TRUE(w->Messages(message::LeftButtonDown).empty());
    EXPECT_TRUE(desktop().EnableWindow(w->GetPlatformWindow(), true));
    EXPECT_EQ(w->Messages(message::Enable).size(), 2u);
}

TEST_F(DesktopTest, PlacementsMaximiseMinimiseAndHide) {
    desktop().SetMonitors({RectT(0, 0, 1920, 1080), RectT(1920, 0, 1280, 1024)});
    auto w = MakeWindow(RectT(100, 100, 400, 300));
    WindowPlacement p = desktop().GetPlacement(w->GetPlatformWindow());
    EXPECT_EQ(p.showCmd, 1u);
    EXPECT_EQ(p.normal, RectT(100, 100, 400, 300));
    p.normal = RectT(2000, 100, 400, 300);
    p.showCmd = 3;
    desktop().SetPlacement(w->GetPlatformWindow(), p);
    EXPECT_TRUE(desktop().IsZoomed(w->GetPlatformWindow()));
    EXPECT_EQ(w->UI_GetGlobalStructureRect(),
              RectT(1920, 0, 1280, 1024)); // on its restored rectangle's monitor
    EXPECT_EQ(desktop().GetPlacement(w->GetPlatformWindow()).flags, 2u);
    p.showCmd = 2;
    desktop().SetPlacement(w->GetPlatformWindow(), p);
    EXPECT_TRUE(w->UI_IsMinimized());
    EXPECT_EQ(desktop().WindowFromPoint(PointT(2100, 200)), 0u);
    w->UI_Minimize(false);
    EXPECT_FALSE(w->UI_IsMinimized());
    p.showCmd = 0;
    desktop().SetPlacement(w->GetPlatformWindow(), p);
    EXPECT_FALSE(w->UI_IsShown());
}

TEST_F(DesktopTest, MonitorsByIndexPointAndVisibility) {
    desktop().SetMonitors({RectT(0, 0, 1920, 1080), RectT(1920, 0, 1280, 1024)});
    orvui::utility::MonitorInfo monitors;
    RectT r;
    EXPECT_TRUE(monitors.GetMonitorRect(1, r));
    EXPECT_EQ(r, RectT(1920, 0, 1280, 1024));
    EXPECT_FALSE(monitors.GetMonitorRect(2, r));
    EXPECT_TRUE(monitors.GetMonitorRectFromPoint(PointT(3500, 10), r)); // off screen: the nearest
    EXPECT_EQ(r.left, 1920);
    RectT lost(5000, 2000, 300, 200);
    EXPECT_TRUE(monitors.EnsureRectIsVisible(lost));
    EXPECT_EQ(lost, RectT(2900, 824, 300, 200));
    EXPECT_TRUE(monitors.GetMonitorRectFromRect(RectT(1800, 100, 400, 300), r));
    EXPECT_EQ(r.left, 1920); // most of it lies on the second monitor
    RectT fine(10, 10, 300, 200);
    EXPECT_FALSE(monitors.EnsureRectIsVisible(fine));
}

TEST_F(DesktopTest, ChildWindowsFollowTheirNodesToAnotherWindow) {
    auto first = MakeWindow(RectT(0, 0, 400, 300));
    auto second = MakeWindow(RectT(500, 0, 400, 300));
    boost::intrusive_ptr<RecordingWindow> frame(new RecordingWindow);
    first->ChildPushBack(frame);
    frame->UI_CreateWindow(u"Frame", first->GetPlatformWindow(), RectT(10, 10, 100, 100),
                           style::Child | style::Visible, 0);
    second->ChildPushBack(frame); // a frame dragged to another window
    EXPECT_EQ(desktop().GetParent(frame->GetPlatformWindow()), second->GetPlatformWindow());
    RectT client = second->UI_GetGlobalClientRect();
    EXPECT_EQ(desktop().WindowFromPoint(PointT(client.left + 20, client.top + 20)),
              frame->GetPlatformWindow());
    first.reset(); // the old window goes; the frame lives on in the new one
    EXPECT_TRUE(desktop().IsWindow(frame->GetPlatformWindow()));
    EXPECT_FALSE(frame->IsTopLevel());
    EXPECT_EQ(frame->UI_GetGlobalRect().left, client.left + 10);
}

TEST_F(DesktopTest, DestroyedOrResetWindowsLeaveNoDanglingHandles) {
    auto w = MakeWindow(RectT(0, 0, 400, 300));
    NativeWindow handle = w->GetPlatformWindow();
    desktop().DestroyNativeWindow(handle);
    EXPECT_EQ(w->GetPlatformWindow(), 0u);
    EXPECT_FALSE(w->IsTopLevel());
    auto survivor = MakeWindow(RectT(0, 0, 100, 100));
    Desktop::Reset();                             // a new desktop while the object still lives
    EXPECT_EQ(survivor->GetPlatformWindow(), 0u); // told its window went with the old desktop
    EXPECT_FALSE(survivor->IsTopLevel());
    survivor->UI_Invalidate(); // asks nothing of the old desktop's records
    auto fresh = MakeWindow(RectT(0, 0, 200, 200));
    EXPECT_NE(fresh->GetPlatformWindow(), handle); // handles are never reused
    survivor.reset();                              // must not take the new desktop's window with it
    EXPECT_TRUE(desktop().IsWindow(fresh->GetPlatformWindow()));
}

TEST_F(DesktopTest, AWindowTakenOverByAnotherObjectIsForgottenByTheFirst) {
    auto first = MakeWindow(RectT(0, 0, 400, 300));
    NativeWindow handle = first->GetPlatformWindow();
    boost::intrusive_ptr<RecordingWindow> second(new RecordingWindow);
    second->UI_AttachWindow(handle);
    EXPECT_EQ(second->GetPlatformWindow(), handle);
    EXPECT_EQ(first->GetPlatformWindow(), 0u);
    EXPECT_FALSE(first->IsTopLevel());
    first.reset(); // must not destroy the window it no longer has
    EXPECT_TRUE(desktop().IsWindow(handle));
    second.reset();
    EXPECT_FALSE(desktop().IsWindow(handle));
}

TEST_F(DesktopTest, RaisingOrDestroyingAWindowCountsAsAStackingChange) {
    auto back = MakeWindow(RectT(0, 0, 400, 300));
    auto front = MakeWindow(RectT(100, 100, 400, 300));
    std::uint64_t before = desktop().StackingChanges();
    desktop().BringToFront(front->GetPlatformWindow()); // already in front
    EXPECT_EQ(desktop().StackingChanges(), before);
    desktop().BringToFront(back->GetPlatformWindow());
    EXPECT_GT(desktop().StackingChanges(), before);
    before = desktop().StackingChanges();
    back.reset();
    EXPECT_GT(desktop().StackingChanges(), before);
}

TEST_F(DesktopTest, ApplicationReturningReactivatesItsWindow) {
    auto a = MakeWindow(RectT(0, 0, 400, 300));
    a->UI_Activate();
    desktop().SetApplicationActive(false);
    EXPECT_FALSE(desktop().IsCaptionActive(a->GetPlatformWindow()));
    EXPECT_EQ(desktop().GetActiveWindow(), 0u);
    desktop().SetApplicationActive(true);
    EXPECT_EQ(desktop().GetActiveWindow(), a->GetPlatformWindow());
    EXPECT_TRUE(desktop().IsCaptionActive(a->GetPlatformWindow()));
}

TEST_F(DesktopTest, AMinimisedMaximisedWindowRestoresMaximised) {
    auto w = MakeWindow(RectT(100, 100, 400, 300));
    WindowPlacement p = desktop().GetPlacement(w->GetPlatformWindow());
    p.showCmd = 3;
    desktop().SetPlacement(w->GetPlatformWindow(), p);
    w->UI_Minimize(true);
    EXPECT_TRUE(w->UI_IsMinimized());
    w->UI_Minimize(false);
    EXPECT_TRUE(desktop().IsZoomed(w->GetPlatformWindow()));
}

TEST_F(DesktopTest, APointerCaptureGetsTheReleaseAnywhere) {
    auto w = MakeWindow(RectT(0, 0, 400, 300));
    std::vector<std::string> log;
    boost::intrusive_ptr<RecordingNode> chip(new RecordingNode("chip", &log));
    w->ChildPushBack(chip);
    chip->UI_SetRect(RectF(0, 0, 50, 50));
    {
        PointerCapture capture(chip.get());
        EXPECT_EQ(desktop().GetCapture(), w->GetPlatformWindow());
        desktop().MouseUp(PointT(1500, 900)); // over no window at all
    }
    ASSERT_FALSE(log.empty());
    EXPECT_EQ(log.back().substr(0, 7), "chip:2@");
    EXPECT_EQ(desktop().GetCapture(), 0u);
}

TEST_F(DesktopTest, APressOnAMenuBarTitleTellsTheWindowWhichTitle) {
    boost::intrusive_ptr<RecordingWindow> w(new RecordingWindow);
    w->UI_CreateWindow(u"menus", 0, RectT(100, 100, 400, 300), style::Popup | style::Caption | style::Visible,
                       0, true);
    desktop().SetMenuBar(w->GetPlatformWindow(), {u"File", u"Window"});
    RectT file = desktop().GetMenuBarItemRect(w->GetPlatformWindow(), 0);
    RectT window = desktop().GetMenuBarItemRect(w->GetPlatformWindow(), 1);
    EXPECT_EQ(window.left, file.left + file.width); // side by side, left to right
    EXPECT_TRUE(desktop().GetMenuBarItemRect(w->GetPlatformWindow(), 2).IsEmpty());
    // The bar lies between the title bar and the client area.
    EXPECT_EQ(window.top + window.height, desktop().GetClientRect(w->GetPlatformWindow()).top);

    PointT onWindow(window.left + window.width / 2, window.top + window.height / 2);
    desktop().MouseMove(onWindow);
    desktop().MouseDown(onWindow);
    desktop().MouseUp(onWindow);
    ASSERT_EQ(w->Messages(message::MenuBarPressed).size(), 1u);
    for (OS_Event const& e : w->messages) {
        if (e.message == message::MenuBarPressed) {
            EXPECT_EQ(e.wParam, 1u);
        }
    }
    EXPECT_TRUE(w->Messages(message::LeftButtonDown).empty()); // the menu took the press

    // The bar beyond the last title is no title.
    PointT beyond(window.left + window.width + 20, window.top + 5);
    desktop().MouseDown(beyond);
    desktop().MouseUp(beyond);
    EXPECT_EQ(w->Messages(message::MenuBarPressed).size(), 1u);

    // A window made without a menu keeps no titles.
    auto plain = MakeWindow(RectT(600, 100, 200, 200));
    desktop().SetMenuBar(plain->GetPlatformWindow(), {u"File"});
    EXPECT_TRUE(desktop().GetMenuBarItemRect(plain->GetPlatformWindow(), 0).IsEmpty());
}
