// The workspace manager's stories on a temporary preferences folder: first start with and without
// built-in workspaces, the settings cache, switching, creating, saving, deleting, resetting.
#include "manager/ManagerStories.h"

#include "host/core/Dir.h"
#include "host/core/Error.h"
#include "host/core/FileUtils.h"
#include "host/core/PropListUtils.h"
#include "host/core/TextConversion.h"
#include "host/ui/Menu.h"
#include "manager/Manager.h"
#include "manager/PlatformMenuHelperBase.h"
#include "manager/WorkspaceDirs.h"
#include "persistence/WorkspaceBuilder.h"
#include "persistence/WorkspaceDocument.h"
#include "support/FileSizeLimit.h"
#include "support/TempDir.h"

#include <cstdlib>
#include <filesystem>

using namespace orvtest;
using orvcore::proplist::PropList;
using orvcore::utility::FileUtils;

TEST_F(ManagerStories, TheFoldersLiveInThePreferencesFolder) {
    EXPECT_TRUE(FileUtils::DirectoryExists(saved));
    EXPECT_TRUE(FileUtils::DirectoryExists(archived));
    EXPECT_EQ(saved, prefs.U16("SavedWorkspaces"));
    EXPECT_EQ(archived, prefs.U16("ArchivedWorkspaces"));
    EXPECT_EQ(settings, prefs.U16("WSMgrCfg"));
    EXPECT_FALSE(FileUtils::FileExists(settings));
}

TEST_F(ManagerStories, AFirstStartListsTheBuiltInsAndWritesTheSettings) {
    BuiltIns builtIns;
    Start(&builtIns);
    EXPECT_EQ(Names(), (std::vector<std::u16string>{u"Editing", u"Mixing"}));
    EXPECT_EQ(manager->GetWorkspaceTable().at(u"Editing"), nullptr); // placeholders
    ASSERT_TRUE(FileUtils::FileExists(settings));
    PropList doc;
    orvcore::proplist::utils::LoadPropList(settings, doc, true);
    std::vector<std::u16string> listed;
    doc.GetValue("BuiltIns", listed);
    EXPECT_EQ(listed, (std::vector<std::u16string>{u"Editing", u"Mixing"}));
    EXPECT_FALSE(doc.HasKey("WorkspaceConfigVersion")); // records come with a flush only

    // Without a provider nothing is listed and nothing written; a flush without a document writes none.
    std::filesystem::remove(prefs.Path() / "WSMgrCfg");
    Restart(nullptr);
    EXPECT_TRUE(Names().empty());
    manager->FlushManagerSettings();
    EXPECT_FALSE(FileUtils::FileExists(settings));
    EXPECT_THROW(manager->Initialize(), orvcore::config::Error);
}

TEST_F(ManagerStories, SelectingABuiltInWritesAUserFileThatTheNextSelectionLoads) {
    BuiltIns builtIns;
    Start(&builtIns);
    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Editing"));
    EXPECT_EQ(builtIns.builds, 1);
    EXPECT_EQ(FrameTypes(), (std::vector<std::string>{"editor", "browser"}));
    ASSERT_NE(manager->GetWorkspaceTable().at(u"Editing"), nullptr);
    EXPECT_EQ(FilesIn(saved), std::vector<std::u16string>{prefs.U16("SavedWorkspaces/UserWorkspace1.xml")});
    EXPECT_TRUE(manager->SetCurrentWorkspace(u"Editing")); // already current
    main->GetFrame(0)->AddTab("mixer", true);              // the user changes it

    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Mixing"));
    EXPECT_EQ(FrameTypes(), std::vector<std::string>{"mixer"});
    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Editing")); // loaded from its file, with the change
    EXPECT_EQ(builtIns.builds, 2);
    EXPECT_EQ(main->GetFrame(0)->GetTabCount(), 2);
    EXPECT_FALSE(manager->SetCurrentWorkspace(u"Nobody"));
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Editing");
}

