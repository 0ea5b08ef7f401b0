#include "tests/gui/gui_test.h"

#include "config/text_conv.h"

#include <wx/checkbox.h>
#include <wx/combobox.h>
#include <wx/dirdlg.h>
#include <wx/filedlg.h>
#include <wx/listbox.h>
#include <wx/radiobox.h>
#include <wx/stopwatch.h>
#include <wx/treectrl.h>
#include <wx/uiaction.h>

#include <filesystem>
#include <fstream>
#include <map>
#include <string>
#include <tuple>
#include <vector>

#include <stdlib.h>

namespace
{

// Each node's label by its id: a node replaced by a new one counts as changed.
using Labels = std::map<void*, std::string>;

void Walk(wxTreeCtrl* tree, const wxTreeItemId& node, const wxTreeItemId& skip, Labels& out)
{
    out[node.GetID()] = tree->GetItemText(node).utf8_string();
    wxTreeItemIdValue cookie;
    for (auto child = tree->GetFirstChild(node, cookie); child.IsOk() && node != skip;
         child = tree->GetNextChild(node, cookie))
        Walk(tree, child, skip, out);
}

// Leaves in a chooser the path a user's choice would.
struct Chosen : wxDirDialog
{
    // On GTK, wxDirDialog::SetPath only moves the native chooser; GetPath returns the path the
    // user accepted, which the dialog keeps in its base class.
    static void Set(wxDirDialog& d, const wxString& path) { d.*(&Chosen::m_path) = path; }
    // GTK's file chooser takes a path only once it has read the folder, and an open dialog only
    // a file that exists: wx's own wxExpectModal<wxFileDialog> leaves GetPath empty there.
    static void Set(wxFileDialog& d, const wxString& path)
    {
        d.SetPath(path);
        for (const wxStopWatch clock; d.GetPath() != path && clock.Time() < 5000;)
            wxYield();
    }
};

// Answers a library chooser; wx's test hook cannot answer either of them with a path.
template <class Dialog> struct Answer : wxExpectModalBase<Dialog, Answer<Dialog>>
{
    Answer(const wxString& path, int id) : path(path), id(id) {}
    int OnInvoked(Dialog* dialog) const override
    {
        if (id == wxID_OK)
            Chosen::Set(*dialog, path);
        return id;
    }
    wxString path;
    int id;
};

class OptionPage : public FrameTest
{
  protected:
    ConfigRecord& Rec() { return m_frame->Config(); }
    wxTreeItemId Node(int page) const
    {
        return ConfigFrame::FindNodeByPageId(m_frame->Tree(), page, m_frame->Tree()->GetRootItem());
    }
    // As a user's click would: shows the node's page.
    void Show(int page) { m_frame->Tree()->SelectItem(Node(page)); }
    // Leaves out the children of `refilled`.
    Labels Tree(int refilled = PAGE_ID_NONE) const
    {
        Labels out;
        Walk(m_frame->Tree(), m_frame->Tree()->GetRootItem(),
             refilled ? Node(refilled) : wxTreeItemId(), out);
        return out;
    }
    Labels With(Labels labels, int page, const std::string& label) const
    {
        EXPECT_EQ(labels.count(Node(page).GetID()), 1u) << "no node " << page;
        labels[Node(page).GetID()] = label;
        return labels;
    }
    std::vector<std::string> Children(int page) const
    {
        std::vector<std::string> texts;
        wxTreeItemIdValue cookie;
        for (auto child = m_frame->Tree()->GetFirstChild(Node(page), cookie); child.IsOk();
             child = m_frame->Tree()->GetNextChild(Node(page), cookie))
            texts.push_back(m_frame->Tree()->GetItemText(child).utf8_string());
        return texts;
    }

