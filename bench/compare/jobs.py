# SPDX-License-Identifier: Apache-2.0
"""What is measured: the jobs, how each program is told to do one, and how we see that it did.

Every job is real work for every program:

- All of them work on the same bytes: copies of a library that the tool has written.
- Regenerating starts from a library without a symbol table. One with a table would do for some,
  but llvm-ar leaves such a library as it is.
- New libraries are made by appending ("q"): with "r", ar compares each file's name with all those
  in front of it. Replacing one is "r", on a library with a table, and the file differs from the
  member.
- What can be appended to is removed first, what is changed is copied first, and extraction starts
  in an empty folder; none of this is timed.
- Sizes are told by the archivers' companions, size and llvm-size, in their own format. The
  symbols of a library are told by nm and llvm-nm, which tell each member's symbols too: only the
  limit program does the same as the tool there.
- Before it is timed, each program does the job once, and what came of it is looked at. Of the
  limit program every byte must be that of the tool, but for libraries of builds of one module,
  whose decorations it leaves out.
"""
import dataclasses
import hashlib
import shutil
import subprocess

import libraries


@dataclasses.dataclass(frozen=True)
class Job:
    name: str
    title: str
    start: str  # "new", or which library is copied or only read: see Workplace.prepare
    files: str  # what stands behind the library: "none", "all", "first", "edited", "middle"
    words: dict  # for each program: itself and its options


def job(name, title, start, files, tool, ar, llvm, limit):
    words = {"tool": ["tool", *tool.split()], "ar": ar.split(), "llvm-ar": llvm.split(),
             "limit": ["limit", limit]}
    return Job(name, title, start, files, words)


# fmt: off
JOBS = (
    # name                   title                       start    files     tool                ar            llvm            limit
    job("create-no-table",   "create without a table",   "new",   "all",    "-c -n --create",   "ar qcSD",    "llvm-ar qcSD", "create-without-table"),
    job("create",            "create",                   "new",   "all",    "-c --create",      "ar qcD",     "llvm-ar qcD",  "create"),
    job("regenerate",        "regenerate the table",     "bare",  "none",   "-s",               "ar sD",      "llvm-ar sD",   "regenerate"),
    job("replace",           "replace one",              "whole", "edited", "-r",               "ar rD",      "llvm-ar rD",   "replace"),
    job("delete",            "delete one",               "whole", "middle", "-d",               "ar dD",      "llvm-ar dD",   "delete"),
    job("list",              "list",                     "read",  "none",   "-t",               "ar t",       "llvm-ar t",    "list"),
    job("list-long",         "list -v",                  "read",  "none",   "-tv",              "ar tv",      "llvm-ar tv",   "list-long"),
    job("extract",           "extract",                  "read",  "none",   "-x",               "ar x",       "llvm-ar x",    "extract"),
    job("sizes",             "sizes",                    "read",  "none",   "--sizes",          "size",       "llvm-size",    "sizes"),
    job("symbols",           "symbols (--zs)",           "read",  "none",   "--zs",             "nm -s",      "llvm-nm -M",   "symbols"),
    job("start-up",          "start-up: one object",     "new",   "first",  "-c --create",       "ar qcD",     "llvm-ar qcD",  "create"),
)
# fmt: on


class Failure(Exception):
    """A program failed, or did not do its job."""


class Workplace:
    """A folder with libraries of some of a corpus's objects, which lie in another folder.

    whole.a has a symbol table, bare.a has none; library.a is what a job writes. In the folder
    "edited" is the object in the middle with a byte more than the member has.
    """

    def __init__(self, folder, names, objects):
        self.folder = folder
        self.names = names
        self.objects = objects
        self.bytes = sum((objects / name).stat().st_size for name in names)
        self.middle = names[len(names) // 2]
        self.edited = folder / "edited" / self.middle
        self.extracted = folder / "extracted"

    def make(self, tool):
        self.folder.mkdir()
        for library, options in (("whole.a", ["-c"]), ("bare.a", ["-c", "-n"])):
            subprocess.run([tool, *options, "--create", self.folder / library, *self.names],
                           cwd=self.objects, stderr=subprocess.DEVNULL, check=True)
        self.edited.parent.mkdir()
        self.edited.write_bytes((self.objects / self.middle).read_bytes() + b"\0")

    def remove(self):
        shutil.rmtree(self.folder)

    def path(self, name):
        return self.folder / name

    def prepare(self, job):
        """Makes what the job starts from, and returns the library that it is to work on."""
        if job.name == "extract":
            shutil.rmtree(self.extracted, ignore_errors=True)
            self.extracted.mkdir()
        if job.start == "read":
            return self.path("whole.a")
        library = self.path("library.a")
        library.unlink(missing_ok=True)
        if job.start != "new":
            shutil.copyfile(self.path(job.start + ".a"), library)
        return library

    def run_folder(self, job):
        return self.extracted if job.name == "extract" else self.objects

    def files(self, job):
        """What stands behind the library on the command line."""
        return {"none": [], "all": self.names, "first": self.names[:1], "middle": [self.middle],
                "edited": [self.edited]}[job.files]


def check(job, workplace, output):
    """Raises Failure unless the program that has just run did the job."""
    if job.start != "read":
        _check_library(job, workplace)
    elif job.name == "extract":
        _check_extracted(workplace)
    else:
        _check_listing(job, workplace, output)


def _check_library(job, workplace):
    library = libraries.read(workplace.path("library.a"))
    expected = workplace.names[:1] if job.files == "first" else list(workplace.names)
    if job.name == "delete":
        expected.remove(workplace.middle)
    if [member.name for member in library.members] != expected:
        raise Failure("the library has other members than it should")
    if (library.symbols == 0) != (job.name == "create-no-table" or not expected):
        raise Failure(f"the library has a table of {library.symbols} symbols")
    if job.name == "replace" and library.contents(workplace.middle) != workplace.edited.read_bytes():
        raise Failure("the member has not been replaced")


def _check_extracted(workplace):
    sizes = {path.name: path.stat().st_size for path in workplace.extracted.iterdir()}
    expected = {name: (workplace.objects / name).stat().st_size for name in workplace.names}
    if sizes != expected:
        raise Failure("the extracted files are not the members")


def _check_listing(job, workplace, output):
    text = output.read_text()
    least = len(workplace.names)
    if job.name == "symbols":
        least = libraries.read(workplace.path("whole.a")).symbols
    elif missing := set(workplace.names).difference(text.split()):
        raise Failure(f"{min(missing)} is not told of")
    lines = text.count("\n")
    if lines < least:
        raise Failure(f"only {lines} lines instead of {least}")


def digest_of_result(job, workplace, output):
    """A digest of what the program has put out. Extraction puts out what has been checked."""
    digest = hashlib.sha256()
    if job.name != "extract":
        with open(output if job.start == "read" else workplace.path("library.a"), "rb") as file:
            while part := file.read(1 << 20):
                digest.update(part)
    return digest.hexdigest()
