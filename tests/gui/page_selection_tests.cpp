#include "tests/gui/gui_test.h"

#include "tree/option_tree.h"

#include <wx/checkbox.h>
#include <wx/combobox.h>
#include <wx/grid.h>
#include <wx/listbox.h>
#include <wx/radiobox.h>
#include <wx/sizer.h>
#include <wx/textctrl.h>
#include <wx/treectrl.h>

#include <vector>

namespace
{

std::vector<wxString> Items(const wxItemContainer* items)
{
    std::vector<wxString> texts;
    for (unsigned i = 0; i < items->GetCount(); ++i)
        texts.push_back(items->GetString(i));
    return texts;
}

class PageSelection : public FrameTest
{
  protected:
    // A page still to come gets stand-ins under the ids its controls will have.
    void SetUp() override
    {
        FrameTest::SetUp();
        const wxString items[] = {"0", "1", "2"};
        if (wxWindow* p = EmptyPage(ID_PAGE_VERILOG_OPTIONS))
        {
            for (const int id : {ID_VERILOG_CONNECTIVITY, ID_VERILOG_CASE})
                new wxRadioBox(p, id, "", wxDefaultPosition, wxDefaultSize, 3, items);
            new wxCheckBox(p, ID_VERILOG_GLOBAL_NET, "");
            new wxTextCtrl(p, ID_VERILOG_SUPPLY1);
            new wxTextCtrl(p, ID_VERILOG_SUPPLY0);
        }
        if (wxWindow* p = EmptyPage(ID_PAGE_VERILOG_DIRECTIVES))
        {
            for (int id = ID_TIMESCALE_DEFINE; id <= ID_CAPACITOR_DELAY; ++id)
            {
                if (id == ID_TIMESCALE_DEFINE || id == ID_CAPACITOR_DEFINE)
                    new wxCheckBox(p, id, "");
                else
                    new wxTextCtrl(p, id);
            }
        }
        if (wxWindow* p = EmptyPage(ID_PAGE_VHDL_OPTIONS))
            for (int id = ID_NET_TYPE; id <= ID_ACTIVE_LIBRARY; ++id)
                new wxComboBox(p, id);
        if (wxWindow* p = EmptyPage(ID_PAGE_LIBRARY_DEFINITIONS))
        {
            new wxTextCtrl(p, ID_LIBRARY_NAME);
            (new wxGrid(p, ID_LIBRARY_GRID))->CreateGrid(1, 1);
        }
    }
    wxWindow* EmptyPage(int id) const
    {
        wxWindow* page = m_frame->FindWindow(id);
        return page->GetChildren().empty() ? page : nullptr;
    }
    template <class T = wxCheckBox> T* Ctrl(int id) const
    {
        T* control = m_frame->FindCtrl<T>(id);
        EXPECT_NE(control, nullptr) << id;
        return control;
    }
    wxString Text(int id) const { return Ctrl<wxTextEntry>(id)->GetValue(); }
    bool Enabled(int id) const { return m_frame->FindWindow(id)->IsEnabled(); }

    wxTreeCtrl* Tree() const { return m_frame->Tree(); }
    wxTreeItemId Find(int pageId) const
    {
        return ConfigFrame::FindNodeByPageId(Tree(), pageId, Tree()->GetRootItem());
    }
    wxString Selected() const
    {
        const wxTreeItemId node = Tree()->GetSelection();
        return node.IsOk() ? Tree()->GetItemText(node) : wxString("(none)");
    }
    void Tool(int id)
    {
        wxCommandEvent event(wxEVT_TOOL, id);
        m_frame->ProcessWindowEvent(event);
    }
    // The one page shown and in the page sizer, every other hidden and out of it; 0 for none.
    int ShownPage() const
    {
        wxSizer* sizer = m_frame->FindWindow(ID_PAGE_HOST)->GetSizer();
        int shown = 0;
        for (int id = ID_PAGE_FIRST; id <= ID_PAGE_LAST; ++id)
        {
            wxWindow* page = m_frame->FindWindow(id);
            EXPECT_EQ(page->IsShown(), sizer->GetItem(page) != nullptr) << id;
            if (page->IsShown())
                shown = shown ? -1 : id;
        }
        return shown;
    }
    std::vector<wxString> Rows() const
    {
        std::vector<wxString> rows;
        for (int row = 0; row < Ctrl<wxGrid>(ID_LIBRARY_GRID)->GetNumberRows(); ++row)
            rows.push_back(Ctrl<wxGrid>(ID_LIBRARY_GRID)->GetCellValue(row, 0));
        return rows;
    }
};

} // namespace

