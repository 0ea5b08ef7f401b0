#include "config/config_record.h"
#include "config/ini_file.h"

#include <gtest/gtest.h>

#include <wx/fileconf.h>

#include <algorithm>
#include <cstring>
#include <random>

namespace
{

ConfigRecord Read(const std::string& file)
{
    ConfigRecord record;
    ReadIniBytes(file, record);
    return record;
}

ConfigRecord WriteThenRead(const ConfigRecord& record) { return Read(FormatIni(record)); }

// The file's lines joined by blanks, so that a whole file reads as a few lines here.
std::string Flat(std::string file)
{
    std::replace(file.begin(), file.end(), '\n', ' ');
    return file;
}

} // namespace

TEST(IniFormat, DefaultRecordWritesEveryGroupAndKeyInOrder)
{
    EXPECT_EQ(Flat(FormatIni(ConfigRecord())),
              "[Defaults] release=5.5.0 spice=yes verilog=no vhdl=no default_orviktype=A flat=no "
              "flat_busses=no open_config_dialog=no backup_extension=.bak show_in_orvik=yes "
              "create_backup_file=no add_global=no add_dc_sources=no generate=no show_nsx=no "
              "show_pat=no run_orvik=yes [Spice] add_unit=no add_mos_multi_prefix=no "
              "add_always_prefix=no use_spice_primitive=no [Verilog] use_named_port=no case=A "
              "global_net_as_supply=no use_define_timescale=no use_define_capacitor=no "
              "[Generic] line0=LIBRARY ieee; line1=USE ieee.std_logic_1164.ALL; ");
}

TEST(IniFormat, PresentTextsAreWrittenEvenWhenEmptyAndPathsComeFirst)
{
    ConfigRecord record;
    record.library_paths = {"/b", "/a", "/b"};
    record.supply0 = "";
    record.use_lib_section = "Generic";
    const std::string file = Flat(FormatIni(record));
    EXPECT_EQ(file.rfind("[Library_path] path0=/b path1=/a path2=/b [Defaults] ", 0), 0u);
    EXPECT_NE(file.find("global_net_as_supply=no supply0= use_define_timescale=no "), file.npos);
    EXPECT_NE(file.find("[VHDL] use_lib_section=Generic "), file.npos);
}

TEST(IniFormat, MissingKeysTakeTheirMissingValues)
{
    ConfigRecord record;
    record.file_path = "/x.ini";
    record.saved = false;
    record.library_paths = {"/old"};
    ReadIniBytes("[Defaults]\ngenerate=yes\n", record);

    EXPECT_FALSE(record.spice || record.run_orvik || record.load_circuit);
    EXPECT_TRUE(record.use_named_port);
    EXPECT_EQ(std::string({record.default_orviktype, record.case_}), "DU");
    EXPECT_EQ(record.backup_extension, ".bak");
    EXPECT_EQ(record.timescale_unit, "1ns");
    EXPECT_EQ(record.timescale_precision, "1ps");
    for (const auto* text :
         {&record.supply1, &record.supply0, &record.capacitor_scale,
          &record.capacitor_delay_coefficient, &record.net_type, &record.bus_type,
          &record.archi_name, &record.config_prefix, &record.use_lib_section})
        EXPECT_EQ(*text, std::optional<std::string>("")); // present and empty, not absent
    EXPECT_TRUE(record.library_paths.empty());
    EXPECT_TRUE(record.library_definitions.empty()); // the file replaces "Generic"
    // What is the tool's own is never taken from a file.
    EXPECT_FALSE(record.generate);
    EXPECT_EQ(record.file_path, "/x.ini");
    EXPECT_FALSE(record.saved);
}

TEST(IniFormat, ValueFormsReadAsTheFormatSays)
{
    struct Case
    {
        const char* flag;
        const char* orvikType;
        const char* letterCase;
        bool yes;
        const char* codes; // default_orviktype, then case
    };
    // Only "yes" in any case is yes; a code letter is the first character, with case, or the
    // fallback.
    const Case cases[] = {
        {"yes", "A", "A", true, "AA"},       {"YES", "VHDL-AMS", "Lower", true, "VL"},
        {"yEs", "vhdl", "l", true, "DU"},    {"1", "", "x", false, "DU"},
        {"true", "\xE9", "", false, "DU"},   {"y", "D", "U", false, "DU"},
        {"yes please", "", "", false, "DU"}, {"", "", "", false, "DU"}};
    for (const Case& c : cases)
    {
        const ConfigRecord record = Read(std::string("[Spice]\nadd_unit=") + c.flag +
                                         "\n[Defaults]\ndefault_orviktype=" + c.orvikType +
                                         "\n[Verilog]\ncase=" + c.letterCase + "\n");
        EXPECT_EQ(record.add_unit, c.yes) << c.flag;
        EXPECT_EQ(std::string({record.default_orviktype, record.case_}), c.codes)
            << c.orvikType << " " << c.letterCase;
    }
}

