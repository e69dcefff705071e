#!/usr/bin/python3
"""recovery.py CYCLES [SEED [DISPLAYS]]: types, kills the program at a random moment, starts it again, and looks at what comes back.

Numbers that count up are typed into a cell of each of the three files of a project, one after the other, and now and
then a file is saved. After each kill every file shows the last number that was typed more than ten seconds before, or a
later one; the file on the disk holds what was saved last; undo leads back to it. Prints how much was lost.

Several displays share the cycles: a cycle is mostly waiting.

    KVR_BIN=build/dev/bin tests/faults/recovery.py 200 1 5
"""
import random
import re
import time

import displays

MOST_LOST = 10.0  # seconds
TABLES = {'moor.HDKV': ('Local ', 3), 'moor.kvnw': ('Radius and width', 2),
          'moor.kvxs': ('Points of the current cross section', 2)}


class Lost(Exception):
    """What should have come back and did not."""


class Cycles:
    def __init__(self, folder, seed):
        import samples
        from editor import Editor
        from screen import Table
        from waiting import wait_for

        self.samples, self.Editor, self.Table, self.wait_for = samples, Editor, Table, wait_for
        self.folder, self.random = folder, random.Random(seed)
        self.project = samples.write_project(folder)
        self.name, self.number = f'display {seed}', 1000  # the next to be typed
        self.typed = {name: [] for name in TABLES}  # number and time, those since the last save
        self.saved = dict.fromkeys(TABLES)
        self.losses, self.recovered = [], 0
        self.editor = None

    def table(self, name):
        return self.editor.table(TABLES[name][0])

    def shown(self, name):
        return self.table(name).cell(1, TABLES[name][1]).name

    def start(self):
        self.editor = self.Editor(self.folder, 'moor.kvrp', recovers=True)
        self.wait_for(lambda: len(self.editor.windows()) == 3, 'the project opens its three files', 20)
        self.editor.settle()

    def type_until(self, end):
        name = None
        while time.monotonic() < end:
            name = self.random.choice(list(TABLES))
            self.editor.click_cell(1, TABLES[name][1], self.table(name))
            self.editor.type(f'{self.number}')
            self.editor.press('Return')
            self.typed[name].append((self.number, time.monotonic()))
            self.number += 1
            if self.random.random() < 0.05:
                self.editor.save()
                self.saved[name] = self.number - 1
                self.typed[name] = []
            time.sleep(self.random.choice((0, 0.2, 1.5)))

    def kill(self):
        self.editor.process.kill()
        killed = time.monotonic()
        self.editor.end()
        return killed

    def recover(self):
        """Opens what can be recovered; the names of the files."""
        names = []
        while self.editor.no_message() is not None:
            dialog = self.editor.box()
            if dialog.name != 'Recover Changes':
                raise Lost(f'a message: {self.editor.box_texts()}')
            table = self.Table(dialog.find('table', '^Recover Changes'))
            names.append(table.cell(1, 1).name)
            left = table.lines
            self.editor.click(table.cell(1, 1))
            self.editor.click(dialog.find('push button', '^Open'))
            self.wait_for(lambda: self.editor.no_message() is None or table.lines < left, 'it is opened')
        return names

    def check(self, name, killed, recovered):
        on_disk = re.search(rf'\b{self.saved[name]}\b', self.samples.Saved(f'{self.folder}/{name}').text)
        if self.saved[name] and not on_disk:
            raise Lost(f'{name} does not hold the saved {self.saved[name]}')
        shown = self.shown(name)
        known = [number for number, _ in self.typed[name]]
        back = int(shown) if shown.isdigit() and int(shown) in known else None
        lost = [when for number, when in self.typed[name] if back is None or number > back]
        seconds = killed - lost[0] if lost else 0.0
        self.losses.append(seconds)
        self.recovered += back is not None
        if seconds > MOST_LOST:
            raise Lost(f'{name} shows {shown}: typing of {seconds:.1f} s is lost, of {self.typed[name]}')
        if back is None and name in recovered and not self.typed[name]:
            raise Lost(f'{name} was recovered, though it had been saved')

    def cycle(self):
        self.start()
        self.type_until(time.monotonic() + self.random.uniform(0.5, 20))
        killed = self.kill()
        self.start()
        recovered = self.recover()
        for name in TABLES:
            self.check(name, killed, recovered)
        # The next cycle begins with saved files.
        for name in TABLES:
            self.editor.click_cell(1, TABLES[name][1], self.table(name))
            if self.editor.modified:
                self.editor.save()
            shown = self.shown(name)
            self.saved[name] = int(shown) if shown.isdigit() and int(shown) >= 1000 else None
            self.typed[name] = []
        self.kill()

    def run(self, cycles):
        for number in range(1, cycles + 1):
            self.cycle()
            print(f'{self.name}, cycle {number}: {len(self.losses)} looks, {self.recovered} recovered, most lost '
                  f'{max(self.losses):.1f} s', flush=True)


def run(folder, number, seed):
    cycles = Cycles(folder, seed)
    try:
        cycles.run(number)
    finally:
        if cycles.editor:
            cycles.editor.end()


if __name__ == '__main__':
    displays.main(run, __file__, __doc__)