TEST_F(ManagerStories, TheSettingsCacheSparesReadingFilesThatDidNotChange) {
    BuiltIns builtIns;
    Start(&builtIns);
    manager->CreateUserWorkspace(u"Mine");
    manager->CreateUserWorkspace(u"Other");
    manager->FlushManagerSettings();
    Restart(&builtIns);
    EXPECT_EQ(manager->GetFilesRead(), 0u);
    EXPECT_EQ(manager->GetKnownFiles().size(), 4u); // two user files, two archives
    EXPECT_EQ(Names(), (std::vector<std::u16string>{u"Editing", u"Mine", u"Mixing", u"Other"}));

    // A file changed after the flush is read again; a deleted one is dropped.
    std::u16string mine = manager->GetWorkspaceTable().at(u"Mine")->GetFilePath();
    std::u16string other = manager->GetWorkspaceTable().at(u"Other")->GetFilePath();
    std::filesystem::last_write_time(std::filesystem::path(orvcore::filesupport::ToPath(mine)),
                                     std::filesystem::file_time_type::clock::now() + std::chrono::seconds(5));
    std::filesystem::remove(orvcore::filesupport::ToPath(other));
    Restart(&builtIns);
    EXPECT_EQ(manager->GetFilesRead(), 1u);
    EXPECT_EQ(Names(), (std::vector<std::u16string>{u"Editing", u"Mine", u"Mixing"}));

    // Records of another version, or lists of unequal length, are no records: every file is read.
    PropList doc;
    orvcore::proplist::utils::LoadPropList(settings, doc, true);
    doc.SetValue("WorkspaceConfigVersion", std::string("1.0"));
    orvcore::proplist::utils::SavePropList(settings, doc);
    Restart(&builtIns);
    EXPECT_EQ(manager->GetFilesRead(), 3u); // Mine, and both archives
    manager->FlushManagerSettings();
    orvcore::proplist::utils::LoadPropList(settings, doc, true);
    doc.SetValue("UserNames", std::vector<std::u16string>{u"Mine"});
    orvcore::proplist::utils::SavePropList(settings, doc);
    Restart(&builtIns);
    EXPECT_EQ(manager->GetFilesRead(), 3u);
}

TEST_F(ManagerStories, TwoFilesOfOneNameGiveOneWorkspaceAndForeignFilesAreSkipped) {
    Start(nullptr);
    manager->CreateUserWorkspace(u"Twin");
    std::u16string first = manager->GetWorkspaceTable().at(u"Twin")->GetFilePath();
    FileUtils::Copy(first, prefs.U16("SavedWorkspaces/Copy.xml"));
    prefs.Write("SavedWorkspaces/broken.xml", "<prop.list><key>");
    prefs.Write("SavedWorkspaces/notes.txt", "hello");
    prefs.Write("SavedWorkspaces/empty.xml", "");
    // A name that is only the extension is a hidden file without one; an upper-case extension is
    // another extension.
    manager->CreateUserWorkspace(u"Hidden");
    std::u16string hidden = manager->GetWorkspaceTable().at(u"Hidden")->GetFilePath();
    FileUtils::Copy(hidden, prefs.U16("SavedWorkspaces/Upper.XML"));
    std::filesystem::rename(orvcore::filesupport::ToPath(hidden), prefs.Path() / "SavedWorkspaces" / ".xml");
    Restart(nullptr);
    EXPECT_EQ(Names(), std::vector<std::u16string>{u"Twin"});
    // The last file read under a name wins (files are read in name order).
    EXPECT_EQ(manager->GetWorkspaceTable().at(u"Twin")->GetFilePath(), first);
}

TEST_F(ManagerStories, DeletingABuiltInLastsUntilTheManagerIsReset) {
    BuiltIns builtIns;
    Start(&builtIns);
    manager->SetCurrentWorkspace(u"Mixing");
    manager->DeleteUserWorkspace(u"Editing"); // never selected: a placeholder
    manager->DeleteUserWorkspace(u"Mixing");  // the current one, with its file
    EXPECT_FALSE(manager->HasCurrentWorkspace());
    EXPECT_TRUE(FilesIn(saved).empty());
    EXPECT_THROW(manager->DeleteUserWorkspace(u"Nobody"), orvcore::config::Error);
    Restart(&builtIns);
    EXPECT_TRUE(Names().empty());
    manager->ResetWorkspaceMgr();
    EXPECT_EQ(Names(), (std::vector<std::u16string>{u"Editing", u"Mixing"}));
}

