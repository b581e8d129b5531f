// The toolkit's own draw supplier.
#include "host/ui/canvasor/SupplierInterface.h"

namespace canvasor {

FileImageP CairoSupplier::MakeFileImage(std::string const& pngBytes) {
    Image image = Image::FromPNG(pngBytes);
    return image.IsEmpty() ? nullptr : std::make_shared<FileImage>(std::move(image));
}

} // namespace canvasor
