#include "app/config_frame.h"

#include "app/ids.h"
#include "config/text_conv.h"
#include "tree/option_tree.h"

#include <wx/checkbox.h>
#include <wx/combobox.h>
#include <wx/grid.h>
#include <wx/listbox.h>
#include <wx/radiobox.h>
#include <wx/sizer.h>
#include <wx/textentry.h>
#include <wx/treectrl.h>

namespace
{

// Loading never raises a control's change event: that would run its handler and clear 'saved'.
// A check box's SetValue and a radio box's SetSelection raise none; text entries need
// ChangeValue.
void LoadCheck(const ConfigFrame& frame, int id, bool value)
{
    if (auto* box = frame.FindCtrl<wxCheckBox>(id))
        box->SetValue(value);
}

// A negative item, from a code the record should not hold, leaves the selection as it is.
void LoadRadio(const ConfigFrame& frame, int id, int item)
{
    if (auto* radio = frame.FindCtrl<wxRadioBox>(id))
        if (item >= 0 && static_cast<unsigned>(item) < radio->GetCount())
            radio->SetSelection(item);
}

void LoadText(const ConfigFrame& frame, int id, const wxString& text)
{
    if (auto* entry = frame.FindCtrl<wxTextEntry>(id))
        entry->ChangeValue(text);
}

// An absent text leaves the control as it is.
void LoadPresentText(const ConfigFrame& frame, int id, const std::optional<std::string>& text)
{
    if (text)
        LoadText(frame, id, ToWx(*text));
}

void EnableCtrl(const ConfigFrame& frame, int id, bool enable)
{
    if (wxWindow* control = frame.FindWindow(id))
        control->Enable(enable);
}

int CodeItem(char code, const char* codes)
{
    for (int item = 0; codes[item]; ++item)
        if (codes[item] == code)
            return item;
    return -1;
}

bool HasText(const std::optional<std::string>& text) { return text && !text->empty(); }

} // namespace

ConfigFrame::NodeKey ConfigFrame::NodeKey::Of(const wxTreeCtrl* tree, const wxTreeItemId& node)
{
    const OptionItemData* data = NodeData(tree, node);
    return {data ? data->page : nullptr, data ? data->pageId : 0, data != nullptr,
            tree->GetItemText(node)};
}

// Nodes with a PageId of their own are the same node whatever their label now says; the others
// are known by their text.
bool ConfigFrame::NodeKey::SameNode(const NodeKey& other) const
{
    if (hasData != other.hasData || page != other.page || pageId != other.pageId)
        return false;
    const bool ownId = hasData && pageId != PAGE_ID_NONE && pageId != NODE_LIBRARY_ENTRY;
    return ownId || text == other.text;
}

void ConfigFrame::OnTreeSelChanged(wxTreeEvent& event)
{
    if (m_quietSelection)
        return;
    m_selectionLost = false; // the user's choice wins over any selection still to be put back
    const wxTreeItemId node = event.GetItem();
    if (!node.IsOk())
        return;
    const OptionItemData* data = NodeData(Tree(), node);
    ShowPage(data ? data->page : nullptr, data ? data->pageId : PAGE_ID_NONE);
}

void ConfigFrame::ShowPage(wxWindow* page, int pageId)
{
    for (int id = ID_PAGE_FIRST; id <= ID_PAGE_LAST; ++id)
        if (wxWindow* shown = FindWindow(id))
        {
            shown->Show(false);
            if (m_pageSizer)
                m_pageSizer->Detach(shown);
        }
    if (page)
    {
        LoadPageControls(page, pageId);
        page->Show(true);
        if (m_pageSizer)
            m_pageSizer->Add(page, 1, wxGROW | wxALL, 0);
    }
    if (m_pageSizer)
        m_pageSizer->Layout();
}

