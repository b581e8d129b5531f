// The toolkit's node manager: keyboard focus and its grouping, input and pointer captures, the
// routing of mouse and key events to nodes, the user-resize function, the modal window, timer
// identifiers and guards that freeze hover feedback. One manager is current per process: the one
// last constructed (the library's WorkspaceUIManager), else a default.
#pragma once

#include "host/ui/InputCapture.h"

#include "host/ui/canvasor/Image.h"

#include <functional>
#include <map>
#include <memory>
#include <string>

namespace canvasor {
class SupplierInterface;
}

namespace orvui::utility {
class ResourceManager;
}

namespace orvui::ui {

class OS_Window;

class UI_NodeManager {
public:
    // The current manager.
    static UI_NodeManager* Get();
    virtual ~UI_NodeManager();

    // --- Drawing supplier ---
    canvasor::SupplierInterface* GetOSDrawSupplier() const { return drawSupplier_; }
    void SetOSDrawSupplier(canvasor::SupplierInterface* supplier) { drawSupplier_ = supplier; }

    // --- User resizing of top-level windows ---
    // Called with (true, window node, isResize) when the user starts moving or resizing a window by
    // its chrome and with false when that ends.
    using UserResizeFunction = std::function<void(bool begin, UI_Node* node, bool resize)>;
    void InstallUserResizeFunction(UserResizeFunction f) { userResize_ = std::move(f); }
    void NotifyUserResize(bool begin, UI_Node* node, bool resize);

    // Guards.
    class SuspendMouseOverUpdates {
    public:
        SuspendMouseOverUpdates();
        ~SuspendMouseOverUpdates();
        SuspendMouseOverUpdates(SuspendMouseOverUpdates const&) = delete;
        SuspendMouseOverUpdates& operator=(SuspendMouseOverUpdates const&) = delete;
    };
    bool MouseOverUpdatesSuspended() const { return mouseOverSuspended_ > 0; }

    // Tells the user-resize function that node is being resized for the guard's lifetime.
    class NotifyUserResizing {
    public:
        explicit NotifyUserResizing(UI_Node* node, bool resize = true);
        ~NotifyUserResizing();
        NotifyUserResizing(NotifyUserResizing const&) = delete;
        NotifyUserResizing& operator=(NotifyUserResizing const&) = delete;

    private:
        UI_Node* node_;
        bool resize_;
    };

    // Holds focus-change notifications back until the outermost guard ends; then the nodes whose
    // focus changed between its start and its end hear of it once.
    class GroupingFocusChanges {
    public:
        GroupingFocusChanges();
        ~GroupingFocusChanges();
        GroupingFocusChanges(GroupingFocusChanges const&) = delete;
        GroupingFocusChanges& operator=(GroupingFocusChanges const&) = delete;
    };

    // --- Modal window ---
    void SetModalWindow(OS_Window* window) { modal_ = window; }
    bool HasModalWindow() const { return modal_ != nullptr; }
    OS_Window* GetModalWindow() const { return modal_; }

    // --- Captures ---
    // Starts a capture that sees input first; a previous one ends.
    void BeginInputCapture(std::shared_ptr<InputCapture> capture);
    void EndInputCapture(InputCapture const* capture);
    InputCapture* GetInputCapture() const { return inputCapture_.get(); }
    void SetPointerCaptureNode(UI_Node* node) { pointerCapture_ = node; }
    UI_Node* GetPointerCaptureNode() const { return pointerCapture_; }

    // --- Images ---
    // The toolkit's resources.
    utility::ResourceManager* GetResourceManager();
    // A "png" resource decoded by the draw supplier, kept after the first call; null when missing.
    canvasor::FileImageP GetImage(std::string const& name);

    // --- Timers ---
    unsigned long GetUniqueTimerID() { return ++lastTimerID_; }

    // --- Focus ---
    UI_Node* GetFocusLeaf() const { return focus_; }
    // Moves the focus; the nodes whose (deep) focus changed hear of it with the reason.
    void SetFocusLeaf(UI_Node* node, int reason);
    // Whether focus notifications are being delivered right now.
    bool IsUpdatingFocus() const { return updatingFocus_ > 0; }
    // Forgets the focus without telling anyone (a window that closes takes its focus with it).
    void UI_ClearPreviousKeyboardFocus() { focus_ = nullptr; }

    // --- Routing ---
    // A mouse message to a window: to the input capture, then to the pointer-capture node or the
    // deepest shown node under the pointer, bubbling up; moves also set the cursor.
    void DispatchMouse(OS_Window& window, OS_Event const& event);
    // A key to the input capture, else to the focus leaf (or the active window), bubbling up.
    void DispatchKey(KeyboardEvent& event);
    // The deepest shown node at a global point within root, or null.
    static UI_Node* HitTest(UI_Node* root, PointT global);

    // A node is going away.
    void ForgetNode(UI_Node* node);
    // Back to no focus, no captures, no modal window and no user-resize function (a fresh desktop).
    void ResetState();

protected:
    UI_NodeManager();

private:
    void Notify(UI_Node* from, UI_Node* to, int reason);

    canvasor::SupplierInterface* drawSupplier_ = nullptr;
    UserResizeFunction userResize_;
    int mouseOverSuspended_ = 0;
    OS_Window* modal_ = nullptr;
    std::shared_ptr<InputCapture> inputCapture_;
    UI_Node* pointerCapture_ = nullptr;
    unsigned long lastTimerID_ = 1000;
    UI_Node* focus_ = nullptr;
    int grouping_ = 0;
    UI_Node* focusAtGroupStart_ = nullptr;
    int groupReason_ = 0;
    int updatingFocus_ = 0;
    UI_NodeManager* previous_ = nullptr;
    std::unique_ptr<utility::ResourceManager> resources_;
    std::map<std::string, canvasor::FileImageP> images_;
};

// The platform's node manager; a library makes it concrete with a public constructor.
class OS_NodeManager : public UI_NodeManager {
protected:
    OS_NodeManager() = default;
};

} // namespace orvui::ui
