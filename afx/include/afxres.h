// afxres.h - identifiers shared by resource scripts and code.
#pragma once

#ifndef __AFXRES_H__
#define __AFXRES_H__

#ifdef RC_INVOKED
#ifndef _INC_WINDOWS
#define _INC_WINDOWS
#include "winres.h"
#endif
#endif

#ifndef IDC_STATIC
#define IDC_STATIC              (-1)
#endif

// Standard command range
#define ID_HELP                 0xE146
#define ID_DEFAULT_HELP         0xE147
#define ID_CONTEXT_HELP         0xE145
#define ID_EDIT_CLEAR           0xE120
#define ID_EDIT_COPY            0xE122
#define ID_EDIT_CUT             0xE123
#define ID_EDIT_PASTE           0xE125
#define ID_EDIT_SELECT_ALL      0xE12A
#define ID_EDIT_UNDO            0xE12B
#define ID_APP_EXIT             0xE141
#define ID_APP_ABOUT            0xE140

// Application strings
#define AFX_IDS_APP_TITLE       0xE000
#define AFX_IDS_IDLEMESSAGE     0xE001

// Framework prompts (carried by the framework DLL)
#define AFX_IDP_INVALID_FILENAME    0xF100
#define AFX_IDP_FAILED_TO_OPEN_DOC  0xF101
#define AFX_IDP_INTERNAL_FAILURE    0xF108
#define AFX_IDP_COMMAND_FAILURE     0xF109
#define AFX_IDP_FAILED_MEMORY_ALLOC 0xF10A
#define AFX_IDP_PARSE_INT           0xF110
#define AFX_IDP_PARSE_REAL          0xF111
#define AFX_IDP_PARSE_INT_RANGE     0xF112
#define AFX_IDP_PARSE_REAL_RANGE    0xF113
#define AFX_IDP_PARSE_STRING_SIZE   0xF114
#define AFX_IDP_PARSE_RADIO_BUTTON  0xF115
#define AFX_IDP_PARSE_BYTE          0xF116
#define AFX_IDP_PARSE_UINT          0xF117

#endif // __AFXRES_H__
