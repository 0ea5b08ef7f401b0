#include "tests/gui/gui_test.h"

#include "tree/option_tree.h"

#include <wx/treectrl.h>

#include <map>
#include <string>

namespace
{

// One line per node: indented text, "| pageId page" or "| -" without data, then "+" or "-" for
// an expanded or collapsed node with children.
void Dump(wxTreeCtrl* tree, const wxTreeItemId& node, int depth, std::string& out)
{
    out += std::string(2 * depth, ' ') + tree->GetItemText(node).utf8_string() + " |";
    const OptionItemData* data = NodeData(tree, node);
    out += data ? " " + std::to_string(data->pageId) + " " + std::to_string(data->page->GetId())
                : " -";
    if (tree->ItemHasChildren(node))
        out += tree->IsExpanded(node) ? " +" : " -";
    out += "\n";
    wxTreeItemIdValue cookie;
    for (auto child = tree->GetFirstChild(node, cookie); child.IsOk();
         child = tree->GetNextChild(node, cookie))
        Dump(tree, child, depth + 1, out);
}

class OptionTree : public FrameTest
{
  protected:
    wxTreeCtrl* Tree() const { return m_frame->Tree(); }
    wxTreeItemId Find(int pageId, wxTreeItemId from = {}) const
    {
        return ConfigFrame::FindNodeByPageId(Tree(), pageId,
                                             from.IsOk() ? from : Tree()->GetRootItem());
    }
    // The node's subtree without the node's own line.
    std::string DumpBelow(const wxTreeItemId& node) const
    {
        std::string out;
        wxTreeItemIdValue cookie;
        for (auto child = Tree()->GetFirstChild(node, cookie); child.IsOk();
             child = Tree()->GetNextChild(node, cookie))
            Dump(Tree(), child, 1, out);
        return out;
    }
    void Rebuild(void (*set)(ConfigRecord&))
    {
        m_frame->Config() = ConfigRecord();
        set(m_frame->Config());
        m_frame->BuildOptionTree();
    }
};

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
    std::string dump;
    Dump(Tree(), Tree()->GetRootItem(), 0, dump);
    EXPECT_EQ(dump, expected);
    m_frame->BuildOptionTree(); // a rebuild replaces, it adds nothing
    wxYield();
    dump.clear();
    Dump(Tree(), Tree()->GetRootItem(), 0, dump);
    EXPECT_EQ(dump, expected);
}

// Each case changes one field: its node, and no other, shows the change.
TEST_F(OptionTree, EachLabelShowsItsOwnFieldByItsRule)
{
    const struct
    {
        int pageId;
        void (*set)(ConfigRecord&);
        const char* label;
    } cases[] = {
        {6000, [](ConfigRecord& c) { c.open_config_dialog = true; },
         "Open configuration tool: Yes"},
        {6001, [](ConfigRecord& c) { c.create_backup_file = true; }, "Backup netlist: Yes"},
        {6002, [](ConfigRecord& c) { c.backup_extension = ""; }, "Backup extention: \"\""},
        {6003, [](ConfigRecord& c) { c.show_nsx = true; }, "Show netlist: Yes"},
        {6004, [](ConfigRecord& c) { c.show_pat = true; }, "Show pattern: Yes"},
        {6005, [](ConfigRecord& c) { c.run_orvik = false; }, "Run ORVIK: No"},
        {6006, [](ConfigRecord& c) { c.load_circuit = false; }, "Load circuit: No"},
        {6011, [](ConfigRecord& c) { c.default_orviktype = 'D'; }, "Default language: Verilog"},
        {6011, [](ConfigRecord& c) { c.default_orviktype = 'V'; }, "Default language: VHDL"},
        {6012, [](ConfigRecord& c) { c.flat = true; }, "Flatten netlist: Yes"},
        {6013, [](ConfigRecord& c) { c.flat_busses = true; }, "Flatten busses: Yes"},
        {6014, [](ConfigRecord& c) { c.add_global = true; }, "Add .GLOBAL directive: Yes"},
        {6015, [](ConfigRecord& c) { c.add_dc_sources = true; }, "Add DC sources: Yes"},
        {6017, [](ConfigRecord& c) { c.add_always_prefix = true; }, "Add prefix: Yes"},
        {6018, [](ConfigRecord& c) { c.add_unit = true; }, "Add units: Yes"},
        {6019, [](ConfigRecord& c) { c.add_mos_multi_prefix = true; }, "Add MOS factors: Yes"},
        {6021, [](ConfigRecord& c) { c.use_named_port = true; }, "Connectivity: Named port"},
        {6022, [](ConfigRecord& c) { c.case_ = 'U'; }, "Lexical: Upper case"},
        {6022, [](ConfigRecord& c) { c.case_ = 'L'; }, "Lexical: Lower case"},
        {6023, [](ConfigRecord& c) { c.global_net_as_supply = true; }, "Use global net: Yes"},
        {6024, [](ConfigRecord& c) { c.supply1 = ""; }, "Supply 1: "},
        {6025, [](ConfigRecord& c) { c.supply0 = "gnd"; }, "Supply 0: gnd"},
        {6026, [](ConfigRecord& c) { c.use_define_timescale = true; }, "Time scale: Use defined"},
        {6029, [](ConfigRecord& c) { c.use_define_capacitor = true; }, "Capacitor: Use defined"},
        {6032, [](ConfigRecord& c) { c.net_type = ""; }, "Net type: Undefined"},
        {6033, [](ConfigRecord& c) { c.bus_type = "bit_vector"; }, "Net bus: bit_vector"},
        {6034, [](ConfigRecord& c) { c.archi_name = "\xe9t\xe9"; },
         "Architecture name: \u00e9t\u00e9"},
        {6035, [](ConfigRecord& c) { c.config_prefix = "CFG"; }, "Configuration Prefix Name: CFG"},
        {6036, [](ConfigRecord& c) { c.use_lib_section = "Generic"; }, "Active Library: Generic"},
    };
    const int valueNodes[] = {6000, 6001, 6002, 6003, 6004, 6005, 6006, 6011, 6012,
                              6013, 6014, 6015, 6017, 6018, 6019, 6021, 6022, 6023,
                              6024, 6025, 6026, 6029, 6032, 6033, 6034, 6035, 6036};
    std::map<int, wxString> defaults;
    for (const int id : valueNodes)
        defaults[id] = NodeText(id);
    for (const auto& c : cases)
    {
        SCOPED_TRACE(c.label);
        Rebuild(c.set);
        for (const int id : valueNodes)
        {
            const wxString expected = id == c.pageId ? wxString::FromUTF8(c.label) : defaults[id];
            EXPECT_EQ(NodeText(id), expected) << id;
            EXPECT_EQ(m_frame->NodeLabel(id), expected) << id;
        }
    }
}

