// The two ways the window ends. The netlister learns the outcome from the file alone (the exit
// status is always 0), so a way out never leaves a file that was not written in full.
#include "app/config_frame.h"

#include "config/text_conv.h"

#include <wx/filefn.h>
#include <wx/msgdlg.h>

void ConfigFrame::OnQuit(wxCommandEvent&) { Close(true); }

void ConfigFrame::OnCloseWindow(wxCloseEvent&)
{
    bool destroy = true;
    if (!m_config->saved)
    {
        wxMessageDialog question(this, "Do you want save your configuration before close?", "Save",
                                 wxYES_NO | wxCANCEL);
        switch (question.ShowModal())
        {
        case wxID_YES:
            // A save that did not complete keeps the window, and with it the changes.
            destroy = SaveConfig();
            break;
        case wxID_CANCEL:
            destroy = false;
            break;
        default:
            break;
        }
    }
    if (destroy)
        Destroy();
}

void ConfigFrame::OnGenerate(wxCommandEvent&)
{
    // The flag stays set only in a record whose file was written with it.
    const auto saveGenerating = [this]
    {
        const bool before = m_config->generate;
        m_config->generate = true;
        if (SaveConfig())
            return true;
        m_config->generate = before;
        return false;
    };

    bool cancelled = false;
    if (m_config->file_path.empty() || !wxFileExists(ToWx(m_config->file_path)))
    {
        SetStatusText("The Configuration file does not exit");
    }
    else if (m_config->saved)
    {
        if (!m_config->generate && !saveGenerating())
            return;
    }
    else
    {
        wxMessageDialog question(this, "Do you want save your new configuration before netlisting?",
                                 "Save", wxYES_NO | wxCANCEL);
        switch (question.ShowModal())
        {
        case wxID_YES:
            if (!saveGenerating())
                return;
            break;
        case wxID_NO:
            // Reading the file back drops the changes; no load reads `generate`. A file that
            // cannot be read is not replaced by a record that never came from it.
            if (!LoadConfig(ToWx(m_config->file_path)))
                return;
            if (m_config->generate)
                m_config->saved = true; // the record now holds what the file holds
            else if (!saveGenerating())
                return;
            break;
        case wxID_CANCEL:
            cancelled = true;
            SetStatusText("Netlisting aborted");
            break;
        default:
            break;
        }
    }
    if (!cancelled && !m_config->file_path.empty())
        Close(true);
}
