// The Verilog directives page is still to come: its panel stays empty and its events do nothing.
#include "app/config_frame.h"

void ConfigFrame::OnTimescaleDefine(wxCommandEvent&) {}
void ConfigFrame::OnTimescaleUnit(wxCommandEvent&) {}
void ConfigFrame::OnTimescalePrecision(wxCommandEvent&) {}
void ConfigFrame::OnCapacitorDefine(wxCommandEvent&) {}
void ConfigFrame::OnCapacitorScale(wxCommandEvent&) {}
void ConfigFrame::OnCapacitorDelay(wxCommandEvent&) {}
