target_sources(StartShellPathTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/host/StartShellPath.cpp
  ${CMAKE_SOURCE_DIR}/src/host/TextConvert.cpp)
