#include "tests/gui/gui_test.h"

#include "resources/images.h"

#include <wx/image.h>
#include <wx/statusbr.h>
#include <wx/toolbar.h>

namespace
{

struct ToolCase
{
    int id;
    int image;
    const char* help;
};

const ToolCase TOOLS[] = {
    {ID_TOOL_NEW, 0, "Create a new configuration file"},
    {ID_TOOL_OPEN, 1, "Open a configuration file"},
    {ID_TOOL_SAVE, 2, "Save the configuration file"},
    {ID_TOOL_SAVE_AS, 3, "Save the options in a new configuration file"},
    {wxID_SEPARATOR, -1, ""},
    {ID_TOOL_EXPAND, 4, "Expand a selected node"},
    {ID_TOOL_COLLAPSE, 5, "Collapse a selected node"},
    {wxID_SEPARATOR, -1, ""},
    {ID_TOOL_GENERATE, 6, "Generate the netlist"},
};

bool SamePixels(const wxBitmap& shown, const wxBitmap& expected)
{
    const wxImage a = shown.ConvertToImage();
    const wxImage b = expected.ConvertToImage();
    return a.GetSize() == b.GetSize() && a.HasMask() == b.HasMask() &&
           std::equal(a.GetData(), a.GetData() + 3 * a.GetWidth() * a.GetHeight(), b.GetData());
}

TEST_F(FrameTest, CommandBarHoldsTheSevenToolsInOrder)
{
    wxToolBar* bar = m_frame->GetToolBar();
    ASSERT_NE(bar, nullptr);
    EXPECT_EQ(bar->GetToolBitmapSize(), wxSize(24, 24));
    EXPECT_EQ(bar->GetMargins(), wxSize(1, 1));
    ASSERT_EQ(bar->GetToolsCount(), std::size(TOOLS));
    for (size_t pos = 0; pos < std::size(TOOLS); ++pos)
    {
        const ToolCase& expected = TOOLS[pos];
        const wxToolBarToolBase* tool = bar->GetToolByPos(int(pos));
        SCOPED_TRACE(pos);
        ASSERT_NE(tool, nullptr);
        if (expected.id == wxID_SEPARATOR)
        {
            EXPECT_TRUE(tool->IsSeparator());
            continue;
        }
        EXPECT_EQ(tool->GetId(), expected.id);
        EXPECT_EQ(tool->GetKind(), wxITEM_NORMAL);
        EXPECT_EQ(tool->GetLabel(), "");
        EXPECT_EQ(tool->GetShortHelp(), expected.help);
        EXPECT_EQ(tool->GetLongHelp(), expected.help);
        EXPECT_EQ(tool->GetNormalBitmap().GetSize(), wxSize(24, 24));
        EXPECT_TRUE(SamePixels(tool->GetNormalBitmap(), CommandBarBitmap(expected.image)));
        // Only start-up with a file enables Generate.
        EXPECT_EQ(tool->IsEnabled(), expected.id != ID_TOOL_GENERATE);
    }
}

TEST_F(FrameTest, RestingOnAToolShowsItsHelpInTheStatusBar)
{
    wxToolBar* bar = m_frame->GetToolBar();
    for (const ToolCase& tool : TOOLS)
    {
        if (tool.id == wxID_SEPARATOR)
            continue;
        bar->OnMouseEnter(tool.id); // what the toolkit calls when the pointer enters the tool
        EXPECT_EQ(StatusText(), tool.help);
    }
}

} // namespace
