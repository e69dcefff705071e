#!/usr/bin/python3
"""run.py [all] [KIND...]: saves files while calls of the system fail or the program is killed, and sees that nothing is
lost.

    KVR_BIN=build/dev/bin KVR_FAULT_CALLS=build/dev/tests/faults/libfault_calls.so tests/faults/run.py

Without `all`, a sample of the points. Kinds are hdkv and, in the shell, moor.HDKV, moor.kvnw, moor.kvxs, moor.kvrp.
"""
import os
import sys
import tempfile

import faults
import hdkv_faults
import shell_faults

ROOT = os.path.abspath(os.path.join(os.path.dirname(os.path.abspath(__file__)), '../..'))


def given(variable, path):
    return os.path.abspath(os.environ.get(variable, f'{ROOT}/{path}'))


def main():
    programs = os.environ['KVR_BIN'] = given('KVR_BIN', 'build/dev/bin')
    library = given('KVR_FAULT_CALLS', 'build/dev/tests/faults/libfault_calls.so')
    every, kinds = 1 if 'all' in sys.argv[1:] else 5, [each for each in sys.argv[1:] if each != 'all']
    with tempfile.TemporaryDirectory(prefix='kvr-faults-') as folder:
        orders = faults.Orders(f'{folder}/orders', library)
        count, wrong = hdkv_faults.run(programs, folder, orders, every) if not kinds or 'hdkv' in kinds else (0, [])
        if kinds != ['hdkv']:
            more, found = shell_faults.run(folder, orders, 8 * every if every > 1 else 1, kinds)
            count, wrong = count + more, wrong + found
    print(*wrong, f'{count} points, {len(wrong)} violations', sep='\n')
    return 1 if wrong else 0


if __name__ == '__main__':
    sys.exit(main())
