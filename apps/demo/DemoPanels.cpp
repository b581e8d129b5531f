#include "DemoPanels.h"

#include "host/core/PropList.h"
#include "host/ui/canvasor/Canvasor.h"
#include "workspace/TabPanel.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace orvdemo {

using canvasor::Canvasor;
using canvasor::ColorRGBA;
using orvui::ui::RectF;
using orvworkspace::workspace::TabPanel;
using orvworkspace::workspace::Workspace;
using orvworkspace::workspace::WorkspaceFrameBase;

namespace {

struct Kind {
    std::string type;
    std::u16string name;
};

std::vector<Kind> const& Kinds() {
    static std::vector<Kind> const kinds{
        {"project", u"Project"},          {"media", u"Media Browser"}, {"source", u"Source Monitor"},
        {"program", u"Program Monitor"},  {"timeline", u"Timeline"},   {"effects", u"Effects"},
        {"controls", u"Effect Controls"}, {"meters", u"Audio Meters"}, {"info", u"Info"},
        {"history", u"History"}};
    return kinds;
}

ColorRGBA Grey(float v) {
    return ColorRGBA(v, v, v, 1);
}

canvasor::Font TextFont(float size = 11, bool bold = false) {
    canvasor::Font font;
    font.size = size;
    font.bold = bold;
    return font;
}

// A panel that draws its kind over a dark background.
class DemoPanel : public TabPanel {
public:
    DemoPanel(Workspace* workspace, WorkspaceFrameBase* frame, std::string const& type)
        : TabPanel(workspace, frame, true, type, PanelName(type)) {}

    void UI_Draw(Canvasor& c) override {
        RectF r = UI_GetLocalBounds();
        c.FillRect(r, Grey(0.16f));
        Draw(c, r);
    }

protected:
    virtual void Draw(Canvasor& c, RectF const& r) = 0;