TEST(IniFormat, ReservedGroupsInAnyCaseAreNeverLibraries)
{
    const ConfigRecord record =
        Read("[spice]\nline0=a\n[LIBRARY_PATH]\npath0=/p\n[vHdL]\nnet_type=bit\n[defaults]\n"
             "spice=yes\n[verilog]\ncase=L\n");
    EXPECT_TRUE(record.library_definitions.empty());
    EXPECT_EQ(record.library_paths, (LibraryPathList{"/p"}));
    EXPECT_EQ(record.net_type, "bit"); // keys and groups match without case, as the INI class does
    EXPECT_TRUE(record.spice);
    EXPECT_EQ(record.case_, 'L');

    // A library named like a reserved group is written into that group and not read back.
    ConfigRecord named;
    named.AddLibraryLine("spice", "LIBRARY x;");
    EXPECT_EQ(WriteThenRead(named).library_definitions,
              (LibraryDefinitionList{{"Generic", "LIBRARY ieee;"},
                                     {"Generic", "USE ieee.std_logic_1164.ALL;"}}));
}

TEST(IniFormat, ForeignGroupsAreLibrariesWrittenBackAsNumberedLines)
{
    const ConfigRecord record = Read("[Defaults]\nspice=yes\n[My lib]\nuse=USE a.b;\nfirst=LIBRARY "
                                     "a;\n[empty]\n[Zed]\nline0=z\n");
    // Entries under any key names come in the INI class's order; a group without entries is no
    // library.
    EXPECT_EQ(
        record.library_definitions,
        (LibraryDefinitionList{{"My lib", "LIBRARY a;"}, {"My lib", "USE a.b;"}, {"Zed", "z"}}));
    EXPECT_NE(FormatIni(record).find("[My\\ lib]\nline0=LIBRARY a;\nline1=USE a.b;\n"),
              std::string::npos);
}

TEST(IniFormat, LibrariesWhoseNamesDifferOnlyInCaseLoseNoLine)
{
    // The INI class matches group names without case: both libraries share one group.
    ConfigRecord record;
    record.RemoveLibrary("Generic");
    record.AddLibraryLine("IEEE", "A");
    record.AddLibraryLine("IEEE", "B");
    record.AddLibraryLine("ieee", "c");
    EXPECT_EQ(WriteThenRead(record).library_definitions,
              (LibraryDefinitionList{{"IEEE", "A"}, {"IEEE", "B"}, {"IEEE", "c"}}));
}

TEST(IniFormat, LoadCircuitIsReadFromShowInOrvikThenLoadCircuit)
{
    const std::pair<const char*, bool> cases[] = {{"show_in_orvik=yes\n", true},
                                                  {"load_circuit=yes\n", true},
                                                  {"show_in_orvik=no\nload_circuit=yes\n", false},
                                                  {"show_in_orvik=yes\nload_circuit=no\n", true},
                                                  {"", false}};
    for (const auto& [lines, expected] : cases)
        EXPECT_EQ(Read(std::string("[Defaults]\n") + lines).load_circuit, expected) << lines;

    // A file the tool wrote reads back with the value it was written with.
    ConfigRecord record;
    record.load_circuit = false;
    EXPECT_FALSE(WriteThenRead(record).load_circuit);
    record.load_circuit = true;
    EXPECT_TRUE(WriteThenRead(record).load_circuit);
}

TEST(IniFormat, ManyPathsAndLinesKeepTheUsersOrder)
{
    ConfigRecord record;
    for (int i = 0; i < 25; ++i)
    {
        record.library_paths.push_back("/lib/" + std::to_string(24 - i));
        record.AddLibraryLine("Big", "line " + std::to_string(24 - i));
    }
    const ConfigRecord read = WriteThenRead(record);
    EXPECT_EQ(read.library_paths, record.library_paths);
    EXPECT_EQ(read.library_definitions, record.library_definitions);
}

