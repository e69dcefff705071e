"""Undo and redo as a user sees them."""
import samples
from case import Case
from waiting import wait_for


class Undo(Case):
    def test_redo_of_a_save_that_dropped_lines(self):
        """With a first line that was touched in between, redo loses nothing."""
        editor = self.open(samples.hd_text({'InitList': [], 'WindList': []}))
        editor.put(1, 1, 'INN')
        editor.save()  # the line has no chainage and goes
        for _ in range(2):
            editor.press('ctrl+z')
            editor.settle()
        editor.click_cell(1, 1)
        editor.press('ctrl+y')
        editor.settle()
        self.assertEqual(editor.table().cell(1, 1).name, 'INN')
        editor.press('ctrl+y')
        editor.settle()
        editor.press('ctrl+z')
        editor.settle()
        self.assertEqual(editor.table().cell(1, 1).name, 'INN')
