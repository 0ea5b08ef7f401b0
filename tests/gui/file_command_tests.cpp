#include "tests/gui/file_frame_test.h"

#include <optional>
#include <sys/stat.h>
#include <unistd.h>

namespace
{

namespace fs = std::filesystem;

// Everything a save would write, and so everything a load or New may change.
std::string Options(const ConfigRecord& record) { return FormatIni(record); }

class FileCommandTest : public FileFrameTest
{
  protected:
    // A loaded file with an unsaved change and the flag that only New clears.
    fs::path LoadChanged()
    {
        const fs::path file = Path("first.ini");
        Put(file, HAND_WRITTEN);
        Load(file);
        Change();
        m_frame->Config().generate = true;
        return file;
    }
    void ExpectUnchanged(const std::string& options, const fs::path& file)
    {
        const ConfigRecord& record = m_frame->Config();
        EXPECT_EQ(Options(record), options);
        EXPECT_EQ(record.file_path, file.string());
        EXPECT_EQ(record.config_name, file.filename().string());
        EXPECT_FALSE(record.saved);
    }
};

struct NewCase
{
    const char* name;
    bool changed;
    bool hasPath;
    std::vector<int> answers; // the question, then the save dialog if one is asked
    bool replaces;
    bool failingWrite = false;
};

class NewCommand : public FileCommandTest, public testing::WithParamInterface<NewCase>
{
};

TEST_P(NewCommand, DiscardsChangesOnlyWhenToldOrSaved)
{
    const NewCase& c = GetParam();
    const fs::path file = LoadChanged();
    if (!c.changed)
        m_frame->Config().saved = true;
    if (!c.hasPath)
        m_frame->Config().file_path.clear();
    const std::string before = Options(m_frame->Config());

    DialogScript script;
    if (!c.answers.empty())
        script.Question(OPEN_QUESTION, c.answers[0]);
    if (c.answers.size() > 1)
        script.SaveFile("", c.answers[1]);
    {
        std::optional<WritesFail> full;
        if (c.failingWrite)
            full.emplace();
        script.Run([&] { Tool(ID_TOOL_NEW); });
    }

    const ConfigRecord& record = m_frame->Config();
    if (c.replaces)
    {
        EXPECT_EQ(Options(record), Options(ConfigRecord()));
        EXPECT_EQ(record.file_path, "");
        EXPECT_EQ(record.config_name, "Configuration");
        EXPECT_TRUE(record.saved);
        EXPECT_FALSE(record.generate);
    }
    else
    {
        EXPECT_EQ(Options(record), before);
        EXPECT_TRUE(record.flat_busses);
        EXPECT_FALSE(record.saved);
    }
    // Yes keeps the changes in the file before they leave the window.
    const bool savedFirst = c.replaces && !c.answers.empty() && c.answers[0] == wxID_YES;
    EXPECT_EQ(InFile(file, "flat_busses"), savedFirst ? "yes" : "no");
}

INSTANTIATE_TEST_SUITE_P(
    Answers, NewCommand,
    testing::Values(NewCase{"NothingUnsaved", false, true, {}, true},
                    NewCase{"No", true, true, {wxID_NO}, true},
                    NewCase{"Cancel", true, true, {wxID_CANCEL}, false},
                    NewCase{"YesSaved", true, true, {wxID_YES}, true},
                    NewCase{"YesDialogCancelled", true, false, {wxID_YES, wxID_CANCEL}, false},
                    NewCase{"YesWriteFailed", true, true, {wxID_YES}, false, true}),
    [](const auto& info) { return std::string(info.param.name); });

struct OpenCase
{
    const char* name;
    bool changed;
    bool hasPath;
    int question;   // 0: not asked
    int saveDialog; // 0: not shown
    const char* chosen;
    int openDialog; // 0: not shown
    const char* status;
};

class OpenCommand : public FileCommandTest, public testing::WithParamInterface<OpenCase>
{
};

TEST_P(OpenCommand, LoadsTheChosenFileOrLeavesEverything)
{
    const OpenCase& c = GetParam();
    const fs::path first = LoadChanged();
    if (!c.changed)
        m_frame->Config().saved = true;
    if (!c.hasPath)
        m_frame->Config().file_path.clear();
    fs::create_directory(Path("folder.ini"));
    Put(Path("second.ini"), "[Defaults]\nflat=yes\n[Verilog]\ncase=U\n");
    const ConfigRecord before = m_frame->Config();

    DialogScript script;
    if (c.question)
        script.Question(OPEN_QUESTION, c.question);
    if (c.saveDialog)
        script.SaveFile("", c.saveDialog);
    if (c.openDialog)
        script.OpenFile(Path(c.chosen), c.openDialog);
    script.Run([&] { Tool(ID_TOOL_OPEN); });

    const ConfigRecord& record = m_frame->Config();
    const fs::path chosen = Path(c.chosen);
    const std::string status = c.status;
    EXPECT_EQ(StatusText(), status.find("%s") == std::string::npos
                                ? wxString(status)
                                : wxString::Format(status.c_str(), chosen.string()));
    const bool loaded = status == "Configuration second.ini loaded";
    EXPECT_EQ(record.file_path, loaded ? chosen.string() : before.file_path);
    EXPECT_EQ(record.config_name, loaded ? "second.ini" : before.config_name);
    EXPECT_EQ(record.flat, loaded);
    EXPECT_EQ(record.case_, loaded ? 'U' : 'L');
    EXPECT_TRUE(record.generate); // no load reads it
    // saved: true only when it was, or when the question's Yes saved.
    EXPECT_EQ(record.saved, !c.changed || (c.question == wxID_YES && !c.saveDialog));
    EXPECT_EQ(InFile(first, "flat_busses"), record.saved && c.changed ? "yes" : "no");
}

const char* const CANCELLED = "Load configuration cancelled";

INSTANTIATE_TEST_SUITE_P(
    Answers, OpenCommand,
    testing::Values(OpenCase{"NothingUnsaved", false, true, 0, 0, "second.ini", wxID_OK,
                             "Configuration second.ini loaded"},
                    OpenCase{"No", true, true, wxID_NO, 0, "second.ini", wxID_OK,
                             "Configuration second.ini loaded"},
                    OpenCase{"Yes", true, true, wxID_YES, 0, "second.ini", wxID_OK,
                             "Configuration second.ini loaded"},
                    OpenCase{"Cancel", true, true, wxID_CANCEL, 0, "second.ini", 0, CANCELLED},
                    OpenCase{"YesButSaveCancelled", true, false, wxID_YES, wxID_CANCEL,
                             "second.ini", 0, CANCELLED},
                    OpenCase{"FileDialogCancelled", false, true, 0, 0, "second.ini", wxID_CANCEL,
                             CANCELLED},
                    OpenCase{"Folder", false, true, 0, 0, "folder.ini", wxID_OK,
                             "Configuration %s could not be read: Is a directory"}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(FileCommandTest, OpenAnsweredNoStillAsksBeforeClosing)
{
    LoadChanged();
    Put(Path("second.ini"), "[Defaults]\n");
    DialogScript()
        .Question(OPEN_QUESTION, wxID_NO)
        .OpenFile(Path("second.ini"))
        .Run([&] { Tool(ID_TOOL_OPEN); });
    DialogScript().Question(CLOSE_QUESTION, wxID_CANCEL).Run([&] { m_frame->Close(); });
    EXPECT_FALSE(Closed());
}

TEST_F(FileCommandTest, LoadTakesTheFileAndNeverWritesIt)
{
    const fs::path file = Path("given.ini");
    Put(file, HAND_WRITTEN);
    ASSERT_EQ(chmod(file.c_str(), 0444), 0);
    m_frame->Config().saved = false;
    m_frame->Config().generate = true;

    EXPECT_TRUE(m_frame->LoadConfig(file.string()));
    const ConfigRecord& record = m_frame->Config();
    EXPECT_EQ(StatusText(), "Configuration " + file.string() + " loaded");
    EXPECT_EQ(record.file_path, file.string());
    EXPECT_EQ(record.config_name, "given.ini");
    EXPECT_EQ(record.case_, 'L');
    EXPECT_FALSE(record.saved);
    EXPECT_TRUE(record.generate);
    EXPECT_EQ(Slurp(file), HAND_WRITTEN);
}

struct UnreadableCase
{
    const char* name;
    std::function<fs::path(const fs::path& dir)> make;
    const char* status; // %s: the path
};

class UnreadableLoad : public FileCommandTest, public testing::WithParamInterface<UnreadableCase>
{
};

TEST_P(UnreadableLoad, LeavesRecordPathAndTreeAsTheyWere)
{
    const fs::path first = LoadChanged();
    const std::string options = Options(m_frame->Config());
    const fs::path path = GetParam().make(m_dir);
    if (path.empty())
        GTEST_SKIP() << "cannot make such a file here";
    EXPECT_FALSE(m_frame->LoadConfig(path.string()));
    EXPECT_EQ(StatusText(), wxString::Format(GetParam().status, path.string()));
    ExpectUnchanged(options, first);
}

INSTANTIATE_TEST_SUITE_P(
    Files, UnreadableLoad,
    testing::Values(UnreadableCase{"Missing",
                                   [](const fs::path& dir) { return dir / "missing.ini"; },
                                   "Configuration %s not founded"},
                    UnreadableCase{"Folder",
                                   [](const fs::path& dir)
                                   {
                                       fs::create_directory(dir / "sub");
                                       return dir / "sub";
                                   },
                                   "Configuration %s could not be read: Is a directory"},
                    UnreadableCase{"IoError",
                                   [](const fs::path&) {
                                       return fs::path(access("/proc/self/mem", R_OK) == 0
                                                           ? "/proc/self/mem"
                                                           : "");
                                   },
                                   "Configuration %s could not be read: Input/output error"},
                    UnreadableCase{"NoPermission",
                                   [](const fs::path& dir)
                                   {
                                       if (geteuid() == 0) // root reads anything
                                           return fs::path();
                                       Put(dir / "locked.ini", "[Defaults]\n");
                                       chmod((dir / "locked.ini").c_str(), 0);
                                       return dir / "locked.ini";
                                   },
                                   "Configuration %s could not be read: Permission denied"}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(FileCommandTest, SaveAsThenSaveWritesTheNewFileWithoutAsking)
{
    const fs::path first = LoadChanged();
    const fs::path second = Path("second.ini");
    DialogScript().SaveFile(second).Run([&] { Tool(ID_TOOL_SAVE_AS); });
    EXPECT_EQ(StatusText(), "Configuration saved");
    EXPECT_EQ(m_frame->Config().file_path, second.string());
    EXPECT_EQ(m_frame->Config().config_name, "first.ini"); // until the file is opened again
    EXPECT_TRUE(m_frame->Config().saved);
    EXPECT_EQ(InFile(second, "generate"), "yes");

    m_frame->Config().flat = true;
    m_frame->Config().saved = false;
    DialogScript().Run([&] { Tool(ID_TOOL_SAVE); });
    EXPECT_EQ(InFile(second, "flat"), "yes");
    EXPECT_EQ(Slurp(first), HAND_WRITTEN);
}

TEST_F(FileCommandTest, SaveAsCancelledChangesNothing)
{
    const fs::path first = LoadChanged();
    const std::string options = Options(m_frame->Config());
    const wxString status = StatusText();
    DialogScript().SaveFile("", wxID_CANCEL).Run([&] { Tool(ID_TOOL_SAVE_AS); });
    EXPECT_EQ(StatusText(), status);
    ExpectUnchanged(options, first);
}

TEST_F(FileCommandTest, SaveWithoutAFileAsksForOne)
{
    Change();
    DialogScript().SaveFile("", wxID_CANCEL).Run([&] { Tool(ID_TOOL_SAVE); });
    EXPECT_EQ(StatusText(), "Save not completed");
    EXPECT_FALSE(m_frame->Config().saved);

    DialogScript().SaveFile(Path("new.ini")).Run([&] { Tool(ID_TOOL_SAVE); });
    EXPECT_EQ(StatusText(), "Configuration saved");
    EXPECT_EQ(InFile(Path("new.ini"), "flat_busses"), "yes");
    EXPECT_EQ(m_frame->Config().file_path, Path("new.ini").string());
}

TEST_F(FileCommandTest, SaveWritesOnlyWhatTheRecordHolds)
{
    const fs::path file = LoadChanged();
    // Another program adds to the file while the window is open.
    Put(file, HAND_WRITTEN + "\n[Foreign]\nx=1\n[Defaults]\nadded=1\n");
    EXPECT_TRUE(m_frame->SaveConfig());
    EXPECT_EQ(Slurp(file), FormatIni(m_frame->Config()));
    EXPECT_FALSE(ParseIni(Slurp(file))->HasGroup("/Foreign"));
}

TEST_F(FileCommandTest, SaveThroughALinkKeepsTheLink)
{
    fs::create_directory(Path("store"));
    Put(Path("store/real.ini"), HAND_WRITTEN);
    fs::create_symlink("store/real.ini", Path("link.ini"));
    Load(Path("link.ini"));
    Change();
    EXPECT_TRUE(m_frame->SaveConfig());
    EXPECT_TRUE(fs::is_symlink(Path("link.ini")));
    EXPECT_EQ(InFile(Path("store/real.ini"), "flat_busses"), "yes");
}

struct BrokenPathCase
{
    const char* name;
    std::function<void(const fs::path& file)> breakIt; // what happens to the file after loading
    int error;
};

class FailedSave : public FileCommandTest, public testing::WithParamInterface<BrokenPathCase>
{
};

TEST_P(FailedSave, IsReportedAndLeavesEverything)
{
    fs::create_directory(Path("store"));
    const fs::path file = Path("store/config.ini");
    Put(file, HAND_WRITTEN);
    Load(file);
    Change();
    GetParam().breakIt(file);
    const auto before = fs::is_directory(file) ? std::string("folder") : Slurp(file);
    const std::string options = Options(m_frame->Config());

    EXPECT_FALSE(m_frame->SaveConfig());
    EXPECT_EQ(StatusText(), "Configuration " + file.string() +
                                " could not be saved: " + wxSysErrorMsgStr(GetParam().error));
    ExpectUnchanged(options, file);
    EXPECT_EQ(fs::is_directory(file) ? std::string("folder") : Slurp(file), before);
}

INSTANTIATE_TEST_SUITE_P(Paths, FailedSave,
                         testing::Values(BrokenPathCase{"FolderBecameAFile",
                                                        [](const fs::path& file)
                                                        {
                                                            fs::remove_all(file.parent_path());
                                                            Put(file.parent_path(), "plain");
                                                        },
                                                        ENOTDIR},
                                         BrokenPathCase{"FileBecameAFolder",
                                                        [](const fs::path& file)
                                                        {
                                                            fs::remove(file);
                                                            fs::create_directory(file);
                                                        },
                                                        EISDIR},
                                         BrokenPathCase{"FolderRemoved",
                                                        [](const fs::path& file)
                                                        { fs::remove_all(file.parent_path()); },
                                                        ENOENT}),
                         [](const auto& info) { return std::string(info.param.name); });

TEST_F(FileCommandTest, FailedSaveToAChosenNameAsksAgainNextTime)
{
    Put(Path("plain"), "not a folder");
    Change();
    DialogScript().SaveFile(Path("plain/new.ini")).Run([&] { Tool(ID_TOOL_SAVE); });
    EXPECT_EQ(StatusText(), "Configuration " + Path("plain/new.ini").string() +
                                " could not be saved: " + wxSysErrorMsgStr(ENOTDIR));
    EXPECT_EQ(m_frame->Config().file_path, "");
    EXPECT_FALSE(m_frame->Config().saved);
    DialogScript().SaveFile("", wxID_CANCEL).Run([&] { Tool(ID_TOOL_SAVE); });
}

TEST_F(FileCommandTest, FailedSaveAsStaysWithTheOldFile)
{
    const fs::path first = LoadChanged();
    const std::string options = Options(m_frame->Config());
    Put(Path("plain"), "not a folder");
    DialogScript().SaveFile(Path("plain/new.ini")).Run([&] { Tool(ID_TOOL_SAVE_AS); });
    ExpectUnchanged(options, first);
    EXPECT_EQ(Slurp(first), HAND_WRITTEN);
}

} // namespace
