// A host of the workspace for tests: panels that paint a flat colour and log what they hear, their
// creators (hiding, obliterating, saving state as asked), a workspace that logs its hooks, and a
// fixture that attaches the workspace to a host application window on a fresh headless desktop.
#pragma once

#include "frames/WorkspaceBorderElement.h"
#include "frames/WorkspaceFrame.h"
#include "host/core/PropList.h"
#include "host/ui/Desktop.h"
#include "host/ui/canvasor/Canvasor.h"
#include "host/ui/controls/TabWell.h"
#include "support/SnapshotOnFailure.h"
#include "workspace/TabCreator.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <gtest/gtest.h>
#include <string>
#include <vector>

namespace orvtest {

using namespace orvworkspace::workspace;
using orvui::ui::Desktop;
using orvui::ui::NativeWindow;
namespace style = orvui::ui::style;

class PaintedPanel : public TabPanel {
public:
    PaintedPanel(Workspace* ws, WorkspaceFrameBase* frame, std::string const& type, canvasor::ColorRGBA paint,
                 std::vector<std::string>* log)
        : TabPanel(ws, frame, true, type, std::u16string(type.begin(), type.end()))
        , paint_(paint)
        , log_(log) {}

    void UI_Draw(canvasor::Canvasor& c) override { c.FillRect(UI_GetLocalBounds(), paint_); }
    void NotifyTopLevelWindowIsClosing() override { Log("window closing"); }
    void NotifyFrameIsClosing() override { Log("frame closing"); }
    bool AllowClose() const override { return allowClose; }

    bool allowClose = true;
    std::string state = "fresh";

private:
    void DoSaveStateData(orvcore::proplist::PropList* list) override { list->SetValue("state", state); }
    void DoLoadStateData(orvcore::proplist::PropList* list) override { list->GetValue("state", state); }
    void Log(std::string const& what) {
        if (log_) {
            log_->push_back(GetTabType() + ": " + what);
        }
    }

