#pragma once

#include <wx/app.h>

class ConfigFrame;

// Builds the main window as start-up shows it: sash at 180, wide enough for every page.
ConfigFrame* OpenMainWindow();

class ConfigTool : public wxApp
{
  public:
    bool OnInit() override;
    int OnExit() override;
};