TEST_F(ManagerStories, ACreatedWorkspaceRevertsToItsFirstLayout) {
    BuildTwoFrames();
    Start(nullptr);
    manager->CreateUserWorkspace(u"Mine");
    EXPECT_EQ(FilesIn(archived).size(), 1u);
    EXPECT_THROW(manager->CreateUserWorkspace(u"Mine"), orvcore::config::Error);
    left->AddTab("mixer", true);
    ASSERT_TRUE(manager->SaveWorkspace(u"Mine"));
    manager->RevertWorkspace(u"Mine");
    EXPECT_EQ(FrameTypes(), (std::vector<std::string>{"editor", "browser"}));
    EXPECT_EQ(main->GetFrame(0)->GetTabCount(), 1);
    EXPECT_FALSE(manager->SaveWorkspace(u"Nobody"));

    // Adding under an existing name without replacing changes nothing.
    PropList document;
    SaveWorkspace(*workspace, document, u"");
    EXPECT_FALSE(manager->AddWorkspace(u"Mine", document, false));
    EXPECT_TRUE(manager->AddWorkspace(u"Project", document, false));
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Project");
}

TEST_F(ManagerStories, NamesSortForAMenuFilledFromTheTop) {
    Start(nullptr);
    for (char16_t const* name : {u"beta", u"Alpha", u"alpha2"}) {
        manager->CreateUserWorkspace(name);
    }
    std::vector<std::u16string> sorted;
    manager->GetUISortedWorkspaceNames(sorted);
    EXPECT_EQ(sorted, (std::vector<std::u16string>{u"beta", u"alpha2", u"Alpha"}));
}

TEST_F(ManagerStories, AFailedWriteKeepsThePreviousFileWholeAndIsNoSuccess) {
    Start(nullptr);
    BuildTwoFrames();
    manager->CreateUserWorkspace(u"Mine");
    std::u16string path = manager->GetWorkspaceTable().at(u"Mine")->GetFilePath();
    std::string before = FileUtils::ReadWholeFile(path, 1 << 20);
    ASSERT_GT(before.size(), 200u);
    left->AddTab("mixer", true);
    // As on a disk that is full: no file may grow past 200 bytes.
    bool written = true;
    ASSERT_TRUE(WithFileSizeLimit(200, [&] { written = manager->SaveWorkspace(u"Mine"); }));
    EXPECT_FALSE(written);
    EXPECT_EQ(FileUtils::ReadWholeFile(path, 1 << 20), before);
    // A switch away then a switch back loads the last layout that was written.
    manager->CreateUserWorkspace(u"Other");
    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Mine"));
    EXPECT_EQ(main->GetFrame(0)->GetTabCount(), 2); // saved on the way out, now that the disk has room
}

TEST_F(ManagerStories, ALoadThatFailsLeavesTheLoadingCounterAtRest) {
    BuiltIns builtIns;
    Start(&builtIns);
    std::filesystem::remove_all(prefs.Path() / "SavedWorkspaces"); // no user file can be made
    EXPECT_THROW(manager->SetCurrentWorkspace(u"Editing"), orvcore::config::Error);
    EXPECT_FALSE(manager->CheckWorkspaceLoading());
    EXPECT_FALSE(manager->HasCurrentWorkspace());
}

namespace {

class ShippedWorkspaces : public SystemWorkspaceProviderBase {
public:
    explicit ShippedWorkspaces(std::u16string f)
        : folder(std::move(f)) {}
    void GetSystemWorkspaceFolder(std::u16string& out) const override { out = folder; }
    std::u16string folder;
};

class LocalizedBuiltIns : public BuiltIns {
public:
    LocalizedBuiltIns() { names = {u"Editing"}; }
    bool SupportsLocalizedWorkspaceNames() const override { return true; }
    void GetWorkspaceStringKeys(std::list<std::string>& out) const override {
        out.push_back("$$$/Test/Workspace/Editing=Editing");
    }
};

class CountingHelper : public MenuHelperBase {
public:
    void RebuildMenu() override { log.push_back(u"rebuild"); }
    void NewActiveWorkspace(std::u16string const& name) override { log.push_back(u"current " + name); }
    std::vector<std::u16string> log;
};

} // namespace

