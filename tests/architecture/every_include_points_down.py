"""Fails on an include of a folder that does not stand below the including one, by the block of
ARCHITECTURE.md that begins with app/: each line has folders of one height before what they are."""
import pathlib
import re
import sys

root = pathlib.Path(sys.argv[1])
text = (root / "ARCHITECTURE.md").read_text()
lines = re.search(r"^```\n(app/.*?)^```", text, re.S | re.M).group(1).splitlines()
depth = {folder: row for row, line in enumerate(lines)
         for folder in re.findall(r"(\w+)/(?=\s)", re.match(r"(\w+/\s+)*", line + " ").group())}
wrong = 0
for file in [*root.glob("*/**/*.h"), *root.glob("*/**/*.cpp")]:
    here = file.relative_to(root).parts[0]
    for there in re.findall(r'^#include "(\w+)/', file.read_text(), re.M) if here in depth else ():
        if there != here and depth.get(there, 99) <= depth[here]:
            print(f"{file.relative_to(root)} includes {there}/, which does not stand below it")
            wrong += 1
print(f"{len(depth)} folders, {wrong} includes that do not point down")
sys.exit(wrong > 0 or len(depth) < 10)
