// Builders: a default arrangement described in code (windows, a tree of splitters and frames, the
// tab types of each frame) and laid onto a live workspace the way a restore is, reusing the panels
// that exist. A WorkspaceBuilder may instead carry a ready workspace document (UsePropList).
#pragma once

#include "host/core/PropList.h"
#include "persistence/WorkspaceDocument.h"

#include <memory>
#include <string>
#include <vector>

namespace orvworkspace::workspace {

class WorkspaceFrame;

// Where a builder puts what it builds.
struct BuildContext {
    TopLevelWindow* window = nullptr;
    Splitter* parent = nullptr;
    bool leftOrTop = true;
    std::vector<boost::intrusive_ptr<WorkspaceFrame>>* frames = nullptr;
    ReusableTabPool* pool = nullptr;
};

class BuilderBase {
public:
    virtual ~BuilderBase() = default;
    virtual void Build(Workspace& workspace, TopLevelWindow& window, BuildContext& context) = 0;
};

class FrameBuilder : public BuilderBase {
public:
    explicit FrameBuilder(std::string const& tabType)
        : shown_{tabType} {}
    explicit FrameBuilder(std::vector<std::string> tabTypes)
        : shown_(std::move(tabTypes)) {}
    // A tab to show, or (remembered) one to keep as closed in the frame.
    void AddTab(std::string const& tabType, bool remembered);
    void SetFrontTabIdx(unsigned long index) { front_ = index; }
    void Build(Workspace& workspace, TopLevelWindow& window, BuildContext& context) override;

private:
    std::vector<std::string> shown_;
    std::vector<std::string> remembered_;
    unsigned long front_ = 0;
};

class SplitterBuilder : public BuilderBase {
public:
    explicit SplitterBuilder(bool vertical)
        : vertical_(vertical) {}
    SplitterBuilder(bool vertical, std::unique_ptr<BuilderBase> leftOrTop,
                    std::unique_ptr<BuilderBase> rightOrBottom)
        : vertical_(vertical)
        , first_(std::move(leftOrTop))
        , second_(std::move(rightOrBottom)) {}
    // Puts the builder on that side, replacing any builder there.
    void AddElement(std::unique_ptr<BuilderBase> builder, bool leftOrTop);
    void SetSplitVal(float placement) {
        placement_ = placement;
        placementSet_ = true;
    }
    void Build(Workspace& workspace, TopLevelWindow& window, BuildContext& context) override;

private:
    bool vertical_;
    std::unique_ptr<BuilderBase> first_;
    std::unique_ptr<BuilderBase> second_;
    float placement_ = 0.5f;
    bool placementSet_ = false;
};

class WorkspaceBuilder {
public:
    // usePropList is what UsePropList answers; resetFlag is kept for the host (GetResetFlag): the
    // root-frame reset of this library needs no such switch.
    WorkspaceBuilder(Workspace& workspace, bool resetFlag, bool usePropList)
        : workspace_(workspace)
        , resetFlag_(resetFlag)
        , usePropList_(usePropList) {}

    void AddWindow(std::unique_ptr<BuilderBase> root, RectT const& globalRect,
                   std::string const& toolBarTabType);
    void BuildWorkspace();
    orvcore::proplist::PropList& GetPropList() { return propList_; }
    bool UsePropList() const { return usePropList_; }
    bool GetResetFlag() const { return resetFlag_; }

private:
    struct WindowRecord {
        std::unique_ptr<BuilderBase> root;
        RectT rect;
        std::string toolBarTabType;
    };

    Workspace& workspace_;
    bool resetFlag_;
    bool usePropList_;
    orvcore::proplist::PropList propList_;
    std::vector<WindowRecord> windows_;
};

} // namespace orvworkspace::workspace
