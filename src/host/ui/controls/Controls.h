// The toolkit's small controls: push buttons (with a picture supplied per state), check boxes, static
// text and images, single-line text entry and its search variant, sliders, dividers and list boxes.
// Each is drawn in theme colours and operated through the desktop's input.
#pragma once

#include "host/ui/canvasor/Image.h"
#include "host/ui/controls/ControlView.h"

#include <string>
#include <vector>

namespace orvui::controls {

// A push button: a press and release inside it (or Enter or space while it has focus) clicks it.
class UI_Button : public UI_InteractiveControlView {
public:
    explicit UI_Button(std::u16string label = {})
        : label_(std::move(label)) {}
    void SetLabel(std::u16string label);
    // The label as shown: '&' marks the next letter as the shortcut and is not drawn.
    std::u16string const& GetLabel() const { return label_; }
    void SetClickFunction(std::function<void()> f) { click_ = std::move(f); }
    void SetDefault(bool isDefault) { default_ = isDefault; }
    bool IsDefault() const { return default_; }
    void Click();

    bool UI_DoMouseEvent(ui::UI_Node* target, ui::MouseEvent& event) override;
    bool UI_DoKeyboardEvent(ui::KeyboardEvent& event) override;
    void UI_Draw(canvasor::Canvasor& c) override;

protected:
    bool IsPressed() const { return pressed_; }

private:
    std::u16string label_;
    std::function<void()> click_;
    bool default_ = false;
    bool pressed_ = false;
};

// A button whose picture for each state (bit 2 pressed, bit 4 disabled) comes from a supply function.
class UI_PictureButton : public UI_Button {
public:
    using PictureSupply = std::function<canvasor::Image(unsigned long state)>;
    void SetPictureSupply(PictureSupply supply) { supply_ = std::move(supply); }
    unsigned long GetState() const;
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    PictureSupply supply_;
};

class UI_Checkbox : public UI_InteractiveControlView {
public:
    explicit UI_Checkbox(std::u16string label = {})
        : label_(std::move(label)) {}
    bool IsChecked() const { return checked_; }
    void SetChecked(bool checked);
    bool UI_DoMouseEvent(ui::UI_Node* target, ui::MouseEvent& event) override;
    bool UI_DoKeyboardEvent(ui::KeyboardEvent& event) override;
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    void Toggle();
    std::u16string label_;
    bool checked_ = false;
};

class UI_StaticText : public UI_ControlView {
public:
    explicit UI_StaticText(std::u16string text = {})
        : text_(std::move(text)) {}
    void SetText(std::u16string text);
    std::u16string const& GetText() const { return text_; }
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    std::u16string text_;
};

class UI_StaticImage : public UI_ControlView {
public:
    void SetImage(canvasor::Image image);
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    canvasor::Image image_;
};

// A thin line between groups of controls.
class UI_Divider : public UI_ControlView {
public:
    void UI_Draw(canvasor::Canvasor& c) override;
};

// Single-line text entry: typing inserts at the end (replacing everything while all is selected),
// Backspace deletes, Control+A selects all, Enter commits.
class UI_TextEdit : public UI_InteractiveControlView {
public:
    void SetText(std::u16string text);
    std::u16string const& GetText() const { return text_; }
    void SelectAll() { allSelected_ = !text_.empty(); }
    bool IsAllSelected() const { return allSelected_; }
    void SetMaxLength(std::size_t maxLength) { maxLength_ = maxLength; }
    // Told with the text when Enter is pressed.
    void SetCommitFunction(std::function<void(std::u16string const&)> f) { commit_ = std::move(f); }

    bool UI_DoMouseEvent(ui::UI_Node* target, ui::MouseEvent& event) override;
    bool UI_DoKeyboardEvent(ui::KeyboardEvent& event) override;
    void UI_Draw(canvasor::Canvasor& c) override;

protected:
    virtual void TextChanged() {}

private:
    std::u16string text_;
    bool allSelected_ = false;
    std::size_t maxLength_ = 0;
    std::function<void(std::u16string const&)> commit_;
};

// A text edit whose every change is reported at once (for filtering lists as one types).
class UI_SearchBox : public UI_TextEdit {
public:
    void SetSearchFunction(std::function<void(std::u16string const&)> f) { search_ = std::move(f); }
    void UI_Draw(canvasor::Canvasor& c) override;

protected:
    void TextChanged() override;

private:
    std::function<void(std::u16string const&)> search_;
};

// A value between a minimum and a maximum, set by pressing or dragging along the track.
class UI_Slider : public UI_InteractiveControlView {
public:
    void SetRange(float minimum, float maximum);
    void SetValue(float value);
    float GetValue() const { return value_; }
    bool UI_DoMouseEvent(ui::UI_Node* target, ui::MouseEvent& event) override;
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    void SetFromPoint(float x);
    float minimum_ = 0, maximum_ = 1, value_ = 0;
    bool dragging_ = false;
};

// One row of a list box.
class UI_ListBoxItem {
public:
    explicit UI_ListBoxItem(std::u16string shown = {}, std::u16string standsFor = {})
        : text(std::move(shown))
        , data(std::move(standsFor)) {}
    std::u16string text;
    // What the row stands for (a full path, say); the text is what is shown.
    std::u16string data;
};

// Rows of text, one selected; a click selects, a double click (or Enter) activates.
class UI_ListBox : public UI_InteractiveControlView {
public:
    static constexpr int RowHeight = 18;

    void SetItems(std::vector<UI_ListBoxItem> items);
    std::vector<UI_ListBoxItem> const& GetItems() const { return items_; }
    void SetSelection(long index);
    long GetSelection() const { return selection_; }
    UI_ListBoxItem const* GetSelectedItem() const;
    RectT GetRowGlobalRect(long index) const;
    void SetActivateFunction(std::function<void(long)> f) { activate_ = std::move(f); }

    bool UI_DoMouseEvent(ui::UI_Node* target, ui::MouseEvent& event) override;
    bool UI_DoKeyboardEvent(ui::KeyboardEvent& event) override;
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    std::vector<UI_ListBoxItem> items_;
    long selection_ = -1;
    std::function<void(long)> activate_;
};

} // namespace orvui::controls
