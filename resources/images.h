#pragma once

#include <wx/bitmap.h>
#include <wx/iconbndl.h>

// Command bar pictures, 24 x 24, in tool order: new, open, save, save as, expand, collapse,
// generate. Any other index gives the null bitmap.
constexpr int COMMAND_BAR_IMAGE_COUNT = 7;
wxBitmap CommandBarBitmap(int index);

// The welcome page's 32 x 32 logo for index 0; the null bitmap otherwise.
wxBitmap LogoBitmap(int index);

// The window icon in 16, 32 and 48 pixels.
wxIconBundle AppIcons();
