// Buttons, check boxes, text, images, text entry, sliders and list boxes.
#include "host/ui/controls/Controls.h"

#include "host/core/TextConversion.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"

#include <algorithm>

namespace orvui::controls {

using canvasor::Canvasor;
using canvasor::ColorRGBA;
using orvcore::utility::UTF16to8;

namespace {

ColorRGBA Ink(bool enabled) {
    ColorRGBA c = ui::GetColor(ui::color::ControlText);
    if (!enabled) {
        c.a = 0.4f;
    }
    return c;
}

// A label without its shortcut marks ("&Yes" shows as "Yes"; "&&" is a literal ampersand).
std::string ShownLabel(std::u16string const& label) {
    std::u16string shown;
    for (std::size_t i = 0; i < label.size(); ++i) {
        if (label[i] == u'&' && i + 1 < label.size()) {
            ++i;
        }
        shown.push_back(label[i]);
    }
    return UTF16to8(shown);
}

bool Inside(ui::UI_Node const& node, ui::MouseEvent const& event) {
    return node.UI_HitTest(event.GetLocalPoint());
}

} // namespace

// --- Button ---

void UI_Button::SetLabel(std::u16string label) {
    label_ = std::move(label);
    UI_Invalidate();
}

void UI_Button::Click() {
    if (IsEnabled() && click_) {
        boost::intrusive_ptr<ui::UI_Node> keep(IsReferenced() ? this : nullptr);
        click_();
    }
}

bool UI_Button::UI_DoMouseEvent(ui::UI_Node*, ui::MouseEvent& event) {
    if (!IsEnabled()) {
        return false;
    }
    TakeFocusOnPress(event);
    if (event.IsAction(ui::action::Press)) {
        pressed_ = true;
        UI_Invalidate();
        return true;
    }
    if (event.IsAction(ui::action::Release) && pressed_) {
        pressed_ = false;
        UI_Invalidate();
        if (Inside(*this, event)) {
            Click();
        }
        return true;
    }
    return false;
}

bool UI_Button::UI_DoKeyboardEvent(ui::KeyboardEvent& event) {
    if (event.IsKeyDown() && (event.GetKeyCode() == ui::key::Enter || event.GetKeyCode() == ' ')) {
        Click();
        return true;
    }
    return false;
}

void UI_Button::UI_Draw(Canvasor& c) {
    RectF r = UI_GetLocalBounds();
    c.FillRect(r, ui::GetColor(pressed_ ? ui::color::ControlHighlight : ui::color::ControlBackground));
    c.StrokeRect(
        r, canvasor::Pen{default_ || UI_HasKeyboardFocus(false) ? 2.0f : 1.0f,
                         ui::GetColor(default_ ? ui::color::ControlHighlight : ui::color::WindowBorder)});
    std::string text = ShownLabel(label_);
    canvasor::TextMetrics m = c.MeasureText(text, canvasor::Font());
    c.DrawText(text, PointF((r.width - m.width) / 2, (r.height - m.height) / 2), canvasor::Font(),
               Ink(IsEnabled()));
}

unsigned long UI_PictureButton::GetState() const {
    unsigned long state = 0;
    if (IsPressed()) {
        state |= 1UL << 2;
    }
    if (!IsEnabled()) {
        state |= 1UL << 4;
    }
    return state;
}

void UI_PictureButton::UI_Draw(Canvasor& c) {
    canvasor::Image picture = supply_ ? supply_(GetState()) : canvasor::Image();
    if (picture.IsEmpty()) {
        UI_Button::UI_Draw(c);
        return;
    }
    RectF r = UI_GetLocalBounds();
    c.DrawImage(picture,
                RectF((r.width - float(picture.Width())) / 2, (r.height - float(picture.Height())) / 2,
                      float(picture.Width()), float(picture.Height())));
}

// --- Check box ---

void UI_Checkbox::SetChecked(bool checked) {
    if (checked != checked_) {
        checked_ = checked;
        UI_Invalidate();
    }
}

void UI_Checkbox::Toggle() {
    SetChecked(!checked_);
    SendChanged(checked_ ? 1 : 0);
}

bool UI_Checkbox::UI_DoMouseEvent(ui::UI_Node*, ui::MouseEvent& event) {
    if (!IsEnabled()) {
        return false;
    }
    TakeFocusOnPress(event);
    if (event.IsAction(ui::action::Release) && Inside(*this, event)) {
        Toggle();
        return true;
    }
    return event.IsAction(ui::action::Press);
}

bool UI_Checkbox::UI_DoKeyboardEvent(ui::KeyboardEvent& event) {
    if (event.IsKeyDown() && event.GetKeyCode() == ' ') {
        Toggle();
        return true;
    }
    return false;
}

void UI_Checkbox::UI_Draw(Canvasor& c) {
    RectF r = UI_GetLocalBounds();
    RectF box(1, (r.height - 12) / 2, 12, 12);
    c.FillRect(box, ui::GetColor(ui::color::ControlBackground));
    c.StrokeRect(box, canvasor::Pen{1, Ink(IsEnabled())});
    if (checked_) {
        c.NewPath();
        c.MoveTo(PointF(box.left + 2.5f, box.top + 6));
        c.LineTo(PointF(box.left + 5, box.top + 9));
        c.LineTo(PointF(box.left + 10, box.top + 3));
        c.Stroke(canvasor::Pen{1.5f, Ink(IsEnabled())});
    }
    c.DrawText(ShownLabel(label_), PointF(18, (r.height - 13) / 2), canvasor::Font(), Ink(IsEnabled()));
}

// --- Static text, images, dividers ---

void UI_StaticText::SetText(std::u16string text) {
    text_ = std::move(text);
    UI_Invalidate();
}

void UI_StaticText::UI_Draw(Canvasor& c) {
    c.DrawText(UTF16to8(text_), PointF(0, 2), canvasor::Font(), Ink(IsEnabled()));
}

void UI_StaticImage::SetImage(canvasor::Image image) {
    image_ = std::move(image);
    UI_Invalidate();
}

void UI_StaticImage::UI_Draw(Canvasor& c) {
    if (!image_.IsEmpty()) {
        c.DrawImage(image_, RectF(0, 0, float(image_.Width()), float(image_.Height())));
    }
}

void UI_Divider::UI_Draw(Canvasor& c) {
    RectF r = UI_GetLocalBounds();
    c.FillRect(r.width >= r.height ? RectF(0, r.height / 2, r.width, 1) : RectF(r.width / 2, 0, 1, r.height),
               ui::GetColor(ui::color::WindowBorder));
}

// --- Text entry ---

void UI_TextEdit::SetText(std::u16string text) {
    if (maxLength_ && text.size() > maxLength_) {
        text.resize(maxLength_);
    }
    text_ = std::move(text);
    allSelected_ = false;
    UI_Invalidate();
}

bool UI_TextEdit::UI_DoMouseEvent(ui::UI_Node*, ui::MouseEvent& event) {
    if (!IsEnabled()) {
        return false;
    }
    TakeFocusOnPress(event);
    if (event.IsAction(ui::action::DoubleClickPress)) {
        SelectAll();
        UI_Invalidate();
    }
    return event.IsAction(ui::action::Press) || event.IsAction(ui::action::DoubleClickPress);
}

bool UI_TextEdit::UI_DoKeyboardEvent(ui::KeyboardEvent& event) {
    if (!event.IsKeyDown() || !IsEnabled()) {
        return false;
    }
    unsigned key = event.GetKeyCode();
    if (key == ui::key::Enter) {
        if (commit_) {
            commit_(text_);
        }
        return true;
    }
    if (key == 'A' && (event.GetModifiers() & ui::modifier::Control)) {
        SelectAll();
        UI_Invalidate();
        return true;
    }
    if (key == 8) { // Backspace
        if (allSelected_) {
            text_.clear();
        } else if (!text_.empty()) {
            text_.pop_back();
        }
        allSelected_ = false;
        UI_Invalidate();
        TextChanged();
        return true;
    }
    char32_t ch = event.GetCharacter();
    if (ch >= 0x20 && ch != 0x7F) {
        if (allSelected_) {
            text_.clear();
            allSelected_ = false;
        }
        std::u16string typed = orvcore::utility::UTF8to16([&] {
            std::string utf8;
            orvcore::utility::AppendUTF8(utf8, ch);
            return utf8;
        }());
        if (!maxLength_ || text_.size() + typed.size() <= maxLength_) {
            text_ += typed;
        }
        UI_Invalidate();
        TextChanged();
        return true;
    }
    return false;
}

void UI_TextEdit::UI_Draw(Canvasor& c) {
    RectF r = UI_GetLocalBounds();
    c.FillRect(r, ui::GetColor(ui::color::WindowBackground));
    c.StrokeRect(r, canvasor::Pen{1, ui::GetColor(UI_HasKeyboardFocus(false) ? ui::color::ControlHighlight
                                                                             : ui::color::WindowBorder)});
    std::string text = UTF16to8(text_);
    canvasor::TextMetrics m = c.MeasureText(text, canvasor::Font());
    if (allSelected_) {
        c.FillRect(RectF(3, 3, m.width + 2, r.height - 6), ui::GetColor(ui::color::ControlHighlight));
    }
    c.DrawText(text, PointF(4, (r.height - m.height) / 2), canvasor::Font(), Ink(IsEnabled()));
    if (UI_HasKeyboardFocus(false) && !allSelected_) {
        c.FillRect(RectF(5 + m.width, 4, 1, r.height - 8), Ink(true));
    }
}

void UI_SearchBox::TextChanged() {
    if (search_) {
        search_(GetText());
    }
}

void UI_SearchBox::UI_Draw(Canvasor& c) {
    UI_TextEdit::UI_Draw(c);
    RectF r = UI_GetLocalBounds();
    // A small magnifier at the right end.
    c.StrokeRect(RectF(r.width - 15, r.height / 2 - 5, 7, 7), canvasor::Pen{1, Ink(IsEnabled())});
    c.NewPath();
    c.MoveTo(PointF(r.width - 8, r.height / 2 + 2));
    c.LineTo(PointF(r.width - 4, r.height / 2 + 6));
    c.Stroke(canvasor::Pen{1.5f, Ink(IsEnabled())});
}

// --- Slider ---

void UI_Slider::SetRange(float minimum, float maximum) {
    minimum_ = std::min(minimum, maximum);
    maximum_ = std::max(minimum, maximum);
    SetValue(value_);
}

void UI_Slider::SetValue(float value) {
    value = std::clamp(value, minimum_, maximum_);
    if (value != value_) {
        value_ = value;
        UI_Invalidate();
    }
}

void UI_Slider::SetFromPoint(float x) {
    float width = std::max(1.0f, UI_GetRect().width - 8);
    float before = value_;
    SetValue(minimum_ + (maximum_ - minimum_) * std::clamp((x - 4) / width, 0.0f, 1.0f));
    if (value_ != before) {
        SendChanged(long(value_));
    }
}

bool UI_Slider::UI_DoMouseEvent(ui::UI_Node*, ui::MouseEvent& event) {
    if (!IsEnabled()) {
        return false;
    }
    TakeFocusOnPress(event);
    if (event.IsAction(ui::action::Press)) {
        dragging_ = true;
        SetFromPoint(event.GetLocalPoint().x);
        return true;
    }
    if (event.IsAction(ui::action::Move) && dragging_) {
        SetFromPoint(event.GetLocalPoint().x);
        return true;
    }
    if (event.IsAction(ui::action::Release) && dragging_) {
        dragging_ = false;
        return true;
    }
    return false;
}

void UI_Slider::UI_Draw(Canvasor& c) {
    RectF r = UI_GetLocalBounds();
    c.FillRect(RectF(4, r.height / 2 - 1, r.width - 8, 2), ui::GetColor(ui::color::WindowBorder));
    float span = maximum_ > minimum_ ? (value_ - minimum_) / (maximum_ - minimum_) : 0;
    float x = 4 + span * (r.width - 8);
    c.FillRect(RectF(x - 4, r.height / 2 - 6, 8, 12), ui::GetColor(ui::color::ControlHighlight));
}

// --- List box ---

void UI_ListBox::SetItems(std::vector<UI_ListBoxItem> items) {
    items_ = std::move(items);
    selection_ = items_.empty() ? -1 : std::min<long>(selection_, long(items_.size()) - 1);
    UI_Invalidate();
}

void UI_ListBox::SetSelection(long index) {
    index = index >= 0 && index < long(items_.size()) ? index : -1;
    if (index != selection_) {
        selection_ = index;
        UI_Invalidate();
        SendChanged(index);
    }
}

UI_ListBoxItem const* UI_ListBox::GetSelectedItem() const {
    return selection_ >= 0 ? &items_[std::size_t(selection_)] : nullptr;
}

RectT UI_ListBox::GetRowGlobalRect(long index) const {
    if (index < 0 || index >= long(items_.size())) {
        return RectT();
    }
    return UI_LocalToGlobal(RectT(0, int(index) * RowHeight, int(UI_GetRect().width), RowHeight));
}

bool UI_ListBox::UI_DoMouseEvent(ui::UI_Node*, ui::MouseEvent& event) {
    if (!IsEnabled()) {
        return false;
    }
    TakeFocusOnPress(event);
    long row = long(event.GetLocalPoint().y) / RowHeight;
    bool onRow = event.GetLocalPoint().y >= 0 && row < long(items_.size());
    if (event.IsAction(ui::action::Press) && onRow) {
        SetSelection(row);
        return true;
    }
    if (event.IsAction(ui::action::DoubleClickPress) && onRow) {
        SetSelection(row);
        if (activate_) {
            activate_(row);
        }
        return true;
    }
    return false;
}

bool UI_ListBox::UI_DoKeyboardEvent(ui::KeyboardEvent& event) {
    if (!event.IsKeyDown() || items_.empty()) {
        return false;
    }
    switch (event.GetKeyCode()) {
    case ui::key::Down:
        SetSelection(std::min<long>(selection_ + 1, long(items_.size()) - 1));
        return true;
    case ui::key::Up:
        SetSelection(std::max<long>(selection_ - 1, 0));
        return true;
    case ui::key::Enter:
        if (selection_ >= 0 && activate_) {
            activate_(selection_);
            return true;
        }
        return false;
    default:
        return false;
    }
}

void UI_ListBox::UI_Draw(Canvasor& c) {
    RectF r = UI_GetLocalBounds();
    c.FillRect(r, ui::GetColor(ui::color::WindowBackground));
    for (std::size_t i = 0; i < items_.size(); ++i) {
        float top = float(i) * RowHeight;
        if (top > r.height) {
            break;
        }
        if (long(i) == selection_) {
            c.FillRect(RectF(0, top, r.width, float(RowHeight)), ui::GetColor(ui::color::ControlHighlight));
        }
        c.DrawText(UTF16to8(items_[i].text), PointF(4, top + 2), canvasor::Font(), Ink(IsEnabled()));
    }
    c.StrokeRect(r, canvasor::Pen{1, ui::GetColor(ui::color::WindowBorder)});
}

} // namespace orvui::controls
