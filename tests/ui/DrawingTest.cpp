// Drawing: the canvas, images and resources, and snapshots of windows with their chrome, background
// and opacity.
#include "UiDoubles.h"
#include "support/ImageCompare.h"

#include "host/ui/NodeManager.h"
#include "host/ui/ResourceManager.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"
#include "host/ui/canvasor/SupplierInterface.h"

#include <algorithm>
#include <cmath>

using namespace orvtest;
using canvasor::Canvasor;
using canvasor::ColorRGBA;
using canvasor::Image;

namespace {

::testing::AssertionResult Near(ColorRGBA actual, ColorRGBA expected, float tolerance = 0.02f) {
    if (std::fabs(actual.r - expected.r) <= tolerance && std::fabs(actual.g - expected.g) <= tolerance &&
        std::fabs(actual.b - expected.b) <= tolerance && std::fabs(actual.a - expected.a) <= tolerance) {
        return ::testing::AssertionSuccess();
    }
    return ::testing::AssertionFailure() << "colour (" << actual.r << ", " << actual.g << ", " << actual.b
                                         << ", " << actual.a << ") is not (" << expected.r << ", "
                                         << expected.g << ", " << expected.b << ", " << expected.a << ")";
}

// How many pixels of an image painted in parts differ from the window painted whole.
int PixelsDifferingFromWholeRepaint(orvui::ui::NativeWindow w, Image const& partial) {
    orvui::ui::Desktop::Get().Invalidate(w);
    return orvtest::PixelsDiffering(orvui::ui::Desktop::Get().WindowImage(w), partial);
}

// A node that fills itself with one colour.
class Swatch : public UI_Node {
public:
    explicit Swatch(ColorRGBA c)
        : color(c) {}
    void UI_Draw(Canvasor& c) override { c.FillRect(UI_GetLocalBounds(), color); }
    ColorRGBA color;
};

} // namespace

TEST(Canvas, FillsGradientsAndText) {
    Image image(100, 40);
    {
        Canvasor c(image);
        c.FillRect(RectF(0, 0, 50, 40), ColorRGBA(1, 0, 0, 1));
        c.FillRect(RectF(50, 0, 50, 40),
                   canvasor::LinearGradient{PointF(50, 0), PointF(100, 0), ColorRGBA(0, 0, 0, 1),
                                            ColorRGBA(0, 0, 1, 1)});
        c.Save();
        c.Translate(10, 10);
        c.ClipRect(RectF(0, 0, 5, 5));
        c.FillRect(RectF(0, 0, 100, 100), ColorRGBA(0, 1, 0, 1)); // clipped to 5 × 5 at (10, 10)
        c.Restore();
        canvasor::TextMetrics shortText = c.MeasureText("ab", canvasor::Font());
        canvasor::TextMetrics longText = c.MeasureText("abcdef", canvasor::Font());
        EXPECT_GT(shortText.width, 5);
        EXPECT_GT(longText.width, 2.5f * shortText.width);
        EXPECT_NEAR(shortText.height, 13, 3); // DejaVu Sans at 11 pixels
    }
    EXPECT_TRUE(Near(image.Pixel(5, 5), ColorRGBA(1, 0, 0, 1)));
    EXPECT_TRUE(Near(image.Pixel(12, 12), ColorRGBA(0, 1, 0, 1)));
    EXPECT_TRUE(Near(image.Pixel(16, 16), ColorRGBA(1, 0, 0, 1)));
    EXPECT_TRUE(Near(image.Pixel(75, 20), ColorRGBA(0, 0, 0.5f, 1), 0.03f));
    EXPECT_EQ(image.Pixel(-1, 0), ColorRGBA());
}

TEST(Canvas, RememberedMeasurementsKeepFontsAndTextsApart) {
    // Measured twice, with other measurements between, a text keeps its width in each font.
    canvasor::Font regular, large, bold;
    large.size = 22.0f;
    bold.bold = true;
    float plain = Canvasor::Measure("Plain", regular).width;
    float bigger = Canvasor::Measure("Plain", large).width;
    float heavier = Canvasor::Measure("Plain wide", bold).width;
    EXPECT_GT(bigger, 1.8f * plain);
    EXPECT_GT(Canvasor::Measure("Plain wide", regular).width, plain);
    EXPECT_NE(Canvasor::Measure("Plain wide", regular).width, heavier);
    EXPECT_EQ(Canvasor::Measure("Plain", regular).width, plain);
    EXPECT_EQ(Canvasor::Measure("Plain", large).width, bigger);
    Image image(1, 1);
    Canvasor c(image);
    EXPECT_EQ(c.MeasureText("Plain wide", bold).width, heavier);
}

