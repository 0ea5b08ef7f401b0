// The configuration library runs without a display; a wx assert or a logged warning here would be
// a message box in the program, so either fails the test.
#include <gtest/gtest.h>

#include <wx/init.h>
#include <wx/log.h>

namespace
{

class FailingLog : public wxLog
{
  protected:
    void DoLogRecord(wxLogLevel level, const wxString& msg, const wxLogRecordInfo&) override
    {
        if (level <= wxLOG_Warning)
            ADD_FAILURE() << "logged: " << msg.utf8_str().data();
    }
};

void FailOnAssert(const wxString& file, int line, const wxString& func, const wxString& cond,
                  const wxString& msg)
{
    ADD_FAILURE() << "wx assert " << file.utf8_str().data() << ":" << line << " in "
                  << func.utf8_str().data() << ": " << cond.utf8_str().data() << " "
                  << msg.utf8_str().data();
}

} // namespace

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    wxInitializer wx(argc, argv);
    if (!wx.IsOk())
        return 1;
    wxSetAssertHandler(FailOnAssert);
    delete wxLog::SetActiveTarget(new FailingLog);
    return RUN_ALL_TESTS();
}
