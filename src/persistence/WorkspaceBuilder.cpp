// Building a workspace from builders.
#include "persistence/WorkspaceBuilder.h"

#include "frames/WorkspaceFrame.h"
#include "host/ui/MonitorInfo.h"
#include "layout/FrameDataProxy.h"
#include "layout/Splitter.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <list>

namespace orvworkspace::workspace {

namespace {
void PutOnSide(BuildContext const& context, LayoutManagerElement* element) {
    element->SetParent(context.parent);
    if (context.leftOrTop) {
        context.parent->SetLeftOrTop(element);
    } else {
        context.parent->SetRightOrBottom(element);
    }
}
} // namespace

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
    bool shown = frame->GetTabCount() > 0;
    if (shown) {
        frame->GetLMFrame()->SetLayoutManager(window.GetLayoutManager());
        PutOnSide(context, frame->GetLMFrame());
        context.frames->push_back(frame);
    } else {
        window.ChildRemove(frame.get());
    }
    boost::intrusive_ptr<WorkspaceFrame> hiddenFrame;
    TabDataList removed;
    for (std::string const& type : remembered_) {
        if (!workspace.TabTypeHidesWhenClosed(type)) {
            removed.emplace_back(type, "");
            continue;
        }
        WorkspaceFrame* keeper = frame.get();
        if (!shown) {
            if (!hiddenFrame) {
                hiddenFrame = window.CreateWorkspaceFrame();
                window.ChildRemove(hiddenFrame.get());
                hiddenFrame->ShowFrame(false);
                window.AddHiddenFrame(hiddenFrame);
            }
            keeper = hiddenFrame.get();
        }
        if (boost::intrusive_ptr<TabPanel> panel =
                TakeOrCreateTabPanel(workspace, type, *context.pool, nullptr)) {
            panel->SetFrame(nullptr);
            keeper->CacheTabData(panel, true);
        }
    }
    if (shown) {
        for (auto const& entry : removed) {
            frame->AddRemovedTabData(entry.first, entry.second);
        }
        long index = std::min<long>(long(front_), frame->GetTabCount() - 1);
        frame->BringTabToFront(index);
        frame->GetFrontTabPanel()->UI_Show(true);
        return;
    }
    FrameDataProxy* proxy = nullptr;
    if (hiddenFrame) {
        hiddenFrame->SetRemovedTabData(removed);
        proxy = new FrameDataProxy(window.GetLayoutManager(), hiddenFrame->GetLMFrame());
    } else {
        proxy = new FrameDataProxy(window.GetLayoutManager(), removed);
    }
    PutOnSide(context, proxy);
    if (context.leftOrTop) {
        context.parent->SetLeftOrTopVisible(false);
    } else {
        context.parent->SetRightOrBottomVisible(false);
    }
}

void SplitterBuilder::AddElement(std::unique_ptr<BuilderBase> builder, bool leftOrTop) {
    (leftOrTop ? first_ : second_) = std::move(builder);
}

void SplitterBuilder::Build(Workspace& workspace, TopLevelWindow& window, BuildContext& context) {
    auto* splitter = new Splitter(context.parent->GetLayoutManager(), vertical_);
    PutOnSide(context, splitter);
    for (bool leftOrTop : {true, false}) {
        BuilderBase* child = (leftOrTop ? first_ : second_).get();
        if (child) {
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
        boost::intrusive_ptr<TopLevelWindow> window;
        if (!existing.empty()) {
            window = existing.front();
            existing.pop_front();
            for (auto side :
                 {LayoutManager::Top, LayoutManager::Left, LayoutManager::Right, LayoutManager::Bottom}) {
                if (window->HasStaticElement(side)) {
                    window->RemoveStaticElement(side, false);
                }
            }
        } else {
            window = workspace_.AddTopLevelWindow(workspace_.GetMainTopLevelWindow() == nullptr, nullptr);
        }
        std::vector<boost::intrusive_ptr<WorkspaceFrame>> oldFrames;
        for (std::size_t i = 0; i < window->ChildSize(); ++i) {
            if (auto* frame = dynamic_cast<WorkspaceFrame*>(window->ChildGet(i))) {
                oldFrames.emplace_back(frame);
            }
        }
        (void)window->TakeHiddenFrames();
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
        window->ResetRootFrame(root, frames);
        for (auto const& old : oldFrames) {
            if (std::find(frames.begin(), frames.end(), old) == frames.end()) {
                window->ChildRemove(old.get());
            }
        }
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
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(panel->GetFrame())) {
            for (long i = 0; i < frame->GetTabCount(); ++i) {
                if (frame->GetTabPanel(i) == panel.get()) {
                    frame->DetachTabPanel(i);
                    break;
                }
            }
        }
    }
}

} // namespace orvworkspace::workspace
