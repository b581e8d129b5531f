// The workspace commands as a user meets them: the new, delete and reset dialogs answered by typing
// and clicking, and the workspaces drop-down driven by clicks on the control.
#include "manager/ManagerStories.h"

#include "host/core/Error.h"
#include "host/core/StringUtils.h"
#include "host/ui/Dialogs.h"
#include "host/ui/Menu.h"
#include "host/ui/controls/Controls.h"
#include "host/ui/controls/Popup.h"
#include "manager/WorkspaceDialogs.h"
#include "manager/WorkspacesPopup.h"
#include "ui/UiDoubles.h"

using namespace orvtest;
using orvui::controls::PopupItem;
using orvui::ui::ScopedModalDriver;
using orvui::ui::UI_ModalWindow;
namespace key = orvui::ui::key;
namespace dialogs = orvworkspace::workspaceutils;

namespace {

void ClickAt(PointT p) {
    Desktop::Get().MouseMove(p);
    Desktop::Get().MouseDown(p);
    Desktop::Get().MouseUp(p);
}

void ClickNode(orvui::ui::UI_Node* node) {
    ASSERT_NE(node, nullptr);
    RectT r = node->UI_GetGlobalRect();
    ClickAt(PointT(r.left + r.width / 2, r.top + r.height / 2));
}

void Type(std::u16string const& text) {
    for (char16_t ch : text) {
        unsigned code = (ch >= u'a' && ch <= u'z') ? unsigned(ch - u'a' + u'A') : unsigned(ch);
        Desktop::Get().KeyDown(code, ch);
    }
}

std::u16string Message(UI_ModalWindow& modal) {
    auto* text = dynamic_cast<orvui::controls::UI_StaticText*>(modal.UI_FindNodeByID("Message"));
    return text ? text->GetText() : std::u16string();
}

// A popup whose changed notification a test can send as the control would, for items (the empty
// one) that a click cannot choose.
class NotifiedPopup : public orvworkspace::sharedui::WorkspacesPopup {
public:
    using WorkspacesPopup::WorkspacesPopup;
    void Choose(long index) {
        SetValue(index);
        SendChanged(index);
    }
};

class Chooser : public ManagerStories {
protected:
    // The workspace commands the host heard.
    std::vector<std::string> Commands() const {
        std::vector<std::string> commands;
        for (std::string const& entry : workspace->log) {
            if (entry.rfind("command ", 0) == 0) {
                commands.push_back(entry.substr(8));
            }
        }
        return commands;
    }
    // Opens the drop-down with a click and picks an item with another.
    static void Pick(orvui::controls::UI_Popup& popup, long index) {
        ScopedModalDriver driver(Steps({[index](UI_ModalWindow& m) {
            auto& menu = dynamic_cast<orvui::utility::MenuWindow&>(m);
            RectT r = menu.GetItemGlobalRect(index);
            ClickAt(PointT(r.left + 10, r.top + r.height / 2));
        }}));
        ClickNode(&popup);
    }
    template <typename Popup> boost::intrusive_ptr<Popup> Place(Popup* popup) {
        boost::intrusive_ptr<Popup> p(popup);
        main->ChildPushBack(p);
        p->UI_SetRect(orvui::ui::RectF(10, 10, 240, 22));
        return p;
    }
    static std::vector<std::u16string> Texts(orvui::controls::UI_Popup const& popup) {
        std::vector<std::u16string> texts;
        for (PopupItem const& item : popup.GetItems()) {
            texts.push_back(item.text);
        }
        return texts;
    }
    static std::vector<bool> Enabled(orvui::controls::UI_Popup const& popup) {
        std::vector<bool> enabled;
        for (PopupItem const& item : popup.GetItems()) {
            enabled.push_back(item.enabled);
        }
        return enabled;
    }
    static long Checked(orvui::controls::UI_Popup const& popup) {
        long checked = -1;
        for (std::size_t i = 0; i < popup.GetItems().size(); ++i) {
            if (popup.GetItems()[i].checked) {
                EXPECT_EQ(checked, -1) << "two items checked";
                checked = long(i);
            }
        }
        return checked;
    }
};

} // namespace