TEST(IniFormat, NumberedKeysComeFirstByValueThenOtherKeys)
{
    const ConfigRecord record =
        Read("[Library_path]\nzeta=Z\npath10=ten\nPATH2=two\npath007=seven\nalpha=A\n"
             "path99999999999999999999999999=huge\npath=bare\npath1x=mixed\npath1=one\n"
             "path01=one again\n");
    EXPECT_EQ(record.library_paths, (LibraryPathList{"one again", "one", "two", "seven", "ten",
                                                     "huge", "A", "bare", "mixed", "Z"}));
}

namespace
{

// Texts the file can carry: no '$' or backslash, which the INI class's variable expansion may
// change. Bytes above 0x7F, quotes, blanks at either end, '=' and ';' are all fair.
std::string RandomText(std::mt19937& random, bool name = false)
{
    static const std::string alphabet = "abcXYZ019 _-.;=\"'#[]\t\xE9\xC3\xA9\xFF";
    static const std::string nameAlphabet = "abcdefghXYZ019 _-.()\xE9";
    const std::string& from = name ? nameAlphabet : alphabet;
    std::string text(std::uniform_int_distribution<int>(name ? 1 : 0, 12)(random), ' ');
    for (char& c : text)
        c = from[std::uniform_int_distribution<size_t>(0, from.size() - 1)(random)];
    return text;
}

ConfigRecord RandomRecord(std::mt19937& random)
{
    auto flag = [&] { return random() % 2 == 1; };
    auto pick = [&](const char* letters) { return letters[random() % std::strlen(letters)]; };
    ConfigRecord r;
    // clang-format off
    for (bool* field : {&r.open_config_dialog, &r.create_backup_file, &r.show_nsx, &r.show_pat,
                        &r.run_orvik, &r.load_circuit, &r.spice, &r.verilog, &r.vhdl, &r.flat,
                        &r.flat_busses, &r.add_global, &r.add_dc_sources, &r.add_always_prefix,
                        &r.add_unit, &r.add_mos_multi_prefix, &r.use_spice_primitive,
                        &r.use_named_port, &r.global_net_as_supply, &r.use_define_timescale,
                        &r.use_define_capacitor})
        *field = flag();
    // clang-format on
    r.default_orviktype = pick("ADV");
    r.case_ = pick("ULA");
    r.backup_extension = RandomText(random);
    // Absent texts read back as their missing values; the round trip covers present ones.
    for (auto* text : {&r.supply1, &r.supply0, &r.timescale_unit, &r.timescale_precision,
                       &r.capacitor_scale, &r.capacitor_delay_coefficient, &r.net_type, &r.bus_type,
                       &r.archi_name, &r.config_prefix, &r.use_lib_section})
        *text = RandomText(random);
    for (int i = random() % 14; i > 0; --i)
        r.library_paths.push_back(RandomText(random));
    r.library_definitions.clear();
    for (int i = random() % 30; i > 0; --i)
        r.AddLibraryLine("lib " + RandomText(random, true).substr(0, 1 + random() % 2),
                         RandomText(random));
    return r;
}

} // namespace

TEST(IniFormat, RandomRecordsSurviveWriteThenRead)
{
    std::mt19937 random(20261206);
    for (int round = 0; round < 300; ++round)
    {
        const ConfigRecord record = RandomRecord(random);
        const std::string file = FormatIni(record);
        const ConfigRecord read = Read(file);
        ASSERT_EQ(FormatIni(read), file) << "round " << round;
        ASSERT_EQ(read.library_paths, record.library_paths) << "round " << round;
        ASSERT_EQ(read.library_definitions.size(), record.library_definitions.size());
        ASSERT_EQ(read.supply1, record.supply1);
        ASSERT_EQ(read.load_circuit, record.load_circuit);
    }
}

