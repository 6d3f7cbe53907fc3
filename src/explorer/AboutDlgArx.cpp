#include "explorer/AboutDlgArx.h"

#include "res/resource.h"

CAboutDlgArx::CAboutDlgArx(fw::CWnd *parent) : CDialog(IDD_ABOUTBOX, parent) {}
