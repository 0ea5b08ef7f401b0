#include "tree/option_tree.h"

#include "app/config_frame.h"
#include "app/ids.h"
#include "config/text_conv.h"

#include <wx/treectrl.h>

namespace
{

wxString LanguageName(char code)
{
    switch (code)
    {
    case 'D':
        return "Verilog";
    case 'V':
        return "VHDL";
    default: // 'A', and whatever else a file may hold
        return "Spice";
    }
}

wxString CaseName(char code)
{
    switch (code)
    {
    case 'U':
        return "Upper case";
    case 'L':
        return "Lower case";
    default:
        return "No change case";
    }
}

// Only an absent text is "Undefined": a present empty one is shown as it is.
wxString AbsentUndefined(const std::optional<std::string>& text)
{
    return text ? ToWx(*text) : wxString("Undefined");
}

// The VHDL names have no use when empty, so empty is shown as "Undefined" too.
wxString EmptyUndefined(const std::optional<std::string>& text)
{
    return text && !text->empty() ? ToWx(*text) : wxString("Undefined");
}

wxString Defined(bool useDefined) { return useDefined ? "Use defined" : "Use default value"; }

bool HasText(const std::optional<std::string>& text) { return text && !text->empty(); }

wxString Label(const char* format, const wxString& value)
{
    return wxString::Format(format, value);
}

wxString FlagLabel(const char* format, bool value)
{
    return wxString::Format(format, YesNoText(value));
}

// A node of the tree; its page is the page window as it is found at this moment.
wxTreeItemId AppendOptionNode(ConfigFrame& frame, wxTreeCtrl* tree, const wxTreeItemId& parent,
                              const wxString& text, int page, int pageId)
{
    return tree->AppendItem(parent, text, -1, -1,
                            new OptionItemData(frame.FindWindow(page), pageId));
}

// A node whose label shows a value of the record.
wxTreeItemId AppendValueNode(ConfigFrame& frame, wxTreeCtrl* tree, const wxTreeItemId& parent,
                             int page, int pageId)
{
    return AppendOptionNode(frame, tree, parent, frame.NodeLabel(pageId), page, pageId);
}

} // namespace

const char* YesNoText(bool value) { return value ? "Yes" : "No"; }

OptionItemData* NodeData(const wxTreeCtrl* tree, const wxTreeItemId& node)
{
    if (!tree || !node.IsOk())
        return nullptr;
    return dynamic_cast<OptionItemData*>(tree->GetItemData(node));
}

wxString ConfigFrame::NodeLabel(int pageId) const
{
    if (!m_config)
        return {};
    const ConfigRecord& c = *m_config;
    switch (pageId)
    {
    case NODE_OPEN_CONFIG_DIALOG:
        return FlagLabel("Open configuration tool: %s", c.open_config_dialog);
    case NODE_BACKUP_NETLIST:
        return FlagLabel("Backup netlist: %s", c.create_backup_file);
    case NODE_BACKUP_EXTENSION:
        return Label("Backup extention: \"%s\"", ToWx(c.backup_extension));
    case NODE_SHOW_NETLIST:
        return FlagLabel("Show netlist: %s", c.show_nsx);
    case NODE_SHOW_PATTERN:
        return FlagLabel("Show pattern: %s", c.show_pat);
    case NODE_RUN_ORVIK:
        return FlagLabel("Run ORVIK: %s", c.run_orvik);
    case NODE_LOAD_CIRCUIT:
        return FlagLabel("Load circuit: %s", c.load_circuit);
    case NODE_DEFAULT_LANGUAGE:
        return Label("Default language: %s", LanguageName(c.default_orviktype));
    case NODE_FLATTEN_NETLIST:
        return FlagLabel("Flatten netlist: %s", c.flat);
    case NODE_FLATTEN_BUSSES:
        return FlagLabel("Flatten busses: %s", c.flat_busses);
    case NODE_ADD_GLOBAL:
        return FlagLabel("Add .GLOBAL directive: %s", c.add_global);
    case NODE_ADD_DC_SOURCES:
        return FlagLabel("Add DC sources: %s", c.add_dc_sources);
    case NODE_SPICE_ADD_PREFIX:
        return FlagLabel("Add prefix: %s", c.add_always_prefix);
    case NODE_SPICE_ADD_UNIT:
        return FlagLabel("Add units: %s", c.add_unit);
    case NODE_SPICE_ADD_MOS_FACTOR:
        return FlagLabel("Add MOS factors: %s", c.add_mos_multi_prefix);
    case NODE_CONNECTIVITY:
        return Label("Connectivity: %s",
                     wxString(c.use_named_port ? "Named port" : "Ordered port"));
    case NODE_LEXICAL:
        return Label("Lexical: %s", CaseName(c.case_));
    case NODE_GLOBAL_NET:
        return FlagLabel("Use global net: %s", c.global_net_as_supply);
    case NODE_SUPPLY1:
        return Label("Supply 1: %s", AbsentUndefined(c.supply1));
    case NODE_SUPPLY0:
        return Label("Supply 0: %s", AbsentUndefined(c.supply0));
    case NODE_TIMESCALE:
        return Label("Time scale: %s", Defined(c.use_define_timescale));
    case NODE_TIMESCALE_UNIT:
        return Label("Unit: %s", ToWx(c.timescale_unit.value_or("")));
    case NODE_TIMESCALE_PRECISION:
        return Label("Precision: %s", ToWx(c.timescale_precision.value_or("")));
    case NODE_CAPACITOR:
        return Label("Capacitor: %s", Defined(c.use_define_capacitor));
    case NODE_CAPACITOR_SCALE:
        return Label("Scale: %s", ToWx(c.capacitor_scale.value_or("")));
    case NODE_CAPACITOR_DELAY:
        return Label("Delais coefficient: %s", ToWx(c.capacitor_delay_coefficient.value_or("")));
    case NODE_NET_TYPE:
        return Label("Net type: %s", EmptyUndefined(c.net_type));
    case NODE_BUS_TYPE:
        return Label("Net bus: %s", EmptyUndefined(c.bus_type));
    case NODE_ARCHITECTURE_NAME:
        return Label("Architecture name: %s", EmptyUndefined(c.archi_name));
    case NODE_CONFIGURATION_PREFIX:
        return Label("Configuration Prefix Name: %s", EmptyUndefined(c.config_prefix));
    case NODE_ACTIVE_LIBRARY:
        return Label("Active Library: %s", EmptyUndefined(c.use_lib_section));
    default: // a node whose label is fixed, or no node at all
        return {};
    }
}

