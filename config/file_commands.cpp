// New, Open, load by path, Save and Save As: the record's way to and from the file.
#include "app/config_frame.h"

#include "config/atomic_file.h"
#include "config/ini_file.h"
#include "config/text_conv.h"

#include <wx/filedlg.h>
#include <wx/filename.h>
#include <wx/log.h>
#include <wx/msgdlg.h>

namespace
{

const char* const INI_WILDCARD = "INI files (*.ini)|*.ini";

// GTK's dialog reports a full path only for a file picked in its own chooser; a path given to
// it beforehand (SetPath) comes back as folder and name alone.
wxString ChosenPath(const wxFileDialog& dialog)
{
    const wxString path = dialog.GetPath();
    if (!path.empty() || dialog.GetFilename().empty())
        return path;
    return wxFileName(dialog.GetDirectory(), dialog.GetFilename()).GetFullPath();
}

} // namespace

bool ConfigFrame::LoadConfig(const wxString& path)
{
    const wxFileName name(path);
    if (!name.Exists())
    {
        SetStatusText(wxString::Format("Configuration %s not founded", path));
        return false;
    }
    // Read first: a file that cannot be read leaves the record, its path and the tree as they
    // were, instead of turning every option into its missing-key value.
    std::string bytes;
    wxString reason;
    if (!ReadFileBytes(path, bytes, reason))
    {
        SetStatusText(wxString::Format("Configuration %s could not be read: %s", path, reason));
        return false;
    }
    m_config->file_path = FromWx(name.GetFullPath());
    m_config->config_name = FromWx(name.GetFullName());
    {
        wxLogNull quiet;
        ReadIniBytes(bytes, *m_config);
    }
    ResetLibraryEditor();
    RefreshCurrentPage();
    BuildOptionTree();
    SetStatusText(wxString::Format("Configuration %s loaded", path));
    return true;
}

bool ConfigFrame::SaveConfig()
{
    const std::string previousPath = m_config->file_path;
    if (m_config->file_path.empty())
    {
        wxFileDialog dialog(this, "Save a Configuration File", "", "", INI_WILDCARD, wxFD_SAVE);
        const wxString chosen = dialog.ShowModal() == wxID_OK ? ChosenPath(dialog) : wxString();
        if (chosen.empty())
        {
            SetStatusText("Save not completed");
            return false;
        }
        m_config->file_path = FromWx(chosen);
    }

    const wxString path = ToWx(m_config->file_path);
    wxString reason;
    bool written = false;
    {
        wxLogNull quiet;
        written = WriteFileAtomically(path, FormatIni(*m_config), reason);
    }
    if (!written)
    {
        // A name that could not be written is not kept: the next Save asks again.
        m_config->file_path = previousPath;
        SetStatusText(wxString::Format("Configuration %s could not be saved: %s", path, reason));
        return false;
    }
    m_config->saved = true;
    SetStatusText("Configuration saved");
    return true;
}

bool ConfigFrame::SaveConfigAs()
{
    wxFileDialog dialog(this, "Save a Configuration File", "", "", INI_WILDCARD, wxFD_SAVE);
    const wxString chosen = dialog.ShowModal() == wxID_OK ? ChosenPath(dialog) : wxString();
    if (chosen.empty())
        return false;
    const std::string previousPath = m_config->file_path;
    m_config->file_path = FromWx(chosen);
    if (SaveConfig())
        return true;
    m_config->file_path = previousPath;
    return false;
}

// Before the record is replaced: unsaved changes are dropped only on No, or once a save has
// kept them.
bool ConfigFrame::MaySetConfigAside()
{
    if (m_config->saved)
        return true;
    wxMessageDialog question(
        this, "Do you want save your configuration before load the new configuration?", "Save",
        wxYES_NO | wxCANCEL);
    const int answer = question.ShowModal();
    return answer == wxID_NO || (answer == wxID_YES && SaveConfig());
}

void ConfigFrame::OnNewConfig(wxCommandEvent&)
{
    if (!MaySetConfigAside())
        return;
    m_config = std::make_unique<ConfigRecord>();
    ResetLibraryEditor();
    RefreshCurrentPage();
    BuildOptionTree();
}

void ConfigFrame::OnOpenConfig(wxCommandEvent&)
{
    if (!MaySetConfigAside())
    {
        SetStatusText("Load configuration cancelled");
        return;
    }
    wxFileDialog dialog(this, "Open a Configuration File", "", "", INI_WILDCARD, wxFD_OPEN);
    const wxString chosen = dialog.ShowModal() == wxID_OK ? ChosenPath(dialog) : wxString();
    if (chosen.empty())
    {
        SetStatusText("Load configuration cancelled");
        return;
    }
    // Loading by path fills the record, the page and the tree alike; Open names the file only.
    if (LoadConfig(chosen))
        SetStatusText(wxString::Format("Configuration %s loaded", ToWx(m_config->config_name)));
}

void ConfigFrame::OnSaveConfig(wxCommandEvent&) { SaveConfig(); }

void ConfigFrame::OnSaveConfigAs(wxCommandEvent&) { SaveConfigAs(); }
