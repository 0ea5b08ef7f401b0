#pragma once

// Tests of the ways the record reaches a file: a window with a scratch folder, the program's
// questions answered in order through wx's modal test hook, and the file read back.
#include "tests/gui/gui_test.h"

#include "config/ini_file.h"

#include <wx/app.h>
#include <wx/fileconf.h>
#include <wx/toolbar.h>

#include <csignal>
#include <filesystem>
#include <fstream>
#include <functional>
#include <memory>
#include <sys/resource.h>
#include <vector>

inline const char* const OPEN_QUESTION =
    "Do you want save your configuration before load the new configuration?";
inline const char* const CLOSE_QUESTION = "Do you want save your configuration before close?";
inline const char* const GENERATE_QUESTION =
    "Do you want save your new configuration before netlisting?";

// A question of the program: its text, caption "Save", Yes, No and Cancel, no icon asked for.
class QuestionExpected : public wxExpectModalBase<wxMessageDialog, QuestionExpected>
{
  public:
    QuestionExpected(const wxString& text, int answer) : m_text(text), m_answer(answer) {}

  protected:
    int OnInvoked(wxMessageDialog* dialog) const override
    {
        EXPECT_EQ(dialog->GetMessage(), m_text);
        EXPECT_EQ(dialog->GetCaption(), "Save");
        EXPECT_EQ(dialog->GetMessageDialogStyle(), wxYES_NO | wxCANCEL);
        EXPECT_NE(dynamic_cast<ConfigFrame*>(dialog->GetParent()), nullptr);
        return m_answer;
    }
    wxString GetDefaultDescription() const override { return "question \"" + m_text + "\""; }

  private:
    wxString m_text;
    int m_answer;
};

// The program's file chooser: title, the INI wildcard and exactly the style asked for.
class FileExpected : public wxExpectModalBase<wxFileDialog, FileExpected>
{
  public:
    FileExpected(long style, const wxString& path, int answer)
        : m_style(style), m_path(path), m_answer(answer)
    {
    }

  protected:
    int OnInvoked(wxFileDialog* dialog) const override
    {
        EXPECT_EQ(dialog->GetMessage(),
                  m_style == wxFD_OPEN ? "Open a Configuration File" : "Save a Configuration File");
        EXPECT_EQ(dialog->GetWildcard(), "INI files (*.ini)|*.ini");
        EXPECT_EQ(dialog->GetWindowStyle(), m_style);
        EXPECT_NE(dynamic_cast<ConfigFrame*>(dialog->GetParent()), nullptr);
        dialog->SetPath(m_path);
        return m_answer;
    }
    wxString GetDefaultDescription() const override
    {
        return m_style == wxFD_OPEN ? "open file dialog" : "save file dialog";
    }

  private:
    long m_style;
    wxString m_path;
    int m_answer;
};

// Reports an unexpected dialog like the shared hook and then cancels it: left to the toolkit it
// would wait for a user who never comes.
class ScriptHook : public FailingModalHook
{
  public:
    using FailingModalHook::FailingModalHook;

  protected:
    int Enter(wxDialog* dialog) override
    {
        const int answer = FailingModalHook::Enter(dialog);
        return answer == wxID_NONE ? wxID_CANCEL : answer;
    }
};

// The dialogs one action must show, in order, with their answers; any other dialog, or one
// missing, fails the test.
class DialogScript
{
  public:
    DialogScript& Question(const wxString& text, int answer)
    {
        m_expected.push_back(std::make_shared<QuestionExpected>(text, answer));
        return *this;
    }
    DialogScript& OpenFile(const std::filesystem::path& path, int answer = wxID_OK)
    {
        m_expected.push_back(std::make_shared<FileExpected>(wxFD_OPEN, path.string(), answer));
        return *this;
    }
    DialogScript& SaveFile(const std::filesystem::path& path, int answer = wxID_OK)
    {
        m_expected.push_back(std::make_shared<FileExpected>(wxFD_SAVE, path.string(), answer));
        return *this;
    }
    void Run(const std::function<void()>& action) const
    {
        ScriptHook hook(__FILE__, __LINE__, __func__);
        for (const auto& expected : m_expected)
            hook.AddExpectation(*expected);
        action();
        hook.CheckUnmetExpectations();
    }

  private:
    std::vector<std::shared_ptr<wxModalExpectation>> m_expected;
};

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
class WritesFail
{
  public:
    WritesFail()
    {
        getrlimit(RLIMIT_FSIZE, &m_saved);
        m_handler = signal(SIGXFSZ, SIG_IGN);
        struct rlimit small = m_saved;
        small.rlim_cur = 16;
        setrlimit(RLIMIT_FSIZE, &small);
    }
    ~WritesFail()
    {
        setrlimit(RLIMIT_FSIZE, &m_saved);
        signal(SIGXFSZ, m_handler);
    }

  private:
    struct rlimit m_saved;
    void (*m_handler)(int);
};

class FileFrameTest : public FrameTest
{
  protected:
    void SetUp() override
    {
        FrameTest::SetUp();
        char pattern[] = "/tmp/zidovade_gui.XXXXXX";
        ASSERT_NE(mkdtemp(pattern), nullptr);
        m_dir = pattern;
    }
    void TearDown() override
    {
        std::error_code ignored;
        std::filesystem::remove_all(m_dir, ignored);
        if (Closed())
            wxTheApp->ProcessIdle(); // deletes the destroyed window
        else
            FrameTest::TearDown();
    }

    // The window asked to be destroyed: it goes at the next idle time.
    bool Closed() const { return wxPendingDelete.Member(m_frame); }

    std::filesystem::path Path(const char* name) const { return m_dir / name; }
    // A value as the netlister finds it in the file; "-" when the key is not there.
    static std::string InFile(const std::filesystem::path& path, const char* key)
    {
        const auto ini = ParseIni(Slurp(path));
        return ini->Read(wxString("/Defaults/") + key, "-").ToStdString();
    }

    // The file as start-up loads it.
    void Load(const std::filesystem::path& path)
    {
        ASSERT_TRUE(m_frame->LoadConfig(path.string()));
        m_frame->GetToolBar()->EnableTool(ID_TOOL_GENERATE, true);
    }
    // An option changed on a page: the record holds it and is no longer saved.
    void Change()
    {
        m_frame->Config().flat_busses = true;
        m_frame->Config().saved = false;
    }
    // A tool pressed as the toolkit reports a click.
    void Tool(int id) { m_frame->GetToolBar()->OnLeftClick(id, false); }

    std::filesystem::path m_dir;
};

// A configuration as another program may have left it: comments, a key and a group the tool does
// not know, no final line end. Any rewrite changes its bytes.
inline const std::string HAND_WRITTEN = "; kept by hand\r\n[Defaults]\r\nspice=yes\r\n"
                                        "flat_busses=no\r\nunknown_key=1\r\ngenerate=no\r\n"
                                        "[Verilog]\r\ncase=L\r\n[Generic]\r\nline0=LIBRARY ieee;";
