// The five menu operations on the toolkit's menus.
#include "manager/PlatformMenuHelper.h"

#include "host/ui/Menu.h"

namespace orvworkspace::workspace {

PlatformMenuHelper::PlatformMenuHelper(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                                       std::pair<unsigned long, unsigned long> const& idRange, bool hostFlag)
    : PlatformMenuHelperBase(menu, manager, idRange, hostFlag) {}

PlatformMenuHelper::PlatformMenuHelper(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                                       IdAllocator& idAllocator, bool hostFlag)
    : PlatformMenuHelperBase(menu, manager, idAllocator, hostFlag) {}

unsigned long PlatformMenuHelper::GetNumberMenuItems() const {
    return static_cast<unsigned long>(menu_->GetItemCount());
}

void PlatformMenuHelper::InsertMenuW(std::u16string const& text, unsigned long command) {
    menu_->InsertItem(0, text, command);
    SetCommandCheckStyle(command, false);
}

void PlatformMenuHelper::InsertSeparator() {
    menu_->InsertSeparator(0);
}

void PlatformMenuHelper::DeleteFirstItem() {
    menu_->RemoveItem(0);
}

void PlatformMenuHelper::SetMenuCheck(unsigned long command, bool checked) {
    menu_->CheckItem(command, checked);
}

} // namespace orvworkspace::workspace
