// Resource ids of Lumvex1.arx, shared by Lumvex1.rc and the module's code.
// Plain #defines only: the resource compiler reads this file too.
#pragma once

// ---- Resources --------------------------------------------------------------------------
#define IDD_ABOUTBOX            100   // about box, CAboutDlgArx
#define IDR_MAINFRAME           128   // frame: menu, accelerators, title string, icon, top tool bar
#define IDR_LOADING_CURSOR      131   // animated hourglass of the folder tree's loading effect
#define IDD_FOLDER_SETTINGS     136   // folder settings, CDialogSetLa
#define IDD_DIALOG_RUN          200   // hidden host dialog, CDialogRun
#define IDR_TOOLBAR_BOTTOM      204   // accept and cancel buttons
#define IDR_TILE_MENU           208   // context menu of a thumbnail tile
#define IDI_ABOUT               221   // icon of the about box

// Tool bar resources are custom data of this type (WORD version 1, width, height, count, ids).
#define RT_TOOLBAR_TYPE         241

// ---- Commands of the explorer ---------------------------------------------------------
#define ID_VIEW_BEGIN           32771 // scroll to the first row, sorted anew
#define ID_VIEW_INCREASE        32774 // larger pictures
#define ID_VIEW_DECREASE        32775 // smaller pictures
#define ID_VIEW_ALIGNE          32782 // fit the frame to whole tiles
#define ID_SORT_BY_DATE         32788
#define ID_SORT_BY_SIZE         32789
#define ID_SEARCH_BOX           32790 // top tool bar slot under the search box
#define ID_MARK_ALL             32793 // Ctrl+A: mark every drawing
#define ID_CLEAR_FOCUSED_EDIT   32794 // Delete: clear the selection of the focused caption box
#define ID_BROWSE_ACCEPT        32795 // bottom tool bar: accept
#define ID_BROWSE_CANCEL        32796 // bottom tool bar: cancel
#define ID_TILE_COPY            32797
#define ID_SORT_BY_NAME         32799
#define ID_TILE_DELETE          32800
#define ID_TILE_PASTE           32801
#define ID_TILE_RENAME          32802
#define ID_TILE_PROPERTY        32803
#define ID_SEARCH_LABEL         32804 // top tool bar slot under the "Search:" label
#define ID_LAYER_LABEL          32805 // top tool bar slot under the layer label

// ---- Controls of the folder settings dialog --------------------------------------------
#define IDC_COLOR_SWATCH        200   // CStaticColor
#define IDC_LISP_COMMAND        201
#define IDC_LAYER_NAME          1017
#define IDC_USE_CURRENT_LAYER   1081

#ifndef IDC_STATIC
#define IDC_STATIC              (-1)
#endif

// ---- Ids of the window framework (the class library's documented values) ---------------
#define ID_SEPARATOR            0

#define AFX_IDS_APP_TITLE       0xE000
#define AFX_IDS_IDLEMESSAGE     0xE001

#define ID_FILE_NEW             0xE100
#define ID_FILE_OPEN            0xE101
#define ID_FILE_SAVE            0xE103
#define ID_FILE_PRINT           0xE107
#define ID_FILE_PRINT_DIRECT    0xE108
#define ID_FILE_PRINT_PREVIEW   0xE109

#define ID_EDIT_COPY            0xE122
#define ID_EDIT_CUT             0xE123
#define ID_EDIT_PASTE           0xE125
#define ID_EDIT_UNDO            0xE12B

#define ID_APP_ABOUT            0xE140
#define ID_APP_EXIT             0xE141
#define ID_HELP                 0xE146

#define ID_NEXT_PANE            0xE150
#define ID_PREV_PANE            0xE151

#define ID_INDICATOR_CAPS       0xE701
#define ID_INDICATOR_NUM        0xE702
#define ID_INDICATOR_SCRL       0xE703

#define AFX_IDW_TOOLBAR         0xE800
#define AFX_IDW_STATUS_BAR      0xE801
#define ID_VIEW_TOOLBAR         0xE800
#define ID_VIEW_STATUS_BAR      0xE801
#define AFX_IDW_PANE_FIRST      0xE900

#define AFX_IDS_SCSIZE          0xEF00
#define AFX_IDS_SCMOVE          0xEF01
#define AFX_IDS_SCMINIMIZE      0xEF02
#define AFX_IDS_SCMAXIMIZE      0xEF03
#define AFX_IDS_SCNEXTWINDOW    0xEF04
#define AFX_IDS_SCPREVWINDOW    0xEF05
#define AFX_IDS_SCCLOSE         0xEF06
#define AFX_IDS_SCRESTORE       0xEF12
#define AFX_IDS_SCTASKLIST      0xEF13
