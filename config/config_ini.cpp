// The mapping between the record and the INI file the netlister reads.
#include "config/config_record.h"

#include "config/text_conv.h"

#include <wx/confbase.h>
#include <wx/utils.h>

#include <algorithm>
#include <cctype>
#include <cstring>
#include <numeric>
#include <variant>

namespace
{

using FieldRef =
    std::variant<bool ConfigRecord::*, char ConfigRecord::*, std::string ConfigRecord::*,
                 std::optional<std::string> ConfigRecord::*>;

struct Key
{
    const char* name;
    FieldRef field;
    const char* missing;           // stored when the file lacks the key; nullptr: never read
    const char* letters = nullptr; // code letters: the allowed ones, the fallback first
};

struct Group
{
    const char* path;
    std::vector<Key> keys; // in the order they are written
};

// The load circuit setting is written under this name; see ReadLoadCircuit.
constexpr const char* LOAD_CIRCUIT_KEY = "show_in_orvik";

const std::vector<Group>& Groups()
{
    using R = ConfigRecord;
    static const std::vector<Group> groups = {
        {"/Defaults",
         {{"spice", &R::spice, "no"},
          {"verilog", &R::verilog, "no"},
          {"vhdl", &R::vhdl, "no"},
          {"default_orviktype", &R::default_orviktype, "D", "DAV"},
          {"flat", &R::flat, "no"},
          {"flat_busses", &R::flat_busses, "no"},
          {"open_config_dialog", &R::open_config_dialog, "no"},
          {"backup_extension", &R::backup_extension, ".bak"},
          {LOAD_CIRCUIT_KEY, &R::load_circuit, nullptr},
          {"create_backup_file", &R::create_backup_file, "no"},
          {"add_global", &R::add_global, "no"},
          {"add_dc_sources", &R::add_dc_sources, "no"},
          {"generate", &R::generate, nullptr},
          {"show_nsx", &R::show_nsx, "no"},
          {"show_pat", &R::show_pat, "no"},
          {"run_orvik", &R::run_orvik, "no"}}},
        {"/Spice",
         {{"add_unit", &R::add_unit, "no"},
          {"add_mos_multi_prefix", &R::add_mos_multi_prefix, "no"},
          {"add_always_prefix", &R::add_always_prefix, "no"},
          {"use_spice_primitive", &R::use_spice_primitive, "no"}}},
        {"/Verilog",
         {{"use_named_port", &R::use_named_port, "yes"},
          {"case", &R::case_, "U", "UAL"},
          {"global_net_as_supply", &R::global_net_as_supply, "no"},
          {"supply1", &R::supply1, ""},
          {"supply0", &R::supply0, ""},
          {"use_define_timescale", &R::use_define_timescale, "no"},
          {"timescale_unit", &R::timescale_unit, "1ns"},
          {"timescale_precision", &R::timescale_precision, "1ps"},
          {"use_define_capacitor", &R::use_define_capacitor, "no"},
          {"capacitor_scale", &R::capacitor_scale, ""},
          {"capacitor_delay_coefficient", &R::capacitor_delay_coefficient, ""}}},
        {"/VHDL",
         {{"net_type", &R::net_type, ""},
          {"bus_type", &R::bus_type, ""},
          {"archi_name", &R::archi_name, ""},
          {"config_prefix", &R::config_prefix, ""},
          {"use_lib_section", &R::use_lib_section, ""}}},
    };
    return groups;
}

constexpr const char* LIBRARY_PATH_GROUP = "Library_path";
constexpr const char* RESERVED_GROUPS[] = {"Defaults", "Spice", "Verilog", "VHDL",
                                           LIBRARY_PATH_GROUP};

bool IsReserved(const wxString& group)
{
    return std::any_of(std::begin(RESERVED_GROUPS), std::end(RESERVED_GROUPS),
                       [&](const char* name) { return group.IsSameAs(name, false); });
}

bool IsYes(const wxString& value) { return value.IsSameAs("yes", false); }

char CodeLetter(const wxString& value, const char* letters)
{
    if (!value.empty())
    {
        const wxUniChar first = value[0];
        for (const char* letter = letters; *letter; ++letter)
            if (first == *letter)
                return *letter;
    }
    return letters[0];
}

void ReadKey(wxConfigBase& ini, const Key& key, ConfigRecord& record)
{
    if (!key.missing)
        return;
    wxString value;
    if (!ini.Read(key.name, &value))
        value = key.missing;
    std::visit(
        [&](auto member)
        {
            using Field = std::remove_reference_t<decltype(record.*member)>;
            if constexpr (std::is_same_v<Field, bool>)
                record.*member = IsYes(value);
            else if constexpr (std::is_same_v<Field, char>)
                record.*member = CodeLetter(value, key.letters);
            else
                record.*member = IniToBytes(value);
        },
        key.field);
}

void WriteKey(wxConfigBase& ini, const Key& key, const ConfigRecord& record)
{
    std::visit(
        [&](auto member)
        {
            using Field = std::remove_cv_t<std::remove_reference_t<decltype(record.*member)>>;
            const Field& value = record.*member;
            if constexpr (std::is_same_v<Field, bool>)
                ini.Write(key.name, value ? "yes" : "no");
            else if constexpr (std::is_same_v<Field, char>)
                ini.Write(key.name, BytesToIni(std::string(1, value)));
            else if constexpr (std::is_same_v<Field, std::string>)
                ini.Write(key.name, BytesToIni(value));
            else if constexpr (std::is_same_v<Field, std::optional<std::string>>)
            {
                if (value)
                    ini.Write(key.name, BytesToIni(*value));
            }
        },
        key.field);
}

// The tool writes the setting as show_in_orvik; files of other origins may carry load_circuit.
bool ReadLoadCircuit(wxConfigBase& ini)
{
    wxString value;
    if (ini.Read(LOAD_CIRCUIT_KEY, &value) || ini.Read("load_circuit", &value))
        return IsYes(value);
    return false;
}

// The number of a key made of the prefix (in any case, as the INI class matches keys) and
// decimal digits, without its leading zeros; false for any other key.
bool KeyNumber(const wxString& key, const char* prefix, std::string& number)
{
    const size_t length = std::strlen(prefix);
    if (key.length() <= length)
        return false;
    number.clear();
    for (size_t i = 0; i < key.length(); ++i)
    {
        const wxUniChar c = key[i];
        if (i < length)
        {
            if (!c.IsAscii() || std::tolower(static_cast<char>(c)) != prefix[i])
                return false;
        }
        else if (c < '0' || c > '9')
            return false;
        else if (c != '0' || !number.empty())
            number.push_back(static_cast<char>(c));
    }
    return true;
}

// Every value of the current group, in the order the entries were written. The INI class
// enumerates keys in name order, which puts "path10" before "path2"; the order is the user's, so
// numbered keys come first, by number (of any length), and any others follow in the class's order.
std::vector<std::string> ReadValues(wxConfigBase& ini, const char* prefix)
{
    struct Entry
    {
        bool numbered;
        std::string number;
        std::string value;
    };
    std::vector<Entry> entries;
    entries.reserve(ini.GetNumberOfEntries());
    // Expanding copies every value, and only a value with a '$', '%' or backslash can change:
    // the others are read as they stand.
    const bool expand = ini.IsExpandingEnvVars();
    ini.SetExpandEnvVars(false);
    wxString key, value;
    long cookie = 0;
    for (bool more = ini.GetFirstEntry(key, cookie); more; more = ini.GetNextEntry(key, cookie))
    {
        Entry entry;
        entry.numbered = KeyNumber(key, prefix, entry.number);
        ini.Read(key, &value);
        if (expand && std::any_of(value.wx_str(), value.wx_str() + value.length(),
                                  [](wchar_t c) { return c == '$' || c == '%' || c == '\\'; }))
            value = wxExpandEnvVars(value);
        entry.value = IniToBytes(value);
        entries.push_back(std::move(entry));
    }
    ini.SetExpandEnvVars(expand);
    // Sorting positions, not entries, moves no text.
    std::vector<size_t> order(entries.size());
    std::iota(order.begin(), order.end(), size_t(0));
    std::stable_sort(order.begin(), order.end(),
                     [&](size_t left, size_t right)
                     {
                         const Entry& a = entries[left];
                         const Entry& b = entries[right];
                         if (a.numbered != b.numbered || !a.numbered)
                             return a.numbered && !b.numbered;
                         if (a.number.length() != b.number.length())
                             return a.number.length() < b.number.length();
                         return a.number < b.number;
                     });

    std::vector<std::string> values;
    values.reserve(entries.size());
    for (const size_t index : order)
        values.push_back(std::move(entries[index].value));
    return values;
}

// A numbered key; wxString::Format would cost more than the write itself.
wxString NumberedKey(const char* prefix, size_t number)
{
    return wxString::FromAscii((prefix + std::to_string(number)).c_str());
}

} // namespace

