#include "tests/gui/file_frame_test.h"

#include <wx/treectrl.h>

namespace
{

namespace fs = std::filesystem;

const char* const SAVED = "Configuration saved";
const char* const CANCELLED = "Load configuration cancelled";
const char* const LOADED = "Configuration second.ini loaded";
const char* const SECOND = "[Defaults]\nflat=yes\n[Verilog]\ncase=U\n";

// A loaded file with an unsaved change and the flag that only New clears, and a status bar that
// shows only what the action writes there.
class FileCommandTest : public FileFrameTest
{
  protected:
    void SetUp() override
    {
        FileFrameTest::SetUp();
        LoadAndChange(Path("first.ini"));
        m_frame->Config().generate = true;
        m_before = FormatIni(m_frame->Config());
        fs::create_directory(Path("folder.ini"));
        Put(Path("second.ini"), SECOND);
        m_frame->SetStatusText("-");
    }
    // The record's options (unless `ini` is empty), its file and name, and the name on the tree.
    void Expect(const std::string& ini, const std::string& path, const char* name, bool saved)
    {
        const ConfigRecord& record = m_frame->Config();
        if (!ini.empty())
        {
            EXPECT_EQ(FormatIni(record), ini);
        }
        EXPECT_EQ(record.file_path, path);
        EXPECT_EQ(record.config_name, name);
        EXPECT_EQ(record.saved, saved);
        EXPECT_EQ(m_frame->Tree()->GetItemText(m_frame->Tree()->GetRootItem()), name);
    }
    // second.ini in the record and the tree; a load never sets nor clears `saved`.
    void ExpectLoaded(bool saved)
    {
        Expect("", Path("second.ini"), "second.ini", saved);
        const ConfigRecord& record = m_frame->Config();
        EXPECT_TRUE(record.flat);
        EXPECT_EQ(record.case_, 'U');
        EXPECT_TRUE(record.generate); // no load reads it
        EXPECT_EQ(Slurp(Path("second.ini")), SECOND);
    }
    // A file chooser as a case gives it: nullptr not shown, "" cancelled, else the name chosen.
    void AddChooser(std::vector<Dialog>& dialogs, const char* name, bool open)
    {
        if (name)
            dialogs.push_back(Chooser(open, *name ? Path(name) : ""));
    }

