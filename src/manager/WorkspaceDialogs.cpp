// The new, delete and reset dialogs on the toolkit's message boxes.
#include "manager/WorkspaceDialogs.h"

#include "host/core/Localizer.h"
#include "host/core/StringUtils.h"
#include "host/ui/Dialogs.h"
#include "host/ui/controls/Popup.h"
#include "manager/ManagerBase.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <algorithm>

namespace orvworkspace::workspaceutils {

using orvcore::utility::TruncateUIStringInMiddle;
using orvui::ui::OS_Window;

namespace {

std::u16string Text(char const* key) {
    return orvcore::config::Localizer::Get().Localize(key);
}

// Names are shown at most this long, shortened in the middle where they are longest alike.
std::u16string Shown(std::u16string const& name) {
    return TruncateUIStringInMiddle(name, 100, 0.25);
}

OS_Window* WindowOf(DialogParent const& parent) {
    return parent ? parent->UI_GetContainingWindow() : nullptr;
}

} // namespace

bool RequestCreateNewWorkspace(canvasor::SupplierInterface* drawSupplier, DialogParent const& parent,
                               orvworkspace::workspace::ManagerBase& manager) {
    std::u16string name = Text("$$$/orvworkspace/workspaceutils/NewWSDefName=Untitled Workspace");
    if (!orvui::ui::SimpleInputBox(
            drawSupplier, Text("$$$/orvworkspace/workspaceutils/NewWSTitle=New Workspace"),
            Text("$$$/orvworkspace/workspaceutils/NewWSLabel=Name:"), name, true, WindowOf(parent), false, 0,
            0, orvui::ui::ButtonOK, orvui::ui::ButtonCancel)) {
        return false;
    }
    if (manager.HasNamedWorkspace(name)) {
        std::u16string question = orvcore::utility::ReplaceInString(
            Text("$$$/orvworkspace/workspaceutils/ReplaceWSPrompt=A workspace called \"@0\" already exists.  "
                 "Would you like to replace \"@1\"?"),
            name, name);
        if (!orvui::ui::SimpleConfirmationBox(
                drawSupplier, Text("$$$/orvworkspace/workspaceutils/ReplaceWSTitle=New Workspace"), question,
                WindowOf(parent))) {
            return false;
        }
        manager.DeleteUserWorkspace(name);
    }
    manager.CreateUserWorkspace(name);
    return true;
}

bool ChooseDeleteWorkspace(canvasor::SupplierInterface* drawSupplier, DialogParent const& parent,
                           orvworkspace::workspace::ManagerBase& manager) {
    std::vector<std::u16string> names;
    manager.GetWorkspaces(names);
    if (manager.HasCurrentWorkspace()) {
        names.erase(std::remove(names.begin(), names.end(), manager.GetCurrentWorkspace()), names.end());
    }
    if (names.empty()) {
        orvui::ui::messagebox::ShowNote(
            drawSupplier, Text("$$$/orvworkspace/workspaceutils/NewWSError=Error"),
            Text("$$$/orvworkspace/workspaceutils/NewWSNoWS=No User workspaces Defined"), WindowOf(parent));
        return false;
    }
    std::u16string name;
    if (!GetWorkspaceNameForDelete(drawSupplier, parent, names, name)) {
        return false;
    }
    manager.DeleteUserWorkspace(name);
    return true;
}

bool GetWorkspaceNameForDelete(canvasor::SupplierInterface* drawSupplier, DialogParent const& parent,
                               std::vector<std::u16string> const& names, std::u16string& name) {
    boost::intrusive_ptr<orvui::ui::UI_MessageBox> box(new orvui::ui::UI_MessageBox(
        drawSupplier, Text("$$$/orvworkspace/workspaceutils/DeleteWSTitle=Delete Workspace"),
        Text("$$$/orvworkspace/workspaceutils/DeleteWSLabel=Name:"),
        orvui::ui::ButtonOK | orvui::ui::ButtonCancel, orvui::ui::ButtonCancel, 0, WindowOf(parent)));
    boost::intrusive_ptr<orvui::controls::UI_Popup> popup(new orvui::controls::UI_Popup);
    popup->UI_SetNodeID("Workspaces Popup");
    std::vector<orvui::controls::PopupItem> items;
    for (std::u16string const& n : names) {
        items.emplace_back(Shown(n), n);
    }
    popup->SetItems(std::move(items));
    popup->SetValue(names.empty() ? -1 : 0);
    popup->UI_SetRect(orvui::ui::RectF(0, 0, 300, 22));
    box->GetPreButtonLayoutDecorator()->ChildPushBack(popup);
    if (box->Run() != int(orvui::ui::ButtonOK) || popup->GetValue() < 0) {
        return false;
    }
    name = popup->GetValueString();
    return true;
}

bool GetWorkspaceNameForDelete(orvworkspace::workspace::Workspace& workspace,
                               std::vector<std::u16string> const& names, std::u16string& name) {
    return GetWorkspaceNameForDelete(workspace.GetDrawSupplier(),
                                     DialogParent(workspace.GetMainTopLevelWindow()), names, name);
}

bool ConfirmRevertCurrWorkspace(canvasor::SupplierInterface* drawSupplier, DialogParent const& parent,
                                orvworkspace::workspace::ManagerBase& manager) {
    if (!manager.HasCurrentWorkspace()) {
        return false;
    }
    std::u16string current = manager.GetCurrentWorkspace();
    std::u16string question =
        orvcore::utility::ReplaceInString(Text("$$$/orvworkspace/workspaceutils/RestoreWSText=Are you sure "
                                               "you want to reset '@0' to its original "
                                               "layout?"),
                                          Shown(current));
    if (!orvui::ui::SimpleConfirmationBox(
            drawSupplier, Text("$$$/orvworkspace/workspaceutils/RestoreWSTitle=Reset Workspace"), question,
            WindowOf(parent), Text("$$$/orvworkspace/workspaceutils/ResetWSConfirmBtn=&Yes"),
            Text("$$$/orvworkspace/workspaceutils/ResetWSCancelBtn=&No"))) {
        return false;
    }
    manager.RevertWorkspace(current);
    return true;
}

} // namespace orvworkspace::workspaceutils
