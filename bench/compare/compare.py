#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Compares the tool with the plain archivers, job by job, in one go.

The corpora are made anew from their seed, on memory-backed storage where there is enough. For each
corpus and job the tool, ar and llvm-ar with their companions, and the program that does only what
can't be avoided take turns; what counts is the median. jobs.py says what the jobs are, and why
they are the same work for all. Then the tool and that program do them with a tenth and a third of
each corpus, to see how their processor time grows.

GNU's programs look for plugins beside themselves, and would hand each object to them; copies in
another place find none.

Prints Markdown, and says on standard error how far it is. `cmake --build --preset dev --target
compare` measures everything; to choose, run this file by hand (--help).
"""
import argparse
import datetime
import json
import os
import pathlib
import platform
import shutil
import subprocess
import sys
import tempfile

sys.dont_write_bytecode = True
import jobs  # noqa: E402
import measure  # noqa: E402
import report  # noqa: E402

# Of a corpus: itself, a library with and one without a table, the one that is worked on, and the
# one that takes its place.
COPIES = 5
PLUGIN_PROGRAMS = ("ar", "nm", "size")
OTHER_PROGRAMS = ("llvm-ar", "llvm-nm", "llvm-size")
MEMORY_BACKED = pathlib.Path("/dev/shm")
PARTS = (10, 3)


def parse_options(words):
    parser = argparse.ArgumentParser(description=__doc__.split("\n")[0])
    add = parser.add_argument
    add("--tool", required=True, type=pathlib.Path, help="the quarn to be measured")
    add("--parts", required=True, type=pathlib.Path,
        help="the folder with make_corpus, limit and run_once")
    add("--corpora", default="", help="their names, with commas; all of them if not given")
    add("--jobs", default="", help="likewise: " + ",".join(job.name for job in jobs.JOBS))
    add("--scale", default=1.0, type=float, help="the part of each corpus that is made")
    add("--seed", default=1, type=int)
    add("--repetitions", default=7, type=int)
    add("--work", type=pathlib.Path, help="the folder for the files; a new one is made in it")
    add("--json", type=pathlib.Path, help="all numbers go to this file")
    add("--markdown", type=pathlib.Path, help="the tables go to this file too")
    return parser.parse_args(words)


def chosen(names, known, what):
    wanted = names.split(",") if names else list(known)
    for name in wanted:
        if name not in known:
            sys.exit(f"compare: no {what} '{name}': there are {', '.join(known)}")
    return wanted


def say(text):
    print(text, file=sys.stderr, flush=True)


def find_programs(options, folder):
    """Paths by name: the tool, our own parts, and those of the peers that are there."""
    programs = {"tool": options.tool.resolve()}
    for part in ("make_corpus", "limit", "run_once"):
        programs[part] = (options.parts / part).resolve()
    folder.mkdir()
    for name in PLUGIN_PROGRAMS:
        if path := shutil.which(name):
            programs[name] = pathlib.Path(shutil.copy(os.path.realpath(path), folder / name))
    for name in OTHER_PROGRAMS:
        if path := shutil.which(name):
            programs[name] = pathlib.Path(path)
    return programs


def peer_versions(programs):
    def version(name):
        told = subprocess.run([programs[name], "--version"], stdout=subprocess.PIPE, check=True,
                              text=True).stdout.splitlines()
        return next(line.strip() for line in told if "version" in line or "GNU" in line)

    return {name: version(name) for name in report.PEERS if name in programs}


def known_corpora(make_corpus):
    """What the program says of each: objects, builds of a module, bytes."""
    lines = subprocess.run([make_corpus], stdout=subprocess.PIPE, check=True,
                           text=True).stdout.splitlines()
    rows = (line.split() for line in lines)
    return {name: {"objects": int(objects), "builds": int(builds), "bytes": int(size)}
            for name, objects, builds, size in rows}


def work_folder(options, needed):
    """Where there is enough room, in memory if possible."""
    candidates = [options.work] if options.work else [MEMORY_BACKED, tempfile.gettempdir()]
    for candidate in filter(os.path.isdir, candidates):
        if shutil.disk_usage(candidate).free >= needed:
            return tempfile.mkdtemp(prefix="quarn_compare.", dir=candidate)
    sys.exit(f"compare: no folder with {needed / 1e9:.1f} GB of room")


def storage_of(folder):
    """The type of the file system, from the mount with the longest matching path."""
    with open("/proc/mounts", encoding="utf-8") as mounts:
        rows = [line.split() for line in mounts]
    inside = [row for row in rows if f"{folder}/".startswith(row[1].rstrip("/") + "/")]
    return max(inside, key=lambda row: len(row[1]))[2]


def machine_facts(folder):
    with open("/proc/cpuinfo", encoding="utf-8") as facts:
        models = [line.split(":")[1].strip() for line in facts if line.startswith("model name")]
    return {"processor": models[0] if models else platform.machine(), "cores": os.cpu_count(),
            "kernel": platform.release(), "storage": storage_of(folder),
            "load": [os.getloadavg()[0]]}


class Comparison:
    def __init__(self, options, programs, folder):
        self.options = options
        self.programs = programs
        self.folder = folder
        self.runner = measure.Runner(programs, options.repetitions)
        wanted = chosen(options.jobs, [job.name for job in jobs.JOBS], "job")
        self.jobs = [job for job in jobs.JOBS if job.name in wanted]

    def compare(self, name, has_builds):
        """All there is to say of a corpus. Its files are there only meanwhile."""
        objects = self.folder / "objects"
        objects.mkdir()
        names = self.make_objects(name, objects)
        whole = self.make_workplace(names, objects)
        result = {"objects": len(names), "bytes": whole.bytes, "jobs": {}, "runs": {}}
        for job in self.jobs:
            say(f"{name}: {job.title}")
            figures = self.runner.measure(job, whole, ["tool", *report.PEERS, "limit"], has_builds)
            result["jobs"][job.name] = {program: each.medians()
                                        for program, each in figures.items()}
            result["runs"][job.name] = {program: vars(each) for program, each in figures.items()}
        whole.remove()
        result["growth"] = self.measure_growth(name, names, objects, result, has_builds)
        shutil.rmtree(objects)
        return result

    def make_objects(self, name, objects):
        say(f"{name}: making the objects")
        words = [self.programs["make_corpus"], name, str(self.options.seed),
                 str(self.options.scale), objects]
        return subprocess.run(words, stdout=subprocess.PIPE, check=True, text=True).stdout.split()

    def make_workplace(self, names, objects):
        workplace = jobs.Workplace(self.folder / "libraries", names, objects)
        workplace.make(self.programs["tool"])
        return workplace

    def measure_growth(self, corpus, names, objects, result, has_builds):
        """The exponents for each job, from the parts and the whole."""
        points = {job: {program: [(result["bytes"], medians[program]["processor"])]
                        for program in ("tool", "limit")}
                  for job, medians in result["jobs"].items() if job != "start-up"}
        for count in sorted({len(names) // part for part in PARTS} - {0, len(names)}):
            say(f"{corpus}: the first {count} objects")
            part = self.make_workplace(names[:count], objects)
            for job in self.jobs:
                if job.name in points:
                    figures = self.runner.measure(job, part, ["tool", "limit"], has_builds)
                    for program, each in figures.items():
                        point = part.bytes, each.medians()["processor"]
                        points[job.name][program].append(point)
            part.remove()
        return {job: {program: report.growth_exponent(each) for program, each in both.items()}
                for job, both in points.items()}


def compare_all(options, programs, corpora, folder):
    machine = machine_facts(folder)
    comparison = Comparison(options, programs, folder)
    results = {"date": datetime.date.today().isoformat(), "machine": machine,
               "peers": peer_versions(programs), "seed": options.seed, "scale": options.scale,
               "repetitions": options.repetitions,
               "corpora": {name: comparison.compare(name, facts["builds"] > 1)
                           for name, facts in corpora.items()}}
    machine["load"].append(os.getloadavg()[0])
    return results


def put_results(options, results):
    if options.json:
        options.json.write_text(json.dumps(results, indent=1) + "\n")
    text = report.markdown(results)
    if options.markdown:
        options.markdown.write_text(text)
    print(text, end="")


def main(words):
    options = parse_options(words)
    known = known_corpora(options.parts.resolve() / "make_corpus")
    corpora = {name: known[name] for name in chosen(options.corpora, known, "corpus")}
    largest = max(corpus["bytes"] * max(options.scale, 1 / corpus["objects"])
                  for corpus in corpora.values())
    folder = pathlib.Path(work_folder(options, COPIES * largest))
    os.environ["LC_ALL"] = "C"
    try:
        put_results(options, compare_all(options, find_programs(options, folder / "programs"),
                                         corpora, folder))
    except (jobs.Failure, subprocess.CalledProcessError) as failure:
        sys.exit(f"compare: {failure}")
    finally:
        shutil.rmtree(folder)


if __name__ == "__main__":
    main(sys.argv[1:])
