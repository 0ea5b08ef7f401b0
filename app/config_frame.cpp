#include "app/config_frame.h"

#include "app/ids.h"
#include "app/page_layout.h"
#include "resources/images.h"

#include <algorithm>

#include <wx/font.h>
#include <wx/panel.h>
#include <wx/sizer.h>
#include <wx/splitter.h>
#include <wx/statbmp.h>
#include <wx/stattext.h>
#include <wx/statusbr.h>
#include <wx/treectrl.h>

namespace
{

// Page panels in the order they are built: the welcome page first.
constexpr int PAGE_BUILD_ORDER[] = {ID_PAGE_WELCOME,
                                    ID_PAGE_NETLIST_TYPE,
                                    ID_PAGE_PATTERN,
                                    ID_PAGE_COMMON,
                                    ID_PAGE_SPICE,
                                    ID_PAGE_VHDL_OPTIONS,
                                    ID_PAGE_VERILOG_OPTIONS,
                                    ID_PAGE_VERILOG_DIRECTIVES,
                                    ID_PAGE_LIBRARY_DEFINITIONS};

wxPanel* NewPane(wxWindow* parent, wxWindowID id = wxID_ANY)
{
    return new wxPanel(parent, id, wxDefaultPosition, wxDefaultSize, wxTAB_TRAVERSAL | wxNO_BORDER);
}

} // namespace

wxSizer* InstallPageSizer(wxWindow* parent, wxSizer* sizer, bool callFit, bool setSizer)
{
    if (setSizer)
    {
        parent->SetSizer(sizer);
        if (callFit)
            sizer->SetSizeHints(parent);
    }
    return sizer;
}

ConfigFrame::ConfigFrame(wxWindow* parent, wxWindowID id, const wxString& title, const wxPoint& pos,
                         const wxSize& size, long style)
{
    Create(parent, id, title, pos, size, style);
    CreateCommandBar();

    CreateStatusBar(1, wxSTB_DEFAULT_STYLE, 0);
    SetStatusText(wxString::Format("ORVIK netlist configuration tool %d.%d.%d%s - Welcome!",
                                   RELEASE_MAJOR, RELEASE_MINOR, RELEASE_MICRO, ""));

    auto* mainPanel = NewPane(this);
    BuildMainPanel(mainPanel, true, true);

    wxWindow* host = FindWindow(ID_PAGE_HOST);
    for (const int pageId : PAGE_BUILD_ORDER)
    {
        auto* page = NewPane(host, pageId);
        switch (pageId)
        {
        case ID_PAGE_WELCOME:
            BuildWelcomePage(page, true, true);
            break;
        case ID_PAGE_NETLIST_TYPE:
            BuildNetlistTypePage(page, true, true);
            break;
        case ID_PAGE_PATTERN:
            BuildPatternPage(page, true, true);
            break;
        case ID_PAGE_COMMON:
            BuildCommonPage(page, true, true);
            break;
        case ID_PAGE_SPICE:
            BuildSpicePage(page, true, true);
            break;
        default: // pages still to come stay empty panels
            break;
        }
    }

    m_config = std::make_unique<ConfigRecord>();
    BuildOptionTree();

    m_pageSizer = new wxFlexGridSizer(8, 0, 0);
    m_pageSizer->AddGrowableRow(0);
    m_pageSizer->AddGrowableCol(0);
    host->SetSizer(m_pageSizer);
    host->SetAutoLayout(true);

    ShowPage(nullptr, PAGE_ID_NONE);
    // Not put in the page sizer: it keeps its own size until a node is selected.
    FindWindow(ID_PAGE_WELCOME)->Show();
    ResetLibraryEditor();
    SetIcons(AppIcons());
}

ConfigFrame::~ConfigFrame() = default;

wxTreeCtrl* ConfigFrame::Tree() const { return FindCtrl<wxTreeCtrl>(ID_OPTION_TREE); }

