#include "tests/gui/gui_test.h"

#include "resources/images.h"

#include <wx/image.h>
#include <wx/statusbr.h>
#include <wx/toolbar.h>

#include <algorithm>

namespace
{

TEST_F(FrameTest, CommandBarHoldsTheSevenToolsInOrder)
{
    const struct
    {
        int id;
        const char* help; // also shown in the status bar while the pointer rests on the tool
    } tools[] = {
        {ID_TOOL_NEW, "Create a new configuration file"},
        {ID_TOOL_OPEN, "Open a configuration file"},
        {ID_TOOL_SAVE, "Save the configuration file"},
        {ID_TOOL_SAVE_AS, "Save the options in a new configuration file"},
        {wxID_SEPARATOR, ""},
        {ID_TOOL_EXPAND, "Expand a selected node"},
        {ID_TOOL_COLLAPSE, "Collapse a selected node"},
        {wxID_SEPARATOR, ""},
        {ID_TOOL_GENERATE, "Generate the netlist"},
    };
    wxToolBar* bar = m_frame->GetToolBar();
    ASSERT_EQ(bar->GetToolsCount(), std::size(tools));
    int image = 0;
    for (size_t pos = 0; pos < std::size(tools); ++pos)
    {
        const wxToolBarToolBase* tool = bar->GetToolByPos(int(pos));
        SCOPED_TRACE(pos);
        EXPECT_EQ(tool->IsSeparator(), tools[pos].id == wxID_SEPARATOR);
        if (tool->IsSeparator())
            continue;
        EXPECT_EQ(tool->GetId(), tools[pos].id);
        EXPECT_EQ(tool->GetShortHelp(), tools[pos].help);
        const wxImage shown = tool->GetNormalBitmap().ConvertToImage();
        const wxImage expected = CommandBarBitmap(image++).ConvertToImage();
        ASSERT_EQ(shown.GetSize(), expected.GetSize());
        const unsigned char* pixels = shown.GetData();
        EXPECT_TRUE(std::equal(pixels, pixels + 3 * shown.GetWidth() * shown.GetHeight(),
                               expected.GetData()));
        // Only start-up with a file enables Generate.
        EXPECT_EQ(tool->IsEnabled(), tools[pos].id != ID_TOOL_GENERATE);
        bar->OnMouseEnter(tools[pos].id); // what the toolkit calls when the pointer enters it
        EXPECT_EQ(StatusText(), tools[pos].help);
    }
}

} // namespace
