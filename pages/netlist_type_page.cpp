#include "app/config_frame.h"

#include "app/ids.h"
#include "app/page_layout.h"
#include "pages/page_controls.h"

#include <wx/intl.h>
#include <wx/radiobox.h>
#include <wx/sizer.h>

wxSizer* ConfigFrame::BuildNetlistTypePage(wxWindow* parent, bool callFit, bool setSizer)
{
    auto* top = new wxBoxSizer(wxVERTICAL);

    auto* types = AddOptionBox(top, parent, _("Netlist type"));
    AddOptionRow(types, NewCheckBox(parent, ID_ALLOW_SPICE, _("SPICE"),
                                    _("Select SPICE as allowed netlisting language")));
    AddOptionRow(types, NewCheckBox(parent, ID_ALLOW_VERILOG, _("Verilog"),
                                    _("Select Verilog as allowed netlisting language")));
    AddOptionRow(types, NewCheckBox(parent, ID_ALLOW_VHDL, _("VHDL / VHDL-AMS"),
                                    _("Select VHDL / VHDL-AMS as allowed netlisting language")));

    // Item order is the order of the codes 'A', 'D', 'V' in OnDefaultLanguage.
    const wxString languages[] = {_("Spice"), _("Verilog"), _("VHDL / VHDL-AMS")};
    auto* language =
        new wxRadioBox(parent, ID_DEFAULT_LANGUAGE, _("Default language"), wxDefaultPosition,
                       wxDefaultSize, WXSIZEOF(languages), languages, 1, wxRA_SPECIFY_COLS);
    language->SetToolTip(_("Select the default language used when the ORVIKTYPE  attribute is not "
                           "specified on a model"));
    top->Add(language, 0, wxGROW | wxALL, 5);

    auto* options = AddOptionBox(top, parent, _("Netlist options"));
    AddOptionRow(options,
                 NewCheckBox(parent, ID_FLATTEN_NETLIST, _("Flatten netlist (Verilog only)"),
                             _("Netlist with no hierarchy and produce flat netlist")));
    AddOptionRow(options, NewCheckBox(parent, ID_FLATTEN_BUSSES, _("Flatten busses"),
                                      _("Expand busses without using parentheses in net names")));

    return InstallPageSizer(parent, top, callFit, setSizer);
}

void ConfigFrame::OnAllowSpice(wxCommandEvent& event)
{
    m_config->spice = event.IsChecked();
    m_config->saved = false;
    RefreshLanguageNodes();
}

void ConfigFrame::OnAllowVerilog(wxCommandEvent& event)
{
    m_config->verilog = event.IsChecked();
    m_config->saved = false;
    RefreshLanguageNodes();
}

void ConfigFrame::OnAllowVhdl(wxCommandEvent& event)
{
    m_config->vhdl = event.IsChecked();
    m_config->saved = false;
    RefreshLanguageNodes();
}

void ConfigFrame::RefreshLanguageNodes()
{
    RefillNode(*this, &ConfigFrame::FillLanguageNodes, NODE_NETLIST_TYPE);
}

void ConfigFrame::OnDefaultLanguage(wxCommandEvent& event)
{
    char code = 'A';
    switch (event.GetInt())
    {
    case 1:
        code = 'D';
        break;
    case 2:
        code = 'V';
        break;
    default: // any other item means Spice
        break;
    }
    m_config->default_orviktype = code;
    RefreshNodeLabel(NODE_DEFAULT_LANGUAGE);
    m_config->saved = false;
}

void ConfigFrame::OnFlattenNetlist(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::flat, event, NODE_FLATTEN_NETLIST);
}

void ConfigFrame::OnFlattenBusses(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::flat_busses, event, NODE_FLATTEN_BUSSES);
}
