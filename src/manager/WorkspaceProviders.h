// What the manager keeps per workspace (an entry: the file it lives in) and the host's two sources
// of workspaces it did not make itself: built-in ones laid out by builders, and system ones shipped
// as files in a folder.
#pragma once

#include <list>
#include <memory>
#include <string>
#include <vector>

namespace orvworkspace::workspace {

class Workspace;
class WorkspaceBuilder;

class WorkspaceEntryImplData {
public:
    virtual ~WorkspaceEntryImplData() = default;
    virtual std::u16string GetFilePath() const = 0;
};

// A workspace file; nameKey is the localisation string the name was made from (empty when none),
// which the file stores as its user name so that the name follows the user's language.
class ManagerEntryImplData : public WorkspaceEntryImplData {
public:
    ManagerEntryImplData(std::u16string filePath, std::u16string nameKey)
        : filePath_(std::move(filePath))
        , nameKey_(std::move(nameKey)) {}
    std::u16string GetFilePath() const override { return filePath_; }
    std::u16string const& GetNameKey() const { return nameKey_; }

private:
    std::u16string filePath_;
    std::u16string nameKey_;
};

class WorkspaceProviderBase {
public:
    virtual void GetWorkspaces(std::vector<std::u16string>& out) const = 0;
    virtual ~WorkspaceProviderBase() = default;
};

class BuiltInWorkspaceProviderBase : public WorkspaceProviderBase {
public:
    virtual bool SupportsLocalizedWorkspaceNames() const { return false; }
    // One localisation string per built-in workspace, when names are localised.
    virtual void GetWorkspaceStringKeys(std::list<std::string>&) const {}
    // The builder that lays out a built-in workspace; null for a name it does not know.
    virtual std::unique_ptr<WorkspaceBuilder> CreateWorkspaceBuilder(std::u16string const& name,
                                                                     Workspace& workspace) const = 0;
};

class SystemWorkspaceProviderBase : public WorkspaceProviderBase {
public:
    void GetWorkspaces(std::vector<std::u16string>& out) const override {
        out.insert(out.end(), names_.begin(), names_.end());
    }
    // The folder of the shipped workspace files; empty when there is none.
    virtual void GetSystemWorkspaceFolder(std::u16string& folder) const = 0;
    bool FindWorkspace(std::u16string const& name) const;
    // The manager replaces the names with what it found in the folder.
    void InitWorkspaceNameList(std::vector<std::u16string> names) { names_ = std::move(names); }

private:
    std::vector<std::u16string> names_;
};

inline bool SystemWorkspaceProviderBase::FindWorkspace(std::u16string const& name) const {
    for (auto const& n : names_) {
        if (n == name) {
            return true;
        }
    }
    return false;
}

// Told by the manager when its list of names or its current workspace changes (menus, popups).
class MenuHelperBase {
public:
    virtual ~MenuHelperBase() = default;
    virtual void RebuildMenu() = 0;
    virtual void NewActiveWorkspace(std::u16string const& name) = 0;
};

} // namespace orvworkspace::workspace
