# Lists the streams of a compound file as Debian's python3-olefile sees them:
# one line per stream, "<name> <size>", names joined with "/" for nested storages.
import sys

import olefile

with olefile.OleFileIO(sys.argv[1]) as ole:
    for path in sorted(ole.listdir(streams=True, storages=False)):
        name = "/".join(path)
        print(name, ole.get_size(name))