TEST_F(ManagerStories, ASystemWorkspaceIsCopiedOnceAndResetsToItsShippedFile) {
    TempDir shipped;
    BuildTwoFrames();
    Ship(shipped, u"Colour");
    ShippedWorkspaces system(shipped.U16());
    Start(nullptr, &system);
    EXPECT_EQ(Names(), std::vector<std::u16string>{u"Colour"});
    EXPECT_TRUE(system.FindWorkspace(u"Colour"));
    EXPECT_EQ(manager->GetWorkspaceTable().at(u"Colour"), nullptr);

    workspace->RemoveTab(left, 0L, false, false);
    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Colour"));
    EXPECT_EQ(FrameTypes(), (std::vector<std::string>{"editor", "browser"}));
    std::u16string copy = prefs.U16("SavedWorkspaces/Colour.xml");
    EXPECT_EQ(manager->GetWorkspaceTable().at(u"Colour")->GetFilePath(), copy);
    main->GetFrame(0)->AddTab("mixer", true);
    ASSERT_TRUE(manager->SaveWorkspace(u"Colour"));
    std::string shippedBytes = FileUtils::ReadWholeFile(shipped.U16("Colour.xml"), 1 << 20);
    EXPECT_NE(FileUtils::ReadWholeFile(copy, 1 << 20),
              shippedBytes); // the user's copy changed, not the shipped file
    manager->RevertWorkspace(u"Colour");
    EXPECT_EQ(main->GetFrame(0)->GetTabCount(), 1);
    // Chosen again after a restart, the user's copy is used as it is.
    Restart(nullptr, &system);
    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Colour"));
    EXPECT_EQ(main->GetFrame(0)->GetTabCount(), 2);
}

TEST_F(ManagerStories, LocalizedNamesAreSavedUnderTheirKeyAndReadBackAsText) {
    LocalizedBuiltIns builtIns;
    Start(&builtIns);
    EXPECT_EQ(Names(), std::vector<std::u16string>{u"Editing"});
    PropList doc;
    orvcore::proplist::utils::LoadPropList(settings, doc, true);
    std::vector<std::string> keys;
    doc.GetValue("BuiltInKeys", keys);
    EXPECT_EQ(keys, std::vector<std::string>{"$$$/Test/Workspace/Editing=Editing"});
    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Editing"));
    PropList file;
    orvcore::proplist::utils::LoadPropList(manager->GetWorkspaceTable().at(u"Editing")->GetFilePath(), file,
                                           true);
    EXPECT_EQ(GetWorkspaceUserName(file), u"$$$/Test/Workspace/Editing=Editing");
    Restart(&builtIns);
    EXPECT_EQ(Names(), std::vector<std::u16string>{u"Editing"});
    ASSERT_NE(manager->GetWorkspaceTable().at(u"Editing"), nullptr); // the file, found under its text
}

TEST_F(ManagerStories, HelpersHearOfNewListsAndNewCurrentWorkspaces) {
    BuiltIns builtIns;
    Start(&builtIns);
    CountingHelper helper;
    manager->AddMenuHelper(&helper);
    manager->SetCurrentWorkspace(u"Mixing");
    manager->CreateUserWorkspace(u"Mine");
    manager->DefaultingToProjectWorkspace();
    EXPECT_EQ(helper.log, (std::vector<std::u16string>{u"rebuild", u"current Mixing", u"rebuild",
                                                       u"current Mine", u"current "}));
    EXPECT_FALSE(manager->CheckWorkspaceLoading());
    manager->RemoveMenuHelper(&helper);
    manager->SetCurrentWorkspace(u"Mine");
    EXPECT_EQ(helper.log.size(), 5u);
}

// --- Menu helpers ---

namespace {

std::vector<std::u16string> MenuTexts(orvui::utility::OS_Menu const& menu) {
    std::vector<std::u16string> texts;
    for (auto const& item : menu.Items()) {
        texts.push_back(item.separator ? u"--" : item.text);
    }
    return texts;
}

} // namespace

