// orvdemo: a mock media editor on orvworkspace. On a display (DISPLAY set, built with SDL2) it is
// interactive: dock, float, resize, close and reopen panels with the mouse, and the Window menu.
// Without one, with --headless or with a --script, it takes a scripted tour through the desktop's
// input and writes a snapshot after every step, the final workspace document and a Graphviz graph
// of its layout into an output folder it prints. Either way it saves its workspace on the way out
// (a SIGTERM or SIGINT on a display counts as a request to quit).
//
//   orvdemo [--headless] [--script FILE] [--out FOLDER] [--prefs FOLDER] [--describe FILE]
#include "DemoHost.h"
#ifdef ORV_WITH_SDL
#include "host/ui_sdl/SdlBackend.h"
#endif
#include "Tour.h"
#include "host/ui/Desktop.h"
#include "workspace/WorkspaceUtils.h"

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
    std::cerr
        << "usage: orvdemo [--headless] [--script FILE] [--out FOLDER] [--prefs FOLDER] [--describe FILE]\n";
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
    std::string script, out, prefs, describe;
    bool headless = false;
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
            headless = true;
            continue;
        }
        if ((arg == "--script" && !value(script)) || (arg == "--out" && !value(out)) ||
            (arg == "--prefs" && !value(prefs)) || (arg == "--describe" && !value(describe))) {
            return Usage();
        }
        if (arg != "--script" && arg != "--out" && arg != "--prefs" && arg != "--describe") {
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
        orvui::ui::Desktop::Reset();
        orvui::ui::Desktop::Get().SetMonitors({orvdemo::DemoApp::Monitor});
        std::string shipped = ORVDEMO_WORKSPACES_DIR;
#ifdef ORV_WITH_SDL
        if (!headless && script.empty() && std::getenv("DISPLAY")) {
            std::string why;
            if (auto display = orvui::sdl::SdlBackend::Open(why)) {
                // On a display the demo is an application like any other: its workspaces live in
                // the user's preferences folder unless told otherwise, and last from run to run.
                if (!prefs.empty()) {
                    std::filesystem::create_directories(prefs);
                    ::setenv("ORV_PREFS_DIR", prefs.c_str(), 1);
                }
                orvdemo::DemoApp app(std::u16string(shipped.begin(), shipped.end()), u"Editing");
                // The ` key maximises the frame under the pointer, or restores the layout.
                display->SetShortcutHook([&app](char32_t ch) {
                    return ch == U'`' &&
                           orvworkspace::workspace::WorkspaceUtils::ToggleFrameMaximizationState(
                               app.GetWorkspace());
                });
                display->Present();
                if (!describe.empty()) {
                    std::ofstream where(describe);
                    app.Describe(where);
                }
                std::cout << "orvdemo: running on the display\n" << std::flush;
                display->Run();
                return 0; // the application saves its workspace on the way out
            }
            std::cerr << "orvdemo: no display (" << why << "); taking the tour instead\n";
        }
#endif
        std::filesystem::path outFolder = out.empty() ? FreshFolder("orvdemo") : std::filesystem::path(out);
        // Unless told otherwise, a tour keeps its workspaces in a fresh preferences folder, so it
        // never touches the user's own.
        std::filesystem::path prefsFolder =
            prefs.empty() ? outFolder / "prefs" : std::filesystem::path(prefs);
        std::filesystem::create_directories(prefsFolder);
        ::setenv("ORV_PREFS_DIR", prefsFolder.c_str(), 1);
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
