#include "tests/gui/gui_test.h"

#include "tree/option_tree.h"

#include <wx/checkbox.h>
#include <wx/combobox.h>
#include <wx/grid.h>
#include <wx/listbox.h>
#include <wx/radiobox.h>
#include <wx/sizer.h>
#include <wx/treectrl.h>

#include <string>
#include <tuple>

namespace
{

class PageSelection : public FrameTest
{
  protected:
    // Controls of pages still to come get stand-ins under their ids; a combo box stands in for
    // any text.
    void SetUp() override
    {
        FrameTest::SetUp();
        const wxString items[] = {"0", "1", "2"};
        wxWindow* host = m_frame->FindWindow(ID_PAGE_HOST);
        for (int id = ID_VERILOG_CONNECTIVITY; id <= ID_LIBRARY_GRID; ++id)
            if (m_frame->FindWindow(id))
                continue;
            else if (id <= ID_VERILOG_CASE)
                new wxRadioBox(host, id, "", wxDefaultPosition, wxDefaultSize, 3, items);
            else if (id == ID_VERILOG_GLOBAL_NET || id == ID_TIMESCALE_DEFINE ||
                     id == ID_CAPACITOR_DEFINE)
                new wxCheckBox(host, id, "");
            else if (id == ID_LIBRARY_GRID)
                (new wxGrid(host, id))->CreateGrid(1, 1);
            else
                new wxComboBox(host, id);
    }
    // The controls from `first` to `last` as the user sees them: a check box as 1 or 0, a radio
    // box as its item, a text as it is, a list or a grid as its rows; "~" marks a disabled one.
    std::string Values(int first, int last) const
    {
        wxString out;
        for (int id = first; id <= last; ++id)
        {
            wxWindow* w = m_frame->FindWindow(id);
            wxString value;
            if (auto* box = dynamic_cast<wxCheckBox*>(w))
                value = box->GetValue() ? "1" : "0";
            else if (auto* radio = dynamic_cast<wxRadioBox*>(w))
                value << radio->GetSelection();
            else if (auto* entry = dynamic_cast<wxTextEntry*>(w))
                value = entry->GetValue();
            else if (auto* list = dynamic_cast<wxListBox*>(w))
                value = wxJoin(list->GetStrings(), ',');
            else if (auto* grid = dynamic_cast<wxGrid*>(w))
                for (int row = 0; row < grid->GetNumberRows(); ++row)
                    value << (row ? "," : "") << grid->GetCellValue(row, 0);
            else
                continue;
            out << (out.empty() ? "" : "|") << (w->IsEnabled() ? "" : "~") << value;
        }
        return out.utf8_string();
    }
    wxTreeCtrl* Tree() const { return m_frame->Tree(); }
    // The one page shown, which alone is in the page sizer; 0 for none, -1 for a wrong layout.
    int ShownPage() const
    {
        wxSizer* sizer = m_frame->FindWindow(ID_PAGE_HOST)->GetSizer();
        int shown = 0;
        for (int id = ID_PAGE_FIRST; id <= ID_PAGE_LAST; ++id)
            if (wxWindow* page = m_frame->FindWindow(id); page->IsShown() || sizer->GetItem(page))
                shown = shown || !page->IsShown() || !sizer->GetItem(page) ? -1 : id;
        return shown;
    }
};

} // namespace

// Every node, as a click selects it, shows the page its data names (the tree tests check which),
// and a node without data shows none.
TEST_F(PageSelection, EachNodeShowsItsPageAlone)
{
    SelectNode("Language"); // the root is selected already: a click on it would do nothing
    int count = 0;
    for (auto node = Tree()->GetRootItem(); node.IsOk(); node = Tree()->GetNext(node), ++count)
    {
        Tree()->SelectItem(node);
        const OptionItemData* data = NodeData(Tree(), node);
        EXPECT_EQ(ShownPage(), data ? data->page->GetId() : 0) << Tree()->GetItemText(node);
    }
    EXPECT_EQ(count, 44);
}

