// The VHDL library definitions page is still to come: its panel stays empty, so there is no
// editor to reset, and its events do nothing.
#include "app/config_frame.h"

#include <wx/grid.h>

void ConfigFrame::ResetLibraryEditor() {}
void ConfigFrame::OnLibraryCellChange(wxGridEvent&) {}
void ConfigFrame::OnSaveLibraryDefinition(wxCommandEvent&) {}
void ConfigFrame::OnRemoveLibraryDefinition(wxCommandEvent&) {}
