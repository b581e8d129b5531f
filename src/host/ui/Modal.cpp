// The modal loop.
#include "host/ui/Modal.h"

#include "host/ui/Desktop.h"
#include "host/ui/NodeManager.h"

namespace orvui::ui {

namespace {
ModalDriver driver;
// A driver that never ends its modal would hang a headless run; this many turns is plenty for any
// scripted answer.
constexpr int MaxTurns = 10000;
bool driverBounded = true;
} // namespace

ModalDriver SetModalDriver(ModalDriver next, bool bounded) {
    ModalDriver previous = std::move(driver);
    driver = std::move(next);
    driverBounded = bounded;
    return previous;
}

bool HasModalDriver() {
    return static_cast<bool>(driver);
}

bool IsModalDriverBounded() {
    return driverBounded;
}

void UI_ModalWindow::EndModal(int result) {
    if (!done_) {
        done_ = true;
        result_ = result;
    }
}

int UI_ModalWindow::RunModal() {
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    Desktop& desktop = Desktop::Get();
    UI_NodeManager* manager = UI_NodeManager::Get();
    done_ = false;
    NativeWindow self = GetPlatformWindow();
    NativeWindow owner = desktop.GetOwner(self);
    bool ownerWasEnabled = owner && desktop.IsEnabled(owner);
    if (ownerWasEnabled) {
        desktop.EnableWindow(owner, false);
    }
    OS_Window* previousModal = manager->GetModalWindow();
    UI_Node* previousFocus = manager->GetFocusLeaf();
    manager->SetModalWindow(this);
    UI_Show(true);
    desktop.Activate(self);
    (initialFocus_ && IsAncestorOf(initialFocus_) ? initialFocus_ : this)
        ->UI_GainKeyboardFocus(FocusByProgram);
    for (int turn = 0; !done_; ++turn) {
        if (!driver || (driverBounded && turn >= MaxTurns)) {
            CancelModal();
            break;
        }
        ModalDriver current = driver; // the driver may replace itself
        current(*this);
        desktop.ProcessPendingWork();
    }
    UI_Show(false);
    manager->SetModalWindow(previousModal);
    if (ownerWasEnabled && desktop.IsWindow(owner)) {
        desktop.EnableWindow(owner, true);
        desktop.Activate(owner);
    }
    if (manager->GetFocusLeaf() == this || UI_HasKeyboardFocus(true)) {
        manager->SetFocusLeaf(previousFocus, FocusByProgram);
    }
    return result_;
}

} // namespace orvui::ui
