#!/usr/bin/python3
"""random_sessions.py SESSIONS STEPS SEED: drives the program through sessions of random steps on a project.

A session types at mixed speeds into cells and fields, appends and deletes lines, goes from page to page and window to
window, searches, types nonsense, undoes and redoes, and saves. After every save the file holds what a simple model
says, value by value, and the checker finds nothing in it; in the end undo leads back to the first file, byte for byte.
A message that nobody asked for, or that comes twice, is a fault. A session ends with its first fault; SEED and its
number repeat it.

    KVR_BIN=build/release/bin tests/desktop/random_sessions.py 200 200 1
"""
import os
import random
import subprocess
import sys
import time

from session import Session

HERE = os.path.dirname(os.path.abspath(__file__))
SPEEDS = (10, 10, 25, 50)
# Pages with a table whose columns are a branch, a chainage and numbers: caption, list, and fields.
TABLES = {'Initial': ('InitList', {'Discharge': 'G_discharge'}),
          'Wind': ('WindList', {'Topographical': 'G_wind_factor'}),
          'Flood Plain Resist.': ('FloodList', {'Flood Plain': 'G_flood_plan_res'}),
          'KLR Parameters': ('KlrParamList', {'Maximum volume': 'maxvol'})}
FIELDS = {'Default Values': {'Alpha': 'alpha', 'Theta': 'theta', 'FroudeExp': 'froude_exp'}}


class Fault(Exception):
    """What the program did and should not have."""


