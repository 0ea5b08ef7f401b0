#include "tests/gui/file_frame_test.h"

#include <optional>
#include <unistd.h>

namespace
{

namespace fs = std::filesystem;

constexpr int GENERATE = ID_TOOL_GENERATE, CLOSE = 0, QUIT = ID_QUIT; // CLOSE: the close button

// The record and its file before the way out.
enum : int
{
    CHANGED = 1,     // an option changed since the file was loaded
    FLAG = 2,        // Generate set the flag earlier in the record's life
    GONE = 4,        // the file was removed after loading; the path is kept
    NO_PATH = 8,     // no file: a save asks for a name, and the chooser is cancelled
    BAD_PARENT = 16, // the record's file lies in a "folder" that is a regular file
    FULL_DISK = 32,  // every write fails half way
    UNREADABLE = 64  // the record's file exists and cannot be read, by root neither
};

struct ExitCase
{
    const char* name;
    int way;
    int state;
    int answer;           // to the one question asked; 0: none asked
    const char* generate; // in the file afterwards; nullptr: not a byte changed
    bool closes;
    const char* status; // nullptr: not looked at; "%s": the scratch folder
};

class WayOut : public FileFrameTest, public testing::WithParamInterface<ExitCase>
{
};

TEST_P(WayOut, LeavesTheFileTheNetlisterExpects)
{
    const ExitCase& c = GetParam();
    const std::string file = Path("netlist.ini");
    LoadAndChange(file, c.state & CHANGED);
    ConfigRecord& record = m_frame->Config();
    record.generate = c.state & FLAG;
    if (c.state & GONE)
        fs::remove(file);
    if (c.state & NO_PATH)
        record.file_path.clear();
    if (c.state & BAD_PARENT)
        record.file_path = Path("plain/netlist.ini");
    if (c.state & UNREADABLE)
        record.file_path = "/proc/self/mem";
    if ((c.state & UNREADABLE) && access("/proc/self/mem", R_OK) != 0)
        GTEST_SKIP() << "no /proc";

    // Generate asks its own question only about a file that is there.
    const bool generateAsks = c.way == GENERATE && !(c.state & (GONE | NO_PATH));
    std::vector<Dialog> dialogs;
    if (c.answer)
        dialogs.push_back(Question(generateAsks ? GENERATE_QUESTION : CLOSE_QUESTION, c.answer));
    if ((c.state & NO_PATH) && c.answer == wxID_YES)
        dialogs.push_back(Chooser(false, ""));
    {
        std::optional<WritesFail> full;
        if (c.state & FULL_DISK)
            full.emplace();
        // Quit has no control of its own: its command reaches the frame as a tool's does.
        WithDialogs(dialogs,
                    [&]
                    {
                        if (c.way == CLOSE)
                            m_frame->Close();
                        else
                            Tool(c.way);
                    });
    }

    EXPECT_EQ(Closed(), c.closes);
    EXPECT_EQ(StatusText(), c.status ? Status(c.status) : StatusText());
    if (!c.closes) // the changes stay for another try, and a later save must not hand over
    {
        EXPECT_EQ(m_frame->Config().flat_busses, bool(c.state & CHANGED));
        EXPECT_EQ(m_frame->Config().saved, !(c.state & CHANGED));
        EXPECT_EQ(m_frame->Config().generate, bool(c.state & FLAG));
    }
    if (!c.generate)
    {
        EXPECT_EQ(fs::exists(file) ? Slurp(file) : "gone", c.state & GONE ? "gone" : HAND_WRITTEN);
        return;
    }
    EXPECT_EQ(InFile(file, "generate"), c.generate);
    // Rewritten from the record: with the change, or with the file's values after No.
    const bool keptChange = (c.state & CHANGED) && c.answer == wxID_YES;
    EXPECT_EQ(InFile(file, "flat_busses"), keptChange ? "yes" : "no");
    EXPECT_EQ(InFile(file, "unknown_key"), "-");
}

const char* const NO_FILE = "The Configuration file does not exit";
const char* const DISK_FULL = "Configuration %s/netlist.ini could not be saved: File too large";
const char* const NOT_A_FOLDER =
    "Configuration %s/plain/netlist.ini could not be saved: Not a directory";
const char* const UNREAD = "Configuration /proc/self/mem could not be read: Input/output error";

const ExitCase WAYS[] = {
    {"GenerateFlagClear", GENERATE, 0, 0, "yes", true, nullptr},
    {"GenerateFlagSet", GENERATE, FLAG, 0, nullptr, true, nullptr},
    {"GenerateChangedYes", GENERATE, CHANGED, wxID_YES, "yes", true, nullptr},
    {"GenerateChangedNo", GENERATE, CHANGED, wxID_NO, "yes", true, nullptr},
    {"GenerateChangedNoFlagSet", GENERATE, CHANGED | FLAG, wxID_NO, nullptr, true, nullptr},
    {"GenerateChangedCancel", GENERATE, CHANGED, wxID_CANCEL, nullptr, false, "Netlisting aborted"},
    {"GenerateNoFileCloseYes", GENERATE, CHANGED | GONE, wxID_YES, "no", true, nullptr},
    {"GenerateNoFileCloseNo", GENERATE, CHANGED | GONE, wxID_NO, nullptr, true, NO_FILE},
    {"GenerateNoFileCloseCancel", GENERATE, CHANGED | GONE, wxID_CANCEL, nullptr, false, NO_FILE},
    {"GenerateNoPath", GENERATE, CHANGED | NO_PATH, 0, nullptr, false, NO_FILE},
    {"CloseUnchanged", CLOSE, FLAG, 0, nullptr, true, nullptr},
    {"CloseChangedYes", CLOSE, CHANGED, wxID_YES, "no", true, "Configuration saved"},
    {"CloseChangedYesFlagSet", CLOSE, CHANGED | FLAG, wxID_YES, "yes", true, nullptr},
    {"CloseChangedNo", CLOSE, CHANGED, wxID_NO, nullptr, true, nullptr},
    {"CloseChangedCancel", CLOSE, CHANGED, wxID_CANCEL, nullptr, false, nullptr},
    {"QuitChangedNo", QUIT, CHANGED, wxID_NO, nullptr, true, nullptr},
    {"QuitChangedCancel", QUIT, CHANGED, wxID_CANCEL, nullptr, false, nullptr},
    // A save that did not complete keeps the window: the netlister must not go on with a file
    // that was not written, nor the user lose the changes.
    {"CloseYesSaveFails", CLOSE, CHANGED | BAD_PARENT, wxID_YES, nullptr, false, NOT_A_FOLDER},
    {"CloseYesNameCancelled", CLOSE, CHANGED | NO_PATH, wxID_YES, nullptr, false,
     "Save not completed"},
    {"GenerateSaveFails", GENERATE, FULL_DISK, 0, nullptr, false, DISK_FULL},
    {"GenerateYesSaveFails", GENERATE, CHANGED | FULL_DISK, wxID_YES, nullptr, false, DISK_FULL},
    {"GenerateNoUnreadable", GENERATE, CHANGED | UNREADABLE, wxID_NO, nullptr, false, UNREAD},
};

INSTANTIATE_TEST_SUITE_P(Table, WayOut, testing::ValuesIn(WAYS),
                         [](const auto& info) { return std::string(info.param.name); });

} // namespace
