// The command bar: the only source of the seven commands, there is no menu.
#include "app/config_frame.h"

#include "app/ids.h"
#include "resources/images.h"

#include <wx/toolbar.h>

void ConfigFrame::CreateCommandBar()
{
    wxToolBar* bar = CreateToolBar(wxTB_HORIZONTAL | wxTB_FLAT | wxNO_BORDER, wxID_ANY);
    bar->SetToolBitmapSize(wxSize(24, 24));
    BuildCommandBar(bar);
}

void ConfigFrame::BuildCommandBar(wxToolBar* toolBar)
{
    // GTK takes margins only before the first tool.
    toolBar->SetMargins(1, 1);
    // The tool tip and the status bar text are the same; the greyed picture is the toolkit's.
    const auto addTool = [toolBar](int id, int image, const wxString& help)
    {
        toolBar->AddTool(id, wxEmptyString, CommandBarBitmap(image), wxNullBitmap, wxITEM_NORMAL,
                         help, help);
    };
    addTool(ID_TOOL_NEW, 0, _("Create a new configuration file"));
    addTool(ID_TOOL_OPEN, 1, _("Open a configuration file"));
    addTool(ID_TOOL_SAVE, 2, _("Save the configuration file"));
    addTool(ID_TOOL_SAVE_AS, 3, _("Save the options in a new configuration file"));
    toolBar->AddSeparator();
    addTool(ID_TOOL_EXPAND, 4, _("Expand a selected node"));
    addTool(ID_TOOL_COLLAPSE, 5, _("Collapse a selected node"));
    toolBar->AddSeparator();
    addTool(ID_TOOL_GENERATE, 6, _("Generate the netlist"));
    // Enabled by start-up only when the netlister passed a file.
    toolBar->EnableTool(ID_TOOL_GENERATE, false);
    toolBar->Realize();
}
