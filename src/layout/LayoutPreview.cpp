// What-if layouts: the tree is copied with stand-in frames and window, the edit is made on the copy,
// and the rectangle a frame would get is read back. Every copy is freed before returning.
#include "layout/Frame.h"
#include "layout/FrameHostProxy.h"
#include "layout/LayoutManager.h"
#include "layout/PreviewSplitter.h"
#include "layout/ProxyMgrHostInterface.h"

#include <memory>
#include <set>

namespace orvworkspace::workspace {

namespace {

void CollectSplitters(LayoutManagerElement* e, std::set<Splitter*>& out) {
    if (Splitter* s = AsSplitter(e)) {
        out.insert(s);
        CollectSplitters(s->GetLeftOrTop(), out);
        CollectSplitters(s->GetRightOrBottom(), out);
    }
}

// The copied frame standing for the real host, depth first, first child first.
Frame* FindCopy(LayoutManagerElement* e, FrameHostInterface const* realHost) {
    if (!e || !realHost) {
        return nullptr;
    }
    if (Frame* f = AsFrame(e)) {
        auto* proxy = static_cast<FrameHostProxy*>(f->GetHostInterface());
        return proxy->GetRealHost() == realHost ? f : nullptr;
    }
    if (Splitter* s = AsSplitter(e)) {
        if (Frame* found = FindCopy(s->GetLeftOrTop(), realHost)) {
            return found;
        }
        return FindCopy(s->GetRightOrBottom(), realHost);
    }
    return nullptr;
}

} // namespace

LayoutManager::LayoutManager(LayoutManager const& source, LayoutManagerHostInterface* host, Splitter* root,
                             RectT const& rect)
    : host_(host)
    , rootSplitter_(root)
    , containingRect_(rect)
    , borderSize_(source.borderSize_)
    , splitterHalfWidth_(source.splitterHalfWidth_) {
    // Every node of the copy answers to this layout, so its passes remember subtree reports like
    // any layout's instead of asking the original, which is not laying out.
    std::vector<LayoutManagerElement*> pending{root};
    while (!pending.empty()) {
        LayoutManagerElement* e = pending.back();
        pending.pop_back();
        e->SetLayoutManager(this);
        if (Splitter* s = AsSplitter(e)) {
            for (LayoutManagerElement* child : {s->GetLeftOrTop(), s->GetRightOrBottom()}) {
                if (child) {
                    pending.push_back(child);
                }
            }
        }
    }
}

RectT LayoutManager::PreviewAddFrame(Frame* target, InsertionType side, Frame* newFrame) {
    if (!newFrame) {
        return RectT();
    }
    auto* copy = new PreviewSplitter(*rootSplitter_);
    Frame* copiedTarget = target ? FindCopy(copy, target->GetHostInterface()) : nullptr;
    ProxyMgrHostInterface window;
    FrameHostProxy newHost(newFrame->GetHostInterface());
    Frame added(nullptr, &newHost); // outlives the layout, which unlinks it on destruction
    {
        LayoutManager preview(*this, &window, copy, containingRect_);
        if (target && !copiedTarget) {
            return RectT();
        }
        preview.AddFrame(copiedTarget, side, &added);
    }
    return newHost.GetRect();
}

RectT LayoutManager::PreviewRemoveFrame(Frame* f, Frame* other) const {
    if (!f) {
        return RectT();
    }
    auto* copy = new PreviewSplitter(*rootSplitter_);
    ProxyMgrHostInterface window;
    RectT result;
    // A collapse leaves the copied parent out of the tree but alive, and it still owns the frames it
    // copied, which may now hang elsewhere in the tree: it is freed after the layout that holds the
    // rest of the copy.
    std::set<Splitter*> all, reachable;
    CollectSplitters(copy, all);
    {
        LayoutManager preview(*this, &window, copy, containingRect_);
        if (Frame* removed = FindCopy(copy, f->GetHostInterface())) {
            Frame* partner = nullptr;
            if (other) {
                partner = FindCopy(copy, other->GetHostInterface());
            } else if (Splitter* parent = removed->GetParent()) {
                partner = AsFrame(parent->GetLeftOrTop() == removed ? parent->GetRightOrBottom()
                                                                    : parent->GetLeftOrTop());
            }
            preview.RemoveFrame(removed, false, false);
            if (partner) {
                result = static_cast<FrameHostProxy*>(partner->GetHostInterface())->GetRect();
            }
        }
        CollectSplitters(preview.GetRootSplitter(), reachable);
    }
    for (Splitter* s : all) {
        if (!reachable.count(s)) {
            delete s;
        }
    }
    return result;
}

} // namespace orvworkspace::workspace