TEST_F(PageSelection, EachNodeShowsItsPageAlone)
{
    m_frame->Config().library_paths = {"/lib"};
    m_frame->BuildOptionTree();
    wxYield();
    const std::pair<const char*, int> cases[] = {{"Netlister", 0},
                                                 {"Configuration", 5008},
                                                 {"Language", 0},
                                                 {"Netlist", 5000},
                                                 {"Netlist type", 5000},
                                                 {"Spice", 5000},
                                                 {"Flatten busses: No", 5000},
                                                 {"Pattern", 5001},
                                                 {"/lib", 5001},
                                                 {"Backup extention: \".bak\"", 5002},
                                                 {"Add units: No", 5003},
                                                 {"Verilog", 5005},
                                                 {"Supply 0: Undefined", 5005},
                                                 {"Capacitor: Use default value", 5006},
                                                 {"Options", 5004},
                                                 {"Active Library: Undefined", 5004},
                                                 {"Library Definitions", 5007},
                                                 {"LIBRARY ieee;", 5007}};
    for (const auto& [label, page] : cases)
    {
        SelectNode(label);
        EXPECT_EQ(ShownPage(), page) << label;
    }
}

TEST_F(PageSelection, LoadingShowsTheRecordWithoutChangeEventsOrClearingSaved)
{
    int events = 0;
    for (int id = ID_ALLOW_SPICE; id <= ID_LIBRARY_GRID; ++id)
        if (wxWindow* control = id == ID_LABEL ? nullptr : m_frame->FindWindow(id))
            for (const auto type : {wxEVT_TEXT, wxEVT_CHECKBOX, wxEVT_RADIOBOX, wxEVT_LISTBOX})
                control->Bind(type, [&events](wxEvent&) { ++events; });
    ConfigRecord& c = m_frame->Config();
    c.vhdl = true, c.flat_busses = true, c.default_orviktype = 'D';
    c.add_dc_sources = true, c.library_paths = {"/z", "/a", "/m"};
    c.backup_extension = ".old", c.show_pat = true, c.run_orvik = false;
    c.add_mos_multi_prefix = true, c.use_named_port = true, c.case_ = 'L';
    c.use_define_capacitor = true, c.capacitor_scale = "2", c.timescale_unit = "1ns";
    c.net_type = "bit", c.archi_name = "", c.use_lib_section = "Generic";
    Ctrl<wxTextEntry>(ID_TIMESCALE_PRECISION)->ChangeValue("kept"); // absent: left alone
    Ctrl<wxTextEntry>(ID_BUS_TYPE)->ChangeValue("kept");
    m_frame->BuildOptionTree();

    SelectNode("Netlist");
    EXPECT_TRUE(Ctrl(ID_ALLOW_SPICE)->GetValue() && Ctrl(ID_ALLOW_VHDL)->GetValue());
    EXPECT_FALSE(Ctrl(ID_ALLOW_VERILOG)->GetValue() || Ctrl(ID_FLATTEN_NETLIST)->GetValue());
    EXPECT_TRUE(Ctrl(ID_FLATTEN_BUSSES)->GetValue());
    EXPECT_EQ(Ctrl<wxRadioBox>(ID_DEFAULT_LANGUAGE)->GetSelection(), 1);
    c.default_orviktype = 'X', c.flat_busses = false; // an odd code leaves the radio box alone
    SelectNode("Netlist type");
    EXPECT_EQ(Ctrl<wxRadioBox>(ID_DEFAULT_LANGUAGE)->GetSelection(), 1);
    EXPECT_FALSE(Ctrl(ID_FLATTEN_BUSSES)->GetValue());

    SelectNode("Pattern");
    EXPECT_TRUE(Ctrl(ID_ADD_DC_SOURCES)->GetValue());
    EXPECT_EQ(Items(Ctrl<wxListBox>(ID_LIBRARY_PATH_LIST)),
              (std::vector<wxString>{"/z", "/a", "/m"}));
    c.library_paths = {"/y"};
    SelectNode("/z");
    EXPECT_EQ(Items(Ctrl<wxListBox>(ID_LIBRARY_PATH_LIST)), std::vector<wxString>{"/y"});

    SelectNode("Common");
    EXPECT_EQ(Text(ID_BACKUP_EXTENSION), ".old");
    EXPECT_FALSE(Enabled(ID_BACKUP_EXTENSION));
    EXPECT_TRUE(Ctrl(ID_SHOW_PATTERN)->GetValue() && Ctrl(ID_LOAD_CIRCUIT)->GetValue());
    EXPECT_FALSE(Enabled(ID_LOAD_CIRCUIT));

    SelectNode("Add MOS factors: Yes");
    EXPECT_TRUE(Ctrl(ID_SPICE_ADD_MOS_FACTOR)->GetValue());
    EXPECT_FALSE(Ctrl(ID_SPICE_ADD_UNIT)->GetValue());

    SelectNode("Verilog");
    EXPECT_EQ(Ctrl<wxRadioBox>(ID_VERILOG_CONNECTIVITY)->GetSelection(), 0);
    EXPECT_EQ(Ctrl<wxRadioBox>(ID_VERILOG_CASE)->GetSelection(), 1);
    c.case_ = 'q';
    SelectNode("Connectivity: Named port");
    EXPECT_EQ(Ctrl<wxRadioBox>(ID_VERILOG_CASE)->GetSelection(), 1);

    SelectNode("Time scale: Use default value");
    EXPECT_EQ(Text(ID_TIMESCALE_UNIT), "1ns");
    EXPECT_EQ(Text(ID_TIMESCALE_PRECISION), "kept");
    EXPECT_FALSE(Enabled(ID_TIMESCALE_UNIT) || Enabled(ID_TIMESCALE_PRECISION));
    EXPECT_TRUE(Ctrl(ID_CAPACITOR_DEFINE)->GetValue() && Enabled(ID_CAPACITOR_SCALE));
    EXPECT_EQ(Text(ID_CAPACITOR_SCALE), "2");

    SelectNode("Options");
    EXPECT_EQ(Text(ID_NET_TYPE), "bit");
    EXPECT_EQ(Text(ID_BUS_TYPE), "kept");
    EXPECT_EQ(Text(ID_ARCHITECTURE_NAME), "");
    SelectNode("Net type: bit"); // the list is refilled under the text shown
    EXPECT_EQ(Text(ID_ACTIVE_LIBRARY), "Generic");

    SelectNode("USE ieee.std_logic_1164.ALL;");
    wxYield();
    EXPECT_EQ(events, 0);
    EXPECT_TRUE(c.saved);
}

