// The split tree of one window and everything done to it: edits (root frame, frames added beside
// others, removed with or without a placeholder, the tree swapped, a frame maximised, fixed border
// frames), walks and hit tests, and the relayout that places every frame inside the window.
//
// The manager owns one hidden horizontal root splitter whose first child is the real root element,
// every splitter below it and every placeholder; frames belong to their widgets. The engine never
// throws: requests that cannot apply do nothing, and queries that find nothing return null or an
// empty rectangle.
#pragma once

#include "host/core/ScopedPtr.h"
#include "layout/FrameZones.h"
#include "layout/LayoutTypes.h"

#include <iosfwd>
#include <list>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace orvworkspace::workspace {

class DropZone;
class Frame;
class FrameDataProxy;
struct SnapPoint;
class LayoutManagerElement;
class LayoutManagerHostInterface;
class Splitter;

class LayoutManager {
public:
    // The side of a new frame in AddFrame, and the place of a static border frame.
    enum InsertionType { Top = 0, Left = 1, Bottom = 2, Right = 3 };
    // What lies under a point: no bar, one bar of either orientation, or a crossing of bars.
    enum CursorType { NoSplitter = 0, VerticalSplitter = 1, HorizontalSplitter = 2, SplitterCrossing = 3 };

    // Moves bars under the mouse during a splitter drag; points are in layout coordinates.
    class Tracker {
    public:
        virtual ~Tracker() = default;
        virtual void TrackBegin(PointT const& point) = 0;
        virtual void TrackMove(PointT const& point) = 0;
        virtual void TrackEnd() = 0;
    };

    explicit LayoutManager(LayoutManagerHostInterface* host);
    ~LayoutManager();
    LayoutManager(LayoutManager const&) = delete;
    LayoutManager& operator=(LayoutManager const&) = delete;

    LayoutManagerHostInterface* GetHostInterface() const { return host_; }
    Splitter* GetRootSplitter() const { return rootSplitter_; }
    bool LayoutEnabled() const;
    bool SplitterSnappingEnabled() const;
    long GetTabMinHeight() const;
    long GetTabMinWidth() const;

    // --- Tree edits ---

    // Starts the tree with f, or puts f above a tree whose whole content is hidden; then lays out.
    void SetRootFrame(Frame* f, RectT const& rect);
    // Puts newFrame beside target (beside the whole layout when target is null) and lays out. On an
    // empty tree newFrame simply becomes the root.
    void AddFrame(Frame* target, InsertionType side, Frame* newFrame);
    // Takes f out of the tree: collapsing its parent, or leaving a placeholder in its place that
    // remembers f itself (rememberFrame) or its tabs. A frame not in this tree is left alone.
    void RemoveFrame(Frame* f, bool keepPlace, bool rememberFrame);
    // Replaces the whole tree by the one under newRoot (which becomes the root splitter) and collects
    // its placeholders. No layout.
    void SwapRoot(Splitter* newRoot);

    void SetStaticBorderFrame(Frame* f, RectT const& rect, InsertionType type, bool relayout);
    Frame* GetStaticBorderFrame(InsertionType type) const;
    bool HasStaticBorderFrame(InsertionType type) const;
    void EnableLeftStaticBorderAsSecondTopFrame(bool enable) { leftStaticBorderAsSecondTop_ = enable; }
    bool GetEnableLeftStaticBorderAsSecondTopFrame() const { return leftStaticBorderAsSecondTop_; }

    // Maximises f (hiding every other shown frame) or, with null, restores them; then lays out.
    void SetMaximizedFrame(Frame* f);
    Frame* GetMaximizedFrame() { return maximizedFrame_; }
    Frame const* GetMaximizedFrame() const { return maximizedFrame_; }
    bool HasMaximizedFrame() const { return maximizedFrame_ != nullptr; }
    bool IsTheMaximizedFrame(Frame const* f) const { return f && f == maximizedFrame_; }

    // Makes s the top of its chain of same-orientation splitters without changing the order of the
    // leaves, then refits that part of the tree.
    void MajorizeSplitter(Splitter* s);
    // The top of the chain of same-orientation splitters that s belongs to.
    Splitter* FindMajorSplitter(Splitter* s) const;

    // --- Placeholders ---

    // The first placeholder (in creation order) holding a tab of this type, or null.
    FrameDataProxy* FindFrameForReanimation(std::string const& tabType) const;
    // The first placeholder remembering f, or null.
    FrameDataProxy* FindFrameForReanimation(Frame const* f) const;
    bool HasAnyReanimatableFrames() const { return !reanimatableProxies_.empty(); }
    // Puts f into the placeholder's slot and deletes the placeholder; the caller lays out with
    // LayoutNewFrame. Nothing happens when proxy is not one of this layout's placeholders.
    void ReanimateFrame(LayoutManagerElement* proxy, Frame* f);

