// Shows the manager's workspaces as commands at the top of a menu: one command per name (ascending
// from the top), a check mark on the current workspace, and a separator above the host's own items.
// Picking a command makes that workspace current. The logic works through five menu operations a
// derived class supplies (PlatformMenuHelper does so on the toolkit's menus).
//
// Command IDs come from a pool: a fixed range (names beyond it get no command), or an allocator asked
// for exactly the IDs still missing. ID 0 is never checked.
#pragma once

#include "manager/WorkspaceProviders.h"

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace orvui::utility {
class OS_Menu;
}

namespace orvworkspace::workspace {

class ManagerBase;

class PlatformMenuHelperBase : public MenuHelperBase {
public:
    using IdAllocator = std::shared_ptr<std::function<unsigned long(unsigned long)>>;

    // A helper over the menu (a new empty one, owned by the helper, when menu is null); the items
    // already in a given menu are the host's and stay below the workspace commands.
    static std::unique_ptr<PlatformMenuHelperBase>
    NewPlatformMenuHelper(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                          std::pair<unsigned long, unsigned long> const& idRange, bool hostFlag);
    static std::unique_ptr<PlatformMenuHelperBase> NewPlatformMenuHelper(orvui::utility::OS_Menu* menu,
                                                                         ManagerBase& manager,
                                                                         IdAllocator& idAllocator,
                                                                         bool hostFlag);

    void RebuildMenu() override;
    void NewActiveWorkspace(std::u16string const& name) override;
    // Makes the command's workspace current; false (nothing done) for a command that is not one.
    bool HandleCommand(unsigned long command);
    bool IsWorkspaceCommand(unsigned long command) const { return commandNames_.count(command) != 0; }
    bool WorkspaceNameForCmd(unsigned long command, std::u16string& name) const;
    bool WorkspaceCmdForName(std::u16string const& name, unsigned long& command) const;
    unsigned long GetInitialMenuItemCount() const { return initialItemCount_; }
    void SetSizeMainFrame(bool size) { sizeMainFrame_ = size; }
    orvui::utility::OS_Menu* GetMenu() const { return menu_; }
    unsigned long GetCheckedCommand() const { return checkedCommand_; }

    // --- The menu, as a derived class provides it ---
    virtual unsigned long GetNumberMenuItems() const = 0;
    virtual void InsertMenuW(std::u16string const& text, unsigned long command) = 0;
    virtual void InsertSeparator() = 0;
    virtual void DeleteFirstItem() = 0;
    virtual void SetMenuCheck(unsigned long command, bool checked) = 0;

protected:
    PlatformMenuHelperBase(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                           std::pair<unsigned long, unsigned long> const& idRange, bool hostFlag);
    PlatformMenuHelperBase(orvui::utility::OS_Menu* menu, ManagerBase& manager, IdAllocator& idAllocator,
                           bool hostFlag);
    // The items in the menu now are the host's.
    void Init();
    orvui::utility::OS_Menu* menu_;
    std::unique_ptr<orvui::utility::OS_Menu> ownMenu_;

private:
    void ClearWorkspaceMenu();

    bool hostFlag_;
    ManagerBase& manager_;
    unsigned long initialItemCount_ = 0;
    std::map<unsigned long, std::u16string> commandNames_;
    std::vector<unsigned long> commandIds_;
    bool initialised_ = false;
    IdAllocator idAllocator_;
    unsigned long checkedCommand_ = 0;
    bool sizeMainFrame_ = true;
};

// Process-wide: whether a command's check mark is a radio dot (false for workspace commands).
void SetCommandCheckStyle(unsigned long command, bool radio);
bool IsCommandCheckStyleRadio(unsigned long command);

} // namespace orvworkspace::workspace