void ConfigFrame::RefreshNodeLabel(int pageId)
{
    wxTreeCtrl* tree = Tree();
    if (!tree)
        return;
    const wxTreeItemId node = FindNodeByPageId(tree, pageId, tree->GetRootItem());
    const wxString label = NodeLabel(pageId);
    if (node.IsOk() && !label.empty())
        tree->SetItemText(node, label);
}

wxTreeItemId ConfigFrame::FindNodeByPageId(wxTreeCtrl* tree, int pageId, const wxTreeItemId& parent)
{
    if (!tree || !parent.IsOk())
        return {};
    wxTreeItemIdValue cookie;
    for (wxTreeItemId child = tree->GetFirstChild(parent, cookie); child.IsOk();
         child = tree->GetNextChild(parent, cookie))
    {
        if (const OptionItemData* data = NodeData(tree, child); data && data->pageId == pageId)
            return child;
        if (const wxTreeItemId found = FindNodeByPageId(tree, pageId, child); found.IsOk())
            return found;
    }
    return {};
}

void ConfigFrame::BuildOptionTree()
{
    wxTreeCtrl* tree = Tree();
    if (!tree)
        return;
    KeepSelectionThrough(tree, wxTreeItemId());
    tree->DeleteAllItems();
    if (!m_config)
        return;

    const wxTreeItemId root =
        tree->AddRoot(ToWx(m_config->config_name), -1, -1,
                      new OptionItemData(FindWindow(ID_PAGE_WELCOME), PAGE_ID_NONE));
    // AddRoot selected the root without telling anyone, while another page may be shown.
    tree->Unselect();

    const wxTreeItemId netlister = tree->AppendItem(root, "Netlister");
    BuildNetlistBranch(tree, netlister);
    BuildPatternBranch(tree, netlister);
    BuildCommonBranch(tree, netlister);
    tree->Expand(netlister);

    const wxTreeItemId language = tree->AppendItem(root, "Language");
    BuildSpiceBranch(tree, language);
    BuildVerilogBranch(tree, language);
    BuildVhdlBranch(tree, language);
    tree->Expand(language);
    tree->Expand(root);
}

