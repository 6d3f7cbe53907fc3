(setq x (list 1 2.5 "a\\b" (list "c"))) (cadr x)
