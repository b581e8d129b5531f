// Helpers over the whole workspace: finding panels by type in the tab walk (windows in child order,
// their tabbed frames in child order, each frame's tabs in order) and maximising a frame within its
// window.
#pragma once

#include <list>
#include <string>

namespace orvworkspace::workspace {

class TabPanel;
class TopLevelWindow;
class Workspace;
class WorkspaceFrame;

namespace WorkspaceUtils {

// Appends every panel of the type to out, in walk order, and its index within its frame to indices.
void FindAllTabsOfType(Workspace const& workspace, std::string const& tabType, std::list<TabPanel*>& out,
                       std::list<long>* indices = nullptr);
// A window can maximise one of its frames when it has more than one.
bool CanHaveMaximizedFrame(TopLevelWindow const* window);
// Maximises the frame (focusing its front panel), or, when a frame is maximised, restores the
// layout. False when the window has fewer than two frames.
bool ToggleThisFrameMaximizationState(Workspace& workspace, WorkspaceFrame* frame);

} // namespace WorkspaceUtils

} // namespace orvworkspace::workspace
