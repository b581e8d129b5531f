#include "Tour.h"

#include "DemoHost.h"
#include "frames/WorkspaceFrame.h"
#include "host/core/PropListUtils.h"
#include "host/core/TextConversion.h"
#include "host/ui/Desktop.h"
#include "host/ui/Menu.h"
#include "host/ui/Modal.h"
#include "host/ui/controls/TabWell.h"
#include "layout/DropZone.h"
#include "layout/Frame.h"
#include "layout/FrameDataProxy.h"
#include "layout/Splitter.h"
#include "persistence/WorkspaceDocument.h"
#include "workspace/DropZoneOverlay.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/WorkspaceUtils.h"

#include <fstream>
#include <iomanip>
#include <sstream>

namespace orvdemo {

using namespace orvworkspace::workspace;
using orvui::ui::Desktop;
using orvui::ui::PointT;
using orvui::ui::RectT;
namespace utils = orvworkspace::workspace::WorkspaceUtils;

namespace {

PointT Middle(RectT const& r) {
    return PointT(r.left + r.width / 2, r.top + r.height / 2);
}

// Moves the pointer in short steps, as a hand does, so every drag step sees it.
void GlideTo(PointT from, PointT to) {
    constexpr int Steps = 8;
    for (int i = 1; i <= Steps; ++i) {
        Desktop::Get().MouseMove(
            PointT(from.x + (to.x - from.x) * i / Steps, from.y + (to.y - from.y) * i / Steps));
    }
}

std::vector<std::string> Words(std::string const& line) {
    std::istringstream in(line);
    std::vector<std::string> words;
    for (std::string w; in >> w;) {
        words.push_back(w);
    }
    return words;
}

std::string Rest(std::string const& line, std::string const& command) {
    std::size_t at = line.find(command) + command.size();
    std::size_t begin = line.find_first_not_of(" \t", at);
    std::size_t end = line.find_last_not_of(" \t\r");
    return begin == std::string::npos ? std::string() : line.substr(begin, end - begin + 1);
}

DropZone::DropType ZoneNamed(std::string const& name) {
    if (name == "left") {
        return DropZone::Left;
    }
    if (name == "right") {
        return DropZone::Right;
    }
    if (name == "top") {
        return DropZone::Top;
    }
    if (name == "bottom") {
        return DropZone::Bottom;
    }
    if (name == "center") {
        return DropZone::Center;
    }
    throw TourError("unknown drop zone '" + name + "' (left, right, top, bottom or center)");
}

struct TabPlace {
    WorkspaceFrame* frame = nullptr;
    long index = -1;
};

TabPlace Find(Workspace const& workspace, std::string const& type) {
    long index = -1;
    TabPanel* panel = utils::FindFirstTabOfType(workspace, type, &index);
    auto* frame = panel ? dynamic_cast<WorkspaceFrame*>(panel->GetFrame()) : nullptr;
    if (!frame) {
        throw TourError("no panel of type '" + type + "' is shown");
    }
    return {frame, index};
}

PointT OnTab(TabPlace const& place) {
    return Middle(place.frame->GetTabWell()->GetTabGlobalRect(place.index));
}

PointT InZone(DropZoneOverlayWindow const& overlay, DropZone::DropType type) {
    PointT point;
    if (!overlay.PointInZone(type, point)) {
        throw TourError("the frame offers no such drop zone");
    }
    return point;
}

// The layout trees as a Graphviz graph: splitters with their orientation, frames with their tabs.
void Dot(LayoutManagerElement* element, std::ostream& out, int& next, int parent) {
    int id = next++;
    if (Splitter* s = AsSplitter(element)) {
        out << "  n" << id << " [shape=diamond,label=\"" << (s->IsVertical() ? "|" : "--") << "\"];\n";
        for (LayoutManagerElement* child : {s->GetLeftOrTop(), s->GetRightOrBottom()}) {
            if (child) {
                Dot(child, out, next, id);
            }
        }
    } else if (AsPlaceholder(element)) {
        out << "  n" << id << " [shape=box,style=dashed,label=\"closed frame\"];\n";
    } else if (Frame* f = AsFrame(element)) {
        std::string label;
        if (auto* frame = static_cast<WorkspaceFrameBase*>(f->GetHostData())) {
            if (auto* tabbed = dynamic_cast<WorkspaceFrame*>(frame)) {
                for (long i = 0; i < tabbed->GetTabCount(); ++i) {
                    label += (i ? "\\n" : "") + tabbed->GetTabPanel(i)->GetTabType();
                }
            }
        }
        out << "  n" << id << " [shape=box,label=\"" << label << "\"];\n";
    }
    if (parent >= 0) {
        out << "  n" << parent << " -> n" << id << ";\n";
    }
}

} // namespace

Tour::Tour(DemoApp& app, std::filesystem::path outFolder)
    : app_(app)
    , out_(std::move(outFolder)) {
    std::filesystem::create_directories(out_);
    Snapshot("start");
}

char const* Tour::BuiltInScript() {
    return "# Split a frame: the effect controls go to the right of the program monitor.\n"
           "drag controls onto program right\n"
           "# Float the info panel, then dock it back under the timeline.\n"
           "float info 1700 400\n"
           "drag info onto timeline bottom\n"
           "maximize timeline\n"
           "maximize timeline\n"
           "# Close the meters from the Window menu and bring them back in their place.\n"
           "menu Audio Meters\n"
           "menu Audio Meters\n"
           "new My Edit\n"
           "menu Color\n"
           "switch My Edit\n"
           "reset\n";
}

void Tour::Run(std::string const& line) {
    std::vector<std::string> w = Words(line);
    if (w.empty() || w[0][0] == '#') {
        return;
    }
    DemoWorkspace& workspace = app_.GetWorkspace();
    Manager& manager = app_.GetManager();
    std::string const& command = w[0];
    auto need = [&](std::size_t n, char const* usage) {
        if (w.size() != n) {
            throw TourError(std::string("usage: ") + usage);
        }
    };
    if (command == "switch" || command == "new") {
        std::u16string name = orvcore::utility::UTF8to16(Rest(line, command));
        if (name.empty()) {
            throw TourError("usage: " + command + " NAME");
        }
        if (command == "new") {
            manager.CreateUserWorkspace(name);
        } else if (!manager.HasNamedWorkspace(name) || !manager.SetCurrentWorkspace(name)) {
            throw TourError("no workspace called '" + Rest(line, command) + "'");
        }
    } else if (command == "drag") {
        need(5, "drag TYPE onto TYPE ZONE");
        DropZone::DropType zone = ZoneNamed(w[4]);
        TabPlace from = Find(workspace, w[1]);
        TabPlace onto = Find(workspace, w[3]);
        PointT start = OnTab(from);
        Desktop::Get().MouseMove(start);
        Desktop::Get().MouseDown(start);
        PointT over = Middle(onto.frame->UI_GetGlobalRect());
        GlideTo(start, over);
        TopLevelWindow* window = onto.frame->GetTopLevelWindow();
        DropZoneOverlayWindow* overlay = window ? window->GetDropZoneOverlay() : nullptr;
        if (!overlay) {
            Desktop::Get().MouseUp(over);
            throw TourError("no drop zones were offered over '" + w[3] + "'");
        }
        PointT target = InZone(*overlay, zone);
        GlideTo(over, target);
        Desktop::Get().MouseUp(target);
    } else if (command == "float") {
        need(4, "float TYPE X Y");
        TabPlace from = Find(workspace, w[1]);
        PointT start = OnTab(from);
        PointT target;
        try {
            target = PointT(std::stoi(w[2]), std::stoi(w[3]));
        } catch (std::logic_error const&) {
            throw TourError("usage: float TYPE X Y (X and Y whole numbers)");
        }
        Desktop::Get().MouseMove(start);
        Desktop::Get().MouseDown(start);
        GlideTo(start, target);
        Desktop::Get().MouseUp(target);
    } else if (command == "maximize") {
        need(2, "maximize TYPE");
        TabPlace place = Find(workspace, w[1]);
        Desktop::Get().MouseMove(Middle(place.frame->UI_GetGlobalRect()));
        if (!utils::ToggleFrameMaximizationState(workspace)) {
            throw TourError("the frame of '" + w[1] + "' cannot be maximised");
        }
    } else if (command == "toggle") {
        need(2, "toggle TYPE");
        if (!workspace.FindCreator(w[1])) {
            throw TourError("unknown panel type '" + w[1] + "'");
        }
        utils::ToggleTabState(workspace, w[1], false);
    } else if (command == "reset") {
        need(1, "reset");
        if (!manager.HasCurrentWorkspace()) {
            throw TourError("no current workspace to reset");
        }
        manager.RevertWorkspace(manager.GetCurrentWorkspace());
    } else if (command == "menu") {
        // A press on the menu bar's Window title, then a click on the item, as a hand would.
        std::u16string item = orvcore::utility::UTF8to16(Rest(line, command));
        bool found = false;
        bool opened = false;
        std::string offered;
        {
            orvui::ui::ScopedModalDriver driver([&](orvui::ui::UI_ModalWindow& modal) {
                if (opened) {
                    return; // a dialog the item opened: nobody answers, so it is cancelled
                }
                opened = true;
                auto* menu = dynamic_cast<orvui::utility::MenuWindow*>(&modal);
                for (std::size_t i = 0; menu && i < menu->GetMenu().GetItemCount(); ++i) {
                    if (!menu->GetMenu().GetItem(i).separator) {
                        offered += (offered.empty() ? "" : ", ") +
                                   orvcore::utility::UTF16to8(menu->GetMenu().GetItem(i).text);
                    }
                    if (menu->GetMenu().GetItem(i).text == item) {
                        found = true;
                        PointT on = Middle(menu->GetItemGlobalRect(i));
                        Desktop::Get().MouseMove(on);
                        Desktop::Get().MouseDown(on);
                        Desktop::Get().MouseUp(on);
                        return;
                    }
                }
                modal.CancelModal();
            });
            PointT title = Middle(Desktop::Get().GetMenuBarItemRect(app_.GetAppWindow(), 0));
            Desktop::Get().MouseMove(title);
            Desktop::Get().MouseDown(title);
            Desktop::Get().MouseUp(title);
        }
        if (!found) {
            throw TourError("the Window menu has no item '" + Rest(line, command) + "' (it offers " +
                            (offered.empty() ? std::string("nothing") : offered) + ")");
        }
    } else if (command == "snapshot") {
        need(2, "snapshot NAME");
        Snapshot(w[1]);
        return;
    } else {
        throw TourError("unknown command '" + command + "'");
    }
    Snapshot(command);
}

void Tour::RunScript(std::istream& script) {
    int number = 0;
    for (std::string line; std::getline(script, line);) {
        ++number;
        try {
            Run(line);
        } catch (TourError const& e) {
            throw TourError("line " + std::to_string(number) + ": " + e.what());
        }
    }
}

void Tour::Snapshot(std::string const& name) {
    std::ostringstream file;
    file << std::setw(2) << std::setfill('0') << step_++ << "-" << name << ".png";
    std::filesystem::path path = out_ / file.str();
    Desktop::Get().Snapshot().WritePNG(path.string());
    snapshots_.push_back(path);
}

void Tour::WriteFinalDocuments() {
    DemoWorkspace& workspace = app_.GetWorkspace();
    orvcore::proplist::PropList document;
    SaveWorkspace(workspace, document, app_.GetManager().GetCurrentWorkspace());
    std::ofstream(out_ / "workspace.xml") << orvcore::proplist::utils::DocumentText(document);
    std::ofstream dot(out_ / "layout.dot");
    dot << "digraph layout {\n";
    int next = 0;
    for (TopLevelWindow* window : workspace.GetWindows()) {
        if (Splitter* root = window->GetLayoutManager()->GetRootSplitter()) {
            Dot(root, dot, next, -1);
        }
    }
    dot << "}\n";
}

} // namespace orvdemo
