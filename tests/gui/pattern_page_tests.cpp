#include "tests/gui/page_test.h"

#include <wx/dirdlg.h>
#include <wx/filedlg.h>
#include <wx/listbox.h>
#include <wx/stopwatch.h>

#include <filesystem>
#include <fstream>
#include <string>

#include <stdlib.h>

namespace
{

// On GTK, wxDirDialog::SetPath only moves the native chooser; GetPath reports the path the
// user accepted, which the dialog keeps in its base class.
struct AcceptedDirectory : wxDirDialog
{
    static void Set(wxDirDialog& dialog, const wxString& path)
    {
        dialog.*(&AcceptedDirectory::m_path) = path;
    }
};

// wx's test hook answers file choosers with a path, but not directory choosers.
class ExpectDirChoice : public wxExpectModalBase<wxDirDialog, ExpectDirChoice>
{
  public:
    ExpectDirChoice(const wxString& path, int answer, wxWindow* parent)
        : m_path(path), m_answer(answer), m_parent(parent)
    {
    }

  protected:
    int OnInvoked(wxDirDialog* dialog) const override
    {
        EXPECT_EQ(dialog->GetMessage(), "Add a library path");
        EXPECT_EQ(dialog->GetParent(), m_parent);
        if (m_answer == wxID_OK)
            AcceptedDirectory::Set(*dialog, m_path);
        return m_answer;
    }

  private:
    wxString m_path;
    int m_answer;
    wxWindow* m_parent;
};

// GTK's file chooser takes a path only once it has read the folder, and an open dialog only a file
// that exists: wx's own wxExpectModal<wxFileDialog> gets an empty GetPath there.
class ExpectFileChoice : public wxExpectModalBase<wxFileDialog, ExpectFileChoice>
{
  public:
    ExpectFileChoice(const wxString& path, int answer, wxWindow* parent)
        : m_path(path), m_answer(answer), m_parent(parent)
    {
    }

  protected:
    int OnInvoked(wxFileDialog* dialog) const override
    {
        EXPECT_EQ(dialog->GetMessage(), "Add a library file");
        EXPECT_EQ(dialog->GetWildcard(), "All files (*.*)|*.*");
        EXPECT_FALSE(dialog->HasFlag(wxFD_SAVE));
        EXPECT_EQ(dialog->GetParent(), m_parent);
        if (m_answer != wxID_OK)
            return m_answer;
        dialog->SetPath(m_path);
        const wxStopWatch clock;
        while (dialog->GetPath() != m_path && clock.Time() < 5000)
            wxYield();
        EXPECT_EQ(dialog->GetPath().utf8_string(), m_path.utf8_string());
        return m_answer;
    }

  private:
    wxString m_path;
    int m_answer;
    wxWindow* m_parent;
};

constexpr const char* NON_ASCII_LIB = "mos \xc3\xa9t\xc3\xa9.lib";

class LibraryPaths : public PageTest
{
  protected:
    // Real files, for the file chooser: "cells.lib", "Cells.lib", "z.lib" and one with a name
    // that is not ASCII.
    static void SetUpTestSuite()
    {
        char pattern[] = "/tmp/zidovade-libs-XXXXXX";
        ASSERT_NE(mkdtemp(pattern), nullptr);
        s_dir = std::string(pattern) + "/";
        for (const char* name : {"cells.lib", "Cells.lib", "z.lib", NON_ASCII_LIB})
            std::ofstream(s_dir + name) << "* library\n";
    }
    static void TearDownTestSuite() { std::filesystem::remove_all(s_dir); }

    static std::string In(const std::string& name) { return s_dir + name; }
    static LibraryPathList AllIn(const LibraryPathList& names)
    {
        LibraryPathList paths;
        for (const std::string& name : names)
            paths.push_back(In(name));
        return paths;
    }

    void ShowPaths(const LibraryPathList& paths)
    {
        Record().library_paths = paths;
        m_frame->BuildOptionTree();
        SelectPageOf(NODE_LIBRARIES);
    }