// 520 x 450 was chosen for narrower fonts than desktops use today: a window a little larger
// beats an option whose label is cut off.
void ConfigFrame::GrowToShowPages()
{
    wxWindow* host = FindWindow(ID_PAGE_HOST);
    if (!host)
        return;
    wxSize needed;
    for (int id = ID_PAGE_FIRST; id <= ID_PAGE_LAST; ++id)
        if (const wxWindow* page = FindWindow(id))
            needed.IncTo(page->GetMinSize());
    SendSizeEvent();
    const wxSize available = host->GetSize();
    const wxSize missing(std::max(0, needed.x - available.x), std::max(0, needed.y - available.y));
    if (missing.x > 0 || missing.y > 0)
        SetSize(GetSize() + missing);
}

wxSizer* ConfigFrame::BuildMainPanel(wxWindow* parent, bool callFit, bool setSizer)
{
    auto* top = new wxFlexGridSizer(2, 0, 0);
    top->AddGrowableCol(0);
    top->AddGrowableRow(0);

    auto* splitter =
        new wxSplitterWindow(parent, ID_SPLITTER, wxDefaultPosition, wxSize(200, -1),
                             wxSP_3DSASH | wxSP_3DBORDER | wxSIMPLE_BORDER, "splitter");
    splitter->SetMinimumPaneSize(5);
    auto* treePane = NewPane(splitter);
    BuildTreePane(treePane, false, true);
    auto* pagePane = NewPane(splitter);
    BuildPageHostPane(pagePane, false, true);
    splitter->SplitVertically(treePane, pagePane);
    top->Add(splitter, 0, wxGROW | wxALL, 5);

    return InstallPageSizer(parent, top, callFit, setSizer);
}

wxSizer* ConfigFrame::BuildTreePane(wxWindow* parent, bool callFit, bool setSizer)
{
    auto* top = new wxFlexGridSizer(2, 0, 0);
    top->AddGrowableCol(0);
    top->AddGrowableRow(0);
    auto* tree = new wxTreeCtrl(parent, ID_OPTION_TREE, wxDefaultPosition, wxSize(200, -1),
                                wxTR_HAS_BUTTONS | wxTR_LINES_AT_ROOT | wxNO_BORDER);
    top->Add(tree, 0, wxGROW, 5);
    return InstallPageSizer(parent, top, callFit, setSizer);
}

wxSizer* ConfigFrame::BuildPageHostPane(wxWindow* parent, bool callFit, bool setSizer)
{
    auto* top = new wxFlexGridSizer(1, 0, 0);
    top->AddGrowableCol(0);
    top->AddGrowableRow(0);
    auto* host = new wxPanel(parent, ID_PAGE_HOST, wxDefaultPosition, wxDefaultSize, 0);
    top->Add(host, 0, wxGROW, 5);
    return InstallPageSizer(parent, top, callFit, setSizer);
}

wxSizer* ConfigFrame::BuildWelcomePage(wxWindow* parent, bool callFit, bool setSizer)
{
    auto* top = new wxFlexGridSizer(2, 10, 0);
    top->AddGrowableCol(1);
    top->AddGrowableRow(1);

    top->Add(new wxStaticBitmap(parent, ID_LOGO, LogoBitmap(0)), 0, wxALIGN_CENTER_VERTICAL | wxALL,
             5);

    auto* title =
        new wxStaticText(parent, ID_LABEL, _("Welcome to the ORVIK\nnetlist configuration tool"),
                         wxDefaultPosition, wxDefaultSize, wxALIGN_CENTRE_HORIZONTAL);
    title->SetFont(wxFont(16, wxFONTFAMILY_ROMAN, wxFONTSTYLE_NORMAL, wxFONTWEIGHT_NORMAL, false,
                          wxEmptyString));
    top->Add(title, 0, wxGROW | wxALL, 5);

    top->Add(20, 10, 0, wxGROW | wxALL, 5);

    top->Add(new wxStaticText(parent, ID_LABEL,
                              _("To change the configuration, \nselect a option in the tree.\n\n"
                                "Selected option appears in this panel."),
                              wxDefaultPosition, wxDefaultSize, wxALIGN_CENTRE_HORIZONTAL),
             0, wxALIGN_CENTER_HORIZONTAL | wxALL, 5);

    return InstallPageSizer(parent, top, callFit, setSizer);
}
