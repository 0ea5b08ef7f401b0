#include "app/config_frame.h"

#include "app/ids.h"
#include "app/page_layout.h"
#include "pages/page_controls.h"

#include <wx/intl.h>
#include <wx/sizer.h>

wxSizer* ConfigFrame::BuildSpicePage(wxWindow* parent, bool callFit, bool setSizer)
{
    auto* top = new wxFlexGridSizer(1, 0, 0);
    top->AddGrowableCol(0);
    top->AddGrowableRow(0);

    auto* options = AddOptionBox(top, parent, _("Spice Options"));
    AddOptionRow(options,
                 NewCheckBox(parent, ID_SPICE_ADD_PREFIX,
                             _("Always add primitive prefix in front of instance name"),
                             _("Add the primitive prefix even if the instance name  already starts "
                               "with this prefix")));
    AddOptionRow(
        options,
        NewCheckBox(parent, ID_SPICE_ADD_UNIT, _("Add unit after primitive value"),
                    _("Add unit for transistor parameters values (L, W, AS, AD, PS, PD)")));
    AddOptionRow(options,
                 NewCheckBox(parent, ID_SPICE_ADD_MOS_FACTOR, _("Add MOS multiplicator factor"),
                             _("Indicate that transistors are connected in parallel so "
                               "the effective  widths are multiplied by the "
                               "multiplicity M")));

    return InstallPageSizer(parent, top, callFit, setSizer);
}

void ConfigFrame::OnSpiceAddPrefix(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::add_always_prefix, event, NODE_SPICE_ADD_PREFIX);
}

void ConfigFrame::OnSpiceAddUnit(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::add_unit, event, NODE_SPICE_ADD_UNIT);
}

void ConfigFrame::OnSpiceAddMosFactor(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::add_mos_multi_prefix, event, NODE_SPICE_ADD_MOS_FACTOR);
}