// Power nets need both supply names; without them the option is dropped from the record.
TEST_F(PageSelection, GlobalNetNeedsBothSupplies)
{
    const struct
    {
        std::optional<std::string> supply1, supply0;
        bool global, enabled, checked;
    } cases[] = {{"vdd", "gnd", true, true, true},
                 {"vdd", "gnd", false, true, false},
                 {"vdd", "", true, false, false},
                 {std::nullopt, "gnd", true, false, false}};
    for (const auto& p : cases)
    {
        ConfigRecord& c = m_frame->Config();
        c.supply1 = p.supply1, c.supply0 = p.supply0, c.global_net_as_supply = p.global;
        Ctrl<wxTextEntry>(ID_VERILOG_SUPPLY1)->ChangeValue("kept");
        m_frame->BuildOptionTree();
        SelectNode("Verilog");
        SCOPED_TRACE(p.supply0.value_or("-"));
        EXPECT_EQ(Enabled(ID_VERILOG_GLOBAL_NET), p.enabled);
        EXPECT_EQ(Ctrl(ID_VERILOG_GLOBAL_NET)->GetValue(), p.checked);
        EXPECT_EQ(c.global_net_as_supply, p.checked);
        EXPECT_EQ(NodeText(NODE_GLOBAL_NET),
                  p.checked ? "Use global net: Yes" : "Use global net: No");
        EXPECT_EQ(Text(ID_VERILOG_SUPPLY1), p.supply1.value_or("kept"));
        EXPECT_EQ(Text(ID_VERILOG_SUPPLY0), *p.supply0);
        SelectNode("Language");
    }
}

