# It drags the frame's size grip with real input: no other test may move the pointer meanwhile.
set_tests_properties(win_BottomBarPaintTest PROPERTIES RESOURCE_LOCK display)
