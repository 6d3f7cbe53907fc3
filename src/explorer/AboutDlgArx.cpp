#include "explorer/AboutDlgArx.h"

#include "res/resource.h"

CAboutDlgArx::CAboutDlgArx() : CDialog(IDD_ABOUTBOX) {}
