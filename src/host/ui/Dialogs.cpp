// Message boxes, input and confirmation boxes, notes and the file-open dialog.
#include "host/ui/Dialogs.h"

#include "host/core/Dir.h"
#include "host/core/FileUtils.h"
#include "host/core/Localizer.h"
#include "host/ui/Desktop.h"
#include "host/ui/MonitorInfo.h"
#include "host/ui/controls/Controls.h"

#include <algorithm>

namespace orvui::ui {

using controls::UI_Button;

namespace {

constexpr int ButtonWidth = 84;
constexpr int ButtonHeight = 24;
constexpr int Margin = 12;

NativeWindow OwnerOf(OS_Window* parent) {
    for (UI_Node* n = parent; n; n = n->UI_GetParentNode()) {
        if (OS_Window* w = n->UI_GetOSWindow(); w && w->IsTopLevel()) {
            return w->GetPlatformWindow();
        }
    }
    return 0;
}

// A dialog of a size, centred over its owner (or the primary monitor).
RectT Centred(NativeWindow owner, int width, int height) {
    RectT area;
    if (owner) {
        area = Desktop::Get().GetWindowRect(owner);
    } else {
        utility::MonitorInfo().GetMonitorRect(0, area);
    }
    return RectT(area.left + (area.width - width) / 2, area.top + (area.height - height) / 2, width, height);
}

std::u16string Localized(char const* text) {
    return orvcore::config::Localizer::Get().Localize(text);
}

boost::intrusive_ptr<UI_Button> MakeButton(UI_Node* parent, std::u16string const& label, char const* id,
                                           std::function<void()> click) {
    boost::intrusive_ptr<UI_Button> button(new UI_Button(label));
    button->UI_SetNodeID(id);
    button->SetClickFunction(std::move(click));
    parent->ChildPushBack(button);
    return button;
}

} // namespace

// --- Message box ---

UI_MessageBox::UI_MessageBox(canvasor::SupplierInterface*, std::u16string const& title,
                             std::u16string const& message, unsigned buttons, unsigned defaultButton, int,
                             OS_Window* parent, std::u16string const& okLabel,
                             std::u16string const& cancelLabel)
    : decorator_(new UI_SubView)
    , defaultButton_(defaultButton) {
    NativeWindow owner = OwnerOf(parent);
    UI_CreateWindow(title, owner, Centred(owner, Width, 140), style::Popup | style::Caption,
                    style::ToolWindow);
    UI_SetNodeID("MessageBox");
    boost::intrusive_ptr<controls::UI_StaticText> text(new controls::UI_StaticText(message));
    text->UI_SetNodeID("Message");
    ChildPushBack(text);
    decorator_->UI_SetNodeID("PreButtonArea");
    ChildPushBack(decorator_);
    if (buttons & ButtonOK) {
        ok_ = MakeButton(this, okLabel.empty() ? Localized("$$$/orvui/Dialog/OK=OK") : okLabel, "OK",
                         [this] { EndModal(int(ButtonOK)); });
    }
    if (buttons & ButtonCancel) {
        cancel_ =
            MakeButton(this, cancelLabel.empty() ? Localized("$$$/orvui/Dialog/Cancel=Cancel") : cancelLabel,
                       "Cancel", [this] { EndModal(int(ButtonCancel)); });
    }
    SetCancelResult(int(cancel_ ? ButtonCancel : ButtonOK));
    if (UI_Button* d = GetButton(defaultButton_)) {
        d->SetDefault(true);
    }
}

UI_Button* UI_MessageBox::GetButton(unsigned button) const {
    return button == ButtonOK ? ok_.get() : button == ButtonCancel ? cancel_.get() : nullptr;
}

void UI_MessageBox::Arrange() {
    int y = Margin;
    if (UI_Node* text = UI_FindNodeByID("Message")) {
        text->UI_SetRect(RectF(float(Margin), float(y), float(Width - 2 * Margin), 18));
        y += 18 + kRowSpacingAboveAndBelow;
    }
    // The caller's controls, one under the other, centred across the box.
    int areaTop = y;
    for (std::size_t i = 0; i < decorator_->ChildSize(); ++i) {
        UI_Node* child = decorator_->ChildGet(i);
        RectF r = child->UI_GetRect();
        float w = r.width > 0 ? r.width : float(Width - 2 * Margin);
        float h = r.height > 0 ? r.height : 22;
        child->UI_SetRect(RectF((float(Width - 2 * Margin) - w) / 2, float(y - areaTop), w, h));
        y += int(h) + kRowSpacingAboveAndBelow;
    }
    decorator_->UI_SetRect(
        RectF(float(Margin), float(areaTop), float(Width - 2 * Margin), float(y - areaTop)));
    y += kRowSpacingAboveAndBelow;
    int x = Width - Margin;
    for (UI_Button* button : {cancel_.get(), ok_.get()}) {
        if (button) {
            x -= ButtonWidth;
            button->UI_SetRect(RectF(float(x), float(y), float(ButtonWidth), float(ButtonHeight)));
            x -= 8;
        }
    }
    y += ButtonHeight + Margin;
    RectF client = UI_GetRect();
    UI_SetRect(RectF(client.left, client.top, float(Width), float(y)));
}

int UI_MessageBox::Run() {
    Arrange();
    return RunModal();
}

bool UI_MessageBox::UI_DoKeyboardEvent(KeyboardEvent& event) {
    if (!event.IsKeyDown()) {
        return false;
    }
    if (event.GetKeyCode() == key::Escape) {
        CancelModal();
        return true;
    }
    if (event.GetKeyCode() == key::Enter) {
        if (UI_Button* d = GetButton(defaultButton_)) {
            d->Click();
            return true;
        }
    }
    return UI_DoAdvanceKeyboardFocus(event);
}

// --- Simple boxes ---

bool SimpleInputBox(canvasor::SupplierInterface* supplier, std::u16string const& title,
                    std::u16string const& label, std::u16string& text, bool selectAll, OS_Window* parent,
                    bool, int width, int maxLength, unsigned okButton, unsigned cancelButton) {
    boost::intrusive_ptr<UI_MessageBox> box(
        new UI_MessageBox(supplier, title, label, okButton | cancelButton, okButton, 0, parent));
    boost::intrusive_ptr<controls::UI_TextEdit> edit(new controls::UI_TextEdit);
    edit->UI_SetNodeID("Text");
    if (maxLength > 0) {
        edit->SetMaxLength(std::size_t(maxLength));
    }
    edit->SetText(text);
    if (selectAll) {
        edit->SelectAll();
    }
    edit->SetCommitFunction([b = box.get(), okButton](std::u16string const&) { b->EndModal(int(okButton)); });
    edit->UI_SetRect(RectF(0, 0, float(width > 0 ? width : UI_MessageBox::Width - 24), 22));
    box->GetPreButtonLayoutDecorator()->ChildPushBack(edit);
    box->SetInitialFocus(edit.get());
    int answer = box->Run();
    if (answer != int(okButton)) {
        return false;
    }
    text = edit->GetText();
    return true;
}

bool SimpleConfirmationBox(canvasor::SupplierInterface* supplier, std::u16string const& title,
                           std::u16string const& question, OS_Window* parent, std::u16string const& okLabel,
                           std::u16string const& cancelLabel) {
    boost::intrusive_ptr<UI_MessageBox> box(new UI_MessageBox(
        supplier, title, question, ButtonOK | ButtonCancel, ButtonOK, 0, parent, okLabel, cancelLabel));
    return box->Run() == int(ButtonOK);
}

namespace messagebox {
void ShowNote(canvasor::SupplierInterface* supplier, std::u16string const& title, std::u16string const& text,
              OS_Window* parent) {
    boost::intrusive_ptr<UI_MessageBox> box(
        new UI_MessageBox(supplier, title, text, ButtonOK, ButtonOK, 0, parent));
    box->Run();
}
} // namespace messagebox

// --- File-open dialog ---

OS_FileOpenDialog::OS_FileOpenDialog(OS_Window* parent, std::u16string const& title)
    : list_(new controls::UI_ListBox) {
    NativeWindow owner = OwnerOf(parent);
    UI_CreateWindow(title, owner, Centred(owner, 420, 330), style::Popup | style::Caption, style::ToolWindow);
    UI_SetNodeID("FileOpenDialog");
    list_->UI_SetNodeID("Files");
    list_->UI_SetRect(RectF(12, 12, 408 - 24, 240));
    list_->SetActivateFunction([this](long) { Accept(); });
    ChildPushBack(list_);
    ok_ = MakeButton(this, Localized("$$$/orvui/Dialog/Open=Open"), "OK", [this] { Accept(); });
    cancel_ = MakeButton(this, Localized("$$$/orvui/Dialog/Cancel=Cancel"), "Cancel",
                         [this] { EndModal(int(ButtonCancel)); });
    ok_->UI_SetRect(RectF(408 - 12 - 2 * ButtonWidth - 8, 264, float(ButtonWidth), float(ButtonHeight)));
    cancel_->UI_SetRect(RectF(408 - 12 - ButtonWidth, 264, float(ButtonWidth), float(ButtonHeight)));
    ok_->SetDefault(true);
    SetCancelResult(int(ButtonCancel));
}

void OS_FileOpenDialog::AddFilter(std::u16string const& description, std::u16string const& extension) {
    filters_.emplace_back(description, extension);
}

void OS_FileOpenDialog::SetFolder(std::u16string const& folder) {
    folder_ = folder;
}

void OS_FileOpenDialog::Fill() {
    std::vector<std::u16string> paths;
    orvcore::utility::FileUtils::ContainedFiles(folder_, paths);
    auto lower = [](std::u16string s) {
        for (char16_t& ch : s) {
            if (ch >= u'A' && ch <= u'Z') {
                ch = char16_t(ch - u'A' + u'a');
            }
        }
        return s;
    };
    std::vector<controls::UI_ListBoxItem> items;
    for (std::u16string const& path : paths) {
        std::u16string name = orvcore::filesupport::FromPath(orvcore::filesupport::ToPath(path).filename());
        std::u16string extension =
            orvcore::filesupport::FromPath(orvcore::filesupport::ToPath(path).extension());
        bool wanted = filters_.empty() || std::any_of(filters_.begin(), filters_.end(), [&](auto const& f) {
                          return lower(u"." + f.second) == lower(extension);
                      });
        if (wanted) {
            items.emplace_back(name, path);
        }
    }
    list_->SetItems(std::move(items));
}

void OS_FileOpenDialog::Accept() {
    if (controls::UI_ListBoxItem const* item = list_->GetSelectedItem()) {
        chosen_ = item->data;
        EndModal(int(ButtonOK));
    }
}

bool OS_FileOpenDialog::RunModal() {
    chosen_.clear();
    Fill();
    int answer = UI_ModalWindow::RunModal();
    if (answer != int(ButtonOK)) {
        chosen_.clear();
        return false;
    }
    return !chosen_.empty();
}

bool OS_FileOpenDialog::UI_DoKeyboardEvent(KeyboardEvent& event) {
    if (event.IsKeyDown() && event.GetKeyCode() == key::Escape) {
        CancelModal();
        return true;
    }
    return UI_DoAdvanceKeyboardFocus(event);
}

} // namespace orvui::ui
