#include "app/config_frame.h"

#include "app/ids.h"
#include "app/page_layout.h"
#include "config/text_conv.h"
#include "pages/page_controls.h"

#include <wx/combobox.h>
#include <wx/intl.h>
#include <wx/sizer.h>
#include <wx/stattext.h>

namespace
{

// A small grid that indents a control under the check box it depends on.
wxFlexGridSizer* NewIndentGrid()
{
    auto* grid = new wxFlexGridSizer(2, 0, 0);
    grid->AddGrowableCol(0);
    grid->AddGrowableRow(0);
    return grid;
}

} // namespace

wxSizer* ConfigFrame::BuildCommonPage(wxWindow* parent, bool callFit, bool setSizer)
{
    auto* top = new wxBoxSizer(wxVERTICAL);

    auto* before = AddOptionBox(top, parent, _("Before netlisting"));
    AddOptionRow(before,
                 NewCheckBox(parent, ID_OPEN_CONFIG_DIALOG, _("Open ZidovAde configuration"),
                             _("Open this configuration manager before each netlist generation")));
    AddOptionRow(
        before,
        NewCheckBox(parent, ID_BACKUP_NETLIST, _("Backup existing netlist"),
                    _("Backup existing netlist & pattern files with the defined extension")));

    auto* extension = NewIndentGrid();
    before->Add(extension, 0, 0, 5); // no centring: meaningless in a vertical sizer
    extension->Add(5, 5, 0, wxALIGN_CENTER | wxALL, 5);
    extension->Add(new wxStaticText(parent, ID_LABEL, _("Defined extension")), 0,
                   wxALIGN_CENTER_VERTICAL, 5);
    extension->Add(4, 10, 0, wxALIGN_CENTER | wxALL, 5);
    const wxString extensions[] = {_(".bak")};
    extension->Add(new wxComboBox(parent, ID_BACKUP_EXTENSION, wxEmptyString, wxDefaultPosition,
                                  wxSize(100, -1), WXSIZEOF(extensions), extensions, wxCB_DROPDOWN),
                   0, wxALIGN_CENTER, 5);

    auto* after = AddOptionBox(top, parent, _("After netlisting"));
    AddOptionRow(
        after,
        NewCheckBox(parent, ID_SHOW_NETLIST, _("Show netlist file (.nsx) "),
                    _("Open the netlist file with the default text editor after netlisting")));
    AddOptionRow(
        after,
        NewCheckBox(parent, ID_SHOW_PATTERN, _("Show pattern file (.pat)"),
                    _("Open the pattern file with the default text editor after netlisting")));
    AddOptionRow(
        after, NewCheckBox(parent, ID_RUN_ORVIK, _("Run ORVIK"), _("Run ORVIK after netlisting")));

    auto* circuit = NewIndentGrid();
    after->Add(circuit, 0, 0, 5); // no centring: meaningless in a vertical sizer
    circuit->Add(5, 5, 0, wxALIGN_CENTER | wxALL, 5);
    circuit->Add(NewCheckBox(parent, ID_LOAD_CIRCUIT, _("Load circuit"),
                             _("Load circuit and show netlist & pattern files")),
                 0, wxALIGN_CENTER | wxALL, 5);

    return InstallPageSizer(parent, top, callFit, setSizer);
}

void ConfigFrame::OnOpenConfigDialog(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::open_config_dialog, event, NODE_OPEN_CONFIG_DIALOG);
}

void ConfigFrame::OnBackupNetlist(wxCommandEvent& event)
{
    m_config->create_backup_file = event.IsChecked();
    RefreshPageKeepingFocus(*this); // the extension box follows the flag
    m_config->saved = false;
    RefreshNodeLabel(NODE_BACKUP_NETLIST);
}

// Every keystroke lands here. Nothing in it may reload the combo box: ChangeValue would put
// the caret back at the start while the user is still typing.
void ConfigFrame::OnBackupExtension(wxCommandEvent& event)
{
    m_config->backup_extension = FromWx(event.GetString());
    m_config->saved = false;
    RefreshNodeLabel(NODE_BACKUP_EXTENSION);
}

void ConfigFrame::OnShowNetlist(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::show_nsx, event, NODE_SHOW_NETLIST);
}

void ConfigFrame::OnShowPattern(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::show_pat, event, NODE_SHOW_PATTERN);
}

void ConfigFrame::OnRunOrvik(wxCommandEvent& event)
{
    m_config->run_orvik = event.IsChecked();
    RefreshPageKeepingFocus(*this); // "Load circuit" follows the flag; its value stays
    m_config->saved = false;
    RefreshNodeLabel(NODE_RUN_ORVIK);
}

void ConfigFrame::OnLoadCircuit(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::load_circuit, event, NODE_LOAD_CIRCUIT);
}
