target_sources(FwSplitterTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/fw/SplitterWnd.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/View.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/ViewPrinting.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/FrameWnd.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/Wnd.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/WinApp.cpp)
target_link_libraries(FwSplitterTest PRIVATE comctl32 comdlg32)
