"""Fails on an include of a folder that does not stand below the including one.

The order stands in ARCHITECTURE.md, in the block that begins with app/: each line has
folders of one height, ending in a slash, before what they are.
"""
import pathlib
import re
import sys

root = pathlib.Path(sys.argv[1])
text = (root / "ARCHITECTURE.md").read_text()
block = re.search(r"^```\n(app/.*?)^```", text, re.S | re.M).group(1)
height = {}
for row, line in enumerate(block.splitlines()):
    for folder in re.match(r"((?:\w+/\s+)*)", line + " ").group(1).split():
        height[folder.rstrip("/")] = -row

wrong = []
for file in sorted(path for path in root.glob("*/**/*") if path.suffix in (".h", ".cpp")):
    here = file.relative_to(root).parts[0]
    for there in re.findall(r'^#include "(\w+)/', file.read_text(), re.M) if here in height else ():
        if there != here and height.get(there, -99) >= height[here]:
            wrong.append(f"{file.relative_to(root)} includes {there}/, which does not stand below it")
print("\n".join(wrong) or f"{len(height)} folders, every include points down")
sys.exit(1 if wrong or len(height) < 10 else 0)
