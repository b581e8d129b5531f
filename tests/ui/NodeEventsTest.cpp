// Nodes: event routing and bubbling, input capture, cursors, focus and its grouping, coordinates,
// timers and queued calls under virtual time.
#include "UiDoubles.h"

#include "host/ui/InputCapture.h"
#include "host/ui/Theme.h"

using namespace orvtest;

namespace {

class NodeTest : public DesktopTest {
protected:
    void SetUp() override {
        DesktopTest::SetUp();
        window = MakeWindow(RectT(100, 100, 406, 328)); // client 400 × 300 at (103, 125)
        outer = new RecordingNode("outer", &log);
        inner = new RecordingNode("inner", &log);
        window->ChildPushBack(outer);
        outer->ChildPushBack(inner);
        outer->UI_SetRect(RectF(10, 20, 200, 100));
        inner->UI_SetRect(RectF(5, 5, 50, 40));
    }
    void TearDown() override {
        UI_NodeManager::Get()->BeginInputCapture(nullptr);
        UI_NodeManager::Get()->SetFocusLeaf(nullptr, 0);
        window.reset();
        DesktopTest::TearDown();
    }
    // A global point at a position inside the window's client area.
    PointT At(int x, int y) const { return PointT(103 + x, 125 + y); }

    std::vector<std::string> log;
    boost::intrusive_ptr<RecordingWindow> window;
    boost::intrusive_ptr<RecordingNode> outer, inner;
};

class SwallowingCapture : public InputCapture {
public:
    explicit SwallowingCapture(std::vector<std::string>* l)
        : log(l) {}
    bool HandleMouseEvent(MouseEvent& event) override {
        log->push_back("capture:" + std::to_string(event.GetAction()));
        return event.IsAction(action::Press);
    }
    bool HandleKeyboardEvent(KeyboardEvent& event) override { return event.GetKeyCode() == key::Escape; }
    void CaptureEnded() override { log->push_back("capture:ended"); }
    std::vector<std::string>* log;
};

} // namespace

TEST_F(NodeTest, EventsGoToTheDeepestNodeAndBubbleUntilHandled) {
    desktop().MouseDown(At(20, 30)); // inside inner: local (5, 5)
    EXPECT_EQ(log, (std::vector<std::string>{"inner:1@5,5", "outer:1@10,10 via"}));
    log.clear();
    inner->consumes = true;
    desktop().MouseUp(At(20, 30));
    EXPECT_EQ(log, (std::vector<std::string>{"inner:2@5,5"}));
    log.clear();
    desktop().MouseDown(At(100, 80)); // outer only
    EXPECT_EQ(log, (std::vector<std::string>{"outer:1@90,60"}));
    log.clear();
    inner->UI_Show(false);
    desktop().MouseDown(At(20, 30)); // a hidden node is not hit
    EXPECT_EQ(log, (std::vector<std::string>{"outer:1@10,10"}));
    log.clear();
    desktop().MouseDown(At(20, 30), 0, 2);
    desktop().MouseDown(At(20, 30), 1);
    desktop().MouseWheel(At(20, 30), -120);
    EXPECT_EQ(log, (std::vector<std::string>{"outer:3@10,10", "outer:4@10,10", "outer:6@10,10"}));
}

TEST_F(NodeTest, InputCaptureSeesEventsFirst) {
    auto capture = std::make_shared<SwallowingCapture>(&log);
    UI_NodeManager::Get()->BeginInputCapture(capture);
    desktop().MouseDown(At(20, 30));
    desktop().MouseUp(At(20, 30));
    EXPECT_EQ(log, (std::vector<std::string>{"capture:1", "capture:2", "inner:2@5,5", "outer:2@10,10 via"}));
    log.clear();
    inner->UI_GainKeyboardFocus(FocusByProgram);
    log.clear();
    desktop().KeyDown(key::Escape);
    desktop().KeyDown('A');
    EXPECT_EQ(log, (std::vector<std::string>{"inner:key65", "outer:key65"}));
    log.clear();
    UI_NodeManager::Get()->EndInputCapture(capture.get());
    EXPECT_EQ(log, (std::vector<std::string>{"capture:ended"}));
    EXPECT_EQ(UI_NodeManager::Get()->GetInputCapture(), nullptr);
}

