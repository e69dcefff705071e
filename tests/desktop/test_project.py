"""The editors of a project beside each other."""
import os

import case
import samples
from case import Case
from waiting import wait_for


class TypingWithANetwork(Case):
    """The map fetches locations soon after a change; nobody who types notices."""

    def test_fast_lines(self):
        editor = self.open_project(samples.hd_text({'InitList': ['"MOORBECK", 100, 1, 2']}))
        expected = ['"MOORBECK", 100, 1, 2']
        for n, speed in enumerate((10, 25, 50, 10, 25, 50), 1):
            editor.click_cell(n, 4)
            editor.press('Tab')  # behind the last cell: a new line
            wait_for(lambda: editor.table().lines == n + 1, 'a line is appended')
            editor.type(f'RIVER10\t{n}234\t{n}.567\t{n}8.25', speed)
            expected.append(f'"RIVER10", {n}234, {n}.567, {n}8.25')
        editor.press('Return')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), expected)
        self.assert_clean()

    def test_the_map_follows_a_line_that_moves(self):
        editor = self.open_project()
        plan = editor.frame.find('filler', '^Map of the river network')
        for change, place in ((lambda: editor.put(1, 2, '6000'), 'MOORBECK 6000.0 m'),
                              (lambda: editor.press('ctrl+z'), 'MOORBECK 100.0 m'),
                              (lambda: editor.go_to('Wind'), 'MOORBECK 100.0 m'),
                              (lambda: editor.put(1, 2, '700'), 'MOORBECK 700.0 m'),
                              (lambda: editor.go_to('Initial'), 'MOORBECK 100.0 m')):
            change()
            wait_for(lambda: plan.description == place, f'the map shows {place}, not {plan.description}', 4)

    def test_fast_changes(self):
        """Down the columns, where every line that is left is told to the others."""
        lines = [f'"MOORBECK", {100 * n}, 1, 2' for n in range(1, 9)]
        for speed in (10, 50):
            editor = self.open_project(samples.hd_text({'InitList': lines}))
            editor.click_cell(1, 2)
            for n in range(1, 9):
                editor.type(f'{n}23{n}\t{n}.{n}71\t{n}0.5\t', speed)
                if n < 8:
                    editor.press('Tab')
            editor.save()
            self.assertEqual(self.saved().records('InitList')[:8],
                             [f'"MOORBECK", {n}23{n}, {n}.{n}71, {n}0.5' for n in range(1, 9)])


class ComingBack(Case):
    def test_a_reopened_file_is_on_the_map(self):
        editor = self.open_project()
        plan = editor.frame.find('filler', '^Map of the river network')

        def legend():  # counts the locations
            editor.settle(0.4)
            x, y, width, _ = plan.place
            return case.session.pixels(x + width - 160, y + 10, 150, 120)

        shown = legend()
        editor.press('ctrl+F4')
        wait_for(lambda: len(editor.windows()) == 2, 'its window goes')
        wait_for(lambda: legend() != shown, 'and so do its marks')
        editor.menu('File', 'Open Recent', '/moor.HDKV')
        wait_for(lambda: len(editor.windows()) == 3, 'its window is back')
        editor.menu('Window', 'Side by Side')
        wait_for(lambda: legend() == shown, 'and so are its marks')


class Redo(Case):
    def test_ctrl_y_in_the_network(self):
        editor = self.open_project()
        table = editor.table('Radius and width')
        editor.put(1, 2, '1500', leave='Return', table=table)
        editor.press('ctrl+z')
        wait_for(lambda: editor.table('Radius and width').cell(1, 2).name == '1000', 'Ctrl+Z takes the radius back')
        editor.press('ctrl+y')
        wait_for(lambda: editor.table('Radius and width').cell(1, 2).name == '1500', 'Ctrl+Y makes it again')

    def test_ctrl_y_in_the_cross_sections(self):
        editor = self.open_project()
        name = 'Points of the current cross section'
        editor.put(1, 2, '12.5', leave='Return', table=editor.table(name))
        editor.press('ctrl+z')
        wait_for(lambda: editor.table(name).cell(1, 2).name == '10', 'Ctrl+Z takes the level back')
        editor.press('ctrl+y')
        wait_for(lambda: editor.table(name).cell(1, 2).name == '12.5', 'Ctrl+Y makes it again')


class Names(Case):
    def test_names_with_unusual_capitals(self):
        """A branch picked on the map and inserted is in the network, however its capitals are formed."""
        branches = {'Weiße Elster': 9000, 'Kızılırmak': 5000}
        for name in branches:
            editor = self.open_project(samples.hd_text({'InitList': [], 'WindList': []}), {name: branches[name]})
            plan = editor.frame.find('filler', '^Map of the river network')
            editor.click(plan)
            editor.press('Home', 'space')
            editor.settle()
            editor.click_cell(1, 1)
            editor.press('ctrl+l')
            editor.settle(0.3)
            self.assert_no_message()
            inserted = [editor.table().cell(line, 1).name for line in range(1, editor.table().lines + 1)]
            self.assertIn(name.upper(), inserted)
            # The map knows the place as one of its own: N goes to it, and Delete deletes it.
            editor.click(plan)
            editor.press('n', 'Delete')
            wait_for(lambda: name.upper() not in [editor.table().cell(line, 1).name
                                                  for line in range(1, editor.table().lines + 1)],
                     'the location on the map is deleted')

    def test_project_finds_its_file_after_the_save(self):
        """A member whose spelling the save has changed stays a member."""
        samples.write_project(self.folder)
        os.rename(f'{self.folder}/moor.HDKV', f'{self.folder}/moor.hdkv')
        samples.write(f'{self.folder}/moor.kvrp', samples.project_text('moor.hdkv', 'moor.kvnw', 'moor.kvxs'))
        editor = self.start('moor.kvrp')
        wait_for(lambda: len(editor.windows()) >= 3, 'the project opens')
        editor.settle()
        editor.put(1, 3, '2.5')
        editor.save()
        self.assertEqual([f for f in os.listdir(self.folder) if f.lower() == 'moor.hdkv'], ['moor.HDKV'])
        self.assertIn('<moor.HDKV>', samples.Saved(f'{self.folder}/moor.kvrp').text)
        self.assertEqual(editor.project_files()[0], 'moor.HDKV')
        self.assertIn('moor.HDKV', editor.status())


class FileThatCannotBeOpened(Case):
    def test_the_first_one_is_told_once_by_its_name(self):
        samples.write_project(self.folder)
        os.rename(f'{self.folder}/moor.HDKV', f'{self.folder}/Moor.HdKv')
        self.start('moor.kvrp')
        self.assert_told_once('of the project moor could not be opened', 'Moor.HdKv: Unsupported file format')
        self.assertEqual(len(self.editor.windows()), 2)


class SharedFile(Case):
    def test_second_project_is_told(self):
        samples.write_project(self.folder)
        samples.write(f'{self.folder}/other.kvrp', samples.project_text('moor.HDKV', 'moor.kvxs'))
        editor = self.start('moor.kvrp', 'other.kvrp')
        said = ' '.join(editor.answer('OK'))
        self.assertIn('are open in another project', said)
        while editor.no_message():  # each project says it of the other's files
            editor.answer('OK')
        tree = [w.name for w in editor.frame.find('tree', '^Files of the project').children() if w.role == 'table cell']
        self.assertEqual(sorted(name.split()[0] for name in tree if '(in ' in name), ['moor.HDKV', 'moor.kvxs'])
