# SPDX-License-Identifier: Apache-2.0
"""The measured numbers as ratios, exponents of growth, and tables in Markdown."""
import math

import jobs

PEERS = ("ar", "llvm-ar")


def ratios(medians, kind="wall"):
    """The tool's time over the faster peer's, None without one, and over the limit program's."""
    times = {program: each[kind] for program, each in medians.items()}
    peer = min((times[peer] for peer in PEERS if peer in times), default=None)
    return (times["tool"] / peer if peer else None, times["tool"] / times["limit"])


def growth_exponent(points):
    """The slope of the line through the logarithms of (size, time): 1 for linear growth."""
    logs = [(math.log(size), math.log(time)) for size, time in points if time > 0]
    if len(logs) < 2:
        return None
    middle = sum(x for x, _ in logs) / len(logs), sum(y for _, y in logs) / len(logs)
    spread = sum((x - middle[0]) ** 2 for x, _ in logs)
    if spread == 0:
        return None
    return sum((x - middle[0]) * (y - middle[1]) for x, y in logs) / spread


def number(value):
    return "–" if value is None else f"{value:.2f}"


def row(cells):
    return "| " + " | ".join(cells) + " |"


def table(head, rows):
    return "\n".join([row(head), row(["---"] + ["---:"] * (len(head) - 1)), *map(row, rows)])


def measured_jobs(results):
    return [job for job in jobs.JOBS
            if any(job.name in corpus["jobs"] for corpus in results["corpora"].values())]


def ratio_table(results, kind):
    def cell(corpus, job):
        medians = corpus["jobs"].get(job.name)
        return " / ".join(number(ratio) for ratio in ratios(medians, kind)) if medians else ""

    corpora = results["corpora"]
    return table(["job", *corpora],
                 [[job.title, *(cell(corpus, job) for corpus in corpora.values())]
                  for job in measured_jobs(results)])


def time_cell(medians, program):
    if program not in medians:
        return "–"
    each = medians[program]
    return f"{each['wall'] * 1e3:.1f} ({each['processor'] * 1e3:.1f}), {each['peak'] / 1024:.0f}"


def growth_cell(exponents):
    return " / ".join(number(exponents.get(program)) for program in ("tool", "limit"))


def corpus_table(corpus):
    programs = ["tool", *PEERS, "limit"]
    rows = []
    for job in jobs.JOBS:
        if medians := corpus["jobs"].get(job.name):
            rows.append([job.title, *(time_cell(medians, program) for program in programs),
                         growth_cell(corpus["growth"].get(job.name, {}))])
    return table(["job", *programs, "growth"], rows)


def markdown(results):
    """The whole report."""
    machine = results["machine"]
    loads = ", ".join(f"{load:.1f}" for load in machine["load"])
    parts = [
        f"Measured on {results['date']}: {machine['processor']}, {machine['cores']} cores, Linux "
        f"{machine['kernel']}, files on {machine['storage']}; processes ready to run, before and "
        f"after: {loads}. Peers: {'; '.join(results['peers'].values()) or 'none'}. Seed "
        f"{results['seed']}, scale {results['scale']:g}, medians of {results['repetitions']} "
        "rounds.",
        "Time of the tool over that of the faster peer / over that of the limit program. Peers "
        "tell more than the tool does under symbols.",
        ratio_table(results, "wall"),
        "The same of processor time, which other work on the machine disturbs less.",
        ratio_table(results, "processor"),
    ]
    for name, corpus in results["corpora"].items():
        parts.append(f"{name}: {corpus['objects']} objects, {corpus['bytes'] / 1e6:.0f} MB. "
                     "Milliseconds (of processor time), MiB at the most; growth is the exponent "
                     "of the bytes in the processor time, of the tool / of the limit program.")
        parts.append(corpus_table(corpus))
    return "\n\n".join(parts) + "\n"
