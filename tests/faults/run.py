#!/usr/bin/python3
"""run.py [all] [KIND...]: saves files while calls of the system fail or the program is killed, and sees that nothing is
lost.

    KVR_BIN=build/dev/bin KVR_FAULT_CALLS=build/dev/tests/faults/libfault_calls.so tests/faults/run.py

Without `all`, a sample of the points. Kinds are hdkv, killed (while another program writes) and, in the shell, moor.HDKV, moor.kvnw, moor.kvxs, moor.kvrp.
"""
import os
import sys
import tempfile

import faults
import hdkv_faults
import killed_between
import shell_faults

HDKV = {'hdkv': hdkv_faults, 'killed': killed_between}
SAMPLE = {'hdkv': 11, 'killed': 61, 'shell': 61}  # every which point; primes, so that each fault has its turn

ROOT = os.path.abspath(os.path.join(os.path.dirname(os.path.abspath(__file__)), '../..'))


def given(variable, path):
    return os.path.abspath(os.environ.get(variable, f'{ROOT}/{path}'))


def main():
    programs = os.environ['KVR_BIN'] = given('KVR_BIN', 'build/dev/bin')
    library = given('KVR_FAULT_CALLS', 'build/dev/tests/faults/libfault_calls.so')
    is_sample, kinds = 'all' not in sys.argv[1:], [each for each in sys.argv[1:] if each != 'all']
    with tempfile.TemporaryDirectory(prefix='kvr-faults-') as folder:
        orders = faults.Orders(f'{folder}/orders', library)
        count, wrong = 0, []
        for kind, module in HDKV.items():
            if not kinds or kind in kinds:
                more, found = module.run(programs, folder, orders, SAMPLE[kind] if is_sample else 1)
                count, wrong = count + more, wrong + found
        if not kinds or set(kinds) - set(HDKV):
            more, found = shell_faults.run(folder, orders, SAMPLE['shell'] if is_sample else 1, kinds)
            count, wrong = count + more, wrong + found
    print(*wrong, f'{count} points, {len(wrong)} violations', sep='\n')
    return 1 if wrong else 0


if __name__ == '__main__':
    sys.exit(main())
