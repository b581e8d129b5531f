// The workspace document: every top-level window with its split tree, frames, tabs and tab states,
// the static bars, written into and read from one property list. Restoring reuses the panels that
// exist (matched by tab type through a pool), reuses windows in child order, removes what the
// document no longer holds and orphans panels nobody asked for.
//
// Choices where the document leaves them open: a "Splitter" without "Orient", "Sub1Vis" or
// "Sub2Vis" reads false, a "Frame" without "CurrTab" reads 0, a window without "Splitter" gets an
// empty layout; splitters nested deeper than MaxSplitterDepth are not read (what lies below is
// dropped). "SerCfgMax" and "CurrTab" are signed 32-bit integers, "ShowCmd" unsigned. A restore
// always builds new frames (old ones go when their window is filled).
#pragma once

#include "layout/LayoutTypes.h"

#include <boost/intrusive_ptr.hpp>
#include <functional>
#include <list>
#include <string>
#include <vector>

namespace orvcore::proplist {
class PropList;
}

namespace orvworkspace::workspace {

class Frame;
class LayoutManagerElement;
class Splitter;
class TabPanel;
class TopLevelWindow;
class Workspace;
class WorkspaceFrame;
class WorkspaceFrameBase;

using ReusableTabPool = std::list<boost::intrusive_ptr<TabPanel>>;

inline constexpr char const* WorkspaceDocumentVersion = "1.2";
inline constexpr int MaxSplitterDepth = 64;

void SaveWorkspace(Workspace& workspace, orvcore::proplist::PropList& list, std::u16string const& userName);
// Rebuilds the workspace from a document; raises InvalidWorkspace or UnableToLoadWorkspace (changing
// nothing) for a document without, or with another, version.
bool RestoreWorkspace(Workspace& workspace, orvcore::proplist::PropList const& list,
                      bool restoreMainWindowBounds, bool restoreMaximizedFrames, bool forceRelayout);
bool IsCompatibleVersion(orvcore::proplist::PropList const& list);
std::u16string GetWorkspaceUserName(orvcore::proplist::PropList const& list);
// Makes the document's first window open at rect (its saved placement is dropped).
void SetMainWindowGlobalRect(orvcore::proplist::PropList& list, RectT const& rect);

void SaveTopLevelWindow(TopLevelWindow& window, orvcore::proplist::PropList& list, bool framesAsProxies);
void RestoreTopLevelWindow(TopLevelWindow& window, orvcore::proplist::PropList const& list,
                           ReusableTabPool& pool, bool restoreBounds, bool restoreMaximizedFrame,
                           bool forceRelayout);
// A panel of the type: the first of the pool (taken out of its old place), else a new one from the
// type's creator; null when there is none.
boost::intrusive_ptr<TabPanel> TakeOrCreateTabPanel(Workspace& workspace, std::string const& type,
                                                    ReusableTabPool& pool, WorkspaceFrameBase* frame);
// Every panel of the workspace now: in frames, static bars and hidden tabs, in window order.
ReusableTabPool CollectReusableTabs(Workspace& workspace);

// --- Shared by the document reader and the builders ---
// Takes a panel out of whatever holds it (a frame's tabs or a tabless frame).
void Unplace(TabPanel& panel);
void RemoveStaticElements(TopLevelWindow& window);
// The next window to fill: the first of the existing ones (taken out of the list, its static
// elements removed), else a new one (the main window when the workspace has none yet).
boost::intrusive_ptr<TopLevelWindow>
NextWindowToFill(Workspace& workspace, std::list<boost::intrusive_ptr<TopLevelWindow>>& existing);
void PutOnSide(Splitter* parent, LayoutManagerElement* child, bool leftOrTop);
// Closed tabs (type, state) of a frame: a type that hides when closed comes back as a kept panel
// (from the pool or its creator) in the keeper frame; the others are returned, to be remembered.
TabDataList KeepClosedTabs(Workspace& workspace, TabDataList const& pairs, ReusableTabPool& pool,
                           std::function<WorkspaceFrame&()> const& keeper);
// A placeholder on the parent's side, which is hidden, standing for a frame of closed tabs.
void MakeFrameProxy(TopLevelWindow& window, Workspace& workspace, TabDataList const& pairs,
                    ReusableTabPool& pool, Splitter* parent, bool leftOrTop);
// Installs a built tree and removes the window's frames that are not part of it.
void InstallTree(TopLevelWindow& window, Splitter* root,
                 std::vector<boost::intrusive_ptr<WorkspaceFrame>>& frames);

// "0" and "1" from the root splitter down to the frame (left or top, right or bottom).
std::string GetMaximizedFramePath(Frame const* frame);
Frame* FindFrameByPath(std::string const& path, Splitter* root);

} // namespace orvworkspace::workspace

namespace orvworkspace::config {
// The library's version, "2.0.0.420171".
std::u16string GetVersionString();
} // namespace orvworkspace::config