TEST_F(ManagerStories, AMenuListsTheWorkspacesAboveTheHostsItemsAndChecksTheCurrentOne) {
    Start(nullptr);
    for (char16_t const* name : {u"b", u"a", u"C"}) {
        manager->CreateUserWorkspace(name);
    }
    orvui::utility::OS_Menu menu;
    for (char16_t const* item : {u"New", u"Delete", u"Reset"}) {
        menu.AppendItem(item, 1);
    }
    auto helper = PlatformMenuHelperBase::NewPlatformMenuHelper(&menu, *manager, {500, 10}, false);
    EXPECT_EQ(helper->GetInitialMenuItemCount(), 3u);
    manager->AddMenuHelper(helper.get());
    std::vector<std::u16string> expected{u"a", u"b", u"C", u"--", u"New", u"Delete", u"Reset"};
    EXPECT_EQ(MenuTexts(menu), expected);
    EXPECT_EQ(menu.GetItem(0).command, 500u);
    EXPECT_TRUE(menu.IsChecked(502)); // C, the last one created, is current
    EXPECT_FALSE(IsCommandCheckStyleRadio(500));
    helper->RebuildMenu();
    EXPECT_EQ(MenuTexts(menu), expected);

    // Picking a command switches; a command that is none of ours is left to the host.
    EXPECT_TRUE(helper->HandleCommand(500));
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"a");
    EXPECT_TRUE(menu.IsChecked(500));
    EXPECT_FALSE(menu.IsChecked(502));
    EXPECT_FALSE(helper->HandleCommand(1));
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"a");
    manager->DefaultingToProjectWorkspace();
    EXPECT_EQ(helper->GetCheckedCommand(), 0u);

    // Everything gone: only the host's items, no separator.
    for (char16_t const* name : {u"a", u"b", u"C"}) {
        manager->DeleteUserWorkspace(name);
    }
    EXPECT_EQ(MenuTexts(menu), (std::vector<std::u16string>{u"New", u"Delete", u"Reset"}));
    manager->RemoveMenuHelper(helper.get());
}

TEST_F(ManagerStories, CommandIdsComeFromARangeOrAnAllocatorAskedOnlyForWhatIsMissing) {
    Start(nullptr);
    for (char16_t const* name : {u"a", u"b", u"c"}) {
        manager->CreateUserWorkspace(name);
    }
    auto ranged = PlatformMenuHelperBase::NewPlatformMenuHelper(nullptr, *manager, {1000, 2}, false);
    ranged->RebuildMenu();
    // Two IDs for three names: the last two in ascending order get them, and nothing is checked.
    EXPECT_EQ(MenuTexts(*ranged->GetMenu()), (std::vector<std::u16string>{u"b", u"c", u"--"}));
    EXPECT_EQ(ranged->GetMenu()->GetItem(0).command, 1000u);
    EXPECT_EQ(ranged->GetCheckedCommand(), 0u);

    std::vector<unsigned long> asked;
    unsigned long next = 7000;
    PlatformMenuHelperBase::IdAllocator allocator =
        std::make_shared<std::function<unsigned long(unsigned long)>>([&](unsigned long count) {
            asked.push_back(count);
            unsigned long first = next;
            next += count;
            return first;
        });
    auto allocated = PlatformMenuHelperBase::NewPlatformMenuHelper(nullptr, *manager, allocator, false);
    manager->AddMenuHelper(allocated.get());
    manager->CreateUserWorkspace(u"d");
    manager->DeleteUserWorkspace(u"a");
    EXPECT_EQ(asked, (std::vector<unsigned long>{3, 1}));
    manager->RemoveMenuHelper(allocated.get());

    // A pool starting at 0: the command with ID 0 is never checked nor reported.
    auto fromZero = PlatformMenuHelperBase::NewPlatformMenuHelper(nullptr, *manager, {0, 5}, false);
    fromZero->RebuildMenu();
    unsigned long command = 99;
    EXPECT_FALSE(fromZero->WorkspaceCmdForName(u"b", command)); // b is first from the top: ID 0
    EXPECT_EQ(command, 0u);
    EXPECT_TRUE(fromZero->WorkspaceCmdForName(u"c", command));
    EXPECT_EQ(command, 1u);
}

TEST_F(ManagerStories, LongNamesAreShortenedInTheMenuButKeptWholeForTheCommand) {
    Start(nullptr);
    std::u16string longName(150, u'x');
    longName += u"end";
    manager->CreateUserWorkspace(longName);
    auto helper = PlatformMenuHelperBase::NewPlatformMenuHelper(nullptr, *manager, {10, 4}, false);
    helper->RebuildMenu();
    EXPECT_LE(helper->GetMenu()->GetItem(0).text.size(), 100u);
    std::u16string whole;
    ASSERT_TRUE(helper->WorkspaceNameForCmd(10, whole));
    EXPECT_EQ(whole, longName);
}

