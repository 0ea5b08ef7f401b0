#include "tests/gui/page_test.h"

#include <wx/checkbox.h>
#include <wx/combobox.h>
#include <wx/radiobox.h>
#include <wx/uiaction.h>

#include <string>

namespace
{

// One check box of the netlist type, pattern, common and Spice pages with what it drives.
struct CheckBoxCase
{
    const char* name;
    int id;
    bool ConfigRecord::*field;
    int node;
    const char* format;
};
void PrintTo(const CheckBoxCase& c, std::ostream* os) { *os << c.name; }

const CheckBoxCase CHECK_BOXES[] = {
    {"FlattenNetlist", ID_FLATTEN_NETLIST, &ConfigRecord::flat, NODE_FLATTEN_NETLIST,
     "Flatten netlist: %s"},
    {"FlattenBusses", ID_FLATTEN_BUSSES, &ConfigRecord::flat_busses, NODE_FLATTEN_BUSSES,
     "Flatten busses: %s"},
    {"AddGlobal", ID_ADD_GLOBAL, &ConfigRecord::add_global, NODE_ADD_GLOBAL,
     "Add .GLOBAL directive: %s"},
    {"AddDcSources", ID_ADD_DC_SOURCES, &ConfigRecord::add_dc_sources, NODE_ADD_DC_SOURCES,
     "Add DC sources: %s"},
    {"OpenConfigDialog", ID_OPEN_CONFIG_DIALOG, &ConfigRecord::open_config_dialog,
     NODE_OPEN_CONFIG_DIALOG, "Open configuration tool: %s"},
    {"BackupNetlist", ID_BACKUP_NETLIST, &ConfigRecord::create_backup_file, NODE_BACKUP_NETLIST,
     "Backup netlist: %s"},
    {"ShowNetlist", ID_SHOW_NETLIST, &ConfigRecord::show_nsx, NODE_SHOW_NETLIST,
     "Show netlist: %s"},
    {"ShowPattern", ID_SHOW_PATTERN, &ConfigRecord::show_pat, NODE_SHOW_PATTERN,
     "Show pattern: %s"},
    {"RunOrvik", ID_RUN_ORVIK, &ConfigRecord::run_orvik, NODE_RUN_ORVIK, "Run ORVIK: %s"},
    {"LoadCircuit", ID_LOAD_CIRCUIT, &ConfigRecord::load_circuit, NODE_LOAD_CIRCUIT,
     "Load circuit: %s"},
    {"SpiceAddPrefix", ID_SPICE_ADD_PREFIX, &ConfigRecord::add_always_prefix, NODE_SPICE_ADD_PREFIX,
     "Add prefix: %s"},
    {"SpiceAddUnit", ID_SPICE_ADD_UNIT, &ConfigRecord::add_unit, NODE_SPICE_ADD_UNIT,
     "Add units: %s"},
    {"SpiceAddMosFactor", ID_SPICE_ADD_MOS_FACTOR, &ConfigRecord::add_mos_multi_prefix,
     NODE_SPICE_ADD_MOS_FACTOR, "Add MOS factors: %s"},
};

class CheckBoxes : public PageTest, public testing::WithParamInterface<CheckBoxCase>
{
};

TEST_P(CheckBoxes, WriteTheFieldAndRewriteOnlyTheirNode)
{
    const CheckBoxCase& c = GetParam();
    SelectPageOf(c.node);
    const bool initial = Record().*c.field;
    auto* box = m_frame->FindCtrl<wxCheckBox>(c.id);
    ASSERT_NE(box, nullptr);
    ASSERT_EQ(box->GetValue(), initial) << "page not loaded";

    const auto before = Labels();
    for (const bool value : {!initial, initial})
    {
        Click(c.id, value);
        EXPECT_EQ(Record().*c.field, value);
        EXPECT_FALSE(Record().saved);
        const auto after = Labels();
        if (value == initial)
            ExpectSameLabels(before, after);
        else
            ExpectOnlyLabelChanged(before, after, Node(c.node), YesNoLabel(c.format, value));
    }
}

INSTANTIATE_TEST_SUITE_P(Pages, CheckBoxes, testing::ValuesIn(CHECK_BOXES),
                         [](const auto& info) { return std::string(info.param.name); });

// A check box whose flag enables another control of the common page.
struct EnablingCase
{
    const char* name;
    int flag;
    bool ConfigRecord::*field;
    int dependent;
};
void PrintTo(const EnablingCase& c, std::ostream* os) { *os << c.name; }

class Enabling : public PageTest, public testing::WithParamInterface<EnablingCase>
{
};

TEST_P(Enabling, DependentControlFollowsTheFlagAtOnce)
{
    const EnablingCase& c = GetParam();
    Record().backup_extension = ".old";
    Record().load_circuit = true;
    m_frame->BuildOptionTree();
    SelectPageOf(NODE_OPEN_CONFIG_DIALOG);
    wxWindow* dependent = m_frame->FindWindow(c.dependent);
    ASSERT_NE(dependent, nullptr);
    const bool initial = Record().*c.field;
    EXPECT_EQ(dependent->IsEnabled(), initial);
    wxWindow* flag = m_frame->FindWindow(c.flag);
    flag->SetFocus();
    wxYield();
    ASSERT_EQ(wxWindow::FindFocus(), flag);

    for (const bool value : {!initial, initial, !initial})
    {
        Click(c.flag, value);
        wxYield();
        EXPECT_EQ(dependent->IsEnabled(), value);
        EXPECT_TRUE(m_frame->FindWindow(ID_PAGE_COMMON)->IsShown());
        // Re-showing the page must not take the focus from the box the user is on.
        EXPECT_EQ(wxWindow::FindFocus(), flag);
    }
    // Disabling shows the value; it does not change it.
    EXPECT_EQ(Record().backup_extension, ".old");
    EXPECT_TRUE(Record().load_circuit);
    EXPECT_EQ(m_frame->FindCtrl<wxComboBox>(ID_BACKUP_EXTENSION)->GetValue(), ".old");
    EXPECT_TRUE(m_frame->FindCtrl<wxCheckBox>(ID_LOAD_CIRCUIT)->GetValue());
    EXPECT_EQ(NodeUtf8(NODE_BACKUP_EXTENSION), "Backup extention: \".old\"");
    EXPECT_EQ(NodeUtf8(NODE_LOAD_CIRCUIT), "Load circuit: Yes");
}

INSTANTIATE_TEST_SUITE_P(CommonPage, Enabling,
                         testing::Values(EnablingCase{"BackupExtension", ID_BACKUP_NETLIST,
                                                      &ConfigRecord::create_backup_file,
                                                      ID_BACKUP_EXTENSION},
                                         EnablingCase{"LoadCircuit", ID_RUN_ORVIK,
                                                      &ConfigRecord::run_orvik, ID_LOAD_CIRCUIT}),
                         [](const auto& info) { return std::string(info.param.name); });

struct LanguageCase
{
    const char* name;
    bool spice, verilog, vhdl;
    std::vector<std::string> children;
};
void PrintTo(const LanguageCase& c, std::ostream* os) { *os << c.name; }

class Languages : public PageTest, public testing::WithParamInterface<LanguageCase>
{
};

TEST_P(Languages, NetlistTypeListsTheAllowedLanguages)
{
    const LanguageCase& c = GetParam();
    SelectPageOf(NODE_FLATTEN_BUSSES);
    const auto before = Labels(NODE_NETLIST_TYPE);
    // Tick the boxes to set, then clear the others: every step goes through its own handler.
    const std::pair<int, bool> clicks[] = {
        {ID_ALLOW_SPICE, c.spice}, {ID_ALLOW_VERILOG, c.verilog}, {ID_ALLOW_VHDL, c.vhdl}};
    for (const bool pass : {true, false})
        for (const auto& [id, value] : clicks)
            if (value == pass)
                Click(id, value);

    EXPECT_EQ(Record().spice, c.spice);
    EXPECT_EQ(Record().verilog, c.verilog);
    EXPECT_EQ(Record().vhdl, c.vhdl);
    EXPECT_FALSE(Record().saved);
    EXPECT_EQ(ChildTexts(NODE_NETLIST_TYPE), c.children);
    // wx cannot expand a node without children.
    EXPECT_EQ(OptionTree()->IsExpanded(Node(NODE_NETLIST_TYPE)), !c.children.empty());
    ExpectSameLabels(before, Labels(NODE_NETLIST_TYPE));
}

INSTANTIATE_TEST_SUITE_P(
    NetlistTypePage, Languages,
    testing::Values(LanguageCase{"None", false, false, false, {}},
                    LanguageCase{"VhdlAlone", false, false, true, {"VHDL"}},
                    LanguageCase{"VerilogAlone", false, true, false, {"Verilog"}},
                    LanguageCase{"SpiceAndVhdl", true, false, true, {"Spice", "VHDL"}},
                    LanguageCase{"All", true, true, true, {"Spice", "Verilog", "VHDL"}}),
    [](const auto& info) { return std::string(info.param.name); });

struct DefaultLanguageCase
{
    int item;
    char code;
    const char* label;
};
void PrintTo(const DefaultLanguageCase& c, std::ostream* os) { *os << c.label; }

class DefaultLanguage : public PageTest, public testing::WithParamInterface<DefaultLanguageCase>
{
};

TEST_P(DefaultLanguage, ItemWritesItsCodeAndShortName)
{
    const DefaultLanguageCase& c = GetParam();
    Record().default_orviktype = c.code == 'D' ? 'V' : 'D'; // start from another language
    m_frame->BuildOptionTree();
    SelectPageOf(NODE_DEFAULT_LANGUAGE);
    const auto before = Labels();

    ChooseRadio(ID_DEFAULT_LANGUAGE, c.item);
    EXPECT_EQ(Record().default_orviktype, c.code);
    EXPECT_FALSE(Record().saved);
    ExpectOnlyLabelChanged(before, Labels(), Node(NODE_DEFAULT_LANGUAGE), c.label);
}

INSTANTIATE_TEST_SUITE_P(NetlistTypePage, DefaultLanguage,
                         testing::Values(DefaultLanguageCase{0, 'A', "Default language: Spice"},
                                         DefaultLanguageCase{1, 'D', "Default language: Verilog"},
                                         DefaultLanguageCase{2, 'V', "Default language: VHDL"}));

// Showing a page puts the record's values in its controls without anything counting as a change.
TEST_F(PageTest, ShowingThePagesKeepsTheRecordSaved)
{
    Record().verilog = true;
    Record().default_orviktype = 'V';
    Record().flat_busses = true;
    Record().add_dc_sources = true;
    Record().library_paths = {"/opt/lib", "/opt/lib/cells.lib"};
    Record().create_backup_file = true;
    Record().backup_extension = ".old";
    Record().run_orvik = false;
    Record().add_unit = true;
    m_frame->BuildOptionTree();
    Record().saved = true;

    for (const int node : {NODE_FLATTEN_BUSSES, NODE_LIBRARIES, NODE_BACKUP_EXTENSION,
                           NODE_SPICE_ADD_UNIT, NODE_DEFAULT_LANGUAGE, NODE_RUN_ORVIK})
    {
        SelectPageOf(node);
        wxYield();
        EXPECT_TRUE(Record().saved) << "showing the page of node " << node;
    }
    EXPECT_EQ(m_frame->FindCtrl<wxRadioBox>(ID_DEFAULT_LANGUAGE)->GetSelection(), 2);
    EXPECT_EQ(m_frame->FindCtrl<wxComboBox>(ID_BACKUP_EXTENSION)->GetValue(), ".old");
    EXPECT_FALSE(m_frame->FindWindow(ID_LOAD_CIRCUIT)->IsEnabled());
    EXPECT_TRUE(m_frame->FindCtrl<wxCheckBox>(ID_SPICE_ADD_UNIT)->GetValue());
}

// Whatever the box holds is stored as it is, an emptied box as empty text.
class BackupExtension : public PageTest, public testing::WithParamInterface<const char*>
{
};

TEST_P(BackupExtension, StoresTheTextAsItIs)
{
    const std::string text = GetParam();
    SelectPageOf(NODE_BACKUP_EXTENSION);
    const auto before = Labels();
    TypeText(ID_BACKUP_EXTENSION, wxString::FromUTF8(text));
    EXPECT_EQ(Record().backup_extension, text);
    EXPECT_FALSE(Record().saved);
    ExpectOnlyLabelChanged(before, Labels(), Node(NODE_BACKUP_EXTENSION),
                           wxString::FromUTF8("Backup extention: \"" + text + "\""));
}

INSTANTIATE_TEST_SUITE_P(CommonPage, BackupExtension,
                         testing::Values("", "old", " sauvegard\xc3\xa9", ".bak.1"));

// Real keystrokes into the focused box: each one is stored, and the caret stays where the user
// is typing. A handler that reloaded the box would move the caret to the start.
TEST_F(PageTest, KeystrokesInTheExtensionBoxAreStoredOneByOneAndKeepFocusAndCaret)
{
    Record().create_backup_file = true;
    Record().backup_extension = "";
    m_frame->BuildOptionTree();
    SelectPageOf(NODE_BACKUP_EXTENSION);
    auto* box = m_frame->FindCtrl<wxComboBox>(ID_BACKUP_EXTENSION);
    ASSERT_NE(box, nullptr);
    ASSERT_TRUE(box->IsEnabled());
    box->SetFocus();
    wxYield();
    ASSERT_EQ(wxWindow::FindFocus(), box);

    wxUIActionSimulator keys;
    const std::string typed = ".bak";
    for (size_t i = 0; i < typed.size(); ++i)
    {
        keys.Char(typed[i]);
        wxYield();
        const std::string sofar = typed.substr(0, i + 1);
        EXPECT_EQ(Record().backup_extension, sofar);
        EXPECT_EQ(box->GetValue(), sofar);
        EXPECT_EQ(box->GetInsertionPoint(), box->GetLastPosition());
        EXPECT_EQ(wxWindow::FindFocus(), box);
    }
    EXPECT_FALSE(Record().saved);
    EXPECT_EQ(NodeUtf8(NODE_BACKUP_EXTENSION), "Backup extention: \".bak\"");

    box->SetInsertionPoint(1);
    keys.Char('o');
    wxYield();
    EXPECT_EQ(Record().backup_extension, ".obak");
    EXPECT_EQ(box->GetInsertionPoint(), 2);
    EXPECT_EQ(wxWindow::FindFocus(), box);

    keys.Char(WXK_DOWN); // picks the list's only item, which arrives as a text event
    wxYield();
    EXPECT_EQ(Record().backup_extension, ".bak");
    EXPECT_EQ(NodeUtf8(NODE_BACKUP_EXTENSION), "Backup extention: \".bak\"");
}

// A control on the wrong panel would show on another page.
TEST_F(PageTest, EveryControlSitsOnItsPage)
{
    const std::pair<int, std::vector<int>> pages[] = {
        {ID_PAGE_NETLIST_TYPE,
         {ID_ALLOW_SPICE, ID_ALLOW_VERILOG, ID_ALLOW_VHDL, ID_DEFAULT_LANGUAGE, ID_FLATTEN_NETLIST,
          ID_FLATTEN_BUSSES}},
        {ID_PAGE_PATTERN,
         {ID_ADD_GLOBAL, ID_ADD_DC_SOURCES, ID_LIBRARY_PATH_LIST, ID_ADD_LIBRARY_PATH,
          ID_ADD_LIBRARY_FILE, ID_REMOVE_LIBRARY_PATH}},
        {ID_PAGE_COMMON,
         {ID_OPEN_CONFIG_DIALOG, ID_BACKUP_NETLIST, ID_BACKUP_EXTENSION, ID_SHOW_NETLIST,
          ID_SHOW_PATTERN, ID_RUN_ORVIK, ID_LOAD_CIRCUIT}},
        {ID_PAGE_SPICE, {ID_SPICE_ADD_PREFIX, ID_SPICE_ADD_UNIT, ID_SPICE_ADD_MOS_FACTOR}}};
    for (const auto& [page, ids] : pages)
        for (const int id : ids)
        {
            wxWindow* control = m_frame->FindWindow(id);
            ASSERT_NE(control, nullptr) << id;
            EXPECT_EQ(control->GetParent()->GetId(), page) << id;
        }
    auto* language = m_frame->FindCtrl<wxRadioBox>(ID_DEFAULT_LANGUAGE);
    ASSERT_EQ(language->GetCount(), 3u);
    EXPECT_EQ(language->GetString(2), "VHDL / VHDL-AMS");
    auto* extension = m_frame->FindCtrl<wxComboBox>(ID_BACKUP_EXTENSION);
    EXPECT_EQ(extension->GetCount(), 1u);
    EXPECT_EQ(extension->GetString(0), ".bak");
}

TEST_F(PageTest, ChangeIsStoredWhenItsNodeIsNotInTheTree)
{
    SelectPageOf(NODE_SPICE_ADD_UNIT);
    OptionTree()->Delete(Node(NODE_SPICE_ADD_UNIT));
    const auto before = Labels();
    Click(ID_SPICE_ADD_UNIT, true);
    EXPECT_TRUE(Record().add_unit);
    EXPECT_FALSE(Record().saved);
    ExpectSameLabels(before, Labels());
}

} // namespace
