"""Every fault at every file call of the commands of hdkv that write."""
import os
import subprocess

import faults
from guarded import Guarded

RIVER, SOURCE = 'river.HDKV', 'source.HDKV'  # what is written to, and what is only read
# The words of each command, and what stands under the name that it writes to.
COMMANDS = {'set': (('set', RIVER, 'G_waterlevel', '4.25'), ('file', 'link')),
            'fmt': (('fmt', RIVER), ('file', 'link')),
            'set -o': (('set', SOURCE, 'G_waterlevel', '4.25', '-o', RIVER), ('nothing', 'file', 'link')),
            'new': (('new', RIVER), ('nothing', 'file'))}
TIME_OF_DAY = 'LimitedPeriod(Start|End) = .*'  # of "new"


def old_text(hdkv, folder):
    """A whole file with a comment, which every command drops."""
    path = f'{folder}/new.HDKV'
    subprocess.run([hdkv, 'new', path], check=True, capture_output=True)
    with open(path, encoding='utf-8') as file:
        first, rest = file.read().split('\n', 1)
    os.remove(path)
    return f'{first}\n// A comment.\n{rest}'


class Runs:
    """One command and what it meets under the name that it writes to."""

    def __init__(self, hdkv, folder, orders, command, there):
        self._hdkv, self._orders, self._there, self._folder = hdkv, orders, there, f'{folder}/hdkv'
        self._words = [f'{self._folder}/{word}' if word in (RIVER, SOURCE) else word for word in COMMANDS[command][0]]
        self._old = old_text(hdkv, folder)
        self._refused = command == 'new' and there != 'nothing'
        self._new, self.calls = self._reference()

    def _guarded(self):
        guarded = Guarded(self._folder, RIVER, None if self._there == 'nothing' else self._old,
                          linked=self._there == 'link', passing=TIME_OF_DAY)
        with open(f'{self._folder}/{SOURCE}', 'w', encoding='utf-8') as file:
            file.write(self._old)
        guarded.belongs_there(SOURCE)
        return guarded

    def _run(self, point=None):
        self._orders.arm(self._folder, point)
        result = subprocess.run([self._hdkv, *self._words], timeout=60, capture_output=True, text=True,
                                env={**os.environ, **self._orders.environment})
        return result, self._orders.disarm()

    def _reference(self):
        """What the file holds when the command has worked, and the calls that it took."""
        guarded = self._guarded()
        result, calls = self._run()
        works = result.returncode == (4 if self._refused else 0)
        if not works or not calls or (guarded.content() == guarded.text) != self._refused:
            raise RuntimeError(f'hdkv {self._words} does not work here: {result.stderr}')
        return '' if self._refused else guarded.content(), calls

    def violations(self, point):
        guarded = self._guarded()
        result, _ = self._run(point)
        found = [] if self._source_is_whole() else ['what was only to be read is another']
        if point.kills:
            return found + guarded.violations(self._new, None, may_litter=True) + self._again(guarded)
        if result.returncode < 0:
            return [f'ended by signal {-result.returncode}']
        if result.returncode != 0 and not result.stderr.strip():
            found.append('failed without a word')
        if '""' in result.stderr:
            found.append(f'names nothing: {result.stderr}')
        return found + guarded.violations(self._new, result.returncode == 0, said=result.stderr,
                                          may_litter=point.keeps_files)

    def _again(self, guarded):
        """After a kill the command can be given once more, unless it has done its work."""
        is_done = self._words[0] == 'new' and os.path.exists(guarded.path)
        result, _ = self._run()
        if result.returncode == (4 if is_done else 0):
            return guarded.violations(self._new, None if is_done else True, may_litter=True)
        return [f'the next one ends with {result.returncode}: {result.stderr}']

    def _source_is_whole(self):
        with open(f'{self._folder}/{SOURCE}', encoding='utf-8') as file:
            return file.read() == self._old


def run(programs, folder, orders, which):
    """Goes through a slice of the points. Gives back how many there were and what did not hold."""
    count, wrong = 0, []
    for command, (_, places) in COMMANDS.items():
        for there in places:
            runs = Runs(f'{programs}/hdkv', folder, orders, command, there)
            for point in list(faults.points(runs.calls))[which]:
                count += 1
                wrong += faults.told([f'hdkv {command}, {there}, {point}: {sentence}'
                                      for sentence in runs.violations(point)])
    return count, wrong
