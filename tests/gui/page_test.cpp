#include "tests/gui/page_test.h"

namespace
{

void Walk(wxTreeCtrl* tree, const wxTreeItemId& node, const wxTreeItemId& skip,
          std::vector<TreeNode>& out)
{
    out.push_back({node, tree->GetItemText(node)});
    if (skip.IsOk() && node == skip)
        return;
    wxTreeItemIdValue cookie;
    for (auto child = tree->GetFirstChild(node, cookie); child.IsOk();
         child = tree->GetNextChild(node, cookie))
        Walk(tree, child, skip, out);
}

} // namespace

wxTreeItemId PageTest::Node(int pageId) const
{
    return ConfigFrame::FindNodeByPageId(OptionTree(), pageId, OptionTree()->GetRootItem());
}

void PageTest::SelectPageOf(int pageId)
{
    const wxTreeItemId node = Node(pageId);
    ASSERT_TRUE(node.IsOk()) << "no node " << pageId;
    OptionTree()->SelectItem(node);
}

std::vector<TreeNode> PageTest::Labels(int skipChildrenOf) const
{
    std::vector<TreeNode> nodes;
    const wxTreeItemId root = OptionTree()->GetRootItem();
    if (root.IsOk())
        Walk(OptionTree(), root, skipChildrenOf ? Node(skipChildrenOf) : wxTreeItemId(), nodes);
    return nodes;
}

std::vector<std::string> PageTest::ChildTexts(int pageId) const
{
    std::vector<std::string> texts;
    const wxTreeItemId node = Node(pageId);
    if (!node.IsOk())
        return texts;
    wxTreeItemIdValue cookie;
    for (auto child = OptionTree()->GetFirstChild(node, cookie); child.IsOk();
         child = OptionTree()->GetNextChild(node, cookie))
        texts.push_back(OptionTree()->GetItemText(child).utf8_string());
    return texts;
}

void PageTest::ExpectOnlyLabelChanged(const std::vector<TreeNode>& before,
                                      const std::vector<TreeNode>& after, const wxTreeItemId& node,
                                      const wxString& expected)
{
    ASSERT_FALSE(before.empty()) << "the tree is empty";
    ASSERT_EQ(before.size(), after.size()) << "nodes were added or removed";
    bool seen = false;
    for (size_t i = 0; i < before.size(); ++i)
    {
        ASSERT_EQ(before[i].id, after[i].id) << "node " << i << " was replaced";
        if (after[i].id == node)
        {
            seen = true;
            EXPECT_EQ(after[i].text.utf8_string(), expected.utf8_string());
        }
        else
            EXPECT_EQ(after[i].text.utf8_string(), before[i].text.utf8_string())
                << "node " << i << " changed too";
    }
    EXPECT_TRUE(seen) << "the node is not in the tree";
}

void PageTest::ExpectSameLabels(const std::vector<TreeNode>& before,
                                const std::vector<TreeNode>& after)
{
    ExpectOnlyLabelChanged(before, after, before.empty() ? wxTreeItemId() : before.front().id,
                           before.empty() ? wxString() : before.front().text);
}

wxString YesNoLabel(const char* format, bool value)
{
    return wxString::Format(format, value ? "Yes" : "No");
}
