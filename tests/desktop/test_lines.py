"""Lines sorted and filtered under the user's hands; the file keeps its own order."""
import samples
from case import Case
from waiting import wait_for

LINES = ['"RHINE", 300, 3, 10', '"ELBE", 100, 1, 11', '"RHINE", 100, 2, 12', '"ELBE", 50, 5, 13']


class SortedAndFiltered(Case):
    def open_lines(self, **more):
        return self.open(samples.hd_text({'InitList': LINES}), **more)

    def branches(self, editor):
        table = editor.table()
        return [' '.join(table.line(line)[:2]) for line in range(1, table.lines + 1)]

    def wait_for_lines(self, editor, *lines):
        wait_for(lambda: self.branches(editor) == list(lines), f'{lines} are shown, not {self.branches(editor)}', 5)

    def test_sorted_lines_are_edited_and_the_file_keeps_its_order(self):
        editor = self.open_lines()
        editor.click_cell(1, 3)
        editor.press('ctrl+shift+d')
        self.wait_for_lines(editor, 'ELBE 50', 'RHINE 300', 'RHINE 100', 'ELBE 100')
        editor.put(1, 3, '0.5')
        self.wait_for_lines(editor, 'ELBE 50', 'RHINE 300', 'RHINE 100', 'ELBE 100')  # nothing jumps away
        editor.press('F5')
        self.wait_for_lines(editor, 'RHINE 300', 'RHINE 100', 'ELBE 100', 'ELBE 50')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES[:3] + ['"ELBE", 50, 0.5, 13'])
        editor.menu('Lines', 'Sort by Branch')
        self.wait_for_lines(editor, 'ELBE 50', 'ELBE 100', 'RHINE 100', 'RHINE 300')
        editor.menu('Lines', 'Make This')
        editor.save()
        self.assertEqual(self.saved().records('InitList')[0], '"ELBE", 50, 0.5, 13')
        editor.press('ctrl+z', 'ctrl+z')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES)

    def test_filtered_lines_are_deleted_and_hidden_ones_stay(self):
        editor = self.open_lines()
        editor.click_cell(1, 1)
        editor.press('ctrl+shift+f')
        editor.type('elb')
        self.wait_for_lines(editor, 'ELBE 100', 'ELBE 50')
        wait_for(lambda: '2 of 4 shown' in editor.status(), 'the status bar says how many are shown', 3)
        editor.press('Down', 'ctrl+a', 'Delete')
        self.assertIsNone(editor.no_message())
        editor.press('ctrl+shift+f', 'Escape', 'Escape')
        self.wait_for_lines(editor, 'RHINE 300', 'RHINE 100')
        editor.press('ctrl+z')
        self.wait_for_lines(editor, 'RHINE 300', 'ELBE 100', 'RHINE 100', 'ELBE 50')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES)


