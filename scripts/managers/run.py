#!/usr/bin/python3
# SPDX-License-Identifier: MIT
"""Runs the desktop tests of a build under window managers, or those that write with an input method,
in turn, and prints a table of them.

    scripts/managers/run.py [--only REGEX] [--jobs 2] BUILD MANAGER|METHOD...

scripts/desktops installs and builds what is needed, and calls this. What a test that fails has said
is kept under BUILD/desktops/MANAGER.
"""
import argparse
import concurrent.futures
import fnmatch
import os
import pathlib
import re
import shutil
import subprocess
import sys
import tempfile
import time

ROOT = pathlib.Path(__file__).resolve().parent.parent.parent
TIME_LIMIT = 120  # seconds for one test; one that waits in vain gives up much earlier
INPUT_METHODS = 'ibus', 'fcitx5'
# What a person does with a window, and the tests that do it under each manager, kind by kind.
KINDS = {'whiteboard': 'board', 'annotation': 'layer', 'imageAnnotation': 'image'}
WALK = {
    'opened ten times at the asked frame, to the pixel': 'Opening.tenTimesEndsAtTheAskedFrameEachTime',
    'drawn on, and ended by END': 'Walk.drawnOnAndEnded',
    'a colour chosen in the popover': 'Walk.popoverChoosesAColour',
    'text written': 'Walk.textIsWritten',
    'the tool bar dragged, and brought back inside': 'Walk.barIsDraggedAndBroughtBackInside',
    'moved, its tool bar with it': 'FramedWalk.movedWithItsBar',
    'resized at every edge': 'FramedWalk.resizedAtEveryEdge',
    'minimised and restored': 'FramedWalk.minimisedAndRestored',
    'another program activated, the tool bar stays': 'Walk.anotherProgramIsActivatedAndTheBarStays',
}
# This one has no kind in its name: it is of the layer.
FULL_SCREEN = 'LayerAmongPrograms.isEndedWhileAFullScreenProgramIsActive'
PASSED, KNOWN, FAILED, ABSENT = 'passed', 'known', '**failed**', ''


def program_for(manager, build):
    name = 'penwick-test-input-methods' if manager in INPUT_METHODS else 'penwick-test-desktop'
    return build / 'tests/desktop' / name


def environment(manager):
    if manager in INPUT_METHODS:
        return dict(os.environ)
    return dict(os.environ, PENWICK_WINDOW_MANAGER=manager)


def tests_of(program, manager):
    """The tests that the program has under the manager, by their full names."""
    listed = subprocess.run([program, '--gtest_list_tests'], env=environment(manager), check=True,
                            capture_output=True, text=True).stdout
    suite = ''
    for line in listed.splitlines():
        name = line.split('#')[0].strip()
        if not line.startswith(' '):
            suite = name
        elif manager not in INPUT_METHODS or name.endswith(f'/{manager}'):
            yield suite + name


def row_of(test, manager):
    """The test's name without the manager, which is the same under each."""
    return re.sub(rf'/{manager}(_|$)', r'/\1', test).replace('/_', '/').rstrip('/')


def run(program, test, manager):
    """Returns whether it passed, and what it said."""
    with tempfile.TemporaryDirectory() as private:
        folders = {'HOME': 'home', 'XDG_RUNTIME_DIR': 'run'}
        for folder in folders.values():
            os.mkdir(os.path.join(private, folder), 0o700)
        variables = {name: os.path.join(private, folder) for name, folder in folders.items()}
        process = subprocess.Popen([program, f'--gtest_filter={test}'], text=True, errors='replace',
                                   stdout=subprocess.PIPE, stderr=subprocess.STDOUT,
                                   env=environment(manager) | variables | {'TMPDIR': private})
        try:
            said, _ = process.communicate(timeout=TIME_LIMIT)
        except subprocess.TimeoutExpired:
            process.kill()  # what it has started ends with it
            said, _ = process.communicate()
            said += f'\nit was ended after {TIME_LIMIT} s\n'
        return process.returncode == 0, said