TEST_F(Chooser, ANewNameMakesTheCurrentWorkspaceAndAnExistingOneAsksFirst) {
    Start();
    BuildTwoFrames();
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow& m) {
                                            EXPECT_EQ(Desktop::Get().GetTitle(m.GetPlatformWindow()),
                                                      u"New Workspace");
                                            Type(u"Grading");
                                        },
                                        [](UI_ModalWindow& m) { ClickNode(m.UI_FindNodeByID("OK")); }}));
        EXPECT_TRUE(dialogs::RequestCreateNewWorkspace(nullptr, main, *manager));
    }
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Grading");
    EXPECT_EQ(Names(), std::vector<std::u16string>{u"Grading"});

    // The same name again: asked whether to replace it, and declined, nothing changes.
    main->RemoveFrame(right, false);
    std::u16string question;
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow&) { Type(u"Grading"); },
                                        [](UI_ModalWindow& m) { ClickNode(m.UI_FindNodeByID("OK")); },
                                        [&](UI_ModalWindow& m) {
                                            question = Message(m);
                                            ClickNode(m.UI_FindNodeByID("Cancel"));
                                        }}));
        EXPECT_FALSE(dialogs::RequestCreateNewWorkspace(nullptr, main, *manager));
    }
    EXPECT_EQ(question,
              u"A workspace called \"Grading\" already exists.  Would you like to replace \"Grading\"?");
    Restart();
    manager->SetCurrentWorkspace(u"Grading");
    EXPECT_EQ(FrameTypes(), (std::vector<std::string>{"editor", "browser"})); // the file kept both frames

    // Accepted, the workspace is made again from the live arrangement.
    main->RemoveFrame(main->GetFrame(1), false);
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow&) { Type(u"Grading"); },
                                        [](UI_ModalWindow& m) { ClickNode(m.UI_FindNodeByID("OK")); },
                                        [](UI_ModalWindow& m) { ClickNode(m.UI_FindNodeByID("OK")); }}));
        EXPECT_TRUE(dialogs::RequestCreateNewWorkspace(nullptr, main, *manager));
    }
    Restart();
    manager->SetCurrentWorkspace(u"Grading");
    EXPECT_EQ(FrameTypes(), std::vector<std::string>{"editor"});

    // Nobody there to answer: cancelled, nothing made.
    EXPECT_FALSE(dialogs::RequestCreateNewWorkspace(nullptr, main, *manager));
    EXPECT_EQ(Names(), std::vector<std::u16string>{u"Grading"});
}

TEST_F(Chooser, DeletingOffersEveryWorkspaceButTheCurrentOne) {
    BuiltIns builtIns;
    Start(&builtIns);
    manager->SetCurrentWorkspace(u"Editing");
    std::u16string note;
    {
        // Mixing is the only other workspace; the box starts on it.
        ScopedModalDriver driver(Steps({[](UI_ModalWindow& m) {
            auto* popup = dynamic_cast<orvui::controls::UI_Popup*>(m.UI_FindNodeByID("Workspaces Popup"));
            ASSERT_NE(popup, nullptr);
            EXPECT_EQ(popup->GetItems().size(), 1u);
            EXPECT_EQ(popup->GetValueString(), u"Mixing");
            ClickNode(m.UI_FindNodeByID("OK"));
        }}));
        EXPECT_TRUE(dialogs::ChooseDeleteWorkspace(nullptr, main, *manager));
    }
    EXPECT_EQ(Names(), std::vector<std::u16string>{u"Editing"});
    {
        // Only the current one is left: a note, and nothing is deleted.
        ScopedModalDriver driver(Steps({[&](UI_ModalWindow& m) {
            EXPECT_EQ(Desktop::Get().GetTitle(m.GetPlatformWindow()), u"Error");
            note = Message(m);
            ClickNode(m.UI_FindNodeByID("OK"));
        }}));
        EXPECT_FALSE(dialogs::ChooseDeleteWorkspace(nullptr, main, *manager));
    }
    EXPECT_EQ(note, u"No User workspaces Defined");
    EXPECT_EQ(Names(), std::vector<std::u16string>{u"Editing"});

    // Cancelling the choice deletes nothing; the names are shown shortened but chosen whole.
    std::u16string longName(140, u'x');
    std::u16string chosen;
    {
        ScopedModalDriver driver(Steps({[&](UI_ModalWindow& m) {
            auto* popup = dynamic_cast<orvui::controls::UI_Popup*>(m.UI_FindNodeByID("Workspaces Popup"));
            ASSERT_NE(popup, nullptr);
            EXPECT_EQ(popup->GetItems()[1].text,
                      orvcore::utility::TruncateUIStringInMiddle(longName, 100, 0.25));
            popup->SetValue(1);
            ClickNode(m.UI_FindNodeByID("OK"));
        }}));
        EXPECT_TRUE(dialogs::GetWorkspaceNameForDelete(*workspace, {u"short", longName}, chosen));
    }
    EXPECT_EQ(chosen, longName);
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow&) { Desktop::Get().KeyDown(key::Escape); }}));
        EXPECT_FALSE(dialogs::GetWorkspaceNameForDelete(*workspace, {u"short"}, chosen));
    }
}