TEST_F(NodeTest, PointerCaptureSendsEveryMouseEventToOneNode) {
    {
        PointerCapture capture(inner.get());
        desktop().MouseMove(At(300, 200));
        EXPECT_EQ(log, (std::vector<std::string>{"inner:5@285,175", "outer:5@290,180 via"}));
    }
    log.clear();
    desktop().MouseMove(At(300, 200));
    EXPECT_TRUE(log.empty()); // over the window itself, which does not log
}

TEST_F(NodeTest, CursorComesFromTheNodesUnderThePointer) {
    outer->cursorToSet = cursor::VerticalSplitter;
    desktop().MouseMove(At(20, 30));
    EXPECT_EQ(desktop().GetCursor(), cursor::VerticalSplitter); // inner passes, outer sets it
    inner->cursorToSet = cursor::DragTab;
    desktop().MouseMove(At(21, 30));
    EXPECT_EQ(desktop().GetCursor(), cursor::DragTab);
    desktop().MouseMove(At(300, 250));
    EXPECT_EQ(desktop().GetCursor(), cursor::Arrow);
}

TEST_F(NodeTest, FocusChangesNotifyTheNodesThatGainedAndLost) {
    inner->UI_GainKeyboardFocus(FocusByMouse);
    EXPECT_EQ(log, (std::vector<std::string>{"inner:focus1+", "outer:focus1+"}));
    EXPECT_TRUE(outer->UI_HasKeyboardFocus(true));
    EXPECT_FALSE(outer->UI_HasKeyboardFocus(false));
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), inner.get());
    log.clear();
    outer->UI_GainKeyboardFocus(FocusByKeyboard); // within outer: only inner lost it
    EXPECT_EQ(log, (std::vector<std::string>{"inner:focus2-"}));
    log.clear();
    outer->UI_LoseKeyboardFocus(FocusByProgram);
    EXPECT_EQ(log, (std::vector<std::string>{"outer:focus3-"}));
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), nullptr);
}

TEST_F(NodeTest, GroupedFocusChangesAreDeliveredOnceAtTheEnd) {
    boost::intrusive_ptr<RecordingNode> other(new RecordingNode("other", &log));
    window->ChildPushBack(other);
    {
        UI_NodeManager::GroupingFocusChanges outerGroup;
        inner->UI_GainKeyboardFocus(FocusByProgram);
        {
            UI_NodeManager::GroupingFocusChanges innerGroup;
            other->UI_GainKeyboardFocus(FocusByProgram);
        }
        outer->UI_GainKeyboardFocus(FocusByProgram);
        EXPECT_TRUE(log.empty());
    }
    EXPECT_EQ(log, (std::vector<std::string>{"outer:focus3+"})); // nobody had it before; outer has it now
}

TEST_F(NodeTest, CoordinatesRoundTripThroughNestedNodes) {
    PointT global = inner->UI_LocalToGlobal(PointT(7, 9));
    EXPECT_EQ(global, At(10 + 5 + 7, 20 + 5 + 9));
    EXPECT_EQ(inner->UI_GlobalToLocal(global), PointT(7, 9));
    PointF f = inner->UI_GlobalToLocalF(inner->UI_LocalToGlobalF(PointF(1.25f, 2.5f)));
    EXPECT_FLOAT_EQ(f.x, 1.25f);
    EXPECT_FLOAT_EQ(f.y, 2.5f);
    EXPECT_EQ(inner->UI_GetGlobalRect(), RectT(At(15, 25).x, At(15, 25).y, 50, 40));
    Matrix m = inner->UI_GetSelfToParentMatrix();
    EXPECT_FLOAT_EQ(m.Apply(PointF(1, 1)).x, 6.0f);
    // Moving the window moves every node with it.
    window->UI_Move(PointT(0, 0));
    EXPECT_EQ(inner->UI_LocalToGlobal(PointT(0, 0)), PointT(3 + 15, 25 + 25));
    EXPECT_EQ(inner->UI_GetNodeParents(), (std::vector<UI_Node*>{outer.get(), window.get()}));
}