TEST(DirtyRegion, KeepsDistantAreasApartAndMergesWhatCostsNothing) {
    orvui::ui::DirtyRegion region;
    auto has = [&](RectT r) {
        return std::find(region.Rects().begin(), region.Rects().end(), r) != region.Rects().end();
    };
    region.Add(RectT());
    EXPECT_TRUE(region.IsEmpty());
    // Two corners of a large window stay two small areas.
    region.Add(RectT(0, 0, 10, 10));
    region.Add(RectT(990, 990, 10, 10));
    ASSERT_EQ(region.Rects().size(), 2u);
    EXPECT_EQ(region.Bounds(), RectT(0, 0, 1000, 1000));
    // An area inside one adds nothing; one that continues it along an edge joins it.
    region.Add(RectT(2, 2, 5, 5));
    region.Add(RectT(10, 0, 10, 10));
    ASSERT_EQ(region.Rects().size(), 2u);
    EXPECT_TRUE(has(RectT(0, 0, 20, 10)));
    // An area covering one swallows it.
    region.Add(RectT(980, 980, 20, 20));
    ASSERT_EQ(region.Rects().size(), 2u);
    EXPECT_TRUE(has(RectT(980, 980, 20, 20)));
    // Past the limit, the two that waste least together are merged: here the close pair.
    for (int i = 0; i < int(orvui::ui::DirtyRegion::MaxRects); ++i) {
        region.Add(RectT(100 * i + 100, 500, 10, 10));
    }
    EXPECT_EQ(region.Rects().size(), orvui::ui::DirtyRegion::MaxRects);
    EXPECT_EQ(region.Bounds(), RectT(0, 0, 1000, 1000));
    EXPECT_TRUE(has(RectT(0, 0, 20, 10)));
    EXPECT_TRUE(has(RectT(980, 980, 20, 20)));
    region.Clear();
    EXPECT_TRUE(region.IsEmpty());
}

TEST(Canvas, ImagesRoundTripAsPngAndResourcesDecode) {
    Image image(3, 2);
    {
        Canvasor c(image);
        c.FillRect(RectF(0, 0, 3, 2), ColorRGBA(0.2f, 0.4f, 0.6f, 1));
    }
    Image back = Image::FromPNG(image.ToPNG());
    ASSERT_FALSE(back.IsEmpty());
    EXPECT_EQ(back.Width(), 3);
    EXPECT_TRUE(Near(back.Pixel(2, 1), ColorRGBA(0.2f, 0.4f, 0.6f, 1)));
    EXPECT_TRUE(Image::FromPNG("not a png").IsEmpty());
    EXPECT_TRUE(Image::FromPNG(image.ToPNG().substr(0, 20)).IsEmpty()); // truncated

    orvui::utility::ResourceManager resources;
    for (char const* name : {"closebox", "gripper", "DownArrow", "SP_PopupToolSelect_5x5_N"}) {
        EXPECT_FALSE(Image::FromPNG(resources.GetResource("png", name)).IsEmpty()) << name;
    }
    EXPECT_TRUE(resources.GetResource("png", "nothing").empty());
    canvasor::FileImageP box = UI_NodeManager::Get()->GetImage("closebox");
    ASSERT_NE(box, nullptr);
    EXPECT_EQ(box->Width(), 11);
    EXPECT_EQ(UI_NodeManager::Get()->GetImage("closebox"), box); // decoded once
    EXPECT_EQ(UI_NodeManager::Get()->GetImage("nothing"), nullptr);
}

