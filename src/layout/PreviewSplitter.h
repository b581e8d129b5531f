// A deep copy of a splitter and everything below it, for what-if layouts. Frames are copied as new
// frames over FrameHostProxy stand-ins, which this splitter owns; placeholders are not copied, so a
// preview lays out as if closed frames' slots did not exist. Child splitters are copies too, owned
// like any splitter by the layout that holds the copy.
#pragma once

#include "layout/Splitter.h"

#include <memory>
#include <vector>

namespace orvworkspace::workspace {

class FrameHostProxy;

class PreviewSplitter : public Splitter {
public:
    explicit PreviewSplitter(Splitter const& source);
    ~PreviewSplitter() override;

private:
    void CopyChild(LayoutManagerElement* child, bool first);

    std::vector<std::unique_ptr<FrameHostProxy>> proxies_;
    std::vector<std::unique_ptr<Frame>> frames_;
};

} // namespace orvworkspace::workspace