void ConfigFrame::LoadPageControls(wxWindow* page, int pageId)
{
    if (!page || !m_config)
        return;
    ConfigRecord& c = *m_config;
    switch (page->GetId())
    {
    case ID_PAGE_NETLIST_TYPE:
        LoadCheck(*this, ID_ALLOW_SPICE, c.spice);
        LoadCheck(*this, ID_ALLOW_VERILOG, c.verilog);
        LoadCheck(*this, ID_ALLOW_VHDL, c.vhdl);
        LoadRadio(*this, ID_DEFAULT_LANGUAGE, CodeItem(c.default_orviktype, "ADV"));
        LoadCheck(*this, ID_FLATTEN_NETLIST, c.flat);
        LoadCheck(*this, ID_FLATTEN_BUSSES, c.flat_busses);
        break;

    case ID_PAGE_PATTERN:
        LoadCheck(*this, ID_ADD_GLOBAL, c.add_global);
        LoadCheck(*this, ID_ADD_DC_SOURCES, c.add_dc_sources);
        if (auto* list = FindCtrl<wxListBox>(ID_LIBRARY_PATH_LIST))
        {
            list->Clear();
            for (unsigned i = 0; i < c.library_paths.size(); ++i)
                list->Insert(ToWx(c.library_paths[i]), i);
        }
        break;

    case ID_PAGE_COMMON:
        LoadCheck(*this, ID_OPEN_CONFIG_DIALOG, c.open_config_dialog);
        LoadCheck(*this, ID_BACKUP_NETLIST, c.create_backup_file);
        LoadText(*this, ID_BACKUP_EXTENSION, ToWx(c.backup_extension));
        EnableCtrl(*this, ID_BACKUP_EXTENSION, c.create_backup_file);
        LoadCheck(*this, ID_SHOW_NETLIST, c.show_nsx);
        LoadCheck(*this, ID_SHOW_PATTERN, c.show_pat);
        LoadCheck(*this, ID_RUN_ORVIK, c.run_orvik);
        LoadCheck(*this, ID_LOAD_CIRCUIT, c.load_circuit);
        EnableCtrl(*this, ID_LOAD_CIRCUIT, c.run_orvik);
        break;

    case ID_PAGE_SPICE:
        LoadCheck(*this, ID_SPICE_ADD_PREFIX, c.add_always_prefix);
        LoadCheck(*this, ID_SPICE_ADD_UNIT, c.add_unit);
        LoadCheck(*this, ID_SPICE_ADD_MOS_FACTOR, c.add_mos_multi_prefix);
        break;

    case ID_PAGE_VERILOG_OPTIONS:
        LoadRadio(*this, ID_VERILOG_CONNECTIVITY, c.use_named_port ? 0 : 1);
        LoadRadio(*this, ID_VERILOG_CASE, CodeItem(c.case_, "ULA"));
        if (auto* globalNet = FindCtrl<wxCheckBox>(ID_VERILOG_GLOBAL_NET))
        {
            // Power nets need both supply names; without them the option cannot hold.
            const bool supplies = HasText(c.supply1) && HasText(c.supply0);
            if (!supplies && c.global_net_as_supply)
            {
                c.global_net_as_supply = false;
                RefreshNodeLabel(NODE_GLOBAL_NET);
            }
            globalNet->Enable(supplies);
            globalNet->SetValue(c.global_net_as_supply);
        }
        LoadPresentText(*this, ID_VERILOG_SUPPLY1, c.supply1);
        LoadPresentText(*this, ID_VERILOG_SUPPLY0, c.supply0);
        break;

    case ID_PAGE_VERILOG_DIRECTIVES:
        LoadCheck(*this, ID_TIMESCALE_DEFINE, c.use_define_timescale);
        LoadPresentText(*this, ID_TIMESCALE_UNIT, c.timescale_unit);
        EnableCtrl(*this, ID_TIMESCALE_UNIT, c.use_define_timescale);
        LoadPresentText(*this, ID_TIMESCALE_PRECISION, c.timescale_precision);
        EnableCtrl(*this, ID_TIMESCALE_PRECISION, c.use_define_timescale);
        LoadCheck(*this, ID_CAPACITOR_DEFINE, c.use_define_capacitor);
        LoadPresentText(*this, ID_CAPACITOR_SCALE, c.capacitor_scale);
        EnableCtrl(*this, ID_CAPACITOR_SCALE, c.use_define_capacitor);
        LoadPresentText(*this, ID_CAPACITOR_DELAY, c.capacitor_delay_coefficient);
        EnableCtrl(*this, ID_CAPACITOR_DELAY, c.use_define_capacitor);
        break;

    case ID_PAGE_VHDL_OPTIONS:
        LoadPresentText(*this, ID_NET_TYPE, c.net_type);
        LoadPresentText(*this, ID_BUS_TYPE, c.bus_type);
        LoadPresentText(*this, ID_ARCHITECTURE_NAME, c.archi_name);
        LoadPresentText(*this, ID_CONFIGURATION_PREFIX, c.config_prefix);
        FillActiveLibraryChoice();
        break;

    case ID_PAGE_LIBRARY_DEFINITIONS:
        ResetLibraryEditor();
        if (pageId == NODE_LIBRARY_ENTRY)
            LoadLibraryEditor();
        break;

    default: // the welcome page shows nothing of the record
        break;
    }
}