TEST_F(ManagerStories, TheMainWindowGetsItsRememberedPlaceOrTheDefaultOne) {
    manager = std::make_unique<Manager>(*workspace, saved, archived, settings, nullptr, false);
    std::vector<std::u16string> names;
    EXPECT_THROW(manager->GetWorkspaces(names), orvcore::config::Error); // not initialised yet
    manager->Initialize();
    // Without settings: maximised on the first monitor.
    manager->ApplyDefaultMainWindowSize();
    EXPECT_EQ(Desktop::Get().GetPlacement(appWindow).showCmd, 3u);
    // Remembered by a flush, given back later.
    RectT placed(150, 120, 900, 600);
    orvui::ui::WindowPlacement normal = Desktop::Get().GetPlacement(appWindow);
    normal.showCmd = 1;
    normal.normal = placed;
    Desktop::Get().SetPlacement(appWindow, normal);
    ASSERT_EQ(Desktop::Get().GetWindowRect(appWindow), placed);
    PropList empty;
    orvcore::proplist::utils::SavePropList(settings, empty);
    manager->FlushManagerSettings();
    Desktop::Get().SetWindowRect(appWindow, RectT(10, 10, 500, 400));
    manager->ApplyDefaultMainWindowSize();
    EXPECT_EQ(Desktop::Get().GetWindowRect(appWindow), placed);
}

TEST_F(ManagerStories, AddingOverABuiltInPlaceholderLaysItOutFirstThenTakesTheDocument) {
    BuiltIns builtIns;
    Start(&builtIns);
    BuildTwoFrames();
    PropList document;
    SaveWorkspace(*workspace, document, u"");
    ASSERT_TRUE(manager->AddWorkspace(u"Mixing", document, true));
    EXPECT_EQ(builtIns.builds, 1);
    EXPECT_EQ(manager->GetCurrentWorkspace(), u"Mixing");
    EXPECT_EQ(FrameTypes(), (std::vector<std::string>{"editor", "browser"}));
    ASSERT_NE(manager->GetWorkspaceTable().at(u"Mixing"), nullptr);
    EXPECT_FALSE(manager->AddWorkspace(u"", document, true));
}

TEST_F(ManagerStories, ABuiltInResetsToItsBuilderAndAResetManagerKeepsShippedWorkspaces) {
    BuiltIns builtIns;
    TempDir shipped;
    BuildTwoFrames();
    Ship(shipped, u"Colour");
    ShippedWorkspaces system(shipped.U16());
    Start(&builtIns, &system);
    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Mixing"));
    main->GetFrame(0)->AddTab("editor", true);
    manager->RevertWorkspace(u"Mixing");
    EXPECT_EQ(main->GetFrame(0)->GetTabCount(), 1); // laid out by its builder again
    EXPECT_EQ(builtIns.builds, 2);
    EXPECT_THROW(manager->RevertWorkspace(u"Nobody"), orvcore::config::Error);

    ASSERT_TRUE(manager->SetCurrentWorkspace(u"Colour"));
    manager->CreateUserWorkspace(u"Mine");
    manager->ResetWorkspaceMgr();
    EXPECT_FALSE(manager->HasCurrentWorkspace());
    EXPECT_EQ(Names(), (std::vector<std::u16string>{u"Colour", u"Editing", u"Mixing"}));
    EXPECT_TRUE(FilesIn(saved).empty());
    EXPECT_TRUE(FilesIn(archived).empty());
    EXPECT_TRUE(FileUtils::FileExists(shipped.U16("Colour.xml"))); // shipped files are never touched
}

TEST_F(ManagerStories, ADamagedSettingsDocumentCountsAsNoneUntilTheNextFlushReplacesIt) {
    BuiltIns builtIns;
    prefs.Write("WSMgrCfg", "<prop.list><key>Work");
    Start(&builtIns);
    EXPECT_EQ(Names(), (std::vector<std::u16string>{u"Editing", u"Mixing"}));
    EXPECT_EQ(FileUtils::ReadWholeFile(settings, 1 << 20), "<prop.list><key>Work"); // left as it was
    manager->CreateUserWorkspace(u"Mine");
    manager->FlushManagerSettings();
    PropList doc;
    ASSERT_TRUE(orvcore::proplist::utils::LoadPropList(settings, doc, false));
    std::vector<std::u16string> names;
    doc.GetValue("UserNames", names);
    EXPECT_EQ(names, (std::vector<std::u16string>{u"Mine", u"Mine"})); // the archive, then the user file
}
