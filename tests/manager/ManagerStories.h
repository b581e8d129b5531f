// The manager's test fixture: a host workspace on the headless desktop, a temporary preferences
// folder, two built-in workspaces, and helpers to start, restart and look at the manager.
#pragma once

#include "workspace/WorkspaceDoubles.h"

#include "host/core/FileUtils.h"
#include "host/core/PropListUtils.h"
#include "host/core/TextConversion.h"
#include "manager/Manager.h"
#include "manager/WorkspaceDirs.h"
#include "persistence/WorkspaceBuilder.h"
#include "persistence/WorkspaceDocument.h"
#include "support/TempDir.h"

#include <cstdlib>
#include <memory>

namespace orvtest {

using orvcore::proplist::PropList;
using orvcore::utility::FileUtils;
using orvui::ui::RectT;

// Two built-in workspaces: "Editing" (editor | browser) and "Mixing" (a mixer alone).
class BuiltIns : public BuiltInWorkspaceProviderBase {
public:
    void GetWorkspaces(std::vector<std::u16string>& out) const override {
        out.insert(out.end(), names.begin(), names.end());
    }
    std::unique_ptr<WorkspaceBuilder> CreateWorkspaceBuilder(std::u16string const& name,
                                                             Workspace& ws) const override {
        ++builds;
        auto builder = std::make_unique<WorkspaceBuilder>(ws, true, false);
        RectT rect(100, 80, 1000, 700);
        if (name == u"Editing") {
            builder->AddWindow(std::make_unique<SplitterBuilder>(true,
                                                                 std::make_unique<FrameBuilder>("editor"),
                                                                 std::make_unique<FrameBuilder>("browser")),
                               rect, "");
        } else if (name == u"Mixing") {
            builder->AddWindow(std::make_unique<FrameBuilder>("mixer"), rect, "");
        } else {
            return nullptr;
        }
        return builder;
    }
    std::vector<std::u16string> names{u"Editing", u"Mixing"};
    mutable int builds = 0;
};

class ManagerStories : public WorkspaceTest {
protected:
    void SetUp() override {
        setenv("ORV_PREFS_DIR", prefs.Path().string().c_str(), 1);
        WorkspaceTest::SetUp();
        orvworkspace::workspaceutils::GetWorkspaceDirs(nullptr, saved, archived, settings);
    }
    void TearDown() override {
        manager.reset();
        WorkspaceTest::TearDown();
        unsetenv("ORV_PREFS_DIR");
    }
    Manager& Start(BuiltInWorkspaceProviderBase* builtIn = nullptr,
                   SystemWorkspaceProviderBase* system = nullptr) {
        manager = std::make_unique<Manager>(*workspace, saved, archived, settings, builtIn, system, false);
        manager->Initialize();
        return *manager;
    }
    void Restart(BuiltInWorkspaceProviderBase* builtIn = nullptr,
                 SystemWorkspaceProviderBase* system = nullptr) {
        manager.reset();
        Start(builtIn, system);
    }
    // The live arrangement, shipped as a system workspace file in a folder.
    void Ship(TempDir const& folder, std::u16string const& name) {
        PropList document;
        SaveWorkspace(*workspace, document, name);
        orvcore::proplist::utils::SavePropList(folder.U16(orvcore::utility::UTF16to8(name) + ".xml"),
                                               document);
    }
    std::vector<std::u16string> Names() const {
        std::vector<std::u16string> names;
        manager->GetWorkspaces(names);
        return names;
    }
    std::vector<std::u16string> FilesIn(std::u16string const& folder) const {
        std::vector<std::u16string> files;
        FileUtils::ContainedFiles(folder, files);
        return files;
    }
    std::vector<std::string> FrameTypes() const {
        std::vector<std::string> types;
        for (unsigned long f = 0; f < main->GetFrameCount(); ++f) {
            types.push_back(main->GetFrame(f)->GetFrontTabPanel()->GetTabType());
        }
        return types;
    }

    TempDir prefs;
    std::u16string saved, archived, settings;
    std::unique_ptr<Manager> manager;
};

} // namespace orvtest
