// The relayout of a split tree: visibility refresh, the static border frames, the recursive fit of
// splitters with the distribution that lets constrained frames keep their size, the layout after a
// new frame, and frame zones.
#include "layout/Frame.h"
#include "layout/LayoutManager.h"
#include "layout/LayoutManagerHostInterface.h"
#include "layout/Splitter.h"

#include <algorithm>
#include <cstdlib>

namespace orvworkspace::workspace {

namespace {

// The component of p along s's axis, for reading and writing.
std::int32_t& AxisOf(Splitter const* s, PointT& p) {
    return s->IsVertical() ? p.x : p.y;
}

long Sign(long v) {
    return v < 0 ? -1 : 1;
}

} // namespace

LayoutManager::ReportPassScope::ReportPassScope(LayoutManager& manager, ReportPassKind kind)
    : manager_(manager)
    , savedPass_(manager.reportPass_)
    , savedKind_(manager.reportPassKind_) {
    if (manager.reportPassKind_ != kind) {
        manager.reportPass_ = ++manager.lastReportPass_;
        manager.reportPassKind_ = kind;
    }
}

LayoutManager::ReportPassScope::~ReportPassScope() {
    manager_.reportPass_ = savedPass_;
    manager_.reportPassKind_ = savedKind_;
}

bool LayoutManager::RefreshVisibility(LayoutManagerElement* e) {
    ReportPassScope pass(*this, ReportPassKind::Refresh);
    return RefreshBranch(e);
}

bool LayoutManager::RefreshBranch(LayoutManagerElement* e) {
    if (Frame* f = AsFrame(e)) {
        f->SetConstraintSize(true);
        return f->IsFrameShown();
    }
    Splitter* s = AsSplitter(e);
    if (!s) {
        return false;
    }
    // The saved placement reads the subtree's flags before the refresh below changes them.
    s->SavePlacementState();
    s->SetConstrained(false);
    s->SetLeftOrTopVisible(RefreshBranch(s->GetLeftOrTop()));
    s->SetRightOrBottomVisible(RefreshBranch(s->GetRightOrBottom()));
    return s->IsLeftOrTopSubtreeVisible() || s->IsRightOrBottomSubtreeVisible();
}

Splitter* LayoutManager::FindNearestVisibleSplitter(LayoutManagerElement* e, bool* cameFromFirst) const {
    if (!e) {
        return nullptr;
    }
    LayoutManagerElement* from = e;
    for (Splitter* s = e->GetParent(); s; from = s, s = s->GetParent()) {
        if (s->IsVisible()) {
            if (cameFromFirst) {
                *cameFromFirst = s->GetLeftOrTop() == from;
            }
            return s;
        }
    }
    return nullptr;
}

FrameZones LayoutManager::ConstructFrameZones(RectT const& r) const {
    RectT const& c = containingRect_;
    long eL = r.left == c.left ? borderSize_ : splitterHalfWidth_;
    long eT = r.top == c.top ? borderSize_ : splitterHalfWidth_;
    long eR = r.Right() == c.Right() ? borderSize_ : splitterHalfWidth_;
    long eB = r.Bottom() == c.Bottom() ? borderSize_ : splitterHalfWidth_;
    FrameZones zones;
    zones.SetEdgeSize(FrameZones::Left, eL);
    zones.SetEdgeSize(FrameZones::Top, eT);
    zones.SetEdgeSize(FrameZones::Right, eR);
    zones.SetEdgeSize(FrameZones::Bottom, eB);
    // A strip never reaches outside r: one thicker than r is r itself.
    auto clip = [](long edge, std::int32_t extent) {
        return std::int32_t(std::min<long>(edge, std::max(extent, 0)));
    };
    std::int32_t wL = clip(eL, r.width), hT = clip(eT, r.height), wR = clip(eR, r.width),
                 hB = clip(eB, r.height);
    zones[FrameZones::Left] = RectT(r.left, r.top, wL, r.height);
    zones[FrameZones::Top] = RectT(r.left, r.top, r.width, hT);
    zones[FrameZones::Right] = RectT(r.Right() - wR, r.top, wR, r.height);
    zones[FrameZones::Bottom] = RectT(r.left, r.Bottom() - hB, r.width, hB);
    RectT content(std::int32_t(r.left + eL), std::int32_t(r.top + eT), std::int32_t(r.width - eL - eR),
                  std::int32_t(r.height - eT - eB));
    zones[FrameZones::Interior] = content.width > 0 && content.height > 0 ? content : RectT();
    zones[FrameZones::Whole] = r;
    return zones;
}

void LayoutManager::PlaceFrame(Frame* f, RectT const& rect) {
    if (LayoutEnabled()) {
        f->SetSizeAndPos(ConstructFrameZones(rect));
    }
}

void LayoutManager::PlaceStaticBorderFrames(RectT const& rect, RectT& remaining) {
    RectT& r = remaining;
    if (Frame* top = GetStaticBorderFrame(Top)) {
        std::int32_t h = top->GetMinimumSize().y;
        PlaceFrame(top, RectT(rect.left, rect.top, rect.width, h));
        r.top += h;
        r.height -= h;
    }
    Frame* left = GetStaticBorderFrame(Left);
    if (left && leftStaticBorderAsSecondTop_) {
        std::int32_t h = left->GetMinimumSize().y;
        PlaceFrame(left, RectT(r.left, r.top, r.width, h));
        r.top += h;
        r.height -= h;
    }
    if (Frame* bottom = GetStaticBorderFrame(Bottom)) {
        std::int32_t h = bottom->GetMinimumSize().y;
        PlaceFrame(bottom, RectT(r.left, rect.Bottom() - h, r.width, h));
        r.height -= h;
    }
    if (leftStaticBorderAsSecondTop_) {
        return; // a right strip has no place in this arrangement
    }
    if (left) {
        std::int32_t w = left->GetMinimumSize().x;
        PlaceFrame(left, RectT(r.left, r.top, w, r.height));
        r.left += w;
        r.width -= w;
    }
    if (Frame* right = GetStaticBorderFrame(Right)) {
        std::int32_t w = right->GetMinimumSize().x;
        PlaceFrame(right, RectT(rect.Right() - w, r.top, w, r.height));
        r.width -= w;
    }
}

void LayoutManager::Layout(RectT const& rect, bool distribute, bool refresh, bool keepBarPositions) {
    if (!LayoutEnabled() || rect.width <= 0 || rect.height <= 0) {
        return;
    }
    PointT delta(rect.width - containingRect_.width, rect.height - containingRect_.height);
    containingRect_ = rect;
    RectT remaining = rect;
    PlaceStaticBorderFrames(rect, remaining);
    if (maximizedFrame_) {
        PlaceFrame(maximizedFrame_, remaining);
        return;
    }
    if (refresh) {
        RefreshVisibility(rootSplitter_);
    }
    PointT* d = delta.x == 0 && delta.y == 0 ? nullptr : &delta;
    FitNodeToRect(GetRoot(), remaining, remaining, distribute, true, keepBarPositions, d);
}

void LayoutManager::ReLayout(bool distribute, bool refresh, bool keepBarPositions) {
    Layout(containingRect_, distribute, refresh, keepBarPositions);
}

void LayoutManager::FitNodeToRect(LayoutManagerElement* e, RectT rect, RectT containing, bool distribute,
                                  bool preferFirst, bool keepBarPositions, PointT* delta) {
    if (!LayoutEnabled()) {
        return;
    }
    if (Frame* f = AsFrame(e)) {
        PlaceFrame(f, rect);
    } else if (Splitter* s = AsSplitter(e)) {
        ReportPassScope pass(*this, ReportPassKind::Fit);
        FitSplitter(s, rect, containing, distribute, preferFirst, keepBarPositions, delta);
    }
}

RectT LayoutManager::ChildRect(Splitter* s, bool first) const {
    RectT r = s->GetLocation();
    if (!s->IsVisible()) {
        return r;
    }
    long cut = s->GetPixelPlacement() - s->Origin(r);
    if (s->IsVertical()) {
        return first ? RectT(r.left, r.top, std::int32_t(cut), r.height)
                     : RectT(std::int32_t(r.left + cut), r.top, std::int32_t(r.width - cut), r.height);
    }
    return first ? RectT(r.left, r.top, r.width, std::int32_t(cut))
                 : RectT(r.left, std::int32_t(r.top + cut), r.width, std::int32_t(r.height - cut));
}

void LayoutManager::FitSplitter(Splitter* s, RectT const& rect, RectT const& containing, bool distribute,
                                bool preferFirst, bool keep, PointT* delta) {
    PointT* firstDelta = delta;
    PointT negated, firstCopy, secondCopy;
    PointT* secondDelta = nullptr;
    if (delta) {
        negated = *delta;
        AxisOf(s, negated) = -AxisOf(s, negated);
        secondDelta = &negated;
    }
    RectT old = s->GetLocation();
    s->SetLocation(rect);
    if (old.width == 0 && old.height == 0) {
        s->SavePlacementState(); // first fit of a new splitter
    }
    LayoutManagerElement* a = s->GetLeftOrTop();
    LayoutManagerElement* b = s->GetRightOrBottom();
    if (!s->IsVisible()) {
        // The visible child takes the whole rectangle; a placeholder takes none.
        if (s->GetLeftOrTopVisibleFlag() && a) {
            FitNodeToRect(a, rect, containing, distribute, preferFirst, keep, delta);
        }
        if (s->GetRightOrBottomVisibleFlag() && b) {
            FitNodeToRect(b, rect, containing, distribute, preferFirst, keep, secondDelta);
        }
        return;
    }
    bool inHeight = !s->IsVertical();
    bool adjusting = userAdjustingCount_ > 0;
    if (keep || (adjusting && (a->IsStretchy(inHeight) || b->IsStretchy(inHeight)))) {
        // The bar returns to its saved absolute position.
        s->SetPixelPlacement(s->GetPrevPixelPlacement());
        s->SetConstrained(true);
    } else if (distribute) {
        long prevA = 0, prevB = 0;
        if (delta) {
            s->GetPrevPlacementSizes(prevA, prevB);
        }
        DistributeExtent(s, rect, preferFirst, delta);
        if (delta) {
            long nowA = 0, nowB = 0;
            s->GetPlacementSizes(nowA, nowB);
            firstCopy = *delta;
            AxisOf(s, firstCopy) = std::int32_t(nowA - prevA);
            secondCopy = *delta;
            AxisOf(s, secondCopy) = std::int32_t(nowB - prevB);
            firstDelta = &firstCopy;
            secondDelta = &secondCopy;
        }
    }
    RectT rectA = ChildRect(s, true);
    RectT rectB = ChildRect(s, false);
    // While the user drags, keeping bar positions stops at the first change of orientation.
    bool k = keep;
    if (adjusting && s->GetParent() && s->GetParent()->IsVertical() != s->IsVertical()) {
        k = false;
    }
    auto crosses = [&](LayoutManagerElement* child) {
        Splitter* inner = AsSplitter(child);
        return adjusting && inner && inner->IsVertical() != s->IsVertical();
    };
    FitNodeToRect(a, rectA, containing, distribute, preferFirst, crosses(a) ? false : k, firstDelta);
    FitNodeToRect(b, rectB, containing, distribute, preferFirst, crosses(b) ? false : k, secondDelta);
}

void LayoutManager::DistributeExtent(Splitter* s, RectT const& rect, bool preferFirst, PointT const* delta) {
    bool hasDelta = delta != nullptr;
    long d = hasDelta ? (s->IsVertical() ? delta->x : delta->y) : 0;
    if (s->GetConstrained() || (hasDelta && d == 0)) {
        return;
    }
    LayoutManagerElement* a = s->GetLeftOrTop();
    LayoutManagerElement* b = s->GetRightOrBottom();
    long extent = s->Extent(rect);
    bool inHeight = !s->IsVertical();
    bool stretchyA = a->IsStretchy(inHeight);
    bool stretchyB = b->IsStretchy(inHeight);
    long prevA = 0, prevB = 0;
    s->GetPrevPlacementSizes(prevA, prevB);
    if (stretchyA && stretchyB) {
        return;
    }
    PointT constraintA, constraintB;
    a->GetConstraintSize(constraintA);
    b->GetConstraintSize(constraintB);
    long cA = s->Along(constraintA), cB = s->Along(constraintB);
    long fallbackA = 0, fallbackB = 0;
    if (stretchyA) {
        fallbackA = cA;
        cA = 0;
    }
    if (stretchyB) {
        fallbackB = cB;
        cB = 0;
    }

    // Which side gets its wish, and the wishes.
    bool first;
    if (cA != 0) {
        first = cB == 0 || preferFirst;
    } else if (cB != 0) {
        first = false;
    } else if (extent < fallbackA + fallbackB) {
        first = preferFirst;
        (first ? cA : cB) = first ? fallbackA : fallbackB;
    } else {
        cA = RoundPlacement(extent, s->GetPrevPlacement(), 0);
        if (extent < fallbackB + cA) {
            cA = fallbackA + (extent - fallbackB - fallbackA) / 2;
        }
        first = true;
    }
    long wantA = cA != 0 ? cA - prevA : 0;
    long wantB = cB != 0 ? cB - prevB : 0;

    // With a known change of extent, the side whose wish the change serves better moves.
    if (hasDelta) {
        if (!first) {
            long nA = cA - d - prevA;
            first = wantA == 0 || (nA != 0 && std::labs(nA) > std::labs(wantA));
        } else {
            long nB = cB - d - prevB;
            first = !(wantB == 0 || (nB != 0 && std::labs(nB) > std::labs(wantB)));
        }
    }

    // Never move by more than the splitter's change of extent, nor against it.
    auto step = [&](long want) -> long {
        if (want == 0 || d == 0 || (d < 0) != (want < 0)) {
            return 0;
        }
        return Sign(want) * std::min(std::labs(d), std::labs(want));
    };
    auto move = [&](long prev, long want) { return hasDelta ? prev + step(want) : prev + want; };
    long size;
    if (first) {
        if (cA != 0) {
            size = move(prevA, wantA);
        } else if (cB != 0) {
            first = false;
            size = move(prevB, wantB);
        } else {
            return;
        }
    } else {
        if (cB != 0) {
            size = move(prevB, wantB);
        } else if (cA != 0) {
            first = true;
            size = move(prevA, wantA);
        } else {
            return;
        }
    }
    if (size == extent) {
        return;
    }
    long sizeA = first ? size : extent - size;
    s->SetPixelPlacement(s->Origin(rect) + sizeA);
    s->SetPlacement(s->GetPlacement()); // store the minimum-size correction
    s->SetConstrained(true);
}

void LayoutManager::LayoutSplitterChild(Splitter* s, LayoutManagerElement* child, bool distribute,
                                        bool childIsFirst, bool preferFirst, bool keepBarPositions,
                                        bool updateNow, PointT* delta) {
    if (!LayoutEnabled() || !s) {
        return;
    }
    RectT rect = ChildRect(s, childIsFirst);
    PointT negated;
    PointT* childDelta = delta;
    if (delta && !childIsFirst) {
        negated = *delta;
        AxisOf(s, negated) = -AxisOf(s, negated);
        childDelta = &negated;
    }
    FitNodeToRect(child, rect, containingRect_, distribute, preferFirst, keepBarPositions, childDelta);
    if (updateNow && host_) {
        host_->UpdateNow();
    }
}

void LayoutManager::LayoutSplitterChildren(Splitter* s, bool distribute, bool keepFirst, bool keepSecond,
                                           PointT* delta) {
    if (!s) {
        return;
    }
    // Each side gets its own copy, so a change made while fitting one cannot leak into the other.
    PointT firstCopy = delta ? *delta : PointT();
    PointT secondCopy = firstCopy;
    LayoutSplitterChild(s, s->GetLeftOrTop(), distribute, true, false, keepFirst, false, &firstCopy);
    LayoutSplitterChild(s, s->GetRightOrBottom(), distribute, false, true, keepSecond, false, &secondCopy);
    if (host_) {
        host_->UpdateNow();
    }
}

bool LayoutManager::LayoutNewFrame(Frame* f) {
    if (!LayoutEnabled()) {
        return true;
    }
    Splitter* x = FindNearestVisibleSplitter(f);
    if (!x) {
        Layout(containingRect_, false, false, false);
        return false;
    }
    Layout(containingRect_, false, true, false);
    Layout(containingRect_, true, false, true);
    MajorizeSplitter(x);
    bool xFirst = false;
    Splitter* p = FindNearestVisibleSplitter(x, &xFirst);
    bool fFirst = false;
    if (Splitter* v = FindNearestVisibleSplitter(f, &fFirst)) {
        PlaceFrame(f, ChildRect(v, fFirst)); // provisional: on its own side of the bar
    }
    f->SetConstraintSize(false);
    if (p) {
        LayoutSplitterChild(p, x, true, xFirst, true, false, true, nullptr);
    } else {
        FitNodeToRect(x, x->GetLocation(), containingRect_, true, true, false, nullptr);
    }
    return true;
}

} // namespace orvworkspace::workspace