TEST_F(NodeTest, TimersFireInTimeOrderUnderVirtualTime) {
    inner->InstallTimer(1, 0.5, true);
    outer->InstallTimer(2, 0.3, false);
    inner->InstallTimer(3, 0.3, false);
    desktop().AdvanceTime(0.2);
    EXPECT_TRUE(log.empty());
    desktop().AdvanceTime(1.0);
    EXPECT_EQ(log, (std::vector<std::string>{"outer:timer2@0.300000", "inner:timer3@0.300000",
                                             "inner:timer1@0.500000", "inner:timer1@1.000000"}));
    EXPECT_DOUBLE_EQ(desktop().Now(), 1.2);
    inner->RemoveTimer(1);
    log.clear();
    desktop().AdvanceTime(5);
    EXPECT_TRUE(log.empty());
    // A node that goes away takes its timers with it.
    inner->InstallTimer(4, 0.1, true);
    EXPECT_TRUE(desktop().HasTimer(inner.get(), 4));
    RecordingNode* raw = inner.get();
    outer->ChildRemove(inner.get());
    inner.reset();
    EXPECT_FALSE(desktop().HasTimer(raw, 4));
    desktop().AdvanceTime(1);
    EXPECT_TRUE(log.empty());
}

TEST_F(NodeTest, QueuedCallsRunWhenDueInOrderWithTimers) {
    std::vector<std::string> order;
    desktop().PostToMainThread([&] { order.push_back("later"); }, 0.4);
    desktop().PostToMainThread([&] { order.push_back("now"); });
    outer->InstallTimer(9, 0.2, false);
    desktop().ProcessPendingWork();
    EXPECT_EQ(order, std::vector<std::string>{"now"});
    desktop().AdvanceTime(1);
    EXPECT_EQ(order, (std::vector<std::string>{"now", "later"}));
    EXPECT_EQ(log, std::vector<std::string>{"outer:timer9@0.200000"});
    // Calls queued by calls wait for the next turn, so a call that queues itself cannot hang a turn.
    desktop().PostToMainThread([&] { desktop().PostToMainThread([&] { order.push_back("chained"); }); });
    desktop().ProcessPendingWork();
    EXPECT_EQ(order.back(), "later");
    desktop().ProcessPendingWork();
    EXPECT_EQ(order.back(), "chained");
    int runs = 0;
    std::function<void()> again = [&] {
        ++runs;
        desktop().PostToMainThread(again);
    };
    desktop().PostToMainThread(again);
    desktop().ProcessPendingWork();
    desktop().AdvanceTime(1);
    EXPECT_EQ(runs, 2);
}

