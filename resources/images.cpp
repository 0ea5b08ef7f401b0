#include "resources/images.h"

#include "resources/image_data.h"

#include <wx/icon.h>
#include <wx/image.h>

#include <iterator>

namespace
{

static_assert(std::size(COMMAND_BAR_PIXELS) == COMMAND_BAR_IMAGE_COUNT);

// The pictures share one background colour that the tool bar and the window show through.
wxBitmap MaskedBitmap(const unsigned char* pixels, int size)
{
    // Static data: wx neither copies nor frees the pixels, and nothing here writes to them.
    wxImage image(size, size, const_cast<unsigned char*>(pixels), true);
    image.SetMaskColour(236, 233, 216);
    return wxBitmap(image);
}

wxIcon MaskedIcon(const unsigned char* pixels, int size)
{
    wxIcon icon;
    icon.CopyFromBitmap(MaskedBitmap(pixels, size));
    return icon;
}

} // namespace

wxBitmap CommandBarBitmap(int index)
{
    if (index < 0 || index >= COMMAND_BAR_IMAGE_COUNT)
        return wxNullBitmap;
    return MaskedBitmap(COMMAND_BAR_PIXELS[index], 24);
}

wxBitmap LogoBitmap(int index)
{
    if (index != 0)
        return wxNullBitmap;
    return MaskedBitmap(LOGO_PIXELS, 32);
}

wxIconBundle AppIcons()
{
    wxIconBundle icons;
    icons.AddIcon(MaskedIcon(ICON16_PIXELS, 16));
    icons.AddIcon(MaskedIcon(LOGO_PIXELS, 32));
    icons.AddIcon(MaskedIcon(ICON48_PIXELS, 48));
    return icons;
}