    // Rows of text from the top, as lists and trees show them.
    static void Rows(Canvasor& c, RectF const& r, std::vector<std::string> const& rows, float indent = 8) {
        float y = r.top + 8;
        for (std::string const& row : rows) {
            if (y + 14 > r.top + r.height) {
                break;
            }
            c.DrawText(row, orvui::ui::PointF(r.left + indent, y), TextFont(), Grey(0.82f));
            y += 18;
        }
    }
};

class ProjectPanel : public DemoPanel {
public:
    using DemoPanel::DemoPanel;

protected:
    void Draw(Canvasor& c, RectF const& r) override {
        std::vector<std::string> rows{"Bin: " + bin_};
        for (int i = 1; i <= 12; ++i) {
            rows.push_back("  Clip " + std::string(i < 10 ? "0" : "") + std::to_string(i) + ".mov");
        }
        Rows(c, r, rows);
    }
    void DoSaveStateData(orvcore::proplist::PropList* list) override { list->SetValue("Bin", bin_); }
    void DoLoadStateData(orvcore::proplist::PropList* list) override { list->GetValue("Bin", bin_); }

private:
    std::string bin_ = "Footage";
};

class MediaPanel : public DemoPanel {
public:
    using DemoPanel::DemoPanel;

protected:
    // A grid of thumbnails in varied hues.
    void Draw(Canvasor& c, RectF const& r) override {
        float w = 64, h = 40, gap = 8;
        int index = 0;
        for (float y = r.top + gap; y + h <= r.top + r.height; y += h + gap) {
            for (float x = r.left + gap; x + w <= r.left + r.width; x += w + gap, ++index) {
                float t = float(index % 7) / 7.0f;
                c.FillRect(RectF(x, y, w, h), ColorRGBA(0.3f + 0.5f * t, 0.45f, 0.8f - 0.5f * t, 1));
            }
        }
    }
};

// A monitor: a letterboxed picture with a timecode under it.
class MonitorPanel : public DemoPanel {
public:
    MonitorPanel(Workspace* workspace, WorkspaceFrameBase* frame, std::string const& type, ColorRGBA sky)
        : DemoPanel(workspace, frame, type)
        , sky_(sky) {
        SetTabColor(sky);
    }

protected:
    void Draw(Canvasor& c, RectF const& r) override {
        c.FillRect(r, Grey(0.05f));
        float w = std::max(0.0f, r.width - 16);
        float h = std::min(w * 9 / 16, std::max(0.0f, r.height - 40));
        w = h * 16 / 9;
        RectF picture(r.left + (r.width - w) / 2, r.top + 8, w, h);
        canvasor::LinearGradient sky;
        sky.from = orvui::ui::PointF(picture.left, picture.top);
        sky.to = orvui::ui::PointF(picture.left, picture.top + picture.height);
        sky.fromColor = sky_;
        sky.toColor = ColorRGBA(0.9f, 0.75f, 0.45f, 1);
        c.FillRect(picture, sky);
        c.FillRect(
            RectF(picture.left, picture.top + picture.height * 0.7f, picture.width, picture.height * 0.3f),
            ColorRGBA(0.2f, 0.35f, 0.2f, 1));
        c.DrawText("00:00:12:05", orvui::ui::PointF(r.left + 8, picture.top + picture.height + 8),
                   TextFont(12, true), ColorRGBA(0.4f, 0.8f, 1, 1));
    }

private:
    ColorRGBA sky_;
};

// Tracks with clips and a playhead; it can be locked against edits.
class TimelinePanel : public DemoPanel {
public:
    using DemoPanel::DemoPanel;
    bool IsLockable() const override { return true; }

protected:
    void Draw(Canvasor& c, RectF const& r) override {
        float track = 26;
        int n = 0;
        for (float y = r.top + 24; y + track <= r.top + r.height; y += track + 2, ++n) {
            c.FillRect(RectF(r.left, y, r.width, track), Grey(0.22f));
            bool audio = n >= 3;
            for (float x = r.left + 20 + float(n % 3) * 30; x < r.left + r.width; x += 170) {
                c.FillRect(RectF(x, y + 3, 130, track - 6),
                           audio ? ColorRGBA(0.3f, 0.65f, 0.4f, 1) : ColorRGBA(0.35f, 0.45f, 0.85f, 1));
            }
        }
        float playhead = r.left + r.width * 0.4f;
        c.FillRect(RectF(playhead, r.top, 2, r.height), ColorRGBA(0.95f, 0.3f, 0.3f, 1));
    }
};

class EffectsPanel : public DemoPanel {
public:
    using DemoPanel::DemoPanel;

protected:
    void Draw(Canvasor& c, RectF const& r) override {
        Rows(c, r,
             {"Video Effects", "  Blur & Sharpen", "  Color Correction", "  Distort", "Audio Effects",
              "  Reverb", "  Equalizer"});
    }
};

// Parameters with slider bars.
class ControlsPanel : public DemoPanel {
public:
    using DemoPanel::DemoPanel;

protected:
    void Draw(Canvasor& c, RectF const& r) override {
        std::vector<std::pair<std::string, float>> params{
            {"Position", 0.5f}, {"Scale", 0.8f}, {"Rotation", 0.1f}, {"Opacity", 1.0f}, {"Volume", 0.65f}};
        float y = r.top + 10;
        for (auto const& [name, value] : params) {
            if (y + 16 > r.top + r.height) {
                break;
            }
            c.DrawText(name, orvui::ui::PointF(r.left + 8, y), TextFont(), Grey(0.82f));
            float barWidth = std::max(0.0f, r.width - 110);
            c.FillRect(RectF(r.left + 96, y + 4, barWidth, 6), Grey(0.3f));
            c.FillRect(RectF(r.left + 96, y + 4, barWidth * value, 6), ColorRGBA(0.35f, 0.6f, 0.95f, 1));
            y += 22;
        }
    }
};

// Level bars; it snaps to the widths of one or two channel pairs.
class MetersPanel : public DemoPanel {
public:
    using DemoPanel::DemoPanel;

protected:
    void DoGetSnapSizes(std::vector<orvui::ui::PointT>& sizes) const override {
        sizes.push_back(orvui::ui::PointT(60, 0));
        sizes.push_back(orvui::ui::PointT(120, 0));
    }
    void Draw(Canvasor& c, RectF const& r) override {
        float levels[] = {0.72f, 0.64f, 0.9f, 0.5f};
        float w = 10;
        for (int i = 0; i < 4; ++i) {
            float x = r.left + 10 + float(i) * (w + 6);
            float h = (r.height - 20) * levels[i];
            float bottom = r.top + r.height - 10;
            c.FillRect(RectF(x, bottom - h, w, h), ColorRGBA(0.3f, 0.8f, 0.35f, 1));
            float hot = std::max(0.0f, h - (r.height - 20) * 0.75f);
            c.FillRect(RectF(x, bottom - h, w, hot), ColorRGBA(0.95f, 0.75f, 0.2f, 1));
        }
    }
};

class InfoPanel : public DemoPanel {
public:
    using DemoPanel::DemoPanel;

protected:
    void Draw(Canvasor& c, RectF const& r) override {
        Rows(c, r,
             {"Clip 04.mov", "Type: Movie", "Video: 3840 x 2160 (1.0)", "Audio: 48000 Hz - Stereo",
              "Duration: 00:01:42:10"});
    }
};

// The list of steps; closing it throws it away, but its position is kept for the next one.
class HistoryPanel : public DemoPanel {
public:
    using DemoPanel::DemoPanel;

protected:
    void Draw(Canvasor& c, RectF const& r) override {
        std::vector<std::string> rows;
        for (int i = 0; i < 8; ++i) {
            rows.push_back((i == step_ ? "> " : "  ") + std::string("Step ") + std::to_string(i + 1));
        }
        Rows(c, r, rows);
    }
    void DoSaveStateData(orvcore::proplist::PropList* list) override {
        list->SetValue("Step", std::int32_t(step_));
    }
    void DoLoadStateData(orvcore::proplist::PropList* list) override {
        std::int32_t step = 0;
        if (list->GetValue("Step", step)) {
            step_ = step;
        }
    }

private:
    int step_ = 3;
};

class DemoCreator : public orvworkspace::workspace::TabCreator {
public:
    explicit DemoCreator(std::string type)
        : TabCreator(std::move(type)) {}

