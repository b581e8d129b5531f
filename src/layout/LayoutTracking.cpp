// Starting a splitter drag: the tracker for the bars under the mouse, and the walk for the bars a
// dragged one may line up with.
#include "layout/LayoutManager.h"
#include "layout/SnapPoint.h"
#include "layout/Splitter.h"
#include "layout/SplitterTrackerMark2.h"

#include <algorithm>

namespace orvworkspace::workspace {

void LayoutManager::AcquireTracker(long x, long y, orvcore::utility::ScopedPtr<Tracker>& out) {
    out.reset();
    std::vector<Splitter*> hits = FindSplittersContainingPoint(x, y);
    if (hits.empty()) {
        return;
    }
    for (Splitter* s : hits) {
        MajorizeSplitter(s);
    }
    out = std::make_unique<SplitterTrackerMark2>(this, hits);
}

void LayoutManager::FindAdjacentSnapPoints(Splitter* dragged, bool vertical, long, long,
                                           std::vector<Splitter*> const& excluded,
                                           std::vector<SnapPoint*>& out) {
    DoFindAdjacentSnapPoints(dragged, rootSplitter_, vertical, excluded, out);
}

void LayoutManager::DoFindAdjacentSnapPoints(Splitter* dragged, Splitter* start, bool vertical,
                                             std::vector<Splitter*> const& excluded,
                                             std::vector<SnapPoint*>& out) {
    for (Splitter* s = start; s; s = AsSplitter(s->GetRightOrBottom())) {
        if (!s->IsVisible() || s->IsVertical() != vertical ||
            std::find(excluded.begin(), excluded.end(), s) != excluded.end()) {
            return;
        }
        out.push_back(new SnapPoint{dragged, 0, s, nullptr, true});
        if (Splitter* first = AsSplitter(s->GetLeftOrTop()); first && s->IsLeftOrTopSubtreeVisible()) {
            DoFindAdjacentSnapPoints(dragged, first, vertical, excluded, out);
        }
    }
}

} // namespace orvworkspace::workspace
