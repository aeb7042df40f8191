// Resource numbers of the library's catalogue. Controls load these through the
// host's resource chain once the host has called LoadOrvaneControlsLibrary.
#pragma once

// String table
#define IDS_DRAGLISTCTRL_CAPTION    5100
#define IDS_COLOR                   5101
#define IDS_DOUBLE_OVERFLOW         5107
#define IDS_DOUBLE_UNDERFLOW        5108
#define IDS_NOT_A_NUMBER            5109
#define IDS_CANNOT_CONVERT          5110
#define IDS_LONG_NOT_IN_RANGE       5111
#define IDS_DOUBLE_SYNTAX           5112
#define IDS_DOUBLE_NOT_IN_RANGE     5113
#define IDS_MUST_BE_DECIMAL         5114
#define IDS_MUST_BE_BINARY          5115
#define IDS_MUST_BE_HEXADECIMAL     5116
#define IDS_BINARY_SYNTAX           5117
#define IDS_HEXADECIMAL_SYNTAX      5118
#define IDS_DECIMAL_SYNTAX          5119
#define IDS_LONG_OVERFLOW           5120
#define IDS_LONG_UNDERFLOW          5121

// Dialog templates
#define IDD_MY_PAGE                 5100
#define IDD_COLOR_POPUP             5103
#define IDD_COLUMNS_PAGE            5105

// Controls
#define IDC_COLUMNS_LIST            5101
#define IDC_COLOR_DUMMY             5102
#define IDC_COLOR_OTHER             5104

// Base of the in-place combo box control numbers
#define IDC_COMBO_BASE              5106

// Cursors
#define IDC_SLIDER_CURSOR           5100
