// The split tree's edits, walks, hit tests, structure check and dump. Sizing and relayout live in
// LayoutSizing.cpp.
#include "layout/LayoutManager.h"

#include "layout/Frame.h"
#include "layout/FrameDataProxy.h"
#include "layout/LayoutManagerHostInterface.h"
#include "layout/Splitter.h"

#include <algorithm>
#include <cassert>
#include <functional>
#include <map>
#include <ostream>
#include <set>

namespace orvworkspace::workspace {

namespace {

// Calls visit for e and every node below it, a node before its first subtree before its second.
void PreOrder(LayoutManagerElement* e, std::function<void(LayoutManagerElement*)> const& visit) {
    if (!e) {
        return;
    }
    visit(e);
    if (Splitter* s = AsSplitter(e)) {
        PreOrder(s->GetLeftOrTop(), visit);
        PreOrder(s->GetRightOrBottom(), visit);
    }
}

// The child that is not `child`, or null when child is neither.
LayoutManagerElement* OtherChild(Splitter* parent, LayoutManagerElement* child) {
    if (parent->GetLeftOrTop() == child) {
        return parent->GetRightOrBottom();
    }
    if (parent->GetRightOrBottom() == child) {
        return parent->GetLeftOrTop();
    }
    return nullptr;
}

} // namespace

LayoutManager::LayoutManager(LayoutManagerHostInterface* host)
    : host_(host)
    , rootSplitter_(new Splitter(this, false)) {}

LayoutManager::~LayoutManager() {
    // Frames outlive the layout with their widgets; they must not point into freed splitters.
    for (Frame* f : GetFrames()) {
        f->SetParent(nullptr);
    }
    DeleteSplittersBelow(GetRoot());
    delete rootSplitter_;
    for (FrameDataProxy* proxy : reanimatableProxies_) {
        delete proxy;
    }
}

void LayoutManager::DeleteSplittersBelow(LayoutManagerElement* e) {
    std::vector<Splitter*> splitters;
    PreOrder(e, [&](LayoutManagerElement* node) {
        if (Splitter* s = AsSplitter(node)) {
            splitters.push_back(s);
        }
    });
    for (Splitter* s : splitters) {
        delete s;
    }
}

LayoutManagerElement* LayoutManager::GetRoot() const {
    return rootSplitter_->GetLeftOrTop();
}

bool LayoutManager::LayoutEnabled() const {
    return host_ && host_->GetLayoutEnabled();
}
bool LayoutManager::SplitterSnappingEnabled() const {
    return host_ && host_->GetSplitterSnappingEnabled();
}
long LayoutManager::GetTabMinHeight() const {
    return host_ ? host_->GetTabMinHeight() : 0;
}
long LayoutManager::GetTabMinWidth() const {
    return host_ ? host_->GetTabMinWidth() : 0;
}

bool LayoutManager::IsInTree(LayoutManagerElement const* e) const {
    if (!e) {
        return false;
    }
    for (LayoutManagerElement const* node = e; node != rootSplitter_;) {
        Splitter* parent = node->GetParent();
        if (!parent || (parent->GetLeftOrTop() != node && parent->GetRightOrBottom() != node)) {
            return false;
        }
        node = parent;
    }
    return e != rootSplitter_;
}

// --- Tree edits ---

void LayoutManager::SetRootFrame(Frame* f, RectT const& rect) {
    if (!f || IsInTree(f)) {
        return;
    }
    if (LayoutManagerElement* oldRoot = GetRoot()) {
        if (rootSplitter_->GetLeftOrTopVisibleFlag()) {
            return;
        }
        // The whole tree is hidden (say only placeholders are left): the new frame goes above it.
        Splitter* s = new Splitter(this, false);
        s->SetParent(rootSplitter_);
        rootSplitter_->SetLeftOrTop(s);
        s->SetLeftOrTop(f);
        s->SetRightOrBottom(oldRoot);
        f->SetParent(s);
        oldRoot->SetParent(s);
    } else {
        rootSplitter_->SetLeftOrTop(f);
        f->SetParent(rootSplitter_);
    }
    f->SetLayoutManager(this);
    Layout(rect, false, true, false);
}

void LayoutManager::AddFrame(Frame* target, InsertionType side, Frame* newFrame) {
    if (!newFrame || newFrame == target || IsInTree(newFrame)) {
        return;
    }
    newFrame->SetLayoutManager(this);
    if (!GetRoot()) {
        // Nothing to put it beside: the new frame starts the tree.
        rootSplitter_->SetLeftOrTop(newFrame);
        newFrame->SetParent(rootSplitter_);
        rootSplitter_->SetLeftOrTopVisible(true);
        Layout(containingRect_, false, true, false);
        return;
    }
    RefreshVisibility(rootSplitter_);
    if (maximizedFrame_) {
        SetMaximizedFrame(nullptr);
    }
    Splitter* s = new Splitter(this, side == Left || side == Right);
    MajorizeSplitter(s);
    // A target that is not in this tree is taken as the whole layout, so the frame still lands.
    LayoutManagerElement* anchor = IsInTree(target) ? static_cast<LayoutManagerElement*>(target) : GetRoot();
    Splitter* parent = anchor->GetParent();
    anchor->SetParent(s);
    s->SetParent(parent);
    parent->ReplaceElement(anchor, s);
    if (side == Left || side == Top) {
        s->SetLeftOrTop(newFrame);
        s->SetRightOrBottom(anchor);
    } else {
        s->SetLeftOrTop(anchor);
        s->SetRightOrBottom(newFrame);
    }
    newFrame->SetParent(s);
    LayoutNewFrame(newFrame);
}

void LayoutManager::RemoveFrame(Frame* f, bool keepPlace, bool rememberFrame) {
    if (!IsInTree(f)) {
        return;
    }
    if (maximizedFrame_) {
        SetMaximizedFrame(nullptr);
    }
    Splitter* parent = f->GetParent();
    Splitter* grandParent = parent->GetParent();
    Splitter* visible = FindNearestVisibleSplitter(f);
    Splitter* major = visible ? FindMajorSplitter(visible) : nullptr;

    if (keepPlace) {
        bool wasFirst = parent->GetLeftOrTop() == f;
        TabDataList first, second, third;
        f->GetTabData(first, second, third);
        FrameDataProxy* proxy;
        if (rememberFrame) {
            proxy = new FrameDataProxy(this, f, second);
        } else {
            first.insert(first.end(), second.begin(), second.end());
            first.insert(first.end(), third.begin(), third.end());
            proxy = new FrameDataProxy(this, std::move(first));
        }
        proxy->SetParent(parent);
        reanimatableProxies_.push_back(proxy);
        parent->ReplaceElement(f, proxy);
        if (wasFirst) {
            parent->SetLeftOrTopVisible(false);
        } else {
            parent->SetRightOrBottomVisible(false);
        }
    } else {
        LayoutManagerElement* sibling = OtherChild(parent, f);
        if (sibling && grandParent) {
            grandParent->ReplaceElement(parent, sibling);
            sibling->SetParent(grandParent);
            if (!parent->IsPreviewCopy()) {
                delete parent;
            }
            if (major == parent) {
                Splitter* s = AsSplitter(sibling);
                major = s ? FindMajorSplitter(s) : nullptr;
            }
        } else {
            parent->ReplaceElement(f, nullptr);
        }
    }
    f->SetParent(nullptr);

    if (LayoutEnabled()) {
        Layout(containingRect_, false, true, false);
        if (major) {
            FitNodeToRect(major, major->GetLocation(), containingRect_, true, true, false, nullptr);
        }
    }
}

void LayoutManager::SwapRoot(Splitter* newRoot) {
    if (newRoot == rootSplitter_) {
        return;
    }
    std::vector<Frame*> oldFrames = GetFrames();
    std::set<Splitter*> oldSplitters;
    PreOrder(GetRoot(), [&](LayoutManagerElement* e) {
        if (Splitter* s = AsSplitter(e)) {
            oldSplitters.insert(s);
        }
    });
    oldSplitters.insert(rootSplitter_);

    rootSplitter_ = newRoot ? newRoot : new Splitter(this, false);
    rootSplitter_->SetParent(nullptr);
    for (Splitter* s : oldSplitters) {
        delete s;
    }
    for (FrameDataProxy* proxy : reanimatableProxies_) {
        delete proxy;
    }
    reanimatableProxies_.clear();
    // Frames that did not move into the new tree no longer have a parent here.
    for (Frame* f : oldFrames) {
        if (oldSplitters.count(f->GetParent())) {
            f->SetParent(nullptr);
        }
    }
    rootSplitter_->SetLayoutManager(this);
    PreOrder(GetRoot(), [&](LayoutManagerElement* e) {
        e->SetLayoutManager(this);
        if (FrameDataProxy* proxy = AsPlaceholder(e)) {
            reanimatableProxies_.push_back(proxy);
        }
    });
    // Frames hidden by a maximise that did not come along are no longer this layout's to show; if
    // the maximised frame itself did not come along, the ones that did are shown again.
    framesHiddenByMaximize_.remove_if([&](Frame* f) { return !IsInTree(f); });
    if (maximizedFrame_ && !IsInTree(maximizedFrame_)) {
        maximizedFrame_ = nullptr;
        for (Frame* hidden : framesHiddenByMaximize_) {
            hidden->ShowFrame(true);
        }
        framesHiddenByMaximize_.clear();
    }
}

void LayoutManager::SetStaticBorderFrame(Frame* f, RectT const& rect, InsertionType type, bool relayout) {
    staticBorderFrames_[type] = f;
    if (relayout) {
        Layout(rect, false, true, true);
    }
}

Frame* LayoutManager::GetStaticBorderFrame(InsertionType type) const {
    auto it = staticBorderFrames_.find(type);
    return it == staticBorderFrames_.end() ? nullptr : it->second;
}

bool LayoutManager::HasStaticBorderFrame(InsertionType type) const {
    return GetStaticBorderFrame(type) != nullptr;
}

void LayoutManager::SetMaximizedFrame(Frame* f) {
    if (f && (f == maximizedFrame_ || !IsInTree(f))) {
        return;
    }
    if (f && maximizedFrame_) {
        // Going straight from one maximised frame to another: bring the others back first, or they
        // would stay hidden for good.
        SetMaximizedFrame(nullptr);
    }
    maximizedFrame_ = f;
    if (!f) {
        for (Frame* hidden : framesHiddenByMaximize_) {
            hidden->ShowFrame(true);
        }
        framesHiddenByMaximize_.clear();
    } else {
        framesHiddenByMaximize_.clear();
        for (Frame* other : GetFrames()) {
            if (other != f && other->IsFrameShown()) {
                framesHiddenByMaximize_.push_back(other);
                other->ShowFrame(false);
            }
        }
    }
    Layout(containingRect_, false, true, false);
}

Splitter* LayoutManager::FindMajorSplitter(Splitter* s) const {
    if (!s) {
        return nullptr;
    }
    Splitter* top = s;
    for (Splitter* p = s->GetParent(); p && p->GetParent() && p->IsVertical() == s->IsVertical();
         p = p->GetParent()) {
        top = p;
    }
    return top;
}

void LayoutManager::MajorizeSplitter(Splitter* s) {
    if (!s) {
        return;
    }
    RefreshVisibility(rootSplitter_);
    Splitter* major = FindMajorSplitter(s);
    if (major == s) {
        return;
    }
    Splitter* top = major->GetParent();
    RectT location = major->GetLocation();
    RefreshVisibility(major);
    while (s->GetParent() != top) {
        Splitter* q = s->GetParent();
        Splitter* g = q->GetParent();
        LayoutManagerElement* t;
        if (q->GetRightOrBottom() == s) {
            t = s->GetLeftOrTop();
            s->SetLeftOrTop(q);
            q->SetRightOrBottom(t);
        } else {
            t = s->GetRightOrBottom();
            s->SetRightOrBottom(q);
            q->SetLeftOrTop(t);
        }
        s->SetParent(g);
        q->SetParent(s);
        if (t) {
            t->SetParent(q);
        }
        if (g->GetRightOrBottom() == q) {
            g->SetRightOrBottom(s);
        } else {
            g->SetLeftOrTop(s);
        }
        RectT sLocation = s->GetLocation();
        s->SetLocation(q->GetLocation());
        q->SetLocation(sLocation);
    }
    if (LayoutEnabled()) {
        FitNodeToRect(s, location, containingRect_, true, true, true, nullptr);
        RefreshVisibility(s);
    }
}

// --- Placeholders ---

FrameDataProxy* LayoutManager::FindFrameForReanimation(std::string const& tabType) const {
    for (FrameDataProxy* proxy : reanimatableProxies_) {
        if (proxy->HasTabType(tabType)) {
            return proxy;
        }
    }
    return nullptr;
}

FrameDataProxy* LayoutManager::FindFrameForReanimation(Frame const* f) const {
    for (FrameDataProxy* proxy : reanimatableProxies_) {
        if (proxy->HasFrame() && proxy->IsFrame(f)) {
            return proxy;
        }
    }
    return nullptr;
}

void LayoutManager::ReanimateFrame(LayoutManagerElement* proxy, Frame* f) {
    auto listed = std::find(reanimatableProxies_.begin(), reanimatableProxies_.end(), proxy);
    if (!f || listed == reanimatableProxies_.end() || !proxy->GetParent() || IsInTree(f)) {
        return;
    }
    if (maximizedFrame_) {
        SetMaximizedFrame(nullptr);
    }
    Splitter* parent = proxy->GetParent();
    bool wasFirst = parent->GetLeftOrTop() == proxy;
    f->SetParent(parent);
    f->SetLayoutManager(this);
    parent->ReplaceElement(proxy, f);
    if (wasFirst) {
        parent->SetLeftOrTopVisible(true);
    } else {
        parent->SetRightOrBottomVisible(true);
    }
    // Make the way up visible: each ancestor shows the branch leading here, up to the first
    // splitter that already shows both.
    LayoutManagerElement* previous = f;
    for (Splitter* s = parent; s && !s->IsVisible(); s = s->GetParent()) {
        if (s->GetLeftOrTop() == previous) {
            s->SetLeftOrTopVisible(true);
        } else if (s->GetRightOrBottom() == previous) {
            s->SetRightOrBottomVisible(true);
        }
        previous = s;
    }
    reanimatableProxies_.erase(listed);
    delete proxy;
}

// --- Walks and queries ---

std::vector<Frame*> LayoutManager::GetFrames() const {
    std::vector<Frame*> frames;
    PreOrder(GetRoot(), [&](LayoutManagerElement* e) {
        if (Frame* f = AsFrame(e)) {
            frames.push_back(f);
        }
    });
    return frames;
}

std::vector<Splitter*> LayoutManager::GetSplitters() const {
    std::vector<Splitter*> splitters;
    PreOrder(GetRoot(), [&](LayoutManagerElement* e) {
        Splitter* s = AsSplitter(e);
        if (s && s->IsVisible()) {
            splitters.push_back(s);
        }
    });
    return splitters;
}

std::vector<Splitter*> LayoutManager::FindAllSplittersInSameRowCol(Splitter* s) const {
    std::vector<Splitter*> result;
    if (!s) {
        return result;
    }
    RectT ref = s->GetLocation();
    for (Splitter* other : GetSplitters()) {
        RectT r = other->GetLocation();
        bool same = s->IsVertical() ? (r.top == ref.top && r.Bottom() == ref.Bottom())
                                    : (r.left == ref.left && r.Right() == ref.Right());
        if (other != s && same) {
            result.push_back(other);
        }
    }
    return result;
}

std::vector<Splitter*> LayoutManager::FindSplittersContainingPoint(long x, long y) const {
    std::vector<Splitter*> result;
    if (maximizedFrame_) {
        return result;
    }
    for (Splitter* s : GetSplitters()) {
        if (s->ContainsPoint(x, y)) {
            result.push_back(s);
        }
    }
    return result;
}

LayoutManager::CursorType LayoutManager::HitCheckCursor(long x, long y) const {
    std::vector<Splitter*> hits = FindSplittersContainingPoint(x, y);
    if (hits.empty()) {
        return NoSplitter;
    }
    if (hits.size() > 1) {
        return SplitterCrossing;
    }
    return hits.front()->IsVertical() ? VerticalSplitter : HorizontalSplitter;
}

std::string LayoutManager::StructureProblem(bool checkVisibility) const {
    if (!rootSplitter_) {
        return "there is no root splitter";
    }
    if (rootSplitter_->GetParent() || rootSplitter_->GetRightOrBottom()) {
        return "the root splitter has a parent or a second child";
    }
    if (rootSplitter_->GetLayoutManager() != this) {
        return "the root splitter belongs to another layout";
    }
    std::set<LayoutManagerElement const*> seen;
    std::vector<FrameDataProxy*> placeholders;
    std::vector<LayoutManagerElement*> pending{rootSplitter_};
    while (!pending.empty()) {
        Splitter* s = AsSplitter(pending.back());
        pending.pop_back();
        for (LayoutManagerElement* child : {s->GetLeftOrTop(), s->GetRightOrBottom()}) {
            if (!child) {
                continue;
            }
            if (!seen.insert(child).second) {
                return "a node occurs twice in the tree";
            }
            if (child->GetParent() != s) {
                return "a node's parent link does not lead to the splitter holding it";
            }
            if (child->GetLayoutManager() != this) {
                return "a node of the tree belongs to another layout";
            }
            if (AsSplitter(child)) {
                pending.push_back(child);
            } else if (FrameDataProxy* proxy = AsPlaceholder(child)) {
                placeholders.push_back(proxy);
            }
        }
    }
    if (placeholders.size() != reanimatableProxies_.size() ||
        !std::all_of(placeholders.begin(), placeholders.end(), [&](FrameDataProxy* p) {
            return std::count(reanimatableProxies_.begin(), reanimatableProxies_.end(), p) == 1;
        })) {
        return "the placeholders in the tree and the layout's list of them differ";
    }
    if (maximizedFrame_ && !seen.count(maximizedFrame_)) {
        return "the maximised frame is not in the tree";
    }
    if (checkVisibility) {
        std::function<bool(LayoutManagerElement*, std::string&)> visible = [&](LayoutManagerElement* e,
                                                                               std::string& problem) {
            if (Frame* f = AsFrame(e)) {
                return f->IsFrameShown();
            }
            Splitter* s = AsSplitter(e);
            if (!s) {
                return false;
            }
            bool a = visible(s->GetLeftOrTop(), problem);
            bool b = visible(s->GetRightOrBottom(), problem);
            if (problem.empty() &&
                (a != s->GetLeftOrTopVisibleFlag() || b != s->GetRightOrBottomVisibleFlag())) {
                problem = "a splitter's branch flags disagree with the frames' shown state";
            }
            return (a && s->GetLeftOrTop()) || (b && s->GetRightOrBottom());
        };
        std::string problem;
        visible(rootSplitter_, problem);
        if (!problem.empty()) {
            return problem;
        }
    }
    return {};
}

void LayoutManager::AssertStructureOK() const {
    [[maybe_unused]] std::string problem = StructureProblem();
    assert(problem.empty() && "the layout tree is malformed");
}

void LayoutManager::DumpToGraphvis(std::ostream& out) const {
    out << "digraph ORVLayoutManager {\n";
    // Nodes are numbered in pre-order, so two dumps of the same tree are the same text; missing
    // children get numbers after all the nodes and are drawn as points.
    std::map<LayoutManagerElement const*, unsigned long> ids;
    unsigned long next = 1;
    PreOrder(GetRoot(), [&](LayoutManagerElement* e) { ids[e] = next++; });
    std::function<void(LayoutManagerElement*, unsigned long)> dump = [&](LayoutManagerElement* e,
                                                                         unsigned long id) {
        if (!e) {
            out << id << " [shape=point];\n";
        } else if (AsFrame(e)) {
            out << id << " [shape=box,label=\"Frame\"];\n";
        } else if (AsPlaceholder(e)) {
            out << id << " [shape=box,style=dashed,label=\"Placeholder\"];\n";
        } else if (Splitter* s = AsSplitter(e)) {
            RectT l = s->GetLocation();
            out << id << " [label=\"" << (s->IsVertical() ? "V Split s:" : "--H Split-- s:")
                << s->GetPixelPlacement() << " l:" << l.left << " t:" << l.top << " b:" << l.top + l.height
                << " r:" << l.left + l.width << "\"];\n";
            LayoutManagerElement* children[2] = {s->GetLeftOrTop(), s->GetRightOrBottom()};
            unsigned long childIds[2];
            for (int k = 0; k < 2; ++k) {
                childIds[k] = children[k] ? ids[children[k]] : next++;
                out << id << " -> " << childIds[k] << ";\n";
            }
            dump(children[0], childIds[0]);
            dump(children[1], childIds[1]);
        }
    };
    if (GetRoot()) {
        dump(GetRoot(), ids[GetRoot()]);
    }
    out << "}";
}

} // namespace orvworkspace::workspace