    canvasor::ColorRGBA paint_;
    std::vector<std::string>* log_;
};

// A painted panel that asks the layout for given snap sizes.
class SizedPanel : public PaintedPanel {
public:
    SizedPanel(Workspace* ws, std::vector<orvui::ui::PointT> sizes)
        : PaintedPanel(ws, nullptr, "sized", canvasor::ColorRGBA(0.5f, 0.5f, 0.5f, 1), nullptr)
        , snapSizes_(std::move(sizes)) {}

private:
    void DoGetSnapSizes(std::vector<orvui::ui::PointT>& out) const override {
        out.insert(out.end(), snapSizes_.begin(), snapSizes_.end());
    }
    std::vector<orvui::ui::PointT> snapSizes_;
};

// A bar that can sit along a window edge; rippable bars show a gripper to tear them off.
class ToolBar : public SizedPanel, public WorkspaceBorderElement {
public:
    ToolBar(Workspace* ws, bool rippable)
        : SizedPanel(ws, {PointT(0, 30)})
        , rippable_(rippable) {}
    bool IsRippable() override { return rippable_; }
    void ConvertToRegularTab() override { ++conversions; }
    int conversions = 0;

private:
    bool rippable_;
};

struct PanelKind {
    std::string type;
    canvasor::ColorRGBA paint;
    bool hides = false;
    bool obliterates = false;
    bool savesState = false;
};

class PaintedPanelCreator : public TabCreator {
public:
    PaintedPanelCreator(PanelKind kind, std::vector<std::string>* log)
        : TabCreator(kind.type)
        , kind_(std::move(kind))
        , log_(log) {}
    boost::intrusive_ptr<TabPanel> CreateTabPanel(Workspace* ws, WorkspaceFrameBase* frame) const override {
        return new PaintedPanel(ws, frame, kind_.type, kind_.paint, log_);
    }
    bool HidesWhenClosed() const override { return kind_.hides; }
    bool ObliteratesWhenClosed() const override { return kind_.obliterates; }
    bool SavesStateWhenObliterated() const override { return kind_.savesState; }

private:
    PanelKind kind_;
    std::vector<std::string>* log_;
};

class HostWorkspace : public Workspace {
public:
    void NotifyObliterating(TabPanel* panel) override {
        log.push_back("obliterating " + panel->GetTabType());
    }
    void NotifyPreOrphaning(TabPanel* panel) override {
        log.push_back("pre-orphaning " + panel->GetTabType());
    }
    void NotifyOrphaning(TabPanel* panel) override { log.push_back("orphaning " + panel->GetTabType()); }
    void NotifyTabDragBegin(TabPanel* panel) override { log.push_back("tab begin " + panel->GetTabType()); }
    void NotifyTabDragEnd(TabPanel* panel) override { log.push_back("tab end " + panel->GetTabType()); }
    void NotifySplitterDragBegin(TopLevelWindow*) override { log.push_back("bar begin"); }
    void NotifySplitterDragEnd(TopLevelWindow*) override { log.push_back("bar end"); }
    void DoWorkspaceCmdNew() override { log.push_back("command new"); }
    void DoWorkspaceCmdDelete() override { log.push_back("command delete"); }
    void DoWorkspaceCmdReset() override { log.push_back("command reset"); }
    std::vector<std::string> log;
};

// Colours of the three panel kinds every test registers.
inline constexpr canvasor::ColorRGBA EditorPaint{0.8f, 0.2f, 0.2f, 1};
inline constexpr canvasor::ColorRGBA BrowserPaint{0.2f, 0.6f, 0.2f, 1};
inline constexpr canvasor::ColorRGBA MixerPaint{0.2f, 0.2f, 0.8f, 1};

class WorkspaceTest : public DesktopScenario {
protected:
    void SetUp() override {
        DesktopScenario::SetUp();
        appWindow = Desktop::Get().CreateNativeWindow(
            u"Host", style::Popup | style::Caption | style::SizingFrame | style::Visible, 0, 0,
            orvui::ui::RectT(100, 80, 1000, 700));
        workspace = new HostWorkspace;
        Register({"editor", EditorPaint});
        Register({"browser", BrowserPaint});
        Register({"mixer", MixerPaint});
        workspace->AttachToClientApp(nullptr, nullptr, appWindow, nullptr, false);
        main = workspace->GetMainTopLevelWindow();
    }
    void CloseWindows() override {
        main = nullptr;
        workspace.reset();
    }
    void Register(PanelKind kind) {
        workspace->RegisterTabCreator(new PaintedPanelCreator(std::move(kind), &panelLog));
    }

    // The main window with two frames side by side: editor | browser.
    void BuildTwoFrames() {
        left = main->CreateRootFrame("editor", true, true);
        right = main->AddTabbedFrame(left, "browser", LayoutManager::Right);
    }
    static PaintedPanel* Painted(TabPanel* panel) { return dynamic_cast<PaintedPanel*>(panel); }

    // --- Pointing at things on the desktop ---
    static PointT Middle(RectT const& r) { return PointT(r.left + r.width / 2, r.top + r.height / 2); }
    static void Click(PointT p) {
        Desktop::Get().MouseMove(p);
        Desktop::Get().MouseDown(p);
        Desktop::Get().MouseUp(p);
    }
    static PointT OnTab(WorkspaceFrame* frame, long index) {
        return Middle(frame->GetTabWell()->GetTabGlobalRect(index));
    }
    static canvasor::ColorRGBA SeenAt(PointT p) { return Desktop::Get().Snapshot().Pixel(p.x, p.y); }
    static bool Looks(canvasor::ColorRGBA seen, canvasor::ColorRGBA expected, float tolerance = 0.01f) {
        auto near = [&](float a, float b) { return a - b < tolerance && b - a < tolerance; };
        return near(seen.r, expected.r) && near(seen.g, expected.g) && near(seen.b, expected.b);
    }

    NativeWindow appWindow = 0;
    boost::intrusive_ptr<HostWorkspace> workspace;
    TopLevelWindow* main = nullptr;
    WorkspaceFrame* left = nullptr;
    WorkspaceFrame* right = nullptr;
    std::vector<std::string> panelLog;
};

} // namespace orvtest
