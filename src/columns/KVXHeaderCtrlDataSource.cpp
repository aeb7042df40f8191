// KVXHeaderCtrlDataSource: rendering of a dragged column.
#include "KVXHeaderCtrlDataSource.h"

#include "KVXHeaderCtrlClipboardFormats.h"

KVXHeaderCtrlDataSource::KVXHeaderCtrlDataSource()
    : m_bSortedColumn(false)
{
}

KVXHeaderCtrlDataSource::~KVXHeaderCtrlDataSource()
{
}

void KVXHeaderCtrlDataSource::SetData(KVXColumnInfo& columnInfo, bool bSortedColumn)
{
    m_ColumnInfo = columnInfo;
    m_bSortedColumn = bSortedColumn;
}

BOOL KVXHeaderCtrlDataSource::OnRenderFileData(LPFORMATETC lpFormatEtc, CFile* pFile)
{
    if (lpFormatEtc == NULL || lpFormatEtc->cfFormat != KVXHeaderCtrlClipboardFormats::HeaderCtrlItem)
        return FALSE;
    m_ColumnInfo.Write(pFile);
    const BYTE flag = m_bSortedColumn ? 1 : 0;
    pFile->Write(&flag, 1);
    return TRUE;
}
