# SPDX-License-Identifier: Apache-2.0
"""Libraries as the comparison looks at them: members, their bytes, and how many symbols there are."""
import dataclasses
import mmap

HEADER = 60


@dataclasses.dataclass(frozen=True)
class Member:
    name: str
    start: int  # of its bytes
    size: int


class Library:
    def __init__(self, path):
        self.path = path
        self.members = []
        self.symbols = 0
        self._long_names = b""
        with open(path, "rb") as file, mmap.mmap(file.fileno(), 0, access=mmap.ACCESS_READ) as text:
            position = 8
            while position < len(text):
                position = self._read_member(text, position)

    def contents(self, name):
        member = next(member for member in self.members if member.name == name)
        with open(self.path, "rb") as file:
            file.seek(member.start)
            return file.read(member.size)

    def _read_member(self, text, position):
        field = text[position:position + 16].decode().rstrip()
        start = position + HEADER
        size = int(text[position + 48:position + 58])
        if field == "/":
            self.symbols = int.from_bytes(text[start:start + 4], "big")
        elif field == "//":
            self._long_names = text[start:start + size]
        else:
            self.members.append(Member(self._name(field), start, size))
        return start + size + size % 2

    def _name(self, field):
        if not field.startswith("/"):
            return field[:-1]
        start = int(field[1:])
        return self._long_names[start:self._long_names.index(b"/\n", start)].decode()


def read(path):
    return Library(path)

