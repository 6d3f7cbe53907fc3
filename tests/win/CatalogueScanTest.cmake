target_sources(CatalogueScanTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/catalogue/FolderScan.cpp
  ${CMAKE_SOURCE_DIR}/src/catalogue/Ombra3Doc.cpp
  ${CMAKE_SOURCE_DIR}/src/host/ModuleGlobals.cpp
  ${CMAKE_SOURCE_DIR}/src/host/TextConvert.cpp)
