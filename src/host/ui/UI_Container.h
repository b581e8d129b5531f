// A node whose children are added and removed at its children's request: windows in the
// workspace, frames in a window. A child asks to leave through ChildRequestRemove, which the
// container may refuse.
#pragma once

#include "host/ui/UI_Node.h"

namespace orvui::ui {

class UI_Container : public UI_Node {
public:
    // Removes the child when the container agrees; true when it is gone (or was never ours).
    virtual bool ChildRequestRemove(boost::intrusive_ptr<UI_Node> node);
    // Whether keyboard focus may move on from this container's children to the next container.
    virtual bool AllowFocusToAdvanceFromChildren() const { return true; }
    // Removes every child; each goes away when its last reference does.
    void DeleteChildren();
};

// A plain grouping node inside a window.
class UI_SubView : public UI_Container {};

} // namespace orvui::ui
