target_sources(CatalogueDocumentTest PRIVATE
  ${CMAKE_SOURCE_DIR}/src/catalogue/Ombra3Doc.cpp
  ${CMAKE_SOURCE_DIR}/src/host/ModuleGlobals.cpp)
