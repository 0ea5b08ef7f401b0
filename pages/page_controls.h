#pragma once

#include "app/config_frame.h"

#include <wx/checkbox.h>
#include <wx/sizer.h>
#include <wx/statbox.h>
#include <wx/treectrl.h>
#include <wx/weakref.h>

// A check box with its tooltip, created clear, as the option pages make them.
inline wxCheckBox* NewCheckBox(wxWindow* parent, int id, const wxString& label, const wxString& tip)
{
    auto* box = new wxCheckBox(parent, id, label);
    box->SetToolTip(tip);
    return box;
}

// A titled group of options, stretched across the page.
inline wxStaticBoxSizer* AddOptionBox(wxSizer* top, wxWindow* parent, const wxString& title)
{
    auto* box = new wxStaticBoxSizer(new wxStaticBox(parent, wxID_ANY, title), wxVERTICAL);
    top->Add(box, 0, wxGROW | wxALL, 5);
    return box;
}

// One option per row of a vertical static box sizer. Centring vertically means nothing in a
// vertical sizer, and wx asserts on flags it ignores.
inline void AddOptionRow(wxSizer* column, wxWindow* control) { column->Add(control, 0, wxALL, 5); }

// The change every option check box makes: its field, the unsaved mark, its node's label.
inline void StoreCheck(ConfigFrame& frame, bool ConfigRecord::*field, const wxCommandEvent& event,
                       int pageId)
{
    frame.Config().*field = event.IsChecked();
    frame.Config().saved = false;
    frame.RefreshNodeLabel(pageId);
}

// Refills the children of the node with the given PageId and opens it; a node that is not in
// the tree is skipped. `fill` is one of the frame's refillers.
using NodeFiller = void (ConfigFrame::*)(wxTreeCtrl*, const wxTreeItemId&);
inline void RefillNode(ConfigFrame& frame, NodeFiller fill, int pageId)
{
    wxTreeCtrl* tree = frame.Tree();
    if (!tree)
        return;
    const wxTreeItemId node = ConfigFrame::FindNodeByPageId(tree, pageId, tree->GetRootItem());
    if (!node.IsOk())
        return;
    (frame.*fill)(tree, node);
    tree->Expand(node);
}

// Re-showing the page hides it for a moment, which takes the keyboard focus from the control the
// user has just used; the focus goes back to it so that Tab and Space go on from there.
inline void RefreshPageKeepingFocus(ConfigFrame& frame)
{
    const wxWeakRef<wxWindow> focus = wxWindow::FindFocus();
    frame.RefreshCurrentPage();
    if (focus && focus->IsShownOnScreen() && wxWindow::FindFocus() != focus)
        focus->SetFocus();
}