TEST_F(OptionTree, RefilledNodesListTheirEntries)
{
    const struct
    {
        int pageId;
        void (*set)(ConfigRecord&);
        const char* subtree;
    } cases[] = {
        {6007, [](ConfigRecord& c) { c.spice = false; }, ""},
        {6007, [](ConfigRecord& c) { c.verilog = c.vhdl = true; },
         "  Spice | 6008 5000\n  Verilog | 6009 5000\n  VHDL | 6010 5000\n"},
        {6016,
         [](ConfigRecord& c) {
             c.library_paths = {"/z", "/a"};
         },
         "  /z | 0 5001\n  /a | 0 5001\n"},
        {6026, [](ConfigRecord& c) { c.timescale_unit = "1ns"; }, ""},
        {6026,
         [](ConfigRecord& c)
         {
             c.use_define_timescale = true;
             c.timescale_unit = "", c.timescale_precision = "1ps";
         },
         "  Precision: 1ps | 6028 5006\n"},
        {6029,
         [](ConfigRecord& c)
         {
             c.use_define_capacitor = true;
             c.capacitor_scale = "2", c.capacitor_delay_coefficient = "0.5";
         },
         "  Scale: 2 | 6030 5006\n  Delais coefficient: 0.5 | 6031 5006\n"},
        {6037,
         [](ConfigRecord& c)
         {
             c.library_definitions.clear();
             c.AddLibraryLine("work", "LIBRARY work;");
             c.AddLibraryLine("Work", "USE work.all;"); // another library: case counts
             c.AddLibraryLine("work", "USE work.pkg.all;");
         },
         "  Work | 6038 5007 -\n    USE work.all; | 6038 5007\n  work | 6038 5007 -\n"
         "    LIBRARY work; | 6038 5007\n    USE work.pkg.all; | 6038 5007\n"},
    };
    for (const auto& c : cases)
    {
        Rebuild(c.set);
        EXPECT_EQ(DumpBelow(Find(c.pageId)), c.subtree) << c.pageId;
    }
}

TEST_F(OptionTree, UnknownLanguageBecomesSpiceWithoutTouchingSaved)
{
    for (const bool saved : {true, false})
    {
        m_frame->Config().default_orviktype = 'X';
        m_frame->Config().saved = saved;
        m_frame->BuildOptionTree();
        EXPECT_EQ(NodeText(NODE_DEFAULT_LANGUAGE), "Default language: Spice");
        EXPECT_EQ(m_frame->Config().default_orviktype, 'A');
        EXPECT_EQ(m_frame->Config().saved, saved);
    }
}

TEST_F(OptionTree, SearchIsPreOrderBelowTheParentOnly)
{
    m_frame->Config().AddLibraryLine("Work", "USE work.all;");
    m_frame->Config().config_name = "caf\xe9.ini";
    m_frame->BuildOptionTree();
    EXPECT_EQ(Tree()->GetItemText(Tree()->GetRootItem()), wxString::FromUTF8("caf\u00e9.ini"));
    const wxTreeItemId generic = Find(NODE_LIBRARY_ENTRY);
    EXPECT_EQ(Tree()->GetItemText(generic), "Generic");
    EXPECT_EQ(Tree()->GetItemText(Find(NODE_LIBRARY_ENTRY, generic)), "LIBRARY ieee;");
    EXPECT_FALSE(Find(6020).IsOk());
    EXPECT_FALSE(Find(NODE_FLATTEN_BUSSES, Tree()->GetItemParent(Find(NODE_LEXICAL))).IsOk());

    m_frame->RefreshNodeLabel(NODE_NETLIST_TYPE); // a fixed label stays
    EXPECT_EQ(NodeText(NODE_NETLIST_TYPE), "Netlist type");
    Tree()->DeleteAllItems();
    wxYield();
    m_frame->RefreshNodeLabel(NODE_FLATTEN_BUSSES);
    EXPECT_FALSE(Find(NODE_FLATTEN_BUSSES).IsOk());
}
