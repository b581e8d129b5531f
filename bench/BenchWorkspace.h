// The workspace the workspace benchmarks measure: a host's main window on a 4K monitor of the
// headless desktop holding n tabbed frames, each split off an existing one so the tree stays
// balanced, each frame with the given panel types as its tabs (plain panels that paint nothing of
// their own).
#pragma once

#include "frames/WorkspaceFrame.h"
#include "host/ui/Desktop.h"
#include "workspace/TabCreator.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <deque>
#include <string>
#include <vector>

namespace orvbench {

using namespace orvworkspace::workspace;

class PlainPanelCreator : public TabCreator {
public:
    explicit PlainPanelCreator(std::string type)
        : TabCreator(std::move(type)) {}
    boost::intrusive_ptr<TabPanel> CreateTabPanel(Workspace* ws, WorkspaceFrameBase* frame) const override {
        return new TabPanel(ws, frame, true, tabType, u"Plain");
    }
};

class BenchWorkspace {
public:
    static constexpr RectT Large{0, 0, 3840, 2160};
    static constexpr RectT Smaller{0, 0, 3600, 2000};

    // The window covers the one monitor, Large unless given.
    BenchWorkspace(int n, std::vector<std::string> const& tabTypes, RectT window = Large) {
        orvui::ui::Desktop::Reset();
        orvui::ui::Desktop::Get().SetMonitors({window});
        namespace style = orvui::ui::style;
        app = orvui::ui::Desktop::Get().CreateNativeWindow(
            u"Bench", style::Popup | style::Caption | style::SizingFrame | style::Visible, 0, 0, window);
        workspace = new Workspace;
        for (std::string const& type : tabTypes) {
            workspace->RegisterTabCreator(new PlainPanelCreator(type));
        }
        workspace->AttachToClientApp(nullptr, nullptr, app, nullptr, false);
        TopLevelWindow* main = workspace->GetMainTopLevelWindow();
        auto fill = [&](WorkspaceFrame* frame) {
            for (std::size_t t = 1; t < tabTypes.size(); ++t) {
                frame->AddTab(tabTypes[t], false);
            }
            return frame;
        };
        std::deque<WorkspaceFrame*> toSplit{fill(main->CreateRootFrame(tabTypes.front(), false, true))};
        std::deque<int> depth{0};
        for (int i = 1; i < n; ++i) {
            WorkspaceFrame* beside = toSplit.front();
            int d = depth.front();
            toSplit.pop_front();
            depth.pop_front();
            WorkspaceFrame* added = fill(main->AddTabbedFrame(
                beside, tabTypes.front(), d % 2 ? LayoutManager::Bottom : LayoutManager::Right));
            toSplit.insert(toSplit.end(), {beside, added});
            depth.insert(depth.end(), {d + 1, d + 1});
        }
        frames = main->GetFrameCount();
    }
    ~BenchWorkspace() {
        workspace.reset();
        orvui::ui::Desktop::Reset();
    }
    BenchWorkspace(BenchWorkspace const&) = delete;
    BenchWorkspace& operator=(BenchWorkspace const&) = delete;

    orvui::ui::NativeWindow app = 0;
    boost::intrusive_ptr<Workspace> workspace;
    unsigned long frames = 0;
};

} // namespace orvbench
