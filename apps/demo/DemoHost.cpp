#include "DemoHost.h"

#include "DemoPanels.h"
#include "host/ui/Desktop.h"
#include "manager/WorkspaceDialogs.h"
#include "manager/WorkspaceDirs.h"
#include "persistence/WorkspaceBuilder.h"
#include "workspace/TopLevelWindow.h"

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

DemoApp::DemoApp(std::u16string const& systemFolder, std::u16string const& firstWorkspace)
    : shipped_(systemFolder) {
    namespace style = orvui::ui::style;
    appWindow_ = Desktop::Get().CreateNativeWindow(
        u"orvdemo", style::Popup | style::Caption | style::SizingFrame | style::Visible, 0, 0, MainRect);
    workspace_ = new DemoWorkspace;
    RegisterPanelCreators(*workspace_);
    workspace_->AttachToClientApp(nullptr, nullptr, appWindow_, nullptr, false);
    std::u16string saved, archived, settings;
    orvworkspace::workspaceutils::GetWorkspaceDirs(nullptr, saved, archived, settings);
    manager_ = std::make_unique<Manager>(*workspace_, saved, archived, settings, &builtIns_,
                                         systemFolder.empty() ? nullptr : &shipped_, false);
    workspace_->SetManager(manager_.get());
    manager_->Initialize();
    manager_->SetCurrentWorkspace(firstWorkspace);
}

DemoApp::~DemoApp() {
    if (manager_->HasCurrentWorkspace()) {
        manager_->SaveWorkspace(manager_->GetCurrentWorkspace());
    }
    manager_->FlushManagerSettings();
    workspace_->SetManager(nullptr);
    manager_.reset();
    workspace_.reset();
    Desktop::Get().DestroyNativeWindow(appWindow_);
}

} // namespace orvdemo
