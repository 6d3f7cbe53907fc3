# Wine takes the ANSI code page from the process's locale: 932 under ja_JP.UTF-8.
set_tests_properties(win_DoubleByteTreeTest PROPERTIES ENVIRONMENT "LC_ALL=ja_JP.UTF-8")
