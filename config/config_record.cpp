#include "config/config_record.h"

#include <algorithm>
#include <utility>

ConfigRecord::ConfigRecord()
{
    AddLibraryLine("Generic", "LIBRARY ieee;");
    AddLibraryLine("Generic", "USE ieee.std_logic_1164.ALL;");
}

void ConfigRecord::AddLibraryPath(const std::string& path)
{
    if (std::find(library_paths.begin(), library_paths.end(), path) == library_paths.end())
        library_paths.push_back(path);
}

void ConfigRecord::RemoveLibraryPath(const std::string& path)
{
    const auto found = std::find(library_paths.begin(), library_paths.end(), path);
    if (found != library_paths.end())
        library_paths.erase(found);
}

namespace
{

// std::string compares as unsigned bytes, the order the definitions are kept in.
bool NameBefore(const std::string& name, const LibraryLine& entry) { return name < entry.name; }
bool EntryBefore(const LibraryLine& entry, const std::string& name) { return entry.name < name; }

} // namespace

void ConfigRecord::AddLibraryLine(const std::string& name, std::string line)
{
    // After the library's other lines; reading a file appends at the end, so this stays cheap.
    const auto at =
        std::upper_bound(library_definitions.begin(), library_definitions.end(), name, NameBefore);
    library_definitions.insert(at, LibraryLine{name, std::move(line)});
}

void ConfigRecord::RemoveLibrary(const std::string& name)
{
    const auto first =
        std::lower_bound(library_definitions.begin(), library_definitions.end(), name, EntryBefore);
    const auto last = std::upper_bound(first, library_definitions.end(), name, NameBefore);
    library_definitions.erase(first, last);
}
