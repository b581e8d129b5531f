#include "DemoHost.h"

#include "DemoPanels.h"
#include "frames/WorkspaceFrame.h"
#include "host/ui/Desktop.h"
#include "host/ui/controls/TabWell.h"
#include "manager/WorkspaceDialogs.h"
#include "manager/WorkspaceDirs.h"
#include "persistence/WorkspaceBuilder.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/WorkspaceUtils.h"

namespace orvdemo {

using namespace orvworkspace::workspace;
using orvui::ui::Desktop;

// --- Workspace commands ---

void DemoWorkspace::DoWorkspaceCmdNew() {
    if (manager_) {
        orvworkspace::workspaceutils::RequestCreateNewWorkspace(GetDrawSupplier(), GetMainTopLevelWindow(),
                                                                *manager_);
    }
}

void DemoWorkspace::DoWorkspaceCmdDelete() {
    if (manager_) {
        orvworkspace::workspaceutils::ChooseDeleteWorkspace(GetDrawSupplier(), GetMainTopLevelWindow(),
                                                            *manager_);
    }
}

void DemoWorkspace::DoWorkspaceCmdReset() {
    if (manager_) {
        orvworkspace::workspaceutils::ConfirmRevertCurrWorkspace(GetDrawSupplier(), GetMainTopLevelWindow(),
                                                                 *manager_);
    }
}

// --- Built-in workspaces ---

namespace {

std::unique_ptr<BuilderBase> Frame(std::vector<std::string> types) {
    return std::make_unique<FrameBuilder>(std::move(types));
}

std::unique_ptr<BuilderBase> Split(bool sideBySide, float placement, std::unique_ptr<BuilderBase> first,
                                   std::unique_ptr<BuilderBase> second) {
    auto splitter = std::make_unique<SplitterBuilder>(sideBySide, std::move(first), std::move(second));
    splitter->SetSplitVal(placement);
    return splitter;
}

} // namespace

void BuiltInWorkspaces::GetWorkspaces(std::vector<std::u16string>& out) const {
    out.insert(out.end(), {u"Editing", u"Color", u"Audio", u"Effects"});
}

std::unique_ptr<WorkspaceBuilder> BuiltInWorkspaces::CreateWorkspaceBuilder(std::u16string const& name,
                                                                            Workspace& workspace) const {
    auto builder = std::make_unique<WorkspaceBuilder>(workspace, true, false);
    std::unique_ptr<BuilderBase> root;
    if (name == u"Editing") {
        // Monitors over the project and the timeline, meters at the side.
        root = Split(false, 0.5f, Split(true, 0.5f, Frame({"source", "controls"}), Frame({"program"})),
                     Split(true, 0.3f, Frame({"project", "media", "info"}),
                           Split(true, 0.92f, Frame({"timeline"}), Frame({"meters"}))));
    } else if (name == u"Color") {
        root = Split(true, 0.3f, Frame({"controls", "effects"}),
                     Split(false, 0.65f, Frame({"program"}), Frame({"timeline", "history"})));
    } else if (name == u"Audio") {
        root = Split(false, 0.45f, Split(true, 0.7f, Frame({"program"}), Frame({"meters"})),
                     Split(true, 0.3f, Frame({"project", "effects"}), Frame({"timeline"})));
    } else if (name == u"Effects") {
        root = Split(true, 0.25f, Frame({"effects", "history"}),
                     Split(false, 0.55f, Split(true, 0.5f, Frame({"controls"}), Frame({"program"})),
                           Frame({"timeline"})));
    } else {
        return nullptr;
    }
    builder->AddWindow(std::move(root), mainRect_, "");
    return builder;
}

// --- The application ---

namespace {
// The running application, for the main window's message hook (a plain function).
DemoApp* running = nullptr;
} // namespace

DemoApp::DemoApp(std::u16string const& systemFolder, std::u16string const& firstWorkspace)
    : shipped_(systemFolder) {
    namespace style = orvui::ui::style;
    appWindow_ = Desktop::Get().CreateNativeWindow(
        u"orvdemo", style::Popup | style::Caption | style::SizingFrame | style::Visible, 0, 0, MainRect,
        nullptr, true);
    Desktop::Get().SetMenuBar(appWindow_, {u"Window"});
    workspace_ = new DemoWorkspace;
    RegisterPanelCreators(*workspace_);
    workspace_->AttachToClientApp(nullptr, nullptr, appWindow_, nullptr, false);
    std::u16string saved, archived, settings;
    orvworkspace::workspaceutils::GetWorkspaceDirs(nullptr, saved, archived, settings);
    manager_ = std::make_unique<Manager>(*workspace_, saved, archived, settings, &builtIns_,
                                         systemFolder.empty() ? nullptr : &shipped_, false);
    workspace_->SetManager(manager_.get());
    manager_->Initialize();
    // The host's items; the helper puts the workspaces above them.
    windowMenu_.AppendItem(u"New Workspace...", NewWorkspace);
    windowMenu_.AppendItem(u"Delete Workspace...", DeleteWorkspace);
    windowMenu_.AppendItem(u"Reset Workspace...", ResetWorkspace);
    windowMenu_.AppendSeparator();
    windowMenu_.AppendItem(u"Maximize Frame", MaximizeFrame);
    windowMenu_.AppendSeparator();
    for (std::size_t i = 0; i < PanelTypes().size(); ++i) {
        windowMenu_.AppendItem(PanelName(PanelTypes()[i]), FirstPanel + i);
    }
    menuHelper_ = PlatformMenuHelperBase::NewPlatformMenuHelper(&windowMenu_, *manager_, {1000, 1999}, false);
    manager_->AddMenuHelper(menuHelper_.get());
    manager_->SetCurrentWorkspace(firstWorkspace);
    running = this;
    workspace_->GetMainTopLevelWindow()->UI_SetEventFunction(&DemoApp::OnWindowMessage);
}

void DemoApp::OnWindowMessage(orvui::ui::OS_Event* event) {
    if (running && event->message == orvui::ui::message::MenuBarPressed && event->wParam == 0) {
        running->OpenWindowMenu();
    }
}

void DemoApp::Describe(std::ostream& out) const {
    for (TopLevelWindow* window : workspace_->GetWindows()) {
        for (unsigned long f = 0; f < window->GetFrameCount(); ++f) {
            WorkspaceFrame* frame = window->GetFrame(f);
            if (!frame || !frame->GetFrontTabPanel()) {
                continue;
            }
            orvui::ui::RectT r = frame->UI_GetGlobalRect();
            out << "frame " << frame->GetFrontTabPanel()->GetTabType() << ' ' << r.left << ' ' << r.top << ' '
                << r.width << ' ' << r.height << '\n';
            for (long i = 0; i < frame->GetTabCount(); ++i) {
                orvui::ui::RectT tab = frame->GetTabWell()->GetTabGlobalRect(i);
                out << "tab " << frame->GetTabPanel(i)->GetTabType() << ' ' << tab.left + tab.width / 2 << ' '
                    << tab.top + tab.height / 2 << '\n';
            }
        }
    }
}

orvui::utility::OS_Menu& DemoApp::GetWindowMenu() {
    // The panel items are checked while a panel of the kind shows.
    for (std::size_t i = 0; i < PanelTypes().size(); ++i) {
        bool front = false;
        windowMenu_.CheckItem(FirstPanel + i,
                              WorkspaceUtils::TabIsShown(*workspace_, PanelTypes()[i], front));
    }
    return windowMenu_;
}

void DemoApp::OpenWindowMenu() {
    unsigned long command = orvui::utility::UI_DoPopupMenu(
        GetWindowMenu(), Desktop::Get().GetMenuBarItemRect(appWindow_, 0), appWindow_);
    if (command) {
        HandleCommand(command);
    }
}

bool DemoApp::HandleCommand(unsigned long command) {
    if (menuHelper_->HandleCommand(command)) {
        return true;
    }
    switch (command) {
    case NewWorkspace:
        workspace_->DoWorkspaceCmdNew();
        return true;
    case DeleteWorkspace:
        workspace_->DoWorkspaceCmdDelete();
        return true;
    case ResetWorkspace:
        workspace_->DoWorkspaceCmdReset();
        return true;
    case MaximizeFrame: {
        TabPanel* focused = workspace_->GetFocusedTabPanel();
        auto* frame = focused ? dynamic_cast<WorkspaceFrame*>(focused->GetFrame()) : nullptr;
        TopLevelWindow* main = workspace_->GetMainTopLevelWindow();
        if (!frame && main && main->GetFrameCount() > 0) {
            frame = main->GetFrame(0);
        }
        WorkspaceUtils::ToggleThisFrameMaximizationState(*workspace_, frame);
        return true;
    }
    default:
        break;
    }
    if (command >= FirstPanel && command < FirstPanel + PanelTypes().size()) {
        WorkspaceUtils::ToggleTabState(*workspace_, PanelTypes()[command - FirstPanel], false);
        return true;
    }
    return false;
}

DemoApp::~DemoApp() {
    running = nullptr;
    if (TopLevelWindow* main = workspace_->GetMainTopLevelWindow()) {
        main->UI_SetEventFunction(nullptr);
    }
    if (manager_->HasCurrentWorkspace()) {
        manager_->SaveWorkspace(manager_->GetCurrentWorkspace());
    }
    manager_->FlushManagerSettings();
    workspace_->SetManager(nullptr);
    manager_->RemoveMenuHelper(menuHelper_.get());
    menuHelper_.reset();
    manager_.reset();
    workspace_.reset();
    Desktop::Get().DestroyNativeWindow(appWindow_);
}

} // namespace orvdemo
