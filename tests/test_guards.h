#pragma once

// In the program a wx assert or a logged warning is a message box the user never asked for; in
// the tests either one fails the test that caused it.
#include <gtest/gtest.h>

#include <wx/debug.h>
#include <wx/log.h>

class FailingLog : public wxLog
{
  protected:
    void DoLogRecord(wxLogLevel level, const wxString& msg, const wxLogRecordInfo&) override
    {
        if (level <= wxLOG_Warning)
            ADD_FAILURE() << "logged: " << msg.utf8_str().data();
    }
};

inline void FailOnAssert(const wxString& file, int line, const wxString& func, const wxString& cond,
                         const wxString& msg)
{
    ADD_FAILURE() << "wx assert " << file.utf8_str().data() << ":" << line << " in "
                  << func.utf8_str().data() << ": " << cond.utf8_str().data() << " "
                  << msg.utf8_str().data();
}

inline void InstallTestGuards()
{
    wxSetAssertHandler(FailOnAssert);
    delete wxLog::SetActiveTarget(new FailingLog);
}
