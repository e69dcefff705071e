#!/usr/bin/python3
"""run.py [all|SHARE/SHARES] [KIND...]: saves files while calls of the system fail or the program is killed, and sees
that nothing is lost.

    KVR_BIN=build/dev/bin KVR_FAULT_CALLS=build/dev/tests/faults/libfault_calls.so tests/faults/run.py

Without `all` or a share of it, as 2/3, a sample of the points. Kinds are hdkv, killed (while another program writes)
and, in the shell, moor.HDKV, moor.kvnw, moor.kvxs, moor.kvrp, member (which gets a new name in a project).
"""
import os
import re
import sys
import tempfile

import faults
import hdkv_faults
import killed_between
import shell_faults

HDKV = {'hdkv': hdkv_faults, 'killed': killed_between}
# Every which point; primes, so that each fault has its turn. Projects take a start of the program each.
SAMPLE = {'hdkv': 23, 'killed': 61, 'moor.HDKV': 113, 'moor.kvnw': 113, 'moor.kvxs': 113, 'moor.kvrp': 487,
          'member': 487}

ROOT = os.path.abspath(os.path.join(os.path.dirname(os.path.abspath(__file__)), '../..'))


def given(variable, path):
    return os.path.abspath(os.environ.get(variable, f'{ROOT}/{path}'))


def main():
    share = next(filter(None, (re.fullmatch(r'(\d+)/(\d+)', each) for each in sys.argv[1:])), None)
    is_sample = 'all' not in sys.argv[1:] and not share
    kinds = [each for each in sys.argv[1:] if each in SAMPLE] or list(SAMPLE)
    first, step = (int(share[1]) - 1, int(share[2])) if share else (0, 1)
    which = {kind: slice(first, None, SAMPLE[kind] if is_sample else step) for kind in kinds}  # of the points
    programs = os.environ['KVR_BIN'] = given('KVR_BIN', 'build/dev/bin')
    library = given('KVR_FAULT_CALLS', 'build/dev/tests/faults/libfault_calls.so')
    with tempfile.TemporaryDirectory(prefix='kvr-faults-') as folder:
        orders = faults.Orders(f'{folder}/orders', library)
        count, wrong = 0, []
        for kind in set(kinds) & set(HDKV):
            more, found = HDKV[kind].run(programs, folder, orders, which.pop(kind))
            count, wrong = count + more, wrong + found
        if which:
            more, found = shell_faults.run(folder, orders, which)
            count, wrong = count + more, wrong + found
    print(f'{count} points, {len(wrong)} violations')
    return 1 if wrong else 0


if __name__ == '__main__':
    sys.exit(main())
