# The scroll bar's jump browses 100,000 drawings. Wine makes files in so large a folder slowly
# (each new name is compared with all the others), so they are made natively, once, empty.
add_custom_target(thumbview_test_folder
  COMMAND python3 ${CMAKE_CURRENT_SOURCE_DIR}/make_empty_drawings.py /tmp/lumvex-test-view-100k 100000)
add_dependencies(ThumbViewTest thumbview_test_folder)
