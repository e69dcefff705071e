"""What an assistive technology sees of a program: widgets by role and accessible name, their text and state."""
import re

import gi

gi.require_version('Atspi', '2.0')
from gi.repository import Atspi, GLib  # noqa: E402  the version has to be chosen first

from waiting import wait_for  # noqa: E402

State = Atspi.StateType
# Nothing that a test asks for by itself stands below these; their parts are asked for by name or by place.
CLOSED = {'table', 'tree', 'combo box', 'menu bar', 'popup menu', 'page tab list', 'tool bar'}


class Widget:
    """One accessible object. Every question goes to the program anew."""

    def __init__(self, accessible):
        self._accessible = accessible

    def __repr__(self):
        return f'{self.role} {self.name!r}'

    @property
    def name(self):
        return self._accessible.get_name() or ''

    @property
    def role(self):
        return self._accessible.get_role_name()

    @property
    def description(self):
        return self._accessible.get_description() or ''

    def has(self, *states):
        present = self._accessible.get_state_set()
        return all(present.contains(state) for state in states)

    @property
    def shown(self):
        return self.has(State.SHOWING)

    def is_shown_as(self, role, beginning):
        """Whether this is still there, shown, and has such a role and name."""
        try:
            return self.shown and self.name.startswith(beginning) and self.role == role
        except GLib.Error:
            return False

    @property
    def enabled(self):
        return self.has(State.ENABLED)

    @property
    def checked(self):
        return self.has(State.CHECKED)

    @property
    def selected(self):
        return self.has(State.SELECTED)

    @property
    def text(self):
        """What stands in a field; of others the name, which is their caption."""
        if 'Text' in self._accessible.get_interfaces():
            return Atspi.Text.get_text(self._accessible, 0, -1)
        return self.name

    @property
    def place(self):
        """x, y, width, height on the screen."""
        box = self._accessible.get_extents(Atspi.CoordType.SCREEN)
        return box.x, box.y, box.width, box.height

    @property
    def middle(self):
        x, y, width, height = self.place
        return x + width // 2, y + height // 2

    def children(self):
        for i in range(self._accessible.get_child_count()):
            if child := self._accessible.get_child_at_index(i):
                yield Widget(child)

    def all(self, role, name=None, hidden=False):
        """The widgets below this one of a role whose name matches, in the order of the program's tree."""
        found = []
        self._collect(role, name, hidden, found)
        return found

    def _collect(self, role, name, hidden, found):
        try:
            for child in self.children():
                if not hidden and not child.shown:
                    continue
                its = child.role
                if its == role and (name is None or re.search(name, child.name)):
                    found.append(child)
                if its not in CLOSED or (its, role) in {('page tab list', 'page tab'), ('tool bar', 'push button')}:
                    child._collect(role, name, hidden, found)
        except GLib.Error:
            pass  # it went while it was looked at

    def find(self, role, name=None, seconds=5.0):
        """The first widget of a role whose name matches; waits until it is shown."""
        return wait_for(lambda: next(iter(self.all(role, name)), None),
                        f'a {role} named {name!r} is shown', seconds)

    def focus(self):
        """Whoever has the keyboard below this one, or None. A table's current cell does not count."""
        try:
            for child in self.children():
                present = child._accessible.get_state_set()
                if not present.contains(State.SHOWING):
                    continue
                role = child.role
                if inner := None if role in ('page tab list', 'combo box', 'menu bar') else child._focus_in(role):
                    return inner
                if present.contains(State.FOCUSED) and role not in ('frame', 'filler', 'layered pane', 'panel',
                                                                    'page tab', 'scroll pane', 'split pane'):
                    return child
        except GLib.Error:
            pass
        return None

    def _focus_in(self, role):
        if role != 'table':
            return self.focus()
        # The editor of a cell stands behind the cells.
        count = self._accessible.get_child_count()
        for i in range(count - 1, max(-1, count - 3), -1):
            child = self._accessible.get_child_at_index(i)
            if child and child.get_role_name() not in ('table cell', 'table row header'):
                if (found := Widget(child)).has(State.FOCUSED):
                    return found
        return None


class Table(Widget):
    """A table, its lines and columns counted from 1."""

    def __init__(self, widget):
        super().__init__(widget._accessible)

    @property
    def lines(self):
        return Atspi.Table.get_n_rows(self._accessible)

    @property
    def columns(self):
        return Atspi.Table.get_n_columns(self._accessible)

    def cell(self, line, column):
        return Widget(Atspi.Table.get_accessible_at(self._accessible, line - 1, column - 1))

    def line(self, line):
        return [self.cell(line, column).name for column in range(1, self.columns + 1)]

    def headers(self):
        return [c.name for c in self.children_until('table column header')]

    def children_until(self, role):
        for i in range(self._accessible.get_child_count()):
            child = Widget(self._accessible.get_child_at_index(i))
            if child.role == role:
                yield child
            elif child.role in ('table row header', 'table cell'):
                return

    @property
    def sight(self):
        """Top and bottom of where lines are shown, on the screen."""
        _, y, _, height = self.place
        header = next(self.children_until('table column header'), None)
        return y + (header.place[3] if header else 0), y + height

    def line_number(self, line):
        """The header of a line."""
        return Widget(self._accessible.get_child_at_index((self.columns + 1) * line))


def application(process):
    """The accessible root of a running program, once its window is shown."""

    def root():
        try:
            desktop = Atspi.get_desktop(0)
            for i in range(desktop.get_child_count()):
                child = desktop.get_child_at_index(i)
                if child and child.get_process_id() == process.pid and child.get_child_count():
                    return Widget(child)
        except GLib.Error:
            pass
        return None

    def started():
        if process.poll() is not None:
            raise RuntimeError(f'the program ended with {process.returncode}')
        return root()

    return wait_for(started, 'the program shows its window', 30)
