// STUB: replaced by the real artwork.
#include "resources/images.h"

wxBitmap CommandBarBitmap(int) { return wxNullBitmap; }
wxBitmap LogoBitmap(int) { return wxNullBitmap; }
wxIconBundle AppIcons() { return {}; }