TEST(IniFormat, EditorArtefactsReadAsTheAuthorMeant)
{
    const std::string plain = "[Defaults]\nspice=yes\nbackup_extension=.sav\n[Verilog]\n"
                              "supply1=vdd\n";
    std::string crlf, cr;
    for (const char c : plain)
    {
        crlf += c == '\n' ? std::string("\r\n") : std::string(1, c);
        cr += c == '\n' ? '\r' : c;
    }
    std::string utf16le = "\xFF\xFE", utf16be = "\xFE\xFF";
    for (const char c : plain)
    {
        utf16le += std::string{c, '\0'};
        utf16be += std::string{'\0', c};
    }
    for (const std::string& file :
         {plain, "\xEF\xBB\xBF" + plain, crlf, "\xEF\xBB\xBF" + crlf, cr, utf16le, utf16be})
    {
        const ConfigRecord record = Read(file);
        EXPECT_TRUE(record.spice);
        EXPECT_EQ(record.backup_extension, ".sav");
        EXPECT_EQ(record.supply1, "vdd");
    }
}

TEST(IniFormat, NonAsciiBytesComeBackExactlyWhateverTheEncoding)
{
    const std::string latin1 = "/home/J\xF6rg/lib";
    const std::string utf8 = "/home/J\xC3\xB6rg/lib";
    const ConfigRecord record = Read("[Library_path]\npath0=" + latin1 + "\npath1=" + utf8 +
                                     "\n[Caf\xE9]\nline0=-- \xA9 caf\xC3\xA9\n");
    EXPECT_EQ(record.library_paths, (LibraryPathList{latin1, utf8}));
    EXPECT_EQ(record.library_definitions,
              (LibraryDefinitionList{{"Caf\xE9", "-- \xA9 caf\xC3\xA9"}}));
    EXPECT_EQ(WriteThenRead(record).library_definitions, record.library_definitions);
}

TEST(IniFormat, HostileFilesNeverCrashAndYieldDefinedValues)
{
    std::mt19937 random(4711);
    // clang-format off
    std::vector<std::string> files = {"", std::string(1, '\0'), "[", "]", "=", "[]\n=\n==x\n",
        "[a/b]\nq=2\n[a]\nx=1\n[a/b]\nr=3\n", "[a/../Defaults]\nspice=yes\n[Defaults]\nflat=yes\n",
        "[..]\nline0=x\n[.]\n[/]\n[//]\n", "[Defaults\nspice=yes\n", "\xFF\xFE\x01", "\xFE\xFF",
        "[Library_path]\npath0=" + std::string(2'000'000, 'x') + "\n",
        "[" + std::string(100'000, 'L') + "]\nline0=y\n"};
    // Structured junk: the pieces INI syntax is made of, in any order.
    const std::string pieces[] = {"[", "]", "/", "=", "..", "\n", "\r", "\\", "\"", ";", "#", "$",
        "a", "B", " ", {"\0", 1}, "\xEF\xBB\xBF", "Defaults", "Library_path", "line0", "path1"};
    // clang-format on
    for (int i = 0; i < 3000; ++i)
    {
        std::string file;
        for (int n = random() % 60; n > 0; --n)
            file += pieces[random() % std::size(pieces)];
        files.push_back(file);
    }
    for (int i = 0; i < 200; ++i)
    {
        std::string file(random() % 400, '\0');
        for (char& c : file)
            c = static_cast<char>(random());
        files.push_back(file);
    }

    for (const std::string& file : files)
    {
        const ConfigRecord record = Read(file);
        ASSERT_NE(std::string("ADV").find(record.default_orviktype), std::string::npos);
        ASSERT_NE(std::string("ULA").find(record.case_), std::string::npos);
        ASSERT_TRUE(record.supply1 && record.use_lib_section && record.timescale_unit);
        ASSERT_TRUE(std::is_sorted(
            record.library_definitions.begin(), record.library_definitions.end(),
            [](const LibraryLine& a, const LibraryLine& b) { return a.name < b.name; }));
        FormatIni(record); // whatever was read can be written
    }
}

TEST(IniFormat, HundredThousandEntriesReadInOrder)
{
    std::string file = "[Library_path]\n";
    for (int i = 0; i < 100'000; ++i)
        file += "path" + std::to_string(i) + "=/lib/" + std::to_string(i) + "\n";
    const ConfigRecord record = Read(file);
    ASSERT_EQ(record.library_paths.size(), 100'000u);
    EXPECT_EQ(record.library_paths[10], "/lib/10");
    EXPECT_EQ(record.library_paths[99'999], "/lib/99999");
}
