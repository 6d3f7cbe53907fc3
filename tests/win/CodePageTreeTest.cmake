# Wine takes the ANSI code page from the process's locale: 1251 under ru_RU.UTF-8, 932 under
# ja_JP.UTF-8. The program runs once under each.
set_tests_properties(win_CodePageTreeTest PROPERTIES ENVIRONMENT "LC_ALL=ru_RU.UTF-8")
add_test(NAME win_CodePageTreeTest932 COMMAND CodePageTreeTest)
set_tests_properties(win_CodePageTreeTest932 PROPERTIES ENVIRONMENT "LC_ALL=ja_JP.UTF-8" WORKING_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
