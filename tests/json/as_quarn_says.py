# SPDX-License-Identifier: Apache-2.0
"""Prints a document's only library in the words of `quarn -tv`, `--zs`, `--sizes` and `--entries`, one
after the other, so that they can be compared.
"""
import json
import sys
import time

library = json.load(sys.stdin)["libraries"][0]
members = library["members"]


def mode_text(mode):
    return "".join(letter if mode >> 8 - i & 1 else "-" for i, letter in enumerate("rwxrwxrwx"))


for member in members:
    date = time.strftime("%b %d %H:%M %Y", time.gmtime(member["date"]))
    print(f"{mode_text(member['mode'])}{member['uid']:>6}/{member['gid']:>6}{member['size']:>7} {date} "
          f"{member['name']} (offset {member['offset']:>6})")

for symbol in library["symbols"]:
    name = symbol["name"]
    if "attributes" in symbol:
        name += "$$BuildAttributes$" + symbol["attributes"]
    member = members[symbol["member"]]
    print(f"{name:<20} from {member['name']:<10} at offset {member['offset']:>6}")

COLUMNS = ("code", "readOnlyData", "readWriteData", "zeroInitialised", "debug")
objects = [member for member in members if member["kind"] == "object"]
print("\n      Code    RO Data    RW Data    ZI Data      Debug   Object Name")
rows = [[member["sizes"][column] for column in COLUMNS] for member in objects]
for row, name in zip(rows, [member["name"] for member in objects]):
    print(" ".join(f"{size:>10}" for size in row) + "   " + name)
print(" ".join(f"{sum(column):>10}" for column in zip(*rows)) + "   TOTAL\n")

entries = [(member, section) for member in objects for section in member["entrySections"]]
for member, section in entries:
    print(f"ENTRY at offset {member['entry']} in section {section['name']} of {member['name']}")
if not entries:
    print("No ENTRY points found.")
