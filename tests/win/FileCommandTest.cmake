target_sources(FileCommandTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/filecmd/ForFileCommands.cpp
  ${CMAKE_SOURCE_DIR}/src/filecmd/SelectionCommands.cpp
  ${CMAKE_SOURCE_DIR}/src/filecmd/ShellFileOp.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/OleDataObject.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/OleDataSource.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/SharedFile.cpp
  ${CMAKE_SOURCE_DIR}/src/fw/WinApp.cpp
  ${CMAKE_SOURCE_DIR}/src/host/TextConvert.cpp)
