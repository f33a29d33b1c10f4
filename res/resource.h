// Resource numbers of the plug-in: string table entries 1 to 33, dialogs, bitmaps. Read by the
// resource compiler and by C++ alike, so it holds plain #defines only.
#pragma once

// String table. Numbers not listed here are kept free for the texts of later tools.
#define IDS_NO_EVENT_CONNECTION 1
#define IDS_HELP_FILE 2
#define IDS_CONTOUR_BUTTON 3
#define IDS_IMPORT_BUTTON 4
#define IDS_POLYLINE_ENTRY 6
#define IDS_POLYGON_ENTRY 7
#define IDS_SURVEY_FILTER 8
#define IDS_READ_FAILED 9
#define IDS_INSERT_POINTS 10
#define IDS_EDIT_GROUP_IMPORT 11
#define IDS_PROGRESS_TITLE 12
#define IDS_PROGRESS_PLOT 13
#define IDS_PROGRESS_TERRAIN 14
#define IDS_CONVERT_CONTOUR 15
#define IDS_END_WIZARD 16
#define IDS_SETTINGS_FILE 17
#define IDS_SETTINGS_SECTION 18
#define IDS_KEY_HEIGHT 19
#define IDS_KEY_SEGLEN 20
#define IDS_KEY_INTERPOL 21
#define IDS_EDIT_GROUP_CONTOUR 22
#define IDS_CACHE_FILE 23
#define IDS_PROGRESS_HEIGHT_POINTS 24
#define IDS_PROGRESS_OBJECTS 25
#define IDS_KEY_PATH 32

// Toolbar bitmaps, 20 x 20 pixels, 16 colours.
#define IDB_IMPORT 1001
#define IDB_CONTOUR 1002
#define IDB_POLYGON 1016