    wxListBox* List() const { return m_frame->FindCtrl<wxListBox>(ID_LIBRARY_PATH_LIST); }

    std::vector<std::string> ListTexts() const
    {
        std::vector<std::string> texts;
        if (wxListBox* list = List())
            for (unsigned i = 0; i < list->GetCount(); ++i)
                texts.push_back(list->GetString(i).utf8_string());
        return texts;
    }

    // The record, the list box and the "Libraries" node must list the same entries.
    void ExpectShown(const LibraryPathList& expected)
    {
        EXPECT_EQ(Record().library_paths, expected);
        EXPECT_EQ(ListTexts(), expected);
        EXPECT_EQ(ChildTexts(NODE_LIBRARIES), expected);
        // wx cannot expand a node without children.
        EXPECT_EQ(OptionTree()->IsExpanded(Node(NODE_LIBRARIES)), !expected.empty());
        ASSERT_NE(List(), nullptr);
        EXPECT_EQ(List()->GetSelection(), wxNOT_FOUND);
        EXPECT_FALSE(Record().saved);
    }

    void Choose(int button, const std::string& path, int answer)
    {
        const wxString shown = wxString::FromUTF8(path);
        if (button == ID_ADD_LIBRARY_PATH)
        {
            wxTEST_DIALOG(Press(button), ExpectDirChoice(shown, answer, m_frame));
        }
        else
        {
            wxTEST_DIALOG(Press(button), ExpectFileChoice(shown, answer, m_frame));
        }
    }

    void SelectEntry(int index)
    {
        wxListBox* list = List();
        ASSERT_NE(list, nullptr);
        list->SetSelection(index);
        wxCommandEvent event(wxEVT_LISTBOX, ID_LIBRARY_PATH_LIST);
        event.SetEventObject(list);
        event.SetInt(index);
        event.SetString(list->GetString(index));
        list->HandleWindowEvent(event);
    }