TEST_F(PageSelection, ActiveLibraryListsEachDefinitionOnceAndDropsAnUnknownOne)
{
    ConfigRecord& c = m_frame->Config();
    c.AddLibraryLine("Work", "USE work.all;");
    c.AddLibraryLine("Work", "USE work.pkg.all;");
    c.use_lib_section = "Work";
    m_frame->BuildOptionTree();
    SelectNode("Options");
    SelectNode("Net type: Undefined"); // loaded twice
    EXPECT_EQ(Items(Ctrl<wxComboBox>(ID_ACTIVE_LIBRARY)),
              (std::vector<wxString>{"Generic", "Work"}));
    EXPECT_EQ(Text(ID_ACTIVE_LIBRARY), "Work");

    c.use_lib_section = "work";
    SelectNode("Options");
    EXPECT_EQ(Text(ID_ACTIVE_LIBRARY), "");
    EXPECT_FALSE(c.use_lib_section.has_value());
    EXPECT_EQ(NodeText(NODE_ACTIVE_LIBRARY), "Active Library: Undefined");

    Ctrl<wxComboBox>(ID_ACTIVE_LIBRARY)->Destroy(); // without its combo box nothing is corrected
    c.use_lib_section = "nothing";
    m_frame->FillActiveLibraryChoice();
    EXPECT_EQ(c.use_lib_section, "nothing");
}

TEST_F(PageSelection, LibraryNodesLoadTheirDefinitionIntoTheEditor)
{
    m_frame->Config().AddLibraryLine("Work", "USE work.all;");
    m_frame->BuildOptionTree();
    SelectNode("USE ieee.std_logic_1164.ALL;");
    EXPECT_EQ(Text(ID_LIBRARY_NAME), "Generic");
    EXPECT_EQ(Rows(), (std::vector<wxString>{"LIBRARY ieee;", "USE ieee.std_logic_1164.ALL;", ""}));
    SelectNode("Work");
    EXPECT_EQ(Text(ID_LIBRARY_NAME), "Work");
    EXPECT_EQ(Rows(), (std::vector<wxString>{"USE work.all;", ""}));
    Ctrl<wxTextEntry>(ID_LIBRARY_NAME)->ChangeValue("");
    SelectNode("Library Definitions");
    EXPECT_EQ(Text(ID_LIBRARY_NAME), "");
}

// The tree selects the root by itself when rebuilt; the page shown must stay the page that later
// refreshes reload, and the root must still answer a click.
TEST_F(PageSelection, RebuildKeepsThePageShown)
{
    SelectNode("Common");
    m_frame->Config().run_orvik = false;
    m_frame->BuildOptionTree();
    wxYield();
    EXPECT_EQ(Selected(), "Common");
    m_frame->RefreshCurrentPage();
    EXPECT_EQ(ShownPage(), ID_PAGE_COMMON);
    EXPECT_FALSE(Enabled(ID_LOAD_CIRCUIT));
    SelectNode("Configuration");
    EXPECT_EQ(ShownPage(), ID_PAGE_WELCOME);

    SelectNode("USE ieee.std_logic_1164.ALL;");
    m_frame->Config().AddLibraryLine("Generic", "USE ieee.numeric_std.ALL;");
    m_frame->BuildOptionTree();
    wxYield();
    EXPECT_EQ(Rows().size(), 3u);
    m_frame->RefreshCurrentPage();
    EXPECT_EQ(Rows().size(), 4u);
}

