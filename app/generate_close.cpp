// STUB: replaced by Generate and close.
#include "app/config_frame.h"

void ConfigFrame::OnQuit(wxCommandEvent&) { Close(true); }
void ConfigFrame::OnCloseWindow(wxCloseEvent&) { Destroy(); }
void ConfigFrame::OnGenerate(wxCommandEvent&) {}