class RandomSession:
    def __init__(self, folder, seed):
        import samples
        from editor import Editor

        self.samples, self.random = samples, random.Random(seed)
        self.folder = folder
        os.makedirs(folder, exist_ok=True)
        self.columns = {page: self.number_columns(section) for page, (section, _) in TABLES.items()}
        self.lines = {page: [[self.name(), str(100 * n), *(self.number() for _ in range(columns))] for n in range(1, 6)]
                      for page, columns in self.columns.items()}
        self.globals = {}
        lists = {TABLES[page][0]: [f'"{r[0]}", ' + ', '.join(r[1:]) for r in rows] for page, rows in self.lines.items()}
        samples.write_project(folder, samples.hd_text(lists))
        self.path = f'{folder}/moor.HDKV'
        subprocess.run([os.path.join(os.environ['KVR_BIN'], 'hdkv'), 'fmt', self.path], check=True)
        self.first = samples.Saved(self.path).text
        self.editor = Editor(folder, 'moor.kvrp')
        self.page = 'Initial'
        self.steps = 0

    def number_columns(self, section):
        """How many a list has, behind branch and chainage."""
        hdkv, empty = os.path.join(os.environ['KVR_BIN'], 'hdkv'), f'{self.folder}/empty.hdkv'
        if not os.path.exists(empty):
            subprocess.run([hdkv, 'new', empty], check=True)
        shown = subprocess.run([hdkv, 'show', empty, section, '--format', 'csv'], check=True, capture_output=True, text=True)
        return len(shown.stdout.split('\n')[0].split(',')) - 2

    # ---- what is typed

    def name(self):
        return self.random.choice(('MOORBECK', 'RIVER10', 'INN', 'MOOR', 'RIVER1', 'AELDER'))

    def number(self):
        """Few share digits, so that a lost one shows."""
        digits = self.random.randint(0, 3)
        return f'{self.random.randint(10 ** 6, 10 ** 7 - 1) / 10 ** (digits + 2):.{digits}f}'.rstrip('.')

    def speed(self):
        return self.random.choice(SPEEDS)

    def a_line(self):
        return self.random.randint(1, len(self.lines[self.page]))

    # ---- steps; every one leaves the program without a dialog

    def change_cell(self):
        line, column = self.a_line(), self.random.randint(1, len(self.lines[self.page][0]))
        text = self.name() if column == 1 else self.number()
        self.editor.click_cell(line, column)
        self.editor.type(text.lower() if self.random.random() < .5 else text, self.speed())
        self.lines[self.page][line - 1][column - 1] = text
        ways = ['Tab', 'Return', 'click', 'page', 'save', 'undo']
        if column == 1:  # the first click beside the offers of names only closes them
            ways = ['Tab', 'Return', 'save']
        elif (line, column) == (len(self.lines[self.page]), len(self.lines[self.page][0])):
            ways = ['click', 'page', 'save', 'undo']  # a key would append a line
        leave = self.random.choice(ways)
        if leave in ('Tab', 'Return'):
            self.editor.press(leave)
        elif leave == 'click':
            self.editor.click_cell(self.a_line(), 1)
        elif leave == 'page':
            self.change_page()
        elif leave == 'save':
            self.save()
        else:
            self.undo_and_redo()

    def change_lines(self):
        """Types on from cell to cell without looking."""
        line = self.a_line()
        self.editor.click_cell(line, 2)
        for row in self.lines[self.page][line - 1:line + 2]:
            row[1:] = [self.number() for _ in row[1:]]
            self.editor.type('\t'.join(row[1:]) + '\t', self.speed())
            if row is not self.lines[self.page][-1]:
                self.editor.press('Tab')
            else:
                break
        else:
            return
        # Tab behind the last cell has appended a line, which is taken back.
        self.editor.press('ctrl+z')

    def append_line(self):
        columns = self.columns[self.page]
        row = [self.name(), self.number(), *(self.number() for _ in range(columns))]
        self.editor.click_cell(len(self.lines[self.page]), columns + 2)
        self.editor.press(self.random.choice(('Tab', 'Insert')))
        self.editor.settle(0.05)
        self.editor.click_cell(len(self.lines[self.page]) + 1, 1)
        self.editor.type('\t'.join(row), self.speed())
        self.editor.press('shift+Tab')
        self.lines[self.page].append(row)

    def append_incomplete_line(self):
        """Goes with the next save."""
        columns = self.columns[self.page]
        self.editor.click_cell(len(self.lines[self.page]), columns + 2)
        self.editor.press('Tab')
        self.editor.settle(0.05)
        name = self.name()
        self.editor.type(name + '\t', self.speed())
        self.lines[self.page].append([name, '', *['?'] * columns])
        self.save()

    def delete_line(self):
        if len(self.lines[self.page]) < 4:
            return
        line = self.a_line()
        self.editor.click_line(line)
        self.editor.press('Delete')
        del self.lines[self.page][line - 1]

    def change_field(self):
        fields = TABLES[self.page][1]
        self.fill(fields)

    def change_default_value(self):
        self.editor.go_to('Default Values')
        self.fill(FIELDS['Default Values'])
        self.editor.go_to(self.page)

    def fill(self, fields):
        name = self.random.choice(list(fields))
        text = self.number()
        self.editor.fill(name, text, self.speed())
        self.globals[fields[name]] = text

    def change_page(self):
        self.page = self.random.choice(list(TABLES))
        self.editor.go_to(self.page)

    def save(self):
        self.editor.press('ctrl+s')
        self.expect_no_message()
        for page in TABLES:
            self.lines[page] = [row for row in self.lines[page] if row[0] and row[1]]
        deadline = time.monotonic() + 5
        while (difference := self.difference()) and time.monotonic() < deadline:
            time.sleep(0.1)
        if difference:
            raise Fault(difference)
        if found := self.samples.misread(self.path):
            raise Fault(f'the checker finds: {found}')

    def difference(self):
        """The first value that the file has otherwise than the model."""
        saved = self.samples.Saved(self.path)
        for page, (section, _) in TABLES.items():
            records = [[part.strip('" ') for part in record.split(',')] for record in saved.records(section)]
            if len(records) != len(self.lines[page]):
                return f'{page}: {len(records)} lines instead of {len(self.lines[page])}'
            for n, (record, row) in enumerate(zip(records, self.lines[page]), 1):
                if record[0] != row[0] or [float(v) for v in record[1:]] != [float(v) for v in row[1:]]:
                    return f'{page}, line {n}: {record} instead of {row}'
        for keyword, text in self.globals.items():
            if float(saved.value(keyword)) != float(text):
                return f'{keyword}: {saved.value(keyword)} instead of {text}'
        return ''

    def undo_and_redo(self):
        """There and back: the next save shows whether nothing has changed."""
        steps = self.random.randint(1, 5)
        done = 0
        for _ in range(steps):
            if not self.command('Undo').enabled:
                break
            self.editor.click(self.command('Undo'))
            done += 1
        for _ in range(done):
            self.editor.click(self.command('Redo'))
        self.page = self.editor.current_page()
        if self.page not in TABLES:
            self.change_page()

    def command(self, name):
        bar = next(w for w in self.editor.frame.children() if w.role == 'tool bar' and w.name == 'Standard')
        return next(w for w in bar.children() if w.name.startswith(name))

    def search(self):
        self.editor.press('F7')
        self.editor.box()
        self.editor.press('ctrl+a')
        self.editor.type(self.name().lower() + '\n', self.speed())
        self.dismiss_one('Searched item not found')
        self.editor.press('F3')
        self.dismiss_one('earched item')

    def search_while_typing(self):
        line = self.a_line()
        text = self.number()
        self.editor.click_cell(line, 3)
        self.editor.type(text, self.speed())
        self.lines[self.page][line - 1][2] = text
        self.editor.press('F7')
        self.editor.box()
        self.editor.press('Escape')
        self.editor.click_cell(line, 1)

    def nonsense(self):
        """Told once, whatever comes next; Escape takes it back."""
        line = self.a_line()
        self.editor.click_cell(line, 3)
        self.editor.type(self.random.choice(('x', '1.2.3', '7e', 'abc', '12,5')), self.speed())
        way = self.random.choice(('Tab', 'tab', 'save', 'cell', 'search', 'goto'))
        if way == 'tab':
            self.editor.page(self.random.choice([p for p in TABLES if p != self.page]))
        elif way == 'cell':
            self.editor.click_cell(line % len(self.lines[self.page]) + 1, 2)
        else:
            self.editor.press({'Tab': 'Tab', 'save': 'ctrl+s', 'search': 'F7', 'goto': 'ctrl+g'}[way])
        said = self.editor.box_texts()
        if 'Floating point number required' not in said:
            raise Fault(f'nonsense and {way}: {said}')
        self.editor.press('Return')
        self.expect_no_message()
        if self.editor.current_page() != self.page:
            raise Fault(f'nonsense and {way}: the page {self.editor.current_page()} is in front')
        self.editor.press('Escape')

    def go_to_line(self):
        self.editor.press('ctrl+g')
        self.editor.box()
        self.editor.press('ctrl+a')
        self.editor.type(f'{self.a_line()}\n', self.speed())

    def channel(self):
        """A change in the network's own table, and back to the parameters."""
        table = self.editor.table('Radius and width')
        self.editor.put(1, 1, '0', self.speed(), 'Return', table)
        self.editor.put(2, 1, self.random.choice(('9800', '9850', '9000')), self.speed(), 'Return', table)
        self.editor.click_cell(self.a_line(), 1)

    def insert_from_map(self):
        self.editor.click(self.editor.frame.find('filler', '^Map of the river network'))
        self.editor.press('Home', 'Escape', 'space')
        self.editor.settle(0.1)
        line = len(self.lines[self.page])
        self.editor.click_cell(line, 1)
        self.editor.press('ctrl+l')
        self.editor.settle(0.1)
        table = self.editor.table()
        if table.lines != line + 1:
            raise Fault(f'{table.lines} lines after a place was inserted into {line}')
        row = table.line(line + 1)
        self.lines[self.page].append([row[0], *(text for text in row[1:])])
        self.editor.click_cell(line + 1, 2)
        texts = [self.number() for _ in row[1:]]
        self.editor.type('\t'.join(texts), self.speed())
        self.editor.press('shift+Tab')
        self.lines[self.page][-1][1:] = texts

    STEPS = [(change_cell, 30), (change_lines, 8), (append_line, 8), (append_incomplete_line, 3), (delete_line, 4),
             (change_field, 8), (change_default_value, 4), (change_page, 12), (save, 6), (undo_and_redo, 8),
             (search, 4), (search_while_typing, 4), (nonsense, 5), (go_to_line, 3), (channel, 4), (insert_from_map, 4)]

    # ---- messages

    def expect_no_message(self):
        if said := self.editor.no_message():
            raise Fault(f'a message nobody asked for: {said}')

    def dismiss_one(self, text):
        if said := self.editor.no_message():
            if text not in ' '.join(said):
                raise Fault(f'a message nobody asked for: {said}')
            self.editor.press('Return')
            self.expect_no_message()

    # ---- the session

    def run(self, steps):
        for self.steps in range(1, steps + 1):
            step = self.random.choices([s for s, _ in self.STEPS], [weight for _, weight in self.STEPS])[0]
            self.editor.hands.log.append(f'-- {self.steps} {step.__name__} on {self.page}')
            step(self)
            self.expect_no_message()
            if self.editor.process.poll() is not None:
                raise Fault('the program ended')
        self.editor.go_to(self.page)
        self.editor.click_cell(1, 1)
        self.save()
        self.back_to_the_start()

    def back_to_the_start(self):
        for _ in range(100 * max(self.steps, 20)):
            if not self.command('Undo').enabled:
                break
            self.editor.hands.click(*self.command('Undo').middle, times=10)
            self.editor.settle(0.02)
        self.editor.press('ctrl+s')
        self.expect_no_message()
        self.editor.settle()
        if self.samples.Saved(self.path).text != self.first:
            raise Fault('undo does not lead back to the first file')

    def end(self):
        return self.editor.end()


