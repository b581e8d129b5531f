// Where a host keeps its workspaces: folders and the settings file inside the user's preferences.
#pragma once

#include <string>

namespace orvworkspace::workspaceutils {

// savedFolder: "SavedWorkspaces" in the preferences folder, archiveFolder: "ArchivedWorkspaces"
// there (both made when missing), settingsFile: the path of "WSMgrCfg" there (not made). The first
// argument is not read.
void GetWorkspaceDirs(void const* ignored, std::u16string& savedFolder, std::u16string& archiveFolder,
                      std::u16string& settingsFile);

} // namespace orvworkspace::workspaceutils
