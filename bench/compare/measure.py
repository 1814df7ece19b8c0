# SPDX-License-Identifier: Apache-2.0
"""Running programs in turns and keeping what each run took."""
import dataclasses
import os
import statistics
import subprocess

import jobs

# A job that takes less than this is repeated so many times as often.
SHORT_SECONDS = 0.02
SHORT_FACTOR = 5


@dataclasses.dataclass
class Figures:
    """What the runs of one program at one job took: seconds, seconds, KiB."""

    wall: list = dataclasses.field(default_factory=list)
    processor: list = dataclasses.field(default_factory=list)
    peak: list = dataclasses.field(default_factory=list)

    def add(self, wall, processor, peak):
        self.wall.append(wall)
        self.processor.append(processor)
        self.peak.append(peak)

    def medians(self):
        return {field.name: statistics.median(getattr(self, field.name))
                for field in dataclasses.fields(self)}


class Runner:
    """Runs jobs. `programs` has the path of each program, by the name that a job calls it."""

    def __init__(self, programs, repetitions):
        self.programs = programs
        self.repetitions = repetitions

    def takes_part(self, job, program):
        return job.words[program][0] in self.programs

    def run(self, job, program, workplace, output=os.devnull):
        """One run, from the preparation on: seconds, seconds of processor time, KiB."""
        library = workplace.prepare(job)
        name, *options = job.words[program]
        words = [self.programs["run_once"], output, self.programs[name], *options, library,
                 *workplace.files(job)]
        errors = workplace.path("errors")
        with open(errors, "wb") as stream:
            told = subprocess.run(words, cwd=workplace.run_folder(job), stderr=stream,
                                  stdout=subprocess.PIPE, check=False, text=True).stdout.split()
        if len(told) != 4 or told[3] != "0":
            raise jobs.Failure(f"{program}: {job.name}: {errors.read_text()[:1000]}")
        return int(told[0]) / 1e6, int(told[1]) / 1e6, int(told[2])

    def run_checked(self, job, program, workplace):
        """One run whose outcome is looked at: its seconds, and a digest of its outcome."""
        output = workplace.path("output")
        seconds = self.run(job, program, workplace, output)[0]
        try:
            jobs.check(job, workplace, output)
        except jobs.Failure as failure:
            raise jobs.Failure(f"{program}: {job.name}: {failure}") from None
        return seconds, jobs.digest_of_result(job, workplace, output)

    def measure(self, job, workplace, programs, has_builds):
        """Runs the job in turns: Figures for each of the programs that take part."""
        programs = [program for program in programs if self.takes_part(job, program)]
        checked = {program: self.run_checked(job, program, workplace)
                   for program in programs}
        if "limit" in checked and not has_builds and checked["limit"][1] != checked["tool"][1]:
            raise jobs.Failure(f"limit: {job.name}: not what the tool does")
        is_short = checked["tool"][0] < SHORT_SECONDS
        figures = {program: Figures() for program in programs}
        for turn in range(self.repetitions * (SHORT_FACTOR if is_short else 1)):
            first = turn % len(programs)
            for program in programs[first:] + programs[:first]:
                figures[program].add(*self.run(job, program, workplace))
        return figures