def one_session(number, steps, seed, out, desktop):
    folder = f'{out}/{seed}-{number}'
    session = None
    try:
        session = RandomSession(folder, f'{seed}-{number}')
        session.run(steps)
        return ''
    except Exception as error:  # whatever it is, the session is worth looking at
        desktop.picture(f'{folder}/failed.png')
        if session:
            with open(f'{folder}/keys.txt', 'w', encoding='utf-8') as log:
                log.write('\n'.join(session.editor.hands.log))
        return f'step {session.steps if session else 0}: {type(error).__name__}: {error}'
    finally:
        if session:
            session.end()


def main():
    sessions, steps, seed = (int(argument) for argument in sys.argv[1:4])
    for variable, folder in (('KVR_BIN', 'build/dev/bin'), ('KVR_OUT', 'build/dev/desktop')):
        os.environ[variable] = os.path.abspath(os.environ.get(variable, os.path.join(HERE, '../..', folder)))
    failed = 0
    with Session() as desktop:
        out = os.environ['KVR_OUT'] + '/sessions'
        for number in range(1, sessions + 1):
            start = time.monotonic()
            fault = one_session(number, steps, seed, out, desktop)
            failed += bool(fault)
            print(f'session {number} of seed {seed}: {steps} steps, {time.monotonic() - start:.0f} s: '
                  f'{fault or "fine"}', flush=True)
    print(f'{sessions - failed} of {sessions} sessions without a fault')
    return 1 if failed else 0


if __name__ == '__main__':
    sys.exit(main())
