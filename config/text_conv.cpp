#include "config/text_conv.h"

wxString ToWx(const std::string& bytes)
{
    const wxString utf8 = wxString::FromUTF8(bytes.data(), bytes.size());
    if (!utf8.empty() || bytes.empty())
        return utf8;
    return wxString(bytes.data(), wxConvISO8859_1, bytes.size());
}

std::string FromWx(const wxString& text) { return text.utf8_string(); }

wxString BytesToIni(const std::string& bytes)
{
    return wxString(bytes.data(), wxConvISO8859_1, bytes.size());
}

std::string IniToBytes(const wxString& text)
{
    std::string bytes;
    bytes.reserve(text.length());
    const wxStringCharType* chars = text.wx_str();
    for (size_t i = 0; i < text.length(); ++i)
    {
        if (static_cast<wxUint32>(chars[i]) < 0x100)
            bytes.push_back(static_cast<char>(chars[i]));
        else // only text from outside the file, an expanded variable, gets here
            bytes += wxString(chars[i]).utf8_string();
    }
    return bytes;
}
