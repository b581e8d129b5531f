// The pattern for tests that tell a user's story through the headless desktop: two windows with a
// few nodes, a click and a drag driven as real input, assertions on what the user would see, and a
// snapshot written when the test fails.
#include "UiDoubles.h"

#include "host/ui/InputCapture.h"
#include "host/ui/canvasor/Canvasor.h"
#include "support/SnapshotOnFailure.h"
#include "support/TempDir.h"

using namespace orvtest;
using canvasor::ColorRGBA;

namespace {

// A swatch that changes colour when clicked.
class ToggleSwatch : public UI_Node {
public:
    void UI_Draw(canvasor::Canvasor& c) override { c.FillRect(UI_GetLocalBounds(), on ? On : Off); }
    bool UI_DoMouseEvent(UI_Node*, MouseEvent& event) override {
        if (event.IsAction(action::Press)) {
            on = !on;
            UI_Invalidate();
            return true;
        }
        return false;
    }
    static constexpr ColorRGBA On{0, 1, 0, 1}, Off{0.5f, 0.5f, 0.5f, 1};
    bool on = false;
};

// A chip the user can drag around inside its window.
class DraggableChip : public UI_Node {
public:
    void UI_Draw(canvasor::Canvasor& c) override { c.FillRect(UI_GetLocalBounds(), ColorRGBA(1, 1, 0, 1)); }
    bool UI_DoMouseEvent(UI_Node*, MouseEvent& event) override {
        PointT global = event.GetGlobalPoint();
        if (event.IsAction(action::Press)) {
            grab = std::make_unique<PointerCapture>(this);
            last = global;
            return true;
        }
        if (event.IsAction(action::Move) && grab) {
            RectF r = UI_GetRect();
            UI_SetRect(RectF(r.left + float(global.x - last.x), r.top + float(global.y - last.y), r.width,
                             r.height));
            last = global;
            return true;
        }
        if (event.IsAction(action::Release) && grab) {
            grab.reset();
            return true;
        }
        return false;
    }
    std::unique_ptr<PointerCapture> grab;
    PointT last;
};

class ExampleScenario : public DesktopScenario {
protected:
    void SetUp() override {
        DesktopScenario::SetUp();
        left = MakeWindow(RectT(50, 50, 406, 328));
        right = MakeWindow(RectT(500, 50, 406, 328));
        swatch = new ToggleSwatch;
        left->ChildPushBack(swatch);
        swatch->UI_SetRect(RectF(20, 20, 60, 40));
        chip = new DraggableChip;
        right->ChildPushBack(chip);
        chip->UI_SetRect(RectF(10, 10, 30, 30));
    }
    void CloseWindows() override {
        swatch.reset();
        chip.reset();
        left.reset();
        right.reset();
    }
    static boost::intrusive_ptr<RecordingWindow> MakeWindow(RectT rect) {
        return MakeCaptionWindow(u"example", rect);
    }
    // What the user sees at a point of a window's client area.
    ColorRGBA SeenAt(boost::intrusive_ptr<RecordingWindow> const& w, int x, int y) {
        RectT client = w->UI_GetGlobalClientRect();
        return Desktop::Get().Snapshot().Pixel(client.left + x, client.top + y);
    }
    // Colours on screen are 8-bit: equal within one step.
    static bool Looks(ColorRGBA seen, ColorRGBA expected) {
        auto near = [](float a, float b) { return a - b < 0.01f && b - a < 0.01f; };
        return near(seen.r, expected.r) && near(seen.g, expected.g) && near(seen.b, expected.b) &&
               near(seen.a, expected.a);
    }
    PointT Global(boost::intrusive_ptr<RecordingWindow> const& w, int x, int y) {
        return w->UI_LocalToGlobal(PointT(x, y));
    }

    boost::intrusive_ptr<RecordingWindow> left, right;
    boost::intrusive_ptr<ToggleSwatch> swatch;
    boost::intrusive_ptr<DraggableChip> chip;
};

} // namespace

TEST_F(ExampleScenario, ClickingTheSwatchLightsItUp) {
    EXPECT_TRUE(Looks(SeenAt(left, 40, 30), ToggleSwatch::Off));
    Desktop::Get().MouseDown(Global(left, 40, 30));
    Desktop::Get().MouseUp(Global(left, 40, 30));
    EXPECT_TRUE(Looks(SeenAt(left, 40, 30), ToggleSwatch::On));
    EXPECT_EQ(Desktop::Get().GetActiveWindow(), left->GetPlatformWindow());
}

TEST_F(ExampleScenario, DraggingTheChipMovesItUnderThePointer) {
    Desktop& desktop = Desktop::Get();
    desktop.MouseDown(Global(right, 20, 20));
    // The pointer leaves the chip and even the window: the chip keeps following.
    for (int step = 1; step <= 5; ++step) {
        desktop.MouseMove(Global(right, 20 + 30 * step, 20 + 20 * step));
    }
    desktop.MouseUp(Global(right, 170, 120));
    EXPECT_EQ(chip->UI_GetRect(), RectF(160, 110, 30, 30));
    EXPECT_TRUE(Looks(SeenAt(right, 175, 125), ColorRGBA(1, 1, 0, 1)));
    EXPECT_FALSE(Looks(SeenAt(right, 20, 20), ColorRGBA(1, 1, 0, 1)));
}

TEST_F(ExampleScenario, AFailingScenarioLeavesAPictureOfTheScreen) {
    std::filesystem::path file = WriteSnapshot(); // what TearDown does when a test fails
    ASSERT_TRUE(std::filesystem::exists(file));
    canvasor::Image picture = canvasor::Image::FromPNG(orvtest::ReadFile(file));
    EXPECT_EQ(picture.Width(), 1920);
    EXPECT_EQ(picture.Height(), 1080);
    std::filesystem::remove(file);
}
