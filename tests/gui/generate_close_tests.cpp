#include "tests/gui/file_frame_test.h"

#include <unistd.h>

namespace
{

enum class Way
{
    Generate,
    Close
};

struct Question
{
    const char* text;
    int answer;
};

// One way out: the state before it, the questions it asks with their answers, and what it leaves.
struct ExitCase
{
    const char* name;
    Way way;
    bool changed;                    // an option changed since the file was loaded
    bool flagSet;                    // Generate set the flag earlier in the record's life
    bool fileGone;                   // the file was removed after loading; the path is kept
    std::vector<Question> questions; // in the order asked
    const char* generate;            // in the file afterwards; nullptr: not a byte changed
    bool closes;
    const char* status = nullptr; // not looked at when null
};

class WayOut : public FileFrameTest, public testing::WithParamInterface<ExitCase>
{
};

TEST_P(WayOut, LeavesTheFileTheNetlisterExpects)
{
    const ExitCase& c = GetParam();
    const auto file = Path("netlist.ini");
    Put(file, HAND_WRITTEN);
    Load(file);
    if (c.changed)
        Change();
    m_frame->Config().generate = c.flagSet;
    if (c.fileGone)
        std::filesystem::remove(file);

    DialogScript script;
    for (const Question& q : c.questions)
        script.Question(q.text, q.answer);
    script.Run(
        [&]
        {
            if (c.way == Way::Generate)
                Tool(ID_TOOL_GENERATE);
            else
                m_frame->Close(); // the window's close button
        });

    if (!c.generate && c.fileGone)
    {
        EXPECT_FALSE(std::filesystem::exists(file));
    }
    else if (!c.generate)
    {
        EXPECT_EQ(Slurp(file), HAND_WRITTEN);
    }
    else
    {
        EXPECT_EQ(InFile(file, "generate"), c.generate);
        // Rewritten from the record: with the changes, or with the file's values after No.
        const bool keptChange =
            c.changed && !c.questions.empty() && c.questions.back().answer == wxID_YES;
        EXPECT_EQ(InFile(file, "flat_busses"), keptChange ? "yes" : "no");
        EXPECT_EQ(InFile(file, "unknown_key"), "-");
    }
    EXPECT_EQ(Closed(), c.closes);
    if (c.status)
    {
        EXPECT_EQ(StatusText(), c.status);
    }
}

const char* const NO_FILE = "The Configuration file does not exit";

INSTANTIATE_TEST_SUITE_P(
    Table, WayOut,
    testing::Values(
        ExitCase{"GenerateFlagClear", Way::Generate, false, false, false, {}, "yes", true},
        ExitCase{"GenerateFlagSet", Way::Generate, false, true, false, {}, nullptr, true},
        ExitCase{"GenerateChangedYes",
                 Way::Generate,
                 true,
                 false,
                 false,
                 {{GENERATE_QUESTION, wxID_YES}},
                 "yes",
                 true},
        ExitCase{"GenerateChangedNo",
                 Way::Generate,
                 true,
                 false,
                 false,
                 {{GENERATE_QUESTION, wxID_NO}},
                 "yes",
                 true},
        ExitCase{"GenerateChangedNoFlagSet",
                 Way::Generate,
                 true,
                 true,
                 false,
                 {{GENERATE_QUESTION, wxID_NO}},
                 nullptr,
                 true},
        ExitCase{"GenerateChangedCancel",
                 Way::Generate,
                 true,
                 false,
                 false,
                 {{GENERATE_QUESTION, wxID_CANCEL}},
                 nullptr,
                 false,
                 "Netlisting aborted"},
        ExitCase{"GenerateNoFileUnchanged",
                 Way::Generate,
                 false,
                 false,
                 true,
                 {},
                 nullptr,
                 true,
                 NO_FILE},
        ExitCase{"GenerateNoFileCloseYes",
                 Way::Generate,
                 true,
                 false,
                 true,
                 {{CLOSE_QUESTION, wxID_YES}},
                 "no",
                 true},
        ExitCase{"GenerateNoFileCloseNo",
                 Way::Generate,
                 true,
                 false,
                 true,
                 {{CLOSE_QUESTION, wxID_NO}},
                 nullptr,
                 true,
                 NO_FILE},
        ExitCase{"GenerateNoFileCloseCancel",
                 Way::Generate,
                 true,
                 false,
                 true,
                 {{CLOSE_QUESTION, wxID_CANCEL}},
                 nullptr,
                 false,
                 NO_FILE},
        ExitCase{"CloseUnchanged", Way::Close, false, true, false, {}, nullptr, true},
        ExitCase{"CloseChangedYes",
                 Way::Close,
                 true,
                 false,
                 false,
                 {{CLOSE_QUESTION, wxID_YES}},
                 "no",
                 true,
                 "Configuration saved"},
        ExitCase{"CloseChangedYesFlagSet",
                 Way::Close,
                 true,
                 true,
                 false,
                 {{CLOSE_QUESTION, wxID_YES}},
                 "yes",
                 true},
        ExitCase{"CloseChangedNo",
                 Way::Close,
                 true,
                 false,
                 false,
                 {{CLOSE_QUESTION, wxID_NO}},
                 nullptr,
                 true},
        ExitCase{"CloseChangedCancel",
                 Way::Close,
                 true,
                 false,
                 false,
                 {{CLOSE_QUESTION, wxID_CANCEL}},
                 nullptr,
                 false}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(FileFrameTest, GenerateWithoutAFileTouchesNothingAndStaysOpen)
{
    Change();
    DialogScript().Run([&] { Tool(ID_TOOL_GENERATE); });
    EXPECT_EQ(StatusText(), NO_FILE);
    EXPECT_FALSE(Closed());
    EXPECT_TRUE(std::filesystem::is_empty(m_dir));
}

TEST_F(FileFrameTest, GenerateCanBePressedAgainAfterCancel)
{
    const auto file = Path("netlist.ini");
    Put(file, HAND_WRITTEN);
    Load(file);
    Change();
    DialogScript().Question(GENERATE_QUESTION, wxID_CANCEL).Run([&] { Tool(ID_TOOL_GENERATE); });
    DialogScript().Question(GENERATE_QUESTION, wxID_YES).Run([&] { Tool(ID_TOOL_GENERATE); });
    EXPECT_EQ(InFile(file, "generate"), "yes");
    EXPECT_TRUE(Closed());
}

struct FailedSaveCase
{
    const char* name;
    Way way;
    bool changed;
    std::vector<Question> questions;
};

class FailedSaveOnTheWayOut : public FileFrameTest,
                              public testing::WithParamInterface<FailedSaveCase>
{
};

// The netlister must never go on with a file that was not written, nor the user lose changes.
TEST_P(FailedSaveOnTheWayOut, KeepsWindowFileAndChanges)
{
    const auto file = Path("netlist.ini");
    Put(file, HAND_WRITTEN);
    Load(file);
    if (GetParam().changed)
        Change();
    DialogScript script;
    for (const Question& q : GetParam().questions)
        script.Question(q.text, q.answer);
    {
        WritesFail full;
        script.Run(
            [&]
            {
                if (GetParam().way == Way::Generate)
                    Tool(ID_TOOL_GENERATE);
                else
                    m_frame->Close();
            });
    }
    EXPECT_FALSE(Closed());
    EXPECT_EQ(Slurp(file), HAND_WRITTEN);
    EXPECT_EQ(StatusText(),
              "Configuration " + file.string() + " could not be saved: " + wxSysErrorMsgStr(EFBIG));
    EXPECT_EQ(m_frame->Config().saved, !GetParam().changed);
    EXPECT_FALSE(m_frame->Config().generate); // a later save must not hand over by surprise
    EXPECT_EQ(m_frame->Config().flat_busses, GetParam().changed);
}

INSTANTIATE_TEST_SUITE_P(
    Ways, FailedSaveOnTheWayOut,
    testing::Values(FailedSaveCase{"GenerateUnchanged", Way::Generate, false, {}},
                    FailedSaveCase{
                        "GenerateYes", Way::Generate, true, {{GENERATE_QUESTION, wxID_YES}}},
                    FailedSaveCase{"CloseYes", Way::Close, true, {{CLOSE_QUESTION, wxID_YES}}}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(FileFrameTest, CloseKeepsTheWindowWhenTheSaveDialogIsCancelled)
{
    Change();
    DialogScript()
        .Question(CLOSE_QUESTION, wxID_YES)
        .SaveFile("", wxID_CANCEL)
        .Run([&] { m_frame->Close(); });
    EXPECT_FALSE(Closed());
    EXPECT_EQ(StatusText(), "Save not completed");
    EXPECT_TRUE(m_frame->Config().flat_busses);
}

// A file that exists but cannot be read: an I/O error that root gets as well.
TEST_F(FileFrameTest, GenerateNoWithAnUnreadableFileSavesNothingAndStaysOpen)
{
    if (access("/proc/self/mem", R_OK) != 0)
        GTEST_SKIP() << "no /proc";
    Change();
    m_frame->Config().file_path = "/proc/self/mem";
    DialogScript().Question(GENERATE_QUESTION, wxID_NO).Run([&] { Tool(ID_TOOL_GENERATE); });
    EXPECT_FALSE(Closed());
    EXPECT_EQ(StatusText(),
              "Configuration /proc/self/mem could not be read: " + wxSysErrorMsgStr(EIO));
    EXPECT_TRUE(m_frame->Config().flat_busses);
    EXPECT_FALSE(m_frame->Config().generate);
}

TEST_F(FileFrameTest, QuitAsksLikeTheCloseButton)
{
    Change();
    wxCommandEvent quit(wxEVT_MENU, ID_QUIT);
    DialogScript()
        .Question(CLOSE_QUESTION, wxID_CANCEL)
        .Run([&] { m_frame->HandleWindowEvent(quit); });
    EXPECT_FALSE(Closed());
    DialogScript().Question(CLOSE_QUESTION, wxID_NO).Run([&] { m_frame->HandleWindowEvent(quit); });
    EXPECT_TRUE(Closed());
}

} // namespace
