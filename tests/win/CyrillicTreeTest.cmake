# Wine takes the ANSI code page from the process's locale: 1251 under ru_RU.UTF-8.
set_tests_properties(win_CyrillicTreeTest PROPERTIES ENVIRONMENT "LC_ALL=ru_RU.UTF-8")
