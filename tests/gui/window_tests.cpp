#include "tests/gui/gui_test.h"

#include <wx/splitter.h>
#include <wx/statbmp.h>
#include <wx/treectrl.h>

TEST_F(FrameTest, StartsAsTheEmptyWindowOfAFreshStart)
{
    EXPECT_EQ(m_frame->GetTitle(), "ZIDOVADE Configuration Tool");
    EXPECT_EQ(m_frame->GetPosition(), wxPoint(20, 20));
    EXPECT_EQ(m_frame->GetSize().y, 450);
    EXPECT_GE(m_frame->GetSize().x, 520);
    EXPECT_EQ(StatusText(), "ORVIK netlist configuration tool 5.5.0 - Welcome!");
    EXPECT_TRUE(m_frame->Config().saved);
    EXPECT_TRUE(m_frame->Config().file_path.empty());

    auto* splitter = m_frame->FindCtrl<wxSplitterWindow>(ID_SPLITTER);
    ASSERT_NE(splitter, nullptr);
    EXPECT_EQ(splitter->GetName(), "splitter");
    EXPECT_EQ(splitter->GetSashPosition(), 180);
    EXPECT_TRUE(splitter->IsSplit());
    EXPECT_EQ(splitter->GetSplitMode(), wxSPLIT_VERTICAL);
    EXPECT_TRUE(splitter->GetWindow1()->IsDescendant(m_frame->Tree()));
    EXPECT_TRUE(splitter->GetWindow2()->IsDescendant(m_frame->FindWindow(ID_PAGE_HOST)));
    EXPECT_NE(m_frame->FindCtrl<wxStaticBitmap>(ID_LOGO), nullptr);
}

TEST_F(FrameTest, EveryPageSitsInTheHostAndOnlyTheWelcomePageShows)
{
    wxWindow* host = m_frame->FindWindow(ID_PAGE_HOST);
    for (int id = ID_PAGE_FIRST; id <= ID_PAGE_LAST; ++id)
    {
        wxWindow* page = m_frame->FindWindow(id);
        ASSERT_NE(page, nullptr) << id;
        EXPECT_EQ(page->GetParent(), host) << id;
        EXPECT_EQ(page->IsShown(), id == ID_PAGE_WELCOME) << id;
        // Nothing of a page is cut off: the window opens large enough for the largest one.
        EXPECT_LE(page->GetMinSize().x, host->GetSize().x) << id;
        EXPECT_LE(page->GetMinSize().y, host->GetSize().y) << id;
    }
}
