// STUB: replaced by the command bar.
#include "app/config_frame.h"

#include <wx/toolbar.h>

void ConfigFrame::CreateCommandBar() {}
void ConfigFrame::BuildCommandBar(wxToolBar*) {}
