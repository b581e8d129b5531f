// Controls and dialogs operated through the desktop's input; modal dialogs answered by drivers that
// click and type, and cancelled when nobody answers.
#include "UiDoubles.h"

#include "host/ui/Dialogs.h"
#include "host/ui/Menu.h"
#include "host/ui/canvasor/Canvasor.h"
#include "host/ui/controls/Controls.h"
#include "host/ui/controls/Popup.h"
#include "support/SnapshotOnFailure.h"
#include "support/TempDir.h"

using namespace orvtest;
using namespace orvui::controls;
using orvui::ui::ModalDriver;
using orvui::ui::ScopedModalDriver;
using orvui::ui::UI_ModalWindow;

namespace {

canvasor::ColorRGBA ColorRGBAOf(float r, float g, float b) {
    return canvasor::ColorRGBA(r, g, b, 1);
}

void ClickAt(PointT p, int clicks = 1) {
    Desktop::Get().MouseMove(p);
    Desktop::Get().MouseDown(p, 0, clicks);
    Desktop::Get().MouseUp(p);
}

void ClickNode(UI_Node* node, int clicks = 1) {
    RectT r = node->UI_GetGlobalRect();
    ClickAt(PointT(r.left + r.width / 2, r.top + r.height / 2), clicks);
}

void Type(std::u16string const& text) {
    for (char16_t ch : text) {
        unsigned code = (ch >= u'a' && ch <= u'z') ? unsigned(ch - u'a' + u'A') : unsigned(ch);
        Desktop::Get().KeyDown(code, ch);
    }
}

ModalDriver Steps(std::vector<std::function<void(UI_ModalWindow&)>> steps) {
    return orvtest::Steps<UI_ModalWindow>(std::move(steps));
}

class ControlsTest : public DesktopScenario {
protected:
    void SetUp() override {
        DesktopScenario::SetUp();
        window = MakeCaptionWindow(u"controls", RectT(100, 100, 506, 428));
    }
    void CloseWindows() override {
        window->DeleteChildren();
        window.reset();
    }
    template <typename T> boost::intrusive_ptr<T> Add(T* control, RectF rect) {
        boost::intrusive_ptr<T> p(control);
        window->ChildPushBack(p);
        p->UI_SetRect(rect);
        return p;
    }
    boost::intrusive_ptr<RecordingWindow> window;
};

} // namespace

TEST_F(ControlsTest, ButtonsClickOnReleaseInsideAndOnEnter) {
    int clicks = 0;
    auto button = Add(new UI_Button(u"&Apply"), RectF(10, 10, 80, 24));
    button->SetClickFunction([&] { ++clicks; });
    ClickNode(button.get());
    EXPECT_EQ(clicks, 1);
    EXPECT_TRUE(button->UI_HasKeyboardFocus(false));
    Desktop::Get().MouseDown(button->UI_LocalToGlobal(PointT(5, 5)));
    Desktop::Get().MouseUp(button->UI_LocalToGlobal(PointT(200, 200))); // released elsewhere
    EXPECT_EQ(clicks, 1);
    Desktop::Get().KeyDown(key::Enter);
    EXPECT_EQ(clicks, 2);
    button->SetEnabled(false);
    ClickNode(button.get());
    EXPECT_EQ(clicks, 2);
}

TEST_F(ControlsTest, TextEditTypesSelectsAllAndCommits) {
    auto edit = Add(new UI_TextEdit, RectF(10, 40, 200, 22));
    std::u16string committed;
    edit->SetCommitFunction([&](std::u16string const& t) { committed = t; });
    ClickNode(edit.get());
    Type(u"Colour Grade");
    EXPECT_EQ(edit->GetText(), u"Colour Grade");
    Desktop::Get().KeyDown(8);
    EXPECT_EQ(edit->GetText(), u"Colour Grad");
    Desktop::Get().SetModifiers(modifier::Control);
    Desktop::Get().KeyDown('A');
    Desktop::Get().SetModifiers(0);
    EXPECT_TRUE(edit->IsAllSelected());
    Type(u"Edit");
    EXPECT_EQ(edit->GetText(), u"Edit");
    Desktop::Get().KeyDown(key::Enter);
    EXPECT_EQ(committed, u"Edit");
    edit->SetMaxLength(5);
    Type(u"ing");
    EXPECT_EQ(edit->GetText(), u"Editi"); // typing stops at the limit
}

