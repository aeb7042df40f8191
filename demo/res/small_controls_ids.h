// Bitmaps of the gallery's small-controls page (see make_small_controls_bitmaps.py).
#pragma once

#define IDB_SMALL_PLAY_NORMAL       3101
#define IDB_SMALL_PLAY_PRESSED      3102
#define IDB_SMALL_PLAY_DISABLED     3103
#define IDB_SMALL_BOLD_NORMAL       3111
#define IDB_SMALL_BOLD_PRESSED      3112
#define IDB_SMALL_BOLD_DISABLED     3113
#define IDB_SMALL_RECORD_NORMAL     3121
#define IDB_SMALL_RECORD_PRESSED    3122
#define IDB_SMALL_RECORD_DISABLED   3123
