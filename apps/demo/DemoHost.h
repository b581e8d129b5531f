// The demo host: its workspace (whose workspace commands open the library's dialogs), the built-in
// workspaces it ships as builders, and the application that starts and stops it all as a host
// does: a manager over the preferences folders, the built-in provider, a system provider over the
// demo's folder of workspace files, the first workspace made current, and on exit the current
// workspace saved and the manager's settings flushed.
#pragma once

#include "host/ui/Menu.h"
#include "host/ui/UITypes.h"
#include "manager/Manager.h"
#include "manager/PlatformMenuHelperBase.h"
#include "manager/WorkspaceProviders.h"
#include "workspace/Workspace.h"

#include <memory>
#include <ostream>
#include <string>
#include <vector>

namespace orvdemo {

class DemoWorkspace : public orvworkspace::workspace::Workspace {
public:
    void SetManager(orvworkspace::workspace::ManagerBase* manager) { manager_ = manager; }
    void DoWorkspaceCmdNew() override;
    void DoWorkspaceCmdDelete() override;
    void DoWorkspaceCmdReset() override;

private:
    orvworkspace::workspace::ManagerBase* manager_ = nullptr;
};

// "Editing", "Color", "Audio" and "Effects", laid out in code.
class BuiltInWorkspaces : public orvworkspace::workspace::BuiltInWorkspaceProviderBase {
public:
    explicit BuiltInWorkspaces(orvui::ui::RectT mainRect)
        : mainRect_(mainRect) {}
    void GetWorkspaces(std::vector<std::u16string>& out) const override;
    std::unique_ptr<orvworkspace::workspace::WorkspaceBuilder>
    CreateWorkspaceBuilder(std::u16string const& name,
                           orvworkspace::workspace::Workspace& workspace) const override;

private:
    orvui::ui::RectT mainRect_;
};

// Workspace files shipped with the demo (apps/demo/workspaces).
class ShippedWorkspaces : public orvworkspace::workspace::SystemWorkspaceProviderBase {
public:
    explicit ShippedWorkspaces(std::u16string folder)
        : folder_(std::move(folder)) {}
    void GetSystemWorkspaceFolder(std::u16string& folder) const override { folder = folder_; }

private:
    std::u16string folder_;
};

class DemoApp {
public:
    static constexpr orvui::ui::RectT Monitor{0, 0, 1920, 1080};
    static constexpr orvui::ui::RectT MainRect{40, 30, 1600, 960};

    // Starts the host on the desktop: its main window, the workspace with its panel kinds, the
    // manager over the preferences folders, and the first workspace.
    DemoApp(std::u16string const& systemFolder, std::u16string const& firstWorkspace);
    // Saves the current workspace and the manager's settings, as a host does on exit.
    ~DemoApp();
    DemoApp(DemoApp const&) = delete;
    DemoApp& operator=(DemoApp const&) = delete;

    // The main window's Window menu: the workspaces (kept by a menu helper), then new, delete and
    // reset, maximising the focused panel's frame (the ` key does it for the frame under the
    // pointer), then one item per panel kind, checked while it is shown.
    enum Command : unsigned long {
        NewWorkspace = 1,
        DeleteWorkspace = 2,
        ResetWorkspace = 3,
        MaximizeFrame = 4, // the frame of the focused panel, or back from a maximised one
        FirstPanel = 100,  // one per panel kind, in the order of PanelTypes
    };
    orvui::utility::OS_Menu& GetWindowMenu();
    // Opens the Window menu under its title in the menu bar and carries out the choice.
    void OpenWindowMenu();
    // Carries out a command of the Window menu; false for one it does not know.
    bool HandleCommand(unsigned long command);

    // Where things are on the desktop, one per line, for scripts that drive the demo from outside:
    // "tab TYPE X Y" (the centre of each tab) and "frame TYPE LEFT TOP WIDTH HEIGHT" (each frame,
    // named by its front tab).
    void Describe(std::ostream& out) const;

    DemoWorkspace& GetWorkspace() const { return *workspace_; }
    orvworkspace::workspace::Manager& GetManager() const { return *manager_; }
    orvui::ui::NativeWindow GetAppWindow() const { return appWindow_; }

private:
    static void OnWindowMessage(orvui::ui::OS_Event* event);

    orvui::ui::NativeWindow appWindow_ = 0;
    boost::intrusive_ptr<DemoWorkspace> workspace_;
    BuiltInWorkspaces builtIns_{MainRect};
    ShippedWorkspaces shipped_;
    std::unique_ptr<orvworkspace::workspace::Manager> manager_;
    orvui::utility::OS_Menu windowMenu_;
    std::unique_ptr<orvworkspace::workspace::PlatformMenuHelperBase> menuHelper_;
};

} // namespace orvdemo