// Power nets need both supply names, or the option is dropped from the record; neither that nor
// dropping an active library that is not defined marks the record changed.
TEST_F(PageSelection, LoadingShowsTheRecordWithoutChangeEventsOrClearingSaved)
{
    int events = 0; // caught on their way up to the frame, before its handlers
    for (const auto type : {wxEVT_TEXT, wxEVT_CHECKBOX, wxEVT_RADIOBOX, wxEVT_LISTBOX})
        m_frame->Bind(type, [&events](wxEvent&) { ++events; });
    ConfigRecord& c = m_frame->Config();
    c.vhdl = true, c.flat_busses = true, c.default_orviktype = 'D';
    c.add_dc_sources = true, c.library_paths = {"/z", "/a", "/m"};
    c.backup_extension = ".old", c.show_pat = true, c.run_orvik = false;
    c.add_mos_multi_prefix = true, c.case_ = 'L';
    c.supply1 = "vdd", c.supply0 = "", c.global_net_as_supply = true;
    c.use_define_capacitor = true, c.capacitor_scale = "2", c.timescale_unit = "1ns";
    c.net_type = "bit", c.archi_name = "", c.config_prefix = "CFG", c.use_lib_section = "Work";
    c.AddLibraryLine("Work", "USE work.all;"), c.AddLibraryLine("Work", "USE work.pkg.all;");
    for (const int id : {ID_BUS_TYPE, ID_TIMESCALE_PRECISION})
        m_frame->FindCtrl<wxTextEntry>(id)->ChangeValue("kept"); // absent: left alone
    m_frame->BuildOptionTree();
    EXPECT_EQ(NodeText(NODE_DEFAULT_LANGUAGE), "Default language: Verilog");
    const std::tuple<const char*, int, int, const char*> pages[] = {
        {"Netlist", ID_ALLOW_SPICE, ID_FLATTEN_BUSSES, "1|0|1|1|0|1"},
        {"Pattern", ID_ADD_GLOBAL, ID_LIBRARY_PATH_LIST, "0|1|/z,/a,/m"},
        {"Common", ID_OPEN_CONFIG_DIALOG, ID_LOAD_CIRCUIT, "0|0|~.old|0|1|0|~1"},
        {"Add MOS factors: Yes", ID_SPICE_ADD_PREFIX, ID_SPICE_ADD_MOS_FACTOR, "0|0|1"},
        {"Verilog", ID_VERILOG_CONNECTIVITY, ID_VERILOG_SUPPLY0, "1|1|~0|vdd|"},
        {"Time scale: Use default value", ID_TIMESCALE_DEFINE, ID_CAPACITOR_DELAY,
         "0|~1ns|~kept|1|2|"},
        {"Options", ID_NET_TYPE, ID_ACTIVE_LIBRARY, "bit|kept||CFG|Work"},
        {"USE work.all;", ID_LIBRARY_NAME, ID_LIBRARY_GRID,
         "Work|USE work.all;,USE work.pkg.all;,"},
        {"Library Definitions", ID_LIBRARY_NAME, ID_LIBRARY_NAME, "Work"}, // no library to load
    };
    for (const auto& [node, first, last, values] : pages)
    {
        SelectNode(node);
        EXPECT_EQ(Values(first, last), values) << node;
    }
    EXPECT_FALSE(c.global_net_as_supply);
    EXPECT_EQ(NodeText(NODE_GLOBAL_NET), "Use global net: No");
    // Reloaded: lists are refilled, power nets may be used with both supply names, and a code of
    // no case leaves the radio box as it was.
    c.supply0 = "gnd", c.global_net_as_supply = true, c.library_paths = {"/y"}, c.case_ = 'q';
    SelectNode("Connectivity: Ordered port");
    EXPECT_EQ(Values(ID_VERILOG_CASE, ID_VERILOG_SUPPLY0), "1|1|vdd|gnd");
    SelectNode("/z");
    EXPECT_EQ(Values(ID_LIBRARY_PATH_LIST, ID_LIBRARY_PATH_LIST), "/y");
    SelectNode("Net type: bit");
    // Each library once, though loaded twice; an active library that is not defined is dropped.
    EXPECT_EQ(wxJoin(m_frame->FindCtrl<wxComboBox>(ID_ACTIVE_LIBRARY)->GetStrings(), ','),
              "Generic,Work");
    c.use_lib_section = "work";
    SelectNode("Options");
    EXPECT_EQ(Values(ID_ACTIVE_LIBRARY, ID_ACTIVE_LIBRARY), "");
    EXPECT_FALSE(c.use_lib_section.has_value());
    EXPECT_EQ(NodeText(NODE_ACTIVE_LIBRARY), "Active Library: Undefined");
    // The tree selects the root by itself when rebuilt; the page shown must stay the page that
    // later refreshes reload.
    SelectNode("Common");
    c.run_orvik = true;
    m_frame->BuildOptionTree();
    wxYield();
    EXPECT_EQ(Tree()->GetItemText(Tree()->GetSelection()), "Common");
    m_frame->RefreshCurrentPage();
    EXPECT_EQ(ShownPage(), ID_PAGE_COMMON);
    EXPECT_EQ(Values(ID_RUN_ORVIK, ID_LOAD_CIRCUIT), "1|1");
    EXPECT_EQ(events, 0);
    EXPECT_TRUE(c.saved);
}

// Nothing selected, or nothing at all in the tree: the tools say so, the handlers do nothing.
TEST_F(PageSelection, ExpandAndCollapseNeedASelection)
{
    wxCommandEvent expand(wxEVT_TOOL, ID_TOOL_EXPAND), collapse(wxEVT_TOOL, ID_TOOL_COLLAPSE);
    Tree()->Unselect();
    m_frame->ProcessWindowEvent(expand);
    EXPECT_EQ(StatusText(), "Select a node to expand it");
    Tree()->DeleteAllItems();
    wxYield();
    m_frame->ProcessWindowEvent(collapse);
    EXPECT_EQ(StatusText(), "Select a node to collapse it");
    m_frame->RefreshCurrentPage();
    m_frame->FillActiveLibraryChoice();
    m_frame->RefreshNodeLabel(NODE_FLATTEN_BUSSES);
    EXPECT_EQ(NodeText(NODE_FLATTEN_BUSSES), ""); // nothing found in an empty tree
}
