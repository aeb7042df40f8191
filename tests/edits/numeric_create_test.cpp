// The numeric edit initialises once (spin, value shown and committed), whether it is
// created with Create, while the framework still names it as the object being
// created, or subclassed from a dialog control.
#include "edit_harness.h"

#include "KVXLongEdit.h"

namespace {

using namespace edit_test;

struct CountingLongEdit : KVXLongEdit
{
    int nShown = 0;
    int SetValueAsVariant(KVXVariant v, int bCommit) override { ++nShown; return KVXLongEdit::SetValueAsVariant(v, bCommit); }
};

using NumericEditCreate = PageFixture;

TEST_F(NumericEditCreate, InitialisesOnceWhetherCreatedOrSubclassed)
{
    CountingLongEdit created;
    CountingLongEdit subclassed;
    ASSERT_TRUE(created.Create(WS_CHILD | WS_VISIBLE | WS_BORDER, CRect(10, 80, 90, 100), &dlg, 2001));
    ASSERT_TRUE(subclassed.SubclassDlgItem(kIdEdit1, &dlg));
    EXPECT_EQ(1, created.nShown);
    EXPECT_EQ(1, subclassed.nShown);
    EXPECT_EQ("0", Narrow(WindowText(created)));
}

} // namespace
