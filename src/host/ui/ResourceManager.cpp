// The library's built-in images, drawn once with the toolkit's own canvas.
#include "host/ui/ResourceManager.h"

#include "host/ui/Desktop.h"
#include "host/ui/canvasor/Canvasor.h"

namespace orvui::utility {

namespace {

using canvasor::Canvasor;
using canvasor::ColorRGBA;
using canvasor::Image;
using canvasor::Pen;
using orvui::ui::PointF;
using orvui::ui::RectF;

std::string CloseBox() {
    Image image(11, 11);
    Canvasor c(image);
    Pen pen{1.6f, ColorRGBA(0.85f, 0.85f, 0.85f, 1)};
    c.NewPath();
    c.MoveTo(PointF(2.5f, 2.5f));
    c.LineTo(PointF(8.5f, 8.5f));
    c.MoveTo(PointF(8.5f, 2.5f));
    c.LineTo(PointF(2.5f, 8.5f));
    c.Stroke(pen);
    return image.ToPNG();
}

std::string Gripper() {
    Image image(8, 12);
    Canvasor c(image);
    for (int row = 0; row < 4; ++row) {
        for (int col = 0; col < 2; ++col) {
            c.FillRect(RectF(1.0f + 4 * col, 1.0f + 3 * row, 2, 2), ColorRGBA(0.7f, 0.7f, 0.7f, 1));
        }
    }
    return image.ToPNG();
}

std::string DownArrow() {
    Image image(9, 6);
    Canvasor c(image);
    c.NewPath();
    c.MoveTo(PointF(0.5f, 0.5f));
    c.LineTo(PointF(8.5f, 0.5f));
    c.LineTo(PointF(4.5f, 5.5f));
    c.ClosePath();
    c.Fill(ColorRGBA(0.85f, 0.85f, 0.85f, 1));
    return image.ToPNG();
}

std::string PopupToolSelect() {
    Image image(5, 5);
    Canvasor c(image);
    c.NewPath();
    c.MoveTo(PointF(5, 0));
    c.LineTo(PointF(5, 5));
    c.LineTo(PointF(0, 5));
    c.ClosePath();
    c.Fill(ColorRGBA(0.8f, 0.8f, 0.8f, 1));
    return image.ToPNG();
}

} // namespace

ResourceManager::ResourceManager() {
    resources_[{"png", "closebox"}] = CloseBox();
    resources_[{"png", "gripper"}] = Gripper();
    resources_[{"png", "DownArrow"}] = DownArrow();
    resources_[{"png", "SP_PopupToolSelect_5x5_N"}] = PopupToolSelect();
}

std::string ResourceManager::GetResource(std::string const& type, std::string const& name) const {
    auto it = resources_.find({type, name});
    return it == resources_.end() ? std::string() : it->second;
}

bool ResourceManager::HasResource(std::string const& type, std::string const& name) const {
    return resources_.count({type, name}) != 0;
}

void ResourceManager::SetCursor(int cursor) const {
    ui::Desktop::Get().SetCursor(cursor);
}

void ResourceManager::AddResource(std::string const& type, std::string const& name, std::string bytes) {
    resources_[{type, name}] = std::move(bytes);
}

} // namespace orvui::utility
