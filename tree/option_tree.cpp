// STUB: replaced by the option tree implementation.
#include "app/config_frame.h"

#include <wx/treectrl.h>

void ConfigFrame::BuildOptionTree() {}
wxTreeItemId ConfigFrame::FindNodeByPageId(wxTreeCtrl*, int, const wxTreeItemId&) { return {}; }
wxString ConfigFrame::NodeLabel(int) const { return {}; }
void ConfigFrame::RefreshNodeLabel(int) {}
void ConfigFrame::BuildNetlistBranch(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::BuildPatternBranch(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::BuildCommonBranch(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::BuildSpiceBranch(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::BuildVerilogBranch(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::BuildVhdlBranch(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::FillLanguageNodes(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::FillLibraryPathNodes(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::FillTimeScaleNodes(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::FillCapacitorNodes(wxTreeCtrl*, const wxTreeItemId&) {}
void ConfigFrame::FillLibraryDefinitionNodes(wxTreeCtrl*, const wxTreeItemId&) {}
