#pragma once

class wxSizer;
class wxWindow;

// The common ending of every page builder: with setSizer the panel takes the sizer, with
// callFit as well the sizer sets the panel's size hints. Returns the sizer.
wxSizer* InstallPageSizer(wxWindow* parent, wxSizer* sizer, bool callFit, bool setSizer);
