// Resource ids of Lumvex1.arx, shared by Lumvex1.rc and the module's code.
// Plain #defines only: the resource compiler reads this file too.
#pragma once

// ---- Resources --------------------------------------------------------------------------
#define IDD_ABOUTBOX 100         // about box, CAboutDlgArx
#define IDR_MAINFRAME 128        // frame: menu, accelerators, title string, icon, top tool bar
#define IDR_LOADING_CURSOR 131   // animated hourglass of the folder tree's loading effect
#define IDD_FOLDER_SETTINGS 136  // folder settings, CDialogSetLa
#define IDD_DIALOG_RUN 200       // hidden host dialog, CDialogRun
#define IDR_TOOLBAR_BOTTOM 204   // accept and cancel buttons
#define IDR_TILE_MENU 208        // context menu of a thumbnail tile
#define IDI_ABOUT 221            // icon of the about box

// Tool bar resources are custom data of this type (WORD version 1, width, height, count, ids).
#define RT_TOOLBAR_TYPE 241

// ---- Commands of the explorer ---------------------------------------------------------
#define ID_VIEW_BEGIN 32771     // scroll to the first row, sorted anew
#define ID_VIEW_INCREASE 32774  // larger pictures
#define ID_VIEW_DECREASE 32775  // smaller pictures
#define ID_VIEW_ALIGNE 32782    // fit the frame to whole tiles
#define ID_SORT_BY_DATE 32788
#define ID_SORT_BY_SIZE 32789
#define ID_SEARCH_BOX 32790          // top tool bar slot under the search box
#define ID_MARK_ALL 32793            // Ctrl+A: mark every drawing
#define ID_CLEAR_FOCUSED_EDIT 32794  // Delete: clear the selection of the focused caption box
#define ID_BROWSE_ACCEPT 32795       // bottom tool bar: accept
#define ID_BROWSE_CANCEL 32796       // bottom tool bar: cancel
#define ID_TILE_COPY 32797
#define ID_SORT_BY_NAME 32799
#define ID_TILE_DELETE 32800
#define ID_TILE_PASTE 32801
#define ID_TILE_RENAME 32802
#define ID_TILE_PROPERTY 32803
#define ID_SEARCH_LABEL 32804  // top tool bar slot under the "Search:" label
#define ID_LAYER_LABEL 32805   // top tool bar slot under the layer label

// ---- Controls of the folder settings dialog --------------------------------------------
#define IDC_COLOR_SWATCH 200  // CStaticColor
#define IDC_LISP_COMMAND 201
#define IDC_LAYER_NAME 1017
#define IDC_USE_CURRENT_LAYER 1081

#ifndef IDC_STATIC
#define IDC_STATIC (-1)
#endif

// ---- Ids of the window framework (the class library's values) ---------------------------
#include "fw/FrameworkIds.h"
