// Named resources compiled into the library, by type and name: the PNG images the workspace draws
// with ("closebox", "gripper", "DownArrow", "SP_PopupToolSelect_5x5_N") and, later, text resources.
// The images are drawn by code on first use and kept as PNG bytes. A missing resource is empty.
#pragma once

#include <map>
#include <string>
#include <utility>

namespace orvui::utility {

class ResourceManager {
public:
    ResourceManager();

    // The bytes of a resource ("png" for images), empty when there is none.
    std::string GetResource(std::string const& type, std::string const& name) const;
    bool HasResource(std::string const& type, std::string const& name) const;
    // Adds or replaces a resource (a host may bring its own).
    void AddResource(std::string const& type, std::string const& name, std::string bytes);
    // Sets the desktop's cursor by number (see orvui::ui::cursor); cursors are resources of the
    // platform's.
    void SetCursor(int cursor) const;

private:
    std::map<std::pair<std::string, std::string>, std::string> resources_;
};

} // namespace orvui::utility
