// STUB: replaced by the page implementation.
#include "app/config_frame.h"

#include <wx/sizer.h>

wxSizer* ConfigFrame::BuildSpicePage(wxWindow*, bool, bool) { return nullptr; }
void ConfigFrame::OnSpiceAddPrefix(wxCommandEvent&) {}
void ConfigFrame::OnSpiceAddUnit(wxCommandEvent&) {}
void ConfigFrame::OnSpiceAddMosFactor(wxCommandEvent&) {}
