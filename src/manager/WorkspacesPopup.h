// A drop-down listing the manager's workspaces (in code-unit order, upper case first), with a check
// mark on the current one; picking a name switches to it. Under the names, when commands are
// shown: an empty item, "New Workspace...", "Delete Workspace..." and a reset item, which call the
// workspace's DoWorkspaceCmdNew, DoWorkspaceCmdDelete and DoWorkspaceCmdReset (a host typically
// answers them with the workspace dialogs) and put the selection back on the current workspace.
// The popup registers itself with the manager, which rebuilds it whenever the list or the current
// workspace changes, and leaves it when destroyed.
#pragma once

#include "host/ui/controls/Popup.h"
#include "manager/WorkspaceProviders.h"

namespace orvui::controls {
struct UI_ControlChangedMessage;
}

namespace orvworkspace::workspace {
class ManagerBase;
}

namespace orvworkspace::sharedui {

// Always shows the commands; names are shortened for show and the reset item names the current
// workspace ("Reset Workspace..." without one, then disabled).
class WorkspacesPopup : public orvui::controls::UI_Popup, public orvworkspace::workspace::MenuHelperBase {
public:
    explicit WorkspacesPopup(orvworkspace::workspace::ManagerBase& manager);
    ~WorkspacesPopup() override;
    WorkspacesPopup(WorkspacesPopup const&) = delete;
    WorkspacesPopup& operator=(WorkspacesPopup const&) = delete;

    void RebuildMenu() override;
    void NewActiveWorkspace(std::u16string const& name) override;

private:
    void PopupChanged(orvui::controls::UI_ControlChangedMessage* message);

    orvworkspace::workspace::ManagerBase& manager_;
};

namespace orv_v1 {

// The older chooser: full names, commands only when asked for, and an external behaviour in which
// the host reads the control itself and picking a name does nothing here.
class WorkspacesPopup : public orvui::controls::UI_Popup, public orvworkspace::workspace::MenuHelperBase {
public:
    WorkspacesPopup(orvworkspace::workspace::ManagerBase& manager, bool withCommands);
    ~WorkspacesPopup() override;
    WorkspacesPopup(WorkspacesPopup const&) = delete;
    WorkspacesPopup& operator=(WorkspacesPopup const&) = delete;

    void SetExternalBehavior(bool external);
    bool GetExternalBehavior() const { return externalBehavior_; }

    void RebuildMenu() override;
    void NewActiveWorkspace(std::u16string const& name) override;

private:
    bool HasCommands() const { return withCommands_ && !externalBehavior_; }
    void PopupChanged(orvui::controls::UI_ControlChangedMessage* message);

    orvworkspace::workspace::ManagerBase& manager_;
    bool externalBehavior_ = false;
    bool withCommands_;
};

} // namespace orv_v1

} // namespace orvworkspace::sharedui
