// The base node's default answers.
#include "layout/LayoutManagerElement.h"

namespace orvworkspace::workspace {

bool LayoutManagerElement::AllowSnapping(bool, Frame*) const {
    return true;
}

} // namespace orvworkspace::workspace
