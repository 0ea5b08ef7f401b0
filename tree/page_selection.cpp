// STUB: replaced by the page selection implementation.
#include "app/config_frame.h"

#include "app/ids.h"

#include <wx/sizer.h>
#include <wx/treectrl.h>

void ConfigFrame::OnTreeSelChanged(wxTreeEvent&) {}
void ConfigFrame::ShowPage(wxWindow* page, int pageId)
{
    for (int id = ID_PAGE_FIRST; id <= ID_PAGE_LAST; ++id)
        if (wxWindow* w = FindWindow(id))
        {
            w->Show(false);
            m_pageSizer->Detach(w);
        }
    if (page)
    {
        LoadPageControls(page, pageId);
        page->Show(true);
        m_pageSizer->Add(page, 1, wxGROW | wxALL, 0);
    }
    m_pageSizer->Layout();
}
void ConfigFrame::LoadPageControls(wxWindow*, int) {}
void ConfigFrame::RefreshCurrentPage() {}
void ConfigFrame::FillActiveLibraryChoice() {}
void ConfigFrame::OnExpandNode(wxCommandEvent&) {}
void ConfigFrame::OnCollapseNode(wxCommandEvent&) {}
void ConfigFrame::ExpandSubtree(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::CollapseSubtree(wxTreeCtrl*, const wxTreeItemId&) {}
