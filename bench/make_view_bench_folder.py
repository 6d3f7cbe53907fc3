#!/usr/bin/env python3
"""Makes the folder bench_thumbview browses: 100,000 drawings with real stored previews.

Usage: make_view_bench_folder.py SAMPLE_TOOL FOLDER

The sample tool writes 240 different drawings once; the 100,000 names are hard links to them,
so the folder costs the space of 240 files and a few seconds to make. The preview painter knows
drawings by path, so every name is a drawing of its own to it. A file "FOLDER.complete" beside
the folder says that it was finished.
"""

import os
import shutil
import subprocess
import sys

COUNT = 100_000
DISTINCT = 240


def main():
    tool, folder = sys.argv[1], sys.argv[2]
    if os.path.exists(folder + ".complete"):
        return
    source = folder + "-source"
    for path in (folder, source):
        shutil.rmtree(path, ignore_errors=True)
    subprocess.run([sys.executable, tool, source, str(DISTINCT), "--seed", "7"], check=True,
                   stdout=subprocess.DEVNULL)
    drawings = sorted(name for name in os.listdir(source) if name.lower().endswith(".dwg"))
    os.makedirs(folder)
    for i in range(COUNT):
        os.link(os.path.join(source, drawings[i % len(drawings)]), os.path.join(folder, "d%06d.dwg" % i))
    open(folder + ".complete", "w").close()


if __name__ == "__main__":
    main()
