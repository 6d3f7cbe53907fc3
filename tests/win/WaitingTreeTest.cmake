# The waiting tree's loading protocol with both effects, on a tree control of its own.
target_sources(WaitingTreeTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/explorer/WaitingTreeCtrl.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/Controls.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/Wnd.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/WinApp.cpp)
target_link_libraries(WaitingTreeTest PRIVATE comctl32 winmm)
