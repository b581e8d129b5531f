// Building a workspace from builders.
#include "persistence/WorkspaceBuilder.h"

#include "frames/WorkspaceFrame.h"
#include "host/ui/MonitorInfo.h"
#include "layout/Splitter.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <list>

namespace orvworkspace::workspace {

void FrameBuilder::AddTab(std::string const& tabType, bool remembered) {
    (remembered ? remembered_ : shown_).push_back(tabType);
}

void FrameBuilder::Build(Workspace& workspace, TopLevelWindow& window, BuildContext& context) {
    boost::intrusive_ptr<WorkspaceFrame> frame = window.CreateWorkspaceFrame();
    for (std::string const& type : shown_) {
        if (boost::intrusive_ptr<TabPanel> panel =
                TakeOrCreateTabPanel(workspace, type, *context.pool, frame.get())) {
            frame->AddTab(panel, false);
        }
    }
    TabDataList closed;
    for (std::string const& type : remembered_) {
        closed.emplace_back(type, "");
    }
    if (frame->GetTabCount() == 0) {
        window.ChildRemove(frame.get());
        MakeFrameProxy(window, workspace, closed, *context.pool, context.parent, context.leftOrTop);
        return;
    }
    frame->GetLMFrame()->SetLayoutManager(window.GetLayoutManager());
    PutOnSide(context.parent, frame->GetLMFrame(), context.leftOrTop);
    context.frames->push_back(frame);
    TabDataList removed =
        KeepClosedTabs(workspace, closed, *context.pool, [&]() -> WorkspaceFrame& { return *frame; });
    if (!removed.empty()) {
        frame->SetRemovedTabData(removed);
    }
    frame->BringTabToFront(std::min<long>(long(front_), frame->GetTabCount() - 1));
    frame->GetFrontTabPanel()->UI_Show(true);
}

void SplitterBuilder::AddElement(std::unique_ptr<BuilderBase> builder, bool leftOrTop) {
    (leftOrTop ? first_ : second_) = std::move(builder);
}

void SplitterBuilder::Build(Workspace& workspace, TopLevelWindow& window, BuildContext& context) {
    auto* splitter = new Splitter(context.parent->GetLayoutManager(), vertical_);
    PutOnSide(context.parent, splitter, context.leftOrTop);
    for (bool leftOrTop : {true, false}) {
        if (BuilderBase* child = (leftOrTop ? first_ : second_).get()) {
            BuildContext inner = context;
            inner.parent = splitter;
            inner.leftOrTop = leftOrTop;
            child->Build(workspace, window, inner);
        }
    }
    if (placementSet_) {
        splitter->SetPlacement(placement_);
    }
}

void WorkspaceBuilder::AddWindow(std::unique_ptr<BuilderBase> root, RectT const& globalRect,
                                 std::string const& toolBarTabType) {
    windows_.push_back(WindowRecord{std::move(root), globalRect, toolBarTabType});
}

void WorkspaceBuilder::BuildWorkspace() {
    ReusableTabPool pool = CollectReusableTabs(workspace_);
    workspace_.ClearRemovedWindowData();
    std::list<boost::intrusive_ptr<TopLevelWindow>> existing;
    for (TopLevelWindow* window : workspace_.GetWindows()) {
        existing.emplace_back(window);
        if (!window->IsMain()) {
            window->UI_Show(false);
        }
    }
    for (WindowRecord& record : windows_) {
        boost::intrusive_ptr<TopLevelWindow> window = NextWindowToFill(workspace_, existing);
        (void)window->TakeHiddenFrames(); // their panels are in the pool
        RectT rect = record.rect;
        if (orvui::utility::MonitorInfo* monitors = workspace_.ORV_GetMonitorInfo()) {
            monitors->EnsureRectIsVisible(rect);
        }
        window->UI_SetGlobalStructureRect(rect);
        std::vector<boost::intrusive_ptr<WorkspaceFrame>> frames;
        auto* root = new Splitter(window->GetLayoutManager(), false);
        BuildContext context{window.get(), root, true, &frames, &pool};
        if (record.root) {
            record.root->Build(workspace_, *window, context);
        }
        window->UI_Show(true);
        InstallTree(*window, root, frames);
        if (!record.toolBarTabType.empty()) {
            window->SetStaticElement(record.toolBarTabType, LayoutManager::Top, false);
        }
        orvui::ui::RectF local = window->UI_GetLocalBounds();
        RectT localRect(0, 0, std::int32_t(local.width), std::int32_t(local.height));
        window->GetLayoutManager()->SetContainingRect(localRect);
        window->GetLayoutManager()->Layout(localRect, false, true, true);
    }
    for (auto const& window : existing) {
        if (!window->IsMain()) {
            workspace_.RemoveWindow(window.get(), false);
        }
    }
    // Panels nobody asked for are released without being orphaned.
    for (auto const& panel : pool) {
        Unplace(*panel);
    }
}

} // namespace orvworkspace::workspace
