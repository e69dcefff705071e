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
