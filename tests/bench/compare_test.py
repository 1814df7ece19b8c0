# SPDX-License-Identifier: Apache-2.0
"""The comparison's own arithmetic, and small runs of it: all jobs are done and looked at.

QUARN_COMPARE is the folder of the sources, QUARN_TOOL the tool, QUARN_PARTS the folder of what the
comparison runs beside it.
"""
import json
import os
import pathlib
import subprocess
import sys
import tempfile
import unittest

COMPARE = os.environ["QUARN_COMPARE"]
sys.dont_write_bytecode = True
sys.path.insert(0, COMPARE)
import jobs  # noqa: E402
import report  # noqa: E402


def medians(wall):
    return {"wall": wall, "processor": wall, "peak": 1}


def compare(folder, words, environment):
    """Runs a comparison of a few objects: its outcome as JSON, and what it printed."""
    numbers = pathlib.Path(folder) / "numbers.json"
    told = subprocess.run(
        [sys.executable, f"{COMPARE}/compare.py", "--tool", os.environ["QUARN_TOOL"], "--parts",
         os.environ["QUARN_PARTS"], "--work", folder, "--repetitions", "1", "--json", numbers,
         *words], env={**os.environ, **environment}, check=True, stdout=subprocess.PIPE, text=True)
    return json.loads(numbers.read_text()), told.stdout


class Arithmetic(unittest.TestCase):
    def test_the_ratio_is_to_the_faster_peer_and_to_the_limit(self):
        times = {"tool": medians(2.0), "ar": medians(8.0), "llvm-ar": medians(4.0),
                 "limit": medians(1.0)}
        self.assertEqual(report.ratios(times), (0.5, 2.0))

    def test_without_peers_there_is_only_the_limit(self):
        self.assertEqual(report.ratios({"tool": medians(3.0), "limit": medians(2.0)}), (None, 1.5))

    def test_growth_is_the_exponent_of_the_size(self):
        self.assertAlmostEqual(report.growth_exponent([(10, 3), (30, 9), (100, 30)]), 1)
        self.assertAlmostEqual(report.growth_exponent([(10, 1), (100, 100)]), 2)
        self.assertIsNone(report.growth_exponent([(10, 1)]))


class Runs(unittest.TestCase):
    def test_all_jobs_are_done_with_whatever_peers_there_are(self):
        with tempfile.TemporaryDirectory() as folder:
            results, text = compare(folder, ["--corpora", "small", "--scale", "0.001"], {})
            self.assertEqual(os.listdir(folder), ["numbers.json"])
        small = results["corpora"]["small"]
        self.assertEqual(small["objects"], 10)
        self.assertEqual(set(small["jobs"]), {job.name for job in jobs.JOBS})
        self.assertEqual(set(small["growth"]), {job.name for job in jobs.JOBS} - {"start-up"})
        for programs in small["jobs"].values():
            for figures in programs.values():
                self.assertTrue(all(value > 0 for value in figures.values()), figures)
        for job in jobs.JOBS:
            self.assertEqual(text.count(f"\n| {job.title} |"), 3)

    def test_every_corpus_can_be_measured_without_peers(self):
        with tempfile.TemporaryDirectory() as folder:
            results, _ = compare(folder, ["--scale", "0.0001"], {"PATH": "/nonexistent"})
        self.assertEqual(set(results["corpora"]), {"small", "cxx", "variants", "debug", "big"})
        self.assertEqual(results["peers"], {})

    def test_only_what_is_asked_for_is_measured(self):
        with tempfile.TemporaryDirectory() as folder:
            results, _ = compare(folder, ["--corpora", "variants", "--scale", "0.001", "--jobs",
                                          "list,create"], {"PATH": "/nonexistent"})
        self.assertEqual(list(results["corpora"]), ["variants"])
        self.assertEqual(list(results["corpora"]["variants"]["jobs"]), ["create", "list"])


if __name__ == "__main__":
    unittest.main()
