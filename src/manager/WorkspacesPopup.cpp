// The workspaces drop-down: building its items from the manager and acting on the user's choice.
#include "manager/WorkspacesPopup.h"

#include "host/core/Localizer.h"
#include "host/core/StringUtils.h"
#include "host/ui/controls/ControlView.h"
#include "manager/ManagerBase.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <functional>

namespace orvworkspace::sharedui {

using orvui::controls::PopupItem;
using orvui::controls::UI_ControlChangedMessage;
using orvui::controls::UI_Popup;
using orvworkspace::workspace::ManagerBase;

namespace {

// The command items follow the names: an empty item, new, delete and reset, at these distances
// from the end.
constexpr long EmptyFromEnd = 4;
constexpr long NewFromEnd = 3;
constexpr long DeleteFromEnd = 2;
constexpr long ResetFromEnd = 1;

std::u16string Text(char const* key) {
    return orvcore::config::Localizer::Get().Localize(key);
}

std::u16string Shown(std::u16string const& name) {
    return orvcore::utility::TruncateUIStringInMiddle(name, 100, 0.25);
}

// The manager's names in code-unit order (upper case before lower case), as its table keeps them.
std::vector<std::u16string> SortedNames(ManagerBase const& manager) {
    std::vector<std::u16string> names;
    manager.GetWorkspaces(names);
    std::sort(names.begin(), names.end());
    return names;
}

void AppendCommands(std::vector<PopupItem>& items, std::u16string const& resetText) {
    items.emplace_back(std::u16string());
    items.emplace_back(Text("$$$/orvworkspace/sharedui/WorkspacesPopup/WorkspaceNew=New Workspace..."));
    items.emplace_back(Text("$$$/orvworkspace/sharedui/WorkspacesPopup/WorkspaceDelete=Delete Workspace..."));
    items.emplace_back(resetText);
}

// Checks and selects the item shown as current, or shows no choice when there is no current one.
void MarkCurrent(UI_Popup& popup, ManagerBase const& manager, std::u16string const& shownCurrent) {
    if (manager.HasCurrentWorkspace()) {
        if (long it = popup.FindStringExact(shownCurrent); it >= 0) {
            popup.CheckItem(it, true);
            popup.SetValue(it);
        }
    } else {
        popup.UncheckAllItems();
        popup.SetValueUnknown();
        popup.SetValue(-1);
    }
}

// Deleting needs a workspace other than the current one.
void EnableDelete(UI_Popup& popup, ManagerBase const& manager, std::size_t names) {
    bool deletable = names >= 2 && manager.HasCurrentWorkspace();
    popup.DisableItem(popup.GetItemCount() - DeleteFromEnd, !deletable);
}

// A command item was chosen: the selection goes back to the current workspace (or the first item)
// and the host's hook runs; the empty item only restores the selection.
void RunCommand(UI_Popup& popup, ManagerBase& manager, long chosen, std::u16string const& shownCurrent) {
    long n = popup.GetItemCount();
    long back = manager.HasCurrentWorkspace() ? popup.FindStringExact(shownCurrent) : -1;
    if (back < 0) {
        back = 0;
    }
    popup.CheckItem(back, true);
    popup.SetValue(back);
    orvworkspace::workspace::Workspace& workspace = manager.GetWorkspace();
    if (chosen == n - NewFromEnd) {
        workspace.DoWorkspaceCmdNew();
    } else if (chosen == n - DeleteFromEnd) {
        workspace.DoWorkspaceCmdDelete();
    } else if (chosen == n - ResetFromEnd) {
        workspace.DoWorkspaceCmdReset();
    }
}

// A name was chosen: switching makes the manager rebuild the popup.
void SwitchTo(UI_Popup& popup, ManagerBase& manager, long chosen) {
    if (chosen >= 0 && chosen < popup.GetItemCount()) {
        std::u16string name = popup.GetItems()[std::size_t(chosen)].Full();
        manager.SetCurrentWorkspace(name);
    }
}

// What both popups do when made: the node ID, one check mark, a place among the manager's helpers
// (which builds the items at once), and the user's choices sent to changed.
void JoinManager(UI_Popup& popup, orvworkspace::workspace::MenuHelperBase& helper, ManagerBase& manager,
                 std::function<void(UI_ControlChangedMessage*)> changed) {
    popup.UI_SetNodeID("WorkspacesPopup");
    popup.SetItemCheckStyle(true);
    manager.AddMenuHelper(&helper);
    popup.NotifyWhenChanged(std::move(changed));
}

} // namespace

// --- WorkspacesPopup ---

WorkspacesPopup::WorkspacesPopup(ManagerBase& manager)
    : UI_Popup(0, false)
    , manager_(manager) {
    JoinManager(*this, *this, manager_, [this](UI_ControlChangedMessage* message) { PopupChanged(message); });
}

WorkspacesPopup::~WorkspacesPopup() {
    manager_.RemoveMenuHelper(this);
}

void WorkspacesPopup::RebuildMenu() {
    UncheckAllItems();
    std::vector<std::u16string> names = SortedNames(manager_);
    std::vector<PopupItem> items;
    for (std::u16string const& name : names) {
        items.emplace_back(Shown(name), name);
    }
    std::u16string shownCurrent = Shown(manager_.GetCurrentWorkspace());
    bool named = manager_.HasCurrentWorkspace() && !shownCurrent.empty();
    AppendCommands(
        items,
        named ? orvcore::utility::ReplaceInString(
                    Text("$$$/orvworkspace/sharedui/WorkspacesPopup/ResetWorkspace=Reset \"@0\"..."),
                    shownCurrent)
              : Text("$$$/orvworkspace/sharedui/WorkspacesPopup/ResetWorkspaceDefault=Reset Workspace..."));
    SetItems(std::move(items));
    EnableAllItems();
    MarkCurrent(*this, manager_, shownCurrent);
    if (!manager_.HasCurrentWorkspace()) {
        DisableItem(GetItemCount() - ResetFromEnd, true);
    }
    EnableDelete(*this, manager_, names.size());
}

void WorkspacesPopup::NewActiveWorkspace(std::u16string const&) {
    RebuildMenu();
}

void WorkspacesPopup::PopupChanged(UI_ControlChangedMessage*) {
    long chosen = GetValue();
    if (chosen >= GetItemCount() - EmptyFromEnd) {
        RunCommand(*this, manager_, chosen, Shown(manager_.GetCurrentWorkspace()));
    } else {
        SwitchTo(*this, manager_, chosen);
    }
}

// --- orv_v1::WorkspacesPopup ---

namespace orv_v1 {

WorkspacesPopup::WorkspacesPopup(ManagerBase& manager, bool withCommands)
    : UI_Popup(0, false)
    , manager_(manager)
    , withCommands_(withCommands) {
    JoinManager(*this, *this, manager_, [this](UI_ControlChangedMessage* message) { PopupChanged(message); });
}

WorkspacesPopup::~WorkspacesPopup() {
    manager_.RemoveMenuHelper(this);
}

void WorkspacesPopup::SetExternalBehavior(bool external) {
    externalBehavior_ = external;
    if (withCommands_) {
        RebuildMenu();
    }
}

void WorkspacesPopup::RebuildMenu() {
    UncheckAllItems();
    std::vector<std::u16string> names = SortedNames(manager_);
    std::vector<PopupItem> items(names.begin(), names.end());
    if (HasCommands()) {
        AppendCommands(items,
                       orvcore::utility::ReplaceInString(
                           Text("$$$/orvworkspace/sharedui/WorkspacesPopup/WorkspaceReset=Reset \"@0\"..."),
                           manager_.GetCurrentWorkspace()));
    }
    SetItems(std::move(items));
    MarkCurrent(*this, manager_, manager_.GetCurrentWorkspace());
    EnableAllItems();
    if (HasCommands()) {
        EnableDelete(*this, manager_, names.size());
    }
}

void WorkspacesPopup::NewActiveWorkspace(std::u16string const&) {
    if (HasCommands()) {
        RebuildMenu();
    }
}

void WorkspacesPopup::PopupChanged(UI_ControlChangedMessage*) {
    if (externalBehavior_) {
        return; // the host reads the control itself
    }
    long chosen = GetValue();
    if (withCommands_ && chosen >= GetItemCount() - EmptyFromEnd) {
        RunCommand(*this, manager_, chosen, manager_.GetCurrentWorkspace());
    } else {
        SwitchTo(*this, manager_, chosen);
    }
}

} // namespace orv_v1

} // namespace orvworkspace::sharedui
