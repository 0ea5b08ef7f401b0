#include "config/ini_file.h"

#include "config/config_record.h"

#include <wx/fileconf.h>
#include <wx/log.h>
#include <wx/mstream.h>
#include <wx/strconv.h>

namespace
{

bool StartsWith(const std::string& bytes, const char* prefix, size_t length)
{
    return bytes.compare(0, length, prefix, length) == 0;
}

// UTF-16 files become UTF-8 bytes; a UTF-8 byte-order mark is dropped. Everything else is kept
// byte for byte, so Latin-1 and UTF-8 files alike are written back as they were.
std::string WithoutByteOrderMark(std::string bytes)
{
    if (StartsWith(bytes, "\xEF\xBB\xBF", 3))
        return bytes.substr(3);

    const bool little = StartsWith(bytes, "\xFF\xFE", 2);
    if (little || StartsWith(bytes, "\xFE\xFF", 2))
    {
        bytes.erase(0, 2);
        bytes.resize(bytes.size() & ~size_t(1));
        const wxMBConvUTF16LE le;
        const wxMBConvUTF16BE be;
        const wxMBConv& conv = little ? static_cast<const wxMBConv&>(le) : be;
        const wxString text(bytes.data(), conv, bytes.size());
        return text.utf8_string();
    }
    return bytes;
}

// The INI class asserts on some malformed files (a key with no name, a nested group seen twice)
// and then goes on parsing; in this program an assert would be a dialog the user never asked for.
class AssertsSilenced
{
  public:
    AssertsSilenced() : m_previous(wxSetAssertHandler(nullptr)) {}
    ~AssertsSilenced() { wxSetAssertHandler(m_previous); }
    AssertsSilenced(const AssertsSilenced&) = delete;
    AssertsSilenced& operator=(const AssertsSilenced&) = delete;

  private:
    wxAssertHandler_t m_previous;
};

} // namespace

std::unique_ptr<wxFileConfig> ParseIni(std::string bytes)
{
    bytes = WithoutByteOrderMark(std::move(bytes));
    wxLogNull quiet;
    const AssertsSilenced silenced;
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