    // --- Previews ---

    // The rectangle newFrame would get from AddFrame(target, side, newFrame), worked out on a copy
    // of the tree; the real frames are neither placed nor asked to show. Empty when target has no
    // copy (it is not in this tree).
    RectT PreviewAddFrame(Frame* target, InsertionType side, Frame* newFrame);
    // The rectangle `other` (by default f's sibling, when that is a frame) would get once f is
    // removed, worked out on a copy. Empty when there is no such frame.
    RectT PreviewRemoveFrame(Frame* f, Frame* other) const;

    // --- Dragging ---

    // The six drop regions of frame when its rectangle is rect: side bands, centre and tab row, in
    // that order. exclusions holds four insets by InsertionType taken by the window's edge regions.
    std::vector<DropZone> GetDropZones(Frame* frame, RectT const& rect, std::vector<long> const& exclusions);
    // A tracker for the bars under (x, y), each majorized first; out stays empty when no bar is there
    // (always while a frame is maximised). Whatever out held before is deleted.
    void AcquireTracker(long x, long y, orvcore::utility::ScopedPtr<Tracker>& out);
    // Appends the positions of the visible bars of the given orientation that a chain walk from the
    // root splitter meets, skipping the excluded ones; from and to are not consulted.
    void FindAdjacentSnapPoints(Splitter* dragged, bool vertical, long from, long to,
                                std::vector<Splitter*> const& excluded, std::vector<SnapPoint*>& out);

    // --- Settings ---

    void SetBorderSize(long size) { borderSize_ = size; }
    long GetBorderSize() const { return borderSize_; }
    void SetSplitterHalfWidth(long halfWidth) { splitterHalfWidth_ = halfWidth; }
    long GetSplitterHalfWidth() const { return splitterHalfWidth_; }
    // Stores the rectangle only; no layout.
    void SetContainingRect(RectT const& rect) { containingRect_ = rect; }
    RectT GetContainingRect() const { return containingRect_; }
    void SetUserAdjustingSplitter(bool adjusting) { userAdjustingCount_ += adjusting ? 1 : -1; }
    bool GetUserAdjustingSplitter() const { return userAdjustingCount_ > 0; }

    // --- Layout ---

    // Lays out the whole window inside rect: static border frames first, then the maximised frame
    // or the tree. Nothing while layout is disabled or rect is empty.
    void Layout(RectT const& rect, bool distribute, bool refresh, bool keepBarPositions);
    void ReLayout(bool distribute, bool refresh, bool keepBarPositions);
    // Places one subtree in rect; delta is how much rect grew since the last pass (may be null).
    void FitNodeToRect(LayoutManagerElement* e, RectT rect, RectT containing, bool distribute,
                       bool preferFirst, bool keepBarPositions, PointT* delta);
    // Re-places the subtree on one side of s's bar.
    void LayoutSplitterChild(Splitter* s, LayoutManagerElement* child, bool distribute, bool childIsFirst,
                             bool preferFirst, bool keepBarPositions, bool updateNow, PointT* delta);
    // Re-places both sides of s's bar, each preferring the part next to the bar. delta is required.
    void LayoutSplitterChildren(Splitter* s, bool distribute, bool keepFirst, bool keepSecond, PointT* delta);
    // The layout that follows adding or reanimating f; false when f has no visible splitter above it.
    bool LayoutNewFrame(Frame* f);
    // Cuts a frame rectangle into its edge strips, content and whole.
    FrameZones ConstructFrameZones(RectT const& r) const;

    // --- Walks and queries ---

    // Every frame leaf, shown or hidden, left to right; placeholders skipped.
    std::vector<Frame*> GetFrames() const;
    // The splitters below the root splitter with both branches visible, in pre-order.
    std::vector<Splitter*> GetSplitters() const;
    // The other visible splitters spanning exactly the same range as s across s's axis.
    std::vector<Splitter*> FindAllSplittersInSameRowCol(Splitter* s) const;
    CursorType HitCheckCursor(long x, long y) const;
    // The visible splitters whose bar contains the point, in pre-order; none while maximised.
    std::vector<Splitter*> FindSplittersContainingPoint(long x, long y) const;
    // Checks the tree's structure and, in debug builds, stops on the first fault. Changes nothing.
    void AssertStructureOK() const;
    // The first structural fault found, empty when there is none: parent links, the root splitter's
    // shape, nodes belonging to this layout, every frame once, placeholders listed exactly once, a
    // maximised frame in the tree. With checkVisibility, also that the branch flags agree with the
    // frames' shown state, as they do right after a refresh.
    std::string StructureProblem(bool checkVisibility = false) const;
    // Writes the tree as a Graphviz digraph.
    void DumpToGraphvis(std::ostream& out) const;

