#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Holds documents of many libraries against the published schema, with the public validator, and shows
that the schema refuses documents that are wrong: of a good one each field that is taken away, each that
is added, and each value of another type.
"""
import copy
import json
import os
import pathlib
import shutil
import subprocess
import sys
import tempfile
import unittest

import jsonschema

SCHEMA = json.loads(pathlib.Path(os.environ["QUARN_SCHEMA"]).read_text())
EXAMPLES = pathlib.Path(os.environ["QUARN_EXAMPLES"])
OBJECTS = pathlib.Path(os.environ["QUARN_OBJECTS"])
VALIDATOR = jsonschema.validators.validator_for(SCHEMA)(SCHEMA)

# Fields that are there only where there is something to say.
MAY_BE_MISSING = ("fileBytes", "nameBytes")
FOREIGN_MACHINE = b"\x3e\x00"


def run(*words):
    return subprocess.run(words, capture_output=True, check=False)


def document_of(*words):
    """The document, which is valid JSON without a name twice in an object."""
    def unique(pairs):
        names = [name for name, _ in pairs]
        assert len(names) == len(set(names)), names
        return dict(pairs)

    done = run("quarn-json", *words)
    assert done.returncode == 0, done.stderr
    return json.loads(done.stdout.decode("utf-8", "strict"), object_pairs_hook=unique)


def member(name, contents=b"", numbers=(b"0", b"0", b"0", b"100644")):
    fields = zip((name, *numbers, str(len(contents)).encode()), (16, 12, 6, 6, 8, 10))
    header = b"".join(field.ljust(width) for field, width in fields) + b"`\n"
    return header + contents + b"\n" * (len(contents) % 2)


def archive(*members):
    return b"!<arch>\n" + b"".join(members)


def patched(data, offset, piece):
    return data[:offset] + piece + data[offset + len(piece):]


class Folder(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp())
        self.addCleanup(shutil.rmtree, self.folder)
        before = os.getcwd()
        os.chdir(self.folder)
        self.addCleanup(os.chdir, before)

    def write(self, name, data):
        with open(name, "wb") as file:
            file.write(data)

    def assertFits(self, document):
        for error in VALIDATOR.iter_errors(document):
            self.fail(f"{error.json_path}: {error.message[:500]}")

    def assertRefused(self, document, what):
        self.assertFalse(VALIDATOR.is_valid(document), f"accepted: {what}")

    def rich(self):
        """A library of all there is: each kind of member, builds, and names that are no UTF-8."""
        plain = (EXAMPLES / "wide_plain.o").read_bytes()
        self.write("foreign.o", patched(plain, 18, FOREIGN_MACHINE))
        self.write("broken.o", plain[:-10])
        self.write("notes.txt", b"notes\n")
        self.write(b"odd\xff.o", (EXAMPLES / "matrix_debug.o").read_bytes())
        self.write("map", b"* $IEEE1\n")
        for name, text in (("one.o", "$ZEV_ISAv4$IEEE1"), ("two.o", "$ZEV_ISAv5$IEEE1")):
            done = run("llvm-objcopy", "--keep-global-symbol=wide_gcd", "--remove-section", ".ZEV.attributes",
                       "--add-symbol", f"BuildAttributes${text}=0,local", EXAMPLES / "wide_plain.o", name)
            self.assertEqual(done.returncode, 0, done.stderr)
        done = run("quarn", "--create", "rich.a", "foreign.o", "broken.o", "notes.txt", b"odd\xff.o",
                   "one.o", "two.o")
        self.assertEqual(done.returncode, 0, done.stderr)
        return document_of("--libattrmap=map", "rich.a")


class GoodDocuments(Folder):
    def test_schema_itself(self):
        type(VALIDATOR).check_schema(SCHEMA)

    def test_real_libraries(self):
        libraries = []
        for folder in (EXAMPLES, *sorted(OBJECTS.iterdir())):
            for kind in ("plain", "debug", "sections", "build_[a-d]", "*"):
                objects = sorted(folder.glob(f"*_{kind}.o"))
                if not objects:
                    continue
                libraries.append(f"{len(libraries)}.a")
                run("quarn", "--create", libraries[-1], *objects)
        self.assertGreater(len(libraries), 10)
        for options in ((), ("--qobix_buildattr",)):
            document = document_of(*options, *libraries)
            self.assertEqual(len(document["libraries"]), len(libraries))
            self.assertFits(document)

    def test_empty_libraries(self):
        self.write("nothing.a", archive())
        self.write("table.a", archive(member(b"/", b"\0\0\0\0")))
        self.assertFits(document_of("nothing.a", "table.a"))

    def test_each_kind_of_member(self):
        document = self.rich()
        self.assertFits(document)
        library = document["libraries"][0]
        self.assertEqual({row["kind"] for row in library["members"]},
                         {"file", "object", "foreign", "unreadable"})
        self.assertEqual(len(library["variantGroups"]), 1)
        self.assertIn("nameBytes", library["members"][3])
        self.assertTrue(any("attributes" in symbol for symbol in library["symbols"]))

    def test_names_of_any_byte(self):
        names = [bytes([byte]) * 3 for byte in range(1, 256) if byte not in b"\n /"]
        names += ["é", "漢字", "\U0001f370", "\ufffd", "\"\\", "\u2028"]
        names = [name if isinstance(name, bytes) else name.encode() for name in names]
        self.write("names.a", archive(*(member(name + b"/") for name in names)))
        self.write(b"odd\xfe.a", archive())
        document = document_of("names.a", b"odd\xfe.a")
        self.assertFits(document)
        found = [bytes.fromhex(row["nameBytes"]) if "nameBytes" in row else row["name"].encode()
                 for row in document["libraries"][0]["members"]]
        self.assertEqual(found, names)
        self.assertEqual(document["libraries"][1]["fileBytes"], b"odd\xfe.a".hex())

    def test_largest_numbers(self):
        numbers = (b"4294967295", b"999999", b"999999", b"37777777")
        self.write("large.a", archive(member(b"x/", b"", numbers)))
        document = document_of("large.a")
        self.assertFits(document)
        self.assertEqual(document["libraries"][0]["members"][0]["date"], 4294967295)

    def test_prefixes_and_changed_bytes(self):
        """A library that is damaged is read, and the document fits, or there is none."""
        self.rich()
        data = pathlib.Path("rich.a").read_bytes()
        documents = 0
        for at in range(0, len(data), 211):
            for name, damaged in (("cut.a", data[:at]), ("changed.a", patched(data, at, b"\xff"))):
                self.write(name, damaged)
                done = run("quarn-json", name)
                if done.returncode != 0:
                    self.assertEqual(done.stdout, b"", (name, at))
                    self.assertNotEqual(done.stderr, b"", (name, at))
                    continue
                self.assertFits(json.loads(done.stdout))
                documents += 1
        self.assertGreater(documents, 20)


def objects_in(value, path=()):
    """The way to each object in the document."""
    if isinstance(value, dict):
        yield path
    pairs = value.items() if isinstance(value, dict) else enumerate(value) if isinstance(value, list) else ()
    for key, inner in pairs:
        yield from objects_in(inner, (*path, key))


def at(document, path):
    for key in path:
        document = document[key]
    return document


class WrongDocuments(Folder):
    def changed(self, path, change):
        document = copy.deepcopy(self.document)
        change(at(document, path))
        return document

    def setUp(self):
        super().setUp()
        self.document = self.rich()
        # Of many alike some are enough.
        for library in self.document["libraries"]:
            library["symbols"] = [row for row in library["symbols"] if "attributes" in row] + library["symbols"][:2]
        self.assertFits(self.document)

    def test_field_is_missing(self):
        for path in objects_in(self.document):
            for key in at(self.document, path):
                if key in MAY_BE_MISSING or (path[-2:-1] == ("symbols",) and key == "attributes"):
                    continue
                self.assertRefused(self.changed(path, lambda row: row.pop(key)), f"{path} without {key}")

    def test_field_is_not_known(self):
        for path in objects_in(self.document):
            self.assertRefused(self.changed(path, lambda row: row.update(surprise=1)), f"{path} with more")

    def test_value_is_of_another_type(self):
        for path in objects_in(self.document):
            for key, value in at(self.document, path).items():
                wrong = 1.5 if not isinstance(value, (int, float)) or isinstance(value, bool) else "1"
                self.assertRefused(self.changed(path, lambda row: row.update({key: wrong})), f"{path} {key}")

    def test_value_is_out_of_range(self):
        def refuse(path, key, wrong):
            self.assertRefused(self.changed(path, lambda row: row.update({key: wrong})), f"{path} {key} {wrong}")

        refuse((), "formatVersion", 2)
        refuse((), "libraries", [])
        library = ("libraries", 0)
        refuse(library, "attributes", "ZEV")
        refuse(library, "symbolTable", None)
        for key in ("offset", "size", "date", "uid", "gid", "mode"):
            refuse((*library, "members", 0), key, -1)
            refuse((*library, "members", 0), key, 2 ** 32)
        refuse((*library, "members", 0), "kind", "ghost")
        refuse((*library, "members", 2), "kind", "object")
        refuse((*library, "members", 2), "entry", 0)
        refuse((*library, "members", 3), "nameBytes", "6")
        refuse((*library, "members", 3), "nameBytes", "FF")
        refuse((*library, "members", 3), "entry", 2 ** 64)
        refuse((*library, "symbols", 0), "member", -1)
        refuse((*library, "variantGroups", 0), "variants", [])
        refuse((*library, "variantGroups", 0, "variants", 0), "decoration", "$J")


if __name__ == "__main__":
    unittest.main(argv=[sys.argv[0]])
