// Windows and nodes that record what the toolkit tells them, for the toolkit's own tests.
#pragma once

#include "host/ui/Desktop.h"
#include "host/ui/Modal.h"
#include "host/ui/NodeManager.h"
#include "host/ui/OS_Window.h"

#include <functional>
#include <gtest/gtest.h>
#include <memory>
#include <string>
#include <vector>

namespace orvtest {

using namespace orvui::ui;

// A top-level or child window that logs its messages and activation changes.
class RecordingWindow : public OS_Window {
public:
    void UI_HandleOSEvent(OS_Event& event) override {
        messages.push_back(event);
        OS_Window::UI_HandleOSEvent(event);
    }
    void UI_ActivationChanged(bool active) override { activations.push_back(active); }
    void UI_SizeChanged() override { ++sizeChanges; }
    std::vector<unsigned> Messages(unsigned only = 0) const {
        std::vector<unsigned> out;
        for (OS_Event const& e : messages) {
            if (!only || e.message == only) {
                out.push_back(e.message);
            }
        }
        return out;
    }

    std::vector<OS_Event> messages;
    std::vector<bool> activations;
    int sizeChanges = 0;
};

// A node that logs mouse events (as "name:action@x,y"), may consume them, sets a cursor, wants
// focus and counts focus changes and timers.
class RecordingNode : public UI_Node {
public:
    RecordingNode(std::string n, std::vector<std::string>* sharedLog)
        : name(std::move(n))
        , log(sharedLog) {}

    bool UI_DoMouseEvent(UI_Node* target, MouseEvent& event) override {
        PointF p = event.GetLocalPoint();
        log->push_back(name + ":" + std::to_string(event.GetAction()) + "@" + std::to_string(int(p.x)) + "," +
                       std::to_string(int(p.y)) + (target == this ? "" : " via"));
        return consumes;
    }
    bool UI_DoKeyboardEvent(KeyboardEvent& event) override {
        log->push_back(name + ":key" + std::to_string(event.GetKeyCode()));
        return consumesKeys;
    }
    bool UI_DoCursor(PointF) override {
        if (cursorToSet < 0) {
            return false;
        }
        Desktop::Get().SetCursor(cursorToSet);
        return true;
    }
    void UI_FocusChanged(int reason) override {
        log->push_back(name + ":focus" + std::to_string(reason) + (UI_HasKeyboardFocus(true) ? "+" : "-"));
    }
    bool UI_WantsKeyboardFocus() const override { return true; }
    void UI_DoTimerNotify(unsigned long id) override {
        log->push_back(name + ":timer" + std::to_string(id) + "@" + std::to_string(Desktop::Get().Now()));
    }

    std::string name;
    std::vector<std::string>* log;
    bool consumes = false;
    bool consumesKeys = false;
    int cursorToSet = -1;
};

// A modal driver that runs one step per turn of the loop; later turns do nothing.
template <typename Modal = UI_ModalWindow> ModalDriver Steps(std::vector<std::function<void(Modal&)>> steps) {
    auto shared = std::make_shared<std::vector<std::function<void(Modal&)>>>(std::move(steps));
    auto turn = std::make_shared<std::size_t>(0);
    return [shared, turn](UI_ModalWindow& modal) {
        if (*turn < shared->size()) {
            (*shared)[(*turn)++](dynamic_cast<Modal&>(modal));
        }
    };
}

// A shown top-level window with a caption and a sizing frame.
inline boost::intrusive_ptr<RecordingWindow> MakeCaptionWindow(std::u16string const& title, RectT rect) {
    boost::intrusive_ptr<RecordingWindow> w(new RecordingWindow);
    w->UI_CreateWindow(title, 0, rect, style::Popup | style::Caption | style::SizingFrame | style::Visible,
                       0);
    return w;
}

// Gives every toolkit test a fresh desktop.
class DesktopTest : public ::testing::Test {
protected:
    void SetUp() override { Desktop::Reset(); }
    void TearDown() override { Desktop::Reset(); }

    // A shown top-level window with a caption and sizing frame at a structure rectangle.
    boost::intrusive_ptr<RecordingWindow> MakeWindow(RectT rect, std::uint32_t extra = 0,
                                                     NativeWindow owner = 0) {
        boost::intrusive_ptr<RecordingWindow> w(new RecordingWindow);
        w->UI_CreateWindow(u"test", owner, rect, style::Popup | style::Caption | style::SizingFrame | extra,
                           0);
        w->UI_Show(true);
        return w;
    }
    Desktop& desktop() { return Desktop::Get(); }
};

} // namespace orvtest