    std::string m_before;
};

// Start-up names the whole path; files it cannot take are Open's cases below.
TEST_F(FileCommandTest, LoadByPathReportsThePath)
{
    EXPECT_TRUE(m_frame->LoadConfig(Path("second.ini")));
    EXPECT_EQ(StatusText(), "Configuration " + Path("second.ini") + " loaded");
    ExpectLoaded(false);
}

// New and Open set the record aside: unsaved changes go only on No or once saved.
struct AsideCase
{
    const char* name;
    int tool;
    bool changed;
    int question;       // 0: not asked
    const char* saveAs; // the save chooser, asked when the record has no file (see AddChooser)
    const char* open;   // the open chooser
    const char* status; // "%s": the scratch folder
};

class SetAside : public FileCommandTest, public testing::WithParamInterface<AsideCase>
{
};

TEST_P(SetAside, DropsChangesOnlyWhenToldOrSaved)
{
    const AsideCase& c = GetParam();
    m_frame->Config().saved = !c.changed;
    if (c.saveAs)
        m_frame->Config().file_path.clear();
    std::vector<Dialog> dialogs;
    if (c.question)
        dialogs.push_back(Question(OPEN_QUESTION, c.question));
    AddChooser(dialogs, c.saveAs, false);
    AddChooser(dialogs, c.open, true);
    WithDialogs(dialogs, [&] { Tool(c.tool); });

    EXPECT_EQ(StatusText(), Status(c.status));
    const bool savedFirst = c.question == wxID_YES && !c.saveAs;
    if (Status(c.status) == LOADED)
        ExpectLoaded(!c.changed || savedFirst);
    else if (c.tool == ID_TOOL_OPEN || c.question == wxID_CANCEL || c.saveAs)
        Expect(m_before, c.saveAs ? "" : Path("first.ini"), "first.ini", !c.changed);
    else
        Expect(FormatIni(ConfigRecord()), "", "Configuration", true);
    EXPECT_EQ(InFile(Path("first.ini"), "flat_busses"), savedFirst ? "yes" : "no");
}

const char* const SAVE_FAILS = "Configuration %s/plain/new.ini could not be saved: Not a directory";

const AsideCase ASIDE[] = {
    {"NewUnchanged", ID_TOOL_NEW, false, 0, nullptr, nullptr, "-"},
    {"NewNo", ID_TOOL_NEW, true, wxID_NO, nullptr, nullptr, "-"},
    {"NewCancel", ID_TOOL_NEW, true, wxID_CANCEL, nullptr, nullptr, "-"},
    {"NewYes", ID_TOOL_NEW, true, wxID_YES, nullptr, nullptr, SAVED},
    {"NewYesNameCancelled", ID_TOOL_NEW, true, wxID_YES, "", nullptr, "Save not completed"},
    {"NewYesSaveFails", ID_TOOL_NEW, true, wxID_YES, "plain/new.ini", nullptr, SAVE_FAILS},
    {"OpenUnchanged", ID_TOOL_OPEN, false, 0, nullptr, "second.ini", LOADED},
    {"OpenNo", ID_TOOL_OPEN, true, wxID_NO, nullptr, "second.ini", LOADED},
    {"OpenYes", ID_TOOL_OPEN, true, wxID_YES, nullptr, "second.ini", LOADED},
    {"OpenCancel", ID_TOOL_OPEN, true, wxID_CANCEL, nullptr, nullptr, CANCELLED},
    {"OpenYesNameCancelled", ID_TOOL_OPEN, true, wxID_YES, "", nullptr, CANCELLED},
    {"OpenYesSaveFails", ID_TOOL_OPEN, true, wxID_YES, "plain/new.ini", nullptr, CANCELLED},
    {"OpenChooserCancelled", ID_TOOL_OPEN, false, 0, nullptr, "", CANCELLED},
    {"OpenFolder", ID_TOOL_OPEN, false, 0, nullptr, "folder.ini",
     "Configuration %s/folder.ini could not be read: Is a directory"},
    {"OpenMissing", ID_TOOL_OPEN, false, 0, nullptr, "missing.ini",
     "Configuration %s/missing.ini not founded"},
};

INSTANTIATE_TEST_SUITE_P(Answers, SetAside, testing::ValuesIn(ASIDE),
                         [](const auto& info) { return std::string(info.param.name); });

struct SaveCase
{
    const char* name;
    int tool;
    const char* path;   // the record's file before; "": none
    const char* chosen; // the save chooser (see AddChooser)
    const char* status; // "%s": the scratch folder
    const char* after;  // the record's file afterwards
};

class SaveCommand : public FileCommandTest, public testing::WithParamInterface<SaveCase>
{
};

TEST_P(SaveCommand, WritesTheWholeRecordOrReportsWhyNot)
{
    const SaveCase& c = GetParam();
    m_frame->Config().file_path = *c.path ? Path(c.path) : "";
    std::vector<Dialog> dialogs;
    AddChooser(dialogs, c.chosen, false);
    WithDialogs(dialogs, [&] { Tool(c.tool); });

    const bool saved = Status(c.status) == SAVED;
    const std::string target = *c.after ? Path(c.after) : "";
    EXPECT_EQ(StatusText(), Status(c.status));
    Expect(m_before, target, "first.ini", saved); // the name changes only when a file is opened
    // A save leaves nothing of what the old file held; a failed one leaves it as it was.
    const bool rewritten = saved && target == Path("first.ini");
    EXPECT_EQ(Slurp(Path("first.ini")), rewritten ? m_before : HAND_WRITTEN);
    if (!saved)
        return;
    EXPECT_EQ(Slurp(target), m_before);
    // From now on Save writes the same file without asking.
    m_frame->Config().flat = true;
    m_frame->Config().saved = false;
    WithDialogs({}, [&] { Tool(ID_TOOL_SAVE); });
    EXPECT_EQ(InFile(target, "flat"), "yes");
}

const char* const NOT_A_FOLDER =
    "Configuration %s/plain/first.ini could not be saved: Not a directory";

const SaveCase SAVES[] = {
    {"Save", ID_TOOL_SAVE, "first.ini", nullptr, SAVED, "first.ini"},
    {"SaveAsksForAName", ID_TOOL_SAVE, "", "new.ini", SAVED, "new.ini"},
    {"SaveNameCancelled", ID_TOOL_SAVE, "", "", "Save not completed", ""},
    {"SaveNameUnwritable", ID_TOOL_SAVE, "", "plain/new.ini", SAVE_FAILS, ""}, // asks again
    {"SaveFolderIsAFile", ID_TOOL_SAVE, "plain/first.ini", nullptr, NOT_A_FOLDER,
     "plain/first.ini"},
    {"SavePathIsAFolder", ID_TOOL_SAVE, "folder.ini", nullptr,
     "Configuration %s/folder.ini could not be saved: Is a directory", "folder.ini"},
    {"SaveAs", ID_TOOL_SAVE_AS, "first.ini", "second.ini", SAVED, "second.ini"},
    {"SaveAsCancelled", ID_TOOL_SAVE_AS, "first.ini", "", "-", "first.ini"},
    {"SaveAsUnwritable", ID_TOOL_SAVE_AS, "first.ini", "plain/new.ini", SAVE_FAILS, "first.ini"},
};

INSTANTIATE_TEST_SUITE_P(Paths, SaveCommand, testing::ValuesIn(SAVES),
                         [](const auto& info) { return std::string(info.param.name); });

} // namespace
