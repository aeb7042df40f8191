// Resource numbers of the buttons tests' own bitmaps.
#pragma once

#define IDB_TEST_NORMAL         101
#define IDB_TEST_PRESSED        102
#define IDB_TEST_DISABLED       103
#define IDB_TEST_FACE_NORMAL    111
#define IDB_TEST_FACE_PRESSED   112
#define IDB_TEST_FACE_DISABLED  113
