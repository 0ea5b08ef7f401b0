// STUB: replaced by the page implementation.
#include "app/config_frame.h"

#include <wx/sizer.h>

wxSizer* ConfigFrame::BuildNetlistTypePage(wxWindow*, bool, bool) { return nullptr; }
void ConfigFrame::OnAllowSpice(wxCommandEvent&) {}
void ConfigFrame::OnAllowVerilog(wxCommandEvent&) {}
void ConfigFrame::OnAllowVhdl(wxCommandEvent&) {}
void ConfigFrame::OnDefaultLanguage(wxCommandEvent&) {}
void ConfigFrame::OnFlattenNetlist(wxCommandEvent&) {}
void ConfigFrame::OnFlattenBusses(wxCommandEvent&) {}
void ConfigFrame::RefreshLanguageNodes() {}
