// Modal dialogs as real toolkit windows: a message box whose area above its buttons can hold a
// caller's control, the simple input and confirmation boxes and the note built on it, and a
// file-open dialog listing a folder's files by extension. They run through the modal loop, so a
// headless run answers them with a ModalDriver and, without one, they are cancelled at once.
//
// Buttons are numbered 1 (OK) and 2048 (Cancel); a set of buttons is their sum (2049: both). A box
// answers the number of the button that ended it; Enter presses the default button, Escape and
// closing answer Cancel when there is one. Node IDs: "Message", "OK", "Cancel", "Text" (the input
// box's edit), "Files" (the file list).
#pragma once

#include "host/ui/Modal.h"
#include "host/ui/UI_Container.h"

#include <string>
#include <vector>

namespace canvasor {
class SupplierInterface;
}

namespace orvui::controls {
class UI_Button;
class UI_ListBox;
class UI_TextEdit;
} // namespace orvui::controls

namespace orvui::ui {

inline constexpr unsigned ButtonOK = 1;
inline constexpr unsigned ButtonCancel = 2048;

class UI_MessageBox : public UI_ModalWindow {
public:
    static constexpr int kRowSpacingAboveAndBelow = 8;
    static constexpr int Width = 380;

    UI_MessageBox(canvasor::SupplierInterface* supplier, std::u16string const& title,
                  std::u16string const& message, unsigned buttons, unsigned defaultButton, int icon,
                  OS_Window* parent, std::u16string const& okLabel = {},
                  std::u16string const& cancelLabel = {});

    // Where a caller puts its own control (a popup, say), above the buttons; laid out at RunModal.
    UI_SubView* GetPreButtonLayoutDecorator() const { return decorator_.get(); }
    controls::UI_Button* GetButton(unsigned button) const;
    // Lays the box out, runs it and answers the button that ended it.
    int Run();

    // Places the message, the caller's controls and the buttons, and sizes the box to them.
    void Arrange();

    bool UI_DoKeyboardEvent(KeyboardEvent& event) override;

private:
    boost::intrusive_ptr<UI_SubView> decorator_;
    boost::intrusive_ptr<controls::UI_Button> ok_;
    boost::intrusive_ptr<controls::UI_Button> cancel_;
    unsigned defaultButton_;
};

// Asks for a line of text; text holds the proposal and receives the answer. True when confirmed.
bool SimpleInputBox(canvasor::SupplierInterface* supplier, std::u16string const& title,
                    std::u16string const& label, std::u16string& text, bool selectAll, OS_Window* parent,
                    bool multiline = false, int width = 0, int maxLength = 0, unsigned okButton = ButtonOK,
                    unsigned cancelButton = ButtonCancel);

// Asks a yes-or-no question; true when confirmed. Custom labels replace OK and Cancel.
bool SimpleConfirmationBox(canvasor::SupplierInterface* supplier, std::u16string const& title,
                           std::u16string const& question, OS_Window* parent,
                           std::u16string const& okLabel = {}, std::u16string const& cancelLabel = {});

namespace messagebox {
// Shows a note with an OK button.
void ShowNote(canvasor::SupplierInterface* supplier, std::u16string const& title, std::u16string const& text,
              OS_Window* parent);
} // namespace messagebox

// Chooses a file of a folder, filtered by extension.
class OS_FileOpenDialog : public UI_ModalWindow {
public:
    OS_FileOpenDialog(OS_Window* parent, std::u16string const& title);

    // Offers files with this extension (without the dot, compared ignoring case); no filter shows all.
    void AddFilter(std::u16string const& description, std::u16string const& extension);
    void SetFolder(std::u16string const& folder);
    std::u16string const& GetFolder() const { return folder_; }
    // Lists the folder, runs the dialog; true when a file was chosen.
    bool RunModal();
    // The chosen file's full path; empty when none.
    std::u16string const& GetFullPath() const { return chosen_; }
    controls::UI_ListBox* GetFileList() const { return list_.get(); }

    bool UI_DoKeyboardEvent(KeyboardEvent& event) override;

private:
    void Fill();
    void Accept();

    std::u16string folder_;
    std::vector<std::pair<std::u16string, std::u16string>> filters_;
    std::u16string chosen_;
    boost::intrusive_ptr<controls::UI_ListBox> list_;
    boost::intrusive_ptr<controls::UI_Button> ok_;
    boost::intrusive_ptr<controls::UI_Button> cancel_;
};

} // namespace orvui::ui
