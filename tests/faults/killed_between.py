"""hdkv is killed while another program writes to the same file: every moment of both."""
import os
import re
import subprocess
import time

import faults
from hdkv_faults import RIVER, old_text

THEIRS, OURS = ('G_f', '77'), ('G_waterlevel', '4.25')  # keyword and value


def with_value(text, keyword, value):
    return re.sub(rf'\b{keyword} = .*', f'{keyword} = {value}', text, count=1)


def writes_over_it(path, text):
    with open(path, 'w', encoding='utf-8') as file:
        file.write(text)


def puts_another_in_its_place(path, text):
    other = f'{os.path.dirname(path)}/other'
    writes_over_it(other, text)
    os.replace(other, path)


WAYS = (writes_over_it, puts_another_in_its_place)


class Runs:
    def __init__(self, hdkv, folder, orders):
        self._hdkv, self._orders = hdkv, orders
        self._folder, self._old = f'{folder}/killed', old_text(hdkv, folder)
        self._path = f'{self._folder}/{RIVER}'
        self._theirs = with_value(self._old, *THEIRS)

    def _set(self, point=None, waits=0):
        self._orders.arm(self._folder, point, waits)
        return subprocess.Popen([self._hdkv, 'set', self._path, *OURS], stdout=subprocess.DEVNULL,
                                stderr=subprocess.PIPE, text=True, env={**os.environ, **self._orders.environment})

    def _clear(self):
        os.makedirs(self._folder, exist_ok=True)
        for name in os.listdir(self._folder):
            os.remove(f'{self._folder}/{name}')
        writes_over_it(self._path, self._old)

    def calls(self):
        self._clear()
        self._set().communicate()
        return self._orders.disarm()

    def _standing(self):
        """The contents of all files, by name."""
        contents = {}
        for name in os.listdir(self._folder):
            with open(f'{self._folder}/{name}', encoding='utf-8', errors='replace') as file:
                contents[name] = file.read()
        return contents

    def violations(self, way, waits, kill):
        """The other one writes before the call `waits`, hdkv is killed at the call `kill`, and given again."""
        self._clear()
        program = self._set(faults.Point(kill, '', faults.KILL), waits)
        end = time.monotonic() + 60
        while not self._orders.is_waiting() and program.poll() is None and time.monotonic() < end:
            time.sleep(0.0002)
        way(self._path, self._theirs)
        self._orders.let_on()
        program.communicate(timeout=60)
        self._orders.disarm()
        found = self._lost('killed')
        again = self._set()
        said = again.communicate(timeout=60)[1]
        self._orders.disarm()
        if again.returncode != 0:
            found.append(f'the next one ends with {again.returncode}: {said}')
        return found + self._lost('the next one')

    def _lost(self, when):
        standing = self._standing()
        value = re.compile(r'\b{} = {}\b'.format(*THEIRS))
        found = []
        if not any(value.search(text) for text in standing.values()):
            found.append(f'{when}: what the other program wrote is nowhere, in {", ".join(standing)}')
        if not standing.get(RIVER, '').rstrip().endswith('[/KAVO0_HD]'):
            found.append(f'{when}: the file is not whole')
        return found


def run(programs, folder, orders, which):
    """Goes through a slice of the pairs of calls. Gives back how many there were and what did not hold."""
    runs, count, wrong = Runs(f'{programs}/hdkv', folder, orders), 0, []
    number = len(runs.calls())
    pairs = [(waits, kill) for waits in range(1, number + 1) for kill in range(waits, number + 1)]
    for way in WAYS:
        for waits, kill in pairs[which]:
            count += 1
            wrong += faults.told([f'hdkv set, another {way.__name__} before call {waits}, killed at call {kill}: {each}'
                                  for each in runs.violations(way, waits, kill)])
    return count, wrong
