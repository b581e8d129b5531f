// For tests that drive the headless desktop: a fresh desktop per test and, when the test fails, a
// PNG of what the screen showed, written to $ORV_TEST_SNAPSHOTS (default: the build folder's
// test-snapshots) and named after the test, so a failure can be looked at.
#pragma once

#include "host/ui/Desktop.h"

#include <cstdlib>
#include <filesystem>
#include <gtest/gtest.h>

namespace orvtest {

class DesktopScenario : public ::testing::Test {
protected:
    void SetUp() override { orvui::ui::Desktop::Reset(); }
    void TearDown() override {
        if (HasFailure()) {
            WriteSnapshot();
        }
        CloseWindows();
        orvui::ui::Desktop::Reset();
    }
    // Tests release their windows here, before the desktop goes.
    virtual void CloseWindows() {}

    std::filesystem::path WriteSnapshot() {
        char const* folder = std::getenv("ORV_TEST_SNAPSHOTS");
        std::filesystem::path dir = folder && *folder ? folder : "test-snapshots";
        std::filesystem::create_directories(dir);
        auto const* info = ::testing::UnitTest::GetInstance()->current_test_info();
        std::filesystem::path file =
            dir / (std::string(info->test_suite_name()) + "." + info->name() + ".png");
        orvui::ui::Desktop::Get().Snapshot().WritePNG(file.string());
        std::printf("screen snapshot: %s\n", file.string().c_str());
        return file;
    }
};

} // namespace orvtest
