"""Every fault at every file call of the commands of hdkv that write."""
import os
import subprocess

import faults
from guarded import Guarded

COMMANDS = {'set': ('G_waterlevel', '4.25'), 'fmt': ()}  # and what follows the file


def old_text(hdkv, folder):
    """A whole file with a comment, which every command drops."""
    path = f'{folder}/new.HDKV'
    subprocess.run([hdkv, 'new', path], check=True, capture_output=True)
    with open(path, encoding='utf-8') as file:
        first, rest = file.read().split('\n', 1)
    os.remove(path)
    return f'{first}\n// A comment.\n{rest}'


class Runs:
    def __init__(self, hdkv, folder, orders):
        self._hdkv, self._orders = hdkv, orders
        self._folder, self._old = f'{folder}/hdkv', old_text(hdkv, folder)

    def guarded(self, linked):
        return Guarded(self._folder, 'river.HDKV', self._old, linked)

    def run(self, command, point=None):
        self._orders.arm(self._folder, point)
        result = subprocess.run([self._hdkv, command, f'{self._folder}/river.HDKV', *COMMANDS[command]], timeout=60,
                                capture_output=True, text=True, env={**os.environ, **self._orders.environment})
        return result, self._orders.disarm()

    def reference(self, command, linked):
        """What the file holds when the command has worked, and the calls that it took."""
        guarded = self.guarded(linked)
        result, calls = self.run(command)
        if result.returncode != 0 or not calls or guarded.content() == self._old:
            raise RuntimeError(f'hdkv {command} does not work here: {result.stderr}')
        return guarded.content(), calls

    def violations(self, command, linked, point, new):
        guarded = self.guarded(linked)
        result, _ = self.run(command, point)
        if not point.kills:
            if result.returncode < 0:
                return [f'ended by signal {-result.returncode}']
            silent = result.returncode != 0 and not result.stderr.strip()
            nameless = '""' in result.stderr
            found = guarded.violations(new, result.returncode == 0, said=result.stderr, may_litter=point.keeps_files)
            return found + silent * ['failed without a word'] + nameless * [f'names nothing: {result.stderr}']
        found = guarded.violations(new, None, may_litter=True)
        result, _ = self.run(command)  # and it can be said again
        return found + (guarded.violations(new, True, may_litter=True) if result.returncode == 0 else [result.stderr])


def run(programs, folder, orders, every):
    """Goes through every nth point. Gives back how many there were and what did not hold."""
    runs, count, wrong = Runs(f'{programs}/hdkv', folder, orders), 0, []
    for command in COMMANDS:
        for linked in (False, True):
            new, calls = runs.reference(command, linked)
            for point in list(faults.points(calls))[::every]:
                count += 1
                wrong += [f'hdkv {command}{" through a link" if linked else ""}, {point}: {sentence}'
                          for sentence in runs.violations(command, linked, point, new)]
    return count, wrong
