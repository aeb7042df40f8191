// Main of every test executable: starts the framework as an application's start-up
// does (module state, instance and resource handles, the application object), so
// tests can use AfxGetApp, dialogs and message boxes, then runs the tests.
#include <afxwin.h>

#include <gtest/gtest.h>

namespace {

// The application object; its name (shown as the caption of AfxMessageBox) is
// the executable's base name, as for an application without a title string.
class CTestApp : public CWinApp
{
public:
    CTestApp() : CWinApp(NULL) {}
};

CTestApp theTestApp;

} // namespace

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    if (!AfxWinInit(::GetModuleHandleW(NULL), NULL, ::GetCommandLineW(), SW_SHOWNORMAL))
    {
        fprintf(stderr, "AfxWinInit failed\n");
        return 1;
    }
    int nResult = RUN_ALL_TESTS();
    AfxWinTerm();
    return nResult;
}
