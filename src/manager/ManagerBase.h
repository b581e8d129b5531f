// The workspace manager: the application's named workspaces (built-in, system and user ones), the
// current one, switching between them (saving the outgoing one first), creating, adding, deleting
// and resetting them, and a small settings document that caches what was found on disk. The rules
// live here; where workspaces are stored is left to a derived class (Manager keeps them as files).
//
// Choices where the rules are silent or unsafe: saving reports whether the file was written (a
// failed write keeps the previous file and is not taken for success); saving a name without an
// entry (a placeholder, an unknown name) writes nothing; steps that need a built-in provider treat
// the name as unknown when there is none; a settings document that cannot be read is treated as
// absent.
#pragma once

#include "manager/WorkspaceProviders.h"

#include <map>
#include <memory>
#include <string>
#include <unordered_set>
#include <vector>

namespace orvcore::proplist {
class PropList;
}

namespace orvworkspace::workspace {

class Workspace;

class ManagerBase {
public:
    using Table = std::map<std::u16string, std::unique_ptr<WorkspaceEntryImplData>>;

    ManagerBase(Workspace& workspace, BuiltInWorkspaceProviderBase* builtIn,
                SystemWorkspaceProviderBase* system, bool sizeMainFrame);
    ManagerBase(Workspace& workspace, BuiltInWorkspaceProviderBase* builtIn, bool sizeMainFrame);
    virtual ~ManagerBase();
    ManagerBase(ManagerBase const&) = delete;
    ManagerBase& operator=(ManagerBase const&) = delete;

    // Reads the settings and the folders; raises AlreadyIntialized the second time.
    void Initialize();
    bool IsInitialized() const { return initialized_; }
    void ResetWorkspaceMgr();

    bool SetCurrentWorkspace(std::u16string const& name);
    std::u16string const& GetCurrentWorkspace() const { return current_; }
    bool HasCurrentWorkspace() const { return !current_.empty(); }
    void GetCurrentWorkspace(orvcore::proplist::PropList& out) const;
    bool HasNamedWorkspace(std::u16string const& name) const { return workspaces_.count(name) != 0; }
    std::int32_t GetNumberWorkspaces() const { return std::int32_t(workspaces_.size()); }
    void GetWorkspaces(std::vector<std::u16string>& out) const;
    // The names in the order a menu filled from the top wants them: descending, case folded.
    void GetUISortedWorkspaceNames(std::vector<std::u16string>& out) const;

    void CreateUserWorkspace(std::u16string const& name);
    bool AddWorkspace(std::u16string const& name, orvcore::proplist::PropList& document, bool replace);
    void DeleteUserWorkspace(std::u16string const& name);
    void RevertWorkspace(std::u16string const& name);
    // Writes the live arrangement into the workspace's file; false when nothing was written.
    bool SaveWorkspace(std::u16string const& name);
    void DefaultingToProjectWorkspace();
    virtual void FlushManagerSettings();
    void ApplyDefaultMainWindowSize();

    void SetSizeMainFrame(bool size) { sizeMainFrame_ = size; }
    void ForceConstraintLayoutForBuilder(bool force) { forceConstraintLayout_ = force; }
    bool CheckWorkspaceLoading() const { return loading_ > 0; }
    Workspace& GetWorkspace() const { return workspace_; }
    void AddMenuHelper(MenuHelperBase* helper);
    void RemoveMenuHelper(MenuHelperBase* helper);

    // --- What tests and menus look at ---
    Table const& GetWorkspaceTable() const { return workspaces_; }
    Table const& GetArchiveTable() const { return archives_; }
    Table const& GetSystemTable() const { return systems_; }
    std::unordered_set<std::u16string> const& GetKnownFiles() const { return knownFiles_; }

protected:
    // --- Storage, supplied by a derived class ---
    virtual void PopulateSystemWorkspaces(Table& workspaces, Table& systems) = 0;
    virtual void PopulateUserWorkspaces(Table& workspaces, Table& archives) = 0;
    virtual std::unique_ptr<WorkspaceEntryImplData> DoCreateUserWorkspace(std::u16string const& name) = 0;
    virtual bool DoSaveWorkspace(std::u16string const& name, WorkspaceEntryImplData const* entry) = 0;
    virtual bool DoDeleteWorkspace(std::u16string const& name, WorkspaceEntryImplData const* entry) = 0;
    virtual void DoLoadWorkspace(std::u16string const& name, WorkspaceEntryImplData const* entry,
                                 orvcore::proplist::PropList& out) = 0;
    virtual bool LoadManagerSettings(orvcore::proplist::PropList& out) = 0;
    virtual void SaveManagerSettings(orvcore::proplist::PropList const& list) = 0;
    virtual void ClearManagerSettings() = 0;
    // Whether a settings document exists but cannot be read: it counts as absent, is not written
    // over at start-up, and is replaced by the next flush.
    virtual bool ManagerSettingsDamaged() const { return false; }
    virtual std::u16string GetUserWorkspaceFolder() const = 0;
    virtual std::unique_ptr<WorkspaceEntryImplData> DoArchiveWorkspace(std::u16string const& fileName) = 0;

    // Adds (or replaces) an entry for a file; a name made from a "$$$" key is localised and the key
    // kept. Nothing for an empty name.
    static void AddEntry(Table& table, std::u16string const& path, std::u16string name);
    // The localisation key a new workspace of this name stores, or empty.
    std::u16string NameKeyFor(std::u16string const& name) const;
    std::unordered_set<std::u16string>& KnownFiles() { return knownFiles_; }
    BuiltInWorkspaceProviderBase* BuiltInProvider() const { return builtIn_; }
    SystemWorkspaceProviderBase* SystemProvider() const { return system_; }

private:
    void CheckInitialized() const;
    // Both read the settings document Initialize loaded once (haveSettings: there was one).
    void ReadSettingsCache(orvcore::proplist::PropList const& settings, bool haveSettings);
    void AddBuiltInPlaceholders(orvcore::proplist::PropList settings, bool haveSettings);
    bool IsBuiltIn(std::u16string const& name) const;
    // Lays a built-in workspace out from its builder; false when the provider has none.
    bool LayOutBuiltIn(std::u16string const& name);
    // The same, then written as the user file the name maps to from now on.
    bool LayOutBuiltInAsUserWorkspace(std::u16string const& name);
    // A new user file's entry; raises CannotCreateWorkspace when none can be made.
    std::unique_ptr<WorkspaceEntryImplData> NewUserWorkspace(std::u16string const& name);
    // Writes the live arrangement as the name's file and as its archived first layout.
    void KeepAsUserWorkspaceWithArchive(std::u16string const& name,
                                        std::unique_ptr<WorkspaceEntryImplData> entry);
    WorkspaceEntryImplData* CopySystemWorkspace(std::u16string const& name);
    void SaveCurrent();
    void RebuildAll();
    void NotifyCurrent(std::u16string const& name);

    BuiltInWorkspaceProviderBase* builtIn_;
    SystemWorkspaceProviderBase* system_;
    // Files whose cached record matched at start-up (only asked whether it holds a path).
    std::unordered_set<std::u16string> knownFiles_;
    Workspace& workspace_;
    std::u16string current_;
    Table workspaces_;
    Table archives_;
    Table systems_;
    bool initialized_ = false;
    bool sizeMainFrame_;
    std::vector<MenuHelperBase*> helpers_;
    std::int32_t loading_ = 0;
    bool forceConstraintLayout_ = false;
};

} // namespace orvworkspace::workspace
