#include "thumbs/FocusedEdit.h"

fw::CEdit *g_pFocusedEdit = nullptr;
