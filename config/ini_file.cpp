#include "config/ini_file.h"

#include "config/config_record.h"

#include <wx/fileconf.h>
#include <wx/log.h>
#include <wx/mstream.h>

std::unique_ptr<wxFileConfig> ParseIni(std::string bytes)
{
    wxLogNull quiet;
    wxMemoryInputStream in(bytes.data(), bytes.size());
    return std::make_unique<wxFileConfig>(in, wxConvISO8859_1);
}

std::string FormatIni(const ConfigRecord& record)
{
    wxLogNull quiet;
    wxMemoryInputStream empty("", 0);
    wxFileConfig ini(empty, wxConvISO8859_1);
    record.WriteIni(ini);
    wxMemoryOutputStream out;
    ini.Save(out, wxConvISO8859_1);
    std::string bytes(out.GetLength(), '\0');
    out.CopyTo(bytes.data(), bytes.size());
    return bytes;
}

void ReadIniBytes(const std::string& bytes, ConfigRecord& record)
{
    const auto ini = ParseIni(bytes);
    wxLogNull quiet;
    record.ReadIni(*ini);
}