TEST_F(NodeTest, ChildrenCanBeReorderedAndFound) {
    boost::intrusive_ptr<RecordingNode> second(new RecordingNode("second", &log));
    second->UI_SetNodeID("second");
    window->ChildPushBack(second);
    EXPECT_EQ(window->ChildSize(), 2u);
    window->ChildMove(second.get(), 0);
    EXPECT_EQ(window->ChildGet(0), second.get());
    EXPECT_EQ(window->UI_FindNodeByID("second"), second.get());
    second->UI_SetParent(outer.get());
    EXPECT_EQ(second->UI_GetParentNode(), outer.get());
    EXPECT_EQ(window->ChildSize(), 1u);
    second->UI_SetParent(nullptr);
    EXPECT_EQ(outer->ChildSize(), 1u);
    EXPECT_FALSE(window->ChildRemove(second.get()));
    // Removing many at once keeps the order of the rest and leaves the removed ones parentless.
    std::vector<boost::intrusive_ptr<RecordingNode>> many;
    for (char const* name : {"a", "b", "c", "d"}) {
        many.emplace_back(new RecordingNode(name, &log));
        window->ChildPushBack(many.back());
    }
    std::size_t before = window->ChildSize();
    EXPECT_EQ(window->ChildRemoveIf([&](UI_Node* n) { return n == many[0].get() || n == many[2].get(); }),
              2u);
    EXPECT_EQ(window->ChildSize(), before - 2);
    EXPECT_EQ(window->ChildIndex(many[3].get()), window->ChildIndex(many[1].get()) + 1);
    EXPECT_EQ(many[0]->UI_GetParentNode(), nullptr);
    EXPECT_EQ(many[2]->UI_GetParentNode(), nullptr);
    EXPECT_EQ(many[1]->UI_GetParentNode(), window.get());
    EXPECT_EQ(window->ChildRemoveIf([](UI_Node*) { return false; }), 0u);
}

TEST_F(NodeTest, TabMovesFocusThroughTheWindowAndShiftTabBack) {
    boost::intrusive_ptr<RecordingNode> third(new RecordingNode("third", &log));
    window->ChildPushBack(third);
    KeyboardEvent tab(key::Tab, true, 0);
    EXPECT_TRUE(window->UI_DoAdvanceKeyboardFocus(tab));
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), outer.get()); // tree order: outer, inner, third
    EXPECT_TRUE(window->UI_DoAdvanceKeyboardFocus(tab));
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), inner.get());
    EXPECT_TRUE(window->UI_DoAdvanceKeyboardFocus(tab));
    EXPECT_TRUE(window->UI_DoAdvanceKeyboardFocus(tab)); // wraps round
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), outer.get());
    KeyboardEvent backTab(key::Tab, true, modifier::Shift);
    EXPECT_TRUE(window->UI_DoAdvanceKeyboardFocus(backTab));
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), third.get());
    KeyboardEvent other('A', true, 0);
    EXPECT_FALSE(window->UI_DoAdvanceKeyboardFocus(other));
    third->UI_Show(false); // hidden nodes are skipped
    EXPECT_TRUE(window->UI_DoAdvanceKeyboardFocus(tab));
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), outer.get());
}

TEST_F(NodeTest, PressesOfferMouseActivationBeforeTheEvent) {
    struct Activating : RecordingNode {
        using RecordingNode::RecordingNode;
        bool UI_DoMouseActivate() override {
            log->push_back(name + ":activate");
            return true;
        }
    };
    boost::intrusive_ptr<Activating> panel(new Activating("panel", &log));
    inner->ChildPushBack(panel);
    panel->UI_SetRect(RectF(0, 0, 10, 10));
    desktop().MouseDown(At(16, 26));
    desktop().MouseMove(At(17, 26));
    // The panel sits at inner's origin, so both see the same local point.
    EXPECT_EQ(log,
              (std::vector<std::string>{"panel:activate", "panel:1@1,1", "inner:1@1,1 via", "outer:1@6,6 via",
                                        "panel:5@2,1", "inner:5@2,1 via", "outer:5@7,6 via"}));
}

