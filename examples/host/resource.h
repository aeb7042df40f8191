// Resource identifiers of the host example.
#pragma once

#define IDD_HOST    100
#define IDC_COUNT   1001
#define IDC_COLOUR  1002
#define IDC_TREE    1003
