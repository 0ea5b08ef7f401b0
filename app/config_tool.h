#pragma once

#include <wx/app.h>

class ConfigTool : public wxApp
{
  public:
    bool OnInit() override;
    int OnExit() override;
};
