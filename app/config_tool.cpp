#include "app/config_tool.h"

#include "app/config_frame.h"
#include "app/ids.h"

#include <wx/splitter.h>
#include <wx/toolbar.h>

ConfigFrame* OpenMainWindow()
{
    auto* frame = new ConfigFrame(nullptr, wxID_ANY, "ZIDOVADE Configuration Tool", wxPoint(20, 20),
                                  wxSize(520, 450));
    if (auto* splitter = frame->FindCtrl<wxSplitterWindow>(ID_SPLITTER))
        splitter->SetSashPosition(180, true);
    frame->GrowToShowPages();
    frame->Show(true);
    return frame;
}

bool ConfigTool::OnInit()
{
    // No base OnInit: it would parse the command line and refuse unexpected arguments, while the
    // netlister passes one path and anything after it is ignored.
    ConfigFrame* frame = OpenMainWindow();

    if (argc > 1)
    {
        frame->LoadConfig(argv[1]);
        if (wxWindow* welcome = frame->FindWindow(ID_PAGE_WELCOME))
            welcome->Show();
        if (wxToolBar* bar = frame->GetToolBar())
            bar->EnableTool(ID_TOOL_GENERATE, true);
    }
    return true;
}

int ConfigTool::OnExit()
{
    wxApp::OnExit();
    // The netlister reads the outcome from the file alone.
    return 0;
}
