# The version the about box must name, from the same generated header as the resources.
target_include_directories(DialogLayoutTest PRIVATE ${LUMVEX_VERSION_DIR})