class InsertedAndMoved(Case):
    """The lines themselves, by keys and by the menus that a right click opens."""

    def places(self):
        return [' '.join(self.editor.table().line(line)[:2]) for line in range(1, self.editor.table().lines + 1)]

    def wait_for_places(self, *places):
        wait_for(lambda: self.places() == list(places), f'{places} are shown, not {self.places()}', 5)

    def test_lines_are_moved_and_duplicated_by_keys(self):
        editor = self.open(samples.hd_text({'InitList': LINES}))
        editor.click_cell(3, 1)
        editor.press('ctrl+shift+Up', 'ctrl+shift+Up')
        self.wait_for_places('RHINE 100', 'RHINE 300', 'ELBE 100', 'ELBE 50')
        editor.press('ctrl+u')
        self.wait_for_places('RHINE 100', 'RHINE 100', 'RHINE 300', 'ELBE 100', 'ELBE 50')
        editor.press('ctrl+Return')
        editor.type('weser\t7\t')
        editor.save()
        self.assertEqual(self.saved().records('InitList'),
                         [LINES[2], LINES[2], '"WESER", 7, 3.5, 12', LINES[0], LINES[1], LINES[3]])
        editor.press(*['ctrl+z'] * 6)
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES)

    def test_the_menu_of_line_numbers_is_about_the_lines_selected_or_the_one_below_it(self):
        editor = self.open(samples.hd_text({'InitList': LINES}))
        editor.click_line(2)
        editor.click_line(3, held='shift')
        editor.click_line(3, button=3)
        editor.press('d')  # Delete 2 Lines
        self.wait_for_places('RHINE 300', 'ELBE 50')
        editor.press('ctrl+z')
        self.wait_for_places('RHINE 300', 'ELBE 100', 'RHINE 100', 'ELBE 50')
        editor.click_line(2)
        editor.click_line(4, button=3)  # one that is not selected
        editor.press('d')
        self.wait_for_places('RHINE 300', 'ELBE 100', 'RHINE 100')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES[:3])

    def test_cells_are_cut_and_cleared_and_delete_says_that_it_takes_lines(self):
        editor = self.open(samples.hd_text({'InitList': LINES}))
        editor.click_cell(1, 3)
        editor.press('shift+Down', 'Delete')
        wait_for(lambda: 'Ctrl+Backspace' in editor.status(), 'Delete says that it takes lines', 3)
        editor.press('ctrl+BackSpace')
        wait_for(lambda: '2 cells cleared' in editor.status(), 'what was done is said', 3)
        editor.click_cell(3, 4)
        editor.menu('Edit', 'Cut')
        editor.click_cell(4, 4)
        editor.press('ctrl+v')
        editor.click_cell(1, 1)
        for lines, key in enumerate(('shift+F10', 'Menu'), 5):
            editor.press(key, 'Down', 'Return')  # the first entry: Insert Line
            wait_for(lambda: editor.table().lines == lines, f'{key} opens the menu of the cell', 3)
        editor.save()
        self.assertEqual(self.saved().records('InitList')[:4],
                         ['"RHINE", 300, 3.5, 10', '"ELBE", 100, 3.5, 11', '"RHINE", 100, 2, 12', '"ELBE", 50, 5, 12'])

    def test_lines_at_the_cross_sections_of_a_branch(self):
        editor = self.open_project()
        editor.click_cell(1, 1)
        editor.press('ctrl+shift+l')
        box = editor.box()
        editor.press('alt+t')
        editor.type('1500')
        editor.press('alt+c')
        wait_for(lambda: any('2 lines: 0, 1000' in text for text in editor.box_texts()), 'two are between', 3)
        self.assertTrue(box.shown)
        editor.press('Return')
        wait_for(lambda: '2 lines inserted' in editor.status(), 'what was done is said', 3)
        editor.save()
        self.assertEqual(self.saved().records('InitList')[2:4], ['"MOORBECK", 0, 3.5, 12', '"MOORBECK", 1000, 3.5, 12'])


class ChangedSinceTheSave(Case):
    """Lines that differ from the last save say so, beside their numbers and to whoever cannot see that."""

    def marks(self):
        table = self.editor.table()
        return [table.line_number(line).description for line in range(1, table.lines + 1)]

    def wait_for_marks(self, *marks):
        wait_for(lambda: self.marks() == list(marks), f'{marks} are told, not {self.marks()}', 5)

    def test_changes_are_told_and_reverted(self):
        changed, new = 'Changed since the last save', 'New since the last save'
        editor = self.open(samples.hd_text({'InitList': LINES}))
        self.wait_for_marks('', '', '', '')
        editor.put(2, 3, '1.5')
        editor.click_cell(3, 1)
        editor.press('ctrl+u', 'ctrl+shift+Up')
        self.wait_for_marks('', changed, new, '', '')
        self.assertEqual(editor.table().cell(2, 3).description, 'was 1 m at the last save')
        editor.press('ctrl+z', 'ctrl+z')
        self.wait_for_marks('', changed, '', '')
        editor.put(4, 3, '6')
        editor.press('ctrl+shift+d')
        self.wait_for_marks(changed, '', changed, '')  # sorted by the last column, largest first
        editor.click_line(1)
        editor.click_line(1, button=3)
        editor.press('Up', 'Return')  # the last entry: Revert to Saved Values
        wait_for(lambda: '1 cell reverted' in editor.status(), 'what was done is said', 3)
        self.wait_for_marks('', '', changed, '')
        editor.press('ctrl+z')
        self.wait_for_marks(changed, '', changed, '')
        editor.save()
        self.assertEqual(self.saved().records('InitList'),
                         [LINES[0], '"ELBE", 100, 1.5, 11', LINES[2], '"ELBE", 50, 6, 13'])
        self.wait_for_marks('', '', '', '')
        editor.press('ctrl+z', 'ctrl+z')
        self.wait_for_marks(changed, '', changed, '')
        editor.press('ctrl+a', 'ctrl+shift+BackSpace')
        self.wait_for_marks('', '', '', '')
        editor.menu('Edit', 'Undo')
        self.wait_for_marks(changed, '', changed, '')


