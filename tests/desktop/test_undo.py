"""Undo and redo as a user sees them."""
import samples
from case import Case
from waiting import wait_for


class Undo(Case):
    def test_back_to_the_saved_state_clears_the_mark(self):
        editor = self.open()
        editor.put(1, 3, '2.5')
        editor.save()
        editor.put(2, 3, '2.75')
        editor.go_to('Default Values')
        editor.fill('Delta', '0.75')
        self.assertTrue(editor.modified)
        editor.press('ctrl+z')
        editor.settle()
        editor.press('ctrl+z')
        wait_for(lambda: not editor.modified, 'the mark goes with the last undo')
        editor.press('ctrl+y')
        wait_for(lambda: editor.modified, 'redo brings the mark back')

    def test_a_global_field_comes_into_view(self):
        editor = self.open()
        editor.go_to('Default Values')
        editor.fill('Delta', '0.75')
        editor.go_to('Wind')
        editor.menu('Edit', 'Undo')
        wait_for(lambda: editor.current_page() == 'Default Values', 'undo shows the page of what it changes')
        self.assertEqual(editor.field('Delta').text, '0.5')
        editor.go_to('Initial')
        editor.menu('Edit', 'Redo')
        wait_for(lambda: editor.current_page() == 'Default Values', 'redo shows the page of what it changes')
        self.assertEqual(editor.field('Delta').text, '0.75')

    def test_a_line_comes_into_view(self):
        lines = [f'"MOORBECK", {n}, 1, 2' for n in range(1, 201)]
        editor = self.open(samples.hd_text({'InitList': lines}))
        editor.put(1, 3, '2.5')
        editor.press('ctrl+End')
        editor.go_to('Wind')
        editor.click_cell(1, 1)
        editor.press('ctrl+z')
        wait_for(lambda: editor.current_page() == 'Initial', 'undo shows the page of what it changes')
        self.assertEqual(editor.table().cell(1, 3).name, '1')
        self.assertIn('Line 1 of 200', editor.status())

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

    def test_all_the_way_back(self):
        """Undo to the start and a save give the first file."""
        editor = self.open()
        editor.put(1, 3, '2.5')
        editor.save()
        editor.press('ctrl+z')
        editor.settle()
        editor.press('ctrl+s')
        editor.settle()
        first = self.saved().text
        editor.put(2, 1, 'innster')
        editor.put(3, 4, '77.125')
        editor.go_to('Wind')
        editor.put(1, 3, '0.875')
        editor.fill('Topographical', '0.75')
        editor.go_to('Initial')
        editor.click_line(2)
        editor.press('Delete')
        editor.save()
        changed = self.saved().text
        self.assertNotEqual(changed, first)
        for _ in range(12):
            editor.press('ctrl+z', pause=60)
        editor.settle()
        editor.press('ctrl+s')
        editor.settle()
        self.assertEqual(self.saved().text, first)
        for _ in range(12):
            editor.press('ctrl+y', pause=60)
        editor.settle()
        editor.press('ctrl+s')
        editor.settle()
        self.assertEqual(self.saved().text, changed)
