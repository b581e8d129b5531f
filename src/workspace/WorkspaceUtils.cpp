// The tab walk and frame maximisation.
#include "workspace/WorkspaceUtils.h"

#include "frames/WorkspaceFrame.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <mutex>

namespace orvworkspace::workspace::WorkspaceUtils {

namespace {
// Walks may call one another, and hosts may search from inside a visit.
std::recursive_mutex tabWalkLock;
} // namespace

void FindAllTabsOfType(Workspace const& workspace, std::string const& tabType, std::list<TabPanel*>& out,
                       std::list<long>* indices) {
    std::lock_guard<std::recursive_mutex> lock(tabWalkLock);
    for (std::size_t w = 0; w < workspace.ChildSize(); ++w) {
        auto* window = dynamic_cast<TopLevelWindow*>(workspace.ChildGet(w));
        if (!window) {
            continue;
        }
        for (std::size_t f = 0; f < window->ChildSize(); ++f) {
            auto* frame = dynamic_cast<WorkspaceFrame*>(window->ChildGet(f));
            if (!frame) {
                continue;
            }
            for (long i = 0; i < frame->GetTabCount(); ++i) {
                TabPanel* panel = frame->GetTabPanel(i);
                if (panel && panel->GetTabType() == tabType) {
                    out.push_back(panel);
                    if (indices) {
                        indices->push_back(i);
                    }
                }
            }
        }
    }
}

bool CanHaveMaximizedFrame(TopLevelWindow const* window) {
    return window && window->GetFrameCount() > 1;
}

bool ToggleThisFrameMaximizationState(Workspace& workspace, WorkspaceFrame* frame) {
    TopLevelWindow* window = frame ? frame->GetTopLevelWindow() : nullptr;
    if (!window || window->GetFrameCount() < 2) {
        return false;
    }
    LayoutManager* layout = window->GetLayoutManager();
    if (!layout->GetMaximizedFrame()) {
        layout->SetMaximizedFrame(frame->GetLMFrame());
        workspace.SetFocusedTabPanel(frame->GetFrontTabPanel());
    } else {
        layout->SetMaximizedFrame(nullptr);
    }
    return true;
}

} // namespace orvworkspace::workspace::WorkspaceUtils
