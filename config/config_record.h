#pragma once

#include <optional>
#include <string>
#include <vector>

class wxConfigBase;

// Ordered library directories and files, in the user's order.
using LibraryPathList = std::vector<std::string>;

// One line of a named VHDL library definition. A definition is the run of consecutive
// entries sharing one name; the list stays in byte order of the names.
struct LibraryLine
{
    std::string name;
    std::string line;

    bool operator==(const LibraryLine& other) const
    {
        return name == other.name && line == other.line;
    }
};
using LibraryDefinitionList = std::vector<LibraryLine>;

// The release written as the file's version stamp and shown in the welcome text.
constexpr int RELEASE_MAJOR = 5;
constexpr int RELEASE_MINOR = 5;
constexpr int RELEASE_MICRO = 0;

// One netlister configuration. Texts are the file's bytes, whatever their encoding;
// an absent optional text is not written, a present empty one is.
struct ConfigRecord
{
    ConfigRecord();

    std::string file_path;
    std::string config_name = "Configuration";
    bool saved = true;
    bool open_config_dialog = false;
    bool create_backup_file = false;
    std::string backup_extension = ".bak";
    bool show_nsx = false;
    bool show_pat = false;
    bool run_orvik = true;
    bool load_circuit = true;
    bool generate = false;
    bool spice = true;
    bool verilog = false;
    bool vhdl = false;
    char default_orviktype = 'A'; // 'A' Spice, 'D' Verilog, 'V' VHDL
    bool flat = false;
    bool flat_busses = false;
    bool add_global = false;
    bool add_dc_sources = false;
    LibraryPathList library_paths;
    bool add_always_prefix = false;
    bool add_unit = false;
    bool add_mos_multi_prefix = false;
    bool use_spice_primitive = false;
    bool use_named_port = false;
    char case_ = 'A'; // 'U' upper, 'L' lower, 'A' unchanged; the INI key is "case"
    bool global_net_as_supply = false;
    std::optional<std::string> supply1;
    std::optional<std::string> supply0;
    bool use_define_timescale = false;
    std::optional<std::string> timescale_unit;
    std::optional<std::string> timescale_precision;
    bool use_define_capacitor = false;
    std::optional<std::string> capacitor_scale;
    std::optional<std::string> capacitor_delay_coefficient;
    std::optional<std::string> net_type;
    std::optional<std::string> bus_type;
    std::optional<std::string> archi_name;
    std::optional<std::string> config_prefix;
    std::optional<std::string> use_lib_section;
    LibraryDefinitionList library_definitions;

    // Appends unless an entry with the same bytes exists.
    void AddLibraryPath(const std::string& path);
    // Removes the first entry with the same bytes, if any.
    void RemoveLibraryPath(const std::string& path);
    // Inserts after every entry whose name sorts before or equal to `name`.
    void AddLibraryLine(const std::string& name, std::string line);
    void RemoveLibrary(const std::string& name);

    void ReadIni(wxConfigBase& ini);
    void WriteIni(wxConfigBase& ini) const;
};
