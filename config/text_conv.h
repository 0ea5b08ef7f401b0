#pragma once

#include <wx/string.h>

#include <string>

// The record keeps the file's bytes; the screen shows text. These two are the only bridge:
// bytes that are valid UTF-8 are shown as UTF-8, any other bytes as Latin-1, and text the
// user typed is stored as UTF-8.
wxString ToWx(const std::string& bytes);
std::string FromWx(const wxString& text);

// The INI class sees every file byte as one Latin-1 character, so that bytes the user did not
// touch are written back exactly as they were read, whatever the file's encoding.
wxString BytesToIni(const std::string& bytes);
std::string IniToBytes(const wxString& text);
