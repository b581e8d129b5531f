// The splitter's bar arithmetic and its size reports, which combine its children's.
#include "layout/Splitter.h"

#include "layout/LayoutManager.h"

#include <algorithm>
#include <cmath>

namespace orvworkspace::workspace {

void Splitter::ReplaceElement(LayoutManagerElement* old, LayoutManagerElement* replacement) {
    if (leftOrTop_ == old) {
        leftOrTop_ = replacement;
    } else if (rightOrBottom_ == old) {
        rightOrBottom_ = replacement;
    }
}

bool Splitter::SameOrientation(LayoutManagerElement* e) const {
    Splitter* other = AsSplitter(e);
    return !other || other->vertical_ == vertical_;
}

void Splitter::SetPlacement(float f) {
    if (std::isnan(f)) {
        f = 0.5f;
    }
    placement_ = std::clamp(f, 0.0f, 1.0f);
}

float Splitter::GetPlacement() const {
    float f = placement_;
    if (IsVisible()) {
        long extent = Extent(location_);
        long minA = Along(leftOrTop_->GetMinimumSize());
        long minB = Along(rightOrBottom_->GetMinimumSize());
        if (extent < minA + minB) {
            return 0.5f;
        }
        long a = 0, b = 0;
        GetPlacementSizes(a, b);
        if (a < minA) {
            CalcPlacement(Origin(location_) + minA, f);
        } else if (b < minB) {
            CalcPlacement(Origin(location_) + extent - minB, f);
        }
    }
    return std::clamp(f, 0.0f, 1.0f);
}

long Splitter::GetPixelPlacement() const {
    return RoundPlacement(Extent(location_), GetPlacement(), Origin(location_));
}

void Splitter::SetPixelPlacement(long pixel) {
    long extent = Extent(location_);
    if (extent != 0) {
        SetPlacement(static_cast<float>(pixel - Origin(location_)) / static_cast<float>(extent));
    }
}

long Splitter::CalcPixelPlacement(float f, RectT const& r) const {
    return RoundPlacement(Extent(r), f, Origin(r));
}

bool Splitter::CalcPlacement(long pixel, float& f) const {
    long extent = Extent(location_);
    if (extent == 0) {
        return false;
    }
    f = static_cast<float>(pixel - Origin(location_)) / static_cast<float>(extent);
    return true;
}

void Splitter::GetPlacementSizes(long& a, long& b) const {
    long pos = RoundPlacement(Extent(location_), placement_, Origin(location_));
    a = pos - Origin(location_);
    b = Extent(location_) - a;
}

void Splitter::SavePlacementState() {
    prevPlacement_ = GetPlacement();
    prevLocation_ = location_;
}

long Splitter::GetPrevPixelPlacement() const {
    return RoundPlacement(Extent(prevLocation_), prevPlacement_, Origin(prevLocation_));
}

void Splitter::GetPrevPlacementSizes(long& a, long& b) const {
    a = GetPrevPixelPlacement() - Origin(prevLocation_);
    b = Extent(prevLocation_) - a;
}

RectT Splitter::GetDrawRect() const {
    RectT r = location_;
    long bar = GetPixelPlacement();
    if (vertical_) {
        r.left = bar;
        r.width = 0;
    } else {
        r.top = bar;
        r.height = 0;
    }
    if (leftOrTop_) {
        LayoutManager* manager = leftOrTop_->GetLayoutManager();
        long h = manager ? manager->GetSplitterHalfWidth() : 0;
        r.left -= h;
        r.top -= h;
        r.width += 2 * h;
        r.height += 2 * h;
    }
    return r;
}

bool Splitter::ContainsPoint(long x, long y) const {
    RectT r = GetDrawRect();
    return r.width > 0 && r.height > 0 && r.left <= x && x < r.left + r.width && r.top <= y &&
           y < r.top + r.height;
}

PointT Splitter::Combine(PointT a, PointT b) const {
    if (vertical_) {
        return PointT(a.x + b.x, std::max(a.y, b.y));
    }
    return PointT(std::max(a.x, b.x), a.y + b.y);
}

bool Splitter::CachedReport(unsigned long& stamp, bool fitOnly) const {
    LayoutManager* manager = GetLayoutManager();
    unsigned long pass = manager ? manager->GetReportPass() : 0;
    if (pass == 0 || (fitOnly && manager->GetReportPassKind() != LayoutManager::ReportPassKind::Fit)) {
        return false;
    }
    if (stamp == pass) {
        return true;
    }
    stamp = pass; // the caller stores the value it computes now
    return false;
}

PointT Splitter::DoGetMinimumSize() const {
    if (CachedReport(minimumStamp_, false)) {
        return cachedMinimum_;
    }
    LayoutManagerElement* a = CountedFirst();
    LayoutManagerElement* b = CountedSecond();
    cachedMinimum_ = Combine(a ? a->GetMinimumSize() : PointT(), b ? b->GetMinimumSize() : PointT());
    return cachedMinimum_;
}

void Splitter::DoGetConstraintSize(PointT& size) const {
    if (CachedReport(constraintStamp_, true)) {
        size = cachedConstraint_;
        return;
    }
    PointT ca, cb;
    if (LayoutManagerElement* a = CountedFirst()) {
        a->GetConstraintSize(ca);
    }
    if (LayoutManagerElement* b = CountedSecond()) {
        b->GetConstraintSize(cb);
    }
    cachedConstraint_ = Combine(ca, cb);
    size = cachedConstraint_;
}

bool Splitter::DoGetIsStretchy(bool inHeight) const {
    if (CachedReport(stretchyStamp_[inHeight], true)) {
        return cachedStretchy_[inHeight];
    }
    LayoutManagerElement* a = CountedFirst();
    LayoutManagerElement* b = CountedSecond();
    cachedStretchy_[inHeight] = (a && a->IsStretchy(inHeight)) || (b && b->IsStretchy(inHeight));
    return cachedStretchy_[inHeight];
}

void Splitter::DoGetSnapSizes(std::vector<PointT>& sizes) const {
    if (LayoutManagerElement* a = CountedFirst()) {
        a->GetSnapSizes(sizes);
    }
    if (LayoutManagerElement* b = CountedSecond()) {
        std::size_t start = sizes.size();
        b->GetSnapSizes(sizes);
        long bar = GetPixelPlacement();
        for (std::size_t i = start; i < sizes.size(); ++i) {
            (vertical_ ? sizes[i].x : sizes[i].y) += static_cast<std::int32_t>(bar);
        }
    }
}

bool Splitter::AllowSnapping(bool inHeight, Frame* dragged) const {
    if (LayoutManagerElement* a = CountedFirst(); a && !a->AllowSnapping(inHeight, dragged)) {
        return false;
    }
    if (LayoutManagerElement* b = CountedSecond(); b && !b->AllowSnapping(inHeight, dragged)) {
        return false;
    }
    return true;
}

} // namespace orvworkspace::workspace
