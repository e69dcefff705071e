"""Every fault at every file call of a save in the shell, for the files of all its editors, with real keys."""
import glob
import os
import re
import shutil
import sys
import time

import faults
from guarded import Guarded

sys.path.insert(0, os.path.join(os.path.dirname(os.path.abspath(__file__)), '../desktop'))
import samples  # noqa: E402: it stands there

# What the file holds at first; the cell that is typed into: table, line, column; what stands in the file before its
# value.
KINDS = {'moor.HDKV': (samples.hd_text, 'Local ', 1, 4, '"MOORBECK", 100, 1.25, '),
         'moor.kvnw': (samples.network_text, 'Radius and width', 1, 2, 'DATA = 0, '),
         'moor.kvxs': (samples.sections_text, 'Points', 1, 1, 'Point = ')}
PATIENCE = 8  # seconds for a save, or a message


class Desk:
    """The shell with a file open that is saved again and again."""

    def __init__(self, folder, orders, name, linked):
        text, *self._cell, self._before = KINDS[name]
        self._orders, self._name, self._folder = orders, name, f'{folder}/files'
        self._armed = self._folder
        self._home = f'{folder}/home'  # of logs and settings
        os.makedirs(self._home, exist_ok=True)
        self._guarded = Guarded(self._folder, name, text(), linked)
        self._value, self._editor, self._point = 1, None, None

    def _start(self):
        from editor import Editor  # only inside of a session: it looks up the accessibility bus

        os.environ.update(self._orders.environment)
        try:
            self._editor = Editor(self._home, f'{self._folder}/{self._name}')
        finally:
            for name in self._orders.environment:
                del os.environ[name]

    def end(self):
        if self._editor:
            self._editor.end()
        self._editor = None

    def _change(self):
        """Types another value. What the file holds when that is saved."""
        if not self._editor:
            self._start()
        table, line, column = self._cell
        self._value += 1
        value = f'1.{self._value:04}1'
        self._click(line, column, table)
        self._editor.type(value)
        self._editor.press('Return')
        # The value is the only thing that may be new, once the file has been written as the program writes it.
        return re.sub(re.escape(self._before) + r'[^,\n]*', self._before + value, self._guarded.content(), count=1)

    def _click(self, line, column, table):
        """A bar above the table that goes just now takes the cell away from below the mouse."""
        for _ in range(5):
            self._editor.click_cell(line, column, self._editor.table(table))
            if self._editor.status().startswith(f'Line {line} of'):
                return
            time.sleep(0.5)
        raise RuntimeError(f'line {line} is not reached: {self._editor.status()}')

    def save(self, point=None):
        """Changes something and saves, with a fault. Gives back the calls that the save took and what did not hold
        afterwards, with the fault as it was met."""
        new, self._point = self._change(), point
        self._orders.arm(self._armed, point)
        self._editor.press('ctrl+s')
        saved, said = self._outcome()
        calls = self._orders.disarm()
        found = []
        if point:
            point = point.met(calls)
            found = self._guarded.violations(new, saved, said, may_litter=saved is None or point.keeps_files)
        if saved is False and not said:
            found.append('nothing is said')
        if saved is None and not point.kills:
            found.append('the program ended')
        if saved is None:
            self.end()
        self._guarded.start_over()
        return calls, [f'{point}: {sentence}' for sentence in found]

    def _bar(self):
        """What stands above the view, when something is beside the file that was not there."""
        if not any('.displaced-' in name for _, _, names in os.walk(self._guarded.folder) for name in names):
            return ''
        self._editor.settle()
        return '\n'.join(label.text for label in self._editor.frame.all('label'))

    def _outcome(self):
        """Whether the program says that it has saved, and its words; None when it is no more."""
        try:
            return self._look()
        except Exception:  # it went while it was looked at
            time.sleep(1)
            if self._editor.process.poll() is None:
                raise
            return None, ''

    def _look(self):
        editor, end = self._editor, time.monotonic() + PATIENCE
        while time.monotonic() < end:
            if editor.process.poll() is not None:
                return None, ''
            if texts := editor.no_message():
                editor.press('Escape')
                editor.settle()
                return not editor.modified, '\n'.join(texts)
            if not editor.modified:
                return True, editor.status() + self._bar()
        return False, ''


class ProjectDesk(Desk):
    """The shell with a project whose member gets a new name by its first save: then the project is written anew."""

    def __init__(self, folder, orders, _, linked):
        super().__init__(folder, orders, 'moor.HDKV', linked)
        self._name, self._linked, self._member = 'moor.kvrp', linked, f'{folder}/member'

    def _change(self):
        self.end()
        shutil.rmtree(self._member, ignore_errors=True)
        os.makedirs(self._member)
        samples.write(f'{self._member}/moor.hdkv', samples.hd_text())
        self._guarded = Guarded(self._folder, self._name, samples.project_text('../member/moor.hdkv'), self._linked)
        super()._change()
        return self._guarded.text.replace('.hdkv', '.HDKV')

    def _look(self):
        saved, said = self._look_behind_member()
        # Whoever is asked first, as metadata cannot be kept, answers with Escape.
        return saved and 'still names' not in said and 'Save?' not in said, said

    def _look_behind_member(self):
        saved, said = super()._look()
        if saved is None:
            return saved, said
        # The project is written behind its member; a lock may have to stay.
        end = time.monotonic() + (2 if self._point and self._point.keeps_files else PATIENCE)
        while glob.glob(f'{self._folder}/**/.*.lock', recursive=True) and time.monotonic() < end:
            time.sleep(0.05)
        if texts := self._editor.no_message():  # it comes when the member is saved
            said += '\n'.join(texts)
        return saved, said


class MemberDesk(ProjectDesk):
    """The same, and what fails are the calls on the member."""

    def __init__(self, *given):
        super().__init__(*given)
        self._armed, self._text = self._member, samples.hd_text()

    def _change(self):
        self.end()
        os.makedirs(self._folder, exist_ok=True)
        samples.write(f'{self._folder}/moor.kvrp', samples.project_text('../member/moor.hdkv'))
        self._guarded = Guarded(self._member, 'moor.hdkv', self._text, self._linked, other_name='moor.HDKV')
        # As long as the shell has the file.
        self._guarded.belongs_there(('far/' if self._linked else '') + '.moor.hdkv.lock')
        return Desk._change(self)

    def _look(self):
        return self._look_behind_member()

    def save(self, point=None):
        answer = super().save(point)
        if not point:
            self._text = self._guarded.text  # as the program writes it
        return answer


PROJECTS = {'moor.kvrp': ProjectDesk, 'member': MemberDesk}


def run(folder, orders, which):
    """Goes through slices of the points, by kind. Gives back how many there were and what did not hold."""
    from session import Session

    count, wrong = 0, []
    with Session():
        for name, some in which.items():
            for linked in (False, True):
                desk = PROJECTS.get(name, Desk)(folder, orders, name, linked)
                try:
                    desk.save()  # as the program writes it
                    calls, _ = desk.save()
                    for point in list(faults.points(calls))[some]:
                        count += 1
                        wrong += faults.told([f'shell, {name}{" through a link" if linked else ""}: {sentence}'
                                              for sentence in desk.save(point)[1]])
                        if count % 100 == 0:
                            print(f'shell, {name}: {count} points so far, {len(wrong)} violations', flush=True)
                finally:
                    desk.end()
            print(f'shell, {name}: {count} points so far, {len(wrong)} violations', flush=True)
    return count, wrong
