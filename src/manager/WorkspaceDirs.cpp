// The workspace folders inside the preferences folder.
#include "manager/WorkspaceDirs.h"

#include "host/core/Dir.h"
#include "host/core/File.h"

namespace orvworkspace::workspaceutils {

void GetWorkspaceDirs(void const*, std::u16string& savedFolder, std::u16string& archiveFolder,
                      std::u16string& settingsFile) {
    orvcore::filesupport::Dir prefs = orvcore::filesupport::Dir::PrefDir();
    orvcore::filesupport::Dir saved(prefs, u"SavedWorkspaces");
    orvcore::filesupport::Dir archived(prefs, u"ArchivedWorkspaces");
    saved.Create();
    archived.Create();
    savedFolder = saved.FullPath();
    archiveFolder = archived.FullPath();
    settingsFile = orvcore::filesupport::File(prefs, u"WSMgrCfg").FullPath();
}

} // namespace orvworkspace::workspaceutils