    boost::intrusive_ptr<TabPanel> CreateTabPanel(Workspace* ws, WorkspaceFrameBase* frame) const override {
        std::string const& type = tabType;
        if (type == "project") {
            return new ProjectPanel(ws, frame, type);
        }
        if (type == "media") {
            return new MediaPanel(ws, frame, type);
        }
        if (type == "source") {
            return new MonitorPanel(ws, frame, type, ColorRGBA(0.35f, 0.55f, 0.9f, 1));
        }
        if (type == "program") {
            return new MonitorPanel(ws, frame, type, ColorRGBA(0.85f, 0.45f, 0.35f, 1));
        }
        if (type == "timeline") {
            return new TimelinePanel(ws, frame, type);
        }
        if (type == "effects") {
            return new EffectsPanel(ws, frame, type);
        }
        if (type == "controls") {
            return new ControlsPanel(ws, frame, type);
        }
        if (type == "meters") {
            return new MetersPanel(ws, frame, type);
        }
        if (type == "info") {
            return new InfoPanel(ws, frame, type);
        }
        return new HistoryPanel(ws, frame, type);
    }
    bool HidesWhenClosed() const override { return tabType == "effects"; }
    bool ObliteratesWhenClosed() const override { return tabType == "history"; }
    bool SavesStateWhenObliterated() const override { return tabType == "history"; }
};

} // namespace

std::vector<std::string> const& PanelTypes() {
    static std::vector<std::string> const types = [] {
        std::vector<std::string> t;
        for (Kind const& kind : Kinds()) {
            t.push_back(kind.type);
        }
        return t;
    }();
    return types;
}

std::u16string PanelName(std::string const& type) {
    for (Kind const& kind : Kinds()) {
        if (kind.type == type) {
            return kind.name;
        }
    }
    return std::u16string(type.begin(), type.end());
}

void RegisterPanelCreators(Workspace& workspace) {
    for (std::string const& type : PanelTypes()) {
        workspace.RegisterTabCreator(new DemoCreator(type));
    }
}

} // namespace orvdemo
