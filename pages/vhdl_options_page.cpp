// The VHDL options page is still to come: its panel stays empty and its events do nothing.
#include "app/config_frame.h"

void ConfigFrame::OnNetType(wxCommandEvent&) {}
void ConfigFrame::OnBusType(wxCommandEvent&) {}
void ConfigFrame::OnArchitectureName(wxCommandEvent&) {}
void ConfigFrame::OnConfigurationPrefix(wxCommandEvent&) {}
void ConfigFrame::OnActiveLibrary(wxCommandEvent&) {}