    static std::string s_dir;
};

std::string LibraryPaths::s_dir;

// Names are taken in the suite's folder of real files.
struct ChooserCase
{
    const char* name;
    int button;
    std::string path;
    int answer;
    LibraryPathList expected;
};
void PrintTo(const ChooserCase& c, std::ostream* os) { *os << c.name; }

class Choosers : public LibraryPaths, public testing::WithParamInterface<ChooserCase>
{
};

TEST_P(Choosers, AppendTheChosenPathOnlyWhenConfirmedAndNew)
{
    const ChooserCase& c = GetParam();
    ShowPaths(AllIn({"lib", "cells.lib"}));
    const auto before = Labels(NODE_LIBRARIES);

    Choose(c.button, In(c.path), c.answer);

    ExpectShown(AllIn(c.expected));
    ExpectSameLabels(before, Labels(NODE_LIBRARIES));
}

INSTANTIATE_TEST_SUITE_P(
    PatternPage, Choosers,
    testing::Values(
        ChooserCase{
            "PathConfirmed", ID_ADD_LIBRARY_PATH, "other", wxID_OK, {"lib", "cells.lib", "other"}},
        ChooserCase{
            "PathCancelled", ID_ADD_LIBRARY_PATH, "other", wxID_CANCEL, {"lib", "cells.lib"}},
        ChooserCase{"PathAlreadyListed", ID_ADD_LIBRARY_PATH, "lib", wxID_OK, {"lib", "cells.lib"}},
        ChooserCase{
            "FileConfirmed", ID_ADD_LIBRARY_FILE, "z.lib", wxID_OK, {"lib", "cells.lib", "z.lib"}},
        ChooserCase{"FileNotAscii",
                    ID_ADD_LIBRARY_FILE,
                    NON_ASCII_LIB,
                    wxID_OK,
                    {"lib", "cells.lib", NON_ASCII_LIB}},
        ChooserCase{
            "FileCancelled", ID_ADD_LIBRARY_FILE, "z.lib", wxID_CANCEL, {"lib", "cells.lib"}},
        ChooserCase{
            "FileAlreadyListed", ID_ADD_LIBRARY_FILE, "cells.lib", wxID_OK, {"lib", "cells.lib"}},
        ChooserCase{"CaseMatters",
                    ID_ADD_LIBRARY_FILE,
                    "Cells.lib",
                    wxID_OK,
                    {"lib", "cells.lib", "Cells.lib"}}),
    [](const auto& info) { return std::string(info.param.name); });

struct RemoveCase
{
    const char* name;
    LibraryPathList paths;
    int selected; // wxNOT_FOUND: nothing selected
    LibraryPathList expected;
};
void PrintTo(const RemoveCase& c, std::ostream* os) { *os << c.name; }

class Removal : public LibraryPaths, public testing::WithParamInterface<RemoveCase>
{
};

TEST_P(Removal, RemovesTheFirstEntryEqualToTheSelection)
{
    const RemoveCase& c = GetParam();
    ShowPaths(c.paths);
    if (c.selected != wxNOT_FOUND)
        List()->SetSelection(c.selected);
    const auto before = Labels(NODE_LIBRARIES);
    wxWindow* remove = m_frame->FindWindow(ID_REMOVE_LIBRARY_PATH);
    remove->SetFocus();
    wxYield();

    Press(ID_REMOVE_LIBRARY_PATH);

    ExpectShown(c.expected);
    EXPECT_EQ(wxWindow::FindFocus(), remove) << "the refilled page took the focus";
    ExpectSameLabels(before, Labels(NODE_LIBRARIES));
}

INSTANTIATE_TEST_SUITE_P(
    PatternPage, Removal,
    testing::Values(RemoveCase{"Only", {"/a"}, 0, {}},
                    RemoveCase{"Middle", {"/a", "/b", "/c"}, 1, {"/a", "/c"}},
                    RemoveCase{"NothingSelected", {"/a", "/b"}, wxNOT_FOUND, {"/a", "/b"}},
                    // Two equal entries can only come from a file: the first one goes.
                    RemoveCase{
                        "SecondOfTwoEqual", {"/x", "/dup", "/y", "/dup"}, 3, {"/x", "/y", "/dup"}}),
    [](const auto& info) { return std::string(info.param.name); });

// A file written in Latin-1 holds bytes that are not UTF-8; the list shows them as text.
TEST_F(LibraryPaths, EntryReadInLatin1CanBeRemovedAndIsNotAddedTwice)
{
    const std::string latin1 = "/opt/biblioth\xe8que";
    ShowPaths({latin1, "/opt/lib"});
    const std::string shown = "/opt/biblioth\xc3\xa8que";
    ASSERT_EQ(ListTexts().at(0), shown);

    Choose(ID_ADD_LIBRARY_PATH, shown, wxID_OK);
    EXPECT_EQ(Record().library_paths, (LibraryPathList{latin1, "/opt/lib"}));

    List()->SetSelection(0);
    Press(ID_REMOVE_LIBRARY_PATH);
    EXPECT_EQ(Record().library_paths, LibraryPathList{"/opt/lib"});
    EXPECT_EQ(ChildTexts(NODE_LIBRARIES), std::vector<std::string>{"/opt/lib"});
}

TEST_F(LibraryPaths, SelectingAnEntryShowsItInTheStatusBar)
{
    ShowPaths({"/opt/lib", "/opt/cells.lib"});
    Record().saved = true;
    const auto before = Labels();

    SelectEntry(1);

    EXPECT_EQ(StatusText().utf8_string(), "/opt/cells.lib");
    EXPECT_FALSE(Record().saved);
    EXPECT_EQ(Record().library_paths, (LibraryPathList{"/opt/lib", "/opt/cells.lib"}));
    ExpectSameLabels(before, Labels());
}

} // namespace