void ConfigFrame::BuildNetlistBranch(wxTreeCtrl* tree, const wxTreeItemId& parent)
{
    char& language = m_config->default_orviktype;
    if (language != 'A' && language != 'D' && language != 'V')
        language = 'A'; // shown as Spice, so it is Spice; 'saved' stays as the file left it

    const wxTreeItemId netlist =
        AppendOptionNode(*this, tree, parent, "Netlist", ID_PAGE_NETLIST_TYPE, 0);
    const wxTreeItemId types = AppendOptionNode(*this, tree, netlist, "Netlist type",
                                                ID_PAGE_NETLIST_TYPE, NODE_NETLIST_TYPE);
    FillLanguageNodes(tree, types);
    tree->Expand(types);
    for (const int pageId : {NODE_DEFAULT_LANGUAGE, NODE_FLATTEN_NETLIST, NODE_FLATTEN_BUSSES})
        AppendValueNode(*this, tree, netlist, ID_PAGE_NETLIST_TYPE, pageId);
}

void ConfigFrame::BuildPatternBranch(wxTreeCtrl* tree, const wxTreeItemId& parent)
{
    const wxTreeItemId pattern =
        AppendOptionNode(*this, tree, parent, "Pattern", ID_PAGE_PATTERN, 0);
    AppendValueNode(*this, tree, pattern, ID_PAGE_PATTERN, NODE_ADD_GLOBAL);
    AppendValueNode(*this, tree, pattern, ID_PAGE_PATTERN, NODE_ADD_DC_SOURCES);
    const wxTreeItemId libraries =
        AppendOptionNode(*this, tree, pattern, "Libraries", ID_PAGE_PATTERN, NODE_LIBRARIES);
    FillLibraryPathNodes(tree, libraries);
    tree->Expand(libraries);
}

void ConfigFrame::BuildCommonBranch(wxTreeCtrl* tree, const wxTreeItemId& parent)
{
    const wxTreeItemId common = AppendOptionNode(*this, tree, parent, "Common", ID_PAGE_COMMON, 0);
    AppendValueNode(*this, tree, common, ID_PAGE_COMMON, NODE_OPEN_CONFIG_DIALOG);
    const wxTreeItemId backup =
        AppendValueNode(*this, tree, common, ID_PAGE_COMMON, NODE_BACKUP_NETLIST);
    AppendValueNode(*this, tree, backup, ID_PAGE_COMMON, NODE_BACKUP_EXTENSION);
    tree->Expand(backup);
    AppendValueNode(*this, tree, common, ID_PAGE_COMMON, NODE_SHOW_NETLIST);
    AppendValueNode(*this, tree, common, ID_PAGE_COMMON, NODE_SHOW_PATTERN);
    const wxTreeItemId run = AppendValueNode(*this, tree, common, ID_PAGE_COMMON, NODE_RUN_ORVIK);
    AppendValueNode(*this, tree, run, ID_PAGE_COMMON, NODE_LOAD_CIRCUIT);
    tree->Expand(run);
}

void ConfigFrame::BuildSpiceBranch(wxTreeCtrl* tree, const wxTreeItemId& parent)
{
    const wxTreeItemId spice = AppendOptionNode(*this, tree, parent, "Spice", ID_PAGE_SPICE, 0);
    for (const int pageId : {NODE_SPICE_ADD_PREFIX, NODE_SPICE_ADD_UNIT, NODE_SPICE_ADD_MOS_FACTOR})
        AppendValueNode(*this, tree, spice, ID_PAGE_SPICE, pageId);
}

void ConfigFrame::BuildVerilogBranch(wxTreeCtrl* tree, const wxTreeItemId& parent)
{
    const wxTreeItemId verilog =
        AppendOptionNode(*this, tree, parent, "Verilog", ID_PAGE_VERILOG_OPTIONS, 0);
    AppendValueNode(*this, tree, verilog, ID_PAGE_VERILOG_OPTIONS, NODE_CONNECTIVITY);
    AppendValueNode(*this, tree, verilog, ID_PAGE_VERILOG_OPTIONS, NODE_LEXICAL);
    const wxTreeItemId globalNet =
        AppendValueNode(*this, tree, verilog, ID_PAGE_VERILOG_OPTIONS, NODE_GLOBAL_NET);
    AppendValueNode(*this, tree, globalNet, ID_PAGE_VERILOG_OPTIONS, NODE_SUPPLY1);
    AppendValueNode(*this, tree, globalNet, ID_PAGE_VERILOG_OPTIONS, NODE_SUPPLY0);
    tree->Expand(globalNet);
    FillTimeScaleNodes(
        tree, AppendValueNode(*this, tree, verilog, ID_PAGE_VERILOG_DIRECTIVES, NODE_TIMESCALE));
    FillCapacitorNodes(
        tree, AppendValueNode(*this, tree, verilog, ID_PAGE_VERILOG_DIRECTIVES, NODE_CAPACITOR));
}

