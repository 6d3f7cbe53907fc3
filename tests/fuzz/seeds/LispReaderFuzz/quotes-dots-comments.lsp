'(a . (b 'c)) ;| block |; ; line comment
(nil t T NIL ())
