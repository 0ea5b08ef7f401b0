#include "tests/gui/gui_test.h"

#include "app/config_tool.h"
#include "tests/test_guards.h"

#include <wx/app.h>
#include <wx/checkbox.h>
#include <wx/log.h>
#include <wx/radiobox.h>
#include <wx/splitter.h>
#include <wx/statusbr.h>
#include <wx/textentry.h>
#include <wx/treectrl.h>

namespace
{

class TestApp : public wxApp
{
  public:
    bool OnInit() override { return true; }
};

wxTreeItemId FindByText(wxTreeCtrl* tree, const wxTreeItemId& node, const wxString& text)
{
    if (!node.IsOk())
        return {};
    if (tree->GetItemText(node) == text)
        return node;
    wxTreeItemIdValue cookie;
    for (auto child = tree->GetFirstChild(node, cookie); child.IsOk();
         child = tree->GetNextChild(node, cookie))
        if (auto found = FindByText(tree, child, text); found.IsOk())
            return found;
    return {};
}

} // namespace

void FrameTest::SetUp()
{
    m_frame = OpenMainWindow();
    wxYield();
}

void FrameTest::TearDown()
{
    m_frame->Destroy();
    wxYield();
}

void FrameTest::Click(int id, bool checked)
{
    auto* box = m_frame->FindCtrl<wxCheckBox>(id);
    ASSERT_NE(box, nullptr) << "no check box " << id;
    box->SetValue(checked);
    wxCommandEvent event(wxEVT_CHECKBOX, id);
    event.SetEventObject(box);
    event.SetInt(checked);
    box->HandleWindowEvent(event);
}

void FrameTest::ChooseRadio(int id, int item)
{
    auto* radio = m_frame->FindCtrl<wxRadioBox>(id);
    ASSERT_NE(radio, nullptr) << "no radio box " << id;
    radio->SetSelection(item);
    wxCommandEvent event(wxEVT_RADIOBOX, id);
    event.SetEventObject(radio);
    event.SetInt(item);
    event.SetString(radio->GetString(item));
    radio->HandleWindowEvent(event);
}

void FrameTest::Press(int id)
{
    wxWindow* button = m_frame->FindWindow(id);
    ASSERT_NE(button, nullptr) << "no button " << id;
    wxCommandEvent event(wxEVT_BUTTON, id);
    event.SetEventObject(button);
    button->HandleWindowEvent(event);
}

void FrameTest::TypeText(int id, const wxString& text)
{
    auto* entry = dynamic_cast<wxTextEntry*>(m_frame->FindWindow(id));
    ASSERT_NE(entry, nullptr) << "no text entry " << id;
    entry->SetValue(text); // raises the control's own text event, as typing does
}

void FrameTest::SelectNode(const wxString& label)
{
    wxTreeCtrl* tree = m_frame->Tree();
    const wxTreeItemId node = FindByText(tree, tree->GetRootItem(), label);
    ASSERT_TRUE(node.IsOk()) << "no node " << label.utf8_str().data();
    tree->SelectItem(node);
}

wxString FrameTest::NodeText(int pageId) const
{
    wxTreeCtrl* tree = m_frame->Tree();
    const wxTreeItemId node = ConfigFrame::FindNodeByPageId(tree, pageId, tree->GetRootItem());
    return node.IsOk() ? tree->GetItemText(node) : wxString();
}

wxString FrameTest::StatusText() const { return m_frame->GetStatusBar()->GetStatusText(0); }

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    wxApp::SetInstance(new TestApp);
    if (!wxEntryStart(argc, argv) || !wxTheApp->CallOnInit())
    {
        fprintf(stderr, "cannot start the GUI (is there a display?)\n");
        return 1;
    }
    InstallTestGuards();
    const int result = RUN_ALL_TESTS();
    wxTheApp->OnExit();
    wxEntryCleanup();
    return result;
}
