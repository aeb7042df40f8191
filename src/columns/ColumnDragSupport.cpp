// The column drags' drop source and the reading of dropped columns.
#include "ColumnDragSupport.h"

#include "ColumnPayload.h"
#include "KVXColumnInfo.h"
#include "KVXHeaderCtrlClipboardFormats.h"

#include <memory>

ColumnDropSource::ColumnDropSource(HWND hWndSource)
    : m_hWndSource(hWndSource)
{
}

SCODE ColumnDropSource::QueryContinueDrag(BOOL bEscapePressed, DWORD dwKeyState)
{
    if (!::IsWindow(m_hWndSource))
        return DRAGDROP_S_CANCEL;
    return COleDropSource::QueryContinueDrag(bEscapePressed, dwKeyState);
}

bool IsStillAttached(HWND hWnd, const CWnd* pWnd)
{
    return hWnd != NULL && ::IsWindow(hWnd) && CWnd::FromHandlePermanent(hWnd) == pWnd;
}

bool ReadDroppedColumn(COleDataObject* pDataObject, KVXColumnInfo& column, bool* pbSortedColumn)
{
    const CLIPFORMAT cfColumn = static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem);
    std::unique_ptr<CFile> pFile(pDataObject->GetFileData(cfColumn));
    if (pFile == NULL)
        return false;

    // No more than the longest record and its flag is read, however long the data.
    BYTE bytes[ColumnPayload::kMaxPayloadBytes];
    UINT nRead = 0;
    while (nRead < sizeof bytes)
    {
        const UINT n = pFile->Read(bytes + nRead, static_cast<UINT>(sizeof bytes) - nRead);
        if (n == 0)
            break;
        nRead += n;
    }
    pFile.reset();

    const ColumnPayload::Check check = ColumnPayload::CheckPayload(bytes, nRead);
    if (check.verdict != ColumnPayload::Valid || (pbSortedColumn != NULL && !check.hasFlag))
        return false;
    CMemFile record(bytes, static_cast<UINT>(check.recordSize));
    column.Read(&record);
    if (pbSortedColumn != NULL)
        *pbSortedColumn = check.flag;
    return true;
}

std::vector<int> HeaderItemWidths(CHeaderCtrl* pHeader)
{
    std::vector<int> widths;
    const int nCount = pHeader->GetItemCount();
    for (int i = 0; i < nCount; ++i)
    {
        HDITEM item = {};
        item.mask = HDI_WIDTH;
        if (!pHeader->GetItem(i, &item))
            break;
        widths.push_back(item.cxy);
    }
    return widths;
}
