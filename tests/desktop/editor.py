"""The program as its user meets it: pages, fields, cells, messages, windows."""
import os
import re
import shutil
import signal
import subprocess
import time

from hands import Hands
from screen import State, Table, application
from waiting import PATIENCE, NotInTime, wait_for


def active_window():
    """The window that has the keyboard; empty while it passes from one to the next."""
    return subprocess.run(['xdotool', 'getactivewindow'], capture_output=True, text=True).stdout.strip()


def largest_window(pid):
    """The main window of a program: a message may be up as soon as it starts."""
    found = subprocess.run(['xdotool', 'search', '--onlyvisible', '--pid', str(pid)], capture_output=True, text=True)

    def area(window):
        size = subprocess.run(['xdotool', 'getwindowgeometry', '--shell', window], capture_output=True,
                              text=True).stdout
        return int(re.search(r'WIDTH=(\d+)', size).group(1)) * int(re.search(r'HEIGHT=(\d+)', size).group(1))

    return max(found.stdout.split(), key=area, default='')


class Editor:
    """The program, started with files; `folder` is where it runs and where its log is kept. What a program before it has
    left over is forgotten, unless it `recovers`; it takes files of further starts when it is `shared`."""

    def __init__(self, folder, *files, language=None, recovers=False, shared=False):
        self.hands = Hands()
        self._known = {}  # widgets that were looked for
        self._log = open(f'{folder}/kvrshell.log', 'w+', encoding='utf-8', errors='replace')
        program = os.path.join(os.environ['KVR_BIN'], 'kvrshell')
        if not recovers:
            shutil.rmtree(f'{folder}/state', ignore_errors=True)
        # Settings and unsaved changes of its own: those of one case must not meet the next.
        environment = dict(os.environ, XDG_CONFIG_HOME=f'{folder}/settings', XDG_STATE_HOME=f'{folder}/state',
                           LC_ALL=(language or 'C') + '.UTF-8')
        self.process = subprocess.Popen([program, *([] if shared else ['--separate']), *files], cwd=folder, stdout=self._log, stderr=self._log,
                                        env=environment)
        try:
            self.root = application(self.process)
            self.frame = next(w for w in self.root.children() if w.role == 'frame')
        except BaseException:
            self.end()
            raise
        self._window = wait_for(lambda: largest_window(self.process.pid), 'the window is on the desktop')
        self.settle()

    def end(self):
        """Ends the program whatever state it is in, and gives back what it wrote to its log."""
        if self._log.closed:
            return ''
        if self.process.poll() is None:
            self.process.send_signal(signal.SIGKILL)
        self.process.wait()
        self._log.seek(0)
        text = self._log.read()
        self._log.close()
        return text

    # ---- time

    def settle(self, seconds=0.15):
        """Lets the program meet what was pressed: it has answered, and some time later nothing on screen differs."""
        seen = None
        for _ in range(20):
            before, seen = seen, (self.frame.name, active_window(), self.status())
            if seen == before:
                return
            time.sleep(seconds * PATIENCE)

    # ---- keys

    def press(self, *keys, pause=20):
        self.hands.press(*keys, pause=pause)

    def type(self, text, speed=25):
        self.hands.type(text, speed)

    def click(self, widget, **more):
        self.hands.click(*widget.middle, **more)
        self.settle(0.05)

    def menu(self, *entries):
        """Chooses a menu entry with the mouse: menu('Edit', 'Undo'). Entries are found by how they begin
        or end."""
        bar = self._menu_bar()
        item = wait_for(lambda: next((w for w in bar.children() if w.name == entries[0]), None),
                        f'the menu {entries[0]} is there')
        self.hands.click(*item.middle)
        for entry in entries[1:]:
            item = wait_for(lambda: self._entry(entry), f'the entry {entry} is shown')
            self.hands.click(*item.middle)
        x, y, width, height = self.frame.place
        self.hands.rest(x + width // 2, y + height - 2)  # over nothing that would speak in the status bar
        self.settle()

    def _menu_bar(self):
        return next(w for w in self.frame.children() if w.role == 'menu bar')

    def _entry(self, name):
        for popup in [w for w in self._popups(self._menu_bar()) if w.shown]:
            for item in popup.children():
                its = item.name.split('\t')[0]
                if (its.startswith(name) or its.endswith(name)) and item.shown:
                    return item
        return None

    def _popups(self, widget):
        for child in widget.children():
            if child.role == 'popup menu':
                yield child
            if child.role in ('popup menu', 'menu item', 'menu'):
                yield from self._popups(child)

    def open_menu(self, name):
        item = next(w for w in self._menu_bar().children() if w.name == name)
        self.hands.click(*item.middle)
        self.settle(0.1)

    # ---- windows

    @property
    def window_id(self):
        """Of the main window, for the X server."""
        return self._window

    @property
    def title(self):
        return self.frame.name

    @property
    def modified(self):
        return '*' in self.title

    def status(self):
        bar = next((w for w in self.frame.children() if w.role == 'status bar'), None)
        return bar.name if bar else ''

    def window(self, title):
        """The window of a document, by how its title begins."""
        return self.frame.find('frame', f'^{re.escape(title)}')

    def windows(self):
        """The titles of the documents' windows, those behind others too."""
        pane = next(w for w in self.frame.children() if w.role == 'layered pane')
        return [w.name for w in pane.children() if w.role == 'frame']

    def project_files(self):
        """What stands below the project in its tree, with the marks of modified files."""
        names = [w.name for w in self.frame.find('tree', '^Files of the project').children() if w.role == 'table cell']
        return names[1:]

    # ---- pages

    def page(self, name):
        """Clicks the tab of a page."""
        self.hands.click(*self._tab(name).middle)
        self.settle(0.1)

    def _tab(self, name):
        return self.frame.find('page tab', f'^{re.escape(name)}$')

    def pages(self):
        """The captions of all pages, from top to bottom."""
        return [tab.name for tab in self._sheet().children() if tab.role == 'page tab']

    def current_page(self):
        return self._sheet().name

    def _sheet(self):
        """The column of tabs of the window in front."""
        return next(w for w in self.frame.all('page tab list') if w.place[2] < w.place[3])

    def go_to(self, name):
        """Brings a page into view and waits for it."""
        self.page(name)
        wait_for(lambda: self.current_page() == name, f'the page {name} is in front')

    def field(self, name, role='text', nth=0):
        """A field of the page by how its name begins."""
        return self._shown(role, name, nth)

    def _shown(self, role, name, nth):
        """The nth widget that shows, of those whose name begins so. Looking through a window takes a while, so what was
        found is remembered as long as it is there."""
        key = (role, name, nth)
        known = self._known.get(key)
        if known and known.is_shown_as(role, name):
            return known
        pattern = f'^{re.escape(name)}'
        found = wait_for(lambda: (self.frame.all(role, pattern)[nth:] or [None])[0], f'a {role} {name!r} is shown')
        self._known[key] = found
        return found

    def fill(self, name, text, speed=25, leave='Tab', nth=0):
        """Replaces what stands in a field by typed text and leaves it with a key, if one is given."""
        self.hands.click(*self.field(name, nth=nth).middle)
        self.press('ctrl+a')
        self.type(text, speed) if text else self.press('BackSpace')
        if leave:
            self.press(leave)
            self.settle(0.1)

    # ---- tables

    def table(self, name='Local ', nth=0):
        """A table of the page by how its name begins."""
        return Table(self._shown('table', name, nth))

    def click_cell(self, line, column, table=None, **more):
        table = table or self.table()
        self.click(self.in_sight(table, table.cell(line, column)), **more)

    def click_line(self, line, table=None, **more):
        """On its number, which is beside the line's cells: the place that it tells itself forgets how far the table is
        scrolled."""
        table = table or self.table()
        y = self.in_sight(table, table.cell(line, 1)).middle[1]
        self.hands.click(table.line_number(line).middle[0], y, **more)
        self.settle(0.05)

    def in_sight(self, table, part):
        """The part of a table, after the wheel was turned until it is shown."""
        for _ in range(200):
            top, bottom = table.sight
            left, _, width, _ = table.place
            across, middle = part.middle
            if not top < middle < bottom:
                self.hands.wheel(*table.middle, down=middle >= bottom)
            elif not left < across < left + width:
                self.hands.wheel_sideways(*table.middle, right=across >= left + width)
            else:
                return part
            self.settle(0.02)
        raise AssertionError('the wheel does not bring the cell into sight')

    def put(self, line, column, text, speed=25, leave='Tab', table=None):
        """Types into a cell, in place of what stands there."""
        self.click_cell(line, column, table)
        self.type(text, speed)
        if leave:
            self.press(leave)
            self.settle(0.1)

    def empty(self, line, column, table=None):
        """Empties a cell that stays in edit mode."""
        self.click_cell(line, column, table)
        self.press('F2', 'ctrl+a', 'BackSpace')

    def focus(self):
        return self.frame.focus()

    # ---- messages

    def _boxes(self):
        # Every one is a window of the desktop, and modal. Looking for it among the widgets takes far longer.
        if active_window() == self._window:
            return []
        # Seen from the program it stands beside the frame, or below the window that it is about.
        beside = [w for w in self.root.children() if w.role in ('alert', 'dialog') and w.shown]
        boxes = beside or self.frame.all('alert') + self.frame.all('dialog')
        return sorted(boxes, key=lambda box: not box.has(State.ACTIVE))

    def box(self, seconds=5.0):
        """The message box or dialog that is up, once it is."""
        return wait_for(lambda: (self._boxes() or [None])[0], 'a message or dialog is shown', seconds)

    def box_texts(self):
        box = self.box()
        return [label.text for label in box.all('label') if label.text]

    def answer(self, button='OK'):
        """The texts of the message that has to be up, pressed away by its button."""
        box = self.box()
        texts = [label.text for label in box.all('label') if label.text]
        found = wait_for(lambda: next((b for b in box.all('push button') if b.name.replace('&', '') == button), None),
                         f'the button {button} among {[b.name for b in box.all("push button")]} of {texts}')
        self.hands.click(*found.middle)
        wait_for(lambda: self._gone(box), f'the message {texts} goes')
        self.settle(0.1)
        return texts

    @staticmethod
    def _gone(box):
        try:
            return not box.shown
        except Exception:  # its object is no more
            return True

    def no_message(self):
        """What stands in a message that is up against expectation; None when there is none."""
        self.settle()
        boxes = self._boxes()
        return [label.text for label in boxes[0].all('label') if label.text] if boxes else None

    # ---- files

    def save(self, seconds=8.0):
        """Ctrl+S, and what it changes: the mark of a modified document goes."""
        self.press('ctrl+s')
        try:
            wait_for(lambda: not self.modified, 'the document is saved', seconds)
        except NotInTime as late:
            raise NotInTime(f'{late}; message: {self.no_message()}') from None
        self.settle(0.1)
