#include "app/config_tool.h"

wxIMPLEMENT_APP_NO_MAIN(ConfigTool);

int main(int argc, char** argv)
{
    // The netlister reads the outcome from the file alone: the status is 0 even when the toolkit
    // cannot start (no display).
    wxEntry(argc, argv);
    return 0;
}