TEST_F(DesktopTest, SnapshotShowsChromeBackgroundNodesAndOpacity) {
    auto back = MakeWindow(RectT(100, 100, 400, 300));
    boost::intrusive_ptr<Swatch> red(new Swatch(ColorRGBA(1, 0, 0, 1)));
    back->ChildPushBack(red);
    red->UI_SetRect(RectF(0, 0, 100, 100));
    back->UI_Activate();
    Image shot = desktop().Snapshot();
    RectT client = back->UI_GetGlobalClientRect();
    EXPECT_TRUE(Near(shot.Pixel(client.left + 50, client.top + 50), ColorRGBA(1, 0, 0, 1)));
    EXPECT_TRUE(Near(shot.Pixel(client.left + 300, client.top + 200), GetColor(color::WindowBackground)));
    EXPECT_TRUE(Near(shot.Pixel(300, 110), GetColor(color::TitleBarActive)));
    EXPECT_TRUE(Near(shot.Pixel(1500, 900), ColorRGBA(0, 0, 0, 1))); // no window there

    // A half-transparent popup over the red node blends with it.
    boost::intrusive_ptr<RecordingWindow> popup(new RecordingWindow);
    popup->UI_CreateWindow(u"", 0, RectT(client.left + 20, client.top + 20, 40, 40),
                           style::Popup | style::Visible, 0);
    boost::intrusive_ptr<Swatch> blue(new Swatch(ColorRGBA(0, 0, 1, 1)));
    popup->ChildPushBack(blue);
    blue->UI_SetRect(RectF(0, 0, 40, 40));
    popup->UI_SetOpacity(0.5f);
    shot = desktop().Snapshot();
    EXPECT_TRUE(Near(shot.Pixel(client.left + 30, client.top + 30), ColorRGBA(0.5f, 0, 0.5f, 1)));
    // A layered overlay shows only what it draws: the window beneath shows through the rest.
    boost::intrusive_ptr<RecordingWindow> overlay(new RecordingWindow);
    overlay->UI_CreateWindow(u"", 0, RectT(client.left + 60, client.top + 60, 40, 40),
                             style::Popup | style::Visible, style::Layered | style::MouseTransparent);
    shot = desktop().Snapshot();
    EXPECT_TRUE(Near(shot.Pixel(client.left + 70, client.top + 70), ColorRGBA(1, 0, 0, 1)));
    // Hiding a node repaints the window without it.
    red->UI_Show(false);
    EXPECT_TRUE(desktop().IsDirty(back->GetPlatformWindow()));
    shot = desktop().Snapshot();
    EXPECT_TRUE(Near(shot.Pixel(client.left + 5, client.top + 5), GetColor(color::WindowBackground)));
}

TEST_F(DesktopTest, ANodesChangeRepaintsOnlyItsAreaAndMatchesAWholeRepaint) {
    auto window = MakeWindow(RectT(100, 100, 400, 300));
    boost::intrusive_ptr<Swatch> left(new Swatch(ColorRGBA(1, 0, 0, 1)));
    boost::intrusive_ptr<Swatch> right(new Swatch(ColorRGBA(0, 1, 0, 1)));
    boost::intrusive_ptr<Swatch> inner(new Swatch(ColorRGBA(0, 0, 1, 1)));
    window->ChildPushBack(left);
    window->ChildPushBack(right);
    right->ChildPushBack(inner);
    left->UI_SetRect(RectF(0, 0, 150, 200));
    right->UI_SetRect(RectF(150, 0, 150, 200));
    inner->UI_SetRect(RectF(10.5f, 10.5f, 40, 40)); // straddles pixels: its edges are blended
    NativeWindow w = window->GetPlatformWindow();
    Image before = desktop().WindowImage(w);
    EXPECT_FALSE(desktop().IsDirty(w));

    // A change inside the right node marks only its area; the image handed out before keeps its pixels.
    right->color = ColorRGBA(1, 1, 0, 1);
    inner->UI_SetRect(RectF(60.5f, 30.5f, 40, 40)); // moved: its old place is marked too
    right->UI_Invalidate();
    EXPECT_TRUE(desktop().IsDirty(w));
    RectT client = window->UI_GetGlobalClientRect();
    int cx = client.left - 100, cy = client.top - 100;
    RectT marked = desktop().Record(w)->dirtyRegion.Bounds();
    EXPECT_FALSE(marked.IsEmpty());
    EXPECT_TRUE(marked.Intersection(RectT(cx, cy, 140, 200)).IsEmpty()); // the left node is left alone
    window->UI_UpdateNow();
    EXPECT_FALSE(desktop().IsDirty(w));
    Image partial = desktop().WindowImage(w);
    EXPECT_TRUE(Near(before.Pixel(cx + 200, cy + 100), ColorRGBA(0, 1, 0, 1)));
    EXPECT_TRUE(Near(partial.Pixel(cx + 200, cy + 100), ColorRGBA(1, 1, 0, 1)));

    // Painted whole, the window looks the same pixel for pixel.
    EXPECT_EQ(PixelsDifferingFromWholeRepaint(w, partial), 0);
}

