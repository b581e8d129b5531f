// Containers.
#include "host/ui/UI_Container.h"

namespace orvui::ui {

bool UI_Container::ChildRequestRemove(boost::intrusive_ptr<UI_Node> node) {
    if (node && node->UI_GetParentNode() == this) {
        ChildRemove(node.get());
    }
    return true;
}

void UI_Container::DeleteChildren() {
    while (ChildSize() > 0) {
        ChildRemove(ChildGet(ChildSize() - 1));
    }
}

} // namespace orvui::ui