void ConfigRecord::WriteIni(wxConfigBase& ini) const
{
    if (!library_paths.empty())
    {
        ini.SetPath(wxString("/") + LIBRARY_PATH_GROUP);
        for (size_t i = 0; i < library_paths.size(); ++i)
            ini.Write(NumberedKey("path", i), BytesToIni(library_paths[i]));
    }

    for (const Group& group : Groups())
    {
        ini.SetPath(group.path);
        if (group.path == Groups().front().path)
            ini.Write("release", wxString::Format("%d.%d.%d%s", RELEASE_MAJOR, RELEASE_MINOR,
                                                  RELEASE_MICRO, ""));
        for (const Key& key : group.keys)
            WriteKey(ini, key, *this);
    }

    const std::string* current = nullptr;
    size_t lineNumber = 0;
    for (const LibraryLine& entry : library_definitions)
    {
        if (!current || entry.name != *current)
        {
            ini.SetPath("/" + BytesToIni(entry.name));
            current = &entry.name;
            // Group names match without case, so "IEEE" and "ieee" share a group: go on after
            // the lines already there instead of overwriting them.
            lineNumber = 0;
            while (ini.HasEntry(NumberedKey("line", lineNumber)))
                ++lineNumber;
        }
        ini.Write(NumberedKey("line", lineNumber++), BytesToIni(entry.line));
    }
    ini.SetPath("/");
}

void ConfigRecord::ReadIni(wxConfigBase& ini)
{
    ini.SetPath(wxString("/") + LIBRARY_PATH_GROUP);
    library_paths = ReadValues(ini, "path");

    for (const Group& group : Groups())
    {
        ini.SetPath(group.path);
        for (const Key& key : group.keys)
            ReadKey(ini, key, *this);
        if (group.path == Groups().front().path)
            load_circuit = ReadLoadCircuit(ini);
    }

    ini.SetPath("/");
    std::vector<wxString> libraries;
    wxString group;
    long cookie = 0;
    for (bool more = ini.GetFirstGroup(group, cookie); more; more = ini.GetNextGroup(group, cookie))
        if (!IsReserved(group))
            libraries.push_back(group);

    library_definitions.clear();
    for (const wxString& library : libraries)
    {
        ini.SetPath("/" + library);
        const std::string name = IniToBytes(library);
        for (std::string& line : ReadValues(ini, "line"))
            AddLibraryLine(name, std::move(line));
    }
    ini.SetPath("/");
}