TEST_F(DesktopTest, AddingReorderingAndRemovingChildrenRepaintsOnlyWhereTheyLie) {
    auto window = MakeWindow(RectT(100, 100, 400, 300));
    boost::intrusive_ptr<Swatch> base(new Swatch(ColorRGBA(1, 0, 0, 1)));
    window->ChildPushBack(base);
    base->UI_SetRect(RectF(0, 0, 100, 100));
    NativeWindow w = window->GetPlatformWindow();
    desktop().WindowImage(w);
    RectT client = window->UI_GetGlobalClientRect();
    int cx = client.left - 100, cy = client.top - 100;

    // A child placed before it is attached: only its area is marked, not the window.
    boost::intrusive_ptr<Swatch> added(new Swatch(ColorRGBA(0, 0, 1, 1)));
    added->UI_SetRect(RectF(50, 50, 100, 100));
    window->ChildPushBack(added);
    EXPECT_FALSE(desktop().IsWhollyDirty(w));
    RectT marked = desktop().Record(w)->dirtyRegion.Bounds();
    EXPECT_TRUE(marked.Contains(PointT(cx + 60, cy + 60)));
    EXPECT_FALSE(marked.Contains(PointT(cx + 300, cy + 200)));
    Image image = desktop().WindowImage(w);
    EXPECT_TRUE(Near(image.Pixel(cx + 75, cy + 75), ColorRGBA(0, 0, 1, 1)));
    EXPECT_EQ(PixelsDifferingFromWholeRepaint(w, image), 0);

    // Brought to the back, the overlap shows the other child again.
    window->ChildMove(added.get(), 0);
    EXPECT_FALSE(desktop().IsWhollyDirty(w));
    image = desktop().WindowImage(w);
    EXPECT_TRUE(Near(image.Pixel(cx + 75, cy + 75), ColorRGBA(1, 0, 0, 1)));
    EXPECT_EQ(PixelsDifferingFromWholeRepaint(w, image), 0);

    // Removed, one way or the other, what they covered is background again.
    window->ChildRemove(base.get());
    EXPECT_FALSE(desktop().IsWhollyDirty(w));
    image = desktop().WindowImage(w);
    EXPECT_TRUE(Near(image.Pixel(cx + 20, cy + 20), GetColor(color::WindowBackground)));
    EXPECT_TRUE(Near(image.Pixel(cx + 75, cy + 75), ColorRGBA(0, 0, 1, 1)));
    EXPECT_EQ(window->ChildRemoveIf([&](UI_Node* n) { return n == added.get(); }), 1u);
    EXPECT_FALSE(desktop().IsWhollyDirty(w));
    image = desktop().WindowImage(w);
    EXPECT_TRUE(Near(image.Pixel(cx + 120, cy + 120), GetColor(color::WindowBackground)));
    EXPECT_EQ(PixelsDifferingFromWholeRepaint(w, image), 0);
}

TEST_F(DesktopTest, AChangeUnderAMenuBarIsRepaintedWhereItShows) {
    boost::intrusive_ptr<RecordingWindow> window(new RecordingWindow);
    window->UI_CreateWindow(u"menu", 0, RectT(50, 50, 400, 300),
                            style::Popup | style::Caption | style::SizingFrame | style::Visible, 0, true);
    boost::intrusive_ptr<Swatch> swatch(new Swatch(ColorRGBA(1, 0, 0, 1)));
    window->ChildPushBack(swatch);
    swatch->UI_SetRect(RectF(10, 10, 40, 40));
    NativeWindow w = window->GetPlatformWindow();
    desktop().WindowImage(w);
    swatch->color = ColorRGBA(0, 0, 1, 1);
    swatch->UI_Invalidate();
    EXPECT_FALSE(desktop().IsWhollyDirty(w));
    Image image = desktop().WindowImage(w);
    RectT client = window->UI_GetGlobalClientRect();
    EXPECT_TRUE(Near(image.Pixel(client.left - 50 + 30, client.top - 50 + 30), ColorRGBA(0, 0, 1, 1)));
    EXPECT_EQ(PixelsDifferingFromWholeRepaint(w, image), 0);
}

TEST_F(DesktopTest, OnlyARealChangeOfActivationOrVisibilityRepaintsAWindowWhole) {
    auto window = MakeWindow(RectT(100, 100, 400, 300));
    NativeWindow w = window->GetPlatformWindow();
    bool active = desktop().IsCaptionActive(w);
    desktop().WindowImage(w);
    desktop().SetCaptionActive(w, active);
    desktop().ShowWindow(w, desktop().IsVisible(w));
    EXPECT_FALSE(desktop().IsDirty(w));
    desktop().SetCaptionActive(w, !active);
    EXPECT_TRUE(desktop().IsWhollyDirty(w));
}
