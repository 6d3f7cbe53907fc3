target_sources(ShellFileOpTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/filecmd/ShellFileOp.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/WinApp.cpp)
