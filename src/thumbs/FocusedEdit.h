// The edit box of the explorer that has the focus (a caption box or the search box), or null:
// the frame's Delete command clears its selected text and never touches a file.
#pragma once

#include "fw/Controls.h"

extern fw::CEdit *g_pFocusedEdit;
