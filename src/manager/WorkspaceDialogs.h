// The dialogs behind a host's workspace commands: naming a new workspace (asking before one of the
// same name is replaced), choosing one to delete, and confirming the reset of the current one. They
// run on the toolkit's modal dialogs and carry out the answer through the manager; errors of the
// manager pass through as exceptions.
#pragma once

#include <boost/intrusive_ptr.hpp>
#include <string>
#include <vector>

namespace canvasor {
class SupplierInterface;
}

namespace orvui::ui {
class UI_Node;
}

namespace orvworkspace::workspace {
class ManagerBase;
class Workspace;
} // namespace orvworkspace::workspace

namespace orvworkspace::workspaceutils {

using DialogParent = boost::intrusive_ptr<orvui::ui::UI_Node>;

// Asks for a name and keeps the live arrangement under it, as the current workspace. True when a
// workspace was made; false when the user cancelled or declined to replace one of that name.
bool RequestCreateNewWorkspace(canvasor::SupplierInterface* drawSupplier, DialogParent const& parent,
                               orvworkspace::workspace::ManagerBase& manager);
// Lets the user pick a workspace other than the current one and deletes it. With nothing to pick,
// shows a note. True when one was deleted.
bool ChooseDeleteWorkspace(canvasor::SupplierInterface* drawSupplier, DialogParent const& parent,
                           orvworkspace::workspace::ManagerBase& manager);
// Asks before resetting the current workspace to its original layout; true when it was reset.
bool ConfirmRevertCurrWorkspace(canvasor::SupplierInterface* drawSupplier, DialogParent const& parent,
                                orvworkspace::workspace::ManagerBase& manager);

// A box with a drop-down of the names (shortened for show); name receives the full name chosen.
// True when the user confirmed.
bool GetWorkspaceNameForDelete(canvasor::SupplierInterface* drawSupplier, DialogParent const& parent,
                               std::vector<std::u16string> const& names, std::u16string& name);
// The same, modal to the workspace's main window and drawn with its supplier.
bool GetWorkspaceNameForDelete(orvworkspace::workspace::Workspace& workspace,
                               std::vector<std::u16string> const& names, std::u16string& name);

} // namespace orvworkspace::workspaceutils