TEST_F(ControlsTest, CheckboxesListsSlidersAndSearch) {
    auto check = Add(new UI_Checkbox(u"Snap"), RectF(10, 70, 100, 20));
    std::vector<long> changes;
    check->NotifyWhenChanged([&](UI_ControlChangedMessage* m) { changes.push_back(m->value); });
    ClickNode(check.get());
    ClickNode(check.get());
    EXPECT_EQ(changes, (std::vector<long>{1, 0}));

    auto list = Add(new UI_ListBox, RectF(10, 100, 200, 100));
    list->SetItems({UI_ListBoxItem(u"one"), UI_ListBoxItem(u"two"), UI_ListBoxItem(u"three")});
    long activated = -1;
    list->SetActivateFunction([&](long i) { activated = i; });
    RectT row = list->GetRowGlobalRect(1);
    ClickAt(PointT(row.left + 5, row.top + 5));
    EXPECT_EQ(list->GetSelection(), 1);
    Desktop::Get().KeyDown(key::Down);
    EXPECT_EQ(list->GetSelection(), 2);
    ClickAt(PointT(row.left + 5, row.top + 5), 2);
    EXPECT_EQ(activated, 1);

    auto slider = Add(new UI_Slider, RectF(10, 210, 108, 20));
    slider->SetRange(0, 100);
    ClickAt(slider->UI_LocalToGlobal(PointT(54, 10)));
    EXPECT_NEAR(slider->GetValue(), 50, 1);

    auto search = Add(new UI_SearchBox, RectF(10, 240, 150, 22));
    std::vector<std::u16string> searched;
    search->SetSearchFunction([&](std::u16string const& t) { searched.push_back(t); });
    ClickNode(search.get());
    Type(u"ab");
    EXPECT_EQ(searched, (std::vector<std::u16string>{u"a", u"ab"}));
}

TEST_F(ControlsTest, PopupChoiceByClickSendsTheChangeAndSetsTheValue) {
    auto popup = Add(new UI_Popup, RectF(10, 10, 200, 22));
    popup->SetItemCheckStyle(true);
    popup->SetItems({PopupItem(u"Editing"), PopupItem(u"Colo\u2026ading", u"Colour Grading"), PopupItem(u""),
                     PopupItem(u"New Workspace...")});
    popup->CheckItem(0, true);
    popup->SetValue(0);
    popup->DisableItem(3, true);
    EXPECT_EQ(popup->FindStringExact(u"Colo\u2026ading"), 1);
    EXPECT_EQ(popup->FindStringExact(u"Colour Grading"), -1); // the shown text is what is searched
    std::vector<long> changes;
    popup->NotifyWhenChanged([&](UI_ControlChangedMessage* m) { changes.push_back(m->value); });
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow& m) {
            auto& menu = dynamic_cast<orvui::utility::MenuWindow&>(m);
            EXPECT_TRUE(menu.GetMenu().GetItem(0).checked);
            EXPECT_TRUE(menu.GetMenu().GetItem(2).separator);
            RectT r = menu.GetItemGlobalRect(1);
            ClickAt(PointT(r.left + 10, r.top + 5));
        }}));
        ClickNode(popup.get());
    }
    EXPECT_EQ(popup->GetValue(), 1);
    EXPECT_EQ(popup->GetValueString(), u"Colour Grading");
    EXPECT_EQ(changes, std::vector<long>{1});
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow& m) {
                                            auto& menu = dynamic_cast<orvui::utility::MenuWindow&>(m);
                                            RectT r = menu.GetItemGlobalRect(3); // disabled
                                            ClickAt(PointT(r.left + 10, r.top + 5));
                                        },
                                        [](UI_ModalWindow&) { Desktop::Get().KeyDown(key::Escape); }}));
        ClickNode(popup.get());
    }
    EXPECT_EQ(popup->GetValue(), 1);
    EXPECT_EQ(changes.size(), 1u);
    popup->SetValueUnknown();
    EXPECT_TRUE(popup->IsValueUnknown());
    popup->SetValue(-1);
    EXPECT_EQ(popup->GetValueString(), u"");
}

