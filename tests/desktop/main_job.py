#!/usr/bin/python3
"""main_job.py SAMPLE_FOLDER OUT_FOLDER: drives the program through its main job on a desktop of its own, and tells what
was done, what was verified and where the pictures are. Exit code 0 when everything held.

    KVR_BIN=build/release/bin tests/desktop/main_job.py examples/river out/drive
"""
import csv
import os
import shutil
import subprocess
import sys

import samples
from session import Session
from waiting import NotInTime, wait_for

LINE = ['DRIVE BRANCH', '1234.5', '2.75', '18.25']  # that is typed
LEVEL = '3.125'
BEYOND = '99999999'  # a chainage behind the end of every river


class MainJob:
    def __init__(self, sample, out, desktop):
        from editor import Editor  # looks for the accessibility bus as soon as it is imported

        for name in ('project', 'settings'):
            shutil.rmtree(f'{out}/{name}', ignore_errors=True)
        shutil.copytree(sample, f'{out}/project')
        self.out, self.desktop = out, desktop
        self.checks = self.failed = 0
        self.pictures = []
        self.editor = Editor(out, 'project/river.kvrp')

    # ---- what is told

    @staticmethod
    def did(what):
        print(f'  {what}', flush=True)

    def verify(self, fact, what):
        self.checks += 1
        self.failed += not fact
        print(f'    {"verified:" if fact else "FAILED:  "} {what}', flush=True)

    def comes(self, met, what):
        """Verifies what the program does in its own time."""
        try:
            wait_for(met, what)
            self.verify(True, what)
        except NotInTime:
            self.verify(False, what)

    def picture(self, name):
        self.editor.settle()
        self.pictures.append(f'{self.out}/{name}.png')
        self.desktop.picture(self.pictures[-1])

    # ---- what is looked at

    def lines(self):
        return self.editor.table().lines

    def place(self, line):
        """Branch and chainage of a line, in metres."""
        return [self.editor.table().cell(line, column).name for column in (1, 2)]

    def plan(self):
        return self.editor.frame.find('filler', '^Map of the river network')

    def marks(self, place):
        """Whether the map marks a place, which it tells in a tenth of a metre."""
        return self.plan().description == f'{place[0]} {float(place[1]):.1f} m'

    def painted(self):
        return self.desktop.pixels(*self.plan().place)

    def hdkv(self, command, *more):
        done = subprocess.run([os.path.join(os.environ['KVR_BIN'], 'hdkv'), command,
                               samples.same_name(f'{self.out}/project', 'river.HDKV'), *more],
                              capture_output=True, text=True)
        return done.stdout.splitlines() if done.returncode == 0 else [f'exit code {done.returncode}', done.stderr]

    def saved_lines(self, section):
        return list(csv.reader(self.hdkv('show', section, '--format', 'csv')))[1:]  # behind the names of the columns

    # ---- the parameters

    def look_at_every_page(self):
        self.did('Go through the pages with Ctrl+Page Down')
        self.editor.click_cell(1, 1)
        pages = self.editor.pages()
        for number, page in enumerate(pages, 1):
            if number > 1:
                self.editor.press('ctrl+Next')
                self.comes(lambda: self.editor.current_page() == page, f'the page "{page}" is in front')
            self.picture(f'page-{number:02}')
        self.editor.go_to(pages[0])

    def type_values(self):
        editor = self.editor
        self.did('Type a global water level and leave the field with Tab')
        editor.fill('Water Level', LEVEL)
        self.verify(editor.field('Water Level').text == LEVEL, f'the field shows {LEVEL}')
        self.verify(editor.modified, 'the document is modified')
        self.line = self.lines() + 1
        self.did('Press Insert in the table; type river, chainage, level and discharge, Tab after each')
        editor.click_cell(self.line - 1, 1)
        editor.press('Insert')
        self.comes(lambda: self.lines() == self.line, f'the table has {self.line} lines')
        editor.click_cell(self.line, 1)
        editor.type('\t'.join(LINE).lower() + '\t')
        self.comes(lambda: self.lines() == self.line + 1, 'Tab in the last cell appends another line')
        self.verify(editor.table().line(self.line) == LINE, 'the line is as it was typed, its name in capitals')

    def delete_and_undo(self):
        self.did('Click the number of the last line and press Delete')
        self.editor.click_line(self.line + 1)
        self.editor.press('Delete')
        self.comes(lambda: self.lines() == self.line, 'the line is gone')
        self.editor.press('ctrl+z')
        self.comes(lambda: self.lines() == self.line + 1, 'Ctrl+Z brings it back')
        self.editor.press('ctrl+y')
        self.comes(lambda: self.lines() == self.line, 'Ctrl+Y deletes it again')

    def search(self):
        self.did('Press F7 and search for the new branch')
        self.editor.click_cell(1, 1)
        self.editor.press('F7')
        self.editor.box()
        self.editor.press('ctrl+a')
        self.editor.type(LINE[0].lower() + '\n')
        self.comes(lambda: f'Line {self.line} ' in self.editor.status(), f'line {self.line} is current')
        self.picture('line-found')

    def switch_units(self):
        self.did('Switch to US customary units and back')
        shown = lambda: self.editor.table().line(self.line)  # noqa: E731
        self.editor.menu('View', 'Units', 'US Customary')
        self.comes(lambda: shown()[1].startswith('4050.'), 'the chainage 1234.5 m is 4050 ft')
        self.picture('us-units')
        self.editor.menu('View', 'Units', 'Metric')
        self.comes(lambda: shown() == LINE, 'in metres the line is as before')

    # ---- parameters, map and cross sections

    def insert_from_map(self):
        self.did('Pick the place in the middle of the map with the space bar, and insert it with Ctrl+L')
        before = self.lines()
        self.editor.click_cell(before, 1)
        self.editor.click(self.plan())
        self.editor.press('Escape', 'space')
        self.comes(lambda: self.plan().description, 'the map marks a place')
        picked, picture = self.plan().description, self.painted()
        self.editor.click_cell(before, 1)
        self.editor.press('ctrl+l')
        self.comes(lambda: self.lines() == before + 1, 'the page has a line more')
        self.verify(self.marks(self.place(before + 1)), f'it is the place picked, {picked}')
        self.comes(lambda: self.painted() != picture, 'the map shows it')
        self.picture('inserted-from-map')

    def delete_on_map(self):
        self.did('Step to a location on the map with N, and delete it with Delete')
        before, first = self.lines(), self.place(1)
        self.editor.click(self.plan())
        self.editor.press('Escape', 'n')
        self.comes(lambda: self.marks(first), f'the first initial condition is selected, {" ".join(first)}')
        self.editor.press('Delete')
        self.comes(lambda: self.lines() == before - 1, 'its line is gone')
        self.editor.click_cell(2, 3)
        self.editor.press('ctrl+z')
        self.comes(lambda: self.lines() == before and self.place(1) == first, 'Ctrl+Z brings the line back')

    def show_on_map(self):
        self.did('Click a line and see its place on the map; change its chainage and see the map follow')
        self.editor.click(self.plan())
        self.editor.press('Escape')  # what is picked is marked before what others show
        self.editor.click_cell(3, 2)
        place = self.place(3)
        self.comes(lambda: self.marks(place), f'the map marks {" ".join(place)}')
        self.editor.settle(0.3)
        picture = self.painted()
        self.editor.type(BEYOND + '\t')
        self.comes(lambda: self.painted() != picture, 'a place beyond the river leaves the map')
        self.editor.press('ctrl+z')
        self.comes(lambda: self.marks(place) and self.painted() == picture, 'taken back it is there again')

    def load_curves(self):
        self.did('Load branches, chainages, radius and channel width into the increments in curves')
        editor = self.editor
        editor.go_to('W. L. Incr. - Curves')
        width = editor.field('Water Surface width', 'check box')
        if width.checked:  # else the column is locked
            editor.click(width)
        table = editor.table('Water level increment')
        before = table.lines
        editor.click(editor.field('Load Branch', 'push button'))
        editor.click(editor.box().find('radio button', '^Branch, Chainage, Radius and Channel Width'))
        editor.press('Return')
        self.comes(lambda: table.lines > before, 'lines come')
        last = table.line(table.lines)
        self.verify(all(float(text) > 0 for text in last[3:5]), f'the last has width {last[3]} m, radius {last[4]} m')
        self.loaded = table.lines - 1  # the first holds the global values
        self.picture('curves')

    # ---- the file

    def save(self):
        self.did('Save with Ctrl+S, and read the file with hdkv')
        self.editor.go_to('Initial')
        shown = self.lines()
        self.editor.save()
        lines, curves = self.saved_lines('InitList'), self.saved_lines('WLCurveList')
        self.verify(self.hdkv('get', 'G_waterlevel') == [LEVEL], f'the global water level is {LEVEL}')
        self.verify(LINE in lines, 'the typed line is in the file')
        self.verify(len(lines) == shown, f'the file has the {shown} lines of the table')
        self.verify(len(curves) == self.loaded, f'and the {self.loaded} lines of the increments')
        self.verify('0 findings' in self.hdkv('check')[0], 'hdkv check finds nothing')

    def reopen(self):
        self.did('Close the document and open it again from the recent files')
        self.editor.menu('File', 'Close')
        self.comes(lambda: len(self.editor.windows()) == 2, 'the window is closed')
        self.editor.menu('File', 'Open Recent', '/river.HDKV')
        self.comes(lambda: len(self.editor.windows()) == 3, 'the document is open again')
        self.editor.settle()
        self.verify(self.editor.table().line(self.line) == LINE, 'the typed line is there')
        self.picture('reopened')

    STEPS = (look_at_every_page, type_values, delete_and_undo, search, switch_units, insert_from_map, delete_on_map,
             show_on_map, load_curves, save, reopen)

    def run(self):
        try:
            self.did('Open the project and put its windows side by side')
            self.comes(lambda: len(self.editor.project_files()) == len(self.editor.windows()) == 3,
                       'parameters, network and cross sections are open')
            self.editor.settle()
            self.editor.menu('Window', 'Side by Side')
            for step in self.STEPS:
                step(self)
                self.verify(not self.editor.no_message(), 'no message is up that nobody asked for')
        except Exception as error:  # whatever it is, the other steps would tell nothing
            self.verify(False, f'{type(error).__name__}: {error}, after {self.editor.hands.log[-3:]}')
            self.picture('failed')
        finally:
            log = self.editor.end()
        print(log, end='')
        print('\nPictures:', *self.pictures, sep='\n  ')
        print(f'\n{self.checks} checks, {self.failed} failed')
        return 1 if self.failed else 0


if __name__ == '__main__':
    if len(sys.argv) != 3:
        sys.exit(__doc__)
    os.environ['KVR_BIN'] = os.path.abspath(os.environ.get('KVR_BIN', 'build/release/bin'))
    with Session() as desktop:
        sys.exit(MainJob(*map(os.path.abspath, sys.argv[1:]), desktop).run())
