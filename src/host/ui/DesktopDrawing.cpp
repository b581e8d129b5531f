// Painting windows: the toolkit's chrome, then the window's nodes, each in its own translated and
// clipped space with its opacity; and snapshots of the whole desktop.
#include "host/core/TextConversion.h"
#include "host/ui/Desktop.h"
#include "host/ui/OS_Window.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"

#include <algorithm>

namespace orvui::ui {

namespace {

using canvasor::Canvasor;

bool Meet(RectF const& a, RectF const& b) {
    return a.left < b.left + b.width && b.left < a.left + a.width && a.top < b.top + b.height &&
           b.top < a.top + a.height;
}

// Draws a node and its children; with an area (in the node's parent's coordinates, the root's own
// for the root) only the nodes that meet it.
void DrawNode(UI_Node* node, Canvasor& c, bool isRoot, RectF const* area = nullptr) {
    if (!node->UI_IsShown()) {
        return;
    }
    RectF r = node->UI_GetRect();
    if (area && !isRoot && !Meet(r, *area)) {
        return;
    }
    RectF inner;
    if (area) {
        inner = isRoot ? *area : RectF(area->left - r.left, area->top - r.top, area->width, area->height);
    }
    c.Save();
    if (!isRoot) {
        c.Translate(r.left, r.top);
    }
    c.ClipRect(RectF(0, 0, r.width, r.height));
    // A window's own opacity is applied when its image is composited, not inside the image.
    bool layered = !isRoot && node->UI_GetOpacity() < 1.0f;
    if (layered) {
        c.PushOpacity();
    }
    node->UI_Draw(c);
    for (std::size_t i = 0; i < node->ChildSize(); ++i) {
        UI_Node* child = node->ChildGet(i);
        if (OS_Window* w = child->UI_GetOSWindow(); w && w->IsTopLevel()) {
            continue; // a separate window, painted on its own
        }
        DrawNode(child, c, false, area ? &inner : nullptr);
    }
    if (layered) {
        c.PopOpacity(node->UI_GetOpacity());
    }
    c.Restore();
}

void DrawChrome(Canvasor& c, NativeWindowRecord const& record, RectT const& client) {
    RectT r = record.rect;
    c.FillRect(RectF(0, 0, float(r.width), float(r.height)), GetColor(color::WindowBorder));
    RectF title{float(BorderWidth), float(BorderWidth), float(r.width - 2 * BorderWidth),
                float(TitleBarHeight)};
    c.FillRect(title, GetColor(record.captionActive ? color::TitleBarActive : color::TitleBarInactive));
    c.Save();
    c.ClipRect(title);
    c.DrawText(orvcore::utility::UTF16to8(record.title), PointF(title.left + 6, title.top + 4),
               canvasor::Font(), GetColor(color::TitleText));
    c.Restore();
    if (record.hasMenu) {
        c.FillRect(RectF(float(BorderWidth), float(BorderWidth + TitleBarHeight),
                         float(r.width - 2 * BorderWidth), float(MenuBarHeight)),
                   GetColor(color::MenuBar));
        // Where the desktop finds the titles for a press, so the two never disagree.
        std::vector<RectT> items = Desktop::Get().GetMenuBarItemRects(record.handle);
        for (std::size_t i = 0; i < items.size(); ++i) {
            RectT const& item = items[i];
            c.DrawText(orvcore::utility::UTF16to8(record.menuTitles[i]),
                       PointF(float(item.left - r.left + 8), float(item.top - r.top + 3)), canvasor::Font(),
                       GetColor(color::TitleText));
        }
    }
    (void)client;
}

} // namespace

void Desktop::PaintWindow(NativeWindow w) {
    NativeWindow top = TopLevelOf(w);
    NativeWindowRecord* record = Find(top);
    if (!record) {
        return;
    }
    RectT r = record->rect;
    paintedPixels_ += std::uint64_t(std::max(0, r.width)) * std::uint64_t(std::max(0, r.height));
    canvasor::Image image(r.width, r.height);
    {
        Canvasor c(image);
        RectT client = GetClientRect(top);
        if ((record->style & style::Caption) == style::Caption) {
            DrawChrome(c, *record, client);
        }
        RectF clientArea(float(client.left - r.left), float(client.top - r.top), float(client.width),
                         float(client.height));
        // A layered window (an overlay) shows only what it draws; the rest lets the windows beneath show.
        if (!(record->exStyle & style::Layered)) {
            c.FillRect(clientArea, GetColor(color::WindowBackground));
        }
        if (record->object) {
            c.Save();
            c.Translate(clientArea.left, clientArea.top);
            DrawNode(record->object, c, true);
            c.Restore();
        }
    }
    record = Find(top); // drawing code may not add windows, but stay safe
    if (record) {
        record->image = image;
        record->dirty = false;
        record->dirtyRegion.Clear();
    }
}

void Desktop::PaintDirty(NativeWindow w) {
    NativeWindow top = TopLevelOf(w);
    NativeWindowRecord* record = Find(top);
    if (!record) {
        return;
    }
    RectT r = record->rect;
    RectT client = GetClientRect(top);
    RectT clientArea(client.left - r.left, client.top - r.top, client.width, client.height);
    // Only the inside of an opaque window that keeps its size is painted in parts; anything else
    // (a layered window's transparency, a new size) is painted whole. Nodes mark only what lies in
    // the client area, so a mark is clipped to it.
    bool whole = record->dirty || record->image.IsEmpty() || record->image.Width() != r.width ||
                 record->image.Height() != r.height || (record->exStyle & style::Layered) || !record->object;
    if (whole) {
        if (record->dirty || !record->dirtyRegion.IsEmpty() || record->image.IsEmpty()) {
            PaintWindow(top);
        }
        return;
    }
    std::vector<RectT> areas;
    for (RectT const& marked : record->dirtyRegion.Rects()) {
        if (RectT area = marked.Intersection(clientArea); !area.IsEmpty()) {
            areas.push_back(area);
        }
    }
    record->dirtyRegion.Clear();
    if (areas.empty()) {
        return;
    }
    if (record->image.IsShared()) {
        record->image = record->image.Clone(); // images handed out keep what they showed
    }
    canvasor::Image image = record->image;
    Canvasor c(image);
    for (RectT const& area : areas) {
        paintedPixels_ += std::uint64_t(area.width) * std::uint64_t(area.height);
        c.Save();
        RectF areaF(float(area.left), float(area.top), float(area.width), float(area.height));
        c.ClipRect(areaF);
        c.FillRect(areaF, GetColor(color::WindowBackground));
        c.Translate(float(clientArea.left), float(clientArea.top));
        RectF inClient(areaF.left - float(clientArea.left), areaF.top - float(clientArea.top), areaF.width,
                       areaF.height);
        DrawNode(record->object, c, true, &inClient);
        c.Restore();
    }
}

canvasor::Image Desktop::WindowImage(NativeWindow w) {
    NativeWindow top = TopLevelOf(w);
    NativeWindowRecord const* record = Find(top);
    if (!record) {
        return canvasor::Image();
    }
    PaintDirty(top);
    return Find(top)->image;
}

canvasor::Image Desktop::Snapshot() {
    RectT area = monitors_.front();
    for (RectT const& m : monitors_) {
        area = area.Union(m);
    }
    canvasor::Image screen(area.width, area.height);
    std::vector<NativeWindow> order = zOrder_;
    Canvasor c(screen);
    c.FillRect(RectF(0, 0, float(area.width), float(area.height)), canvasor::ColorRGBA(0, 0, 0, 1));
    for (NativeWindow w : order) {
        NativeWindowRecord const* record = Find(w);
        if (!record || !record->shown || record->showState == ShowState::Minimized) {
            continue;
        }
        canvasor::Image image = WindowImage(w);
        RectT r = Find(w)->rect;
        c.DrawImage(
            image, RectF(float(r.left - area.left), float(r.top - area.top), float(r.width), float(r.height)),
            Find(w)->opacity);
    }
    return screen;
}

} // namespace orvui::ui
