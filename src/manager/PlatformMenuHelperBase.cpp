// Workspace commands in a menu: rebuilding, checking, handling.
#include "manager/PlatformMenuHelperBase.h"

#include "host/core/StringUtils.h"
#include "host/ui/Menu.h"
#include "manager/ManagerBase.h"
#include "manager/PlatformMenuHelper.h"

#include <algorithm>
#include <mutex>

namespace orvworkspace::workspace {

namespace {

std::map<unsigned long, bool>& CheckStyles() {
    static std::map<unsigned long, bool> styles;
    return styles;
}

std::mutex& CheckStylesLock() {
    static std::mutex lock;
    return lock;
}

} // namespace

void SetCommandCheckStyle(unsigned long command, bool radio) {
    std::lock_guard<std::mutex> guard(CheckStylesLock());
    CheckStyles()[command] = radio;
}

bool IsCommandCheckStyleRadio(unsigned long command) {
    std::lock_guard<std::mutex> guard(CheckStylesLock());
    auto found = CheckStyles().find(command);
    return found != CheckStyles().end() && found->second;
}

PlatformMenuHelperBase::PlatformMenuHelperBase(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                                               std::pair<unsigned long, unsigned long> const& idRange,
                                               bool hostFlag)
    : menu_(menu)
    , hostFlag_(hostFlag)
    , manager_(manager) {
    if (!menu_) {
        ownMenu_ = std::make_unique<orvui::utility::OS_Menu>();
        menu_ = ownMenu_.get();
    }
    for (unsigned long i = 0; i < idRange.second; ++i) {
        commandIds_.push_back(idRange.first + i);
    }
}

PlatformMenuHelperBase::PlatformMenuHelperBase(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                                               IdAllocator& idAllocator, bool hostFlag)
    : menu_(menu)
    , hostFlag_(hostFlag)
    , manager_(manager)
    , idAllocator_(idAllocator) {
    if (!menu_) {
        ownMenu_ = std::make_unique<orvui::utility::OS_Menu>();
        menu_ = ownMenu_.get();
    }
}

std::unique_ptr<PlatformMenuHelperBase>
PlatformMenuHelperBase::NewPlatformMenuHelper(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                                              std::pair<unsigned long, unsigned long> const& idRange,
                                              bool hostFlag) {
    auto helper = std::make_unique<PlatformMenuHelper>(menu, manager, idRange, hostFlag);
    helper->Init();
    return helper;
}

std::unique_ptr<PlatformMenuHelperBase>
PlatformMenuHelperBase::NewPlatformMenuHelper(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                                              IdAllocator& idAllocator, bool hostFlag) {
    auto helper = std::make_unique<PlatformMenuHelper>(menu, manager, idAllocator, hostFlag);
    helper->Init();
    return helper;
}

void PlatformMenuHelperBase::Init() {
    initialItemCount_ = GetNumberMenuItems();
    initialised_ = true;
}

void PlatformMenuHelperBase::ClearWorkspaceMenu() {
    while (GetNumberMenuItems() > initialItemCount_) {
        DeleteFirstItem();
    }
}

void PlatformMenuHelperBase::RebuildMenu() {
    ClearWorkspaceMenu();
    commandNames_.clear();
    checkedCommand_ = 0;
    std::vector<std::u16string> names;
    manager_.GetUISortedWorkspaceNames(names); // descending: inserted at the top, they read ascending
    std::size_t n = names.size();
    if (n > 0) {
        if (commandIds_.size() < n && idAllocator_ && *idAllocator_) {
            unsigned long missing = static_cast<unsigned long>(n - commandIds_.size());
            unsigned long first = (*idAllocator_)(missing);
            for (unsigned long i = 0; i < missing; ++i) {
                commandIds_.push_back(first + i);
            }
        }
        InsertSeparator();
        if (commandIds_.empty()) {
            return;
        }
        // The names take IDs from the pool downwards, so the top command has the pool's first ID.
        std::size_t cursor = std::min(commandIds_.size(), n);
        for (std::u16string const& name : names) {
            if (cursor == 0) {
                return; // a pool too small: the rest get no command, and nothing is checked
            }
            --cursor;
            unsigned long id = commandIds_[cursor];
            InsertMenuW(orvcore::utility::TruncateUIStringInMiddle(name, 100, 0.25), id);
            commandNames_[id] = name;
        }
    }
    if (manager_.HasCurrentWorkspace()) {
        NewActiveWorkspace(manager_.GetCurrentWorkspace());
    }
}

void PlatformMenuHelperBase::NewActiveWorkspace(std::u16string const& name) {
    if (checkedCommand_ != 0) {
        SetMenuCheck(checkedCommand_, false);
    }
    checkedCommand_ = 0;
    for (auto const& [id, commandName] : commandNames_) {
        if (commandName == name) {
            checkedCommand_ = id;
            break;
        }
    }
    if (checkedCommand_ != 0) {
        SetMenuCheck(checkedCommand_, true);
    }
}

bool PlatformMenuHelperBase::HandleCommand(unsigned long command) {
    auto found = commandNames_.find(command);
    if (found == commandNames_.end()) {
        return false;
    }
    std::u16string name = found->second; // the switch rebuilds the menu under us
    manager_.SetCurrentWorkspace(name);
    return true;
}

bool PlatformMenuHelperBase::WorkspaceNameForCmd(unsigned long command, std::u16string& name) const {
    auto found = commandNames_.find(command);
    if (found == commandNames_.end()) {
        return false;
    }
    name = found->second;
    return true;
}

bool PlatformMenuHelperBase::WorkspaceCmdForName(std::u16string const& name, unsigned long& command) const {
    command = 0;
    for (auto const& [id, commandName] : commandNames_) {
        if (commandName == name) {
            command = id;
            break;
        }
    }
    return command != 0;
}

} // namespace orvworkspace::workspace
