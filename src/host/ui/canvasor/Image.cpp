// Images on cairo image surfaces.
#include "host/ui/canvasor/Image.h"

#include <cairo.h>
#include <cstdint>
#include <cstring>

namespace canvasor {

namespace {

std::shared_ptr<cairo_surface_t> Own(cairo_surface_t* surface) {
    if (!surface || cairo_surface_status(surface) != CAIRO_STATUS_SUCCESS) {
        if (surface) {
            cairo_surface_destroy(surface);
        }
        return nullptr;
    }
    return std::shared_ptr<cairo_surface_t>(surface, cairo_surface_destroy);
}

struct ReadState {
    std::string const* bytes;
    std::size_t offset;
};

cairo_status_t ReadBytes(void* closure, unsigned char* data, unsigned int length) {
    auto* state = static_cast<ReadState*>(closure);
    if (state->offset + length > state->bytes->size()) {
        return CAIRO_STATUS_READ_ERROR;
    }
    std::memcpy(data, state->bytes->data() + state->offset, length);
    state->offset += length;
    return CAIRO_STATUS_SUCCESS;
}

cairo_status_t WriteBytes(void* closure, unsigned char const* data, unsigned int length) {
    static_cast<std::string*>(closure)->append(reinterpret_cast<char const*>(data), length);
    return CAIRO_STATUS_SUCCESS;
}

} // namespace

Image::Image(int width, int height)
    : surface_(Own(
          cairo_image_surface_create(CAIRO_FORMAT_ARGB32, width > 0 ? width : 1, height > 0 ? height : 1))) {}

Image Image::FromPNG(std::string const& bytes) {
    Image image;
    static unsigned char const signature[8] = {0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n'};
    if (bytes.size() < 8 || std::memcmp(bytes.data(), signature, 8) != 0) {
        return image;
    }
    ReadState state{&bytes, 0};
    image.surface_ = Own(cairo_image_surface_create_from_png_stream(ReadBytes, &state));
    return image;
}

Image Image::Clone() const {
    if (!surface_) {
        return Image();
    }
    Image copy(Width(), Height());
    cairo_surface_flush(surface_.get());
    cairo_t* cr = cairo_create(copy.surface_.get());
    cairo_set_operator(cr, CAIRO_OPERATOR_SOURCE);
    cairo_set_source_surface(cr, surface_.get(), 0, 0);
    cairo_paint(cr);
    cairo_destroy(cr);
    cairo_surface_flush(copy.surface_.get());
    return copy;
}

int Image::Width() const {
    return surface_ ? cairo_image_surface_get_width(surface_.get()) : 0;
}
int Image::Height() const {
    return surface_ ? cairo_image_surface_get_height(surface_.get()) : 0;
}

ColorRGBA Image::Pixel(int x, int y) const {
    if (!surface_ || x < 0 || y < 0 || x >= Width() || y >= Height()) {
        return ColorRGBA();
    }
    cairo_surface_flush(surface_.get());
    unsigned char const* data = cairo_image_surface_get_data(surface_.get());
    int stride = cairo_image_surface_get_stride(surface_.get());
    std::uint32_t pixel;
    std::memcpy(&pixel, data + y * stride + x * 4, 4);
    float a = float((pixel >> 24) & 0xFF) / 255.0f;
    if (a == 0) {
        return ColorRGBA();
    }
    auto channel = [&](int shift) { return float((pixel >> shift) & 0xFF) / 255.0f / a; };
    return ColorRGBA(channel(16), channel(8), channel(0), a);
}

std::string Image::ToPNG() const {
    std::string bytes;
    if (surface_) {
        cairo_surface_write_to_png_stream(surface_.get(), WriteBytes, &bytes);
    }
    return bytes;
}

bool Image::WritePNG(std::string const& path) const {
    return surface_ && cairo_surface_write_to_png(surface_.get(), path.c_str()) == CAIRO_STATUS_SUCCESS;
}

} // namespace canvasor
