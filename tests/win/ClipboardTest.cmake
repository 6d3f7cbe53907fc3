target_sources(ClipboardTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/filecmd/ForFileCommands.cpp
  ${CMAKE_SOURCE_DIR}/src/filecmd/SelectionCommands.cpp
  ${CMAKE_SOURCE_DIR}/src/filecmd/ShellFileOp.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/OleDataObject.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/OleDataSource.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/SharedFile.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/WinApp.cpp
  ${CMAKE_SOURCE_DIR}/src/host/TextConvert.cpp)
# The second process that reads the clipboard back.
add_executable(ClipboardTestReader ${CMAKE_CURRENT_SOURCE_DIR}/ClipboardTestReader.cpp)
target_link_libraries(ClipboardTestReader PRIVATE user32 shell32)
add_dependencies(ClipboardTest ClipboardTestReader)
