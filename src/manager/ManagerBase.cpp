// The manager's rules: tables, the settings cache, switching, creating, deleting, resetting.
#include "manager/ManagerBase.h"

#include "host/core/DateTime.h"
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/File.h"
#include "host/core/FileTimes.h"
#include "host/core/FileUtils.h"
#include "host/core/Localizer.h"
#include "host/core/PropList.h"
#include "host/core/TextConversion.h"
#include "persistence/WorkspaceBuilder.h"
#include "persistence/WorkspaceDocument.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <cctype>

namespace orvworkspace::workspace {

using orvcore::config::ThrowError;
using orvcore::proplist::PropList;
using orvcore::utility::UTF16to8;
using orvcore::utility::UTF8to16;

namespace {

constexpr char const* ConfigVersion = "1.1";

// Restores the counter on every way out, an exception included.
struct Counting {
    explicit Counting(std::int32_t& c)
        : count(c) {
        ++count;
    }
    ~Counting() { --count; }
    std::int32_t& count;
};

std::u16string Localized(std::string const& key) {
    return orvcore::config::Localizer::Get().Localize(key);
}

// The list under the key as stored when it has the kind asked for, else a converted copy in copy.
template <typename T>
std::vector<T> const& ListOf(PropList const& list, std::string const& key, std::vector<T>& copy) {
    if (auto const* stored = list.Peek<std::vector<T>>(key)) {
        return *stored;
    }
    list.GetValue(key, copy);
    return copy;
}

std::u16string FileNameOf(std::u16string const& path) {
    return orvcore::filesupport::File(path).GetName();
}

} // namespace

ManagerBase::ManagerBase(Workspace& workspace, BuiltInWorkspaceProviderBase* builtIn,
                         SystemWorkspaceProviderBase* system, bool sizeMainFrame)
    : builtIn_(builtIn)
    , system_(system)
    , workspace_(workspace)
    , sizeMainFrame_(sizeMainFrame) {}

ManagerBase::ManagerBase(Workspace& workspace, BuiltInWorkspaceProviderBase* builtIn, bool sizeMainFrame)
    : ManagerBase(workspace, builtIn, nullptr, sizeMainFrame) {}

ManagerBase::~ManagerBase() = default;

void ManagerBase::CheckInitialized() const {
    if (!initialized_) {
        ThrowError(orvcore::config::errors::WorkspaceManagerNotInitialized);
    }
}

// --- Start-up ---

void ManagerBase::Initialize() {
    if (initialized_) {
        ThrowError(orvcore::config::errors::WorkspaceManagerAlreadyInitialized);
    }
    PropList settings;
    bool haveSettings = LoadManagerSettings(settings);
    ReadSettingsCache(settings, haveSettings);
    AddBuiltInPlaceholders(std::move(settings), haveSettings);
    PopulateSystemWorkspaces(workspaces_, systems_);
    PopulateUserWorkspaces(workspaces_, archives_);
    initialized_ = true;
}

void ManagerBase::AddEntry(Table& table, std::u16string const& path, std::u16string name) {
    std::u16string nameKey;
    if (name.size() > 4 && name.compare(0, 3, u"$$$") == 0) {
        nameKey = name;
        name = Localized(UTF16to8(nameKey));
    }
    if (name.empty()) {
        return;
    }
    table[name] = std::make_unique<ManagerEntryImplData>(path, nameKey);
}

void ManagerBase::ReadSettingsCache(PropList const& settings, bool haveSettings) {
    if (!haveSettings) {
        return;
    }
    std::string version;
    settings.GetValue("WorkspaceConfigVersion", version);
    if (version != ConfigVersion) {
        return;
    }
    // The lists are read where they lie when they have the kinds written here; a document written
    // otherwise (texts stored as UTF-8, say) is read through copies.
    std::vector<std::string> timesCopy;
    std::vector<std::u16string> pathsCopy, namesCopy;
    std::vector<std::int32_t> typesCopy;
    auto const& times = ListOf(settings, "ModifiedTimes", timesCopy);
    auto const& paths = ListOf(settings, "FilePaths", pathsCopy);
    auto const& names = ListOf(settings, "UserNames", namesCopy);
    auto const& types = ListOf(settings, "WorkspaceTypes", typesCopy);
    if (paths.size() != times.size() || names.size() != times.size() || types.size() != times.size()) {
        return; // records that do not line up are no records
    }
    // One look at each file, all at once: a missing one has no time.
    std::vector<boost::posix_time::ptime> modifiedTimes = orvcore::filesupport::ModifiedTimes(paths);
    for (std::size_t i = 0; i < times.size(); ++i) {
        boost::posix_time::ptime modified = modifiedTimes[i];
        if (modified.is_special() || orvcore::utility::ToIsoString(modified) != times[i]) {
            continue; // changed or gone: the folder scans find it again
        }
        knownFiles_.insert(paths[i]);
        switch (types[i]) {
        case 0:
            AddEntry(archives_, paths[i], names[i]);
            break;
        case 1:
            AddEntry(workspaces_, paths[i], names[i]);
            break;
        case 2:
            AddEntry(systems_, paths[i], names[i]);
            break;
        default:
            break;
        }
    }
}

void ManagerBase::AddBuiltInPlaceholders(PropList settings, bool haveSettings) {
    bool localized = builtIn_ && builtIn_->SupportsLocalizedWorkspaceNames();
    if (haveSettings) {
        std::vector<std::u16string> names;
        bool listed = false;
        if (settings.HasKey("BuiltInKeys")) {
            std::vector<std::string> keys;
            settings.GetValue("BuiltInKeys", keys);
            for (std::string const& key : keys) {
                names.push_back(Localized(key));
            }
            listed = true;
        } else if (!localized && settings.HasKey("BuiltIns")) {
            settings.GetValue("BuiltIns", names);
            listed = true;
        }
        if (listed) {
            for (std::u16string const& name : names) {
                if (!workspaces_.count(name)) {
                    workspaces_[name] = nullptr;
                }
            }
            return;
        }
    }
    if (!builtIn_) {
        return;
    }
    std::vector<std::u16string> provided, added;
    builtIn_->GetWorkspaces(provided);
    for (std::u16string const& name : provided) {
        if (!workspaces_.count(name)) {
            workspaces_[name] = nullptr;
            added.push_back(name);
        }
    }
    if (localized) {
        std::list<std::string> keys;
        builtIn_->GetWorkspaceStringKeys(keys);
        settings.SetValue("BuiltInKeys", std::vector<std::string>(keys.begin(), keys.end()));
        settings.SetValue("BuiltIns", std::vector<std::u16string>());
    } else {
        settings.SetValue("BuiltIns", added);
    }
    if (!ManagerSettingsDamaged()) {
        SaveManagerSettings(settings);
    }
}

// --- Settings ---

void ManagerBase::FlushManagerSettings() {
    PropList settings;
    if (!LoadManagerSettings(settings) && !ManagerSettingsDamaged()) {
        return; // no settings document yet: the records wait for one
    }
    settings.SetValue("WorkspaceConfigVersion", std::string(ConfigVersion));
    PropList* window = settings.GetSubList("MainWndPos");
    if (!window) {
        window = settings.NewSubList("MainWndPos");
    }
    if (TopLevelWindow* main = workspace_.GetMainTopLevelWindow()) {
        main->SaveWindowStateData(*window);
    }
    std::vector<std::string> times;
    std::vector<std::u16string> paths, names;
    std::vector<std::int32_t> types;
    std::int32_t type = 0;
    for (Table const* table : {&archives_, &workspaces_, &systems_}) {
        for (auto const& [name, entry] : *table) {
            if (!entry) {
                continue;
            }
            orvcore::filesupport::File file(entry->GetFilePath());
            if (!file.Exists()) {
                continue;
            }
            times.push_back(orvcore::utility::ToIsoString(file.Modified()));
            paths.push_back(entry->GetFilePath());
            names.push_back(name);
            types.push_back(type);
        }
        ++type;
    }
    settings.SetValue("ModifiedTimes", times);
    settings.SetValue("FilePaths", paths);
    settings.SetValue("UserNames", names);
    settings.SetValue("WorkspaceTypes", types);
    SaveManagerSettings(settings);
}

void ManagerBase::ApplyDefaultMainWindowSize() {
    TopLevelWindow* main = workspace_.GetMainTopLevelWindow();
    if (!main) {
        return;
    }
    PropList settings;
    if (LoadManagerSettings(settings)) {
        if (PropList const* state = settings.GetSubList("MainWndPos");
            state && main->RestoreWindowStateData(*state)) {
            return;
        }
    }
    main->ApplyDefaultWindowState();
}

// --- Names ---

void ManagerBase::GetWorkspaces(std::vector<std::u16string>& out) const {
    CheckInitialized();
    for (auto const& entry : workspaces_) {
        out.push_back(entry.first);
    }
}

void ManagerBase::GetUISortedWorkspaceNames(std::vector<std::u16string>& out) const {
    std::size_t first = out.size();
    GetWorkspaces(out);
    auto fold = [](char16_t c) { return c < 128 ? char16_t(std::tolower(int(c))) : c; };
    auto before = [&](std::u16string const& a, std::u16string const& b) {
        return std::lexicographical_compare(a.begin(), a.end(), b.begin(), b.end(),
                                            [&](char16_t x, char16_t y) { return fold(x) < fold(y); });
    };
    // Descending: a menu filled from the top, one name after the other, then reads ascending.
    std::stable_sort(out.begin() + long(first), out.end(),
                     [&](std::u16string const& a, std::u16string const& b) { return before(b, a); });
}

std::u16string ManagerBase::NameKeyFor(std::u16string const& name) const {
    if (!builtIn_ || !builtIn_->SupportsLocalizedWorkspaceNames()) {
        return {};
    }
    std::list<std::string> keys;
    builtIn_->GetWorkspaceStringKeys(keys);
    for (std::string const& key : keys) {
        if (Localized(key) == name) {
            return UTF8to16(key);
        }
    }
    return {};
}

bool ManagerBase::IsBuiltIn(std::u16string const& name) const {
    if (!builtIn_) {
        return false;
    }
    std::vector<std::u16string> names;
    builtIn_->GetWorkspaces(names);
    return std::find(names.begin(), names.end(), name) != names.end();
}

// --- Helpers ---

void ManagerBase::AddMenuHelper(MenuHelperBase* helper) {
    if (!helper) {
        return;
    }
    helpers_.push_back(helper);
    try {
        helper->RebuildMenu();
        if (!current_.empty()) {
            helper->NewActiveWorkspace(current_);
        }
    } catch (...) {
        // A helper that fails its first rebuild (its constructor then throws, so nothing will ever
        // remove it) must not stay listed.
        RemoveMenuHelper(helper);
        throw;
    }
}

void ManagerBase::RemoveMenuHelper(MenuHelperBase* helper) {
    auto found = std::find(helpers_.begin(), helpers_.end(), helper);
    if (found != helpers_.end()) {
        helpers_.erase(found);
    }
}

void ManagerBase::RebuildAll() {
    for (MenuHelperBase* helper : std::vector<MenuHelperBase*>(helpers_)) {
        helper->RebuildMenu();
    }
}

void ManagerBase::NotifyCurrent(std::u16string const& name) {
    current_ = name;
    for (MenuHelperBase* helper : std::vector<MenuHelperBase*>(helpers_)) {
        helper->NewActiveWorkspace(current_);
    }
}

// --- Switching ---

void ManagerBase::SaveCurrent() {
    if (current_.empty()) {
        return;
    }
    auto found = workspaces_.find(current_);
    if (found != workspaces_.end() && found->second) {
        DoSaveWorkspace(current_, found->second.get());
    }
}

void ManagerBase::GetCurrentWorkspace(PropList& out) const {
    orvworkspace::workspace::SaveWorkspace(workspace_, out, u"");
}

bool ManagerBase::LayOutBuiltIn(std::u16string const& name) {
    std::unique_ptr<WorkspaceBuilder> builder =
        builtIn_ ? builtIn_->CreateWorkspaceBuilder(name, workspace_) : nullptr;
    if (!builder) {
        return false;
    }
    if (builder->UsePropList()) {
        RestoreWorkspace(workspace_, builder->GetPropList(), sizeMainFrame_, true, forceConstraintLayout_);
    } else {
        builder->BuildWorkspace();
    }
    return true;
}

bool ManagerBase::LayOutBuiltInAsUserWorkspace(std::u16string const& name) {
    if (!LayOutBuiltIn(name)) {
        return false;
    }
    std::unique_ptr<WorkspaceEntryImplData> made = NewUserWorkspace(name);
    DoSaveWorkspace(name, made.get());
    workspaces_[name] = std::move(made);
    return true;
}

std::unique_ptr<WorkspaceEntryImplData> ManagerBase::NewUserWorkspace(std::u16string const& name) {
    std::unique_ptr<WorkspaceEntryImplData> entry = DoCreateUserWorkspace(name);
    if (!entry) {
        ThrowError(orvcore::config::errors::CannotCreateWorkspace);
    }
    return entry;
}

void ManagerBase::KeepAsUserWorkspaceWithArchive(std::u16string const& name,
                                                 std::unique_ptr<WorkspaceEntryImplData> entry) {
    DoSaveWorkspace(name, entry.get());
    std::u16string fileName = FileNameOf(entry->GetFilePath());
    workspaces_[name] = std::move(entry);
    if (std::unique_ptr<WorkspaceEntryImplData> archive = DoArchiveWorkspace(fileName)) {
        DoSaveWorkspace(name, archive.get());
        archives_[name] = std::move(archive);
    }
}

WorkspaceEntryImplData* ManagerBase::CopySystemWorkspace(std::u16string const& name) {
    if (!system_) {
        return nullptr;
    }
    auto found = systems_.find(name);
    if (found == systems_.end() || !found->second) {
        return nullptr;
    }
    std::u16string from = found->second->GetFilePath();
    std::u16string fileName = FileNameOf(from);
    if (!fileName.empty()) {
        std::u16string target;
        orvcore::utility::FileUtils::BuildPathSpec(GetUserWorkspaceFolder(), fileName, target);
        if (!orvcore::utility::FileUtils::FileExists(target) &&
            !orvcore::utility::FileUtils::Copy(from, target)) {
            return nullptr; // a copy that failed must not become the user's workspace
        }
        auto* system = dynamic_cast<ManagerEntryImplData*>(found->second.get());
        workspaces_[name] =
            std::make_unique<ManagerEntryImplData>(target, system ? system->GetNameKey() : u"");
        orvcore::utility::FileUtils::RemoveReadOnlyAttribute(target);
    }
    auto entry = workspaces_.find(name);
    return entry == workspaces_.end() ? nullptr : entry->second.get();
}

bool ManagerBase::SetCurrentWorkspace(std::u16string const& name) {
    Counting loading(loading_);
    CheckInitialized();
    if (name == current_) {
        return true;
    }
    SaveCurrent();
    WorkspaceEntryImplData* entry = nullptr;
    if (auto found = workspaces_.find(name); found != workspaces_.end()) {
        entry = found->second.get();
    }
    if (!entry && systems_.count(name) && systems_[name]) {
        entry = CopySystemWorkspace(name);
        if (!entry) {
            return false;
        }
    }
    bool result = true;
    if (entry) {
        PropList document;
        DoLoadWorkspace(name, entry, document);
        result = RestoreWorkspace(workspace_, document, sizeMainFrame_, false, false);
        if (!result) {
            return false;
        }
    } else {
        if (!LayOutBuiltInAsUserWorkspace(name)) {
            return false;
        }
    }
    NotifyCurrent(name);
    return result;
}

// --- Creating, adding, saving ---

void ManagerBase::CreateUserWorkspace(std::u16string const& name) {
    CheckInitialized();
    if (workspaces_.count(name)) {
        ThrowError(orvcore::config::errors::WorkspaceAlreadyExists);
    }
    SaveCurrent();
    KeepAsUserWorkspaceWithArchive(name, NewUserWorkspace(name));
    current_ = name;
    RebuildAll();
    NotifyCurrent(name);
}

bool ManagerBase::AddWorkspace(std::u16string const& name, PropList& document, bool replace) {
    if (name.empty()) {
        return false;
    }
    auto found = workspaces_.find(name);
    if (found != workspaces_.end()) {
        if (!replace) {
            return false;
        }
        SaveCurrent();
        if (found->second) {
            DoSaveWorkspace(name, found->second.get());
        } else {
            if (!LayOutBuiltInAsUserWorkspace(name)) {
                return false;
            }
        }
        bool ok = RestoreWorkspace(workspace_, document, sizeMainFrame_, true, forceConstraintLayout_);
        if (ok) {
            NotifyCurrent(name);
        }
        return ok;
    }
    std::unique_ptr<WorkspaceEntryImplData> entry = NewUserWorkspace(name);
    bool ok = RestoreWorkspace(workspace_, document, sizeMainFrame_, true, forceConstraintLayout_);
    if (ok) {
        KeepAsUserWorkspaceWithArchive(name, std::move(entry));
        RebuildAll();
        NotifyCurrent(name);
    }
    return ok;
}

bool ManagerBase::SaveWorkspace(std::u16string const& name) {
    CheckInitialized();
    auto found = workspaces_.find(name);
    if (found == workspaces_.end() || !found->second) {
        return false; // a placeholder or an unknown name has no file to write
    }
    return DoSaveWorkspace(name, found->second.get());
}

void ManagerBase::DefaultingToProjectWorkspace() {
    CheckInitialized();
    SaveCurrent();
    current_.clear();
    for (MenuHelperBase* helper : std::vector<MenuHelperBase*>(helpers_)) {
        helper->NewActiveWorkspace(current_);
    }
}

// --- Deleting and resetting ---

void ManagerBase::DeleteUserWorkspace(std::u16string const& name) {
    CheckInitialized();
    auto found = workspaces_.find(name);
    if (found != workspaces_.end() && found->second) {
        if (DoDeleteWorkspace(name, found->second.get())) {
            workspaces_.erase(found);
            if (name == current_) {
                current_.clear();
            }
        }
    } else if (IsBuiltIn(name)) {
        workspaces_.erase(name);
    } else {
        ThrowError(orvcore::config::errors::UnknownWorkspace);
    }
    if (auto archive = archives_.find(name); archive != archives_.end() && archive->second) {
        DoDeleteWorkspace(name, archive->second.get());
        archives_.erase(archive);
    }
    PropList settings;
    if (LoadManagerSettings(settings)) {
        if (settings.HasKey("BuiltInKeys")) {
            std::vector<std::string> keys;
            settings.GetValue("BuiltInKeys", keys);
            auto key = std::find_if(keys.begin(), keys.end(),
                                    [&](std::string const& k) { return Localized(k) == name; });
            if (key != keys.end()) {
                keys.erase(key);
                settings.SetValue("BuiltInKeys", keys);
                SaveManagerSettings(settings);
            }
        } else if (settings.HasKey("BuiltIns")) {
            std::vector<std::u16string> names;
            settings.GetValue("BuiltIns", names);
            auto listed = std::find(names.begin(), names.end(), name);
            if (listed != names.end()) {
                names.erase(listed);
                settings.SetValue("BuiltIns", names);
                SaveManagerSettings(settings);
            }
        }
    }
    RebuildAll();
}

void ManagerBase::RevertWorkspace(std::u16string const& name) {
    CheckInitialized();
    auto fromFile = [&](WorkspaceEntryImplData const* entry) {
        PropList document;
        DoLoadWorkspace(name, entry, document);
        RestoreWorkspace(workspace_, document, sizeMainFrame_, false, false);
    };
    if (system_) {
        if (auto found = systems_.find(name); found != systems_.end() && found->second) {
            fromFile(found->second.get());
            return;
        }
    }
    if (auto found = archives_.find(name); found != archives_.end() && found->second) {
        fromFile(found->second.get());
        return;
    }
    if (!IsBuiltIn(name) || !LayOutBuiltIn(name)) {
        ThrowError(orvcore::config::errors::UnknownWorkspace);
    }
    current_ = name;
}

void ManagerBase::ResetWorkspaceMgr() {
    for (Table* table : {&workspaces_, &archives_}) {
        for (auto const& [name, entry] : *table) {
            if (entry) {
                DoDeleteWorkspace(name, entry.get());
            }
        }
        table->clear();
    }
    current_.clear();
    initialized_ = false;
    ClearManagerSettings();
    Initialize();
    RebuildAll();
}

} // namespace orvworkspace::workspace
