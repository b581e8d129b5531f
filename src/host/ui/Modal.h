// Modal windows and the loop that runs them. A modal window disables its owner, takes the keyboard
// focus and processes input until it ends with a result. Headless runs answer modals through a
// ModalDriver, called on every turn of the loop with the modal window, which may inject input or end
// it; with no driver installed a modal ends at once with its cancel answer, so nothing ever waits
// for a person who is not there. A modal that no driver ends within a bounded number of turns is
// cancelled too.
#pragma once

#include "host/ui/OS_Window.h"

#include <functional>

namespace orvui::ui {

class UI_ModalWindow : public OS_Window {
public:
    // Ends the loop with a result.
    void EndModal(int result);
    bool IsModalDone() const { return done_; }
    int GetModalResult() const { return result_; }
    // The answer when the modal is cancelled (Escape, a click outside, no driver).
    void SetCancelResult(int result) { cancelResult_ = result; }
    int GetCancelResult() const { return cancelResult_; }
    virtual void CancelModal() { EndModal(cancelResult_); }
    // The node that takes the keyboard focus when the loop starts (the window itself by default).
    void SetInitialFocus(UI_Node* node) { initialFocus_ = node; }

    // Shows the window, runs the loop until it ends, hides it, and returns the result.
    int RunModal();

private:
    bool done_ = false;
    int result_ = 0;
    int cancelResult_ = 0;
    UI_Node* initialFocus_ = nullptr;
};

// Called on each turn of a modal loop with the modal window.
using ModalDriver = std::function<void(UI_ModalWindow& modal)>;
// Installs the driver (empty: none); returns the previous one. A bounded driver's modals are
// cancelled after a fixed number of turns, so a script that never answers cannot hang a headless
// run; a display backend's driver, which waits on a person, is unbounded.
ModalDriver SetModalDriver(ModalDriver driver, bool bounded = true);
bool HasModalDriver();
bool IsModalDriverBounded();

// Installs a driver for a scope.
class ScopedModalDriver {
public:
    explicit ScopedModalDriver(ModalDriver driver, bool bounded = true)
        : previousBounded_(IsModalDriverBounded())
        , previous_(SetModalDriver(std::move(driver), bounded)) {}
    ~ScopedModalDriver() { SetModalDriver(std::move(previous_), previousBounded_); }
    ScopedModalDriver(ScopedModalDriver const&) = delete;
    ScopedModalDriver& operator=(ScopedModalDriver const&) = delete;

private:
    bool previousBounded_;
    ModalDriver previous_;
};

} // namespace orvui::ui
