// Deep copies of splitter trees for previews.
#include "layout/PreviewSplitter.h"

#include "layout/Frame.h"
#include "layout/FrameHostProxy.h"

namespace orvworkspace::workspace {

PreviewSplitter::PreviewSplitter(Splitter const& source)
    : Splitter(source.GetLayoutManager(), source.IsVertical(), true) {
    SetPlacement(source.GetPlacement());
    CopyChild(source.GetLeftOrTop(), true);
    CopyChild(source.GetRightOrBottom(), false);
}

PreviewSplitter::~PreviewSplitter() {
    frames_.clear(); // the frames before the stand-ins they point at
}

void PreviewSplitter::CopyChild(LayoutManagerElement* child, bool first) {
    LayoutManagerElement* copy = nullptr;
    if (Splitter* s = AsSplitter(child)) {
        copy = new PreviewSplitter(*s); // owned by the layout that will hold this tree
    } else if (Frame* f = AsFrame(child)) {
        proxies_.push_back(std::make_unique<FrameHostProxy>(f->GetHostInterface()));
        frames_.push_back(std::make_unique<Frame>(GetLayoutManager(), proxies_.back().get()));
        copy = frames_.back().get();
    }
    if (!copy) {
        return; // a placeholder's slot stays empty
    }
    copy->SetParent(this);
    if (first) {
        SetLeftOrTop(copy);
    } else {
        SetRightOrBottom(copy);
    }
}

} // namespace orvworkspace::workspace
