// The workspace manager over files: user workspaces in one folder, their archived first layouts in
// another, the settings document in a file (see GetWorkspaceDirs). Every file is written through a
// temporary file renamed over the old one, so a failed write (a full disk, a crash) leaves the
// previous file whole.
#pragma once

#include "manager/ManagerBase.h"

namespace orvworkspace::workspace {

class Manager : public ManagerBase {
public:
    Manager(Workspace& workspace, std::u16string savedFolder, std::u16string archiveFolder,
            std::u16string settingsFile, BuiltInWorkspaceProviderBase* builtIn,
            SystemWorkspaceProviderBase* system, bool sizeMainFrame);
    Manager(Workspace& workspace, std::u16string savedFolder, std::u16string archiveFolder,
            std::u16string settingsFile, BuiltInWorkspaceProviderBase* builtIn, bool sizeMainFrame);

    // How many workspace files the folder scans have read (what a warm start avoids).
    std::size_t GetFilesRead() const { return filesRead_; }

protected:
    void PopulateSystemWorkspaces(Table& workspaces, Table& systems) override;
    void PopulateUserWorkspaces(Table& workspaces, Table& archives) override;
    std::unique_ptr<WorkspaceEntryImplData> DoCreateUserWorkspace(std::u16string const& name) override;
    bool DoSaveWorkspace(std::u16string const& name, WorkspaceEntryImplData const* entry) override;
    bool DoDeleteWorkspace(std::u16string const& name, WorkspaceEntryImplData const* entry) override;
    void DoLoadWorkspace(std::u16string const& name, WorkspaceEntryImplData const* entry,
                         orvcore::proplist::PropList& out) override;
    bool LoadManagerSettings(orvcore::proplist::PropList& out) override;
    void SaveManagerSettings(orvcore::proplist::PropList const& list) override;
    void ClearManagerSettings() override;
    bool ManagerSettingsDamaged() const override { return settingsDamaged_; }
    std::u16string GetUserWorkspaceFolder() const override { return savedFolder_; }
    std::unique_ptr<WorkspaceEntryImplData> DoArchiveWorkspace(std::u16string const& fileName) override;

private:
    // Reads every unknown ".xml" workspace file of a folder into a table; unreadable, empty and
    // foreign files are skipped.
    void ScanFolder(std::u16string const& folder, Table& table);

    std::u16string savedFolder_;
    std::u16string archiveFolder_;
    std::u16string settingsFile_;
    std::size_t filesRead_ = 0;
    bool settingsDamaged_ = false;
};

} // namespace orvworkspace::workspace
