// orvdemo: a mock media editor on orvworkspace. Without a display (or with --headless) it takes a
// scripted tour through the desktop's input and writes a snapshot after every step, the final
// workspace document and a Graphviz graph of its layout into an output folder it prints.
//
//   orvdemo [--headless] [--script FILE] [--out FOLDER] [--prefs FOLDER]
#include "DemoHost.h"
#include "Tour.h"
#include "host/ui/Desktop.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <sstream>
#include <string>
#include <unistd.h>

#ifndef ORVDEMO_WORKSPACES_DIR
#define ORVDEMO_WORKSPACES_DIR ""
#endif

namespace {

int Usage() {
    std::cerr << "usage: orvdemo [--headless] [--script FILE] [--out FOLDER] [--prefs FOLDER]\n";
    return 2;
}

std::filesystem::path FreshFolder(char const* stem) {
    std::filesystem::path base = std::filesystem::temp_directory_path();
    for (int n = 0;; ++n) {
        std::filesystem::path p =
            base / (std::string(stem) + "-" + std::to_string(::getpid()) + "-" + std::to_string(n));
        if (std::filesystem::create_directories(p)) {
            return p;
        }
    }
}

} // namespace

int main(int argc, char** argv) {
    std::string script, out, prefs;
    for (int i = 1; i < argc; ++i) {
        std::string arg = argv[i];
        auto value = [&](std::string& into) {
            if (i + 1 >= argc) {
                return false;
            }
            into = argv[++i];
            return true;
        };
        if (arg == "--headless") {
            continue; // the only mode this build has
        }
        if ((arg == "--script" && !value(script)) || (arg == "--out" && !value(out)) ||
            (arg == "--prefs" && !value(prefs))) {
            return Usage();
        }
        if (arg != "--script" && arg != "--out" && arg != "--prefs") {
            return Usage();
        }
    }
    std::string tour = orvdemo::Tour::BuiltInScript();
    if (!script.empty()) {
        std::ifstream in(script);
        if (!in) {
            std::cerr << "orvdemo: cannot read the script " << script << "\n";
            return 1;
        }
        std::ostringstream text;
        text << in.rdbuf();
        tour = text.str();
    }
    try {
        std::filesystem::path outFolder = out.empty() ? FreshFolder("orvdemo") : std::filesystem::path(out);
        // Unless told otherwise, the demo keeps its workspaces in a fresh preferences folder, so a
        // tour never touches the user's own.
        std::filesystem::path prefsFolder =
            prefs.empty() ? outFolder / "prefs" : std::filesystem::path(prefs);
        std::filesystem::create_directories(prefsFolder);
        ::setenv("ORV_PREFS_DIR", prefsFolder.c_str(), 1);
        orvui::ui::Desktop::Reset();
        orvui::ui::Desktop::Get().SetMonitors({orvdemo::DemoApp::Monitor});
        std::string shipped = ORVDEMO_WORKSPACES_DIR;
        orvdemo::DemoApp app(std::u16string(shipped.begin(), shipped.end()), u"Editing");
        orvdemo::Tour steps(app, outFolder);
        std::istringstream lines(tour);
        steps.RunScript(lines);
        steps.WriteFinalDocuments();
        std::cout << "orvdemo: " << steps.GetSnapshots().size() << " snapshots and the final documents in "
                  << outFolder.string() << "\n";
    } catch (orvdemo::TourError const& e) {
        std::cerr << "orvdemo: " << e.what() << "\n";
        return 1;
    } catch (std::exception const& e) {
        // The library's errors, and the file system's (an output folder that cannot be made).
        std::cerr << "orvdemo: " << e.what() << "\n";
        return 1;
    }
    return 0;
}
