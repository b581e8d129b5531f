// The tracker of a splitter drag: moves one bar, or the bars of a crossing, under the mouse within
// ranges that leave room for the frames behind them, snaps them to preferred positions and relays
// out both sides after every move. Made by LayoutManager::AcquireTracker; owns its snap points.
#pragma once

#include "layout/LayoutManager.h"
#include "layout/SnapPoint.h"

#include <memory>
#include <vector>

namespace orvworkspace::workspace {

// What the tracker knows of one dragged splitter.
struct SplitterTrackRecord {
    Splitter* splitter = nullptr;
    Frame* nearestFirstFrame = nullptr;
    Frame* nearestSecondFrame = nullptr;
    float startPlacement = 0.5f;
    long rangeMin = 0;
    long rangeMax = 0;
    long countFirst = 0;
    long countSecond = 0;
    std::vector<SnapPoint*> snapsX;
    std::vector<SnapPoint*> snapsY;
    std::vector<SnapPoint*> ownedFirst;
    std::vector<SnapPoint*> ownedSecond;
    std::vector<Splitter*> excluded;
};

class SplitterTrackerMark2 : public LayoutManager::Tracker {
public:
    SplitterTrackerMark2(LayoutManager* layoutManager, std::vector<Splitter*> const& splitters);
    ~SplitterTrackerMark2() override;

    void TrackBegin(PointT const& point) override;
    void TrackMove(PointT const& point) override;
    void TrackEnd() override {}

    std::vector<SplitterTrackRecord> const& GetRecords() const { return records_; }

private:
    void PrepareRecord(SplitterTrackRecord& record);
    void Walk(SplitterTrackRecord& record, LayoutManagerElement* e, bool first);
    void AddCandidate(SplitterTrackRecord& record, SnapPoint point, bool first);
    void MoveRecord(SplitterTrackRecord& record, PointT const& point, bool& snappedX, bool& snappedY,
                    PointT& snapPos);

    std::vector<SplitterTrackRecord> records_;
    PointT startPoint_;
    PointT lastPoint_;
    long tabMinWidth_;
    long tabMinHeight_;
    long splitterHalfWidth_;
    LayoutManager* layoutManager_;
};

} // namespace orvworkspace::workspace
