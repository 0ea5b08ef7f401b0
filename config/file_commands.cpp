// STUB: replaced by the file commands.
#include "app/config_frame.h"

bool ConfigFrame::LoadConfig(const wxString&) { return false; }
bool ConfigFrame::SaveConfig() { return false; }
bool ConfigFrame::SaveConfigAs() { return false; }
void ConfigFrame::OnNewConfig(wxCommandEvent&) {}
void ConfigFrame::OnOpenConfig(wxCommandEvent&) {}
void ConfigFrame::OnSaveConfig(wxCommandEvent&) {}
void ConfigFrame::OnSaveConfigAs(wxCommandEvent&) {}
