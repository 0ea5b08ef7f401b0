#pragma once

// Tests of the ways the record reaches a file: a window with a scratch folder, the program's
// dialogs answered in order through wx's modal test hook, and the file read back.
#include "tests/gui/gui_test.h"

#include "config/ini_file.h"

#include <wx/app.h>
#include <wx/fileconf.h>
#include <wx/filedlg.h>
#include <wx/msgdlg.h>
#include <wx/toolbar.h>

#include <csignal>
#include <filesystem>
#include <fstream>
#include <functional>
#include <sys/resource.h>
#include <vector>

inline const char* const OPEN_QUESTION =
    "Do you want save your configuration before load the new configuration?";
inline const char* const CLOSE_QUESTION = "Do you want save your configuration before close?";
inline const char* const GENERATE_QUESTION =
    "Do you want save your new configuration before netlisting?";

// One dialog as the program must show it, over the main window, and the answer it gets: a
// question (caption "Save", Yes, No and Cancel, no icon asked for) or a file chooser (its title,
// the INI wildcard, exactly the style asked for) that returns the given path.
struct Dialog : wxModalExpectation
{
    Dialog(long style, const wxString& text, int answer, const std::string& path = "")
        : m_style(style), m_text(text), m_answer(answer), m_path(path)
    {
    }
    int Invoke(wxDialog* dialog) const override
    {
        EXPECT_NE(dynamic_cast<ConfigFrame*>(dialog->GetParent()), nullptr);
        if (auto* question = dynamic_cast<wxMessageDialog*>(dialog))
        {
            EXPECT_EQ(question->GetMessage(), m_text);
            EXPECT_EQ(question->GetCaption(), "Save");
            EXPECT_EQ(question->GetMessageDialogStyle(), m_style);
        }
        else if (auto* chooser = dynamic_cast<wxFileDialog*>(dialog))
        {
            EXPECT_EQ(chooser->GetMessage(), m_text);
            EXPECT_EQ(chooser->GetWildcard(), "INI files (*.ini)|*.ini");
            EXPECT_EQ(chooser->GetWindowStyle(), m_style);
            chooser->SetPath(m_path);
        }
        else
            return wxID_NONE;
        return m_answer;
    }
    wxString GetDefaultDescription() const override { return "dialog \"" + m_text + "\""; }

    long m_style;
    wxString m_text;
    int m_answer;
    std::string m_path;
};

inline Dialog Question(const char* text, int answer) { return {wxYES_NO | wxCANCEL, text, answer}; }
// The open or the save chooser; "" cancels it.
inline Dialog Chooser(bool open, const std::string& path)
{
    return {open ? wxFD_OPEN : wxFD_SAVE,
            open ? "Open a Configuration File" : "Save a Configuration File",
            path.empty() ? wxID_CANCEL : wxID_OK, path};
}

// The dialogs one action must show, in order; any other dialog, or one missing, fails the test.
inline void WithDialogs(const std::vector<Dialog>& dialogs, const std::function<void()>& action)
{
    FailingModalHook hook(__FILE__, __LINE__, __func__);
    for (const Dialog& dialog : dialogs)
        hook.AddExpectation(dialog);
    action();
    hook.CheckUnmetExpectations();
}

inline void Put(const std::filesystem::path& path, const std::string& bytes)
{
    std::ofstream(path, std::ios::binary) << bytes;
}

inline std::string Slurp(const std::filesystem::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

// Makes every write past a few bytes fail, as a full disk would; root is bound by it too.
struct WritesFail
{
    void (*handler)(int) = signal(SIGXFSZ, SIG_IGN);
    rlimit saved = {};
    WritesFail()
    {
        getrlimit(RLIMIT_FSIZE, &saved);
        const rlimit small = {16, saved.rlim_max};
        setrlimit(RLIMIT_FSIZE, &small);
    }
    ~WritesFail()
    {
        setrlimit(RLIMIT_FSIZE, &saved);
        signal(SIGXFSZ, handler);
    }
};

// A configuration as another program may have left it: comments, a key and a group the tool does
// not carry, no final line end. Any rewrite changes its bytes.
inline const std::string HAND_WRITTEN = "; kept by hand\r\n[Defaults]\r\nspice=yes\r\n"
                                        "flat_busses=no\r\nunknown_key=1\r\ngenerate=no\r\n"
                                        "[Foreign]\r\nx=1\r\n[Verilog]\r\ncase=L";

class FileFrameTest : public FrameTest
{
  protected:
    void SetUp() override
    {
        FrameTest::SetUp();
        char pattern[] = "/tmp/zidovade_gui.XXXXXX";
        ASSERT_NE(mkdtemp(pattern), nullptr);
        m_dir = pattern;
        Put(Path("plain"), "a file, not a folder"); // a folder no file can be written into
    }
    void TearDown() override
    {
        std::filesystem::remove_all(m_dir);
        if (Closed())
            wxTheApp->ProcessIdle(); // deletes the destroyed window
        else
            FrameTest::TearDown();
    }

    // The window asked to be destroyed: it goes at the next idle time.
    bool Closed() const { return wxPendingDelete.Member(m_frame); }
    std::string Path(const std::string& name) const { return (m_dir / name).string(); }
    // A value as the netlister finds it in the file; "-" when the key is not there.
    static std::string InFile(const std::string& path, const char* key)
    {
        return ParseIni(Slurp(path))->Read(wxString("/Defaults/") + key, "-").ToStdString();
    }

    // The file as start-up loads it, then an option changed on a page: the record holds it and
    // is no longer saved.
    void LoadAndChange(const std::string& path, bool change = true)
    {
        Put(path, HAND_WRITTEN);
        ASSERT_TRUE(m_frame->LoadConfig(path));
        m_frame->GetToolBar()->EnableTool(ID_TOOL_GENERATE, true);
        m_frame->Config().flat_busses = change;
        m_frame->Config().saved = !change;
    }
    // A tool pressed as the toolkit reports a click.
    void Tool(int id) { m_frame->GetToolBar()->OnLeftClick(id, false); }
    // A status text; "%s" stands for the scratch folder.
    wxString Status(const char* text) const { return wxString::Format(text, m_dir.string()); }

    std::filesystem::path m_dir;
};
