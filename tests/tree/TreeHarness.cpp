#include "TreeHarness.h"

#include "Input.h"
#include "OrvaneLibrary.h"

#include <sstream>

namespace tree_test {

namespace {

std::string Narrow(const CString& s)
{
    std::string out;
    for (int i = 0; i < s.GetLength(); ++i)
        out += static_cast<char>(s[i] < 0x80 ? s[i] : '?');
    return out;
}

const char* CodeName(UINT code)
{
    switch (code)
    {
    case TVN_SELCHANGINGW: return "ing";
    case TVN_SELCHANGEDW: return "ed";
    case NM_CLICK: return "click";
    case NM_RCLICK: return "rclick";
    case TVN_BEGINDRAGW: return "drag";
    case TVN_BEGINRDRAGW: return "rdrag";
    case TVN_ITEMEXPANDINGW: return "expanding";
    case TVN_ITEMEXPANDEDW: return "expanded";
    default: return nullptr;
    }
}

bool CarriesItems(UINT code)
{
    return code == TVN_SELCHANGINGW || code == TVN_SELCHANGEDW || code == TVN_BEGINDRAGW
        || code == TVN_BEGINRDRAGW || code == TVN_ITEMEXPANDINGW || code == TVN_ITEMEXPANDEDW;
}

bool g_bWatchdogFired = false;

void CALLBACK WatchdogExpired(HWND, UINT, UINT_PTR id, DWORD)
{
    ::KillTimer(NULL, id);
    g_bWatchdogFired = true;
    ::ReleaseCapture();
}

} // namespace

PressWatchdog::PressWatchdog()
{
    g_bWatchdogFired = false;
    m_timer = ::SetTimer(NULL, 0, 5000, &WatchdogExpired);
}

PressWatchdog::~PressWatchdog()
{
    ::KillTimer(NULL, m_timer);
    EXPECT_FALSE(g_bWatchdogFired) << "a press loop did not end by itself";
}

std::string ItemName(const CTreeCtrl& tree, HTREEITEM hItem)
{
    if (hItem == NULL)
        return std::string();
    return Narrow(tree.GetItemText(hItem));
}

std::string SelectedNames(const CMultiTree& tree)
{
    std::string names;
    for (HTREEITEM h = tree.GetRootItem(); h != NULL; h = tree.GetNextVisibleItem(h))
    {
        if (tree.IsSelected(h))
        {
            if (!names.empty())
                names += ' ';
            names += ItemName(tree, h);
        }
    }
    return names;
}

void CTestTree::OnItemSelected(HTREEITEM hItem, bool bSelected)
{
    if (!m_hookTrace.empty())
        m_hookTrace += ' ';
    m_hookTrace += (bSelected ? '+' : '-');
    m_hookTrace += ItemName(*this, hItem);
}

/////////////////////////////////////////////////////////////////////////////
// CRecordingParent

BOOL CRecordingParent::CreateParent(int x, int y, int cx, int cy)
{
    LPCTSTR cls = AfxRegisterWndClass(0, ::LoadCursor(NULL, IDC_ARROW), (HBRUSH)(COLOR_WINDOW + 1));
    return CreateEx(0, cls, _T("tree test"), WS_POPUP | WS_VISIBLE | WS_CLIPCHILDREN, x, y, cx, cy, NULL, NULL);
}

BOOL CRecordingParent::OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    const NMHDR* pHdr = reinterpret_cast<const NMHDR*>(lParam);
    const bool fromTree = m_pTree != nullptr && pHdr->hwndFrom == m_pTree->m_hWnd;
    if (fromTree && CodeName(pHdr->code) != nullptr)
    {
        Record r = {};
        r.code = pHdr->code;
        r.emulated = m_pTree->IsEmulatedNotify() != FALSE;
        if (CarriesItems(pHdr->code))
        {
            const NMTREEVIEW* pNM = reinterpret_cast<const NMTREEVIEW*>(lParam);
            r.oldName = ItemName(*m_pTree, pNM->itemOld.hItem);
            r.newName = ItemName(*m_pTree, pNM->itemNew.hItem);
            r.newMask = pNM->itemNew.mask;
            r.newParam = pNM->itemNew.lParam;
            r.ptDrag = pNM->ptDrag;
        }
        m_records.push_back(r);
        if (pHdr->code == NM_CLICK || pHdr->code == NM_RCLICK)
            m_selectionAtClick.push_back(SelectedNames(*m_pTree));
        if (pHdr->code == TVN_SELCHANGINGW && m_hVeto != NULL)
        {
            const NMTREEVIEW* pNM = reinterpret_cast<const NMTREEVIEW*>(lParam);
            if (pNM->itemNew.hItem == m_hVeto || pNM->itemOld.hItem == m_hVeto)
            {
                *pResult = TRUE;
                return TRUE;
            }
        }
    }
    // The framework reflects the notification to the tree first (collapse handling).
    return CWnd::OnNotify(wParam, lParam, pResult);
}

