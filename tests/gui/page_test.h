#pragma once

// Shared by the option page tests: a main window plus ways to look at the whole tree.
#include "tests/gui/gui_test.h"

#include <wx/treectrl.h>

#include <string>
#include <vector>

struct TreeNode
{
    wxTreeItemId id;
    wxString text;
};

class PageTest : public FrameTest
{
  protected:
    ConfigRecord& Record() { return m_frame->Config(); }
    wxTreeCtrl* OptionTree() const { return m_frame->Tree(); }
    wxTreeItemId Node(int pageId) const;

    // Selects the node as a user's click would, which shows its page.
    void SelectPageOf(int pageId);

    // Every node in tree order, leaving out the children of `skipChildrenOf` (a refilled node).
    std::vector<TreeNode> Labels(int skipChildrenOf = PAGE_ID_NONE) const;
    // Texts as UTF-8, so that a failure prints them readably.
    std::vector<std::string> ChildTexts(int pageId) const;
    std::string NodeUtf8(int pageId) const { return NodeText(pageId).utf8_string(); }

    // Fails unless `after` holds the same nodes as `before` with the same texts, except `node`,
    // whose text must be `expected`.
    static void ExpectOnlyLabelChanged(const std::vector<TreeNode>& before,
                                       const std::vector<TreeNode>& after, const wxTreeItemId& node,
                                       const wxString& expected);
    static void ExpectSameLabels(const std::vector<TreeNode>& before,
                                 const std::vector<TreeNode>& after);
};

// "Flatten busses: %s" filled as the tree shows flags.
wxString YesNoLabel(const char* format, bool value);