// A refill under the selected node neither reloads nor hides the page, nor takes the focus.
TEST_F(PageSelection, RefillUnderTheSelectionKeepsPageAndFocus)
{
    SelectNode("Spice");
    Ctrl(ID_FLATTEN_NETLIST)->SetValue(true); // not the record's value: a reload would clear it
    Ctrl(ID_ALLOW_VERILOG)->SetFocus();
    wxYield();
    ASSERT_EQ(wxWindow::FindFocus(), Ctrl(ID_ALLOW_VERILOG));
    Click(ID_ALLOW_VERILOG, true);
    wxYield();
    EXPECT_EQ(Selected(), "Spice");
    Click(ID_ALLOW_SPICE, false);
    wxYield();
    EXPECT_EQ(Selected(), "Netlist type");
    EXPECT_EQ(ShownPage(), ID_PAGE_NETLIST_TYPE);
    EXPECT_TRUE(Ctrl(ID_FLATTEN_NETLIST)->GetValue());
    EXPECT_EQ(wxWindow::FindFocus(), Ctrl(ID_ALLOW_VERILOG));

    m_frame->Config().library_paths = {"/lib/a", "/lib/b"};
    m_frame->BuildOptionTree();
    SelectNode("/lib/a");
    Ctrl<wxListBox>(ID_LIBRARY_PATH_LIST)->SetSelection(0);
    Press(ID_REMOVE_LIBRARY_PATH);
    Ctrl(ID_ADD_GLOBAL)->SetValue(true);
    wxYield();
    EXPECT_EQ(Selected(), "Libraries");
    EXPECT_EQ(ShownPage(), ID_PAGE_PATTERN);
    EXPECT_TRUE(Ctrl(ID_ADD_GLOBAL)->GetValue());
}

// With the selected node gone, a handler's own refresh or selection shows a page at once.
TEST_F(PageSelection, SelectionAfterARefillIsNotSwallowed)
{
    for (const bool refresh : {true, false})
    {
        Click(ID_ALLOW_SPICE, true);
        SelectNode("Spice");
        Click(ID_ALLOW_SPICE, false);
        Ctrl(ID_FLATTEN_NETLIST)->SetValue(true);
        if (refresh)
            m_frame->RefreshCurrentPage();
        else
            Tree()->SelectItem(Find(NODE_NETLIST_TYPE));
        EXPECT_FALSE(Ctrl(ID_FLATTEN_NETLIST)->GetValue()) << refresh;
        EXPECT_EQ(Selected(), "Netlist type");
    }
}

TEST_F(PageSelection, ExpandAndCollapseWholeSubtrees)
{
    m_frame->Config().use_define_timescale = true;
    m_frame->Config().timescale_unit = "1ns";
    m_frame->BuildOptionTree();
    SelectNode("Verilog");
    Tool(ID_TOOL_EXPAND);
    EXPECT_TRUE(Tree()->IsExpanded(Find(NODE_TIMESCALE)));
    EXPECT_FALSE(Tree()->IsExpanded(Tree()->GetItemParent(Find(NODE_FLATTEN_BUSSES))));

    SelectNode("Configuration");
    Tool(ID_TOOL_COLLAPSE);
    Tree()->Expand(Tree()->GetRootItem());
    for (const int id : {NODE_GLOBAL_NET, NODE_TIMESCALE, NODE_LIBRARY_DEFINITIONS})
        EXPECT_FALSE(Tree()->IsExpanded(Find(id))) << id;
    Tool(ID_TOOL_EXPAND);
    for (const int id : {NODE_GLOBAL_NET, NODE_TIMESCALE, NODE_LIBRARY_ENTRY, NODE_NETLIST_TYPE})
        EXPECT_TRUE(Tree()->IsExpanded(Find(id))) << id;
    EXPECT_EQ(StatusText(), "ORVIK netlist configuration tool 5.5.0 - Welcome!");

    Tree()->Unselect();
    Tool(ID_TOOL_COLLAPSE);
    EXPECT_EQ(StatusText(), "Select a node to collapse it");
    EXPECT_TRUE(Tree()->IsExpanded(Find(NODE_TIMESCALE)));
    Tree()->DeleteAllItems();
    wxYield();
    Tool(ID_TOOL_EXPAND);
    EXPECT_EQ(StatusText(), "Select a node to expand it");
    m_frame->RefreshCurrentPage();
    m_frame->FillActiveLibraryChoice();
    EXPECT_EQ(ShownPage(), ID_PAGE_WELCOME);
}
