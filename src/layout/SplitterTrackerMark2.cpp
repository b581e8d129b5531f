// Dragging bars: ranges and snap candidates fixed at the start, then every move clamps, snaps and
// relays out the two sides of each bar.
#include "layout/SplitterTrackerMark2.h"

#include "layout/Frame.h"
#include "layout/LayoutManagerHostInterface.h"
#include "layout/Splitter.h"

#include <algorithm>

namespace orvworkspace::workspace {

namespace {

std::int32_t& Along(Splitter const* s, PointT& p) {
    return s->IsVertical() ? p.x : p.y;
}

} // namespace

SplitterTrackerMark2::SplitterTrackerMark2(LayoutManager* layoutManager,
                                           std::vector<Splitter*> const& splitters)
    : tabMinWidth_(layoutManager->GetTabMinWidth())
    , tabMinHeight_(layoutManager->GetTabMinHeight())
    , splitterHalfWidth_(splitters.empty() || !splitters.front()->GetLayoutManager()
                             ? layoutManager->GetSplitterHalfWidth()
                             : splitters.front()->GetLayoutManager()->GetSplitterHalfWidth())
    , layoutManager_(layoutManager) {
    for (Splitter* s : splitters) {
        SplitterTrackRecord record;
        record.splitter = s;
        record.startPlacement = s->GetPlacement();
        records_.push_back(record);
    }
}

SplitterTrackerMark2::~SplitterTrackerMark2() {
    for (SplitterTrackRecord& record : records_) {
        for (SnapPoint* p : record.ownedFirst) {
            delete p;
        }
        for (SnapPoint* p : record.ownedSecond) {
            delete p;
        }
    }
}

void SplitterTrackerMark2::TrackBegin(PointT const& point) {
    startPoint_ = lastPoint_ = point;
    for (SplitterTrackRecord& record : records_) {
        record.splitter->SetConstrained(true);
        PrepareRecord(record);
    }
}

void SplitterTrackerMark2::AddCandidate(SplitterTrackRecord& record, SnapPoint point, bool first) {
    auto* candidate = new SnapPoint(point);
    (record.splitter->IsVertical() ? record.snapsX : record.snapsY).push_back(candidate);
    (first ? record.ownedFirst : record.ownedSecond).push_back(candidate);
}

void SplitterTrackerMark2::Walk(SplitterTrackRecord& record, LayoutManagerElement* e, bool first) {
    Splitter* dragged = record.splitter;
    bool inHeight = !dragged->IsVertical();
    if (Splitter* s = AsSplitter(e)) {
        if (!s->IsVisible() || s->IsVertical() == dragged->IsVertical()) {
            // A bar behind the dragged one: it takes a tab's length of the range, and its frames are
            // looked at unless it gives way anyway.
            if (s->IsVisible()) {
                record.excluded.push_back(s);
                ++(first ? record.countFirst : record.countSecond);
            }
            if (!s->IsStretchy(inHeight)) {
                if (s->IsLeftOrTopSubtreeVisible()) {
                    Walk(record, s->GetLeftOrTop(), first);
                }
                if (s->IsRightOrBottomSubtreeVisible()) {
                    Walk(record, s->GetRightOrBottom(), first);
                }
            }
        } else if (!s->IsStretchy(inHeight)) {
            PointT constraint;
            s->GetConstraintSize(constraint);
            long size = dragged->Along(constraint);
            if (size != 0) {
                AddCandidate(record, SnapPoint{dragged, size, s, nullptr, first}, first);
            }
        }
    } else if (Frame* f = AsFrame(e)) {
        Frame*& nearest = first ? record.nearestFirstFrame : record.nearestSecondFrame;
        auto coordinate = [&](Frame* frame) {
            RectT r = frame->GetFrameLocalRect();
            return dragged->IsVertical() ? r.left : r.top;
        };
        if (!nearest || (first ? coordinate(f) > coordinate(nearest) : coordinate(f) < coordinate(nearest))) {
            nearest = f;
        }
    }
}

void SplitterTrackerMark2::PrepareRecord(SplitterTrackRecord& record) {
    Splitter* s = record.splitter;
    bool inHeight = !s->IsVertical();
    RectT location = s->GetLocation();
    record.rangeMin = s->Origin(location);
    record.rangeMax = s->Origin(location) + s->Extent(location);
    if (s->IsLeftOrTopSubtreeVisible()) {
        Walk(record, s->GetLeftOrTop(), true);
    }
    if (s->IsRightOrBottomSubtreeVisible()) {
        Walk(record, s->GetRightOrBottom(), false);
    }
    // The frames next to the bar offer their preferred sizes, unless their side gives way anyway.
    for (bool first : {true, false}) {
        LayoutManagerElement* child = first ? s->GetLeftOrTop() : s->GetRightOrBottom();
        Frame* nearest = first ? record.nearestFirstFrame : record.nearestSecondFrame;
        if (!child || !nearest || child->IsStretchy(inHeight)) {
            continue;
        }
        std::vector<PointT> sizes;
        nearest->GetSnapSizes(sizes);
        for (PointT const& size : sizes) {
            if (long along = s->Along(size)) {
                AddCandidate(record, SnapPoint{s, along, nullptr, nearest, first}, first);
            }
        }
    }
    long tab = s->IsVertical() ? tabMinWidth_ : tabMinHeight_;
    record.rangeMin += (record.countFirst + 1) * tab;
    record.rangeMax -= (record.countSecond + 1) * tab;

    record.excluded.push_back(s);
    std::vector<SnapPoint*>& snaps = s->IsVertical() ? record.snapsX : record.snapsY;
    std::size_t before = snaps.size();
    long from = s->IsVertical() ? location.top : location.left;
    long to = s->IsVertical() ? location.Bottom() : location.Right();
    layoutManager_->FindAdjacentSnapPoints(s, s->IsVertical(), from, to, record.excluded, snaps);
    record.ownedFirst.insert(record.ownedFirst.end(), snaps.begin() + long(before), snaps.end());
}

void SplitterTrackerMark2::TrackMove(PointT const& point) {
    if (point == lastPoint_) {
        return;
    }
    for (SplitterTrackRecord& record : records_) {
        layoutManager_->RefreshVisibility(record.splitter);
        record.splitter->SetConstrained(true);
    }
    bool snappedX = false, snappedY = false;
    PointT snapPos;
    for (SplitterTrackRecord& record : records_) {
        MoveRecord(record, point, snappedX, snappedY, snapPos);
    }
    lastPoint_ = point;
    if (LayoutManagerHostInterface* host = layoutManager_->GetHostInterface()) {
        host->UpdateNow();
    }
}

void SplitterTrackerMark2::MoveRecord(SplitterTrackRecord& record, PointT const& point, bool& snappedX,
                                      bool& snappedY, PointT& snapPos) {
    Splitter* s = record.splitter;
    bool inHeight = !s->IsVertical();
    bool snapping = layoutManager_->SplitterSnappingEnabled();
    PointT target = point;
    bool& snapped = s->IsVertical() ? snappedX : snappedY;
    if (snapped) {
        // An earlier bar on this axis snapped: this one follows it exactly, range or not.
        Along(s, target) = Along(s, snapPos);
    } else {
        std::vector<SnapPoint*> const& candidates = s->IsVertical() ? record.snapsX : record.snapsY;
        if (snapping && !candidates.empty()) {
            for (SnapPoint* candidate : candidates) {
                snapped = candidate->Snap(target);
                if (snapped) {
                    break;
                }
            }
        }
        Along(s, target) = std::int32_t(
            std::clamp<long>(Along(s, target), record.rangeMin, std::max(record.rangeMin, record.rangeMax)));
        if (snapped) {
            Along(s, snapPos) = Along(s, target);
        }
    }
    PointT delta;
    Along(s, delta) = std::int32_t(Along(s, target) - s->GetPixelPlacement());
    if (Along(s, delta) == 0) {
        return;
    }
    s->SetPixelPlacement(Along(s, target));
    auto givesWay = [&](LayoutManagerElement* child) { return !child || child->IsStretchy(inHeight); };
    bool keepFirst = !snapping || givesWay(s->GetLeftOrTop());
    bool keepSecond = !snapping || givesWay(s->GetRightOrBottom());
    layoutManager_->LayoutSplitterChildren(s, true, keepFirst, keepSecond, &delta);
}

} // namespace orvworkspace::workspace
