// The manager's storage as files.
#include "manager/Manager.h"

#include "host/core/Error.h"
#include "host/core/File.h"
#include "host/core/FileUtils.h"
#include "host/core/PropList.h"
#include "host/core/PropListUtils.h"
#include "persistence/WorkspaceDocument.h"
#include "workspace/Workspace.h"

namespace orvworkspace::workspace {

using orvcore::proplist::PropList;
using orvcore::utility::FileUtils;

Manager::Manager(Workspace& workspace, std::u16string savedFolder, std::u16string archiveFolder,
                 std::u16string settingsFile, BuiltInWorkspaceProviderBase* builtIn,
                 SystemWorkspaceProviderBase* system, bool sizeMainFrame)
    : ManagerBase(workspace, builtIn, system, sizeMainFrame)
    , savedFolder_(std::move(savedFolder))
    , archiveFolder_(std::move(archiveFolder))
    , settingsFile_(std::move(settingsFile)) {}

Manager::Manager(Workspace& workspace, std::u16string savedFolder, std::u16string archiveFolder,
                 std::u16string settingsFile, BuiltInWorkspaceProviderBase* builtIn, bool sizeMainFrame)
    : Manager(workspace, std::move(savedFolder), std::move(archiveFolder), std::move(settingsFile), builtIn,
              nullptr, sizeMainFrame) {}

namespace {
// The ".xml" extension as File::GetExtension sees it (a name that is only ".xml" has none), without
// building a path object for every file of a large folder.
bool HasXmlExtension(std::u16string const& path) {
    std::size_t n = path.size();
    return n > 4 && path.compare(n - 4, 4, u".xml") == 0 && path[n - 5] != u'/';
}
} // namespace

void Manager::ScanFolder(std::u16string const& folder, Table& table) {
    std::vector<std::u16string> files;
    FileUtils::ContainedFiles(folder, files);
    for (std::u16string const& path : files) {
        if (KnownFiles().count(path) || !HasXmlExtension(path)) {
            continue;
        }
        PropList document;
        ++filesRead_;
        try {
            orvcore::proplist::utils::LoadPropList(path, document, true);
        } catch (orvcore::config::Error const&) {
            continue; // unreadable or damaged: not a workspace
        }
        if (!document.IsEmpty() && IsCompatibleVersion(document)) {
            AddEntry(table, path, GetWorkspaceUserName(document));
        }
    }
}

void Manager::PopulateUserWorkspaces(Table& workspaces, Table& archives) {
    ScanFolder(savedFolder_, workspaces);
    ScanFolder(archiveFolder_, archives);
}

void Manager::PopulateSystemWorkspaces(Table& workspaces, Table& systems) {
    SystemWorkspaceProviderBase* provider = SystemProvider();
    if (!provider) {
        systems.clear();
        return;
    }
    std::u16string folder;
    provider->GetSystemWorkspaceFolder(folder);
    if (!folder.empty() && FileUtils::DirectoryExists(folder)) {
        Table scanned;
        ScanFolder(folder, scanned);
        for (auto& [name, entry] : scanned) {
            if (!systems.count(name)) {
                systems[name] = std::move(entry); // a valid cached record wins over the scan
            }
        }
    }
    std::vector<std::u16string> names;
    for (auto const& entry : systems) {
        names.push_back(entry.first);
        if (!workspaces.count(entry.first)) {
            workspaces[entry.first] = nullptr;
        }
    }
    provider->InitWorkspaceNameList(names);
}

std::unique_ptr<WorkspaceEntryImplData> Manager::DoCreateUserWorkspace(std::u16string const& name) {
    std::u16string path = FileUtils::UniqueFileName(savedFolder_, u"UserWorkspace", u".xml");
    if (path.empty()) {
        return nullptr;
    }
    // A workspace whose file cannot even be made is not made (the caller reports it).
    if (!FileUtils::CreateNewFile(path) && !FileUtils::FileExists(path)) {
        return nullptr;
    }
    return std::make_unique<ManagerEntryImplData>(path, NameKeyFor(name));
}

std::unique_ptr<WorkspaceEntryImplData> Manager::DoArchiveWorkspace(std::u16string const& fileName) {
    std::u16string path;
    FileUtils::BuildPathSpec(archiveFolder_, fileName, path);
    FileUtils::CreateNewFile(path);
    return std::make_unique<ManagerEntryImplData>(path, u"");
}

bool Manager::DoSaveWorkspace(std::u16string const& name, WorkspaceEntryImplData const* entry) {
    if (!entry) {
        return false;
    }
    auto const* data = dynamic_cast<ManagerEntryImplData const*>(entry);
    std::u16string userName = data && !data->GetNameKey().empty() ? data->GetNameKey() : name;
    PropList list;
    orvworkspace::workspace::SaveWorkspace(GetWorkspace(), list, userName);
    try {
        // Written beside the old file and renamed over it: the old file stays whole until then.
        orvcore::proplist::utils::SavePropList(entry->GetFilePath(), list);
    } catch (orvcore::config::Error const&) {
        return false;
    }
    return true;
}

bool Manager::DoDeleteWorkspace(std::u16string const&, WorkspaceEntryImplData const* entry) {
    return entry && FileUtils::RemoveFile(entry->GetFilePath());
}

void Manager::DoLoadWorkspace(std::u16string const&, WorkspaceEntryImplData const* entry, PropList& out) {
    if (entry) {
        orvcore::proplist::utils::LoadPropList(entry->GetFilePath(), out, true);
    }
}

bool Manager::LoadManagerSettings(PropList& out) {
    settingsDamaged_ = false;
    if (!FileUtils::FileExists(settingsFile_)) {
        return false;
    }
    try {
        orvcore::proplist::utils::LoadPropList(settingsFile_, out, true);
    } catch (orvcore::config::Error const&) {
        out = PropList();
        settingsDamaged_ = true; // counts as none, and is left as it is until the next flush
        return false;
    }
    return true;
}

void Manager::SaveManagerSettings(PropList const& list) {
    try {
        orvcore::proplist::utils::SavePropList(settingsFile_, list);
    } catch (orvcore::config::Error const&) {
        // The cache is only a cache: without it the next start scans the folders again.
    }
}

void Manager::ClearManagerSettings() {
    FileUtils::RemoveFile(settingsFile_);
    settingsDamaged_ = false;
}

} // namespace orvworkspace::workspace
