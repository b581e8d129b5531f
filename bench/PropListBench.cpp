// Writing and reading a 1 MB property-list document shaped like a large saved workspace, against
// pugixml's own parse of the same bytes. Prints MB/s of each (medians of five repetitions) and the
// ratio of our read to pugixml's parse.
#include "MedianCollector.h"
#include "host/core/PropListUtils.h"

#include <benchmark/benchmark.h>
#include <cstdio>
#include <pugixml.hpp>

using orvcore::proplist::PropList;
namespace utils = orvcore::proplist::utils;

namespace {

// Windows of splitters and frames, each frame with tabs whose state is a nested fragment, until the
// document reaches about a megabyte.
PropList MakeWorkspaceLike(std::size_t targetBytes) {
    PropList doc;
    doc.SetValue("ORV_Wrkspce", "1.2");
    doc.SetValue("UserName", u"Colour & \u00C9dition");
    PropList tabState;
    tabState.SetValue("Zoom", 1.25f);
    tabState.SetValue("Columns", std::vector<std::int32_t>{120, 80, 200, 64, 64});
    tabState.SetValue("Recent", std::vector<std::string>{"/media/clip <1>.mov", "/media/clip 2.mov"});
    tabState.SetValue("Sorted", true);
    std::string stateText;
    tabState.OutputAsXMLFragment(stateText);

    int window = 0;
    std::size_t windowBytes = 0;
    while (windowBytes == 0 || std::size_t(window) * windowBytes < targetBytes) {
        PropList* tlw = doc.NewSubList("TopLevelFrame-" + std::to_string(window++));
        tlw->SetValue("SzPos", std::vector<std::int32_t>{0, 0, 1920, 1080});
        tlw->SetValue("HasToolBar", true);
        tlw->SetValue("ToolBarTabType", "tools");
        PropList* splitter = tlw->NewSubList("Splitter");
        for (int depth = 0; depth < 12; ++depth) {
            splitter->SetValue("Orient", depth % 2 == 0);
            splitter->SetValue("Place", 0.5f + depth * 0.01f);
            splitter->SetValue("Sub1Vis", true);
            splitter->SetValue("Sub2Vis", true);
            PropList* frame = splitter->NewSubList("Sub1")->NewSubList("Frame");
            frame->SetValue("CurrTab", depth % 3);
            frame->SetValue("TabIDs", std::vector<std::string>{"project", "media", "effects"});
            for (int tab = 0; tab < 3; ++tab) {
                frame->SetValue("VisTabState-" + std::to_string(tab), stateText);
            }
            splitter = splitter->NewSubList("Sub2")->NewSubList("Splitter");
        }
        if (windowBytes == 0) {
            std::string text;
            tlw->OutputAsXMLFragment(text);
            windowBytes = text.size();
        }
    }
    doc.SetValue("SerCfgMax", window);
    return doc;
}

std::string const& Document() {
    static std::string const text = utils::DocumentText(MakeWorkspaceLike(1 << 20));
    return text;
}

void BM_Write(benchmark::State& state) {
    PropList doc;
    utils::ParseDocument(Document(), doc, u"bench");
    for (auto _ : state) {
        benchmark::DoNotOptimize(utils::DocumentText(doc));
    }
    state.SetBytesProcessed(std::int64_t(state.iterations()) * std::int64_t(Document().size()));
}

void BM_Read(benchmark::State& state) {
    for (auto _ : state) {
        PropList doc;
        utils::ParseDocument(Document(), doc, u"bench");
        benchmark::DoNotOptimize(doc);
    }
    state.SetBytesProcessed(std::int64_t(state.iterations()) * std::int64_t(Document().size()));
}

void BM_PugixmlParse(benchmark::State& state) {
    for (auto _ : state) {
        pugi::xml_document doc;
        benchmark::DoNotOptimize(doc.load_buffer(Document().data(), Document().size()));
    }
    state.SetBytesProcessed(std::int64_t(state.iterations()) * std::int64_t(Document().size()));
}

BENCHMARK(BM_Write)->Repetitions(5)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Read)->Repetitions(5)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_PugixmlParse)->Repetitions(5)->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    orvbench::MedianCollector reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    double megabytes = double(Document().size()) / (1024.0 * 1024.0);
    auto rate = [&](char const* name) {
        double seconds = reporter.Seconds(std::string(name) + "/");
        return seconds <= 0 ? 0.0 : megabytes / seconds;
    };
    double write = rate("BM_Write"), read = rate("BM_Read"), pugi = rate("BM_PugixmlParse");
    std::printf("\ndocument: %zu bytes\n", Document().size());
    std::printf("write: %.1f MB/s\nread: %.1f MB/s\npugixml parse: %.1f MB/s\n", write, read, pugi);
    if (pugi > 0) {
        std::printf("read / pugixml parse: %.2f (target at least 0.50)\n", read / pugi);
    }
    benchmark::Shutdown();
    return 0;
}