TEST_F(NodeTest, GuardsAndThemeNotifications) {
    UI_NodeManager* manager = UI_NodeManager::Get();
    EXPECT_FALSE(manager->MouseOverUpdatesSuspended());
    {
        UI_NodeManager::SuspendMouseOverUpdates freeze;
        UI_NodeManager::SuspendMouseOverUpdates again;
        EXPECT_TRUE(manager->MouseOverUpdatesSuspended());
    }
    EXPECT_FALSE(manager->MouseOverUpdatesSuspended());
    std::vector<std::string> heard;
    manager->InstallUserResizeFunction([&](bool begin, UI_Node* node, bool) {
        heard.push_back((begin ? "begin " : "end ") + node->UI_GetNodeID());
    });
    window->UI_SetNodeID("window");
    { UI_NodeManager::NotifyUserResizing resizing(window.get()); }
    EXPECT_EQ(heard, (std::vector<std::string>{"begin window", "end window"}));
    manager->InstallUserResizeFunction(nullptr);
    EXPECT_NE(manager->GetUniqueTimerID(), manager->GetUniqueTimerID());

    int changes = 0;
    InstallThemeChangedFunction([&] { ++changes; });
    Theme::Current().SetColor(color::WindowBackground, canvasor::ColorRGBA(1, 1, 1, 1));
    Theme::Current().SetName("Light", false);
    Theme::Current().SetName("Light", true);
    EXPECT_EQ(changes, 2);
    EXPECT_EQ(GetColor(color::WindowBackground), canvasor::ColorRGBA(1, 1, 1, 1));
    EXPECT_EQ(GetColor(9999), canvasor::ColorRGBA(1, 0, 1, 1)); // a missing number shows
    InstallThemeChangedFunction(nullptr);
    Theme::Terminate();
    EXPECT_NE(GetColor(color::WindowBackground), canvasor::ColorRGBA(1, 1, 1, 1)); // defaults again
    EXPECT_EQ(Theme::Current().GetFontName(FontKind::Normal), "DejaVu Sans");
    EXPECT_EQ(WINtoORV(ORVtoWIN(RectT(10, 20, 30, 40))), RectT(10, 20, 30, 40));
    EXPECT_EQ(ORVtoWIN(RectT(10, 20, 30, 40)).right, 40);
}

TEST_F(NodeTest, KeysGoToTheFocusOrTheActiveWindowAndStopThere) {
    struct KeyWindow : RecordingWindow {
        std::vector<std::string>* log = nullptr;
        bool UI_DoKeyboardEvent(KeyboardEvent& e) override {
            log->push_back("window:key" + std::to_string(e.GetKeyCode()));
            return false;
        }
    };
    boost::intrusive_ptr<UI_Container> host(new UI_Container);
    boost::intrusive_ptr<RecordingNode> above(new RecordingNode("above", &log));
    above->ChildPushBack(host);
    boost::intrusive_ptr<KeyWindow> keyed(new KeyWindow);
    keyed->log = &log;
    host->ChildPushBack(keyed);
    keyed->UI_CreateWindow(u"keys", 0, RectT(600, 100, 300, 200),
                           style::Popup | style::Caption | style::Visible, 0);
    keyed->UI_Activate();
    desktop().KeyDown('K');                                   // no focus: the active window
    EXPECT_EQ(log, std::vector<std::string>{"window:key75"}); // and not the nodes above the window
    keyed.reset();
    host->DeleteChildren();
}

TEST_F(NodeTest, AContainerCanKeepFocusAmongItsChildren) {
    struct Frame : UI_Container {
        bool UI_WantsKeyboardFocus() const override { return false; }
        bool AllowFocusToAdvanceFromChildren() const override { return false; }
    };
    boost::intrusive_ptr<Frame> frame(new Frame);
    window->ChildPushBack(frame);
    frame->UI_SetRect(RectF(0, 150, 200, 100));
    boost::intrusive_ptr<RecordingNode> a(new RecordingNode("a", &log)), b(new RecordingNode("b", &log));
    frame->ChildPushBack(a);
    frame->ChildPushBack(b);
    a->UI_GainKeyboardFocus(FocusByProgram);
    KeyboardEvent tab(key::Tab, true, 0);
    EXPECT_TRUE(window->UI_DoAdvanceKeyboardFocus(tab));
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), b.get());
    EXPECT_TRUE(window->UI_DoAdvanceKeyboardFocus(tab)); // wraps within the frame, never to outer
    EXPECT_EQ(UI_Node::UI_GetKeyboardFocusLeafNode(), a.get());
}