LRESULT CRecordingParent::WindowProc(UINT message, WPARAM wParam, LPARAM lParam)
{
    if (message == kProbeMessage)
    {
        m_probes.push_back(m_pTree != nullptr ? SelectedNames(*m_pTree) : std::string());
        return 0;
    }
    if (message == kCaptureMessage)
    {
        ::SetCapture(reinterpret_cast<HWND>(wParam));
        return 0;
    }
    return CWnd::WindowProc(message, wParam, lParam);
}

std::string CRecordingParent::Trace() const
{
    std::string trace;
    for (const Record& r : m_records)
    {
        if (!trace.empty())
            trace += ' ';
        if (r.emulated)
            trace += '*';
        trace += CodeName(r.code);
        if (!r.oldName.empty() || !r.newName.empty())
        {
            trace += ':';
            if (!r.oldName.empty())
                trace += "-" + r.oldName;
            if (!r.newName.empty())
                trace += "+" + r.newName;
        }
    }
    return trace;
}

const CRecordingParent::Record* CRecordingParent::Last(UINT code) const
{
    for (auto it = m_records.rbegin(); it != m_records.rend(); ++it)
    {
        if (it->code == code)
            return &*it;
    }
    return nullptr;
}

/////////////////////////////////////////////////////////////////////////////
// TreeFixture

void TreeFixture::SetUpTestSuite()
{
    orvane_test::LoadLibraryOnce();
}

void TreeFixture::SetUp()
{
    ASSERT_TRUE(m_parent.CreateParent(60, 60, 320, 420));
    m_parent.m_pTree = &m_tree;
    CreateTree();
}

void TreeFixture::TearDown()
{
    m_tree.DestroyWindow();
    m_parent.DestroyWindow();
    orvane_test::PumpUntilIdle(50);
}

void TreeFixture::CreateTree(DWORD extraStyle)
{
    if (m_tree.m_hWnd != NULL)
        m_tree.DestroyWindow();
    m_items.clear();
    CRect rc;
    m_parent.GetClientRect(&rc);
    rc.DeflateRect(10, 10);
    ASSERT_TRUE(m_tree.Create(kBaseStyle | extraStyle, rc, &m_parent, kTreeId));
}

void TreeFixture::Build(const char* spec)
{
    std::vector<HTREEITEM> parents;   // parents[level] = last item at that level
    std::istringstream lines(spec);
    std::string line;
    LPARAM data = 100;
    m_tree.SetRedraw(FALSE);
    while (std::getline(lines, line))
    {
        size_t level = line.find_first_not_of(' ');
        if (level == std::string::npos)
            continue;
        const std::string name = line.substr(level);
        HTREEITEM hParent = level == 0 ? TVI_ROOT : parents.at(level - 1);
        CString text(name.c_str());
        HTREEITEM h = m_tree.InsertItem(TVIF_TEXT | TVIF_PARAM, text, 0, 0, 0, 0, data++, hParent, TVI_LAST);
        m_items[name] = h;
        parents.resize(level + 1);
        parents[level] = h;
    }
    for (auto& entry : m_items)
    {
        if (m_tree.ItemHasChildren(entry.second))
            m_tree.Expand(entry.second, TVE_EXPAND);
    }
    m_tree.SetRedraw(TRUE);
    m_tree.UpdateWindow();
    m_parent.ClearTrace();
}

