// A 32-bit premultiplied ARGB image in memory (a cairo image surface): window images, snapshots and
// decoded PNGs. Copies share the pixels.
#pragma once

#include "host/ui/canvasor/Color.h"

#include <memory>
#include <string>

typedef struct _cairo_surface cairo_surface_t;

namespace canvasor {

class Image {
public:
    Image() = default;
    Image(int width, int height);

    // Decodes PNG bytes; an empty image when they are no PNG.
    static Image FromPNG(std::string const& bytes);

    bool IsEmpty() const { return !surface_; }
    int Width() const;
    int Height() const;
    // The colour of a pixel, unpremultiplied; transparent black outside the image.
    ColorRGBA Pixel(int x, int y) const;
    // The PNG encoding of the image; empty for an empty image.
    std::string ToPNG() const;
    // Writes the PNG to a file; false when it cannot.
    bool WritePNG(std::string const& path) const;
    cairo_surface_t* Surface() const { return surface_.get(); }
    // Whether another copy shares the pixels.
    bool IsShared() const { return surface_.use_count() > 1; }
    // A copy with pixels of its own.
    Image Clone() const;

private:
    std::shared_ptr<cairo_surface_t> surface_;
};

// A decoded image file, as the draw supplier makes it.
class FileImage {
public:
    explicit FileImage(Image image)
        : image_(std::move(image)) {}
    Image const& GetImage() const { return image_; }
    int Width() const { return image_.Width(); }
    int Height() const { return image_.Height(); }

private:
    Image image_;
};
using FileImageP = std::shared_ptr<FileImage>;

} // namespace canvasor
