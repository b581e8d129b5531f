// The drop regions of one frame: four side bands whose slanted ends meet at the corners of the tab
// panel, the centre they leave, and the tab row.
#include "layout/DropZone.h"
#include "layout/Frame.h"
#include "layout/LayoutManager.h"

#include <algorithm>

namespace orvworkspace::workspace {

std::vector<DropZone> LayoutManager::GetDropZones(Frame* frame, RectT const& rect,
                                                  std::vector<long> const& exclusions) {
    std::vector<DropZone> zones;
    if (!frame) {
        return zones;
    }
    // Insets taken by the window's own edge regions, by InsertionType; missing ones count as 0.
    auto ex = [&](std::size_t k) { return k < exclusions.size() ? exclusions[k] : 0L; };
    RectT panel = frame->FrameRectToTabPanelRect(rect);
    RectT well = frame->FrameRectToTabWellRect(rect);
    long t = static_cast<long>(std::min({0.2 * panel.width, 0.2 * panel.height, 50.0}));

    // The top edge of the panel area stays: the top exclusion only shortens the tab row.
    long l = panel.left + ex(Left), r = panel.Right() - ex(Right);
    long top = panel.top, b = panel.Bottom() - ex(Bottom);
    auto pt = [](long x, long y) { return PointT(std::int32_t(x), std::int32_t(y)); };
    auto add = [&](DropZone::DropType type, std::vector<PointT> area) {
        zones.emplace_back(this, area, type, frame);
    };
    add(DropZone::Top, {pt(l, top), pt(l + t, top + t), pt(r - t, top + t), pt(r, top)});
    add(DropZone::Left, {pt(l, top), pt(l + t, top + t), pt(l + t, b - t), pt(l, b)});
    add(DropZone::Bottom, {pt(l, b), pt(l + t, b - t), pt(r - t, b - t), pt(r, b)});
    add(DropZone::Right, {pt(r, b), pt(r - t, b - t), pt(r - t, top + t), pt(r, top)});
    add(DropZone::Center,
        {pt(l + t, top + t), pt(r - t, top + t), pt(r - t, b - t), pt(l + t, b - t), pt(l + t, top + t)});
    long wl = well.left + ex(Left), wr = well.Right() - ex(Right);
    long wt = well.top + ex(Top), wb = well.Bottom();
    add(DropZone::TabWell, {pt(wl, wt), pt(wr, wt), pt(wr, wb), pt(wl, wb)});
    return zones;
}

} // namespace orvworkspace::workspace
