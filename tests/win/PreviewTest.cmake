# The drawings of the fixtures, seen through drive Z:.
target_compile_definitions(PreviewTest PRIVATE LUMVEX_FIXTURES_DIR="${CMAKE_SOURCE_DIR}/../shared/fixtures")
