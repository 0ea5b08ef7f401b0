#pragma once

#include <wx/string.h>
#include <wx/treebase.h>

class wxTreeCtrl;
class wxWindow;

// What a tree node stands for: the page shown when it is selected, and the id by which handlers
// find it to rewrite its label or children (0 for nodes nobody looks up).
class OptionItemData : public wxTreeItemData
{
  public:
    OptionItemData(wxWindow* page, int pageId) : page(page), pageId(pageId) {}

    wxWindow* page; // not owned
    int pageId;
};

// The item data of a node, or nullptr for an invalid node or one without data.
OptionItemData* NodeData(const wxTreeCtrl* tree, const wxTreeItemId& node);

// Tree labels show flags as "Yes" / "No", not as the file's "yes" / "no".
const char* YesNoText(bool value);