void TreeFixture::BuildFlat(int count)
{
    std::string spec;
    for (int i = 0; i < count; ++i)
        spec += "I" + std::to_string(i) + "\n";
    Build(spec.c_str());
}

std::vector<std::string> TreeFixture::Names(const std::string& list) const
{
    std::istringstream words(list);
    std::vector<std::string> names;
    for (std::string name; words >> name;)
        names.push_back(name);
    return names;
}

HTREEITEM TreeFixture::Item(const std::string& name) const
{
    auto it = m_items.find(name);
    return it == m_items.end() ? NULL : it->second;
}

void TreeFixture::Arrange(const std::vector<std::string>& selected, const std::string& caret)
{
    m_tree.CTreeCtrl::SelectItem(caret.empty() ? NULL : Item(caret));
    for (auto& entry : m_items)
    {
        bool want = false;
        for (const std::string& name : selected)
            want = want || name == entry.first;
        m_tree.CTreeCtrl::SetItemState(entry.second, want ? TVIS_SELECTED : 0, TVIS_SELECTED);
    }
    m_tree.SetAnchor(NULL);
    m_tree.UpdateWindow();
    m_parent.ClearTrace();
    m_parent.m_selectionAtClick.clear();
    m_parent.m_probes.clear();
    m_tree.m_hookTrace.clear();
}

CPoint TreeFixture::LabelPoint(const std::string& name) const
{
    CRect rc;
    EXPECT_TRUE(m_tree.GetItemRect(Item(name), &rc, TRUE)) << name;
    return rc.CenterPoint();
}

CPoint TreeFixture::RightOfLabel(const std::string& name) const
{
    CRect rc;
    EXPECT_TRUE(m_tree.GetItemRect(Item(name), &rc, TRUE)) << name;
    return CPoint(rc.right + 20, rc.CenterPoint().y);
}

CPoint TreeFixture::PointWithHit(const std::string& name, UINT hitFlag) const
{
    // Scan the item's row left of the label for the area the tree reports.
    CRect rc;
    EXPECT_TRUE(m_tree.GetItemRect(Item(name), &rc, TRUE)) << name;
    const int y = rc.CenterPoint().y;
    for (int x = 0; x < rc.left; ++x)
    {
        UINT flags = 0;
        if (m_tree.HitTest(CPoint(x, y), &flags) == Item(name) && (flags & hitFlag))
            return CPoint(x + 2, y);   // a little inside the area
    }
    ADD_FAILURE() << "no hit area " << hitFlag << " on " << name;
    return CPoint(0, y);
}

void TreeFixture::PointCursorAt(CPoint client)
{
    CPoint screen = client;
    m_tree.ClientToScreen(&screen);
    ::SetCursorPos(screen.x, screen.y);
    orvane_test::PumpUntilIdle(50);
}

void TreeFixture::PostMove(CPoint pt, UINT keys)
{
    m_tree.PostMessage(WM_MOUSEMOVE, keys, MAKELPARAM(pt.x, pt.y));
}

void TreeFixture::PostButtonUp(CPoint pt, UINT keys, UINT message)
{
    m_tree.PostMessage(message, keys, MAKELPARAM(pt.x, pt.y));
}

void TreeFixture::SendButtonDown(CPoint pt, UINT keys)
{
    PressWatchdog watchdog;
    m_tree.SendMessage(WM_LBUTTONDOWN, keys, MAKELPARAM(pt.x, pt.y));
}

void TreeFixture::Click(CPoint pt, UINT keys)
{
    PointCursorAt(pt);
    PostButtonUp(pt, keys & ~(MK_LBUTTON | MK_RBUTTON));
    SendButtonDown(pt, keys | MK_LBUTTON);
    orvane_test::PumpUntilIdle(50);
}

} // namespace tree_test
