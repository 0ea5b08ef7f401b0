#include "config/config_record.h"
#include "config/text_conv.h"

#include <gtest/gtest.h>

namespace
{

std::vector<std::string> Names(const ConfigRecord& record)
{
    std::vector<std::string> names;
    for (const LibraryLine& entry : record.library_definitions)
        names.push_back(entry.name + ":" + entry.line);
    return names;
}

} // namespace

TEST(ConfigRecord, DefaultHoldsOnlyTheGenericLibrary)
{
    const ConfigRecord record;
    const LibraryDefinitionList expected{{"Generic", "LIBRARY ieee;"},
                                         {"Generic", "USE ieee.std_logic_1164.ALL;"}};
    EXPECT_EQ(record.library_definitions, expected);
    EXPECT_TRUE(record.library_paths.empty());
    EXPECT_FALSE(record.supply1.has_value());
    EXPECT_FALSE(record.use_lib_section.has_value());
}

TEST(ConfigRecord, LibraryPathsStayUniqueByExactBytes)
{
    ConfigRecord record;
    record.AddLibraryPath("/opt/lib");
    record.AddLibraryPath("/opt/Lib");
    record.AddLibraryPath("/opt/lib");
    record.AddLibraryPath("/opt/lib/");
    EXPECT_EQ(record.library_paths, (LibraryPathList{"/opt/lib", "/opt/Lib", "/opt/lib/"}));

    record.RemoveLibraryPath("/nowhere");
    record.RemoveLibraryPath("/opt/Lib");
    EXPECT_EQ(record.library_paths, (LibraryPathList{"/opt/lib", "/opt/lib/"}));
}

TEST(ConfigRecord, RemovingAPathTakesOnlyTheFirstOfEqualEntries)
{
    ConfigRecord record;
    record.library_paths = {"a", "b", "a", "c"}; // a file may hold duplicates
    record.RemoveLibraryPath("a");
    EXPECT_EQ(record.library_paths, (LibraryPathList{"b", "a", "c"}));
    // The text may be the entry's own: nothing is compared after the removal.
    record.RemoveLibraryPath(record.library_paths.front());
    EXPECT_EQ(record.library_paths, (LibraryPathList{"a", "c"}));
}

TEST(ConfigRecord, LibraryLinesKeepByteOrderOfNamesAndLineOrderWithin)
{
    ConfigRecord record;
    record.RemoveLibrary("Generic");
    record.AddLibraryLine("work", "w1");
    record.AddLibraryLine("Work", "W1");
    record.AddLibraryLine("\xC3\xa9t\xC3\xa9", "accented"); // bytes above 0x7F sort last
    record.AddLibraryLine("work", "w2");
    record.AddLibraryLine("Work", "W2");
    record.AddLibraryLine("wor", "prefix");
    record.AddLibraryLine("work", "w1"); // the same line twice is allowed
    EXPECT_EQ(Names(record),
              (std::vector<std::string>{"Work:W1", "Work:W2", "wor:prefix", "work:w1", "work:w2",
                                        "work:w1", "\xC3\xa9t\xC3\xa9:accented"}));
}

TEST(ConfigRecord, RemovingALibraryTakesAllItsLinesAndNothingElse)
{
    ConfigRecord record;
    record.AddLibraryLine("Alpha", "a");
    record.AddLibraryLine("Zeta", "z");
    record.RemoveLibrary("generic"); // names compare with case
    EXPECT_EQ(record.library_definitions.size(), 4u);

    // The name may be the text of an entry being removed.
    record.RemoveLibrary(record.library_definitions[1].name);
    EXPECT_EQ(Names(record), (std::vector<std::string>{"Alpha:a", "Zeta:z"}));
    record.RemoveLibrary("Alpha");
    record.RemoveLibrary("Zeta");
    EXPECT_TRUE(record.library_definitions.empty());
}

TEST(TextConversion, ShowsUtf8AsUtf8AndOtherBytesAsLatin1)
{
    EXPECT_EQ(ToWx("caf\xC3\xA9"), wxString::FromUTF8("caf\xC3\xA9"));
    EXPECT_EQ(ToWx("caf\xE9"), wxString(L"caf\u00E9"));
    EXPECT_EQ(ToWx(""), wxString());
    EXPECT_EQ(ToWx(std::string("a\0b", 3)).length(), 3u);
    EXPECT_EQ(FromWx(wxString(L"caf\u00E9 \u03A9")), "caf\xC3\xA9 \xCE\xA9");
}

TEST(TextConversion, IniSideIsByteTransparent)
{
    std::string all;
    for (int byte = 1; byte < 256; ++byte)
        all.push_back(static_cast<char>(byte));
    EXPECT_EQ(IniToBytes(BytesToIni(all)), all);
    // A character from outside the file (an expanded variable) arrives as UTF-8.
    EXPECT_EQ(IniToBytes(wxString(L"\u00E9 \u03A9")), "\xE9 \xCE\xA9");
}
