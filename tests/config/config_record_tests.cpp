#include "config/config_record.h"

#include <gtest/gtest.h>

TEST(ConfigRecord, DefaultHoldsGenericLibrary)
{
    const ConfigRecord record;
    const LibraryDefinitionList expected{{"Generic", "LIBRARY ieee;"},
                                         {"Generic", "USE ieee.std_logic_1164.ALL;"}};
    EXPECT_EQ(record.library_definitions, expected);
}
