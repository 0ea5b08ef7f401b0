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
#include <type_traits>
#include <vector>

#include <stdlib.h>

namespace
{

// Each node's label by its id: a node replaced by a new one counts as changed.
using Labels = std::map<void*, std::string>;

// On GTK, wxDirDialog::SetPath only moves the native chooser; GetPath returns the path the user
// accepted, which the dialog keeps in its base class.
struct DirPath : wxDirDialog
{
    using wxDirDialog::m_path;
};

// Answers a library chooser, leaving in it the path a user's choice would (also when cancelled,
// which must then be ignored); wx's test hook cannot answer either of them with a path.
template <class Dialog> struct Answer : wxExpectModalBase<Dialog, Answer<Dialog>>
{
    Answer(const std::string& path, int id) : path(wxString::FromUTF8(path)), id(id) {}
    int OnInvoked(Dialog* dialog) const override
    {
        if constexpr (std::is_same_v<Dialog, wxDirDialog>)
            dialog->*(&DirPath::m_path) = path;
        else
        {
            // GTK's file chooser takes a path only once it has read the folder, and an open
            // dialog only a file that exists: wxExpectModal<wxFileDialog> leaves GetPath empty.
            dialog->SetPath(path);
            for (const wxStopWatch clock; dialog->GetPath() != path && clock.Time() < 5000;)
                wxYield();
        }
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
    // Leaves out the children of `refilled` (all leaves). GetNext is the generic tree control's
    // pre-order walk, which GTK builds use.
    Labels Tree(int refilled = PAGE_ID_NONE) const
    {
        Labels out;
        wxTreeCtrl* tree = m_frame->Tree();
        for (auto node = tree->GetRootItem(); node.IsOk(); node = tree->GetNext(node))
            if (!refilled || tree->GetItemParent(node) != Node(refilled))
                out[node.GetID()] = tree->GetItemText(node).utf8_string();
        return out;
    }
    Labels With(Labels labels, int page, const std::string& label) const
    {
        labels[Node(page).GetID()] = label;
        return labels;
    }
    // The labels of the node's children, "|" between them.
    std::string Children(int page) const
    {
        wxString texts;
        wxTreeItemIdValue cookie;
        for (auto child = m_frame->Tree()->GetFirstChild(Node(page), cookie); child.IsOk();
             child = m_frame->Tree()->GetNextChild(Node(page), cookie))
            texts << (texts.empty() ? "" : "|") << m_frame->Tree()->GetItemText(child);
        return texts.utf8_string();
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
        wxString shown;
        for (const std::string& path : expected)
            shown << (shown.empty() ? "" : "|") << ToWx(path);
        auto* list = m_frame->FindCtrl<wxListBox>(ID_LIBRARY_PATH_LIST);
        ASSERT_NE(list, nullptr);
        EXPECT_EQ(wxJoin(list->GetStrings(), '|').utf8_string(), shown.utf8_string());
        EXPECT_EQ(list->GetSelection(), wxNOT_FOUND);
        EXPECT_EQ(Children(NODE_LIBRARIES), shown.utf8_string());
        // wx cannot expand a node without children.
        EXPECT_EQ(m_frame->Tree()->IsExpanded(Node(NODE_LIBRARIES)), !expected.empty());
    }
    template <class Dialog> void Choose(int button, const std::string& path, int answer)
    {
        wxTEST_DIALOG(Press(button), Answer<Dialog>(path, answer));
    }
};

// The label's text comes from the tree: a handler writing another node's text shows up. A flag
// enables its dependent control at once, without re-showing the page (which would take the
// focus) or changing the dependent's value.
TEST_F(OptionPage, CheckBoxesWriteTheirFieldAndRewriteOnlyTheirNode)
{
    Rec().backup_extension = ".old"; // not the default, which a reset would bring back
    using R = ConfigRecord;
    // The last: the control the box enables, 0 for none.
    const std::tuple<int, bool R::*, int, int> boxes[] = {
        {ID_FLATTEN_NETLIST, &R::flat, NODE_FLATTEN_NETLIST, 0},
        {ID_FLATTEN_BUSSES, &R::flat_busses, NODE_FLATTEN_BUSSES, 0},
        {ID_ADD_GLOBAL, &R::add_global, NODE_ADD_GLOBAL, 0},
        {ID_ADD_DC_SOURCES, &R::add_dc_sources, NODE_ADD_DC_SOURCES, 0},
        {ID_OPEN_CONFIG_DIALOG, &R::open_config_dialog, NODE_OPEN_CONFIG_DIALOG, 0},
        {ID_BACKUP_NETLIST, &R::create_backup_file, NODE_BACKUP_NETLIST, ID_BACKUP_EXTENSION},
        {ID_SHOW_NETLIST, &R::show_nsx, NODE_SHOW_NETLIST, 0},
        {ID_SHOW_PATTERN, &R::show_pat, NODE_SHOW_PATTERN, 0},
        {ID_RUN_ORVIK, &R::run_orvik, NODE_RUN_ORVIK, ID_LOAD_CIRCUIT},
        {ID_LOAD_CIRCUIT, &R::load_circuit, NODE_LOAD_CIRCUIT, 0},
        {ID_SPICE_ADD_PREFIX, &R::add_always_prefix, NODE_SPICE_ADD_PREFIX, 0},
        {ID_SPICE_ADD_UNIT, &R::add_unit, NODE_SPICE_ADD_UNIT, 0},
        {ID_SPICE_ADD_MOS_FACTOR, &R::add_mos_multi_prefix, NODE_SPICE_ADD_MOS_FACTOR, 0}};
    for (const auto& [id, field, node, dependent] : boxes)
    {
        SCOPED_TRACE(id);
        Show(node);
        wxWindow* box = m_frame->FindWindow(id);
        ASSERT_TRUE(box && box->IsShownOnScreen()) << "not on the page of its node";
        box->SetFocus();
        wxYield();
        ASSERT_EQ(wxWindow::FindFocus(), box);
        const bool initial = Rec().*field;
        const Labels before = Tree();
        const std::string label = before.at(Node(node).GetID());
        for (const bool value : {!initial, initial})
        {
            Rec().saved = true;
            Click(id, value);
            wxYield();
            EXPECT_EQ(Rec().*field, value);
            EXPECT_FALSE(Rec().saved);
            EXPECT_EQ(Tree(),
                      With(before, node,
                           label.substr(0, label.rfind(": ")) + (value ? ": Yes" : ": No")));
            EXPECT_EQ(wxWindow::FindFocus(), box) << "re-showing the page took the focus";
            EXPECT_TRUE(!dependent || m_frame->FindWindow(dependent)->IsEnabled() == value);
        }
    }
    EXPECT_TRUE(Rec().backup_extension == ".old" && Rec().load_circuit);
    EXPECT_EQ(m_frame->FindCtrl<wxComboBox>(ID_BACKUP_EXTENSION)->GetValue(), ".old");
}

// The page's controls, from the node "Spice". The default language, from another item each time,
// rewrites only its own node. The boxes refill the children of the selected node: the selection
// moves to the parent only once that node is gone, and the page is neither reloaded nor hidden,
// nor loses the focus.
TEST_F(OptionPage, NetlistTypeControlsRelabelTheDefaultAndRefillTheLanguages)
{
    SelectNode("Spice");
    auto* flatten = m_frame->FindCtrl<wxCheckBox>(ID_FLATTEN_NETLIST);
    flatten->SetValue(true); // not the record's value: a reload would clear it
    wxWindow* verilog = m_frame->FindWindow(ID_ALLOW_VERILOG);
    verilog->SetFocus();
    wxYield();
    ASSERT_EQ(wxWindow::FindFocus(), verilog);
    const std::tuple<int, char, const char*, std::vector<bool>, const char*> cases[] = {
        {1, 'D', "Verilog", {true, true, true}, "Spice|Verilog|VHDL"},
        {2, 'V', "VHDL", {true, false, true}, "Spice|VHDL"},
        {0, 'A', "Spice", {false, true, false}, "Verilog"},
        {1, 'D', "Verilog", {false, false, false}, ""}};
    for (const auto& [item, code, name, allowed, children] : cases)
    {
        Rec().saved = true;
        const Labels before = Tree();
        ChooseRadio(ID_DEFAULT_LANGUAGE, item);
        EXPECT_EQ(Rec().default_orviktype, code);
        EXPECT_FALSE(Rec().saved);
        EXPECT_EQ(Tree(),
                  With(before, NODE_DEFAULT_LANGUAGE, std::string("Default language: ") + name));
        Rec().saved = true;
        const Labels others = Tree(NODE_NETLIST_TYPE);
        // Ticks first, then clears: every box (ids in a row) goes through its own handler.
        for (const bool pass : {true, false})
            for (int i = 0; i < 3; ++i)
                if (allowed[i] == pass)
                    Click(ID_ALLOW_SPICE + i, pass);
        wxYield();
        EXPECT_EQ((std::vector<bool>{Rec().spice, Rec().verilog, Rec().vhdl}), allowed);
        EXPECT_FALSE(Rec().saved);
        EXPECT_EQ(Children(NODE_NETLIST_TYPE), children);
        // wx cannot expand a node without children.
        EXPECT_EQ(m_frame->Tree()->IsExpanded(Node(NODE_NETLIST_TYPE)), *children != 0);
        EXPECT_EQ(Tree(NODE_NETLIST_TYPE), others);
        EXPECT_EQ(m_frame->Tree()->GetItemText(m_frame->Tree()->GetSelection()),
                  allowed[0] ? "Spice" : "Netlist type");
        EXPECT_TRUE(flatten->IsShownOnScreen() && flatten->GetValue());
        EXPECT_EQ(wxWindow::FindFocus(), verilog);
    }
}

// Real keystrokes into the focused box. A handler that reloaded the box would move the caret.
TEST_F(OptionPage, ExtensionBoxStoresEachKeystrokeAndKeepsFocusAndCaret)
{
    Rec().create_backup_file = true, Rec().backup_extension = "";
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

// A selected entry, as a click selects it, shows in the status bar and changes nothing else.
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
        const Labels all = Tree(), others = Tree(NODE_LIBRARIES);
        auto* list = m_frame->FindCtrl<wxListBox>(ID_LIBRARY_PATH_LIST);
        list->SetSelection(selected);
        if (selected != wxNOT_FOUND)
        {
            wxCommandEvent event(wxEVT_LISTBOX, ID_LIBRARY_PATH_LIST);
            event.SetString(list->GetString(selected));
            list->HandleWindowEvent(event);
            EXPECT_EQ(StatusText().utf8_string(), ToWx(paths[selected]).utf8_string());
            EXPECT_FALSE(Rec().saved);
            EXPECT_EQ(Tree(), all);
            Rec().saved = true;
        }
        Press(ID_REMOVE_LIBRARY_PATH);
        ExpectPaths(expected);
        EXPECT_EQ(Tree(NODE_LIBRARIES), others);
    }
}

} // namespace
