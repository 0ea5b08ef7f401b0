// Measures what the record mapping adds to the INI class on a large configuration: 10,000
// library paths and 500 libraries of 20 lines. Run by hand:
//   build/bench/ini_bench [ROUNDS]
// The last two lines are the ratios (mapping + INI class) / (INI class alone); the goal is at
// most 1.3 for each.
#include "config/config_record.h"
#include "config/ini_file.h"
#include "config/text_conv.h"

#include <wx/fileconf.h>
#include <wx/init.h>
#include <wx/log.h>
#include <wx/mstream.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <vector>

namespace
{

int g_rounds = 15;

ConfigRecord LargeRecord()
{
    ConfigRecord record;
    for (int i = 0; i < 10'000; ++i)
        record.library_paths.push_back("/opt/orvik/libraries/process_" + std::to_string(i) +
                                       "/models.lib");
    for (int library = 0; library < 500; ++library)
        for (int line = 0; line < 20; ++line)
            record.AddLibraryLine("lib_" + std::to_string(library),
                                  "USE lib_" + std::to_string(library) + ".package_" +
                                      std::to_string(line) + ".ALL;");
    return record;
}

// The fastest of several rounds, in milliseconds: the least disturbed by other work.
double Time(const std::function<void()>& work)
{
    std::vector<double> times;
    for (int round = 0; round < g_rounds; ++round)
    {
        const auto start = std::chrono::steady_clock::now();
        work();
        times.push_back(
            std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start)
                .count());
    }
    return *std::min_element(times.begin(), times.end());
}

struct Entry
{
    wxString group;
    wxString key;
    wxString value;
};

// Every entry of the file, as the INI class alone would be given them.
std::vector<Entry> EntriesOf(const std::string& bytes)
{
    std::vector<Entry> entries;
    const auto ini = ParseIni(bytes);
    wxString group, key;
    long groupCookie = 0, keyCookie = 0;
    for (bool g = ini->GetFirstGroup(group, groupCookie); g;
         g = ini->GetNextGroup(group, groupCookie))
    {
        ini->SetPath("/" + group);
        for (bool k = ini->GetFirstEntry(key, keyCookie); k; k = ini->GetNextEntry(key, keyCookie))
            entries.push_back({"/" + group, key, ini->Read(key, wxString())});
        ini->SetPath("/");
    }
    return entries;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc > 1)
        g_rounds = std::max(1, std::atoi(argv[1]));
    wxInitializer wx(argc, argv);
    wxLogNull quiet;
    const ConfigRecord record = LargeRecord();
    const std::string bytes = FormatIni(record);
    const std::vector<Entry> entries = EntriesOf(bytes);
    std::printf("file: %zu bytes, %zu entries\n", bytes.size(), entries.size());

    const double bareParse = Time(
        [&]
        {
            wxMemoryInputStream in(bytes.data(), bytes.size());
            wxFileConfig ini(in, wxConvISO8859_1);
        });
    const double parseAndRead = Time(
        [&]
        {
            ConfigRecord read;
            ReadIniBytes(bytes, read);
        });

    const double bareWrite = Time(
        [&]
        {
            wxMemoryInputStream empty("", 0);
            wxFileConfig ini(empty, wxConvISO8859_1);
            for (const Entry& entry : entries)
            {
                ini.SetPath(entry.group);
                ini.Write(entry.key, entry.value);
            }
            wxMemoryOutputStream out;
            ini.Save(out, wxConvISO8859_1);
        });
    const double writeAndSave = Time([&] { FormatIni(record); });

    std::printf("bare parse        %8.2f ms\n", bareParse);
    std::printf("parse + ReadIni   %8.2f ms\n", parseAndRead);
    std::printf("bare write + save %8.2f ms\n", bareWrite);
    std::printf("WriteIni + save   %8.2f ms\n", writeAndSave);
    std::printf("read ratio  %.2f\n", parseAndRead / bareParse);
    std::printf("write ratio %.2f\n", writeAndSave / bareWrite);
    return 0;
}
