// The factory of one kind of panel, registered with the workspace under its tab type. It also
// answers what closing such a panel does: hide it, destroy it for good, and whether its state is
// still remembered when it is destroyed.
#pragma once

#include <boost/intrusive_ptr.hpp>
#include <string>

namespace orvworkspace::workspace {

class TabPanel;
class Workspace;
class WorkspaceFrameBase;

class TabCreator {
public:
    explicit TabCreator(std::string type = {})
        : tabType(std::move(type)) {}
    virtual ~TabCreator() = default;
    TabCreator(TabCreator const&) = delete;
    TabCreator& operator=(TabCreator const&) = delete;

    // A new panel of this type for the frame (which may be null).
    virtual boost::intrusive_ptr<TabPanel> CreateTabPanel(Workspace* workspace,
                                                          WorkspaceFrameBase* frame) const = 0;
    virtual bool HidesWhenClosed() const { return false; }
    virtual bool ObliteratesWhenClosed() const { return false; }
    virtual bool SavesStateWhenObliterated() const { return false; }

    std::string const& GetTabType() const { return tabType; }

protected:
    std::string tabType;
};

} // namespace orvworkspace::workspace
