# The framework's controls and bars, with a resource script drawn over the module's
# own tool bar picture.
target_sources(FwControlsTest PRIVATE
  ${CMAKE_CURRENT_SOURCE_DIR}/FwControlsTest.rc
  ${CMAKE_SOURCE_DIR}/src/fw/Controls.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/Menu.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/StatusBar.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/ToolBar.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/FrameWnd.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/Wnd.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/WinApp.cpp)
target_include_directories(FwControlsTest PRIVATE
  $<$<COMPILE_LANGUAGE:RC>:${CMAKE_BINARY_DIR}/src/res/pictures>)
add_dependencies(FwControlsTest lumvex_pictures)
target_link_libraries(FwControlsTest PRIVATE comctl32)