void ConfigFrame::LoadLibraryEditor()
{
    wxTreeCtrl* tree = Tree();
    wxTreeItemId node = tree ? tree->GetSelection() : wxTreeItemId();
    if (!node.IsOk())
        return;
    if (!tree->ItemHasChildren(node)) // a line: the library is its parent
        node = tree->GetItemParent(node);
    if (!node.IsOk())
        return;
    // Compared as shown: bytes that are not UTF-8 do not survive a trip through the screen.
    const wxString name = tree->GetItemText(node);

    auto* grid = FindCtrl<wxGrid>(ID_LIBRARY_GRID);
    if (grid)
        for (int row = grid->GetNumberRows() - 1; row >= 0; --row)
            grid->DeleteRows(row);
    LoadText(*this, ID_LIBRARY_NAME, name);
    if (!grid)
        return;
    int row = 0;
    for (const LibraryLine& entry : m_config->library_definitions)
        if (ToWx(entry.name) == name)
        {
            grid->AppendRows(1);
            if (grid->GetNumberCols() > 0)
                grid->SetCellValue(row, 0, ToWx(entry.line));
            ++row;
        }
    grid->AppendRows(1); // where a new line is typed
}

void ConfigFrame::RefreshCurrentPage()
{
    wxTreeCtrl* tree = Tree();
    if (!tree)
        return;
    RestoreLostSelection(tree);
    const wxTreeItemId node = tree->GetSelection();
    if (!node.IsOk())
        return;
    const OptionItemData* data = NodeData(tree, node);
    ShowPage(data ? data->page : nullptr, data ? data->pageId : PAGE_ID_NONE);
}

void ConfigFrame::FillActiveLibraryChoice()
{
    if (!m_config)
        return;
    auto* combo = FindCtrl<wxComboBox>(ID_ACTIVE_LIBRARY);
    if (!combo)
        return;
    const std::string active = m_config->use_lib_section.value_or("");

    // Only the list: wxComboBox::Clear would also empty the text and raise a text event.
    combo->wxItemContainer::Clear();
    bool found = false;
    bool first = true;
    std::string last;
    for (const LibraryLine& entry : m_config->library_definitions)
    {
        if (first || entry.name != last)
        {
            combo->Append(ToWx(entry.name));
            last = entry.name;
            first = false;
        }
        if (entry.name == active)
            found = true;
    }
    if (found)
        combo->ChangeValue(ToWx(active));
    else
    {
        combo->ChangeValue(wxString());
        m_config->use_lib_section.reset(); // names no library; 'saved' is left alone
    }

    if (wxTreeCtrl* tree = Tree())
        if (const wxTreeItemId node =
                FindNodeByPageId(tree, NODE_ACTIVE_LIBRARY, tree->GetRootItem());
            node.IsOk())
        {
            tree->SetItemText(node, NodeLabel(NODE_ACTIVE_LIBRARY));
            tree->Expand(node);
        }
}

