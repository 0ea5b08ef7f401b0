#include "tests/gui/gui_test.h"

#include <wx/splitter.h>
#include <wx/statbmp.h>
#include <wx/toolbar.h>
#include <wx/treectrl.h>

TEST_F(FrameTest, StartsAsTheEmptyWindowOfAFreshStart)
{
    EXPECT_EQ(m_frame->GetTitle(), "ZIDOVADE Configuration Tool");
    EXPECT_EQ(m_frame->GetPosition(), wxPoint(20, 20));
    EXPECT_EQ(m_frame->GetSize(), wxSize(520, 450));
    EXPECT_EQ(StatusText(), "ORVIK netlist configuration tool 5.5.0 - Welcome!");
    EXPECT_EQ(m_frame->FindCtrl<wxSplitterWindow>(ID_SPLITTER)->GetSashPosition(), 180);

    for (int id = ID_PAGE_FIRST; id <= ID_PAGE_LAST; ++id)
    {
        wxWindow* page = m_frame->FindWindow(id);
        ASSERT_NE(page, nullptr) << id;
        EXPECT_EQ(page->GetParent()->GetId(), ID_PAGE_HOST);
        EXPECT_EQ(page->IsShown(), id == ID_PAGE_WELCOME) << id;
    }
    EXPECT_NE(m_frame->FindCtrl<wxStaticBitmap>(ID_LOGO), nullptr);
    EXPECT_NE(m_frame->Tree(), nullptr);
    EXPECT_TRUE(m_frame->Config().saved);
}
