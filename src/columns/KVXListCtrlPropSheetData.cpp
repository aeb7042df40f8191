// KVXListCtrlPropSheetData: the chooser settings of a column-customising list.
#include "KVXListCtrlPropSheetData.h"

KVXListCtrlPropSheetData::KVXListCtrlPropSheetData()
    : m_pHelpTarget(NULL), m_pfnDisplayHelp(NULL)
{
}

KVXListCtrlPropSheetData::~KVXListCtrlPropSheetData()
{
}
