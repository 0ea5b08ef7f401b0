// STUB: replaced by the page implementation.
#include "app/config_frame.h"

#include <wx/sizer.h>

wxSizer* ConfigFrame::BuildCommonPage(wxWindow*, bool, bool) { return nullptr; }
void ConfigFrame::OnOpenConfigDialog(wxCommandEvent&) {}
void ConfigFrame::OnBackupNetlist(wxCommandEvent&) {}
void ConfigFrame::OnBackupExtension(wxCommandEvent&) {}
void ConfigFrame::OnShowNetlist(wxCommandEvent&) {}
void ConfigFrame::OnShowPattern(wxCommandEvent&) {}
void ConfigFrame::OnRunOrvik(wxCommandEvent&) {}
void ConfigFrame::OnLoadCircuit(wxCommandEvent&) {}
