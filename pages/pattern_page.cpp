#include "app/config_frame.h"

#include "app/ids.h"
#include "app/page_layout.h"
#include "config/text_conv.h"
#include "pages/page_controls.h"

#include <wx/button.h>
#include <wx/dirdlg.h>
#include <wx/filedlg.h>
#include <wx/intl.h>
#include <wx/listbox.h>
#include <wx/sizer.h>

#include <algorithm>

namespace
{

// Entries are compared as the list box shows them (ToWx): a path read from a Latin-1 file and
// the same path chosen now differ in bytes but are one entry to the user.
const std::string* FindShownPath(const LibraryPathList& paths, const wxString& shown)
{
    const auto it = std::find_if(paths.begin(), paths.end(),
                                 [&shown](const std::string& path) { return ToWx(path) == shown; });
    return it == paths.end() ? nullptr : &*it;
}

void AddChosenPath(ConfigRecord& config, const wxString& chosen)
{
    if (chosen.empty() || FindShownPath(config.library_paths, chosen)) // empty names nothing
        return;
    config.AddLibraryPath(FromWx(chosen));
}

} // namespace

wxSizer* ConfigFrame::BuildPatternPage(wxWindow* parent, bool callFit, bool setSizer)
{
    auto* top = new wxFlexGridSizer(1, 0, 0);
    top->AddGrowableCol(0);
    // The list takes the height there is. At the window's first size GTK's taller buttons leave
    // less than the list's 160 pixels, and a list of fixed height pushes "Remove" off the page.
    top->AddGrowableRow(1);

    auto* pattern = AddOptionBox(top, parent, _("Pattern Options"));
    AddOptionRow(pattern, NewCheckBox(parent, ID_ADD_GLOBAL, _("Add .GLOBAL directive"),
                                      _("Add global nets in the .GLOBAL directive")));
    AddOptionRow(pattern, NewCheckBox(parent, ID_ADD_DC_SOURCES, _("Add DC sources"),
                                      _("Add voltage DC sources on unconnected IO pins")));

    auto* libraries = AddOptionBox(top, parent, _("Process Libraries Path / File"));
    auto* list = new wxListBox(parent, ID_LIBRARY_PATH_LIST, wxDefaultPosition, wxSize(80, 160), 0,
                               nullptr, wxLB_SINGLE | wxLB_NEEDED_SB);
    list->SetMinSize(wxSize(80, 80));
    libraries->Add(list, 1, wxGROW | wxALL, 5);

    auto* buttons = new wxFlexGridSizer(2, 0, 0);
    buttons->AddGrowableCol(0);
    buttons->AddGrowableRow(0);
    libraries->Add(buttons, 0, wxALL, 5);
    buttons->Add(new wxButton(parent, ID_ADD_LIBRARY_PATH, _("Add Path")), 0, wxGROW | wxALL, 5);
    buttons->Add(new wxButton(parent, ID_ADD_LIBRARY_FILE, _("Add File")), 0,
                 wxALIGN_CENTER | wxALL, 5);
    buttons->Add(new wxButton(parent, ID_REMOVE_LIBRARY_PATH, _("Remove")), 0,
                 wxALIGN_CENTER | wxALL, 5);

    return InstallPageSizer(parent, top, callFit, setSizer);
}

void ConfigFrame::OnAddGlobalDirective(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::add_global, event, NODE_ADD_GLOBAL);
}

void ConfigFrame::OnAddDcSources(wxCommandEvent& event)
{
    StoreCheck(*this, &ConfigRecord::add_dc_sources, event, NODE_ADD_DC_SOURCES);
}

void ConfigFrame::OnLibraryPathSelected(wxCommandEvent& event)
{
    SetStatusText(event.GetString(), 0);
    m_config->saved = false;
}

void ConfigFrame::OnAddLibraryPath(wxCommandEvent&)
{
    wxDirDialog dialog(this, "Add a library path", wxEmptyString, 0);
    if (dialog.ShowModal() == wxID_OK)
        AddChosenPath(*m_config, dialog.GetPath());
    RefreshPageKeepingFocus(*this);
    m_config->saved = false;
    RefillNode(*this, &ConfigFrame::FillLibraryPathNodes, NODE_LIBRARIES);
}

void ConfigFrame::OnAddLibraryFile(wxCommandEvent&)
{
    wxFileDialog dialog(this, "Add a library file", wxEmptyString, wxEmptyString,
                        "All files (*.*)|*.*", wxFD_OPEN);
    if (dialog.ShowModal() == wxID_OK)
        AddChosenPath(*m_config, dialog.GetPath());
    RefreshPageKeepingFocus(*this);
    m_config->saved = false;
    RefillNode(*this, &ConfigFrame::FillLibraryPathNodes, NODE_LIBRARIES);
}

void ConfigFrame::OnRemoveLibraryPath(wxCommandEvent&)
{
    if (auto* list = FindCtrl<wxListBox>(ID_LIBRARY_PATH_LIST))
    {
        const wxString selected = list->GetStringSelection();
        if (!selected.empty())
            if (const std::string* path = FindShownPath(m_config->library_paths, selected))
                m_config->RemoveLibraryPath(std::string(*path)); // a copy: the entry goes away
        RefreshPageKeepingFocus(*this);
    }
    m_config->saved = false;
    RefillNode(*this, &ConfigFrame::FillLibraryPathNodes, NODE_LIBRARIES);
}