void ConfigFrame::OnExpandNode(wxCommandEvent&)
{
    wxTreeCtrl* tree = Tree();
    const wxTreeItemId node = tree ? tree->GetSelection() : wxTreeItemId();
    if (node.IsOk())
        ExpandSubtree(tree, node);
    else
        SetStatusText("Select a node to expand it", 0);
}

void ConfigFrame::OnCollapseNode(wxCommandEvent&)
{
    wxTreeCtrl* tree = Tree();
    const wxTreeItemId node = tree ? tree->GetSelection() : wxTreeItemId();
    if (node.IsOk())
        CollapseSubtree(tree, node);
    else
        SetStatusText("Select a node to collapse it", 0);
}

void ConfigFrame::ExpandSubtree(wxTreeCtrl* tree, const wxTreeItemId& node)
{
    if (!tree || !node.IsOk())
        return;
    tree->Expand(node);
    wxTreeItemIdValue cookie;
    for (wxTreeItemId child = tree->GetFirstChild(node, cookie); child.IsOk();
         child = tree->GetNextChild(node, cookie))
        ExpandSubtree(tree, child);
}

void ConfigFrame::CollapseSubtree(wxTreeCtrl* tree, const wxTreeItemId& node)
{
    if (!tree || !node.IsOk())
        return;
    tree->Collapse(node);
    wxTreeItemIdValue cookie;
    for (wxTreeItemId child = tree->GetFirstChild(node, cookie); child.IsOk();
         child = tree->GetNextChild(node, cookie))
        CollapseSubtree(tree, child);
}

void ConfigFrame::KeepSelectionThrough(wxTreeCtrl* tree, const wxTreeItemId& emptied)
{
    const wxTreeItemId selected = tree->GetSelection();
    if (!selected.IsOk())
    {
        // A whole rebuild with nothing to put back still ends with the root selected quietly,
        // not with the tree's own selection event that would bring back the welcome page.
        if (!emptied.IsOk() && !m_selectionLost)
        {
            m_lostSelection.clear();
            m_selectionLost = true;
        }
        return;
    }
    if (emptied.IsOk())
    {
        wxTreeItemId above = tree->GetItemParent(selected);
        while (above.IsOk() && above != emptied)
            above = tree->GetItemParent(above);
        if (!above.IsOk()) // the selection is not among the nodes that go
            return;
    }
    m_lostSelection.clear();
    for (wxTreeItemId node = selected; node.IsOk() && node != tree->GetRootItem();
         node = tree->GetItemParent(node))
        m_lostSelection.insert(m_lostSelection.begin(), NodeKey::Of(tree, node));
    m_selectionLost = true;
}

void ConfigFrame::RestoreLostSelection(wxTreeCtrl* tree)
{
    if (!m_selectionLost)
        return;
    m_selectionLost = false;
    if (tree->GetSelection().IsOk())
        return;
    wxTreeItemId node = tree->GetRootItem();
    if (!node.IsOk())
        return;
    // The deepest node still there on the way to the old one: it shows the same page.
    for (const NodeKey& step : m_lostSelection)
    {
        wxTreeItemIdValue cookie;
        wxTreeItemId child = tree->GetFirstChild(node, cookie);
        while (child.IsOk() && !NodeKey::Of(tree, child).SameNode(step))
            child = tree->GetNextChild(node, cookie);
        if (!child.IsOk())
            break;
        node = child;
    }
    SelectQuietly(tree, node);
}

void ConfigFrame::SelectQuietly(wxTreeCtrl* tree, const wxTreeItemId& node)
{
    m_quietSelection = true;
    tree->SelectItem(node);
    m_quietSelection = false;
}

// Runs before the tree's own idle processing, which would otherwise select a node with an event.
void ConfigFrame::OnInternalIdle()
{
    wxFrame::OnInternalIdle();
    if (m_selectionLost && !IsBeingDeleted())
        if (wxTreeCtrl* tree = Tree())
            RestoreLostSelection(tree);
}