class ComingBack(Case):
    """What the user has arranged is there again when the file is opened again; the file holds nothing of it."""

    def test_page_order_filter_and_cell(self):
        text = samples.hd_text({'InitList': LINES, 'WindList': ['"ELBE", 10, 0.5', '"RHINE", 20, 0.6', '"ELBE", 30, 0.7']})
        editor = self.open(text)
        editor.click_cell(1, 2)
        editor.press('ctrl+shift+d')
        editor.go_to('Wind')
        editor.click_cell(2, 1)
        editor.press('ctrl+shift+f')
        editor.type('elb')
        wait_for(lambda: editor.table().lines == 2, 'two lines pass the filter', 3)
        editor.press('Down', 'Down', 'Right')
        place = editor.status()
        self.assertIn('Line 3 of 3', place)
        editor.press('ctrl+F4')
        editor.menu('File', 'Open Recent', '/moor.HDKV')
        wait_for(lambda: editor.current_page() == 'Wind', 'the page is in front again', 5)
        wait_for(lambda: editor.status() == place, f'{place} again, not {editor.status()}', 5)
        self.assertEqual(editor.table().lines, 2)
        editor.go_to('Initial')
        table = editor.table()
        self.assertEqual([table.cell(line, 2).name for line in range(1, 5)], ['300', '100', '100', '50'])
        self.assertFalse(editor.modified)
        editor.press('ctrl+shift+o')
        self.assertEqual([table.cell(line, 2).name for line in range(1, 5)], ['300', '100', '100', '50'])


class CommandsOverAnOpenCell(Case):
    """What was typed is taken before a key is about the table, and what cannot be taken is told."""
    TEXT = samples.hd_text({'InitList': LINES})

    def test_a_value_stays_in_its_line(self):
        editor = self.open(self.TEXT)
        editor.click_cell(2, 3)
        editor.type('7.5')
        editor.press('ctrl+shift+Return')
        editor.settle()
        self.assertEqual(editor.table().line(3)[:3], ['ELBE', '100', '7.5'])
        self.assertEqual(editor.table().line(2)[0], '')
        editor.press('ctrl+z')
        editor.click_cell(2, 3)
        editor.type('8')
        editor.press('ctrl+shift+g')
        editor.settle()
        editor.click_cell(2, 3)
        editor.type('abc')
        for key in ('ctrl+shift+Return', 'ctrl+Return', 'ctrl+u', 'ctrl+shift+g', 'ctrl+h', 'ctrl+shift+l'):
            editor.press(key)
            self.assertIn('Floating point number required', editor.box_texts())
            editor.answer()
            self.assertEqual(editor.table().lines, 4)
        editor.press('Escape')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), [LINES[0], '"ELBE", 100, 3.5, 11'] + LINES[2:])

    def test_what_is_typed_is_found(self):
        editor = self.open(self.TEXT)
        editor.click_cell(4, 3)
        editor.type('7.5')
        editor.press('ctrl+h')
        editor.box()
        editor.type('7.5')
        editor.settle(0.6)
        self.assertIn('1 cell found', ' '.join(editor.box_texts()))
        editor.press('Return')  # finds, and does not close
        editor.settle()
        self.assertIn('1 cell found', ' '.join(editor.box_texts()))
        editor.press('Escape')
