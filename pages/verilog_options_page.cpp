// The Verilog options page is still to come: its panel stays empty and its events do nothing.
#include "app/config_frame.h"

void ConfigFrame::OnVerilogConnectivity(wxCommandEvent&) {}
void ConfigFrame::OnVerilogCase(wxCommandEvent&) {}
void ConfigFrame::OnVerilogGlobalNet(wxCommandEvent&) {}
void ConfigFrame::OnVerilogSupply1(wxCommandEvent&) {}
void ConfigFrame::OnVerilogSupply0(wxCommandEvent&) {}
