// The draw supplier: the factory of fonts and decoded images that drawing code asks for, so it never
// decodes files itself. The toolkit's own supplier decodes PNGs with cairo.
#pragma once

#include "host/ui/canvasor/Canvasor.h"
#include "host/ui/canvasor/Image.h"

namespace canvasor {

class SupplierInterface {
public:
    virtual ~SupplierInterface() = default;
    // An image from PNG bytes; null when the bytes are no image.
    virtual FileImageP MakeFileImage(std::string const& pngBytes) = 0;
    virtual Font MakeFont(std::string const& family, float size, bool bold) = 0;
};

class CairoSupplier : public SupplierInterface {
public:
    FileImageP MakeFileImage(std::string const& pngBytes) override;
    Font MakeFont(std::string const& family, float size, bool bold) override {
        return Font{family, size, bold};
    }
};

} // namespace canvasor
