// The main of the tests that need wxBase only: the configuration library runs without a
// display, and the process tests watch the program from outside.
#include "tests/test_guards.h"

#include <wx/init.h>

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    wxInitializer wx(argc, argv);
    if (!wx.IsOk())
        return 1;
    InstallTestGuards();
    return RUN_ALL_TESTS();
}
