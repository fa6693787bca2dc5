# SPDX-License-Identifier: Apache-2.0
"""Runs the tests of a module, or of a class in it, several at a time: these mostly wait for display ticks.

  python3 -B -m side_by_side test_monitor
"""

import io
import multiprocessing
import sys
import unittest

AT_A_TIME = 4


def names(suite):
    for part in suite:
        if isinstance(part, unittest.TestSuite):
            yield from names(part)
        else:
            yield part.id()


def run(name):
    """Whether the test passed, and what is to be told of it."""
    told = io.StringIO()
    test = unittest.defaultTestLoader.loadTestsFromName(name)
    result = unittest.TextTestRunner(stream=told, verbosity=2).run(test)
    return result.wasSuccessful(), told.getvalue()


def main(what):
    every = list(names(unittest.defaultTestLoader.loadTestsFromName(what)))
    # Each in a process of its own, forked when the modules are there.
    with multiprocessing.get_context("fork").Pool(AT_A_TIME, maxtasksperchild=1) as pool:
        passed = 0
        for is_passed, told in pool.imap_unordered(run, every):
            print(told, flush=True)
            passed += is_passed
    print(f"{passed} of {len(every)} passed")
    return 0 if every and passed == len(every) else 1


if __name__ == "__main__":
    sys.exit(main(sys.argv[1]))
