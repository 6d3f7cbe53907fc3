#!/usr/bin/env python3
"""Makes a folder of COUNT empty drawings d000000.dwg, d000001.dwg, ... once.

Usage: make_empty_drawings.py FOLDER COUNT

The files are made beside the folder and renamed into place, so that builds running at the same
time never see half of them.
"""

import os
import shutil
import sys


def main():
    folder, count = sys.argv[1], int(sys.argv[2])
    if os.path.isdir(folder):
        return
    making = "%s.making-%d" % (folder, os.getpid())
    os.makedirs(making)
    for i in range(count):
        open(os.path.join(making, "d%06d.dwg" % i), "w").close()
    try:
        os.rename(making, folder)
    except OSError:  # made by another build meanwhile
        shutil.rmtree(making)


if __name__ == "__main__":
    main()