TEST_F(Chooser, ResetAsksWithTheCurrentNameAndRevertsOnlyWhenConfirmed) {
    Start();
    {
        // Nothing current: no question at all.
        int turns = 0;
        ScopedModalDriver driver([&](UI_ModalWindow& m) {
            ++turns;
            m.EndModal(int(orvui::ui::ButtonOK));
        });
        EXPECT_FALSE(dialogs::ConfirmRevertCurrWorkspace(nullptr, main, *manager));
        EXPECT_EQ(turns, 0);
    }
    BuildTwoFrames();
    manager->CreateUserWorkspace(u"Grading");
    main->RemoveFrame(right, false);
    manager->SaveWorkspace(u"Grading");
    std::u16string question;
    {
        ScopedModalDriver driver(Steps({[&](UI_ModalWindow& m) {
            EXPECT_EQ(Desktop::Get().GetTitle(m.GetPlatformWindow()), u"Reset Workspace");
            question = Message(m);
            ClickNode(m.UI_FindNodeByID("Cancel"));
        }}));
        EXPECT_FALSE(dialogs::ConfirmRevertCurrWorkspace(nullptr, main, *manager));
    }
    EXPECT_EQ(question, u"Are you sure you want to reset 'Grading' to its original layout?");
    EXPECT_EQ(main->GetFrameCount(), 1u);
    {
        ScopedModalDriver driver(Steps({[](UI_ModalWindow& m) { ClickNode(m.UI_FindNodeByID("OK")); }}));
        EXPECT_TRUE(dialogs::ConfirmRevertCurrWorkspace(nullptr, main, *manager));
    }
    EXPECT_EQ(FrameTypes(), (std::vector<std::string>{"editor", "browser"})); // its first layout
}

TEST_F(Chooser, ThePopupListsTheNamesChecksTheCurrentOneAndOffersTheCommands) {
    Start();
    manager->CreateUserWorkspace(u"beta");
    manager->CreateUserWorkspace(u"Alpha");
    Restart(); // nothing current
    ASSERT_FALSE(manager->HasCurrentWorkspace());
    auto popup = Place(new orvworkspace::sharedui::WorkspacesPopup(*manager));
    EXPECT_EQ(popup->UI_GetNodeID(), "WorkspacesPopup");
    EXPECT_EQ(Texts(*popup), (std::vector<std::u16string>{u"Alpha", u"beta", u"", u"New Workspace...",
                                                          u"Delete Workspace...", u"Reset Workspace..."}));
    EXPECT_EQ(Enabled(*popup), (std::vector<bool>{true, true, true, true, false, false}));
    EXPECT_EQ(Checked(*popup), -1);
    EXPECT_EQ(popup->GetValue(), -1);

    // Picking a name switches to it; the manager's notice rebuilds the popup.
    Pick(*popup, 0);
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Alpha");
    EXPECT_EQ(popup->GetItems().back().text, u"Reset \"Alpha\"...");
    EXPECT_EQ(Enabled(*popup), (std::vector<bool>{true, true, true, true, true, true}));
    EXPECT_EQ(Checked(*popup), 0);
    EXPECT_EQ(popup->GetValue(), 0);

    // The commands call the host once each and put the selection back on the current workspace.
    for (long item : {3L, 4L, 5L}) {
        Pick(*popup, item);
        EXPECT_EQ(Checked(*popup), 0);
        EXPECT_EQ(popup->GetValue(), 0);
    }
    EXPECT_EQ(Commands(), (std::vector<std::string>{"new", "delete", "reset"}));
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Alpha");

    // A long name is shown shortened but switched to whole.
    std::u16string longName = u"Colour " + std::u16string(120, u'g');
    manager->CreateUserWorkspace(longName);
    manager->SetCurrentWorkspace(u"Alpha");
    long index = popup->FindStringExact(orvcore::utility::TruncateUIStringInMiddle(longName, 100, 0.25));
    ASSERT_EQ(index, 1); // "C" sorts between "Alpha" and "beta"
    Pick(*popup, index);
    EXPECT_EQ(manager->GetCurrentWorkspace(), longName);
    EXPECT_EQ(Checked(*popup), 1);

    // Destroyed, the popup leaves the manager's helpers: later changes must not reach it.
    main->ChildRemove(popup.get());
    popup.reset();
    manager->SetCurrentWorkspace(u"beta");
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"beta");
}

