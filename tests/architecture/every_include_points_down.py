"""Fails on an include of a folder that does not stand below the including one, by ARCHITECTURE.md:
in the block that begins with app/ each line has folders of one height before what they are; in the
table of the engine's rooms each stands above what it may include, from the bottom up."""
import pathlib
import re
import sys

root = pathlib.Path(sys.argv[1])
text = (root / "ARCHITECTURE.md").read_text()
lines = re.search(r"^```\n(app/.*?)^```", text, re.S | re.M).group(1).splitlines()
folders = {folder: row for row, line in enumerate(lines)
           for folder in re.findall(r"(\w+)/(?=\s)", re.match(r"(\w+/\s+)*", line + " ").group())}
table = re.search(r"^\| room of `engine/`.*?\n\n", text, re.S | re.M).group()
rooms = {room: -row for row, room in enumerate(re.findall(r"^\| `(\w+)/`", table, re.M))}
wrong = 0
for base, depth in (root, folders), (root / "engine", rooms):
    for file in [*base.glob("*/**/*.h"), *base.glob("*/**/*.cpp")]:
        here = file.relative_to(base).parts[0]
        for there in re.findall(r'^#include "(\w+)/', file.read_text(), re.M):
            if here in depth and there != here and depth.get(there, 99) <= depth[here]:
                print(f"{file.relative_to(root)} includes {there}/, which does not stand below it")
                wrong += 1
print(f"{len(folders)} folders, {len(rooms)} rooms, {wrong} includes that do not point down")
sys.exit(wrong > 0 or len(folders) < 10 or len(rooms) < 7)