def known_failures():
    """Pairs of a manager and a pattern of rows."""
    for line in (ROOT / 'scripts/managers/known.txt').read_text().splitlines():
        words = line.split('#')[0].split()
        if words:
            yield tuple(words)


def is_known(manager, row):
    return any(manager == known and fnmatch.fnmatchcase(row, pattern)
               for known, pattern in known_failures())


def run_all(program, manager, arguments):
    """What came of each row."""
    folder = arguments.build / 'desktops' / manager
    shutil.rmtree(folder, ignore_errors=True)
    folder.mkdir(parents=True)
    tests = [test for test in tests_of(program, manager) if re.search(arguments.only, test)]
    begin = time.monotonic()
    outcomes = {}
    with concurrent.futures.ThreadPoolExecutor(arguments.jobs) as pool:
        results = pool.map(lambda test: run(program, test, manager), tests)
        for test, (passed, said) in zip(tests, results):
            row = row_of(test, manager)
            outcomes[row] = PASSED if passed else KNOWN if is_known(manager, row) else FAILED
            if not passed:
                (folder / (row.replace('/', '.') + '.txt')).write_text(said)
                print(f'{manager}: {outcomes[row].strip("*")}: {row}', flush=True)
    print(f'{manager}: {len(tests)} tests in {time.monotonic() - begin:.0f} s', flush=True)
    return outcomes


def table(managers, outcomes):
    rows = dict.fromkeys(row for manager in managers for row in outcomes[manager])
    yield '| test | ' + ' | '.join(managers) + ' |'
    yield '|---|' + '---|' * len(managers)
    for row in rows:
        cells = [outcomes[manager].get(row, ABSENT) for manager in managers]
        yield f'| {row} | ' + ' | '.join(cells) + ' |'


def walk_cell(test, column):
    """The kinds for which the test passed, and those for which it did not."""
    outcomes = {word: next((outcome for row, outcome in column.items()
                            if row.endswith(f'/{test}/{kind}')), ABSENT)
                for kind, word in KINDS.items()}
    passed = [word for word, outcome in outcomes.items() if outcome == PASSED]
    missing = [word for word, outcome in outcomes.items() if outcome in (KNOWN, FAILED)]
    return ', '.join(passed + [f'**not {word}**' for word in missing])


def walk_table(managers, outcomes):
    """The table of kinds and doings by manager."""
    yield '| | ' + ' | '.join(managers) + ' |'
    yield '|---|' + '---|' * len(managers)
    for doing, test in WALK.items():
        yield f'| {doing} | ' + ' | '.join(walk_cell(test, outcomes[m]) for m in managers) + ' |'
    cells = []
    for manager in managers:
        found = next((outcome for row, outcome in outcomes[manager].items()
                      if row.endswith(f'/{FULL_SCREEN}')), ABSENT)
        cells.append('layer' if found == PASSED else '**not layer**' if found else '')
    yield '| a full-screen program beside the layer, END | ' + ' | '.join(cells) + ' |'


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument('--only', default='', metavar='REGEX')
    parser.add_argument('--jobs', type=int, default=2)
    parser.add_argument('build', type=pathlib.Path)
    parser.add_argument('managers', nargs='+')
    arguments = parser.parse_args()

    outcomes = {manager: run_all(program_for(manager, arguments.build), manager, arguments)
                for manager in arguments.managers}
    if not any(outcomes.values()):
        sys.exit('error: no test has such a name')
    lines = list(table(arguments.managers, outcomes))
    managers = [manager for manager in arguments.managers if manager not in INPUT_METHODS]
    if any(f'/{test}/' in row for manager in managers for row in outcomes[manager]
           for test in WALK.values()):
        lines = [*walk_table(managers, outcomes), '', *lines]
    (arguments.build / 'desktops/table.md').write_text('\n'.join(lines) + '\n')
    print('\n' + '\n'.join(lines))
    sys.exit(any(FAILED in column.values() for column in outcomes.values()))


if __name__ == '__main__':
    main()
