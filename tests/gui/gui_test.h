#pragma once

// Every GUI test includes this first: dialogs that a test did not expect, asserts and log
// messages fail the test instead of blocking the X server with a window nobody answers.
#include <gtest/gtest.h>

#include <wx/modalhook.h>
#include <wx/string.h>

class FailingModalHook;
#define wxTEST_DIALOG_HOOK_CLASS FailingModalHook

#include <wx/testing.h>

class FailingModalHook : public wxTestingModalHook
{
  public:
    using wxTestingModalHook::wxTestingModalHook;

  protected:
    // A dialog nobody expected is cancelled after the failure is reported: shown for real, it
    // would wait for an answer that never comes.
    int Enter(wxDialog* dialog) override
    {
        const int answer = wxTestingModalHook::Enter(dialog);
        return answer == wxID_NONE ? wxID_CANCEL : answer;
    }

    void ReportFailure(const wxString& msg) override { ADD_FAILURE() << msg.utf8_str().data(); }
};

#include "app/config_frame.h"
#include "app/ids.h"

#include <wx/event.h>

// A fresh main window per test, built as start-up builds it, torn down afterwards.
class FrameTest : public testing::Test
{
  protected:
    void SetUp() override;
    void TearDown() override;

    // Raises the control's own event as a click or a keystroke would, through the real routing.
    void Click(int id, bool checked = true);
    void ChooseRadio(int id, int item);
    void Press(int id);
    void TypeText(int id, const wxString& text);

    // Selects the tree node with the given label (exact text), as a user's click would.
    void SelectNode(const wxString& label);
    wxString NodeText(int pageId) const;
    wxString StatusText() const;

    ConfigFrame* m_frame = nullptr; // wx owns top-level windows
};