    // While a pass is under way, splitters remember the reports of their subtrees (0: no pass).
    // Within a refresh only minimum sizes are remembered (the refresh itself changes the frames'
    // constraints); within a fit, constraints and stretchiness too. Nothing a pass does changes a
    // report it has already given out: a subtree's reports are asked before any of its frames is
    // placed, and a frame's reports depend on that frame alone. This keeps a pass linear in the
    // number of nodes instead of growing with their depth.
    enum class ReportPassKind { None, Refresh, Fit };
    unsigned long GetReportPass() const { return reportCacheEnabled ? reportPass_ : 0; }
    // Turns the remembering off process-wide, so a test can check that it changes no result.
    static void SetReportCacheEnabled(bool enabled) { reportCacheEnabled = enabled; }
    ReportPassKind GetReportPassKind() const { return reportPassKind_; }

protected:
    // The real root element: the root splitter's first child.
    LayoutManagerElement* GetRoot() const;

private:
    friend class SplitterTrackerMark2;

    void DoFindAdjacentSnapPoints(Splitter* dragged, Splitter* start, bool vertical,
                                  std::vector<Splitter*> const& excluded, std::vector<SnapPoint*>& out);

    // A second layout over an already built tree (a preview's copy), with this one's sizes.
    LayoutManager(LayoutManager const& source, LayoutManagerHostInterface* host, Splitter* root,
                  RectT const& rect);

    // Opens a report pass of a kind for its lifetime, unless one of that kind is already open.
    class ReportPassScope {
    public:
        ReportPassScope(LayoutManager& manager, ReportPassKind kind);
        ~ReportPassScope();
        ReportPassScope(ReportPassScope const&) = delete;
        ReportPassScope& operator=(ReportPassScope const&) = delete;

    private:
        LayoutManager& manager_;
        unsigned long savedPass_;
        ReportPassKind savedKind_;
    };

    // The recursive refresh below RefreshVisibility, inside its report pass.
    bool RefreshBranch(LayoutManagerElement* e);
    // Whether e hangs below the root splitter through links that agree both ways.
    bool IsInTree(LayoutManagerElement const* e) const;
    // Recomputes visibility flags, saved placements and frame constraints below e; whether e's
    // branch holds a shown frame.
    bool RefreshVisibility(LayoutManagerElement* e);
    // The nearest ancestor splitter of e with both branches visible, and whether the path came up
    // through its first child.
    Splitter* FindNearestVisibleSplitter(LayoutManagerElement* e, bool* cameFromFirst = nullptr) const;
    void FitSplitter(Splitter* s, RectT const& rect, RectT const& containing, bool distribute,
                     bool preferFirst, bool keep, PointT* delta);
    void DistributeExtent(Splitter* s, RectT const& rect, bool preferFirst, PointT const* delta);
    // The part of s's location on one side of its bar (all of it when a branch is hidden).
    RectT ChildRect(Splitter* s, bool first) const;
    void PlaceStaticBorderFrames(RectT const& rect, RectT& remaining);
    void PlaceFrame(Frame* f, RectT const& rect);
    void DeleteSplittersBelow(LayoutManagerElement* e);

    LayoutManagerHostInterface* host_;
    Splitter* rootSplitter_;
    RectT containingRect_;
    long borderSize_ = 1;
    long splitterHalfWidth_ = 2;
    int userAdjustingCount_ = 0;
    std::list<FrameDataProxy*> reanimatableProxies_;
    std::map<InsertionType, Frame*> staticBorderFrames_;
    bool leftStaticBorderAsSecondTop_ = false;
    Frame* maximizedFrame_ = nullptr;
    std::list<Frame*> framesHiddenByMaximize_;
    static inline bool reportCacheEnabled = true;
    // Pass numbers are unique in the process, so a splitter moved between layouts (a restored tree
    // swapped in) can never mistake an old stamp for the current pass.
    static inline unsigned long lastReportPass_ = 0;
    unsigned long reportPass_ = 0;
    ReportPassKind reportPassKind_ = ReportPassKind::None;
};

} // namespace orvworkspace::workspace