TEST_F(ControlsTest, InputBoxAnsweredByTypingAndCancelled) {
    std::u16string name = u"Untitled Workspace";
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow& m) {
                                            EXPECT_EQ(Desktop::Get().GetTitle(m.GetPlatformWindow()),
                                                      u"New Workspace");
                                            Type(u"Grading"); // the proposal was selected: typing replaces it
                                        },
                                        [](UI_ModalWindow& m) { ClickNode(m.UI_FindNodeByID("OK")); }}));
        EXPECT_TRUE(orvui::ui::SimpleInputBox(nullptr, u"New Workspace", u"Name:", name, true, window.get()));
    }
    EXPECT_EQ(name, u"Grading");
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow&) { Type(u"zzz"); },
                                        [](UI_ModalWindow&) { Desktop::Get().KeyDown(key::Escape); }}));
        EXPECT_FALSE(
            orvui::ui::SimpleInputBox(nullptr, u"New Workspace", u"Name:", name, true, window.get()));
    }
    EXPECT_EQ(name, u"Grading");
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow&) {
            Type(u" 2");
            Desktop::Get().KeyDown(key::Enter); // Enter in the edit confirms
        }}));
        EXPECT_TRUE(orvui::ui::SimpleInputBox(nullptr, u"New", u"Name:", name, false, window.get()));
    }
    EXPECT_EQ(name, u"Grading 2");
    EXPECT_FALSE(
        orvui::ui::SimpleInputBox(nullptr, u"New", u"Name:", name, true, window.get())); // nobody answers
    EXPECT_TRUE(Desktop::Get().IsEnabled(window->GetPlatformWindow()));
}

TEST_F(ControlsTest, ConfirmationWithCustomLabelsAndNotes) {
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow& m) {
            auto* yes = dynamic_cast<UI_Button*>(m.UI_FindNodeByID("OK"));
            ASSERT_NE(yes, nullptr);
            EXPECT_EQ(yes->GetLabel(), u"&Yes");
            auto* text = dynamic_cast<UI_StaticText*>(m.UI_FindNodeByID("Message"));
            EXPECT_EQ(text->GetText(), u"Are you sure?");
            ClickNode(yes);
        }}));
        EXPECT_TRUE(orvui::ui::SimpleConfirmationBox(nullptr, u"Reset Workspace", u"Are you sure?",
                                                     window.get(), u"&Yes", u"&No"));
    }
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow& m) { ClickNode(m.UI_FindNodeByID("Cancel")); }}));
        EXPECT_FALSE(orvui::ui::SimpleConfirmationBox(nullptr, u"Reset", u"Sure?", window.get()));
    }
    EXPECT_FALSE(orvui::ui::SimpleConfirmationBox(nullptr, u"Reset", u"Sure?", window.get()));
    int turns = 0;
    {
        ScopedModalDriver driver([&](UI_ModalWindow& m) {
            ++turns;
            EXPECT_EQ(m.UI_FindNodeByID("Cancel"), nullptr);
            ClickNode(m.UI_FindNodeByID("OK"));
        });
        orvui::ui::messagebox::ShowNote(nullptr, u"Error", u"No User workspaces Defined", window.get());
    }
    EXPECT_EQ(turns, 1);
}

TEST_F(ControlsTest, AMessageBoxHoldsACallersPopup) {
    boost::intrusive_ptr<orvui::ui::UI_MessageBox> box(new orvui::ui::UI_MessageBox(
        nullptr, u"Delete Workspace", u"Name:", orvui::ui::ButtonOK | orvui::ui::ButtonCancel,
        orvui::ui::ButtonCancel, 0, window.get()));
    boost::intrusive_ptr<UI_Popup> popup(new UI_Popup);
    popup->UI_SetNodeID("Workspaces Popup");
    popup->SetItems({PopupItem(u"Audio"), PopupItem(u"Editing")});
    popup->SetValue(0);
    popup->UI_SetRect(RectF(0, 0, 200, 22));
    box->GetPreButtonLayoutDecorator()->ChildPushBack(popup);
    ScopedModalDriver driver([&](UI_ModalWindow& m) {
        if (auto* menu = dynamic_cast<orvui::utility::MenuWindow*>(&m)) {
            RectT r = menu->GetItemGlobalRect(1);
            ClickAt(PointT(r.left + 10, r.top + 5));
        } else if (popup->GetValue() == 0) {
            ClickNode(m.UI_FindNodeByID("Workspaces Popup")); // opens the popup's own menu
        } else {
            ClickNode(m.UI_FindNodeByID("OK"));
        }
    });
    EXPECT_EQ(box->Run(), int(orvui::ui::ButtonOK));
    EXPECT_EQ(popup->GetValueString(), u"Editing");
    RectF area = box->GetPreButtonLayoutDecorator()->UI_GetRect();
    RectF ok = box->UI_FindNodeByID("OK")->UI_GetRect();
    EXPECT_LT(area.Bottom(), ok.top); // the caller's control sits above the buttons
}