    void ShowPaths(const LibraryPathList& paths)
    {
        Rec().library_paths = paths;
        m_frame->BuildOptionTree();
        Show(NODE_LIBRARIES);
        Rec().saved = true;
    }
    // The record, the list box and node 6016 hold the same entries, and nothing is selected.
    void ExpectPaths(const LibraryPathList& expected)
    {
        EXPECT_EQ(Rec().library_paths, expected);
        EXPECT_FALSE(Rec().saved);
        std::vector<std::string> shown, listed;
        for (const std::string& path : expected)
            shown.push_back(ToWx(path).utf8_string());
        auto* list = m_frame->FindCtrl<wxListBox>(ID_LIBRARY_PATH_LIST);
        ASSERT_NE(list, nullptr);
        for (const wxString& text : list->GetStrings())
            listed.push_back(text.utf8_string());
        EXPECT_EQ(listed, shown);
        EXPECT_EQ(list->GetSelection(), wxNOT_FOUND);
        EXPECT_EQ(Children(NODE_LIBRARIES), shown);
        // wx cannot expand a node without children.
        EXPECT_EQ(m_frame->Tree()->IsExpanded(Node(NODE_LIBRARIES)), !expected.empty());
    }
    template <class Dialog> void Choose(int button, const std::string& path, int answer)
    {
        wxTEST_DIALOG(Press(button), Answer<Dialog>(wxString::FromUTF8(path), answer));
    }
};

TEST_F(OptionPage, CheckBoxesWriteTheirFieldAndRewriteOnlyTheirNode)
{
    using R = ConfigRecord;
    const std::tuple<int, bool R::*, int, const char*> boxes[] = {
        {ID_FLATTEN_NETLIST, &R::flat, NODE_FLATTEN_NETLIST, "Flatten netlist"},
        {ID_FLATTEN_BUSSES, &R::flat_busses, NODE_FLATTEN_BUSSES, "Flatten busses"},
        {ID_ADD_GLOBAL, &R::add_global, NODE_ADD_GLOBAL, "Add .GLOBAL directive"},
        {ID_ADD_DC_SOURCES, &R::add_dc_sources, NODE_ADD_DC_SOURCES, "Add DC sources"},
        {ID_OPEN_CONFIG_DIALOG, &R::open_config_dialog, NODE_OPEN_CONFIG_DIALOG,
         "Open configuration tool"},
        {ID_BACKUP_NETLIST, &R::create_backup_file, NODE_BACKUP_NETLIST, "Backup netlist"},
        {ID_SHOW_NETLIST, &R::show_nsx, NODE_SHOW_NETLIST, "Show netlist"},
        {ID_SHOW_PATTERN, &R::show_pat, NODE_SHOW_PATTERN, "Show pattern"},
        {ID_RUN_ORVIK, &R::run_orvik, NODE_RUN_ORVIK, "Run ORVIK"},
        {ID_LOAD_CIRCUIT, &R::load_circuit, NODE_LOAD_CIRCUIT, "Load circuit"},
        {ID_SPICE_ADD_PREFIX, &R::add_always_prefix, NODE_SPICE_ADD_PREFIX, "Add prefix"},
        {ID_SPICE_ADD_UNIT, &R::add_unit, NODE_SPICE_ADD_UNIT, "Add units"},
        {ID_SPICE_ADD_MOS_FACTOR, &R::add_mos_multi_prefix, NODE_SPICE_ADD_MOS_FACTOR,
         "Add MOS factors"}};
    for (const auto& [id, field, node, label] : boxes)
    {
        SCOPED_TRACE(label);
        Show(node);
        wxWindow* box = m_frame->FindWindow(id);
        ASSERT_TRUE(box && box->IsShownOnScreen()) << "not on the page of its node";
        const bool initial = Rec().*field;
        const Labels before = Tree();
        for (const bool value : {!initial, initial})
        {
            Rec().saved = true;
            Click(id, value);
            EXPECT_EQ(Rec().*field, value);
            EXPECT_FALSE(Rec().saved);
            EXPECT_EQ(Tree(), With(before, node, std::string(label) + (value ? ": Yes" : ": No")));
        }
    }
}

TEST_F(OptionPage, DependentControlsFollowTheirFlagAtOnceAndKeepTheirValue)
{
    Rec().backup_extension = ".old";
    Rec().load_circuit = true;
    m_frame->BuildOptionTree();
    Show(NODE_OPEN_CONFIG_DIALOG);
    const std::tuple<int, bool ConfigRecord::*, int> flags[] = {
        {ID_BACKUP_NETLIST, &ConfigRecord::create_backup_file, ID_BACKUP_EXTENSION},
        {ID_RUN_ORVIK, &ConfigRecord::run_orvik, ID_LOAD_CIRCUIT}};
    for (const auto& [flagId, field, dependentId] : flags)
    {
        wxWindow* flag = m_frame->FindWindow(flagId);
        wxWindow* dependent = m_frame->FindWindow(dependentId);
        ASSERT_TRUE(flag && dependent);
        const bool initial = Rec().*field;
        EXPECT_EQ(dependent->IsEnabled(), initial);
        flag->SetFocus();
        wxYield();
        ASSERT_EQ(wxWindow::FindFocus(), flag);
        for (const bool value : {!initial, initial})
        {
            Click(flagId, value);
            wxYield();
            EXPECT_EQ(dependent->IsEnabled(), value) << dependentId;
            EXPECT_TRUE(dependent->IsShownOnScreen());
            EXPECT_EQ(wxWindow::FindFocus(), flag) << "re-showing the page took the focus";
        }
    }
    EXPECT_EQ(Rec().backup_extension, ".old");
    EXPECT_TRUE(Rec().load_circuit);
    EXPECT_EQ(m_frame->FindCtrl<wxComboBox>(ID_BACKUP_EXTENSION)->GetValue(), ".old");
    EXPECT_TRUE(m_frame->FindCtrl<wxCheckBox>(ID_LOAD_CIRCUIT)->GetValue());
}

TEST_F(OptionPage, LanguageBoxesRefillNetlistTypeWithTheAllowedLanguages)
{
    Show(NODE_FLATTEN_BUSSES);
    const std::pair<std::vector<bool>, std::vector<std::string>> cases[] = {
        {{false, false, false}, {}},
        {{false, false, true}, {"VHDL"}},
        {{false, true, false}, {"Verilog"}},
        {{true, false, true}, {"Spice", "VHDL"}},
        {{true, true, true}, {"Spice", "Verilog", "VHDL"}}};
    const int ids[] = {ID_ALLOW_SPICE, ID_ALLOW_VERILOG, ID_ALLOW_VHDL};
    for (const auto& [allowed, children] : cases)
    {
        Rec().saved = true;
        const Labels before = Tree(NODE_NETLIST_TYPE);
        // Ticks first, then clears: every box goes through its own handler.
        for (const bool pass : {true, false})
            for (size_t i = 0; i < 3; ++i)
                if (allowed[i] == pass)
                    Click(ids[i], pass);
        EXPECT_EQ((std::vector<bool>{Rec().spice, Rec().verilog, Rec().vhdl}), allowed);
        EXPECT_FALSE(Rec().saved);
        EXPECT_EQ(Children(NODE_NETLIST_TYPE), children);
        // wx cannot expand a node without children.
        EXPECT_EQ(m_frame->Tree()->IsExpanded(Node(NODE_NETLIST_TYPE)), !children.empty());
        EXPECT_EQ(Tree(NODE_NETLIST_TYPE), before);
    }
}

TEST_F(OptionPage, DefaultLanguageItemsWriteTheirCodeAndLabel)
{
    Show(NODE_DEFAULT_LANGUAGE);
    // Starting from another item each time.
    const std::tuple<int, char, const char*> items[] = {
        {1, 'D', "Verilog"}, {2, 'V', "VHDL"}, {0, 'A', "Spice"}};
    for (const auto& [item, code, name] : items)
    {
        Rec().saved = true;
        const Labels before = Tree();
        ChooseRadio(ID_DEFAULT_LANGUAGE, item);
        EXPECT_EQ(Rec().default_orviktype, code);
        EXPECT_FALSE(Rec().saved);
        EXPECT_EQ(Tree(),
                  With(before, NODE_DEFAULT_LANGUAGE, std::string("Default language: ") + name));
    }
}

// Real keystrokes into the focused box. A handler that reloaded the box would move the caret.
TEST_F(OptionPage, ExtensionBoxStoresEachKeystrokeAndKeepsFocusAndCaret)
{
    Rec().create_backup_file = true;
    Rec().backup_extension = "";
    m_frame->BuildOptionTree();
    Show(NODE_BACKUP_EXTENSION);
    auto* box = m_frame->FindCtrl<wxComboBox>(ID_BACKUP_EXTENSION);
    ASSERT_TRUE(box && box->IsEnabled());
    box->SetFocus();
    wxYield();
    ASSERT_EQ(wxWindow::FindFocus(), box);
    const Labels before = Tree();
    wxUIActionSimulator keys;
    const std::string typed = ".bak";
    for (size_t i = 1; i <= typed.size(); ++i)
    {
        Rec().saved = true;
        keys.Char(typed[i - 1]);
        wxYield();
        EXPECT_EQ(Rec().backup_extension, typed.substr(0, i));
        EXPECT_FALSE(Rec().saved);
        EXPECT_EQ(box->GetInsertionPoint(), long(i));
        EXPECT_EQ(wxWindow::FindFocus(), box);
    }
    EXPECT_EQ(Tree(), With(before, NODE_BACKUP_EXTENSION, "Backup extention: \".bak\""));
    // Stored as typed, an emptied box as empty text.
    for (const char* text : {" sauvegard\xc3\xa9", ""})
    {
        TypeText(ID_BACKUP_EXTENSION, wxString::FromUTF8(text));
        EXPECT_EQ(Rec().backup_extension, text);
        EXPECT_EQ(NodeText(NODE_BACKUP_EXTENSION).utf8_string(),
                  std::string("Backup extention: \"") + text + "\"");
    }
}

TEST_F(OptionPage, ChoosersAddOnlyAConfirmedPathNotShownYet)
{
    // The file chooser needs real files.
    char dir[] = "/tmp/zidovade-libs-XXXXXX";
    ASSERT_NE(mkdtemp(dir), nullptr);
    const std::string in = std::string(dir) + "/";
    for (const char* name : {"cells.lib", "Cells.lib"})
        std::ofstream(in + name) << "* library\n";
    const LibraryPathList listed = {"/opt/biblioth\xe8que", in + "cells.lib"}; // Latin-1 bytes
    const std::tuple<bool, std::string, int, bool> cases[] = {
        {true, in + "d\xc3\xa9", wxID_OK, true},
        {true, in + "other", wxID_CANCEL, false},
        {true, "/opt/biblioth\xc3\xa8que", wxID_OK, false},
        {false, in + "Cells.lib", wxID_OK, true},
        {false, in + "Cells.lib", wxID_CANCEL, false},
        {false, in + "cells.lib", wxID_OK, false}};
    for (const auto& [isDir, path, answer, added] : cases)
    {
        SCOPED_TRACE(path);
        ShowPaths(listed);
        const Labels before = Tree(NODE_LIBRARIES);
        isDir ? Choose<wxDirDialog>(ID_ADD_LIBRARY_PATH, path, answer)
              : Choose<wxFileDialog>(ID_ADD_LIBRARY_FILE, path, answer);
        LibraryPathList expected = listed;
        if (added)
            expected.push_back(path);
        ExpectPaths(expected);
        EXPECT_EQ(Tree(NODE_LIBRARIES), before);
    }
    std::filesystem::remove_all(dir);
}

TEST_F(OptionPage, RemoveTakesTheFirstEntryShownAsTheSelection)
{
    const std::tuple<LibraryPathList, int, LibraryPathList> cases[] = {
        {{"/a"}, 0, {}},
        {{"/a", "/b"}, wxNOT_FOUND, {"/a", "/b"}},
        // Two equal entries can only come from a file.
        {{"/x", "/dup", "/y", "/dup"}, 3, {"/x", "/y", "/dup"}},
        {{"/opt/biblioth\xe8que", "/opt/lib"}, 0, {"/opt/lib"}}};
    for (const auto& [paths, selected, expected] : cases)
    {
        ShowPaths(paths);
        m_frame->FindCtrl<wxListBox>(ID_LIBRARY_PATH_LIST)->SetSelection(selected);
        const Labels before = Tree(NODE_LIBRARIES);
        Press(ID_REMOVE_LIBRARY_PATH);
        ExpectPaths(expected);
        EXPECT_EQ(Tree(NODE_LIBRARIES), before);
    }
}

TEST_F(OptionPage, SelectedLibraryPathShowsInTheStatusBar)
{
    ShowPaths({"/opt/lib", "/opt/cells.lib"});
    const Labels before = Tree();
    auto* list = m_frame->FindCtrl<wxListBox>(ID_LIBRARY_PATH_LIST);
    wxCommandEvent event(wxEVT_LISTBOX, ID_LIBRARY_PATH_LIST);
    event.SetEventObject(list);
    event.SetString(list->GetString(1));
    list->HandleWindowEvent(event);
    EXPECT_EQ(StatusText(), "/opt/cells.lib");
    EXPECT_FALSE(Rec().saved);
    EXPECT_EQ(Tree(), before);
}

} // namespace
