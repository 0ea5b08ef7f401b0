// STUB: replaced by the page implementation.
#include "app/config_frame.h"

#include <wx/sizer.h>

wxSizer* ConfigFrame::BuildPatternPage(wxWindow*, bool, bool) { return nullptr; }
void ConfigFrame::OnAddGlobalDirective(wxCommandEvent&) {}
void ConfigFrame::OnAddDcSources(wxCommandEvent&) {}
void ConfigFrame::OnLibraryPathSelected(wxCommandEvent&) {}
void ConfigFrame::OnAddLibraryPath(wxCommandEvent&) {}
void ConfigFrame::OnAddLibraryFile(wxCommandEvent&) {}
void ConfigFrame::OnRemoveLibraryPath(wxCommandEvent&) {}