TEST_F(ControlsTest, FileOpenDialogListsMatchingFilesAndReturnsTheChoice) {
    TempDir folder;
    folder.Write("b-theme.xml", "");
    folder.Write("a-notes.txt", "");
    folder.Write("C-THEME.XML", "");
    boost::intrusive_ptr<orvui::ui::OS_FileOpenDialog> dialog(
        new orvui::ui::OS_FileOpenDialog(window.get(), u"Load Theme Colors"));
    dialog->AddFilter(u"XML Files (*.xml)", u"xml");
    dialog->SetFolder(folder.U16());
    ScopedModalDriver driver(Steps({[&](UI_ModalWindow&) {
        auto const& items = dialog->GetFileList()->GetItems();
        ASSERT_EQ(items.size(), 2u);
        EXPECT_EQ(items[0].text, u"C-THEME.XML");
        EXPECT_EQ(items[1].text, u"b-theme.xml");
        RectT row = dialog->GetFileList()->GetRowGlobalRect(1);
        ClickAt(PointT(row.left + 5, row.top + 5), 2);
    }}));
    ASSERT_TRUE(dialog->RunModal());
    EXPECT_EQ(dialog->GetFullPath(), folder.U16("b-theme.xml"));
    ScopedModalDriver none(nullptr);
    EXPECT_FALSE(dialog->RunModal());
    EXPECT_TRUE(dialog->GetFullPath().empty());
}

TEST_F(ControlsTest, PictureButtonsAskForTheirPicturePerState) {
    std::vector<unsigned long> asked;
    auto button = Add(new UI_PictureButton, RectF(10, 10, 20, 20));
    button->SetPictureSupply([&](unsigned long state) {
        asked.push_back(state);
        canvasor::Image picture(8, 8);
        canvasor::Canvasor c(picture);
        c.FillRect(RectF(0, 0, 8, 8), state & (1UL << 2) ? ColorRGBAOf(0, 1, 0) : ColorRGBAOf(0, 0, 1));
        return picture;
    });
    int clicks = 0;
    button->SetClickFunction([&] { ++clicks; });
    PointT middle = button->UI_LocalToGlobal(PointT(10, 10));
    Desktop::Get().MouseDown(middle);
    canvasor::Image pressed = Desktop::Get().Snapshot();
    Desktop::Get().MouseUp(middle);
    canvasor::Image released = Desktop::Get().Snapshot();
    EXPECT_EQ(clicks, 1);
    EXPECT_EQ(pressed.Pixel(middle.x, middle.y), ColorRGBAOf(0, 1, 0));
    EXPECT_EQ(released.Pixel(middle.x, middle.y), ColorRGBAOf(0, 0, 1));
    button->SetEnabled(false);
    EXPECT_EQ(button->GetState(), 1UL << 4);
    ASSERT_FALSE(asked.empty());

    auto image = Add(new UI_StaticImage, RectF(100, 10, 8, 8));
    canvasor::Image red(8, 8);
    {
        canvasor::Canvasor c(red);
        c.FillRect(RectF(0, 0, 8, 8), ColorRGBAOf(1, 0, 0));
    }
    image->SetImage(red);
    PointT at = image->UI_LocalToGlobal(PointT(4, 4));
    EXPECT_EQ(Desktop::Get().Snapshot().Pixel(at.x, at.y), ColorRGBAOf(1, 0, 0));
}

TEST_F(ControlsTest, OnlyABoundedDriverHasItsModalsCutShort) {
    // A driver that answers only after a long wait, as a person at a display may.
    auto slow = [](int& turns) {
        return [&turns](UI_ModalWindow& m) {
            if (++turns == 12000) {
                m.EndModal(int(orvui::ui::ButtonOK));
            }
        };
    };
    int turns = 0;
    {
        ScopedModalDriver driver(slow(turns)); // bounded: a script that never answers
        EXPECT_FALSE(orvui::ui::SimpleConfirmationBox(nullptr, u"Reset", u"Sure?", window.get()));
    }
    EXPECT_LT(turns, 12000);
    turns = 0;
    {
        ScopedModalDriver driver(slow(turns), false);
        EXPECT_FALSE(orvui::ui::IsModalDriverBounded());
        EXPECT_TRUE(orvui::ui::SimpleConfirmationBox(nullptr, u"Reset", u"Sure?", window.get()));
    }
    EXPECT_EQ(turns, 12000);
    EXPECT_TRUE(orvui::ui::IsModalDriverBounded()); // the scope gave back what it found
}
