#include "tests/gui/gui_test.h"

#include "tree/option_tree.h"

#include <wx/treectrl.h>

#include <string>

namespace
{

// One line per node: indented text, "| pageId page" or "| -" without data, then "+" or "-" for
// an expanded or collapsed node with children.
std::string Dump(wxTreeCtrl* tree, const wxTreeItemId& node, int depth = 0)
{
    const OptionItemData* data = NodeData(tree, node);
    wxString line = wxString(' ', 2 * depth) + tree->GetItemText(node);
    line << (data ? wxString::Format(" | %d %d", data->pageId, data->page->GetId()) : " | -");
    if (tree->ItemHasChildren(node))
        line << (tree->IsExpanded(node) ? " +" : " -");
    std::string out = (line + "\n").utf8_string();
    wxTreeItemIdValue cookie;
    for (auto child = tree->GetFirstChild(node, cookie); child.IsOk();
         child = tree->GetNextChild(node, cookie))
        out += Dump(tree, child, depth + 1);
    return out;
}

using OptionTree = FrameTest;

} // namespace

TEST_F(OptionTree, DefaultRecordGivesTheWholeTable)
{
    const char* expected = R"(Configuration | 0 5008 +
  Netlister | - +
    Netlist | 0 5000 -
      Netlist type | 6007 5000 +
        Spice | 6008 5000
      Default language: Spice | 6011 5000
      Flatten netlist: No | 6012 5000
      Flatten busses: No | 6013 5000
    Pattern | 0 5001 -
      Add .GLOBAL directive: No | 6014 5001
      Add DC sources: No | 6015 5001
      Libraries | 6016 5001
    Common | 0 5002 -
      Open configuration tool: No | 6000 5002
      Backup netlist: No | 6001 5002 +
        Backup extention: ".bak" | 6002 5002
      Show netlist: No | 6003 5002
      Show pattern: No | 6004 5002
      Run ORVIK: Yes | 6005 5002 +
        Load circuit: Yes | 6006 5002
  Language | - +
    Spice | 0 5003 -
      Add prefix: No | 6017 5003
      Add units: No | 6018 5003
      Add MOS factors: No | 6019 5003
    Verilog | 0 5005 -
      Connectivity: Ordered port | 6021 5005
      Lexical: No change case | 6022 5005
      Use global net: No | 6023 5005 +
        Supply 1: Undefined | 6024 5005
        Supply 0: Undefined | 6025 5005
      Time scale: Use default value | 6026 5006
      Capacitor: Use default value | 6029 5006
    VHDL / VHDL-AMS | 0 5004 -
      Options | 0 5004 +
        Net type: Undefined | 6032 5004
        Net bus: Undefined | 6033 5004
        Architecture name: Undefined | 6034 5004
        Configuration Prefix Name: Undefined | 6035 5004
        Active Library: Undefined | 6036 5004
      Library Definitions | 6037 5007 +
        Generic | 6038 5007 -
          LIBRARY ieee; | 6038 5007
          USE ieee.std_logic_1164.ALL; | 6038 5007
)";
    EXPECT_EQ(Dump(m_frame->Tree(), m_frame->Tree()->GetRootItem()), expected);
    // A code no language has is shown as Spice and becomes Spice; the rebuild replaces the tree.
    m_frame->Config().default_orviktype = 'X';
    m_frame->BuildOptionTree();
    wxYield();
    EXPECT_EQ(Dump(m_frame->Tree(), m_frame->Tree()->GetRootItem()), expected);
    EXPECT_TRUE(m_frame->Config().default_orviktype == 'A' && m_frame->Config().saved);

    EXPECT_EQ(NodeText(NODE_LIBRARY_ENTRY), "Generic"); // the first, pre-order
}

// Flags alternate from node to node, so that a label showing a neighbour's flag shows up. An empty
// supply is shown as it is; an empty VHDL name is "Undefined".
TEST_F(OptionTree, OtherValuesFollowTheirRules)
{
    ConfigRecord& c = m_frame->Config();
    c.open_config_dialog = c.show_nsx = c.flat = c.add_global = c.add_always_prefix = true;
    c.add_mos_multi_prefix = c.verilog = c.vhdl = true, c.load_circuit = c.spice = false;
    c.default_orviktype = 'V', c.use_named_port = true, c.case_ = 'U', c.backup_extension = "";
    c.supply1 = "", c.supply0 = "gnd", c.net_type = "", c.bus_type = "bit_vector";
    c.use_define_timescale = true, c.timescale_unit = "", c.timescale_precision = "1ps";
    c.use_define_capacitor = true, c.capacitor_scale = "2", c.capacitor_delay_coefficient = "0.5";
    c.archi_name = "\xe9t\xe9", c.config_prefix = "CFG", c.use_lib_section = "Work";
    // A library is a run of lines with one name; case counts.
    c.library_definitions = {
        {"Work", "USE work.all;"}, {"work", "LIBRARY work;"}, {"work", "USE work.pkg.all;"}};
    m_frame->BuildOptionTree();
    // "" for an id not in the tree.
    std::string labels;
    for (int id = NODE_OPEN_CONFIG_DIALOG; id <= NODE_ACTIVE_LIBRARY; ++id)
        labels += NodeText(id).utf8_string() + "|";
    EXPECT_EQ(labels,
              "Open configuration tool: Yes|Backup netlist: No|Backup extention: \"\"|"
              "Show netlist: Yes|Show pattern: No|Run ORVIK: Yes|Load circuit: No|Netlist type||"
              "Verilog|VHDL|Default language: VHDL|Flatten netlist: Yes|Flatten busses: No|"
              "Add .GLOBAL directive: Yes|Add DC sources: No|Libraries|Add prefix: Yes|"
              "Add units: No|Add MOS factors: Yes||Connectivity: Named port|Lexical: Upper case|"
              "Use global net: No|Supply 1: |Supply 0: gnd|Time scale: Use defined||"
              "Precision: 1ps|Capacitor: Use defined|Scale: 2|Delais coefficient: 0.5|"
              "Net type: Undefined|Net bus: bit_vector|Architecture name: \u00e9t\u00e9|"
              "Configuration Prefix Name: CFG|Active Library: Work|");
    wxTreeCtrl* tree = m_frame->Tree();
    EXPECT_EQ(Dump(tree, ConfigFrame::FindNodeByPageId(tree, NODE_LIBRARY_DEFINITIONS,
                                                       tree->GetRootItem())),
              R"(Library Definitions | 6037 5007 +
  Work | 6038 5007 -
    USE work.all; | 6038 5007
  work | 6038 5007 -
    LIBRARY work; | 6038 5007
    USE work.pkg.all; | 6038 5007
)");
}
