#!/usr/bin/python3
"""compare.py BEFORE AFTER FILE [ROUNDS]: two builds of hdkv side by side, loading and saving a file and a small one.

They take turns, so that whatever else the machine does meets both. Prints the medians of the time that passes and of
the time of the processor, and their ratio; exits with 1 when the processor's is above the limit.

    bench/compare.py before/build/release/bin/hdkv build/release/bin/hdkv million.hdkv 15
"""
import os
import shutil
import statistics
import subprocess
import sys
import tempfile
import time

LIMIT = 1.05
SMALL = os.path.join(os.path.dirname(os.path.abspath(__file__)), '../examples/river/river.HDKV')
COMMANDS = {'load': lambda file, number: ('get', file, 'G_waterlevel'),
            'load and save': lambda file, number: ('set', file, 'G_waterlevel', str(number))}


def seconds(hdkv, words):
    """How long a run takes, and how long it keeps the processor busy."""
    begin = time.perf_counter()
    program = subprocess.Popen([hdkv, *words], stdout=subprocess.DEVNULL)
    _, status, usage = os.wait4(program.pid, 0)
    passed = time.perf_counter() - begin
    program.returncode = os.waitstatus_to_exitcode(status)
    if program.returncode != 0:
        sys.exit(f'{hdkv} {words} ends with {program.returncode}')
    return passed, usage.ru_utime + usage.ru_stime


def compare(programs, file, command, rounds, folder):
    """Of each program the two medians."""
    times = {program: [] for program in programs}
    for number in range(1, rounds + 1):
        for program in programs if number % 2 else programs[::-1]:
            copy = os.path.join(folder, 'copy.hdkv')
            shutil.copyfile(file, copy)
            os.utime(copy, (1e9, 1e9))  # nobody has just written it
            os.sync()
            times[program].append(seconds(program, COMMANDS[command](copy, number)))
    return [tuple(map(statistics.median, zip(*times[program]))) for program in programs]


def main():
    if len(sys.argv) not in (4, 5):
        sys.exit(__doc__)
    before, after, file, rounds = *map(os.path.abspath, sys.argv[1:4]), int((*sys.argv[4:], 15)[0])
    print(f'{"":24} {"passes (before, after)":>28} {"processor (before, after)":>30}')
    is_slow = False
    with tempfile.TemporaryDirectory(dir=os.path.dirname(file)) as folder:
        for each, count in ((file, rounds), (SMALL, 10 * rounds)):
            for command in COMMANDS:
                old, new = compare((before, after), each, command, count, folder)
                columns = [f'{a * 1000:8.1f} {b * 1000:8.1f} ms {b / a:6.3f}' for a, b in zip(old, new)]
                print(f'{os.path.basename(each)[:12]:12} {command:13}', *columns, sep='  ')
                is_slow = is_slow or new[1] > LIMIT * old[1]
    return 1 if is_slow else 0


if __name__ == '__main__':
    sys.exit(main())
