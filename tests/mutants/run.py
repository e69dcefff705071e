#!/usr/bin/python3
"""run.py [check|ROOM|NUMBER...]: puts one fault after the other into the sources and sees whether a test notices.

Every fault of mutants.py replaces a text that stands in its file once; the room's test programs are built and run,
those that are quickest first, and the file gets its own text back. A fault that no test notices has survived: a test is
missing, or weaker than it looks. Works on build/dev, where everything is built already; by hand, for it takes a while.
`check` only looks whether the texts are there.
"""
import contextlib
import os
import subprocess
import sys
import time

from mutants import MUTANTS

ROOT = os.path.abspath(os.path.join(os.path.dirname(os.path.abspath(__file__)), '../..'))
BUILD = f'{ROOT}/build/dev'
PROGRAMS = {'tql': ['tql_test'], 'files': ['data_test'], 'data': ['data_test', 'cli_test'], 'cli': ['cli_test'], 'rules': ['rules_test'],
            'problems': ['problems_test'],
            'ks': ['ks_test', 'pages_test', 'shell_test'],
            'documents': ['shell_test', 'ks_test', 'module_test', 'cross_sections_test'],
            'grid': ['grid_test', 'pages_test', 'sheet_pages_test'],
            'document': ['pages_test', 'sheet_pages_test', 'module_test'], 'pages': ['pages_test', 'sheet_pages_test'],
            'module': ['module_test'], 'common': ['network_test', 'cross_sections_test'], 'network': ['network_test'],
            'plot': ['plot_test'], 'profile': ['profile_test'],
            'cross_sections': ['cross_sections_test'], 'shell': ['shell_test']}
MINUTES = 3  # a test that hangs has noticed, too


@contextlib.contextmanager
def fault(path, text, wrong):
    """The file with another text, while the block lasts."""
    with open(path, encoding='utf-8') as file:
        own = file.read()
    if own.count(text) != 1:
        raise ValueError(f'stands {own.count(text)} times in the file')
    try:
        write(path, own.replace(text, wrong))
        yield
    finally:
        write(path, own)


def write(path, text):
    with open(path, 'w', encoding='utf-8') as file:
        file.write(text)


def run(*command, minutes=None):
    return subprocess.run(command, cwd=ROOT, capture_output=True, text=True, timeout=minutes and 60 * minutes,
                          env={**os.environ, 'QT_QPA_PLATFORM': 'offscreen'}, errors='replace')


def notices(program):
    """The first test of the program that fails, if one does."""
    if run('ninja', '-C', BUILD, program).returncode:
        raise ValueError('does not compile')
    try:
        result = run(f'{BUILD}/bin/{program}', '--gtest_fail_fast', minutes=MINUTES)
    except subprocess.TimeoutExpired:
        return f'{program} hangs'
    if result.returncode == 0:
        return ''
    lines = result.stdout.splitlines()
    failed = next((line for line in lines if 'FAILED  ]' in line), None)
    return failed or f'{program} breaks off: ' + next((line for line in reversed(lines) if 'RUN  ' in line), '')


def stale():
    """The faults whose text does not stand in its file once."""
    for room, file, text, _ in MUTANTS:
        with open(f'{ROOT}/src/{file}', encoding='utf-8') as source:
            if (count := source.read().count(text)) != 1:
                yield f'{room}, {file}: {text!r} stands {count} times in the file'


def main():
    wanted = sys.argv[1:]
    if wanted == ['check']:
        print(*(found := list(stale())), sep='\n')
        return 1 if found else 0
    noticed, survived, unusable = 0, [], []
    for number, (room, file, text, wrong) in enumerate(MUTANTS, 1):
        if wanted and room not in wanted and str(number) not in wanted:
            continue
        start, said = time.monotonic(), ''
        name = f'{number} {room}, {file}: ' + ' '.join((wrong or 'without ' + text).split())
        try:
            with fault(f'{ROOT}/src/{file}', text, wrong):
                said = next(filter(None, map(notices, PROGRAMS[room])), '')
            noticed += bool(said)
            if not said:
                survived.append(name)
        except (ValueError, OSError) as error:
            said = str(error)
            unusable.append(name)
        print(f'{name}\n    {said or "SURVIVED"} ({time.monotonic() - start:.0f} s)', flush=True)
    print(f'{noticed} of {noticed + len(survived)} faults noticed')
    for title, names in (('survived', survived), ('no longer usable', unusable)):
        for name in names:
            print(f'{title}: {name}')
    return 1 if survived or unusable else 0


if __name__ == '__main__':
    sys.exit(main())
