# The swatch's layer lookups against the development host's layer table.
target_sources(LayerColorTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/settings/StaticColor.cpp
  ${CMAKE_SOURCE_DIR}/src/host/TextConvert.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/Controls.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/Wnd.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/WinApp.cpp)
target_link_libraries(LayerColorTest PRIVATE comctl32)
