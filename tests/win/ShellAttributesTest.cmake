# What the tree asks the shell about an item, against a folder of the test's own.
target_sources(ShellAttributesTest PRIVATE ${CMAKE_SOURCE_DIR}/src/explorer/ShellAttributes.cpp)
