#include "app/config_tool.h"

wxIMPLEMENT_APP(ConfigTool);
