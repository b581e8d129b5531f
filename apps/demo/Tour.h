// The scripted tour: a small command language that drives the demo through the desktop's real
// input (presses, moves and releases on tabs and drop zones) and the host's menu commands, with a
// PNG snapshot of the screen after every step. One command per line; '#' starts a comment.
//
//   switch NAME            make the named workspace current (as picking it in the Window menu)
//   drag TYPE onto TYPE ZONE
//                          drag the tab of a panel type onto the frame showing another type and
//                          drop it in a zone: left, right, top, bottom or center
//   float TYPE X Y         tear the tab off and drop it at a desktop point: a floating window
//   maximize TYPE          maximise the frame showing the type, or restore the layout when one
//                          is maximised (the pointer is moved over it first)
//   toggle TYPE            the Window-menu item of a panel type: close it, or bring it back
//   menu ITEM              open the Window menu on the menu bar and click the item of that text
//                          (a workspace, a panel kind; a dialog it opens goes unanswered)
//   new NAME               keep the arrangement as a new user workspace
//   reset                  reset the current workspace to its original layout
//   snapshot NAME          an extra snapshot under that name
#pragma once

#include <filesystem>
#include <istream>
#include <stdexcept>
#include <string>
#include <vector>

namespace orvdemo {

class DemoApp;

class TourError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

class Tour {
public:
    Tour(DemoApp& app, std::filesystem::path outFolder);

    // Runs one line; throws TourError naming what is wrong with it.
    void Run(std::string const& line);
    // Runs every line, stopping at the first error (reported with its line number).
    void RunScript(std::istream& script);
    // The tour the demo takes when given no script.
    static char const* BuiltInScript();

    // The snapshots written so far, in order.
    std::vector<std::filesystem::path> const& GetSnapshots() const { return snapshots_; }
    // Writes the current arrangement as a document and as a Graphviz graph of its layout trees.
    void WriteFinalDocuments();

private:
    void Snapshot(std::string const& name);

    DemoApp& app_;
    std::filesystem::path out_;
    std::vector<std::filesystem::path> snapshots_;
    int step_ = 0;
};

} // namespace orvdemo