void ConfigFrame::BuildVhdlBranch(wxTreeCtrl* tree, const wxTreeItemId& parent)
{
    const wxTreeItemId vhdl =
        AppendOptionNode(*this, tree, parent, "VHDL / VHDL-AMS", ID_PAGE_VHDL_OPTIONS, 0);
    const wxTreeItemId options =
        AppendOptionNode(*this, tree, vhdl, "Options", ID_PAGE_VHDL_OPTIONS, 0);
    for (const int pageId : {NODE_NET_TYPE, NODE_BUS_TYPE, NODE_ARCHITECTURE_NAME,
                             NODE_CONFIGURATION_PREFIX, NODE_ACTIVE_LIBRARY})
        AppendValueNode(*this, tree, options, ID_PAGE_VHDL_OPTIONS, pageId);
    tree->Expand(options);
    FillLibraryDefinitionNodes(tree, AppendOptionNode(*this, tree, vhdl, "Library Definitions",
                                                      ID_PAGE_LIBRARY_DEFINITIONS,
                                                      NODE_LIBRARY_DEFINITIONS));
}

void ConfigFrame::FillLanguageNodes(wxTreeCtrl* tree, const wxTreeItemId& node)
{
    if (!tree || !node.IsOk())
        return;
    KeepSelectionThrough(tree, node);
    tree->CollapseAndReset(node);
    if (m_config->spice)
        AppendOptionNode(*this, tree, node, "Spice", ID_PAGE_NETLIST_TYPE, NODE_LANGUAGE_SPICE);
    if (m_config->verilog)
        AppendOptionNode(*this, tree, node, "Verilog", ID_PAGE_NETLIST_TYPE, NODE_LANGUAGE_VERILOG);
    if (m_config->vhdl)
        AppendOptionNode(*this, tree, node, "VHDL", ID_PAGE_NETLIST_TYPE, NODE_LANGUAGE_VHDL);
}

void ConfigFrame::FillLibraryPathNodes(wxTreeCtrl* tree, const wxTreeItemId& node)
{
    if (!tree || !node.IsOk())
        return;
    KeepSelectionThrough(tree, node);
    tree->CollapseAndReset(node);
    for (const std::string& path : m_config->library_paths)
        AppendOptionNode(*this, tree, node, ToWx(path), ID_PAGE_PATTERN, 0);
}

void ConfigFrame::FillTimeScaleNodes(wxTreeCtrl* tree, const wxTreeItemId& node)
{
    if (!tree || !node.IsOk())
        return;
    KeepSelectionThrough(tree, node);
    tree->CollapseAndReset(node);
    if (!m_config->use_define_timescale)
        return;
    if (HasText(m_config->timescale_unit))
        AppendValueNode(*this, tree, node, ID_PAGE_VERILOG_DIRECTIVES, NODE_TIMESCALE_UNIT);
    if (HasText(m_config->timescale_precision))
        AppendValueNode(*this, tree, node, ID_PAGE_VERILOG_DIRECTIVES, NODE_TIMESCALE_PRECISION);
}

void ConfigFrame::FillCapacitorNodes(wxTreeCtrl* tree, const wxTreeItemId& node)
{
    if (!tree || !node.IsOk())
        return;
    KeepSelectionThrough(tree, node);
    tree->CollapseAndReset(node);
    if (!m_config->use_define_capacitor)
        return;
    if (HasText(m_config->capacitor_scale))
        AppendValueNode(*this, tree, node, ID_PAGE_VERILOG_DIRECTIVES, NODE_CAPACITOR_SCALE);
    if (HasText(m_config->capacitor_delay_coefficient))
        AppendValueNode(*this, tree, node, ID_PAGE_VERILOG_DIRECTIVES, NODE_CAPACITOR_DELAY);
}

void ConfigFrame::FillLibraryDefinitionNodes(wxTreeCtrl* tree, const wxTreeItemId& node)
{
    if (!tree || !node.IsOk())
        return;
    KeepSelectionThrough(tree, node);
    tree->DeleteChildren(node);
    std::string name; // of the last library node appended
    wxTreeItemId library;
    for (const LibraryLine& entry : m_config->library_definitions)
    {
        if (!library.IsOk() || entry.name != name)
        {
            library = AppendOptionNode(*this, tree, node, ToWx(entry.name),
                                       ID_PAGE_LIBRARY_DEFINITIONS, NODE_LIBRARY_ENTRY);
            name = entry.name;
        }
        AppendOptionNode(*this, tree, library, ToWx(entry.line), ID_PAGE_LIBRARY_DEFINITIONS,
                         NODE_LIBRARY_ENTRY);
    }
    tree->Expand(node);
}