TEST_F(Chooser, TheEmptyItemOnlyPutsTheSelectionBack) {
    Start();
    manager->CreateUserWorkspace(u"beta");
    manager->CreateUserWorkspace(u"Alpha");
    auto popup = Place(new NotifiedPopup(*manager));
    ASSERT_EQ(popup->GetItems()[2].text, u"");
    popup->Choose(2);
    EXPECT_EQ(popup->GetValue(), 0);
    EXPECT_EQ(Checked(*popup), 0);
    EXPECT_TRUE(Commands().empty());
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Alpha");
    main->ChildRemove(popup.get());
    // The default workspace answers the commands with nothing.
    boost::intrusive_ptr<orvworkspace::workspace::Workspace> plain(new orvworkspace::workspace::Workspace);
    plain->DoWorkspaceCmdNew();
    plain->DoWorkspaceCmdDelete();
    plain->DoWorkspaceCmdReset();
}

TEST_F(Chooser, APopupMadeBeforeStartUpIsRefusedAndNotKept) {
    Manager early(*workspace, saved, archived, settings, nullptr, nullptr, false);
    EXPECT_THROW(orvworkspace::sharedui::WorkspacesPopup popup(early), orvcore::config::Error);
    early.Initialize();
    early.CreateUserWorkspace(u"Later"); // tells its helpers: none may be left over
    EXPECT_EQ(early.GetCurrentWorkspace(), u"Later");
}

TEST_F(Chooser, ASingleCurrentWorkspaceCannotBeDeleted) {
    Start();
    manager->CreateUserWorkspace(u"Only");
    auto popup = Place(new orvworkspace::sharedui::WorkspacesPopup(*manager));
    EXPECT_EQ(Enabled(*popup), (std::vector<bool>{true, true, true, false, true}));
    EXPECT_EQ(Checked(*popup), 0);
    main->ChildRemove(popup.get());
}

TEST_F(Chooser, TheOlderPopupShowsNamesAloneOrHandsTheControlToTheHost) {
    Start();
    manager->CreateUserWorkspace(u"Alpha");
    manager->CreateUserWorkspace(u"beta");
    auto plain = Place(new orvworkspace::sharedui::orv_v1::WorkspacesPopup(*manager, false));
    EXPECT_EQ(Texts(*plain), (std::vector<std::u16string>{u"Alpha", u"beta"}));
    EXPECT_EQ(Checked(*plain), 1);
    Pick(*plain, 0);
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Alpha");
    EXPECT_EQ(plain->GetValue(), 0);
    // Without commands the switch's notice does not rebuild it: the check mark stays where it was
    // until the list is rebuilt.
    EXPECT_EQ(Checked(*plain), 1);
    plain->RebuildMenu();
    EXPECT_EQ(Checked(*plain), 0);
    manager->SetCurrentWorkspace(u"beta");

    // With commands: the reset item always names the current workspace and is never disabled.
    auto commands = Place(new orvworkspace::sharedui::orv_v1::WorkspacesPopup(*manager, true));
    EXPECT_EQ(Texts(*commands), (std::vector<std::u16string>{u"Alpha", u"beta", u"", u"New Workspace...",
                                                             u"Delete Workspace...", u"Reset \"beta\"..."}));
    Pick(*commands, 5);
    EXPECT_EQ(Commands(), std::vector<std::string>{"reset"});
    EXPECT_EQ(Checked(*commands), 1);
    manager->SetCurrentWorkspace(u"Alpha"); // rebuilt by the notice, as commands are shown
    EXPECT_EQ(Checked(*commands), 0);

    // Handed to the host: names alone, and picking one switches nothing.
    commands->SetExternalBehavior(true);
    EXPECT_EQ(Texts(*commands), (std::vector<std::u16string>{u"Alpha", u"beta"}));
    Pick(*commands, 1);
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Alpha");
    EXPECT_EQ(commands->GetValueString(), u"beta"); // what the host reads
    main->ChildRemove(plain.get());
    main->ChildRemove(commands.get());
}
