// The workspace menu helper on the toolkit's menus: commands and the separator inserted at the top,
// the top item removed, check marks set by command.
#pragma once

#include "manager/PlatformMenuHelperBase.h"

namespace orvworkspace::workspace {

class PlatformMenuHelper : public PlatformMenuHelperBase {
public:
    // These leave the menu's items uncounted as the host's (NewPlatformMenuHelper counts them).
    PlatformMenuHelper(orvui::utility::OS_Menu* menu, ManagerBase& manager,
                       std::pair<unsigned long, unsigned long> const& idRange, bool hostFlag);
    PlatformMenuHelper(orvui::utility::OS_Menu* menu, ManagerBase& manager, IdAllocator& idAllocator,
                       bool hostFlag);

    unsigned long GetNumberMenuItems() const override;
    void InsertMenuW(std::u16string const& text, unsigned long command) override;
    void InsertSeparator() override;
    void DeleteFirstItem() override;
    void SetMenuCheck(unsigned long command, bool checked) override;

private:
    friend class PlatformMenuHelperBase;
};

} // namespace orvworkspace::workspace
