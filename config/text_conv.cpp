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
    const wxStringCharType* chars = text.wx_str();
    const size_t length = text.length();
    std::string bytes(length, '\0');
    size_t i = 0;
    for (; i < length && static_cast<wxUint32>(chars[i]) < 0x100; ++i)
        bytes[i] = static_cast<char>(chars[i]);
    if (i == length)
        return bytes;

    // Only text from outside the file, an expanded variable, gets here: its characters become
    // UTF-8, the file's own bytes stay as they were.
    bytes.resize(i);
    for (; i < length; ++i)
    {
        if (static_cast<wxUint32>(chars[i]) < 0x100)
            bytes.push_back(static_cast<char>(chars[i]));
        else
            bytes += wxString(chars[i]).utf8_string();
    }
    return bytes;
}
